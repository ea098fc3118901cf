// SPDX-License-Identifier: MIT
// The small pictures of files and places in a file panel.
#ifndef INTERFACE_PANEL_ICONS_H
#define INTERFACE_PANEL_ICONS_H

class BPoint;
class BView;

namespace BPrivate {

enum class PanelIcon { kFile, kProgram, kFolder, kHome, kDesktop, kDisk };

/// Icons are squares of this many pixels.
constexpr float kPanelIconSize = 16;

/// Draws an icon with its left-top at \a where; \a isLink adds the sign of a link. Changes the high colour.
void DrawPanelIcon(BView* view, BPoint where, PanelIcon icon, bool isLink);

} // namespace BPrivate

#endif // INTERFACE_PANEL_ICONS_H
