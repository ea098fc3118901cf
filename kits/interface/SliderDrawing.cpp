// SPDX-License-Identifier: MIT
// BSlider: where its parts are, and how they are drawn.
#include <Slider.h>

#include <algorithm>
#include <cmath>

#include <Window.h>

#include "BarLook.h"

namespace {

// Between the bar and what is above, below or beside it.
constexpr float kBarMargin = 6;
// The bar's ends lie so far inside, for the half of the thumb that reaches beyond them.
constexpr float kBarInset = 8;
// How far a block thumb reaches over the bar's sides, and half its length.
constexpr float kBlockOverhang = 4;
constexpr float kBlockHalf = 6;
// A triangle thumb's half side, and how far it goes from the middle of the bar.
constexpr float kTriangleHalf = 6;
constexpr float kTriangleOverhang = 6;
constexpr float kTextGap = 8;
constexpr float kShortestBar = 48;

} // namespace


void
BSlider::SetFont(const BFont* font, uint32 mask)
{
	BControl::SetFont(font, mask);
	Redraw();
}


void
BSlider::GetPreferredSize(float* _width, float* _height)
{
	const auto widthOf = [this](const char* text) {
		return text != NULL ? std::ceil(StringWidth(text)) : 0;
	};
	const bool hasUpdateText = UpdateText() != NULL;
	const float label = widthOf(Label());
	const float update = hasUpdateText ? std::ceil(MaxUpdateTextWidth()) : 0;
	const float minimum = widthOf(MinLimitLabel());
	const float maximum = widthOf(MaxLimitLabel());
	const float line = BPrivate::TextLineHeight(this);
	const float across = 2 * kBarMargin + fBarThickness;

	float width, height;
	if (IsHorizontal()) {
		width = std::max({label + update + (label > 0 && update > 0 ? kTextGap : 0),
			minimum + maximum + (minimum > 0 && maximum > 0 ? kTextGap : 0),
			2 * kBarInset + kShortestBar});
		height = across + (HasTitleLine() ? line : 0) + (HasLimitLine() ? line : 0);
	} else {
		width = std::max({label, update, minimum, maximum, across});
		height = TopLines() * line + BottomLines() * line + 2 * kBarInset + kShortestBar;
	}
	if (_width != NULL)
		*_width = width;
	if (_height != NULL)
		*_height = height;
}


void
BSlider::ResizeToPreferred()
{
	// Along the bar a longer slider is no worse.
	float width, height;
	GetPreferredSize(&width, &height);
	if (IsHorizontal())
		width = std::max(width, Bounds().Width());
	else
		height = std::max(height, Bounds().Height());
	ResizeTo(width, height);
}


BRect
BSlider::BarFrame() const
{
	const float line = BPrivate::TextLineHeight(this);
	BRect frame = Bounds();
	if (IsHorizontal()) {
		frame.InsetBy(kBarInset, 0);
		frame.top += kBarMargin + (HasTitleLine() ? line : 0);
		frame.bottom = frame.top + fBarThickness;
		return frame;
	}
	frame.left = std::floor((frame.left + frame.right - fBarThickness) / 2);
	frame.right = frame.left + fBarThickness;
	frame.top += kBarInset + TopLines() * line;
	frame.bottom -= kBarInset + BottomLines() * line;
	return frame;
}


BRect
BSlider::HashMarksFrame() const
{
	BRect frame = BarFrame();
	if (IsHorizontal())
		frame.InsetBy(0, -kBarMargin);
	else
		frame.InsetBy(-kBarMargin, 0);
	return frame;
}


BRect
BSlider::ThumbFrame() const
{
	const BRect bar = BarFrame();
	const BPoint at = ThumbPoint();
	if (fStyle == B_TRIANGLE_THUMB) {
		// The tip touches the bar's middle.
		if (IsHorizontal())
			return BRect(
				at.x - kTriangleHalf, at.y, at.x + kTriangleHalf, bar.bottom + kTriangleOverhang);
		return BRect(
			at.x, at.y - kTriangleHalf, bar.right + kTriangleOverhang, at.y + kTriangleHalf);
	}
	if (IsHorizontal())
		return BRect(at.x - kBlockHalf, bar.top - kBlockOverhang, at.x + kBlockHalf,
			bar.bottom + kBlockOverhang);
	return BRect(bar.left - kBlockOverhang, at.y - kBlockHalf, bar.right + kBlockOverhang,
		at.y + kBlockHalf);
}


int32
BSlider::ValueForPoint(BPoint point) const
{
	const BRect bar = BarFrame();
	const double length = IsHorizontal() ? bar.Width() : bar.Height();
	if (length <= 0)
		return fMinimum;
	const double way = IsHorizontal() ? point.x - bar.left : bar.bottom - point.y;
	const double range = static_cast<double>(fMaximum) - fMinimum;
	const double place = std::clamp(way / length, 0.0, 1.0);
	return static_cast<int32>(std::floor(fMinimum + range * place + 0.5));
}


void
BSlider::Draw(BRect)
{
	DrawSlider();
}


void
BSlider::DrawSlider()
{
	DrawBar();
	DrawHashMarks();
	DrawThumb();
	if (IsFocus() && Window()->IsActive())
		DrawFocusMark();
	DrawText();
}


void
BSlider::DrawBar()
{
	const BRect bar = BarFrame();
	BRect filled;
	rgb_color fillColor;
	if (FillColor(&fillColor)) {
		filled = bar;
		if (IsHorizontal())
			filled.right = ThumbPoint().x;
		else
			filled.top = ThumbPoint().y;
	}
	BPrivate::DrawBar(this, bar, BPrivate::StrengthOf(IsEnabled(), BarColor(), ViewColor()), filled,
		BPrivate::StrengthOf(IsEnabled(), fillColor, ViewColor()));
}


void
BSlider::DrawHashMarks()
{
	const BRect frame = HashMarksFrame();
	const BRect bar = BarFrame();
	const bool before = (fHashMarks & B_HASH_MARKS_TOP) != 0;
	const bool after = (fHashMarks & B_HASH_MARKS_BOTTOM) != 0;
	if (fHashMarkCount <= 0 || (!before && !after))
		return;

	SetHighColor(BPrivate::ControlBorderColor({IsEnabled(), false, false}));
	const float length = IsHorizontal() ? bar.Width() : bar.Height();
	const float gap = fHashMarkCount > 1 ? length / (fHashMarkCount - 1) : 0;
	for (int32 i = 0; i < fHashMarkCount; i++) {
		const float way = std::floor(i * gap + 0.5f);
		if (IsHorizontal()) {
			const float x = bar.left + way;
			if (before)
				StrokeLine(BPoint(x, frame.top), BPoint(x, bar.top - 2));
			if (after)
				StrokeLine(BPoint(x, bar.bottom + 2), BPoint(x, frame.bottom));
		} else {
			const float y = bar.bottom - way;
			if (before)
				StrokeLine(BPoint(frame.left, y), BPoint(bar.left - 2, y));
			if (after)
				StrokeLine(BPoint(bar.right + 2, y), BPoint(frame.right, y));
		}
	}
}


void
BSlider::DrawThumb()
{
	const BPrivate::ControlState state = {IsEnabled(), false, IsTracking()};
	if (fStyle == B_TRIANGLE_THUMB)
		BPrivate::DrawTriangleThumb(this, ThumbFrame(), fOrientation, state);
	else
		BPrivate::DrawBlockThumb(this, ThumbFrame(), fOrientation, state);
}


void
BSlider::DrawFocusMark()
{
	const BPrivate::ControlState state = {IsEnabled(), true, IsTracking()};
	if (fStyle == B_TRIANGLE_THUMB)
		BPrivate::DrawTriangleThumb(this, ThumbFrame(), fOrientation, state);
	else
		BPrivate::DrawBlockThumb(this, ThumbFrame(), fOrientation, state);
}


void
BSlider::DrawText()
{
	SetHighColor(BPrivate::ControlTextColor(IsEnabled(), ViewColor()));
	SetDrawingMode(B_OP_OVER);
	const BRect bounds = Bounds();
	const BRect bar = BarFrame();
	const float line = BPrivate::TextLineHeight(this);
	if (IsHorizontal()) {
		const char* update = UpdateText();
		const float updateWidth = update != NULL ? StringWidth(update) + kTextGap : 0;
		BString label(Label());
		// A fraction of a pixel that is missing cuts nothing.
		TruncateString(&label, B_TRUNCATE_END, std::max(bounds.Width() - updateWidth, 0.0f) + 1);
		DrawTextIn(bounds.top, B_ALIGN_LEFT, label.String());
		DrawTextIn(bounds.top, B_ALIGN_RIGHT, UpdateText());
		DrawTextIn(bar.bottom + kBarMargin, B_ALIGN_LEFT, MinLimitLabel());
		DrawTextIn(bar.bottom + kBarMargin, B_ALIGN_RIGHT, MaxLimitLabel());
	} else {
		DrawTextIn(bounds.top, B_ALIGN_CENTER, Label());
		DrawTextIn(bar.top - kBarInset - line, B_ALIGN_CENTER, MaxLimitLabel());
		DrawTextIn(bar.bottom + kBarInset, B_ALIGN_CENTER, MinLimitLabel());
		DrawTextIn(bounds.bottom - line + 1, B_ALIGN_CENTER, UpdateText());
	}
	SetDrawingMode(B_OP_COPY);
}


const char*
BSlider::UpdateText() const
{
	return NULL;
}


void
BSlider::UpdateTextChanged()
{
	Redraw();
}


float
BSlider::MaxUpdateTextWidth()
{
	// The text for a limit is the longest as a rule, and a class may keep one buffer for all.
	const int32 value = Value();
	float width = 0;
	for (int32 limit : {fMinimum, fMaximum}) {
		SetValueNoUpdate(limit);
		const char* text = UpdateText();
		if (text != NULL)
			width = std::max(width, StringWidth(text));
	}
	SetValueNoUpdate(value);
	UpdateText();
	return width;
}


bool
BSlider::IsHorizontal() const
{
	return fOrientation == B_HORIZONTAL;
}


bool
BSlider::HasTitleLine() const
{
	return Label() != NULL || UpdateText() != NULL;
}


bool
BSlider::HasLimitLine() const
{
	return MinLimitLabel() != NULL || MaxLimitLabel() != NULL;
}


/// The lines of text above and below a vertical bar.
int32
BSlider::TopLines() const
{
	return (Label() != NULL ? 1 : 0) + (MaxLimitLabel() != NULL ? 1 : 0);
}


int32
BSlider::BottomLines() const
{
	return (MinLimitLabel() != NULL ? 1 : 0) + (UpdateText() != NULL ? 1 : 0);
}


/// The place of the value on the middle line of the bar, in whole pixels.
BPoint
BSlider::ThumbPoint() const
{
	const BRect bar = BarFrame();
	if (IsHorizontal())
		return BPoint(bar.left + std::floor(Position() * std::max(bar.Width(), 0.0f) + 0.5f),
			std::floor((bar.top + bar.bottom) / 2));
	return BPoint(std::floor((bar.left + bar.right) / 2),
		bar.bottom - std::floor(Position() * std::max(bar.Height(), 0.0f) + 0.5f));
}


/// One text in the line that begins at \a top; nothing for null.
void
BSlider::DrawTextIn(float top, alignment align, const char* text)
{
	if (text == NULL)
		return;
	font_height height;
	GetFontHeight(&height);
	const BRect bounds = Bounds();
	const float space = bounds.Width() - StringWidth(text);
	float left = bounds.left;
	if (align == B_ALIGN_RIGHT)
		left += std::floor(space);
	else if (align == B_ALIGN_CENTER)
		left += std::floor(space / 2);
	DrawString(text, BPoint(left, top + std::ceil(height.ascent)));
}
