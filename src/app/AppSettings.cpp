// SPDX-License-Identifier: MIT
// The designer's settings object, in a file of its own: who links it has read the settings file.

#include "app/Preferences.h"

TPreferences AppSettings("Plim_Settings");
std::mutex AppSettingsLock;
