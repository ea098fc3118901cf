// SPDX-License-Identifier: MIT
// Whole numbers for lengths and coordinates, which may be anything.
#ifndef INTERFACE_WHOLE_PIXELS_H
#define INTERFACE_WHOLE_PIXELS_H

#include <algorithm>
#include <cmath>

#include <SupportDefs.h>

namespace BPrivate {

/// The whole part of \a value within ±2^29, which is far outside of any screen, and near enough that sums of two
/// stay in an int32; 0 for what is no number.
inline int32
WholePixels(float value)
{
	constexpr float kLimit = 1 << 29;
	return std::isnan(value) ? 0 : static_cast<int32>(std::clamp(value, -kLimit, kLimit));
}

} // namespace BPrivate

#endif // INTERFACE_WHOLE_PIXELS_H
