// SPDX-License-Identifier: MIT
// The end of a wait with a limit.

#ifndef _DEADLINE_H
#define _DEADLINE_H

#include <chrono>
#include <condition_variable>
#include <mutex>

#include <OS.h>

namespace BPrivate {

/// The moment at which a wait that begins now ends. \a timeout: microseconds, 0 or less for no wait at all.
class Deadline {
public:
	explicit Deadline(bigtime_t timeout)
		: fInfinite(timeout > kLongestWait),
		  fNoWait(timeout <= 0),
		  fWhen(std::chrono::steady_clock::now()
			  + std::chrono::microseconds(fInfinite || fNoWait ? 0 : timeout))
	{
	}

	/// Waits until \a done() holds. \a lock is held whenever it is asked. Returns its last answer.
	template <typename Done>
	bool Wait(
		std::condition_variable& condition, std::unique_lock<std::mutex>& lock, Done done) const
	{
		if (fNoWait)
			return done();
		if (fInfinite) {
			condition.wait(lock, done);
			return true;
		}
		return condition.wait_until(lock, fWhen, done);
	}

	/// What a wait that came to nothing returns.
	status_t Error() const { return fNoWait ? B_WOULD_BLOCK : B_TIMED_OUT; }

private:
	// Some thirty years; more would overflow the clock.
	static constexpr bigtime_t kLongestWait = 1'000'000'000'000'000;

	bool fInfinite;
	bool fNoWait;
	std::chrono::steady_clock::time_point fWhen;
};

} // namespace BPrivate

#endif // _DEADLINE_H
