// SPDX-License-Identifier: MIT
// Tests of BScrollView: where its parts are, its target, borders and resizing.
#include <ScrollView.h>

#include <ListView.h>

#include "ControlsFixture.h"

namespace {

// Keeps who targets it.
class TargetView : public BView {
public:
	TargetView(BRect frame, uint32 mode = B_FOLLOW_ALL)
		: BView(frame, "target", mode, B_WILL_DRAW)
	{
	}

	void TargetedByScrollView(BScrollView* scrollView) override
	{
		targetedBy.push_back(scrollView);
	}

	std::vector<BScrollView*> targetedBy;
};

class ScrollViewTest : public ControlsTest {};

const BRect kTarget(20, 30, 119, 109);

} // namespace


TEST_F(ScrollViewTest, FrameLiesAroundTheTarget)
{
	const struct {
		bool horizontal;
		bool vertical;
		border_style border;
		BRect frame;
		BRect target;
	} cases[] = {
		{false, false, B_FANCY_BORDER, BRect(18, 28, 121, 111), BRect(2, 2, 101, 81)},
		{false, true, B_FANCY_BORDER, BRect(18, 28, 135, 111), BRect(2, 2, 101, 81)},
		{true, true, B_FANCY_BORDER, BRect(18, 28, 135, 125), BRect(2, 2, 101, 81)},
		{true, false, B_PLAIN_BORDER, BRect(19, 29, 120, 124), BRect(1, 1, 100, 80)},
		{true, true, B_PLAIN_BORDER, BRect(19, 29, 134, 124), BRect(1, 1, 100, 80)},
		{false, false, B_NO_BORDER, BRect(20, 30, 119, 109), BRect(0, 0, 99, 79)},
		{true, true, B_NO_BORDER, BRect(20, 30, 134, 124), BRect(0, 0, 99, 79)},
	};
	for (const auto& row : cases) {
		SCOPED_TRACE(::testing::Message() << row.horizontal << row.vertical << row.border);
		TargetView* target = new TargetView(kTarget);
		BScrollView view(
			"scroll", target, B_FOLLOW_ALL, 0, row.horizontal, row.vertical, row.border);
		EXPECT_EQ(view.Frame(), row.frame);
		EXPECT_EQ(target->Frame(), row.target);
		EXPECT_EQ(target->Parent(), &view);
		EXPECT_EQ(view.Target(), target);
		EXPECT_EQ(view.Border(), row.border);
		EXPECT_EQ(target->targetedBy, std::vector<BScrollView*>{&view});
		EXPECT_EQ(view.ScrollBar(B_HORIZONTAL) != nullptr, row.horizontal);
		EXPECT_EQ(view.ScrollBar(B_VERTICAL) != nullptr, row.vertical);
	}
}


TEST_F(ScrollViewTest, BarsHaveTheirNamesRangesAndPlaces)
{
	TargetView* target = new TargetView(kTarget);
	BScrollView view("scroll", target, B_FOLLOW_ALL, 0, true, true);
	BScrollBar* across = view.ScrollBar(B_HORIZONTAL);
	BScrollBar* down = view.ScrollBar(B_VERTICAL);
	EXPECT_STREQ(across->Name(), "_HSB_");
	EXPECT_STREQ(down->Name(), "_VSB_");
	EXPECT_EQ(target->ScrollBar(B_HORIZONTAL), across);
	EXPECT_EQ(target->ScrollBar(B_VERTICAL), down);
	for (BScrollBar* bar : {across, down}) {
		float min, max;
		bar->GetRange(&min, &max);
		EXPECT_EQ(min, 0);
		EXPECT_EQ(max, 1000);
	}
	EXPECT_EQ(down->Frame().Width(), B_V_SCROLL_BAR_WIDTH);
	EXPECT_EQ(across->Frame().Height(), B_H_SCROLL_BAR_HEIGHT);
	EXPECT_EQ(down->Frame().left, target->Frame().right + 1);
	EXPECT_EQ(across->Frame().top, target->Frame().bottom + 1);
	EXPECT_TRUE(view.Bounds().Contains(down->Frame()));
	EXPECT_TRUE(view.Bounds().Contains(across->Frame()));
}


TEST_F(ScrollViewTest, ResizingStretchesTargetAndBars)
{
	TargetView* target = new TargetView(kTarget);
	BScrollView* view = Add(new BScrollView("scroll", target, B_FOLLOW_LEFT_TOP, 0, true, true));
	const BRect across = view->ScrollBar(B_HORIZONTAL)->Frame();
	const BRect down = view->ScrollBar(B_VERTICAL)->Frame();
	view->ResizeBy(30, 20);
	EXPECT_EQ(target->Frame(), BRect(2, 2, 131, 101));
	EXPECT_EQ(view->ScrollBar(B_HORIZONTAL)->Frame(),
		BRect(across.left, across.top + 20, across.right + 30, across.bottom + 20));
	EXPECT_EQ(view->ScrollBar(B_VERTICAL)->Frame(),
		BRect(down.left + 30, down.top, down.right + 30, down.bottom + 20));
	view->ResizeBy(-30, -20);
	EXPECT_EQ(target->Frame(), BRect(2, 2, 101, 81));
	EXPECT_EQ(view->ScrollBar(B_VERTICAL)->Frame(), down);
}


TEST_F(ScrollViewTest, ReleasedTargetIsTheCallersAgain)
{
	TargetView* target = new TargetView(kTarget);
	BScrollView* view = Add(new BScrollView("scroll", target, B_FOLLOW_ALL, 0, true, true));
	view->SetTarget(NULL);
	EXPECT_EQ(view->Target(), nullptr);
	EXPECT_EQ(target->Parent(), nullptr);
	EXPECT_EQ(target->ScrollBar(B_VERTICAL), nullptr);
	EXPECT_EQ(target->targetedBy, (std::vector<BScrollView*>{view, nullptr}));

	TargetView* other = new TargetView(BRect(0, 0, 9, 9));
	view->SetTarget(other);
	EXPECT_EQ(other->Frame(), BRect(2, 2, 101, 81));
	EXPECT_EQ(other->ScrollBar(B_VERTICAL), view->ScrollBar(B_VERTICAL));
	EXPECT_EQ(view->ChildAt(0), other);
	delete target;
}


TEST_F(ScrollViewTest, ViewWithoutATargetCanGetOne)
{
	BScrollView view("scroll", NULL, B_FOLLOW_ALL, 0, true, true);
	EXPECT_EQ(view.Target(), nullptr);
	EXPECT_TRUE(view.Bounds().IsValid());
	TargetView* target = new TargetView(kTarget);
	view.SetTarget(target);
	EXPECT_EQ(view.Target(), target);
	EXPECT_TRUE(view.Bounds().Contains(target->Frame()));
}


TEST_F(ScrollViewTest, AnotherBorderKeepsTheFrame)
{
	TargetView* target = new TargetView(kTarget);
	BScrollView* view = Add(new BScrollView("scroll", target, B_FOLLOW_ALL, 0, true, true));
	const BRect frame = view->Frame();
	view->SetBorder(B_PLAIN_BORDER);
	EXPECT_EQ(view->Frame(), frame);
	EXPECT_EQ(target->Frame(), BRect(1, 1, 102, 82));
	EXPECT_EQ(view->ScrollBar(B_VERTICAL)->Frame().right, view->Bounds().right);
	view->SetBorder(B_NO_BORDER);
	EXPECT_EQ(target->Frame(), BRect(0, 0, 102, 82));
	view->SetBorder(B_FANCY_BORDER);
	EXPECT_EQ(target->Frame(), BRect(2, 2, 101, 81));
}


TEST_F(ScrollViewTest, OnlyBordersAreHighlighted)
{
	TargetView* target = new TargetView(kTarget);
	BScrollView view("scroll", target, B_FOLLOW_ALL, 0, true, true);
	EXPECT_FALSE(view.IsBorderHighlighted());
	EXPECT_EQ(view.SetBorderHighlighted(true), B_OK);
	EXPECT_TRUE(view.IsBorderHighlighted());
	view.SetBorder(B_NO_BORDER);
	EXPECT_FALSE(view.IsBorderHighlighted());
	EXPECT_EQ(view.SetBorderHighlighted(true), B_ERROR);
	EXPECT_FALSE(view.IsBorderHighlighted());
}


TEST_F(ScrollViewTest, FocusOfAListHighlightsTheBorder)
{
	BListView* list = new BListView(kTarget, "list", B_SINGLE_SELECTION_LIST, B_FOLLOW_ALL);
	BScrollView* view = Add(new BScrollView("scroll", list, B_FOLLOW_ALL, 0, false, true));
	Show();
	Do([list] { list->MakeFocus(true); });
	EXPECT_TRUE(Ask([view] { return view->IsBorderHighlighted(); }));
	Do([list] { list->MakeFocus(false); });
	EXPECT_FALSE(Ask([view] { return view->IsBorderHighlighted(); }));
}


TEST_F(ScrollViewTest, WheelOverTheCornerScrolls)
{
	TargetView* target = new TargetView(kTarget);
	BScrollView* view = Add(new BScrollView("scroll", target, B_FOLLOW_NONE, 0, true, true));
	Show();
	fRobot->MoveTo(BPoint(18 + 112, 28 + 92));
	fRobot->Wheel(2);
	EXPECT_EQ(Ask([view] { return view->ScrollBar(B_VERTICAL)->Value(); }), 6);
	EXPECT_EQ(Ask([target] { return target->LeftTop(); }), BPoint(0, 6));
}


TEST_F(ScrollViewTest, ArchiveBringsBarsAndTargetBack)
{
	BListView* list = new BListView(kTarget, "list", B_SINGLE_SELECTION_LIST, B_FOLLOW_ALL);
	BScrollView view("scroll", list, B_FOLLOW_ALL, 0, true, false, B_PLAIN_BORDER);
	BMessage archive;
	ASSERT_EQ(view.Archive(&archive, true), B_OK);
	std::unique_ptr<BArchivable> object(BScrollView::Instantiate(&archive));
	BScrollView* copy = dynamic_cast<BScrollView*>(object.get());
	ASSERT_NE(copy, nullptr);
	EXPECT_EQ(copy->Border(), B_PLAIN_BORDER);
	EXPECT_EQ(copy->Frame(), view.Frame());
	ASSERT_NE(dynamic_cast<BListView*>(copy->Target()), nullptr);
	ASSERT_NE(copy->ScrollBar(B_HORIZONTAL), nullptr);
	EXPECT_EQ(copy->ScrollBar(B_VERTICAL), nullptr);
	EXPECT_EQ(copy->Target()->ScrollBar(B_HORIZONTAL), copy->ScrollBar(B_HORIZONTAL));
}
