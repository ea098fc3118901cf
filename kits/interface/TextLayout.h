// SPDX-License-Identifier: MIT
// Where the lines of a text begin, and where its characters stand.
#ifndef KITS_INTERFACE_TEXT_LAYOUT_H
#define KITS_INTERFACE_TEXT_LAYOUT_H

#include <string>
#include <vector>

#include <Font.h>

namespace BPrivate {

/// The lines of a text in one font. Offsets are bytes of the text, distances pixels.
class TextLayout {
public:
	TextLayout();

	/// Breaks \a text into lines: at line breaks, and with a \a width above 0 between words, too.
	///
	/// The layout refers to \a text until the next call.
	void SetTo(const std::string& text, const BFont& font, float width, float tabWidth);

	/// The text was changed: \a removed bytes at \a offset gave way to \a inserted ones. Lays out the
	/// paragraphs that this touched only.
	void Update(int32 offset, int32 removed, int32 inserted);

	int32 CountLines() const { return static_cast<int32>(fStarts.size()); }

	/// The first byte of a line, and the byte behind its last visible one (before a line break).
	int32 LineStart(int32 line) const { return fStarts[line]; }
	int32 LineEnd(int32 line) const;

	/// The last offset of the line that a caret stands at in this line, not at the start of the next.
	int32 LastOffset(int32 line) const;

	/// The line of the character at \a offset. An offset at a soft break belongs to the line after it.
	int32 LineAt(int32 offset) const;

	float LineHeight() const { return fLineHeight; }
	float Ascent() const { return fAscent; }
	float LineWidth(int32 line) const;

	/// How far from its line's left edge the character at \a offset begins.
	float XAt(int32 line, int32 offset) const;

	/// The offset whose character begins nearest to \a x in the line.
	int32 OffsetAt(int32 line, float x) const;

private:
	float WidthOf(int32 from, int32 to) const;
	int32 BreakLine(int32 start, int32 end, float width) const;
	void AddLines(int32 start, int32 end);

	const std::string* fText;
	BFont fFont;
	std::vector<int32> fStarts;
	float fWidth;
	float fTabWidth;
	float fAscent;
	float fLineHeight;
};

/// The length of the UTF-8 character that begins at \a offset; 1 for a byte that begins none.
int32 CharacterLength(const std::string& text, int32 offset);

/// Where the character before \a offset begins; 0 at the start.
int32 CharacterBefore(const std::string& text, int32 offset);

} // namespace BPrivate

#endif // KITS_INTERFACE_TEXT_LAYOUT_H
