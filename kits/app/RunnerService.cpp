// SPDX-License-Identifier: MIT
// The thread that sends the messages of all message runners.

#include "app/RunnerService.h"

#include <algorithm>
#include <thread>

namespace BPrivate {

namespace {

constexpr bigtime_t kShortestInterval = 1000;
// A century; more would overflow the clock.
constexpr bigtime_t kLongestInterval = 3'000'000'000'000'000;

} // namespace


RunnerService&
RunnerService::Default()
{
	static RunnerService* service = new RunnerService;
	return *service;
}


RunnerService::RunnerService()
	: fStarted(false),
	  fNextToken(1)
{
}


int64
RunnerService::Add(const BMessenger& target, const BMessage& message, bigtime_t interval,
	int32 count, const BMessenger& replyTo)
{
	std::lock_guard<std::mutex> lock(fMutex);
	int64 token = fNextToken++;
	auto runner = std::make_unique<Runner>(Runner{target, replyTo, message, interval, count, {}});
	Schedule(token, *runner);
	fRunners[token] = std::move(runner);
	if (!fStarted) {
		fStarted = true;
		std::thread(&RunnerService::RunThread, this).detach();
	}
	return token;
}


void
RunnerService::Remove(int64 token)
{
	std::lock_guard<std::mutex> lock(fMutex);
	auto found = fRunners.find(token);
	if (found == fRunners.end())
		return;
	Unschedule(token, *found->second);
	fRunners.erase(found);
}


bool
RunnerService::SetInterval(int64 token, bigtime_t interval)
{
	std::lock_guard<std::mutex> lock(fMutex);
	auto found = fRunners.find(token);
	if (found == fRunners.end())
		return false;

	Unschedule(token, *found->second);
	found->second->interval = interval;
	Schedule(token, *found->second);
	return true;
}


bool
RunnerService::SetCount(int64 token, int32 count)
{
	std::lock_guard<std::mutex> lock(fMutex);
	auto found = fRunners.find(token);
	if (found == fRunners.end())
		return false;

	Unschedule(token, *found->second);
	found->second->count = count;
	Schedule(token, *found->second);
	return true;
}


bool
RunnerService::GetInfo(int64 token, bigtime_t* interval, int32* count)
{
	std::lock_guard<std::mutex> lock(fMutex);
	auto found = fRunners.find(token);
	if (found == fRunners.end())
		return false;

	if (interval != nullptr)
		*interval = found->second->interval;
	if (count != nullptr)
		*count = std::max<int32>(found->second->count, -1);
	return true;
}


void
RunnerService::Schedule(int64 token, Runner& runner)
{
	runner.due = Clock::now()
		+ std::chrono::microseconds(
			std::clamp(runner.interval, kShortestInterval, kLongestInterval));
	fSchedule.insert({runner.due, token});
	fChanged.notify_one();
}


void
RunnerService::Unschedule(int64 token, const Runner& runner)
{
	fSchedule.erase({runner.due, token});
}


void
RunnerService::RunThread()
{
	std::unique_lock<std::mutex> lock(fMutex);
	while (true) {
		if (fSchedule.empty()) {
			fChanged.wait(lock);
			continue;
		}
		auto [due, token] = *fSchedule.begin();
		if (Clock::now() < due) {
			fChanged.wait_until(lock, due);
			continue;
		}
		SendDue(token);
	}
}


/// Sends one message of the runner, with the service locked: Remove() must not return before it is sent.
void
RunnerService::SendDue(int64 token)
{
	auto found = fRunners.find(token);
	Runner& runner = *found->second;
	Unschedule(token, runner);

	bool sent = runner.target.SendMessage(&runner.message, runner.replyTo) == B_OK;
	if (sent && runner.count > 0)
		runner.count--;
	if (!sent || runner.count == 0) {
		fRunners.erase(found);
		return;
	}

	// From when it was due, so that the rate holds; a tick that was missed is left out.
	bigtime_t interval = std::clamp(runner.interval, kShortestInterval, kLongestInterval);
	runner.due += std::chrono::microseconds(interval);
	if (runner.due < Clock::now())
		runner.due = Clock::now() + std::chrono::microseconds(interval);
	fSchedule.insert({runner.due, token});
}

} // namespace BPrivate
