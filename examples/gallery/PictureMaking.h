// SPDX-License-Identifier: MIT
// The pictures of the gallery's picture buttons, drawn by the program itself.
#ifndef GALLERY_PICTURE_MAKING_H
#define GALLERY_PICTURE_MAKING_H

#include <memory>

#include <GraphicsDefs.h>

class BPicture;
class BView;

/// A lamp of 32 x 32 pixels in \a color. \a view, which must be attached to a locked window, draws it.
std::unique_ptr<BPicture> MakeLamp(BView* view, rgb_color color, bool lit);

#endif // GALLERY_PICTURE_MAKING_H
