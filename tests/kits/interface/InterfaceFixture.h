// SPDX-License-Identifier: MIT
// What the tests of views and windows share: an application, views that write down their hooks.
#ifndef TESTS_INTERFACE_FIXTURE_H
#define TESTS_INTERFACE_FIXTURE_H

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include <Application.h>
#include <Message.h>
#include <Messenger.h>
#include <View.h>
#include <Window.h>

using Log = std::vector<std::string>;


/// Waits until the window handled all that was posted to it, twice: handling may post more.
inline void
Settle(BWindow* window)
{
	for (int i = 0; i < 2; i++) {
		BMessage reply;
		ASSERT_EQ(BMessenger(window).SendMessage(static_cast<uint32>('sync'), &reply), B_OK);
	}
}


inline void
Quit(BWindow* window)
{
	if (window->Lock())
		window->Quit();
}


/// A view that writes the hooks of the tree into a log.
class TreeView : public BView {
public:
	TreeView(const char* name, Log* log)
		: BView(BRect(0, 0, 9, 9), name, B_FOLLOW_NONE, 0),
		  fLog(log)
	{
	}

	void AttachedToWindow() override { Add("attached"); }
	void AllAttached() override { Add("all attached"); }
	void DetachedFromWindow() override { Add("detached"); }
	void AllDetached() override { Add("all detached"); }

protected:
	void Add(const char* what)
	{
		fLog->push_back(std::string(Name()) + " " + what + (Window() == nullptr ? "!" : ""));
	}

private:
	Log* fLog;
};


class InterfaceTest : public ::testing::Test {
protected:
	/// A titled window at (100, 100), 201 by 101 pixels; hidden, locked, not running.
	BWindow* MakeWindow(uint32 flags = 0)
	{
		return new BWindow(BRect(100, 100, 300, 200), "test", B_TITLED_WINDOW, flags);
	}

	BApplication fApplication{"application/x-vnd.plimworks-interface-test"};
};

#endif // TESTS_INTERFACE_FIXTURE_H
