// SPDX-License-Identifier: MIT
// A disk on which the n-th thing that a program does to it fails, or is the program's last.

#pragma once

#include <functional>
#include <string>
#include <vector>

/// What happens at the chosen call.
enum disk_fault {
	DISK_CALL_FAILS,  // it does nothing and reports an error: a full disk, a broken one
	DISK_STAYS_FULL,  // the same, and so does each later call that needs room
	DISK_WRITES_HALF, // a write takes half of the bytes; the next one finds the disk full
	PROGRAM_IS_KILLED // the program ends before the call, as by kill -9
};

/// Counts the calls that change something on the disk (open for writing, write, truncate, sync, rename, unlink, mkdir,
/// change of permissions or attributes) of this program and its libraries, and makes one of them fail.
///
/// The functions of the C library are found in this program first. One object at a time; only calls of the thread that
/// made it count.
class FaultyDisk {
public:
	/// Nothing happens at \a call 0: it only counts.
	FaultyDisk(int call, disk_fault fault, int error);
	~FaultyDisk();

	FaultyDisk(const FaultyDisk&) = delete;
	FaultyDisk& operator=(const FaultyDisk&) = delete;

	/// What was called so far, by name.
	const std::vector<std::string>& Calls() const;
	/// Whether the chosen call was reached.
	bool WasReached() const;
};

/// Runs \a work in a copy of this program that is killed at its \a call th change of the disk; true when it was.
///
/// \a work must not need other threads than its own.
bool IsKilledAt(int call, const std::function<void()>& work);
