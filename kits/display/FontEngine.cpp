// SPDX-License-Identifier: MIT
// What every font engine does alike: finding styles by name or face, and shortening text.
#include "display/FontEngine.h"

#include <bit>
#include <cstring>
#include <vector>

#include <strings.h>

#include <String.h>

namespace BPrivate {

namespace {

bool
IsContinuation(char byte)
{
	return (byte & 0xc0) == 0x80;
}


/// Where each character starts, and the end.
std::vector<int32>
CharacterStarts(const BString& text)
{
	std::vector<int32> starts;
	for (int32 i = 0; i < text.Length(); i++) {
		if (!IsContinuation(text[i]))
			starts.push_back(i);
	}
	starts.push_back(text.Length());
	return starts;
}


/// \a text with the characters from \a from up to \a to replaced by an ellipsis.
BString
Shortened(const BString& text, const std::vector<int32>& starts, size_t from, size_t to)
{
	BString result(text.String(), starts[from]);
	result.Append(B_UTF8_ELLIPSIS);
	result.Append(text.String() + starts[to]);
	return result;
}


/// Which characters to leave out when \a kept of \a count stay.
void
CutForMode(uint32 mode, size_t count, size_t kept, size_t* from, size_t* to)
{
	switch (mode) {
		case B_TRUNCATE_BEGINNING:
			*from = 0;
			break;
		case B_TRUNCATE_MIDDLE:
		case B_TRUNCATE_SMART:
			*from = (kept + 1) / 2;
			break;
		default:
			*from = kept;
			break;
	}
	*to = *from + (count - kept);
}

} // namespace


FontKey
FontKey::Of(const BFont& font)
{
	uint32 code = font.FamilyAndStyle();
	return {static_cast<uint16>(code >> 16), static_cast<uint16>(code & 0xffff), font.Size(),
		font.Shear(), font.Rotation(), font.Spacing(), font.Face(), font.Flags()};
}


int32
FontEngine::FindFamily(const char* name)
{
	font_family family;
	for (int32 i = 0; GetFamily(i, &family) == B_OK; i++) {
		if (strcasecmp(family, name) == 0)
			return i;
	}
	return B_NAME_NOT_FOUND;
}


int32
FontEngine::FindStyle(int32 family, const char* name)
{
	FontStyleInfo info;
	for (int32 i = 0; GetStyle(family, i, &info) == B_OK; i++) {
		if (strcasecmp(info.name, name) == 0)
			return i;
	}
	return B_NAME_NOT_FOUND;
}


int32
FontEngine::FindStyle(int32 family, uint16 face)
{
	const uint16 kStyleFaces =
		B_ITALIC_FACE | B_BOLD_FACE | B_CONDENSED_FACE | B_LIGHT_FACE | B_HEAVY_FACE;
	int32 best = 0;
	int bestDistance = 100;
	FontStyleInfo info;
	for (int32 i = 0; GetStyle(family, i, &info) == B_OK; i++) {
		uint16 differing = static_cast<uint16>((info.face ^ face) & kStyleFaces);
		int distance = std::popcount(differing);
		if (distance < bestDistance) {
			best = i;
			bestDistance = distance;
		}
	}
	return best;
}


void
FontEngine::TruncateString(const FontKey& font, BString* text, uint32 mode, float width)
{
	if (mode == B_NO_TRUNCATION || StringWidth(font, text->String(), text->Length()) <= width)
		return;

	std::vector<int32> starts = CharacterStarts(*text);
	size_t count = starts.size() - 1;
	// The widths grow with the number of characters kept, so the largest that fits is found by halving.
	size_t fits = 0;
	size_t tooMany = count;
	BString best;
	while (fits < tooMany) {
		size_t kept = (fits + tooMany) / 2;
		size_t from;
		size_t to;
		CutForMode(mode, count, kept, &from, &to);
		BString shortened = Shortened(*text, starts, from, to);
		if (StringWidth(font, shortened.String(), shortened.Length()) <= width) {
			best = shortened;
			fits = kept + 1;
		} else
			tooMany = kept;
	}
	*text = best;
}

} // namespace BPrivate
