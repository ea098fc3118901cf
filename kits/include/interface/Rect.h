// SPDX-License-Identifier: MIT
// A rectangle that names pixel centres: all four sides belong to it.
#ifndef _RECT_H
#define _RECT_H

#include <Point.h>
#include <Size.h>
#include <SupportDefs.h>

/// BRect(0, 0, 9, 9) covers 10 x 10 pixels and is 9 wide and 9 high. Valid when left <= right and
/// top <= bottom; the default is (0, 0, -1, -1).
class BRect {
public:
	float left;
	float top;
	float right;
	float bottom;

	BRect()
		: left(0),
		  top(0),
		  right(-1),
		  bottom(-1)
	{
	}
	BRect(const BRect& other) = default;
	BRect(float left, float top, float right, float bottom)
		: left(left),
		  top(top),
		  right(right),
		  bottom(bottom)
	{
	}
	/// The points are not sorted.
	BRect(BPoint leftTop, BPoint rightBottom)
		: left(leftTop.x),
		  top(leftTop.y),
		  right(rightBottom.x),
		  bottom(rightBottom.y)
	{
	}
	BRect(BPoint leftTop, BSize size)
		: left(leftTop.x),
		  top(leftTop.y),
		  right(leftTop.x + size.width),
		  bottom(leftTop.y + size.height)
	{
	}
	/// \a side pixels wide and high, at (0, 0): right and bottom are side - 1.
	BRect(float side)
		: left(0),
		  top(0),
		  right(side - 1),
		  bottom(side - 1)
	{
	}
	/// \a width by \a height pixels, at (0, 0): right is width - 1, bottom is height - 1.
	BRect(float width, float height)
		: left(0),
		  top(0),
		  right(width - 1),
		  bottom(height - 1)
	{
	}
	BRect& operator=(const BRect& other) = default;

	void Set(float left, float top, float right, float bottom);
	void PrintToStream() const;

	BPoint LeftTop() const { return BPoint(left, top); }
	BPoint RightBottom() const { return BPoint(right, bottom); }
	BPoint LeftBottom() const { return BPoint(left, bottom); }
	BPoint RightTop() const { return BPoint(right, top); }

	/// Each moves two sides only.
	void SetLeftTop(const BPoint point);
	void SetRightBottom(const BPoint point);
	void SetLeftBottom(const BPoint point);
	void SetRightTop(const BPoint point);

	/// Moves every side inwards; negative values move it outwards.
	void InsetBy(BPoint inset);
	void InsetBy(float dx, float dy);
	void OffsetBy(BPoint delta);
	void OffsetBy(float dx, float dy);
	/// Moves the left-top there and keeps the size.
	void OffsetTo(BPoint offset);
	void OffsetTo(float x, float y);

	BRect& InsetBySelf(BPoint inset);
	BRect& InsetBySelf(float dx, float dy);
	BRect InsetByCopy(BPoint inset) const;
	BRect InsetByCopy(float dx, float dy) const;
	BRect& OffsetBySelf(BPoint offset);
	BRect& OffsetBySelf(float dx, float dy);
	BRect OffsetByCopy(BPoint offset) const;
	BRect OffsetByCopy(float dx, float dy) const;
	BRect& OffsetToSelf(BPoint offset);
	BRect& OffsetToSelf(float x, float y);
	BRect OffsetToCopy(BPoint offset) const;
	BRect OffsetToCopy(float x, float y) const;

	bool operator==(BRect other) const;
	bool operator!=(BRect other) const { return !(*this == other); }
	/// The intersection, invalid when there is none.
	BRect operator&(BRect other) const;
	/// The smallest rect around both.
	BRect operator|(BRect other) const;

	bool IsValid() const { return left <= right && top <= bottom; }
	float Width() const { return right - left; }
	float Height() const { return bottom - top; }
	/// Rounded up.
	int32 IntegerWidth() const;
	int32 IntegerHeight() const;
	BSize Size() const { return BSize(right - left, bottom - top); }

	/// Touching edges count; an invalid rect intersects and contains nothing.
	bool Intersects(BRect rect) const;
	bool Contains(BPoint point) const;
	bool Contains(BRect rect) const;
};

#endif // _RECT_H
