// SPDX-License-Identifier: MIT

#include "ControlLook.h"

#include <algorithm>

#include <InterfaceDefs.h>
#include <View.h>
#include <Window.h>

namespace BPrivate {

namespace {

constexpr float kButtonRadius = 3;
constexpr float kDisabledStrength = 0.45f;

void
StrokeRoundFrame(BView* view, BRect frame, rgb_color color)
{
	view->SetHighColor(color);
	view->StrokeRoundRect(frame, kButtonRadius, kButtonRadius);
}


rgb_color
BorderColor(ControlState state)
{
	if (state.enabled && state.focused)
		return ui_color(B_KEYBOARD_NAVIGATION_COLOR);
	const rgb_color border = tint_color(ui_color(B_CONTROL_BORDER_COLOR), B_DARKEN_2_TINT);
	const rgb_color panel = ui_color(B_PANEL_BACKGROUND_COLOR);
	return state.enabled ? border : BlendColors(panel, border, kDisabledStrength);
}

} // namespace


rgb_color
BlendColors(rgb_color under, rgb_color over, float amount)
{
	const auto blend = [amount](uint8 from, uint8 to) {
		return static_cast<uint8>(from + (to - from) * std::clamp(amount, 0.0f, 1.0f) + 0.5f);
	};
	rgb_color color;
	color.red = blend(under.red, over.red);
	color.green = blend(under.green, over.green);
	color.blue = blend(under.blue, over.blue);
	color.alpha = 255;
	return color;
}


rgb_color
ControlTextColor(bool enabled, rgb_color background)
{
	const rgb_color text = ui_color(B_PANEL_TEXT_COLOR);
	return enabled ? text : BlendColors(background, text, kDisabledStrength);
}


void
DrawButtonSurface(BView* view, BRect frame, ControlState state, bool isDefault)
{
	const rgb_color outside = view->LowColor();
	const rgb_color panel = ui_color(B_PANEL_BACKGROUND_COLOR);
	view->SetHighColor(outside);
	view->FillRect(view->Bounds());

	if (isDefault) {
		const rgb_color mark =
			BlendColors(outside, BorderColor({state.enabled, false, false}), 0.5f);
		StrokeRoundFrame(view, view->Bounds().InsetByCopy(1, 1), mark);
	}

	rgb_color surface =
		tint_color(ui_color(B_CONTROL_BACKGROUND_COLOR), B_DARKEN_1_TINT / 2 + 0.5f);
	if (!state.enabled)
		surface = BlendColors(panel, surface, kDisabledStrength);
	if (state.pressed)
		surface = tint_color(panel, B_DARKEN_2_TINT);
	view->SetHighColor(surface);
	view->FillRoundRect(frame, kButtonRadius, kButtonRadius);
	StrokeRoundFrame(view, frame, BorderColor(state));
	if (state.enabled && state.focused)
		StrokeRoundFrame(view, frame.InsetByCopy(1, 1), BorderColor(state));
}


void
DrawFieldSurface(BView* view, BRect frame, ControlState state)
{
	rgb_color surface = ui_color(B_DOCUMENT_BACKGROUND_COLOR);
	if (!state.enabled)
		surface = BlendColors(ui_color(B_PANEL_BACKGROUND_COLOR), surface, kDisabledStrength);
	if (state.pressed)
		surface = tint_color(surface, B_DARKEN_1_TINT);
	view->SetHighColor(surface);
	view->FillRect(frame);
	view->SetHighColor(BorderColor(state));
	view->StrokeRect(frame);
}


void
DrawTick(BView* view, BRect frame, ControlState state, bool partly)
{
	const rgb_color mark = ui_color(B_CONTROL_MARK_COLOR);
	view->SetHighColor(
		state.enabled ? mark : BlendColors(view->LowColor(), mark, kDisabledStrength));
	const float third = frame.Width() / 3;
	if (partly) {
		view->FillRect(BRect(
			frame.left + 3, frame.top + third + 1, frame.right - 3, frame.bottom - third - 1));
		return;
	}
	view->SetPenSize(2);
	const BPoint corner(frame.left + third + 1, frame.bottom - 3);
	view->StrokeLine(BPoint(frame.left + 3, frame.bottom - third - 1), corner);
	view->StrokeLine(corner, BPoint(frame.right - 3, frame.top + 3));
	view->SetPenSize(1);
}


void
AdoptParentColors(BView* view)
{
	const rgb_color color = view->Parent() != nullptr ? view->Parent()->ViewColor()
													  : ui_color(B_PANEL_BACKGROUND_COLOR);
	if (color == B_TRANSPARENT_COLOR)
		return;
	view->SetViewColor(color);
	view->SetLowColor(color);
}

} // namespace BPrivate
