// SPDX-License-Identifier: MIT

#include <ScrollView.h>

#include <algorithm>
#include <cstring>

#include <Message.h>
#include <Window.h>

#include "ControlLook.h"

namespace {

const char* const kHorizontalName = "_HSB_";
const char* const kVerticalName = "_VSB_";
constexpr float kStandardRange = 1000;

// Without a target.
constexpr float kEmptySize = 16;


float
SizeOf(border_style border)
{
	switch (border) {
		case B_FANCY_BORDER:
			return 2;
		case B_PLAIN_BORDER:
			return 1;
		default:
			return 0;
	}
}


// What a bar adds to the frame: with a border, the bar's outline lies on the border's inner line.
float
BarSize(border_style border)
{
	return B_V_SCROLL_BAR_WIDTH + (border == B_NO_BORDER ? 1 : 0);
}


BRect
FrameAround(const BView* target, border_style border, bool horizontal, bool vertical)
{
	BRect frame = target != NULL ? target->Frame() : BRect(0, 0, kEmptySize, kEmptySize);
	if (vertical)
		frame.right += BarSize(border);
	if (horizontal)
		frame.bottom += BarSize(border);
	frame.InsetBy(-SizeOf(border), -SizeOf(border));
	return frame;
}

} // namespace


BScrollView::BScrollView(const char* name, BView* target, uint32 resizingMode, uint32 flags,
	bool horizontal, bool vertical, border_style border)
	: BView(FrameAround(target, border, horizontal, vertical), name, resizingMode,
		flags | B_WILL_DRAW | B_FRAME_EVENTS | B_DRAW_ON_CHILDREN),
	  fHorizontalBar(NULL),
	  fVerticalBar(NULL),
	  fTarget(NULL),
	  fBorder(border),
	  fHighlighted(false),
	  fDrawnWidth(Bounds().Width()),
	  fDrawnHeight(Bounds().Height())
{
	MakeBars(horizontal, vertical);
	SetTarget(target);
	PlaceChildren();
}


BScrollView::BScrollView(const char* name, BView* target, uint32 flags, bool horizontal,
	bool vertical, border_style border)
	: BScrollView(name, target, B_FOLLOW_LEFT_TOP, flags, horizontal, vertical, border)
{
}


BScrollView::BScrollView(BMessage* archive)
	: BView(archive),
	  fHorizontalBar(NULL),
	  fVerticalBar(NULL),
	  fTarget(NULL),
	  fBorder(B_FANCY_BORDER),
	  fHighlighted(false),
	  fDrawnWidth(Bounds().Width()),
	  fDrawnHeight(Bounds().Height())
{
	const int32 style = archive->GetInt32("_style", B_FANCY_BORDER);
	if (style == B_PLAIN_BORDER || style == B_NO_BORDER)
		fBorder = static_cast<border_style>(style);
	// The bars and the target came with the other views of the archive.
	for (int32 i = 0; i < CountChildren(); i++) {
		BView* child = ChildAt(i);
		BScrollBar* bar = dynamic_cast<BScrollBar*>(child);
		const char* name = child->Name() != NULL ? child->Name() : "";
		if (bar != NULL && strcmp(name, kHorizontalName) == 0)
			fHorizontalBar = bar;
		else if (bar != NULL && strcmp(name, kVerticalName) == 0)
			fVerticalBar = bar;
		else if (fTarget == NULL)
			fTarget = child;
	}
	ConnectTarget();
}


BScrollView::~BScrollView() {}


BArchivable*
BScrollView::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BScrollView") ? new BScrollView(archive) : NULL;
}


status_t
BScrollView::Archive(BMessage* archive, bool deep) const
{
	status_t status = BView::Archive(archive, deep);
	if (status == B_OK)
		status = archive->AddInt32("_style", fBorder);
	return status;
}


void
BScrollView::AllAttached()
{
	BView::AllAttached();
}


void
BScrollView::AllDetached()
{
	BView::AllDetached();
}


void
BScrollView::AttachedToWindow()
{
	BPrivate::AdoptParentColors(this);
	fDrawnWidth = Bounds().Width();
	fDrawnHeight = Bounds().Height();
	BView::AttachedToWindow();
}


void
BScrollView::DetachedFromWindow()
{
	BView::DetachedFromWindow();
}


void
BScrollView::Draw(BRect)
{
	// What the target leaves free is background; children draw the rest.
}


void
BScrollView::DrawAfterChildren(BRect)
{
	if (fBorder == B_NO_BORDER)
		return;
	const BRect bounds = Bounds();
	const rgb_color low = ViewColor();
	rgb_color line = tint_color(ui_color(B_CONTROL_BORDER_COLOR), B_DARKEN_1_TINT);
	const rgb_color focus = ui_color(B_KEYBOARD_NAVIGATION_COLOR);
	if (fBorder == B_PLAIN_BORDER) {
		SetHighColor(fHighlighted ? focus : line);
		StrokeRect(bounds);
		return;
	}
	if (fHighlighted)
		BPrivate::DrawDoubleFrame(this, bounds, focus, BPrivate::BlendColors(low, focus, 0.5f));
	else
		BPrivate::DrawDoubleFrame(this, bounds, BPrivate::BlendColors(low, line, 0.4f), line);
}


void
BScrollView::FrameMoved(BPoint newPosition)
{
	BView::FrameMoved(newPosition);
}


void
BScrollView::FrameResized(float newWidth, float newHeight)
{
	BView::FrameResized(newWidth, newHeight);
	// What lay on the border before, and what lies there now.
	const float border = BorderSize();
	const float right = std::min(fDrawnWidth, newWidth) - border;
	const float bottom = std::min(fDrawnHeight, newHeight) - border;
	fDrawnWidth = newWidth;
	fDrawnHeight = newHeight;
	Invalidate(BRect(right, 0, newWidth, newHeight));
	Invalidate(BRect(0, bottom, newWidth, newHeight));
}


void
BScrollView::MessageReceived(BMessage* message)
{
	if (message->what != B_MOUSE_WHEEL_CHANGED) {
		BView::MessageReceived(message);
		return;
	}

	// Over the border and the corner, and what the target and the bars made no use of.
	const float x = message->GetFloat("be:wheel_delta_x", 0);
	const float y = message->GetFloat("be:wheel_delta_y", 0);
	bool used = false;
	if (y != 0 && fVerticalBar != NULL)
		used = fVerticalBar->TurnWheel(y);
	if (x != 0 && fHorizontalBar != NULL)
		used = fHorizontalBar->TurnWheel(x) || used;
	if (!used)
		BView::MessageReceived(message);
}


void
BScrollView::MouseDown(BPoint where)
{
	BView::MouseDown(where);
}


void
BScrollView::MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage)
{
	BView::MouseMoved(where, code, dragMessage);
}


void
BScrollView::MouseUp(BPoint where)
{
	BView::MouseUp(where);
}


void
BScrollView::WindowActivated(bool active)
{
	BView::WindowActivated(active);
}


void
BScrollView::GetPreferredSize(float* _width, float* _height)
{
	float width = kEmptySize;
	float height = kEmptySize;
	if (fTarget != NULL)
		fTarget->GetPreferredSize(&width, &height);
	if (_width != NULL)
		*_width = width + 2 * BorderSize() + (fVerticalBar != NULL ? BarSize(fBorder) : 0);
	if (_height != NULL)
		*_height = height + 2 * BorderSize() + (fHorizontalBar != NULL ? BarSize(fBorder) : 0);
}


void
BScrollView::ResizeToPreferred()
{
	BView::ResizeToPreferred();
	if (Window() == NULL)
		PlaceChildren();
}


void
BScrollView::MakeFocus(bool focus)
{
	BView::MakeFocus(focus);
}


BScrollBar*
BScrollView::ScrollBar(orientation direction) const
{
	return direction == B_HORIZONTAL ? fHorizontalBar : fVerticalBar;
}


void
BScrollView::SetBorder(border_style border)
{
	if (border == fBorder)
		return;
	fBorder = border;
	if (border == B_NO_BORDER)
		fHighlighted = false;
	PlaceChildren();
	if (Window() != NULL)
		Invalidate();
}


border_style
BScrollView::Border() const
{
	return fBorder;
}


status_t
BScrollView::SetBorderHighlighted(bool highlight)
{
	if (fBorder == B_NO_BORDER)
		return B_ERROR;
	if (highlight == fHighlighted)
		return B_OK;
	fHighlighted = highlight;
	if (Window() != NULL)
		InvalidateBorder();
	return B_OK;
}


bool
BScrollView::IsBorderHighlighted() const
{
	return fHighlighted;
}


void
BScrollView::SetTarget(BView* target)
{
	if (target == fTarget)
		return;

	if (fTarget != NULL) {
		BView* released = fTarget;
		fTarget = NULL;
		for (BScrollBar* bar : {fHorizontalBar, fVerticalBar}) {
			if (bar != NULL)
				bar->SetTarget(static_cast<BView*>(NULL));
		}
		SetBorderHighlighted(false);
		released->TargetedByScrollView(NULL);
		RemoveChild(released);
	}
	if (target == NULL)
		return;

	fTarget = target;
	const BRect frame = TargetFrame();
	target->MoveTo(frame.LeftTop());
	target->ResizeTo(frame.Width(), frame.Height());
	// Before the bars, as the first in keyboard navigation and in lists of children.
	AddChild(target, ChildAt(0));
	ConnectTarget();
}


BView*
BScrollView::Target() const
{
	return fTarget;
}


float
BScrollView::BorderSize() const
{
	return SizeOf(fBorder);
}


BRect
BScrollView::TargetFrame() const
{
	const BRect bounds = Bounds().OffsetToCopy(B_ORIGIN);
	BRect frame = bounds.InsetByCopy(BorderSize(), BorderSize());
	if (fVerticalBar != NULL)
		frame.right -= BarSize(fBorder);
	if (fHorizontalBar != NULL)
		frame.bottom -= BarSize(fBorder);
	return frame;
}


// Bars share a line with the border and, at the corner, with each other.
BRect
BScrollView::BarFrame(orientation direction) const
{
	const BRect target = TargetFrame();
	const float line = fBorder == B_NO_BORDER ? 0 : 1;
	if (direction == B_VERTICAL) {
		return BRect(target.right + 1, target.top - line, target.right + 1 + B_V_SCROLL_BAR_WIDTH,
			target.bottom + (fHorizontalBar != NULL ? 1 : line));
	}
	return BRect(target.left - line, target.bottom + 1,
		target.right + (fVerticalBar != NULL ? 1 : line),
		target.bottom + 1 + B_H_SCROLL_BAR_HEIGHT);
}


void
BScrollView::MakeBars(bool horizontal, bool vertical)
{
	if (horizontal) {
		fHorizontalBar = new BScrollBar(
			BRect(0, 0, 0, 0), kHorizontalName, NULL, 0, kStandardRange, B_HORIZONTAL);
	}
	if (vertical) {
		fVerticalBar =
			new BScrollBar(BRect(0, 0, 0, 0), kVerticalName, NULL, 0, kStandardRange, B_VERTICAL);
	}
	if (fHorizontalBar != NULL)
		AddChild(fHorizontalBar);
	if (fVerticalBar != NULL)
		AddChild(fVerticalBar);
}


void
BScrollView::PlaceChildren()
{
	const auto place = [](BView* view, BRect frame) {
		if (view == NULL)
			return;
		view->MoveTo(frame.LeftTop());
		view->ResizeTo(frame.Width(), frame.Height());
	};
	place(fHorizontalBar, BarFrame(B_HORIZONTAL));
	place(fVerticalBar, BarFrame(B_VERTICAL));
	place(fTarget, TargetFrame());
}


void
BScrollView::ConnectTarget()
{
	if (fTarget == NULL)
		return;
	if (fHorizontalBar != NULL)
		fHorizontalBar->SetTarget(fTarget);
	if (fVerticalBar != NULL)
		fVerticalBar->SetTarget(fTarget);
	fTarget->TargetedByScrollView(this);
}


void
BScrollView::InvalidateBorder()
{
	const BRect bounds = Bounds();
	const float inner = BorderSize() - 1;
	BRect edge = bounds;
	edge.bottom = edge.top + inner;
	Invalidate(edge);
	edge = bounds;
	edge.top = edge.bottom - inner;
	Invalidate(edge);
	edge = bounds;
	edge.right = edge.left + inner;
	Invalidate(edge);
	edge = bounds;
	edge.left = edge.right - inner;
	Invalidate(edge);
}
