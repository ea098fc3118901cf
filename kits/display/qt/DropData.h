// SPDX-License-Identifier: MIT
// What other programs drop or put on the clipboard, as messages, and back.
#ifndef DISPLAY_QT_DROP_DATA_H
#define DISPLAY_QT_DROP_DATA_H

#include <memory>

#include <SupportDefs.h>

class BMessage;
class QMimeData;

namespace BPrivate {

/// Whether there are files or text.
bool IsUsableDrop(const QMimeData& data);

/// B_SIMPLE_DATA with "refs" for local files that are there, and "text/plain" (B_MIME_TYPE).
std::unique_ptr<BMessage> MakeDropMessage(const QMimeData& data);

/// A field of type B_MIME_TYPE for each form, the type its name. B_ENTRY_NOT_FOUND without any.
status_t ReadMimeData(const QMimeData& data, BMessage* message);
/// The caller owns the result.
QMimeData* MakeMimeData(const BMessage& message);

} // namespace BPrivate

#endif // DISPLAY_QT_DROP_DATA_H
