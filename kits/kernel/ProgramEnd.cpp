// SPDX-License-Identifier: MIT
// What has to happen when the program ends, before the first static object goes.

#include "kernel/ProgramEnd.h"

#include <stdlib.h>
#include <unistd.h>

#include <atomic>

namespace BPrivate {

namespace {

constexpr int kMaxFunctions = 8;

std::atomic<int> sCount(0);
std::atomic<void (*)()> sFunctions[kMaxFunctions];


void
end_program()
{
	for (int i = sCount; i-- > 0;) {
		void (*function)() = sFunctions[i].exchange(nullptr);
		if (function != nullptr)
			function();
	}
}


/// exit() destroys the thread-local objects of its thread before all else. When the thread itself ends, its main
/// function has been left first, also by pthread_exit(), which unwinds the stack; exit() leaves nothing.
struct ExitWatch {
	~ExitWatch()
	{
		if (isArmed)
			end_program();
	}

	bool isArmed = false;
};

thread_local ExitWatch tExitWatch;


/// The library is loaded by the main thread, which has no main function of ours to be left.
struct MainThreadWatch {
	MainThreadWatch() { tExitWatch.isArmed = gettid() == getpid(); }
};

MainThreadWatch sMainThreadWatch;

} // namespace


void
call_at_program_end(void (*function)())
{
	const int index = sCount++;
	if (index >= kMaxFunctions)
		abort();
	sFunctions[index] = function;
	if (index == 0)
		atexit(end_program);
}


ThreadEndWatch::ThreadEndWatch()
{
	tExitWatch.isArmed = true;
}


ThreadEndWatch::~ThreadEndWatch()
{
	tExitWatch.isArmed = false;
}

} // namespace BPrivate
