// SPDX-License-Identifier: MIT
// What the gallery's menus and buttons ask the window for.
#ifndef GALLERY_COMMANDS_H
#define GALLERY_COMMANDS_H

#include <SupportDefs.h>

const uint32 GM_SHOW_PAGE = 'page';  // "index" (int32)
const uint32 GM_SHOW_ALERT = 'alrt'; // "type" (int32): an alert_type; "buttons" (int32): 1 to 3
const uint32 GM_OPEN_FILES = 'open';
const uint32 GM_SAVE_FILE = 'save';
const uint32 GM_TELL = 'tell'; // "text" (string): for the line at the window's foot

#endif // GALLERY_COMMANDS_H
