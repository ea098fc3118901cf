// SPDX-License-Identifier: MIT
// Tests of BStatusBar: its value, its texts, and the messages that drive it.
#include <StatusBar.h>

#include <cmath>

#include <Messenger.h>

#include "ControlsFixture.h"

namespace {

class StatusBarTest : public ControlsTest {
protected:
	void SetUp() override
	{
		ControlsTest::SetUp();
		fBar = Add(new BStatusBar(BRect(10, 10, 209, 20), "bar", "Label", "end"));
	}

	BStatusBar* fBar = nullptr;
};


void
ExpectTexts(const BStatusBar* bar, const char* label, const char* text, const char* trailingText,
	const char* trailingLabel)
{
	EXPECT_STREQ(bar->Label(), label);
	EXPECT_STREQ(bar->Text(), text);
	EXPECT_STREQ(bar->TrailingText(), trailingText);
	EXPECT_STREQ(bar->TrailingLabel(), trailingLabel);
}

} // namespace


TEST_F(StatusBarTest, NewBarIsEmptyAndEndsAtAHundred)
{
	EXPECT_EQ(fBar->CurrentValue(), 0);
	EXPECT_EQ(fBar->MaxValue(), 100);
	EXPECT_EQ(fBar->BarColor(), ui_color(B_STATUS_BAR_COLOR));
	ExpectTexts(fBar, "Label", nullptr, nullptr, "end");
}


TEST_F(StatusBarTest, UpdateAddsAndKeepsTextsThatAreNotGiven)
{
	fBar->Update(10, "one", "1");
	fBar->Update(15.5f);
	EXPECT_EQ(fBar->CurrentValue(), 25.5f);
	ExpectTexts(fBar, "Label", "one", "1", "end");
	fBar->Update(1, nullptr, "2");
	ExpectTexts(fBar, "Label", "one", "2", "end");
	fBar->Update(1, "");
	ExpectTexts(fBar, "Label", nullptr, "2", "end");
}


TEST_F(StatusBarTest, SetToSetsTheValueAndClearsTextsThatAreNotGiven)
{
	fBar->SetTo(40, "text", "trailing");
	EXPECT_EQ(fBar->CurrentValue(), 40);
	ExpectTexts(fBar, "Label", "text", "trailing", "end");
	fBar->SetTo(30, "other");
	EXPECT_EQ(fBar->CurrentValue(), 30);
	ExpectTexts(fBar, "Label", "other", nullptr, "end");
	fBar->SetTo(20);
	ExpectTexts(fBar, "Label", nullptr, nullptr, "end");
}


TEST_F(StatusBarTest, ValueStaysBetweenNoughtAndTheGreatest)
{
	const struct {
		float given;
		float kept;
	} kRows[] = {{101, 100}, {-1, 0}, {INFINITY, 100}, {-INFINITY, 0}, {NAN, 0}};
	for (const auto& row : kRows) {
		fBar->SetTo(row.given);
		EXPECT_EQ(fBar->CurrentValue(), row.kept) << row.given;
	}
	fBar->SetTo(90);
	fBar->SetMaxValue(50);
	EXPECT_EQ(fBar->CurrentValue(), 50);
	fBar->SetMaxValue(-3);
	EXPECT_EQ(fBar->MaxValue(), 0);
	EXPECT_EQ(fBar->CurrentValue(), 0);
}


TEST_F(StatusBarTest, ResetStartsAgainWithNewLabels)
{
	fBar->SetMaxValue(7);
	fBar->SetTo(5, "text", "trailing");
	fBar->Reset("Again");
	EXPECT_EQ(fBar->CurrentValue(), 0);
	EXPECT_EQ(fBar->MaxValue(), 100);
	ExpectTexts(fBar, "Again", nullptr, nullptr, nullptr);
}


TEST_F(StatusBarTest, TextsMayBeSetToThemselves)
{
	fBar->SetText("text");
	fBar->SetText(fBar->Text());
	EXPECT_STREQ(fBar->Text(), "text");
	fBar->Reset(fBar->Label(), fBar->TrailingLabel());
	ExpectTexts(fBar, "Label", nullptr, nullptr, "end");
}


TEST_F(StatusBarTest, MessagesUpdateAndReset)
{
	Show();
	BMessage update(B_UPDATE_STATUS_BAR);
	update.AddFloat("delta", 12);
	update.AddString("text", "twelve");
	update.AddString("trailing_text", "12");
	ASSERT_EQ(BMessenger(fBar).SendMessage(&update), B_OK);
	fRobot->Settle();
	Do([this] {
		EXPECT_EQ(fBar->CurrentValue(), 12);
		ExpectTexts(fBar, "Label", "twelve", "12", "end");
	});

	// A message without its fields adds nothing and keeps the texts.
	ASSERT_EQ(BMessenger(fBar).SendMessage(B_UPDATE_STATUS_BAR), B_OK);
	fRobot->Settle();
	Do([this] {
		EXPECT_EQ(fBar->CurrentValue(), 12);
		ExpectTexts(fBar, "Label", "twelve", "12", "end");
	});

	BMessage reset(B_RESET_STATUS_BAR);
	reset.AddString("label", "Second");
	reset.AddString("trailing_label", "last");
	ASSERT_EQ(BMessenger(fBar).SendMessage(&reset), B_OK);
	fRobot->Settle();
	Do([this] {
		EXPECT_EQ(fBar->CurrentValue(), 0);
		ExpectTexts(fBar, "Second", nullptr, nullptr, "last");
	});
}


TEST_F(StatusBarTest, HeightIsFittedAndTheWidthKept)
{
	BStatusBar* bare = Add(new BStatusBar(BRect(10, 100, 99, 101), "bare"));
	Show();
	Do([&] {
		float height;
		fBar->GetPreferredSize(nullptr, &height);
		EXPECT_EQ(fBar->Frame(), BRect(10, 10, 209, 10 + height));
		EXPECT_EQ(bare->Frame().Width(), 89);
		EXPECT_EQ(bare->Frame().Height(), bare->BarHeight());
		EXPECT_LT(bare->Frame().Height(), fBar->Frame().Height());
	});
}


TEST_F(StatusBarTest, FirstTextMakesRoomThatStays)
{
	BStatusBar* bare = Add(new BStatusBar(BRect(10, 100, 99, 101), "bare"));
	Show();
	Do([&] {
		const float before = bare->Frame().Height();
		bare->SetText("now");
		const float after = bare->Frame().Height();
		EXPECT_GT(after, before);
		bare->SetText(nullptr);
		EXPECT_EQ(bare->Frame().Height(), after);
	});
}


TEST_F(StatusBarTest, BarHeightChangesTheViewsHeight)
{
	Show();
	Do([this] {
		const float text = fBar->Frame().Height() - fBar->BarHeight();
		fBar->SetBarHeight(40);
		EXPECT_EQ(fBar->BarHeight(), 40);
		EXPECT_EQ(fBar->Frame().Height(), text + 40);
		fBar->SetBarHeight(-2);
		EXPECT_EQ(fBar->BarHeight(), 1);
	});
}


TEST_F(StatusBarTest, ArchiveKeepsTheBar)
{
	fBar->SetMaxValue(10);
	fBar->SetTo(4, "text", "trailing");
	fBar->SetBarColor(make_color(4, 5, 6));
	fBar->SetBarHeight(9);
	BMessage archive;
	ASSERT_EQ(fBar->Archive(&archive), B_OK);
	std::unique_ptr<BArchivable> object(instantiate_object(&archive));
	const BStatusBar* bar = dynamic_cast<BStatusBar*>(object.get());
	ASSERT_NE(bar, nullptr);
	EXPECT_EQ(bar->CurrentValue(), 4);
	EXPECT_EQ(bar->MaxValue(), 10);
	EXPECT_EQ(bar->BarColor(), make_color(4, 5, 6));
	EXPECT_EQ(bar->BarHeight(), 9);
	ExpectTexts(bar, "Label", "text", "trailing", "end");
}
