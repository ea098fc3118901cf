// SPDX-License-Identifier: MIT
// BScrollBar: what it is told, and what it does to its target.
#include <ScrollBar.h>

#include <algorithm>
#include <cmath>
#include <utility>

#include <Message.h>
#include <MessageRunner.h>
#include <Window.h>

#include "ScrollBarLink.h"

namespace {

constexpr float kStandardRange = 1000;

uint32
FollowMode(orientation direction)
{
	return direction == B_VERTICAL ? B_FOLLOW_RIGHT | B_FOLLOW_TOP_BOTTOM
								   : B_FOLLOW_LEFT_RIGHT | B_FOLLOW_BOTTOM;
}

} // namespace


/// The bar as its target sees it.
class BScrollBar::Link final : public BPrivate::ScrollBarLink {
public:
	explicit Link(BScrollBar* bar)
		: fBar(bar)
	{
	}

	BScrollBar* ScrollBar() override { return fBar; }
	void GetRange(float* minimum, float* maximum) const override
	{
		fBar->GetRange(minimum, maximum);
	}
	void TargetScrolled(float value) override { fBar->SetValue(value); }
	void WheelTurned(float delta) override { fBar->TurnWheel(delta); }
	void TargetGone() override { fBar->fTarget = NULL; }

private:
	BScrollBar* fBar;
};


BScrollBar::BScrollBar(
	BRect frame, const char* name, BView* target, float min, float max, orientation direction)
	: BView(
		frame, name, FollowMode(direction), B_WILL_DRAW | B_FULL_UPDATE_ON_RESIZE | B_FRAME_EVENTS),
	  fLink(std::make_unique<Link>(this)),
	  fTarget(NULL),
	  fMin(0),
	  fMax(0),
	  fValue(0),
	  fProportion(0),
	  fSmallStep(1),
	  fLargeStep(10),
	  fWheelRest(0),
	  fDragOffset(0),
	  fOrientation(direction),
	  fPressed(kNoPart)
{
	SetViewColor(B_TRANSPARENT_COLOR);
	SetRange(min, max);
	SetTarget(target);
}


BScrollBar::BScrollBar(
	const char* name, BView* target, float min, float max, orientation orientation)
	: BScrollBar(BRect(0, 0, B_V_SCROLL_BAR_WIDTH, B_H_SCROLL_BAR_HEIGHT), name, target, min, max,
		orientation)
{
}


BScrollBar::BScrollBar(BMessage* archive)
	: BView(archive),
	  fLink(std::make_unique<Link>(this)),
	  fTarget(NULL),
	  fMin(0),
	  fMax(0),
	  fValue(0),
	  fProportion(archive->GetFloat("_prop", 0)),
	  fSmallStep(archive->GetFloat("_steps", 0, 1)),
	  fLargeStep(archive->GetFloat("_steps", 1, 10)),
	  fWheelRest(0),
	  fDragOffset(0),
	  fOrientation(
		  archive->GetInt32("_orient", B_VERTICAL) == B_HORIZONTAL ? B_HORIZONTAL : B_VERTICAL),
	  fPressed(kNoPart)
{
	SetRange(archive->GetFloat("_range", 0, 0), archive->GetFloat("_range", 1, kStandardRange));
	SetValue(archive->GetFloat("_val", 0));
	SetProportion(fProportion);
	fTargetName = archive->GetString("_target", "");
}


BScrollBar::~BScrollBar()
{
	Disconnect();
}


BArchivable*
BScrollBar::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BScrollBar") ? new BScrollBar(archive) : NULL;
}


status_t
BScrollBar::Archive(BMessage* archive, bool deep) const
{
	status_t status = BView::Archive(archive, deep);
	for (const float limit : {fMin, fMax}) {
		if (status == B_OK)
			status = archive->AddFloat("_range", limit);
	}
	for (const float step : {fSmallStep, fLargeStep}) {
		if (status == B_OK)
			status = archive->AddFloat("_steps", step);
	}
	if (status == B_OK)
		status = archive->AddFloat("_val", fValue);
	if (status == B_OK)
		status = archive->AddInt32("_orient", fOrientation);
	if (status == B_OK)
		status = archive->AddFloat("_prop", fProportion);
	const char* target = fTarget != NULL ? fTarget->Name() : fTargetName.String();
	if (status == B_OK && target != NULL && target[0] != '\0')
		status = archive->AddString("_target", target);
	return status;
}


void
BScrollBar::AllAttached()
{
	// Only now the views that it may be named after are in the window.
	FindNamedTarget();
	BView::AllAttached();
}


void
BScrollBar::AllDetached()
{
	BView::AllDetached();
}


void
BScrollBar::AttachedToWindow()
{
	BView::AttachedToWindow();
}


void
BScrollBar::DetachedFromWindow()
{
	StopTracking();
	BView::DetachedFromWindow();
}


void
BScrollBar::FrameMoved(BPoint newPosition)
{
	BView::FrameMoved(newPosition);
}


void
BScrollBar::FrameResized(float newWidth, float newHeight)
{
	BView::FrameResized(newWidth, newHeight);
}


void
BScrollBar::WindowActivated(bool active)
{
	if (!active)
		StopTracking();
	BView::WindowActivated(active);
}


void
BScrollBar::GetPreferredSize(float* _width, float* _height)
{
	const BRect bounds = Bounds();
	if (_width != NULL)
		*_width = IsVertical() ? B_V_SCROLL_BAR_WIDTH : bounds.Width();
	if (_height != NULL)
		*_height = IsVertical() ? bounds.Height() : B_H_SCROLL_BAR_HEIGHT;
}


void
BScrollBar::ResizeToPreferred()
{
	BView::ResizeToPreferred();
}


void
BScrollBar::MakeFocus(bool focus)
{
	BView::MakeFocus(focus);
}


void
BScrollBar::SetValue(float value)
{
	if (std::isnan(value))
		return;
	value = std::round(std::max(std::min(value, fMax), fMin));
	if (value == fValue)
		return;
	fValue = value;
	if (Window() != NULL)
		Invalidate();
	ValueChanged(value);
}


float
BScrollBar::Value() const
{
	return fValue;
}


void
BScrollBar::SetProportion(float proportion)
{
	if (std::isnan(proportion))
		return;
	proportion = std::clamp(proportion, 0.0f, 1.0f);
	if (proportion == fProportion)
		return;
	fProportion = proportion;
	if (Window() != NULL)
		Invalidate();
}


float
BScrollBar::Proportion() const
{
	return fProportion;
}


void
BScrollBar::ValueChanged(float newValue)
{
	if (fTarget == NULL)
		return;
	BPoint where = fTarget->LeftTop();
	float& place = IsVertical() ? where.y : where.x;
	if (place == newValue)
		return;
	place = newValue;
	fTarget->ScrollTo(where);
}


void
BScrollBar::SetRange(float min, float max)
{
	if (std::isnan(min) || std::isnan(max))
		return;
	min = std::round(min);
	max = std::max(std::round(max), min);
	if (min == fMin && max == fMax)
		return;
	fMin = min;
	fMax = max;
	if (Window() != NULL)
		Invalidate();
	if (fMin == fMax)
		StopTracking();
	SetValue(fValue);
}


void
BScrollBar::GetRange(float* _min, float* _max) const
{
	if (_min != NULL)
		*_min = fMin;
	if (_max != NULL)
		*_max = fMax;
}


void
BScrollBar::SetSteps(float smallStep, float largeStep)
{
	// Less than a pixel would never move on.
	fSmallStep = std::max(std::round(smallStep), 1.0f);
	fLargeStep = std::max(std::round(largeStep), 1.0f);
}


void
BScrollBar::GetSteps(float* _smallStep, float* _largeStep) const
{
	if (_smallStep != NULL)
		*_smallStep = fSmallStep;
	if (_largeStep != NULL)
		*_largeStep = fLargeStep;
}


void
BScrollBar::SetTarget(BView* target)
{
	fTargetName = "";
	if (target == fTarget)
		return;
	Disconnect();
	if (target != NULL)
		Connect(target);
}


void
BScrollBar::SetTarget(const char* targetName)
{
	Disconnect();
	fTargetName = targetName;
	FindNamedTarget();
}


BView*
BScrollBar::Target() const
{
	return fTarget;
}


void
BScrollBar::SetOrientation(orientation direction)
{
	if (direction == fOrientation)
		return;
	BView* target = fTarget;
	Disconnect();
	fOrientation = direction;
	SetResizingMode(FollowMode(direction));
	ResizeTo(Bounds().Height(), Bounds().Width());
	if (target != NULL)
		Connect(target);
	if (Window() != NULL)
		Invalidate();
}


orientation
BScrollBar::Orientation() const
{
	return fOrientation;
}


void
BScrollBar::Connect(BView* target)
{
	if (BScrollBar* other = target->ScrollBar(fOrientation))
		other->Disconnect();
	fTarget = target;
	target->SetScrollBar(fOrientation, fLink.get());
	const BPoint where = target->LeftTop();
	const float place = IsVertical() ? where.y : where.x;
	SetValue(place);
	// A target outside the range comes into it.
	if (place != fValue)
		ValueChanged(fValue);
}


void
BScrollBar::Disconnect()
{
	StopTracking();
	if (fTarget != NULL)
		fTarget->SetScrollBar(fOrientation, NULL);
	fTarget = NULL;
}


void
BScrollBar::FindNamedTarget()
{
	if (fTarget != NULL || fTargetName.IsEmpty() || Window() == NULL)
		return;
	BView* target = Window()->FindView(fTargetName.String());
	if (target != NULL && target != this)
		Connect(target);
}


bool
BScrollBar::IsVertical() const
{
	return fOrientation == B_VERTICAL;
}


bool
BScrollBar::IsEnabled() const
{
	return fMax > fMin;
}
