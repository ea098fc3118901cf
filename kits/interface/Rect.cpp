// SPDX-License-Identifier: MIT
// BRect: moving, insetting and combining rectangles.
#include <Rect.h>

#include <algorithm>
#include <cmath>
#include <cstdio>

#include "interface/WholePixels.h"

using BPrivate::WholePixels;

void
BRect::Set(float left, float top, float right, float bottom)
{
	this->left = left;
	this->top = top;
	this->right = right;
	this->bottom = bottom;
}


void
BRect::PrintToStream() const
{
	std::printf("BRect(l:%.1f, t:%.1f, r:%.1f, b:%.1f)\n", left, top, right, bottom);
}


void
BRect::SetLeftTop(const BPoint point)
{
	left = point.x;
	top = point.y;
}


void
BRect::SetRightBottom(const BPoint point)
{
	right = point.x;
	bottom = point.y;
}


void
BRect::SetLeftBottom(const BPoint point)
{
	left = point.x;
	bottom = point.y;
}


void
BRect::SetRightTop(const BPoint point)
{
	right = point.x;
	top = point.y;
}


void
BRect::InsetBy(BPoint inset)
{
	InsetBy(inset.x, inset.y);
}


void
BRect::InsetBy(float dx, float dy)
{
	left += dx;
	top += dy;
	right -= dx;
	bottom -= dy;
}


void
BRect::OffsetBy(BPoint delta)
{
	OffsetBy(delta.x, delta.y);
}


void
BRect::OffsetBy(float dx, float dy)
{
	left += dx;
	top += dy;
	right += dx;
	bottom += dy;
}


void
BRect::OffsetTo(BPoint offset)
{
	OffsetTo(offset.x, offset.y);
}


void
BRect::OffsetTo(float x, float y)
{
	right = x + Width();
	bottom = y + Height();
	left = x;
	top = y;
}


BRect&
BRect::InsetBySelf(BPoint inset)
{
	InsetBy(inset);
	return *this;
}


BRect&
BRect::InsetBySelf(float dx, float dy)
{
	InsetBy(dx, dy);
	return *this;
}


BRect
BRect::InsetByCopy(BPoint inset) const
{
	return BRect(*this).InsetBySelf(inset);
}


BRect
BRect::InsetByCopy(float dx, float dy) const
{
	return BRect(*this).InsetBySelf(dx, dy);
}


BRect&
BRect::OffsetBySelf(BPoint offset)
{
	OffsetBy(offset);
	return *this;
}


BRect&
BRect::OffsetBySelf(float dx, float dy)
{
	OffsetBy(dx, dy);
	return *this;
}


BRect
BRect::OffsetByCopy(BPoint offset) const
{
	return BRect(*this).OffsetBySelf(offset);
}


BRect
BRect::OffsetByCopy(float dx, float dy) const
{
	return BRect(*this).OffsetBySelf(dx, dy);
}


BRect&
BRect::OffsetToSelf(BPoint offset)
{
	OffsetTo(offset);
	return *this;
}


BRect&
BRect::OffsetToSelf(float x, float y)
{
	OffsetTo(x, y);
	return *this;
}


BRect
BRect::OffsetToCopy(BPoint offset) const
{
	return BRect(*this).OffsetToSelf(offset);
}


BRect
BRect::OffsetToCopy(float x, float y) const
{
	return BRect(*this).OffsetToSelf(x, y);
}


bool
BRect::operator==(BRect other) const
{
	return left == other.left && top == other.top && right == other.right && bottom == other.bottom;
}


BRect
BRect::operator&(BRect other) const
{
	return BRect(std::max(left, other.left), std::max(top, other.top), std::min(right, other.right),
		std::min(bottom, other.bottom));
}


BRect
BRect::operator|(BRect other) const
{
	return BRect(std::min(left, other.left), std::min(top, other.top), std::max(right, other.right),
		std::max(bottom, other.bottom));
}


int32
BRect::IntegerWidth() const
{
	return WholePixels(std::ceil(right - left));
}


int32
BRect::IntegerHeight() const
{
	return WholePixels(std::ceil(bottom - top));
}


bool
BRect::Intersects(BRect rect) const
{
	return IsValid() && rect.IsValid() && rect.left <= right && left <= rect.right
		&& rect.top <= bottom && top <= rect.bottom;
}


bool
BRect::Contains(BPoint point) const
{
	return point.x >= left && point.x <= right && point.y >= top && point.y <= bottom;
}


bool
BRect::Contains(BRect rect) const
{
	return rect.IsValid() && Contains(rect.LeftTop()) && Contains(rect.RightBottom());
}
