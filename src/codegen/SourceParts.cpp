// SPDX-License-Identifier: MIT
// Cuts C++ source into code, literals and comments.

#include "codegen/SourceParts.h"

#include <algorithm>

namespace {

bool
IsDigit(char c)
{
	return c >= '0' && c <= '9';
}


bool
IsWordByte(char c)
{
	return c == '_' || IsDigit(c) || (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
}


/// The word, or the number with its separators, that ends at the end of \a text.
std::string_view
LastWord(std::string_view text)
{
	size_t start = text.length();
	while (start > 0 && (IsWordByte(text[start - 1]) || text[start - 1] == '\''))
		start--;
	return text.substr(start);
}


bool
IsRawPrefix(std::string_view word)
{
	return word == "R" || word == "u8R" || word == "uR" || word == "UR" || word == "LR";
}

} // namespace


TSourceParts::TSourceParts(std::string_view source)
	: fSource(source),
	  fPosition(0),
	  fCodeStart(0)
{
}


bool
TSourceParts::Next(source_part* part)
{
	if (fPosition >= fSource.length())
		return false;

	const size_t start = fPosition;
	part->kind = KindAt(start);
	if (part->kind == SOURCE_CODE)
		fCodeStart = start;
	fPosition = EndOf(part->kind, start);
	if (part->kind != SOURCE_CODE)
		fCodeStart = fPosition;
	part->text = fSource.substr(start, fPosition - start);
	return true;
}


/// What begins at \a position, where neither a literal nor a comment is open.
source_part_kind
TSourceParts::KindAt(size_t position) const
{
	const std::string_view before = fSource.substr(fCodeStart, position - fCodeStart);
	if (fSource[position] == '"')
		return IsRawPrefix(LastWord(before)) ? SOURCE_RAW_STRING : SOURCE_STRING;
	if (fSource[position] == '\'') {
		// In a number it divides the digits.
		const std::string_view word = LastWord(before);
		return !word.empty() && IsDigit(word[0]) ? SOURCE_CODE : SOURCE_CHARACTER;
	}
	const std::string_view mark = fSource.substr(position, 2);
	return mark == "//" || mark == "/*" ? SOURCE_COMMENT : SOURCE_CODE;
}


size_t
TSourceParts::EndOf(source_part_kind kind, size_t start) const
{
	switch (kind) {
		case SOURCE_STRING:
		case SOURCE_CHARACTER:
			return EndOfLiteral(start);

		case SOURCE_RAW_STRING:
			return EndOfRawString(start);

		case SOURCE_COMMENT:
			return EndOfComment(start);

		default:
			return EndOfCode(start);
	}
}


size_t
TSourceParts::EndOfCode(size_t start) const
{
	size_t end = start + 1;
	while (end < fSource.length() && KindAt(end) == SOURCE_CODE)
		end++;
	return end;
}


size_t
TSourceParts::EndOfLiteral(size_t start) const
{
	size_t end = start + 1;
	while (end < fSource.length() && fSource[end] != fSource[start])
		end += fSource[end] == '\\' ? 2 : 1;
	return std::min(end + 1, fSource.length());
}


size_t
TSourceParts::EndOfRawString(size_t start) const
{
	const size_t bracket = fSource.find('(', start);
	if (bracket == std::string_view::npos)
		return fSource.length();

	const std::string_view delimiter = fSource.substr(start + 1, bracket - start - 1);
	for (size_t at = fSource.find(')', bracket); at != std::string_view::npos;
		 at = fSource.find(')', at + 1)) {
		const std::string_view behind = fSource.substr(at + 1);
		if (behind.substr(0, delimiter.length()) == delimiter
			&& behind.substr(delimiter.length(), 1) == "\"")
			return at + 1 + delimiter.length() + 1;
	}
	return fSource.length();
}


size_t
TSourceParts::EndOfComment(size_t start) const
{
	if (fSource[start + 1] == '*') {
		const size_t end = fSource.find("*/", start + 2);
		return end == std::string_view::npos ? fSource.length() : end + 2;
	}

	size_t end = fSource.find('\n', start);
	while (end != std::string_view::npos && fSource[end - 1] == '\\')
		end = fSource.find('\n', end + 1);
	return end == std::string_view::npos ? fSource.length() : end;
}
