// SPDX-License-Identifier: MIT
// Colours as text.

#include "model/ColorText.h"

#include <algorithm>
#include <cstdio>
#include <cstring>

namespace {

/// No more of a text is looked at, in bytes.
constexpr size_t kMaxLength = 1023;


bool
IsBlank(char c)
{
	return c == ' ' || (c >= '\t' && c <= '\r');
}


/// The low byte of the number that [text, end) begins with; 0 when it begins with none. \a text is moved behind it.
///
/// The same as strtol() would give, which takes several times as long: each view of a form has its
/// colours parsed twice while the form is loaded.
uint8
TakeChannelValue(const char*& text, const char* end)
{
	// So many digits make no number that is too large.
	constexpr int kFewDigits = 9;
	uint32 few = 0;
	const char* const start = text;
	const char* const fewEnd = end - text > kFewDigits ? text + kFewDigits : end;
	for (; text < fewEnd && *text >= '0' && *text <= '9'; text++)
		few = few * 10 + (*text - '0');
	if (text > start && (text < fewEnd || text == end))
		return static_cast<uint8>(few);

	text = std::find_if_not(start, end, IsBlank);
	const bool isNegative = text < end && *text == '-';
	if (text < end && (*text == '-' || *text == '+'))
		text++;

	int64 value = 0;
	for (; text < end && *text >= '0' && *text <= '9'; text++) {
		const int digit = *text - '0';
		if (__builtin_mul_overflow(value, 10, &value)
			|| __builtin_add_overflow(value, isNegative ? -digit : digit, &value))
			return isNegative ? 0 : 255;
	}
	return static_cast<uint8>(value);
}

} // namespace


char*
RGBColorToStr(rgb_color color, char* buffer)
{
	if (buffer != nullptr) {
		snprintf(buffer, kColorTextSize, "{%d,%d,%d,%d}", color.red, color.green, color.blue,
			color.alpha);
	}
	return buffer;
}


rgb_color
StrToRGBColor(const char* text, rgb_color* color)
{
	if (color == nullptr)
		return rgb_color{0, 0, 0, 0};
	if (text == nullptr)
		return *color;

	while (*text == ' ')
		text++;
	while (*text == '{')
		text++;

	const char* end = text + strnlen(text, kMaxLength);
	while (end > text && end[-1] == ' ')
		end--;
	while (end > text && end[-1] == '}')
		end--;

	uint8* const channels[] = {&color->red, &color->green, &color->blue, &color->alpha};
	for (uint8* channel : channels) {
		while (text < end && *text == ',')
			text++;
		if (text == end)
			break;
		*channel = TakeChannelValue(text, end);
		text = std::find(text, end, ',');
	}
	return *color;
}
