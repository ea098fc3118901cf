// SPDX-License-Identifier: MIT
// The Translation Kit, all of it.
#ifndef _TRANSLATION_KIT_H
#define _TRANSLATION_KIT_H

#include <BitmapStream.h>
#include <TranslationUtils.h>

#endif // _TRANSLATION_KIT_H
