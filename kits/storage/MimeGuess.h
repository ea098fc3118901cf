// SPDX-License-Identifier: MIT
// The type of a file that says nothing about it.

#ifndef _MIME_GUESS_H
#define _MIME_GUESS_H

#include <string>
#include <string_view>

#include <SupportDefs.h>

namespace BPrivate {

/// By content, then name. Never empty: B_FILE_MIME_TYPE when neither tells.
std::string guess_mime_type(std::string_view content, const std::string& name);

/// The type of the node behind an open descriptor, which may be one for the status alone. A name that
/// is empty is found out. \a type is written on B_OK only.
status_t guess_descriptor_type(int fd, std::string name, std::string* type);

} // namespace BPrivate

#endif
