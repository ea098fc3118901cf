// SPDX-License-Identifier: MIT
// How failed checks show points, rects and colours.
#ifndef TESTS_SUPPORT_PRINTERS_H
#define TESTS_SUPPORT_PRINTERS_H

#include <ostream>

#include <GraphicsDefs.h>
#include <Rect.h>

inline void
PrintTo(const BPoint& point, std::ostream* out)
{
	*out << "(" << point.x << ", " << point.y << ")";
}


inline void
PrintTo(const BRect& rect, std::ostream* out)
{
	*out << "(" << rect.left << ", " << rect.top << ", " << rect.right << ", " << rect.bottom
		 << ")";
}


inline void
PrintTo(const rgb_color& color, std::ostream* out)
{
	*out << "{" << +color.red << ", " << +color.green << ", " << +color.blue << ", " << +color.alpha
		 << "}";
}

#endif // TESTS_SUPPORT_PRINTERS_H
