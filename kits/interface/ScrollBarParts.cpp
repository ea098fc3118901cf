// SPDX-License-Identifier: MIT
// BScrollBar: its parts, their picture, and how they are worked.
#include <ScrollBar.h>

#include <algorithm>
#include <cmath>

#include <Message.h>
#include <MessageRunner.h>
#include <Messenger.h>
#include <Window.h>

#include "ArrowLook.h"
#include "ControlLook.h"

namespace {

constexpr uint32 kMsgRepeat = '_RPT';
constexpr bigtime_t kFirstRepeat = 300000;
constexpr bigtime_t kNextRepeat = 40000;

// How many small steps a notch of the wheel goes.
constexpr float kWheelSteps = 3;

constexpr float kArrowSize = 4;


rgb_color
EdgeColor(bool enabled)
{
	const rgb_color panel = ui_color(B_PANEL_BACKGROUND_COLOR);
	const rgb_color edge = tint_color(ui_color(B_CONTROL_BORDER_COLOR), B_DARKEN_1_TINT);
	return BPrivate::StrengthOf(enabled, edge, panel);
}


rgb_color
TrackColor(bool enabled)
{
	const rgb_color panel = ui_color(B_PANEL_BACKGROUND_COLOR);
	return enabled ? tint_color(panel, 1.1f) : panel;
}


rgb_color
SurfaceColor(bool pressed)
{
	const rgb_color thumb = ui_color(B_SCROLL_BAR_THUMB_COLOR);
	return tint_color(thumb, pressed ? B_DARKEN_1_TINT : 0.6f);
}


// A held thumb must not look like the track.
rgb_color
ThumbColor(bool pressed)
{
	const rgb_color surface = SurfaceColor(false);
	return pressed ? BPrivate::BlendColors(surface, ui_color(B_CONTROL_HIGHLIGHT_COLOR), 0.4f)
				   : surface;
}

} // namespace


void
BScrollBar::Draw(BRect)
{
	DrawTrack();
	DrawArrow(kArrowBack);
	DrawArrow(kArrowForward);
	DrawThumb();
	SetHighColor(EdgeColor(IsEnabled()));
	StrokeRect(Bounds());
}


void
BScrollBar::DrawTrack()
{
	const BRect bounds = Bounds();
	SetHighColor(TrackColor(IsEnabled()));
	FillRect(bounds);
	if (fPressed != kPageBack && fPressed != kPageForward)
		return;
	const BRect pressed = PartFrame(fPressed);
	if (!pressed.IsValid())
		return;
	SetHighColor(tint_color(TrackColor(true), B_DARKEN_1_TINT));
	FillRect(pressed);
}


void
BScrollBar::DrawArrow(Part part)
{
	const BRect frame = PartFrame(part);
	if (!frame.IsValid())
		return;
	const bool pressed = fPressed == part && PartAt(fPointer) == part;
	SetHighColor(IsEnabled() ? SurfaceColor(pressed) : ui_color(B_PANEL_BACKGROUND_COLOR));
	FillRect(frame);

	// A line towards the track; the outline goes around the rest, and over its ends.
	SetHighColor(EdgeColor(IsEnabled()));
	const bool back = part == kArrowBack;
	if (IsVertical()) {
		const float y = back ? frame.bottom : frame.top;
		StrokeLine(BPoint(frame.left - 1, y), BPoint(frame.right + 1, y));
	} else {
		const float x = back ? frame.right : frame.left;
		StrokeLine(BPoint(x, frame.top - 1), BPoint(x, frame.bottom + 1));
	}

	using BPrivate::ArrowDirection;
	const ArrowDirection direction = IsVertical()
		? (back ? ArrowDirection::kUp : ArrowDirection::kDown)
		: (back ? ArrowDirection::kLeft : ArrowDirection::kRight);
	const float room = std::floor((std::min(frame.Width(), frame.Height()) - 4) / 2);
	if (room < 1)
		return;
	const rgb_color panel = ui_color(B_PANEL_BACKGROUND_COLOR);
	const rgb_color color = BPrivate::ControlTextColor(true, panel);
	BPrivate::DrawArrowHead(this, frame, direction, std::min(kArrowSize, room),
		BPrivate::BlendColors(panel, color, IsEnabled() ? 0.75f : 0.25f));
}


void
BScrollBar::DrawThumb()
{
	if (!HasThumb())
		return;
	// Its edges lie on the track's ends, and on the outline at its sides.
	BRect frame = PartFrame(kThumb);
	if (IsVertical())
		frame.InsetBy(-1, 0);
	else
		frame.InsetBy(0, -1);
	const rgb_color surface = ThumbColor(fPressed == kThumb);
	SetHighColor(surface);
	FillRect(frame);
	SetHighColor(tint_color(EdgeColor(true), B_DARKEN_1_TINT));
	StrokeRect(frame);

	// Three lines across, where there is room for them.
	const float length = IsVertical() ? frame.Height() : frame.Width();
	if (length < 16)
		return;
	const BPoint middle(
		std::floor((frame.left + frame.right) / 2), std::floor((frame.top + frame.bottom) / 2));
	SetHighColor(tint_color(surface, B_DARKEN_2_TINT));
	for (float offset = -3; offset <= 3; offset += 3) {
		if (IsVertical()) {
			StrokeLine(BPoint(frame.left + 4, middle.y + offset),
				BPoint(frame.right - 4, middle.y + offset));
		} else {
			StrokeLine(BPoint(middle.x + offset, frame.top + 4),
				BPoint(middle.x + offset, frame.bottom - 4));
		}
	}
}


void
BScrollBar::MessageReceived(BMessage* message)
{
	switch (message->what) {
		case kMsgRepeat:
			Repeat();
			break;

		case B_MOUSE_WHEEL_CHANGED:
		{
			float delta = message->GetFloat("be:wheel_delta_y", 0);
			// Most wheels turn one way only: over a horizontal bar that way is meant.
			const float sideways = message->GetFloat("be:wheel_delta_x", 0);
			if (!IsVertical() && sideways != 0)
				delta = sideways;
			if (!TurnWheel(delta))
				BView::MessageReceived(message);
			break;
		}

		default:
			BView::MessageReceived(message);
			break;
	}
}


void
BScrollBar::MouseDown(BPoint where)
{
	if (!IsEnabled() || fPressed != kNoPart)
		return;
	const BMessage* message = Window()->CurrentMessage();
	const int32 buttons =
		message != NULL ? message->GetInt32("buttons", 0) : int32(B_PRIMARY_MOUSE_BUTTON);

	Part part = PartAt(where);
	if (part == kNoPart)
		return;
	SetMouseEventMask(B_POINTER_EVENTS, B_NO_POINTER_HISTORY | B_SUSPEND_VIEW_FOCUS);
	fPointer = where;
	if (buttons == B_TERTIARY_MOUSE_BUTTON && HasThumb() && part != kArrowBack
		&& part != kArrowForward) {
		// The thumb comes under the pointer.
		fDragOffset = std::floor(ThumbLength() / 2);
		fPressed = kThumb;
		DragThumb(where);
		return;
	}

	fPressed = part;
	Invalidate();
	if (part == kThumb) {
		float from, to;
		GetThumb(&from, &to);
		fDragOffset = Along(where) - from;
		return;
	}
	StartRepeat(kFirstRepeat);
	// What is scrolled may take the bar away: nothing comes after it.
	StepBy(part);
}


void
BScrollBar::MouseMoved(BPoint where, uint32, const BMessage*)
{
	if (fPressed == kNoPart)
		return;
	const bool wasInside = PartAt(fPointer) == fPressed;
	fPointer = where;
	if (fPressed == kThumb)
		DragThumb(where);
	else if ((PartAt(where) == fPressed) != wasInside)
		Invalidate();
}


void
BScrollBar::MouseUp(BPoint)
{
	StopTracking();
}


void
BScrollBar::StepBy(Part part)
{
	switch (part) {
		case kArrowBack:
			SetValue(fValue - fSmallStep);
			break;
		case kArrowForward:
			SetValue(fValue + fSmallStep);
			break;
		case kPageBack:
			SetValue(fValue - fLargeStep);
			break;
		case kPageForward:
			SetValue(fValue + fLargeStep);
			break;
		default:
			break;
	}
}


// A page click goes on until the thumb has reached the pointer; an arrow waits while the pointer is elsewhere.
void
BScrollBar::Repeat()
{
	if (fPressed == kNoPart || fPressed == kThumb)
		return;
	StartRepeat(kNextRepeat);
	if (PartAt(fPointer) == fPressed)
		StepBy(fPressed);
}


void
BScrollBar::StartRepeat(bigtime_t delay)
{
	fRepeat = std::make_unique<BMessageRunner>(BMessenger(this), BMessage(kMsgRepeat), delay, 1);
}


void
BScrollBar::StopTracking()
{
	fRepeat.reset();
	if (fPressed == kNoPart)
		return;
	fPressed = kNoPart;
	if (Window() != NULL)
		Invalidate();
}


void
BScrollBar::DragThumb(BPoint where)
{
	SetValue(ValueForThumb(Along(where) - fDragOffset));
}


// Fractions of a step add up: fine wheels send many small turns. False when there is nothing to scroll.
bool
BScrollBar::TurnWheel(float delta)
{
	if (delta == 0 || !IsEnabled())
		return false;
	const float turned = delta * fSmallStep * kWheelSteps + fWheelRest;
	const float whole = std::trunc(turned);
	fWheelRest = turned - whole;
	if (whole != 0)
		SetValue(fValue + whole);
	return true;
}


float
BScrollBar::Along(BPoint where) const
{
	const BRect bounds = Bounds();
	return IsVertical() ? where.y - bounds.top : where.x - bounds.left;
}


// From one distance along the bar up to another, without the outline at the sides.
BRect
BScrollBar::Piece(float from, float to) const
{
	const BRect bounds = Bounds();
	if (IsVertical())
		return BRect(bounds.left + 1, bounds.top + from, bounds.right - 1, bounds.top + to - 1);
	return BRect(bounds.left + from, bounds.top + 1, bounds.left + to - 1, bounds.bottom - 1);
}


// Square, while the bar is long enough.
float
BScrollBar::ArrowLength() const
{
	const BRect bounds = Bounds();
	const float length = IsVertical() ? bounds.Height() + 1 : bounds.Width() + 1;
	const float across = IsVertical() ? bounds.Width() + 1 : bounds.Height() + 1;
	return std::max(std::min(across, std::floor(length / 2)), 0.0f);
}


float
BScrollBar::ThumbLength() const
{
	scroll_bar_info info = {};
	get_scroll_bar_info(&info);
	const BRect bounds = Bounds();
	// The thumb's edges lie on the lines of the arrows.
	const float track =
		(IsVertical() ? bounds.Height() : bounds.Width()) + 1 - 2 * ArrowLength() + 2;
	const float smallest = static_cast<float>(info.min_knob_size);
	if (track < smallest)
		return 0;
	const float share = info.proportional ? std::round(track * fProportion) : 0;
	return std::clamp(share, smallest, track);
}


bool
BScrollBar::HasThumb() const
{
	return IsEnabled() && ThumbLength() > 0;
}


void
BScrollBar::GetThumb(float* from, float* to) const
{
	const BRect bounds = Bounds();
	const float length = ThumbLength();
	const float start = ArrowLength() - 1;
	const float room = (IsVertical() ? bounds.Height() : bounds.Width()) + 1 - 2 * start - length;
	const float share = IsEnabled() ? (fValue - fMin) / (fMax - fMin) : 0;
	*from = start + std::round(room * share);
	*to = *from + length;
}


float
BScrollBar::ValueForThumb(float from) const
{
	const BRect bounds = Bounds();
	const float start = ArrowLength() - 1;
	const float room =
		(IsVertical() ? bounds.Height() : bounds.Width()) + 1 - 2 * start - ThumbLength();
	if (room <= 0)
		return fMin;
	return fMin + std::clamp((from - start) / room, 0.0f, 1.0f) * (fMax - fMin);
}


// An invalid rectangle for what is not there.
BRect
BScrollBar::PartFrame(Part part) const
{
	const BRect bounds = Bounds();
	const float length = (IsVertical() ? bounds.Height() : bounds.Width()) + 1;
	const float arrow = ArrowLength();
	if (part == kArrowBack)
		return Piece(0, arrow);
	if (part == kArrowForward)
		return Piece(length - arrow, length);
	if (!HasThumb())
		return BRect();

	float from, to;
	GetThumb(&from, &to);
	switch (part) {
		case kPageBack:
			return Piece(arrow, from);
		case kThumb:
			return Piece(from, to);
		case kPageForward:
			return Piece(to, length - arrow);
		default:
			return BRect();
	}
}


BScrollBar::Part
BScrollBar::PartAt(BPoint where) const
{
	const BRect bounds = Bounds();
	if (!bounds.Contains(where))
		return kNoPart;
	const float place = Along(where);
	const float length = (IsVertical() ? bounds.Height() : bounds.Width()) + 1;
	const float arrow = ArrowLength();
	if (place < arrow)
		return kArrowBack;
	if (place >= length - arrow)
		return kArrowForward;
	if (!HasThumb())
		return kNoPart;

	float from, to;
	GetThumb(&from, &to);
	if (place < from)
		return kPageBack;
	return place < to ? kThumb : kPageForward;
}
