// SPDX-License-Identifier: MIT
// Tests of the waits for the user in the middle of a program's function.
#include <Looper.h>
#include <Messenger.h>
#include <OS.h>

#include <gtest/gtest.h>

#include "app/LooperPrivate.h"
#include "interface/UserWait.h"

using BPrivate::LooperAccess;
using BPrivate::UserWait;

namespace {

constexpr uint32 kMsgWait = 'wait';
constexpr bigtime_t kLimit = 10000000;


/// Waits for the user, and then until it may go on.
class WaitingLooper : public BLooper {
public:
	WaitingLooper()
		: BLooper("waiting looper")
	{
	}
	~WaitingLooper() override { delete_sem(mayGoOn); }

	void MessageReceived(BMessage* message) override
	{
		if (message->what != kMsgWait) {
			BLooper::MessageReceived(message);
			return;
		}
		wait.Wait("a test");
		acquire_sem_etc(mayGoOn, 1, B_RELATIVE_TIMEOUT, kLimit);
	}

	bool BeginsToWait()
	{
		PostMessage(kMsgWait);
		const bigtime_t end = system_time() + kLimit;
		while (!LooperAccess::IsInUserWait(this) && system_time() < end)
			snooze(1000);
		return LooperAccess::IsInUserWait(this);
	}

	UserWait wait;
	const sem_id mayGoOn = create_sem(0, "may go on");
};


void
Quit(BLooper* looper)
{
	looper->Lock();
	looper->Quit();
}

} // namespace


TEST(UserWaitTest, TheLooperIsBusyAgainAsSoonAsTheWaitIsEnded)
{
	for (int i = 0; i < 20; i++) {
		WaitingLooper* looper = new WaitingLooper;
		looper->Run();
		ASSERT_TRUE(looper->BeginsToWait());
		looper->wait.End();
		// Its thread has hardly woken up.
		EXPECT_FALSE(LooperAccess::IsInUserWait(looper));
		release_sem(looper->mayGoOn);
		Quit(looper);
	}
}


TEST(UserWaitTest, AWaitThatIsOverDoesNotBegin)
{
	WaitingLooper* looper = new WaitingLooper;
	looper->wait.End();
	looper->Run();
	looper->PostMessage(kMsgWait);
	release_sem(looper->mayGoOn);
	// Answered behind the wait.
	BMessage reply;
	EXPECT_EQ(BMessenger(looper).SendMessage(uint32('ping'), &reply), B_OK);
	EXPECT_FALSE(LooperAccess::IsInUserWait(looper));
	Quit(looper);
}
