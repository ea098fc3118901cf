// SPDX-License-Identifier: MIT
// The shared MIME database: the packages of all folders of data, and the user's own changes.

#ifndef _MIME_DATABASE_H
#define _MIME_DATABASE_H

#include <functional>
#include <map>
#include <mutex>
#include <string>
#include <string_view>
#include <vector>

#include "storage/MimePackage.h"

struct stat;

namespace BPrivate {

/// The packages are read when first needed, and again when a file of theirs has changed, appeared or
/// vanished. Any thread; lasts as long as the process.
class MimeDatabase {
public:
	static MimeDatabase& Default();

	/// What is known about the type: of each thing, what the package with the highest precedence
	/// tells. False when no package has the type. A supertype is there when it has a subtype.
	bool Find(const std::string& type, mime_description* description);
	/// Whether Find() would find it. Takes a hundredth of the time as long as nothing else was asked for.
	bool Has(const std::string& type);
	/// Every type, as its first package spells it, in alphabetical order.
	std::vector<std::string> Types();

	/// Changes the type in the user's own package, which is made when necessary, and has the desktop's
	/// form of the database updated. Nothing has changed when it fails.
	status_t Change(const std::string& type, const std::function<void(mime_description*)>& change);
	/// B_ENTRY_NOT_FOUND for an unknown type, B_NOT_ALLOWED for one that the user does not own.
	status_t Remove(const std::string& type);

	/// The type by content and name, either of which may be empty; empty when neither tells.
	std::string Guess(std::string_view content, const std::string& name);

private:
	struct rule {
		std::string type;
		size_t folder;
		const mime_magic* magic;
	};
	struct folder {
		// Tells the state in which the packages were read, and names the folder.
		std::string signature;
		std::map<std::string, mime_description> types;
	};

	void Refresh();
	/// Reads the folder's packages when they are not as they were; whether they were read.
	bool RefreshFolder(const std::string& path, folder* folder);
	void CollectRules();
	void Merge(mime_description type, std::map<std::string, mime_description>* types);
	std::string GuessByContent(std::string_view content, int32 lowest, int32 highest) const;
	std::string GuessByName(const std::string& name) const;

	std::mutex fLock;
	std::vector<folder> fFolders;
	// By falling priority, then by precedence.
	std::vector<rule> fRules;
};

/// How many bytes of a file are looked at.
const size_t kMimeContentSize = 4096;

} // namespace BPrivate

#endif
