// SPDX-License-Identifier: MIT
// A frame with a label around other views.
#ifndef _BOX_H
#define _BOX_H

#include <String.h>
#include <View.h>

/// A border, and a label in the bold font over its top left. Children are placed by the caller.
class BBox : public BView {
public:
	BBox(BRect frame, const char* name = NULL, uint32 resizingMode = B_FOLLOW_LEFT_TOP,
		uint32 flags = B_WILL_DRAW | B_FRAME_EVENTS | B_NAVIGABLE_JUMP,
		border_style border = B_FANCY_BORDER);
	BBox(const char* name, uint32 flags = B_WILL_DRAW | B_FRAME_EVENTS | B_NAVIGABLE_JUMP,
		border_style border = B_FANCY_BORDER, BView* child = NULL);
	BBox(border_style border, BView* child);
	BBox(BMessage* archive);
	virtual ~BBox();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void AttachedToWindow() override;
	void Draw(BRect updateRect) override;
	void FrameResized(float newWidth, float newHeight) override;
	void GetPreferredSize(float* _width, float* _height) override;

	virtual void SetBorder(border_style border);
	border_style Border() const;

	/// The text is copied; null takes the label away.
	void SetLabel(const char* string);
	/// The view becomes the box's first child, at (10, 0), in place of the label so far, which is deleted.
	/// B_BAD_VALUE when it has another parent.
	status_t SetLabel(BView* viewLabel);
	/// Null without a text label.
	const char* Label() const;
	BView* LabelView() const;

	/// How far the border's top lies below the box's, in pixels.
	float TopBorderOffset();
	/// What is inside the border, in the box's coordinates.
	BRect InnerFrame();

private:
	void ClearLabel();
	float LabelHeight() const;

	BString fLabel;
	BView* fLabelView;
	border_style fBorder;
	float fDrawnWidth;
	float fDrawnHeight;
};

#endif // _BOX_H
