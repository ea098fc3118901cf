// SPDX-License-Identifier: MIT

#include "TextLayout.h"

#include <algorithm>
#include <cmath>
#include <cstring>
#include <limits>
#include <unordered_map>

#include "TextStyles.h"

namespace BPrivate {

namespace {

// No piece is longer, in bytes: parts of a piece are measured from its start.
constexpr int32 kLongestPiece = 128;

// Sums of widths are not exact: a text that is measured as a whole fits into its own width.
constexpr float kTolerance = 0.01f;

// Lines beyond are not measured without keeping their pieces, in bytes.
constexpr int32 kLongLine = 4096;

// How many lines' pieces are kept.
constexpr size_t kMostKept = 200;

// A dot, for each character of a hidden text.
constexpr const char* kDot = "\xe2\x80\xa2";

bool
IsContinuation(char byte)
{
	return (static_cast<unsigned char>(byte) & 0xc0) == 0x80;
}

// How many fonts' widths are kept.
constexpr size_t kMostFonts = 32;


// A character whose width does not depend on its neighbours, of scripts that are written letter by letter; 0 for
// any other, and for bytes that are none.
uint32
SimpleCharacter(const std::string& text, int32 offset, int32 length)
{
	const auto byte = [&](int32 i) { return static_cast<uint8>(text[offset + i]); };
	const uint32 first = byte(0);
	if (length == 1)
		return first >= 0x20 && first < 0x7f ? first : 0;
	if (length == 2) {
		const uint32 code = (first & 0x1f) << 6 | (byte(1) & 0x3f);
		const bool isLetter = (code >= 0xa1 && code < 0x300 && code != 0xad)
			|| (code >= 0x370 && code < 0x483) || (code >= 0x48a && code < 0x530);
		return isLetter ? code : 0;
	}
	if (length == 3) {
		const uint32 code = (first & 0x0f) << 12 | (byte(1) & 0x3f) << 6 | (byte(2) & 0x3f);
		const bool isSign = (code >= 0x3041 && code < 0x3097) || (code >= 0x30a1 && code < 0x3100)
			|| (code >= 0x4e00 && code < 0xa000) || (code >= 0xac00 && code < 0xd7a4);
		return isSign ? code : 0;
	}
	return 0;
}

} // namespace


struct TextLayout::CharacterWidths {
	explicit CharacterWidths(const BFont& ofFont)
		: font(ofFont)
	{
		std::fill(std::begin(ascii), std::end(ascii), -1.0f);
	}

	BFont font;
	float ascii[128];
	std::unordered_map<uint32, float> others;
};


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


TextLayout::TextLayout(const std::string& text, const TextStyles& styles)
	: fText(text),
	  fStyles(styles),
	  fLines(1, Line{0, 0, 0, -1, 0}),
	  fWidth(0),
	  fTabWidth(28),
	  fHidden(false)
{
}


TextLayout::~TextLayout() {}


// Adds the lines from \a start on, up to the end or to one that \a isKnown, which is added with a height below 0.
template <typename IsKnown>
void
TextLayout::AddLines(int32 start, std::vector<Line>* lines, const IsKnown& isKnown) const
{
	const int32 size = static_cast<int32>(fText.size());
	int32 paragraphEnd = -1;
	while (true) {
		if (isKnown(start)) {
			lines->push_back({start, 0, -1, -1, 0});
			return;
		}
		if (start > paragraphEnd) {
			const size_t newline = fText.find('\n', static_cast<size_t>(start));
			paragraphEnd = newline != std::string::npos ? static_cast<int32>(newline) : size;
		}
		const int32 next = fWidth > 0 ? BreakLine(start, paragraphEnd) : paragraphEnd;
		Line line = {start, 0, 0, -1, 0};
		Measure(&line, next);
		lines->push_back(line);
		if (next < paragraphEnd) {
			start = next;
			continue;
		}
		if (paragraphEnd == size)
			return;
		start = paragraphEnd + 1;
	}
}


void
TextLayout::SetTo(float width, float tabWidth)
{
	fWidth = width;
	fTabWidth = tabWidth;
	fPieces.clear();
	fCharacterWidths.clear();
	fLines.clear();
	AddLines(0, &fLines, [](int32) { return false; });
	PlaceLines(0);
}


void
TextLayout::SetHidden(bool hidden)
{
	fHidden = hidden;
	SetTo(fWidth, fTabWidth);
}


void
TextLayout::Update(int32 offset, int32 removed, int32 inserted)
{
	fPieces.clear();
	// A word that got shorter may fit into the line before its own; the one before that breaks elsewhere only
	// when a word went through the line between.
	int32 first = LineAt(offset);
	for (int32 back = 0; back < 2 && first > 0 && fText[fLines[first].start - 1] != '\n'; back++)
		first--;

	// From the first line on that begins where one began before, they are the same.
	const int32 shift = inserted - removed;
	std::vector<Line> added;
	size_t old = static_cast<size_t>(first);
	AddLines(fLines[first].start, &added, [&](int32 start) {
		if (start < offset + inserted || start >= static_cast<int32>(fText.size()))
			return false;
		while (old < fLines.size() && fLines[old].start < start - shift)
			old++;
		return old < fLines.size() && fLines[old].start == start - shift;
	});
	const bool metOld = !added.empty() && added.back().height < 0;
	if (metOld)
		added.pop_back();
	else
		old = fLines.size();

	for (size_t line = old; line < fLines.size(); line++)
		fLines[line].start += shift;
	const auto lines = fLines.begin();
	const size_t count = added.size();
	const size_t replaced = old - static_cast<size_t>(first);
	// In place as far as it goes: most changes keep the number of lines.
	const size_t common = std::min(count, replaced);
	std::copy(added.begin(), added.begin() + common, lines + first);
	if (count > common)
		fLines.insert(lines + first + common, added.begin() + common, added.end());
	else
		fLines.erase(lines + first + common, lines + old);
	PlaceLines(first);
}


// A line is as high as the highest of its styles; an empty one as what would be typed into it.
void
TextLayout::Measure(Line* line, int32 end) const
{
	const std::vector<TextStyles::Run>& runs = fStyles.Runs();
	float descent = 0;
	float leading = 0;
	size_t run = static_cast<size_t>(fStyles.IndexAt(std::max(
		line->start < static_cast<int32>(fText.size()) ? line->start : line->start - 1, int32(0))));
	do {
		font_height height;
		runs[run].style.font.GetHeight(&height);
		line->ascent = std::max(line->ascent, std::ceil(height.ascent));
		descent = std::max(descent, std::ceil(height.descent));
		leading = std::max(leading, std::ceil(height.leading));
		run++;
	} while (run < runs.size() && runs[run].offset < end);
	line->height = line->ascent + descent + leading;
}


void
TextLayout::PlaceLines(int32 first)
{
	for (int32 line = first; line < CountLines(); line++) {
		fLines[line].top =
			line > 0 ? fLines[line - 1].top + static_cast<double>(fLines[line - 1].height) : 0;
	}
}


int32
TextLayout::LineEnd(int32 line) const
{
	if (line + 1 >= CountLines())
		return static_cast<int32>(fText.size());
	const int32 next = fLines[line + 1].start;
	return next > 0 && fText[next - 1] == '\n' ? next - 1 : next;
}


int32
TextLayout::LastOffset(int32 line) const
{
	// The end of a line that was broken between words is the start of the next one.
	const int32 end = LineEnd(line);
	const bool softBreak = line + 1 < CountLines() && LineStart(line + 1) == end;
	return softBreak ? CharacterBefore(fText, end) : end;
}


int32
TextLayout::LineAt(int32 offset) const
{
	const auto next = std::upper_bound(fLines.begin(), fLines.end(), offset,
		[](int32 place, const Line& line) { return place < line.start; });
	return std::max(static_cast<int32>(next - fLines.begin()) - 1, int32(0));
}


int32
TextLayout::LineAtHeight(float y) const
{
	const auto next = std::upper_bound(fLines.begin(), fLines.end(), static_cast<double>(y),
		[](double place, const Line& line) { return place < line.top; });
	return std::max(static_cast<int32>(next - fLines.begin()) - 1, int32(0));
}


float
TextLayout::Height() const
{
	return static_cast<float>(fLines.back().top) + fLines.back().height;
}


float
TextLayout::LineWidth(int32 line) const
{
	if (fLines[line].width >= 0)
		return fLines[line].width;
	const int32 end = LineEnd(line);
	if (end - LineStart(line) > kLongLine) {
		// It takes long, and is asked for again.
		LinePieces(line);
		return fLines[line].width;
	}
	Piece piece = {LineStart(line), 0, 0, 0, nullptr};
	while (NextPiece(end, &piece)) {
	}
	return fLines[line].width = piece.x;
}


float
TextLayout::Width() const
{
	float width = 0;
	for (int32 line = 0; line < CountLines(); line++)
		width = std::max(width, LineWidth(line));
	return width;
}


const TextLayout::Pieces&
TextLayout::LinePieces(int32 line) const
{
	const auto kept = fPieces.find(line);
	if (kept != fPieces.end())
		return kept->second;
	if (fPieces.size() >= kMostKept)
		fPieces.clear();
	Pieces& pieces = fPieces[line];
	Piece piece = {LineStart(line), 0, 0, 0, nullptr};
	const int32 end = LineEnd(line);
	while (NextPiece(end, &piece))
		pieces.push_back(piece);
	fLines[line].width = piece.x;
	return pieces;
}


bool
TextLayout::NextPiece(int32 end, Piece* piece) const
{
	if (!FindPiece(end, piece))
		return false;
	piece->width = WidthWithin(*piece, piece->length);
	return true;
}


// Goes from a piece to the next of its line, which is not measured yet; from one without length to the first. At the
// end the piece is an empty one behind all, and the answer is false.
bool
TextLayout::FindPiece(int32 end, Piece* piece) const
{
	piece->x += piece->width;
	piece->offset += piece->length;
	piece->length = 0;
	piece->width = 0;
	piece->style = nullptr;
	if (piece->offset >= end)
		return false;

	const int32 start = piece->offset;
	if (!fHidden && fText[start] == '\t') {
		while (start + piece->length < end && fText[start + piece->length] == '\t')
			piece->length++;
	} else {
		const std::vector<TextStyles::Run>& runs = fStyles.Runs();
		const size_t run = static_cast<size_t>(fStyles.IndexAt(start));
		piece->style = &runs[run].style;
		int32 limit = std::min(end, start + kLongestPiece);
		if (run + 1 < runs.size())
			limit = std::min(limit, runs[run + 1].offset);
		const char* text = fText.data() + start;
		const void* tab =
			fHidden ? nullptr : memchr(text, '\t', static_cast<size_t>(limit - start));
		if (tab != nullptr)
			limit = start + static_cast<int32>(static_cast<const char*>(tab) - text);
		else if (limit == start + kLongestPiece && limit < end)
			limit = GoodCut(start, limit);
		piece->length = limit - start;
	}
	return true;
}


// A long piece ends behind a word or, where there is none, behind a character.
int32
TextLayout::GoodCut(int32 start, int32 limit) const
{
	const char* text = fText.data();
	const void* blank = memrchr(text + start, ' ', static_cast<size_t>(limit - start));
	if (blank != nullptr)
		return static_cast<int32>(static_cast<const char*>(blank) - text) + 1;
	for (int32 cut = limit; cut > limit - 4; cut--) {
		if (!IsContinuation(fText[cut]))
			return cut;
	}
	return limit;
}


// How wide so many bytes of a piece are.
float
TextLayout::WidthWithin(const Piece& piece, int32 length) const
{
	if (length == 0)
		return 0;
	if (piece.style != nullptr)
		return WidthOf(*piece.style, piece.offset, length);
	// Each tab goes on to the next stop.
	const float firstStop = (std::floor(piece.x / fTabWidth) + 1) * fTabWidth;
	return firstStop - piece.x + static_cast<float>(length - 1) * fTabWidth;
}


float
TextLayout::WidthOf(const TextStyle& style, int32 offset, int32 length) const
{
	const Sum sum =
		AddWidths(style, offset, offset + length, std::numeric_limits<float>::infinity());
	return sum.isKnown ? sum.width : style.font.StringWidth(fText.data() + offset, length);
}


// Asking the font takes long. It sets letters side by side, so that their widths can be added: up to the first
// that goes beyond the limit, or whose width alone says nothing.
TextLayout::Sum
TextLayout::AddWidths(const TextStyle& style, int32 offset, int32 end, float limit) const
{
	CharacterWidths& widths = WidthsOf(style.font);
	const char* text = fText.data();
	double sum = 0;
	while (offset < end) {
		const bool isAscii = text[offset] >= 0x20 && text[offset] < 0x7f;
		const int32 length = isAscii ? 1 : CharacterLength(fText, offset);
		const uint32 code = fHidden ? 0
			: isAscii               ? static_cast<uint32>(text[offset])
									: SimpleCharacter(fText, offset, length);
		if (code == 0 && !fHidden)
			return {offset, static_cast<float>(sum), false};
		float& width =
			code < 128 ? widths.ascii[code] : widths.others.try_emplace(code, -1.0f).first->second;
		if (width < 0) {
			width = fHidden ? style.font.StringWidth(kDot)
							: style.font.StringWidth(text + offset, length);
		}
		const double wider = sum + static_cast<double>(width);
		if (static_cast<float>(wider) > limit)
			break;
		sum = wider;
		offset += length;
	}
	return {offset, static_cast<float>(sum), true};
}


TextLayout::CharacterWidths&
TextLayout::WidthsOf(const BFont& font) const
{
	for (const auto& widths : fCharacterWidths) {
		if (widths->font == font)
			return *widths;
	}
	if (fCharacterWidths.size() >= kMostFonts)
		fCharacterWidths.clear();
	fCharacterWidths.push_back(std::make_unique<CharacterWidths>(font));
	return *fCharacterWidths.back();
}


// The offset of the first character of a piece that does not end within \a room of its start; the piece's end, and
// how wide it is, when all do.
int32
TextLayout::FittingPart(const Piece& piece, float room, float* _width) const
{
	const int32 end = piece.offset + piece.length;
	int32 fitting = end;
	if (piece.style == nullptr) {
		const float more = room - WidthWithin(piece, 1);
		const float tabs = more < 0 ? 0 : std::floor(more / fTabWidth) + 1;
		fitting =
			piece.offset + static_cast<int32>(std::min(tabs, static_cast<float>(piece.length)));
	} else {
		// Most text can be added up.
		const Sum sum = AddWidths(*piece.style, piece.offset, end, room);
		if (sum.isKnown) {
			*_width = sum.width;
			return sum.end;
		}
		std::vector<int32> ends;
		for (int32 i = piece.offset; i < end;) {
			i += CharacterLength(fText, i);
			ends.push_back(i);
		}
		const auto over = std::partition_point(ends.begin(), ends.end(), [&](int32 place) {
			return WidthOf(*piece.style, piece.offset, place - piece.offset) <= room;
		});
		fitting = over == ends.begin() ? piece.offset : *(over - 1);
	}
	if (fitting == end)
		*_width = WidthWithin(piece, piece.length);
	return fitting;
}


std::string
TextLayout::Shown(int32 offset, int32 length) const
{
	if (!fHidden)
		return fText.substr(static_cast<size_t>(offset), static_cast<size_t>(length));
	std::string dots;
	for (int32 i = offset; i < offset + length; i += CharacterLength(fText, i))
		dots += kDot;
	return dots;
}


float
TextLayout::XAt(int32 line, int32 offset) const
{
	offset = std::min(offset, LineEnd(line));
	const Pieces& pieces = LinePieces(line);
	const auto next = std::upper_bound(pieces.begin(), pieces.end(), offset,
		[](int32 place, const Piece& piece) { return place < piece.offset; });
	if (next == pieces.begin())
		return 0;
	const Piece& piece = *(next - 1);
	return piece.x + WidthWithin(piece, offset - piece.offset);
}


int32
TextLayout::OffsetAt(int32 line, float x) const
{
	const int32 last = LastOffset(line);
	const Pieces& pieces = LinePieces(line);
	const auto next = std::upper_bound(pieces.begin(), pieces.end(), x,
		[](float place, const Piece& piece) { return place < piece.x; });
	if (next == pieces.begin())
		return LineStart(line);

	// The last character that begins at x or before.
	const Piece& piece = *(next - 1);
	float width;
	const int32 low = FittingPart(piece, x - piece.x, &width);
	if (low >= last)
		return last;
	const int32 following = low + CharacterLength(fText, low);
	return x < (XAt(line, low) + XAt(line, following)) / 2 ? low : std::min(following, last);
}


/// Where the line from \a start has to be broken to be no wider than the text; \a end when it fits.
int32
TextLayout::BreakLine(int32 start, int32 end) const
{
	Piece piece = {start, 0, 0, 0, nullptr};
	int32 over = start;
	do {
		if (!FindPiece(end, &piece))
			return end;
		over = FittingPart(piece, fWidth + kTolerance - piece.x, &piece.width);
	} while (over == piece.offset + piece.length);

	// Blanks at the end of a line may stick out.
	const char* text = fText.data();
	const auto isBlank = [text](int32 place) { return text[place] == ' ' || text[place] == '\t'; };
	int32 next = over;
	while (next < end && isBlank(next))
		next++;
	if (next > over || (over > start && isBlank(over - 1)))
		return next;
	while (next > start && !isBlank(next - 1))
		next--;
	if (next > start)
		return next;
	// A word wider than the line is broken anywhere, after one character at least.
	return std::max(over, start + CharacterLength(fText, start));
}

} // namespace BPrivate
