// SPDX-License-Identifier: MIT
// BCursor, and how the application's cursor reaches the display.

#include <Cursor.h>

#include <gtest/gtest.h>

#include <AppDefs.h>
#include <Application.h>

#include "app/CursorPrivate.h"

using BPrivate::CursorAccess;


TEST(CursorTest, TheClassicFormBecomesAPictureWithAHotSpot)
{
	BCursor hand(B_HAND_CURSOR);
	ASSERT_EQ(hand.InitCheck(), B_OK);
	auto shape = CursorAccess::Shape(hand);
	EXPECT_EQ(shape->width, 16);
	EXPECT_EQ(shape->height, 16);
	EXPECT_EQ(shape->hotX, 2);
	EXPECT_EQ(shape->hotY, 2);
	ASSERT_EQ(shape->pixels.size(), 256u);
	// Row 3: image 24, mask 3c in hexadecimal.
	EXPECT_EQ(shape->pixels[3 * 16 + 1], 0u);
	EXPECT_EQ(shape->pixels[3 * 16 + 2], 0xff000000u);
	EXPECT_EQ(shape->pixels[3 * 16 + 3], 0xffffffffu);
	EXPECT_EQ(shape->pixels[3 * 16 + 5], 0xff000000u);
	EXPECT_EQ(shape->pixels[3 * 16 + 6], 0u);

	shape = CursorAccess::Shape(BCursor(B_I_BEAM_CURSOR));
	EXPECT_EQ(shape->hotX, 8);
	EXPECT_EQ(shape->hotY, 5);
}


TEST(CursorTest, WhatIsNoCursorIsRefused)
{
	unsigned char data[68] = {32, 1, 0, 0};
	EXPECT_EQ(BCursor(data).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BCursor(static_cast<const void*>(NULL)).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BCursor(static_cast<BCursorID>(99)).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BCursor(static_cast<BBitmap*>(NULL), BPoint(0, 0)).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(CursorAccess::Shape(BCursor(data))->id, B_CURSOR_ID_SYSTEM_DEFAULT);
}


TEST(CursorTest, CopiesShareThePicture)
{
	BCursor cursor(B_CURSOR_ID_GRAB);
	BCursor copy(cursor);
	BCursor assigned(B_CURSOR_ID_HELP);
	assigned = cursor;
	EXPECT_EQ(CursorAccess::Shape(copy), CursorAccess::Shape(cursor));
	EXPECT_EQ(CursorAccess::Shape(assigned)->id, B_CURSOR_ID_GRAB);
	EXPECT_EQ(CursorAccess::Shape(*B_CURSOR_I_BEAM)->id, B_CURSOR_ID_I_BEAM);
	EXPECT_EQ(CursorAccess::Shape(*B_CURSOR_SYSTEM_DEFAULT)->id, B_CURSOR_ID_SYSTEM_DEFAULT);
}


class FakeCursorHost : public BPrivate::CursorHost {
public:
	~FakeCursorHost() override { BPrivate::SetCursorHost(NULL); }

	void SetApplicationCursor(std::shared_ptr<const BPrivate::CursorShape> newShape) override
	{
		shape = newShape;
	}
	void SetCursorHidden(bool nowHidden) override { hidden = nowHidden; }
	void ObscureCursor() override { obscured = true; }

	std::shared_ptr<const BPrivate::CursorShape> shape;
	bool hidden = false;
	bool obscured = false;
};


TEST(CursorTest, TheApplicationsCursorReachesTheDisplay)
{
	BApplication application("application/x-vnd.plim-cursor-test");
	BCursor early(B_CURSOR_ID_CROSS_HAIR);
	application.SetCursor(&early);
	application.HideCursor();
	FakeCursorHost host;
	BPrivate::SetCursorHost(&host);
	EXPECT_EQ(host.shape->id, B_CURSOR_ID_CROSS_HAIR);
	EXPECT_TRUE(host.hidden);
	EXPECT_TRUE(application.IsCursorHidden());

	application.HideCursor();
	application.ShowCursor();
	EXPECT_TRUE(host.hidden);
	application.ShowCursor();
	EXPECT_FALSE(host.hidden);
	application.ShowCursor();
	application.HideCursor();
	EXPECT_TRUE(application.IsCursorHidden());
	application.ShowCursor();

	application.SetCursor(B_HAND_CURSOR);
	EXPECT_EQ(host.shape->width, 16);
	application.ObscureCursor();
	EXPECT_TRUE(host.obscured);
}
