// SPDX-License-Identifier: MIT
// Tests of what the mouse does to a component, in a shown window and with an injected pointer.

#include <string>
#include <vector>

#include <Application.h>
#include <Message.h>
#include <OS.h>
#include <View.h>
#include <Window.h>
#include <gtest/gtest.h>

#include "display/Display.h"
#include "model/ComponentOwner.h"
#include "model/DesignMessages.h"
#include "model/FormDesigner.h"
#include "model/ViewComponent.h"
#include "support/CapturedOutput.h"
#include "support/Printers.h"

namespace {

const bigtime_t kTimeLimit = 10000000;
const bigtime_t kRetryInterval = 50000;

// The window's content begins there on the screen.
const BPoint kOrigin(50, 60);


struct Step {
	BPoint where; // in the window
	uint32 buttons;
};


void
Inject(const Step& step)
{
	BPrivate::Display::Get().InjectPointer(kOrigin + step.where, step.buttons);
}


class TBoxComponent : public TViewComponent, public TComponentOwner {
public:
	explicit TBoxComponent(TFormDesigner* designer)
		: TViewComponent(nullptr, designer)
	{
	}
};


/// Moves the mouse on as soon as a component has been pressed: the events then wait, in order, for the
/// component that polls.
class TMovingDesigner : public TFormDesigner {
public:
	void ComponentSelected(TComponent*) override
	{
		for (const Step& step : fSteps)
			Inject(step);
	}

	bool IsDropWaiting() override { return fDropWaiting; }

	TComponent* CreateComponent(BView* parent, BRect frame) override
	{
		fCreatedIn = parent;
		fCreatedFrame = frame;
		return fCreated;
	}

	void DoneDroppingComponent() override { fDropWaiting = false; }

	std::vector<Step> fSteps;
	bool fDropWaiting = false;
	TComponent* fCreated = nullptr;
	BView* fCreatedIn = nullptr;
	BRect fCreatedFrame;
};


/// A view of a component, or the form beneath it.
class MouseView : public BView {
public:
	MouseView(BRect frame, TComponent* component)
		: BView(frame, "view", B_FOLLOW_NONE, B_WILL_DRAW),
		  fComponent(component),
		  fPressed(create_sem(0, "pressed")),
		  fReceived(create_sem(0, "received")),
		  fDragged(create_sem(0, "dragged"))
	{
	}

	~MouseView() override
	{
		delete_sem(fPressed);
		delete_sem(fReceived);
		delete_sem(fDragged);
	}

	void AttachedToWindow() override
	{
		// However slow the test runs, no step of the pointer is skipped.
		SetEventMask(B_POINTER_EVENTS, B_FULL_POINTER_HISTORY);
	}

	void MouseDown(BPoint where) override
	{
		if (fComponent == nullptr)
			return;
		fComponent->DesignerMouseDown(where, Bounds(), this);
		release_sem(fPressed);
	}

	void MouseMoved(BPoint, uint32, const BMessage* dragMessage) override
	{
		if (dragMessage != nullptr)
			release_sem(fDragged);
	}

	void MessageReceived(BMessage* message) override
	{
		if (message->what < DTM_COMPONENT_MOVE || message->what > DTM_COMPONENT_CONTEXTMENU) {
			BView::MessageReceived(message);
			return;
		}
		fLast = *message;
		fWasDropped = message->WasDropped();
		fHasCorner = FindDroppedCorner(message, this, &fCorner);
		release_sem(fReceived);
	}

	bool WaitForPress() { return WaitFor(fPressed, kTimeLimit); }
	bool WaitForMessage() { return WaitFor(fReceived, kTimeLimit); }
	bool WaitForDrag(bigtime_t limit) { return WaitFor(fDragged, limit); }
	bool HasMessage() { return WaitFor(fReceived, 0); }

	BMessage fLast;
	bool fWasDropped = false;
	bool fHasCorner = false;
	BPoint fCorner;

private:
	static bool WaitFor(sem_id sem, bigtime_t limit)
	{
		return acquire_sem_etc(sem, 1, B_RELATIVE_TIMEOUT, limit) == B_OK;
	}

	TComponent* fComponent;
	sem_id fPressed;
	sem_id fReceived;
	sem_id fDragged;
};


/// A form of 400 by 300 with one component at (20, 20)-(120, 80).
class ComponentMouseTest : public testing::Test {
protected:
	static void SetUpTestSuite()
	{
		sApplication = new BApplication("application/x-vnd.plim-mouse");
	}
	static void TearDownTestSuite() { delete sApplication; }

	ComponentMouseTest()
		: fWindow(
			new BWindow(BRect(kOrigin, kOrigin + BPoint(400, 300)), "Form", B_TITLED_WINDOW, 0)),
		  fForm(new MouseView(fWindow->Bounds(), nullptr)),
		  fBox(&fDesigner),
		  fView(new MouseView(BRect(20, 20, 120, 80), &fBox))
	{
		fWindow->AddChild(fForm);
		fForm->AddChild(fView);
		fBox.SetDTView(fView);
		fDesigner.AddComponent(&fBox);
		fWindow->Show();
		Inject({BPoint(300, 200), 0});
	}

	~ComponentMouseTest() override
	{
		Inject({BPoint(300, 200), 0});
		fWindow->Lock();
		fWindow->Quit();
	}

	/// Presses at \a where, goes through \a steps, and waits until the component is done.
	bool Press(BPoint where, uint32 buttons, const std::vector<Step>& steps)
	{
		fDesigner.fSteps = steps;
		Inject({where, 0});
		Inject({where, buttons});
		return fView->WaitForPress();
	}

	BRect ViewFrame()
	{
		fWindow->Lock();
		const BRect frame = fView->Frame();
		fWindow->Unlock();
		return frame;
	}

	static BApplication* sApplication;

	CapturedOutput fOutput;
	TMovingDesigner fDesigner;
	BWindow* fWindow;
	MouseView* fForm;
	TBoxComponent fBox;
	MouseView* fView;
};

BApplication* ComponentMouseTest::sApplication = nullptr;

const uint32 kPrimary = B_PRIMARY_MOUSE_BUTTON;
const uint32 kSecondary = B_SECONDARY_MOUSE_BUTTON;

} // namespace

TEST_F(ComponentMouseTest, TheHandleResizes)
{
	// Five pixels left of and above the corner is on the handle.
	ASSERT_TRUE(Press(BPoint(115, 75), kPrimary,
		{{BPoint(118, 78), kPrimary}, {BPoint(150, 100), kPrimary}, {BPoint(170, 110), 0}}));
	ASSERT_TRUE(fForm->WaitForMessage());
	EXPECT_EQ(ViewFrame(), BRect(20, 20, 170, 110));
	EXPECT_EQ(fForm->fLast.what, uint32(DTM_COMPONENT_RESIZE));
	EXPECT_EQ(fForm->fLast.FindRect("frame"), BRect(20, 20, 170, 110));
	void* component = nullptr;
	ASSERT_EQ(fForm->fLast.FindPointer("component", &component), B_OK);
	EXPECT_EQ(component, static_cast<TComponent*>(&fBox));
}


TEST_F(ComponentMouseTest, ATooSmallSizeIsDroppedButReported)
{
	ASSERT_TRUE(Press(BPoint(118, 78), kPrimary,
		{{BPoint(110, 70), kPrimary}, {BPoint(25, 60), kPrimary}, {BPoint(25, 60), 0}}));
	ASSERT_TRUE(fForm->WaitForMessage());
	EXPECT_EQ(ViewFrame(), BRect(20, 20, 120, 80));
	EXPECT_EQ(fForm->fLast.FindRect("frame"), BRect(20, 20, 120, 80));
}


TEST_F(ComponentMouseTest, EightPixelsAreEnough)
{
	ASSERT_TRUE(Press(BPoint(118, 78), kPrimary,
		{{BPoint(110, 70), kPrimary}, {BPoint(28, 28), kPrimary}, {BPoint(28, 28), 0}}));
	ASSERT_TRUE(fForm->WaitForMessage());
	EXPECT_EQ(ViewFrame(), BRect(20, 20, 28, 28));
}


TEST_F(ComponentMouseTest, OnePixelBesideTheHandleDrags)
{
	ASSERT_TRUE(Press(BPoint(114, 75), kPrimary, {{BPoint(116, 77), kPrimary}}));

	// The drag has begun when the views hear of it.
	bool dragged = false;
	for (bigtime_t waited = 0; !dragged && waited < kTimeLimit; waited += kRetryInterval) {
		Inject({BPoint(200 + (waited / kRetryInterval) % 2, 150), kPrimary});
		dragged = fForm->WaitForDrag(kRetryInterval);
	}
	ASSERT_TRUE(dragged);
	Inject({BPoint(250, 175), kPrimary});
	Inject({BPoint(250, 175), 0});

	ASSERT_TRUE(fForm->WaitForMessage());
	EXPECT_EQ(fForm->fLast.what, uint32(DTM_COMPONENT_MOVE));
	EXPECT_TRUE(fForm->fWasDropped);
	// The component was taken 94 and 55 pixels from its corner.
	ASSERT_TRUE(fForm->fHasCorner);
	EXPECT_EQ(fForm->fCorner, BPoint(156, 120));
	EXPECT_EQ(ViewFrame(), BRect(20, 20, 120, 80));
}


TEST_F(ComponentMouseTest, TheSecondaryButtonAsksForTheContextMenu)
{
	ASSERT_TRUE(Press(BPoint(60, 50), kSecondary, {{BPoint(61, 52), kSecondary}}));
	ASSERT_TRUE(fForm->WaitForMessage());
	EXPECT_EQ(fForm->fLast.what, uint32(DTM_COMPONENT_CONTEXTMENU));
	EXPECT_EQ(fForm->fLast.FindPoint("where"), BPoint(41, 32));
	void* view = nullptr;
	ASSERT_EQ(fForm->fLast.FindPointer("view", &view), B_OK);
	EXPECT_EQ(view, static_cast<BView*>(fView));
	void* component = nullptr;
	ASSERT_EQ(fForm->fLast.FindPointer("component", &component), B_OK);
	EXPECT_EQ(component, static_cast<TComponent*>(&fBox));
}


TEST_F(ComponentMouseTest, AReleasedButtonOnlySelects)
{
	ASSERT_TRUE(Press(BPoint(60, 50), kPrimary, {{BPoint(60, 50), 0}}));
	EXPECT_TRUE(fBox.IsDesignerSelected());
	EXPECT_FALSE(fForm->HasMessage());
}


TEST_F(ComponentMouseTest, ARubberBandCreatesAChild)
{
	TViewComponent child(nullptr, &fDesigner);
	child.SetComponentName("View7");
	fDesigner.fDropWaiting = true;
	fDesigner.fCreated = &child;
	ASSERT_TRUE(Press(BPoint(40, 30), kPrimary,
		{{BPoint(60, 50), kPrimary}, {BPoint(80, 70), kPrimary}, {BPoint(90, 65), 0}}));

	EXPECT_EQ(fDesigner.fCreatedIn, fView);
	EXPECT_EQ(fDesigner.fCreatedFrame, BRect(20, 10, 70, 45));
	EXPECT_EQ(fBox.ComponentAt(0), &child);
	EXPECT_EQ(child.Owner(), static_cast<TComponentOwner*>(&fBox));
	EXPECT_FALSE(fDesigner.fDropWaiting);
	EXPECT_EQ(fOutput.Text(), "TBoxComponent: Created component 'View7'\n");
}


TEST_F(ComponentMouseTest, AShortRubberBandCreatesAnEightPixelChild)
{
	TViewComponent child(nullptr, &fDesigner);
	fDesigner.fDropWaiting = true;
	fDesigner.fCreated = &child;
	ASSERT_TRUE(Press(BPoint(40, 30), kPrimary, {{BPoint(45, 20), kPrimary}, {BPoint(45, 20), 0}}));
	EXPECT_EQ(fDesigner.fCreatedFrame, BRect(20, 10, 28, 18));
}


TEST_F(ComponentMouseTest, WithoutACreatedChildTheEntryStillWaits)
{
	fDesigner.fDropWaiting = true;
	ASSERT_TRUE(Press(BPoint(40, 30), kPrimary, {{BPoint(90, 70), 0}}));
	EXPECT_EQ(fBox.CountComponents(), 0);
	EXPECT_TRUE(fDesigner.fDropWaiting);
	EXPECT_EQ(fOutput.Text(), "");
}
