// SPDX-License-Identifier: MIT
// Tests of what the mouse does on the design surface.

#include "designer/SurfaceTest.h"

#include <utility>

#include <Autolock.h>
#include <CheckBox.h>
#include <TextControl.h>

#include "model/DesignMessages.h"
#include "model/Property.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "support/Printers.h"

namespace {

/// An entry that makes no component.
class NoneEntry : public TPaletteEntry {
public:
	NoneEntry()
		: TPaletteEntry(0, "None", "TNone")
	{
	}
};

} // namespace

/// A view inside another that counts how often it is drawn.
class DrawCounter : public BView {
public:
	DrawCounter()
		: BView(BRect(2, 2, 12, 12), "counter", B_FOLLOW_NONE, B_WILL_DRAW)
	{
	}

	void Draw(BRect) override { count++; }

	int32 count = 0;
};

class DesignMouseTest : public SurfaceTest {
protected:
	DrawCounter* CountDrawing(TComponent* component) const
	{
		DrawCounter* counter = new DrawCounter;
		Locked([&] { component->DTView()->AddChild(counter); });
		return counter;
	}

	int32 TakeCount(DrawCounter* counter) const
	{
		int32 count;
		Locked([&] { count = std::exchange(counter->count, 0); });
		return count;
	}

	bool IsWaiting() const { return PaletteCatalog().DropEntry() != nullptr; }

	/// Drags what is at \a from, presses Escape on the way, and goes on to \a to.
	void DragWithEscape(BPoint from, BPoint to)
	{
		fRobot.MoveTo(from);
		fRobot.Press();
		fRobot.MoveTo(from + BPoint(6, 6));
		fRobot.MoveTo(to);
		EXPECT_TRUE(fRobot.Key("escape"));
		fRobot.MoveTo(to + BPoint(9, 9));
		fRobot.Release();
		fRobot.Settle();
	}

	/// Both lists, the view and the properties say the same.
	void CheckPlace(TComponent* component, BRect frame, const std::string& parent)
	{
		EXPECT_EQ(Frame(component), frame);
		EXPECT_EQ(ToldFrame(component), frame);
		EXPECT_EQ(Parent(component), parent);
		Locked([&] {
			for (const char* name : {"Left", "Top", "Right", "Bottom"})
				EXPECT_STREQ(
					component->GetPropertyValue(name), component->FindProperty(name)->Value())
					<< name;
		});
	}
};


// #pragma mark - Placing


TEST_F(DesignMouseTest, AClickPlacesEightByEightPixels)
{
	Choose("TButton");
	fRobot.Click(BPoint(50, 60));
	TComponent* button = Find("Button1");
	ASSERT_NE(button, nullptr);
	CheckPlace(button, BRect(50, 60, 58, 68), "");
	EXPECT_FALSE(IsWaiting());
	EXPECT_TRUE(IsModified());
	EXPECT_EQ(Value(button, "Name"), "Button1");
}


TEST_F(DesignMouseTest, ADragPlacesInItsRectangle)
{
	SetModified(false);
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	ASSERT_NE(button, nullptr);
	CheckPlace(button, BRect(20, 30, 120, 60), "");
	EXPECT_TRUE(IsSelected(button));
	EXPECT_FALSE(IsSelected(Form()));
	EXPECT_EQ(Shown(), button);
	EXPECT_TRUE(IsModified());
}


TEST_F(DesignMouseTest, ADragUpAndToTheLeftPlacesAtThePress)
{
	TComponent* box = Draw("TBox", BRect(100, 120, 40, 70));
	ASSERT_NE(box, nullptr);
	CheckPlace(box, BRect(100, 120, 108, 128), "");
	TComponent* flat = Draw("TButton", BRect(10, 10, 90, 12));
	ASSERT_NE(flat, nullptr);
	CheckPlace(flat, BRect(10, 10, 90, 18), "");
}


TEST_F(DesignMouseTest, EachChoicePlacesOneComponent)
{
	ASSERT_NE(Draw("TButton", BRect(20, 30, 120, 60)), nullptr);
	fRobot.Drag(BPoint(20, 80), BPoint(120, 110));
	EXPECT_EQ(Names(), "Button1");
	EXPECT_TRUE(IsSelected(Form()));
}


TEST_F(DesignMouseTest, NamesCountOnFromTheFirstFreeNumber)
{
	for (int32 i = 0; i < 3; i++)
		ASSERT_NE(Draw("TButton", BRect(20, 30 + 40 * i, 120, 60 + 40 * i)), nullptr);
	EXPECT_EQ(Names(), "Button1 Button2 Button3");
	ASSERT_TRUE(ChooseFromMenu(BPoint(60, 85), "Delete"));
	EXPECT_EQ(Names(), "Button1 Button3");
	ASSERT_NE(Draw("TButton", BRect(20, 200, 120, 230)), nullptr);
	EXPECT_EQ(Names(), "Button1 Button3 Button2");
}


TEST_F(DesignMouseTest, AnEntryThatMakesNothingIsUsedUp)
{
	NoneEntry entry;
	PaletteCatalog().SetDropEntry(&entry);
	SetModified(false);
	fRobot.Drag(BPoint(20, 30), BPoint(120, 60));
	EXPECT_EQ(Names(), "");
	EXPECT_FALSE(IsWaiting());
	EXPECT_FALSE(IsModified());
}


TEST_F(DesignMouseTest, EscapePlacesNothingAndTheChoiceWaitsOn)
{
	SetModified(false);
	Choose("TButton");
	DragWithEscape(BPoint(20, 30), BPoint(120, 60));
	EXPECT_EQ(Names(), "");
	EXPECT_TRUE(IsWaiting());
	EXPECT_FALSE(IsModified());

	fRobot.Drag(BPoint(20, 30), BPoint(120, 60));
	EXPECT_EQ(Names(), "Button1");
}


TEST_F(DesignMouseTest, TheMenuOpensWhileAComponentWaits)
{
	Choose("TButton");
	ASSERT_TRUE(ChooseFromMenu(BPoint(60, 80), "Lock components"));
	EXPECT_TRUE(IsWaiting());
	EXPECT_EQ(Names(), "");
}


TEST_F(DesignMouseTest, ARubberBandInABoxPlacesInTheBox)
{
	TComponent* box = Draw("TBox", BRect(50, 40, 250, 240));
	TComponent* button = Draw("TButton", BRect(70, 60, 130, 90));
	ASSERT_NE(button, nullptr);
	CheckPlace(button, BRect(20, 20, 80, 50), "Box1");
	EXPECT_EQ(Children(box), "Button1");
	EXPECT_EQ(Names(), "Box1 Button1");
	EXPECT_EQ(Shown(), button);
	EXPECT_FALSE(IsWaiting());

	TComponent* narrow = Draw("TCheckBox", BRect(70, 120, 75, 150));
	ASSERT_NE(narrow, nullptr);
	CheckPlace(narrow, BRect(20, 80, 28, 110), "Box1");
	EXPECT_EQ(Children(box), "Button1 CheckBox1");
}


TEST_F(DesignMouseTest, EscapeInABoxPlacesNothing)
{
	TComponent* box = Draw("TBox", BRect(50, 40, 250, 240));
	Choose("TButton");
	DragWithEscape(BPoint(70, 60), BPoint(130, 90));
	EXPECT_EQ(Names(), "Box1");
	EXPECT_EQ(Children(box), "");
	EXPECT_TRUE(IsWaiting());
}


TEST_F(DesignMouseTest, AComponentThatHoldsNoOthersIsDraggedWhileAnotherWaits)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	Choose("TBox");
	fRobot.Drag(BPoint(40, 40), BPoint(140, 140));
	CheckPlace(button, BRect(120, 130, 220, 160), "");
	EXPECT_EQ(Names(), "Button1");
	EXPECT_TRUE(IsWaiting());
}


// #pragma mark - Selecting


TEST_F(DesignMouseTest, AClickSelectsOneComponent)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	TComponent* box = Draw("TBox", BRect(20, 100, 250, 250));
	TComponent* inside = Draw("TCheckBox", BRect(40, 120, 140, 150));

	fRobot.Click(BPoint(60, 45));
	EXPECT_TRUE(IsSelected(button));
	EXPECT_FALSE(IsSelected(box));
	EXPECT_FALSE(IsSelected(inside));
	EXPECT_FALSE(IsSelected(Form()));
	EXPECT_EQ(Shown(), button);

	fRobot.Click(BPoint(60, 135));
	EXPECT_FALSE(IsSelected(button));
	EXPECT_FALSE(IsSelected(box));
	EXPECT_TRUE(IsSelected(inside));
	EXPECT_EQ(Shown(), inside);
}


TEST_F(DesignMouseTest, OnlyWhatIsMarkedOtherwiseIsDrawnAnew)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	Draw("TButton", BRect(20, 70, 120, 100));
	TComponent* other = Draw("TButton", BRect(20, 110, 120, 140));
	DrawCounter* ofButton = CountDrawing(button);
	DrawCounter* ofOther = CountDrawing(other);
	fRobot.Click(BPoint(60, 85));
	TakeCount(ofButton);
	TakeCount(ofOther);

	fRobot.Click(BPoint(60, 45));
	EXPECT_GT(TakeCount(ofButton), 0);
	EXPECT_EQ(TakeCount(ofOther), 0);

	// The form's own mark is its border.
	fRobot.Click(BPoint(200, 200));
	EXPECT_TRUE(IsSelected(Form()));
	EXPECT_GT(TakeCount(ofButton), 0);
	EXPECT_EQ(TakeCount(ofOther), 0);

	Draw("TButton", BRect(20, 150, 120, 180));
	EXPECT_EQ(TakeCount(ofButton), 0);
	EXPECT_EQ(TakeCount(ofOther), 0);
}


TEST_F(DesignMouseTest, AClickBesideTheComponentsSelectsTheForm)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	fRobot.Click(BPoint(200, 200));
	EXPECT_FALSE(IsSelected(button));
	EXPECT_TRUE(IsSelected(Form()));
	EXPECT_EQ(Shown(), Form());
}


TEST_F(DesignMouseTest, AClickOnlySelects)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	fRobot.Click(BPoint(200, 200));
	SetModified(false);
	fRobot.Click(BPoint(60, 45));
	EXPECT_TRUE(IsSelected(button));
	CheckPlace(button, BRect(20, 30, 120, 60), "");
	EXPECT_FALSE(IsModified());
}


TEST_F(DesignMouseTest, OneFormOfTheProjectIsSelected)
{
	TDesignForm* first = Form();
	TDesignForm* second = NewForm();
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	fRobot.Click(BPoint(200, 200));
	EXPECT_TRUE(IsSelected(first));

	WorkOn(second);
	fRobot.Click(BPoint(200, 200));
	EXPECT_TRUE(IsSelected(second));
	EXPECT_EQ(Shown(), second);

	WorkOn(first);
	fRobot.Click(BPoint(60, 45));
	EXPECT_TRUE(IsSelected(button));
	WorkOn(second);
	EXPECT_TRUE(IsSelected(second));
	WorkOn(first);
	EXPECT_FALSE(IsSelected(button));
	EXPECT_TRUE(IsSelected(first));
}


TEST_F(DesignMouseTest, AComponentBringsTheHiddenPropertyWindowBack)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	fRobot.Click(BPoint(200, 200));
	{
		BAutolock lock(Inspector());
		Inspector()->Hide();
	}
	// It shows the form already.
	fRobot.Click(BPoint(200, 200));
	EXPECT_TRUE(Inspector()->IsHidden());
	fRobot.Click(BPoint(60, 45));
	EXPECT_EQ(Shown(), button);
	EXPECT_FALSE(Inspector()->IsHidden());
}


TEST_F(DesignMouseTest, ControlsDoNotAct)
{
	TComponent* checkBox = Draw("TCheckBox", BRect(20, 30, 120, 60));
	TComponent* text = Draw("TTextControl", BRect(20, 100, 220, 130));
	fRobot.Click(BPoint(30, 45));
	fRobot.Click(BPoint(100, 115));
	EXPECT_EQ(Shown(), text);
	fRobot.Type("x");
	fRobot.Key("tab");
	fRobot.Key("space");
	Locked([&] {
		EXPECT_EQ(dynamic_cast<BCheckBox*>(checkBox->DTView())->Value(), B_CONTROL_OFF);
		EXPECT_STREQ(dynamic_cast<BTextControl*>(text->DTView())->Text(), "");
	});
}


// #pragma mark - Moving


TEST_F(DesignMouseTest, ADragMovesAComponent)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	SetModified(false);
	fRobot.Drag(BPoint(33, 41), BPoint(163, 241));
	CheckPlace(button, BRect(150, 230, 250, 260), "");
	EXPECT_TRUE(IsModified());
	EXPECT_EQ(Shown(), button);
}


TEST_F(DesignMouseTest, AShortDragEndsOnTheComponentItself)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	fRobot.Drag(BPoint(33, 41), BPoint(38, 44));
	CheckPlace(button, BRect(25, 33, 125, 63), "");

	TComponent* text = Draw("TTextControl", BRect(20, 100, 220, 130));
	fRobot.Drag(BPoint(100, 110), BPoint(103, 115));
	CheckPlace(text, BRect(23, 105, 223, 135), "");

	TComponent* box = Draw("TBox", BRect(20, 160, 220, 280));
	TComponent* inside = Draw("TButton", BRect(40, 180, 140, 210));
	fRobot.Drag(BPoint(50, 190), BPoint(57, 191));
	CheckPlace(inside, BRect(27, 21, 127, 51), "Box1");
	EXPECT_EQ(Children(box), "Button2");
}


TEST_F(DesignMouseTest, AMoveBackWhereItWasIsNoChange)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	SetModified(false);
	fRobot.MoveTo(BPoint(33, 41));
	fRobot.Press();
	fRobot.MoveTo(BPoint(63, 51));
	fRobot.MoveTo(BPoint(33, 41));
	fRobot.Release();
	fRobot.Settle();
	CheckPlace(button, BRect(20, 30, 120, 60), "");
	EXPECT_FALSE(IsModified());
}


TEST_F(DesignMouseTest, ADragIntoABoxNests)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	TComponent* box = Draw("TBox", BRect(20, 100, 250, 250));
	fRobot.Drag(BPoint(30, 40), BPoint(80, 150));
	CheckPlace(button, BRect(50, 40, 150, 70), "Box1");
	EXPECT_EQ(Children(box), "Button1");
	EXPECT_EQ(Names(), "Button1 Box1");
	Locked([&] { EXPECT_EQ(button->Owner(), dynamic_cast<TComponentOwner*>(box)); });
}


TEST_F(DesignMouseTest, ADragOntoTheFormTakesOutOfTheBox)
{
	TComponent* box = Draw("TBox", BRect(20, 100, 250, 250));
	TComponent* button = Draw("TButton", BRect(40, 120, 140, 150));
	EXPECT_EQ(Children(box), "Button1");
	fRobot.Drag(BPoint(50, 130), BPoint(70, 40));
	CheckPlace(button, BRect(60, 30, 160, 60), "");
	EXPECT_EQ(Children(box), "");
	EXPECT_EQ(Names(), "Box1 Button1");
}


TEST_F(DesignMouseTest, ADragFromBoxToBox)
{
	TComponent* first = Draw("TBox", BRect(10, 10, 140, 200));
	TComponent* second = Draw("TBox", BRect(150, 10, 290, 200));
	TComponent* button = Draw("TButton", BRect(30, 30, 100, 60));
	fRobot.Drag(BPoint(40, 40), BPoint(180, 100));
	CheckPlace(button, BRect(20, 80, 90, 110), "Box2");
	EXPECT_EQ(Children(first), "");
	EXPECT_EQ(Children(second), "Button1");
}


TEST_F(DesignMouseTest, ABoxIsMovedWithWhatIsInside)
{
	TComponent* box = Draw("TBox", BRect(20, 20, 150, 120));
	TComponent* button = Draw("TButton", BRect(40, 40, 100, 70));
	fRobot.Drag(BPoint(30, 100), BPoint(130, 250));
	CheckPlace(box, BRect(120, 170, 250, 270), "");
	CheckPlace(button, BRect(20, 20, 80, 50), "Box1");
}


TEST_F(DesignMouseTest, ABoxCannotGoIntoWhatIsInside)
{
	TComponent* outer = Draw("TBox", BRect(20, 20, 280, 280));
	TComponent* inner = Draw("TBox", BRect(100, 100, 250, 250));
	SetModified(false);
	fRobot.Drag(BPoint(40, 60), BPoint(150, 150));
	CheckPlace(outer, BRect(20, 20, 280, 280), "");
	CheckPlace(inner, BRect(80, 80, 230, 230), "Box1");
	EXPECT_EQ(Children(outer), "Box2");
	EXPECT_EQ(Children(inner), "");
	EXPECT_FALSE(IsModified());
}


TEST_F(DesignMouseTest, WhatIsDroppedOnAControlLiesBeneath)
{
	TComponent* moved = Draw("TButton", BRect(20, 30, 80, 60));
	TComponent* box = Draw("TBox", BRect(10, 150, 290, 290));
	Draw("TButton", BRect(120, 30, 220, 60));
	Draw("TTextControl", BRect(40, 170, 200, 200));

	fRobot.Drag(BPoint(30, 40), BPoint(150, 45));
	CheckPlace(moved, BRect(140, 35, 200, 65), "");
	fRobot.Drag(BPoint(150, 63), BPoint(100, 183));
	CheckPlace(moved, BRect(80, 5, 140, 35), "Box1");
	EXPECT_EQ(Children(box), "TextControl1 Button1");
}


TEST_F(DesignMouseTest, ADropOutsideChangesNothing)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	SetModified(false);
	fRobot.Drag(BPoint(30, 40), BPoint(-90, 500));
	CheckPlace(button, BRect(20, 30, 120, 60), "");
	// Onto another window
	BPoint inspector;
	{
		BAutolock lock(Inspector());
		inspector = Inspector()->Frame().LeftTop() + BPoint(20, 50);
	}
	Locked([&] { inspector -= Form()->Frame().LeftTop(); });
	fRobot.Drag(BPoint(30, 40), inspector);
	CheckPlace(button, BRect(20, 30, 120, 60), "");
	EXPECT_EQ(Names(), "Button1");
	EXPECT_FALSE(IsModified());
}


TEST_F(DesignMouseTest, EscapeEndsADrag)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	SetModified(false);
	DragWithEscape(BPoint(30, 40), BPoint(180, 240));
	CheckPlace(button, BRect(20, 30, 120, 60), "");
	EXPECT_FALSE(IsModified());

	// Elsewhere, or it would be a double click.
	fRobot.Drag(BPoint(50, 50), BPoint(150, 150));
	CheckPlace(button, BRect(120, 130, 220, 160), "");
}


TEST_F(DesignMouseTest, ADoubleClickNeverDrags)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	fRobot.Click(BPoint(50, 45));
	fRobot.Press();
	fRobot.MoveTo(BPoint(90, 145));
	fRobot.MoveTo(BPoint(150, 245));
	fRobot.Release();
	fRobot.Settle();
	CheckPlace(button, BRect(20, 30, 120, 60), "");
}


TEST_F(DesignMouseTest, ADragToAnotherFormTakesTheComponentOver)
{
	TDesignForm* first = Form();
	TDesignForm* second = NewForm();
	TComponent* box = Draw("TBox", BRect(10, 10, 150, 150));
	TComponent* button = Draw("TButton", BRect(30, 30, 100, 60));
	WorkOn(second);
	ASSERT_NE(Draw("TButton", BRect(200, 200, 280, 230)), nullptr);
	WorkOn(first);
	SetModified(false);

	// The second form begins 320 pixels below.
	fRobot.Drag(BPoint(20, 100), BPoint(60, 440));
	EXPECT_EQ(Names(), "");
	EXPECT_TRUE(IsModified());
	WorkOn(second);
	EXPECT_EQ(Names(), "Button1 Box1 Button11");
	CheckPlace(box, BRect(50, 30, 190, 170), "");
	CheckPlace(button, BRect(20, 20, 90, 50), "Box1");
	EXPECT_EQ(Children(box), "Button11");
	EXPECT_EQ(Value(button, "Name"), "Button11");
	Locked([&] {
		EXPECT_EQ(box->Designer(), second->View());
		EXPECT_EQ(button->Designer(), second->View());
	});

	// It is the other form's in all respects.
	fRobot.Drag(BPoint(60, 150), BPoint(70, 150));
	CheckPlace(box, BRect(60, 30, 200, 170), "");
	EXPECT_EQ(Shown(), box);
	{
		BAutolock lock(Inspector());
		EXPECT_EQ(Inspector()->DesignView(), second->View());
	}
}


TEST_F(DesignMouseTest, ADragIntoABoxOfAnotherForm)
{
	TDesignForm* first = Form();
	TDesignForm* second = NewForm();
	TComponent* button = Draw("TButton", BRect(30, 30, 100, 60));
	WorkOn(second);
	TComponent* box = Draw("TBox", BRect(20, 20, 280, 280));
	WorkOn(first);
	fRobot.Drag(BPoint(40, 40), BPoint(60, 420));
	EXPECT_EQ(Names(), "");
	WorkOn(second);
	EXPECT_EQ(Names(), "Box1 Button1");
	CheckPlace(button, BRect(30, 70, 100, 100), "Box1");
	EXPECT_EQ(Children(box), "Button1");
}


TEST_F(DesignMouseTest, MessagesAboutUnknownComponentsAreIgnored)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	SetModified(false);
	Locked([&] {
		int nothing = 0;
		for (uint32 what : {DTM_COMPONENT_MOVE, DTM_COMPONENT_RESIZE, DTM_COMPONENT_CONTEXTMENU}) {
			BMessage message(what);
			Form()->View()->MessageReceived(&message);
			message.AddPointer("component", &nothing);
			message.AddRect("frame", BRect(0, 0, 9, 9));
			message.AddPoint("where", BPoint(9, 9));
			Form()->View()->MessageReceived(&message);
			message.AddPoint("_drop_point_", BPoint(400, 200));
			Form()->View()->MessageReceived(&message);
		}
	});
	CheckPlace(button, BRect(20, 30, 120, 60), "");
	EXPECT_FALSE(IsModified());
}


// #pragma mark - Resizing


TEST_F(DesignMouseTest, TheHandleResizes)
{
	TComponent* box = Draw("TBox", BRect(20, 30, 120, 90));
	SetModified(false);
	fRobot.Drag(BPoint(118, 88), BPoint(220, 188));
	CheckPlace(box, BRect(20, 30, 220, 188), "");
	EXPECT_TRUE(IsModified());
	fRobot.Drag(BPoint(216, 185), BPoint(60, 70));
	CheckPlace(box, BRect(20, 30, 60, 70), "");
}


TEST_F(DesignMouseTest, TheHandleBeginsFivePixelsFromTheCorner)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	fRobot.Drag(BPoint(115, 55), BPoint(150, 80));
	CheckPlace(button, BRect(20, 30, 150, 80), "");
	fRobot.Drag(BPoint(144, 75), BPoint(154, 85));
	CheckPlace(button, BRect(30, 40, 160, 90), "");
}


TEST_F(DesignMouseTest, ATooSmallSizeIsDropped)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	SetModified(false);
	fRobot.Drag(BPoint(118, 58), BPoint(25, 55));
	CheckPlace(button, BRect(20, 30, 120, 60), "");
	EXPECT_FALSE(IsModified());
}


TEST_F(DesignMouseTest, EightPixelsAreEnough)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	fRobot.Drag(BPoint(118, 58), BPoint(28, 38));
	CheckPlace(button, BRect(20, 30, 28, 38), "");
}


TEST_F(DesignMouseTest, EscapeEndsAResize)
{
	TComponent* text = Draw("TTextControl", BRect(20, 30, 120, 60));
	SetModified(false);
	DragWithEscape(BPoint(118, 58), BPoint(200, 150));
	CheckPlace(text, BRect(20, 30, 120, 60), "");
	EXPECT_FALSE(IsModified());
}


TEST_F(DesignMouseTest, AComponentInABoxIsResized)
{
	Draw("TBox", BRect(20, 20, 280, 280));
	TComponent* button = Draw("TButton", BRect(50, 50, 150, 80));
	fRobot.Drag(BPoint(148, 78), BPoint(188, 98));
	CheckPlace(button, BRect(30, 30, 168, 78), "Box1");
}
