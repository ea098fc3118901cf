// SPDX-License-Identifier: MIT
// Which of Qt's platforms the environment leads to.
#ifndef DISPLAY_QT_PLATFORMS_H
#define DISPLAY_QT_PLATFORMS_H

#include <string>

namespace BPrivate {

/// The platforms to try, in the form of QT_QPA_PLATFORM, which goes before all else. An X server that
/// answers comes before Wayland, where windows cannot place themselves. With no display in the
/// environment at all: "offscreen". Empty, and \a *reason says why, when the display that is named does
/// not answer.
std::string ChoosePlatforms(std::string* reason);

/// To be called once Qt has connected, or has not. Until then the connection that asked the X server is
/// kept: some servers start afresh, and refuse others for a moment, when their last client leaves.
void PlatformsConnected();

/// Whether the platform has a window manager that raises and activates windows.
bool HasWindowManager(const std::string& platforms);

} // namespace BPrivate

#endif // DISPLAY_QT_PLATFORMS_H
