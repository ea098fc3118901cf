// SPDX-License-Identifier: MIT

#include "ArrowLook.h"

#include <cmath>

#include <View.h>

namespace BPrivate {

void
DrawArrowHead(BView* view, BRect frame, ArrowDirection direction, float size, rgb_color color)
{
	const float x = std::floor((frame.left + frame.right) / 2);
	const float y = std::floor((frame.top + frame.bottom) / 2);
	const bool horizontal =
		direction == ArrowDirection::kLeft || direction == ArrowDirection::kRight;
	const float sign =
		direction == ArrowDirection::kRight || direction == ArrowDirection::kDown ? 1 : -1;
	const float back = -sign * std::floor(size / 2);
	const float tip = back + sign * size;

	view->SetHighColor(color);
	if (horizontal) {
		view->FillTriangle(
			BPoint(x + back, y - size), BPoint(x + back, y + size), BPoint(x + tip, y));
	} else {
		view->FillTriangle(
			BPoint(x - size, y + back), BPoint(x + size, y + back), BPoint(x, y + tip));
	}
}

} // namespace BPrivate
