// SPDX-License-Identifier: MIT
// Tests of the colour functions, and of BPolygon.
#include <InterfaceDefs.h>

#include <gtest/gtest.h>

#include <Polygon.h>

#include "support/Printers.h"

TEST(ColorsTest, TintLightensAndDarkens)
{
	rgb_color grey = {216, 216, 216, 255};
	EXPECT_EQ(tint_color(grey, B_NO_TINT), grey);
	EXPECT_EQ(tint_color(grey, B_LIGHTEN_MAX_TINT), make_color(255, 255, 255));
	EXPECT_EQ(tint_color(grey, B_DARKEN_MAX_TINT), make_color(0, 0, 0));
	EXPECT_EQ(tint_color(grey, B_LIGHTEN_1_TINT), make_color(231, 231, 231));
	EXPECT_EQ(tint_color(grey, B_DARKEN_1_TINT), make_color(184, 184, 184));
	EXPECT_EQ(tint_color({10, 20, 30, 77}, 1.5f).alpha, 77);
}


TEST(ColorsTest, UserColorsStartWithTheDefaults)
{
	EXPECT_EQ(ui_color(B_PANEL_BACKGROUND_COLOR), make_color(216, 216, 216));
	EXPECT_EQ(ui_color(B_FAILURE_COLOR), make_color(255, 65, 54));
	EXPECT_EQ(keyboard_navigation_color(), make_color(0, 0, 229));
	EXPECT_EQ(ui_color(static_cast<color_which>(9999)), make_color(0, 0, 0));
}


TEST(ColorsTest, ASetUserColorIsGiven)
{
	rgb_color before = ui_color(B_SHADOW_COLOR);
	set_ui_color(B_SHADOW_COLOR, {1, 2, 3, 255});
	EXPECT_EQ(ui_color(B_SHADOW_COLOR), make_color(1, 2, 3));
	set_ui_color(B_SHADOW_COLOR, before);
}


TEST(ColorsTest, NamesOfUserColorsGoBothWays)
{
	EXPECT_STREQ(ui_color_name(B_PANEL_TEXT_COLOR), "B_PANEL_TEXT_COLOR");
	EXPECT_EQ(which_ui_color("B_PANEL_TEXT_COLOR"), B_PANEL_TEXT_COLOR);
	EXPECT_EQ(which_ui_color("none such"), B_NO_COLOR);
	EXPECT_EQ(which_ui_color(nullptr), B_NO_COLOR);
	EXPECT_EQ(ui_color_name(B_NO_COLOR), nullptr);
}


TEST(ColorsTest, MixingGoesFromTheFirstToTheSecond)
{
	rgb_color black = {0, 0, 0, 255}, white = {255, 255, 255, 255};
	EXPECT_EQ(mix_color(black, white, 0), black);
	EXPECT_EQ(mix_color(black, white, 255), white);
	EXPECT_EQ(mix_color(black, white, 128), make_color(128, 128, 128));
	EXPECT_EQ(blend_color(black, white, 128), make_color(128, 128, 128));
	EXPECT_EQ(blend_color({9, 9, 9, 0}, {8, 8, 8, 0}, 100), (rgb_color{0, 0, 0, 0}));
	EXPECT_EQ(blend_color({200, 0, 0, 255}, {0, 0, 0, 0}, 128).red, 200);
}


TEST(ColorsTest, BrightnessTellsDarkFromLight)
{
	EXPECT_EQ(make_color(255, 255, 255).Brightness(), 255);
	EXPECT_EQ(make_color(0, 0, 0).Brightness(), 0);
	EXPECT_TRUE(make_color(0, 0, 255).IsDark());
	EXPECT_TRUE(make_color(0, 255, 0).IsLight());
}


TEST(ColorsTest, SystemPaletteFindsItsOwnColors)
{
	const color_map* map = system_colors();
	EXPECT_EQ(map->color_list[B_TRANSPARENT_MAGIC_CMAP8], B_TRANSPARENT_COLOR);
	rgb_color white = map->color_list[map->index_map[0x7fff]];
	EXPECT_EQ(white, make_color(255, 255, 255));
	rgb_color red = map->color_list[map->index_map[31 << 10]];
	EXPECT_EQ(red, make_color(255, 0, 0));
}


TEST(PolygonTest, FrameGoesAroundAllPoints)
{
	BPoint points[] = {{5, 5}, {-2, 8}, {9, 1}};
	BPolygon polygon(points, 2);
	EXPECT_EQ(polygon.Frame(), BRect(-2, 5, 5, 8));
	polygon.AddPoints(points + 2, 1);
	EXPECT_EQ(polygon.CountPoints(), 3);
	EXPECT_EQ(polygon.Frame(), BRect(-2, 1, 9, 8));
	EXPECT_FALSE(BPolygon().Frame().IsValid());
	polygon.AddPoints(nullptr, 4);
	EXPECT_EQ(polygon.CountPoints(), 3);
}


TEST(PolygonTest, MapToStretchesTheFrame)
{
	BPoint points[] = {{0, 0}, {10, 20}};
	BPolygon polygon(points, 2);
	polygon.MapTo(BRect(0, 0, 10, 20), BRect(100, 100, 105, 110));
	EXPECT_EQ(polygon.Frame(), BRect(100, 100, 105, 110));
	BPolygon copy(&polygon);
	copy.MapTo(BRect(100, 0, 100, 0), BRect(3, 4, 50, 60));
	EXPECT_EQ(copy.Frame(), BRect(3, 4, 3, 4));
}
