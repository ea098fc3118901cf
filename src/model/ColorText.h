// SPDX-License-Identifier: MIT
// Colours as text: the form in which property values, form files and generated sources carry them.

#pragma once

#include <GraphicsDefs.h>

/// The longest text that RGBColorToStr() writes, with its terminator.
const int32 kColorTextSize = 20;

/// Writes \a color as "{red,green,blue,alpha}", each a decimal from 0 to 255, and returns \a buffer.
///
/// \a buffer: the caller's, kColorTextSize bytes or more. A null buffer is left alone.
char* RGBColorToStr(rgb_color color, char* buffer);

/// Reads the colour that \a text gives into \a color and returns the result.
///
/// Braces and blanks around the four decimals are optional; a number is cut to its low 8 bits, and
/// what is no number counts as 0. Channels that the text does not give keep what \a color held, so
/// initialise it. With a null \a text the colour is returned as it was.
rgb_color StrToRGBColor(const char* text, rgb_color* color);
