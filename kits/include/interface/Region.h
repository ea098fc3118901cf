// SPDX-License-Identifier: MIT
// A set of pixels, kept as rectangles that do not overlap.
#ifndef _REGION_H
#define _REGION_H

#include <vector>

#include <Rect.h>

/// A rectangle of whole pixels, all four sides included.
struct clipping_rect {
	int32 left;
	int32 top;
	int32 right;
	int32 bottom;
};

/// The rectangles are sorted from the top and, in a row of them, from the left; the same set of
/// pixels always gives the same rectangles. Fractions of a BRect are cut off to the lower pixel.
class BRegion {
public:
	BRegion();
	BRegion(const BRegion& other);
	BRegion(BRegion&& other) noexcept;
	BRegion(const BRect rect);
	virtual ~BRegion();

	BRegion& operator=(const BRegion& other);
	BRegion& operator=(BRegion&& other) noexcept;
	bool operator==(const BRegion& other) const;

	void Set(BRect rect);
	void Set(clipping_rect clipping);
	void MakeEmpty();

	/// The smallest rect around all; invalid when empty.
	BRect Frame() const;
	clipping_rect FrameInt() const { return fBounds; }
	/// Past the end: an invalid rect.
	BRect RectAt(int32 index);
	BRect RectAt(int32 index) const;
	clipping_rect RectAtInt(int32 index) const;
	int32 CountRects();
	int32 CountRects() const;

	bool Intersects(BRect rect) const;
	bool Intersects(clipping_rect clipping) const;
	bool Contains(BPoint point) const;
	bool Contains(int32 x, int32 y);
	bool Contains(int32 x, int32 y) const;

	void OffsetBy(const BPoint& point);
	void OffsetBy(int32 x, int32 y);
	void Include(BRect rect);
	void Include(clipping_rect clipping);
	void Include(const BRegion* region);
	void Exclude(BRect rect);
	void Exclude(clipping_rect clipping);
	void Exclude(const BRegion* region);
	void IntersectWith(const BRegion* region);

	void PrintToStream() const;

private:
	enum Operation { kUnion, kIntersection, kDifference };

	void Combine(const BRegion& other, Operation operation);
	void UpdateBounds();

	// Inclusive sides; an empty region has the bounds (0, 0, -1, -1) and no rectangle. A region of
	// one rectangle keeps it in the bounds alone, so that it needs no memory of its own.
	clipping_rect fBounds;
	std::vector<clipping_rect> fRects;
};

#endif // _REGION_H
