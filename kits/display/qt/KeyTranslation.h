// SPDX-License-Identifier: MIT
// What Qt says of a key, in the words of the API.
#ifndef DISPLAY_QT_KEY_TRANSLATION_H
#define DISPLAY_QT_KEY_TRANSLATION_H

#include <SupportDefs.h>

class QKeyEvent;

namespace BPrivate {

struct KeyInput;

/// The modifiers held according to Qt, with the left one for each.
///
/// Command is the keyboard's Control key, where users of the host have their shortcuts; Control is Alt,
/// Option the logo key. The lock keys are not known to Qt: \a locks is taken over.
uint32 ModifiersOf(int qtModifiers, uint32 locks);

/// The event as a key of the API. \a held: modifiers before it, as from the last event.
KeyInput TranslateKey(const QKeyEvent& event, uint32 held);

} // namespace BPrivate

#endif // DISPLAY_QT_KEY_TRANSLATION_H
