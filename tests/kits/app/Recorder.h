// SPDX-License-Identifier: MIT
// Loopers and handlers that write down what reaches them, for the tests of the Application Kit.

#ifndef TESTS_KITS_APP_RECORDER_H
#define TESTS_KITS_APP_RECORDER_H

#include <chrono>
#include <condition_variable>
#include <functional>
#include <mutex>
#include <vector>

#include <Looper.h>
#include <Message.h>
#include <OS.h>

/// No wait of a test is longer; only a test that fails ever waits that long.
inline constexpr bigtime_t kLimit = 20'000'000;


/// Something that one thread reports and another waits for.
class Signal {
public:
	void Raise()
	{
		std::lock_guard<std::mutex> lock(fMutex);
		fCount++;
		fCondition.notify_all();
	}

	/// Waits until it was raised \a count times in all; false after the limit.
	bool Wait(int32 count = 1, bigtime_t limit = kLimit)
	{
		std::unique_lock<std::mutex> lock(fMutex);
		return fCondition.wait_for(
			lock, std::chrono::microseconds(limit), [&] { return fCount >= count; });
	}

	int32 Count()
	{
		std::lock_guard<std::mutex> lock(fMutex);
		return fCount;
	}

private:
	std::mutex fMutex;
	std::condition_variable fCondition;
	int32 fCount = 0;
};


/// Keeps the codes of its messages in order.
class Record {
public:
	void Add(uint32 what)
	{
		{
			std::lock_guard<std::mutex> lock(fMutex);
			fCodes.push_back(what);
		}
		fArrived.Raise();
	}

	bool Wait(int32 count = 1, bigtime_t limit = kLimit) { return fArrived.Wait(count, limit); }

	std::vector<uint32> Codes()
	{
		std::lock_guard<std::mutex> lock(fMutex);
		return fCodes;
	}

private:
	std::mutex fMutex;
	std::vector<uint32> fCodes;
	Signal fArrived;
};


class RecordingHandler : public BHandler {
public:
	explicit RecordingHandler(const char* name = NULL)
		: BHandler(name)
	{
	}

	void MessageReceived(BMessage* message) override
	{
		if (hook)
			hook(message);
		record.Add(message->what);
	}

	Record record;
	/// Runs before the message is recorded, in the looper's thread.
	std::function<void(BMessage*)> hook;
};


class RecordingLooper : public BLooper {
public:
	explicit RecordingLooper(const char* name = "recorder")
		: BLooper(name)
	{
	}
	~RecordingLooper() override
	{
		if (gone != nullptr)
			gone->Raise();
	}

	void MessageReceived(BMessage* message) override
	{
		if (hook)
			hook(message);
		record.Add(message->what);
	}
	bool QuitRequested() override { return quitAnswer; }

	Record record;
	std::function<void(BMessage*)> hook;
	bool quitAnswer = true;
	/// Raised by the destructor.
	Signal* gone = nullptr;
};


/// Ends a looper; nothing happens when it has gone.
inline void
QuitLooper(BLooper* looper)
{
	if (looper->Lock())
		looper->Quit();
}


/// Quits a running looper at the end of the block.
class LooperGuard {
public:
	explicit LooperGuard(BLooper* looper)
		: fLooper(looper)
	{
	}
	~LooperGuard() { QuitLooper(fLooper); }

private:
	BLooper* fLooper;
};

#endif // TESTS_KITS_APP_RECORDER_H
