// SPDX-License-Identifier: MIT
// Tests of forms that are used by pointer and keyboard, on a display that draws.

#include <ormi/Components.h>

#include <future>
#include <string>
#include <thread>

#include "EventFormFixture.h"
#include "support/Robot.h"

class UserTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		// The robot waits for the application too, so that must run.
		std::promise<void> started;
		fApplication = std::thread([&started] {
			BApplication application("application/x-vnd.plimworks-ormi-test");
			started.set_value();
			application.Run();
		});
		started.get_future().wait();
		TEventForm* form = new TEventForm;
		form->MakeMainForm(true);
		form->Show();
		ASSERT_TRUE(fRobot.WaitForWindow("Events"));
		gEvents.Take();
	}

	void TearDown() override
	{
		be_app->PostMessage(B_QUIT_REQUESTED);
		fApplication.join();
	}

	/// What was written down about \a component, without draws.
	Lines EventsOf(const char* component)
	{
		EXPECT_TRUE(fRobot.Settle());
		return Without(Beginning(gEvents.Take(), component), "Draw");
	}

	std::thread fApplication;
	Robot fRobot;
};


TEST_F(UserTest, ClickingTellsOfTheWholeClick)
{
	ASSERT_TRUE(fRobot.ClickView("Button1"));
	const Lines events = Without(EventsOf("Button1"), "MouseMoved");
	ASSERT_EQ(events.size(), 3u);
	EXPECT_EQ(events[0].find("Button1MouseDown "), 0u);
	EXPECT_EQ(events[1], "Button1Click");
	EXPECT_EQ(events[2].find("Button1MouseUp "), 0u);

	ASSERT_TRUE(fRobot.ClickView("CheckBox1"));
	EXPECT_EQ(Count(EventsOf("CheckBox1"), "CheckBox1Change 0"), 1);
	ASSERT_TRUE(fRobot.ClickView("StringView1"));
	EXPECT_EQ(Count(EventsOf("StringView1"), "StringView1Click"), 1);
	fRobot.Click(BPoint(270, 40));
	EXPECT_EQ(Count(EventsOf("Box1"), "Box1Click"), 1);
}


TEST_F(UserTest, DraggingOffAComponentIsNoClick)
{
	fRobot.Drag(BPoint(20, 20), BPoint(250, 150));
	EXPECT_EQ(Count(EventsOf("Button1"), "Button1Click"), 0);
	fRobot.Drag(BPoint(20, 110), BPoint(250, 150));
	EXPECT_EQ(Count(EventsOf("StringView1"), "StringView1Click"), 0);
}


TEST_F(UserTest, TypingTellsOfEachChangeAndEnterOfTheEnd)
{
	fRobot.Click(BPoint(150, 80));
	EXPECT_EQ(Count(EventsOf("TextControl1"), "TextControl1GotFocus"), 1);
	fRobot.Type("!?");
	Lines events = EventsOf("TextControl1");
	EXPECT_EQ(Count(events, "TextControl1Change text!"), 1);
	EXPECT_EQ(Count(events, "TextControl1Change text!?"), 1);
	EXPECT_GE(Count(events, "TextControl1KeyDown"), 2);
	EXPECT_EQ(Count(events, "TextControl1Enter text!?"), 0);
	ASSERT_TRUE(fRobot.Key("enter"));
	EXPECT_EQ(Count(EventsOf("TextControl1"), "TextControl1Enter text!?"), 1);
}


TEST_F(UserTest, TabAndBackTabMoveTheFocus)
{
	fRobot.Click(BPoint(150, 80));
	EventsOf("");
	ASSERT_TRUE(fRobot.Key("shift+tab"));
	Lines events = EventsOf("");
	EXPECT_EQ(Count(events, "TextControl1LostFocus"), 1);
	EXPECT_EQ(Count(events, "CheckBox1GotFocus"), 1);
	ASSERT_TRUE(fRobot.Key("tab"));
	events = EventsOf("");
	EXPECT_EQ(Count(events, "CheckBox1LostFocus"), 1);
	EXPECT_EQ(Count(events, "TextControl1GotFocus"), 1);
}


TEST_F(UserTest, ComponentsShowTheirTextInTheGivenColours)
{
	// The designer's high colour is black with an alpha of 0, which opaque drawing does not look at.
	ASSERT_TRUE(fRobot.Settle());
	const WindowPicture picture = fRobot.Picture();
	int32 dark = 0;
	int32 backgrounds = 0;
	for (int32 y = 100; y <= 120; y++) {
		for (int32 x = 10; x <= 149; x++) {
			const rgb_color color = picture.At(x, y);
			dark += color.red < 100 ? 1 : 0;
			backgrounds += color.red == 216 && color.green == 216 && color.blue == 216 ? 1 : 0;
		}
	}
	EXPECT_GT(dark, 10);
	EXPECT_GT(backgrounds, 1000);
	EXPECT_EQ(picture.At(250, 150).red, 216);
	EXPECT_EQ(picture.At(250, 150).blue, 216);
}
