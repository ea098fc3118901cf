// SPDX-License-Identifier: MIT
// Operations on the text of generated files: marked sections, placeholders, lines and function bodies.

#pragma once

#include <stddef.h>

#include <initializer_list>
#include <string>
#include <string_view>

#include <String.h>

/// The longest line, in bytes without its line break, that is read from an existing file.
inline constexpr size_t kMaxLineLength = 1023;

/// Writes \a content between the markers "// [name]" and "// [END_name]".
///
/// For a new file (\a fileExists false) the section is appended to \a text with both markers. In an existing
/// file, whose old content \a text then is, what stands between the markers is replaced; the first occurrence
/// of each marker counts, in any case of its letters. \a content is expected to end with a line break.
/// Returns false, and leaves \a text as it is, when an existing file lacks a marker or its end marker does not
/// follow the start marker.
bool WriteMachineSection(const char* name, const BString& content, bool fileExists, BString& text);

/// Appends the section \a name to \a out with the content that it has in \a fileText, the file's old text.
///
/// The section is empty for a new file and for one in which a marker is missing.
void WriteUserSection(const char* name, bool fileExists, const BString& fileText, BString& out);

/// Replaces every \a placeholder in \a text by \a value, in any case of its letters and in one pass:
/// what was put in is not searched again.
void ReplacePlaceholder(BString& text, const char* placeholder, const char* value);

/// A word that begins with its only "$", as a text with its zero byte, and what it becomes.
struct placeholder_value {
	std::string_view placeholder;
	std::string_view value;
};

/// Replaces several placeholders, one after the other: what the first put in is searched for the second.
void ReplacePlaceholders(BString& text, std::initializer_list<placeholder_value> placeholders);

/// Appends \a statement to \a text, with its placeholders replaced as ReplacePlaceholders() does it and its
/// second and later lines then indented, as a line of its own that "$TAB" indents.
void AppendStatement(std::string& text, const BString& statement,
	std::initializer_list<placeholder_value> placeholders);

/// Indents the second and every later line of a statement by two spaces.
void IndentContinuationLines(BString& statement);

/// Appends the lines of \a data to \a text, each ended by a line break and with tabs turned into two spaces.
///
/// What follows the last line break is a line too, even when it is empty, so text that ends with a line break
/// gains an empty line. A line holds at most kMaxLineLength bytes and no zero byte.
/// Returns 0, or the number of the first line (from 1) that was cut: only its first kMaxLineLength bytes, or
/// those before its zero byte, are kept. Nothing is read after a line that is too long.
int32 AppendNormalizedLines(const char* data, size_t length, BString& text);

/// The text from \a start up to and including the brace that closes the first opening brace behind it.
///
/// Braces in comments do not count, those in string and character literals do. Without a closing brace
/// everything from \a start on is returned; a negative \a start counts as 0.
BString FunctionBody(const BString& text, long start);
