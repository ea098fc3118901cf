// SPDX-License-Identifier: MIT
// The API's cursors as Qt's.
#ifndef DISPLAY_QT_CURSOR_SHAPES_H
#define DISPLAY_QT_CURSOR_SHAPES_H

#include <QCursor>

namespace BPrivate {

struct CursorShape;

/// Display thread.
QCursor QtCursorFor(const CursorShape& shape);

} // namespace BPrivate

#endif // DISPLAY_QT_CURSOR_SHAPES_H
