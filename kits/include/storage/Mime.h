// SPDX-License-Identifier: MIT
// Sizes of icons, and how far an update of MIME information goes.

#ifndef _MIME_H
#define _MIME_H

#include <SupportDefs.h>

enum icon_size { B_LARGE_ICON = 32, B_MINI_ICON = 16 };

enum {
	B_UPDATE_MIME_INFO_NO_FORCE = 0,
	B_UPDATE_MIME_INFO_FORCE_KEEP_TYPE = 1,
	B_UPDATE_MIME_INFO_FORCE_UPDATE_ALL = 2
};

#endif
