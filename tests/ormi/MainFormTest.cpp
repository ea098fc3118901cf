// SPDX-License-Identifier: MIT
// Tests of the main form: its end is the program's, another form's is not.

#include <ormi/Form.h>

#include <gtest/gtest.h>

#include <Application.h>
#include <Autolock.h>

#include "EventForm.h"

namespace {

constexpr uint32 kOtherFormIsGone = 'gone';


/// An application in the style of generated ones, which counts how often it was asked to quit.
class TTestApp : public BApplication {
public:
	TTestApp()
		: BApplication("application/x-vnd.plimworks-ormi-test"),
		  m_MainForm(new TEventForm())
	{
		m_MainForm->MakeMainForm(true);
		m_MainForm->Show();
	}

	void ReadyToRun() override
	{
		TForm* other = new TEventForm();
		other->Show();
		other->Lock();
		other->Quit();
		PostMessage(kOtherFormIsGone);
	}

	void MessageReceived(BMessage* message) override
	{
		if (message->what != kOtherFormIsGone) {
			BApplication::MessageReceived(message);
			return;
		}
		askedAfterOtherForm = asked;
		m_MainForm->PostMessage(B_QUIT_REQUESTED);
	}

	bool QuitRequested() override
	{
		asked++;
		return BApplication::QuitRequested();
	}

	int asked = 0;
	int askedAfterOtherForm = -1;

private:
	TForm* m_MainForm;
};

} // namespace


TEST(MainFormTest, TheEndOfTheMainFormQuitsTheProgram)
{
	TTestApp app;
	app.Run();
	EXPECT_EQ(app.askedAfterOtherForm, 0);
	EXPECT_EQ(app.asked, 1);
	EXPECT_EQ(app.CountWindows(), 0);
}


TEST(MainFormTest, TheLastFormEndsTheProgramWhenItRefusedToGoWithTheMainForm)
{
	class TPatientApp : public BApplication {
	public:
		TPatientApp()
			: BApplication("application/x-vnd.plimworks-ormi-test"),
			  stubborn(new TEventForm),
			  other(new TEventForm)
		{
			TForm* form = new TEventForm;
			form->MakeMainForm(true);
			for (TForm* one : {form, static_cast<TForm*>(stubborn), static_cast<TForm*>(other)})
				one->Show();
			stubborn->mayQuit = false;
			form->PostMessage(B_QUIT_REQUESTED);
		}

		bool QuitRequested() override
		{
			asked++;
			if (BApplication::QuitRequested())
				return true;
			other->PostMessage(B_QUIT_REQUESTED);
			if (BAutolock lock(stubborn); lock.IsLocked())
				stubborn->mayQuit = true;
			stubborn->PostMessage(B_QUIT_REQUESTED);
			return false;
		}

		TEventForm* stubborn;
		TEventForm* other;
		int asked = 0;
	} app;
	app.Run();
	EXPECT_EQ(app.asked, 2);
}


TEST(MainFormTest, AMainFormMayOutliveTheApplicationObject)
{
	gEvents.Take();
	BApplication* app = new BApplication("application/x-vnd.plimworks-ormi-test");
	TForm* form = new TEventForm;
	form->MakeMainForm(true);
	EXPECT_TRUE(form->IsMainForm());
	form->MakeMainForm(false);
	EXPECT_FALSE(form->IsMainForm());
	form->MakeMainForm(true);
	// It quits the windows that are there still.
	delete app;
	EXPECT_EQ(gEvents.Take().back(), "FormDestroy text");
}
