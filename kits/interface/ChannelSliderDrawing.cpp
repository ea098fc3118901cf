// SPDX-License-Identifier: MIT
// BChannelSlider: where its parts are, and how they are drawn.
#include <ChannelSlider.h>

#include <algorithm>
#include <cmath>

#include <Window.h>

#include "BarLook.h"

namespace {

constexpr float kBarThickness = 6;
// The bar's ends lie so far inside, for the half of the thumb that reaches beyond them.
constexpr float kBarInset = 8;
// How far a thumb reaches over the bar's sides, and half its length.
constexpr float kThumbOverhang = 4;
constexpr float kThumbHalf = 6;
// From the middle of a bar to that of the next, at least.
constexpr float kLeastDistance = 26;
constexpr float kShortestBar = 48;
constexpr float kLabelGap = 4;

} // namespace


/// The room of the bars with their insets, and the lines of the control's label and of those at the limits.
struct BChannelSlider::Places {
	BRect bars;
	float line;
	bool hasOwnLabels;
};


float
BChannelSlider::WidestLabel(bool ofMaximum) const
{
	float width = 0;
	const auto fit = [&](const char* text) {
		if (text != NULL)
			width = std::max(width, std::ceil(StringWidth(text)));
	};
	fit(ofMaximum ? MaxLimitLabel() : MinLimitLabel());
	for (int32 i = 0; i < CountChannels(); i++)
		fit(ofMaximum ? MaxLimitLabelFor(i) : MinLimitLabelFor(i));
	return width;
}


BChannelSlider::Places
BChannelSlider::PlacesOf() const
{
	Places places = {Bounds(), BPrivate::TextLineHeight(this), false};
	for (int32 i = 0; i < CountChannels(); i++) {
		if (MinLimitLabelFor(i) != NULL || MaxLimitLabelFor(i) != NULL)
			places.hasOwnLabels = true;
	}
	if (Label() != NULL)
		places.bars.top += places.line;
	const float minimum = WidestLabel(false);
	const float maximum = WidestLabel(true);
	if (IsVertical()) {
		places.bars.top += maximum > 0 ? places.line : 0;
		places.bars.bottom -= minimum > 0 ? places.line : 0;
	} else {
		places.bars.left += minimum > 0 ? minimum + kLabelGap : 0;
		places.bars.right -= maximum > 0 ? maximum + kLabelGap : 0;
	}
	return places;
}


void
BChannelSlider::GetPreferredSize(float* _width, float* _height)
{
	const float line = BPrivate::TextLineHeight(this);
	const float label = Label() != NULL ? std::ceil(StringWidth(Label())) : 0;
	const float minimum = WidestLabel(false);
	const float maximum = WidestLabel(true);
	const float count = static_cast<float>(std::max<int32>(CountChannels(), 1));
	const float bar = 2 * kBarInset + kShortestBar;
	float width, height;
	if (IsVertical()) {
		// Each channel's labels have its own column.
		const bool hasOwn = PlacesOf().hasOwnLabels;
		const float column =
			std::max(kLeastDistance, hasOwn ? std::max(minimum, maximum) + kLabelGap : 0);
		width = std::max({label, minimum, maximum, count * column - 1});
		height = bar + (minimum > 0 ? line : 0) + (maximum > 0 ? line : 0);
	} else {
		width = std::max(label,
			bar + (minimum > 0 ? minimum + kLabelGap : 0)
				+ (maximum > 0 ? maximum + kLabelGap : 0));
		height = count * kLeastDistance - 1;
	}
	if (_width != NULL)
		*_width = width;
	if (_height != NULL)
		*_height = height + (Label() != NULL ? line : 0);
}


void
BChannelSlider::SetFont(const BFont* font, uint32 mask)
{
	BChannelControl::SetFont(font, mask);
	if (Window() != NULL)
		Invalidate();
}


BRect
BChannelSlider::BarFrame(int32 channel) const
{
	return BarFrame(PlacesOf(), channel);
}


BRect
BChannelSlider::BarFrame(const Places& places, int32 channel) const
{
	const float count = static_cast<float>(CountChannels());
	const float room = (IsVertical() ? places.bars.Width() : places.bars.Height()) + 1;
	const float middle = (static_cast<float>(channel) + 0.5f) * room / count;
	const float first = std::floor(middle - kBarThickness / 2);
	BRect bar = places.bars;
	if (IsVertical()) {
		bar.InsetBy(0, kBarInset);
		bar.left += first;
		bar.right = bar.left + kBarThickness;
	} else {
		bar.InsetBy(kBarInset, 0);
		bar.top += first;
		bar.bottom = bar.top + kBarThickness;
	}
	return bar;
}


/// The place of the value on the middle line of the bar, in whole pixels.
BPoint
BChannelSlider::ThumbPoint(BRect bar, int32 channel) const
{
	const double minimum = MinLimitList()[channel];
	const double range = MaxLimitList()[channel] - minimum;
	const double position = range > 0 ? (ValueList()[channel] - minimum) / range : 0;
	const double length = std::max(IsVertical() ? bar.Height() : bar.Width(), 0.0f);
	const float way = static_cast<float>(std::floor(position * length + 0.5));
	if (IsVertical())
		return BPoint(std::floor((bar.left + bar.right) / 2), bar.bottom - way);
	return BPoint(bar.left + way, std::floor((bar.top + bar.bottom) / 2));
}


BRect
BChannelSlider::ThumbFrame(BRect bar, int32 channel) const
{
	const BPoint at = ThumbPoint(bar, channel);
	if (IsVertical())
		return BRect(bar.left - kThumbOverhang, at.y - kThumbHalf, bar.right + kThumbOverhang,
			at.y + kThumbHalf);
	return BRect(at.x - kThumbHalf, bar.top - kThumbOverhang, at.x + kThumbHalf,
		bar.bottom + kThumbOverhang);
}


/// The channel in whose part of the bars' room the point is; -1 outside.
int32
BChannelSlider::ChannelAt(BPoint where) const
{
	const BRect bars = PlacesOf().bars;
	const float way = IsVertical() ? where.x - bars.left : where.y - bars.top;
	const float room = (IsVertical() ? bars.Width() : bars.Height()) + 1;
	if (CountChannels() == 0 || !bars.Contains(where))
		return -1;
	const int32 channel =
		static_cast<int32>(std::floor(way * static_cast<float>(CountChannels()) / room));
	return std::clamp<int32>(channel, 0, CountChannels() - 1);
}


int32
BChannelSlider::ValueAt(BPoint where, int32 channel) const
{
	const BRect bar = BarFrame(channel);
	const double minimum = MinLimitList()[channel];
	const double range = MaxLimitList()[channel] - minimum;
	const double length = IsVertical() ? bar.Height() : bar.Width();
	if (length <= 0)
		return MinLimitList()[channel];
	const double way = IsVertical() ? bar.bottom - where.y : where.x - bar.left;
	const double place = std::clamp(way / length, 0.0, 1.0);
	return static_cast<int32>(std::floor(minimum + range * place + 0.5));
}


void
BChannelSlider::Draw(BRect)
{
	const Places places = PlacesOf();
	for (int32 i = 0; i < CountChannels(); i++)
		DrawChannel(places, i);
	SetHighColor(BPrivate::ControlTextColor(IsEnabled(), ViewColor()));
	SetDrawingMode(B_OP_OVER);
	DrawLabels(places);
	SetDrawingMode(B_OP_COPY);
}


void
BChannelSlider::DrawChannel(const Places& places, int32 channel)
{
	const BRect bar = BarFrame(places, channel);
	const rgb_color color = tint_color(ui_color(B_PANEL_BACKGROUND_COLOR), B_DARKEN_1_TINT);
	BPrivate::DrawBar(
		this, bar, BPrivate::StrengthOf(IsEnabled(), color, ViewColor()), BRect(), color);
	const bool isCurrent = channel == CurrentChannel();
	const bool isFocused = isCurrent && IsFocus() && Window()->IsActive();
	const bool isHeld = IsTracking() && (isCurrent || MovesAll());
	BPrivate::DrawBlockThumb(
		this, ThumbFrame(bar, channel), fOrientation, {IsEnabled(), isFocused, isHeld});
}


void
BChannelSlider::DrawLabels(const Places& places)
{
	const BRect bounds = Bounds();
	const BRect bars = places.bars;
	const BPoint middle(
		std::floor((bars.left + bars.right) / 2), std::floor((bars.top + bars.bottom) / 2));
	const float half = places.line / 2;
	if (Label() != NULL)
		DrawLine(Label(), BPoint(std::floor((bounds.left + bounds.right) / 2), bounds.top + half));

	const auto draw = [&](const char* text, bool isMaximum, BPoint at) {
		if (text == NULL)
			return;
		if (IsVertical()) {
			DrawLine(text, BPoint(at.x, isMaximum ? bars.top - half : bars.bottom + half));
			return;
		}
		const float width = std::ceil(StringWidth(text)) / 2;
		DrawLine(text,
			BPoint(
				isMaximum ? bars.right + kLabelGap + width : bars.left - kLabelGap - width, at.y));
	};
	// A control's label would lie on those of its channels.
	if (!places.hasOwnLabels) {
		draw(MinLimitLabel(), false, middle);
		draw(MaxLimitLabel(), true, middle);
		return;
	}
	for (int32 i = 0; i < CountChannels(); i++) {
		const BRect bar = BarFrame(places, i);
		const BPoint at(
			std::floor((bar.left + bar.right) / 2), std::floor((bar.top + bar.bottom) / 2));
		draw(MinLimitLabelFor(i), false, at);
		draw(MaxLimitLabelFor(i), true, at);
	}
}


/// One text around a point.
void
BChannelSlider::DrawLine(const char* text, BPoint middle)
{
	font_height height;
	GetFontHeight(&height);
	const float ascent = std::ceil(height.ascent);
	const float descent = std::ceil(height.descent);
	DrawString(text,
		BPoint(std::floor(middle.x - StringWidth(text) / 2),
			std::floor(middle.y + (ascent - descent) / 2)));
}
