// SPDX-License-Identifier: MIT
// What a cursor looks like, for the display; and the display's side of the application's cursor calls.

#ifndef _CURSOR_PRIVATE_H
#define _CURSOR_PRIVATE_H

#include <vector>

#include <Cursor.h>
#include <SupportDefs.h>

namespace BPrivate {

/// A system cursor (\a pixels empty), or a picture.
struct CursorShape {
	BCursorID id = B_CURSOR_ID_SYSTEM_DEFAULT;
	int32 width = 0;
	int32 height = 0;
	int32 hotX = 0;
	int32 hotY = 0;
	/// width * height words 0xAARRGGBB, top row first, not premultiplied.
	std::vector<uint32> pixels;
};


struct CursorAccess {
	/// The shape, never NULL; the system default's for a cursor that failed. Shapes do not change.
	static std::shared_ptr<const CursorShape> Shape(const BCursor& cursor);
};


/// Shows the application's cursor. Called from any thread.
class CursorHost {
public:
	virtual ~CursorHost() = default;

	/// The cursor where no view under the pointer has its own.
	virtual void SetApplicationCursor(std::shared_ptr<const CursorShape> shape) = 0;
	/// By HideCursor(), ShowCursor().
	virtual void SetCursorHidden(bool hidden) = 0;
	/// Hides it until the pointer moves.
	virtual void ObscureCursor() = 0;
};

/// Sets who shows the cursor; it stays the caller's. What was set before is passed on to it at once. NULL: nobody.
void SetCursorHost(CursorHost* host);

} // namespace BPrivate

#endif // _CURSOR_PRIVATE_H
