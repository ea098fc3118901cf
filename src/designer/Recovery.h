// SPDX-License-Identifier: MIT
// Copies of forms that are not saved yet, written aside while the user works on them.

#pragma once

#include <atomic>
#include <condition_variable>
#include <map>
#include <memory>
#include <mutex>
#include <thread>

#include <File.h>
#include <Message.h>
#include <String.h>

enum {
	// A recovery copy: "project" (string), "path" (string), "name" (string), "main" (bool), "index" (int32), "size"
	// and "fingerprint" (int64, only of a form with a file), "incomplete" (bool), "form" (message): see
	// docs/file-formats.md.
	RECOVERY_COPY = 'PRcv'
};

/// The folder of recovery copies and what its files are called.
namespace RecoveryFiles {

/// The folder, in the user's settings; it is made when it is missing.
status_t Folder(BString* folder);

BString LockPath(const BString& folder, const BString& session);
BString CopyPath(const BString& folder, const BString& session, int32 id);

/// Takes the name of a copy apart; false when it is none.
bool ParseCopyName(const char* name, BString* session, int32* id);

/// Opens and locks a session's lock file. B_BUSY when somebody else has it. \a mode: how to open it.
status_t LockSession(const BString& path, uint32 mode, BFile* lock);

} // namespace RecoveryFiles

/// The recovery copies of this program's forms.
///
/// They are written by a thread of their own, the newest of each form. The session's lock file is locked as long as
/// this object lives, so that another designer tells copies in use from those that were left behind. All
/// operations: any thread.
class TRecovery {
public:
	/// Starts the session; see InitCheck(). From now on Current() is this one.
	TRecovery();
	/// Writes what is to be written yet. The copies that were not removed stay.
	~TRecovery();

	TRecovery(const TRecovery&) = delete;
	TRecovery& operator=(const TRecovery&) = delete;

	/// The program's; null where no copies are kept.
	static TRecovery* Current() { return sCurrent; }

	/// Why there is no session: nothing is kept then.
	status_t InitCheck() const { return fStatus; }

	const BString& Session() const { return fSession; }

	/// A number for the copies of one more form.
	int32 NewId() { return ++fLastId; }

	/// Has \a copy written soon, in place of that with this number. Returns at once.
	void Keep(int32 id, std::unique_ptr<BMessage> copy);

	/// Removes a copy, written or not: the form is saved, or the user does not want it.
	void Forget(int32 id);

	/// Makes the file at \a path, a copy of a session that is no more, one of this session. Its number; 0 on failure.
	int32 TakeOver(const char* path);

	/// Waits until everything is written.
	void Flush();

private:
	status_t StartSession();
	void Run();
	void Write(int32 id, const BMessage& copy);

	static std::atomic<TRecovery*> sCurrent;

	BString fFolder;
	BString fSession;
	BFile fLockFile;
	status_t fStatus;
	std::atomic<int32> fLastId;

	std::mutex fLock;
	std::condition_variable fChanged;
	std::map<int32, std::unique_ptr<BMessage>> fWaiting;
	int32 fWriting; // 0: none
	bool fEnding;
	bool fWasTold;
	std::thread fWriter;
};
