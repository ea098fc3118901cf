// SPDX-License-Identifier: MIT
// A bar that shows which part of a view is seen, and scrolls it.
#ifndef _SCROLL_BAR_H
#define _SCROLL_BAR_H

#include <memory>

#include <String.h>
#include <View.h>

const float B_V_SCROLL_BAR_WIDTH = 14;
const float B_H_SCROLL_BAR_HEIGHT = 14;

class BMessageRunner;

/// A scroll bar of a view, its target, that it scrolls in one direction.
///
/// The value is the left or top of the target's bounds, a whole number between minimum and maximum. A
/// range that is empty disables the bar. The target does not own the bar, nor the bar the target; each
/// may go first. Lock the window as for any view; bar and target are in the same window.
class BScrollBar : public BView {
public:
	/// \a target may be null.
	BScrollBar(
		BRect frame, const char* name, BView* target, float min, float max, orientation direction);
	BScrollBar(const char* name, BView* target, float min, float max, orientation orientation);
	BScrollBar(BMessage* archive);
	virtual ~BScrollBar();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void AllAttached() override;
	void AllDetached() override;
	void AttachedToWindow() override;
	void DetachedFromWindow() override;
	void Draw(BRect updateRect) override;
	void FrameMoved(BPoint newPosition) override;
	void FrameResized(float newWidth, float newHeight) override;
	void MessageReceived(BMessage* message) override;
	void MouseDown(BPoint where) override;
	void MouseUp(BPoint where) override;
	void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage) override;
	void WindowActivated(bool active) override;
	void GetPreferredSize(float* _width, float* _height) override;
	void ResizeToPreferred() override;
	void MakeFocus(bool focus = true) override;

	/// Rounded and kept in the range. Calls ValueChanged() when it is another one.
	void SetValue(float value);
	float Value() const;
	/// The visible part of the whole, from 0 to 1: the thumb's share of the bar. 0: a small thumb.
	void SetProportion(float proportion);
	float Proportion() const;
	/// Scrolls the target to \a newValue.
	virtual void ValueChanged(float newValue);
	/// Rounded; the value is kept in it. A maximum below the minimum becomes the minimum.
	void SetRange(float min, float max);
	void GetRange(float* _min, float* _max) const;
	/// Of the arrows, and of a click beside the thumb; 1 and 10 to begin with.
	void SetSteps(float smallStep, float largeStep);
	void GetSteps(float* _smallStep, float* _largeStep) const;

	/// Null for none. The bar before that the target had in this direction gives it up.
	void SetTarget(BView* target);
	/// A view of the bar's window; looked for when the bar gets into one.
	void SetTarget(const char* targetName);
	BView* Target() const;

	/// Swaps width and height, too, when it is another one.
	void SetOrientation(orientation direction);
	orientation Orientation() const;

private:
	enum Part { kNoPart, kArrowBack, kPageBack, kThumb, kPageForward, kArrowForward };

	friend class BScrollView;

	class Link;

	void Connect(BView* target);
	void Disconnect();
	void FindNamedTarget();

	// Geometry along the bar
	bool IsVertical() const;
	float Along(BPoint where) const;
	BRect Piece(float from, float to) const;
	float ArrowLength() const;
	bool HasThumb() const;
	void GetThumb(float* from, float* to) const;
	float ThumbLength() const;
	float ValueForThumb(float from) const;
	BRect PartFrame(Part part) const;
	Part PartAt(BPoint where) const;
	bool IsEnabled() const;

	// Picture
	void DrawArrow(Part part);
	void DrawTrack();
	void DrawThumb();

	// Input
	void StepBy(Part part);
	void Repeat();
	void StartRepeat(bigtime_t delay);
	void StopTracking();
	void DragThumb(BPoint where);
	bool TurnWheel(float delta);

	std::unique_ptr<Link> fLink;
	std::unique_ptr<BMessageRunner> fRepeat;
	BView* fTarget;
	BString fTargetName;
	float fMin;
	float fMax;
	float fValue;
	float fProportion;
	float fSmallStep;
	float fLargeStep;
	float fWheelRest;
	float fDragOffset;
	BPoint fPointer;
	orientation fOrientation;
	Part fPressed;
};

#endif // _SCROLL_BAR_H
