// SPDX-License-Identifier: MIT
// A picture button whose pictures come from files.

#pragma once

#include <memory>

#include <Bitmap.h>
#include <Picture.h>
#include <PictureButton.h>
#include <Window.h>

#include <ormi/views/PictureFile.h>

namespace Ormi {

/// A BPictureButton that shows one bitmap while it is off and another, if it has one, while it is on. A
/// disabled one is faded.
class FileButton : public BPictureButton {
public:
	FileButton(BRect frame, const char* name)
		: BPictureButton(
			frame, name, Nothing(), Nothing(), nullptr, B_ONE_STATE_BUTTON, B_FOLLOW_NONE)
	{
	}

	/// Reads the picture (see ReadPicture()); the view's background is shown when there is none.
	void SetOffFile(const char* path) { SetBitmap(&fOff, path); }
	void SetOnFile(const char* path) { SetBitmap(&fOn, path); }

	void Draw(BRect) override
	{
		const bool isOn = Value() != B_CONTROL_OFF;
		const BBitmap* bitmap = isOn && fOn != nullptr ? fOn.get() : fOff.get();
		if (bitmap != nullptr)
			DrawPictureInto(this, bitmap, bitmap->Bounds());
		if (!IsEnabled()) {
			rgb_color veil = ViewColor();
			veil.alpha = kVeil;
			SetDrawingMode(B_OP_ALPHA);
			SetBlendingMode(B_PIXEL_ALPHA, B_ALPHA_OVERLAY);
			SetHighColor(veil);
			FillRect(Bounds());
			SetDrawingMode(B_OP_COPY);
		}
		if (IsFocus() && Window()->IsActive()) {
			SetHighColor(ui_color(B_KEYBOARD_NAVIGATION_COLOR));
			StrokeRect(Bounds());
		}
	}

private:
	static constexpr uint8 kVeil = 160;

	/// The base class copies the pictures that it is made with.
	static BPicture* Nothing()
	{
		static BPicture sNothing;
		return &sNothing;
	}

	void SetBitmap(std::unique_ptr<BBitmap>* place, const char* path)
	{
		*place = ReadPicture(path);
		if (Window() != nullptr)
			Invalidate();
	}

	std::unique_ptr<BBitmap> fOff;
	std::unique_ptr<BBitmap> fOn;
};

} // namespace Ormi
