// SPDX-License-Identifier: MIT
// The picture of the pointer.

#ifndef _CURSOR_H
#define _CURSOR_H

#include <memory>

#include <Archivable.h>

class BBitmap;
class BPoint;

namespace BPrivate {
struct CursorAccess;
struct CursorShape;
} // namespace BPrivate

/// The system's own cursors.
enum BCursorID {
	B_CURSOR_ID_SYSTEM_DEFAULT = 1,
	B_CURSOR_ID_I_BEAM = 2,
	B_CURSOR_ID_CONTEXT_MENU = 3,
	B_CURSOR_ID_COPY = 4,
	B_CURSOR_ID_CROSS_HAIR = 5,
	B_CURSOR_ID_FOLLOW_LINK = 6,
	B_CURSOR_ID_GRAB = 7,
	B_CURSOR_ID_GRABBING = 8,
	B_CURSOR_ID_HELP = 9,
	B_CURSOR_ID_I_BEAM_HORIZONTAL = 10,
	B_CURSOR_ID_MOVE = 11,
	B_CURSOR_ID_NO_CURSOR = 12,
	B_CURSOR_ID_NOT_ALLOWED = 13,
	B_CURSOR_ID_PROGRESS = 14,
	B_CURSOR_ID_RESIZE_NORTH = 15,
	B_CURSOR_ID_RESIZE_EAST = 16,
	B_CURSOR_ID_RESIZE_SOUTH = 17,
	B_CURSOR_ID_RESIZE_WEST = 18,
	B_CURSOR_ID_RESIZE_NORTH_EAST = 19,
	B_CURSOR_ID_RESIZE_NORTH_WEST = 20,
	B_CURSOR_ID_RESIZE_SOUTH_EAST = 21,
	B_CURSOR_ID_RESIZE_SOUTH_WEST = 22,
	B_CURSOR_ID_RESIZE_NORTH_SOUTH = 23,
	B_CURSOR_ID_RESIZE_EAST_WEST = 24,
	B_CURSOR_ID_RESIZE_NORTH_EAST_SOUTH_WEST = 25,
	B_CURSOR_ID_RESIZE_NORTH_WEST_SOUTH_EAST = 26,
	B_CURSOR_ID_ZOOM_IN = 27,
	B_CURSOR_ID_ZOOM_OUT = 28,
	B_CURSOR_ID_CREATE_LINK = 29
};


/// A cursor: one of the system's, or a picture with a hot spot. A value; copies share the picture.
class BCursor : private BArchivable {
public:
	/// \a cursorData: B_HAND_CURSOR, B_I_BEAM_CURSOR or 68 bytes of that form (size, depth, hot spot, image, mask).
	BCursor(const void* cursorData);
	BCursor(const BCursor& other);
	BCursor(BCursorID id);
	/// Copies the picture; \a hotspot in its pixels.
	BCursor(const BBitmap* bitmap, const BPoint& hotspot);
	BCursor(BMessage* archive);
	virtual ~BCursor();

	static BArchivable* Instantiate(BMessage* archive);
	virtual status_t Archive(BMessage* archive, bool deep = true) const override;

	/// B_OK; B_BAD_VALUE for data, an identifier or a bitmap that is none.
	status_t InitCheck() const;

	BCursor& operator=(const BCursor& other);

private:
	friend struct BPrivate::CursorAccess;

	std::shared_ptr<const BPrivate::CursorShape> fShape;
};

extern const BCursor* B_CURSOR_SYSTEM_DEFAULT;
extern const BCursor* B_CURSOR_I_BEAM;

#endif // _CURSOR_H
