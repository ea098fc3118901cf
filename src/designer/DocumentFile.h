// SPDX-License-Identifier: MIT
// A document of the designer: one flattened message that is the whole content of a file.

#pragma once

#include <Path.h>

#include "app/TypedMessage.h"

/// A message that knows the file it is stored in and that file's type.
///
/// The document's content is the fields of this message. The destructor never writes the file. Use it
/// from one thread.
class TPLIMFile : public TTypedMessage {
public:
	/// \a mimeType: at most 99 characters, or null. With \a fileName the file is read at once; see
	/// InitCheck().
	explicit TPLIMFile(const char* mimeType = nullptr, const char* fileName = nullptr);
	virtual ~TPLIMFile();

	/// Writes the document, and the file's type and preferred application.
	///
	/// Whoever reads the file finds the old document or the new one, whole; what a longer old file
	/// had beyond the new content stays behind it. False, with the file as it was, when it cannot be
	/// written; InitCheck() tells why.
	bool SaveFile();

	/// Replaces the message by the file's; false when it cannot be opened or is no document.
	///
	/// A file that cannot be opened leaves the fields as they are. InitCheck() tells why.
	bool OpenFile();

	/// At most 255 bytes are kept, and a longer name is then refused with B_NAME_TOO_LONG by opening and
	/// saving, which would reach another file. Null is ignored.
	void SetFilename(const char* name);
	const char* Filename() const { return fFilename; }
	const char* FileType() const { return fFileType; }

	/// The result of the last opening, reading or writing; B_NO_INIT before there was one.
	status_t InitCheck() const { return fStatus; }

private:
	status_t ResolvePath();
	status_t WriteDocument();

	char fFilename[256];
	bool fFilenameCut;
	char fFileType[100];
	BPath fPath;
	status_t fStatus;
};
