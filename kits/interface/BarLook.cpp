// SPDX-License-Identifier: MIT

#include "BarLook.h"

#include <cmath>

#include <Region.h>
#include <View.h>

namespace BPrivate {

namespace {

constexpr float kThumbRadius = 3;
constexpr float kTabRadius = 3;

} // namespace


void
DrawBar(BView* view, BRect frame, rgb_color color, BRect filled, rgb_color fillColor)
{
	view->SetHighColor(color);
	view->FillRect(frame);
	if (filled.IsValid()) {
		view->SetHighColor(fillColor);
		view->FillRect(filled);
	}
	const rgb_color panel = view->ViewColor();
	const rgb_color contrast = panel.IsDark() ? make_color(255, 255, 255) : make_color(0, 0, 0);
	view->SetHighColor(BlendColors(panel, contrast, 0.38f));
	view->StrokeRect(frame);
}


void
DrawBlockThumb(BView* view, BRect frame, orientation direction, ControlState state)
{
	view->SetHighColor(ButtonSurfaceColor(state));
	view->FillRoundRect(frame, kThumbRadius, kThumbRadius);
	view->SetHighColor(ControlBorderColor(state));
	view->StrokeRoundRect(frame, kThumbRadius, kThumbRadius);

	// A notch across tells where the value is.
	const float x = std::floor((frame.left + frame.right) / 2);
	const float y = std::floor((frame.top + frame.bottom) / 2);
	view->SetHighColor(BlendColors(ButtonSurfaceColor(state), ControlBorderColor(state), 0.5f));
	if (direction == B_HORIZONTAL)
		view->StrokeLine(BPoint(x, frame.top + 4), BPoint(x, frame.bottom - 4));
	else
		view->StrokeLine(BPoint(frame.left + 4, y), BPoint(frame.right - 4, y));
}


void
DrawTriangleThumb(BView* view, BRect frame, orientation direction, ControlState state)
{
	const BPoint tip = direction == B_HORIZONTAL
		? BPoint(std::floor((frame.left + frame.right) / 2), frame.top)
		: BPoint(frame.left, std::floor((frame.top + frame.bottom) / 2));
	const BPoint second = direction == B_HORIZONTAL ? frame.LeftBottom() : frame.RightTop();
	view->SetHighColor(ButtonSurfaceColor(state));
	view->FillTriangle(tip, second, frame.RightBottom());
	view->SetHighColor(ControlBorderColor(state));
	view->StrokeTriangle(tip, second, frame.RightBottom());
}


rgb_color
TabColor(const BView* view, bool selected, bool enabled)
{
	const rgb_color panel = view->ViewColor();
	if (selected)
		return panel;
	return BlendColors(panel, tint_color(panel, B_DARKEN_1_TINT), enabled ? 0.75f : 0.35f);
}


rgb_color
TabBorderColor(const BView* view)
{
	return tint_color(view->ViewColor(), B_DARKEN_3_TINT);
}


void
DrawTabSurface(BView* view, BRect frame, BTabView::tab_side side, bool selected, bool enabled)
{
	// The corners at the box are square: they are cut off with what reaches below its border. The line
	// that the tab shares with the box is the box's.
	BRect shape = frame;
	BRect shown = frame;
	const float hidden = kTabRadius + 1;
	switch (side) {
		case BTabView::kBottomSide:
			shape.top -= hidden;
			shown.top++;
			break;
		case BTabView::kLeftSide:
			shape.right += hidden;
			shown.right--;
			break;
		case BTabView::kRightSide:
			shape.left -= hidden;
			shown.left++;
			break;
		default:
			shape.bottom += hidden;
			shown.bottom--;
			break;
	}

	view->PushState();
	BRegion visible(shown);
	view->ConstrainClippingRegion(&visible);
	view->SetHighColor(TabColor(view, selected, enabled));
	view->FillRoundRect(shape, kTabRadius, kTabRadius);
	view->SetHighColor(TabBorderColor(view));
	view->StrokeRoundRect(shape, kTabRadius, kTabRadius);
	view->PopState();
}


void
DrawArrow(BView* view, BRect frame, int32 dx, int32 dy, bool enabled)
{
	const BPoint middle(
		std::floor((frame.left + frame.right) / 2), std::floor((frame.top + frame.bottom) / 2));
	const BPoint tip(middle.x + 2 * dx, middle.y + 2 * dy);
	const BPoint one(middle.x - 2 * dx + 4 * dy, middle.y - 2 * dy + 4 * dx);
	const BPoint other(middle.x - 2 * dx - 4 * dy, middle.y - 2 * dy - 4 * dx);
	view->SetHighColor(ControlTextColor(enabled, view->ViewColor()));
	view->SetPenSize(2);
	view->StrokeLine(one, tip);
	view->StrokeLine(tip, other);
	view->SetPenSize(1);
}


float
TextLineHeight(const BView* view)
{
	font_height height;
	view->GetFontHeight(&height);
	return std::ceil(height.ascent) + std::ceil(height.descent) + 4;
}

} // namespace BPrivate
