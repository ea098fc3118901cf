// SPDX-License-Identifier: MIT
// Tests of BRegion: the algebra is compared with sets of pixels.
#include <Region.h>

#include <bitset>
#include <cmath>
#include <random>

#include <gtest/gtest.h>

#include "support/Printers.h"

namespace {

const int kSide = 24;


using Pixels = std::bitset<kSide * kSide>;


Pixels
PixelsOf(const BRegion& region)
{
	Pixels pixels;
	for (int32 i = 0; i < region.CountRects(); i++) {
		clipping_rect rect = region.RectAtInt(i);
		for (int y = rect.top; y <= rect.bottom; y++) {
			for (int x = rect.left; x <= rect.right; x++) {
				EXPECT_FALSE(pixels[y * kSide + x]) << "overlap at " << x << ", " << y;
				pixels.set(y * kSide + x);
			}
		}
	}
	return pixels;
}


class RandomRegion {
public:
	explicit RandomRegion(unsigned seed)
		: fRandom(seed)
	{
	}

	clipping_rect Rect()
	{
		int left = Number(kSide), top = Number(kSide);
		return {
			left, top, std::min(kSide - 1, left + Number(8)), std::min(kSide - 1, top + Number(8))};
	}

	BRegion Region()
	{
		BRegion region;
		for (int i = Number(7); i > 0; i--)
			region.Include(Rect());
		return region;
	}

private:
	int Number(int limit) { return static_cast<int>(fRandom() % limit); }

	std::mt19937 fRandom;
};

} // namespace


TEST(RegionTest, StartsEmpty)
{
	BRegion region;
	EXPECT_EQ(region.CountRects(), 0);
	EXPECT_FALSE(region.Frame().IsValid());
	EXPECT_FALSE(region.RectAt(0).IsValid());
	EXPECT_FALSE(region.Contains(BPoint(0, 0)));
}


TEST(RegionTest, OfARectHasThatRect)
{
	BRegion region(BRect(2, 3, 10, 11));
	EXPECT_EQ(region.CountRects(), 1);
	EXPECT_EQ(region.RectAt(0), BRect(2, 3, 10, 11));
	EXPECT_EQ(region.Frame(), BRect(2, 3, 10, 11));
	EXPECT_FALSE(region.RectAt(1).IsValid());
	EXPECT_FALSE(region.RectAt(-1).IsValid());
	EXPECT_TRUE(region.Contains(BPoint(10, 11)));
	EXPECT_FALSE(region.Contains(11, 11));
}


TEST(RegionTest, OfAnInvalidRectIsEmpty)
{
	BRegion region(BRect(5, 5, 4, 4));
	EXPECT_EQ(region.CountRects(), 0);
	region.Include(BRect());
	EXPECT_EQ(region.CountRects(), 0);
	region.Include(BRect(0, 0, 3, 3));
	region.Set(BRect());
	EXPECT_EQ(region.CountRects(), 0);
}


TEST(RegionTest, NeighboursMergeToOneRect)
{
	BRegion region(BRect(0, 0, 4, 9));
	region.Include(BRect(5, 0, 9, 9));
	EXPECT_EQ(region.CountRects(), 1);
	EXPECT_EQ(region.Frame(), BRect(0, 0, 9, 9));
	region.Include(BRect(0, 10, 9, 12));
	EXPECT_EQ(region.CountRects(), 1);
	EXPECT_EQ(region.Frame(), BRect(0, 0, 9, 12));
}


TEST(RegionTest, ExcludingTheMiddleLeavesAFrame)
{
	BRegion region(BRect(0, 0, 9, 9));
	region.Exclude(BRect(3, 3, 6, 6));
	ASSERT_EQ(region.CountRects(), 4);
	EXPECT_EQ(region.RectAt(0), BRect(0, 0, 9, 2));
	EXPECT_EQ(region.RectAt(1), BRect(0, 3, 2, 6));
	EXPECT_EQ(region.RectAt(2), BRect(7, 3, 9, 6));
	EXPECT_EQ(region.RectAt(3), BRect(0, 7, 9, 9));
	EXPECT_FALSE(region.Intersects(BRect(3, 3, 6, 6)));
	EXPECT_TRUE(region.Intersects(BRect(3, 3, 7, 6)));
}


TEST(RegionTest, OffsetMovesEverything)
{
	BRegion region(BRect(0, 0, 1, 1));
	region.Include(BRect(4, 4, 5, 5));
	region.OffsetBy(10, -2);
	EXPECT_EQ(region.Frame(), BRect(10, -2, 15, 3));
	EXPECT_TRUE(region.Contains(BPoint(14, 2)));
	region.OffsetBy(BPoint(-10, 2));
	EXPECT_EQ(region.RectAt(1), BRect(4, 4, 5, 5));
	BRegion empty;
	empty.OffsetBy(3, 3);
	EXPECT_EQ(empty, BRegion());
}


TEST(RegionTest, CombiningWithItselfIsHarmless)
{
	BRegion region(BRect(0, 0, 5, 5));
	region.Include(BRect(8, 0, 9, 1));
	BRegion copy(region);
	region.Include(&region);
	EXPECT_EQ(region, copy);
	region.IntersectWith(&region);
	EXPECT_EQ(region, copy);
	region.Exclude(&region);
	EXPECT_EQ(region, BRegion());
}


TEST(RegionTest, HugeRectsDoNotOverflow)
{
	BRegion region(BRect(-1e20f, -1e20f, 1e20f, 1e20f));
	region.Exclude(BRect(0, 0, 9, 9));
	EXPECT_EQ(region.CountRects(), 4);
	region.Include(BRect(0, 0, 9, 9));
	EXPECT_EQ(region.CountRects(), 1);

	BRegion whole;
	whole.Set(clipping_rect{INT32_MIN, INT32_MIN, INT32_MAX, INT32_MAX});
	whole.Exclude(clipping_rect{0, 0, 0, 0});
	EXPECT_EQ(whole.CountRects(), 4);
	EXPECT_TRUE(whole.Contains(INT32_MAX, INT32_MAX));
}


TEST(RegionTest, AlgebraIsThatOfPixelSets)
{
	for (unsigned seed = 0; seed < 500; seed++) {
		SCOPED_TRACE(seed);
		RandomRegion random(seed);
		BRegion first = random.Region();
		BRegion second = random.Region();
		Pixels a = PixelsOf(first), b = PixelsOf(second);

		BRegion both(first);
		both.Include(&second);
		EXPECT_EQ(PixelsOf(both), a | b);

		BRegion common(first);
		common.IntersectWith(&second);
		EXPECT_EQ(PixelsOf(common), a & b);

		BRegion rest(first);
		rest.Exclude(&second);
		EXPECT_EQ(PixelsOf(rest), a & ~b);

		// The same pixels, gathered in another way, are the same rectangles.
		BRegion again(common);
		again.Include(&rest);
		EXPECT_EQ(again, first);
	}
}


TEST(RegionTest, EqualSetsHaveEqualRectsWhateverTheOrder)
{
	BRegion rows, columns;
	for (int i = 0; i < 4; i++) {
		rows.Include(BRect(0, i, 3, i));
		columns.Include(BRect(3 - i, 0, 3 - i, 3));
	}
	EXPECT_EQ(rows, columns);
	EXPECT_EQ(rows.CountRects(), 1);
}


TEST(RegionTest, APlaceThatIsNoNumberMovesNothing)
{
	BRegion region(BRect(0, 0, 5, 5));
	region.OffsetBy(BPoint(std::nanf(""), 2));
	EXPECT_EQ(region.Frame(), BRect(0, 2, 5, 7));
	EXPECT_TRUE(region.Contains(BPoint(std::nanf(""), 3)));
}


TEST(RegionTest, AMovedRegionLeavesAnEmptyOne)
{
	BRegion region(BRect(0, 0, 5, 5));
	BRegion taken(std::move(region));
	EXPECT_EQ(taken.Frame(), BRect(0, 0, 5, 5));
	EXPECT_EQ(region.CountRects(), 0); // NOLINT: that is what is promised
}
