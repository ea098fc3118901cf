// SPDX-License-Identifier: MIT
// Operations on the text of generated files: marked sections, placeholders, lines and function bodies.

#include "codegen/SourceText.h"

#include <string.h>

#include <string>
#include <string_view>

namespace {

/// Where the content of a section lies in a text: [from, to).
struct SectionRange {
	int32 from;
	int32 to;
};


BString
StartMarker(const char* name)
{
	BString marker("// [");
	marker << name << "]";
	return marker;
}


BString
EndMarker(const char* name)
{
	BString marker("// [END_");
	marker << name << "]";
	return marker;
}


bool
FindSection(const BString& text, const char* name, SectionRange* range)
{
	const BString startMarker = StartMarker(name);
	const int32 start = text.IFindFirst(startMarker);
	const int32 end = text.IFindFirst(EndMarker(name));
	if (start < 0 || end < 0)
		return false;

	// One character behind the marker belongs to it: the line break, whatever it is.
	range->from = start + startMarker.Length() + 1;
	range->to = end;
	return range->from <= range->to;
}


enum CommentState { kNoComment, kLineComment, kBlockComment };


CommentState
NextCommentState(CommentState state, const char* at, const char* begin)
{
	const char previous = at > begin ? at[-1] : '\0';
	if (*at == '\n')
		return state == kLineComment ? kNoComment : state;
	if (*at != '/')
		return state;
	if (at[1] == '/' || previous == '/')
		return kLineComment;
	if (at[1] == '*')
		return kBlockComment;
	if (previous == '*' && state == kBlockComment)
		return kNoComment;
	return state;
}


char
LowerCase(char c)
{
	return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}


/// Whether \a text, which ends with a zero byte, begins with \a prefix in any case of its letters.
bool
BeginsWith(const char* text, std::string_view prefix)
{
	for (size_t i = 0; i < prefix.length(); i++) {
		if (text[i] != prefix[i] && LowerCase(text[i]) != LowerCase(prefix[i]))
			return false;
	}
	return true;
}


/// The first of \a placeholders that stands at \a text, in any case of its letters; null when none does. \a end: of
/// the text, at its zero byte.
const placeholder_value*
FindPlaceholder(
	const char* text, const char* end, std::initializer_list<placeholder_value> placeholders)
{
	// Placeholders rarely share the letter behind their "$"; the two cases of a letter differ in one bit.
	constexpr int kCase = 'a' - 'A';
	for (const placeholder_value& each : placeholders) {
		if (((text[1] ^ each.placeholder[1]) & ~kCase) != 0)
			continue;
		const size_t length = each.placeholder.length();
		if (static_cast<size_t>(end - text) < length)
			continue;
		if (memcmp(text, each.placeholder.data(), length) == 0
			|| BeginsWith(text, each.placeholder))
			return &each;
	}
	return nullptr;
}


/// Whether one of \a placeholders would stand at \a start if the right text followed it.
bool
BeginsPlaceholder(std::string_view start, std::initializer_list<placeholder_value> placeholders)
{
	for (const placeholder_value& each : placeholders) {
		if (start.length() < each.placeholder.length()
			&& BeginsWith(each.placeholder.data(), start))
			return true;
	}
	return false;
}


/// What becomes of the line breaks in a text that is appended to another.
enum LineBreaks { kLineBreaksKept, kLineBreaksIndented };


void
AppendPiece(std::string_view piece, LineBreaks lineBreaks, std::string& text)
{
	if (lineBreaks == kLineBreaksIndented) {
		size_t lineBreak;
		while ((lineBreak = piece.find('\n')) != std::string_view::npos) {
			text.append(piece.data(), lineBreak + 1).append("  ");
			piece.remove_prefix(lineBreak + 1);
		}
	}
	text.append(piece);
}


/// Appends pieces of some bytes each to a text, most of them without asking it for room each time.
class PieceWriter {
public:
	explicit PieceWriter(std::string& text)
		: fText(text),
		  fLength(0)
	{
	}
	~PieceWriter() { Flush(); }

	void Append(std::string_view piece)
	{
		if (piece.length() > kSize - fLength) {
			Flush();
			if (piece.length() > kSize) {
				fText.append(piece);
				return;
			}
		}
		memcpy(fPieces + fLength, piece.data(), piece.length());
		fLength += piece.length();
	}

private:
	void Flush()
	{
		fText.append(fPieces, fLength);
		fLength = 0;
	}

	static const size_t kSize = 4096;

	std::string& fText;
	size_t fLength;
	char fPieces[kSize];
};


/// Whether putting one of \a placeholders in could make another.
bool
HasDollar(std::initializer_list<placeholder_value> placeholders)
{
	for (const placeholder_value& each : placeholders) {
		if (each.value.find('$') != std::string_view::npos)
			return true;
	}
	return false;
}


/// The first dollar sign from \a from to \a end; null when there is none.
const char*
FindDollar(const char* from, const char* end)
{
	return static_cast<const char*>(memchr(from, '$', end - from));
}


/// Appends \a whole with all of \a placeholders replaced at once. False, with \a text as it was, when one pass for
/// each could come to another result: when replacing one makes another.
bool
AppendInOnePass(const BString& whole, std::initializer_list<placeholder_value> placeholders,
	LineBreaks lineBreaks, std::string& text)
{
	const char* source = whole.String();
	const char* const end = source + whole.Length();
	const char* from = FindDollar(source, end);
	if (from == nullptr) {
		AppendPiece(std::string_view(source, end - source), lineBreaks, text);
		return true;
	}

	const size_t oldLength = text.length();
	const bool isOne = placeholders.size() == 1;
	const bool hasDollar = HasDollar(placeholders);
	const char* loneDollar = nullptr;
	bool makesAnother = false;
	{
		PieceWriter writer(text);
		const auto append = [&](std::string_view piece) {
			if (lineBreaks == kLineBreaksIndented) {
				size_t lineBreak;
				while ((lineBreak = piece.find('\n')) != std::string_view::npos) {
					writer.Append(piece.substr(0, lineBreak + 1));
					writer.Append("  ");
					piece.remove_prefix(lineBreak + 1);
				}
			}
			writer.Append(piece);
		};
		for (; from != nullptr; from = FindDollar(from, end)) {
			const placeholder_value* found = FindPlaceholder(from, end, placeholders);
			if (found == nullptr) {
				loneDollar = from++;
				continue;
			}
			makesAnother = !isOne
				&& ((hasDollar && found->value.find('$') != std::string_view::npos)
					|| (loneDollar != nullptr
						&& BeginsPlaceholder(
							std::string_view(loneDollar, from - loneDollar), placeholders)));
			if (makesAnother)
				break;

			append(std::string_view(source, from - source));
			append(found->value);
			loneDollar = nullptr;
			source = from + found->placeholder.length();
			from = source;
		}
		if (!makesAnother)
			append(std::string_view(source, end - source));
	}
	if (makesAnother)
		text.resize(oldLength);
	return !makesAnother;
}


/// Replaces all of \a placeholders at once. False, with \a text as it is, when one pass for each could come to
/// another result.
bool
ReplaceInOnePass(BString& text, std::initializer_list<placeholder_value> placeholders)
{
	if (FindDollar(text.String(), text.String() + text.Length()) == nullptr)
		return true;

	std::string result;
	result.reserve(text.Length() + text.Length() / 8 + 64);
	if (!AppendInOnePass(text, placeholders, kLineBreaksKept, result))
		return false;
	text.SetTo(result.data(), static_cast<int32>(result.length()));
	return true;
}


void
AppendWithoutTabs(const char* line, size_t length, BString& text)
{
	const char* const end = line + length;
	while (line < end) {
		const void* found = memchr(line, '\t', end - line);
		const char* tab = found != nullptr ? static_cast<const char*>(found) : end;
		text.Append(line, static_cast<int32>(tab - line));
		if (tab == end)
			break;
		text.Append("  ", 2);
		line = tab + 1;
	}
	text.Append("\n", 1);
}

} // namespace


bool
WriteMachineSection(const char* name, const BString& content, bool fileExists, BString& text)
{
	if (!fileExists) {
		text << StartMarker(name) << "\n" << content << EndMarker(name) << "\n\n";
		return true;
	}

	SectionRange range;
	if (!FindSection(text, name, &range))
		return false;

	text.Remove(range.from, range.to - range.from);
	text.Insert(content, range.from);
	return true;
}


void
WriteUserSection(const char* name, bool fileExists, const BString& fileText, BString& out)
{
	out << StartMarker(name) << "\n";
	SectionRange range;
	if (fileExists && FindSection(fileText, name, &range))
		out.Append(fileText.String() + range.from, range.to - range.from);
	out << EndMarker(name) << "\n\n";
}


void
ReplacePlaceholder(BString& text, const char* placeholder, const char* value)
{
	ReplacePlaceholders(text, {{placeholder, value}});
}


void
ReplacePlaceholders(BString& text, std::initializer_list<placeholder_value> placeholders)
{
	if (ReplaceInOnePass(text, placeholders))
		return;

	for (const placeholder_value& each : placeholders)
		ReplaceInOnePass(text, {each});
}


void
AppendStatement(std::string& text, const BString& statement,
	std::initializer_list<placeholder_value> placeholders)
{
	text.append("$TAB");
	if (!AppendInOnePass(statement, placeholders, kLineBreaksIndented, text)) {
		BString replaced(statement);
		ReplacePlaceholders(replaced, placeholders);
		AppendPiece(replaced.String(), kLineBreaksIndented, text);
	}
	text += '\n';
}


void
IndentContinuationLines(BString& statement)
{
	if (strchr(statement.String(), '\n') == nullptr)
		return;

	std::string indented;
	AppendPiece(statement.String(), kLineBreaksIndented, indented);
	statement.SetTo(indented.data(), static_cast<int32>(indented.length()));
}


int32
AppendNormalizedLines(const char* data, size_t length, BString& text)
{
	// Without content there may be no data either.
	if (length == 0)
		data = "";

	int32 cutLine = 0;
	size_t position = 0;
	for (int32 line = 1;; line++) {
		const size_t rest = length - position;
		const size_t window = rest > kMaxLineLength ? kMaxLineLength + 1 : rest;
		const char* start = data + position;
		const void* lineBreak = memchr(start, '\n', window);

		size_t lineLength = rest > kMaxLineLength ? kMaxLineLength : rest;
		if (lineBreak != nullptr)
			lineLength = static_cast<const char*>(lineBreak) - start;

		const size_t kept = strnlen(start, lineLength);
		AppendWithoutTabs(start, kept, text);
		const bool tooLong = lineBreak == nullptr && rest > kMaxLineLength;
		if (cutLine == 0 && (kept < lineLength || tooLong))
			cutLine = line;
		if (lineBreak == nullptr)
			return cutLine;
		position += lineLength + 1;
	}
}


BString
FunctionBody(const BString& text, long start)
{
	if (start < 0)
		start = 0;
	if (start >= text.Length())
		return BString();

	const char* const begin = text.String() + start;
	CommentState comment = kNoComment;
	bool opened = false;
	int32 depth = 0;
	for (const char* at = begin; *at != '\0'; at++) {
		comment = NextCommentState(comment, at, begin);
		if (*at == '{' && comment == kNoComment) {
			opened = true;
			depth++;
		} else if (*at == '}' && comment == kNoComment)
			depth--;
		if (opened && depth == 0)
			return BString(begin, static_cast<int32>(at - begin + 1));
	}
	return BString(begin);
}
