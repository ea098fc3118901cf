// SPDX-License-Identifier: MIT
// What the emitters of a form's files share.

#pragma once

#include <String.h>
#include <StringList.h>

class TDesignForm;

/// Base of the emitters that write the files of one form.
///
/// An emitter serves one file in one run. It only edits text; the generator reads and writes the file.
class TFormEmitter {
public:
	TFormEmitter();
	virtual ~TFormEmitter();

	/// Appends the section \a name to \a out with the content that the user gave it in the old file.
	virtual void EmitUserSection(const char* name, BString& out);

	/// Puts \a content into the section \a name of \a text; see WriteMachineSection().
	virtual void EmitMachineSection(const char* name, BString& content, BString& text);

	TDesignForm* Form() const { return fForm; }
	void SetForm(TDesignForm* form) { fForm = form; }

	/// True when the file was there before this run.
	bool FileExists() const { return fFileExists; }
	void SetFileExists(bool exists) { fFileExists = exists; }

	/// The file's content before this run, empty for a new file.
	const BString& FileText() const { return fFileText; }
	void SetFileText(const BString& text) { fFileText = text; }

	/// The sections of an existing file that could not be updated, for want of a marker.
	const BStringList& SkippedSections() const { return fSkippedSections; }

private:
	TDesignForm* fForm;
	bool fFileExists;
	BString fFileText;
	BStringList fSkippedSections;
};
