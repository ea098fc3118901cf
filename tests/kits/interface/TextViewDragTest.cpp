// SPDX-License-Identifier: MIT
// Tests of BTextView and BTextControl: selecting beyond the edge scrolls what is there into sight.
#include <TextView.h>

#include <cmath>

#include <OS.h>
#include <ScrollView.h>
#include <TextControl.h>

#include "ControlsFixture.h"

namespace {

// Keeps the ways that it was scrolled.
class WatchedView : public BTextView {
public:
	WatchedView()
		: BTextView(BRect(50, 50, 199, 129), "text", BRect(4, 4, 145, 75), B_FOLLOW_LEFT_TOP,
			B_WILL_DRAW | B_NAVIGABLE)
	{
	}

	void ScrollTo(BPoint where) override
	{
		steps.push_back(where - Bounds().LeftTop());
		BTextView::ScrollTo(where);
	}

	std::vector<BPoint> steps;
};


class TextViewDragTest : public ControlsTest {
protected:
	void Show(BTextView* view, const std::string& text)
	{
		fView = view;
		ControlsTest::Show();
		Do([&] {
			fView->SetText(text.c_str());
			fView->MakeFocus();
		});
	}

	void ShowLines(int32 count)
	{
		std::string text;
		for (int32 i = 0; i < count; i++)
			text += std::to_string(100 + i) + "\n";
		Show(Add(new WatchedView), text);
	}

	BPoint Place()
	{
		return Ask([this] { return fView->Bounds().LeftTop(); });
	}

	int32 Caret()
	{
		return Ask([this] {
			int32 start, end;
			fView->GetSelection(&start, &end);
			return start == fAnchor ? end : start;
		});
	}

	template <typename Condition>
	bool Becomes(Condition condition)
	{
		const bigtime_t limit = system_time() + 10000000;
		while (!Ask(condition)) {
			if (system_time() > limit)
				return false;
			snooze(5000);
		}
		return true;
	}

	/// The pointer is pressed at the text's offset, and moved to a place of the window.
	void DragFrom(int32 offset, BPoint to)
	{
		fAnchor = offset;
		const BPoint from = Ask([&] {
			return fView->ConvertToScreen(fView->PointAt(offset)) - fWindow->Frame().LeftTop();
		});
		fRobot->MoveTo(from + BPoint(0, 3));
		fRobot->Press();
		fRobot->MoveTo(to);
	}

	/// Nothing scrolls any more.
	bool StandsStill()
	{
		const BPoint place = Place();
		snooze(150000);
		return Place() == place;
	}

	BTextView* fView = nullptr;
	int32 fAnchor = 0;
};

} // namespace


TEST_F(TextViewDragTest, TextScrollsWhileThePointerRestsBelow)
{
	ShowLines(20);
	DragFrom(0, BPoint(60, 170));
	ASSERT_TRUE(Becomes([this] { return fView->Bounds().top > 40; }));
	// What is selected has come into sight.
	const BRect seen = Ask([this] { return fView->Bounds(); });
	const float caret = Ask([this] {
		int32 end;
		fView->GetSelection(NULL, &end);
		return fView->PointAt(end).y;
	});
	EXPECT_LE(caret, seen.bottom + 100);
	EXPECT_GE(caret, seen.top);

	const float last = Ask([this] { return fView->TextHeight(0, 20) + 8 - 80; });
	EXPECT_TRUE(Becomes([&] { return fView->Bounds().top == std::ceil(last); }));
	EXPECT_TRUE(Becomes([this] {
		int32 end;
		fView->GetSelection(NULL, &end);
		return end == fView->TextLength();
	}));
	fRobot->Release();
	EXPECT_EQ(Caret(), 80);
}


TEST_F(TextViewDragTest, TextScrollsBackWhileThePointerRestsAbove)
{
	ShowLines(30);
	Do([this] { fView->ScrollTo(0, 200); });
	DragFrom(Ask([this] { return fView->OffsetAt(BPoint(4, 240)); }), BPoint(60, 20));
	EXPECT_TRUE(Becomes([this] { return fView->Bounds().top == 0; }));
	EXPECT_EQ(Caret(), 0);
	fRobot->Release();
}


TEST_F(TextViewDragTest, FartherOutItIsFaster)
{
	ShowLines(300);
	const auto widest = [this] {
		float most = 0;
		for (const BPoint& step : static_cast<WatchedView*>(fView)->steps)
			most = std::max(most, step.y);
		static_cast<WatchedView*>(fView)->steps.clear();
		return most;
	};
	DragFrom(0, BPoint(60, 133));
	ASSERT_TRUE(Becomes([this] { return fView->Bounds().top > 20; }));
	const float near = Ask(widest);
	fRobot->MoveTo(BPoint(60, 190));
	Ask(widest);
	const float from = Place().y;
	ASSERT_TRUE(Becomes([&] { return fView->Bounds().top > from + 60; }));
	const float far = Ask(widest);
	EXPECT_GT(near, 0);
	EXPECT_GT(far, 2 * near);
	// Nothing is passed over unseen.
	EXPECT_LE(far, 80);
	fRobot->Release();
}


TEST_F(TextViewDragTest, ItEndsWithTheButtonAndInsideTheView)
{
	ShowLines(300);
	DragFrom(0, BPoint(60, 140));
	ASSERT_TRUE(Becomes([this] { return fView->Bounds().top > 0; }));
	fRobot->MoveTo(BPoint(60, 80));
	EXPECT_TRUE(StandsStill());
	const float inside = Place().y;
	fRobot->MoveTo(BPoint(60, 140));
	ASSERT_TRUE(Becomes([&] { return fView->Bounds().top > inside; }));
	fRobot->Release();
	EXPECT_TRUE(StandsStill());
}


TEST_F(TextViewDragTest, TextThatFitsStandsStill)
{
	ShowLines(3);
	DragFrom(0, BPoint(250, 190));
	EXPECT_TRUE(StandsStill());
	EXPECT_EQ(Place(), B_ORIGIN);
	EXPECT_EQ(Caret(), 12);
	fRobot->MoveTo(BPoint(5, 5));
	EXPECT_TRUE(StandsStill());
	EXPECT_EQ(Place(), B_ORIGIN);
	fRobot->Release();
}


TEST_F(TextViewDragTest, WrappedTextDoesNotScrollSideways)
{
	ShowLines(30);
	DragFrom(0, BPoint(290, 80));
	EXPECT_TRUE(StandsStill());
	EXPECT_EQ(Place(), B_ORIGIN);
	fRobot->Release();
}


TEST_F(TextViewDragTest, LongLinesScrollSideways)
{
	WatchedView* view = Add(new WatchedView);
	view->SetWordWrap(false);
	Show(view, std::string(40, 'm') + "\nshort");
	DragFrom(2, BPoint(290, 60));
	EXPECT_TRUE(Becomes([this] {
		return fView->Bounds().right >= fView->PointAt(40).x && fView->Bounds().top == 0;
	}));
	EXPECT_TRUE(Becomes([this] {
		int32 end;
		fView->GetSelection(NULL, &end);
		return end == 40;
	}));
	fRobot->MoveTo(BPoint(10, 60));
	EXPECT_TRUE(Becomes([this] { return fView->Bounds().left == 0; }));
	EXPECT_EQ(Caret(), 0);
	fRobot->Release();
}


TEST_F(TextViewDragTest, ScrollBarsGoAlong)
{
	BTextView* view = new WatchedView;
	BScrollView* scroll = Add(new BScrollView("scroll", view, B_FOLLOW_LEFT_TOP, 0, true, true));
	std::string text;
	for (int32 i = 0; i < 20; i++)
		text += "line\n";
	Show(view, text);
	DragFrom(0, BPoint(60, 190));
	EXPECT_TRUE(Becomes([&] {
		float last;
		scroll->ScrollBar(B_VERTICAL)->GetRange(NULL, &last);
		return last > 0 && scroll->ScrollBar(B_VERTICAL)->Value() == last;
	}));
	fRobot->Release();
}


TEST_F(TextViewDragTest, TextControlScrollsSideways)
{
	BTextControl* control = Add(new BTextControl(
		BRect(100, 20, 199, 49), "control", NULL, std::string(30, 'm').c_str(), NULL));
	Show(control->TextView(), std::string(30, 'm'));
	// What is selected would be dragged.
	Do([this] { fView->Select(0, 0); });
	DragFrom(1, BPoint(280, 190));
	EXPECT_TRUE(Becomes([this] {
		int32 end;
		fView->GetSelection(NULL, &end);
		return end == 30 && fView->Bounds().right >= fView->PointAt(30).x;
	}));
	EXPECT_EQ(Place().y, 0);
	fRobot->MoveTo(BPoint(10, 25));
	EXPECT_TRUE(Becomes([this] { return fView->Bounds().left == 0; }));
	EXPECT_EQ(Caret(), 0);
	fRobot->Release();
}


TEST_F(TextViewDragTest, ViewThatIsTakenOutWhileItScrollsStops)
{
	ShowLines(300);
	DragFrom(0, BPoint(60, 150));
	ASSERT_TRUE(Becomes([this] { return fView->Bounds().top > 0; }));
	Do([this] {
		fView->RemoveSelf();
		fBackground->AddChild(fView);
	});
	EXPECT_TRUE(StandsStill());
	fRobot->Release();
}
