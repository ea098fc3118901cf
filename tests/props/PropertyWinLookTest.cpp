// SPDX-License-Identifier: MIT
// What the property window shows: rows, marks, panes, and where they are after the window was resized.

#include <MenuField.h>
#include <MenuItem.h>
#include <PopUpMenu.h>
#include <ScrollBar.h>
#include <ScrollView.h>
#include <TextControl.h>

#include "PropertyWinTest.h"
#include "model/Event.h"
#include "props/StringListProperty.h"
#include "props/StringProperty.h"
#include "props/TabView.h"

namespace {

constexpr rgb_color kWhite = {255, 255, 255, 255};
constexpr rgb_color kSelected = {178, 178, 178, 255};
constexpr rgb_color kLine = {222, 222, 222, 255};
constexpr rgb_color kMark = {108, 108, 108, 255};

class PropertyWinLookTest : public PropertyWinTest {
protected:
	void Resize(float width, float height)
	{
		{
			WindowGuard guard(window);
			window->ResizeTo(width, height);
		}
		robot.Settle();
	}

	/// A view's frame in the window's coordinates.
	BRect FrameOf(const char* view)
	{
		robot.Settle();
		WindowGuard guard(window);
		const BView* found = window->FindView(view);
		if (found == nullptr)
			return BRect();
		BRect frame = found->Bounds();
		found->ConvertToScreen(&frame);
		return window->ConvertFromScreen(frame);
	}

	/// A row's frame in the window's coordinates.
	BRect RowFrame(const char* list, int32 row)
	{
		WindowGuard guard(window);
		BRect frame = List(list)->ItemFrame(row);
		List(list)->ConvertToScreen(&frame);
		return window->ConvertFromScreen(frame);
	}

	void ShowEvents()
	{
		WindowGuard guard(window);
		static_cast<TabView*>(window->FindView("tabView"))->SelectTab(1);
	}

	TProperty* AddProperty(const char* name, const char* value)
	{
		TProperty* property = new TProperty(control.get(), name, value, nullptr, true);
		control->AddProperty(property);
		return property;
	}

	template <class Editor>
	TProperty* AddEdited(const char* name, const char* value)
	{
		TProperty* property = new TProperty(control.get(), name, value, nullptr, true);
		control->AddPropAndEditor(
			property, new Editor(control.get(), property), nullptr, nullptr, true);
		return property;
	}

	std::string PickLabel()
	{
		robot.Settle();
		WindowGuard guard(window);
		return dynamic_cast<BMenuField*>(window->FindView("mfPickEdit"))->MenuItem()->Label();
	}

	int32 CountMarkedPicks()
	{
		robot.Settle();
		WindowGuard guard(window);
		BMenu* menu = dynamic_cast<BMenuField*>(window->FindView("mfPickEdit"))->Menu();
		int32 count = 0;
		for (int32 i = 0; i < menu->CountItems(); i++)
			count += menu->ItemAt(i)->IsMarked() ? 1 : 0;
		return count;
	}
};


/// What is drawn of a row, apart from its texts: the ground between them, the line below, the separator.
void
CheckRow(const WindowPicture& picture, BRect row, float separator, rgb_color ground)
{
	const int32 left = static_cast<int32>(row.left);
	const int32 top = static_cast<int32>(row.top);
	const int32 bottom = static_cast<int32>(row.bottom);
	const int32 middle = static_cast<int32>(row.left + separator);
	EXPECT_TRUE(picture.At(left, top) == ground);
	EXPECT_TRUE(picture.At(left + 2, bottom - 1) == ground);
	EXPECT_TRUE(picture.At(left, bottom) == kLine);
	EXPECT_TRUE(picture.At(static_cast<int32>(row.right), bottom) == kLine);
	EXPECT_EQ(picture.Count(BRect(middle, top, middle, bottom), kLine),
		static_cast<int32>(row.Height()) + 1);
	EXPECT_TRUE(picture.At(middle - 1, top) == ground);
	EXPECT_TRUE(picture.At(middle + 1, top) == ground);
}

} // namespace

TEST_F(PropertyWinLookTest, APropertysRowHasItsGroundItsLinesAndItsSeparator)
{
	ShowControl();
	const BRect first = RowFrame("lvProperties", 0);
	const BRect second = RowFrame("lvProperties", 1);
	const WindowPicture picture = robot.Picture();
	CheckRow(picture, first, 100, kSelected);
	CheckRow(picture, second, 100, kWhite);
	// The name begins 4 pixels from the left, the value 110: nothing is drawn before them.
	EXPECT_EQ(
		picture.Count(BRect(second.left, second.top, second.left + 3, second.bottom - 1), kWhite),
		4 * static_cast<int32>(second.Height()));
	EXPECT_EQ(
		picture.Count(
			BRect(second.left + 101, second.top, second.left + 109, second.bottom - 1), kWhite),
		9 * static_cast<int32>(second.Height()));
	EXPECT_LT(picture.Count(
				  BRect(second.left + 4, second.top, second.left + 60, second.bottom - 1), kWhite),
		57 * static_cast<int32>(second.Height()));
}


TEST_F(PropertyWinLookTest, AnEventsMarkKeepsItsDistanceFromTheRightEdge)
{
	control->EventAt(0)->selected = true;
	ShowControl();
	ShowEvents();
	for (const float width : {200.0f, 340.0f}) {
		Resize(width, 300);
		const BRect row = RowFrame("lvEvents", 0);
		const WindowPicture picture = robot.Picture();
		CheckRow(picture, row, 140, kWhite);
		// Round corners: the middle row of pixels is full.
		const float y = (row.top + row.bottom) / 2;
		EXPECT_EQ(picture.Count(BRect(row.right - 70, y, row.right - 64, y), kMark), 7) << width;
		EXPECT_FALSE(
			picture.At(static_cast<int32>(row.right) - 71, static_cast<int32>(y)) == kMark);
		EXPECT_FALSE(
			picture.At(static_cast<int32>(row.right) - 63, static_cast<int32>(y)) == kMark);
		const int32 middle = static_cast<int32>(row.right) - 67;
		EXPECT_TRUE(picture.At(middle, static_cast<int32>(row.top) + 3) == kMark);
		EXPECT_TRUE(picture.At(middle, static_cast<int32>(row.bottom) - 3) == kMark);
		EXPECT_FALSE(picture.At(middle, static_cast<int32>(row.top) + 2) == kMark);
		EXPECT_FALSE(picture.At(middle, static_cast<int32>(row.bottom) - 2) == kMark);
		// The other row has none.
		const BRect other = RowFrame("lvEvents", 2);
		const float otherY = (other.top + other.bottom) / 2;
		EXPECT_EQ(
			picture.Count(BRect(other.right - 70, otherY, other.right - 64, otherY), kMark), 0);
		// The label stands above the marks.
		const BRect label = FrameOf("lblEventSelected");
		EXPECT_LT(std::abs((label.left + label.right) / 2 - (row.right - 67)), 2) << width;
		EXPECT_LT(label.bottom, row.top);
	}
	EXPECT_EQ(robot.Text("lblEventName"), "Name:");
	EXPECT_EQ(robot.Text("lblEventSelected"), "Selected:");
}


TEST_F(PropertyWinLookTest, ThePanesStayAtTheBottomWhateverTheWindowsSize)
{
	ShowControl();
	for (const BPoint size :
		{BPoint(200, 300), BPoint(420, 500), BPoint(150, 140), BPoint(200, 300)}) {
		Resize(size.x, size.y);
		const BRect page = FrameOf("PropertyView");
		const BRect list = FrameOf("svProperties");
		const BRect pane = FrameOf("String");
		const BRect field = FrameOf("efStringEdit");
		EXPECT_EQ(page.right, size.x - 1);
		EXPECT_EQ(page.bottom, size.y - 1);
		EXPECT_EQ(pane.Height(), 29);
		EXPECT_EQ(pane.bottom, page.bottom);
		EXPECT_EQ(pane.left, page.left);
		EXPECT_EQ(pane.right, page.right);
		EXPECT_LT(list.bottom, pane.top);
		EXPECT_EQ(field.left, pane.left + 5);
		EXPECT_EQ(field.right, pane.right - 5);
		EXPECT_EQ(field.top, pane.top + 5);
		EXPECT_TRUE(pane.Contains(field));
	}
}


TEST_F(PropertyWinLookTest, HiddenPanesFollowTheWindowToo)
{
	ShowControl();
	ShowEvents();
	Resize(320, 400);
	{
		WindowGuard guard(window);
		static_cast<TabView*>(window->FindView("tabView"))->SelectTab(0);
	}
	Select("ViewColor");
	const BRect page = FrameOf("PropertyView");
	const BRect pane = FrameOf("Modal");
	EXPECT_EQ(pane.bottom, page.bottom);
	EXPECT_EQ(pane.right, page.right);
	const BRect button = FrameOf("btnModalEdit");
	EXPECT_EQ(button.right, pane.right - 5);
	EXPECT_GE(button.left, pane.right - 25);
	EXPECT_LT(FrameOf("efModalEdit").right, button.left);
}


TEST_F(PropertyWinLookTest, AWindowWithoutRoomShowsWhatFits)
{
	ShowControl();
	const BRect list = FrameOf("svProperties");
	Resize(20, 10);
	Select("Enabled");
	Resize(200, 300);
	EXPECT_TRUE(IsShown("mfPickEdit") || IsShown("efStringEdit"));
	EXPECT_EQ(FrameOf("String").bottom, FrameOf("PropertyView").bottom);
	EXPECT_EQ(FrameOf("svProperties"), list);
}


TEST_F(PropertyWinLookTest, ManyPropertiesScroll)
{
	while (control->CountProperties() < 60) {
		const std::string name = "Own" + std::to_string(control->CountProperties());
		AddEdited<TStringProperty>(name.c_str(), name.c_str());
	}
	ShowControl();
	{
		WindowGuard guard(window);
		BListView* list = List("lvProperties");
		ASSERT_EQ(list->CountItems(), 60);
		float low, high;
		list->ScrollBar(B_VERTICAL)->GetRange(&low, &high);
		EXPECT_EQ(low, 0);
		EXPECT_EQ(high, list->ItemFrame(59).bottom - list->Bounds().Height());
	}
	Select("Own59");
	EXPECT_EQ(robot.Text("efStringEdit"), "Own59");
	Enter("changed");
	EXPECT_EQ(Value("Own59"), "changed");
	{
		// Where the user has scrolled to stays when a value changes.
		WindowGuard guard(window);
		EXPECT_GT(List("lvProperties")->Bounds().top, 0);
	}
	// Another component begins at its first property.
	const auto other = NewComponent("Other");
	Show(other.get(), surface->surface);
	{
		WindowGuard guard(window);
		EXPECT_EQ(List("lvProperties")->Bounds().top, 0);
		EXPECT_EQ(List("lvProperties")->CurrentSelection(), 0);
	}
	EXPECT_EQ(robot.Text("efStringEdit"), "Other");
	Show(nullptr, nullptr);
}


TEST_F(PropertyWinLookTest, AValueThatIsNoChoiceIsShownButMarkedNowhere)
{
	ShowControl();
	Select("Enabled");
	EXPECT_EQ(PickLabel(), "true");
	EXPECT_EQ(CountMarkedPicks(), 1);
	{
		WindowGuard guard(surface);
		control->FindProperty("Font")->SetValue("a_font");
	}
	Select("Font");
	EXPECT_EQ(PickLabel(), "a_font");
	EXPECT_EQ(CountMarkedPicks(), 0);
	Select("ResizingMode");
	EXPECT_EQ(PickLabel(), Value("ResizingMode"));
	EXPECT_EQ(CountMarkedPicks(), 1);
}


TEST_F(PropertyWinLookTest, APickListWithoutAnEditorSaysSo)
{
	ShowControl();
	{
		WindowGuard guard(window);
		window->SelectEditorFor(control->FindProperty("Label"), nullptr, PET_PICKLIST, false);
		BMenu* menu = dynamic_cast<BMenuField*>(window->FindView("mfPickEdit"))->Menu();
		ASSERT_EQ(menu->CountItems(), 1);
		EXPECT_STREQ(menu->ItemAt(0)->Label(), "No editor!");
		EXPECT_EQ(menu->ItemAt(0)->Message(), nullptr);
		EXPECT_STREQ(dynamic_cast<BMenuField*>(window->FindView("mfPickEdit"))->Label(), "Label:");
	}
}


TEST_F(PropertyWinLookTest, APropertyWithoutAnEditorShowsItsTextAndCannotBeEdited)
{
	AddProperty("Bare", "as it is");
	ShowControl();
	EXPECT_EQ(ShownValue("Bare"), "as it is");
	Select("Bare");
	Invoke("Bare");
	EXPECT_EQ(robot.Text("efStringEdit"), "Control1");
	BMessage edit(PWM_STRING_EDIT);
	BMessenger(window).SendMessage(&edit);
	robot.Settle();
	EXPECT_EQ(Value("Bare"), "as it is");
	EXPECT_EQ(Value("Name"), "Control1");
}


TEST_F(PropertyWinLookTest, AListOfStringsHasItsPane)
{
	AddEdited<TStringListProperty>("Items", "");
	ShowControl();
	Invoke("Items");
	EXPECT_TRUE(IsShown("efListEdit"));
	EXPECT_TRUE(IsShown("btnListEdit"));
	EXPECT_FALSE(IsShown("efStringEdit"));
	EXPECT_EQ(robot.Text("efListEdit"), "(Strings)");
	EXPECT_EQ(FocusName(), "efListEdit");
	EXPECT_TRUE(robot.ClickView("btnListEdit"));
	robot.Settle();
	EXPECT_EQ(Value("Items"), "");
	EXPECT_EQ(ShownValue("Items"), "(Strings)");
}


TEST_F(PropertyWinLookTest, TheModalFieldCannotBeTypedInto)
{
	ShowControl();
	Select("Flags");
	robot.ClickView("efModalEdit");
	robot.Type("x");
	robot.Settle();
	EXPECT_EQ(robot.Text("efModalEdit"), "(Flags)");
}


TEST_F(PropertyWinLookTest, AValueLongerThanTheLimitBeforeIsShownWhole)
{
	const std::string label(300, 'w');
	control->FindProperty("Label")->SetValue(label.c_str());
	ShowControl();
	EXPECT_EQ(robot.Text("efStringEdit"), "Control1"); // at most 32 bytes may be typed
	Select("Label");
	EXPECT_EQ(robot.Text("efStringEdit"), label);
}


TEST_F(PropertyWinLookTest, AStoredNameThatIsTooLongIsShownAsFarAsItMayBeTyped)
{
	control->FindProperty("Name")->SetValue(std::string(100, 'n').c_str());
	ShowControl();
	EXPECT_EQ(robot.Text("efStringEdit"), std::string(32, 'n'));
	EXPECT_EQ(Value("Name"), std::string(100, 'n'));
}


TEST_F(PropertyWinLookTest, AFullValueIsShownAndKept)
{
	// Filled to the last byte: such a value has no end of its own.
	const std::string full(1024, 'v');
	{
		WindowGuard guard(surface);
		control->FindProperty("Label")->Editor()->SetValue(full.c_str(), false);
	}
	ShowControl();
	Select("Label");
	EXPECT_EQ(robot.Text("efStringEdit").substr(0, 1024), full);
	EXPECT_EQ(ShownValue("Label").substr(0, 1024), full);
}


TEST_F(PropertyWinLookTest, LongNamesLeaveTheValuesAlone)
{
	const TProperty* property =
		AddEdited<TStringProperty>("APropertyWithThirtyOneCharacters", "value");
	ShowControl();
	Select("Name");
	PlaceOf("lvProperties", control->CountProperties() - 1);
	robot.Settle();
	const BRect row = RowFrame("lvProperties", control->CountProperties() - 1);
	const WindowPicture picture = robot.Picture();
	CheckRow(picture, row, 100, kWhite);
	EXPECT_EQ(picture.Count(BRect(row.left + 101, row.top, row.left + 109, row.bottom - 1), kWhite),
		9 * static_cast<int32>(row.Height()));
	Select(property->Name());
	EXPECT_LT(FrameOf("efStringEdit").left, FrameOf("String").right - 60);
}
