// SPDX-License-Identifier: MIT
// BString: comparing, finding and replacing.

#include <String.h>

#include <string.h>

#include <algorithm>
#include <functional>
#include <string_view>

#include "support/StringBytes.h"

using namespace BPrivate;

namespace {

enum class Case { kExact, kIgnored };


bool
same_ignoring_case(char a, char b)
{
	return ascii_lower(a) == ascii_lower(b);
}


int
compare(std::string_view a, std::string_view b, Case letters)
{
	if (letters == Case::kExact)
		return a.compare(b);

	size_t shared = std::min(a.size(), b.size());
	for (size_t i = 0; i < shared; i++) {
		int difference =
			static_cast<uchar>(ascii_lower(a[i])) - static_cast<uchar>(ascii_lower(b[i]));
		if (difference != 0)
			return difference;
	}
	return a.size() == b.size() ? 0 : (a.size() < b.size() ? -1 : 1);
}


int32
find_first(std::string_view text, std::string_view sought, int32 from, Case letters)
{
	if (from < 0 || static_cast<size_t>(from) > text.size())
		return B_ERROR;
	if (letters == Case::kExact) {
		size_t found = text.find(sought, from);
		return found == std::string_view::npos ? B_ERROR : static_cast<int32>(found);
	}

	// A first byte that is no letter is found by itself, which is much faster.
	const char first = sought.empty() ? 'a' : ascii_lower(sought[0]);
	if (first < 'a' || first > 'z') {
		size_t at = text.find(first, from);
		for (; at != std::string_view::npos; at = text.find(first, at + 1)) {
			if (text.size() - at < sought.size())
				break;
			if (std::equal(sought.begin(), sought.end(), text.begin() + at, same_ignoring_case))
				return static_cast<int32>(at);
		}
		return B_ERROR;
	}

	auto found = std::search(
		text.begin() + from, text.end(), sought.begin(), sought.end(), same_ignoring_case);
	// An empty text is found at the very end too.
	if (found == text.end() && !sought.empty())
		return B_ERROR;
	return static_cast<int32>(found - text.begin());
}


int32
find_last(std::string_view text, std::string_view sought, int32 before, Case letters)
{
	if (before < 0)
		return B_ERROR;
	text = text.substr(0, before);
	if (letters == Case::kExact) {
		size_t found = text.rfind(sought);
		return found == std::string_view::npos ? B_ERROR : static_cast<int32>(found);
	}

	if (sought.empty())
		return static_cast<int32>(text.size());
	auto found =
		std::find_end(text.begin(), text.end(), sought.begin(), sought.end(), same_ignoring_case);
	return found == text.end() ? B_ERROR : static_cast<int32>(found - text.begin());
}


int32
find_first(const std::string& text, const char* sought, int32 from, Case letters)
{
	return sought == nullptr ? B_BAD_VALUE
							 : find_first(std::string_view(text), safe_text(sought), from, letters);
}


int32
find_last(const std::string& text, const char* sought, int32 before, Case letters)
{
	return sought == nullptr
		? B_BAD_VALUE
		: find_last(std::string_view(text), safe_text(sought), before, letters);
}


void
replace_at(std::string& text, int32 position, const char* sought, const char* with)
{
	if (position < 0 || sought == nullptr || sought[0] == '\0')
		return;
	// Either text may lie inside the one that changes.
	std::string replacement(safe_text(with));
	text.replace(position, strlen(sought), replacement);
}


void
replace_all(std::string& text, const char* sought, const char* with, int32 from, Case letters)
{
	std::string_view pattern = safe_text(sought);
	int32 found = pattern.empty() ? B_ERROR : find_first(text, sought, from, letters);
	if (found < 0)
		return;

	std::string_view replacement = safe_text(with);
	std::string result;
	size_t copied = 0;
	while (found >= 0) {
		result.append(text, copied, found - copied);
		result.append(replacement);
		copied = found + pattern.size();
		found = find_first(text, sought, static_cast<int32>(copied), letters);
	}
	result.append(text, copied);
	text = std::move(result);
}


void
replace_bytes(std::string& text, char replaceThis, char withThis, int32 from, Case letters)
{
	if (from < 0 || static_cast<size_t>(from) > text.size())
		return;
	std::replace_if(
		text.begin() + from, text.end(),
		[=](char c) {
			return c == replaceThis
				|| (letters == Case::kIgnored && same_ignoring_case(c, replaceThis));
		},
		withThis);
}

} // namespace


// #pragma mark - comparing


bool
BString::operator<(const BString& string) const
{
	return Compare(string) < 0;
}


bool
BString::operator<=(const BString& string) const
{
	return Compare(string) <= 0;
}


bool
BString::operator==(const BString& string) const
{
	return fText == string.fText;
}


bool
BString::operator>=(const BString& string) const
{
	return Compare(string) >= 0;
}


bool
BString::operator>(const BString& string) const
{
	return Compare(string) > 0;
}


bool
BString::operator!=(const BString& string) const
{
	return fText != string.fText;
}


bool
BString::operator<(const char* string) const
{
	return Compare(string) < 0;
}


bool
BString::operator<=(const char* string) const
{
	return Compare(string) <= 0;
}


bool
BString::operator==(const char* string) const
{
	return Compare(string) == 0;
}


bool
BString::operator>=(const char* string) const
{
	return Compare(string) >= 0;
}


bool
BString::operator>(const char* string) const
{
	return Compare(string) > 0;
}


bool
BString::operator!=(const char* string) const
{
	return Compare(string) != 0;
}


BString::operator const char*() const
{
	return String();
}


bool
operator<(const char* a, const BString& b)
{
	return b.Compare(a) > 0;
}


bool
operator<=(const char* a, const BString& b)
{
	return b.Compare(a) >= 0;
}


bool
operator==(const char* a, const BString& b)
{
	return b.Compare(a) == 0;
}


bool
operator>(const char* a, const BString& b)
{
	return b.Compare(a) < 0;
}


bool
operator>=(const char* a, const BString& b)
{
	return b.Compare(a) <= 0;
}


bool
operator!=(const char* a, const BString& b)
{
	return b.Compare(a) != 0;
}


int
BString::Compare(const BString& string) const
{
	return compare(fText, string.fText, Case::kExact);
}


int
BString::Compare(const char* string) const
{
	return compare(fText, safe_text(string), Case::kExact);
}


int
BString::Compare(const BString& string, int32 length) const
{
	return Compare(string.String(), length);
}


int
BString::Compare(const char* string, int32 length) const
{
	return compare(clipped_text(String(), length), clipped_text(string, length), Case::kExact);
}


int
BString::ICompare(const BString& string) const
{
	return compare(fText, string.fText, Case::kIgnored);
}


int
BString::ICompare(const char* string) const
{
	return compare(fText, safe_text(string), Case::kIgnored);
}


int
BString::ICompare(const BString& string, int32 length) const
{
	return ICompare(string.String(), length);
}


int
BString::ICompare(const char* string, int32 length) const
{
	return compare(clipped_text(String(), length), clipped_text(string, length), Case::kIgnored);
}


// #pragma mark - finding


int32
BString::FindFirst(const BString& string) const
{
	return FindFirst(string, 0);
}


int32
BString::FindFirst(const char* string) const
{
	return FindFirst(string, 0);
}


int32
BString::FindFirst(const BString& string, int32 fromOffset) const
{
	return find_first(fText, std::string_view(string.fText), fromOffset, Case::kExact);
}


int32
BString::FindFirst(const char* string, int32 fromOffset) const
{
	return find_first(fText, string, fromOffset, Case::kExact);
}


int32
BString::FindFirst(char c) const
{
	return FindFirst(c, 0);
}


int32
BString::FindFirst(char c, int32 fromOffset) const
{
	return find_first(fText, std::string_view(&c, 1), fromOffset, Case::kExact);
}


int32
BString::FindLast(const BString& string) const
{
	return FindLast(string, Length());
}


int32
BString::FindLast(const char* string) const
{
	return FindLast(string, Length());
}


int32
BString::FindLast(const BString& string, int32 beforeOffset) const
{
	return find_last(fText, std::string_view(string.fText), beforeOffset, Case::kExact);
}


int32
BString::FindLast(const char* string, int32 beforeOffset) const
{
	return find_last(fText, string, beforeOffset, Case::kExact);
}


int32
BString::FindLast(char c) const
{
	return FindLast(c, Length());
}


int32
BString::FindLast(char c, int32 beforeOffset) const
{
	return find_last(fText, std::string_view(&c, 1), beforeOffset, Case::kExact);
}


int32
BString::IFindFirst(const BString& string) const
{
	return IFindFirst(string, 0);
}


int32
BString::IFindFirst(const char* string) const
{
	return IFindFirst(string, 0);
}


int32
BString::IFindFirst(const BString& string, int32 fromOffset) const
{
	return find_first(fText, std::string_view(string.fText), fromOffset, Case::kIgnored);
}


int32
BString::IFindFirst(const char* string, int32 fromOffset) const
{
	return find_first(fText, string, fromOffset, Case::kIgnored);
}


int32
BString::IFindLast(const BString& string) const
{
	return IFindLast(string, Length());
}


int32
BString::IFindLast(const char* string) const
{
	return IFindLast(string, Length());
}


int32
BString::IFindLast(const BString& string, int32 beforeOffset) const
{
	return find_last(fText, std::string_view(string.fText), beforeOffset, Case::kIgnored);
}


int32
BString::IFindLast(const char* string, int32 beforeOffset) const
{
	return find_last(fText, string, beforeOffset, Case::kIgnored);
}


// #pragma mark - replacing


BString&
BString::ReplaceFirst(char replaceThis, char withThis)
{
	return SetByteAt(FindFirst(replaceThis), withThis);
}


BString&
BString::ReplaceLast(char replaceThis, char withThis)
{
	return SetByteAt(FindLast(replaceThis), withThis);
}


BString&
BString::ReplaceAll(char replaceThis, char withThis, int32 fromOffset)
{
	replace_bytes(fText, replaceThis, withThis, fromOffset, Case::kExact);
	return *this;
}


BString&
BString::ReplaceFirst(const char* replaceThis, const char* withThis)
{
	replace_at(fText, FindFirst(replaceThis), replaceThis, withThis);
	return *this;
}


BString&
BString::ReplaceLast(const char* replaceThis, const char* withThis)
{
	replace_at(fText, FindLast(replaceThis), replaceThis, withThis);
	return *this;
}


BString&
BString::ReplaceAll(const char* replaceThis, const char* withThis, int32 fromOffset)
{
	replace_all(fText, replaceThis, withThis, fromOffset, Case::kExact);
	return *this;
}


BString&
BString::IReplaceFirst(char replaceThis, char withThis)
{
	const char sought[] = {replaceThis, '\0'};
	return SetByteAt(replaceThis == '\0' ? B_ERROR : IFindFirst(sought), withThis);
}


BString&
BString::IReplaceAll(char replaceThis, char withThis, int32 fromOffset)
{
	replace_bytes(fText, replaceThis, withThis, fromOffset, Case::kIgnored);
	return *this;
}


BString&
BString::IReplaceFirst(const char* replaceThis, const char* withThis)
{
	replace_at(fText, IFindFirst(replaceThis), replaceThis, withThis);
	return *this;
}


BString&
BString::IReplaceAll(const char* replaceThis, const char* withThis, int32 fromOffset)
{
	replace_all(fText, replaceThis, withThis, fromOffset, Case::kIgnored);
	return *this;
}
