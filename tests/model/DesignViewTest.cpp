// SPDX-License-Identifier: MIT
// Tests of what components do to their design-time views, in a window that is never shown.

#include <memory>
#include <string>
#include <vector>

#include <Application.h>
#include <Button.h>
#include <Font.h>
#include <Message.h>
#include <OS.h>
#include <View.h>
#include <Window.h>
#include <gtest/gtest.h>

#include "model/ComponentDrag.h"
#include "model/ComponentOwner.h"
#include "model/ControlComponent.h"
#include "model/DesignMessages.h"
#include "model/FormDesigner.h"
#include "model/Property.h"
#include "model/ViewComponent.h"
#include "support/CapturedOutput.h"
#include "support/Printers.h"
#include "support/TidyComponent.h"

namespace {

const bigtime_t kTimeLimit = 10000000;


class TPlainComponent : public TidyComponent<TViewComponent> {
public:
	explicit TPlainComponent(TFormDesigner* designer = nullptr)
		: TidyComponent<TViewComponent>(nullptr, designer)
	{
	}

	bool DefaultEditAction(BPoint where) override
	{
		fEdited.push_back(where);
		return true;
	}

	void SelectedInFormDesigner() override { fSelections++; }

	std::vector<BPoint> fEdited;
	int fSelections = 0;
};


class TBoxComponent : public TPlainComponent, public TComponentOwner {
public:
	explicit TBoxComponent(TFormDesigner* designer)
		: TPlainComponent(designer)
	{
	}
};


class TDesigner : public TFormDesigner {
public:
	void ComponentSelected(TComponent* component) override { fSelected.push_back(component); }

	void ComponentMoved(TComponent* component, BPoint point) override
	{
		fMoved.push_back(component);
		fPoints.push_back(point);
	}

	std::vector<TComponent*> fSelected;
	std::vector<TComponent*> fMoved;
	std::vector<BPoint> fPoints;
};


/// Keeps what it receives, and hands design messages to a component when it has one.
class RecordingView : public BView {
public:
	explicit RecordingView(BRect frame)
		: BView(frame, "view", B_FOLLOW_NONE, B_WILL_DRAW),
		  fReceived(create_sem(0, "received"))
	{
	}

	~RecordingView() override { delete_sem(fReceived); }

	void MessageReceived(BMessage* message) override
	{
		if (message->what == 'clik' && fComponent != nullptr)
			fComponent->DesignerMouseDown(BPoint(3, 4), Bounds(), this);
		else if (message->what < DTM_COMPONENT_MOVE || message->what > DTM_COMPONENT_CONTEXTMENU) {
			BView::MessageReceived(message);
			return;
		}
		fLast = *message;
		release_sem(fReceived);
	}

	bool WaitForMessage()
	{
		return acquire_sem_etc(fReceived, 1, B_RELATIVE_TIMEOUT, kTimeLimit) == B_OK;
	}

	TComponent* fComponent = nullptr;
	BMessage fLast;

private:
	sem_id fReceived;
};


/// A form of the size 400 by 300 at (50, 60) on the screen. The window is locked by the test's thread
/// until StartWindow().
class DesignViewTest : public testing::Test {
protected:
	static void SetUpTestSuite()
	{
		sApplication = new BApplication("application/x-vnd.plim-model");
	}
	static void TearDownTestSuite() { delete sApplication; }

	DesignViewTest()
		: fWindow(new BWindow(BRect(50, 60, 450, 360), "Form", B_TITLED_WINDOW, 0)),
		  fSurface(new RecordingView(fWindow->Bounds())),
		  fComponent(&fDesigner)
	{
		fWindow->AddChild(fSurface);
		fDesigner.SetDTFormView(fSurface);
		fComponent.SetComponentName("View1");
		fComponent.InitPropertyList();
		fView = AddView(&fComponent, BRect(5, 5, 55, 25), fSurface);
		fDesigner.AddComponent(&fComponent);
	}

	~DesignViewTest() override
	{
		if (fStarted)
			fWindow->Lock();
		fWindow->Quit();
	}

	RecordingView* AddView(TComponent* component, BRect frame, BView* parent)
	{
		RecordingView* view = new RecordingView(frame);
		parent->AddChild(view);
		component->SetDTView(view);
		view->fComponent = component;
		return view;
	}

	void StartWindow()
	{
		fStarted = true;
		fWindow->Run();
	}

	BMessage MoveMessage(TComponent* component) const
	{
		BMessage message(DTM_COMPONENT_MOVE);
		message.AddPointer("component", component);
		return message;
	}

	/// As the system delivers it: \a where is on the screen, \a grab in the dragged rectangle.
	BMessage DropMessage(TComponent* component, BPoint where, BPoint grab) const
	{
		BMessage message(DTM_COMPONENT_MOVE);
		ComponentDrag::Begin(component, &message);
		message.AddPoint("_drop_point_", where);
		message.AddPoint("_drop_offset_", grab);
		return message;
	}

	static BApplication* sApplication;

	CapturedOutput fOutput;
	BWindow* fWindow;
	RecordingView* fSurface;
	RecordingView* fView;
	TDesigner fDesigner;
	TPlainComponent fComponent;
	bool fStarted = false;
};

BApplication* DesignViewTest::sApplication = nullptr;

} // namespace

TEST_F(DesignViewTest, EdgesMoveAndResizeTheView)
{
	fComponent.SetPropertyValue("Left", "20");
	EXPECT_EQ(fView->Frame(), BRect(20, 5, 70, 25));
	fComponent.SetPropertyValue("Right", "100");
	EXPECT_EQ(fView->Frame(), BRect(20, 5, 100, 25));
	fComponent.SetPropertyValue("Top", "-10");
	EXPECT_EQ(fView->Frame(), BRect(20, -10, 100, 10));
	fComponent.SetPropertyValue("Bottom", "90");
	EXPECT_EQ(fView->Frame(), BRect(20, -10, 100, 90));
}


TEST_F(DesignViewTest, AnEdgeThatIsNoNumberIsZero)
{
	fComponent.SetPropertyValue("Left", "left");
	EXPECT_EQ(fView->Frame().left, 0);
	fComponent.SetPropertyValue("Left", " 12px");
	EXPECT_EQ(fView->Frame().left, 12);
}


TEST_F(DesignViewTest, ADetachedViewIsLeftAlone)
{
	fView->RemoveSelf();
	fComponent.SetPropertyValue("Left", "20");
	fComponent.MoveComponentTo(BPoint(7, 8));
	EXPECT_EQ(fView->Frame(), BRect(5, 5, 55, 25));
	EXPECT_STREQ(fComponent.FindProperty("Left")->Value(), "20");
	delete fView;
}


TEST_F(DesignViewTest, ColoursAreAppliedToTheView)
{
	fComponent.SetPropertyValue("ViewColor", "{1,2,3,4}");
	fComponent.SetPropertyValue("HighColor", "{5,6,7,8}");
	fComponent.SetPropertyValue("LowColor", "{9,10,11,12}");
	EXPECT_EQ(fView->ViewColor(), (rgb_color{1, 2, 3, 4}));
	EXPECT_EQ(fView->HighColor(), (rgb_color{5, 6, 7, 8}));
	EXPECT_EQ(fView->LowColor(), (rgb_color{9, 10, 11, 12}));

	// What the text leaves out stays.
	fComponent.SetPropertyValue("ViewColor", "{20}");
	EXPECT_EQ(fView->ViewColor(), (rgb_color{20, 2, 3, 4}));
	EXPECT_STREQ(fComponent.GetPropertyValue("ViewColor"), "{20}");
}


TEST_F(DesignViewTest, FontsAreAppliedToTheView)
{
	BFont font;
	fComponent.SetPropertyValue("Font", "be_bold_font");
	fView->GetFont(&font);
	EXPECT_TRUE(font == *be_bold_font);
	fComponent.SetPropertyValue("FontSize", "18");
	fView->GetFont(&font);
	EXPECT_EQ(font.Size(), 18);
	fComponent.SetPropertyValue("Font", "be_fixed_font");
	fView->GetFont(&font);
	EXPECT_TRUE(font == *be_fixed_font);
	fComponent.SetPropertyValue("Font", "be_other_font");
	fView->GetFont(&font);
	EXPECT_TRUE(font == *be_fixed_font);
	EXPECT_STREQ(fComponent.GetPropertyValue("Font"), "be_other_font");
}


TEST_F(DesignViewTest, AnInvisibleComponentStaysVisibleWhileItIsDesigned)
{
	fComponent.SetPropertyValue("Visible", "false");
	EXPECT_FALSE(fView->IsHidden(fView));
	EXPECT_STREQ(fComponent.GetPropertyValue("Visible"), "false");
}


TEST_F(DesignViewTest, ComponentsAreMovedAndResized)
{
	fComponent.MoveComponentTo(BPoint(30, 40));
	EXPECT_EQ(fView->Frame(), BRect(30, 40, 80, 60));
	fComponent.ResizeComponentTo(BRect(100, 100, 109, 119));
	EXPECT_EQ(fView->Frame(), BRect(30, 40, 39, 59));

	fComponent.MoveComponentTo(fSurface, BPoint(1, 2));
	EXPECT_EQ(fSurface->Frame().LeftTop(), BPoint(1, 2));
	fComponent.ResizeComponentTo(fSurface, BRect(0, 0, 50, 60));
	EXPECT_EQ(fSurface->Bounds(), BRect(0, 0, 50, 60));
}


TEST_F(DesignViewTest, AnEditThroughAnEditorMovesTheView)
{
	fComponent.FindProperty("Left")->Editor()->SetValue("33", true);
	EXPECT_EQ(fView->Frame().left, 33);
	EXPECT_TRUE(fComponent.Modified());
}


TEST_F(DesignViewTest, LabelAndEnabledReachTheControl)
{
	TidyComponent<TControlComponent> control(nullptr, &fDesigner);
	control.InitPropertyList();
	BButton* button = new BButton(BRect(0, 0, 80, 24), "button", "Old", nullptr);
	fSurface->AddChild(button);
	control.SetDTView(button);
	EXPECT_STREQ(control.GetPropertyValue("Label"), "Old");

	control.SetPropertyValue("Label", "New");
	EXPECT_STREQ(button->Label(), "New");
	EXPECT_STREQ(control.GetPropertyValue("Label"), "New");

	for (const char* value : {"True", "TRUE", "false", "1", ""}) {
		control.SetPropertyValue("Enabled", "true");
		EXPECT_TRUE(button->IsEnabled());
		control.SetPropertyValue("Enabled", value);
		EXPECT_FALSE(button->IsEnabled()) << "'" << value << "'";
	}

	control.SetPropertyValue("ViewColor", "{1,2,3,4}");
	EXPECT_EQ(button->ViewColor(), (rgb_color{1, 2, 3, 4}));
	EXPECT_STREQ(control.FindProperty("ViewColor")->Value(), "{1,2,3,4}");
	EXPECT_EQ(fOutput.Text().find("Warning"), std::string::npos);
}


TEST_F(DesignViewTest, AViewThatIsNoControlHasNoLabel)
{
	TidyComponent<TControlComponent> control(nullptr, &fDesigner);
	control.InitPropertyList();
	AddView(&control, BRect(0, 0, 9, 9), fSurface);
	control.SetPropertyValue("Label", "text");
	control.SetPropertyValue("Enabled", "false");
	EXPECT_STREQ(control.GetPropertyValue("Label"), "text");
}


TEST_F(DesignViewTest, AControlOutsideAWindowWarns)
{
	TidyComponent<TControlComponent> control(nullptr, &fDesigner);
	control.InitPropertyList();
	BButton button(BRect(0, 0, 80, 24), "button", "Old", nullptr);
	control.SetDTView(&button);
	control.SetPropertyValue("Enabled", "false");
	EXPECT_TRUE(button.IsEnabled());
	EXPECT_STREQ(control.GetPropertyValue("Enabled"), "false");
	EXPECT_NE(fOutput.Text().find("::DTView() not set\n"), std::string::npos);
}


TEST_F(DesignViewTest, OnlyMovesWithAComponentAreHandled)
{
	BMessage resize(DTM_COMPONENT_RESIZE);
	resize.AddPointer("component", &fComponent);
	BMessage empty(DTM_COMPONENT_MOVE);
	EXPECT_FALSE(fComponent.HandleComponentDesignMessage(&resize));
	EXPECT_FALSE(fComponent.HandleComponentDesignMessage(&empty));
	EXPECT_TRUE(fDesigner.fMoved.empty());
}


TEST_F(DesignViewTest, ADropOnTheComponentItselfGoesToTheViewBeneath)
{
	BMessage drop = DropMessage(&fComponent, BPoint(100, 100), BPoint(4, 4));
	EXPECT_FALSE(fComponent.HandleComponentDesignMessage(&drop));
	EXPECT_EQ(fOutput.Text(), "TPlainComponent selected\n");

	StartWindow();
	ASSERT_TRUE(fSurface->WaitForMessage());
	fWindow->Lock();
	EXPECT_EQ(fSurface->fLast.what, uint32(DTM_COMPONENT_MOVE));

	// The copy still says where.
	BPoint corner;
	ASSERT_TRUE(FindDroppedCorner(&fSurface->fLast, fSurface, &corner));
	EXPECT_EQ(corner, BPoint(46, 36));
	fWindow->Unlock();
}


TEST_F(DesignViewTest, AMoveThatWasNotDroppedReportsTheFrame)
{
	TBoxComponent box(&fDesigner);
	AddView(&box, BRect(100, 100, 200, 200), fSurface);
	BMessage move = MoveMessage(&fComponent);
	EXPECT_TRUE(box.HandleComponentDesignMessage(&move));

	ASSERT_EQ(fDesigner.fMoved.size(), 1u);
	EXPECT_EQ(fDesigner.fMoved[0], &fComponent);
	EXPECT_EQ(fDesigner.fPoints[0], BPoint(5, 5));
	EXPECT_EQ(fView->Parent(), fSurface);
	EXPECT_EQ(box.CountComponents(), 0);
}


TEST_F(DesignViewTest, ADropMovesAChildWithinItsParent)
{
	TBoxComponent box(&fDesigner);
	BView* boxView = AddView(&box, BRect(100, 100, 200, 200), fSurface);
	TPlainComponent child(&fDesigner);
	BView* childView = AddView(&child, BRect(1, 1, 21, 21), boxView);
	box.AddComponent(&child);

	// The box begins at (150, 160) on the screen.
	BMessage drop = DropMessage(&child, BPoint(170, 190), BPoint(5, 5));
	EXPECT_TRUE(box.HandleComponentDesignMessage(&drop));
	EXPECT_EQ(childView->Frame(), BRect(15, 25, 35, 45));
	EXPECT_EQ(box.CountComponents(), 1);
	ASSERT_EQ(fDesigner.fPoints.size(), 1u);
	EXPECT_EQ(fDesigner.fPoints[0], BPoint(15, 25));
	EXPECT_EQ(fOutput.Text(), "");
}


TEST_F(DesignViewTest, ADropFromTheFormStaysInTheFormsList)
{
	TBoxComponent box(&fDesigner);
	BView* boxView = AddView(&box, BRect(100, 100, 200, 200), fSurface);
	BMessage drop = DropMessage(&fComponent, BPoint(160, 170), BPoint(0, 0));
	EXPECT_TRUE(box.HandleComponentDesignMessage(&drop));

	EXPECT_EQ(fView->Parent(), boxView);
	EXPECT_EQ(fView->Frame(), BRect(10, 10, 60, 30));
	EXPECT_EQ(box.ComponentAt(0), &fComponent);
	EXPECT_EQ(fComponent.Owner(), static_cast<TComponentOwner*>(&box));
	EXPECT_EQ(fDesigner.ComponentAt(0), &fComponent);
	EXPECT_EQ(fOutput.Text(), "TBoxComponent Adding child from other parent\n");
}


TEST_F(DesignViewTest, TheOtherFaceOfTheFormCountsAsTheForm)
{
	TDesigner window;
	window.SetDTFormView(fSurface);
	fComponent.SetDesigner(&window);
	TBoxComponent box(&window);
	AddView(&box, BRect(100, 100, 200, 200), fSurface);
	BMessage drop = DropMessage(&fComponent, BPoint(160, 170), BPoint(0, 0));
	EXPECT_TRUE(box.HandleComponentDesignMessage(&drop));
	EXPECT_EQ(fDesigner.CountComponents(), 1);
	EXPECT_EQ(box.CountComponents(), 1);
}


TEST_F(DesignViewTest, ADropFromAnotherContainerLeavesItsList)
{
	TBoxComponent from(&fDesigner);
	TBoxComponent to(&fDesigner);
	BView* fromView = AddView(&from, BRect(100, 100, 200, 200), fSurface);
	BView* toView = AddView(&to, BRect(0, 0, 90, 90), fSurface);
	TPlainComponent child(&fDesigner);
	BView* childView = AddView(&child, BRect(1, 1, 21, 21), fromView);
	fDesigner.AddComponent(&child);
	from.AddComponent(&child);

	BMessage drop = DropMessage(&child, BPoint(80, 100), BPoint(0, 0));
	EXPECT_TRUE(to.HandleComponentDesignMessage(&drop));
	EXPECT_EQ(from.CountComponents(), 0);
	EXPECT_EQ(to.ComponentAt(0), &child);
	EXPECT_EQ(child.Owner(), static_cast<TComponentOwner*>(&to));
	EXPECT_EQ(fDesigner.CountComponents(), 2);
	EXPECT_EQ(childView->Parent(), toView);
	EXPECT_EQ(childView->Frame(), BRect(30, 40, 50, 60));
}


TEST_F(DesignViewTest, WhatOwnsNoChildrenTakesTheViewOnly)
{
	TPlainComponent other(&fDesigner);
	BView* otherView = AddView(&other, BRect(100, 100, 200, 200), fSurface);
	BMessage drop = DropMessage(&fComponent, BPoint(160, 170), BPoint(0, 0));
	EXPECT_TRUE(other.HandleComponentDesignMessage(&drop));
	EXPECT_EQ(fView->Parent(), otherView);
	EXPECT_EQ(fComponent.Owner(), &fDesigner);
}


TEST_F(DesignViewTest, AContainerCannotGoIntoItsOwnChild)
{
	TBoxComponent outer(&fDesigner);
	TBoxComponent inner(&fDesigner);
	BView* outerView = AddView(&outer, BRect(100, 100, 200, 200), fSurface);
	BView* innerView = AddView(&inner, BRect(10, 10, 90, 90), outerView);
	outer.AddComponent(&inner);

	BMessage drop = DropMessage(&outer, BPoint(180, 190), BPoint(0, 0));
	EXPECT_TRUE(inner.HandleComponentDesignMessage(&drop));
	EXPECT_EQ(outerView->Parent(), fSurface);
	EXPECT_EQ(innerView->Parent(), outerView);
	EXPECT_EQ(outerView->Frame(), BRect(100, 100, 200, 200));
	EXPECT_EQ(inner.CountComponents(), 0);
}


TEST_F(DesignViewTest, ADropThatComesLateIsNotTaken)
{
	TBoxComponent box(&fDesigner);
	AddView(&box, BRect(100, 100, 200, 200), fSurface);
	BMessage late = DropMessage(&fComponent, BPoint(160, 170), BPoint(0, 0));
	// The same component, dragged again; and one that is destroyed.
	BMessage drop = DropMessage(&fComponent, BPoint(160, 170), BPoint(0, 0));
	EXPECT_FALSE(box.HandleComponentDesignMessage(&late));
	EXPECT_EQ(fView->Parent(), fSurface);

	{
		TPlainComponent gone(&fDesigner);
		drop = DropMessage(&gone, BPoint(160, 170), BPoint(0, 0));
	}
	EXPECT_FALSE(box.HandleComponentDesignMessage(&drop));
	EXPECT_EQ(box.CountComponents(), 0);
}


TEST_F(DesignViewTest, ADropFromAnotherProgramIsNotTaken)
{
	// The other program's pointer may be the same by chance.
	TBoxComponent box(&fDesigner);
	AddView(&box, BRect(100, 100, 200, 200), fSurface);
	BMessage own = DropMessage(&fComponent, BPoint(160, 170), BPoint(0, 0));
	BMessage drop = MoveMessage(&fComponent);
	drop.AddInt64("drag", own.GetInt64("drag", 0) + 1);
	drop.AddPoint("_drop_point_", BPoint(160, 170));
	EXPECT_FALSE(box.HandleComponentDesignMessage(&drop));
	drop.RemoveName("drag");
	EXPECT_FALSE(box.HandleComponentDesignMessage(&drop));
	EXPECT_EQ(fView->Parent(), fSurface);
}


TEST_F(DesignViewTest, AMoveOfAnUnknownComponentIsNotTaken)
{
	TBoxComponent box(&fDesigner);
	AddView(&box, BRect(100, 100, 200, 200), fSurface);
	BMessage move(DTM_COMPONENT_MOVE);
	move.AddPointer("component", reinterpret_cast<void*>(16));
	EXPECT_FALSE(box.HandleComponentDesignMessage(&move));
	EXPECT_TRUE(fDesigner.fMoved.empty());
}


TEST_F(DesignViewTest, ComponentsWithoutAViewAreNotMoved)
{
	TPlainComponent viewless(&fDesigner);
	BMessage drop = DropMessage(&viewless, BPoint(160, 170), BPoint(0, 0));
	EXPECT_FALSE(fComponent.HandleComponentDesignMessage(&drop));
	BMessage other = DropMessage(&fComponent, BPoint(160, 170), BPoint(0, 0));
	EXPECT_FALSE(viewless.HandleComponentDesignMessage(&other));
	EXPECT_EQ(fView->Frame(), BRect(5, 5, 55, 25));
}


TEST_F(DesignViewTest, AMessageThatWasNotDroppedHasNoCorner)
{
	const BMessage move = MoveMessage(&fComponent);
	BPoint corner(1, 2);
	EXPECT_FALSE(FindDroppedCorner(&move, fSurface, &corner));
	EXPECT_EQ(corner, BPoint(1, 2));
}


TEST_F(DesignViewTest, DrawingTheSelectionRestoresTheColour)
{
	fView->SetHighColor(1, 2, 3, 4);
	fComponent.DesignerDrawSelection();
	fComponent.DesignerSelect(true);
	fComponent.DesignerDrawSelection();
	EXPECT_EQ(fView->HighColor(), (rgb_color{1, 2, 3, 4}));
}


TEST_F(DesignViewTest, APressSelectsTheComponentAlone)
{
	TPlainComponent other(&fDesigner);
	AddView(&other, BRect(0, 0, 9, 9), fSurface);
	fDesigner.AddComponent(&other);
	other.DesignerSelect(true);

	fComponent.DesignerMouseDown(BPoint(1, 1), fView->Bounds(), fView);
	EXPECT_TRUE(fComponent.IsDesignerSelected());
	EXPECT_FALSE(other.IsDesignerSelected());
	EXPECT_EQ(fComponent.fSelections, 1);
	EXPECT_EQ(fDesigner.fSelected, std::vector<TComponent*>{&fComponent});
	EXPECT_TRUE(fComponent.fEdited.empty());
}


TEST_F(DesignViewTest, APressWithoutAViewOnlySelects)
{
	TPlainComponent viewless(nullptr);
	viewless.DesignerMouseDown(BPoint(1, 1), BRect(0, 0, 9, 9), nullptr);
	EXPECT_TRUE(viewless.IsDesignerSelected());
	EXPECT_EQ(viewless.fSelections, 0);
}


TEST_F(DesignViewTest, ADoubleClickEditsAndNeverDrags)
{
	StartWindow();
	BMessage press('clik');
	press.AddInt32("clicks", 2);
	fWindow->PostMessage(&press, fView);
	ASSERT_TRUE(fView->WaitForMessage());
	EXPECT_EQ(fComponent.fEdited, std::vector<BPoint>{BPoint(3, 4)});
	EXPECT_TRUE(fComponent.IsDesignerSelected());
}
