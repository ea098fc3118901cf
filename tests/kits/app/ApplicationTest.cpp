// SPDX-License-Identifier: MIT
// BApplication: its start, its end, and the order of things.

#include <Application.h>

#include <atomic>
#include <cstdio>
#include <string>
#include <thread>

#include <gtest/gtest.h>

#include <Message.h>
#include <Roster.h>

#include "Recorder.h"
#include "app/LooperPrivate.h"

using BPrivate::LooperAccess;

static const char* const kSignature = "application/x-vnd.plim-app-test";


/// What the program that prints its hooks prints.
static std::string
RunProgram(const std::string& environment, const std::string& arguments)
{
	std::string command = "cd '" PLIM_SOURCE_DIR "' && " + environment
		+ " '" PLIM_BUILD_DIR "/tests/app_kit_program' " + arguments;
	FILE* pipe = popen(command.c_str(), "r");
	std::string output;
	char buffer[256];
	while (fgets(buffer, sizeof(buffer), pipe) != NULL)
		output += buffer;
	EXPECT_EQ(pclose(pipe), 0);
	return output;
}

static const char* const kEnd = "AboutRequested, launching=0\nQuitRequested\ndone\n";


TEST(ApplicationStartTest, WithoutArgumentsOnlyReadyToRunComesOnceAndFirst)
{
	EXPECT_EQ(RunProgram("", ""),
		std::string("constructed, launching=1\nReadyToRun, launching=1\nMessageReceived\n") + kEnd);
}


TEST(ApplicationStartTest, ArgumentsComeBeforeReadyToRun)
{
	EXPECT_EQ(RunProgram("", "one 'two words' ''"),
		std::string("constructed, launching=1\n"
					"ArgvReceived 4 [one] [two words] [] end=1 cwd=1\n"
					"ReadyToRun, launching=1\nMessageReceived\n")
			+ kEnd);
}


TEST(ApplicationStartTest, FilesComeAsReferencesInsteadOfArguments)
{
	EXPECT_EQ(RunProgram("BE_ARGUMENTS_ARE_FILES=1", "README.md no-such-file LICENSE"),
		std::string("constructed, launching=1\nRefsReceived [README.md] [LICENSE]\n"
					"ReadyToRun, launching=1\nMessageReceived\n")
			+ kEnd);
}


TEST(ApplicationTest, IsMadeLockedAndKnown)
{
	{
		status_t error = B_ERROR;
		BApplication application(kSignature, &error);
		EXPECT_EQ(error, B_OK);
		EXPECT_EQ(application.InitCheck(), B_OK);
		EXPECT_EQ(be_app, &application);
		EXPECT_TRUE(be_app_messenger.IsValid());
		EXPECT_TRUE(application.IsLocked());
		EXPECT_STREQ(application.Signature(), kSignature);
		EXPECT_TRUE(application.IsLaunching());
		EXPECT_EQ(application.CountWindows(), 0);
		EXPECT_EQ(application.WindowAt(0), nullptr);
		EXPECT_NE(BApplication::AppResources(), nullptr);
	}
	EXPECT_EQ(be_app, nullptr);
	EXPECT_FALSE(be_app_messenger.IsValid());
}


TEST(ApplicationTest, ABadSignatureIsReported)
{
	for (const char* signature :
		{"", "plain", "application/", "text/plain", "application/a/b", "application/a b"}) {
		status_t error = B_OK;
		testing::internal::CaptureStderr();
		BApplication application(signature, &error);
		EXPECT_NE(testing::internal::GetCapturedStderr(), "") << signature;
		EXPECT_EQ(error, B_BAD_VALUE) << signature;
		EXPECT_EQ(be_app, nullptr) << signature;
	}
	EXPECT_EXIT(BApplication("bad"), testing::ExitedWithCode(1), "bad signature");
}


TEST(ApplicationTest, ASecondOneIsRefusedAndChangesNothing)
{
	BApplication application(kSignature);
	{
		status_t error = B_OK;
		testing::internal::CaptureStderr();
		BApplication second("application/x-vnd.plim-second", &error);
		testing::internal::GetCapturedStderr();
		EXPECT_EQ(error, B_NOT_ALLOWED);
		EXPECT_LT(second.Run(), 0);
	}
	EXPECT_EQ(be_app, &application);
	EXPECT_TRUE(be_app_messenger.IsValid());
	EXPECT_TRUE(be_roster->IsRunning(kSignature));
}


/// Runs a function once it is ready, and then keeps a record of what it gets.
class TestApplication : public BApplication {
public:
	TestApplication()
		: BApplication(kSignature)
	{
	}

	void ReadyToRun() override
	{
		if (ready)
			ready();
	}
	void MessageReceived(BMessage* message) override
	{
		record.Add(message->what);
		BApplication::MessageReceived(message);
	}
	void Pulse() override
	{
		if (++pulses == 2)
			PostMessage(B_QUIT_REQUESTED);
	}
	void AppActivated(bool active) override { activations += active ? 'A' : 'i'; }

	std::function<void()> ready;
	Record record;
	std::atomic<int32> pulses{0};
	std::string activations;
};


TEST(ApplicationTest, RunReturnsInTheSameThreadAfterQuit)
{
	TestApplication application;
	thread_id loopThread = -1;
	application.ready = [&] {
		loopThread = find_thread(NULL);
		application.Quit();
		application.PostMessage('late');
	};
	application.Run();
	EXPECT_EQ(loopThread, find_thread(NULL));
	EXPECT_TRUE(application.record.Codes().empty());
}


TEST(ApplicationTest, QuitFromAnotherThreadEndsTheLoop)
{
	TestApplication application;
	std::thread quitter;
	application.ready = [&] {
		quitter = std::thread([&] {
			application.Lock();
			application.Quit();
			application.Unlock();
		});
	};
	application.Run();
	quitter.join();
	EXPECT_FALSE(application.IsLaunching());
}


TEST(ApplicationTest, PulseComesAtItsRate)
{
	TestApplication application;
	bigtime_t start = system_time();
	application.SetPulseRate(100000);
	application.Run();
	EXPECT_EQ(application.pulses, 2);
	EXPECT_GE(system_time() - start, 200000);
}


TEST(ApplicationTest, ActivationCallsItsHookAndTellsTheRoster)
{
	TestApplication application;
	app_info info;
	EXPECT_EQ(be_roster->GetActiveAppInfo(&info), B_ERROR);
	BMessage activated(B_APP_ACTIVATED);
	activated.AddBool("active", true);
	application.PostMessage(&activated);
	activated.ReplaceBool("active", false);
	application.PostMessage(&activated);
	activated.RemoveName("active");
	application.PostMessage(&activated);
	application.PostMessage(B_QUIT_REQUESTED);
	application.Run();
	EXPECT_EQ(application.activations, "Ai");
	EXPECT_TRUE(application.record.Codes().empty());
}


TEST(ApplicationTest, RepliesWithoutANamedHandlerGoToIt)
{
	TestApplication application;
	RecordingLooper* looper = new RecordingLooper;
	looper->hook = [](BMessage* message) { message->SendReply('answ'); };
	looper->Run();
	BMessenger(looper).SendMessage('ques');
	ASSERT_TRUE(looper->record.Wait());
	application.PostMessage(B_QUIT_REQUESTED);
	application.Run();
	EXPECT_EQ(application.record.Codes(), (std::vector<uint32>{'answ'}));
	QuitLooper(looper);
}


/// A looper that the application takes for a window.
class FakeWindow : public RecordingLooper {
public:
	FakeWindow(BPrivate::looper_kind kind, bool answer, Signal* gone)
	{
		LooperAccess::SetKind(this, kind);
		quitAnswer = answer;
		this->gone = gone;
		Run();
	}

	bool QuitRequested() override
	{
		asked++;
		if (atQuestion)
			atQuestion();
		return quitAnswer;
	}

	static std::atomic<int32> asked;
	std::function<void()> atQuestion;
};

std::atomic<int32> FakeWindow::asked(0);


TEST(ApplicationQuitTest, AWindowThatRefusesKeepsTheApplicationAndTheWindowsAfterIt)
{
	FakeWindow::asked = 0;
	TestApplication application;
	Signal first;
	Signal second;
	Signal third;
	new FakeWindow(BPrivate::kWindowLooper, true, &first);
	FakeWindow* refusing = new FakeWindow(BPrivate::kWindowLooper, false, &second);
	FakeWindow* last = new FakeWindow(BPrivate::kWindowLooper, true, &third);
	EXPECT_EQ(application.CountWindows(), 3);
	EXPECT_FALSE(application.QuitRequested());
	EXPECT_EQ(FakeWindow::asked, 2);
	EXPECT_EQ(first.Count(), 1);
	EXPECT_EQ(second.Count(), 0);
	EXPECT_EQ(third.Count(), 0);
	EXPECT_TRUE(application.IsLocked());
	EXPECT_EQ(application.CountWindows(), 2);

	EXPECT_TRUE(refusing->Lock());
	refusing->Unlock();
	refusing->Lock();
	refusing->quitAnswer = true;
	refusing->Unlock();
	EXPECT_TRUE(application.QuitRequested());
	EXPECT_EQ(application.CountWindows(), 0);
	EXPECT_FALSE(last->Lock());
}


TEST(ApplicationQuitTest, FilePanelsAreAskedLastAndClosedInAnyCase)
{
	TestApplication application;
	Signal panel;
	Signal window;
	new FakeWindow(BPrivate::kFilePanelWindowLooper, false, &panel);
	FakeWindow* other = new FakeWindow(BPrivate::kWindowLooper, false, &window);
	EXPECT_FALSE(application.QuitRequested());
	EXPECT_EQ(panel.Count(), 0);
	other->Lock();
	other->quitAnswer = true;
	other->Unlock();
	EXPECT_TRUE(application.QuitRequested());
	EXPECT_EQ(panel.Count(), 1);
	EXPECT_EQ(window.Count(), 1);
}


TEST(ApplicationQuitTest, AWindowThatIsAskedMayLockTheApplication)
{
	TestApplication application;
	application.Lock();
	Signal gone;
	std::atomic<bool> locked(false);
	FakeWindow* window = new FakeWindow(BPrivate::kWindowLooper, true, &gone);
	window->atQuestion = [&] {
		// From a third thread, as the window's own work would be.
		std::thread([&] {
			locked = application.LockWithTimeout(kLimit) == B_OK;
			application.Unlock();
		}).join();
	};
	EXPECT_TRUE(application.QuitRequested());
	EXPECT_TRUE(locked);
	EXPECT_EQ(application.CountLocks(), 2);
	application.Unlock();
}


TEST(ApplicationQuitTest, TheDestructorQuitsWindowsAndRegisteredLoopersWithoutAsking)
{
	FakeWindow::asked = 0;
	Signal window;
	Signal menu;
	Signal registered;
	{
		TestApplication application;
		new FakeWindow(BPrivate::kWindowLooper, false, &window);
		new FakeWindow(BPrivate::kMenuWindowLooper, false, &menu);
		EXPECT_EQ(application.CountWindows(), 1);
		RecordingLooper* looper = new RecordingLooper;
		looper->gone = &registered;
		looper->Run();
		EXPECT_EQ(application.RegisterLooper(looper), B_OK);
		EXPECT_EQ(application.RegisterLooper(looper), B_ERROR);
		EXPECT_EQ(application.RegisterLooper(NULL), B_BAD_VALUE);
	}
	EXPECT_EQ(window.Count(), 1);
	EXPECT_EQ(menu.Count(), 1);
	EXPECT_EQ(registered.Count(), 1);
	EXPECT_EQ(FakeWindow::asked, 0);
}


TEST(ApplicationQuitTest, AQuitRequestThatIsRefusedLeavesTheLoopRunning)
{
	TestApplication application;
	Signal gone;
	FakeWindow* window = new FakeWindow(BPrivate::kWindowLooper, false, &gone);
	std::thread asker;
	std::atomic<bool> first(true);
	std::atomic<bool> second(false);
	application.ready = [&] {
		asker = std::thread([&] {
			BMessage reply;
			be_app_messenger.SendMessage(B_QUIT_REQUESTED, &reply);
			first = reply.FindBool("result");
			window->Lock();
			window->quitAnswer = true;
			window->Unlock();
			be_app_messenger.SendMessage(B_QUIT_REQUESTED, &reply);
			second = reply.FindBool("result");
		});
	};
	application.Run();
	asker.join();
	EXPECT_FALSE(first);
	EXPECT_TRUE(second);
	EXPECT_EQ(gone.Count(), 1);
}


TEST(ApplicationTest, DeletingItWaitsForTheThreadsOfLoopersThatQuitThemselves)
{
	static std::atomic<bool> sIsGone;
	sIsGone = false;
	struct SlowCleanup {
		~SlowCleanup()
		{
			snooze(200'000);
			sIsGone = true;
		}
	};
	class CleaningLooper : public BLooper {
	public:
		void MessageReceived(BMessage*) override
		{
			static thread_local SlowCleanup sCleanup;
			(void)&sCleanup;
			PostMessage(B_QUIT_REQUESTED);
		}
	};

	auto application = new BApplication(kSignature);
	auto looper = new CleaningLooper;
	BMessenger messenger(looper);
	looper->Run();
	looper->PostMessage('clen');
	while (messenger.IsValid())
		snooze(1000);
	delete application;
	EXPECT_TRUE(sIsGone);
}
