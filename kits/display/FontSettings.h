// SPDX-License-Identifier: MIT
// The host's font settings, read beside what else a display needs to start.
#ifndef DISPLAY_FONT_SETTINGS_H
#define DISPLAY_FONT_SETTINGS_H

#include <string>

namespace BPrivate {

/// Has fontconfig read its settings and what it knows of all fonts, and look for the plain font's family, in a thread of
/// its own: that takes about as long as connecting to the display. Nothing where the host has no fontconfig. To be
/// called once.
void ReadFontSettingsAhead();

/// Returns the plain font's family when that is done; at once, and "", where it was never begun or there is none. Before
/// fontconfig is used: it would read all of it a second time meanwhile.
std::string AwaitFontSettings();

} // namespace BPrivate

#endif // DISPLAY_FONT_SETTINGS_H
