// SPDX-License-Identifier: MIT
// Pictures from files.

#pragma once

#include <memory>

#include <Bitmap.h>
#include <TranslationUtils.h>
#include <View.h>

namespace Ormi {

/// Reads a picture; null when there is none. A path that is not absolute begins in the program's current
/// folder.
inline std::unique_ptr<BBitmap>
ReadPicture(const char* path)
{
	return std::unique_ptr<BBitmap>(
		*path != '\0' ? BTranslationUtils::GetBitmapFile(path) : nullptr);
}


/// Draws \a picture into \a frame, in the view's Draw(): what is transparent in it stays.
inline void
DrawPictureInto(BView* view, const BBitmap* picture, BRect frame)
{
	view->SetDrawingMode(B_OP_ALPHA);
	view->SetBlendingMode(B_PIXEL_ALPHA, B_ALPHA_OVERLAY);
	view->DrawBitmap(picture, frame);
	view->SetDrawingMode(B_OP_COPY);
}

} // namespace Ormi
