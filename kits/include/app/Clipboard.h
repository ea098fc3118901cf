// SPDX-License-Identifier: MIT
// Data that programs cut, copy and paste.

#ifndef _CLIPBOARD_H
#define _CLIPBOARD_H

#include <memory>

#include <Messenger.h>
#include <SupportDefs.h>

class BMessage;

namespace BPrivate {
class ClipboardState;
class ClipboardStore;
} // namespace BPrivate

enum {
	B_CLIPBOARD_CHANGED = 'CLCH' // to watchers; no fields
};


/// A named clipboard. Objects of one name share the content; "system" is the one that other programs share too.
///
/// Lock() fetches the content; a change counts with Commit(). Everything about the data needs the lock.
class BClipboard {
public:
	/// \a transient: the content is meant for this run only; all but "system" are in this host.
	BClipboard(const char* name, bool transient = false);
	virtual ~BClipboard();

	const char* Name() const;

	/// How often this object, or anybody, has committed.
	uint32 LocalCount() const;
	uint32 SystemCount() const;

	/// \a target gets B_CLIPBOARD_CHANGED after each commit of anybody. B_BAD_VALUE: an invalid target, or not watching.
	status_t StartWatching(BMessenger target);
	status_t StopWatching(BMessenger target);

	/// Asks the program that has the system clipboard. When that does not answer the data are empty; it takes a few
	/// seconds then.
	bool Lock();
	void Unlock();
	/// Whether the calling thread holds the lock.
	bool IsLocked() const;

	/// Empties the data. B_NOT_ALLOWED without the lock, as for the next ones.
	status_t Clear();
	/// Makes the data everybody's. With \a failIfChanged B_ERROR, nothing changed, when somebody else committed since
	/// Lock().
	status_t Commit();
	status_t Commit(bool failIfChanged);
	/// Fetches the content again. B_TIMED_OUT, and empty data, when the program that has it does not answer.
	status_t Revert();

	/// The application that committed last, invalid when another program did.
	BMessenger DataSource() const;
	/// The clipboard's own message, one field of type B_MIME_TYPE for each form; NULL without the lock.
	BMessage* Data() const;

private:
	BClipboard(const BClipboard&) = delete;
	BClipboard& operator=(const BClipboard&) = delete;

	status_t Fetch();

	std::shared_ptr<BPrivate::ClipboardStore> fStore;
	BPrivate::ClipboardState* fState;
};

/// The clipboard that all programs share.
extern BClipboard* be_clipboard;

#endif // _CLIPBOARD_H
