// SPDX-License-Identifier: MIT
// BString: construction, joining, inserting, removing and case.

#include <String.h>

#include <stdio.h>
#include <string.h>

#include <algorithm>
#include <string_view>

#include "support/StringBytes.h"

using namespace BPrivate;

namespace {

std::string
pass_set(const std::string& text, const char* set, const char* with)
{
	std::string result;
	for (char c : text) {
		if (c != '\0' && strchr(set, c) != nullptr)
			result += with;
		else
			result += c;
	}
	return result;
}

} // namespace


BString::BString() {}


BString::BString(const char* string)
	: fText(safe_text(string))
{
}


BString::BString(const BString& string)
	: fText(string.fText)
{
}


BString::BString(BString&& string) noexcept
	: fText(std::move(string.fText))
{
	string.fText.clear();
}


BString::BString(const char* string, int32 maxLength)
	: fText(clipped_text(string, maxLength))
{
}


BString::~BString() {}


const char*
BString::String() const
{
	return fText.c_str();
}


int32
BString::Length() const
{
	return static_cast<int32>(fText.size());
}


int32
BString::CountChars() const
{
	return static_cast<int32>(std::count_if(
		fText.begin(), fText.end(), [](char c) { return (static_cast<uchar>(c) & 0xc0) != 0x80; }));
}


bool
BString::IsEmpty() const
{
	return fText.empty();
}


// #pragma mark - setting


BString&
BString::operator=(const BString& string)
{
	fText = string.fText;
	return *this;
}


BString&
BString::operator=(BString&& string) noexcept
{
	if (this != &string) {
		fText = std::move(string.fText);
		string.fText.clear();
	}
	return *this;
}


BString&
BString::operator=(const char* string)
{
	SetTo(string);
	return *this;
}


BString&
BString::operator=(char c)
{
	SetTo(c, 1);
	return *this;
}


BString&
BString::SetTo(const char* string)
{
	fText = safe_text(string);
	return *this;
}


BString&
BString::SetTo(const char* string, int32 maxLength)
{
	fText = clipped_text(string, maxLength);
	return *this;
}


BString&
BString::SetTo(const BString& string)
{
	return *this = string;
}


BString&
BString::SetTo(const BString& string, int32 maxLength)
{
	return SetTo(string.String(), maxLength);
}


BString&
BString::SetTo(char c, int32 count)
{
	fText.assign(std::max(count, 0), c);
	return *this;
}


// #pragma mark - copying out


BString&
BString::CopyInto(BString& into, int32 fromOffset, int32 length) const
{
	into.fText = std::string(bytes_of(fText, fromOffset, length));
	return into;
}


void
BString::CopyInto(char* into, int32 fromOffset, int32 length) const
{
	if (into == nullptr)
		return;
	std::string_view bytes = bytes_of(fText, fromOffset, length);
	memcpy(into, bytes.data(), bytes.size());
}


BString&
BString::MoveInto(BString& into, int32 from, int32 length)
{
	std::string moved(bytes_of(fText, from, length));
	Remove(from, length);
	into.fText = std::move(moved);
	return into;
}


void
BString::MoveInto(char* into, int32 from, int32 length)
{
	if (into == nullptr)
		return;
	CopyInto(into, from, length);
	Remove(from, length);
}


// #pragma mark - appending and prepending


BString&
BString::operator+=(const BString& string)
{
	return Append(string);
}


BString&
BString::operator+=(const char* string)
{
	return Append(string);
}


BString&
BString::operator+=(char c)
{
	fText += c;
	return *this;
}


BString&
BString::Append(const BString& string)
{
	fText.append(string.fText);
	return *this;
}


BString&
BString::Append(const char* string)
{
	fText.append(safe_text(string));
	return *this;
}


BString&
BString::Append(const BString& string, int32 length)
{
	return Append(string.String(), length);
}


BString&
BString::Append(const char* string, int32 length)
{
	fText.append(clipped_text(string, length));
	return *this;
}


BString&
BString::Append(char c, int32 count)
{
	fText.append(std::max(count, 0), c);
	return *this;
}


BString&
BString::Prepend(const char* string)
{
	return Insert(string, 0);
}


BString&
BString::Prepend(const BString& string)
{
	return Insert(string, 0);
}


BString&
BString::Prepend(const char* string, int32 length)
{
	return Insert(string, length, 0);
}


BString&
BString::Prepend(const BString& string, int32 length)
{
	return Insert(string, length, 0);
}


BString&
BString::Prepend(char c, int32 count)
{
	return Insert(c, count, 0);
}


// #pragma mark - inserting


BString&
BString::Insert(const char* string, int32 position)
{
	return Insert(string, INT32_MAX, position);
}


BString&
BString::Insert(const char* string, int32 length, int32 position)
{
	std::string_view inserted = clipped_text(string, length);
	if (position < 0) {
		size_t skipped = std::min<size_t>(inserted.size(), -static_cast<int64>(position));
		inserted.remove_prefix(skipped);
		position = 0;
	}
	if (position <= Length())
		fText.insert(position, inserted);
	return *this;
}


BString&
BString::Insert(const char* string, int32 fromOffset, int32 length, int32 position)
{
	std::string_view all = safe_text(string);
	if (fromOffset < 0 || static_cast<size_t>(fromOffset) > all.size())
		return *this;
	return Insert(all.data() + fromOffset, length, position);
}


BString&
BString::Insert(const BString& string, int32 position)
{
	return Insert(string.String(), position);
}


BString&
BString::Insert(const BString& string, int32 length, int32 position)
{
	return Insert(string.String(), length, position);
}


BString&
BString::Insert(const BString& string, int32 fromOffset, int32 length, int32 position)
{
	return Insert(string.String(), fromOffset, length, position);
}


BString&
BString::Insert(char c, int32 count, int32 position)
{
	int64 inserted = count;
	if (position < 0) {
		inserted += position;
		position = 0;
	}
	if (position <= Length() && inserted > 0)
		fText.insert(position, inserted, c);
	return *this;
}


// #pragma mark - removing


BString&
BString::Truncate(int32 newLength, bool lazy)
{
	newLength = std::max(newLength, 0);
	if (newLength < Length())
		fText.resize(newLength);
	if (!lazy)
		fText.shrink_to_fit();
	return *this;
}


BString&
BString::Remove(int32 from, int32 length)
{
	int64 end = static_cast<int64>(from) + length;
	from = std::max(from, 0);
	if (end > from && from < Length())
		fText.erase(from, end - from);
	return *this;
}


BString&
BString::RemoveFirst(const BString& string)
{
	return RemoveFirst(string.String());
}


BString&
BString::RemoveLast(const BString& string)
{
	return RemoveLast(string.String());
}


BString&
BString::RemoveAll(const BString& string)
{
	return RemoveAll(string.String());
}


BString&
BString::RemoveFirst(const char* string)
{
	return ReplaceFirst(string, "");
}


BString&
BString::RemoveLast(const char* string)
{
	return ReplaceLast(string, "");
}


BString&
BString::RemoveAll(const char* string)
{
	return ReplaceAll(string, "");
}


BString&
BString::RemoveSet(const char* setOfBytesToRemove)
{
	return ReplaceSet(setOfBytesToRemove, "");
}


BString&
BString::ReplaceSet(const char* setOfBytes, char with)
{
	const char text[] = {with, '\0'};
	return ReplaceSet(setOfBytes, text);
}


BString&
BString::ReplaceSet(const char* setOfBytes, const char* with)
{
	if (setOfBytes != nullptr)
		fText = pass_set(fText, setOfBytes, with == nullptr ? "" : with);
	return *this;
}


// #pragma mark - bytes


char
BString::operator[](int32 index) const
{
	return fText.c_str()[index];
}


char
BString::ByteAt(int32 index) const
{
	return index >= 0 && index < Length() ? fText[index] : '\0';
}


BString&
BString::SetByteAt(int32 pos, char to)
{
	if (pos >= 0 && pos < Length())
		fText[pos] = to;
	return *this;
}


char*
BString::LockBuffer(int32 maxLength)
{
	if (maxLength > Length())
		fText.resize(maxLength, '\0');
	return fText.data();
}


BString&
BString::UnlockBuffer(int32 length)
{
	size_t kept = length < 0 ? strlen(fText.c_str()) : length;
	if (kept < fText.size())
		fText.resize(kept);
	return *this;
}


// #pragma mark - case


BString&
BString::ToLower()
{
	std::transform(fText.begin(), fText.end(), fText.begin(), ascii_lower);
	return *this;
}


BString&
BString::ToUpper()
{
	std::transform(fText.begin(), fText.end(), fText.begin(), ascii_upper);
	return *this;
}


BString&
BString::Capitalize()
{
	ToLower();
	if (!fText.empty())
		fText[0] = ascii_upper(fText[0]);
	return *this;
}


BString&
BString::CapitalizeEachWord()
{
	bool inWord = false;
	for (char& c : fText) {
		bool letter = is_ascii_letter(c);
		if (letter)
			c = inWord ? ascii_lower(c) : ascii_upper(c);
		inWord = letter;
	}
	return *this;
}


BString&
BString::Trim()
{
	constexpr const char* kSpaces = " \t\n\v\f\r";
	size_t last = fText.find_last_not_of(kSpaces);
	fText.erase(last == std::string::npos ? 0 : last + 1);
	fText.erase(0, std::min(fText.find_first_not_of(kSpaces), fText.size()));
	return *this;
}


// #pragma mark - appending values


BString&
BString::operator<<(const char* string)
{
	return Append(string);
}


BString&
BString::operator<<(const BString& string)
{
	return Append(string);
}


BString&
BString::operator<<(char c)
{
	fText += c;
	return *this;
}


BString&
BString::operator<<(bool value)
{
	return Append(value ? "true" : "false");
}


BString&
BString::operator<<(int value)
{
	fText += std::to_string(value);
	return *this;
}


BString&
BString::operator<<(unsigned int value)
{
	fText += std::to_string(value);
	return *this;
}


BString&
BString::operator<<(unsigned long value)
{
	fText += std::to_string(value);
	return *this;
}


BString&
BString::operator<<(long value)
{
	fText += std::to_string(value);
	return *this;
}


BString&
BString::operator<<(unsigned long long value)
{
	fText += std::to_string(value);
	return *this;
}


BString&
BString::operator<<(long long value)
{
	fText += std::to_string(value);
	return *this;
}


BString&
BString::operator<<(float value)
{
	return *this << static_cast<double>(value);
}


BString&
BString::operator<<(double value)
{
	// The longest double has 309 digits before its two decimals.
	char text[400];
	int length = snprintf(text, sizeof(text), "%.2f", value);
	return Append(text, length);
}
