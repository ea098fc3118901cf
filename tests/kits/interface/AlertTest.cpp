// SPDX-License-Identifier: MIT
// Tests of BAlert: buttons, answers, shortcuts, and who waits for them.
#include <Alert.h>

#include <atomic>
#include <thread>

#include <Button.h>
#include <Invoker.h>
#include <OS.h>
#include <TextView.h>

#include "ControlsFixture.h"

namespace {

const uint32 kMsgAsk = 'Task';

// Asks in its own thread when it is told to, and keeps the answer.
class AskingWindow : public BWindow {
public:
	AskingWindow()
		: BWindow(BRect(50, 50, 249, 149), "asking", B_TITLED_WINDOW, 0)
	{
	}

	void MessageReceived(BMessage* message) override
	{
		if (message->what == kMsgAsk) {
			asked = true;
			answer = (new BAlert("alert", "Question?", "No", "Yes"))->Go();
			messagesAtAnswer = messages.load();
		} else if (message->what == 'mess')
			messages++;
		else
			BWindow::MessageReceived(message);
	}

	std::atomic<bool> asked{false};
	std::atomic<int32> answer{-2};
	std::atomic<int32> messages{0};
	std::atomic<int32> messagesAtAnswer{-1};
};


class AlertTest : public ControlsTest {
protected:
	void SetUp() override
	{
		ControlsTest::SetUp();
		Show();
	}

	void TearDown() override
	{
		if (fThread.joinable())
			fThread.join();
		ControlsTest::TearDown();
	}

	/// Lets another thread wait for the alert's answer.
	void Ask(BAlert* alert)
	{
		// The alert is locked by its maker, which is this thread, until it runs.
		fAnswer = -2;
		alert->Unlock();
		fThread = std::thread([this, alert] {
			alert->Lock();
			fAnswer = alert->Go();
		});
		ASSERT_TRUE(fRobot->WaitForWindow("alert"));
	}

	int32 Answer()
	{
		fThread.join();
		return fAnswer;
	}

	BAlert* Make(const char* one, const char* two = nullptr, const char* three = nullptr)
	{
		return new BAlert("alert", "Question?", one, two, three);
	}

	static void Drop(BAlert* alert)
	{
		alert->Lock();
		alert->Quit();
	}

	std::thread fThread;
	std::atomic<int32> fAnswer{-2};
};

} // namespace


TEST_F(AlertTest, ButtonsWithoutALabelAreLeftOut)
{
	BAlert* alert = Make("A", nullptr, "");
	EXPECT_STREQ(alert->ButtonAt(0)->Label(), "A");
	EXPECT_EQ(alert->ButtonAt(1), nullptr);
	EXPECT_EQ(alert->ButtonAt(2), nullptr);
	EXPECT_EQ(alert->ButtonAt(-1), nullptr);
	EXPECT_EQ(alert->ButtonAt(3), nullptr);
	EXPECT_TRUE(alert->ButtonAt(0)->IsDefault());
	Drop(alert);
}


TEST_F(AlertTest, RightMostButtonIsTheDefault)
{
	BAlert* alert = Make("A", "B", "C");
	EXPECT_EQ(alert->DefaultButton(), alert->ButtonAt(2));
	EXPECT_LT(alert->ButtonAt(0)->Frame().right, alert->ButtonAt(1)->Frame().left);
	EXPECT_LT(alert->ButtonAt(1)->Frame().right, alert->ButtonAt(2)->Frame().left);
	EXPECT_TRUE(alert->Bounds().Contains(alert->ButtonAt(2)->Frame()));
	Drop(alert);
}


TEST_F(AlertTest, LookAndFeelAreModal)
{
	BAlert* alert = Make("A");
	EXPECT_EQ(alert->Look(), B_MODAL_WINDOW_LOOK);
	EXPECT_EQ(alert->Feel(), B_MODAL_APP_WINDOW_FEEL);
	EXPECT_NE(alert->Flags() & B_NOT_CLOSABLE, 0u);
	EXPECT_NE(alert->Flags() & B_NOT_RESIZABLE, 0u);
	EXPECT_EQ(alert->Type(), B_INFO_ALERT);
	EXPECT_STREQ(alert->TextView()->Text(), "Question?");
	Drop(alert);
}


TEST_F(AlertTest, ButtonsAreAsWideAsAsked)
{
	const auto widths = [](button_width width) {
		BAlert* alert = new BAlert("alert", "", "A", "A much wider label for a button", "B", width);
		const float result[] = {alert->ButtonAt(0)->Frame().Width(),
			alert->ButtonAt(1)->Frame().Width(), alert->ButtonAt(0)->StringWidth("A")};
		Drop(alert);
		return std::vector<float>(result, result + 3);
	};
	EXPECT_GE(widths(B_WIDTH_AS_USUAL)[0], 75);
	EXPECT_LT(widths(B_WIDTH_AS_USUAL)[0], widths(B_WIDTH_AS_USUAL)[1]);
	EXPECT_EQ(widths(B_WIDTH_FROM_WIDEST)[0], widths(B_WIDTH_FROM_WIDEST)[1]);
	EXPECT_LT(widths(B_WIDTH_FROM_LABEL)[0], 75);
	EXPECT_GT(widths(B_WIDTH_FROM_LABEL)[0], widths(B_WIDTH_FROM_LABEL)[2]);
}


TEST_F(AlertTest, OffsetSpacingSetsTheFirstButtonApart)
{
	const auto gaps = [](button_spacing spacing) {
		BAlert* alert = new BAlert("alert", "", "A", "B", "C", B_WIDTH_AS_USUAL, spacing);
		const BPoint result(alert->ButtonAt(1)->Frame().left - alert->ButtonAt(0)->Frame().right,
			alert->ButtonAt(2)->Frame().left - alert->ButtonAt(1)->Frame().right);
		Drop(alert);
		return result;
	};
	EXPECT_GT(gaps(B_OFFSET_SPACING).x, gaps(B_OFFSET_SPACING).y);
	EXPECT_EQ(gaps(B_EVEN_SPACING).x, gaps(B_EVEN_SPACING).y);
}


TEST_F(AlertTest, LongTextWrapsAndMakesTheAlertHigher)
{
	BAlert* alert = Make("A");
	const float height = alert->Bounds().Height();
	std::string text;
	for (int i = 0; i < 60; i++)
		text += "several words ";
	alert->SetText(text.c_str());
	EXPECT_GT(alert->TextView()->CountLines(), 5);
	EXPECT_GT(alert->Bounds().Height(), height);
	EXPECT_GE(alert->TextView()->Bounds().Height() + 1,
		alert->TextView()->TextHeight(0, alert->TextView()->CountLines() - 1));
	Drop(alert);
}


TEST_F(AlertTest, VeryLongTextMakesTheAlertWider)
{
	BAlert* alert = Make("A");
	const float width = alert->Bounds().Width();
	std::string text;
	for (int i = 0; i < 100; i++)
		text += "a long line of text that needs most of the width\n";
	alert->SetText(text.c_str());
	EXPECT_GT(alert->Bounds().Width(), width);
	alert->SetText("short");
	EXPECT_EQ(alert->Bounds().Width(), width);
	Drop(alert);
}


TEST_F(AlertTest, GoReturnsTheIndexOfTheClickedButton)
{
	Ask(Make("A", "B", "C"));
	ASSERT_TRUE(fRobot->ClickView("B"));
	EXPECT_EQ(Answer(), 1);
	EXPECT_TRUE(fRobot->WaitForNoWindow("alert"));
}


TEST_F(AlertTest, EnterPressesTheDefaultButton)
{
	Ask(Make("A", "B"));
	fRobot->Key("enter");
	EXPECT_EQ(Answer(), 1);
}


TEST_F(AlertTest, ShortcutPressesItsButton)
{
	BAlert* alert = Make("A", "B", "C");
	alert->SetShortcut(0, B_ESCAPE);
	alert->SetShortcut(1, 'y');
	alert->SetShortcut(7, 'z');
	EXPECT_EQ(alert->Shortcut(0), B_ESCAPE);
	EXPECT_EQ(alert->Shortcut(2), 0);
	EXPECT_EQ(alert->Shortcut(7), 0);
	Ask(alert);
	fRobot->Type("y");
	EXPECT_EQ(Answer(), 1);
}


TEST_F(AlertTest, EscapeDoesNothingWithoutAShortcut)
{
	Ask(Make("A", "B"));
	fRobot->Key("escape");
	EXPECT_EQ(fAnswer, -2);
	EXPECT_TRUE(fRobot->ClickView("A"));
	EXPECT_EQ(Answer(), 0);
}


TEST_F(AlertTest, TabAndSpaceWorkTheButtons)
{
	Ask(Make("A", "B"));
	fRobot->Key("tab");
	fRobot->Key("space");
	EXPECT_EQ(Answer(), 0);
}


TEST_F(AlertTest, AlertWithoutButtonsGetsOne)
{
	Ask(Make(nullptr));
	EXPECT_TRUE(fRobot->ClickView("OK"));
	EXPECT_EQ(Answer(), 0);
}


TEST_F(AlertTest, AlertThatEndsWithoutAnAnswerReleasesTheWaiter)
{
	Ask(Make("A", "B"));
	fRobot->Window().SendMessage(B_QUIT_REQUESTED);
	EXPECT_EQ(Answer(), -1);
}


TEST_F(AlertTest, GoWithAnInvokerSendsWhich)
{
	BInvoker invoker(new BMessage('answ'), fWindow);
	BAlert* alert = Make("A", "B", "C");
	EXPECT_EQ(alert->Go(&invoker), B_OK);
	ASSERT_TRUE(fRobot->WaitForWindow("alert"));
	EXPECT_TRUE(fRobot->ClickView("A"));
	ASSERT_TRUE(fRobot->WaitForNoWindow("alert"));
	const std::vector<BMessage> received = Take();
	ASSERT_EQ(received.size(), 1u);
	EXPECT_EQ(received[0].what, 'answ');
	EXPECT_EQ(received[0].GetInt32("which", -1), 0);
	EXPECT_FALSE(invoker.Message()->HasInt32("which"));
}


TEST_F(AlertTest, GoWithoutAnInvokerJustShows)
{
	EXPECT_EQ(Make("A")->Go(nullptr), B_OK);
	ASSERT_TRUE(fRobot->WaitForWindow("alert"));
	fRobot->Key("enter");
	EXPECT_TRUE(fRobot->WaitForNoWindow("alert"));
}


TEST_F(AlertTest, MessagesOfTheAskingWindowWait)
{
	AskingWindow* window = new AskingWindow;
	window->Show();
	const BMessenger messenger(window);
	messenger.SendMessage(kMsgAsk);
	ASSERT_TRUE(fRobot->WaitForWindow("alert"));
	messenger.SendMessage(static_cast<uint32>('mess'));
	fRobot->Key("enter");
	ASSERT_TRUE(fRobot->WaitForNoWindow("alert"));
	// Asked after the others: all of them were handled when the answer comes.
	BMessage reply;
	messenger.SendMessage(static_cast<uint32>('sync'), &reply);
	EXPECT_EQ(window->answer, 1);
	EXPECT_EQ(window->messagesAtAnswer, 0);
	EXPECT_EQ(window->messages, 1);
	window->Lock();
	window->Quit();
}


TEST_F(AlertTest, ManyAlertsAreAnsweredFromManyThreads)
{
	std::vector<std::thread> threads;
	std::atomic<int> answered{0};
	for (int i = 0; i < 4; i++) {
		threads.emplace_back([&answered] {
			for (int round = 0; round < 5; round++) {
				BAlert* alert = new BAlert("quick", "Question?", "No", "Yes");
				BMessage answer('_ans');
				answer.AddInt32("which", 1);
				alert->PostMessage(&answer);
				alert->PostMessage(&answer);
				answered += alert->Go() == 1 ? 1 : 0;
			}
		});
	}
	for (std::thread& thread : threads)
		thread.join();
	EXPECT_EQ(answered, 20);
}


TEST_F(AlertTest, ArchiveBringsBackTextAndButtons)
{
	BAlert* alert =
		new BAlert("alert", "Question?", "A", "B", nullptr, B_WIDTH_FROM_WIDEST, B_STOP_ALERT);
	alert->SetShortcut(0, 'a');
	BMessage archive;
	ASSERT_EQ(alert->Archive(&archive), B_OK);
	BAlert* copy = dynamic_cast<BAlert*>(BAlert::Instantiate(&archive));
	ASSERT_NE(copy, nullptr);
	EXPECT_STREQ(copy->TextView()->Text(), "Question?");
	EXPECT_STREQ(copy->ButtonAt(1)->Label(), "B");
	EXPECT_EQ(copy->ButtonAt(2), nullptr);
	EXPECT_EQ(copy->Type(), B_STOP_ALERT);
	EXPECT_EQ(copy->Shortcut(0), 'a');
	Drop(alert);
	Drop(copy);
}
