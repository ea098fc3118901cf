// SPDX-License-Identifier: MIT
// Delivery and replies as the message tells and does them, and its specifiers.

#include <memory>

#include <Errors.h>
#include <Message.h>
#include <Messenger.h>
#include <Point.h>
#include <gtest/gtest.h>

#include "app/MessagePrivate.h"
#include "kits/app/Recorder.h"

namespace {

/// Sends a message to a looper, waits, and gives the code of the reply. \a receive runs in the looper.
uint32
SendAndWait(std::function<void(BMessage*)> receive)
{
	RecordingLooper* looper = new RecordingLooper();
	looper->hook = std::move(receive);
	looper->Run();
	LooperGuard guard(looper);
	BMessage question('ques');
	BMessage reply;
	EXPECT_EQ(BMessenger(NULL, looper).SendMessage(&question, &reply, kLimit, kLimit), B_OK);
	return reply.what;
}

} // namespace


TEST(MessageReplyTest, MessageThatWasNeverDeliveredHasNobodyToAnswer)
{
	BMessage message('ques');
	BMessage reply('repl');
	BMessage answer;
	EXPECT_FALSE(message.WasDelivered());
	EXPECT_FALSE(message.IsSourceWaiting());
	EXPECT_FALSE(message.IsSourceRemote());
	EXPECT_FALSE(message.IsReply());
	EXPECT_FALSE(message.ReturnAddress().IsValid());
	EXPECT_EQ(message.Previous(), nullptr);
	EXPECT_EQ(message.SendReply('repl'), B_BAD_REPLY);
	EXPECT_EQ(message.SendReply(&reply), B_BAD_REPLY);
	EXPECT_EQ(message.SendReply(&reply, BMessenger()), B_BAD_REPLY);
	EXPECT_EQ(message.SendReply('repl', &answer), B_BAD_REPLY);
	EXPECT_EQ(message.SendReply(&reply, &answer), B_BAD_REPLY);
	EXPECT_EQ(message.SendReply(static_cast<BMessage*>(nullptr)), B_BAD_VALUE);
	EXPECT_EQ(message.SendReply(&reply, static_cast<BMessage*>(nullptr)), B_BAD_VALUE);
}


TEST(MessageReplyTest, WaitingSenderTakesTheFirstReplyOnly)
{
	const uint32 what = SendAndWait([](BMessage* message) {
		EXPECT_TRUE(message->WasDelivered());
		EXPECT_TRUE(message->IsSourceWaiting());
		EXPECT_FALSE(message->IsSourceRemote());
		EXPECT_EQ(message->SendReply('one '), B_OK);
		EXPECT_FALSE(message->IsSourceWaiting());
		EXPECT_EQ(message->SendReply('two '), B_DUPLICATE_REPLY);
	});
	EXPECT_EQ(what, uint32('one '));
}


TEST(MessageReplyTest, ReplyCannotBeSentThroughACopy)
{
	const uint32 what = SendAndWait([](BMessage* message) {
		{
			BMessage copy(*message);
			EXPECT_FALSE(copy.WasDelivered());
			EXPECT_FALSE(copy.IsSourceWaiting());
			EXPECT_EQ(copy.SendReply('copy'), B_BAD_REPLY);
			BMessage assigned;
			assigned = *message;
			EXPECT_EQ(assigned.SendReply('copy'), B_BAD_REPLY);
		}
		// The end of the copies told nobody anything.
		EXPECT_TRUE(message->IsSourceWaiting());
		EXPECT_EQ(message->SendReply('orig'), B_OK);
	});
	EXPECT_EQ(what, uint32('orig'));
}


TEST(MessageReplyTest, WhateverTakesAMessageAwayUnansweredSaysSo)
{
	const BMessage other('othr');
	char bytes[68];
	ASSERT_EQ(other.Flatten(bytes, sizeof(bytes)), B_OK);
	const std::function<void(BMessage*)> kWays[] = {
		[](BMessage*) {},
		[](BMessage* message) { message->MakeEmpty(); },
		[&](BMessage* message) { *message = other; },
		[&](BMessage* message) { message->Unflatten(bytes); },
	};
	for (const auto& way : kWays) {
		uint32 afterwards = B_BAD_REPLY;
		const uint32 what = SendAndWait([&](BMessage* message) {
			way(message);
			if (!message->IsSourceWaiting())
				afterwards = uint32(message->SendReply('late'));
		});
		EXPECT_EQ(what, uint32(B_NO_REPLY));
		EXPECT_EQ(afterwards, uint32(B_BAD_REPLY));
	}
}


TEST(MessageReplyTest, AsynchronousReplyCarriesTheOriginal)
{
	RecordingLooper* asked = new RecordingLooper("asked");
	asked->hook = [](BMessage* message) {
		EXPECT_TRUE(message->WasDelivered());
		EXPECT_FALSE(message->IsSourceWaiting());
		EXPECT_TRUE(message->ReturnAddress().IsValid());
		// Not waited for, so there may be several.
		EXPECT_EQ(message->SendReply('repl'), B_OK);
		EXPECT_EQ(message->SendReply('agai'), B_OK);
	};
	RecordingLooper* asking = new RecordingLooper("asking");
	asking->hook = [](BMessage* reply) {
		EXPECT_TRUE(reply->IsReply());
		ASSERT_NE(reply->Previous(), nullptr);
		EXPECT_EQ(reply->Previous()->what, uint32('ques'));
		EXPECT_STREQ(reply->Previous()->FindString("text"), "why");
	};
	asked->Run();
	asking->Run();
	LooperGuard askedGuard(asked);
	LooperGuard askingGuard(asking);

	BMessage question('ques');
	question.AddString("text", "why");
	EXPECT_EQ(BMessenger(NULL, asked).SendMessage(&question, BMessenger(NULL, asking)), B_OK);
	ASSERT_TRUE(asking->record.Wait(2));
	EXPECT_EQ(asking->record.Codes(), (std::vector<uint32>{'repl', 'agai'}));
}


TEST(MessageReplyTest, HandlerOutsideOfALooperTakesNoReplies)
{
	const uint32 what = SendAndWait([](BMessage* message) {
		BHandler homeless;
		BMessage reply('repl');
		EXPECT_NE(message->SendReply(&reply, &homeless), B_OK);
		EXPECT_TRUE(message->IsSourceWaiting());
		EXPECT_EQ(message->SendReply('next'), B_OK);
	});
	EXPECT_EQ(what, uint32('next'));
}


TEST(MessageReplyTest, DropIsToldByTheMessageAndItsFields)
{
	BMessage message(B_SIMPLE_DATA);
	EXPECT_FALSE(message.WasDropped());
	BPoint offset(1, 1);
	EXPECT_EQ(message.DropPoint(&offset), BPoint(0, 0));
	EXPECT_EQ(offset, BPoint(0, 0));

	message.AddPoint("_drop_point_", BPoint(100, 200));
	message.AddPoint("_drop_offset_", BPoint(3, 4));
	BMessage::Private(message).MarkDelivered();
	BMessage::Private(message).MarkDropped();
	EXPECT_TRUE(message.WasDropped());
	EXPECT_EQ(message.DropPoint(), BPoint(100, 200));
	EXPECT_EQ(message.DropPoint(&offset), BPoint(100, 200));
	EXPECT_EQ(offset, BPoint(3, 4));

	BMessage::Private(message).ClearDelivery();
	EXPECT_FALSE(message.WasDropped());
	EXPECT_FALSE(message.WasDelivered());
}


TEST(MessageReplyTest, SpecifiersAreAStack)
{
	BMessage message('GETP');
	EXPECT_FALSE(message.HasSpecifiers());
	EXPECT_EQ(message.SetCurrentSpecifier(0), B_NAME_NOT_FOUND);
	EXPECT_EQ(message.AddSpecifier("Title"), B_OK);
	EXPECT_EQ(message.AddSpecifier("Window", int32(2)), B_OK);
	EXPECT_EQ(message.AddSpecifier("Item", 3, 4), B_OK);
	EXPECT_EQ(message.AddSpecifier("View", "name of it"), B_OK);
	BMessage own('own ');
	own.AddString("property", "Own");
	EXPECT_EQ(message.AddSpecifier(&own), B_OK);
	EXPECT_EQ(message.AddSpecifier(static_cast<const BMessage*>(nullptr)), B_BAD_VALUE);
	EXPECT_EQ(message.AddSpecifier(static_cast<const char*>(nullptr)), B_BAD_VALUE);
	EXPECT_EQ(message.AddSpecifier("Item", 3, -1), B_BAD_VALUE);
	EXPECT_TRUE(message.HasSpecifiers());

	// Only the receiver takes them off.
	int32 index;
	EXPECT_EQ(message.GetCurrentSpecifier(&index), B_BAD_SCRIPT_SYNTAX);
	EXPECT_EQ(index, 4);
	EXPECT_EQ(message.PopSpecifier(), B_BAD_VALUE);
	BMessage::Private(message).MarkDelivered();

	const struct {
		int32 what;
		const char* property;
	} kRows[] = {{'own ', "Own"}, {B_NAME_SPECIFIER, "View"}, {B_RANGE_SPECIFIER, "Item"},
		{B_INDEX_SPECIFIER, "Window"}, {B_DIRECT_SPECIFIER, "Title"}};
	for (int32 i = 0; i < 5; i++) {
		BMessage specifier;
		int32 what;
		const char* property;
		ASSERT_EQ(message.GetCurrentSpecifier(&index, &specifier, &what, &property), B_OK);
		EXPECT_EQ(index, 4 - i);
		EXPECT_EQ(what, kRows[i].what);
		EXPECT_STREQ(property, kRows[i].property);
		if (what == B_INDEX_SPECIFIER) {
			EXPECT_EQ(specifier.FindInt32("index"), 2);
		}
		if (what == B_RANGE_SPECIFIER) {
			EXPECT_EQ(specifier.FindInt32("range"), 4);
		}
		if (what == B_NAME_SPECIFIER) {
			EXPECT_STREQ(specifier.FindString("name"), "name of it");
		}
		EXPECT_EQ(message.PopSpecifier(), B_OK);
	}
	EXPECT_EQ(message.GetCurrentSpecifier(&index), B_BAD_SCRIPT_SYNTAX);
	EXPECT_EQ(index, -1);
	EXPECT_EQ(message.PopSpecifier(), B_BAD_VALUE);
	EXPECT_EQ(message.SetCurrentSpecifier(3), B_OK);
	int32 what;
	EXPECT_EQ(message.GetCurrentSpecifier(&index, nullptr, &what), B_OK);
	EXPECT_EQ(what, B_NAME_SPECIFIER);
	const char* property;
	EXPECT_EQ(message.GetCurrentSpecifier(&index, nullptr, nullptr, &property), B_BAD_VALUE);
	EXPECT_EQ(message.SetCurrentSpecifier(5), B_BAD_INDEX);
	EXPECT_EQ(message.SetCurrentSpecifier(-1), B_BAD_INDEX);
	message.MakeEmpty();
	EXPECT_FALSE(message.HasSpecifiers());
}
