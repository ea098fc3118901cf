// SPDX-License-Identifier: MIT
// BFont: a font's attributes, and the names behind its numbers.
#include <Font.h>

#include <cstdio>
#include <cstring>
#include <vector>

#include <String.h>

#include "display/Display.h"
#include "display/FontEngine.h"

using BPrivate::Display;
using BPrivate::FontEngine;
using BPrivate::FontKey;
using BPrivate::FontStyleInfo;

namespace {

const float kDefaultSize = 12;

// Families that stand for the user's fonts until somebody asks which they are: a font must not need
// the display to be made, as views and the global fonts are made where there may be none.
const uint16 kUserFonts = 0xfff0;


FontEngine&
Engine()
{
	return Display::Get().Fonts();
}


uint16
FaceOf(uint16 family, uint16 style)
{
	FontStyleInfo info;
	return Engine().GetStyle(family, style, &info) == B_OK ? info.face
														   : static_cast<uint16>(B_REGULAR_FACE);
}


BFont
MakeUserFont(BPrivate::standard_font which, uint16 face)
{
	BFont font;
	font.SetFamilyAndStyle(static_cast<uint32>(kUserFonts + which) << 16);
	font.SetFace(face);
	return font;
}


bool
IsUserFont(uint32 code)
{
	return code >> 16 >= kUserFonts;
}

const BFont sPlainFont;
const BFont sBoldFont = MakeUserFont(BPrivate::kBoldFont, B_BOLD_FACE);
const BFont sFixedFont = MakeUserFont(BPrivate::kFixedFont, B_REGULAR_FACE);

} // namespace


const BFont* be_plain_font = &sPlainFont;
const BFont* be_bold_font = &sBoldFont;
const BFont* be_fixed_font = &sFixedFont;


BFont::BFont()
	: fFamilyID(kUserFonts),
	  fStyleID(0),
	  fSize(kDefaultSize),
	  fShear(90),
	  fRotation(0),
	  fSpacing(B_BITMAP_SPACING),
	  fEncoding(B_UNICODE_UTF8),
	  fFace(B_REGULAR_FACE),
	  fFlags(0)
{
}


BFont::BFont(const BFont* font)
	: BFont()
{
	if (font != nullptr)
		*this = *font;
}


bool
BFont::operator==(const BFont& font) const
{
	bool sameCode = (fFamilyID == font.fFamilyID && fStyleID == font.fStyleID)
		|| FamilyAndStyle() == font.FamilyAndStyle();
	return sameCode && fSize == font.fSize && fShear == font.fShear && fRotation == font.fRotation
		&& fSpacing == font.fSpacing && fEncoding == font.fEncoding && fFace == font.fFace
		&& fFlags == font.fFlags;
}


status_t
BFont::SetFamilyAndStyle(const font_family family, const font_style style)
{
	if (family == nullptr && style == nullptr)
		return B_BAD_VALUE;

	int32 familyID = family != nullptr ? Engine().FindFamily(family) : FamilyAndStyle() >> 16;
	if (familyID < 0)
		return B_NAME_NOT_FOUND;
	int32 styleID = style != nullptr ? Engine().FindStyle(familyID, style) : 0;
	if (styleID < 0)
		return B_NAME_NOT_FOUND;

	SetFamilyAndStyle(static_cast<uint32>(familyID) << 16 | styleID);
	return B_OK;
}


void
BFont::SetFamilyAndStyle(uint32 code)
{
	fFamilyID = static_cast<uint16>(code >> 16);
	fStyleID = static_cast<uint16>(code);
	if (!IsUserFont(code))
		fFace = FaceOf(fFamilyID, fStyleID);
}


status_t
BFont::SetFamilyAndFace(const font_family family, uint16 face)
{
	if (family != nullptr) {
		int32 familyID = Engine().FindFamily(family);
		if (familyID < 0)
			return B_NAME_NOT_FOUND;
		fFamilyID = static_cast<uint16>(familyID);
		fStyleID = 0;
	}
	SetFace(face);
	return B_OK;
}


void
BFont::SetSize(float size)
{
	fSize = size;
}


void
BFont::SetShear(float shear)
{
	fShear = shear;
}


void
BFont::SetRotation(float rotation)
{
	fRotation = rotation;
}


void
BFont::SetSpacing(uint8 spacing)
{
	fSpacing = spacing;
}


void
BFont::SetEncoding(uint8 encoding)
{
	fEncoding = encoding;
}


// The style becomes the family's nearest one; what no style has (underscore) is only kept.
void
BFont::SetFace(uint16 face)
{
	if (fFace == face)
		return;

	fFace = face;
	uint32 code = static_cast<uint32>(fFamilyID) << 16 | fStyleID;
	bool isOwnFace = fFamilyID == kUserFonts + BPrivate::kBoldFont && face == B_BOLD_FACE;
	if (isOwnFace)
		return;
	code = FamilyAndStyle();
	int32 style = Engine().FindStyle(code >> 16, face);
	fFamilyID = static_cast<uint16>(code >> 16);
	fStyleID = static_cast<uint16>(style < 0 ? 0 : style);
}


void
BFont::SetFlags(uint32 flags)
{
	fFlags = flags;
}


void
BFont::GetFamilyAndStyle(font_family* family, font_style* style) const
{
	uint32 code = FamilyAndStyle();
	if (family != nullptr && Engine().GetFamily(code >> 16, family) != B_OK)
		(*family)[0] = '\0';
	FontStyleInfo info = {};
	if (style != nullptr) {
		Engine().GetStyle(code >> 16, code & 0xffff, &info);
		std::memcpy(*style, info.name, sizeof(font_style));
	}
}


uint32
BFont::FamilyAndStyle() const
{
	uint16 family = fFamilyID, style = fStyleID;
	float size;
	if (family >= kUserFonts) {
		Engine().GetStandardFont(
			static_cast<BPrivate::standard_font>(family - kUserFonts), &family, &style, &size);
	}
	return static_cast<uint32>(family) << 16 | style;
}


bool
BFont::IsFixed() const
{
	uint32 code = FamilyAndStyle();
	FontStyleInfo info;
	return Engine().GetStyle(code >> 16, code & 0xffff, &info) == B_OK && info.isFixed;
}


BRect
BFont::BoundingBox() const
{
	font_height height;
	GetHeight(&height);
	return BRect(0, -height.ascent, StringWidth("W"), height.descent);
}


void
BFont::GetHeight(font_height* height) const
{
	if (height != nullptr)
		*height = Engine().Height(FontKey::Of(*this));
}


float
BFont::StringWidth(const char* string) const
{
	return StringWidth(string, -1);
}


float
BFont::StringWidth(const char* string, int32 length) const
{
	if (string == nullptr || length == 0 || string[0] == '\0')
		return 0;
	size_t bytes = length < 0 ? std::strlen(string) : strnlen(string, length);
	return Engine().StringWidth(FontKey::Of(*this), string, static_cast<int32>(bytes));
}


void
BFont::GetStringWidths(const char* stringArray[], const int32 lengthArray[], int32 numStrings,
	float widthArray[]) const
{
	if (stringArray == nullptr || widthArray == nullptr)
		return;
	for (int32 i = 0; i < numStrings; i++)
		widthArray[i] = StringWidth(stringArray[i], lengthArray != nullptr ? lengthArray[i] : -1);
}


void
BFont::TruncateString(BString* inOut, uint32 mode, float width) const
{
	if (inOut != nullptr)
		Engine().TruncateString(FontKey::Of(*this), inOut, mode, width);
}


void
BFont::GetTruncatedStrings(const char* stringArray[], int32 numStrings, uint32 mode, float width,
	BString resultArray[]) const
{
	for (int32 i = 0; i < numStrings; i++) {
		resultArray[i] = stringArray[i];
		TruncateString(&resultArray[i], mode, width);
	}
}


void
BFont::GetTruncatedStrings(const char* stringArray[], int32 numStrings, uint32 mode, float width,
	char* resultArray[]) const
{
	for (int32 i = 0; i < numStrings; i++) {
		BString result(stringArray[i]);
		TruncateString(&result, mode, width);
		std::strcpy(resultArray[i], result.String());
	}
}


void
BFont::GetEscapements(const char charArray[], int32 numChars, float escapementArray[]) const
{
	GetEscapements(charArray, numChars, nullptr, escapementArray);
}


void
BFont::GetEscapements(
	const char charArray[], int32 numChars, escapement_delta* delta, float escapementArray[]) const
{
	if (charArray == nullptr || escapementArray == nullptr || numChars <= 0 || fSize <= 0)
		return;

	Engine().GetEscapements(FontKey::Of(*this), charArray, numChars, escapementArray);
	const char* character = charArray;
	for (int32 i = 0; i < numChars; i++) {
		escapementArray[i] /= fSize;
		if (delta != nullptr) {
			bool isWhite = *character == ' ' || *character == '\t' || *character == '\n';
			escapementArray[i] += isWhite ? delta->space : delta->nonspace;
		}
		if (*character != '\0')
			character++;
		while ((*character & 0xc0) == 0x80)
			character++;
	}
}


void
BFont::GetEscapements(
	const char charArray[], int32 numChars, escapement_delta* delta, BPoint escapementArray[]) const
{
	GetEscapements(charArray, numChars, delta, escapementArray, nullptr);
}


void
BFont::GetEscapements(const char charArray[], int32 numChars, escapement_delta* delta,
	BPoint escapementArray[], BPoint offsetArray[]) const
{
	std::vector<float> widths(numChars > 0 ? numChars : 0);
	GetEscapements(charArray, numChars, delta, widths.data());
	for (size_t i = 0; i < widths.size(); i++) {
		escapementArray[i] = BPoint(widths[i], 0);
		if (offsetArray != nullptr)
			offsetArray[i] = B_ORIGIN;
	}
}


void
BFont::GetBoundingBoxesAsGlyphs(
	const char charArray[], int32 numChars, font_metric_mode, BRect boundingBoxArray[]) const
{
	if (charArray != nullptr && boundingBoxArray != nullptr && numChars > 0)
		Engine().GetGlyphBounds(FontKey::Of(*this), charArray, numChars, boundingBoxArray);
}


void
BFont::GetBoundingBoxesAsString(const char charArray[], int32 numChars, font_metric_mode mode,
	escapement_delta* delta, BRect boundingBoxArray[]) const
{
	std::vector<float> widths(numChars > 0 ? numChars : 0);
	GetEscapements(charArray, numChars, delta, widths.data());
	GetBoundingBoxesAsGlyphs(charArray, numChars, mode, boundingBoxArray);
	float x = 0;
	for (size_t i = 0; i < widths.size(); i++) {
		boundingBoxArray[i].OffsetBy(x, 0);
		x += widths[i] * fSize;
	}
}


void
BFont::PrintToStream() const
{
	font_family family;
	font_style style;
	GetFamilyAndStyle(&family, &style);
	std::printf("BFont { %s, %s, 0x%x, %.1f, %.1f, %.1f }\n", family, style, fFace, fSize, fShear,
		fRotation);
}


int32
count_font_families()
{
	return Engine().CountFamilies();
}


status_t
get_font_family(int32 index, font_family* name, uint32* flags)
{
	if (name == nullptr)
		return B_BAD_VALUE;
	status_t status = Engine().GetFamily(index, name);
	FontStyleInfo info;
	if (status == B_OK && flags != nullptr) {
		bool isFixed = Engine().GetStyle(index, 0, &info) == B_OK && info.isFixed;
		*flags = isFixed ? B_IS_FIXED : 0;
	}
	return status;
}


int32
count_font_styles(font_family name)
{
	int32 family = Engine().FindFamily(name);
	return family < 0 ? 0 : Engine().CountStyles(family);
}


status_t
get_font_style(font_family family, int32 index, font_style* name, uint32* flags)
{
	return get_font_style(family, index, name, nullptr, flags);
}


status_t
get_font_style(font_family family, int32 index, font_style* name, uint16* face, uint32* flags)
{
	if (name == nullptr)
		return B_BAD_VALUE;
	int32 familyID = Engine().FindFamily(family);
	if (familyID < 0)
		return B_NAME_NOT_FOUND;

	FontStyleInfo info;
	status_t status = Engine().GetStyle(familyID, index, &info);
	if (status != B_OK)
		return status;
	std::memcpy(*name, info.name, sizeof(font_style));
	if (face != nullptr)
		*face = info.face;
	if (flags != nullptr)
		*flags = info.isFixed ? B_IS_FIXED : 0;
	return B_OK;
}


bool
update_font_families(bool)
{
	static int32 count = count_font_families();
	int32 now = count_font_families();
	bool changed = now != count;
	count = now;
	return changed;
}
