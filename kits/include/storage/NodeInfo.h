// SPDX-License-Identifier: MIT
// BNodeInfo: the file type, preferred application and icon of a node.

#ifndef _NODE_INFO_H
#define _NODE_INFO_H

#include <MimeType.h>

class BBitmap;
class BNode;

/// Reads and writes the attributes of a node that the desktop uses. The node must stay alive.
class BNodeInfo {
public:
	BNodeInfo();
	BNodeInfo(BNode* node);
	virtual ~BNodeInfo();

	status_t SetTo(BNode* node);
	status_t InitCheck() const;

	/// \a type: B_MIME_TYPE_LENGTH bytes.
	///
	/// A file without the attribute gets the type that its content, then its name tells.
	/// B_ENTRY_NOT_FOUND when they tell nothing.
	virtual status_t GetType(char* type) const;
	/// Writes the attribute "BEOS:TYPE"; null removes it. B_NOT_SUPPORTED on a file system without
	/// attributes, B_BAD_VALUE for a text that is no MIME type.
	virtual status_t SetType(const char* type);

	virtual status_t GetIcon(BBitmap* icon, icon_size which = B_LARGE_ICON) const;
	/// \a data is the caller's to free with delete[].
	status_t GetIcon(uint8** data, size_t* size, type_code* type) const;

	/// The signature, B_MIME_TYPE_LENGTH bytes. Null removes it.
	status_t GetPreferredApp(char* signature, app_verb verb = B_OPEN) const;
	status_t SetPreferredApp(const char* signature, app_verb verb = B_OPEN);

protected:
	BNode* Node() const { return fNode; }

private:
	BNode* fNode;
	status_t fStatus;
};

#endif
