// SPDX-License-Identifier: MIT
// One colour put onto pixels by their coverage.
#ifndef DISPLAY_QT_COVER_PIXELS_H
#define DISPLAY_QT_COVER_PIXELS_H

#include <SupportDefs.h>

namespace BPrivate {

/// Mixes \a pixel into \a count pixels by their coverage, as MixPixels() does; those without any stay as they
/// are. Without alpha the covered ones become opaque.
void CoverPixels(uint32* pixels, const uint8* coverage, int count, uint32 pixel, bool hasAlpha);

} // namespace BPrivate

#endif // DISPLAY_QT_COVER_PIXELS_H
