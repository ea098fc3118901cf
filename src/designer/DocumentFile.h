// SPDX-License-Identifier: MIT
// A document of the designer: one flattened message that is the whole content of a file.

#pragma once

#include <vector>

#include <Path.h>
#include <String.h>

#include "app/TypedMessage.h"
#include "designer/FileStamp.h"

class BNode;

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

	/// Gives the file a text attribute when it is written, in the same step as its content. Where a file system
	/// keeps no attributes it is lost.
	void SetAttribute(const char* name, const char* value);

	/// What the file held when it was last opened, or holds since it was saved.
	const TFileStamp& Stamp() const { return fStamp; }

private:
	struct text_attribute {
		BString name;
		BString value;
	};

	status_t ResolvePath();
	status_t WriteDocument();
	void WriteAttributes(BNode* node) const;

	char fFilename[256];
	bool fFilenameCut;
	char fFileType[100];
	BPath fPath;
	status_t fStatus;
	std::vector<text_attribute> fAttributes;
	TFileStamp fStamp;
};
