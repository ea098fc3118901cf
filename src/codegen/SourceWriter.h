// SPDX-License-Identifier: MIT
// Where generated text goes: the files of a run, and what became of each.

#pragma once

#include <vector>

#include <String.h>

enum generated_outcome {
	GENERATED_CREATED,    // there was no such file
	GENERATED_CHANGED,    // the file got a new content
	GENERATED_UNCHANGED,  // the file had this content already and was not touched
	GENERATED_KEPT,       // the file is its user's, and was left alone
	GENERATED_UNREADABLE, // the file is there but cannot be read; it was left alone
	GENERATED_UNWRITABLE  // the file cannot be written; it is as it was
};

/// One file of a run.
struct generated_file {
	BString path;
	generated_outcome outcome;
	status_t status; // why it could not be read or written
	BString text;    // the new content; only kept by a writer that writes nothing
};

/// Puts generated text into files, and remembers what happened to each.
///
/// A file is replaced in one step, keeping its permissions and attributes: whoever reads it, or finds it after
/// a crash, has the old text or the new one, whole. A file that has the text already is not touched.
class TSourceWriter {
public:
	TSourceWriter();

	/// From now on nothing is written or created; the outcomes are those that writing would have, as far
	/// as they can be told.
	void SetDryRun(bool dryRun) { fDryRun = dryRun; }

	/// Makes sure that the folder \a path is there: creates it unless it exists. Its parent must exist.
	bool PrepareFolder(const char* path);

	/// Makes \a text the content of the file at \a path.
	void WriteText(const char* path, const BString& text);

	/// Makes \a text the content of a new file at \a path; a file, folder or link that is there is left alone.
	void WriteOnce(const char* path, const BString& text);

	/// Notes that the file at \a path is left alone because it is its user's.
	void AddKept(const char* path);

	/// Copies the file at \a path, as it is, to the same name with "~" behind it.
	///
	/// For a file that is going to lose something. False, with the file noted as unwritable, when the copy
	/// cannot be made.
	bool KeepCopy(const char* path);

	/// Notes that the file at \a path is left alone because it cannot be read.
	void AddUnreadable(const char* path, status_t status);

	/// Notes, in one sentence without a line break, what the user should know about the file at \a path.
	void AddRemark(const char* path, const BString& sentence);

	/// What happened so far, in order.
	const std::vector<generated_file>& Files() const { return fFiles; }

	/// The remarks so far, each "PATH: sentence".
	const std::vector<BString>& Remarks() const { return fRemarks; }

private:
	bool fDryRun;
	std::vector<generated_file> fFiles;
	std::vector<BString> fRemarks;
};
