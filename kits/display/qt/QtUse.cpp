// SPDX-License-Identifier: MIT
// The use of Qt outside of the display's thread, and its end before Qt's static objects go.
#include "display/qt/QtUse.h"

#include <atomic>
#include <chrono>
#include <condition_variable>
#include <mutex>

#include <pthread.h>

#include "kernel/Kernel.h"

namespace BPrivate {

namespace {

// Longer than anything takes that is done with Qt; a thread that is stopped meanwhile must not keep the program.
const std::chrono::seconds kLongestUse(3);

std::atomic<int> sUses(0);
std::atomic<bool> sIsOver(false);
// Never destroyed: threads go on while the program ends.
std::mutex& sMutex = *new std::mutex;
std::condition_variable& sEnded = *new std::condition_variable;

// Those of the calling thread among all, and whether its end is one.
thread_local int tUses = 0;
thread_local int tEnds = 0;


bool
Begin()
{
	// In this order, as EndAll() does it the other way round.
	sUses++;
	return !sIsOver;
}


void
End()
{
	sUses--;
	if (!sIsOver)
		return;
	std::lock_guard<std::mutex> lock(sMutex);
	sEnded.notify_all();
}


/// Qt has objects for each thread that used it, and deletes them by a key of its own. That is a use, too.
pthread_key_t
EndKey()
{
	static const pthread_key_t sKey = [] {
		pthread_key_t key;
		pthread_key_create(&key, [](void* round) {
			// The order of the keys is not known: in the second round Qt has done its part.
			static char sSecond;
			if (round != &sSecond && pthread_setspecific(EndKey(), &sSecond) == 0)
				return;
			End();
		});
		return key;
	}();
	return sKey;
}


struct ThreadEnd {
	~ThreadEnd()
	{
		// Once Qt's static objects may be gone, its thread must not be taken apart: it stays until the process goes.
		if (!Begin()) {
			End();
			stay_until_program_end();
			return;
		}
		static char sFirst;
		tEnds = 1;
		if (pthread_setspecific(EndKey(), &sFirst) != 0)
			End();
	}
};

} // namespace


QtUse::QtUse()
	: fIsAllowed(Begin() || tUses > 0)
{
	thread_local ThreadEnd end;
	static_cast<void>(&end);
	tUses++;
}


QtUse::~QtUse()
{
	tUses--;
	End();
}


void
QtUse::EndAll()
{
	sIsOver = true;
	std::unique_lock<std::mutex> lock(sMutex);
	sEnded.wait_for(lock, kLongestUse, [] { return sUses == tUses + tEnds; });
}

} // namespace BPrivate
