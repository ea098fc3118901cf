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


/// The first of \a placeholders that stands at \a text, in any case of its letters; null when none does.
const placeholder_value*
FindPlaceholder(const char* text, std::initializer_list<placeholder_value> placeholders)
{
	for (const placeholder_value& each : placeholders) {
		// Placeholders rarely share the letter behind their "$".
		if (LowerCase(text[1]) == LowerCase(each.placeholder[1])
			&& BeginsWith(text, each.placeholder))
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


/// Replaces all of \a placeholders at once. False, with \a text as it is, when one pass for each could come to
/// another result: when replacing one makes another.
bool
ReplaceInOnePass(BString& text, std::initializer_list<placeholder_value> placeholders)
{
	// Most statements hold no placeholder at all: their first character settles that quickly.
	const char* from = strchr(text.String(), '$');
	if (from == nullptr)
		return true;

	for (const placeholder_value& each : placeholders) {
		if (placeholders.size() > 1 && strchr(each.value, '$') != nullptr)
			return false;
	}

	const char* copied = text.String();
	const char* loneDollar = nullptr;
	std::string result;
	for (; from != nullptr; from = strchr(from, '$')) {
		const placeholder_value* found = FindPlaceholder(from, placeholders);
		if (found == nullptr) {
			loneDollar = from++;
			continue;
		}
		if (placeholders.size() > 1 && loneDollar != nullptr
			&& BeginsPlaceholder(std::string_view(loneDollar, from - loneDollar), placeholders))
			return false;

		if (copied == text.String())
			result.reserve(text.Length() + text.Length() / 8 + 64);
		loneDollar = nullptr;
		result.append(copied, from);
		result.append(found->value);
		copied = from + found->placeholder.length();
		from = copied;
	}
	if (copied != text.String()) {
		result.append(copied);
		text.SetTo(result.data(), static_cast<int32>(result.length()));
	}
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
IndentContinuationLines(BString& statement)
{
	const char* rest = statement.String();
	const char* lineBreak = strchr(rest, '\n');
	if (lineBreak == nullptr)
		return;

	std::string result;
	result.reserve(statement.Length() + 16);
	for (; lineBreak != nullptr; lineBreak = strchr(rest, '\n')) {
		result.append(rest, lineBreak + 1).append("  ");
		rest = lineBreak + 1;
	}
	result.append(rest);
	statement.SetTo(result.data(), static_cast<int32>(result.length()));
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
