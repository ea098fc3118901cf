// SPDX-License-Identifier: MIT
// The host's error numbers as the storage functions report them.

#ifndef _STORAGE_STATUS_H
#define _STORAGE_STATUS_H

#include <cerrno>

#include <Errors.h>

#include "support/HostError.h"

namespace BPrivate {

/// The status for one of the host's error numbers, never B_OK. A quota that is used up is a full
/// device, and an attribute that is missing is an entry that is missing.
inline status_t
status_from_errno(int error)
{
	if (error == EDQUOT)
		return B_DEVICE_FULL;
	if (error == ENODATA)
		return B_ENTRY_NOT_FOUND;
	return host_error(error);
}


/// B_OK for a result of 0 or above, else the status for errno.
inline status_t
status_of(long result)
{
	return result < 0 ? status_from_errno(errno) : B_OK;
}

} // namespace BPrivate

#endif
