// SPDX-License-Identifier: MIT
// The recovery copies of designers that are no more.

#pragma once

#include <memory>
#include <vector>

#include <Message.h>
#include <String.h>

class BFile;

/// One recovery copy that was left behind.
struct lost_form {
	BString copyPath; // where the copy is
	int32 id;    // its number in its session; of two copies of a form the later one has the greater
	int32 index; // the form's place in the project
	BString path; // the form's file; empty when it never had one
	BString name;
	BMessage copy; // RECOVERY_COPY
};

/// What was not saved of one project.
struct lost_project {
	BString session;
	BString path;                 // empty: it was never saved
	std::vector<lost_form> forms; // by their places in the project
};

/// Finds the copies that were left behind, and keeps other designers from finding them as long as it lives.
class TLostWork {
public:
	/// Looks for them. Those of running designers are left alone.
	TLostWork();
	~TLostWork();

	TLostWork(const TLostWork&) = delete;
	TLostWork& operator=(const TLostWork&) = delete;

	/// The projects, the latest first. Of several copies of a form that has a file there is only the latest one: the
	/// others are found again when that is gone.
	const std::vector<lost_project>& Projects() const { return fProjects; }

	/// Removes the copies of \a project.
	static void Discard(const lost_project& project);

private:
	struct session_lock {
		BString session;
		std::unique_ptr<BFile> file; // none: somebody else has it
	};

	bool Claim(const BString& session);
	void AddCopy(const BString& session, int32 id, const char* name);
	lost_project* ProjectFor(const BString& session, const BString& path);
	void RemoveIdleLocks();

	BString fFolder;
	std::vector<session_lock> fLocks;
	std::vector<lost_project> fProjects;
};
