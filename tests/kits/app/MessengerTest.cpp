// SPDX-License-Identifier: MIT
// BMessenger: targets, and synchronous and asynchronous sending.

#include <Messenger.h>

#include <atomic>
#include <thread>

#include <gtest/gtest.h>

#include <Application.h>

#include "Recorder.h"


TEST(MessengerTest, ADefaultOneIsInvalidAndHarmless)
{
	BMessenger messenger;
	BMessage reply;
	BLooper* looper = reinterpret_cast<BLooper*>(1);
	EXPECT_FALSE(messenger.IsValid());
	EXPECT_FALSE(messenger.IsTargetLocal());
	EXPECT_EQ(messenger.Target(&looper), nullptr);
	EXPECT_EQ(looper, nullptr);
	EXPECT_EQ(messenger.SendMessage(1), B_BAD_PORT_ID);
	EXPECT_EQ(messenger.SendMessage(1, &reply), B_BAD_PORT_ID);
	EXPECT_FALSE(messenger.LockTarget());
	EXPECT_TRUE(messenger == BMessenger());
}


TEST(MessengerTest, TargetsAHandlerOfALooper)
{
	BLooper* looper = new BLooper;
	BHandler handler;
	looper->AddHandler(&handler);
	status_t result;
	BMessenger messenger(&handler, NULL, &result);
	EXPECT_EQ(result, B_OK);
	EXPECT_TRUE(messenger.IsValid());
	EXPECT_TRUE(messenger.IsTargetLocal());
	BLooper* found;
	EXPECT_EQ(messenger.Target(&found), &handler);
	EXPECT_EQ(found, looper);
	EXPECT_TRUE(messenger == BMessenger(&handler, looper));
	EXPECT_FALSE(messenger == BMessenger(looper));

	looper->RemoveHandler(&handler);
	EXPECT_EQ(messenger.Target(&found), nullptr);
	looper->Quit();
	EXPECT_FALSE(messenger.IsValid());
	EXPECT_EQ(messenger.SendMessage(1), B_BAD_PORT_ID);
}


TEST(MessengerTest, AHandlerOutsideOfTheLooperIsAMismatch)
{
	BLooper* one = new BLooper;
	BLooper* two = new BLooper;
	BHandler handler;
	status_t result;
	EXPECT_FALSE(BMessenger(&handler, NULL, &result).IsValid());
	EXPECT_EQ(result, B_MISMATCHED_VALUES);
	one->AddHandler(&handler);
	EXPECT_FALSE(BMessenger(&handler, two, &result).IsValid());
	EXPECT_EQ(result, B_MISMATCHED_VALUES);
	EXPECT_FALSE(BMessenger(static_cast<BHandler*>(NULL), NULL, &result).IsValid());
	EXPECT_EQ(result, B_BAD_VALUE);
	one->Quit();
	two->Quit();
}


TEST(MessengerTest, ALooperWithoutAHandlerMeansItsPreferredOneAtTheTimeOfDispatch)
{
	RecordingLooper* looper = new RecordingLooper;
	BMessenger messenger(NULL, looper);
	RecordingHandler preferred;
	looper->AddHandler(&preferred);
	messenger.SendMessage(1);
	looper->SetPreferredHandler(&preferred);
	looper->Run();
	EXPECT_TRUE(preferred.record.Wait());
	QuitLooper(looper);
}


TEST(MessengerTest, AnotherProgramsSignatureCannotBeReached)
{
	status_t result = B_OK;
	EXPECT_FALSE(BMessenger("application/x-vnd.plim-not-running", -1, &result).IsValid());
	EXPECT_EQ(result, B_ERROR);
	EXPECT_FALSE(BMessenger(NULL, -1, &result).IsValid());
	EXPECT_EQ(result, B_BAD_VALUE);
	EXPECT_FALSE(BMessenger(NULL, 1, &result).IsValid());
	EXPECT_EQ(result, B_BAD_TEAM_ID);
}


TEST(MessengerTest, ASynchronousMessageBringsTheReply)
{
	RecordingLooper* looper = new RecordingLooper;
	std::atomic<bool> waiting(false);
	looper->hook = [&](BMessage* message) {
		waiting = message->IsSourceWaiting();
		BMessage reply(99);
		reply.AddString("answer", "yes");
		EXPECT_EQ(message->SendReply(&reply), B_OK);
		EXPECT_EQ(message->SendReply(&reply), B_DUPLICATE_REPLY);
	};
	looper->Run();
	LooperGuard guard(looper);
	BMessage question(1);
	BMessage reply;
	ASSERT_EQ(BMessenger(looper).SendMessage(&question, &reply), B_OK);
	EXPECT_EQ(reply.what, 99u);
	EXPECT_STREQ(reply.FindString("answer"), "yes");
	EXPECT_TRUE(reply.IsReply());
	EXPECT_TRUE(waiting);
}


TEST(MessengerTest, AMessageThatIsNotAnsweredBringsNoReply)
{
	RecordingLooper* looper = new RecordingLooper;
	looper->Run();
	LooperGuard guard(looper);
	BMessage reply;
	EXPECT_EQ(BMessenger(looper).SendMessage(1, &reply), B_OK);
	EXPECT_EQ(reply.what, uint32(B_NO_REPLY));
}


TEST(MessengerTest, AScriptingMessageThatNobodyKnowsIsNotUnderstood)
{
	BLooper* looper = new BLooper;
	looper->Run();
	LooperGuard guard(looper);
	BMessage question(B_GET_PROPERTY);
	question.AddSpecifier("Colour of the sky");
	BMessage reply;
	testing::internal::CaptureStdout();
	EXPECT_EQ(BMessenger(looper).SendMessage(&question, &reply), B_OK);
	EXPECT_NE(testing::internal::GetCapturedStdout().find("BMessage('PGET')"), std::string::npos);
	EXPECT_EQ(reply.what, uint32(B_MESSAGE_NOT_UNDERSTOOD));
	int32 error;
	EXPECT_EQ(reply.FindInt32("error", &error), B_OK);
	EXPECT_EQ(error, B_BAD_SCRIPT_SYNTAX);
	EXPECT_TRUE(reply.HasString("message"));
}


TEST(MessengerTest, TheWaitForAReplyEndsAfterItsTimeout)
{
	RecordingLooper* looper = new RecordingLooper;
	Signal release;
	std::atomic<status_t> lateReply(B_OK);
	looper->hook = [&](BMessage* message) {
		release.Wait();
		lateReply = message->SendReply(5);
	};
	looper->Run();
	BMessage question(1);
	BMessage reply(77);
	BMessenger messenger(looper);
	EXPECT_EQ(messenger.SendMessage(&question, &reply, B_INFINITE_TIMEOUT, 20000), B_TIMED_OUT);
	EXPECT_EQ(messenger.SendMessage(&question, &reply, B_INFINITE_TIMEOUT, 0), B_WOULD_BLOCK);
	EXPECT_EQ(reply.what, 77u);
	release.Raise();
	EXPECT_TRUE(looper->record.Wait(2));
	QuitLooper(looper);
	EXPECT_EQ(lateReply, B_BAD_PORT_ID);
}


TEST(MessengerTest, AReceiverThatQuitsReleasesTheSenders)
{
	RecordingLooper* looper = new RecordingLooper;
	BMessenger messenger(looper);
	Signal busy;
	looper->hook = [&](BMessage*) {
		busy.Raise();
		while (!looper->IsMessageWaiting())
			snooze(500);
		looper->Quit();
	};
	looper->Run();

	BMessage answered(1);
	BMessage queued(1);
	std::thread first([&] { EXPECT_EQ(messenger.SendMessage(1, &answered), B_OK); });
	ASSERT_TRUE(busy.Wait());
	EXPECT_EQ(messenger.SendMessage(2, &queued), B_OK);
	first.join();
	EXPECT_EQ(answered.what, uint32(B_NO_REPLY));
	EXPECT_EQ(queued.what, uint32(B_NO_REPLY));
}


TEST(MessengerTest, AnAsynchronousReplyGoesToTheHandlerThatWasNamed)
{
	RecordingLooper* server = new RecordingLooper;
	RecordingLooper* client = new RecordingLooper;
	std::atomic<uint32> previous(0);
	server->hook = [&](BMessage* message) {
		EXPECT_FALSE(message->IsSourceWaiting());
		message->SendReply(2);
	};
	client->hook = [&](BMessage* message) {
		if (message->IsReply() && message->Previous() != NULL)
			previous = message->Previous()->what;
	};
	server->Run();
	client->Run();
	EXPECT_EQ(BMessenger(server).SendMessage(1, client), B_OK);
	EXPECT_TRUE(client->record.Wait());
	EXPECT_EQ(previous, 1u);
	QuitLooper(server);
	QuitLooper(client);
}


TEST(MessengerTest, AReplyAfterTheSenderHasGoneFails)
{
	RecordingLooper* server = new RecordingLooper;
	RecordingLooper* client = new RecordingLooper;
	Signal clientGone;
	std::atomic<status_t> status(B_OK);
	server->hook = [&](BMessage* message) {
		clientGone.Wait();
		status = message->SendReply(2);
	};
	server->Run();
	client->Run();
	BMessenger(server).SendMessage(1, client);
	QuitLooper(client);
	clientGone.Raise();
	EXPECT_TRUE(server->record.Wait());
	EXPECT_EQ(status, B_BAD_PORT_ID);
	QuitLooper(server);
}


TEST(MessengerTest, ASynchronousReplyCanBeAnsweredInTurn)
{
	RecordingLooper* looper = new RecordingLooper;
	std::atomic<uint32> second(0);
	looper->hook = [&](BMessage* message) {
		BMessage reply(2);
		BMessage answer;
		if (message->SendReply(&reply, &answer) == B_OK)
			second = answer.what;
	};
	looper->Run();
	BMessage reply;
	ASSERT_EQ(BMessenger(looper).SendMessage(1, &reply), B_OK);
	EXPECT_EQ(reply.what, 2u);
	EXPECT_TRUE(reply.IsSourceWaiting());
	EXPECT_EQ(reply.SendReply(3), B_OK);
	EXPECT_TRUE(looper->record.Wait());
	EXPECT_EQ(second, 3u);
	QuitLooper(looper);
}


TEST(MessengerTest, AMessengerKeptInAMessageStillReachesItsTarget)
{
	RecordingLooper* looper = new RecordingLooper;
	BMessage message;
	message.AddMessenger("target", BMessenger(looper));
	looper->Run();
	LooperGuard guard(looper);
	BMessenger found;
	ASSERT_EQ(message.FindMessenger("target", &found), B_OK);
	EXPECT_EQ(found.SendMessage(1), B_OK);
	EXPECT_TRUE(looper->record.Wait());
}


/// Posts in its destructor, which runs after main().
class LatePoster {
public:
	~LatePoster()
	{
		messenger.SendMessage(1);
		if (messenger.LockTarget())
			_exit(3);
		be_app_messenger.SendMessage(2);
		BMessage reply;
		messenger.SendMessage(3, &reply);
	}

	BMessenger messenger;
};


TEST(MessengerTest, SendingFromStaticDestructorsIsHarmless)
{
	testing::FLAGS_gtest_death_test_style = "threadsafe";
	EXPECT_EXIT(
		{
			static LatePoster poster;
			BLooper* looper = new BLooper;
			poster.messenger = BMessenger(looper);
			looper->Run();
			QuitLooper(looper);
			exit(0);
		},
		testing::ExitedWithCode(0), "");
}


// Made before main().
static BHandler sStaticHandler("static");
static BLooper* sStaticLooper = [] {
	BLooper* looper = new BLooper("static");
	looper->AddHandler(&sStaticHandler);
	return looper;
}();
static BMessenger sStaticMessenger(&sStaticHandler);


TEST(MessengerTest, ObjectsMadeBeforeMainWork)
{
	EXPECT_TRUE(sStaticMessenger.IsValid());
	EXPECT_EQ(sStaticMessenger.Target(NULL), &sStaticHandler);
	EXPECT_EQ(sStaticLooper->PostMessage(1, &sStaticHandler), B_OK);
}
