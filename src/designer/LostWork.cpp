// SPDX-License-Identifier: MIT

#include "designer/LostWork.h"

#include <algorithm>
#include <set>
#include <string>

#include <Directory.h>
#include <Entry.h>
#include <File.h>

#include "designer/Recovery.h"
#include "model/Diagnostics.h"

namespace {

constexpr const char* kLockEnding = ".lock";
constexpr int32 kLockEndingLength = 5;


BString
FieldOf(const BMessage& copy, const char* name)
{
	const char* value = "";
	copy.FindString(name, &value);
	return value;
}


/// The names of the folder's entries. While it is read, entries must not go.
std::vector<BString>
NamesIn(const BString& folder)
{
	std::vector<BString> names;
	BDirectory directory(folder.String());
	entry_ref ref;
	while (directory.GetNextRef(&ref) == B_OK)
		names.emplace_back(ref.name);
	return names;
}


void
KeepLatest(std::vector<lost_form>* forms)
{
	std::sort(forms->begin(), forms->end(),
		[](const lost_form& left, const lost_form& right) { return left.id > right.id; });
	std::set<std::string> paths;
	forms->erase(std::remove_if(forms->begin(), forms->end(),
					 [&paths](const lost_form& form) {
						 return !form.path.IsEmpty() && !paths.insert(form.path.String()).second;
					 }),
		forms->end());
	std::sort(forms->begin(), forms->end(), [](const lost_form& left, const lost_form& right) {
		return left.index != right.index ? left.index < right.index : left.id < right.id;
	});
}

} // namespace

TLostWork::TLostWork()
{
	if (RecoveryFiles::Folder(&fFolder) != B_OK)
		return;
	for (const BString& name : NamesIn(fFolder)) {
		BString session;
		int32 id;
		if (RecoveryFiles::ParseCopyName(name.String(), &session, &id) && Claim(session))
			AddCopy(session, id, name.String());
	}
	for (lost_project& project : fProjects)
		KeepLatest(&project.forms);
	// A session is called by the time at which it began.
	std::sort(fProjects.begin(), fProjects.end(),
		[](const lost_project& left, const lost_project& right) {
			if (left.session.Length() != right.session.Length())
				return left.session.Length() > right.session.Length();
			return left.session != right.session ? left.session > right.session
												 : left.path < right.path;
		});
}


TLostWork::~TLostWork()
{
	RemoveIdleLocks();
}


void
TLostWork::Discard(const lost_project& project)
{
	for (const lost_form& form : project.forms)
		BEntry(form.copyPath.String()).Remove();
}


/// Whether the session's copies are this object's: its program is gone, and no other designer looks at them.
bool
TLostWork::Claim(const BString& session)
{
	for (const session_lock& lock : fLocks) {
		if (lock.session == session)
			return lock.file != nullptr;
	}
	std::unique_ptr<BFile> file = std::make_unique<BFile>();
	const BString path = RecoveryFiles::LockPath(fFolder, session);
	if (RecoveryFiles::LockSession(path, B_READ_WRITE | B_CREATE_FILE, file.get()) != B_OK)
		file.reset();
	fLocks.push_back({session, std::move(file)});
	return fLocks.back().file != nullptr;
}


void
TLostWork::AddCopy(const BString& session, int32 id, const char* name)
{
	BString path(fFolder);
	path << "/" << name;
	BFile file(path.String(), B_READ_ONLY);
	lost_form form;
	BMessage document;
	if (file.InitCheck() != B_OK || !file.IsFile() || form.copy.Unflatten(&file) != B_OK
		|| form.copy.what != RECOVERY_COPY || form.copy.FindMessage("form", &document) != B_OK) {
		PrintDiagnostic("Warning: Unable to read the recovery copy '%s'\n", path.String());
		return;
	}
	form.copyPath = path;
	form.id = id;
	form.index = form.copy.GetInt32("index", 0);
	form.path = FieldOf(form.copy, "path");
	form.name = FieldOf(form.copy, "name");
	ProjectFor(session, FieldOf(form.copy, "project"))->forms.push_back(form);
}


lost_project*
TLostWork::ProjectFor(const BString& session, const BString& path)
{
	for (lost_project& project : fProjects) {
		if (project.session == session && project.path == path)
			return &project;
	}
	fProjects.push_back({session, path, {}});
	return &fProjects.back();
}


/// Removes the lock files of sessions that are no more and have no copies.
void
TLostWork::RemoveIdleLocks()
{
	std::set<std::string> used;
	std::vector<BString> sessions;
	for (const BString& name : NamesIn(fFolder)) {
		BString session;
		int32 id;
		if (RecoveryFiles::ParseCopyName(name.String(), &session, &id))
			used.insert(session.String());
		else if (name.FindLast(kLockEnding) == name.Length() - kLockEndingLength)
			sessions.emplace_back(name.String(), name.Length() - kLockEndingLength);
	}
	for (const BString& session : sessions) {
		if (used.count(session.String()) == 0 && Claim(session))
			BEntry(RecoveryFiles::LockPath(fFolder, session).String()).Remove();
	}
}
