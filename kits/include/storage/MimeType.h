// SPDX-License-Identifier: MIT
// BMimeType: a MIME type and what the user's database knows about it.

#ifndef _MIME_TYPE_H
#define _MIME_TYPE_H

#include <string>

#include <Mime.h>
#include <StorageDefs.h>

class BBitmap;
class BMessage;
struct entry_ref;

enum app_verb { B_OPEN };

#define B_APP_MIME_TYPE "application/x-vnd.Be-elfexecutable"
#define B_PEF_APP_MIME_TYPE "application/x-be-executable"
#define B_PE_APP_MIME_TYPE "application/x-vnd.Be-peexecutable"
#define B_ELF_APP_MIME_TYPE "application/x-vnd.Be-elfexecutable"
#define B_RESOURCE_MIME_TYPE "application/x-be-resource"
#define B_FILE_MIME_TYPE "application/octet-stream"

enum { B_META_MIME_CHANGED = 'MMCH' };
enum {
	B_ICON_CHANGED = 0x00000001,
	B_PREFERRED_APP_CHANGED = 0x00000002,
	B_ATTR_INFO_CHANGED = 0x00000004,
	B_FILE_EXTENSIONS_CHANGED = 0x00000008,
	B_SHORT_DESCRIPTION_CHANGED = 0x00000010,
	B_LONG_DESCRIPTION_CHANGED = 0x00000020,
	B_ICON_FOR_TYPE_CHANGED = 0x00000040,
	B_APP_HINT_CHANGED = 0x00000080,
	B_MIME_TYPE_CREATED = 0x00000100,
	B_MIME_TYPE_DELETED = 0x00000200,
	B_SNIFFER_RULE_CHANGED = 0x00000400,
	B_SUPPORTED_TYPES_CHANGED = 0x00000800,
	B_EVERYTHING_CHANGED = (int)0xFFFFFFFF
};
enum { B_META_MIME_MODIFIED = 'MMMD', B_META_MIME_DELETED = 'MMDL' };

/// A MIME type.
///
/// The database is the shared MIME database of the desktop: packages (XML) in mime/packages of
/// $XDG_DATA_HOME, of the share folder beside the running program's bin folder, and of
/// $XDG_DATA_DIRS. A type installed here is one package file of its own in $XDG_DATA_HOME, after
/// which update-mime-database tells the desktop, where that program exists. Types are compared
/// without regard to case. Any thread.
class BMimeType {
public:
	BMimeType();
	BMimeType(const char* mimeType);
	virtual ~BMimeType();

	/// B_BAD_VALUE for a text that is no type; the object is then unset.
	status_t SetTo(const char* mimeType);
	void Unset();
	status_t InitCheck() const;
	/// Null when unset.
	const char* Type() const;

	bool IsValid() const;
	/// A supertype alone ("text") is valid. At most one slash, no blanks, controls or other
	/// separators, shorter than B_MIME_TYPE_LENGTH.
	static bool IsValid(const char* mimeType);

	bool IsSupertypeOnly() const;
	status_t GetSupertype(BMimeType* supertype) const;
	bool operator==(const BMimeType& type) const;
	bool operator==(const char* type) const;
	/// Whether \a type is this type, or a subtype of it.
	bool Contains(const BMimeType* type) const;

	/// Adds the type to the user's database. B_FILE_EXISTS when it is installed.
	status_t Install();
	/// Removes what was installed in the user's database. B_ENTRY_NOT_FOUND when nothing was.
	status_t Delete();
	bool IsInstalled() const;

	/// The getters give B_ENTRY_NOT_FOUND for a type that is not installed, or has no such thing.
	/// \a signature: B_MIME_TYPE_LENGTH bytes. \a description: 256 bytes. A setter installs the type
	/// when necessary; null removes the value.
	status_t GetPreferredApp(char* signature, app_verb verb = B_OPEN) const;
	status_t SetPreferredApp(const char* signature, app_verb verb = B_OPEN);
	status_t GetShortDescription(char* description) const;
	status_t SetShortDescription(const char* description);
	status_t GetLongDescription(char* description) const;
	status_t SetLongDescription(const char* description);
	/// Strings "extensions", without a dot.
	status_t GetFileExtensions(BMessage* extensions) const;
	status_t SetFileExtensions(const BMessage* extensions);

	/// The host's database has no icons of this form: B_ENTRY_NOT_FOUND.
	status_t GetIcon(BBitmap* icon, icon_size size) const;
	status_t GetIcon(uint8** _data, size_t* _size) const;

	/// Strings "super_types".
	static status_t GetInstalledSupertypes(BMessage* supertypes);
	/// Strings "types".
	static status_t GetInstalledTypes(BMessage* types);
	static status_t GetInstalledTypes(const char* supertype, BMessage* subtypes);

	/// Finds the type by the first bytes (rules of high priority), the name's ending, the other rules
	/// for content; at last text is "text/plain" and all else B_FILE_MIME_TYPE. Folders and links have
	/// types of their own. Attributes are not looked at.
	static status_t GuessMimeType(const entry_ref* file, BMimeType* type);
	static status_t GuessMimeType(const void* buffer, int32 length, BMimeType* type);
	/// By the name alone.
	static status_t GuessMimeType(const char* filename, BMimeType* type);

private:
	BMimeType(const BMimeType&) = delete;
	BMimeType& operator=(const BMimeType&) = delete;

	std::string fType;
	status_t fStatus;
};

#endif
