// SPDX-License-Identifier: MIT
// The lock checker: what it reports, and what it lets pass.

#include "app/LockChecker.h"

#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <string>

#include <unistd.h>

#include <gtest/gtest.h>

#include <Messenger.h>

#include "Recorder.h"
#include "app/LooperPrivate.h"

using BPrivate::LooperAccess;

/// Two running loopers of window kind and a plain one, with the checker on.
class LockCheckerTest : public testing::Test {
protected:
	LockCheckerTest()
	{
		testing::internal::CaptureStderr();
		before = be_count_lock_violations();
		LooperAccess::SetKind(one, BPrivate::kWindowLooper);
		LooperAccess::SetKind(two, BPrivate::kWindowLooper);
	}
	~LockCheckerTest() override
	{
		for (BLooper* looper : {one, two, plain})
			QuitLooper(looper);
	}

	void RunAll()
	{
		for (BLooper* looper : {one, two, plain})
			looper->Run();
	}

	int32 Violations() { return be_count_lock_violations() - before; }
	std::string Output() { return testing::internal::GetCapturedStderr(); }

	RecordingLooper* one = new RecordingLooper("One");
	RecordingLooper* two = new RecordingLooper("Two");
	RecordingLooper* plain = new RecordingLooper("Plain");
	int32 before;
};


TEST_F(LockCheckerTest, ReportsAThreadWithTwoWindowLocks)
{
	RunAll();
	one->Lock();
	two->Lock();
	EXPECT_EQ(Violations(), 1);
	two->Unlock();
	one->Unlock();
	std::string output = Output();
	EXPECT_NE(output.find("takes the lock of window \"Two\" while it holds that of window \"One\""),
		std::string::npos)
		<< output;
	// The stack trace names this library or program.
	EXPECT_NE(output.find("("), std::string::npos);
}


TEST_F(LockCheckerTest, LetsAnOpenMenuBeLockedLast)
{
	LooperAccess::SetKind(two, BPrivate::kMenuWindowLooper);
	RunAll();
	one->Lock();
	two->Lock();
	EXPECT_EQ(Violations(), 0);
	two->Unlock();
	one->Unlock();
	EXPECT_EQ(Output(), "");
}


TEST_F(LockCheckerTest, LetsOneLockAfterAnotherAndPlainLoopersPass)
{
	RunAll();
	one->Lock();
	one->Lock();
	plain->Lock();
	plain->Unlock();
	one->Unlock();
	one->Unlock();
	two->Lock();
	two->Unlock();
	EXPECT_EQ(Violations(), 0);
	EXPECT_EQ(Output(), "");
}


TEST_F(LockCheckerTest, LetsAWindowThatDoesNotRunYetPass)
{
	// Both are locked by this thread, which made them.
	EXPECT_EQ(Violations(), 0);
	one->Run();
	EXPECT_EQ(Violations(), 0);
	two->Run();
	plain->Run();
	EXPECT_EQ(Output(), "");
}


TEST_F(LockCheckerTest, ReportsAWaitForAReplyWithAnotherLoopersLock)
{
	RunAll();
	BMessage reply;
	plain->Lock();
	EXPECT_EQ(BMessenger(one).SendMessage(1, &reply), B_OK);
	plain->Unlock();
	EXPECT_EQ(Violations(), 1);
	EXPECT_NE(
		Output().find("waits for a reply while it holds the lock of \"Plain\""), std::string::npos);
}


TEST_F(LockCheckerTest, LetsALoopersOwnThreadWait)
{
	one->hook = [this](BMessage*) {
		BMessage reply;
		BMessenger(two).SendMessage(1, &reply);
		BPrivate::CheckWait("an alert");
	};
	RunAll();
	one->PostMessage(1);
	EXPECT_TRUE(one->record.Wait());
	EXPECT_EQ(Violations(), 0);
	EXPECT_EQ(Output(), "");
}


TEST_F(LockCheckerTest, ReportsOtherWaitsByTheirName)
{
	RunAll();
	two->Lock();
	BPrivate::CheckWait("an alert");
	two->Unlock();
	EXPECT_EQ(Violations(), 1);
	EXPECT_NE(
		Output().find("waits for an alert while it holds the lock of \"Two\""), std::string::npos);
}


TEST_F(LockCheckerTest, LocksThatAreGivenUpDoNotCount)
{
	RunAll();
	one->Lock();
	one->Lock();
	int32 levels = LooperAccess::UnlockFully(one);
	EXPECT_EQ(levels, 2);
	EXPECT_FALSE(one->IsLocked());
	two->Lock();
	two->Unlock();
	EXPECT_EQ(LooperAccess::LockAgain(one, levels), B_OK);
	EXPECT_EQ(one->CountLocks(), 2);
	one->Unlock();
	one->Unlock();
	EXPECT_EQ(Violations(), 0);
	EXPECT_EQ(Output(), "");
}


/// Sets the checker's variable for the processes that a death test starts.
class CheckerSetting {
public:
	explicit CheckerSetting(const char* value)
		: fBefore(getenv(kVariable) != NULL ? getenv(kVariable) : "")
	{
		testing::FLAGS_gtest_death_test_style = "threadsafe";
		setenv(kVariable, value, 1);
	}
	~CheckerSetting() { setenv(kVariable, fBefore.c_str(), 1); }

private:
	static constexpr const char* kVariable = "BE_CHECK_LOCKS";
	std::string fBefore;
};


static void
WaitWithALockHeld()
{
	RecordingLooper* looper = new RecordingLooper("Held");
	looper->Run();
	looper->Lock();
	BPrivate::CheckWait("nothing");
}


TEST(LockCheckerSettingTest, AbortEndsTheProgramAtTheFirstViolation)
{
	CheckerSetting setting("abort");
	EXPECT_EXIT(WaitWithALockHeld(), testing::KilledBySignal(SIGABRT),
		"waits for nothing while it holds the lock of \"Held\"");
}


TEST(LockCheckerSettingTest, ZeroTurnsItOff)
{
	CheckerSetting setting("0");
	EXPECT_EXIT(
		{
			WaitWithALockHeld();
			fprintf(stderr, "%d violations", int(be_count_lock_violations()));
			_exit(0);
		},
		testing::ExitedWithCode(0), "^0 violations");
}
