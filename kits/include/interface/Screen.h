// SPDX-License-Identifier: MIT
// A screen: its size, its colours, its picture.
#ifndef _SCREEN_H
#define _SCREEN_H

#include <GraphicsDefs.h>
#include <Rect.h>
#include <SupportDefs.h>

class BBitmap;
class BWindow;

/// Where no display is present (BE_DISPLAY=none) the screen has a size but no picture.
class BScreen {
public:
	BScreen(screen_id id = B_MAIN_SCREEN_ID);
	/// The screen that \a window is on; null: the main one.
	BScreen(BWindow* window);
	~BScreen();

	BScreen(const BScreen&) = delete;
	BScreen& operator=(const BScreen&) = delete;

	bool IsValid();
	color_space ColorSpace();
	/// Pixels, left-top at (0, 0) on the main screen.
	BRect Frame();
	screen_id ID();

	status_t WaitForRetrace();
	/// Returns B_OK after the retrace, B_ERROR where the display has none to wait for.
	status_t WaitForRetrace(bigtime_t timeout);

	uint8 IndexForColor(rgb_color color);
	uint8 IndexForColor(uint8 red, uint8 green, uint8 blue, uint8 alpha = 255);
	rgb_color ColorForIndex(uint8 index);
	const color_map* ColorMap();

	/// \a _bitmap becomes the caller's. Returns B_OK; B_BAD_VALUE; B_UNSUPPORTED where the display
	/// gives no picture of its screen.
	status_t GetBitmap(BBitmap** _bitmap, bool drawCursor = true, BRect* frame = NULL);
	status_t ReadBitmap(BBitmap* bitmap, bool drawCursor = true, BRect* frame = NULL);

	rgb_color DesktopColor();
	rgb_color DesktopColor(uint32 workspace);
	void SetDesktopColor(rgb_color color, bool stick = true);
	void SetDesktopColor(rgb_color color, uint32 workspace, bool stick = true);

private:
	screen_id fID;
};

#endif // _SCREEN_H
