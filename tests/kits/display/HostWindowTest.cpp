// SPDX-License-Identifier: MIT
// Windows of the display that shows pixels, and its pictures.
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <thread>
#include <vector>

#include <gtest/gtest.h>

#include <OS.h>
#include <Region.h>
#include <Window.h>

#include "RecordingClient.h"
#include "display/Canvas.h"
#include "display/Display.h"
#include "display/PixelBuffer.h"
#include "support/Printers.h"

using BPrivate::Canvas;
using BPrivate::Display;
using BPrivate::Picture;

class HostWindowTest : public testing::Test {
protected:
	HostWindowTest()
		: fWindow(Display::Get().MakeWindow(
			BRect(50, 40, 149, 99), "Test", BPrivate::HostWindowStyle(), &fClient)),
		  fCanvas(Display::Get().MakeCanvas(100, 60, fWindow->Scale()))
	{
	}

	void Fill(BRect rect, rgb_color color)
	{
		BPrivate::CanvasState state;
		state.highColor = color;
		fCanvas->SetState(state);
		fCanvas->FillRect(rect, B_SOLID_HIGH);
	}

	// The host answers in its own time.
	void WaitFor(const std::string& wanted)
	{
		std::string codes;
		for (int i = 0; i < 1000 && codes != wanted; i++) {
			snooze(5000);
			const std::string more = fClient.Codes();
			codes += (codes.empty() || more.empty() ? "" : " ") + more;
		}
		EXPECT_EQ(codes, wanted);
	}

	static uint32 PixelAt(const Picture& picture, int32 x, int32 y)
	{
		return picture.pixels[y * picture.width + x] & 0xffffff;
	}

	RecordingClient fClient;
	std::unique_ptr<BPrivate::HostWindow> fWindow;
	std::unique_ptr<Canvas> fCanvas;
};

TEST_F(HostWindowTest, WhatIsPresentedIsOnTheScreen)
{
	fWindow->Show();
	Fill(BRect(0, 0, 99, 59), {0, 0, 255, 255});
	Fill(BRect(10, 10, 19, 19), {255, 0, 0, 255});
	fWindow->Present(*fCanvas, BRegion(BRect(0, 0, 99, 59)));
	fWindow->Sync();

	Picture screen;
	ASSERT_EQ(Display::Get().ReadScreen(BRect(50, 40, 149, 99), &screen), B_OK);
	ASSERT_EQ(screen.width, 100);
	ASSERT_EQ(screen.height, 60);
	EXPECT_EQ(PixelAt(screen, 5, 5), 0x0000ffu);
	EXPECT_EQ(PixelAt(screen, 10, 10), 0xff0000u);
	EXPECT_EQ(PixelAt(screen, 19, 19), 0xff0000u);
	EXPECT_EQ(PixelAt(screen, 20, 19), 0x0000ffu);
}


TEST_F(HostWindowTest, OnlyThePresentedRegionChanges)
{
	fWindow->Show();
	fWindow->Present(*fCanvas, BRegion(BRect(0, 0, 99, 59)));
	Fill(BRect(0, 0, 99, 59), {0, 0, 0, 255});
	fWindow->Present(*fCanvas, BRegion(BRect(0, 0, 9, 9)));
	Picture picture = fWindow->ReadPicture();
	EXPECT_EQ(PixelAt(picture, 9, 9), 0x000000u);
	EXPECT_EQ(PixelAt(picture, 10, 9), 0xffffffu);
}


TEST_F(HostWindowTest, APictureStaysWithoutTheWindowsThread)
{
	Fill(BRect(0, 0, 99, 59), {0, 128, 0, 255});
	fWindow->Present(*fCanvas, BRegion(BRect(0, 0, 99, 59)));
	fCanvas.reset();
	fWindow->Show();
	fWindow->Hide();
	fWindow->Show();
	fWindow->Sync();
	Picture screen;
	ASSERT_EQ(Display::Get().ReadScreen(BRect(60, 50, 60, 50), &screen), B_OK);
	EXPECT_EQ(PixelAt(screen, 0, 0), 0x008000u);
}


TEST_F(HostWindowTest, ACanvasOfAnotherSizeIsShownWhole)
{
	fWindow->Show();
	fWindow->Present(*fCanvas, BRegion(BRect(0, 0, 99, 59)));
	fWindow->ResizeTo(BSize(149, 99));
	auto larger = Display::Get().MakeCanvas(150, 100, fWindow->Scale());
	larger->FillRect(BRect(0, 0, 149, 99), B_SOLID_HIGH);
	fWindow->Present(*larger, BRegion(BRect(0, 0, 0, 0)));
	Picture picture = fWindow->ReadPicture();
	EXPECT_EQ(picture.width, 150);
	EXPECT_EQ(PixelAt(picture, 149, 99), 0x000000u);
}


TEST_F(HostWindowTest, WhatTheProgramAsksForIsNoNews)
{
	fWindow->Show();
	fWindow->MoveTo(BPoint(60, 40));
	fWindow->ResizeTo(BSize(119, 79));
	fWindow->Sync();
	// What the user does comes after all that the host tells of the requests: the place is known.
	fWindow->InjectFrame(BRect(60, 40, 159, 119));
	WaitFor("active resized");
	EXPECT_EQ(fClient.Last().GetInt32(BPrivate::kTimesAsked, 0), 1);
}


TEST_F(HostWindowTest, WhatTheUserDoesByTheBorderIsNews)
{
	fWindow->Show();
	WaitFor("active");
	fWindow->InjectFrame(BRect(70, 60, 169, 119));
	WaitFor("moved");
	EXPECT_EQ(fClient.Last().GetInt32(BPrivate::kTimesAsked, -1), 0);
	fWindow->InjectFrame(BRect(70, 60, 179, 129));
	WaitFor("resized");
	EXPECT_EQ(fClient.Last().GetInt32(BPrivate::kTimesAsked, -1), 0);
	fWindow->InjectZoom();
	WaitFor("moved resized zoomed");
	fWindow->InjectZoom();
	WaitFor("moved resized zoomed");
	fWindow->InjectMinimized(true);
	WaitFor("inactive minimized");
	fWindow->InjectMinimized(false);
	WaitFor("active restored");
}


TEST_F(HostWindowTest, ShowingActivatesAndHidingDeactivates)
{
	fWindow->Show();
	fWindow->Sync();
	EXPECT_EQ(fClient.Codes(), "active");
	fWindow->Hide();
	EXPECT_EQ(fClient.Codes(), "inactive");
	fWindow->Activate();
	EXPECT_EQ(fClient.Codes(), "");
}


TEST_F(HostWindowTest, ADeletedWindowHearsNothing)
{
	fWindow->Show();
	Display::Get().InjectPointer(BPoint(60, 50), 1);
	fWindow.reset();
	fClient.Codes();
	Display::Get().InjectPointer(BPoint(70, 50), 1);
	Display::Get().InjectPointer(BPoint(70, 50), 0);
	EXPECT_EQ(fClient.Codes(), "");
}


TEST_F(HostWindowTest, EveryLookAndFlagCanBeShown)
{
	const uint32 looks[] = {B_TITLED_WINDOW_LOOK, B_DOCUMENT_WINDOW_LOOK, B_MODAL_WINDOW_LOOK,
		B_FLOATING_WINDOW_LOOK, B_BORDERED_WINDOW_LOOK, B_NO_BORDER_WINDOW_LOOK};
	const uint32 feels[] = {B_NORMAL_WINDOW_FEEL, B_MODAL_APP_WINDOW_FEEL, B_MODAL_ALL_WINDOW_FEEL,
		B_FLOATING_APP_WINDOW_FEEL, B_FLOATING_ALL_WINDOW_FEEL};
	fWindow->Show();
	for (uint32 look : looks) {
		for (uint32 feel : feels) {
			BPrivate::HostWindowStyle style{look, feel, B_NOT_RESIZABLE | B_NOT_CLOSABLE, false};
			fWindow->SetStyle(style);
			fWindow->Present(*fCanvas, BRegion(BRect(0, 0, 99, 59)));
		}
	}
	fWindow->Sync();
	EXPECT_EQ(fWindow->ReadPicture().width, 100);
}


TEST_F(HostWindowTest, ManyThreadsMayShowWindowsAtOnce)
{
	std::vector<std::thread> threads;
	for (int i = 0; i < 4; i++) {
		threads.emplace_back([i] {
			for (int round = 0; round < 5; round++) {
				RecordingClient client;
				auto window = Display::Get().MakeWindow(BRect(i * 50, 0, i * 50 + 39, 39), "Many",
					BPrivate::HostWindowStyle(), &client);
				auto canvas = Display::Get().MakeCanvas(40, 40, window->Scale());
				window->Show();
				for (int step = 0; step < 10; step++) {
					canvas->FillRect(BRect(step, step, step + 5, step + 5), B_SOLID_HIGH);
					window->Present(*canvas, BRegion(BRect(0, 0, 39, 39)));
				}
				window->SetTitle("Another");
				window->Sync();
			}
		});
	}
	for (std::thread& thread : threads)
		thread.join();
	fWindow->Show();
	EXPECT_TRUE(fWindow->IsFront());
}


// #pragma mark - pictures


TEST(PictureTest, ASavedPictureIsReadBack)
{
	auto folder = std::filesystem::temp_directory_path();
	std::string path = folder / ("display-picture-" + std::to_string(getpid()) + ".png");
	Picture picture{2, 1, true, {0xffff0000, 0x800000ff}};
	ASSERT_EQ(Display::Get().SavePicture(picture, path.c_str()), B_OK);
	std::ifstream file(path, std::ios::binary);
	std::string bytes((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
	std::remove(path.c_str());

	Picture read;
	ASSERT_EQ(Display::Get().DecodePicture(bytes.data(), bytes.size(), &read), B_OK);
	EXPECT_EQ(read.width, 2);
	EXPECT_EQ(read.height, 1);
	EXPECT_TRUE(read.hasAlpha);
	EXPECT_EQ(read.pixels, picture.pixels);

	// Cut short it is no picture.
	EXPECT_EQ(Display::Get().DecodePicture(bytes.data(), 20, &read), B_BAD_DATA);
}


TEST(PictureTest, WhatIsNoPictureIsRefused)
{
	Picture picture;
	EXPECT_EQ(Display::Get().DecodePicture("no picture at all", 17, &picture), B_BAD_DATA);
	EXPECT_EQ(Display::Get().DecodePicture("", 0, &picture), B_BAD_DATA);
	EXPECT_EQ(Display::Get().SavePicture(Picture(), "/tmp/empty.png"), B_BAD_VALUE);
	Picture one{1, 1, false, {0}};
	EXPECT_NE(Display::Get().SavePicture(one, "/no/such/folder/one.png"), B_OK);
}
