// SPDX-License-Identifier: MIT
// BClipboard: its protocol, and the exchange with other programs.

#include <Clipboard.h>

#include <cstring>
#include <string>
#include <thread>

#include <gtest/gtest.h>

#include <Message.h>
#include <TypeConstants.h>

#include "Recorder.h"
#include "app/ClipboardPrivate.h"


static void
AddText(BMessage* data, const char* text)
{
	data->AddData("text/plain", B_MIME_TYPE, text, strlen(text), false);
}


static std::string
TextOf(const BMessage& data)
{
	const void* text;
	ssize_t size;
	if (data.FindData("text/plain", B_MIME_TYPE, &text, &size) != B_OK)
		return "(none)";
	return std::string(static_cast<const char*>(text), size);
}


static status_t
Write(BClipboard* clipboard, const char* text)
{
	clipboard->Lock();
	clipboard->Clear();
	AddText(clipboard->Data(), text);
	status_t status = clipboard->Commit();
	clipboard->Unlock();
	return status;
}


static std::string
Read(BClipboard* clipboard)
{
	clipboard->Lock();
	std::string text = TextOf(*clipboard->Data());
	clipboard->Unlock();
	return text;
}


TEST(ClipboardTest, ObjectsOfOneNameShareWhatWasCommitted)
{
	BClipboard writer("test share");
	BClipboard reader("test share");
	BClipboard other("test other");
	EXPECT_STREQ(writer.Name(), "test share");
	EXPECT_EQ(Write(&writer, "hello"), B_OK);
	EXPECT_EQ(Read(&reader), "hello");
	EXPECT_EQ(Read(&other), "(none)");
}


TEST(ClipboardTest, EverythingAboutTheDataNeedsTheLock)
{
	BClipboard clipboard("test lock");
	EXPECT_FALSE(clipboard.IsLocked());
	EXPECT_EQ(clipboard.Data(), nullptr);
	EXPECT_EQ(clipboard.Clear(), B_NOT_ALLOWED);
	EXPECT_EQ(clipboard.Commit(), B_NOT_ALLOWED);
	EXPECT_EQ(clipboard.Revert(), B_NOT_ALLOWED);
	ASSERT_TRUE(clipboard.Lock());
	EXPECT_TRUE(clipboard.IsLocked());
	EXPECT_NE(clipboard.Data(), nullptr);
	std::thread([&] { EXPECT_EQ(clipboard.Data(), nullptr); }).join();
	clipboard.Unlock();
}


TEST(ClipboardTest, WhatIsNotCommittedIsForgotten)
{
	BClipboard clipboard("test forget");
	Write(&clipboard, "kept");
	clipboard.Lock();
	clipboard.Clear();
	AddText(clipboard.Data(), "lost");
	clipboard.Lock();
	EXPECT_EQ(TextOf(*clipboard.Data()), "lost");
	clipboard.Unlock();
	EXPECT_EQ(clipboard.Revert(), B_OK);
	EXPECT_EQ(TextOf(*clipboard.Data()), "kept");
	clipboard.Clear();
	clipboard.Unlock();
	EXPECT_EQ(Read(&clipboard), "kept");
}


TEST(ClipboardTest, ACommitMayFailWhenSomebodyElseCommittedMeanwhile)
{
	BClipboard one("test race");
	BClipboard two("test race");
	one.Lock();
	Write(&two, "first");
	one.Clear();
	AddText(one.Data(), "second");
	EXPECT_LT(one.LocalCount(), one.SystemCount());
	EXPECT_NE(one.Commit(true), B_OK);
	EXPECT_EQ(Read(&two), "first");
	EXPECT_EQ(one.Commit(false), B_OK);
	EXPECT_EQ(one.Commit(true), B_OK);
	one.Unlock();
	EXPECT_EQ(one.LocalCount(), one.SystemCount());
	EXPECT_EQ(Read(&two), "second");
}


TEST(ClipboardTest, WatchersAreTold)
{
	BClipboard clipboard("test watch");
	RecordingLooper* watcher = new RecordingLooper;
	watcher->Run();
	EXPECT_EQ(clipboard.StartWatching(BMessenger()), B_BAD_VALUE);
	EXPECT_EQ(clipboard.StartWatching(BMessenger(watcher)), B_OK);
	Write(&clipboard, "news");
	EXPECT_TRUE(watcher->record.Wait());
	EXPECT_EQ(watcher->record.Codes(), (std::vector<uint32>{B_CLIPBOARD_CHANGED}));
	EXPECT_EQ(clipboard.StopWatching(BMessenger(watcher)), B_OK);
	EXPECT_EQ(clipboard.StopWatching(BMessenger(watcher)), B_BAD_VALUE);
	QuitLooper(watcher);
}


/// A host whose clipboard the test fills and reads.
class FakeHost : public BPrivate::ClipboardExchange {
public:
	FakeHost() { BPrivate::SetClipboardExchange(this); }
	~FakeHost() override { BPrivate::SetClipboardExchange(NULL); }

	status_t Get(BMessage* data) override
	{
		if (!foreign)
			return B_ENTRY_NOT_FOUND;
		*data = content;
		return B_OK;
	}
	status_t Put(const BMessage& data) override
	{
		foreign = false;
		content = data;
		return result;
	}

	void CopyElsewhere(const char* text)
	{
		content.MakeEmpty();
		AddText(&content, text);
		foreign = true;
	}

	BMessage content;
	bool foreign = false;
	status_t result = B_OK;
};


TEST(ClipboardTest, ACommitReachesOtherPrograms)
{
	FakeHost host;
	EXPECT_EQ(Write(be_clipboard, "to the host"), B_OK);
	EXPECT_EQ(TextOf(host.content), "to the host");
	BClipboard other("test private");
	Write(&other, "private");
	EXPECT_EQ(TextOf(host.content), "to the host");
	host.result = B_IO_ERROR;
	EXPECT_EQ(Write(be_clipboard, "refused"), B_IO_ERROR);
	EXPECT_EQ(Read(be_clipboard), "refused");
}


TEST(ClipboardTest, WhatAnotherProgramCopiedIsFetchedByTheNextLock)
{
	FakeHost host;
	Write(be_clipboard, "mine");
	uint32 count = be_clipboard->SystemCount();
	host.CopyElsewhere("theirs");
	EXPECT_EQ(Read(be_clipboard), "theirs");
	EXPECT_EQ(be_clipboard->SystemCount(), count + 1);
	EXPECT_FALSE(be_clipboard->DataSource().IsValid());
	EXPECT_EQ(Read(be_clipboard), "theirs");
	EXPECT_EQ(be_clipboard->SystemCount(), count + 1);
}


TEST(ClipboardTest, AChangeElsewhereIsCountedOnceAndReported)
{
	FakeHost host;
	Write(be_clipboard, "mine");
	RecordingLooper* watcher = new RecordingLooper;
	watcher->Run();
	be_clipboard->StartWatching(BMessenger(watcher));
	uint32 count = be_clipboard->SystemCount();

	be_clipboard->Lock();
	host.CopyElsewhere("theirs");
	BPrivate::ClipboardChangedElsewhere();
	EXPECT_NE(be_clipboard->Commit(true), B_OK);
	be_clipboard->Unlock();
	EXPECT_TRUE(watcher->record.Wait());
	EXPECT_EQ(Read(be_clipboard), "theirs");
	EXPECT_EQ(be_clipboard->SystemCount(), count + 1);
	be_clipboard->StopWatching(BMessenger(watcher));
	QuitLooper(watcher);
}
