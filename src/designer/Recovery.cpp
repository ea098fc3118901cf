// SPDX-License-Identifier: MIT

#include "designer/Recovery.h"

#include <cstdlib>
#include <cstring>

#include <Directory.h>
#include <Entry.h>
#include <FindDirectory.h>
#include <OS.h>
#include <Path.h>

#include "app/ReplacementFile.h"
#include "model/Diagnostics.h"

namespace {

constexpr const char* kFolderName = "Plim_Recovery";
constexpr const char* kCopyEnding = ".copy";
constexpr int32 kMostAttempts = 100;

} // namespace

status_t
RecoveryFiles::Folder(BString* folder)
{
	BPath path;
	status_t status = find_directory(B_USER_SETTINGS_DIRECTORY, &path);
	if (status == B_OK)
		status = path.Append(kFolderName);
	// What nobody has saved is nobody else's to read.
	if (status == B_OK)
		status = create_directory(path.Path(), 0700);
	if (status == B_OK)
		*folder = path.Path();
	return status;
}


BString
RecoveryFiles::LockPath(const BString& folder, const BString& session)
{
	BString path(folder);
	path << "/" << session << ".lock";
	return path;
}


BString
RecoveryFiles::CopyPath(const BString& folder, const BString& session, int32 id)
{
	BString path(folder);
	path << "/" << session << "-" << id << kCopyEnding;
	return path;
}


bool
RecoveryFiles::ParseCopyName(const char* name, BString* session, int32* id)
{
	const char* dash = strrchr(name, '-');
	if (dash == nullptr || dash == name)
		return false;
	char* end;
	const long number = strtol(dash + 1, &end, 10);
	if (number <= 0 || number > INT32_MAX || strcmp(end, kCopyEnding) != 0)
		return false;
	session->SetTo(name, static_cast<int32>(dash - name));
	*id = static_cast<int32>(number);
	return true;
}


status_t
RecoveryFiles::LockSession(const BString& path, uint32 mode, BFile* lock)
{
	status_t status = lock->SetTo(path.String(), mode);
	if (status == B_OK)
		status = lock->Lock();
	if (status != B_OK)
		return status;
	// Until it was locked, somebody else may have taken it for left behind and removed it.
	node_ref opened;
	node_ref present;
	if (lock->GetNodeRef(&opened) != B_OK || BEntry(path.String()).GetNodeRef(&present) != B_OK
		|| !(opened == present))
		return B_BUSY;
	return B_OK;
}


std::atomic<TRecovery*> TRecovery::sCurrent(nullptr);


TRecovery::TRecovery()
	: fStatus(StartSession()),
	  fLastId(0),
	  fWriting(0),
	  fEnding(false),
	  fWasTold(false)
{
	if (fStatus != B_OK)
		return;
	fWriter = std::thread([this] { Run(); });
	sCurrent = this;
}


TRecovery::~TRecovery()
{
	if (fStatus != B_OK)
		return;
	sCurrent = nullptr;
	{
		std::lock_guard<std::mutex> lock(fLock);
		fEnding = true;
	}
	fChanged.notify_all();
	fWriter.join();
	BEntry(RecoveryFiles::LockPath(fFolder, fSession).String()).Remove();
}


void
TRecovery::Keep(int32 id, std::unique_ptr<BMessage> copy)
{
	{
		std::lock_guard<std::mutex> lock(fLock);
		fWaiting[id] = std::move(copy);
	}
	fChanged.notify_all();
}


void
TRecovery::Forget(int32 id)
{
	std::unique_lock<std::mutex> lock(fLock);
	fWaiting.erase(id);
	fChanged.wait(lock, [this, id] { return fWriting != id; });
	BEntry(RecoveryFiles::CopyPath(fFolder, fSession, id).String()).Remove();
}


int32
TRecovery::TakeOver(const char* path)
{
	const int32 id = NewId();
	const BString place = RecoveryFiles::CopyPath(fFolder, fSession, id);
	return BEntry(path).Rename(place.String(), false) == B_OK ? id : 0;
}


void
TRecovery::Flush()
{
	std::unique_lock<std::mutex> lock(fLock);
	fChanged.wait(lock, [this] { return fWaiting.empty() && fWriting == 0; });
}


status_t
TRecovery::StartSession()
{
	status_t status = RecoveryFiles::Folder(&fFolder);
	for (int32 attempt = 0; status == B_OK && attempt < kMostAttempts; attempt++) {
		BString session;
		session << static_cast<int64>(real_time_clock_usecs());
		status = RecoveryFiles::LockSession(RecoveryFiles::LockPath(fFolder, session),
			B_READ_WRITE | B_CREATE_FILE | B_FAIL_IF_EXISTS, &fLockFile);
		if (status == B_OK) {
			fSession = session;
			return B_OK;
		}
		if (status == B_FILE_EXISTS || status == B_BUSY)
			status = B_OK;
	}
	return status == B_OK ? B_BUSY : status;
}


/// The writer's thread.
void
TRecovery::Run()
{
	std::unique_lock<std::mutex> lock(fLock);
	for (;;) {
		fChanged.wait(lock, [this] { return fEnding || !fWaiting.empty(); });
		if (fWaiting.empty())
			return;
		const auto next = fWaiting.begin();
		fWriting = next->first;
		const std::unique_ptr<BMessage> copy = std::move(next->second);
		fWaiting.erase(next);

		lock.unlock();
		Write(fWriting, *copy);
		lock.lock();
		fWriting = 0;
		fChanged.notify_all();
	}
}


void
TRecovery::Write(int32 id, const BMessage& copy)
{
	TReplacementFile file(RecoveryFiles::CopyPath(fFolder, fSession, id).String());
	status_t status = file.InitCheck();
	if (status == B_OK)
		status = copy.Flatten(file.Stream());
	if (status == B_OK)
		status = file.Replace();
	// Once is enough: the disk stays full for a while.
	if (status != B_OK && !fWasTold)
		PrintDiagnostic("Warning: Unable to write recovery copies: %s\n", strerror(status));
	fWasTold = status != B_OK;
}
