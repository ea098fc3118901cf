// SPDX-License-Identifier: MIT
// A window's finished picture, which the X server reads where it is. Display thread only.
#ifndef DISPLAY_QT_SERVER_PIXELS_H
#define DISPLAY_QT_SERVER_PIXELS_H

#include <memory>

#include <QRegion>
#include <QSize>

#include <SupportDefs.h>

struct xcb_connection_t;

namespace BPrivate {

class WindowPixels;

/// Shares the memory of one window's picture with an X server on this machine, so that nobody copies it for the server.
/// The server keeps the memory until it gets another picture's, or this object goes.
class ServerPixels {
public:
	ServerPixels();
	~ServerPixels();

	ServerPixels(const ServerPixels&) = delete;
	ServerPixels& operator=(const ServerPixels&) = delete;

	/// Puts \a region (device pixels, inside of the picture) of \a pixels, which are a picture of this size, into the X
	/// window, and returns when the server has read them. False where that cannot be done: nothing is shown then.
	bool Show(const std::shared_ptr<WindowPixels>& pixels, QSize size, const QRegion& region,
		uint32 window);

private:
	bool Prepare(xcb_connection_t* connection, uint32 window);
	bool Attach(xcb_connection_t* connection, const std::shared_ptr<WindowPixels>& pixels);
	void Detach(xcb_connection_t* connection);

	/// What the server has; null: nothing.
	std::shared_ptr<WindowPixels> fPixels;
	uint32 fSegment;
	/// 0: Prepare() has not succeeded.
	uint32 fContext;
	bool fIsRefused;
};

} // namespace BPrivate

#endif // DISPLAY_QT_SERVER_PIXELS_H
