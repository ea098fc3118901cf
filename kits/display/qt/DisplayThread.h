// SPDX-License-Identifier: MIT
// The thread that Qt's application object lives in, and how work gets there.
#ifndef DISPLAY_QT_DISPLAY_THREAD_H
#define DISPLAY_QT_DISPLAY_THREAD_H

#include <condition_variable>
#include <deque>
#include <functional>
#include <memory>
#include <mutex>
#include <string>
#include <thread>

class QObject;

namespace BPrivate {

/// Tasks run in the order they came, one at a time. They must not wait for any other thread.
class DisplayThread {
public:
	DisplayThread();

	/// Starts Qt on \a platforms (as for QT_QPA_PLATFORM, tried in turn), then runs \a started there.
	/// Returns false, the thread ended, when none of them can be had.
	bool Start(const std::string& platforms, std::function<void()> started);

	/// Runs \a ending in the thread, then ends Qt there and waits for that; the thread itself stays. Later tasks
	/// are refused, but only after \a ending: who waits for one does so until then.
	void Stop(std::function<void()> ending);

	/// Queues \a task; false, and nothing happens, when the thread has ended.
	bool Post(std::function<void()> task);

	/// Runs \a task in the thread and waits for it. False when the thread ended before it was run.
	/// \a meanwhile runs here, before the waiting.
	bool Run(const std::function<void()>& task, const std::function<void()>& meanwhile = nullptr);

	/// In the thread itself, when the host's display broke away: refuses further tasks, lets go all who
	/// wait, and never returns to the caller.
	[[noreturn]] void Abandon(const std::function<void()>& farewell);

	bool IsCurrent() const;

private:
	struct Waiting;

	void Main(const std::string& platforms, const std::function<void()>& started);
	void RunTasks();
	void Refuse();

	std::thread fThread;
	std::mutex fMutex;
	std::condition_variable fCondition;
	std::deque<std::function<void()>> fTasks;
	QObject* fWaker;
	bool fAccepts;
	bool fHasStarted;
	bool fHasEnded;
	bool fWakeIsPending;
	/// Counts up when tasks are thrown away, so that those who wait for them wake.
	bool fRefused;
	std::thread::id fId;
};

} // namespace BPrivate

#endif // DISPLAY_QT_DISPLAY_THREAD_H
