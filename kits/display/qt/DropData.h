// SPDX-License-Identifier: MIT
// What other programs drop or put on the clipboard, as messages, and back.
#ifndef DISPLAY_QT_DROP_DATA_H
#define DISPLAY_QT_DROP_DATA_H

#include <memory>

#include <SupportDefs.h>

class BMessage;
class QMimeData;

namespace BPrivate {

/// Whether there is a message, files or text.
bool IsUsableDrop(const QMimeData& data);

/// The whole message when another program of these kits drags; else B_SIMPLE_DATA with "refs" for local
/// files and "text/plain" (B_MIME_TYPE).
std::unique_ptr<BMessage> MakeDropMessage(const QMimeData& data);

/// The whole message of another program of these kits, else a field of type B_MIME_TYPE for each form, the
/// type its name. B_ENTRY_NOT_FOUND without any; B_TIMED_OUT when who has the data does not answer.
status_t ReadMimeData(const QMimeData& data, BMessage* message);
/// The message for programs of these kits; for others its fields of type B_MIME_TYPE, and "refs" as the
/// files they name. The caller owns the result.
QMimeData* MakeMimeData(const BMessage& message);

} // namespace BPrivate

#endif // DISPLAY_QT_DROP_DATA_H
