// SPDX-License-Identifier: MIT
// Where the lines of a text begin, and where its characters stand.
#ifndef KITS_INTERFACE_TEXT_LAYOUT_H
#define KITS_INTERFACE_TEXT_LAYOUT_H

#include <map>
#include <memory>
#include <string>
#include <vector>

#include <SupportDefs.h>

class BFont;

namespace BPrivate {

struct TextStyle;
class TextStyles;

/// The lines of a text. Offsets are bytes of the text, distances pixels.
///
/// It refers to the text and its styles, which change together: Update() follows each change.
class TextLayout {
public:
	/// What is drawn at once: not long, of one style. Tabs are pieces of their own, without a style.
	struct Piece {
		int32 offset;
		int32 length;
		/// From the line's left edge.
		float x;
		float width;
		const TextStyle* style;
	};
	typedef std::vector<Piece> Pieces;

	TextLayout(const std::string& text, const TextStyles& styles);
	~TextLayout();

	/// Breaks the text into lines: at line breaks, and with a \a width above 0 between words, too.
	void SetTo(float width, float tabWidth);
	/// Each character looks like the next one: a dot.
	void SetHidden(bool hidden);
	bool IsHidden() const { return fHidden; }

	/// The text was changed: \a removed bytes at \a offset gave way to \a inserted ones. Lays out the
	/// lines that this touched only.
	void Update(int32 offset, int32 removed, int32 inserted);

	int32 CountLines() const { return static_cast<int32>(fLines.size()); }

	/// The first byte of a line, and the byte behind its last visible one (before a line break).
	int32 LineStart(int32 line) const { return fLines[line].start; }
	int32 LineEnd(int32 line) const;

	/// The last offset of the line that a caret stands at in this line, not at the start of the next.
	int32 LastOffset(int32 line) const;

	/// The line of the character at \a offset. An offset at a soft break belongs to the line after it.
	int32 LineAt(int32 offset) const;
	/// The line at a distance below the first one's top; the first or last one beyond them.
	int32 LineAtHeight(float y) const;

	float LineTop(int32 line) const { return static_cast<float>(fLines[line].top); }
	float LineHeight(int32 line) const { return fLines[line].height; }
	float Ascent(int32 line) const { return fLines[line].ascent; }
	float Height() const;
	float LineWidth(int32 line) const;
	/// The width of the widest line.
	float Width() const;
	/// What is drawn of a line, from left to right; valid until the next change or question.
	const Pieces& LinePieces(int32 line) const;

	/// How far from its line's left edge the character at \a offset begins.
	float XAt(int32 line, int32 offset) const;

	/// The offset whose character begins nearest to \a x in the line.
	int32 OffsetAt(int32 line, float x) const;

	/// What is drawn for a part of a piece.
	std::string Shown(int32 offset, int32 length) const;

private:
	/// The widths of the characters of a font that were asked for.
	struct CharacterWidths;

	struct Line {
		int32 start;
		float ascent;
		float height;
		// Below 0 until it was asked for.
		mutable float width;
		double top;
	};

	// Characters up to \a end, and how wide they are together; unless the width is known only with what follows.
	struct Sum {
		int32 end;
		float width;
		bool isKnown;
	};

	bool NextPiece(int32 end, Piece* piece) const;
	bool FindPiece(int32 end, Piece* piece) const;
	int32 GoodCut(int32 start, int32 limit) const;
	float WidthWithin(const Piece& piece, int32 length) const;
	float WidthOf(const TextStyle& style, int32 offset, int32 length) const;
	Sum AddWidths(const TextStyle& style, int32 offset, int32 end, float limit) const;
	CharacterWidths& WidthsOf(const BFont& font) const;
	int32 FittingPart(const Piece& piece, float room, float* _width) const;
	int32 BreakLine(int32 start, int32 end) const;
	template <typename IsKnown>
	void AddLines(int32 start, std::vector<Line>* lines, const IsKnown& isKnown) const;
	void Measure(Line* line, int32 end) const;
	void PlaceLines(int32 first);

	const std::string& fText;
	const TextStyles& fStyles;
	std::vector<Line> fLines;
	// Of the lines that were asked for last.
	mutable std::map<int32, Pieces> fPieces;
	mutable std::vector<std::unique_ptr<CharacterWidths>> fCharacterWidths;
	float fWidth;
	float fTabWidth;
	bool fHidden;
};

/// The length of the UTF-8 character that begins at \a offset; 1 for a byte that begins none.
int32 CharacterLength(const std::string& text, int32 offset);

/// Where the character before \a offset begins; 0 at the start.
int32 CharacterBefore(const std::string& text, int32 offset);

} // namespace BPrivate

#endif // KITS_INTERFACE_TEXT_LAYOUT_H
