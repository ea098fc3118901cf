// SPDX-License-Identifier: MIT
// What the tests of controls share: a shown window that keeps what it is sent, and a robot to work it.
#ifndef TESTS_CONTROLS_FIXTURE_H
#define TESTS_CONTROLS_FIXTURE_H

#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include <Application.h>
#include <Control.h>
#include <InterfaceDefs.h>
#include <Message.h>
#include <TextView.h>
#include <Window.h>

#include "support/Printers.h"
#include "support/Robot.h"

/// Keeps the messages with a code in lower case, as the tests' own are.
class SinkWindow : public BWindow {
public:
	SinkWindow()
		: BWindow(BRect(100, 100, 399, 299), "controls", B_TITLED_WINDOW, B_WILL_ACCEPT_FIRST_CLICK)
	{
	}

	void MessageReceived(BMessage* message) override
	{
		const char first = static_cast<char>(message->what >> 24);
		if (first >= 'a' && first <= 'z')
			fReceived.push_back(*message);
		else
			BWindow::MessageReceived(message);
	}

	/// With the window locked.
	std::vector<BMessage> Take()
	{
		std::vector<BMessage> received;
		received.swap(fReceived);
		return received;
	}

private:
	std::vector<BMessage> fReceived;
};


/// A window of 300 x 200 with a background view "background" in the panel's colour.
class ControlsTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		fWindow = new SinkWindow;
		fBackground = new BView(fWindow->Bounds(), "background", B_FOLLOW_ALL, B_WILL_DRAW);
		fBackground->SetViewColor(ui_color(B_PANEL_BACKGROUND_COLOR));
		fWindow->AddChild(fBackground);
	}

	void TearDown() override
	{
		fRobot.reset();
		if (fWindow->Lock())
			fWindow->Quit();
	}

	/// Shows the window; the robot works on it from here on.
	void Show()
	{
		fWindow->Show();
		fRobot = std::make_unique<Robot>(fWindow);
		ASSERT_TRUE(fRobot->WaitForWindow("controls"));
	}

	/// Adds a view to the background.
	template <typename View>
	View* Add(View* view)
	{
		fBackground->AddChild(view);
		return view;
	}

	/// Does something with the window locked, and waits for what comes of it.
	template <typename Function>
	void Do(Function function)
	{
		ASSERT_TRUE(fWindow->Lock());
		function();
		fWindow->Unlock();
		fRobot->Settle();
	}

	/// Asks something with the window locked.
	template <typename Function>
	auto Ask(Function function)
	{
		fRobot->Settle();
		fWindow->Lock();
		auto result = function();
		fWindow->Unlock();
		return result;
	}

	int32 ValueOf(BControl* control)
	{
		return Ask([control] { return control->Value(); });
	}

	std::string TextOf(BTextView* view)
	{
		return Ask([view] { return std::string(view->Text()); });
	}

	std::vector<BMessage> Take()
	{
		return Ask([this] { return fWindow->Take(); });
	}

	/// The codes of what the window was sent.
	std::string TakeCodes()
	{
		std::string codes;
		for (const BMessage& message : Take()) {
			for (int shift = 24; shift >= 0; shift -= 8)
				codes += static_cast<char>(message.what >> shift);
			codes += ' ';
		}
		return codes;
	}

	BApplication fApplication{"application/x-vnd.plimworks-controls-test"};
	SinkWindow* fWindow = nullptr;
	BView* fBackground = nullptr;
	std::unique_ptr<Robot> fRobot;
};

#endif // TESTS_CONTROLS_FIXTURE_H
