// SPDX-License-Identifier: MIT
// Fonts where nothing is drawn: two families whose measures are estimates from the size.
#include "display/NoneFonts.h"

#include <cstring>

#include "display/Utf8.h"

namespace BPrivate {

namespace {

const char* const kFamilies[] = {"Sans", "Mono"};

struct Style {
	const char* name;
	uint16 face;
};

const Style kStyles[] = {{"Regular", B_REGULAR_FACE}, {"Bold", B_BOLD_FACE},
	{"Italic", B_ITALIC_FACE}, {"Bold Italic", B_BOLD_FACE | B_ITALIC_FACE}};

const int32 kFamilyCount = B_COUNT_OF(kFamilies);
const int32 kStyleCount = B_COUNT_OF(kStyles);
const uint16 kMonoFamily = 1;


float
Advance(const FontKey& font, uint32 character)
{
	if (character >= 0x1100)
		return font.size;
	if (font.family == kMonoFamily)
		return 0.6f * font.size;

	float width = 0.55f;
	if (character < 0x80 && character != 0
		&& strchr(" !'(),.:;I[]`fijlrt|", static_cast<char>(character)) != nullptr)
		width = 0.3f;
	else if ((character >= 'A' && character <= 'Z') || character == 'm' || character == 'w')
		width = 0.7f;
	bool isBold = font.style < kStyleCount && (kStyles[font.style].face & B_BOLD_FACE) != 0;
	return width * font.size * (isBold ? 1.1f : 1.0f);
}

} // namespace


int32
NoneFonts::CountFamilies()
{
	return kFamilyCount;
}


status_t
NoneFonts::GetFamily(int32 index, font_family* name)
{
	if (index < 0 || index >= kFamilyCount)
		return B_BAD_INDEX;
	strcpy(*name, kFamilies[index]);
	return B_OK;
}


int32
NoneFonts::CountStyles(int32 family)
{
	return family >= 0 && family < kFamilyCount ? kStyleCount : 0;
}


status_t
NoneFonts::GetStyle(int32 family, int32 style, FontStyleInfo* info)
{
	if (style < 0 || style >= CountStyles(family))
		return B_BAD_INDEX;
	strcpy(info->name, kStyles[style].name);
	info->face = kStyles[style].face;
	info->isFixed = family == kMonoFamily;
	return B_OK;
}


void
NoneFonts::GetStandardFont(standard_font which, uint16* family, uint16* style, float* size)
{
	*family = which == kFixedFont ? kMonoFamily : 0;
	*style = which == kBoldFont ? 1 : 0;
	*size = 12;
}


font_height
NoneFonts::Height(const FontKey& font)
{
	return {0.93f * font.size, 0.24f * font.size, 0};
}


float
NoneFonts::StringWidth(const FontKey& font, const char* text, int32 length)
{
	float width = 0;
	const char* end = text + length;
	while (text < end)
		width += Advance(font, NextCharacter(&text, end));
	return width;
}


void
NoneFonts::GetEscapements(const FontKey& font, const char* text, int32 count, float* escapements)
{
	const char* end = text + strlen(text);
	for (int32 i = 0; i < count; i++)
		escapements[i] = text < end ? Advance(font, NextCharacter(&text, end)) : 0;
}


void
NoneFonts::GetGlyphBounds(const FontKey& font, const char* text, int32 count, BRect* bounds)
{
	const char* end = text + strlen(text);
	for (int32 i = 0; i < count; i++) {
		float width = text < end ? Advance(font, NextCharacter(&text, end)) : 0;
		bounds[i].Set(0, -0.7f * font.size, width - 1, 0);
	}
}

} // namespace BPrivate
