// SPDX-License-Identifier: MIT
// Tests of BBox and BStringView: labels, borders and geometry.
#include <Box.h>

#include <CheckBox.h>
#include <StringView.h>

#include "ControlsFixture.h"

namespace {

class BoxTest : public ControlsTest {
protected:
	void SetUp() override
	{
		ControlsTest::SetUp();
		fBox = Add(new BBox(BRect(10, 10, 109, 89), "box"));
	}

	BBox* fBox = nullptr;
};


class LabelView : public BView {
public:
	explicit LabelView(int* deleted)
		: BView(BRect(5, 5, 64, 24), "label", B_FOLLOW_NONE, 0),
		  fDeleted(deleted)
	{
	}
	~LabelView() override { (*fDeleted)++; }

private:
	int* fDeleted;
};

using StringViewTest = ControlsTest;

} // namespace


TEST_F(BoxTest, NewBoxHasAFancyBorderAndNoLabel)
{
	EXPECT_EQ(fBox->Border(), B_FANCY_BORDER);
	EXPECT_EQ(fBox->Label(), nullptr);
	EXPECT_EQ(fBox->LabelView(), nullptr);
	EXPECT_EQ(fBox->TopBorderOffset(), 0);
	EXPECT_EQ(fBox->InnerFrame(), BRect(2, 2, 97, 77));
}


TEST_F(BoxTest, LabelPushesTheBorderDownByHalfItsHeight)
{
	font_height height;
	fBox->GetFontHeight(&height);
	fBox->SetLabel("Label");
	EXPECT_STREQ(fBox->Label(), "Label");
	EXPECT_NEAR(fBox->TopBorderOffset(), (height.ascent + height.descent) / 2, 1);
	EXPECT_GE(fBox->InnerFrame().top, height.ascent + height.descent);
	fBox->SetLabel(fBox->Label());
	EXPECT_STREQ(fBox->Label(), "Label");
	fBox->SetLabel("");
	EXPECT_EQ(fBox->Label(), nullptr);
}


TEST_F(BoxTest, LabelViewBecomesTheFirstChild)
{
	fBox->AddChild(new BView(BRect(20, 20, 30, 30), "child", B_FOLLOW_NONE, 0));
	int deleted = 0;
	BView* label = new LabelView(&deleted);
	EXPECT_EQ(fBox->SetLabel(label), B_OK);
	EXPECT_EQ(fBox->LabelView(), label);
	EXPECT_EQ(fBox->ChildAt(0), label);
	EXPECT_EQ(label->Frame().LeftTop(), BPoint(10, 0));
	EXPECT_EQ(fBox->TopBorderOffset(), 9);
	EXPECT_EQ(fBox->SetLabel(label), B_OK);
	EXPECT_EQ(deleted, 0);
	fBox->SetLabel("text");
	EXPECT_EQ(deleted, 1);
	EXPECT_EQ(fBox->LabelView(), nullptr);
	EXPECT_EQ(fBox->CountChildren(), 1);
}


TEST_F(BoxTest, LabelViewOfAnotherParentIsRefused)
{
	BView* elsewhere = Add(new BView(BRect(0, 0, 9, 9), "elsewhere", B_FOLLOW_NONE, 0));
	EXPECT_EQ(fBox->SetLabel(elsewhere), B_BAD_VALUE);
	EXPECT_EQ(fBox->LabelView(), nullptr);
}


TEST_F(BoxTest, DeletedLabelViewIsForgotten)
{
	int deleted = 0;
	BView* label = new LabelView(&deleted);
	fBox->SetLabel(label);
	label->RemoveSelf();
	delete label;
	EXPECT_EQ(fBox->LabelView(), nullptr);
	EXPECT_EQ(fBox->TopBorderOffset(), 0);
	fBox->SetLabel("text");
	EXPECT_EQ(deleted, 1);
}


TEST_F(BoxTest, BoxOwnsTheChildItIsMadeWith)
{
	int deleted = 0;
	BView* child = new LabelView(&deleted);
	BBox* box = new BBox(B_PLAIN_BORDER, child);
	EXPECT_EQ(box->ChildAt(0), child);
	EXPECT_EQ(box->Border(), B_PLAIN_BORDER);
	delete box;
	EXPECT_EQ(deleted, 1);
}


TEST_F(BoxTest, ControlsInABoxTakeItsColour)
{
	fBackground->SetViewColor(make_color(200, 220, 240));
	BBox* box = new BBox(BRect(0, 0, 99, 99), "coloured");
	BCheckBox* control = new BCheckBox("control", nullptr);
	box->AddChild(control);
	Add(box);
	EXPECT_EQ(box->ViewColor(), make_color(200, 220, 240));
	EXPECT_EQ(control->ViewColor(), make_color(200, 220, 240));
}


TEST_F(BoxTest, ArchiveBringsBackLabelAndBorder)
{
	fBox->SetLabel("Label");
	fBox->SetBorder(B_PLAIN_BORDER);
	BMessage archive;
	ASSERT_EQ(fBox->Archive(&archive), B_OK);
	std::unique_ptr<BArchivable> object(BBox::Instantiate(&archive));
	BBox* copy = dynamic_cast<BBox*>(object.get());
	ASSERT_NE(copy, nullptr);
	EXPECT_STREQ(copy->Label(), "Label");
	EXPECT_EQ(copy->Border(), B_PLAIN_BORDER);
}


TEST_F(StringViewTest, SetTextDoesNotResize)
{
	BStringView* view = Add(new BStringView(BRect(10, 10, 59, 29), "string", "text"));
	EXPECT_STREQ(view->Text(), "text");
	view->SetText("a text that is very much longer than before");
	EXPECT_EQ(view->Frame(), BRect(10, 10, 59, 29));
	view->SetText(nullptr);
	EXPECT_EQ(view->Text(), nullptr);
	view->SetText("");
	EXPECT_STREQ(view->Text(), "");
}


TEST_F(StringViewTest, PreferredSizeIsTheTexts)
{
	BStringView* view = Add(new BStringView(BRect(10, 10, 59, 29), "string", "text"));
	float width, height;
	view->GetPreferredSize(&width, &height);
	EXPECT_GE(width, view->StringWidth("text"));
	EXPECT_LT(width, view->StringWidth("text") + 1);
	view->ResizeToPreferred();
	EXPECT_EQ(view->Bounds().Width(), width);
}


TEST_F(StringViewTest, AttributesAreKept)
{
	BStringView* view = Add(new BStringView(BRect(10, 10, 59, 29), "string", "text"));
	EXPECT_EQ(view->Alignment(), B_ALIGN_LEFT);
	EXPECT_EQ(view->Truncation(), static_cast<uint32>(B_NO_TRUNCATION));
	view->SetAlignment(B_ALIGN_RIGHT);
	view->SetTruncation(B_TRUNCATE_MIDDLE);
	BMessage archive;
	ASSERT_EQ(view->Archive(&archive), B_OK);
	std::unique_ptr<BArchivable> object(BStringView::Instantiate(&archive));
	BStringView* copy = dynamic_cast<BStringView*>(object.get());
	ASSERT_NE(copy, nullptr);
	EXPECT_STREQ(copy->Text(), "text");
	EXPECT_EQ(copy->Alignment(), B_ALIGN_RIGHT);
	EXPECT_EQ(copy->Truncation(), static_cast<uint32>(B_TRUNCATE_MIDDLE));
}


TEST_F(StringViewTest, BackgroundIsTheParents)
{
	fBackground->SetViewColor(make_color(1, 2, 3));
	BStringView* view = Add(new BStringView(BRect(10, 10, 59, 29), "string", "text"));
	EXPECT_EQ(view->ViewColor(), make_color(1, 2, 3));
	EXPECT_EQ(view->LowColor(), make_color(1, 2, 3));
	EXPECT_EQ(view->HighColor(), make_color(0, 0, 0));
}
