// SPDX-License-Identifier: MIT

#include "props/PropertyWin.h"

#include <vector>

#include <Entry.h>
#include <ListView.h>
#include <OS.h>
#include <Screen.h>

#include "WindowTest.h"
#include "app/Preferences.h"
#include "app/WindowGuard.h"
#include "model/AppComponent.h"
#include "model/Event.h"
#include "props/EventListItem.h"
#include "props/PropertyListItem.h"
#include "props/StringProperty.h"
#include "support/CapturedOutput.h"

namespace {

/// Notes in which order an edit asks and tells it.
class WatchfulControl : public PlainControl {
public:
	using PlainControl::PlainControl;

	bool PropertyModified(const char* name, const char* oldValue, const char* newValue) override
	{
		notes.push_back(std::string("asked ") + name + " " + oldValue + ">" + newValue + " has "
			+ FindProperty(name)->Value());
		return PlainControl::PropertyModified(name, oldValue, newValue);
	}

	void SetPropertyValue(const char* name, const char* value) override
	{
		notes.push_back(std::string("told ") + name + " " + value + " has "
			+ (FindProperty(name) != nullptr ? FindProperty(name)->Value() : ""));
		PlainControl::SetPropertyValue(name, value);
		if (strcmp(name, "Left") == 0)
			FindProperty("Top")->Editor()->SetValue("77", true);
	}

	std::vector<std::string> notes;
};


class PropertyWinTest : public WindowTest {
protected:
	void SetUp() override
	{
		AppSettings.LeaveFileAlone();
		AppSettings.MakeEmpty();
		surface = new SurfaceWindow;
		control = std::make_unique<WatchfulControl>(surface->surface);
		surface->Show();
		window = new PropertyWin;
		window->Show();
		ASSERT_TRUE(robot.WaitForWindow("Properties"));
	}

	void TearDown() override
	{
		{
			WindowGuard guard(window);
			window->SetComponent(nullptr);
			window->SetDesignView(nullptr);
		}
		QuitWindow(surface);
		QuitWindow(window);
		control.reset();
	}

	void ShowControl() { Show(control.get(), surface->surface); }

	void Show(TComponent* component, BView* designView)
	{
		{
			WindowGuard guard(window);
			ASSERT_TRUE(guard.IsLocked());
			window->SetComponent(component);
			window->SetDesignView(designView);
		}
		robot.Settle();
	}

	BListView* List(const char* name) { return dynamic_cast<BListView*>(window->FindView(name)); }

	int32 RowOf(const char* property)
	{
		WindowGuard guard(window);
		BListView* list = List("lvProperties");
		for (int32 i = 0; i < list->CountItems(); i++) {
			const auto* row = static_cast<TPropertyListItem*>(list->ItemAt(i));
			if (strcmp(row->Name(), property) == 0)
				return i;
		}
		return -1;
	}

	std::string ShownValue(const char* property)
	{
		robot.Settle();
		const int32 row = RowOf(property);
		WindowGuard guard(window);
		auto* item = static_cast<TPropertyListItem*>(List("lvProperties")->ItemAt(row));
		return item != nullptr ? item->DisplayValue() : "?";
	}

	/// The middle of a list's row, in the window's coordinates; the list is scrolled to it.
	BPoint PlaceOf(const char* listName, int32 row)
	{
		WindowGuard guard(window);
		BListView* list = List(listName);
		list->ScrollTo(row);
		const BRect frame = list->ItemFrame(row);
		BPoint place(frame.left + 20, (frame.top + frame.bottom) / 2);
		list->ConvertToScreen(&place);
		return window->ConvertFromScreen(place);
	}

	void Select(const char* property)
	{
		robot.Click(PlaceOf("lvProperties", RowOf(property)));
		robot.Settle();
	}

	void Invoke(const char* property)
	{
		robot.Click(PlaceOf("lvProperties", RowOf(property)), 2);
		robot.Settle();
	}

	/// Types \a text in place of what the shown string pane has, and presses Enter.
	void Enter(const char* text)
	{
		robot.ClickView("efStringEdit");
		robot.Key("command+a");
		robot.Type(text);
		robot.Key("enter");
		robot.Settle();
	}

	std::string Value(const char* name)
	{
		WindowGuard guard(surface);
		return control->Value(name);
	}

	bool IsShown(const char* view)
	{
		robot.Settle();
		WindowGuard guard(window);
		return !window->FindView(view)->IsHidden();
	}

	std::string FocusName()
	{
		robot.Settle();
		WindowGuard guard(window);
		BView* focus = window->CurrentFocus();
		while (focus != nullptr && focus->Name() != nullptr && strncmp(focus->Name(), "_", 1) == 0)
			focus = focus->Parent();
		return focus != nullptr && focus->Name() != nullptr ? focus->Name() : "";
	}

	SurfaceWindow* surface = nullptr;
	PropertyWin* window = nullptr;
	std::unique_ptr<WatchfulControl> control;
	Robot robot;
};

} // namespace

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


TEST_F(PropertyWinTest, BothWindowsMayReachForEachOther)
{
	ShowControl();
	const bigtime_t end = system_time() + 1000000;
	std::atomic<bool> done = false;
	struct job {
		SurfaceWindow* surface;
		PropertyWin* window;
		WatchfulControl* control;
		std::atomic<bool>* done;
	} work = {surface, window, control.get(), &done};
	// As the design form does while a component is dragged and clicked.
	thread_id thread = spawn_thread(
		[](void* data) -> int32 {
			job* work = static_cast<job*>(data);
			for (int32 i = 0; !*work->done; i++) {
				WindowGuard guard(work->surface);
				const std::string text = std::to_string(i % 100);
				work->control->FindProperty("Top")->Editor()->SetValue(text.c_str(), false);
				work->window->UpdateDisplayValues();
				WindowGuard inner(work->window);
				if (i % 16 == 0)
					work->window->SetComponent(nullptr);
				else
					work->window->SetComponent(work->control);
			}
			return 0;
		},
		"design", B_NORMAL_PRIORITY, &work);
	resume_thread(thread);
	for (int32 i = 0; system_time() < end; i++) {
		BMessage edit(i % 2 == 0 ? PWM_STRING_EDIT : PWM_PICK);
		edit.AddString("caption", "true");
		BMessage reply;
		ASSERT_EQ(BMessenger(window).SendMessage(&edit, &reply, 10000000, 10000000), B_OK);
	}
	done = true;
	int32 status;
	wait_for_thread(thread, &status);
	ShowControl();
	EXPECT_EQ(ShownValue("Top"), Value("Top"));
}
