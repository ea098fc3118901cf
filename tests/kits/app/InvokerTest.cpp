// SPDX-License-Identifier: MIT
// BInvoker: its message, its target, what it sends.

#include <Invoker.h>

#include <gtest/gtest.h>

#include <Handler.h>
#include <Message.h>

#include "Recorder.h"


class InvokingHandler : public BHandler, public BInvoker {
public:
	status_t Invoke(BMessage* message = NULL) override
	{
		kind = InvokeKind(&notify);
		return BInvoker::Invoke(message);
	}

	uint32 kind = 0;
	bool notify = false;
};


/// Keeps a copy of the last message that its handler got.
class InvokerTest : public testing::Test {
protected:
	InvokerTest()
	{
		looper->AddHandler(&target);
		target.hook = [this](BMessage* message) { received = *message; };
	}

	void Deliver()
	{
		looper->Run();
		QuitLooper(looper);
	}

	RecordingLooper* looper = new RecordingLooper;
	RecordingHandler target;
	BMessage received;
};


TEST_F(InvokerTest, WithoutAMessageNothingIsSent)
{
	BInvoker invoker;
	EXPECT_EQ(invoker.Message(), nullptr);
	EXPECT_EQ(invoker.Command(), 0u);
	EXPECT_EQ(invoker.SetTarget(&target), B_OK);
	EXPECT_EQ(invoker.Invoke(), B_BAD_VALUE);
	Deliver();
	EXPECT_TRUE(target.record.Codes().empty());
}


TEST_F(InvokerTest, SendsACopyWithItsFieldsAdded)
{
	BMessage* message = new BMessage('invk');
	message->AddInt32("own", 3);
	BInvoker invoker(message, &target);
	bigtime_t before = system_time();
	EXPECT_EQ(invoker.Command(), uint32('invk'));
	EXPECT_EQ(invoker.Invoke(), B_OK);
	Deliver();

	EXPECT_EQ(received.what, uint32('invk'));
	EXPECT_EQ(received.FindInt32("own"), 3);
	EXPECT_GE(received.FindInt64("when"), before);
	void* source;
	ASSERT_EQ(received.FindPointer("source", &source), B_OK);
	EXPECT_EQ(source, &invoker);
	EXPECT_FALSE(received.HasMessenger("be:sender"));
	EXPECT_EQ(message->CountNames(B_ANY_TYPE), 1);
}


TEST_F(InvokerTest, AHandlerNamesItselfAsTheSender)
{
	InvokingHandler invoker;
	looper->AddHandler(&invoker);
	BMessage other('othr');
	EXPECT_EQ(invoker.SetTarget(&target), B_OK);
	EXPECT_EQ(invoker.Invoke(&other), B_OK);
	BMessenger self(&invoker);
	Deliver();
	BMessenger sender;
	ASSERT_EQ(received.FindMessenger("be:sender", &sender), B_OK);
	EXPECT_TRUE(sender == self);
}


TEST_F(InvokerTest, ATargetOutsideOfALooperIsRefused)
{
	BHandler outside;
	BInvoker invoker(new BMessage(1), &target);
	EXPECT_EQ(invoker.SetTarget(&outside), B_MISMATCHED_VALUES);
	EXPECT_FALSE(invoker.Messenger().IsValid());
	EXPECT_FALSE(invoker.IsTargetLocal());
	EXPECT_EQ(invoker.Target(), nullptr);
	EXPECT_EQ(invoker.Invoke(), B_BAD_PORT_ID);
	looper->Quit();
}


TEST_F(InvokerTest, TellsItsTarget)
{
	BInvoker invoker;
	BLooper* found;
	EXPECT_EQ(invoker.SetTarget(&target, looper), B_OK);
	EXPECT_EQ(invoker.Target(&found), &target);
	EXPECT_EQ(found, looper);
	EXPECT_TRUE(invoker.IsTargetLocal());
	EXPECT_EQ(invoker.SetTarget(NULL, looper), B_OK);
	EXPECT_EQ(invoker.Target(&found), nullptr);
	EXPECT_EQ(found, looper);
	EXPECT_EQ(invoker.SetTarget(BMessenger(looper)), B_OK);
	EXPECT_EQ(invoker.Target(), looper);
	looper->Quit();
}


TEST_F(InvokerTest, SetMessageDeletesTheOldOne)
{
	BInvoker invoker(new BMessage(1), &target);
	EXPECT_EQ(invoker.SetMessage(new BMessage(2)), B_OK);
	EXPECT_EQ(invoker.Command(), 2u);
	EXPECT_EQ(invoker.SetMessage(invoker.Message()), B_OK);
	EXPECT_EQ(invoker.Command(), 2u);
	EXPECT_EQ(invoker.SetMessage(NULL), B_OK);
	EXPECT_EQ(invoker.Message(), nullptr);
	looper->Quit();
}


TEST_F(InvokerTest, NotifiesObserversEvenWithoutAMessage)
{
	InvokingHandler invoker;
	looper->AddHandler(&invoker);
	invoker.SetTarget(looper);
	bool sent = false;
	looper->hook = [&](BMessage*) { sent = true; };
	invoker.StartWatching(&target, B_CONTROL_MODIFIED);
	EXPECT_EQ(invoker.InvokeNotify(NULL, B_CONTROL_MODIFIED), B_BAD_VALUE);
	EXPECT_EQ(invoker.kind, uint32(B_CONTROL_MODIFIED));
	EXPECT_TRUE(invoker.notify);

	EXPECT_EQ(invoker.Invoke(), B_BAD_VALUE);
	EXPECT_EQ(invoker.kind, uint32(B_CONTROL_INVOKED));
	EXPECT_FALSE(invoker.notify);
	Deliver();
	EXPECT_EQ(target.record.Codes(), (std::vector<uint32>{B_OBSERVER_NOTICE_CHANGE}));
	EXPECT_EQ(received.FindInt32(B_OBSERVE_WHAT_CHANGE), int32(B_CONTROL_MODIFIED));
	EXPECT_FALSE(sent);
}


TEST_F(InvokerTest, RepliesGoToTheHandlerNamedForThem)
{
	BInvoker invoker(new BMessage(1), looper);
	invoker.SetHandlerForReply(&target);
	EXPECT_EQ(invoker.HandlerForReply(), &target);
	looper->hook = [](BMessage* message) { message->SendReply(5); };
	EXPECT_EQ(invoker.SetTimeout(1000), B_OK);
	EXPECT_EQ(invoker.Timeout(), 1000);
	EXPECT_EQ(invoker.Invoke(), B_OK);
	looper->Run();
	EXPECT_TRUE(target.record.Wait());
	EXPECT_EQ(target.record.Codes(), (std::vector<uint32>{5}));
	QuitLooper(looper);
}
