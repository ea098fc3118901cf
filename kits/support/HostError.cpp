// SPDX-License-Identifier: MIT
// The host's errno numbers as status codes of the API.

#include "support/HostError.h"

#include <errno.h>

namespace {

struct ErrorPair {
	int host;
	status_t status;
};

// The platform's own numbers of the POSIX errors that have no B_ name.
constexpr status_t
posix(int offset)
{
	return B_POSIX_ERROR_BASE + offset;
}


constexpr ErrorPair kErrors[] = {
	{ENOMEM, B_NO_MEMORY},
	{EACCES, B_PERMISSION_DENIED},
	{EINTR, B_INTERRUPTED},
	{EIO, B_IO_ERROR},
	{EBUSY, B_BUSY},
	{EFAULT, B_BAD_ADDRESS},
	{ETIMEDOUT, B_TIMED_OUT},
	{EAGAIN, B_WOULD_BLOCK},
	{EBADF, B_FILE_ERROR},
	{EEXIST, B_FILE_EXISTS},
	{EINVAL, B_BAD_VALUE},
	{ENAMETOOLONG, B_NAME_TOO_LONG},
	{ENOENT, B_ENTRY_NOT_FOUND},
	{EPERM, B_NOT_ALLOWED},
	{ENOTDIR, B_NOT_A_DIRECTORY},
	{EISDIR, B_IS_A_DIRECTORY},
	{ENOTEMPTY, B_DIRECTORY_NOT_EMPTY},
	{ENOSPC, B_DEVICE_FULL},
	{EROFS, B_READ_ONLY_DEVICE},
	{EMFILE, B_NO_MORE_FDS},
	{EXDEV, B_CROSS_DEVICE_LINK},
	{ELOOP, B_LINK_LIMIT},
	{ENOEXEC, B_NOT_AN_EXECUTABLE},
	{EPIPE, B_BUSTED_PIPE},
	{E2BIG, B_TOO_MANY_ARGS},
	{EFBIG, B_FILE_TOO_LARGE},
	{ERANGE, B_RESULT_NOT_REPRESENTABLE},
	{ENODEV, B_DEVICE_NOT_FOUND},
	{EOVERFLOW, B_BUFFER_OVERFLOW},
	{EOPNOTSUPP, B_NOT_SUPPORTED},
	{ECHILD, posix(0x02)},
	{EDEADLK, posix(0x03)},
	{EMLINK, posix(0x05)},
	{ENFILE, posix(0x06)},
	{ENOLCK, posix(0x08)},
	{ENOSYS, posix(0x09)},
	{ENOTTY, posix(0x0a)},
	{ENXIO, posix(0x0b)},
	{ESPIPE, posix(0x0c)},
	{ESRCH, posix(0x0d)},
	{EDOM, posix(0x10)},
	{EPROTOTYPE, posix(0x12)},
	{EPROTONOSUPPORT, posix(0x13)},
	{EPFNOSUPPORT, posix(0x14)},
	{EAFNOSUPPORT, posix(0x15)},
	{EADDRINUSE, posix(0x16)},
	{EADDRNOTAVAIL, posix(0x17)},
	{ENETDOWN, posix(0x18)},
	{ENETUNREACH, posix(0x19)},
	{ENETRESET, posix(0x1a)},
	{ECONNABORTED, posix(0x1b)},
	{ECONNRESET, posix(0x1c)},
	{EISCONN, posix(0x1d)},
	{ENOTCONN, posix(0x1e)},
	{ESHUTDOWN, posix(0x1f)},
	{ECONNREFUSED, posix(0x20)},
	{EHOSTUNREACH, posix(0x21)},
	{ENOPROTOOPT, posix(0x22)},
	{ENOBUFS, posix(0x23)},
	{EINPROGRESS, posix(0x24)},
	{EALREADY, posix(0x25)},
	{EILSEQ, posix(0x26)},
	{ENOMSG, posix(0x27)},
	{ESTALE, posix(0x28)},
	{EMSGSIZE, posix(0x2a)},
	{ENOTSOCK, posix(0x2c)},
	{EHOSTDOWN, posix(0x2d)},
	{EBADMSG, posix(0x2e)},
	{ECANCELED, posix(0x2f)},
	{EDESTADDRREQ, posix(0x30)},
	{EDQUOT, posix(0x31)},
	{EIDRM, posix(0x32)},
	{EMULTIHOP, posix(0x33)},
	{ENODATA, posix(0x34)},
	{ENOLINK, posix(0x35)},
	{ENOSR, posix(0x36)},
	{ENOSTR, posix(0x37)},
	{EPROTO, posix(0x39)},
	{ETIME, posix(0x3a)},
	{ETXTBSY, posix(0x3b)},
	{ENOTRECOVERABLE, posix(0x3d)},
	{EOWNERDEAD, posix(0x3e)},
	{ESOCKTNOSUPPORT, posix(0x3f)},
	// The host's own, by their nearest meaning.
	{ELIBACC, B_MISSING_LIBRARY},
	{ELIBBAD, B_NOT_AN_EXECUTABLE},
	{ENOTBLK, B_BAD_VALUE},
	{EUSERS, B_NO_MEMORY},
	{ENOMEDIUM, B_DEVICE_NOT_FOUND},
	{EREMOTEIO, B_IO_ERROR},
};

} // namespace


namespace BPrivate {

status_t
host_error(int error)
{
	if (error == 0)
		return B_OK;
	if (error < 0)
		error = -error;

	for (const ErrorPair& pair : kErrors) {
		if (pair.host == error)
			return pair.status;
	}
	return B_ERROR;
}


status_t
host_error()
{
	return errno == 0 ? B_ERROR : host_error(errno);
}


int
host_errno(status_t status)
{
	for (const ErrorPair& pair : kErrors) {
		if (pair.status == status)
			return pair.host;
	}
	return 0;
}

} // namespace BPrivate
