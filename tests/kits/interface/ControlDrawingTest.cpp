// SPDX-License-Identifier: MIT
// Tests of what controls show, on a display that draws without a screen: the pixels that tell a state.
#include <atomic>
#include <cmath>

#include <Alert.h>
#include <Box.h>
#include <Button.h>
#include <CheckBox.h>
#include <OS.h>
#include <RadioButton.h>
#include <StringView.h>
#include <TextControl.h>
#include <TextView.h>

#include "ControlsFixture.h"

namespace {

class ControlDrawingTest : public ControlsTest {
protected:
	/// The window's picture, with the pointer out of the way.
	WindowPicture Picture()
	{
		fRobot->Settle();
		return fRobot->Picture();
	}

	/// How many pixels of the view's frame are not the window's background.
	int32 Drawn(BRect frame)
	{
		const WindowPicture picture = Picture();
		const int32 all = (frame.IntegerWidth() + 1) * (frame.IntegerHeight() + 1);
		return all - picture.Count(frame, ui_color(B_PANEL_BACKGROUND_COLOR));
	}

	/// Whether doing something changes the picture inside the frame, and nowhere else.
	template <typename Function>
	::testing::AssertionResult Changes(BRect frame, Function function)
	{
		const WindowPicture before = Picture();
		Do(function);
		const WindowPicture after = Picture();
		if (before.SameIn(after, frame))
			return ::testing::AssertionFailure() << "the picture stayed the same";
		const BRect bounds(0, 0, before.width - 1, before.height - 1);
		const BRect others[] = {BRect(0, 0, bounds.right, frame.top - 1),
			BRect(0, frame.bottom + 1, bounds.right, bounds.bottom),
			BRect(0, frame.top, frame.left - 1, frame.bottom),
			BRect(frame.right + 1, frame.top, bounds.right, frame.bottom)};
		for (BRect other : others) {
			if (other.IsValid() && !before.SameIn(after, other))
				return ::testing::AssertionFailure() << "something else changed";
		}
		return ::testing::AssertionSuccess();
	}
};

// Counts how often it is drawn.
class CountingView : public BView {
public:
	explicit CountingView(BRect frame)
		: BView(frame, "counting", B_FOLLOW_ALL, B_WILL_DRAW)
	{
	}

	void Draw(BRect) override { drawn++; }

	std::atomic<int32> drawn{0};
};


// Has its picture drawn anew, and then asks in its own thread.
class RepaintingWindow : public BWindow {
public:
	RepaintingWindow()
		: BWindow(BRect(450, 100, 649, 199), "repainting", B_TITLED_WINDOW, 0),
		  view(new CountingView(Bounds()))
	{
		AddChild(view);
	}

	void MessageReceived(BMessage* message) override
	{
		if (message->what != 'Task') {
			BWindow::MessageReceived(message);
			return;
		}
		view->drawn = 0;
		view->Invalidate();
		(new BAlert("alert", "Question?", "OK"))->Go();
	}

	CountingView* const view;
};

const rgb_color kRed = {255, 0, 0, 255};
const rgb_color kBlack = {0, 0, 0, 255};
const BRect kFrame(20, 20, 139, 44);


int32
RedPixels(const WindowPicture& picture, BRect rect)
{
	int32 count = 0;
	for (int32 y = static_cast<int32>(rect.top); y <= rect.bottom; y++) {
		for (int32 x = static_cast<int32>(rect.left); x <= rect.right; x++) {
			const rgb_color color = picture.At(x, y);
			count += color.red > 150 && color.green < 80 && color.blue < 80 ? 1 : 0;
		}
	}
	return count;
}


int32
DarkPixels(const WindowPicture& picture, BRect rect)
{
	int32 count = 0;
	for (int32 y = static_cast<int32>(rect.top); y <= rect.bottom; y++) {
		for (int32 x = static_cast<int32>(rect.left); x <= rect.right; x++)
			count += picture.At(x, y).Brightness() < 90 ? 1 : 0;
	}
	return count;
}

} // namespace


TEST_F(ControlDrawingTest, ButtonShowsItsStates)
{
	BButton* button = Add(new BButton(kFrame, "button", "Button", nullptr));
	Show();
	EXPECT_TRUE(Changes(kFrame, [button] { button->SetValue(1); })) << "pressed";
	EXPECT_TRUE(Changes(kFrame, [button] { button->SetValue(0); })) << "released";
	EXPECT_TRUE(Changes(kFrame, [button] { button->MakeFocus(); })) << "focused";
	EXPECT_TRUE(Changes(kFrame, [button] { button->SetEnabled(false); })) << "disabled";
	EXPECT_TRUE(Changes(kFrame, [button] { button->SetLabel("Other"); })) << "another label";
	EXPECT_TRUE(Changes(kFrame.InsetByCopy(-3, -3), [button] { button->MakeDefault(true); }));
	EXPECT_TRUE(Changes(kFrame.InsetByCopy(-3, -3), [button] { button->MakeDefault(false); }));
}


TEST_F(ControlDrawingTest, DefaultMarkGoesWithoutATrace)
{
	BButton* button = Add(new BButton(kFrame, "button", "Button", nullptr));
	Show();
	const WindowPicture before = Picture();
	Do([button] { button->MakeDefault(true); });
	EXPECT_FALSE(before.SameIn(Picture(), kFrame.InsetByCopy(-3, -3)));
	Do([button] { button->MakeDefault(false); });
	EXPECT_TRUE(before.SameIn(Picture(), BRect(0, 0, 299, 199)));
}


TEST_F(ControlDrawingTest, FocusIsShownInTheNavigationColour)
{
	BButton* button = Add(new BButton(kFrame, "button", "Button", nullptr));
	Show();
	const rgb_color mark = ui_color(B_KEYBOARD_NAVIGATION_COLOR);
	EXPECT_EQ(Picture().Count(kFrame, mark), 0);
	Do([button] { button->MakeFocus(); });
	EXPECT_GT(Picture().Count(kFrame, mark), 200);
	Do([button] { button->MakeFocus(false); });
	EXPECT_EQ(Picture().Count(kFrame, mark), 0);
}


TEST_F(ControlDrawingTest, LongLabelsStayInside)
{
	Add(new BButton(kFrame, "button", "A label that is by far too long for it", nullptr));
	Add(new BCheckBox(BRect(20, 60, 99, 78), "box", "A label that is too long as well", nullptr));
	Show();
	const rgb_color panel = ui_color(B_PANEL_BACKGROUND_COLOR);
	const WindowPicture picture = Picture();
	EXPECT_EQ(picture.Count(BRect(140, 20, 299, 44), panel), 160 * 25);
	EXPECT_EQ(picture.Count(BRect(100, 60, 299, 78), panel), 200 * 19);
	EXPECT_EQ(picture.Count(BRect(0, 20, 19, 44), panel), 20 * 25);
}


TEST_F(ControlDrawingTest, CheckBoxShowsItsValues)
{
	BCheckBox* box = Add(new BCheckBox(kFrame, "box", "Box", nullptr));
	Show();
	const rgb_color mark = ui_color(B_CONTROL_MARK_COLOR);
	EXPECT_EQ(Picture().Count(kFrame, mark), 0);
	EXPECT_TRUE(Changes(kFrame, [box] { box->SetValue(1); }));
	EXPECT_GT(Picture().Count(kFrame, mark), 4);
	EXPECT_TRUE(Changes(kFrame, [box] { box->SetValue(2); }));
	EXPECT_GT(Picture().Count(kFrame, mark), 4);
	EXPECT_TRUE(Changes(kFrame, [box] { box->SetEnabled(false); }));
	EXPECT_EQ(Picture().Count(kFrame, mark), 0) << "disabled it is paler";
}


TEST_F(ControlDrawingTest, PressedCheckBoxFollowsThePointer)
{
	Add(new BCheckBox(kFrame, "box", "Box", nullptr));
	Show();
	const WindowPicture released = Picture();
	fRobot->MoveTo(BPoint(40, 30));
	fRobot->Press();
	const WindowPicture pressed = Picture();
	EXPECT_FALSE(released.SameIn(pressed, kFrame));
	fRobot->MoveTo(BPoint(40, 130));
	EXPECT_TRUE(released.SameIn(Picture(), kFrame));
	fRobot->MoveTo(BPoint(40, 30));
	EXPECT_TRUE(pressed.SameIn(Picture(), kFrame));
	fRobot->MoveTo(BPoint(40, 130));
	fRobot->Release();
	EXPECT_TRUE(released.SameIn(Picture(), kFrame));
}


TEST_F(ControlDrawingTest, RadioButtonShowsItsDot)
{
	BRadioButton* on = Add(new BRadioButton(kFrame, "on", "On", nullptr));
	BRadioButton* other = Add(new BRadioButton(BRect(20, 60, 139, 84), "other", "Other", nullptr));
	Show();
	const rgb_color mark = ui_color(B_CONTROL_MARK_COLOR);
	Do([on] { on->SetValue(1); });
	EXPECT_GT(Picture().Count(kFrame, mark), 20);
	Do([other] { other->SetValue(1); });
	EXPECT_EQ(Picture().Count(kFrame, mark), 0);
	EXPECT_GT(Picture().Count(BRect(20, 60, 139, 84), mark), 20);
}


TEST_F(ControlDrawingTest, MarkFollowsANewHeight)
{
	BCheckBox* box = Add(new BCheckBox(kFrame, "box", nullptr, nullptr));
	box->SetValue(1);
	Show();
	Do([box] { box->ResizeTo(119, 84); });
	const rgb_color mark = ui_color(B_CONTROL_MARK_COLOR);
	EXPECT_EQ(Picture().Count(BRect(20, 20, 139, 44), mark), 0);
	EXPECT_GT(Picture().Count(BRect(20, 50, 139, 74), mark), 4);
}


TEST_F(ControlDrawingTest, StringViewDrawsAtTheBottomWithItsAlignment)
{
	BStringView* view = Add(new BStringView(BRect(20, 20, 219, 79), "string", "mmm"));
	Show();
	const BRect left(20, 60, 69, 79), middle(95, 60, 144, 79), right(170, 60, 219, 79);
	EXPECT_EQ(Drawn(BRect(20, 20, 219, 60)), 0) << "nothing above the line";
	EXPECT_GT(Drawn(left), 20);
	Do([view] { view->SetAlignment(B_ALIGN_CENTER); });
	EXPECT_EQ(Drawn(left), 0);
	EXPECT_GT(Drawn(middle), 20);
	Do([view] { view->SetAlignment(B_ALIGN_RIGHT); });
	EXPECT_EQ(Drawn(middle), 0);
	EXPECT_GT(Drawn(right), 20);
	Do([view] { view->SetText(""); });
	EXPECT_EQ(Drawn(BRect(20, 20, 219, 79)), 0);
}


TEST_F(ControlDrawingTest, StringViewTruncatesOnRequest)
{
	BStringView* view =
		Add(new BStringView(BRect(20, 20, 79, 39), "string", "mmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmm"));
	Show();
	EXPECT_TRUE(Changes(BRect(20, 20, 79, 39), [view] { view->SetTruncation(B_TRUNCATE_END); }));
	EXPECT_EQ(Drawn(BRect(80, 20, 299, 39)), 0);
}


TEST_F(ControlDrawingTest, TextInAHighColourWithoutAlphaIsOpaque)
{
	BStringView* opaque = Add(new BStringView(BRect(20, 20, 119, 39), "opaque", "Text"));
	opaque->SetHighColor(255, 0, 0, 255);
	BStringView* bare = Add(new BStringView(BRect(20, 60, 119, 79), "bare", "Text"));
	bare->SetHighColor(255, 0, 0, 0);
	Show();
	const WindowPicture picture = Picture();
	EXPECT_GT(RedPixels(picture, BRect(20, 20, 119, 39)), 10);
	EXPECT_EQ(
		RedPixels(picture, BRect(20, 60, 119, 79)), RedPixels(picture, BRect(20, 20, 119, 39)));
}


TEST_F(ControlDrawingTest, TextInTheDesignersDefaultColourIsBlack)
{
	BStringView* view = Add(new BStringView(BRect(20, 20, 119, 39), "string", "Text"));
	const rgb_color none = {0, 0, 0, 0};
	view->SetHighColor(none);
	Show();
	EXPECT_GT(DarkPixels(Picture(), BRect(20, 20, 119, 39)), 20);
}


TEST_F(ControlDrawingTest, LabelIsReadableOnADarkBackground)
{
	fBackground->SetViewColor(kBlack);
	Add(new BCheckBox(kFrame, "box", "Label", nullptr));
	Show();
	const WindowPicture picture = Picture();
	int32 bright = 0;
	for (int32 y = 20; y <= 44; y++) {
		for (int32 x = 45; x <= 139; x++)
			bright += picture.At(x, y).Brightness() > 180 ? 1 : 0;
	}
	EXPECT_GT(bright, 20);
}


TEST_F(ControlDrawingTest, BoxDrawsItsBorderOnceAround)
{
	BBox* box = Add(new BBox(BRect(20, 20, 119, 99), "box"));
	Show();
	const rgb_color line = tint_color(ui_color(B_PANEL_BACKGROUND_COLOR), B_DARKEN_2_TINT);
	Do([box] { box->SetBorder(B_PLAIN_BORDER); });
	EXPECT_EQ(Picture().Count(BRect(20, 20, 119, 99), line), 2 * 100 + 2 * 78);
	Do([box] { box->SetBorder(B_NO_BORDER); });
	EXPECT_EQ(Drawn(BRect(20, 20, 119, 99)), 0);
	Do([box] { box->SetBorder(B_FANCY_BORDER); });
	EXPECT_EQ(Picture().Count(BRect(20, 20, 119, 20), line), 99);
}


TEST_F(ControlDrawingTest, BoxKeepsNoOldBorderWhenItIsResized)
{
	BBox* box = Add(new BBox(BRect(20, 20, 119, 99), "box", B_FOLLOW_LEFT_TOP,
		B_WILL_DRAW | B_FRAME_EVENTS, B_PLAIN_BORDER));
	Show();
	const rgb_color line = tint_color(ui_color(B_PANEL_BACKGROUND_COLOR), B_DARKEN_2_TINT);
	Do([box] { box->ResizeTo(149, 99); });
	EXPECT_EQ(Picture().Count(BRect(20, 20, 169, 119), line), 2 * 150 + 2 * 98);
	Do([box] { box->ResizeTo(79, 59); });
	EXPECT_EQ(Picture().Count(BRect(0, 0, 299, 199), line), 2 * 80 + 2 * 58);
}


TEST_F(ControlDrawingTest, LabelInterruptsTheBorder)
{
	BBox* box = Add(new BBox(BRect(20, 20, 219, 99), "box", B_FOLLOW_LEFT_TOP,
		B_WILL_DRAW | B_FRAME_EVENTS, B_PLAIN_BORDER));
	box->SetLabel("Label");
	Show();
	const rgb_color line = tint_color(ui_color(B_PANEL_BACKGROUND_COLOR), B_DARKEN_2_TINT);
	const float top = 20 + Ask([box] { return box->TopBorderOffset(); });
	const int32 drawn = Picture().Count(BRect(20, top, 219, top), line);
	EXPECT_GT(drawn, 100);
	EXPECT_LT(drawn, 180);
	EXPECT_EQ(Picture().At(20, static_cast<int32>(top)), line);
	EXPECT_EQ(Picture().At(219, static_cast<int32>(top)), line);
}


TEST_F(ControlDrawingTest, TextControlShowsItsStates)
{
	BTextControl* control =
		Add(new BTextControl(BRect(20, 20, 219, 39), "control", "Label:", "text", nullptr));
	const BRect frame = control->Frame();
	Show();
	const rgb_color mark = ui_color(B_KEYBOARD_NAVIGATION_COLOR);
	EXPECT_EQ(Picture().Count(frame, mark), 0);
	EXPECT_TRUE(Changes(frame, [control] { control->MakeFocus(); }));
	EXPECT_GT(Picture().Count(frame, mark), 100);
	EXPECT_TRUE(Changes(frame, [control] { control->SetEnabled(false); }));
	EXPECT_EQ(Picture().Count(frame, mark), 0);
	EXPECT_EQ(Picture().Count(frame, ui_color(B_DOCUMENT_BACKGROUND_COLOR)), 0)
		<< "a disabled field is no white one";
	EXPECT_TRUE(Changes(frame, [control] { control->SetText("other"); }));
}


TEST_F(ControlDrawingTest, ATextShowsWhereWhatIsDraggedOverItWouldGo)
{
	const BRect kInside(4, 4, 96, 46);
	auto* source = Add(new BTextView(BRect(10, 10, 110, 60), "source", kInside, B_FOLLOW_NONE));
	auto* target = Add(new BTextView(BRect(150, 10, 250, 60), "target", kInside, B_FOLLOW_NONE));
	source->SetText("word");
	target->SetText("      ");
	Show();
	Do([&] {
		source->MakeFocus();
		source->SelectAll();
	});
	float height = 0;
	const BPoint place = Ask([&] { return target->ConvertToParent(target->PointAt(3, &height)); });
	const float x = std::floor(place.x);
	const BRect caret(x, place.y, x, place.y + height - 1);
	const auto Dark = [&] { return DarkPixels(Picture(), caret); };

	fRobot->MoveTo(BPoint(20, 20));
	fRobot->Press();
	fRobot->MoveTo(BPoint(30, 30));
	EXPECT_EQ(Dark(), 0);
	fRobot->MoveTo(place + BPoint(1, 5));
	EXPECT_EQ(Dark(), height);
	fRobot->MoveTo(BPoint(280, 150));
	EXPECT_EQ(Dark(), 0);
	fRobot->MoveTo(place + BPoint(1, 5));
	EXPECT_EQ(Dark(), height);
	EXPECT_TRUE(fRobot->Key("escape"));
	EXPECT_EQ(Dark(), 0);
	fRobot->Release();
	EXPECT_EQ(TextOf(target), "      ");
}


TEST_F(ControlDrawingTest, SelectionIsShownWhileFocused)
{
	BTextView* view = Add(new BTextView(
		BRect(20, 20, 219, 99), "text", BRect(4, 4, 195, 75), B_FOLLOW_LEFT_TOP, B_WILL_DRAW));
	view->SetText("some text");
	Show();
	const rgb_color mark = ui_color(B_LIST_SELECTED_BACKGROUND_COLOR);
	Do([view] {
		view->MakeFocus();
		view->Select(0, 4);
	});
	const BPoint end = Ask([view] { return view->ConvertToParent(view->PointAt(4)); });
	const float height = Ask([view] { return view->LineHeight(); });
	const BRect selected(24, 24, end.x - 1, 24 + height - 1);
	EXPECT_GT(Picture().Count(selected, mark), selected.Width() * height / 3);
	EXPECT_EQ(Picture().Count(BRect(end.x + 2, 20, 219, 99), mark), 0);
	Do([view] { view->MakeFocus(false); });
	// The rim of a letter may happen to have the colour.
	EXPECT_LT(Picture().Count(BRect(20, 20, 219, 99), mark), 5);
}


TEST_F(ControlDrawingTest, CaretStandsBeforeItsCharacter)
{
	BTextView* view = Add(new BTextView(
		BRect(20, 20, 219, 99), "text", BRect(4, 4, 195, 75), B_FOLLOW_LEFT_TOP, B_WILL_DRAW));
	view->SetFontAndColor(nullptr, 0, &kRed);
	Show();
	Do([view] { view->MakeFocus(); });
	const int32 height = static_cast<int32>(Ask([view] { return view->LineHeight(); }));
	EXPECT_EQ(Picture().Count(BRect(24, 20, 24, 99), kRed), height);
	fRobot->Type("   ");
	const BPoint caret = Ask([view] { return view->ConvertToParent(view->PointAt(3)); });
	const float x = std::floor(caret.x);
	EXPECT_GT(x, 26);
	EXPECT_EQ(Picture().Count(BRect(24, 20, 24, 99), kRed), 0);
	EXPECT_EQ(Picture().Count(BRect(x, 20, x, 99), kRed), height);
	Do([view] { view->MakeEditable(false); });
	EXPECT_EQ(Picture().Count(BRect(20, 20, 219, 99), kRed), 0);
}


TEST_F(ControlDrawingTest, TypedTextIsDrawnAtOnce)
{
	BTextView* view = Add(new BTextView(
		BRect(20, 20, 219, 99), "text", BRect(4, 4, 195, 75), B_FOLLOW_LEFT_TOP, B_WILL_DRAW));
	Show();
	Do([view] { view->MakeFocus(); });
	const int32 before = DarkPixels(Picture(), BRect(20, 20, 219, 99));
	fRobot->Type("mm");
	const int32 after = DarkPixels(Picture(), BRect(20, 20, 219, 99));
	EXPECT_GT(after, before + 15);
	fRobot->Key("backspace");
	fRobot->Key("backspace");
	EXPECT_EQ(DarkPixels(Picture(), BRect(20, 20, 219, 99)), before);
}


TEST_F(ControlDrawingTest, WindowThatWaitsForAnAlertIsRepainted)
{
	Show();
	RepaintingWindow* window = new RepaintingWindow;
	window->Show();
	Robot robot(window);
	robot.Settle();
	BMessenger(window).SendMessage('Task');
	ASSERT_TRUE(fRobot->WaitForWindow("alert"));
	// The window's own thread waits: no message of it can be waited for.
	const bigtime_t limit = system_time() + 10000000;
	while (window->view->drawn == 0 && system_time() < limit)
		snooze(10000);
	EXPECT_EQ(window->view->drawn, 1);
	fRobot->Key("enter");
	ASSERT_TRUE(fRobot->WaitForNoWindow("alert"));
	window->Lock();
	window->Quit();
}
