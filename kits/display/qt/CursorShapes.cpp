// SPDX-License-Identifier: MIT
// The API's cursors as Qt's.
#include "display/qt/CursorShapes.h"

#include <QImage>
#include <QPixmap>

#include "app/CursorPrivate.h"

namespace BPrivate {

static Qt::CursorShape
SystemShape(BCursorID id)
{
	switch (id) {
		case B_CURSOR_ID_I_BEAM:
		case B_CURSOR_ID_I_BEAM_HORIZONTAL:
			return Qt::IBeamCursor;
		case B_CURSOR_ID_COPY:
			return Qt::DragCopyCursor;
		case B_CURSOR_ID_CREATE_LINK:
			return Qt::DragLinkCursor;
		case B_CURSOR_ID_CROSS_HAIR:
			return Qt::CrossCursor;
		case B_CURSOR_ID_FOLLOW_LINK:
			return Qt::PointingHandCursor;
		case B_CURSOR_ID_GRAB:
			return Qt::OpenHandCursor;
		case B_CURSOR_ID_GRABBING:
			return Qt::ClosedHandCursor;
		case B_CURSOR_ID_HELP:
			return Qt::WhatsThisCursor;
		case B_CURSOR_ID_MOVE:
			return Qt::SizeAllCursor;
		case B_CURSOR_ID_NO_CURSOR:
			return Qt::BlankCursor;
		case B_CURSOR_ID_NOT_ALLOWED:
			return Qt::ForbiddenCursor;
		case B_CURSOR_ID_PROGRESS:
			return Qt::BusyCursor;
		case B_CURSOR_ID_RESIZE_NORTH:
		case B_CURSOR_ID_RESIZE_SOUTH:
		case B_CURSOR_ID_RESIZE_NORTH_SOUTH:
			return Qt::SizeVerCursor;
		case B_CURSOR_ID_RESIZE_EAST:
		case B_CURSOR_ID_RESIZE_WEST:
		case B_CURSOR_ID_RESIZE_EAST_WEST:
			return Qt::SizeHorCursor;
		case B_CURSOR_ID_RESIZE_NORTH_EAST:
		case B_CURSOR_ID_RESIZE_SOUTH_WEST:
		case B_CURSOR_ID_RESIZE_NORTH_EAST_SOUTH_WEST:
			return Qt::SizeBDiagCursor;
		case B_CURSOR_ID_RESIZE_NORTH_WEST:
		case B_CURSOR_ID_RESIZE_SOUTH_EAST:
		case B_CURSOR_ID_RESIZE_NORTH_WEST_SOUTH_EAST:
			return Qt::SizeFDiagCursor;
		default:
			// The host has none for the context menu and for zooming.
			return Qt::ArrowCursor;
	}
}


QCursor
QtCursorFor(const CursorShape& shape)
{
	if (shape.pixels.empty())
		return QCursor(SystemShape(shape.id));

	QImage image(reinterpret_cast<const uchar*>(shape.pixels.data()), shape.width, shape.height,
		QImage::Format_ARGB32);
	return QCursor(QPixmap::fromImage(image), shape.hotX, shape.hotY);
}

} // namespace BPrivate
