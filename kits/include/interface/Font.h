// SPDX-License-Identifier: MIT
// A font: family and style, size and slant, and what text in it measures.
#ifndef _FONT_H
#define _FONT_H

#include <InterfaceDefs.h>
#include <Rect.h>
#include <SupportDefs.h>

class BString;

#define B_FONT_FAMILY_LENGTH 63
#define B_FONT_STYLE_LENGTH 63

typedef char font_family[B_FONT_FAMILY_LENGTH + 1];
typedef char font_style[B_FONT_STYLE_LENGTH + 1];

enum {
	B_CHAR_SPACING = 0,
	B_STRING_SPACING = 1,
	B_BITMAP_SPACING = 2,
	B_FIXED_SPACING = 3,
};

enum font_direction {
	B_FONT_LEFT_TO_RIGHT = 0,
	B_FONT_RIGHT_TO_LEFT = 1,
};

enum {
	B_DISABLE_ANTIALIASING = 1,
	B_FORCE_ANTIALIASING = 2,
};

enum {
	B_NO_TRUNCATION = 0xffffffff,
	B_TRUNCATE_END = 0,
	B_TRUNCATE_BEGINNING = 1,
	B_TRUNCATE_MIDDLE = 2,
	B_TRUNCATE_SMART = 3,
};

enum {
	B_UNICODE_UTF8 = 0,
	B_ISO_8859_1 = 1,
	B_ISO_8859_2 = 2,
	B_ISO_8859_3 = 3,
	B_ISO_8859_4 = 4,
	B_ISO_8859_5 = 5,
	B_ISO_8859_6 = 6,
	B_ISO_8859_7 = 7,
	B_ISO_8859_8 = 8,
	B_ISO_8859_9 = 9,
	B_ISO_8859_10 = 10,
	B_MACINTOSH_ROMAN = 11,
};

enum {
	B_HAS_TUNED_FONT = 1,
	B_IS_FIXED = 2,
};

enum {
	B_ITALIC_FACE = 1,
	B_UNDERSCORE_FACE = 2,
	B_NEGATIVE_FACE = 4,
	B_OUTLINED_FACE = 8,
	B_STRIKEOUT_FACE = 16,
	B_BOLD_FACE = 32,
	B_REGULAR_FACE = 64,
	B_CONDENSED_FACE = 128,
	B_LIGHT_FACE = 256,
	B_HEAVY_FACE = 512,
};

enum font_metric_mode {
	B_SCREEN_METRIC = 0,
	B_PRINTING_METRIC = 1,
};

enum font_file_format {
	B_TRUETYPE_WINDOWS = 0,
	B_POSTSCRIPT_TYPE1_WINDOWS = 1,
};


/// Pixels, all positive: above the baseline, below it, and between two lines.
struct font_height {
	float ascent;
	float descent;
	float leading;
};

/// Extra room after each character that is no white space, and after each that is.
struct escapement_delta {
	float nonspace;
	float space;
};

/// A value: default-constructed it equals the plain font.
///
/// Metrics come from the display's fonts; where no display draws (BE_DISPLAY=none) they are an
/// estimate from the size alone. Any thread; no lock.
class BFont {
public:
	BFont();
	BFont(const BFont& font) = default;
	BFont(const BFont* font);

	BFont& operator=(const BFont& font) = default;
	bool operator==(const BFont& font) const;
	bool operator!=(const BFont& font) const { return !(*this == font); }

	/// A null \a style is the family's first, a null \a family keeps the present one.
	/// Returns B_OK; B_NAME_NOT_FOUND, nothing changed, for names that the display does not know.
	status_t SetFamilyAndStyle(const font_family family, const font_style style);
	void SetFamilyAndStyle(uint32 code);
	status_t SetFamilyAndFace(const font_family family, uint16 face);
	void SetSize(float size);
	/// Degrees, 90 is upright.
	void SetShear(float shear);
	/// Degrees, counter-clockwise.
	void SetRotation(float rotation);
	void SetSpacing(uint8 spacing);
	void SetEncoding(uint8 encoding);
	void SetFace(uint16 face);
	void SetFlags(uint32 flags);

	void GetFamilyAndStyle(font_family* family, font_style* style) const;
	uint32 FamilyAndStyle() const;
	float Size() const { return fSize; }
	float Shear() const { return fShear; }
	float Rotation() const { return fRotation; }
	uint8 Spacing() const { return fSpacing; }
	uint8 Encoding() const { return fEncoding; }
	uint16 Face() const { return fFace; }
	uint32 Flags() const { return fFlags; }
	font_direction Direction() const { return B_FONT_LEFT_TO_RIGHT; }
	bool IsFixed() const;
	BRect BoundingBox() const;

	/// Cuts text that is wider than \a width pixels and puts an ellipsis there; \a mode is one of
	/// B_TRUNCATE_END and its siblings.
	void TruncateString(BString* inOut, uint32 mode, float width) const;
	void GetTruncatedStrings(const char* stringArray[], int32 numStrings, uint32 mode, float width,
		BString resultArray[]) const;
	/// Each result needs room for its string's length and three bytes more.
	void GetTruncatedStrings(const char* stringArray[], int32 numStrings, uint32 mode, float width,
		char* resultArray[]) const;

	/// Pixels, with fractions; 0 for empty or null text. \a length is in bytes, negative: to the end.
	float StringWidth(const char* string) const;
	float StringWidth(const char* string, int32 length) const;
	void GetStringWidths(const char* stringArray[], const int32 lengthArray[], int32 numStrings,
		float widthArray[]) const;

	/// Escapements are in units of the font size: times Size() they are pixels.
	void GetEscapements(const char charArray[], int32 numChars, float escapementArray[]) const;
	void GetEscapements(const char charArray[], int32 numChars, escapement_delta* delta,
		float escapementArray[]) const;
	void GetEscapements(const char charArray[], int32 numChars, escapement_delta* delta,
		BPoint escapementArray[]) const;
	void GetEscapements(const char charArray[], int32 numChars, escapement_delta* delta,
		BPoint escapementArray[], BPoint offsetArray[]) const;
	void GetBoundingBoxesAsGlyphs(const char charArray[], int32 numChars, font_metric_mode mode,
		BRect boundingBoxArray[]) const;
	void GetBoundingBoxesAsString(const char charArray[], int32 numChars, font_metric_mode mode,
		escapement_delta* delta, BRect boundingBoxArray[]) const;

	/// Pixels of one line.
	void GetHeight(font_height* height) const;

	void PrintToStream() const;

private:
	uint16 fFamilyID;
	uint16 fStyleID;
	float fSize;
	float fShear;
	float fRotation;
	uint8 fSpacing;
	uint8 fEncoding;
	uint16 fFace;
	uint32 fFlags;
};

/// The user's fonts. Change a copy and give that to BView::SetFont().
extern const BFont* be_plain_font;
extern const BFont* be_bold_font;
extern const BFont* be_fixed_font;

int32 count_font_families();
/// Returns B_OK; B_BAD_INDEX past the end.
status_t get_font_family(int32 index, font_family* name, uint32* flags = NULL);
int32 count_font_styles(font_family name);
status_t get_font_style(font_family family, int32 index, font_style* name, uint32* flags = NULL);
status_t get_font_style(
	font_family family, int32 index, font_style* name, uint16* face, uint32* flags = NULL);
/// True when fonts came or went since the last call.
bool update_font_families(bool checkOnly);

#endif // _FONT_H
