// SPDX-License-Identifier: MIT
// Tests of BOutlineListView: the full list and its rows, latches, keyboard, sorting.
#include <OutlineListView.h>

#include <cstring>
#include <string>

#include <List.h>

#include "ControlsFixture.h"

namespace {

// Tells where its latches are.
class OpenList : public BOutlineListView {
public:
	explicit OpenList(list_view_type type)
		: BOutlineListView(BRect(10, 10, 209, 189), "outline", type)
	{
	}

	void SelectionChanged() override { changes++; }

	BRect LatchOf(int32 row)
	{
		return LatchRect(ItemFrame(row), static_cast<int32>(ItemAt(row)->OutlineLevel()));
	}

	int32 changes = 0;
};


std::string
TextOfItem(const BListItem* item)
{
	const BStringItem* string = dynamic_cast<const BStringItem*>(item);
	return string != nullptr ? string->Text() : "-";
}


int
CompareItems(const BListItem* a, const BListItem* b)
{
	return strcmp(TextOfItem(a).c_str(), TextOfItem(b).c_str());
}


int
CompareBackwards(const void* a, const void* b)
{
	return CompareItems(*static_cast<BListItem* const*>(b), *static_cast<BListItem* const*>(a));
}


// Text after the dots of the level.
class OutlineListViewTest : public ControlsTest {
protected:
	void SetUp() override
	{
		ControlsTest::SetUp();
		fList = Add(new OpenList(B_SINGLE_SELECTION_LIST));
	}

	void TearDown() override
	{
		ControlsTest::TearDown();
		for (BListItem* item : fItems)
			delete item;
	}

	BStringItem* NewItem(const char* text)
	{
		const uint32 level = static_cast<uint32>(strspn(text, "."));
		BStringItem* item = new BStringItem(text + level, level);
		fItems.push_back(item);
		return item;
	}

	void Fill(std::initializer_list<const char*> texts)
	{
		for (const char* text : texts)
			ASSERT_TRUE(fList->AddItem(NewItem(text)));
	}

	BListItem* Find(const char* text)
	{
		for (int32 i = 0; i < fList->FullListCountItems(); i++) {
			if (TextOfItem(fList->FullListItemAt(i)) == text)
				return fList->FullListItemAt(i);
		}
		return nullptr;
	}

	std::string Full()
	{
		std::string text;
		for (int32 i = 0; i < fList->FullListCountItems(); i++) {
			const BListItem* item = fList->FullListItemAt(i);
			text += (i > 0 ? " " : "") + std::string(item->OutlineLevel(), '.') + TextOfItem(item);
		}
		return text;
	}

	std::string Rows()
	{
		std::string text;
		for (int32 i = 0; i < fList->CountItems(); i++) {
			const std::string row = TextOfItem(fList->ItemAt(i));
			text += (i > 0 ? " " : "") + (fList->IsItemSelected(i) ? "[" + row + "]" : row);
		}
		return text;
	}

	std::string AskRows()
	{
		return Ask([this] { return Rows(); });
	}

	OpenList* fList = nullptr;
	std::vector<BListItem*> fItems;
};

} // namespace


TEST_F(OutlineListViewTest, NewListHasTheDocumentedState)
{
	BOutlineListView list(BRect(0, 0, 99, 99), "outline");
	EXPECT_TRUE(list.FullListIsEmpty());
	EXPECT_EQ(list.FullListCountItems(), 0);
	EXPECT_EQ(list.FullListFirstItem(), nullptr);
	EXPECT_EQ(list.FullListLastItem(), nullptr);
	EXPECT_EQ(list.FullListCurrentSelection(), -1);
	EXPECT_EQ(list.Flags(), B_WILL_DRAW | B_FRAME_EVENTS | B_NAVIGABLE);
	EXPECT_FALSE(list.IsExpanded(0));
	EXPECT_EQ(list.Superitem(NULL), nullptr);
}


TEST_F(OutlineListViewTest, ItemsLieUnderTheNextOneWithALowerLevel)
{
	Fill({"a", ".b", "..c", ".d", "e"});
	EXPECT_EQ(Full(), "a .b ..c .d e");
	EXPECT_EQ(fList->Superitem(Find("c")), Find("b"));
	EXPECT_EQ(fList->Superitem(Find("d")), Find("a"));
	EXPECT_EQ(fList->Superitem(Find("e")), nullptr);
	EXPECT_EQ(fList->CountItemsUnder(Find("a"), false), 3);
	EXPECT_EQ(fList->CountItemsUnder(Find("a"), true), 2);
	EXPECT_EQ(fList->CountItemsUnder(NULL, true), 2);
	EXPECT_EQ(fList->ItemUnderAt(Find("a"), true, 1), Find("d"));
	EXPECT_EQ(fList->ItemUnderAt(Find("a"), false, 1), Find("c"));
	EXPECT_EQ(fList->ItemUnderAt(Find("a"), true, 2), nullptr);
	EXPECT_EQ(fList->ItemUnderAt(Find("a"), true, -1), nullptr);
	BStringItem stranger("stranger");
	EXPECT_EQ(fList->CountItemsUnder(&stranger, false), 0);
	EXPECT_EQ(fList->Superitem(&stranger), nullptr);
}


TEST_F(OutlineListViewTest, AddUnderMakesTheFirstSubitem)
{
	Fill({"a", "e"});
	EXPECT_TRUE(fList->AddUnder(NewItem("c"), Find("a")));
	EXPECT_TRUE(fList->AddUnder(NewItem("b"), Find("a")));
	EXPECT_TRUE(fList->AddUnder(NewItem("d"), Find("c")));
	EXPECT_TRUE(fList->AddUnder(NewItem("top"), NULL));
	EXPECT_EQ(Full(), "top a .b .c ..d e");
	EXPECT_EQ(Rows(), "top a b c d e");
	EXPECT_FALSE(fList->AddUnder(Find("b"), Find("e")));
	EXPECT_FALSE(fList->AddUnder(NULL, Find("e")));
	BStringItem stranger("stranger");
	EXPECT_FALSE(fList->AddUnder(NewItem("x"), &stranger));
}


TEST_F(OutlineListViewTest, ItemsUnderACollapsedOneAreHidden)
{
	Fill({"a"});
	fList->Collapse(Find("a"));
	Fill({".b", "..c", "d", ".e"});
	EXPECT_EQ(Rows(), "a d e");
	EXPECT_EQ(fList->CountItems(), 3);
	EXPECT_EQ(fList->FullListCountItems(), 5);
	EXPECT_EQ(fList->IndexOf(Find("b")), -1);
	EXPECT_EQ(fList->FullListIndexOf(Find("e")), 4);
	EXPECT_FALSE(fList->IsExpanded(0));
	EXPECT_TRUE(fList->IsExpanded(3));
	fList->Expand(Find("a"));
	EXPECT_EQ(Rows(), "a b c d e");
}


TEST_F(OutlineListViewTest, ExpandingKeepsDeeperItemsCollapsed)
{
	Fill({"a", ".b", "..c", ".d"});
	fList->Collapse(Find("b"));
	EXPECT_EQ(Rows(), "a b d");
	fList->Collapse(Find("a"));
	EXPECT_EQ(Rows(), "a");
	fList->Expand(Find("a"));
	EXPECT_EQ(Rows(), "a b d");
	fList->Collapse(Find("a"));
	fList->Expand(Find("b"));
	EXPECT_EQ(Rows(), "a");
	fList->Expand(Find("a"));
	EXPECT_EQ(Rows(), "a b c d");
	fList->Expand(NULL);
	fList->Collapse(NULL);
	EXPECT_EQ(Rows(), "a b c d");
}


TEST_F(OutlineListViewTest, AddedItemMayTakeTheFollowingUnderItself)
{
	Fill({"a", ".b", ".c"});
	BStringItem* between = NewItem("x");
	between->SetExpanded(false);
	EXPECT_TRUE(fList->AddItem(between, 1));
	EXPECT_EQ(Full(), "a x .b .c");
	EXPECT_EQ(Rows(), "a x");
	EXPECT_FALSE(fList->AddItem(NewItem("y"), 5));
	EXPECT_FALSE(fList->AddItem(NewItem("y"), -1));
}


TEST_F(OutlineListViewTest, ListsOfItemsGoInAtTheirLevels)
{
	Fill({"a", "d"});
	BList list;
	list.AddItem(NewItem(".b"));
	list.AddItem(NewItem("..c"));
	EXPECT_TRUE(fList->AddList(&list, 1));
	EXPECT_EQ(Full(), "a .b ..c d");
	EXPECT_FALSE(fList->AddList(&list));
}


TEST_F(OutlineListViewTest, RemovingTakesTheSubitemsOut)
{
	Fill({"a", ".b", "..c", ".d", "e"});
	BListItem* b = Find("b");
	EXPECT_TRUE(fList->RemoveItem(b));
	EXPECT_EQ(Full(), "a .d e");
	EXPECT_EQ(Rows(), "a d e");
	EXPECT_EQ(TextOfItem(fList->RemoveItem(int32(0))), "a");
	EXPECT_EQ(Full(), "e");
	EXPECT_FALSE(fList->RemoveItem(b));
	EXPECT_EQ(fList->RemoveItem(int32(5)), nullptr);
	EXPECT_TRUE(fList->AddItem(b));
	EXPECT_EQ(Full(), "e .b");
	EXPECT_TRUE(fList->RemoveItems(0, 1));
	EXPECT_TRUE(fList->FullListIsEmpty());
	EXPECT_TRUE(fList->IsEmpty());
}


TEST_F(OutlineListViewTest, RemovingUnderACollapsedItemChangesNoRow)
{
	Fill({"a", ".b", ".c", "d"});
	fList->Collapse(Find("a"));
	fList->RemoveItem(Find("b"));
	EXPECT_EQ(Rows(), "a d");
	fList->RemoveItem(Find("c"));
	EXPECT_EQ(Rows(), "a d");
	fList->MakeEmpty();
	EXPECT_EQ(fList->FullListCountItems(), 0);
}


TEST_F(OutlineListViewTest, SelectionCountsRowsAndTheFullListItems)
{
	Fill({"a", ".b", "c"});
	fList->Collapse(Find("a"));
	fList->Select(1);
	EXPECT_EQ(Rows(), "a [c]");
	EXPECT_EQ(fList->CurrentSelection(), 1);
	EXPECT_EQ(fList->FullListCurrentSelection(), 2);
	EXPECT_EQ(fList->FullListCurrentSelection(1), -1);
	fList->Expand(Find("a"));
	EXPECT_EQ(Rows(), "a b [c]");
	EXPECT_EQ(fList->changes, 1);
}


TEST_F(OutlineListViewTest, HiddenSelectionGoesToItsSuperitem)
{
	Fill({"a", ".b", "c"});
	fList->Select(1);
	fList->changes = 0;
	fList->Collapse(Find("a"));
	EXPECT_EQ(Rows(), "[a] c");
	EXPECT_EQ(fList->changes, 1);
	EXPECT_FALSE(Find("b")->IsSelected());
}


TEST_F(OutlineListViewTest, SortingKeepsItemsUnderTheirSuperitems)
{
	Fill({"b", ".z", "..k", "..j", ".y", "a", ".x", ".w"});
	fList->Select(1);
	fList->FullListSortItems(CompareItems);
	EXPECT_EQ(Full(), "a .w .x b .y .z ..j ..k");
	EXPECT_EQ(Rows(), "a w x b y [z] j k");
	fList->SortItems(CompareBackwards);
	EXPECT_EQ(Full(), "b .z ..k ..j .y a .x .w");
	fList->SortItemsUnder(Find("b"), true, CompareItems);
	EXPECT_EQ(Full(), "b .y .z ..k ..j a .x .w");
	fList->SortItemsUnder(NULL, true, CompareItems);
	EXPECT_EQ(Full(), "a .x .w b .y .z ..k ..j");
	fList->SortItemsUnder(Find("b"), false, CompareItems);
	EXPECT_EQ(Full(), "a .x .w b .y .z ..j ..k");
	BStringItem stranger("stranger");
	fList->SortItemsUnder(&stranger, false, CompareItems);
	fList->FullListSortItems(NULL);
	EXPECT_EQ(Full(), "a .x .w b .y .z ..j ..k");
}


TEST_F(OutlineListViewTest, ItemsChangePlacesWithTheirSubitems)
{
	Fill({"a", ".b", "c", ".d", ".e"});
	EXPECT_TRUE(fList->SwapItems(0, 2));
	EXPECT_EQ(Full(), "c .d .e a .b");
	EXPECT_FALSE(fList->SwapItems(0, 1));
	EXPECT_FALSE(fList->MoveItem(0, 2));
	EXPECT_TRUE(fList->MoveItem(3, 0));
	EXPECT_EQ(Full(), "a .b c .d .e");
	EXPECT_TRUE(fList->MoveItem(0, 2));
	EXPECT_EQ(Full(), "c .d .e a .b");
	BStringItem* other = NewItem("other");
	BListItem* c = Find("c");
	EXPECT_TRUE(fList->ReplaceItem(0, other));
	EXPECT_EQ(Full(), "other .d .e a .b");
	EXPECT_FALSE(fList->FullListHasItem(c));
	fList->Collapse(other);
	EXPECT_EQ(Rows(), "other a b");
}


TEST_F(OutlineListViewTest, EachItemUnderStopsAtTheFirstFound)
{
	Fill({"a", ".b", "..c", ".d", "e"});
	const auto collect = [](BListItem* item, void* text) -> BListItem* {
		*static_cast<std::string*>(text) += TextOfItem(item);
		return TextOfItem(item) == "c" ? item : NULL;
	};
	std::string visited;
	EXPECT_EQ(fList->EachItemUnder(Find("a"), true, collect, &visited), nullptr);
	EXPECT_EQ(visited, "bd");
	visited.clear();
	EXPECT_EQ(fList->EachItemUnder(Find("a"), false, collect, &visited), Find("c"));
	EXPECT_EQ(visited, "bc");
	visited.clear();
	fList->FullListDoForEach(
		[](BListItem* item, void* text) {
			*static_cast<std::string*>(text) += TextOfItem(item);
			return TextOfItem(item) == "d";
		},
		&visited);
	EXPECT_EQ(visited, "abcd");
}


TEST_F(OutlineListViewTest, LatchExpandsAndCollapsesWithoutSelecting)
{
	Fill({"a", ".b", "..c", "d"});
	Show();
	const auto latch = [this](int32 row) {
		return Ask([this, row] {
			const BRect rect = fList->LatchOf(row);
			return fList->ConvertToParent(
				BPoint((rect.left + rect.right) / 2, (rect.top + rect.bottom) / 2));
		});
	};
	fRobot->Click(latch(1));
	EXPECT_EQ(AskRows(), "a b d");
	fRobot->Click(latch(0));
	EXPECT_EQ(AskRows(), "a d");
	fRobot->Click(latch(0));
	EXPECT_EQ(AskRows(), "a b d");
	// Released elsewhere.
	fRobot->Drag(latch(0), latch(0) + BPoint(80, 0));
	EXPECT_EQ(AskRows(), "a b d");
	// Where a latch would be, in a row without subitems.
	fRobot->Click(latch(2));
	EXPECT_EQ(AskRows(), "a b [d]");
}


TEST_F(OutlineListViewTest, ClickBesideTheLatchSelects)
{
	Fill({"a", ".b"});
	Show();
	const BPoint place = Ask(
		[this] { return fList->ConvertToParent(fList->LatchOf(1).RightTop() + BPoint(20, 4)); });
	fRobot->Click(place);
	EXPECT_EQ(AskRows(), "a [b]");
	EXPECT_EQ(Ask([&] { return fList->FullListIndexOf(fList->ConvertFromParent(place)); }), 1);
}


TEST_F(OutlineListViewTest, LeftAndRightWalkTheTree)
{
	Fill({"a", ".b", "..c", "d"});
	Show();
	Do([this] {
		fList->MakeFocus(true);
		fList->Select(0);
	});
	fRobot->Key("left");
	EXPECT_EQ(AskRows(), "[a] d");
	fRobot->Key("right");
	EXPECT_EQ(AskRows(), "[a] b c d");
	fRobot->Key("right");
	EXPECT_EQ(AskRows(), "a [b] c d");
	fRobot->Key("right");
	EXPECT_EQ(AskRows(), "a b [c] d");
	fRobot->Key("right");
	EXPECT_EQ(AskRows(), "a b [c] d");
	fRobot->Key("left");
	EXPECT_EQ(AskRows(), "a [b] c d");
	fRobot->Key("left");
	EXPECT_EQ(AskRows(), "a [b] d");
	fRobot->Key("left");
	fRobot->Key("left");
	EXPECT_EQ(AskRows(), "[a] d");
}


TEST_F(OutlineListViewTest, PressedLatchMayVanish)
{
	Fill({"a", ".b"});
	Show();
	const BPoint place = Ask([this] { return fList->ConvertToParent(BPoint(6, 6)); });
	fRobot->MoveTo(place);
	fRobot->Press();
	Do([this] { fList->RemoveItem(int32(0)); });
	fRobot->Release();
	EXPECT_EQ(AskRows(), "");
}


TEST_F(OutlineListViewTest, LargeTreeExpandsAndCollapses)
{
	constexpr int32 kCount = 20000;
	std::vector<std::unique_ptr<BStringItem>> items;
	items.push_back(std::make_unique<BStringItem>("root"));
	fList->AddItem(items[0].get());
	for (int32 i = 1; i < kCount; i++) {
		items.push_back(std::make_unique<BStringItem>("item"));
		ASSERT_TRUE(fList->AddUnder(items[i].get(), items[i % 100 == 0 ? 0 : i - 1].get()));
	}
	Show();
	Do([&] { fList->Collapse(items[0].get()); });
	EXPECT_EQ(Ask([this] { return fList->CountItems(); }), 1);
	Do([&] { fList->Expand(items[0].get()); });
	EXPECT_EQ(Ask([this] { return fList->CountItems(); }), kCount);
	EXPECT_EQ(Ask([&] { return fList->CountItemsUnder(items[0].get(), false); }), kCount - 1);
	Do([this] { fList->MakeEmpty(); });
}


TEST_F(OutlineListViewTest, ArchiveKeepsHiddenItems)
{
	Fill({"a", ".b", "c"});
	fList->Collapse(Find("a"));
	fList->Select(1);
	BMessage archive;
	ASSERT_EQ(fList->BOutlineListView::Archive(&archive), B_OK);
	archive.ReplaceString("class", "BOutlineListView");
	std::unique_ptr<BArchivable> object(BOutlineListView::Instantiate(&archive));
	BOutlineListView* copy = dynamic_cast<BOutlineListView*>(object.get());
	ASSERT_NE(copy, nullptr);
	EXPECT_EQ(copy->FullListCountItems(), 3);
	EXPECT_EQ(copy->CountItems(), 2);
	EXPECT_EQ(copy->FullListItemAt(1)->OutlineLevel(), 1u);
	EXPECT_EQ(copy->CurrentSelection(), 1);
	for (int32 i = 0; i < copy->FullListCountItems(); i++)
		fItems.push_back(copy->FullListItemAt(i));
}
