// SPDX-License-Identifier: MIT

#include "support/FaultyDisk.h"

#include <dlfcn.h>
#include <fcntl.h>
#include <sys/stat.h>
#include <sys/types.h>
#include <sys/wait.h>
#include <sys/xattr.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <cstdarg>
#include <cstdio>
#include <cstring>

namespace {

struct fault_state {
	int call;
	disk_fault fault;
	int error;
	bool reached;
	bool isFull;
	std::vector<std::string> calls;
};

thread_local fault_state* sState = nullptr;


/// Notes the call \a name; true when it is to fail, with errno set. \a half, for writes, may be set instead.
bool
Fails(const char* name, bool needsRoom, bool* half = nullptr)
{
	fault_state* state = sState;
	if (state == nullptr)
		return false;
	// What the vector does must not count.
	sState = nullptr;
	state->calls.push_back(name);
	const bool isChosen = static_cast<int>(state->calls.size()) == state->call;
	sState = state;
	bool fails = state->isFull && needsRoom;
	if (isChosen) {
		state->reached = true;
		switch (state->fault) {
			case PROGRAM_IS_KILLED:
				kill(getpid(), SIGKILL);
				pause();
				break;
			case DISK_STAYS_FULL:
				state->isFull = true;
				fails = needsRoom;
				break;
			case DISK_WRITES_HALF:
				state->isFull = true;
				if (half != nullptr)
					*half = true;
				else
					fails = needsRoom;
				break;
			case DISK_CALL_FAILS:
				fails = true;
				break;
		}
	}
	if (fails)
		errno = state->error;
	return fails;
}


template <typename Function>
Function*
Next(const char* name)
{
	return reinterpret_cast<Function*>(dlsym(RTLD_NEXT, name));
}


bool
IsForWriting(int flags)
{
	return (flags & O_ACCMODE) != O_RDONLY || (flags & O_CREAT) != 0;
}

} // namespace

#define NEXT(name) static auto* const sNext = Next<decltype(name)>(#name)

extern "C" {

int
openat(int folder, const char* path, int flags, ...)
{
	NEXT(openat);
	mode_t mode = 0;
	if ((flags & O_CREAT) != 0) {
		va_list arguments;
		va_start(arguments, flags);
		mode = va_arg(arguments, mode_t);
		va_end(arguments);
	}
	if (IsForWriting(flags) && Fails("open", (flags & O_CREAT) != 0))
		return -1;
	return sNext(folder, path, flags, mode);
}


ssize_t
write(int fd, const void* buffer, size_t size)
{
	NEXT(write);
	bool half = false;
	if (fd > 2 && Fails("write", true, &half))
		return -1;
	return sNext(fd, buffer, half ? size / 2 : size);
}


ssize_t
pwrite(int fd, const void* buffer, size_t size, off_t offset)
{
	NEXT(pwrite);
	bool half = false;
	if (Fails("write", true, &half))
		return -1;
	return sNext(fd, buffer, half ? size / 2 : size, offset);
}


int
ftruncate(int fd, off_t size) noexcept
{
	NEXT(ftruncate);
	return Fails("truncate", true) ? -1 : sNext(fd, size);
}


int
fsync(int fd)
{
	NEXT(fsync);
	return Fails("sync", true) ? -1 : sNext(fd);
}


int
rename(const char* from, const char* to) noexcept
{
	NEXT(rename);
	return Fails("rename", false) ? -1 : sNext(from, to);
}


int
renameat2(
	int fromFolder, const char* from, int toFolder, const char* to, unsigned int flags) noexcept
{
	NEXT(renameat2);
	return Fails("rename", false) ? -1 : sNext(fromFolder, from, toFolder, to, flags);
}


int
unlink(const char* path) noexcept
{
	NEXT(unlink);
	return Fails("unlink", false) ? -1 : sNext(path);
}


int
mkdir(const char* path, mode_t mode) noexcept
{
	NEXT(mkdir);
	return Fails("mkdir", true) ? -1 : sNext(path, mode);
}


int
mkdirat(int folder, const char* path, mode_t mode) noexcept
{
	NEXT(mkdirat);
	return Fails("mkdir", true) ? -1 : sNext(folder, path, mode);
}


int
fchmod(int fd, mode_t mode) noexcept
{
	NEXT(fchmod);
	return Fails("chmod", false) ? -1 : sNext(fd, mode);
}


int
fsetxattr(int fd, const char* name, const void* value, size_t size, int flags) noexcept
{
	NEXT(fsetxattr);
	return Fails("setxattr", true) ? -1 : sNext(fd, name, value, size, flags);
}

} // extern "C"


FaultyDisk::FaultyDisk(int call, disk_fault fault, int error)
{
	// The functions behind are found before they are counted.
	static fault_state sFaults;
	sFaults = {call, fault, error, false, false, {}};
	sState = &sFaults;
}


FaultyDisk::~FaultyDisk()
{
	sState = nullptr;
}


const std::vector<std::string>&
FaultyDisk::Calls() const
{
	return sState->calls;
}


bool
FaultyDisk::WasReached() const
{
	return sState->reached;
}


bool
IsKilledAt(int call, const std::function<void()>& work)
{
	fflush(nullptr);
	const pid_t child = fork();
	if (child == 0) {
		FaultyDisk disk(call, PROGRAM_IS_KILLED, 0);
		work();
		_exit(0);
	}
	int status = 0;
	while (waitpid(child, &status, 0) < 0 && errno == EINTR) {
	}
	return WIFSIGNALED(status) && WTERMSIG(status) == SIGKILL;
}
