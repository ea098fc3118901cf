// SPDX-License-Identifier: MIT
// The look of controls in the window's own pixels.

#include "ControlLook.h"

#include <algorithm>
#include <cmath>

#include <InterfaceDefs.h>
#include <String.h>
#include <View.h>
#include <Window.h>

namespace BPrivate {

namespace {

constexpr float kButtonRadius = 3;
constexpr float kDisabledStrength = 0.45f;

// The side of a mark's square, right minus left, and the space between the mark and its label.
constexpr float kMarkSize = 12;
constexpr float kMarkGap = 6;

void
StrokeRoundFrame(BView* view, BRect frame, float radius, rgb_color color)
{
	view->SetHighColor(color);
	view->StrokeRoundRect(frame, radius, radius);
}


/// Two lines around \a surface, made of fills below the outer one, so that no scale leaves a gap between them.
void
DrawDoubleRoundFrame(
	BView* view, BRect frame, float radius, rgb_color outer, rgb_color inner, rgb_color surface)
{
	view->SetHighColor(inner);
	view->FillRoundRect(frame, radius, radius);
	view->SetHighColor(surface);
	view->FillRoundRect(frame.InsetByCopy(2, 2), radius - 2, radius - 2);
	StrokeRoundFrame(view, frame, radius, outer);
}


rgb_color
MarkColor(ControlState state)
{
	return StrengthOf(state.enabled, ui_color(B_CONTROL_MARK_COLOR), FieldColor(state));
}

} // namespace


rgb_color
BlendColors(rgb_color under, rgb_color over, float amount)
{
	const auto blend = [amount](uint8 from, uint8 to) {
		return static_cast<uint8>(std::lround(from + (to - from) * std::clamp(amount, 0.0f, 1.0f)));
	};
	rgb_color color;
	color.red = blend(under.red, over.red);
	color.green = blend(under.green, over.green);
	color.blue = blend(under.blue, over.blue);
	color.alpha = 255;
	return color;
}


rgb_color
StrengthOf(bool enabled, rgb_color color, rgb_color background)
{
	return enabled ? color : BlendColors(background, color, kDisabledStrength);
}


rgb_color
ControlTextColor(bool enabled, rgb_color background)
{
	rgb_color text = ui_color(B_PANEL_TEXT_COLOR);
	// On a background of its own kind the system's text could not be read.
	if (text.IsDark() == background.IsDark())
		text = background.IsDark() ? make_color(255, 255, 255) : make_color(0, 0, 0);
	return StrengthOf(enabled, text, background);
}


rgb_color
ButtonSurfaceColor(ControlState state)
{
	const rgb_color surface = ui_color(B_CONTROL_BACKGROUND_COLOR);
	if (!state.enabled)
		return BlendColors(
			ui_color(B_PANEL_BACKGROUND_COLOR), tint_color(surface, 0.5f), kDisabledStrength);
	return state.pressed ? tint_color(surface, B_DARKEN_1_TINT) : tint_color(surface, 0.5f);
}


rgb_color
FieldColor(ControlState state)
{
	const rgb_color surface = ui_color(B_DOCUMENT_BACKGROUND_COLOR);
	if (!state.enabled)
		return BlendColors(ui_color(B_PANEL_BACKGROUND_COLOR), surface, kDisabledStrength);
	return state.pressed ? tint_color(surface, B_DARKEN_1_TINT) : surface;
}


rgb_color
ControlBorderColor(ControlState state)
{
	if (state.enabled && state.focused)
		return ui_color(B_KEYBOARD_NAVIGATION_COLOR);
	const rgb_color border = tint_color(ui_color(B_CONTROL_BORDER_COLOR), B_DARKEN_2_TINT);
	return StrengthOf(state.enabled, border, ui_color(B_PANEL_BACKGROUND_COLOR));
}


void
DrawButtonSurface(BView* view, BRect frame, ControlState state, bool isDefault)
{
	if (isDefault) {
		const rgb_color mark = ControlBorderColor({state.enabled, false, false});
		DrawDoubleRoundFrame(view, view->Bounds(), kButtonRadius + 2, mark,
			BlendColors(view->ViewColor(), mark, 0.35f), view->ViewColor());
	}

	const rgb_color surface = ButtonSurfaceColor(state);
	const rgb_color border = ControlBorderColor(state);
	if (state.enabled && state.focused) {
		DrawDoubleRoundFrame(
			view, frame, kButtonRadius, border, BlendColors(surface, border, 0.5f), surface);
		return;
	}
	view->SetHighColor(surface);
	view->FillRoundRect(frame, kButtonRadius, kButtonRadius);
	StrokeRoundFrame(view, frame, kButtonRadius, border);
}


void
DrawDoubleFrame(BView* view, BRect frame, rgb_color outer, rgb_color inner)
{
	// The inner line is two pixels wide, the outer one covers half of it: no scale leaves a gap between.
	view->SetPenSize(2);
	view->SetHighColor(inner);
	view->StrokeRect(BRect(frame.left, frame.top, frame.right - 1, frame.bottom - 1));
	view->SetPenSize(1);
	view->SetHighColor(outer);
	view->StrokeRect(frame);
}


void
DrawFieldSurface(BView* view, BRect frame, ControlState state)
{
	view->SetHighColor(FieldColor(state));
	view->FillRect(frame);
	view->SetHighColor(ControlBorderColor(state));
	view->StrokeRect(frame);
}


void
DrawRoundField(BView* view, BRect frame, ControlState state, bool on)
{
	view->SetHighColor(FieldColor(state));
	view->FillEllipse(frame);
	view->SetHighColor(ControlBorderColor(state));
	view->StrokeEllipse(frame);
	if (!on)
		return;
	view->SetHighColor(MarkColor(state));
	view->FillEllipse(frame.InsetByCopy(3, 3));
}


void
DrawTick(BView* view, BRect frame, ControlState state, bool partly)
{
	view->SetHighColor(MarkColor(state));
	const float third = std::floor(frame.Width() / 3);
	if (partly) {
		view->FillRect(BRect(
			frame.left + 3, frame.top + third + 1, frame.right - 3, frame.bottom - third - 1));
		return;
	}
	view->SetPenSize(2);
	const BPoint corner(frame.left + third + 1, frame.bottom - 3);
	view->StrokeLine(BPoint(frame.left + 3, frame.bottom - third - 2), corner);
	view->StrokeLine(corner, BPoint(frame.right - 3, frame.top + 3));
	view->SetPenSize(1);
}


BRect
MarkFrame(const BView* view)
{
	const BRect bounds = view->Bounds();
	const float top = bounds.top + std::floor((bounds.Height() - kMarkSize) / 2 + 0.5f);
	return BRect(bounds.left + 1, top, bounds.left + 1 + kMarkSize, top + kMarkSize);
}


void
DrawMarkLabel(BView* view, const char* label, bool enabled)
{
	if (label == nullptr)
		return;

	const BRect mark = MarkFrame(view);
	const float left = mark.right + kMarkGap;
	BString text(label);
	// A fraction of a pixel that is missing cuts nothing.
	if (view->StringWidth(label) > view->Bounds().right - left + 1)
		view->TruncateString(&text, B_TRUNCATE_END, view->Bounds().right - left);

	font_height height;
	view->GetFontHeight(&height);
	const float middle = (mark.top + mark.bottom) / 2;
	view->SetHighColor(ControlTextColor(enabled, view->ViewColor()));
	view->SetDrawingMode(B_OP_OVER);
	view->DrawString(text.String(),
		BPoint(left, std::floor(middle + (height.ascent - height.descent) / 2 + 0.5f)));
	view->SetDrawingMode(B_OP_COPY);
}


void
GetMarkSize(const BView* view, const char* label, float* _width, float* _height)
{
	font_height height;
	view->GetFontHeight(&height);
	const float space = label != nullptr ? kMarkGap + std::ceil(view->StringWidth(label)) : 0;
	if (_width != nullptr)
		*_width = 1 + kMarkSize + space + 1;
	if (_height != nullptr)
		*_height =
			std::max(kMarkSize + 2, std::ceil(height.ascent) + std::ceil(height.descent) + 2);
}


void
AdoptParentColors(BView* view)
{
	rgb_color color = ui_color(B_PANEL_BACKGROUND_COLOR);
	// A parent that paints all itself tells nothing about its colour.
	if (view->Parent() != nullptr && view->Parent()->ViewColor() != B_TRANSPARENT_COLOR)
		color = view->Parent()->ViewColor();
	view->SetViewColor(color);
	view->SetLowColor(color);
}

} // namespace BPrivate
