// SPDX-License-Identifier: MIT
// Menus and items as lists: what they hold, who owns it, and what their states mean.
#include <memory>

#include <gtest/gtest.h>

#include <List.h>
#include <MenuBar.h>
#include <MenuField.h>
#include <MenuItem.h>
#include <MessageQueue.h>
#include <PopUpMenu.h>

#include "ControlsFixture.h"

namespace {

/// Counts those that exist.
class CountedItem : public BMenuItem {
public:
	explicit CountedItem(const char* label, BMessage* message = nullptr)
		: BMenuItem(label, message)
	{
		sAlive++;
	}
	~CountedItem() override { sAlive--; }

	using BMenuItem::ContentLocation;
	using BMenuItem::GetContentSize;
	using BMenuItem::Invoke;

	static int32 sAlive;
};

int32 CountedItem::sAlive = 0;


class MenuTest : public ControlsTest {
protected:
	MenuTest() { CountedItem::sAlive = 0; }

	static std::string Labels(const BMenu& menu)
	{
		std::string labels;
		for (int32 i = 0; i < menu.CountItems(); i++)
			labels += std::string(i > 0 ? " " : "") + menu.ItemAt(i)->Label();
		return labels;
	}

	static void Fill(BMenu& menu)
	{
		for (const char* label : {"a", "b", "c", "d"})
			menu.AddItem(new CountedItem(label));
	}
};


int
Backwards(const BMenuItem* a, const BMenuItem* b)
{
	return strcmp(b->Label(), a->Label());
}

} // namespace


TEST_F(MenuTest, ItemsKeepTheirOrder)
{
	BMenu menu("menu");
	Fill(menu);
	BMenuItem* item = new CountedItem("x");
	EXPECT_TRUE(menu.AddItem(item, 1));
	EXPECT_EQ(Labels(menu), "a x b c d");
	EXPECT_EQ(menu.IndexOf(item), 1);
	EXPECT_EQ(item->Menu(), &menu);
	EXPECT_TRUE(menu.SwapItems(0, 4));
	EXPECT_EQ(Labels(menu), "d x b c a");
	EXPECT_TRUE(menu.MoveItem(0, 3));
	EXPECT_EQ(Labels(menu), "x b c d a");
	EXPECT_TRUE(menu.MoveItem(4, 1));
	EXPECT_EQ(Labels(menu), "x a b c d");
	menu.SortItems(Backwards);
	EXPECT_EQ(Labels(menu), "x d c b a");
}


TEST_F(MenuTest, WhatCannotBeAddedChangesNothing)
{
	BMenu menu("menu");
	BMenu other("other");
	Fill(menu);
	EXPECT_FALSE(menu.AddItem(static_cast<BMenuItem*>(nullptr)));
	EXPECT_FALSE(menu.AddItem(static_cast<BMenu*>(nullptr)));
	EXPECT_FALSE(other.AddItem(menu.ItemAt(0))) << "it is another menu's";
	CountedItem loose("loose");
	EXPECT_FALSE(menu.AddItem(&loose, 5));
	EXPECT_FALSE(menu.AddItem(&loose, -1));
	EXPECT_FALSE(menu.AddItem(&loose, BRect(0, 0, 9, 9))) << "only a matrix has places";
	EXPECT_EQ(loose.Menu(), nullptr);
	EXPECT_FALSE(menu.SwapItems(0, 4));
	EXPECT_FALSE(menu.MoveItem(-1, 0));
	EXPECT_EQ(Labels(menu), "a b c d");
	EXPECT_EQ(menu.ItemAt(-1), nullptr);
	EXPECT_EQ(menu.ItemAt(4), nullptr);
	EXPECT_EQ(menu.IndexOf(&loose), -1);
}


TEST_F(MenuTest, RemovedItemsAreTheCallers)
{
	{
		BMenu menu("menu");
		Fill(menu);
		BMenuItem* item = menu.RemoveItem(1);
		EXPECT_EQ(Labels(menu), "a c d");
		EXPECT_EQ(item->Menu(), nullptr);
		EXPECT_FALSE(menu.RemoveItem(item));
		EXPECT_EQ(CountedItem::sAlive, 4);
		delete item;
		EXPECT_FALSE(menu.RemoveItems(1, 3, true)) << "there are not as many";
		EXPECT_TRUE(menu.RemoveItems(0, 2, true));
		EXPECT_EQ(Labels(menu), "d");
		EXPECT_EQ(CountedItem::sAlive, 1);
		EXPECT_EQ(menu.RemoveItem(1), nullptr);
	}
	EXPECT_EQ(CountedItem::sAlive, 0) << "a menu deletes its items";
}


TEST_F(MenuTest, DeletedItemLeavesItsMenu)
{
	BMenu menu("menu");
	Fill(menu);
	delete menu.ItemAt(2);
	EXPECT_EQ(Labels(menu), "a b d");
}


TEST_F(MenuTest, ListIsAddedWholeOrNotAtAll)
{
	BMenu menu("menu");
	Fill(menu);
	BList list;
	list.AddItem(new CountedItem("x"));
	list.AddItem(new CountedItem("y"));
	EXPECT_TRUE(menu.AddList(&list, 1));
	EXPECT_EQ(Labels(menu), "a x y b c d");
	EXPECT_FALSE(menu.AddList(&list, 0)) << "they are in a menu already";
	EXPECT_FALSE(menu.AddList(nullptr, 0));
	EXPECT_EQ(menu.CountItems(), 6);
}


TEST_F(MenuTest, SubmenuGivesItsItemTheName)
{
	BMenu menu("menu");
	BMenu* sub = new BMenu("sub");
	EXPECT_TRUE(menu.AddItem(sub));
	BMenuItem* item = menu.ItemAt(0);
	EXPECT_STREQ(item->Label(), "sub");
	EXPECT_EQ(item->Submenu(), sub);
	EXPECT_EQ(menu.SubmenuAt(0), sub);
	EXPECT_EQ(menu.SubmenuAt(1), nullptr);
	EXPECT_EQ(menu.IndexOf(sub), 0);
	EXPECT_EQ(sub->Supermenu(), &menu);
	EXPECT_EQ(sub->Superitem(), item);
	EXPECT_FALSE(menu.AddItem(sub)) << "a submenu has one place";

	EXPECT_TRUE(menu.RemoveItem(sub));
	EXPECT_EQ(menu.CountItems(), 0);
	EXPECT_EQ(sub->Superitem(), nullptr);
	delete sub;
}


TEST_F(MenuTest, SearchGoesIntoSubmenus)
{
	BMenu menu("menu");
	menu.AddItem(new BMenuItem("plain", new BMessage('plai')));
	BMenu* sub = new BMenu("sub");
	sub->AddItem(new BMenuItem("deep", new BMessage('deep')));
	menu.AddItem(sub);
	EXPECT_EQ(menu.FindItem("deep"), sub->ItemAt(0));
	EXPECT_EQ(menu.FindItem('deep'), sub->ItemAt(0));
	EXPECT_EQ(menu.FindItem("sub"), menu.ItemAt(1));
	EXPECT_EQ(menu.FindItem("none"), nullptr);
	EXPECT_EQ(menu.FindItem('none'), nullptr);
	EXPECT_EQ(menu.FindItem(static_cast<uint32>(0)), nullptr)
		<< "an item without message has no code";
}


TEST_F(MenuTest, RadioModeKeepsOneMark)
{
	BMenu menu("menu");
	Fill(menu);
	menu.ItemAt(0)->SetMarked(true);
	menu.ItemAt(1)->SetMarked(true);
	EXPECT_TRUE(menu.ItemAt(0)->IsMarked()) << "without radio mode each item has its own";
	menu.ItemAt(0)->SetMarked(false);
	menu.SetRadioMode(true);
	menu.ItemAt(2)->SetMarked(true);
	EXPECT_EQ(menu.FindMarked(), menu.ItemAt(2));
	EXPECT_EQ(menu.FindMarkedIndex(), 2);
	EXPECT_FALSE(menu.ItemAt(1)->IsMarked());
	menu.ItemAt(2)->SetMarked(false);
	EXPECT_EQ(menu.FindMarked(), nullptr);
	EXPECT_EQ(menu.FindMarkedIndex(), -1);
}


TEST_F(MenuTest, InvokingAnItemOfARadioMenuMarksIt)
{
	BMenu menu("menu");
	Fill(menu);
	menu.SetRadioMode(true);
	static_cast<CountedItem*>(menu.ItemAt(3))->Invoke();
	EXPECT_EQ(menu.FindMarkedIndex(), 3);
	menu.ItemAt(1)->SetEnabled(false);
	EXPECT_NE(static_cast<CountedItem*>(menu.ItemAt(1))->Invoke(), B_OK);
	EXPECT_EQ(menu.FindMarkedIndex(), 3) << "a disabled item cannot be chosen";
}


TEST_F(MenuTest, LabelFollowsTheMark)
{
	BMenu menu("menu");
	BMenu* sub = new BMenu("sub");
	Fill(*sub);
	menu.AddItem(sub);
	EXPECT_FALSE(sub->IsLabelFromMarked());
	sub->SetLabelFromMarked(true);
	EXPECT_TRUE(sub->IsRadioMode());
	sub->ItemAt(1)->SetMarked(true);
	EXPECT_STREQ(menu.ItemAt(0)->Label(), "b");
	sub->ItemAt(1)->SetMarked(false);
	EXPECT_STREQ(menu.ItemAt(0)->Label(), "b") << "with none marked it stays";
	sub->SetRadioMode(false);
	EXPECT_FALSE(sub->IsLabelFromMarked());
}


TEST_F(MenuTest, DisabledMenuDisablesWhatLeadsThereAndWhatIsInIt)
{
	BMenu menu("menu");
	BMenu* sub = new BMenu("sub");
	Fill(*sub);
	menu.AddItem(sub);
	EXPECT_TRUE(menu.ItemAt(0)->IsEnabled());
	sub->SetEnabled(false);
	EXPECT_FALSE(menu.ItemAt(0)->IsEnabled());
	EXPECT_FALSE(sub->ItemAt(0)->IsEnabled());
	sub->SetEnabled(true);
	menu.SetEnabled(false);
	EXPECT_FALSE(sub->IsEnabled());
	EXPECT_FALSE(sub->ItemAt(0)->IsEnabled());
}


TEST_F(MenuTest, ShortcutImpliesCommand)
{
	BMenuItem item("item", nullptr, 'S', B_SHIFT_KEY);
	uint32 modifiers = 0;
	EXPECT_EQ(item.Shortcut(&modifiers), 'S');
	EXPECT_EQ(modifiers, uint32(B_SHIFT_KEY | B_COMMAND_KEY));
	item.SetShortcut('x', B_NO_COMMAND_KEY | B_CONTROL_KEY);
	EXPECT_EQ(item.Shortcut(&modifiers), 'x');
	EXPECT_EQ(modifiers & B_COMMAND_KEY, 0u);
	BMenuItem plain("plain", nullptr);
	EXPECT_EQ(plain.Shortcut(), 0);
}


TEST_F(MenuTest, SeparatorIsNeverEnabled)
{
	BMenu menu("menu");
	Fill(menu);
	EXPECT_TRUE(menu.AddSeparatorItem());
	BMenuItem* separator = menu.ItemAt(4);
	separator->SetEnabled(true);
	EXPECT_FALSE(separator->IsEnabled());
	EXPECT_STREQ(separator->Label(), "");
	EXPECT_NE(dynamic_cast<BSeparatorItem*>(separator), nullptr);
	EXPECT_LT(separator->Frame().Height(), menu.ItemAt(0)->Frame().Height());
}


TEST_F(MenuTest, ColumnAndRowLayOutTheirItems)
{
	BMenu column("column");
	BMenu row("row", B_ITEMS_IN_ROW);
	Fill(column);
	Fill(row);
	column.AddItem(new BMenuItem("by far the widest", nullptr));
	for (int32 i = 1; i < 4; i++) {
		EXPECT_EQ(column.ItemAt(i)->Frame().top, column.ItemAt(i - 1)->Frame().bottom + 1);
		EXPECT_EQ(column.ItemAt(i)->Frame().right, column.ItemAt(4)->Frame().right);
		EXPECT_EQ(row.ItemAt(i)->Frame().left, row.ItemAt(i - 1)->Frame().right + 1);
		EXPECT_EQ(row.ItemAt(i)->Frame().bottom, row.ItemAt(0)->Frame().bottom);
	}
	float width, height;
	column.GetPreferredSize(&width, &height);
	EXPECT_EQ(width, column.ItemAt(4)->Frame().right);
	EXPECT_EQ(height, column.ItemAt(4)->Frame().bottom);
}


TEST_F(MenuTest, ShortcutsAndLongLabelsNeedTheirWidth)
{
	BMenu menu("menu");
	menu.AddItem(new BMenuItem("a label of some length", nullptr));
	const float plain = menu.ItemAt(0)->Frame().Width();
	menu.AddItem(new BMenuItem("b", nullptr, 'B'));
	const float withShortcut = menu.ItemAt(0)->Frame().Width();
	EXPECT_GT(withShortcut, plain + 20);
	menu.SetMaxContentWidth(40);
	EXPECT_EQ(menu.MaxContentWidth(), 40);
	EXPECT_LT(menu.ItemAt(0)->Frame().Width(), withShortcut - 20);
}


TEST_F(MenuTest, MatrixHasTheFramesThatItIsGiven)
{
	BMenu menu("matrix", 100, 50);
	CountedItem unplaced("lost");
	EXPECT_FALSE(menu.AddItem(&unplaced, 0));
	EXPECT_TRUE(menu.AddItem(new CountedItem("a"), BRect(10, 10, 29, 29)));
	EXPECT_EQ(menu.ItemAt(0)->Frame(), BRect(10, 10, 29, 29));
	float width, height;
	menu.GetPreferredSize(&width, &height);
	EXPECT_EQ(width, 100);
	EXPECT_EQ(height, 50);
}


TEST_F(MenuTest, ArchiveKeepsItemsAndModes)
{
	BMenu menu("menu");
	menu.AddItem(new BMenuItem("save", new BMessage('save'), 'S', B_SHIFT_KEY));
	menu.AddSeparatorItem();
	BPopUpMenu* sub = new BPopUpMenu("sub");
	sub->AddItem(new BMenuItem("deep", nullptr));
	sub->ItemAt(0)->SetMarked(true);
	menu.AddItem(sub);
	menu.ItemAt(0)->SetEnabled(false);
	menu.ItemAt(0)->SetTrigger('v');

	BMessage archive;
	ASSERT_EQ(menu.Archive(&archive, true), B_OK);
	std::unique_ptr<BArchivable> object(instantiate_object(&archive));
	BMenu* copy = dynamic_cast<BMenu*>(object.get());
	ASSERT_NE(copy, nullptr);
	ASSERT_EQ(copy->CountItems(), 3);
	EXPECT_STREQ(copy->ItemAt(0)->Label(), "save");
	EXPECT_EQ(copy->ItemAt(0)->Command(), uint32('save'));
	EXPECT_FALSE(copy->ItemAt(0)->IsEnabled());
	EXPECT_EQ(copy->ItemAt(0)->Trigger(), 'v');
	uint32 modifiers;
	EXPECT_EQ(copy->ItemAt(0)->Shortcut(&modifiers), 'S');
	EXPECT_EQ(modifiers, uint32(B_SHIFT_KEY | B_COMMAND_KEY));
	EXPECT_NE(dynamic_cast<BSeparatorItem*>(copy->ItemAt(1)), nullptr);
	ASSERT_NE(dynamic_cast<BPopUpMenu*>(copy->SubmenuAt(2)), nullptr);
	EXPECT_TRUE(copy->SubmenuAt(2)->IsRadioMode());
	EXPECT_TRUE(copy->SubmenuAt(2)->ItemAt(0)->IsMarked());
	EXPECT_EQ(copy->SubmenuAt(2)->Supermenu(), copy);
}


TEST_F(MenuTest, InfoTellsTheFontOfMenus)
{
	menu_info info;
	ASSERT_EQ(get_menu_info(&info), B_OK);
	EXPECT_EQ(info.font_size, be_plain_font->Size());
	EXPECT_EQ(get_menu_info(nullptr), B_BAD_VALUE);
	EXPECT_EQ(sizeof(menu_info), 144u);
	menu_info larger = info;
	larger.font_size = 20;
	ASSERT_EQ(set_menu_info(&larger), B_OK);
	BMenu menu("menu");
	BFont font;
	menu.GetFont(&font);
	EXPECT_EQ(font.Size(), 20);
	set_menu_info(&info);
}


// #pragma mark - in a window


TEST_F(MenuTest, BarTakesTheWindowsWidthAndTheFontsHeight)
{
	BMenuBar* bar = new BMenuBar(BRect(0, 0, 9, 9), "bar");
	bar->AddItem(new BMenu("File"));
	fBackground->AddChild(bar);
	EXPECT_EQ(bar->Frame().Width(), fWindow->Bounds().Width());
	EXPECT_EQ(bar->Frame().Height(), bar->ItemAt(0)->Frame().Height() + 1);
	EXPECT_EQ(fWindow->KeyMenuBar(), bar);
	fBackground->RemoveChild(bar);
	EXPECT_EQ(fWindow->KeyMenuBar(), nullptr);
	delete bar;

	BMenuBar* fixed =
		new BMenuBar(BRect(0, 0, 99, 19), "fixed", B_FOLLOW_LEFT_TOP, B_ITEMS_IN_ROW, false);
	fBackground->AddChild(fixed);
	EXPECT_EQ(fixed->Frame().Width(), 99);
}


TEST_F(MenuTest, ItemsOfABarGoToItsWindow)
{
	BMenuBar* bar = new BMenuBar(BRect(0, 0, 9, 9), "bar");
	BMenu* file = new BMenu("File");
	CountedItem* open = new CountedItem("Open", new BMessage('open'));
	CountedItem* elsewhere = new CountedItem("Elsewhere", new BMessage('else'));
	elsewhere->SetTarget(be_app);
	file->AddItem(open);
	file->AddItem(elsewhere);
	bar->AddItem(file);
	fBackground->AddChild(bar);
	CountedItem* late = new CountedItem("Late", new BMessage('late'));
	file->AddItem(late);
	Show();

	EXPECT_EQ(open->Messenger(), BMessenger(fWindow));
	EXPECT_EQ(late->Messenger(), BMessenger(fWindow)) << "also when it comes later";
	EXPECT_EQ(elsewhere->Messenger(), BMessenger(be_app));
	Do([late] { EXPECT_EQ(late->Invoke(), B_OK); });
	const std::vector<BMessage> received = Take();
	ASSERT_EQ(received.size(), 1u);
	EXPECT_EQ(received[0].what, uint32('late'));
	EXPECT_EQ(received[0].GetInt32("index", -1), 2);
	void* source = nullptr;
	EXPECT_EQ(received[0].FindPointer("source", &source), B_OK);
	EXPECT_EQ(source, static_cast<BMenuItem*>(late));
	EXPECT_TRUE(received[0].HasInt64("when"));
	EXPECT_TRUE(received[0].HasMessenger("be:sender"));
}


TEST_F(MenuTest, TargetOfThePresentItemsOnly)
{
	BPopUpMenu menu("menu");
	Fill(menu);
	fBackground->SetName("target");
	EXPECT_EQ(menu.SetTargetForItems(fBackground), B_OK);
	menu.AddItem(new CountedItem("late"));
	EXPECT_EQ(menu.ItemAt(0)->Target(), fBackground);
	EXPECT_EQ(menu.ItemAt(4)->Target(), nullptr);
	EXPECT_EQ(menu.SetTargetForItems(BMessenger(fWindow)), B_OK);
	EXPECT_EQ(menu.ItemAt(4)->Messenger(), BMessenger(fWindow));
	BView loose(BRect(0, 0, 9, 9), "loose", B_FOLLOW_NONE, 0);
	EXPECT_NE(menu.SetTargetForItems(&loose), B_OK) << "it has no looper";
}


TEST_F(MenuTest, FieldShowsTheMarkedItem)
{
	BPopUpMenu* menu = new BPopUpMenu("menu");
	Fill(*menu);
	menu->ItemAt(0)->SetEnabled(false);
	BMenuField* field = Add(new BMenuField(BRect(10, 10, 209, 29), "field", "Label:", menu));
	EXPECT_EQ(field->Menu(), menu);
	EXPECT_EQ(menu->FindMarkedIndex(), 1) << "the first enabled one";
	EXPECT_STREQ(field->MenuItem()->Label(), "b");
	menu->ItemAt(3)->SetMarked(true);
	EXPECT_STREQ(field->MenuItem()->Label(), "d");
	EXPECT_EQ(field->Divider(), 99);
	EXPECT_EQ(field->MenuBar()->Frame().left, 99);
	EXPECT_STREQ(field->Label(), "Label:");
	EXPECT_EQ(fWindow->KeyMenuBar(), nullptr) << "a field's bar is not the window's";
	EXPECT_EQ(menu->ItemAt(0)->Messenger(), BMessenger(fWindow));
	field->SetDivider(50);
	EXPECT_EQ(field->MenuBar()->Frame().left, 50);

	menu->RemoveItems(0, menu->CountItems(), true);
	EXPECT_STREQ(field->MenuItem()->Label(), "d") << "with none marked it stays as it was";
	menu->AddItem(new CountedItem("new"));
	menu->ItemAt(0)->SetMarked(true);
	EXPECT_STREQ(field->MenuItem()->Label(), "new");
}


TEST_F(MenuTest, FieldsBarFollowsTheItemsOrTheFrame)
{
	BPopUpMenu* narrow = new BPopUpMenu("menu");
	Fill(*narrow);
	BMenuField* field = Add(new BMenuField(BRect(10, 10, 209, 29), "field", nullptr, narrow));
	EXPECT_EQ(field->Divider(), 0) << "without label";
	EXPECT_LT(field->MenuBar()->Frame().Width(), 100);
	BPopUpMenu* wide = new BPopUpMenu("menu");
	Fill(*wide);
	BMenuField* fixed = Add(new BMenuField(BRect(10, 50, 209, 69), "fixed", nullptr, wide, true));
	EXPECT_EQ(fixed->MenuBar()->Frame().right, 199);
	field->SetEnabled(false);
	EXPECT_FALSE(field->IsEnabled());
	EXPECT_FALSE(field->MenuItem()->IsEnabled());
	EXPECT_EQ(field->Flags() & B_NAVIGABLE, 0u);
	field->SetEnabled(true);
	EXPECT_NE(field->Flags() & B_NAVIGABLE, 0u);
}


TEST_F(MenuTest, FieldOfAPlainMenuShowsItsName)
{
	BMenu* menu = new BMenu("Actions");
	for (const char* label : {"a", "b", "c", "d"})
		menu->AddItem(new BMenuItem(label, nullptr));
	BMenuField* field = Add(new BMenuField(BRect(10, 10, 209, 29), "field", "Label", menu));
	EXPECT_STREQ(field->MenuItem()->Label(), "Actions");
	EXPECT_EQ(menu->FindMarked(), nullptr);
	field->SetAlignment(B_ALIGN_RIGHT);
	EXPECT_EQ(field->Alignment(), B_ALIGN_RIGHT);

	BMessage archive;
	ASSERT_EQ(field->Archive(&archive, true), B_OK);
	std::unique_ptr<BArchivable> object(instantiate_object(&archive));
	BMenuField* copy = dynamic_cast<BMenuField*>(object.get());
	ASSERT_NE(copy, nullptr);
	EXPECT_STREQ(copy->Label(), "Label");
	EXPECT_EQ(copy->Divider(), field->Divider());
	EXPECT_EQ(copy->Menu()->CountItems(), 4);
}
