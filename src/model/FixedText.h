// SPDX-License-Identifier: MIT
// Texts in fields of a fixed size.

#pragma once

#include <cstddef>
#include <cstring>

/// Copies as much of \a text into \a field as fits there with a terminator; null is ignored.
///
/// The text may be a part of the field.
template <size_t size>
void
SetFixedText(char (&field)[size], const char* text)
{
	if (text == nullptr)
		return;
	const size_t length = strnlen(text, size - 1);
	memmove(field, text, length);
	field[length] = '\0';
}
