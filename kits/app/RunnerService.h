// SPDX-License-Identifier: MIT
// The thread that sends the messages of all message runners.

#ifndef _RUNNER_SERVICE_H
#define _RUNNER_SERVICE_H

#include <chrono>
#include <condition_variable>
#include <map>
#include <memory>
#include <mutex>
#include <set>
#include <utility>

#include <Message.h>
#include <Messenger.h>

namespace BPrivate {

/// Knows the runners and sends what is due; sleeps until then. Its thread starts with the first runner.
class RunnerService {
public:
	static RunnerService& Default();

	/// Returns the new runner's token. It goes by itself when all is sent or the target is gone.
	int64 Add(const BMessenger& target, const BMessage& message, bigtime_t interval, int32 count,
		const BMessenger& replyTo);
	/// After the return nothing more is sent. Unknown tokens are ignored.
	void Remove(int64 token);

	/// Each begins a new interval; false when the runner has sent everything.
	bool SetInterval(int64 token, bigtime_t interval);
	bool SetCount(int64 token, int32 count);
	bool GetInfo(int64 token, bigtime_t* interval, int32* count);

private:
	using Clock = std::chrono::steady_clock;

	struct Runner {
		BMessenger target;
		BMessenger replyTo;
		BMessage message;
		bigtime_t interval;
		int32 count; // left; below 0 for ever
		Clock::time_point due;
	};

	RunnerService();

	void Schedule(int64 token, Runner& runner);
	void Unschedule(int64 token, const Runner& runner);
	void RunThread();
	void SendDue(int64 token);

	std::mutex fMutex;
	std::condition_variable fChanged;
	bool fStarted;
	int64 fNextToken;
	std::map<int64, std::unique_ptr<Runner>> fRunners;
	std::set<std::pair<Clock::time_point, int64>> fSchedule;
};

} // namespace BPrivate

#endif // _RUNNER_SERVICE_H
