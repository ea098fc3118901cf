// SPDX-License-Identifier: MIT
// Tests of BView: the tree, its hooks, coordinates, resizing and the graphics state.
#include <View.h>

#include <limits>

#include <MessageFilter.h>
#include <Region.h>

#include "InterfaceFixture.h"
#include "support/Printers.h"

namespace {

using ViewTest = InterfaceTest;


BView*
MakeView(const char* name, BRect frame = BRect(0, 0, 9, 9), uint32 mode = B_FOLLOW_NONE)
{
	return new BView(frame, name, mode, 0);
}


// Attaches another view from within its own hook.
class GrowingView : public TreeView {
public:
	GrowingView(const char* name, Log* log)
		: TreeView(name, log),
		  fLog(log)
	{
	}

	void AttachedToWindow() override
	{
		TreeView::AttachedToWindow();
		AddChild(new TreeView("late", fLog));
	}

private:
	Log* fLog;
};


class FrameView : public BView {
public:
	FrameView(uint32 flags)
		: BView(BRect(10, 10, 29, 29), "frame", B_FOLLOW_NONE, flags)
	{
	}

	void FrameMoved(BPoint where) override { moves.push_back(where); }
	void FrameResized(float width, float height) override
	{
		sizes.push_back(BPoint(width, height));
	}

	std::vector<BPoint> moves;
	std::vector<BPoint> sizes;
};

} // namespace


TEST_F(ViewTest, NewViewHasTheDocumentedState)
{
	BView view(BRect(10, 20, 30, 60), "name", B_FOLLOW_RIGHT, B_WILL_DRAW | B_NAVIGABLE);
	EXPECT_STREQ(view.Name(), "name");
	EXPECT_EQ(view.Frame(), BRect(10, 20, 30, 60));
	EXPECT_EQ(view.Bounds(), BRect(0, 0, 20, 40));
	EXPECT_EQ(view.Flags(), B_WILL_DRAW | B_NAVIGABLE);
	EXPECT_EQ(view.ResizingMode(), B_FOLLOW_RIGHT);
	EXPECT_EQ(view.HighColor(), make_color(0, 0, 0));
	EXPECT_EQ(view.LowColor(), make_color(255, 255, 255));
	EXPECT_EQ(view.ViewColor(), make_color(255, 255, 255));
	EXPECT_EQ(view.PenLocation(), B_ORIGIN);
	EXPECT_EQ(view.PenSize(), 1);
	EXPECT_EQ(view.DrawingMode(), B_OP_COPY);
	EXPECT_EQ(view.Parent(), nullptr);
	EXPECT_EQ(view.Window(), nullptr);
	EXPECT_FALSE(view.IsHidden());
	BFont font;
	view.GetFont(&font);
	EXPECT_EQ(font, *be_plain_font);
}


TEST_F(ViewTest, FramesAreRoundedToWholePixels)
{
	BView view(BRect(1.4f, 1.6f, 11.9f, 11.6f), nullptr, B_FOLLOW_NONE, 0);
	EXPECT_EQ(view.Frame().LeftTop(), BPoint(1, 2));
	EXPECT_EQ(view.Bounds(), BRect(0, 0, 11, 10));
	view.MoveTo(3.5f, 2.2f);
	view.ResizeTo(4.6f, 7.4f);
	EXPECT_EQ(view.Frame(), BRect(4, 2, 9, 9));
}


TEST_F(ViewTest, ChildrenKeepTheirOrder)
{
	BView parent(BRect(0, 0, 99, 99), "parent", B_FOLLOW_NONE, 0);
	BView* a = MakeView("a");
	BView* b = MakeView("b");
	BView* c = MakeView("c");
	parent.AddChild(a);
	parent.AddChild(c);
	parent.AddChild(b, c);
	ASSERT_EQ(parent.CountChildren(), 3);
	EXPECT_EQ(parent.ChildAt(0), a);
	EXPECT_EQ(parent.ChildAt(1), b);
	EXPECT_EQ(parent.ChildAt(2), c);
	EXPECT_EQ(parent.ChildAt(3), nullptr);
	EXPECT_EQ(parent.ChildAt(-1), nullptr);
	EXPECT_EQ(b->PreviousSibling(), a);
	EXPECT_EQ(b->NextSibling(), c);
	EXPECT_EQ(a->PreviousSibling(), nullptr);
	EXPECT_EQ(c->NextSibling(), nullptr);

	EXPECT_TRUE(parent.RemoveChild(b));
	EXPECT_FALSE(parent.RemoveChild(b));
	EXPECT_FALSE(b->RemoveSelf());
	EXPECT_EQ(a->NextSibling(), c);
	EXPECT_EQ(b->Parent(), nullptr);
	parent.AddChild(b, a);
	EXPECT_EQ(parent.ChildAt(0), b);
}


TEST_F(ViewTest, FindViewSearchesDepthFirst)
{
	BView root(BRect(0, 0, 99, 99), "root", B_FOLLOW_NONE, 0);
	BView* first = MakeView("first");
	BView* deep = MakeView("twin");
	BView* twin = MakeView("twin");
	root.AddChild(first);
	first->AddChild(deep);
	root.AddChild(twin);
	EXPECT_EQ(root.FindView("root"), &root);
	EXPECT_EQ(root.FindView("twin"), deep);
	EXPECT_EQ(root.FindView("Twin"), nullptr);
	EXPECT_EQ(root.FindView(nullptr), nullptr);
}


TEST_F(ViewTest, DeletingAViewDeletesItsChildren)
{
	struct Counted : BView {
		Counted(int* count)
			: BView(BRect(), nullptr, 0, 0),
			  count(count)
		{
			++*count;
		}
		~Counted() override { --*count; }
		int* count;
	};

	int count = 0;
	auto* parent = new Counted(&count);
	parent->AddChild(new Counted(&count));
	parent->ChildAt(0)->AddChild(new Counted(&count));
	EXPECT_EQ(count, 3);
	delete parent;
	EXPECT_EQ(count, 0);
}


TEST_F(ViewTest, ScrolledViewsConvertCoordinates)
{
	BView parent(BRect(100, 50, 299, 249), "parent", B_FOLLOW_NONE, 0);
	BView* child = MakeView("child", BRect(10, 20, 59, 69));
	parent.AddChild(child);
	parent.ScrollTo(5, 7);
	child->ScrollTo(BPoint(3, 4));
	EXPECT_EQ(child->Bounds(), BRect(3, 4, 52, 53));
	EXPECT_EQ(child->Frame(), BRect(10, 20, 59, 69));
	EXPECT_EQ(child->LeftTop(), BPoint(3, 4));
	EXPECT_EQ(child->ConvertToParent(BPoint(3, 4)), BPoint(10, 20));
	EXPECT_EQ(child->ConvertFromParent(BPoint(10, 20)), BPoint(3, 4));
	EXPECT_EQ(child->ConvertToParent(BRect(3, 4, 5, 6)), BRect(10, 20, 12, 22));
	// Up through all parents: minus the bounds, plus the frame.
	EXPECT_EQ(child->ConvertToScreen(BPoint(3, 4)), BPoint(10 - 5 + 100, 20 - 7 + 50));
	EXPECT_EQ(child->ConvertFromScreen(BPoint(105, 63)), BPoint(3, 4));
	EXPECT_EQ(
		child->ConvertFromScreen(child->ConvertToScreen(BRect(1, 2, 3, 4))), BRect(1, 2, 3, 4));
}


TEST_F(ViewTest, FlagsAndResizingModeDoNotMix)
{
	BView view(BRect(0, 0, 9, 9), nullptr, B_FOLLOW_ALL, B_WILL_DRAW);
	view.SetFlags(view.Flags() | B_NAVIGABLE);
	EXPECT_EQ(view.Flags(), B_WILL_DRAW | B_NAVIGABLE);
	EXPECT_EQ(view.ResizingMode(), B_FOLLOW_ALL);
	view.SetResizingMode(B_FOLLOW_BOTTOM);
	EXPECT_EQ(view.Flags(), B_WILL_DRAW | B_NAVIGABLE);
	EXPECT_EQ(view.ResizingMode(), B_FOLLOW_BOTTOM);
}


TEST_F(ViewTest, HidingCounts)
{
	BView parent(BRect(0, 0, 99, 99), "parent", B_FOLLOW_NONE, 0);
	BView* child = MakeView("child");
	parent.AddChild(child);
	child->Hide();
	child->Hide();
	child->Show();
	EXPECT_TRUE(child->IsHidden());
	child->Show();
	EXPECT_FALSE(child->IsHidden());

	// A show too many needs another hide.
	child->Show();
	child->Hide();
	EXPECT_FALSE(child->IsHidden());
	child->Hide();
	EXPECT_TRUE(child->IsHidden());
	child->Show();

	parent.Hide();
	EXPECT_TRUE(child->IsHidden());
	EXPECT_FALSE(child->IsHidden(child));
}


TEST_F(ViewTest, PreferredSizeOfTheBaseIsTheCurrentOne)
{
	BView view(BRect(0, 0, 30, 40), nullptr, 0, 0);
	float width = 0, height = 0;
	view.GetPreferredSize(&width, &height);
	EXPECT_EQ(width, 30);
	EXPECT_EQ(height, 40);
	view.GetPreferredSize(nullptr, nullptr);
	view.ResizeToPreferred();
	EXPECT_EQ(view.Bounds(), BRect(0, 0, 30, 40));
}


TEST_F(ViewTest, PopStateBringsEverythingBack)
{
	BView view(BRect(0, 0, 9, 9), nullptr, 0, 0);
	view.SetHighColor(1, 2, 3);
	view.SetOrigin(5, 6);
	view.PushState();
	EXPECT_EQ(view.HighColor(), make_color(1, 2, 3));
	EXPECT_EQ(view.Origin(), B_ORIGIN);
	view.SetHighColor(9, 9, 9);
	view.SetPenSize(4);
	view.SetDrawingMode(B_OP_INVERT);
	view.MovePenTo(7, 7);
	view.SetFontSize(30);
	view.PopState();
	EXPECT_EQ(view.HighColor(), make_color(1, 2, 3));
	EXPECT_EQ(view.Origin(), BPoint(5, 6));
	EXPECT_EQ(view.PenSize(), 1);
	EXPECT_EQ(view.DrawingMode(), B_OP_COPY);
	EXPECT_EQ(view.PenLocation(), B_ORIGIN);
	BFont font;
	view.GetFont(&font);
	EXPECT_EQ(font.Size(), 12);
	view.PopState(); // one too many is harmless
}


TEST_F(ViewTest, FontMaskCopiesWhatItNames)
{
	BView view(BRect(0, 0, 9, 9), nullptr, 0, 0);
	view.SetFontSize(20);
	view.SetFont(be_bold_font, B_FONT_FAMILY_AND_STYLE);
	BFont font;
	view.GetFont(&font);
	EXPECT_EQ(font.Size(), 20);
	EXPECT_EQ(font.FamilyAndStyle(), be_bold_font->FamilyAndStyle());
	view.SetFont(be_plain_font);
	view.GetFont(&font);
	EXPECT_EQ(font, *be_plain_font);
}


TEST_F(ViewTest, UserColorsFollowTheirTint)
{
	BView view(BRect(0, 0, 9, 9), nullptr, 0, 0);
	view.SetViewUIColor(B_PANEL_BACKGROUND_COLOR);
	EXPECT_EQ(view.ViewColor(), ui_color(B_PANEL_BACKGROUND_COLOR));
	view.SetHighUIColor(B_PANEL_BACKGROUND_COLOR, B_DARKEN_1_TINT);
	EXPECT_EQ(view.HighColor(), tint_color(ui_color(B_PANEL_BACKGROUND_COLOR), B_DARKEN_1_TINT));
	float tint = 0;
	EXPECT_EQ(view.HighUIColor(&tint), B_PANEL_BACKGROUND_COLOR);
	EXPECT_EQ(tint, B_DARKEN_1_TINT);
	view.SetHighColor(1, 1, 1);
	EXPECT_EQ(view.HighUIColor(&tint), B_NO_COLOR);
	EXPECT_EQ(tint, B_NO_TINT);
	view.SetViewColor(2, 2, 2);
	EXPECT_EQ(view.ViewUIColor(), B_NO_COLOR);
}


TEST_F(ViewTest, AnUnattachedParentDoesNotMoveItsChildren)
{
	BView parent(BRect(0, 0, 99, 99), "parent", B_FOLLOW_NONE, 0);
	BView* child = MakeView("child", BRect(0, 0, 9, 9), B_FOLLOW_ALL);
	parent.AddChild(child);
	parent.ResizeBy(10, 10);
	EXPECT_EQ(child->Frame(), BRect(0, 0, 9, 9));
}


TEST_F(ViewTest, AttachingCallsHooksInOrder)
{
	Log log;
	auto* parent = new TreeView("parent", &log);
	auto* first = new TreeView("first", &log);
	parent->AddChild(first);
	first->AddChild(new TreeView("inner", &log));
	parent->AddChild(new TreeView("second", &log));
	EXPECT_TRUE(log.empty());

	BWindow* window = MakeWindow();
	window->AddChild(parent);
	EXPECT_EQ(log,
		(Log{"parent attached", "first attached", "inner attached", "inner all attached",
			"first all attached", "second attached", "second all attached",
			"parent all attached"}));
	EXPECT_EQ(parent->Parent(), nullptr);
	EXPECT_EQ(first->Parent(), parent);
	EXPECT_EQ(parent->Looper(), window);
	EXPECT_EQ(parent->NextHandler(), window);
	EXPECT_EQ(first->NextHandler(), parent);

	log.clear();
	EXPECT_TRUE(window->RemoveChild(parent));
	EXPECT_EQ(log,
		(Log{"parent detached", "first detached", "inner detached", "inner all detached",
			"first all detached", "second detached", "second all detached",
			"parent all detached"}));
	EXPECT_EQ(first->Window(), nullptr);
	EXPECT_EQ(first->Looper(), nullptr);
	delete parent;
	window->Quit();
}


TEST_F(ViewTest, ViewsAddedInAHookAreAttachedOnce)
{
	Log log;
	BWindow* window = MakeWindow();
	window->AddChild(new GrowingView("view", &log));
	EXPECT_EQ(
		log, (Log{"view attached", "late attached", "late all attached", "view all attached"}));
	log.clear();
	window->Quit();
	EXPECT_EQ(
		log, (Log{"view detached", "late detached", "late all detached", "view all detached"}));
}


TEST_F(ViewTest, AViewMayMoveToAnotherWindow)
{
	Log log;
	auto* view = new TreeView("view", &log);
	BWindow* first = MakeWindow();
	BWindow* second = MakeWindow();
	first->AddChild(view);
	view->MoveTo(30, 30);
	view->RemoveSelf();
	second->AddChild(view);
	EXPECT_EQ(view->Window(), second);
	EXPECT_EQ(view->Frame(), BRect(30, 30, 39, 39));
	first->Quit();
	second->Quit();
}


TEST_F(ViewTest, ResizingModesFollowTheirSides)
{
	struct {
		uint32 mode;
		BRect expected;
	} const rows[] = {
		{B_FOLLOW_NONE, BRect(10, 10, 29, 29)},
		{B_FOLLOW_LEFT | B_FOLLOW_TOP, BRect(10, 10, 29, 29)},
		{B_FOLLOW_RIGHT | B_FOLLOW_TOP, BRect(21, 10, 40, 29)},
		{B_FOLLOW_LEFT_RIGHT | B_FOLLOW_TOP, BRect(10, 10, 40, 29)},
		{B_FOLLOW_H_CENTER | B_FOLLOW_TOP, BRect(15, 10, 34, 29)},
		{B_FOLLOW_LEFT | B_FOLLOW_BOTTOM, BRect(10, 15, 29, 34)},
		{B_FOLLOW_LEFT | B_FOLLOW_TOP_BOTTOM, BRect(10, 10, 29, 34)},
		{B_FOLLOW_LEFT | B_FOLLOW_V_CENTER, BRect(10, 12, 29, 31)},
		{B_FOLLOW_RIGHT, BRect(21, 10, 40, 29)},
		{B_FOLLOW_ALL, BRect(10, 10, 40, 34)},
	};
	for (const auto& row : rows) {
		SCOPED_TRACE(row.mode);
		BWindow* window = MakeWindow();
		BView* parent = MakeView("parent", BRect(0, 0, 99, 99));
		BView* child = MakeView("child", BRect(10, 10, 29, 29), row.mode);
		window->AddChild(parent);
		parent->AddChild(child);
		parent->ResizeBy(11, 5);
		EXPECT_EQ(child->Frame(), row.expected);
		parent->ResizeBy(-11, -5);
		EXPECT_EQ(child->Frame(), BRect(10, 10, 29, 29));
		window->Quit();
	}
}


TEST_F(ViewTest, SizesMayShrinkBelowZeroAndComeBack)
{
	BWindow* window = MakeWindow();
	BView* parent = MakeView("parent", BRect(0, 0, 99, 99));
	BView* child = MakeView("child", BRect(10, 10, 89, 89), B_FOLLOW_ALL);
	window->AddChild(parent);
	parent->AddChild(child);
	parent->ResizeTo(4, 4);
	EXPECT_EQ(child->Bounds().Width(), -16);
	parent->ResizeTo(99, 99);
	EXPECT_EQ(child->Frame(), BRect(10, 10, 89, 89));
	window->Quit();
}


TEST_F(ViewTest, SizesThatAreNoNumbersLeaveTheChildrenAlone)
{
	const float nan = std::numeric_limits<float>::quiet_NaN();
	BWindow* window = MakeWindow();
	BView* parent = MakeView("parent", BRect(0, 0, 99, 99));
	BView* child = MakeView("child", BRect(10, 10, 89, 89), B_FOLLOW_ALL);
	window->AddChild(parent);
	parent->AddChild(child);
	parent->ResizeTo(nan, nan);
	parent->MoveTo(nan, nan);
	EXPECT_EQ(child->Frame(), BRect(10, 10, 89, 89));
	parent->MoveTo(0, 0);
	parent->ResizeTo(99, 99);
	EXPECT_EQ(parent->Frame(), BRect(0, 0, 99, 99));
	EXPECT_EQ(child->Frame(), BRect(10, 10, 89, 89));
	window->Quit();
}


TEST_F(ViewTest, FrameHooksComeAsMessagesToWhoWantsThem)
{
	BWindow* window = MakeWindow();
	auto* wants = new FrameView(B_FRAME_EVENTS);
	auto* wantsNot = new FrameView(0);
	window->AddChild(wants);
	window->AddChild(wantsNot);
	window->Run();
	window->Lock();
	wants->MoveTo(15, 16);
	wants->ResizeTo(40, 50);
	wantsNot->MoveTo(1, 1);
	EXPECT_EQ(wants->Frame(), BRect(15, 16, 55, 66));
	EXPECT_TRUE(wants->moves.empty());
	window->Unlock();
	Settle(window);
	EXPECT_EQ(wants->moves, std::vector<BPoint>({BPoint(15, 16)}));
	EXPECT_EQ(wants->sizes, std::vector<BPoint>({BPoint(40, 50)}));
	EXPECT_TRUE(wantsNot->moves.empty());
	Quit(window);
}


TEST_F(ViewTest, OnlyOneViewHasTheFocus)
{
	BWindow* window = MakeWindow();
	BView* a = MakeView("a");
	BView* b = MakeView("b");
	window->AddChild(a);
	window->AddChild(b);
	a->MakeFocus();
	EXPECT_TRUE(a->IsFocus());
	EXPECT_EQ(window->PreferredHandler(), a);
	b->MakeFocus();
	EXPECT_FALSE(a->IsFocus());
	EXPECT_EQ(window->CurrentFocus(), b);
	a->MakeFocus(false);
	EXPECT_EQ(window->CurrentFocus(), b);
	b->RemoveSelf();
	EXPECT_EQ(window->CurrentFocus(), nullptr);
	delete b;
	window->Quit();
}


TEST_F(ViewTest, DrawingWithoutAWindowIsHarmless)
{
	BView view(BRect(0, 0, 9, 9), nullptr, 0, 0);
	view.FillRect(view.Bounds());
	view.StrokeLine(BPoint(4, 5));
	EXPECT_EQ(view.PenLocation(), BPoint(4, 5));
	view.BeginLineArray(1);
	view.AddLine(BPoint(0, 0), BPoint(1, 1), make_color(1, 2, 3));
	view.EndLineArray();
	view.Invalidate();
	view.Sync();
	BRegion region(BRect(1, 1, 2, 2));
	view.GetClippingRegion(&region);
	EXPECT_EQ(region.CountRects(), 0);
	view.MovePenTo(0, 0);
	view.DrawString("text");
	EXPECT_EQ(view.PenLocation(), BPoint(view.StringWidth("text"), 0));
}


TEST_F(ViewTest, ArchivesKeepTheTree)
{
	BView view(BRect(1, 2, 30, 40), "archived", B_FOLLOW_RIGHT, B_WILL_DRAW);
	view.SetViewColor(1, 2, 3);
	view.SetHighColor(4, 5, 6);
	view.AddChild(MakeView("inner", BRect(3, 3, 7, 7)));
	BMessage archive;
	ASSERT_EQ(view.Archive(&archive), B_OK);
	BView* copy = dynamic_cast<BView*>(BView::Instantiate(&archive));
	ASSERT_NE(copy, nullptr);
	EXPECT_EQ(copy->Frame(), view.Frame());
	EXPECT_STREQ(copy->Name(), "archived");
	EXPECT_EQ(copy->Flags(), view.Flags());
	EXPECT_EQ(copy->ResizingMode(), view.ResizingMode());
	EXPECT_EQ(copy->ViewColor(), view.ViewColor());
	EXPECT_EQ(copy->HighColor(), view.HighColor());
	ASSERT_EQ(copy->CountChildren(), 1);
	EXPECT_EQ(copy->ChildAt(0)->Frame(), BRect(3, 3, 7, 7));
	delete copy;
}


TEST_F(ViewTest, AViewIsSmall)
{
	EXPECT_LE(sizeof(BView), 256u);
}
