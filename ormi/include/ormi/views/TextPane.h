// SPDX-License-Identifier: MIT
// A text view whose text goes with its size.

#pragma once

#include <TextView.h>

namespace Ormi {

/// A BTextView with a margin around its text, which is as wide as the view.
class TextPane : public BTextView {
public:
	TextPane(BRect frame, const char* name)
		: BTextView(frame, name, TextRectIn(frame), B_FOLLOW_NONE,
			B_WILL_DRAW | B_NAVIGABLE | B_PULSE_NEEDED | B_FRAME_EVENTS)
	{
	}

	void FrameResized(float newWidth, float newHeight) override
	{
		BTextView::FrameResized(newWidth, newHeight);
		FitText();
	}

	void AttachedToWindow() override
	{
		BTextView::AttachedToWindow();
		// What happened to the frame before was not told.
		FitText();
	}

	/// Of the whole text.
	void SetTextColor(rgb_color color)
	{
		BFont font;
		GetFont(&font);
		SetFontAndColor(0, TextLength(), &font, B_FONT_ALL, &color);
		// What is typed into an empty text.
		if (TextLength() == 0)
			SetFontAndColor(&font, B_FONT_ALL, &color);
	}

private:
	static constexpr float kMargin = 3;

	static BRect TextRectIn(BRect frame)
	{
		return frame.OffsetToCopy(B_ORIGIN).InsetByCopy(kMargin, kMargin);
	}

	void FitText() { SetTextRect(TextRectIn(Frame())); }
};

} // namespace Ormi
