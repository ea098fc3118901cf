// SPDX-License-Identifier: MIT
// Who hears from a window's host: hands on to the looper.
#ifndef INTERFACE_WINDOW_CLIENT_H
#define INTERFACE_WINDOW_CLIENT_H

#include <OS.h>

#include "display/HostWindow.h"

namespace BPrivate {

/// Knows the window by its port alone: the calls come from the display's thread, without any lock.
class WindowClient final : public HostWindowClient {
public:
	explicit WindowClient(port_id port);

	void Deliver(std::unique_ptr<BMessage> message) override;
	void Dropped(std::unique_ptr<BMessage> message, BPoint screenWhere, BPoint offset) override;
	void NeedsRedraw() override;

private:
	const port_id fPort;
};

} // namespace BPrivate

#endif // INTERFACE_WINDOW_CLIENT_H
