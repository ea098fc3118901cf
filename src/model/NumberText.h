// SPDX-License-Identifier: MIT
// Whole numbers as text. Not for component libraries.

#pragma once

#include <cstdlib>

/// The number that \a text begins with, as strtol() gives it: 0 when it begins with none.
///
/// Of the short ones without a sign, which a form has thousands of, it is had in a fraction of the time.
inline long
NumberIn(const char* text)
{
	constexpr int kMostDigits = 9;
	long number = 0;
	int digits = 0;
	for (; text[digits] >= '0' && text[digits] <= '9' && digits <= kMostDigits; digits++)
		number = number * 10 + (text[digits] - '0');
	return digits > 0 && digits <= kMostDigits ? number : strtol(text, nullptr, 10);
}
