// SPDX-License-Identifier: MIT
// BPoint beyond what its header does inline.
#include <Point.h>

#include <algorithm>
#include <cstdio>

#include <Rect.h>

const BPoint B_ORIGIN(0, 0);


void
BPoint::ConstrainTo(BRect rect)
{
	x = std::max(std::min(x, rect.right), rect.left);
	y = std::max(std::min(y, rect.bottom), rect.top);
}


void
BPoint::PrintToStream() const
{
	std::printf("BPoint(x:%f, y:%f)\n", x, y);
}
