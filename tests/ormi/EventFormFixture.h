// SPDX-License-Identifier: MIT
// A form with all events, and what a user and the window's neighbours do to it.

#pragma once

#include <gtest/gtest.h>

#include <Application.h>
#include <InterfaceDefs.h>
#include <Message.h>
#include <Messenger.h>
#include <OS.h>

#include "EventForm.h"

/// The lines without those that hold \a word, such as "Draw".
inline Lines
Without(const Lines& lines, const char* word)
{
	Lines rest;
	for (const std::string& line : lines) {
		if (line.find(word) == std::string::npos)
			rest.push_back(line);
	}
	return rest;
}


/// The lines that begin with \a words.
inline Lines
Beginning(const Lines& lines, const std::string& words)
{
	Lines wanted;
	for (const std::string& line : lines) {
		if (line.compare(0, words.size(), words) == 0)
			wanted.push_back(line);
	}
	return wanted;
}


inline int
Count(const Lines& lines, const std::string& wanted)
{
	int count = 0;
	for (const std::string& line : lines)
		count += line == wanted ? 1 : 0;
	return count;
}


class EventFormTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		gEvents.Take();
		fForm = new TEventForm;
	}

	void TearDown() override { Close(); }

	/// Shows the form; its first events are not looked at any more.
	void Open()
	{
		fForm->Show();
		fThread = fForm->Thread();
		TakeEvents();
	}

	void Close()
	{
		if (fForm != nullptr && fForm->Lock())
			fForm->Quit();
		fForm = nullptr;
	}

	/// The form quits itself; its thread ends when it is deleted.
	void WaitUntilGone()
	{
		status_t result;
		EXPECT_EQ(wait_for_thread(fThread, &result), B_OK);
		fForm = nullptr;
	}

	/// Waits until the form handled all that was posted to it, twice: handling may post more.
	void Settle(TForm* form)
	{
		for (int i = 0; i < 2; i++) {
			BMessage reply;
			ASSERT_EQ(BMessenger(form).SendMessage(static_cast<uint32>('sync'), &reply), B_OK);
		}
	}

	/// What was written down, but for draws, which come when the display wants them.
	Lines TakeEvents()
	{
		Settle(fForm);
		return Without(gEvents.Take(), "Draw");
	}

	/// \a where: in the form's coordinates.
	void Pointer(uint32 what, BPoint where, int32 buttons = 0)
	{
		PointerIn(fForm, what, where, buttons);
	}

	void PointerIn(TForm* form, uint32 what, BPoint where, int32 buttons = 0)
	{
		BMessage message(what);
		message.AddInt64("when", system_time());
		message.AddPoint("screen_where", where + BPoint(100, 100));
		message.AddInt32("buttons", buttons);
		form->PostMessage(&message);
	}

	void Click(BPoint where)
	{
		Pointer(B_MOUSE_DOWN, where, B_PRIMARY_MOUSE_BUTTON);
		Pointer(B_MOUSE_UP, where);
	}

	void Key(char key, int32 modifiers = 0)
	{
		for (uint32 what : {B_KEY_DOWN, B_KEY_UP}) {
			BMessage message(what);
			message.AddInt64("when", system_time());
			message.AddInt32("raw_char", key);
			message.AddInt32("modifiers", modifiers);
			message.AddInt8("byte", key);
			message.AddString("bytes", BString(&key, 1));
			fForm->PostMessage(&message);
		}
	}

	template <class Operation>
	void Locked(Operation operation)
	{
		ASSERT_TRUE(fForm->Lock());
		operation();
		fForm->Unlock();
	}

	BApplication fApplication{"application/x-vnd.plimworks-ormi-test"};
	TEventForm* fForm = nullptr;
	thread_id fThread = -1;
};
