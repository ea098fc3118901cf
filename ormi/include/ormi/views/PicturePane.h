// SPDX-License-Identifier: MIT
// A view that shows a picture.

#pragma once

#include <cmath>
#include <memory>

#include <Bitmap.h>
#include <View.h>

#include <ormi/views/PictureFile.h>

namespace Ormi {

/// A picture from a file, at the view's left top, in its middle or as large as the view.
class PicturePane : public BView {
public:
	PicturePane(BRect frame, const char* name)
		: BView(frame, name, B_FOLLOW_NONE, B_WILL_DRAW | B_FRAME_EVENTS | B_FULL_UPDATE_ON_RESIZE)
	{
	}

	/// Reads the picture (see ReadPicture()); nothing is shown when there is none.
	void SetFile(const char* path)
	{
		fBitmap = ReadPicture(path);
		Redraw();
	}

	/// As large as the view.
	void SetStretched(bool stretched)
	{
		fStretched = stretched;
		Redraw();
	}

	/// In the middle, when it is not stretched.
	void SetCentered(bool centered)
	{
		fCentered = centered;
		Redraw();
	}

	/// Takes over the picture; null for none.
	void SetBitmap(BBitmap* bitmap)
	{
		fBitmap.reset(bitmap);
		Redraw();
	}

	/// Null when none is shown.
	const BBitmap* Bitmap() const { return fBitmap.get(); }

	/// Where the picture lies, in the view's coordinates. Invalid without one.
	BRect PictureFrame() const
	{
		if (fBitmap == nullptr)
			return BRect();
		const BRect bounds = Bounds();
		if (fStretched)
			return bounds;
		BRect frame = fBitmap->Bounds().OffsetToCopy(bounds.LeftTop());
		if (fCentered) {
			frame.OffsetBy(std::floor((bounds.Width() - frame.Width()) / 2),
				std::floor((bounds.Height() - frame.Height()) / 2));
		}
		return frame;
	}

	void Draw(BRect) override
	{
		if (fBitmap != nullptr)
			DrawPictureInto(this, fBitmap.get(), PictureFrame());
	}

private:
	void Redraw()
	{
		if (Window() != nullptr)
			Invalidate();
	}

	std::unique_ptr<BBitmap> fBitmap;
	bool fStretched = false;
	bool fCentered = false;
};

} // namespace Ormi
