// SPDX-License-Identifier: MIT

#include "designer/DesignForm.h"

#include <cstring>

#include <Application.h>
#include <Messenger.h>

#include "designer/DesignerTest.h"
#include "model/Property.h"
#include "palette/PaletteCatalog.h"
#include "support/CapturedOutput.h"
#include "support/Printers.h"

class DesignFormTest : public DesignerTest {};


TEST_F(DesignFormTest, ANewFormIsNamedAndInTheMiddleOfTheScreen)
{
	TDesignForm* form = NewForm("Form1");
	EXPECT_STREQ(form->ComponentName(), "Form1");
	// The window's title is the property's, which has its own start.
	EXPECT_STREQ(form->Title(), "Form");
	EXPECT_STREQ(form->ClassName(), "TForm");
	EXPECT_EQ(form->Bounds(), BRect(0, 0, 300, 300));
	EXPECT_NE(form->Flags() & B_WILL_ACCEPT_FIRST_CLICK, 0u);
	ASSERT_NE(form->View(), nullptr);
	EXPECT_STREQ(form->View()->Name(), "vwDesign");
	EXPECT_EQ(form->View()->Frame(), form->Bounds());
	EXPECT_EQ(form->DTView(), form->View());
}


TEST_F(DesignFormTest, EdgesMoveAndResizeTheWindow)
{
	TDesignForm* form = NewForm();
	form->SetPropertyValue("Left", "200");
	form->SetPropertyValue("Top", "150");
	EXPECT_EQ(form->Frame(), BRect(200, 150, 500, 450));
	form->SetPropertyValue("Right", "420");
	form->SetPropertyValue("Bottom", "333");
	EXPECT_EQ(form->Frame(), BRect(200, 150, 420, 333));
	EXPECT_STREQ(form->FindProperty("Left")->Value(), "200");
	EXPECT_STREQ(form->FindProperty("Bottom")->Value(), "333");
}


TEST_F(DesignFormTest, TextThatIsNoNumberCountsAsZero)
{
	TDesignForm* form = NewForm();
	form->SetPropertyValue("Left", "far left");
	EXPECT_EQ(form->Frame().left, 0);
	EXPECT_STREQ(form->FindProperty("Left")->Value(), "far left");
}


TEST_F(DesignFormTest, ANegativeWidthIsLimitedByTheWindow)
{
	TDesignForm* form = NewForm();
	form->SetPropertyValue("Left", "200");
	form->SetPropertyValue("Right", "100");
	EXPECT_GE(form->Frame().Width(), 0);
	EXPECT_EQ(form->Frame().left, 200);
}


TEST_F(DesignFormTest, TheWindowsEdgesGoToTheEditors)
{
	TDesignForm* form = NewForm();
	form->MoveTo(33, 44);
	form->ResizeTo(210, 110);
	form->UpdateWindowPosition();
	EXPECT_STREQ(form->FindProperty("Left")->Value(), "33");
	EXPECT_STREQ(form->FindProperty("Top")->Value(), "44");
	EXPECT_STREQ(form->FindProperty("Right")->Value(), "243");
	EXPECT_STREQ(form->FindProperty("Bottom")->Value(), "154");
}


TEST_F(DesignFormTest, AComponentsEdgesAreRounded)
{
	TDesignForm* form = NewForm();
	TComponent* button = Place(form, "TButton", "Button1");
	form->UpdateComponentPosition(button, BRect(1.4f, 2.5f, 99.6f, 40.2f));
	EXPECT_STREQ(button->FindProperty("Left")->Value(), "1");
	EXPECT_STREQ(button->FindProperty("Top")->Value(), "3");
	EXPECT_STREQ(button->FindProperty("Right")->Value(), "100");
	EXPECT_STREQ(button->FindProperty("Bottom")->Value(), "40");
}


TEST_F(DesignFormTest, TheTitleFollowsItsProperty)
{
	TDesignForm* form = NewForm();
	form->SetPropertyValue("Title", "A new title");
	EXPECT_STREQ(form->Title(), "A new title");
	EXPECT_STREQ(form->GetPropertyValue("Title"), "A new title");
	EXPECT_STREQ(form->ComponentName(), "Form1");
}


TEST_F(DesignFormTest, ColoursGoToTheSurface)
{
	TDesignForm* form = NewForm();
	form->SetPropertyValue("ViewColor", "{10,20,30,255}");
	form->SetPropertyValue("HighColor", "{40,50,60,255}");
	form->SetPropertyValue("LowColor", "{70,80,90,255}");
	EXPECT_EQ(form->View()->ViewColor(), (rgb_color{10, 20, 30, 255}));
	EXPECT_EQ(form->View()->HighColor(), (rgb_color{40, 50, 60, 255}));
	EXPECT_EQ(form->View()->LowColor(), (rgb_color{70, 80, 90, 255}));
	EXPECT_STREQ(form->GetPropertyValue("ViewColor"), "{10,20,30,255}");
}


TEST_F(DesignFormTest, AMissingNameOrValueChangesNothing)
{
	TDesignForm* form = NewForm();
	const BRect frame = form->Frame();
	form->SetPropertyValue("Left", nullptr);
	EXPECT_EQ(form->Frame(), frame);
}


TEST_F(DesignFormTest, PlacingNamesComponentsByTheFirstFreeNumber)
{
	TDesignForm* form = NewForm();
	TPaletteEntry* entry = PaletteCatalog().FindPalEntry("TButton");
	CapturedOutput output;
	for (int32 i = 1; i <= 3; i++) {
		PaletteCatalog().SetDropEntry(entry);
		TComponent* component = form->CreateComponent(form->View(), BRect(10, 20, 80, 44));
		ASSERT_NE(component, nullptr);
		EXPECT_EQ(component->ComponentName(), "Button" + std::to_string(i));
		EXPECT_STREQ(component->FindProperty("Name")->Value(), component->ComponentName());
		EXPECT_STREQ(component->FindProperty("Left")->Value(), "10");
		EXPECT_STREQ(component->FindProperty("Bottom")->Value(), "44");
		EXPECT_EQ(component->DTView()->Parent(), form->View());
		EXPECT_TRUE(form->IsForm(component->Owner()));
		form->DoneDroppingComponent();
		EXPECT_FALSE(form->IsDropWaiting());
	}
	EXPECT_NE(output.Text().find("Creating Component 'Button3'\n"), std::string::npos);
	EXPECT_EQ(form->CountComponents(), 3);
	EXPECT_EQ(form->View()->CountComponents(), 3);
}


TEST_F(DesignFormTest, WithoutAWaitingEntryNothingIsPlaced)
{
	TDesignForm* form = NewForm();
	EXPECT_EQ(form->CreateComponent(form->View(), BRect(0, 0, 20, 20)), nullptr);
	EXPECT_EQ(form->CountComponents(), 0);
}


TEST_F(DesignFormTest, AnEntryThatMakesNothingIsTold)
{
	TDesignForm* form = NewForm();
	PaletteCatalog().SetDropEntry(PaletteCatalog().FindPalEntry("TNone"));
	CapturedOutput output;
	EXPECT_EQ(form->CreateComponent(form->View(), BRect(0, 0, 20, 20)), nullptr);
	EXPECT_EQ(output.Text(), "No component returned from CreateComponent()\n");
	form->DoneDroppingComponent();
}


TEST_F(DesignFormTest, RenamingAFormThroughItsPropertyRenamesIt)
{
	TDesignForm* form = NewForm();
	form->SetPropertyValue("Name", "Renamed");
	EXPECT_STREQ(form->ComponentName(), "Renamed");
	EXPECT_STREQ(form->FindProperty("Name")->Value(), "Renamed");
}


TEST_F(DesignFormTest, AChangedComponentMakesTheFormModifiedUntilItIsSaved)
{
	TDesignForm* form = NewForm();
	TComponent* button = Place(form, "TButton", "Button1");
	Save(form, fFolder / "form.frm");
	EXPECT_FALSE(form->Modified());
	EXPECT_FALSE(button->Modified());
	button->SetPropertyValue("Label", "changed");
	EXPECT_TRUE(form->Modified());
	EXPECT_TRUE(button->Modified());
	Save(form, fFolder / "form.frm");
	EXPECT_FALSE(form->Modified());
	EXPECT_FALSE(button->Modified());
}


TEST_F(DesignFormTest, ClosingAFormHidesItUntilTheProgramEnds)
{
	TDesignForm* form = new TDesignForm("Shown");
	BMessenger messenger(form);
	{
		form->Lock();
		EXPECT_FALSE(form->IsHidden());
		EXPECT_FALSE(form->QuitRequested());
		EXPECT_TRUE(form->IsHidden());
		form->OKToClose(true);
		EXPECT_TRUE(form->QuitRequested());
		form->Quit();
	}
	EXPECT_FALSE(messenger.IsValid());
}


TEST_F(DesignFormTest, LoadingByMessageAnswersWithResultAndName)
{
	TDesignForm* saved = NewForm("Saved");
	Save(saved, fFolder / "form.frm");
	TDesignForm* form = new TDesignForm("Shown");
	BMessenger messenger(form);

	BMessage load(DFM_LOADFILE);
	BMessage reply;
	ASSERT_EQ(messenger.SendMessage(&load, &reply, 5000000, 5000000), B_OK);
	EXPECT_EQ(reply.what, static_cast<uint32>(DFM_LOADFILE));
	EXPECT_FALSE(reply.FindBool("result"));
	EXPECT_STREQ(reply.FindString("formname"), "Shown");

	load.AddString("filename", (fFolder / "form.frm").c_str());
	ASSERT_EQ(messenger.SendMessage(&load, &reply, 5000000, 5000000), B_OK);
	EXPECT_TRUE(reply.FindBool("result"));
	EXPECT_STREQ(reply.FindString("formname"), "Saved");

	form->OKToClose(true);
	form->Lock();
	form->Quit();
}


TEST_F(DesignFormTest, SavingByMessageNeedsAFile)
{
	TDesignForm* form = new TDesignForm("Shown");
	BMessenger messenger(form);
	BMessage save(DFM_SAVEFILE);
	BMessage reply;
	ASSERT_EQ(messenger.SendMessage(&save, &reply, 5000000, 5000000), B_OK);
	EXPECT_EQ(reply.what, static_cast<uint32>(DFM_SAVEFILE));
	EXPECT_FALSE(reply.FindBool("result"));

	form->Lock();
	form->SetFilename((fFolder / "form.frm").c_str());
	form->Unlock();
	ASSERT_EQ(messenger.SendMessage(&save, &reply, 5000000, 5000000), B_OK);
	EXPECT_TRUE(reply.FindBool("result"));
	EXPECT_FALSE(fFolder.Read("form.frm").empty());

	form->OKToClose(true);
	form->Lock();
	form->Quit();
}
