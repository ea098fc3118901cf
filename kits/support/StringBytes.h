// SPDX-License-Identifier: MIT
// What the parts of BString share: clipped views of bytes, and ASCII case.

#ifndef _STRING_BYTES_H
#define _STRING_BYTES_H

#include <string.h>

#include <algorithm>
#include <string_view>

#include <SupportDefs.h>

namespace BPrivate {

inline std::string_view
safe_text(const char* string)
{
	return string == nullptr ? std::string_view() : std::string_view(string);
}


/// At most \a maxLength bytes of \a string; never reads beyond them.
inline std::string_view
clipped_text(const char* string, int32 maxLength)
{
	if (string == nullptr || maxLength <= 0)
		return std::string_view();
	return std::string_view(string, strnlen(string, maxLength));
}


/// The bytes [from, from + length) of \a text, as far as they are inside.
inline std::string_view
bytes_of(std::string_view text, int32 from, int32 length)
{
	int64 end = std::min<int64>(static_cast<int64>(from) + length, text.size());
	int64 start = std::max(from, 0);
	if (start >= end)
		return std::string_view();
	return text.substr(start, end - start);
}


inline char
ascii_lower(char c)
{
	return c >= 'A' && c <= 'Z' ? c - 'A' + 'a' : c;
}


inline char
ascii_upper(char c)
{
	return c >= 'a' && c <= 'z' ? c - 'a' + 'A' : c;
}


inline bool
is_ascii_letter(char c)
{
	return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
}

} // namespace BPrivate

#endif // _STRING_BYTES_H
