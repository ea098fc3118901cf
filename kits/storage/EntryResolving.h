// SPDX-License-Identifier: MIT
// From a path to an entry_ref and back.

#ifndef _ENTRY_RESOLVING_H
#define _ENTRY_RESOLVING_H

#include <string>

#include <SupportDefs.h>

struct entry_ref;

namespace BPrivate {

/// The reference of \a path, which may be relative to the current directory. The links of its folders
/// are resolved, the leaf only with \a traverse. The folder must exist, the leaf need not.
///
/// B_BAD_VALUE for a null path, B_ENTRY_NOT_FOUND for an empty one, B_NAME_TOO_LONG, B_LINK_LIMIT, ...
status_t resolve_path(const char* path, bool traverse, entry_ref* ref);

/// The path of a reference. B_BAD_VALUE for a name that is none, B_ENTRY_NOT_FOUND without the folder.
status_t find_ref_path(const entry_ref& ref, std::string* path);

/// \a folder and \a leaf with one slash between them.
std::string join_path(const std::string& folder, const std::string& leaf);

} // namespace BPrivate

#endif
