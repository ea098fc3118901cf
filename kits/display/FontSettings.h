// SPDX-License-Identifier: MIT
// The host's font settings, read beside what else a display needs to start.
#ifndef DISPLAY_FONT_SETTINGS_H
#define DISPLAY_FONT_SETTINGS_H

namespace BPrivate {

/// Has fontconfig read its settings and what it knows of all fonts, in a thread of its own: that takes about as long as
/// connecting to the display. Nothing where the host has no fontconfig. To be called once.
void ReadFontSettingsAhead();

/// Returns when that is done, at once where it was never begun. Before fontconfig is used: it would read all of it a
/// second time meanwhile.
void AwaitFontSettings();

} // namespace BPrivate

#endif // DISPLAY_FONT_SETTINGS_H
