// SPDX-License-Identifier: MIT
// The display's fonts: which there are, and what text in them measures.
#ifndef DISPLAY_FONT_ENGINE_H
#define DISPLAY_FONT_ENGINE_H

#include <Font.h>
#include <Rect.h>

class BString;

namespace BPrivate {

/// The fonts that every program can ask for.
enum standard_font { kPlainFont, kBoldFont, kFixedFont };

/// A style of a family.
struct FontStyleInfo {
	font_style name;
	uint16 face;
	bool isFixed;
};


/// What an engine is asked to measure: BFont's values, without a BFont (whose constructor asks the engine).
struct FontKey {
	uint16 family;
	uint16 style;
	float size;
	float shear;
	float rotation;
	uint8 spacing;
	uint16 face;
	uint32 flags;

	static FontKey Of(const BFont& font);
};


/// Families and styles are numbered from 0; numbers stay valid while the program runs. Lengths are in
/// bytes of UTF-8, measures in pixels of the API with fractions. Any thread; no lock is taken that a
/// looper could hold. A number out of range measures as the plain font.
class FontEngine {
public:
	virtual ~FontEngine() = default;

	virtual int32 CountFamilies() = 0;
	/// Returns B_OK; B_BAD_INDEX.
	virtual status_t GetFamily(int32 index, font_family* name) = 0;
	virtual int32 CountStyles(int32 family) = 0;
	virtual status_t GetStyle(int32 family, int32 style, FontStyleInfo* info) = 0;
	/// B_NAME_NOT_FOUND for a name that no family has; the case does not matter.
	int32 FindFamily(const char* name);
	/// The family's style of that name, or B_NAME_NOT_FOUND.
	int32 FindStyle(int32 family, const char* name);
	/// The family's style nearest to \a face (B_BOLD_FACE, B_ITALIC_FACE, ...); never fails for a family that is there.
	int32 FindStyle(int32 family, uint16 face);

	/// The user's fonts; size 12 unless the user wants another.
	virtual void GetStandardFont(
		standard_font which, uint16* family, uint16* style, float* size) = 0;

	virtual font_height Height(const FontKey& font) = 0;
	virtual float StringWidth(const FontKey& font, const char* text, int32 length) = 0;
	/// The advance of each of \a count characters from \a text on, in pixels.
	virtual void GetEscapements(
		const FontKey& font, const char* text, int32 count, float* escapements) = 0;
	/// The ink of each character with its origin at (0, 0), y downwards.
	virtual void GetGlyphBounds(
		const FontKey& font, const char* text, int32 count, BRect* bounds) = 0;

	/// Shortens \a text to \a width pixels with an ellipsis by \a mode (B_TRUNCATE_END, ...). Text that
	/// fits stays; where not even the ellipsis fits the text becomes empty.
	void TruncateString(const FontKey& font, BString* text, uint32 mode, float width);
};

} // namespace BPrivate

#endif // DISPLAY_FONT_ENGINE_H
