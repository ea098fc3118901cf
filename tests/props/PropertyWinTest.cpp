// SPDX-License-Identifier: MIT

#include "props/PropertyWin.h"

#include <Entry.h>
#include <OS.h>
#include <Screen.h>

#include "PropertyWinTest.h"
#include "model/Event.h"
#include "props/EventListItem.h"
#include "support/CapturedOutput.h"

TEST_F(PropertyWinTest, OpensAtItsPlaceOnTheScreen)
{
	WindowGuard guard(window);
	const BRect screen = BScreen(window).Frame();
	EXPECT_EQ(window->Frame(),
		BRect(screen.left + 30, screen.top + 150, screen.left + 230, screen.top + 450));
	EXPECT_STREQ(window->Title(), "Properties");
	EXPECT_TRUE((window->Flags() & B_NOT_ZOOMABLE) != 0);
}


TEST_F(PropertyWinTest, TheStoredFrameWins)
{
	AppSettings.SetRect("PropertyWinFrame", BRect(40, 60, 340, 460));
	PropertyWin* other = new PropertyWin;
	EXPECT_EQ(other->Frame(), BRect(40, 60, 340, 460));
	other->Quit();
}


TEST_F(PropertyWinTest, ClosingHidesAndKeepsTheContents)
{
	ShowControl();
	BMessenger(window).SendMessage(B_QUIT_REQUESTED);
	ASSERT_TRUE(robot.WaitForNoWindow("Properties"));
	BRect frame;
	EXPECT_NE(AppSettings.FindRect("PropertyWinFrame", &frame), B_OK);
	window->Show();
	ASSERT_TRUE(robot.WaitForWindow("Properties"));
	EXPECT_GE(RowOf("Name"), 0);
}


TEST_F(PropertyWinTest, AllowedToCloseItStoresItsFrame)
{
	PropertyWin* other = new PropertyWin;
	const BRect frame = other->Frame();
	other->OKToClose(true);
	EXPECT_TRUE(other->QuitRequested());
	BRect stored;
	ASSERT_EQ(AppSettings.FindRect("PropertyWinFrame", &stored), B_OK);
	EXPECT_EQ(stored, frame);
	other->Quit();
}


TEST_F(PropertyWinTest, ListsPropertiesAndEventsInTheComponentsOrder)
{
	ShowControl();
	WindowGuard guard(window);
	BListView* properties = List("lvProperties");
	ASSERT_EQ(properties->CountItems(), control->CountProperties());
	for (int32 i = 0; i < properties->CountItems(); i++) {
		EXPECT_EQ(static_cast<TPropertyListItem*>(properties->ItemAt(i))->Property(),
			control->PropertyAt(i));
	}
	BListView* events = List("lvEvents");
	ASSERT_EQ(events->CountItems(), control->CountEvents());
	for (int32 i = 0; i < events->CountItems(); i++)
		EXPECT_EQ(static_cast<TEventListItem*>(events->ItemAt(i))->Event(), control->EventAt(i));
	EXPECT_EQ(properties->CurrentSelection(), 0);
	EXPECT_EQ(events->CurrentSelection(), -1);
}


TEST_F(PropertyWinTest, TheFirstPropertysEditorIsShown)
{
	ShowControl();
	EXPECT_TRUE(IsShown("efStringEdit"));
	EXPECT_FALSE(IsShown("efModalEdit"));
	EXPECT_FALSE(IsShown("mfPickEdit"));
	EXPECT_EQ(robot.Text("efStringEdit"), "Control1");
}


TEST_F(PropertyWinTest, TheSameComponentAgainKeepsTheSelection)
{
	ShowControl();
	Select("Left");
	ShowControl();
	WindowGuard guard(window);
	const int32 row = List("lvProperties")->CurrentSelection();
	EXPECT_STREQ(
		static_cast<TPropertyListItem*>(List("lvProperties")->ItemAt(row))->Name(), "Left");
}


TEST_F(PropertyWinTest, NoComponentEmptiesBothLists)
{
	ShowControl();
	Show(nullptr, nullptr);
	WindowGuard guard(window);
	EXPECT_TRUE(List("lvProperties")->IsEmpty());
	EXPECT_TRUE(List("lvEvents")->IsEmpty());
	EXPECT_EQ(window->Component(), nullptr);
}


TEST_F(PropertyWinTest, AComponentWithoutPropertiesLeavesThePaneAsItWas)
{
	ShowControl();
	Select("Left");
	TComponent bare(nullptr, nullptr, CT_VISUAL);
	bare.ClearProperties(true);
	Show(&bare, surface->surface);
	EXPECT_TRUE(IsShown("efStringEdit"));
	{
		WindowGuard guard(window);
		EXPECT_TRUE(List("lvProperties")->IsEmpty());
		EXPECT_EQ(List("lvProperties")->CurrentSelection(), -1);
	}
	Show(nullptr, nullptr);
}


TEST_F(PropertyWinTest, ATypedValueAsksThenStoresThenTells)
{
	ShowControl();
	Select("Top");
	control->notes.clear();
	Enter("123");
	ASSERT_GE(control->notes.size(), 2u);
	EXPECT_EQ(control->notes[0], "asked Top 0>123 has 0");
	EXPECT_EQ(control->notes[1], "told Top 123 has 123");
	EXPECT_EQ(Value("Top"), "123");
	EXPECT_EQ(ShownValue("Top"), "123");
	WindowGuard guard(surface);
	EXPECT_EQ(control->DTView()->Frame().top, 123);
}


TEST_F(PropertyWinTest, ARefusedValueIsDropped)
{
	ShowControl();
	Select("Top");
	control->refuses = true;
	Enter("123");
	EXPECT_EQ(Value("Top"), "0");
	EXPECT_EQ(ShownValue("Top"), "0");
}


TEST_F(PropertyWinTest, AComponentMayChangeOtherPropertiesWhileOneIsSet)
{
	ShowControl();
	Select("Left");
	Enter("40");
	EXPECT_EQ(ShownValue("Left"), "40");
	EXPECT_EQ(ShownValue("Top"), "77");
}


TEST_F(PropertyWinTest, WithoutADesignViewNoTextIsApplied)
{
	Show(control.get(), nullptr);
	Select("Top");
	CapturedOutput output;
	Enter("123");
	EXPECT_NE(output.Text().find("Unable to lock the design view\n"), std::string::npos);
	EXPECT_EQ(Value("Top"), "0");
}


TEST_F(PropertyWinTest, APickNeedsNoDesignView)
{
	Show(control.get(), nullptr);
	Invoke("Enabled");
	EXPECT_EQ(Value("Enabled"), "false");
}


TEST_F(PropertyWinTest, TextIsLimitedAsTheEditorSays)
{
	ShowControl();
	Select("Name");
	Enter(std::string(40, 'n').c_str());
	EXPECT_EQ(Value("Name"), std::string(32, 'n'));
	Select("Top");
	Enter(std::string(70, '1').c_str());
	EXPECT_EQ(Value("Top"), std::string(63, '1'));
}


TEST_F(PropertyWinTest, ADoubleClickFlipsABoolean)
{
	ShowControl();
	EXPECT_EQ(Value("Enabled"), "true");
	Invoke("Enabled");
	EXPECT_EQ(Value("Enabled"), "false");
	EXPECT_EQ(ShownValue("Enabled"), "false");
	Invoke("Enabled");
	EXPECT_EQ(Value("Enabled"), "true");
}


TEST_F(PropertyWinTest, ADoubleClickOnAnotherPickListFocusesItOnly)
{
	ShowControl();
	const std::string before = Value("ResizingMode");
	Invoke("ResizingMode");
	EXPECT_TRUE(IsShown("mfPickEdit"));
	EXPECT_EQ(Value("ResizingMode"), before);
	EXPECT_EQ(ShownValue("ResizingMode"), "(Pick List)");
}


TEST_F(PropertyWinTest, ADoubleClickOnATextFocusesItsField)
{
	ShowControl();
	Invoke("Label");
	EXPECT_EQ(FocusName(), "efStringEdit");
}


TEST_F(PropertyWinTest, ADoubleClickOnFlagsOpensTheirDialog)
{
	ShowControl();
	Invoke("Flags");
	ASSERT_TRUE(robot.WaitForWindow("View Flags"));
	EXPECT_TRUE(robot.ClickView("Pulse Needed"));
	EXPECT_TRUE(robot.ClickView("btnOK"));
	ASSERT_TRUE(robot.WaitForNoWindow("View Flags"));
	EXPECT_NE(Value("Flags").find("B_PULSE_NEEDED"), std::string::npos);
	ASSERT_TRUE(robot.WaitForWindow("Properties"));
	EXPECT_EQ(ShownValue("Flags"), "(Flags)");
	EXPECT_EQ(robot.Text("efModalEdit"), "(Flags)");
}


TEST_F(PropertyWinTest, TheButtonOpensTheDialogToo)
{
	ShowControl();
	Select("ViewColor");
	EXPECT_TRUE(robot.ClickView("btnModalEdit"));
	ASSERT_TRUE(robot.WaitForWindow("Color"));
	EXPECT_TRUE(robot.ClickView("btnCancel"));
	ASSERT_TRUE(robot.WaitForNoWindow("Color"));
}


TEST_F(PropertyWinTest, EnterOnARowInvokesIt)
{
	ShowControl();
	Select("Enabled");
	robot.Key("enter");
	robot.Settle();
	EXPECT_EQ(Value("Enabled"), "false");
}


TEST_F(PropertyWinTest, ADoubleClickOnAnEventTicksIt)
{
	ShowControl();
	robot.ClickView("tabView");
	{
		WindowGuard guard(window);
		window->FindView("tabView")->MakeFocus(true);
	}
	robot.Key("right");
	robot.Settle();
	{
		WindowGuard guard(surface);
		control->SetModified(false);
		EXPECT_FALSE(control->EventAt(1)->selected);
	}
	robot.Click(PlaceOf("lvEvents", 1), 2);
	robot.Settle();
	{
		WindowGuard guard(surface);
		EXPECT_TRUE(control->EventAt(1)->selected);
		EXPECT_TRUE(control->Modified());
	}
	robot.Click(PlaceOf("lvEvents", 1), 2);
	robot.Settle();
	WindowGuard guard(surface);
	EXPECT_FALSE(control->EventAt(1)->selected);
}


TEST_F(PropertyWinTest, ARefreshShowsWhatHasChanged)
{
	ShowControl();
	Select("Top");
	{
		WindowGuard guard(surface);
		control->FindProperty("Top")->Editor()->SetValue("55", false);
	}
	window->UpdateDisplayValues();
	EXPECT_EQ(ShownValue("Top"), "55");
	EXPECT_EQ(robot.Text("efStringEdit"), "55");
}


TEST_F(PropertyWinTest, TheComponentMayGoWhileItsEditorIsOpen)
{
	ShowControl();
	Invoke("Label");
	robot.Type("typed");
	{
		WindowGuard guard(window);
		window->SetComponent(nullptr);
	}
	{
		WindowGuard guard(surface);
		control.reset();
	}
	robot.Key("enter");
	robot.Settle();
	EXPECT_TRUE(IsShown("efStringEdit"));
}


TEST_F(PropertyWinTest, DroppedFilesAreNotTaken)
{
	CapturedOutput output;
	BMessage drop(B_SIMPLE_DATA);
	entry_ref ref(1, 2, "name");
	drop.AddRef("refs", &ref);
	BMessage reply;
	BMessenger(window).SendMessage(&drop, &reply);
	EXPECT_NE(reply.what, static_cast<uint32>(B_MESSAGE_NOT_UNDERSTOOD));
}


TEST_F(PropertyWinTest, ValuesThatDoNotFitEndInTheMiddleOfTheirColumn)
{
	control->SetPropertyValue("Label", std::string(200, 'W').c_str());
	control->FindProperty("Label")->SetValue(std::string(200, 'W').c_str());
	ShowControl();
	Select("Label");
	EXPECT_EQ(robot.Text("efStringEdit"), std::string(200, 'W'));
	// Between the text's end and the scroll bar the row shows its ground.
	const BPoint place = PlaceOf("lvProperties", RowOf("Label"));
	float right;
	{
		WindowGuard guard(window);
		BListView* list = List("lvProperties");
		BPoint corner(list->Bounds().right, 0);
		list->ConvertToScreen(&corner);
		right = window->ConvertFromScreen(corner).x;
	}
	robot.Settle();
	const WindowPicture picture = robot.Picture();
	const rgb_color ground = {178, 178, 178, 255};
	EXPECT_EQ(picture.Count(BRect(right - 2, place.y - 3, right, place.y + 3), ground), 21);
}
