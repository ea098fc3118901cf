// SPDX-License-Identifier: MIT
// Menu fields in use.
#include <MenuField.h>
#include <PopUpMenu.h>

#include "MenuFixture.h"

namespace {

class MenuFieldTest : public MenuTrackingTest {};

} // namespace


TEST_F(MenuFieldTest, FieldChoosesAndShowsTheChoice)
{
	BPopUpMenu* menu = new BPopUpMenu("choices");
	for (const char* label : {"red", "green", "blue"})
		menu->AddItem(new BMenuItem(label, new BMessage('colr')));
	BMenuField* field = Add(new BMenuField(BRect(20, 100, 219, 119), "field", "Colour:", menu));
	Show();
	EXPECT_EQ(Ask([field] { return std::string(field->MenuItem()->Label()); }), "red");
	fRobot->ClickView("_mc_mb_");
	ASSERT_TRUE(Opens(menu));
	EXPECT_EQ(fMenuWindow->beginnings, 1);
	fRobot->ClickItem("blue");
	EXPECT_TRUE(Closes(menu));
	const std::vector<BMessage> received = Take();
	ASSERT_EQ(received.size(), 1u);
	EXPECT_EQ(received[0].GetInt32("index", -1), 2);
	EXPECT_EQ(Ask([menu] { return menu->FindMarkedIndex(); }), 2);
	EXPECT_EQ(Ask([field] { return std::string(field->MenuItem()->Label()); }), "blue");

	// A click on the label opens it too, with the marked item under the bar's.
	fRobot->Click(BPoint(25, 108));
	ASSERT_TRUE(Opens(menu));
	ASSERT_TRUE(menu->LockLooper());
	const BRect marked = menu->ConvertToScreen(menu->ItemAt(2)->Frame());
	menu->UnlockLooper();
	const BRect bar =
		Ask([field] { return field->MenuBar()->ConvertToScreen(field->MenuBar()->Bounds()); });
	EXPECT_NEAR(marked.top + marked.bottom, bar.top + bar.bottom, 1);
	fRobot->Key("escape");
	EXPECT_TRUE(Closes(menu));
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(MenuFieldTest, FieldIsUsedByKeyboard)
{
	BPopUpMenu* menu = new BPopUpMenu("choices");
	for (const char* label : {"red", "green", "blue"})
		menu->AddItem(new BMenuItem(label, new BMessage('colr')));
	BMenuField* field = Add(new BMenuField(BRect(20, 100, 219, 119), "field", "Colour:", menu));
	Show();
	Do([field] { field->MakeFocus(); });
	fRobot->Key("space");
	ASSERT_TRUE(Opens(menu));
	EXPECT_EQ(Selected(menu), "red");
	fRobot->Key("down");
	fRobot->Key("enter");
	EXPECT_TRUE(Closes(menu));
	EXPECT_EQ(TakeCodes(), "colr ");
	EXPECT_EQ(Ask([field] { return std::string(field->MenuItem()->Label()); }), "green");
	Do([field] { field->SetEnabled(false); });
	EXPECT_FALSE(Ask([field] { return field->IsFocus(); }));
	fRobot->ClickView("_mc_mb_");
	EXPECT_FALSE(IsOpen(menu));
}


TEST_F(MenuFieldTest, KeysBeginAtTheChoice)
{
	BPopUpMenu* menu = new BPopUpMenu("choices");
	for (const char* label : {"red", "green", "blue"})
		menu->AddItem(new BMenuItem(label, new BMessage('colr')));
	menu->ItemAt(1)->SetMarked(true);
	BMenuField* field = Add(new BMenuField(BRect(20, 100, 219, 119), "field", "Colour:", menu));
	Show();
	Do([field] { field->MakeFocus(); });
	fRobot->Key("space");
	ASSERT_TRUE(Opens(menu));
	EXPECT_EQ(Selected(menu), "green");
	fRobot->Key("down");
	EXPECT_EQ(Selected(menu), "blue");
	fRobot->Key("enter");
	EXPECT_TRUE(Closes(menu));
	fRobot->Key("down");
	ASSERT_TRUE(Opens(menu));
	EXPECT_EQ(Selected(menu), "blue");
	fRobot->Key("home");
	EXPECT_EQ(Selected(menu), "red");
	fRobot->Key("escape");
	EXPECT_TRUE(Closes(menu));
	// What cannot be chosen is passed over.
	Do([menu] { menu->ItemAt(2)->SetEnabled(false); });
	fRobot->Key("space");
	ASSERT_TRUE(Opens(menu));
	EXPECT_EQ(Selected(menu), "red");
	fRobot->Key("escape");
	EXPECT_TRUE(Closes(menu));
}


TEST_F(MenuFieldTest, ChoiceInALongMenuIsInSight)
{
	BPopUpMenu* menu = new BPopUpMenu("choices");
	for (int32 i = 0; i < 200; i++) {
		BString label("Line ");
		label << i;
		menu->AddItem(new BMenuItem(label.String(), new BMessage('line')));
	}
	menu->ItemAt(150)->SetMarked(true);
	BMenuField* field = Add(new BMenuField(BRect(20, 100, 219, 119), "field", "Lines:", menu));
	Show();
	Do([field] { field->MakeFocus(); });
	fRobot->Key("space");
	ASSERT_TRUE(Opens(menu));
	EXPECT_EQ(Selected(menu), "Line 150");
	ASSERT_TRUE(menu->LockLooper());
	EXPECT_TRUE(menu->Bounds().Contains(menu->ItemAt(150)->Frame()));
	menu->UnlockLooper();
	fRobot->Key("escape");
	EXPECT_TRUE(Closes(menu));
}


TEST_F(MenuFieldTest, KeysBeginAtTheStartOfMenusWithoutAChoice)
{
	fEdit->ItemAt(1)->SetMarked(true);
	Show();
	fRobot->Key("command+escape");
	fRobot->Key("right");
	fRobot->Key("down");
	ASSERT_TRUE(Opens(fEdit));
	EXPECT_EQ(Selected(fEdit), "Copy");
	fRobot->Key("escape");
	EXPECT_TRUE(AllClosed());
}
