// SPDX-License-Identifier: MIT
// What a file panel makes of the paths and names that are typed into it.
#ifndef INTERFACE_PANEL_PATHS_H
#define INTERFACE_PANEL_PATHS_H

#include <string>

#include <SupportDefs.h>

struct entry_ref;

namespace BPrivate {

/// Why \a name can be no file's: a sentence for the user; empty when it can.
std::string NameProblem(const std::string& name);

/// The path that a typed text means: "~" is the home folder, and what is not absolute begins in
/// \a folder. Blanks around it do not count. Empty for an empty text.
std::string TypedPath(const std::string& text, const std::string& folder);

/// What \a text can be completed by: the rest of the only folder that goes on like it, with a slash, or
/// what all such folders have in common. Hidden folders only when the text asks for one.
std::string PathCompletion(const std::string& text, const std::string& folder);

/// The folder of \a path; "/" for the root.
std::string ParentPath(const std::string& path);
/// "/" for the root.
std::string LeafName(const std::string& path);

/// \a path, or the nearest folder above it, that still is a folder.
std::string NearestFolder(std::string path);

/// The path without links, remembered so that references to what it contains can be resolved. B_OK;
/// B_NOT_A_DIRECTORY; what else keeps it from being read (B_PERMISSION_DENIED, B_ENTRY_NOT_FOUND, ...).
status_t FindFolder(const std::string& path, std::string* resolved);

/// The folder that \a ref stands for, followed where it is a link. As FindFolder().
status_t FindFolder(const entry_ref& ref, std::string* resolved);

/// \a name, or with a number behind it, such that nothing in \a folder is called so.
std::string UnusedName(const std::string& folder, const std::string& name);

} // namespace BPrivate

#endif // INTERFACE_PANEL_PATHS_H
