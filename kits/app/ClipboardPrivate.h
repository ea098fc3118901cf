// SPDX-License-Identifier: MIT
// The seam through which the system clipboard exchanges data with other programs.

#ifndef _CLIPBOARD_PRIVATE_H
#define _CLIPBOARD_PRIVATE_H

#include <SupportDefs.h>

class BMessage;

namespace BPrivate {

/// The host's clipboard, implemented beside the display. Called from any thread, one call at a time, with no looper
/// lock taken by the kit; it may wait for the display's thread.
///
/// Data are messages with one field of type B_MIME_TYPE a form, the MIME type its name ("text/plain": UTF-8 without
/// terminator). Between programs of these kits the whole message goes over, whatever its fields.
class ClipboardExchange {
public:
	virtual ~ClipboardExchange() = default;

	/// Fills \a data with what another program has put there. B_ENTRY_NOT_FOUND when the content is what Put() gave, or
	/// there is none from elsewhere: what this program has is then still valid. B_TIMED_OUT when the other program did
	/// not answer in time: there are no data then.
	virtual status_t Get(BMessage* data) = 0;

	/// Makes \a data what other programs get.
	virtual status_t Put(const BMessage& data) = 0;
};

/// Connects the system clipboard to \a exchange, which stays the caller's; NULL disconnects, and returns when no call
/// is going on.
void SetClipboardExchange(ClipboardExchange* exchange);

/// Has the display connect its exchange. Implemented beside the display.
void ConnectClipboardExchange();

/// The exchange says that another program took over the clipboard. Watchers are told; the data are fetched by the next
/// Lock(). Any thread; never waits for the exchange.
void ClipboardChangedElsewhere();

} // namespace BPrivate

#endif // _CLIPBOARD_PRIVATE_H
