// SPDX-License-Identifier: MIT
// Tests of BTabView and BTab: selection, attaching, keyboard and mouse, layout of the tabs.
#include <TabView.h>

#include <Button.h>

#include "ControlsFixture.h"

namespace {

// Counts how often it is attached and detached, and when it is deleted.
class CountingPage : public BView {
public:
	CountingPage(BRect frame, const char* name, int32* deleted = nullptr)
		: BView(frame, name, B_FOLLOW_ALL, B_WILL_DRAW),
		  fDeleted(deleted)
	{
	}

	~CountingPage() override
	{
		if (fDeleted != nullptr)
			(*fDeleted)++;
	}

	void AttachedToWindow() override { attached++; }
	void DetachedFromWindow() override { detached++; }

	int32 attached = 0;
	int32 detached = 0;

private:
	int32* fDeleted;
};


// Notes what is selected.
class NotingTabView : public BTabView {
public:
	using BTabView::BTabView;

	void Select(int32 index) override
	{
		selected += std::to_string(index) + ' ';
		BTabView::Select(index);
	}

	std::string selected;
};


class TabViewTest : public ControlsTest {
protected:
	void SetUp() override
	{
		ControlsTest::SetUp();
		fTabs = Add(new NotingTabView(BRect(10, 10, 289, 189), "tabs", B_WIDTH_FROM_LABEL));
		const char* const kNames[] = {"one", "two", "three"};
		for (int i = 0; i < 3; i++) {
			fPages[i] = new CountingPage(BRect(2, 2, 101, 61), kNames[i]);
			fTabs->AddTab(fPages[i]);
		}
	}

	/// The middle of a tab, in the window.
	BPoint On(int32 index)
	{
		const BRect frame = Ask([&] { return fTabs->ConvertToParent(fTabs->TabFrame(index)); });
		return BPoint((frame.left + frame.right) / 2, (frame.top + frame.bottom) / 2);
	}

	int32 Selection()
	{
		return Ask([this] { return fTabs->Selection(); });
	}

	int32 FocusTab()
	{
		return Ask([this] { return fTabs->FocusTab(); });
	}

	NotingTabView* fTabs = nullptr;
	CountingPage* fPages[3] = {};
};

} // namespace


TEST_F(TabViewTest, FirstTabIsSelectedWhenItIsAttached)
{
	EXPECT_EQ(fTabs->CountTabs(), 3);
	BTabView detached(BRect(0, 0, 99, 99), "detached");
	detached.AddTab(new BView(BRect(0, 0, 9, 9), "page", B_FOLLOW_NONE, 0));
	EXPECT_EQ(detached.Selection(), -1);
	Show();
	EXPECT_EQ(Selection(), 0);
	EXPECT_EQ(fPages[0]->attached, 1);
	EXPECT_EQ(fPages[1]->attached, 0);
}


TEST_F(TabViewTest, TabsAreLabelledWithTheNamesOfTheirViews)
{
	EXPECT_STREQ(fTabs->TabAt(0)->Label(), "one");
	EXPECT_STREQ(fTabs->TabAt(2)->Label(), "three");
	BTab* tab = new BTab;
	tab->SetLabel("own");
	CountingPage* page = new CountingPage(BRect(0, 0, 9, 9), "page");
	fTabs->AddTab(page, tab);
	EXPECT_STREQ(fTabs->TabAt(3)->Label(), "own");
	EXPECT_EQ(fTabs->ViewForTab(3), page);
	EXPECT_EQ(fTabs->IndexOf(tab), 3);
	EXPECT_EQ(fTabs->TabAt(4), nullptr);
	EXPECT_EQ(fTabs->ViewForTab(-1), nullptr);
	EXPECT_EQ(fTabs->IndexOf(nullptr), -1);
}


TEST_F(TabViewTest, OnlyTheSelectedViewIsAttached)
{
	Show();
	Do([this] {
		EXPECT_EQ(fPages[0]->Parent(), fTabs->ContainerView());
		// It lies at its own frame.
		EXPECT_EQ(fPages[0]->Frame(), BRect(2, 2, 101, 61));
		fTabs->Select(2);
		EXPECT_EQ(fPages[0]->Window(), nullptr);
		EXPECT_EQ(fPages[0]->Parent(), nullptr);
		EXPECT_EQ(fPages[2]->Parent(), fTabs->ContainerView());
		EXPECT_TRUE(fTabs->TabAt(2)->IsSelected());
		EXPECT_FALSE(fTabs->TabAt(0)->IsSelected());
		fTabs->Select(0);
	});
	EXPECT_EQ(fPages[0]->attached, 2);
	EXPECT_EQ(fPages[0]->detached, 1);
	EXPECT_EQ(fPages[2]->attached, 1);
	EXPECT_EQ(fPages[2]->detached, 1);
}


TEST_F(TabViewTest, SelectOutOfRangeOrOfTheSameTabDoesNothing)
{
	Show();
	Do([this] {
		fTabs->Select(1);
		fTabs->Select(1);
		fTabs->Select(3);
		fTabs->Select(-1);
		EXPECT_EQ(fTabs->Selection(), 1);
	});
	EXPECT_EQ(fPages[1]->attached, 1);
	EXPECT_EQ(fPages[1]->detached, 0);
}


TEST_F(TabViewTest, ClickSelectsByWayOfTheHook)
{
	Show();
	fTabs->selected.clear();
	fRobot->Click(On(1));
	EXPECT_EQ(Selection(), 1);
	fRobot->Click(On(2));
	EXPECT_EQ(Selection(), 2);
	EXPECT_EQ(Ask([this] { return fTabs->selected; }), "1 2 ");
	// Beside the tabs.
	fRobot->Click(BPoint(280, 15));
	EXPECT_EQ(Selection(), 2);
}


TEST_F(TabViewTest, DisabledTabIsSelectedByProgramOnly)
{
	fTabs->TabAt(1)->SetEnabled(false);
	Show();
	fRobot->Click(On(1));
	EXPECT_EQ(Selection(), 0);
	Do([this] { fTabs->MakeFocus(); });
	fRobot->Key("right");
	EXPECT_EQ(Selection(), 2);
	Do([this] { fTabs->Select(1); });
	EXPECT_EQ(Selection(), 1);
}


TEST_F(TabViewTest, ArrowKeysSelectTheNextTab)
{
	Show();
	Do([this] { fTabs->MakeFocus(); });
	EXPECT_EQ(FocusTab(), 0);
	const struct {
		const char* key;
		int32 selection;
	} kRows[] = {{"right", 1}, {"down", 2}, {"right", 2}, {"left", 1}, {"up", 0}, {"left", 0},
		{"end", 2}, {"home", 0}};
	for (const auto& row : kRows) {
		fRobot->Key(row.key);
		EXPECT_EQ(Selection(), row.selection) << row.key;
		EXPECT_EQ(FocusTab(), row.selection) << row.key;
	}
}


TEST_F(TabViewTest, SpaceSelectsTheTabWithTheFocusMark)
{
	Show();
	Do([this] {
		fTabs->MakeFocus();
		fTabs->SetFocusTab(2, true);
		EXPECT_TRUE(fTabs->TabAt(2)->IsFocus());
		EXPECT_FALSE(fTabs->TabAt(0)->IsFocus());
	});
	EXPECT_EQ(Selection(), 0);
	fRobot->Key("space");
	EXPECT_EQ(Selection(), 2);
}


TEST_F(TabViewTest, LosingTheFocusTakesTheMarkAway)
{
	BButton* button = new BButton(BRect(5, 5, 60, 30), "button", "Button", nullptr);
	fPages[0]->AddChild(button);
	Show();
	Do([this] { fTabs->MakeFocus(); });
	fRobot->Key("tab");
	EXPECT_TRUE(Ask([&] { return button->IsFocus(); }));
	EXPECT_EQ(FocusTab(), -1);
	EXPECT_FALSE(Ask([this] { return fTabs->TabAt(0)->IsFocus(); }));
}


TEST_F(TabViewTest, SwitchingTakesTheFocusFromTheOldPage)
{
	BButton* button = new BButton(BRect(5, 5, 60, 30), "button", "Button", nullptr);
	fPages[0]->AddChild(button);
	Show();
	Do([&] { button->MakeFocus(); });
	fRobot->Click(On(1));
	EXPECT_EQ(Ask([this] { return fWindow->CurrentFocus(); }), nullptr);
	// The keyboard still finds its way.
	fRobot->Key("tab");
	EXPECT_TRUE(Ask([this] { return fTabs->IsFocus(); }));
}


TEST_F(TabViewTest, PagesFollowTheContainerWhetherOrNotTheyAreShown)
{
	Show();
	Do([this] {
		const float width = fTabs->ContainerView()->Bounds().Width();
		fTabs->ResizeBy(-40, -30);
		EXPECT_EQ(fTabs->ContainerView()->Bounds().Width(), width - 40);
		EXPECT_EQ(fPages[0]->Frame(), BRect(2, 2, 61, 31));
		EXPECT_EQ(fPages[1]->Frame(), BRect(2, 2, 101, 61));
		fTabs->Select(1);
		EXPECT_EQ(fPages[1]->Frame(), BRect(2, 2, 61, 31));
		fTabs->ResizeBy(40, 30);
		fTabs->Select(0);
		EXPECT_EQ(fPages[0]->Frame(), BRect(2, 2, 101, 61));
	});
}


TEST_F(TabViewTest, ContainerLiesBelowTheTabsInsideTheBorder)
{
	const float tabHeight = fTabs->TabHeight();
	EXPECT_EQ(fTabs->ContainerView()->Frame(), BRect(3, tabHeight + 3, 276, 176));
	fTabs->SetBorder(B_PLAIN_BORDER);
	EXPECT_EQ(fTabs->ContainerView()->Frame(), BRect(1, tabHeight + 1, 278, 178));
	fTabs->SetBorder(B_FANCY_BORDER);
	fTabs->SetTabHeight(40);
	EXPECT_EQ(fTabs->ContainerView()->Frame(), BRect(3, 43, 276, 176));
	fTabs->SetTabSide(BTabView::kBottomSide);
	EXPECT_EQ(fTabs->ContainerView()->Frame(), BRect(3, 3, 276, 179 - 40 - 3));
	EXPECT_EQ(fTabs->TabFrame(0).bottom, 179);
	fTabs->SetTabSide(BTabView::kLeftSide);
	EXPECT_EQ(fTabs->ContainerView()->Frame().left, fTabs->TabFrame(0).right + 3);
	fTabs->SetTabSide(BTabView::kRightSide);
	EXPECT_EQ(fTabs->ContainerView()->Frame().right, fTabs->TabFrame(0).left - 3);
}


TEST_F(TabViewTest, TabsAreAsWideAsAskedFor)
{
	EXPECT_EQ(fTabs->TabWidth(), B_WIDTH_FROM_LABEL);
	EXPECT_GT(fTabs->TabFrame(2).Width(), fTabs->TabFrame(0).Width());
	const float widest = fTabs->TabFrame(2).Width();
	fTabs->SetTabWidth(B_WIDTH_FROM_WIDEST);
	for (int32 i = 0; i < 3; i++)
		EXPECT_EQ(fTabs->TabFrame(i).Width(), widest) << i;
	EXPECT_EQ(fTabs->TabFrame(1).left, fTabs->TabFrame(0).right);
	fTabs->ResizeTo(900, 100);
	fTabs->TabAt(0)->SetLabel("a much longer label");
	EXPECT_GT(fTabs->TabFrame(1).Width(), widest);
	fTabs->SetTabWidth(B_WIDTH_AS_USUAL);
	EXPECT_EQ(fTabs->TabFrame(0).Width(), fTabs->TabFrame(2).Width());
}


TEST_F(TabViewTest, TabsThatDoNotFitAreReachedByTheArrows)
{
	for (int i = 0; i < 9; i++)
		fTabs->AddTab(new CountingPage(BRect(0, 0, 9, 9), "another page"));
	Show();
	EXPECT_TRUE(Ask([this] { return fTabs->TabFrame(0).IsValid(); }));
	EXPECT_FALSE(Ask([this] { return fTabs->TabFrame(11).IsValid(); }));

	// The arrow at the strip's end scrolls forwards, the one before it backwards.
	const BPoint forwards(279, 22), backwards(261, 22);
	for (int i = 0; i < 12; i++)
		fRobot->Click(forwards);
	EXPECT_TRUE(Ask([this] { return fTabs->TabFrame(11).IsValid(); }));
	EXPECT_FALSE(Ask([this] { return fTabs->TabFrame(0).IsValid(); }));
	EXPECT_EQ(Selection(), 0);
	fRobot->Click(On(11));
	EXPECT_EQ(Selection(), 11);
	for (int i = 0; i < 12; i++)
		fRobot->Click(backwards);
	EXPECT_TRUE(Ask([this] { return fTabs->TabFrame(0).IsValid(); }));
	EXPECT_EQ(Selection(), 11);
}


TEST_F(TabViewTest, SelectedTabIsScrolledToWhereItIsSeen)
{
	for (int i = 0; i < 9; i++)
		fTabs->AddTab(new CountingPage(BRect(0, 0, 9, 9), "another page"));
	Show();
	Do([this] {
		for (int32 index : {11, 5, 0, 7}) {
			fTabs->Select(index);
			EXPECT_TRUE(fTabs->TabFrame(index).IsValid()) << index;
			EXPECT_LE(fTabs->TabFrame(index).right, fTabs->Bounds().right - 36) << index;
		}
		// A strip with room again shows them from the first on.
		fTabs->ResizeTo(3000, 100);
	});
	EXPECT_TRUE(Ask([this] { return fTabs->TabFrame(0).IsValid(); }));
}


TEST_F(TabViewTest, RemovedTabIsTheCallersAndTheOneBeforeIsSelected)
{
	Show();
	int32 deleted = 0;
	Do([&] {
		fTabs->AddTab(new CountingPage(BRect(0, 0, 9, 9), "four", &deleted));
		fTabs->Select(3);
		BTab* tab = fTabs->RemoveTab(3);
		ASSERT_NE(tab, nullptr);
		EXPECT_EQ(fTabs->CountTabs(), 3);
		EXPECT_EQ(fTabs->Selection(), 2);
		EXPECT_EQ(tab->View()->Window(), nullptr);
		EXPECT_EQ(deleted, 0);
		delete tab;
		EXPECT_EQ(deleted, 1);
		EXPECT_EQ(fTabs->RemoveTab(3), nullptr);

		// Of the others the selection stays with its tab.
		delete fTabs->RemoveTab(0);
		EXPECT_EQ(fTabs->Selection(), 1);
		EXPECT_STREQ(fTabs->TabAt(1)->Label(), "three");
		delete fTabs->RemoveTab(1);
		delete fTabs->RemoveTab(0);
		EXPECT_EQ(fTabs->Selection(), -1);
		EXPECT_EQ(fTabs->CountTabs(), 0);
	});
}


TEST_F(TabViewTest, FirstTabOfAnAttachedViewIsSelectedAtOnce)
{
	BTabView* tabs = Add(new BTabView(BRect(10, 10, 99, 99), "empty"));
	Show();
	Do([&] {
		EXPECT_EQ(tabs->Selection(), -1);
		CountingPage* page = new CountingPage(BRect(0, 0, 9, 9), "page");
		tabs->AddTab(page);
		EXPECT_EQ(tabs->Selection(), 0);
		EXPECT_EQ(page->attached, 1);
	});
}


TEST_F(TabViewTest, NewViewOfTheSelectedTabIsShown)
{
	Show();
	int32 deleted = 0;
	Do([&] {
		CountingPage* page = new CountingPage(BRect(0, 0, 9, 9), "new", &deleted);
		fTabs->TabAt(0)->SetView(page);
		EXPECT_EQ(page->attached, 1);
		EXPECT_STREQ(fTabs->TabAt(0)->Label(), "one");
		fTabs->TabAt(0)->SetView(nullptr);
		EXPECT_EQ(deleted, 1);
		EXPECT_EQ(fTabs->ViewForTab(0), nullptr);
	});
	// A tab without a view can be left and come back to.
	fRobot->Click(On(1));
	fRobot->Click(On(0));
	EXPECT_EQ(Selection(), 0);
}


TEST_F(TabViewTest, DeletedTabViewDeletesAllViews)
{
	int32 deleted = 0;
	BTabView* tabs = new BTabView(BRect(0, 0, 99, 99), "tabs");
	for (const char* name : {"one", "two", "three"})
		tabs->AddTab(new CountingPage(BRect(0, 0, 9, 9), name, &deleted));
	tabs->Select(1);
	delete tabs;
	EXPECT_EQ(deleted, 3);
}


TEST_F(TabViewTest, ArchiveKeepsTabsAndViews)
{
	BTabView tabs(BRect(0, 0, 199, 99), "tabs", B_WIDTH_FROM_LABEL);
	tabs.AddTab(new BView(BRect(0, 0, 9, 9), "one", B_FOLLOW_NONE, 0));
	tabs.AddTab(new BView(BRect(0, 0, 19, 9), "two", B_FOLLOW_NONE, 0));
	tabs.TabAt(0)->SetEnabled(false);
	tabs.TabAt(1)->SetLabel("second");
	tabs.SetTabSide(BTabView::kLeftSide);
	tabs.SetBorder(B_PLAIN_BORDER);
	tabs.Select(1);
	BMessage archive;
	ASSERT_EQ(tabs.Archive(&archive), B_OK);
	std::unique_ptr<BArchivable> object(instantiate_object(&archive));
	const BTabView* copy = dynamic_cast<BTabView*>(object.get());
	ASSERT_NE(copy, nullptr);
	ASSERT_EQ(copy->CountTabs(), 2);
	EXPECT_EQ(copy->CountChildren(), 1);
	EXPECT_EQ(copy->Selection(), 1);
	EXPECT_EQ(copy->TabWidth(), B_WIDTH_FROM_LABEL);
	EXPECT_EQ(copy->TabSide(), BTabView::kLeftSide);
	EXPECT_EQ(copy->Border(), B_PLAIN_BORDER);
	EXPECT_FALSE(copy->TabAt(0)->IsEnabled());
	EXPECT_STREQ(copy->TabAt(1)->Label(), "second");
	ASSERT_NE(copy->ViewForTab(1), nullptr);
	EXPECT_EQ(copy->ViewForTab(1)->Frame(), BRect(0, 0, 19, 9));
}
