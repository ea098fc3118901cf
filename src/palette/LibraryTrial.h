// SPDX-License-Identifier: MIT
// Trying component libraries before they are loaded.

#pragma once

#include <map>
#include <string>
#include <vector>

#include <Message.h>

/// Tries component libraries in processes of their own, so that one that crashes or never returns does not take the
/// designer with it.
///
/// What was good once is remembered in a file, by path, time and size, and not tried again: starting the designer
/// costs no process then. Files that are no libraries at all are not tried either: loading them does no harm.
class TLibraryTrial {
public:
	/// \a program: plimcheck; without it, nothing is tried and all is safe. \a record: the file that remembers what
	/// was good; it need not exist, nor its folder be writable.
	TLibraryTrial(const char* program, const char* record);

	/// With the program beside the running one, and the record in the user's cache.
	TLibraryTrial();

	/// The longest time that libraries have for a trial, in microseconds; 20 seconds to begin with.
	void SetPatience(bigtime_t patience) { fPatience = patience; }

	/// Tries those of \a paths that are not known to be good, all at a time, and waits for them.
	void TryAll(const std::vector<std::string>& paths);

	/// Whether the library may be loaded; otherwise \a reason says what happened to its process.
	bool IsSafe(const char* path, std::string* reason) const;

private:
	void ReadRecord();
	void WriteRecord(const std::vector<std::string>& paths);

	std::string fProgram;
	std::string fRecord;
	bigtime_t fPatience;
	BMessage fGood;                                // for each path the stamp of its file
	std::map<std::string, std::string> fDangerous; // path and reason
};
