// SPDX-License-Identifier: MIT
// Tests of updates and pixels, on a display that draws without a screen.
#include <View.h>

#include <Bitmap.h>
#include <OS.h>
#include <Region.h>
#include <Window.h>

#include "InterfaceFixture.h"
#include "support/Printers.h"

namespace {

const rgb_color kRed = {255, 0, 0, 255};
const rgb_color kGreen = {0, 255, 0, 255};
const rgb_color kBlue = {0, 0, 255, 255};
const rgb_color kWhite = {255, 255, 255, 255};


rgb_color
PixelOf(const BBitmap& bitmap, int32 x, int32 y)
{
	const uint8* pixel =
		static_cast<const uint8*>(bitmap.Bits()) + y * bitmap.BytesPerRow() + x * 4;
	return {pixel[2], pixel[1], pixel[0], 255};
}


// A bitmap of 20 x 20 with a view all over it.
class BitmapCanvasTest : public InterfaceTest {
protected:
	void SetUp() override
	{
		fBitmap = std::make_unique<BBitmap>(BRect(0, 0, 19, 19), B_RGB32, true);
		ASSERT_EQ(fBitmap->InitCheck(), B_OK);
		fView = new BView(fBitmap->Bounds(), "view", B_FOLLOW_NONE, B_WILL_DRAW);
		fBitmap->AddChild(fView);
		ASSERT_TRUE(fBitmap->Lock());
	}

	void TearDown() override
	{
		fBitmap->Unlock();
		fBitmap.reset();
	}

	rgb_color At(int32 x, int32 y)
	{
		fView->Sync();
		return PixelOf(*fBitmap, x, y);
	}

	// How many pixels have the colour.
	int32 Count(rgb_color color)
	{
		int32 count = 0;
		for (int32 y = 0; y < 20; y++) {
			for (int32 x = 0; x < 20; x++)
				count += At(x, y) == color;
		}
		return count;
	}

	std::unique_ptr<BBitmap> fBitmap;
	BView* fView = nullptr;
};


class DrawnView : public BView {
public:
	DrawnView(BRect frame, const char* name, Log* log, uint32 flags = B_WILL_DRAW)
		: BView(frame, name, B_FOLLOW_ALL, flags),
		  fLog(log)
	{
	}

	void Draw(BRect updateRect) override
	{
		char text[80];
		snprintf(text, sizeof(text), "%s %g,%g,%g,%g", Name(), updateRect.left, updateRect.top,
			updateRect.right, updateRect.bottom);
		fLog->push_back(text);
		EXPECT_EQ(HighColor(), make_color(0, 0, 0)) << "the state of the last time was kept";
		SetHighColor(kRed);
		SetPenSize(7);
	}

	void DrawAfterChildren(BRect) override { fLog->push_back(std::string(Name()) + " after"); }

private:
	Log* fLog;
};


class UpdateTest : public InterfaceTest {
protected:
	void SetUp() override
	{
		fWindow = MakeWindow();
		fParent = new DrawnView(BRect(0, 0, 200, 100), "parent", &fLog);
		fWindow->AddChild(fParent);
	}

	void TearDown() override { Quit(fWindow); }

	void ShowAndSettle()
	{
		fWindow->Show();
		Settle(fWindow);
		TakeLog();
	}

	Log TakeLog()
	{
		Settle(fWindow);
		fWindow->Lock();
		Log log;
		log.swap(fLog);
		fWindow->Unlock();
		return log;
	}

	BWindow* fWindow;
	DrawnView* fParent;
	Log fLog;
};

} // namespace


TEST_F(BitmapCanvasTest, StartsWhite)
{
	EXPECT_EQ(Count(kWhite), 400);
}


TEST_F(BitmapCanvasTest, FilledRectsCoverAllFourSides)
{
	fView->SetHighColor(kRed);
	fView->FillRect(BRect(2, 3, 5, 8));
	EXPECT_EQ(Count(kRed), 4 * 6);
	EXPECT_EQ(At(2, 3), kRed);
	EXPECT_EQ(At(5, 8), kRed);
	EXPECT_EQ(At(6, 8), kWhite);
}


TEST_F(BitmapCanvasTest, StrokedRectsCoverTheirSidesOnly)
{
	fView->SetHighColor(kRed);
	fView->StrokeRect(BRect(2, 3, 5, 8));
	EXPECT_EQ(Count(kRed), 4 * 6 - 2 * 4);
	EXPECT_EQ(At(3, 4), kWhite);
}


TEST_F(BitmapCanvasTest, LinesCoverBothEnds)
{
	fView->SetHighColor(kRed);
	fView->StrokeLine(BPoint(3, 3), BPoint(7, 3));
	EXPECT_EQ(Count(kRed), 5);
	EXPECT_EQ(fView->PenLocation(), BPoint(7, 3));
	fView->StrokeLine(BPoint(7, 6));
	EXPECT_EQ(Count(kRed), 8);
}


TEST_F(BitmapCanvasTest, LineArraysHaveTheirOwnColorsAndDropTheRest)
{
	fView->SetHighColor(kRed);
	fView->BeginLineArray(2);
	fView->AddLine(BPoint(0, 0), BPoint(4, 0), kGreen);
	fView->AddLine(BPoint(0, 2), BPoint(4, 2), kBlue);
	fView->AddLine(BPoint(0, 4), BPoint(4, 4), kGreen);
	EXPECT_EQ(Count(kGreen), 0);
	fView->EndLineArray();
	EXPECT_EQ(Count(kGreen), 5);
	EXPECT_EQ(Count(kBlue), 5);
	EXPECT_EQ(fView->HighColor(), kRed);
	fView->EndLineArray();
	EXPECT_EQ(Count(kRed), 0);
}


TEST_F(BitmapCanvasTest, OriginAndScrollingMoveWhatIsDrawn)
{
	fView->SetHighColor(kRed);
	fView->SetOrigin(5, 5);
	fView->FillRect(BRect(0, 0, 0, 0));
	EXPECT_EQ(At(5, 5), kRed);
	fView->PushState();
	fView->SetOrigin(1, 0);
	fView->FillRect(BRect(0, 0, 0, 0));
	EXPECT_EQ(At(6, 5), kRed);
	fView->PopState();
	fView->SetOrigin(B_ORIGIN);
	fView->ScrollTo(0, -10);
	fView->FillRect(BRect(0, 0, 0, 0));
	EXPECT_EQ(At(0, 10), kRed);
}


TEST_F(BitmapCanvasTest, ClippingNarrowsAndComesBack)
{
	BRegion clip(BRect(0, 0, 9, 9));
	fView->SetHighColor(kRed);
	fView->PushState();
	fView->ConstrainClippingRegion(&clip);
	fView->PushState();
	BRegion inner(BRect(5, 5, 14, 14));
	fView->ConstrainClippingRegion(&inner);
	fView->FillRect(fView->Bounds());
	EXPECT_EQ(Count(kRed), 25);
	fView->ConstrainClippingRegion(nullptr);
	fView->FillRect(fView->Bounds());
	EXPECT_EQ(Count(kRed), 100);
	fView->PopState();
	fView->PopState();
	fView->FillRect(fView->Bounds());
	EXPECT_EQ(Count(kRed), 400);
}


TEST_F(BitmapCanvasTest, ChildrenAreLeftOutUnlessTheParentDrawsOnThem)
{
	fView->AddChild(new BView(BRect(5, 5, 14, 14), "child", B_FOLLOW_NONE, 0));
	fView->SetHighColor(kRed);
	fView->FillRect(fView->Bounds());
	EXPECT_EQ(Count(kRed), 300);
	BRegion visible;
	fView->GetClippingRegion(&visible);
	EXPECT_FALSE(visible.Contains(BPoint(7, 7)));
	fView->SetFlags(fView->Flags() | B_DRAW_ON_CHILDREN);
	fView->FillRect(fView->Bounds());
	EXPECT_EQ(Count(kRed), 400);
}


TEST_F(BitmapCanvasTest, InvertedTwiceIsAsBefore)
{
	fView->SetHighColor(kRed);
	fView->FillRect(BRect(0, 0, 4, 4));
	fView->InvertRect(BRect(0, 0, 9, 9));
	EXPECT_EQ(At(1, 1), make_color(0, 255, 255));
	EXPECT_EQ(At(8, 8), make_color(0, 0, 0));
	fView->InvertRect(BRect(0, 0, 9, 9));
	EXPECT_EQ(Count(kRed), 25);
}


TEST_F(BitmapCanvasTest, BitmapsAreDrawnWithoutTheirTransparentPixels)
{
	BBitmap small(BRect(0, 0, 3, 3), B_RGBA32);
	auto* pixels = static_cast<uint32*>(small.Bits());
	for (int i = 0; i < 16; i++)
		pixels[i] = i % 4 == 0 ? 0 : 0xff00ff00;
	fView->SetDrawingMode(B_OP_OVER);
	fView->DrawBitmap(&small, BPoint(2, 2));
	EXPECT_EQ(Count(kGreen), 12);
	EXPECT_EQ(At(2, 2), kWhite);
	EXPECT_EQ(At(3, 2), kGreen);
}


TEST_F(BitmapCanvasTest, TextMovesThePen)
{
	fView->SetLowColor(kWhite);
	fView->DrawString("II", BPoint(2, 15));
	EXPECT_NEAR(fView->PenLocation().x, 2 + fView->StringWidth("II"), 1);
	EXPECT_EQ(fView->PenLocation().y, 15);
	EXPECT_LT(Count(kWhite), 400);
}


TEST_F(UpdateTest, ShowingDrawsParentsBeforeChildren)
{
	fParent->AddChild(new DrawnView(BRect(10, 10, 20, 20), "child", &fLog));
	fWindow->Show();
	EXPECT_EQ(TakeLog(), (Log{"parent 0,0,200,100", "child 0,0,10,10"}));
}


TEST_F(UpdateTest, InvalidationsMergeUntilTheUpdate)
{
	ShowAndSettle();
	fWindow->Lock();
	fParent->Invalidate(BRect(10, 10, 20, 20));
	fParent->Invalidate(BRect(30.9f, 10, 40.9f, 20));
	EXPECT_TRUE(fLog.empty());
	EXPECT_TRUE(fWindow->NeedsUpdate());
	fWindow->Unlock();
	EXPECT_EQ(TakeLog(), (Log{"parent 10,10,40,20"}));
	EXPECT_FALSE(fWindow->NeedsUpdate());
}


TEST_F(UpdateTest, OnlyWhatIsTouchedIsDrawn)
{
	fParent->AddChild(new DrawnView(BRect(10, 10, 20, 20), "a", &fLog));
	fParent->AddChild(new DrawnView(BRect(30, 10, 40, 20), "b", &fLog));
	ShowAndSettle();
	fWindow->Lock();
	fParent->Invalidate(BRect(30, 10, 35, 15));
	fWindow->Unlock();
	EXPECT_EQ(TakeLog(), (Log{"b 0,0,5,5"}));
}


TEST_F(UpdateTest, DisabledUpdatesWaitForTheLastEnable)
{
	ShowAndSettle();
	fWindow->Lock();
	fWindow->DisableUpdates();
	fWindow->DisableUpdates();
	fParent->Invalidate();
	fWindow->EnableUpdates();
	fWindow->Unlock();
	EXPECT_EQ(TakeLog(), Log());
	fWindow->Lock();
	fWindow->EnableUpdates();
	fWindow->Unlock();
	EXPECT_EQ(TakeLog(), (Log{"parent 0,0,200,100"}));
}


TEST_F(UpdateTest, HiddenViewsAndViewsThatDoNotDrawAreNotAsked)
{
	auto* hidden = new DrawnView(BRect(10, 10, 20, 20), "hidden", &fLog);
	hidden->Hide();
	fParent->AddChild(hidden);
	fParent->AddChild(new DrawnView(BRect(30, 10, 40, 20), "passive", &fLog, 0));
	fWindow->Show();
	EXPECT_EQ(TakeLog(), (Log{"parent 0,0,200,100"}));
	fWindow->Lock();
	hidden->Show();
	fWindow->Unlock();
	EXPECT_EQ(TakeLog(), (Log{"hidden 0,0,10,10"}));
}


TEST_F(UpdateTest, GrowingDrawsTheNewPartUnlessAllIsWanted)
{
	for (uint32 extra : {uint32(0), B_FULL_UPDATE_ON_RESIZE}) {
		SCOPED_TRACE(extra);
		auto* child = new DrawnView(BRect(10, 10, 20, 20), "child", &fLog, B_WILL_DRAW | extra);
		if (!fWindow->IsHidden())
			fWindow->Lock();
		fParent->AddChild(child);
		if (fWindow->IsHidden())
			ShowAndSettle();
		else {
			fWindow->Unlock();
			TakeLog();
		}
		fWindow->Lock();
		child->ResizeTo(15, 10);
		fWindow->Unlock();
		EXPECT_EQ(TakeLog(), (Log{extra != 0 ? "child 0,0,15,10" : "child 11,0,15,10"}));
		fWindow->Lock();
		child->RemoveSelf();
		delete child;
		fWindow->Unlock();
		TakeLog();
	}
}


TEST_F(UpdateTest, DrawAfterChildrenComesLast)
{
	auto* over =
		new DrawnView(BRect(10, 10, 60, 60), "over", &fLog, B_WILL_DRAW | B_DRAW_ON_CHILDREN);
	over->AddChild(new DrawnView(BRect(0, 0, 9, 9), "child", &fLog));
	fParent->AddChild(over);
	fWindow->Show();
	EXPECT_EQ(
		TakeLog(), (Log{"parent 0,0,200,100", "over 0,0,50,50", "child 0,0,9,9", "over after"}));
}


TEST_F(UpdateTest, ScrollingDrawsWhatComesIntoSight)
{
	ShowAndSettle();
	fWindow->Lock();
	fParent->ScrollTo(0, 10);
	fWindow->Unlock();
	EXPECT_EQ(TakeLog(), (Log{"parent 0,101,200,110"}));
}


TEST_F(UpdateTest, InsideDrawTheClippingIsWhatIsUpdated)
{
	class ClipView : public BView {
	public:
		ClipView()
			: BView(BRect(0, 0, 50, 50), "clip", B_FOLLOW_NONE, B_WILL_DRAW)
		{
		}
		void Draw(BRect) override { GetClippingRegion(&region); }
		BRegion region;
	};
	auto* view = new ClipView;
	fParent->AddChild(view);
	ShowAndSettle();
	fWindow->Lock();
	view->Invalidate(BRect(5, 5, 8, 8));
	fWindow->Unlock();
	TakeLog();
	EXPECT_EQ(view->region, BRegion(BRect(5, 5, 8, 8)));
	fWindow->Lock();
	view->GetClippingRegion(&view->region);
	EXPECT_EQ(view->region, BRegion(BRect(0, 0, 50, 50)));
	fWindow->Unlock();
}
