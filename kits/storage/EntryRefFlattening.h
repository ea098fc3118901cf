// SPDX-License-Identifier: MIT
// An entry_ref as bytes, for messages and flattened paths.

#ifndef _ENTRY_REF_FLATTENING_H
#define _ENTRY_REF_FLATTENING_H

#include <string>

#include <SupportDefs.h>

struct entry_ref;

namespace BPrivate {

/// The form is the platform's: device (4 bytes), folder (8 bytes), name with terminator, in the byte
/// order of the machine; an unset reference has no name. Behind the name comes the folder's path with
/// a terminator when it is known, so that another program can find the folder.
std::string flatten_entry_ref(const entry_ref& ref);

/// B_BAD_DATA, \a ref unchanged, for bytes that are no reference; B_BAD_VALUE for null pointers. The
/// bytes are not trusted: a path is believed only where device and inode of what it names agree.
status_t unflatten_entry_ref(const void* buffer, size_t size, entry_ref* ref);

} // namespace BPrivate

#endif
