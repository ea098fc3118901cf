// SPDX-License-Identifier: MIT
// The display that draws nothing.
#include <cstring>
#include <fstream>
#include <string>

#include <gtest/gtest.h>

#include <Region.h>

#include "RecordingClient.h"
#include "display/Canvas.h"
#include "display/Display.h"
#include "display/FontEngine.h"
#include "display/PixelBuffer.h"
#include "support/Printers.h"

using BPrivate::Display;

namespace {

bool
HasLoaded(const char* library)
{
	std::ifstream maps("/proc/self/maps");
	std::string line;
	while (std::getline(maps, line)) {
		if (line.find(library) != std::string::npos)
			return true;
	}
	return false;
}

} // namespace

TEST(NoneDisplayTest, NothingOfQtIsLoaded)
{
	ASSERT_TRUE(HasLoaded("libbe.so"));
	EXPECT_STREQ(Display::Get().Name(), "none");
	EXPECT_FALSE(Display::Get().DrawsPixels());
	EXPECT_FALSE(HasLoaded("libQt6"));
	EXPECT_FALSE(HasLoaded("libbe_display_qt"));
}


TEST(NoneDisplayTest, ItHasOneScreen)
{
	EXPECT_EQ(Display::Get().CountScreens(), 1);
	EXPECT_EQ(Display::Get().ScreenFrame(0), BRect(0, 0, 1023, 767));
	EXPECT_EQ(Display::Get().ScreenAt(BRect(5000, 5000, 5010, 5010)), 0);
}


TEST(NoneDisplayTest, WindowsHaveFramesAndStates)
{
	RecordingClient client;
	auto window = Display::Get().MakeWindow(
		BRect(10, 10, 109, 59), "Title", BPrivate::HostWindowStyle(), &client);
	ASSERT_NE(window, nullptr);
	window->Show();
	EXPECT_EQ(client.Codes(), "active");
	EXPECT_TRUE(window->IsFront());
	EXPECT_EQ(window->Scale(), 1);
	window->MoveTo(BPoint(20, 10));
	window->ResizeTo(BSize(119, 59));
	EXPECT_EQ(client.Codes(), "");
	EXPECT_EQ(window->DecoratorFrame(), BRect(20, 10, 139, 69));
	window->InjectFrame(BRect(30, 10, 149, 69));
	EXPECT_EQ(client.Codes(), "moved");
	EXPECT_EQ(client.Last().GetPoint("where", BPoint()), BPoint(30, 10));
	EXPECT_EQ(client.Last().GetInt32(BPrivate::kTimesAsked, 0), 1);
	window->InjectFrame(BRect(30, 10, 149, 79));
	EXPECT_EQ(client.Codes(), "resized");
	EXPECT_EQ(client.Last().GetInt32("width", 0), 119);
	EXPECT_EQ(client.Last().GetInt32("height", 0), 69);
	EXPECT_EQ(window->DecoratorFrame(), BRect(30, 10, 149, 79));
	window->Hide();
	EXPECT_EQ(client.Codes(), "inactive");
	EXPECT_FALSE(window->IsFront());
}


TEST(NoneDisplayTest, InjectedInputReachesTheWindow)
{
	RecordingClient client;
	auto window = Display::Get().MakeWindow(
		BRect(200, 200, 299, 299), "Title", BPrivate::HostWindowStyle(), &client);
	window->Show();
	client.Codes();
	Display::Get().InjectPointer(BPoint(250, 250), 1);
	Display::Get().InjectPointer(BPoint(250, 250), 0);
	Display::Get().InjectKey({0x3c, "a", 0}, true);
	Display::Get().InjectKey({0x3c, "a", 0}, false);
	EXPECT_EQ(client.Codes(), "move down up key key-up");
}


TEST(NoneDisplayTest, TextHasEstimatedMeasures)
{
	BPrivate::FontEngine& fonts = Display::Get().Fonts();
	BPrivate::FontKey fixed = {1, 0, 10, 90, 0, 0, 0, 0};
	EXPECT_FLOAT_EQ(fonts.StringWidth(fixed, "abcde", 5), 30);
	EXPECT_FLOAT_EQ(fonts.StringWidth(fixed, "\xc3\xa4", 2), 6);
	BPrivate::FontKey plain = {0, 0, 10, 90, 0, 0, 0, 0};
	BPrivate::FontKey bold = {0, 1, 10, 90, 0, 0, 0, 0};
	EXPECT_FLOAT_EQ(fonts.StringWidth(plain, "il W", 4), 3 + 3 + 3 + 7);
	EXPECT_FLOAT_EQ(fonts.StringWidth(bold, "W", 1), 7.7f);
	EXPECT_FLOAT_EQ(fonts.Height(plain).ascent, 9.3f);
	EXPECT_EQ(fonts.FindFamily("Mono"), 1);
	EXPECT_EQ(fonts.FindStyle(0, "Bold Italic"), 3);
	EXPECT_EQ(fonts.FindStyle(0, static_cast<uint16>(B_BOLD_FACE)), 1);
}


TEST(NoneDisplayTest, CanvasesTakeEverythingAndShowNothing)
{
	auto canvas = Display::Get().MakeCanvas(10, 10, 1);
	canvas->FillRect(BRect(0, 0, 9, 9), B_SOLID_HIGH);
	EXPECT_EQ(canvas->PixelAt(BPoint(3, 3)), (rgb_color{0, 0, 0, 0}));
	BPoint end = canvas->DrawString("ab", 2, BPoint(5, 5), nullptr);
	EXPECT_GT(end.x, 5);
	EXPECT_EQ(end.y, 5);
}


TEST(NoneDisplayTest, PicturesAreNotSupported)
{
	BPrivate::Picture picture;
	EXPECT_EQ(Display::Get().DecodePicture("x", 1, &picture), B_UNSUPPORTED);
	EXPECT_EQ(Display::Get().SavePicture(picture, "/tmp/none.png"), B_UNSUPPORTED);
	EXPECT_EQ(Display::Get().ReadScreen(BRect(0, 0, 9, 9), &picture), B_UNSUPPORTED);
}


TEST(NoneDisplayTest, TheClipboardIsTheProgramsOwn)
{
	BMessage data;
	BPrivate::ClipboardExchange& exchange = Display::Get();
	EXPECT_EQ(exchange.Get(&data), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(exchange.Put(data), B_OK);
}
