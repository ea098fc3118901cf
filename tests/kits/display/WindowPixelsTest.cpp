// SPDX-License-Identifier: MIT
// The two pictures of a window, and what of them a window at rest keeps.
#include "display/WindowPixels.h"

#include <cstdint>
#include <fstream>
#include <sstream>
#include <string>

#include <gtest/gtest.h>

using BPrivate::WindowPixels;

namespace {

const size_t kSmall = 100 * 60;
const size_t kLarge = 1000 * 1000;
const uint32 kWhite = 0xffffffff;


/// Bytes of the mapping with \a pixels that are in memory of its own, and not the file's; -1: no such mapping.
long
OwnBytes(const uint32* pixels)
{
	const uintptr_t wanted = reinterpret_cast<uintptr_t>(pixels);
	std::ifstream file("/proc/self/smaps");
	bool isIt = false;
	for (std::string line; std::getline(file, line);) {
		std::istringstream words(line);
		std::string word;
		words >> word;
		const size_t dash = word.find('-');
		if (dash != std::string::npos && line.find(':') > dash) {
			isIt = std::stoull(word.substr(0, dash), nullptr, 16) <= wanted
				&& wanted < std::stoull(word.substr(dash + 1), nullptr, 16);
		} else if (isIt && word == "Anonymous:") {
			long kilobytes = 0;
			words >> kilobytes;
			return kilobytes * 1024;
		}
	}
	return -1;
}


void
Draw(WindowPixels& pixels, size_t from, size_t to, uint32 color)
{
	pixels.Begin();
	for (size_t i = from; i < to; i++)
		pixels.Drawn()[i] = color;
}


void
Finish(WindowPixels& pixels, size_t from, size_t to)
{
	for (size_t i = from; i < to; i++)
		pixels.Finished()[i] = pixels.Drawn()[i];
	pixels.End();
}

} // namespace

class WindowPixelsTest : public testing::TestWithParam<size_t> {};

TEST_P(WindowPixelsTest, BothAreWhiteAtFirst)
{
	WindowPixels pixels(GetParam());
	ASSERT_EQ(pixels.Count(), GetParam());
	for (size_t i : {size_t(0), GetParam() / 2, GetParam() - 1}) {
		EXPECT_EQ(pixels.Drawn()[i], kWhite);
		EXPECT_EQ(pixels.Finished()[i], kWhite);
	}
}


TEST_P(WindowPixelsTest, WhatIsDrawnIsNotFinished)
{
	WindowPixels pixels(GetParam());
	Draw(pixels, 10, GetParam(), 0xff112233);
	EXPECT_EQ(pixels.Finished()[10], kWhite);
	EXPECT_EQ(pixels.Finished()[GetParam() - 1], kWhite);
	EXPECT_EQ(pixels.Drawn()[9], kWhite);
}


TEST_P(WindowPixelsTest, DrawingGoesOnAfterARestWhereItWas)
{
	WindowPixels pixels(GetParam());
	Draw(pixels, 0, GetParam(), 0xff112233);
	Finish(pixels, 0, GetParam());
	pixels.Rest();
	EXPECT_EQ(pixels.Drawn()[0], 0xff112233);
	EXPECT_EQ(pixels.Drawn()[GetParam() - 1], 0xff112233);

	Draw(pixels, 5, 6, 0xff445566);
	EXPECT_EQ(pixels.Drawn()[4], 0xff112233);
	EXPECT_EQ(pixels.Drawn()[5], 0xff445566);
	EXPECT_EQ(pixels.Finished()[5], 0xff112233);
}


TEST_P(WindowPixelsTest, WhatIsBeingDrawnOutlastsARest)
{
	WindowPixels pixels(GetParam());
	Draw(pixels, 0, GetParam(), 0xff112233);
	Finish(pixels, 0, GetParam());
	Draw(pixels, 0, 100, 0xff445566);
	pixels.Rest();
	EXPECT_EQ(pixels.Drawn()[0], 0xff445566);
	EXPECT_EQ(pixels.Finished()[0], 0xff112233);
}

INSTANTIATE_TEST_SUITE_P(Sizes, WindowPixelsTest, testing::Values(kSmall, kLarge));

#if defined(__linux__)

TEST(WindowPixelsMemory, ALargePictureTakesItsOwnPagesWhileItIsDrawnOnly)
{
	WindowPixels pixels(kLarge);
	EXPECT_EQ(OwnBytes(pixels.Drawn()), 0);
	Draw(pixels, 0, kLarge, 0xff112233);
	EXPECT_GE(OwnBytes(pixels.Drawn()), static_cast<long>(kLarge * 4));
	Finish(pixels, 0, kLarge);
	pixels.Rest();
	EXPECT_EQ(OwnBytes(pixels.Drawn()), 0);
}


TEST(WindowPixelsMemory, ASmallChangeAfterARestTakesAFewPages)
{
	WindowPixels pixels(kLarge);
	Draw(pixels, 0, kLarge, 0xff112233);
	Finish(pixels, 0, kLarge);
	pixels.Rest();
	Draw(pixels, kLarge / 2, kLarge / 2 + 10, 0xff445566);
	const long own = OwnBytes(pixels.Drawn());
	EXPECT_GT(own, 0);
	EXPECT_LT(own, 128 * 1024);
}

#endif
