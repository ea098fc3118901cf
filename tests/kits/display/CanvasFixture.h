// SPDX-License-Identifier: MIT
// A canvas to draw on, and a look at its pixels.
#ifndef TESTS_KITS_DISPLAY_CANVAS_FIXTURE_H
#define TESTS_KITS_DISPLAY_CANVAS_FIXTURE_H

#include <memory>
#include <string>

#include <gtest/gtest.h>

#include "display/Canvas.h"
#include "display/Display.h"
#include "display/PixelBuffer.h"
#include "support/Printers.h"

const rgb_color kBlack = {0, 0, 0, 255};
const rgb_color kWhite = {255, 255, 255, 255};
const rgb_color kRed = {255, 0, 0, 255};
const rgb_color kBlue = {0, 0, 255, 255};

/// White, 20 x 12 pixels of the API.
class CanvasFixture : public testing::Test {
protected:
	explicit CanvasFixture(float scale = 1)
		: fCanvas(BPrivate::Display::Get().MakeCanvas(20, 12, scale))
	{
	}

	/// The pixels as text: a row a line, '.' for white, '#' for black, 'r', 'b' for red and blue, '?' for others.
	std::string Rows(int32 width, int32 height)
	{
		std::string rows;
		for (int32 y = 0; y < height; y++) {
			for (int32 x = 0; x < width; x++)
				rows += Letter(fCanvas->PixelAt(BPoint(x, y)));
			rows += '\n';
		}
		return rows;
	}

	int32 CountOf(rgb_color color)
	{
		int32 count = 0;
		for (uint32 pixel : fCanvas->ReadPicture().pixels) {
			rgb_color found = {static_cast<uint8>(pixel >> 16), static_cast<uint8>(pixel >> 8),
				static_cast<uint8>(pixel), 255};
			count += found == color ? 1 : 0;
		}
		return count;
	}

	void SetState() { fCanvas->SetState(fState); }

	std::unique_ptr<BPrivate::Canvas> fCanvas;
	BPrivate::CanvasState fState;

private:
	static char Letter(rgb_color color)
	{
		if (color == kWhite)
			return '.';
		if (color == kBlack)
			return '#';
		if (color == kRed)
			return 'r';
		return color == kBlue ? 'b' : '?';
	}
};

#endif // TESTS_KITS_DISPLAY_CANVAS_FIXTURE_H
