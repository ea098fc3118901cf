// SPDX-License-Identifier: MIT
// Tests of the views that the components of generated programs are made of.

#include <gtest/gtest.h>

#include <Button.h>
#include <Message.h>
#include <Window.h>

#include <Ormi.h>

#include "EventFormFixture.h"
#include "support/Printers.h"

namespace {

/// An item that tells when it is deleted.
class CountedItem : public BStringItem {
public:
	explicit CountedItem(int* deletions)
		: BStringItem("counted"),
		  fDeletions(deletions)
	{
	}

	~CountedItem() { (*fDeletions)++; }

private:
	int* fDeletions;
};


std::string
Shown(const std::vector<Ormi::item_text>& items)
{
	std::string text;
	for (const Ormi::item_text& item : items)
		text += std::to_string(item.level) + item.label.String() + ";";
	return text;
}


/// "A(B,-,C),D": submenus in brackets, "-" for lines.
std::string
Shown(const BMenu* menu)
{
	std::string text;
	for (int32 i = 0; i < menu->CountItems(); i++) {
		const BMenuItem* item = menu->ItemAt(i);
		text += text.empty() ? "" : ",";
		text += dynamic_cast<const BSeparatorItem*>(item) != nullptr ? "-" : item->Label();
		if (item->Submenu() != nullptr)
			text += "(" + Shown(item->Submenu()) + ")";
	}
	return text;
}

} // namespace

TEST(ItemTextTest, ItemsAreDividedByBarsAndLieDeeperByArrows)
{
	const struct {
		const char* text;
		const char* items;
	} kCases[] = {
		{nullptr, ""},
		{"", ""},
		{"One", "0One;"},
		{"One|Two", "0One;0Two;"},
		{" One | Two ", "0One;0Two;"},
		{"One||Two|", "0One;0;0Two;0;"},
		{"A|>B|>>C|>D|E", "0A;1B;2C;1D;0E;"},
		{"A|> B|> > C", "0A;1B;2C;"},
		{">A|>>>B|>>>>C", "0A;1B;2C;"},
		{"A|>>>B|>C", "0A;1B;1C;"},
		{"|", "0;0;"},
		{">", "0;"},
	};
	for (const auto& row : kCases)
		EXPECT_EQ(Shown(Ormi::ParseItems(row.text)), row.items) << (row.text ? row.text : "null");
}


TEST(MenuItemsTest, DeeperItemsMakeSubmenusAndDashesLines)
{
	const struct {
		const char* text;
		const char* menu;
	} kCases[] = {
		{"", ""},
		{"A|-|B", "A,-,B"},
		{"File|>Open|>-|>More|>>Quit|Edit|>Copy", "File(Open,-,More(Quit)),Edit(Copy)"},
		{"-|>A", "-(A)"},
	};
	for (const auto& row : kCases) {
		BMenu menu("menu");
		Ormi::AddMenuItems(&menu, Ormi::ParseItems(row.text));
		// An item that leads to a menu is no line, whatever it is called.
		EXPECT_EQ(Shown(&menu), row.menu) << row.text;
	}
}


class ViewsTest : public EventFormTest {
protected:
	void SetUp() override
	{
		EventFormTest::SetUp();
		Open();
	}
};


TEST_F(ViewsTest, AListDeletesTheItemsThatAreInIt)
{
	int deletions = 0;
	CountedItem* removed = new CountedItem(&deletions);
	{
		Ormi::ItemList<BListView> list(BRect(0, 0, 99, 99), "list");
		list.AddItem(new CountedItem(&deletions));
		list.SetItems("One|Two");
		EXPECT_EQ(deletions, 1);
		EXPECT_EQ(list.CountItems(), 2);
		list.AddItem(removed);
		list.AddItem(new CountedItem(&deletions));
		list.RemoveItem(removed);
	}
	EXPECT_EQ(deletions, 2);
	delete removed;
}


TEST_F(ViewsTest, AnOutlineDeletesItsHiddenItemsToo)
{
	int deletions = 0;
	{
		Ormi::ItemList<BOutlineListView> list(BRect(0, 0, 99, 99), "list");
		list.SetItems("A|>B|C");
		EXPECT_EQ(list.FullListCountItems(), 3);
		EXPECT_EQ(list.FullListItemAt(1)->OutlineLevel(), 1u);
		list.AddUnder(new CountedItem(&deletions), list.FullListItemAt(0));
		list.Collapse(list.FullListItemAt(0));
	}
	EXPECT_EQ(deletions, 1);
}


TEST_F(ViewsTest, AListTellsOfSelectionsAndInvocations)
{
	TListView<TEventForm>* list = nullptr;
	Locked([&] {
		list = new TListView<TEventForm>(fForm, BRect(10, 130, 100, 190), "List");
		fForm->FormView()->AddChild(list);
		list->SetItems("One|Two");
		list->OnSelect = &TEventForm::CheckBox1Change;
		list->OnInvoke = &TEventForm::Box1Click;
	});
	TakeEvents();
	Locked([&] { list->Select(1); });
	EXPECT_EQ(TakeEvents().size(), 1u);
	Locked([&] { list->Invoke(); });
	EXPECT_EQ(Count(TakeEvents(), "Box1Click"), 1);
}


TEST_F(ViewsTest, AMenuBarTellsOfTheItemThatIsStillThere)
{
	TMenuBar<TEventForm>* bar = nullptr;
	Locked([&] {
		bar = new TMenuBar<TEventForm>(fForm, BRect(0, 0, 299, 24), "Menus");
		fForm->FormView()->AddChild(bar);
		EXPECT_EQ(bar->Frame(), BRect(0, 0, 299, 24));
		bar->SetItems("File|>Open|>Close");
	});
	BMessage chosen(Ormi::kMenuItemChosen);
	Locked([&] { chosen.AddPointer("source", bar->SubmenuAt(0)->ItemAt(1)); });
	EXPECT_NE(Ormi::ChosenMenuItem(bar, &chosen), nullptr);
	Locked([&] { bar->SetItems("Edit"); });
	EXPECT_EQ(Ormi::ChosenMenuItem(bar, &chosen), nullptr);
	const BMessage other('oths');
	EXPECT_EQ(Ormi::ChosenMenuItem(bar, &other), nullptr);
}


TEST_F(ViewsTest, AMenuFieldShowsTheSelectedItem)
{
	Locked([&] {
		TMenuField<TEventForm>* field =
			new TMenuField<TEventForm>(fForm, BRect(10, 130, 100, 170), "Field", "");
		fForm->FormView()->AddChild(field);
		EXPECT_EQ(field->Frame(), BRect(10, 130, 100, 170));
		EXPECT_EQ(field->Selected(), -1);
		field->SetItems("Red|Green|Blue");
		EXPECT_EQ(field->Selected(), 0);
		field->SetSelected(2);
		EXPECT_EQ(field->Selected(), 2);
		field->SetSelected(9);
		EXPECT_EQ(field->Selected(), 2);
		field->SetItems("");
		EXPECT_EQ(field->Selected(), -1);
	});
}


TEST_F(ViewsTest, ASlidersLimitsGiveWayToEachOther)
{
	Ormi::RangeSlider slider(BRect(0, 0, 99, 39), "slider", "");
	int32 minimum;
	int32 maximum;
	slider.SetMinimum(200);
	slider.GetLimits(&minimum, &maximum);
	EXPECT_EQ(minimum, 200);
	EXPECT_EQ(maximum, 200);
	slider.SetMaximum(-5);
	slider.GetLimits(&minimum, &maximum);
	EXPECT_EQ(minimum, -5);
	EXPECT_EQ(maximum, -5);
}


TEST_F(ViewsTest, AStatusBarKeepsItsOtherSettingsAndItsFrame)
{
	Locked([&] {
		TStatusBar<TEventForm>* bar =
			new TStatusBar<TEventForm>(fForm, BRect(10, 130, 109, 189), "Bar");
		fForm->FormView()->AddChild(bar);
		bar->SetMaxValue(50);
		bar->SetText("text");
		bar->SetTrailingText("trailing");
		bar->SetValue(20);
		bar->SetLabel("label");
		bar->SetTrailingLabel("end");
		bar->SetBarHeight(30);
		bar->SetFontSize(20);
		EXPECT_EQ(bar->MaxValue(), 50);
		EXPECT_EQ(bar->CurrentValue(), 20);
		EXPECT_STREQ(bar->Text(), "text");
		EXPECT_STREQ(bar->TrailingText(), "trailing");
		EXPECT_STREQ(bar->Label(), "label");
		EXPECT_STREQ(bar->TrailingLabel(), "end");
		EXPECT_EQ(bar->Frame(), BRect(10, 130, 109, 189));
	});
}


TEST_F(ViewsTest, AComponentKeepsItsFrameWhateverItsFont)
{
	const BRect frame(10, 130, 109, 189);
	Locked([&] {
		BView* const views[] = {new TColorControl<TEventForm>(fForm, frame, "c"),
			new TTextControl<TEventForm>(fForm, frame, "t", "", ""),
			new TMenuBar<TEventForm>(fForm, frame, "m"),
			new TMenuField<TEventForm>(fForm, frame, "f", ""),
			new TStatusBar<TEventForm>(fForm, frame, "s"),
			new TSlider<TEventForm>(fForm, frame, "l", "")};
		for (BView* view : views) {
			fForm->FormView()->AddChild(view);
			view->SetFont(be_bold_font);
			view->SetFontSize(24);
			EXPECT_EQ(view->Frame(), frame) << view->Name();
		}
	});
}


TEST_F(ViewsTest, TheDesignersFlagsLeaveThoseThatAViewNeeds)
{
	Locked([&] {
		TTextView<TEventForm>* text = new TTextView<TEventForm>(fForm, BRect(0, 0, 50, 50), "text");
		fForm->FormView()->AddChild(text);
		text->SetFlags(B_WILL_DRAW);
		EXPECT_NE(text->Flags() & B_PULSE_NEEDED, 0u);
		EXPECT_EQ(text->Flags() & B_NAVIGABLE, 0u);
	});
}


TEST_F(ViewsTest, AScrollViewLiesInItsFrameAndIsFilledByAList)
{
	Locked([&] {
		const BRect frame(20, 30, 119, 109);
		for (border_style border : {B_FANCY_BORDER, B_PLAIN_BORDER, B_NO_BORDER}) {
			for (int bars = 0; bars < 4; bars++) {
				TScrollView<TEventForm>* scroll = new TScrollView<TEventForm>(
					fForm, frame, "Scroll", (bars & 1) != 0, (bars & 2) != 0, border);
				fForm->FormView()->AddChild(scroll);
				EXPECT_EQ(scroll->Frame(), frame);
				TListView<TEventForm>* list =
					new TListView<TEventForm>(fForm, BRect(5, 5, 20, 20), "List");
				scroll->AddChild(list);
				const BRect inside =
					Ormi::ScrolledFrame(frame, (bars & 1) != 0, (bars & 2) != 0, border);
				EXPECT_EQ(list->Frame(), inside) << border << " " << bars;
				EXPECT_EQ(scroll->Target(), list);
				scroll->RemoveSelf();
				delete scroll;
			}
		}
	});
}


TEST_F(ViewsTest, AScrollViewScrollsAPageAsLargeAsWhatLiesOnIt)
{
	TScrollView<TEventForm>* scroll = nullptr;
	Locked([&] {
		scroll = new TScrollView<TEventForm>(
			fForm, BRect(20, 30, 119, 109), "Scroll", true, true, B_FANCY_BORDER);
		fForm->FormView()->AddChild(scroll);
		TButton<TEventForm>* button =
			new TButton<TEventForm>(fForm, BRect(12, 12, 202, 152), "In", "In");
		scroll->AddChild(button);
		EXPECT_EQ(button->Frame(), BRect(10, 10, 200, 150));
		EXPECT_EQ(button->Parent(), scroll->Page());
		float least;
		float most;
		scroll->ScrollBar(B_HORIZONTAL)->GetRange(&least, &most);
		EXPECT_EQ(most, 200 - scroll->Page()->Bounds().Width());
		scroll->ScrollBar(B_VERTICAL)->GetRange(&least, &most);
		EXPECT_EQ(most, 150 - scroll->Page()->Bounds().Height());
		scroll->ResizeTo(400, 300);
	});
	Settle(fForm);
	Locked([&] {
		float least;
		float most;
		scroll->ScrollBar(B_HORIZONTAL)->GetRange(&least, &most);
		EXPECT_EQ(most, 0);
	});
}


TEST_F(ViewsTest, ATabViewPutsViewsOnPages)
{
	Locked([&] {
		TTabView<TEventForm>* tabs = new TTabView<TEventForm>(fForm, BRect(0, 0, 199, 149), "Tabs");
		fForm->FormView()->AddChild(tabs);
		tabs->SetTabs("One|Two");
		tabs->OnChange = &TEventForm::Box1Click;
		EXPECT_EQ(tabs->Selection(), 0);
		TButton<TEventForm>* button =
			new TButton<TEventForm>(fForm, BRect(20, 50, 90, 74), "In", "In");
		tabs->AddChild(button);
		EXPECT_EQ(button->Parent(), tabs->Page(0));
		const BPoint corner = tabs->ContainerView()->Frame().LeftTop();
		EXPECT_EQ(button->Frame().LeftTop(), BPoint(20, 50) - corner);
		tabs->SetPage(button, 1);
		EXPECT_EQ(button->Parent(), tabs->Page(1));
		EXPECT_EQ(button->Window(), nullptr);
		tabs->Select(1);
		EXPECT_EQ(button->Window(), fForm);
		tabs->SetPage(button, 9);
		EXPECT_EQ(button->Parent(), tabs->Page(1));
		tabs->SetPage(button, -1);
		EXPECT_EQ(button->Parent(), tabs->Page(0));
		tabs->SetTabs("Only");
		EXPECT_EQ(tabs->CountTabs(), 1);
		EXPECT_EQ(tabs->Selection(), 0);
	});
	EXPECT_EQ(Count(TakeEvents(), "Box1Click"), 2);
}
