// SPDX-License-Identifier: MIT
// Colours as text.

#include "model/ColorText.h"

#include <cstdio>
#include <cstdlib>
#include <cstring>


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

	char numbers[1024];
	size_t length = strnlen(text, sizeof(numbers) - 1);
	memcpy(numbers, text, length);
	while (length > 0 && numbers[length - 1] == ' ')
		length--;
	while (length > 0 && numbers[length - 1] == '}')
		length--;
	numbers[length] = '\0';

	uint8* const channels[] = {&color->red, &color->green, &color->blue, &color->alpha};
	const char* token = numbers;
	for (uint8* channel : channels) {
		while (*token == ',')
			token++;
		if (*token == '\0')
			break;
		*channel = static_cast<uint8>(strtol(token, nullptr, 10));
		while (*token != ',' && *token != '\0')
			token++;
	}
	return *color;
}
