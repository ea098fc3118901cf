// SPDX-License-Identifier: MIT
// Rectangles of documents and messages, whose sides may be no numbers.

#pragma once

#include <cmath>

#include <Rect.h>

/// Whether all sides of \a rect are finite numbers.
inline bool
IsFinite(BRect rect)
{
	return std::isfinite(rect.left) && std::isfinite(rect.top) && std::isfinite(rect.right)
		&& std::isfinite(rect.bottom);
}
