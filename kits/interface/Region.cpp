// SPDX-License-Identifier: MIT
// BRegion: exact set algebra on rows of rectangles.
#include <Region.h>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <limits>
#include <span>

#include "interface/WholePixels.h"

using BPrivate::WholePixels;

namespace {

const clipping_rect kEmpty = {0, 0, -1, -1};

struct Interval {
	int64 from;
	int64 to; // not included

	bool operator==(const Interval& other) const { return from == other.from && to == other.to; }
};


bool
IsValid(const clipping_rect& rect)
{
	return rect.left <= rect.right && rect.top <= rect.bottom;
}


bool
AreEqual(const clipping_rect& a, const clipping_rect& b)
{
	return a.left == b.left && a.top == b.top && a.right == b.right && a.bottom == b.bottom;
}


bool
Overlap(const clipping_rect& a, const clipping_rect& b)
{
	return IsValid(a) && IsValid(b) && a.left <= b.right && b.left <= a.right && a.top <= b.bottom
		&& b.top <= a.bottom;
}


// Every pixel that the rectangle touches.
clipping_rect
Covered(BRect rect)
{
	if (!rect.IsValid())
		return kEmpty;
	return {WholePixels(std::floor(rect.left)), WholePixels(std::floor(rect.top)),
		WholePixels(std::ceil(rect.right)), WholePixels(std::ceil(rect.bottom))};
}


BRect
ToRect(const clipping_rect& rect)
{
	return BRect(rect.left, rect.top, rect.right, rect.bottom);
}


int32
Shift(int32 value, int32 by)
{
	int64 sum = static_cast<int64>(value) + by;
	return static_cast<int32>(std::clamp<int64>(
		sum, std::numeric_limits<int32>::min(), std::numeric_limits<int32>::max()));
}


// Walks over the rows of a region: rectangles that share top and bottom.
class RowIterator {
public:
	explicit RowIterator(std::span<const clipping_rect> rects)
		: fRects(rects)
	{
		FindEnd();
	}

	bool HasRow() const { return fStart < fRects.size(); }
	int64 Top() const { return fRects[fStart].top; }
	int64 Bottom() const { return static_cast<int64>(fRects[fStart].bottom) + 1; }
	std::span<const clipping_rect> Row() const { return fRects.subspan(fStart, fEnd - fStart); }

	void Next()
	{
		fStart = fEnd;
		FindEnd();
	}

	// The next y at which this region's content changes, seen from y.
	int64 NextEdge(int64 y) const
	{
		if (!HasRow())
			return std::numeric_limits<int64>::max();
		return Top() > y ? Top() : Bottom();
	}

private:
	void FindEnd()
	{
		fEnd = fStart;
		while (fEnd < fRects.size() && fRects[fEnd].top == fRects[fStart].top)
			fEnd++;
	}

	std::span<const clipping_rect> fRects;
	size_t fStart = 0;
	size_t fEnd = 0;
};


// Walks over the left and right edges of one row.
class EdgeIterator {
public:
	explicit EdgeIterator(std::span<const clipping_rect> row)
		: fRow(row)
	{
	}

	bool IsInside() const { return fIndex % 2 != 0; }

	int64 Edge() const
	{
		size_t rect = fIndex / 2;
		if (rect >= fRow.size())
			return std::numeric_limits<int64>::max();
		return IsInside() ? static_cast<int64>(fRow[rect].right) + 1 : fRow[rect].left;
	}

	void PassEdgesAt(int64 x)
	{
		while (Edge() == x)
			fIndex++;
	}

private:
	std::span<const clipping_rect> fRow;
	size_t fIndex = 0;
};

} // namespace


BRegion::BRegion()
	: fBounds(kEmpty)
{
}


BRegion::BRegion(const BRegion& other) = default;


BRegion::BRegion(BRegion&& other) noexcept
	: fBounds(other.fBounds),
	  fRects(std::move(other.fRects))
{
	other.MakeEmpty();
}


BRegion::BRegion(const BRect rect)
	: fBounds(Covered(rect))
{
}


BRegion::~BRegion() = default;


BRegion& BRegion::operator=(const BRegion& other) = default;


BRegion&
BRegion::operator=(BRegion&& other) noexcept
{
	if (this == &other)
		return *this;

	fBounds = other.fBounds;
	fRects = std::move(other.fRects);
	other.MakeEmpty();
	return *this;
}


bool
BRegion::operator==(const BRegion& other) const
{
	return AreEqual(fBounds, other.fBounds)
		&& std::equal(
			fRects.begin(), fRects.end(), other.fRects.begin(), other.fRects.end(), AreEqual);
}


void
BRegion::Set(BRect rect)
{
	Set(Covered(rect));
}


void
BRegion::Set(clipping_rect clipping)
{
	fRects.clear();
	fBounds = IsValid(clipping) ? clipping : kEmpty;
}


void
BRegion::MakeEmpty()
{
	fRects.clear();
	fBounds = kEmpty;
}


BRect
BRegion::Frame() const
{
	return ToRect(fBounds);
}


BRect
BRegion::RectAt(int32 index)
{
	return ToRect(RectAtInt(index));
}


BRect
BRegion::RectAt(int32 index) const
{
	return ToRect(RectAtInt(index));
}


clipping_rect
BRegion::RectAtInt(int32 index) const
{
	if (index < 0 || index >= CountRects())
		return kEmpty;
	return fRects.empty() ? fBounds : fRects[index];
}


int32
BRegion::CountRects()
{
	return static_cast<const BRegion*>(this)->CountRects();
}


int32
BRegion::CountRects() const
{
	if (fRects.empty())
		return IsValid(fBounds) ? 1 : 0;
	return static_cast<int32>(fRects.size());
}


bool
BRegion::Intersects(BRect rect) const
{
	return Intersects(Covered(rect));
}


bool
BRegion::Intersects(clipping_rect clipping) const
{
	if (!Overlap(fBounds, clipping))
		return false;
	return fRects.empty()
		|| std::any_of(fRects.begin(), fRects.end(),
			[&](const clipping_rect& rect) { return Overlap(rect, clipping); });
}


bool
BRegion::Contains(BPoint point) const
{
	return Contains(WholePixels(std::floor(point.x)), WholePixels(std::floor(point.y)));
}


bool
BRegion::Contains(int32 x, int32 y)
{
	return Intersects(clipping_rect{x, y, x, y});
}


bool
BRegion::Contains(int32 x, int32 y) const
{
	return Intersects(clipping_rect{x, y, x, y});
}


void
BRegion::OffsetBy(const BPoint& point)
{
	OffsetBy(WholePixels(std::round(point.x)), WholePixels(std::round(point.y)));
}


void
BRegion::OffsetBy(int32 x, int32 y)
{
	if (!IsValid(fBounds))
		return;

	auto move = [x, y](clipping_rect& rect) {
		rect.left = Shift(rect.left, x);
		rect.right = Shift(rect.right, x);
		rect.top = Shift(rect.top, y);
		rect.bottom = Shift(rect.bottom, y);
	};
	move(fBounds);
	std::for_each(fRects.begin(), fRects.end(), move);
}


void
BRegion::Include(BRect rect)
{
	Include(Covered(rect));
}


void
BRegion::Include(clipping_rect clipping)
{
	BRegion other;
	other.Set(clipping);
	Include(&other);
}


void
BRegion::Include(const BRegion* region)
{
	if (!IsValid(region->fBounds))
		return;
	if (!IsValid(fBounds)) {
		*this = *region;
		return;
	}
	Combine(*region, kUnion);
}


void
BRegion::Exclude(BRect rect)
{
	Exclude(Covered(rect));
}


void
BRegion::Exclude(clipping_rect clipping)
{
	BRegion other;
	other.Set(clipping);
	Exclude(&other);
}


void
BRegion::Exclude(const BRegion* region)
{
	if (Overlap(fBounds, region->fBounds))
		Combine(*region, kDifference);
}


void
BRegion::IntersectWith(const BRegion* region)
{
	if (!Overlap(fBounds, region->fBounds)) {
		MakeEmpty();
		return;
	}
	if (fRects.empty() && region->fRects.empty()) {
		const clipping_rect& other = region->fBounds;
		fBounds = {std::max(fBounds.left, other.left), std::max(fBounds.top, other.top),
			std::min(fBounds.right, other.right), std::min(fBounds.bottom, other.bottom)};
		return;
	}
	Combine(*region, kIntersection);
}


void
BRegion::PrintToStream() const
{
	Frame().PrintToStream();
	for (int32 i = 0; i < CountRects(); i++) {
		std::printf("%d ", static_cast<int>(i));
		RectAt(i).PrintToStream();
	}
}


// A sweep from the top: between two neighbouring row edges of either region the content of both is
// constant, so one pass over the two rows' side edges gives that band. Equal neighbouring bands merge,
// which keeps the form canonical.
void
BRegion::Combine(const BRegion& other, Operation operation)
{
	auto rectsOf = [](const BRegion& region) {
		if (region.fRects.empty() && IsValid(region.fBounds))
			return std::span<const clipping_rect>(&region.fBounds, 1);
		return std::span<const clipping_rect>(region.fRects);
	};
	auto isWanted = [operation](bool inFirst, bool inSecond) {
		switch (operation) {
			case kUnion:
				return inFirst || inSecond;
			case kIntersection:
				return inFirst && inSecond;
			default:
				return inFirst && !inSecond;
		}
	};

	const std::span<const clipping_rect> own = rectsOf(*this);
	auto above = [](std::span<const clipping_rect> rects, int32 top) {
		return static_cast<size_t>(
			std::partition_point(rects.begin(), rects.end(),
				[top](const clipping_rect& rect) { return rect.bottom < top; })
			- rects.begin());
	};
	auto upTo = [](std::span<const clipping_rect> rects, int32 bottom) {
		return static_cast<size_t>(
			std::partition_point(rects.begin(), rects.end(),
				[bottom](const clipping_rect& rect) { return rect.top <= bottom; })
			- rects.begin());
	};

	// A window's views each ask for their part of it, and each add to what is to be drawn: what is not in the same rows
	// is left as it is, or out. The nearest row stays in, as it may become one with the new ones.
	size_t head = above(own, other.fBounds.top);
	size_t tail = std::max(head, upTo(own, other.fBounds.bottom));
	if (operation != kIntersection) {
		for (size_t row = head; head > 0 && own[head - 1].top == own[row - 1].top;)
			head--;
		for (size_t row = tail; tail < own.size() && own[tail].top == own[row].top;)
			tail++;
	}
	std::span<const clipping_rect> others = rectsOf(other);
	if (operation != kUnion) {
		const size_t from = above(others, fBounds.top);
		others = others.subspan(from, std::max(from, upTo(others, fBounds.bottom)) - from);
	}
	RowIterator first(own.subspan(head, tail - head));
	RowIterator second(others);
	std::vector<clipping_rect> result;
	if (operation != kIntersection)
		result.assign(own.begin(), own.begin() + static_cast<ptrdiff_t>(head));
	std::vector<Interval> band, previousBand;
	size_t previousStart = 0;
	int64 previousBottom = std::numeric_limits<int64>::min();

	int64 y = std::numeric_limits<int64>::min();
	while (first.HasRow() || second.HasRow()) {
		bool inFirst = first.HasRow() && first.Top() <= y;
		bool inSecond = second.HasRow() && second.Top() <= y;
		int64 bottom = std::min(first.NextEdge(y), second.NextEdge(y));

		band.clear();
		EdgeIterator firstEdge(inFirst ? first.Row() : std::span<const clipping_rect>());
		EdgeIterator secondEdge(inSecond ? second.Row() : std::span<const clipping_rect>());
		int64 from = 0;
		bool inside = false;
		int64 x = std::min(firstEdge.Edge(), secondEdge.Edge());
		while (x != std::numeric_limits<int64>::max()) {
			firstEdge.PassEdgesAt(x);
			secondEdge.PassEdgesAt(x);
			bool wanted = isWanted(firstEdge.IsInside(), secondEdge.IsInside());
			if (wanted && !inside)
				from = x;
			else if (!wanted && inside)
				band.push_back({from, x});
			inside = wanted;
			x = std::min(firstEdge.Edge(), secondEdge.Edge());
		}

		if (!band.empty()) {
			if (previousBottom == y && band == previousBand) {
				for (size_t i = previousStart; i < result.size(); i++)
					result[i].bottom = static_cast<int32>(bottom - 1);
			} else {
				previousStart = result.size();
				for (const Interval& interval : band)
					result.push_back({static_cast<int32>(interval.from), static_cast<int32>(y),
						static_cast<int32>(interval.to - 1), static_cast<int32>(bottom - 1)});
				previousBand = band;
			}
			previousBottom = bottom;
		}

		y = bottom;
		if (first.HasRow() && first.Bottom() <= y)
			first.Next();
		if (second.HasRow() && second.Bottom() <= y)
			second.Next();
	}

	if (operation != kIntersection)
		result.insert(result.end(), own.begin() + static_cast<ptrdiff_t>(tail), own.end());
	fRects.swap(result);
	UpdateBounds();
}


void
BRegion::UpdateBounds()
{
	if (fRects.empty()) {
		fBounds = kEmpty;
		return;
	}

	fBounds = {fRects.front().left, fRects.front().top, fRects.front().right, fRects.back().bottom};
	for (const clipping_rect& rect : fRects) {
		fBounds.left = std::min(fBounds.left, rect.left);
		fBounds.right = std::max(fBounds.right, rect.right);
	}
	if (fRects.size() == 1)
		fRects.clear();
}
