// SPDX-License-Identifier: MIT
// BColorControl: where its parts are, and how they are drawn.
#include <ColorControl.h>

#include <algorithm>
#include <cmath>

#include <TextControl.h>
#include <Window.h>

#include "ControlLook.h"

namespace {

constexpr float kBevel = 2;
// Between the palette and the number fields.
constexpr float kFieldGap = 6;
// Between one number field and the next, and above the chosen colour.
constexpr float kLineGap = 4;
constexpr float kSampleHeight = 14;
constexpr float kLabelGap = 6;
constexpr int32 kRampCount = 4;
constexpr float kMarkerRadius = 3;

rgb_color
RampColor(int32 ramp, int32 level)
{
	const uint8 value = static_cast<uint8>(level);
	return make_color(ramp == 0 || ramp == 1 ? value : 0, ramp == 0 || ramp == 2 ? value : 0,
		ramp == 0 || ramp == 3 ? value : 0);
}

} // namespace


void
BColorControl::GetPreferredSize(float* _width, float* _height)
{
	// The control always has the size that it prefers.
	if (_width != NULL)
		*_width = Bounds().Width();
	if (_height != NULL)
		*_height = Bounds().Height();
}


void
BColorControl::ResizeToPreferred()
{
	LayOut();
}


void
BColorControl::SetFont(const BFont* font, uint32 mask)
{
	BControl::SetFont(font, mask);
	for (BTextControl* number : fNumbers) {
		if (number == NULL)
			return;
		number->SetFont(font, mask);
	}
	LayOut();
}


void
BColorControl::Draw(BRect)
{
	BRect bevel(0, 0, PaletteWidth() - 1, PaletteHeight() - 1);
	const bool focused = IsFocus() && Window()->IsActive();
	const rgb_color border = BPrivate::ControlBorderColor({IsEnabled(), false, false});
	const rgb_color focus = ui_color(B_KEYBOARD_NAVIGATION_COLOR);
	if (focused) {
		BPrivate::DrawDoubleFrame(this, bevel, focus, border);
	} else {
		SetHighColor(border);
		StrokeRect(bevel.InsetByCopy(1, 1));
	}
	for (int32 ramp = 0; ramp < kRampCount; ramp++) {
		DrawRamp(ramp);
		DrawMarker(ramp);
	}
	// White inside: one of the two lines is seen on any ramp.
	if (focused)
		BPrivate::DrawDoubleFrame(this, RampFrame(fCurrentRamp), focus, make_color(255, 255, 255));

	SetHighColor(BPrivate::StrengthOf(IsEnabled(), ValueAsColor(), ViewColor()));
	FillRect(fSampleFrame);
	SetHighColor(border);
	StrokeRect(fSampleFrame);
}


/// Places the number fields and the chosen colour, and gives the control its size.
void
BColorControl::LayOut()
{
	float labelWidth = 0;
	for (const BTextControl* number : fNumbers)
		labelWidth = std::max(labelWidth, std::ceil(StringWidth(number->Label())));
	const float divider = labelWidth + kLabelGap;
	const float fieldWidth = divider + std::ceil(StringWidth("0000")) + 8;
	const float left = PaletteWidth() + kFieldGap;

	float bottom = -kLineGap;
	for (BTextControl* number : fNumbers) {
		float height;
		number->GetPreferredSize(NULL, &height);
		number->MoveTo(left, bottom + kLineGap);
		number->ResizeTo(fieldWidth, height);
		number->SetDivider(divider);
		bottom = number->Frame().bottom;
	}

	// The chosen colour takes what is left beside the taller of the two.
	const float width = left + fieldWidth;
	const float paletteBottom = PaletteHeight() - 1;
	float height;
	if (paletteBottom - bottom >= kLineGap + kSampleHeight) {
		height = paletteBottom;
		fSampleFrame.Set(left, bottom + kLineGap, width, height);
	} else {
		height = std::max(bottom, paletteBottom + kLineGap + kSampleHeight);
		fSampleFrame.Set(1, paletteBottom + kLineGap, PaletteWidth() - 2, height);
	}
	ResizeTo(width, height);
	if (Window() != NULL)
		Invalidate();
}


/// Whether the ramps stand beside each other, with 0 at the bottom.
bool
BColorControl::IsUpright() const
{
	return fLayout == B_CELLS_4x64 || fLayout == B_CELLS_8x32;
}


/// In pixels, with the bevel.
float
BColorControl::PaletteWidth() const
{
	return std::floor(static_cast<int32>(fLayout) * fCellSize) + 2 * kBevel;
}


float
BColorControl::PaletteHeight() const
{
	const int32 rows = 256 / std::max(static_cast<int32>(fLayout), 1);
	return std::floor(rows * fCellSize) + 2 * kBevel;
}


BRect
BColorControl::RampFrame(int32 ramp) const
{
	BRect frame(kBevel, kBevel, PaletteWidth() - kBevel - 1, PaletteHeight() - kBevel - 1);
	const float length = (IsUpright() ? frame.Width() : frame.Height()) + 1;
	const float start = std::floor(ramp * length / kRampCount);
	const float end = std::floor((ramp + 1) * length / kRampCount) - 1;
	if (IsUpright()) {
		frame.right = frame.left + end;
		frame.left += start;
	} else {
		frame.bottom = frame.top + end;
		frame.top += start;
	}
	return frame;
}


/// -1 for none.
int32
BColorControl::RampAt(BPoint where) const
{
	for (int32 ramp = 0; ramp < kRampCount; ramp++) {
		if (RampFrame(ramp).Contains(where))
			return ramp;
	}
	return -1;
}


/// The level that \a where means, also beyond the ramp's ends.
int32
BColorControl::LevelAt(int32 ramp, BPoint where) const
{
	const BRect frame = RampFrame(ramp);
	const float way = IsUpright() ? (frame.bottom - where.y) / frame.Height()
								  : (where.x - frame.left) / frame.Width();
	return static_cast<int32>(std::floor(std::clamp(way, 0.0f, 1.0f) * 255 + 0.5f));
}


void
BColorControl::DrawRamp(int32 ramp)
{
	const BRect frame = RampFrame(ramp);
	const float length = IsUpright() ? frame.Height() : frame.Width();
	// Each step reaches to the end, so that no scale leaves a gap between two.
	const float step = std::max(length / 256, 1.0f);
	for (float way = 0; way <= length; way += step) {
		BRect part = frame;
		const int32 level = static_cast<int32>(std::lround(way / length * 255));
		if (IsUpright()) {
			part.bottom = std::floor(frame.bottom - way);
			part.top = std::max(part.bottom - std::ceil(step) - 1, frame.top);
		} else {
			part.left = std::floor(frame.left + way);
			part.right = std::min(part.left + std::ceil(step) + 1, frame.right);
		}
		SetHighColor(BPrivate::StrengthOf(IsEnabled(), RampColor(ramp, level), ViewColor()));
		FillRect(part);
	}
}


/// A ring at the level of the ramp; the grey ramp has one only for a grey.
void
BColorControl::DrawMarker(int32 ramp)
{
	if (!IsEnabled() || (ramp == 0 && (LevelOf(1) != LevelOf(2) || LevelOf(2) != LevelOf(3))))
		return;
	const BRect frame = RampFrame(ramp);
	const float way = LevelOf(ramp) / 255.0f;
	BPoint middle(
		std::floor((frame.left + frame.right) / 2), std::floor((frame.top + frame.bottom) / 2));
	if (IsUpright())
		middle.y = std::clamp(std::floor(frame.bottom - way * frame.Height() + 0.5f),
			frame.top + kMarkerRadius, frame.bottom - kMarkerRadius);
	else
		middle.x = std::clamp(std::floor(frame.left + way * frame.Width() + 0.5f),
			frame.left + kMarkerRadius, frame.right - kMarkerRadius);

	const BRect ring(middle.x - kMarkerRadius, middle.y - kMarkerRadius, middle.x + kMarkerRadius,
		middle.y + kMarkerRadius);
	SetHighColor(make_color(0, 0, 0));
	StrokeEllipse(ring);
	SetHighColor(make_color(255, 255, 255));
	StrokeEllipse(ring.InsetByCopy(1, 1));
}
