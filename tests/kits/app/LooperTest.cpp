// SPDX-License-Identifier: MIT
// BLooper: its life, its queue, its handlers.

#include <Looper.h>

#include <atomic>
#include <thread>

#include <gtest/gtest.h>

#include <MessageQueue.h>
#include <Messenger.h>

#include "Recorder.h"


TEST(LooperTest, IsMadeLockedByItsCreatorAndNotRunning)
{
	BLooper* looper = new BLooper("fresh");
	EXPECT_TRUE(looper->IsLocked());
	EXPECT_EQ(looper->CountLocks(), 1);
	EXPECT_EQ(looper->LockingThread(), find_thread(NULL));
	EXPECT_LT(looper->Thread(), 0);
	looper->Quit();
}


TEST(LooperTest, RunGivesUpTheLockAndReturnsTheThread)
{
	RecordingLooper* looper = new RecordingLooper;
	thread_id thread = looper->Run();
	LooperGuard guard(looper);
	EXPECT_GT(thread, 0);
	EXPECT_EQ(looper->Thread(), thread);
	EXPECT_FALSE(looper->IsLocked());
	EXPECT_EQ(BLooper::LooperForThread(thread), looper);
}


TEST(LooperTest, RunASecondTimeFails)
{
	RecordingLooper* looper = new RecordingLooper;
	looper->Run();
	LooperGuard guard(looper);
	EXPECT_LT(looper->Run(), 0);
}


TEST(LooperTest, MessagesAreHandledInTheOrderOfPosting)
{
	RecordingLooper* looper = new RecordingLooper;
	for (uint32 what = 1; what <= 3; what++)
		ASSERT_EQ(looper->PostMessage(what), B_OK);
	looper->Run();
	LooperGuard guard(looper);
	for (uint32 what = 4; what <= 6; what++)
		ASSERT_EQ(looper->PostMessage(what), B_OK);

	ASSERT_TRUE(looper->record.Wait(6));
	EXPECT_EQ(looper->record.Codes(), (std::vector<uint32>{1, 2, 3, 4, 5, 6}));
}


TEST(LooperTest, HandlersRunInTheLoopersThreadWithItLocked)
{
	RecordingLooper* looper = new RecordingLooper;
	std::atomic<thread_id> thread(-1);
	std::atomic<bool> locked(false);
	std::atomic<bool> current(false);
	looper->hook = [&](BMessage* message) {
		thread = find_thread(NULL);
		locked = looper->IsLocked();
		current = looper->CurrentMessage() == message;
	};
	looper->Run();
	LooperGuard guard(looper);
	looper->PostMessage(1);

	ASSERT_TRUE(looper->record.Wait());
	EXPECT_EQ(thread, looper->Thread());
	EXPECT_TRUE(locked);
	EXPECT_TRUE(current);
	EXPECT_EQ(looper->CurrentMessage(), nullptr);
}


TEST(LooperTest, PostCopiesTheMessage)
{
	RecordingLooper* looper = new RecordingLooper;
	std::atomic<int32> value(0);
	looper->hook = [&](BMessage* message) {
		int32 found;
		if (message->FindInt32("value", &found) == B_OK)
			value = found;
	};
	{
		BMessage message(1);
		message.AddInt32("value", 42);
		ASSERT_EQ(looper->PostMessage(&message), B_OK);
		message.ReplaceInt32("value", 7);
	}
	looper->Run();
	LooperGuard guard(looper);
	ASSERT_TRUE(looper->record.Wait());
	EXPECT_EQ(value, 42);
}


TEST(LooperTest, PostWithoutAMessageFails)
{
	BLooper* looper = new BLooper;
	EXPECT_EQ(looper->PostMessage(static_cast<BMessage*>(NULL)), B_BAD_VALUE);
	looper->Quit();
}


TEST(LooperTest, PostToAHandlerOfAnotherLooperFails)
{
	BLooper* looper = new BLooper;
	RecordingHandler stranger;
	EXPECT_EQ(looper->PostMessage(1, &stranger), B_MISMATCHED_VALUES);
	looper->Quit();
}


TEST(LooperTest, PostToTheNullHandlerReachesThePreferredOne)
{
	RecordingLooper* looper = new RecordingLooper;
	RecordingHandler preferred;
	looper->AddHandler(&preferred);
	looper->SetPreferredHandler(&preferred);
	EXPECT_EQ(looper->PreferredHandler(), &preferred);
	looper->PostMessage(1, NULL);
	looper->PostMessage(2);
	looper->Run();

	EXPECT_TRUE(preferred.record.Wait());
	EXPECT_TRUE(looper->record.Wait());
	EXPECT_EQ(preferred.record.Codes(), (std::vector<uint32>{1}));
	EXPECT_EQ(looper->record.Codes(), (std::vector<uint32>{2}));
	QuitLooper(looper);
}


TEST(LooperTest, PostToTheNullHandlerReachesTheLooperWhenNoneIsPreferred)
{
	RecordingLooper* looper = new RecordingLooper;
	looper->PostMessage(1, NULL);
	looper->Run();
	LooperGuard guard(looper);
	EXPECT_TRUE(looper->record.Wait());
}


TEST(LooperTest, AMessageForAHandlerThatIsGoneIsDropped)
{
	RecordingLooper* looper = new RecordingLooper;
	{
		RecordingHandler handler;
		looper->AddHandler(&handler);
		ASSERT_EQ(looper->PostMessage(1, &handler), B_OK);
		looper->RemoveHandler(&handler);
	}
	looper->PostMessage(2);
	looper->Run();
	LooperGuard guard(looper);
	ASSERT_TRUE(looper->record.Wait());
	EXPECT_EQ(looper->record.Codes(), (std::vector<uint32>{2}));
}


TEST(LooperTest, TheLooperIsItsOwnFirstHandler)
{
	BLooper* looper = new BLooper;
	BHandler handler("second");
	looper->AddHandler(&handler);
	EXPECT_EQ(looper->CountHandlers(), 2);
	EXPECT_EQ(looper->HandlerAt(0), looper);
	EXPECT_EQ(looper->HandlerAt(1), &handler);
	EXPECT_EQ(looper->HandlerAt(2), nullptr);
	EXPECT_EQ(looper->IndexOf(&handler), 1);
	EXPECT_EQ(handler.Looper(), looper);
	EXPECT_EQ(handler.NextHandler(), looper);

	EXPECT_TRUE(looper->RemoveHandler(&handler));
	EXPECT_FALSE(looper->RemoveHandler(&handler));
	EXPECT_EQ(handler.Looper(), nullptr);
	EXPECT_EQ(handler.NextHandler(), nullptr);
	looper->Quit();
}


TEST(LooperTest, AHandlerThatIsDeletedLeavesItsLooper)
{
	BLooper* looper = new BLooper;
	BHandler* first = new BHandler;
	BHandler second;
	looper->AddHandler(first);
	looper->AddHandler(&second);
	second.SetNextHandler(first);
	looper->SetPreferredHandler(first);
	delete first;

	EXPECT_EQ(looper->CountHandlers(), 2);
	EXPECT_EQ(looper->PreferredHandler(), nullptr);
	EXPECT_EQ(second.NextHandler(), looper);
	looper->Quit();
}


TEST(LooperTest, HandlersOutliveTheirLooper)
{
	BHandler handler;
	BLooper* looper = new BLooper;
	looper->AddHandler(&handler);
	looper->Quit();
	EXPECT_EQ(handler.Looper(), nullptr);
	EXPECT_FALSE(handler.LockLooper());
	EXPECT_EQ(handler.LockLooperWithTimeout(1000), B_BAD_VALUE);
}


TEST(LooperTest, UnhandledMessagesGoUpTheChainOfHandlers)
{
	RecordingLooper* looper = new RecordingLooper;
	BHandler inner;
	RecordingHandler outer;
	looper->AddHandler(&inner);
	looper->AddHandler(&outer);
	inner.SetNextHandler(&outer);
	looper->PostMessage(1, &inner);
	looper->Run();
	EXPECT_TRUE(outer.record.Wait());
	QuitLooper(looper);
}


TEST(LooperTest, QuitOfALooperThatNeverRanDeletesIt)
{
	Signal gone;
	RecordingLooper* looper = new RecordingLooper;
	looper->gone = &gone;
	looper->Quit();
	EXPECT_EQ(gone.Count(), 1);
}


TEST(LooperTest, QuitFromAnotherThreadHandlesWhatWasQueuedAndReturnsWhenItIsGone)
{
	Signal gone;
	std::atomic<int32> handled(0);
	RecordingLooper* looper = new RecordingLooper;
	looper->gone = &gone;
	looper->quitAnswer = false;
	looper->hook = [&](BMessage*) { handled++; };
	for (int32 i = 0; i < 50; i++)
		looper->PostMessage(1);
	looper->Run();
	ASSERT_TRUE(looper->Lock());
	looper->Quit();
	EXPECT_EQ(gone.Count(), 1);
	EXPECT_EQ(handled, 50);
	EXPECT_FALSE(looper->Lock());
}


TEST(LooperTest, QuitInItsOwnThreadDoesNotReturn)
{
	Signal gone;
	std::atomic<bool> returned(false);
	RecordingLooper* looper = new RecordingLooper;
	looper->gone = &gone;
	looper->hook = [&](BMessage*) {
		looper->Quit();
		returned = true;
	};
	thread_id thread = looper->Run();
	BMessenger(looper).SendMessage(1);
	EXPECT_TRUE(gone.Wait());
	status_t result;
	wait_for_thread(thread, &result);
	EXPECT_FALSE(returned);
}


TEST(LooperTest, QuitRequestedDecidesAboutAQuitRequest)
{
	Signal gone;
	RecordingLooper* looper = new RecordingLooper;
	looper->gone = &gone;
	looper->quitAnswer = false;
	looper->Run();
	BMessenger messenger(looper);

	BMessage reply;
	ASSERT_EQ(messenger.SendMessage(B_QUIT_REQUESTED, &reply), B_OK);
	EXPECT_FALSE(reply.FindBool("result"));
	EXPECT_EQ(reply.FindInt32("thread"), looper->Thread());
	EXPECT_EQ(gone.Count(), 0);

	looper->Lock();
	looper->quitAnswer = true;
	looper->Unlock();
	ASSERT_EQ(messenger.SendMessage(B_QUIT_REQUESTED, &reply), B_OK);
	EXPECT_TRUE(reply.FindBool("result"));
	EXPECT_TRUE(gone.Wait());
}


TEST(LooperTest, AQuitRequestForAHandlerIsAnOrdinaryMessage)
{
	RecordingLooper* looper = new RecordingLooper;
	RecordingHandler handler;
	looper->AddHandler(&handler);
	looper->PostMessage(B_QUIT_REQUESTED, &handler);
	looper->Run();
	EXPECT_TRUE(handler.record.Wait());
	QuitLooper(looper);
}


TEST(LooperTest, LoopRunsInTheCallingThread)
{
	std::thread::id loopThread;
	std::thread::id caller;
	std::thread thread([&] {
		caller = std::this_thread::get_id();
		RecordingLooper* looper = new RecordingLooper;
		looper->hook = [&](BMessage*) { loopThread = std::this_thread::get_id(); };
		looper->PostMessage(1);
		looper->PostMessage(B_QUIT_REQUESTED);
		looper->Loop();
	});
	thread.join();
	EXPECT_EQ(loopThread, caller);
}


TEST(LooperTest, ADetachedMessageIsTheReceiversAndAnsweredLater)
{
	RecordingLooper* looper = new RecordingLooper;
	std::atomic<BMessage*> detached(nullptr);
	looper->hook = [&](BMessage*) { detached = looper->DetachCurrentMessage(); };
	looper->Run();
	LooperGuard guard(looper);

	std::thread answerer([&] {
		ASSERT_TRUE(looper->record.Wait());
		detached.load()->SendReply(7);
		delete detached.load();
	});
	BMessage reply;
	EXPECT_EQ(BMessenger(looper).SendMessage(1, &reply), B_OK);
	EXPECT_EQ(reply.what, 7u);
	answerer.join();
}


TEST(LooperTest, TheMessageQueueShowsWhatWaits)
{
	RecordingLooper* looper = new RecordingLooper;
	EXPECT_FALSE(looper->IsMessageWaiting());
	looper->PostMessage(1);
	looper->PostMessage(2);
	EXPECT_TRUE(looper->IsMessageWaiting());
	EXPECT_EQ(looper->MessageQueue()->CountMessages(), 2);
	EXPECT_NE(looper->MessageQueue()->FindMessage(uint32(2), 0), nullptr);
	looper->Run();
	LooperGuard guard(looper);
	EXPECT_TRUE(looper->record.Wait(2));
}


TEST(LooperTest, LookingAtTheQueueFromAnotherThreadLosesNoMessage)
{
	constexpr int32 kCount = 20000;
	RecordingLooper* looper = new RecordingLooper;
	int32 left = kCount;
	looper->hook = [&](BMessage*) {
		if (--left > 0)
			looper->PostMessage(1);
	};
	looper->Run();
	LooperGuard guard(looper);
	std::atomic<bool> done(false);
	std::thread watcher([&] {
		while (!done)
			looper->MessageQueue();
	});
	looper->PostMessage(1);
	EXPECT_TRUE(looper->record.Wait(kCount));
	done = true;
	watcher.join();
}


class CountedMessage : public BMessage {
public:
	explicit CountedMessage(std::atomic<int32>* deleted)
		: BMessage(1),
		  fDeleted(deleted)
	{
	}
	~CountedMessage() override { (*fDeleted)++; }

private:
	std::atomic<int32>* fDeleted;
};


TEST(LooperTest, EachMessageIsDeletedExactlyOnceHandledOrNot)
{
	std::atomic<int32> deleted(0);
	RecordingLooper* handled = new RecordingLooper;
	for (int32 i = 0; i < 10; i++)
		handled->MessageQueue()->AddMessage(new CountedMessage(&deleted));
	handled->Run();
	ASSERT_TRUE(handled->record.Wait(10));
	QuitLooper(handled);
	EXPECT_EQ(deleted, 10);

	RecordingLooper* neverRun = new RecordingLooper;
	for (int32 i = 0; i < 5; i++)
		neverRun->MessageQueue()->AddMessage(new CountedMessage(&deleted));
	neverRun->Quit();
	EXPECT_EQ(deleted, 15);
}


class PortReader : public BLooper {
public:
	using BLooper::MessageFromPort;
};


TEST(LooperTest, MessageFromPortTakesTheNextMessageOrWaitsForALimitedTime)
{
	PortReader* looper = new PortReader;
	EXPECT_EQ(looper->MessageFromPort(1000), nullptr);
	looper->PostMessage(5);
	BMessage* message = looper->MessageFromPort(kLimit);
	ASSERT_NE(message, nullptr);
	EXPECT_EQ(message->what, 5u);
	delete message;
	looper->Quit();
}
