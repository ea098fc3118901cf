// SPDX-License-Identifier: MIT
// The fields that a dragged message has on its way, and that its receiver does not see.
#ifndef DISPLAY_DRAG_FIELDS_H
#define DISPLAY_DRAG_FIELDS_H

namespace BPrivate {

/// The messenger that gets the answer. It stays in the program: another one cannot answer.
inline const char* const kDragReplyTo = "be:drag_reply_to";
/// In what comes from another program: the pointer's place in the dragged rect (point).
inline const char* const kDragOffset = "be:drag_offset";

} // namespace BPrivate

#endif // DISPLAY_DRAG_FIELDS_H
