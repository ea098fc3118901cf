// SPDX-License-Identifier: MIT
// Texts as standard C++ writes them: string literals, comments, statements.

#include "codegen/StandardText.h"

#include <stdint.h>
#include <stdio.h>

#include "codegen/SourceParts.h"
#include "codegen/SourceText.h"

namespace {

/// Lines must stay short enough to be read again.
constexpr int32 kMostLiteralBytes = 512;

/// A character of a text: its code point and the bytes that stand for it.
struct text_character {
	uint32_t code;
	std::string_view bytes;
	bool isValid; // UTF-8; otherwise one byte
};


bool
IsContinuation(char c)
{
	return (static_cast<unsigned char>(c) & 0xc0) == 0x80;
}


text_character
CharacterAt(std::string_view text, size_t position)
{
	static constexpr uint32_t kSmallest[] = {0, 0, 0x80, 0x800, 0x10000};
	const unsigned char lead = static_cast<unsigned char>(text[position]);
	const text_character invalid = {lead, text.substr(position, 1), false};
	if (lead < 0x80)
		return {lead, text.substr(position, 1), true};

	size_t length = 0;
	if (lead >= 0xc2 && lead <= 0xdf)
		length = 2;
	else if (lead >= 0xe0 && lead <= 0xef)
		length = 3;
	else if (lead >= 0xf0 && lead <= 0xf4)
		length = 4;
	if (length == 0 || position + length > text.length())
		return invalid;

	uint32_t code = lead & (0x7f >> length);
	for (size_t i = 1; i < length; i++) {
		const char next = text[position + i];
		if (!IsContinuation(next))
			return invalid;
		code = code << 6 | (static_cast<unsigned char>(next) & 0x3f);
	}
	const bool isSurrogate = code >= 0xd800 && code <= 0xdfff;
	if (code < kSmallest[length] || code > 0x10ffff || isSurrogate)
		return invalid;
	return {code, text.substr(position, length), true};
}


/// A character that is not seen but has an effect: control characters, line separators, marks that turn the
/// direction of writing.
bool
IsControl(uint32_t code)
{
	return code < 0x20 || (code >= 0x7f && code < 0xa0) || (code >= 0x2028 && code <= 0x202e)
		|| (code >= 0x2066 && code <= 0x2069) || code == 0xfeff;
}


/// A space that is none for a compiler.
bool
IsOddSpace(uint32_t code)
{
	return code == 0xa0 || code == 0x1680 || (code >= 0x2000 && code <= 0x200b) || code == 0x202f
		|| code == 0x205f || code == 0x3000 || code == 0xfeff;
}


bool
IsLetter(char c)
{
	return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
}


void
AppendBytes(BString& text, std::string_view bytes)
{
	text.Append(bytes.data(), static_cast<int32>(bytes.length()));
}


void
AppendEscapes(BString& text, std::string_view bytes)
{
	for (const char byte : bytes) {
		// Always three digits: whatever follows is no part of it.
		char escape[8];
		snprintf(escape, sizeof(escape), "\\%03o", static_cast<unsigned char>(byte));
		text << escape;
	}
}


/// Appends a character of a literal, of which only quotes and backslashes have been seen to.
void
AppendLiteralCharacter(BString& text, const text_character& character, bool isAfterQuestionMark)
{
	if (character.isValid && character.code == '\n')
		text << "\\n";
	else if (character.isValid && character.code == '\t')
		text << "\\t";
	else if (character.isValid && character.code == '\r')
		text << "\\r";
	else if (!character.isValid || IsControl(character.code))
		AppendEscapes(text, character.bytes);
	else if (character.code == '?' && isAfterQuestionMark)
		text << "\\?";
	else
		AppendBytes(text, character.bytes);
}


/// Appends the character at \a position of \a text, escaped for a literal; returns how many bytes it has.
size_t
AppendEscaped(BString& escaped, std::string_view text, size_t position)
{
	const text_character character = CharacterAt(text, position);
	const char byte = text[position];
	const bool beginsPlaceholder =
		byte == '$' && position + 1 < text.length() && IsLetter(text[position + 1]);
	if (byte == '"' || byte == '\\')
		escaped << "\\" << byte;
	else if (beginsPlaceholder)
		AppendEscapes(escaped, character.bytes);
	else
		AppendLiteralCharacter(escaped, character, position > 0 && text[position - 1] == '?');
	return character.bytes.length();
}


/// The literal \a literal, quotes included, as its library wrote it, but for what compilers warn of.
void
AppendPlainLiteral(BString& text, std::string_view literal)
{
	for (size_t i = 0; i < literal.length();) {
		if (literal[i] == '\\') {
			AppendBytes(text, literal.substr(i, 2));
			i += 2;
			continue;
		}
		const text_character character = CharacterAt(literal, i);
		AppendLiteralCharacter(text, character, i > 0 && literal[i - 1] == '?');
		i += character.bytes.length();
	}
}


void
AppendPlainCode(BString& text, std::string_view code)
{
	for (size_t i = 0; i < code.length();) {
		const text_character character = CharacterAt(code, i);
		if (character.isValid && IsOddSpace(character.code))
			text << " ";
		else
			AppendBytes(text, character.bytes);
		i += character.bytes.length();
	}
}


void
AppendPlainPart(BString& text, const source_part& part)
{
	switch (part.kind) {
		case SOURCE_CODE:
			AppendPlainCode(text, part.text);
			break;

		case SOURCE_STRING:
		case SOURCE_CHARACTER:
			AppendPlainLiteral(text, part.text);
			break;

		default:
			AppendBytes(text, part.text);
			break;
	}
}

} // namespace


BString
EscapedText(std::string_view text)
{
	BString escaped;
	for (size_t i = 0; i < text.length();)
		i += AppendEscaped(escaped, text, i);
	return escaped;
}


BString
StringLiteral(std::string_view text)
{
	BString literal("\"");
	int32 lineStart = 0;
	for (size_t i = 0; i < text.length();) {
		if (literal.Length() - lineStart > kMostLiteralBytes) {
			literal << "\"\n    \"";
			lineStart = literal.Length();
		}
		i += AppendEscaped(literal, text, i);
	}
	literal << "\"";
	return literal;
}


BString
CommentText(std::string_view text)
{
	BString comment;
	for (size_t i = 0; i < text.length();) {
		const text_character character = CharacterAt(text, i);
		const bool isTrigraph = text[i] == '?' && i > 0 && text[i - 1] == '?';
		if (!character.isValid || IsControl(character.code) || isTrigraph)
			comment << " ";
		else if (text[i] == '\\')
			comment << "/";
		else
			AppendBytes(comment, character.bytes);
		i += character.bytes.length();
	}
	return comment;
}


BString
PlainSource(std::string_view source)
{
	BString plain;
	TSourceParts parts(source);
	source_part part;
	while (parts.Next(&part))
		AppendPlainPart(plain, part);
	return plain;
}


BString
FilledStatement(std::string_view statement, const char* component, std::string_view value)
{
	const BString codeValue = PlainSource(value);
	const BString textValue = EscapedText(value);
	BString filled;
	TSourceParts parts(statement);
	source_part part;
	while (parts.Next(&part)) {
		BString plain;
		AppendPlainPart(plain, part);
		const BString& partValue = part.kind == SOURCE_STRING ? textValue : codeValue;
		ReplacePlaceholder(plain, "$COMPONENT", component);
		ReplacePlaceholder(plain, "$VALUE", partValue.String());
		filled << plain;
	}
	return filled;
}
