// SPDX-License-Identifier: MIT
// Tests of BListView: items, rows, selection, messages, mouse and keyboard.
#include <ListView.h>

#include <cmath>
#include <cstring>

#include <List.h>
#include <OS.h>
#include <ScrollView.h>

#include "ControlsFixture.h"

namespace {

// Keeps how often the selection changed, and what drags were asked for.
class TellingList : public BListView {
public:
	TellingList(BRect frame, list_view_type type, uint32 mode = B_FOLLOW_NONE)
		: BListView(frame, "list", type, mode)
	{
	}

	void SelectionChanged() override { changes++; }

	bool InitiateDrag(BPoint where, int32 index, bool wasSelected) override
	{
		drags++;
		dragPlace = where;
		dragIndex = index;
		dragSelected = wasSelected;
		return acceptsDrags;
	}

	int32 changes = 0;
	int32 drags = 0;
	BPoint dragPlace;
	int32 dragIndex = -1;
	bool dragSelected = false;
	bool acceptsDrags = false;
};


// Draws nothing; counts how often it should.
class CountingItem : public BListItem {
public:
	void DrawItem(BView*, BRect, bool) override { drawn++; }
	static inline std::atomic<int32> drawn{0};
};


int
CompareTexts(const void* a, const void* b)
{
	const BStringItem* first = dynamic_cast<const BStringItem*>(*static_cast<BListItem* const*>(a));
	const BStringItem* second =
		dynamic_cast<const BStringItem*>(*static_cast<BListItem* const*>(b));
	return strcmp(first->Text(), second->Text());
}


class ListViewTest : public ControlsTest {
protected:
	void TearDown() override
	{
		ControlsTest::TearDown();
		for (BListItem* item : fItems)
			delete item;
	}

	TellingList* MakeList(list_view_type type = B_SINGLE_SELECTION_LIST)
	{
		fList = Add(new TellingList(BRect(10, 10, 159, 159), type));
		return fList;
	}

	BStringItem* NewItem(const char* text)
	{
		BStringItem* item = new BStringItem(text);
		fItems.push_back(item);
		return item;
	}

	void Fill(std::initializer_list<const char*> texts)
	{
		for (const char* text : texts)
			ASSERT_TRUE(fList->AddItem(NewItem(text)));
	}

	/// The middle of a row, in the window.
	BPoint RowPlace(int32 index)
	{
		return Ask([this, index] {
			const BRect frame = fList->ItemFrame(index);
			return fList->ConvertToParent(BPoint(60, (frame.top + frame.bottom) / 2));
		});
	}

	void ClickRow(int32 index, int32 count = 1) { fRobot->Click(RowPlace(index), count); }

	/// The texts; selected ones in brackets.
	std::string Rows()
	{
		std::string rows;
		for (int32 i = 0; i < fList->CountItems(); i++) {
			const BStringItem* item = dynamic_cast<BStringItem*>(fList->ItemAt(i));
			const std::string text = item->Text();
			rows += (i > 0 ? " " : "") + (fList->IsItemSelected(i) ? "[" + text + "]" : text);
		}
		return rows;
	}

	std::string AskRows()
	{
		return Ask([this] { return Rows(); });
	}

	TellingList* fList = nullptr;
	std::vector<BListItem*> fItems;
};

} // namespace


TEST_F(ListViewTest, NewListHasTheDocumentedState)
{
	BListView list(BRect(0, 0, 99, 99), "list");
	EXPECT_EQ(list.ListType(), B_SINGLE_SELECTION_LIST);
	EXPECT_EQ(list.Flags(), B_WILL_DRAW | B_FRAME_EVENTS | B_NAVIGABLE);
	EXPECT_EQ(list.ResizingMode(), B_FOLLOW_LEFT_TOP);
	EXPECT_TRUE(list.IsEmpty());
	EXPECT_EQ(list.CountItems(), 0);
	EXPECT_EQ(list.CurrentSelection(), -1);
	EXPECT_EQ(list.FirstItem(), nullptr);
	EXPECT_EQ(list.LastItem(), nullptr);
	EXPECT_EQ(list.Items(), nullptr);
	EXPECT_EQ(list.SelectionMessage(), nullptr);
	EXPECT_EQ(list.SelectionCommand(), 0u);
	EXPECT_EQ(list.InvocationCommand(), 0u);
	EXPECT_FALSE(list.ItemFrame(0).IsValid());
	EXPECT_EQ(list.ViewColor(), ui_color(B_LIST_BACKGROUND_COLOR));
}


TEST_F(ListViewTest, ItemsGoInAtIndicesOnce)
{
	MakeList();
	Fill({"a", "c"});
	BStringItem* b = NewItem("b");
	EXPECT_TRUE(fList->AddItem(b, 1));
	EXPECT_EQ(Rows(), "a b c");
	EXPECT_FALSE(fList->AddItem(b));
	EXPECT_FALSE(fList->AddItem(NULL));
	EXPECT_FALSE(fList->AddItem(NewItem("x"), 4));
	EXPECT_FALSE(fList->AddItem(NewItem("x"), -1));
	EXPECT_EQ(Rows(), "a b c");
	EXPECT_EQ(fList->IndexOf(b), 1);
	EXPECT_TRUE(fList->HasItem(b));
	EXPECT_EQ(fList->Items()[1], b);
	EXPECT_EQ(fList->ItemAt(3), nullptr);
	EXPECT_EQ(fList->ItemAt(-1), nullptr);
}


TEST_F(ListViewTest, ListsOfItemsGoInAsAWhole)
{
	MakeList();
	Fill({"a", "d"});
	BList list;
	list.AddItem(NewItem("b"));
	list.AddItem(NewItem("c"));
	EXPECT_TRUE(fList->AddList(&list, 1));
	EXPECT_EQ(Rows(), "a b c d");
	EXPECT_FALSE(fList->AddList(&list));
	BStringItem* twice = NewItem("e");
	BList doubled;
	doubled.AddItem(twice);
	doubled.AddItem(twice);
	EXPECT_FALSE(fList->AddList(&doubled));
	EXPECT_FALSE(fList->AddList(NULL));
	EXPECT_EQ(Rows(), "a b c d");
	EXPECT_TRUE(fList->AddItem(twice));
	BList empty;
	EXPECT_TRUE(fList->AddList(&empty));
}


TEST_F(ListViewTest, RemovedItemsAreReturnedAndMayComeBack)
{
	MakeList();
	Fill({"a", "b", "c", "d"});
	BListItem* b = fList->ItemAt(1);
	EXPECT_EQ(fList->RemoveItem(1), b);
	EXPECT_EQ(fList->RemoveItem(7), nullptr);
	EXPECT_FALSE(fList->RemoveItem(b));
	EXPECT_TRUE(fList->AddItem(b));
	EXPECT_EQ(Rows(), "a c d b");
	EXPECT_TRUE(fList->RemoveItem(b));
	EXPECT_TRUE(fList->RemoveItems(1, 50));
	EXPECT_EQ(Rows(), "a");
	EXPECT_FALSE(fList->RemoveItems(1, 1));
	EXPECT_FALSE(fList->RemoveItems(0, -1));
	EXPECT_TRUE(fList->RemoveItems(0, 0));
	EXPECT_EQ(Rows(), "a");
}


TEST_F(ListViewTest, EmptyingTouchesNoItem)
{
	MakeList();
	fList->AddItem(new BStringItem("a"));
	fList->AddItem(new BStringItem("b"));
	fList->Select(1);
	fList->changes = 0;
	// As programs do it.
	for (int32 i = 0; i < fList->CountItems(); i++)
		delete fList->ItemAt(i);
	fList->MakeEmpty();
	EXPECT_EQ(fList->changes, 0);
	EXPECT_TRUE(fList->IsEmpty());
	EXPECT_EQ(fList->CurrentSelection(), -1);
}


TEST_F(ListViewTest, EmptiedListTakesTheSameItemsAgain)
{
	MakeList();
	Fill({"a", "b"});
	fList->Select(1);
	fList->MakeEmpty();
	for (BListItem* item : fItems)
		EXPECT_TRUE(fList->AddItem(item));
	EXPECT_EQ(Rows(), "a b");
	EXPECT_EQ(fList->CurrentSelection(), -1);
}


TEST_F(ListViewTest, RowsFollowEachOtherWithoutGap)
{
	MakeList();
	Fill({"a", "b", "c"});
	float top = 0;
	for (int32 i = 0; i < 3; i++) {
		const BRect frame = fList->ItemFrame(i);
		EXPECT_EQ(frame.top, top);
		EXPECT_EQ(frame.left, 0);
		EXPECT_EQ(frame.right, fList->Bounds().right);
		EXPECT_EQ(frame.Height(), std::ceil(fList->ItemAt(i)->Height()));
		EXPECT_EQ(fList->IndexOf(BPoint(5, frame.top)), i);
		EXPECT_EQ(fList->IndexOf(BPoint(5, frame.bottom)), i);
		top = frame.bottom + 1;
	}
	EXPECT_EQ(fList->IndexOf(BPoint(5, top)), -1);
	EXPECT_EQ(fList->IndexOf(BPoint(5, -1)), -1);
}


TEST_F(ListViewTest, HeightsComeFromTheFont)
{
	MakeList();
	Fill({"a"});
	font_height height;
	fList->GetFontHeight(&height);
	const float line = std::ceil(height.ascent + height.descent + height.leading);
	EXPECT_EQ(fList->ItemAt(0)->Height(), line + 4);

	BFont font(be_plain_font);
	font.SetSize(40);
	fList->SetFont(&font);
	EXPECT_GE(fList->ItemAt(0)->Height(), 40);
	EXPECT_EQ(fList->ItemFrame(0).Height(), fList->ItemAt(0)->Height());
}


TEST_F(ListViewTest, RowsBelowMoveWhenAnItemGetsHigher)
{
	MakeList();
	Fill({"a", "b"});
	fList->ItemAt(0)->SetHeight(50);
	fList->InvalidateItem(0);
	EXPECT_EQ(fList->ItemFrame(1).top, 51);
	fList->ItemAt(0)->SetHeight(-4);
	fList->InvalidateItem(0);
	EXPECT_EQ(fList->ItemFrame(1).top, 1);
	fList->InvalidateItem(9);
	fList->InvalidateItem(-1);
}


TEST_F(ListViewTest, SingleListHoldsOneSelected)
{
	MakeList();
	Fill({"a", "b", "c"});
	fList->Select(0);
	fList->Select(2, true);
	EXPECT_EQ(Rows(), "a b [c]");
	fList->Select(0, 2);
	EXPECT_EQ(Rows(), "[a] b c");
	fList->Select(9);
	fList->Select(-1);
	EXPECT_EQ(Rows(), "[a] b c");
	EXPECT_EQ(fList->CurrentSelection(0), 0);
	EXPECT_EQ(fList->CurrentSelection(1), -1);
	EXPECT_EQ(fList->CurrentSelection(-1), -1);
}


TEST_F(ListViewTest, MultipleListSelectsRangesAndExtends)
{
	MakeList(B_MULTIPLE_SELECTION_LIST);
	Fill({"a", "b", "c", "d", "e"});
	fList->Select(1, 2);
	EXPECT_EQ(Rows(), "a [b] [c] d e");
	fList->Select(4, true);
	EXPECT_EQ(Rows(), "a [b] [c] d [e]");
	EXPECT_EQ(fList->CurrentSelection(2), 4);
	fList->Deselect(2);
	fList->DeselectExcept(3, 4);
	EXPECT_EQ(Rows(), "a b c d [e]");
	fList->Select(3, 1);
	EXPECT_EQ(Rows(), "a [b] [c] [d] e");
	fList->Select(2, 90);
	EXPECT_EQ(Rows(), "a b [c] [d] [e]");
	fList->DeselectAll();
	EXPECT_EQ(Rows(), "a b c d e");
}


TEST_F(ListViewTest, SelectionChangedIsCalledForChangesOnly)
{
	MakeList(B_MULTIPLE_SELECTION_LIST);
	Fill({"a", "b", "c"});
	fList->Select(1);
	EXPECT_EQ(fList->changes, 1);
	fList->Select(1);
	fList->Deselect(0);
	fList->DeselectExcept(0, 2);
	EXPECT_EQ(fList->changes, 1);
	fList->DeselectAll();
	EXPECT_EQ(fList->changes, 2);
	fList->DeselectAll();
	EXPECT_EQ(fList->changes, 2);
}


TEST_F(ListViewTest, DisabledItemsCannotBeSelected)
{
	MakeList(B_MULTIPLE_SELECTION_LIST);
	Fill({"a", "b", "c"});
	fList->ItemAt(1)->SetEnabled(false);
	fList->Select(0);
	fList->Select(1);
	EXPECT_EQ(Rows(), "[a] b c");
	fList->Select(0, 2);
	EXPECT_EQ(Rows(), "[a] b [c]");
}


TEST_F(ListViewTest, OneStaysSelectedWhenTheListBecomesSingle)
{
	MakeList(B_MULTIPLE_SELECTION_LIST);
	Fill({"a", "b", "c"});
	fList->Select(1, 2);
	fList->SetListType(B_SINGLE_SELECTION_LIST);
	EXPECT_EQ(Rows(), "a [b] c");
	EXPECT_EQ(fList->changes, 2);
}


TEST_F(ListViewTest, SelectionStaysWithItsItems)
{
	MakeList(B_MULTIPLE_SELECTION_LIST);
	Fill({"d", "a", "c", "b"});
	fList->Select(0);
	fList->Select(2, true);
	fList->changes = 0;
	fList->AddItem(NewItem("z"), 1);
	EXPECT_EQ(Rows(), "[d] z a [c] b");
	EXPECT_TRUE(fList->SwapItems(0, 4));
	EXPECT_EQ(Rows(), "b z a [c] [d]");
	EXPECT_EQ(fList->CurrentSelection(1), 4);
	EXPECT_TRUE(fList->MoveItem(4, 0));
	EXPECT_EQ(Rows(), "[d] b z a [c]");
	EXPECT_TRUE(fList->MoveItem(0, 2));
	EXPECT_EQ(Rows(), "b z [d] a [c]");
	fList->SortItems(CompareTexts);
	EXPECT_EQ(Rows(), "a b [c] [d] z");
	fList->RemoveItem(0);
	EXPECT_EQ(Rows(), "b [c] [d] z");
	EXPECT_EQ(fList->CurrentSelection(0), 1);
	EXPECT_TRUE(fList->ReplaceItem(1, NewItem("n")));
	EXPECT_EQ(Rows(), "b [n] [d] z");
	EXPECT_EQ(fList->changes, 0);
	EXPECT_FALSE(fList->SwapItems(0, 4));
	EXPECT_FALSE(fList->MoveItem(-1, 0));
	EXPECT_FALSE(fList->ReplaceItem(4, NewItem("n")));
	EXPECT_FALSE(fList->ReplaceItem(0, NULL));
	EXPECT_FALSE(fList->ReplaceItem(0, fList->ItemAt(1)));
}


TEST_F(ListViewTest, SelectedItemIsDeselectedBeforeItGoes)
{
	MakeList();
	fList->SetSelectionMessage(new BMessage('slct'));
	Fill({"a", "b"});
	Show();
	Do([this] {
		fList->Select(1);
		fList->RemoveItem(1);
	});
	const std::vector<BMessage> messages = Take();
	ASSERT_EQ(messages.size(), 2u);
	EXPECT_EQ(messages[0].GetInt32("index", 99), 1);
	EXPECT_EQ(messages[1].GetInt32("index", 99), -1);
	EXPECT_FALSE(fItems[1]->IsSelected());
}


TEST_F(ListViewTest, MessagesCarryTheirFields)
{
	MakeList(B_MULTIPLE_SELECTION_LIST);
	fList->SetSelectionMessage(new BMessage('slct'));
	fList->SetInvocationMessage(new BMessage('invk'));
	EXPECT_EQ(fList->SelectionCommand(), uint32('slct'));
	EXPECT_EQ(fList->InvocationCommand(), uint32('invk'));
	Fill({"a", "b", "c"});
	Show();
	Do([this] {
		fList->Select(0);
		fList->Select(2, true);
		fList->Invoke();
	});
	const std::vector<BMessage> messages = Take();
	ASSERT_EQ(messages.size(), 3u);
	const BMessage& last = messages[2];
	EXPECT_EQ(last.what, uint32('invk'));
	EXPECT_EQ(last.GetInt32("index", 0, 9), 0);
	EXPECT_EQ(last.GetInt32("index", 1, 9), 2);
	EXPECT_FALSE(last.HasInt32("index", 2));
	void* source = nullptr;
	ASSERT_EQ(last.FindPointer("source", &source), B_OK);
	EXPECT_EQ(source, fList);
	EXPECT_TRUE(last.HasInt64("when"));
	EXPECT_TRUE(last.HasMessenger("be:sender"));
	EXPECT_FALSE(last.HasPointer("source", 1));
}


TEST_F(ListViewTest, ListWithoutMessagesSendsNone)
{
	MakeList();
	Fill({"a"});
	Show();
	Do([this] { EXPECT_EQ(fList->Invoke(), B_BAD_VALUE); });
	ClickRow(0, 2);
	EXPECT_EQ(TakeCodes(), "");
	EXPECT_EQ(fList->Target(), static_cast<BHandler*>(fWindow));
}


TEST_F(ListViewTest, ClickSelectsAndDoubleClickInvokes)
{
	MakeList();
	fList->SetSelectionMessage(new BMessage('slct'));
	fList->SetInvocationMessage(new BMessage('invk'));
	Fill({"a", "b", "c"});
	Show();
	ClickRow(1);
	EXPECT_EQ(AskRows(), "a [b] c");
	EXPECT_EQ(TakeCodes(), "slct ");
	ClickRow(2, 2);
	EXPECT_EQ(AskRows(), "a b [c]");
	EXPECT_EQ(TakeCodes(), "slct invk ");
	EXPECT_TRUE(Ask([this] { return fList->IsFocus(); }));
}


TEST_F(ListViewTest, DoubleClickOnADisabledRowDoesNothing)
{
	MakeList();
	fList->SetInvocationMessage(new BMessage('invk'));
	Fill({"a", "b"});
	fList->ItemAt(1)->SetEnabled(false);
	Show();
	ClickRow(0);
	ClickRow(1, 2);
	EXPECT_EQ(AskRows(), "[a] b");
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(ListViewTest, ClickBelowTheRowsDeselectsAll)
{
	MakeList();
	Fill({"a"});
	Show();
	ClickRow(0);
	fRobot->Click(BPoint(50, 150));
	EXPECT_EQ(AskRows(), "a");
}


TEST_F(ListViewTest, ModifiersExtendTheSelectionOfAMultipleList)
{
	MakeList(B_MULTIPLE_SELECTION_LIST);
	Fill({"a", "b", "c", "d", "e"});
	Show();
	ClickRow(1);
	fRobot->Hold(B_SHIFT_KEY);
	ClickRow(3);
	EXPECT_EQ(AskRows(), "a [b] [c] [d] e");
	ClickRow(0);
	EXPECT_EQ(AskRows(), "[a] [b] c d e");
	fRobot->Hold(B_COMMAND_KEY);
	ClickRow(4);
	EXPECT_EQ(AskRows(), "[a] [b] c d [e]");
	ClickRow(0);
	EXPECT_EQ(AskRows(), "a [b] c d [e]");
	fRobot->Click(BPoint(50, 155));
	EXPECT_EQ(AskRows(), "a [b] c d [e]");
	fRobot->Hold(0);
	ClickRow(4);
	EXPECT_EQ(AskRows(), "a b c d [e]");
}


TEST_F(ListViewTest, CommandClickDeselectsInASingleList)
{
	MakeList();
	Fill({"a", "b"});
	Show();
	ClickRow(1);
	fRobot->Hold(B_COMMAND_KEY);
	ClickRow(1);
	fRobot->Hold(0);
	EXPECT_EQ(AskRows(), "a b");
}


TEST_F(ListViewTest, DragIsAskedForOnceWhenThePointerMoves)
{
	MakeList();
	Fill({"a", "b", "c"});
	Show();
	const BPoint place = RowPlace(1);
	fRobot->Drag(place, place + BPoint(30, 30));
	EXPECT_EQ(Ask([this] { return fList->drags; }), 1);
	EXPECT_EQ(fList->dragIndex, 1);
	EXPECT_FALSE(fList->dragSelected);
	EXPECT_EQ(fList->dragPlace, place - BPoint(10, 10));
	ClickRow(1);
	fRobot->Drag(place, place + BPoint(1, 1));
	EXPECT_EQ(Ask([this] { return fList->drags; }), 1);
}


TEST_F(ListViewTest, DragOfSeveralKeepsThemSelected)
{
	MakeList(B_MULTIPLE_SELECTION_LIST);
	Fill({"a", "b", "c"});
	Show();
	Do([this] {
		fList->Select(0, 1);
		fList->acceptsDrags = true;
	});
	fRobot->Drag(RowPlace(1), RowPlace(1) + BPoint(30, 10));
	EXPECT_EQ(AskRows(), "[a] [b] c");
	EXPECT_TRUE(fList->dragSelected);
	ClickRow(1);
	EXPECT_EQ(AskRows(), "a [b] c");
}


TEST_F(ListViewTest, ArrowKeysMoveTheSelectionOverDisabledRows)
{
	MakeList();
	Fill({"a", "b", "c", "d"});
	fList->ItemAt(1)->SetEnabled(false);
	Show();
	Do([this] { fList->MakeFocus(true); });
	fRobot->Key("down");
	EXPECT_EQ(AskRows(), "[a] b c d");
	fRobot->Key("down");
	EXPECT_EQ(AskRows(), "a b [c] d");
	fRobot->Key("up");
	EXPECT_EQ(AskRows(), "[a] b c d");
	fRobot->Key("up");
	EXPECT_EQ(AskRows(), "[a] b c d");
	fRobot->Key("end");
	EXPECT_EQ(AskRows(), "a b c [d]");
	fRobot->Key("down");
	EXPECT_EQ(AskRows(), "a b c [d]");
	fRobot->Key("home");
	EXPECT_EQ(AskRows(), "[a] b c d");
}


TEST_F(ListViewTest, KeysOfAnEmptyListDoNothing)
{
	MakeList();
	fList->SetInvocationMessage(new BMessage('invk'));
	Show();
	Do([this] { fList->MakeFocus(true); });
	for (const char* key : {"down", "up", "home", "end", "page-up", "page-down"})
		fRobot->Key(key);
	fRobot->Type("x");
	EXPECT_EQ(Ask([this] { return fList->CurrentSelection(); }), -1);
}


TEST_F(ListViewTest, ShiftExtendsAndOptionMovesTheCursorAlone)
{
	MakeList(B_MULTIPLE_SELECTION_LIST);
	Fill({"a", "b", "c", "d"});
	Show();
	Do([this] { fList->MakeFocus(true); });
	fRobot->Key("down");
	fRobot->Key("shift+down");
	EXPECT_EQ(AskRows(), "[a] [b] c d");
	fRobot->Key("option+down");
	fRobot->Key("option+down");
	EXPECT_EQ(AskRows(), "[a] [b] c d");
	fRobot->Type(" ");
	EXPECT_EQ(AskRows(), "[a] [b] c [d]");
	fRobot->Type(" ");
	EXPECT_EQ(AskRows(), "[a] [b] c d");
	fRobot->Key("up");
	EXPECT_EQ(AskRows(), "a b [c] d");
}


TEST_F(ListViewTest, EnterAndSpaceInvoke)
{
	MakeList();
	fList->SetInvocationMessage(new BMessage('invk'));
	Fill({"a", "b"});
	Show();
	Do([this] {
		fList->MakeFocus(true);
		fList->Select(1);
	});
	fRobot->Key("enter");
	fRobot->Type(" ");
	const std::vector<BMessage> messages = Take();
	ASSERT_EQ(messages.size(), 2u);
	EXPECT_EQ(messages[0].GetInt32("index", 9), 1);
}


TEST_F(ListViewTest, TypedTextSelectsTheRowThatBeginsWithIt)
{
	MakeList();
	Fill({"Apple", "Banana", "Blue berry", "Bluebell", "Cherry", "\xc3\x84ther"});
	Show();
	Do([this] { fList->MakeFocus(true); });
	fRobot->Type("blue");
	EXPECT_EQ(Ask([this] { return fList->CurrentSelection(); }), 2);
	fRobot->Type("b");
	EXPECT_EQ(Ask([this] { return fList->CurrentSelection(); }), 3);
	fRobot->Key("home");
	fRobot->Type("b");
	EXPECT_EQ(Ask([this] { return fList->CurrentSelection(); }), 1);
	fRobot->Type("b");
	EXPECT_EQ(Ask([this] { return fList->CurrentSelection(); }), 2);
	fRobot->Key("home");
	fRobot->Type("\xc3\x84");
	EXPECT_EQ(Ask([this] { return fList->CurrentSelection(); }), 5);
	fRobot->Key("home");
	fRobot->Type("q");
	EXPECT_EQ(Ask([this] { return fList->CurrentSelection(); }), 0);
}


TEST_F(ListViewTest, SpaceGoesOnWithWhatIsTyped)
{
	MakeList();
	fList->SetInvocationMessage(new BMessage('invk'));
	Fill({"Bluebell", "Blue berry"});
	Show();
	Do([this] { fList->MakeFocus(true); });
	fRobot->Type("blue b");
	EXPECT_EQ(Ask([this] { return fList->CurrentSelection(); }), 1);
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(ListViewTest, SelectAllIsForMultipleLists)
{
	MakeList(B_MULTIPLE_SELECTION_LIST);
	Fill({"a", "b"});
	Show();
	Do([this] {
		BMessage message(B_SELECT_ALL);
		fList->MessageReceived(&message);
	});
	EXPECT_EQ(AskRows(), "[a] [b]");
}


TEST_F(ListViewTest, ScrollBarsFollowTheItems)
{
	TellingList* list =
		new TellingList(BRect(10, 10, 109, 89), B_SINGLE_SELECTION_LIST, B_FOLLOW_ALL);
	fList = list;
	BScrollView* view = Add(new BScrollView("scroll", list, B_FOLLOW_NONE, 0, true, true));
	BScrollBar* down = view->ScrollBar(B_VERTICAL);
	BScrollBar* across = view->ScrollBar(B_HORIZONTAL);
	float min, max;
	down->GetRange(&min, &max);
	EXPECT_EQ(max, 0);
	Fill({"a", "b", "c", "d", "e", "f", "g", "h", "i", "j"});
	const float content = list->ItemFrame(9).bottom;
	down->GetRange(&min, &max);
	EXPECT_EQ(max, content - list->Bounds().Height());
	EXPECT_NEAR(down->Proportion(), 80 / (content + 1), 0.001);
	float small, large;
	down->GetSteps(&small, &large);
	EXPECT_EQ(large, list->Bounds().Height());
	across->GetRange(&min, &max);
	EXPECT_EQ(max, 0);

	BStringItem* wide = NewItem("a text that is a good deal wider than the list, and then some");
	list->AddItem(wide);
	across->GetRange(&min, &max);
	EXPECT_EQ(max, std::ceil(wide->Width()) - 1 - list->Bounds().Width());
	list->RemoveItem(wide);
	across->GetRange(&min, &max);
	EXPECT_EQ(max, 0);

	list->ScrollTo(BPoint(0, 10000));
	EXPECT_EQ(list->Bounds().bottom, content);
	list->RemoveItems(1, 9);
	EXPECT_EQ(list->Bounds().top, 0);
	down->GetRange(&min, &max);
	EXPECT_EQ(max, 0);
	EXPECT_EQ(down->Proportion(), 1);
}


TEST_F(ListViewTest, ResizingFitsTheScrollBars)
{
	TellingList* list =
		new TellingList(BRect(10, 10, 109, 89), B_SINGLE_SELECTION_LIST, B_FOLLOW_ALL);
	fList = list;
	BScrollView* view = Add(new BScrollView("scroll", list, B_FOLLOW_NONE, 0, false, true));
	Fill({"a", "b", "c", "d", "e", "f", "g", "h", "i", "j"});
	Show();
	Do([view] { view->ResizeBy(0, 40); });
	float min, max;
	Do([&] { view->ScrollBar(B_VERTICAL)->GetRange(&min, &max); });
	EXPECT_EQ(max, Ask([list] { return list->ItemFrame(9).bottom - list->Bounds().Height(); }));
}


TEST_F(ListViewTest, SelectDoesNotScrollAndScrollToSelectionDoes)
{
	MakeList();
	for (int i = 0; i < 50; i++)
		Fill({"row"});
	fList->Select(40);
	EXPECT_EQ(fList->Bounds().top, 0);
	fList->ScrollToSelection();
	EXPECT_EQ(fList->Bounds().bottom, fList->ItemFrame(40).bottom);
	fList->Select(3);
	fList->ScrollToSelection();
	EXPECT_EQ(fList->Bounds().top, fList->ItemFrame(3).top);
	fList->ScrollTo(int32(4));
	EXPECT_EQ(fList->Bounds().top, fList->ItemFrame(3).top);
	fList->DeselectAll();
	fList->ScrollToSelection();
	EXPECT_EQ(fList->Bounds().top, fList->ItemFrame(3).top);
}


TEST_F(ListViewTest, PageKeysScrollAndArrowsBringTheSelectionIntoSight)
{
	MakeList();
	for (int i = 0; i < 50; i++)
		Fill({"row"});
	Show();
	Do([this] {
		fList->MakeFocus(true);
		fList->Select(0);
	});
	fRobot->Key("page-down");
	EXPECT_EQ(Ask([this] { return fList->Bounds().top; }), 149);
	EXPECT_EQ(Ask([this] { return fList->CurrentSelection(); }), 0);
	fRobot->Key("down");
	EXPECT_EQ(Ask([this] { return fList->Bounds().top; }),
		Ask([this] { return fList->ItemFrame(1).top; }));
	fRobot->Key("page-up");
	EXPECT_EQ(Ask([this] { return fList->Bounds().top; }), 0);
	for (int i = 0; i < 20; i++)
		fRobot->Key("page-down");
	EXPECT_EQ(Ask([this] { return fList->Bounds().bottom; }),
		Ask([this] { return fList->ItemFrame(49).bottom; }));
}


TEST_F(ListViewTest, HugeListDrawsOnlyWhatIsSeen)
{
	MakeList();
	constexpr int32 kCount = 100000;
	std::vector<CountingItem> items(kCount);
	BList list;
	for (CountingItem& item : items)
		list.AddItem(&item);
	ASSERT_TRUE(fList->AddList(&list));
	Show();
	Do([this] { fList->ScrollTo(int32(kCount - 1)); });
	const BRect last = Ask([this] { return fList->ItemFrame(kCount - 1); });
	EXPECT_EQ(Ask([this] { return fList->Bounds().bottom; }), last.bottom);
	EXPECT_EQ(Ask([this, last] { return fList->IndexOf(BPoint(1, last.top)); }), kCount - 1);
	const int32 rows = static_cast<int32>(150 / (last.Height() + 1)) + 2;
	CountingItem::drawn = 0;
	Do([this] { fList->Invalidate(); });
	EXPECT_LE(CountingItem::drawn, rows);
	for (int32 i = 0; i < 1000; i++) {
		Ask([this, i] {
			fList->Select((i * 7919) % kCount);
			return 0;
		});
	}
	Do([this] { fList->MakeEmpty(); });
}


TEST_F(ListViewTest, ItemsMayBeVisitedAndRemovedMeanwhile)
{
	MakeList();
	Fill({"a", "b", "c", "d"});
	fList->DoForEach(
		[](BListItem* item, void* list) {
			static_cast<TellingList*>(list)->RemoveItem(item);
			return false;
		},
		fList);
	EXPECT_EQ(Rows(), "b d");
	static int32 visited = 0;
	fList->DoForEach([](BListItem*) { return ++visited == 1; });
	EXPECT_EQ(visited, 1);
}


TEST_F(ListViewTest, ArchiveKeepsItemsSelectionAndMessages)
{
	MakeList(B_MULTIPLE_SELECTION_LIST);
	Fill({"a", "b", "c"});
	fList->ItemAt(2)->SetEnabled(false);
	fList->Select(1);
	fList->SetSelectionMessage(new BMessage('slct'));
	fList->SetInvocationMessage(new BMessage('invk'));
	BMessage archive;
	ASSERT_EQ(fList->BListView::Archive(&archive), B_OK);
	archive.ReplaceString("class", "BListView");
	std::unique_ptr<BArchivable> object(BListView::Instantiate(&archive));
	BListView* copy = dynamic_cast<BListView*>(object.get());
	ASSERT_NE(copy, nullptr);
	ASSERT_EQ(copy->CountItems(), 3);
	EXPECT_EQ(copy->ListType(), B_MULTIPLE_SELECTION_LIST);
	EXPECT_STREQ(dynamic_cast<BStringItem*>(copy->ItemAt(1))->Text(), "b");
	EXPECT_FALSE(copy->ItemAt(2)->IsEnabled());
	EXPECT_EQ(copy->CurrentSelection(), 1);
	EXPECT_EQ(copy->SelectionCommand(), uint32('slct'));
	EXPECT_EQ(copy->InvocationCommand(), uint32('invk'));
	for (int32 i = 0; i < 3; i++)
		fItems.push_back(copy->ItemAt(i));
}


TEST_F(ListViewTest, StringItemKeepsItsText)
{
	BStringItem item("text", 2, false);
	EXPECT_STREQ(item.Text(), "text");
	EXPECT_EQ(item.OutlineLevel(), 2u);
	EXPECT_FALSE(item.IsExpanded());
	EXPECT_TRUE(item.IsEnabled());
	EXPECT_FALSE(item.IsSelected());
	item.SetText(NULL);
	EXPECT_EQ(item.Text(), nullptr);
	item.SetText("");
	EXPECT_STREQ(item.Text(), "");
}
