// SPDX-License-Identifier: MIT
// A point: pixels, x to the right, y down.
#ifndef _POINT_H
#define _POINT_H

#include <SupportDefs.h>

class BRect;

class BPoint {
public:
	float x;
	float y;

	BPoint()
		: x(0),
		  y(0)
	{
	}
	BPoint(float x, float y)
		: x(x),
		  y(y)
	{
	}
	BPoint(const BPoint& p) = default;
	BPoint& operator=(const BPoint& other) = default;

	void Set(float x, float y)
	{
		this->x = x;
		this->y = y;
	}

	/// Moves the point to the nearest one of \a rect.
	void ConstrainTo(BRect rect);
	void PrintToStream() const;

	BPoint operator-() const { return BPoint(-x, -y); }
	BPoint operator+(const BPoint& other) const { return BPoint(x + other.x, y + other.y); }
	BPoint operator-(const BPoint& other) const { return BPoint(x - other.x, y - other.y); }

	BPoint& operator+=(const BPoint& other)
	{
		x += other.x;
		y += other.y;
		return *this;
	}

	BPoint& operator-=(const BPoint& other)
	{
		x -= other.x;
		y -= other.y;
		return *this;
	}

	bool operator!=(const BPoint& other) const { return x != other.x || y != other.y; }
	bool operator==(const BPoint& other) const { return x == other.x && y == other.y; }
};

/// (0, 0).
extern const BPoint B_ORIGIN;

#endif // _POINT_H
