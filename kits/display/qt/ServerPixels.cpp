// SPDX-License-Identifier: MIT
// A window's finished picture, which the X server reads where it is. Display thread only.
#include "display/qt/ServerPixels.h"

#include <cstdlib>
#include <memory>

#include <fcntl.h>
#include <sys/socket.h>
#include <xcb/shm.h>
#include <xcb/xcb.h>

#include <QGuiApplication>

#include <ByteOrder.h>

#include "display/WindowPixels.h"

namespace BPrivate {

namespace {

// Pixels as WindowPixels have them: 0x..RRGGBB.
const uint8 kDepth = 24;
const uint8 kBitsPerPixel = 32;
const uint32 kRedMask = 0xff0000, kGreenMask = 0xff00, kBlueMask = 0xff;
// The extension's first version that takes memory by its file.
const int kMajor = 1, kMinor = 2;


/// What xcb returns, which its caller frees.
struct Free {
	void operator()(void* memory) const { free(memory); }
};


template <typename Reply>
std::unique_ptr<Reply, Free>
Owned(Reply* reply)
{
	return std::unique_ptr<Reply, Free>(reply);
}


/// Null where there is no X server any more, or another platform.
xcb_connection_t*
Connection()
{
	if (qGuiApp == nullptr || QGuiApplication::platformName() != QLatin1String("xcb"))
		return nullptr;
	auto application = qGuiApp->nativeInterface<QNativeInterface::QX11Application>();
	xcb_connection_t* connection = application != nullptr ? application->connection() : nullptr;
	return connection != nullptr && xcb_connection_has_error(connection) == 0 ? connection
																			  : nullptr;
}


/// Memory can be handed over to a program on this machine only.
bool
IsLocal(xcb_connection_t* connection)
{
	sockaddr_storage address = {};
	socklen_t length = sizeof(address);
	int socket = xcb_get_file_descriptor(connection);
	return getpeername(socket, reinterpret_cast<sockaddr*>(&address), &length) == 0
		&& address.ss_family == AF_UNIX;
}


bool
HasPixelFormat(const xcb_setup_t* setup)
{
	if (setup->image_byte_order
		!= (B_HOST_IS_LENDIAN ? XCB_IMAGE_ORDER_LSB_FIRST : XCB_IMAGE_ORDER_MSB_FIRST))
		return false;
	for (auto format = xcb_setup_pixmap_formats_iterator(setup); format.rem > 0;
		 xcb_format_next(&format)) {
		if (format.data->depth == kDepth)
			return format.data->bits_per_pixel == kBitsPerPixel
				&& format.data->scanline_pad == kBitsPerPixel;
	}
	return false;
}


bool
TakesMemory(xcb_connection_t* connection)
{
	if (qEnvironmentVariableIntValue("QT_X11_NO_MITSHM") != 0 || !IsLocal(connection)
		|| !HasPixelFormat(xcb_get_setup(connection)))
		return false;
	// Asking a server that does not know the extension would end the connection.
	const xcb_query_extension_reply_t* extension = xcb_get_extension_data(connection, &xcb_shm_id);
	if (extension == nullptr || extension->present == 0)
		return false;
	const auto version =
		Owned(xcb_shm_query_version_reply(connection, xcb_shm_query_version(connection), nullptr));
	return version != nullptr
		&& (version->major_version > kMajor
			|| (version->major_version == kMajor && version->minor_version >= kMinor));
}


bool
HasMasks(const xcb_setup_t* setup, xcb_visualid_t wanted)
{
	for (auto screen = xcb_setup_roots_iterator(setup); screen.rem > 0; xcb_screen_next(&screen)) {
		for (auto depth = xcb_screen_allowed_depths_iterator(screen.data); depth.rem > 0;
			 xcb_depth_next(&depth)) {
			for (auto visual = xcb_depth_visuals_iterator(depth.data); visual.rem > 0;
				 xcb_visualtype_next(&visual)) {
				if (visual.data->visual_id == wanted)
					return visual.data->red_mask == kRedMask
						&& visual.data->green_mask == kGreenMask
						&& visual.data->blue_mask == kBlueMask;
			}
		}
	}
	return false;
}


bool
ShowsPixels(xcb_connection_t* connection, xcb_window_t window)
{
	xcb_get_geometry_cookie_t geometryCookie = xcb_get_geometry(connection, window);
	xcb_get_window_attributes_cookie_t attributesCookie =
		xcb_get_window_attributes(connection, window);
	const auto geometry = Owned(xcb_get_geometry_reply(connection, geometryCookie, nullptr));
	const auto attributes =
		Owned(xcb_get_window_attributes_reply(connection, attributesCookie, nullptr));
	return geometry != nullptr && attributes != nullptr && geometry->depth == kDepth
		&& HasMasks(xcb_get_setup(connection), attributes->visual);
}

} // namespace


ServerPixels::ServerPixels()
	: fSegment(0),
	  fContext(0),
	  fIsRefused(false)
{
}


ServerPixels::~ServerPixels()
{
	xcb_connection_t* connection = fContext != 0 ? Connection() : nullptr;
	if (connection == nullptr)
		return;
	Detach(connection);
	xcb_free_gc(connection, fContext);
}


bool
ServerPixels::Show(
	const std::shared_ptr<WindowPixels>& pixels, QSize size, const QRegion& region, uint32 window)
{
	if (fIsRefused || pixels == nullptr || pixels->File() < 0)
		return false;
	xcb_connection_t* connection = Connection();
	if (connection == nullptr)
		return false;
	if ((fContext == 0 && !Prepare(connection, window))
		|| (fPixels != pixels && !Attach(connection, pixels))) {
		fIsRefused = true;
		return false;
	}

	for (const QRect& rect : region) {
		xcb_shm_put_image(connection, window, fContext, static_cast<uint16>(size.width()),
			static_cast<uint16>(size.height()), static_cast<uint16>(rect.x()),
			static_cast<uint16>(rect.y()), static_cast<uint16>(rect.width()),
			static_cast<uint16>(rect.height()), static_cast<int16>(rect.x()),
			static_cast<int16>(rect.y()), kDepth, XCB_IMAGE_FORMAT_Z_PIXMAP, false, fSegment, 0);
	}
	// Any answer comes after the pictures have been read: only then may they change.
	const auto answer =
		Owned(xcb_get_input_focus_reply(connection, xcb_get_input_focus(connection), nullptr));
	return answer != nullptr;
}


bool
ServerPixels::Prepare(xcb_connection_t* connection, uint32 window)
{
	// One server for the whole program.
	static const bool sTakesMemory = TakesMemory(connection);
	if (!sTakesMemory || !ShowsPixels(connection, window))
		return false;
	fContext = xcb_generate_id(connection);
	const uint32 noExposures = 0;
	xcb_create_gc(connection, fContext, window, XCB_GC_GRAPHICS_EXPOSURES, &noExposures);
	return true;
}


bool
ServerPixels::Attach(xcb_connection_t* connection, const std::shared_ptr<WindowPixels>& pixels)
{
	Detach(connection);
	// The connection closes the file when it has sent it.
	int file = fcntl(pixels->File(), F_DUPFD_CLOEXEC, 0);
	if (file < 0)
		return false;
	fSegment = xcb_generate_id(connection);
	const bool isReadOnly = true;
	const auto error = Owned(xcb_request_check(
		connection, xcb_shm_attach_fd_checked(connection, fSegment, file, isReadOnly)));
	if (error != nullptr)
		return false;
	fPixels = pixels;
	return true;
}


void
ServerPixels::Detach(xcb_connection_t* connection)
{
	if (fPixels == nullptr)
		return;
	xcb_shm_detach(connection, fSegment);
	fPixels.reset();
}

} // namespace BPrivate
