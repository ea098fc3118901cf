// SPDX-License-Identifier: MIT
// Tests of BPoint and BRect.
#include <Rect.h>

#include <limits>

#include <gtest/gtest.h>

#include "support/Printers.h"

TEST(PointTest, DefaultIsTheOrigin)
{
	EXPECT_EQ(BPoint(), B_ORIGIN);
	EXPECT_EQ(B_ORIGIN, BPoint(0, 0));
}


TEST(PointTest, ArithmeticWorksOnBothCoordinates)
{
	BPoint point(3, -4);
	EXPECT_EQ(point + BPoint(1, 2), BPoint(4, -2));
	EXPECT_EQ(point - BPoint(1, 2), BPoint(2, -6));
	EXPECT_EQ(-point, BPoint(-3, 4));
	point += BPoint(1, 1);
	point -= BPoint(2, 0);
	EXPECT_EQ(point, BPoint(2, -3));
	EXPECT_NE(point, BPoint(2, 3));
}


TEST(PointTest, ConstrainToMovesToTheNearestPointOfTheRect)
{
	BPoint outside(-5, 40);
	outside.ConstrainTo(BRect(0, 0, 20, 30));
	EXPECT_EQ(outside, BPoint(0, 30));

	BPoint inside(7, 8);
	inside.ConstrainTo(BRect(0, 0, 20, 30));
	EXPECT_EQ(inside, BPoint(7, 8));
}


TEST(RectTest, DefaultIsInvalid)
{
	BRect rect;
	EXPECT_EQ(rect, BRect(0, 0, -1, -1));
	EXPECT_FALSE(rect.IsValid());
	EXPECT_TRUE(BRect(0, 0, 0, 0).IsValid());
}


TEST(RectTest, SidesAreIncluded)
{
	BRect rect(0, 0, 9, 9);
	EXPECT_EQ(rect.Width(), 9);
	EXPECT_EQ(rect.Height(), 9);
	EXPECT_EQ(BRect(10), rect);
	EXPECT_EQ(BRect(10, 20), BRect(0, 0, 9, 19));
	EXPECT_EQ(BRect(BPoint(1, 2), BSize(3, 4)), BRect(1, 2, 4, 6));
}


TEST(RectTest, TwoPointsAreNotSorted)
{
	EXPECT_FALSE(BRect(BPoint(9, 9), BPoint(0, 0)).IsValid());
}


TEST(RectTest, IntegerSizesAreRoundedUp)
{
	BRect rect(0.25, 0, 4.5, 3);
	EXPECT_EQ(rect.IntegerWidth(), 5);
	EXPECT_EQ(rect.IntegerHeight(), 3);
}


TEST(RectTest, ContainsIncludesAllFourEdges)
{
	BRect rect(10, 10, 20, 20);
	EXPECT_TRUE(rect.Contains(BPoint(10, 10)));
	EXPECT_TRUE(rect.Contains(BPoint(20, 20)));
	EXPECT_FALSE(rect.Contains(BPoint(20.5, 20)));
	EXPECT_TRUE(rect.Contains(rect));
	EXPECT_FALSE(rect.Contains(BRect(15, 15, 21, 20)));
}


TEST(RectTest, AnInvalidRectContainsAndTouchesNothing)
{
	BRect invalid(10, 10, 5, 5);
	EXPECT_FALSE(invalid.Contains(BPoint(7, 7)));
	EXPECT_FALSE(invalid.Intersects(BRect(0, 0, 20, 20)));
	EXPECT_FALSE(BRect(0, 0, 20, 20).Intersects(invalid));
	EXPECT_FALSE(BRect(0, 0, 20, 20).Contains(invalid));
}


TEST(RectTest, TouchingEdgesIntersect)
{
	EXPECT_TRUE(BRect(0, 0, 10, 10).Intersects(BRect(10, 10, 20, 20)));
	EXPECT_FALSE(BRect(0, 0, 10, 10).Intersects(BRect(10.5, 0, 20, 20)));
}


TEST(RectTest, IntersectionAndUnion)
{
	EXPECT_EQ(BRect(0, 0, 10, 10) & BRect(5, 6, 20, 20), BRect(5, 6, 10, 10));
	EXPECT_EQ(BRect(0, 0, 10, 10) | BRect(5, 6, 20, 20), BRect(0, 0, 20, 20));
	EXPECT_FALSE((BRect(0, 0, 10, 10) & BRect(11, 0, 20, 10)).IsValid());
}


TEST(RectTest, MovesOfSidesAndCorners)
{
	BRect rect(10, 20, 30, 40);
	EXPECT_EQ(rect.InsetByCopy(2, -3), BRect(12, 17, 28, 43));
	EXPECT_EQ(rect.InsetByCopy(BPoint(1, 1)), BRect(11, 21, 29, 39));
	EXPECT_EQ(rect.OffsetByCopy(-10, 5), BRect(0, 25, 20, 45));
	EXPECT_EQ(rect.OffsetToCopy(1, 2), BRect(1, 2, 21, 22));
	EXPECT_EQ(rect.OffsetToCopy(B_ORIGIN), BRect(0, 0, 20, 20));
	rect.SetLeftTop(BPoint(1, 2));
	EXPECT_EQ(rect, BRect(1, 2, 30, 40));
	rect.SetRightBottom(BPoint(3, 4));
	EXPECT_EQ(rect, BRect(1, 2, 3, 4));
	rect.SetLeftBottom(BPoint(5, 6));
	EXPECT_EQ(rect, BRect(5, 2, 3, 6));
	rect.SetRightTop(BPoint(7, 8));
	EXPECT_EQ(rect, BRect(5, 8, 7, 6));
	EXPECT_EQ(rect.LeftBottom(), BPoint(5, 6));
	EXPECT_EQ(rect.RightTop(), BPoint(7, 8));
	EXPECT_EQ(&rect.OffsetBySelf(1, 1).InsetBySelf(0, 0).OffsetToSelf(0, 0), &rect);
}


TEST(RectTest, WholeSizesOfSidesThatAreNoPixelsStayNumbers)
{
	const float nan = std::numeric_limits<float>::quiet_NaN();
	const float infinite = std::numeric_limits<float>::infinity();
	EXPECT_EQ(BRect(nan, 0, 10, nan).IntegerWidth(), 0);
	EXPECT_EQ(BRect(nan, 0, 10, nan).IntegerHeight(), 0);
	for (float far : {1e30f, infinite}) {
		EXPECT_GT(BRect(0, 0, far, 1).IntegerWidth(), 1000000) << far;
		EXPECT_LT(BRect(0, 0, 1, -far).IntegerHeight(), -1000000) << far;
		// A pixel more, as loops over pixels have it, is a number too.
		EXPECT_GT(BRect(-far, 0, far, 1).IntegerWidth() + 1, 1000000) << far;
	}
}
