// SPDX-License-Identifier: MIT
// Writing the user's packages of the MIME database, and telling the desktop.

#ifndef _MIME_UPDATE_H
#define _MIME_UPDATE_H

#include <string>

#include <SupportDefs.h>

namespace BPrivate {

/// The ending of packages for supertypes alone, which the desktop's database does not know.
extern const char* const kSupertypeSuffix;

/// The name of the user's package of one type; no two types have the same.
std::string package_file_name(const std::string& key);

status_t read_whole_file(const std::string& path, size_t maxSize, std::string* content);

/// Puts a file with the content in the place of \a path, in one step. B_DEVICE_FULL, the old file
/// untouched, and so on.
status_t replace_file(const std::string& path, const std::string& content);

/// Runs update-mime-database on the folder and waits for it. Without that program the packages have
/// to do: nothing happens.
void update_desktop_database(const std::string& folder);

} // namespace BPrivate

#endif
