// SPDX-License-Identifier: MIT
// A frame with scroll bars around another view.
#ifndef _SCROLL_VIEW_H
#define _SCROLL_VIEW_H

#include <ScrollBar.h>
#include <View.h>

/// A border and scroll bars around a target view, which becomes the scroll view's child.
///
/// Add the scroll view, not the target, to a parent. The target should follow all sides. Its
/// TargetedByScrollView() is called, with null when it is released. Lock the window as for any view.
class BScrollView : public BView {
public:
	/// Lies around \a target, which keeps its place and size: a border of 2 (fancy), 1 (plain) or 0
	/// pixels, and 14 more for each bar (15 without a border). Without a target there is room for a small one.
	BScrollView(const char* name, BView* target, uint32 resizingMode = B_FOLLOW_LEFT_TOP,
		uint32 flags = 0, bool horizontal = false, bool vertical = false,
		border_style border = B_FANCY_BORDER);
	BScrollView(const char* name, BView* target, uint32 flags, bool horizontal, bool vertical,
		border_style border = B_FANCY_BORDER);
	BScrollView(BMessage* archive);
	virtual ~BScrollView();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void AllAttached() override;
	void AllDetached() override;
	void AttachedToWindow() override;
	void DetachedFromWindow() override;
	void Draw(BRect updateRect) override;
	/// The border lies over the edges of the bars.
	void DrawAfterChildren(BRect updateRect) override;
	void FrameMoved(BPoint newPosition) override;
	void FrameResized(float newWidth, float newHeight) override;
	void MessageReceived(BMessage* message) override;
	void MouseDown(BPoint where) override;
	void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage) override;
	void MouseUp(BPoint where) override;
	void WindowActivated(bool active) override;
	void GetPreferredSize(float* _width, float* _height) override;
	void ResizeToPreferred() override;
	void MakeFocus(bool focus = true) override;

	/// "_HSB_" or "_VSB_", or null when there is none.
	BScrollBar* ScrollBar(orientation direction) const;

	/// Fits the new border and the target into the same frame.
	virtual void SetBorder(border_style border);
	border_style Border() const;
	/// Shows that the target has the keyboard focus. B_ERROR without a border.
	virtual status_t SetBorderHighlighted(bool highlight);
	bool IsBorderHighlighted() const;

	/// Takes the target so far out without deleting it. The new one, which has no parent, gets its place;
	/// null for none.
	void SetTarget(BView* target);
	BView* Target() const;

private:
	float BorderSize() const;
	BRect TargetFrame() const;
	BRect BarFrame(orientation direction) const;
	void MakeBars(bool horizontal, bool vertical);
	void PlaceChildren();
	void ConnectTarget();
	void InvalidateBorder();

	BScrollBar* fHorizontalBar;
	BScrollBar* fVerticalBar;
	BView* fTarget;
	border_style fBorder;
	bool fHighlighted;
	float fDrawnWidth;
	float fDrawnHeight;
};

#endif // _SCROLL_VIEW_H
