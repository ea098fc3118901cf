// SPDX-License-Identifier: MIT

#include "TextLayout.h"

#include <algorithm>
#include <cmath>

namespace BPrivate {

namespace {

// Words are measured after so many bytes, and at their end.
constexpr int32 kMeasuredPiece = 64;

bool
IsContinuation(char byte)
{
	return (static_cast<unsigned char>(byte) & 0xc0) == 0x80;
}

} // namespace


int32
CharacterLength(const std::string& text, int32 offset)
{
	const int32 size = static_cast<int32>(text.size());
	if (offset >= size)
		return 0;
	const unsigned char first = text[offset];
	const int32 wanted = first < 0xc0 ? 1
		: first < 0xe0                ? 2
		: first < 0xf0                ? 3
		: first < 0xf8                ? 4
									  : 1;
	int32 length = 1;
	while (length < wanted && offset + length < size && IsContinuation(text[offset + length]))
		length++;
	return length == wanted ? length : 1;
}


int32
CharacterBefore(const std::string& text, int32 offset)
{
	for (int32 start = offset - 1; start >= 0 && start >= offset - 4; start--) {
		if (!IsContinuation(text[start]))
			return start + CharacterLength(text, start) == offset ? start : offset - 1;
	}
	return std::max<int32>(offset - 1, 0);
}


TextLayout::TextLayout()
	: fText(nullptr),
	  fStarts(1, 0),
	  fWidth(0),
	  fTabWidth(28),
	  fAscent(0),
	  fLineHeight(0)
{
}


void
TextLayout::SetTo(const std::string& text, const BFont& font, float width, float tabWidth)
{
	fText = &text;
	fFont = font;
	fWidth = width;
	fTabWidth = tabWidth;
	font_height height;
	fFont.GetHeight(&height);
	fAscent = std::ceil(height.ascent);
	fLineHeight = fAscent + std::ceil(height.descent) + std::ceil(height.leading);

	fStarts.assign(1, 0);
	AddLines(0, static_cast<int32>(text.size()));
}


void
TextLayout::Update(int32 offset, int32 removed, int32 inserted)
{
	int32 first = LineAt(offset);
	while (first > 0 && (*fText)[fStarts[first] - 1] != '\n')
		first--;
	const int32 start = fStarts[first];

	// From the next paragraph on the lines are the same, only further on or back.
	std::vector<int32> rest;
	const size_t newline = fText->find('\n', offset + inserted);
	const bool hasRest = newline != std::string::npos;
	const int32 end = static_cast<int32>(hasRest ? newline : fText->size());
	if (hasRest) {
		const int32 shift = inserted - removed;
		rest.assign(
			std::lower_bound(fStarts.begin(), fStarts.end(), end + 1 - shift), fStarts.end());
		for (int32& lineStart : rest)
			lineStart += shift;
	}
	fStarts.resize(first + 1);
	AddLines(start, end);
	fStarts.insert(fStarts.end(), rest.begin(), rest.end());
}


/// Adds the starts of the lines behind the first one, which begins at \a start, up to \a end.
void
TextLayout::AddLines(int32 start, int32 end)
{
	while (true) {
		const size_t newline = fText->find('\n', start);
		const bool isLast = newline == std::string::npos || static_cast<int32>(newline) >= end;
		const int32 paragraphEnd = isLast ? end : static_cast<int32>(newline);
		while (fWidth > 0 && start < paragraphEnd) {
			const int32 next = BreakLine(start, paragraphEnd, fWidth);
			if (next >= paragraphEnd)
				break;
			fStarts.push_back(next);
			start = next;
		}
		if (isLast)
			return;
		start = paragraphEnd + 1;
		fStarts.push_back(start);
	}
}


int32
TextLayout::LineEnd(int32 line) const
{
	const int32 size = fText != nullptr ? static_cast<int32>(fText->size()) : 0;
	if (line + 1 >= CountLines())
		return size;
	const int32 next = fStarts[line + 1];
	return next > 0 && (*fText)[next - 1] == '\n' ? next - 1 : next;
}


int32
TextLayout::LastOffset(int32 line) const
{
	// The end of a line that was broken between words is the start of the next one.
	const int32 end = LineEnd(line);
	const bool softBreak = line + 1 < CountLines() && LineStart(line + 1) == end;
	return softBreak ? CharacterBefore(*fText, end) : end;
}


int32
TextLayout::LineAt(int32 offset) const
{
	const auto next = std::upper_bound(fStarts.begin(), fStarts.end(), offset);
	return static_cast<int32>(next - fStarts.begin()) - 1;
}


float
TextLayout::LineWidth(int32 line) const
{
	return WidthOf(LineStart(line), LineEnd(line));
}


float
TextLayout::XAt(int32 line, int32 offset) const
{
	return WidthOf(LineStart(line), std::min(offset, LineEnd(line)));
}


int32
TextLayout::OffsetAt(int32 line, float x) const
{
	const int32 start = LineStart(line);
	const int32 last = LastOffset(line);

	// The last character that begins at x or before, halving: long lines are measured often enough.
	int32 low = start;
	int32 high = last;
	while (low < high) {
		int32 middle = low + (high - low + 1) / 2;
		while (middle < high && IsContinuation((*fText)[middle]))
			middle++;
		if (WidthOf(start, middle) <= x)
			low = middle;
		else {
			high = middle - 1;
			while (high > low && IsContinuation((*fText)[high]))
				high--;
		}
	}
	if (low >= last)
		return last;
	const int32 next = low + CharacterLength(*fText, low);
	return x < (WidthOf(start, low) + WidthOf(start, next)) / 2 ? low : std::min(next, last);
}


float
TextLayout::WidthOf(int32 from, int32 to) const
{
	float width = 0;
	while (from < to) {
		const size_t found = fText->find('\t', from);
		const int32 tab = found == std::string::npos ? to : std::min<int32>(found, to);
		width += fFont.StringWidth(fText->data() + from, tab - from);
		if (tab < to)
			width = (std::floor(width / fTabWidth) + 1) * fTabWidth;
		from = tab + 1;
	}
	return width;
}


/// Where the line from \a start has to be broken to be no wider than \a width; \a end when it fits.
int32
TextLayout::BreakLine(int32 start, int32 end, float width) const
{
	int32 lastBreak = start;
	int32 offset = start;
	while (offset < end) {
		int32 next = offset;
		// Word by word, and a long word in pieces: a paragraph may be long, a line is not.
		int32 measured = offset;
		bool fits = true;
		while (fits && next < end && (*fText)[next] != ' ' && (*fText)[next] != '\t') {
			next += CharacterLength(*fText, next);
			if (next - measured >= kMeasuredPiece) {
				fits = WidthOf(start, next) <= width;
				measured = next;
			}
		}
		if (!fits || WidthOf(start, next) > width)
			break;
		// Blanks at the end of a line may stick out.
		while (next < end && ((*fText)[next] == ' ' || (*fText)[next] == '\t'))
			next++;
		lastBreak = next;
		offset = next;
	}
	if (lastBreak > start || start == end)
		return lastBreak;

	// A word wider than the line is broken anywhere, after one character at least.
	offset = start + CharacterLength(*fText, start);
	while (offset < end) {
		const int32 next = offset + CharacterLength(*fText, offset);
		if (WidthOf(start, next) > width)
			return offset;
		offset = next;
	}
	return end;
}

} // namespace BPrivate
