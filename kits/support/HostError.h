// SPDX-License-Identifier: MIT
// The host's errno numbers as status codes of the API.

#ifndef _HOST_ERROR_H
#define _HOST_ERROR_H

#include <SupportDefs.h>

namespace BPrivate {

/// The status for one of the host's errno values, negative or not: 0 gives B_OK, a value without a
/// counterpart B_ERROR.
status_t host_error(int error);

/// The status for the calling thread's errno, never B_OK.
status_t host_error();

/// The host's errno value for a status; 0 when it has none.
int host_errno(status_t status);

} // namespace BPrivate

#endif // _HOST_ERROR_H
