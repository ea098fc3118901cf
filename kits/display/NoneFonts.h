// SPDX-License-Identifier: MIT
// Fonts where nothing is drawn: two families whose measures are estimates from the size.
#ifndef DISPLAY_NONE_FONTS_H
#define DISPLAY_NONE_FONTS_H

#include "display/FontEngine.h"

namespace BPrivate {

/// "Sans" and "Mono", each in Regular, Bold, Italic and Bold Italic.
///
/// With the size s: ascent 0.93 s, descent 0.24 s, leading 0. A character of "Mono" is 0.6 s wide. In
/// "Sans" narrow letters and marks (i, l, comma, ...) and the space are 0.3 s, capitals and m and w
/// 0.7 s, all others 0.55 s; bold adds a tenth. Wide scripts (from U+1100 on) are 1.0 s in both.
class NoneFonts : public FontEngine {
public:
	int32 CountFamilies() override;
	status_t GetFamily(int32 index, font_family* name) override;
	int32 CountStyles(int32 family) override;
	status_t GetStyle(int32 family, int32 style, FontStyleInfo* info) override;
	void GetStandardFont(standard_font which, uint16* family, uint16* style, float* size) override;

	font_height Height(const FontKey& font) override;
	float StringWidth(const FontKey& font, const char* text, int32 length) override;
	void GetEscapements(
		const FontKey& font, const char* text, int32 count, float* escapements) override;
	void GetGlyphBounds(const FontKey& font, const char* text, int32 count, BRect* bounds) override;
};

} // namespace BPrivate

#endif // DISPLAY_NONE_FONTS_H
