// SPDX-License-Identifier: MIT
// Tests of the commands of the design surface: menus, clipboard, shortcuts, saving.

#include "designer/SurfaceTest.h"

#include <cmath>
#include <cstdio>
#include <filesystem>

#include <Autolock.h>
#include <Clipboard.h>
#include <DataIO.h>
#include <Entry.h>
#include <MenuItem.h>
#include <PopUpMenu.h>

#include "app/WindowGuard.h"
#include "model/Event.h"
#include "model/Property.h"
#include "model/ViewComponent.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "support/Printers.h"

namespace {

constexpr const char* kComponentType = "application/x-plim-component";
constexpr uint32 kOwnCommand = 1234;

class MenuView : public BView {
public:
	MenuView(BRect frame, TComponent* component)
		: BView(frame, "TMenu", B_FOLLOW_NONE, B_WILL_DRAW),
		  fComponent(component)
	{
	}

	void MouseDown(BPoint where) override { fComponent->DesignerMouseDown(where, Bounds(), this); }

private:
	TComponent* fComponent;
};

/// Adds items of its own to the context menu, and notes which commands it was offered.
class MenuComponent : public TViewComponent {
public:
	MenuComponent(TFormDesigner* designer, BRect frame)
		: TViewComponent(nullptr, designer)
	{
		SetComponentName("Menu");
		SetClassName("TMenu");
		InitPropertyList();
		InitEventList();
		SetDTView(new MenuView(frame, this));
	}

	void AddComponentContextMenuItems(BPopUpMenu* menu) override
	{
		menu->AddItem(new BMenuItem("Duplicate", new BMessage(7)));
		menu->AddItem(new BMenuItem("Own", new BMessage(kOwnCommand)));
	}

	bool HandleComponentContextMessage(BMessage* message) override
	{
		sOffered.push_back(message->what);
		return true;
	}

	static std::vector<uint32> sOffered;
};

std::vector<uint32> MenuComponent::sOffered;

class MenuEntry : public TPaletteEntry {
public:
	MenuEntry()
		: TPaletteEntry(0, "Menu", "TMenu")
	{
	}

	TComponent* CreateComponent(BView* parent, TFormDesigner* designer, BRect frame) override
	{
		MenuComponent* component = new MenuComponent(designer, frame);
		parent->AddChild(component->DTView());
		return component;
	}
};

} // namespace

class DesignCommandsTest : public SurfaceTest {
protected:
	DesignCommandsTest()
	{
		static MenuEntry sEntry;
		if (PaletteCatalog().FindPalEntry("TMenu") == nullptr)
			PaletteCatalog().AddPalEntry(&sEntry);
		MenuComponent::sOffered.clear();
		ClearClipboard();
	}

	static void ClearClipboard()
	{
		be_clipboard->Lock();
		be_clipboard->Clear();
		be_clipboard->Commit();
		be_clipboard->Unlock();
	}

	static void PutOnClipboard(const void* data, size_t size)
	{
		be_clipboard->Lock();
		be_clipboard->Clear();
		be_clipboard->Data()->AddData(kComponentType, B_MIME_TYPE, data, size);
		be_clipboard->Commit();
		be_clipboard->Unlock();
	}

	/// The record on the clipboard; one without a code when there is none.
	static BMessage ClipboardRecord()
	{
		BMessage record;
		be_clipboard->Lock();
		const void* data;
		ssize_t size;
		if (be_clipboard->Data()->FindData(kComponentType, B_MIME_TYPE, &data, &size) == B_OK) {
			BMemoryIO stream(data, size);
			record.Unflatten(&stream);
		}
		be_clipboard->Unlock();
		return record;
	}

	/// A command that no menu has.
	void Send(uint32 command)
	{
		BMessage message(command);
		BMessenger(Form()->View()).SendMessage(&message);
		fRobot.Settle();
	}

	void SetText(TComponent* component, const char* property, const char* value)
	{
		Locked([&] { component->SetPropertyValue(property, value); });
	}

	bool HasPasteEnabled()
	{
		bool isEnabled = false;
		BPopUpMenu* menu = nullptr;
		fRobot.Click(BPoint(280, 280), 1, B_SECONDARY_MOUSE_BUTTON);
		Robot robot;
		if (robot.WaitForWindow("pmFormDesign")) {
			BLooper* looper;
			robot.Window().Target(&looper);
			BAutolock lock(looper);
			menu =
				dynamic_cast<BPopUpMenu*>(static_cast<BWindow*>(looper)->FindView("pmFormDesign"));
			isEnabled = menu != nullptr && menu->FindItem("Paste")->IsEnabled();
		}
		EXPECT_NE(menu, nullptr);
		fRobot.Key("escape");
		EXPECT_TRUE(robot.WaitForNoWindow("pmFormDesign"));
		return isEnabled;
	}
};


// #pragma mark - The menu of a component


TEST_F(DesignCommandsTest, TheSecondaryButtonSelectsAndOpensTheMenu)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	fRobot.Click(BPoint(200, 200));
	fRobot.Click(BPoint(60, 45), 1, B_SECONDARY_MOUSE_BUTTON);
	BPoint middle;
	for (const char* label : {"Properties", "Delete", "Cut", "Copy"})
		EXPECT_TRUE(fRobot.FindItem(label, &middle)) << label;
	fRobot.Key("escape");
	ASSERT_TRUE(fRobot.WaitForNoWindow("pmComponentDesign"));
	EXPECT_TRUE(IsSelected(button));
	EXPECT_EQ(Shown(), button);
	EXPECT_EQ(Names(), "Button1");
}


TEST_F(DesignCommandsTest, PropertiesActivatesThePropertyWindow)
{
	Draw("TButton", BRect(20, 30, 120, 60));
	ASSERT_TRUE(ChooseFromMenu(BPoint(60, 45), "Properties"));
	EXPECT_TRUE(Inspector()->IsActive());
	WorkOn(Form());
	EXPECT_FALSE(Inspector()->IsActive());
	ASSERT_TRUE(ChooseFromMenu(BPoint(200, 200), "Properties"));
	EXPECT_TRUE(Inspector()->IsActive());
}


TEST_F(DesignCommandsTest, DeleteRemovesTheComponent)
{
	Draw("TButton", BRect(20, 30, 120, 60));
	TComponent* other = Draw("TButton", BRect(20, 100, 120, 130));
	SetModified(false);
	ASSERT_TRUE(ChooseFromMenu(BPoint(60, 45), "Delete"));
	EXPECT_EQ(Names(), "Button2");
	EXPECT_EQ(Shown(), Form());
	EXPECT_TRUE(IsModified());
	Locked([&] {
		EXPECT_EQ(Form()->View()->ChildAt(0), other->DTView());
		EXPECT_EQ(Form()->View()->ChildAt(1), nullptr);
	});
}


TEST_F(DesignCommandsTest, ADeletedBoxLeavesItsButtonsOnTheForm)
{
	Draw("TBox", BRect(50, 40, 250, 240));
	TComponent* first = Draw("TButton", BRect(70, 60, 130, 90));
	TComponent* second = Draw("TButton", BRect(70, 120, 130, 150));
	ASSERT_TRUE(ChooseFromMenu(BPoint(200, 200), "Delete"));
	EXPECT_EQ(Names(), "Button1 Button2");
	for (TComponent* button : {first, second}) {
		EXPECT_EQ(Parent(button), "");
		EXPECT_EQ(ToldFrame(button), Frame(button));
		Locked([&] { EXPECT_EQ(button->DTView()->Parent(), Form()->View()); });
	}
	EXPECT_EQ(Frame(first), BRect(20, 20, 80, 50));
	EXPECT_EQ(Frame(second), BRect(20, 80, 80, 110));
}


TEST_F(DesignCommandsTest, ADeletedInnerBoxLeavesItsButtonInTheOuterOne)
{
	TComponent* outer = Draw("TBox", BRect(10, 10, 290, 290));
	Draw("TBox", BRect(50, 50, 250, 250));
	TComponent* button = Draw("TButton", BRect(70, 70, 130, 100));
	ASSERT_TRUE(ChooseFromMenu(BPoint(200, 200), "Delete"));
	EXPECT_EQ(Names(), "Box1 Button1");
	EXPECT_EQ(Children(outer), "Button1");
	EXPECT_EQ(Parent(button), "Box1");
	EXPECT_EQ(Frame(button), BRect(20, 20, 80, 50));

	ASSERT_TRUE(ChooseFromMenu(BPoint(250, 280), "Delete"));
	EXPECT_EQ(Names(), "Button1");
	EXPECT_EQ(Parent(button), "");
}


TEST_F(DesignCommandsTest, AComponentAnswersItsOwnItems)
{
	ASSERT_NE(Draw("TMenu", BRect(20, 30, 120, 60)), nullptr);
	ASSERT_TRUE(ChooseFromMenu(BPoint(60, 45), "Own"));
	EXPECT_EQ(MenuComponent::sOffered, std::vector<uint32>{kOwnCommand});
	// "Properties" is finished before the component is asked.
	ASSERT_TRUE(ChooseFromMenu(BPoint(60, 45), "Properties"));
	EXPECT_EQ(MenuComponent::sOffered.size(), 1u);
	WorkOn(Form());
	ASSERT_TRUE(ChooseFromMenu(BPoint(60, 45), "Copy"));
	EXPECT_EQ(MenuComponent::sOffered, (std::vector<uint32>{kOwnCommand, 5}));
	// What it cut is gone, and is not asked.
	ASSERT_TRUE(ChooseFromMenu(BPoint(60, 45), "Cut"));
	EXPECT_EQ(MenuComponent::sOffered.size(), 2u);
	EXPECT_EQ(Names(), "");
}


TEST_F(DesignCommandsTest, DuplicateCopiesAndPastes)
{
	ASSERT_NE(Draw("TMenu", BRect(20, 30, 120, 60)), nullptr);
	ASSERT_TRUE(ChooseFromMenu(BPoint(60, 45), "Duplicate"));
	EXPECT_EQ(Names(), "Menu1 Menu11");
	EXPECT_EQ(ClipboardRecord().what, uint32('comp'));
	EXPECT_EQ(MenuComponent::sOffered, std::vector<uint32>{7});
}


TEST_F(DesignCommandsTest, ACommandWithoutAShownComponentDoesNothing)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	{
		BAutolock lock(Inspector());
		Inspector()->SetComponent(nullptr);
	}
	for (uint32 command : {3, 4, 5, 7}) {
		WindowGuard guard(Form());
		BMessage message(command);
		EXPECT_EQ(Form()->HandleComponentContextMessage(&message), command == 3) << command;
	}
	EXPECT_EQ(Find("Button1"), button);
	EXPECT_EQ(ClipboardRecord().what, 0u);
}


// #pragma mark - The clipboard


TEST_F(DesignCommandsTest, CopyPutsARecordOnTheClipboard)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	SetText(button, "Label", "Press");
	Locked([&] { button->SetEventSelection("OnClick", true); });
	ASSERT_TRUE(ChooseFromMenu(BPoint(60, 45), "Copy"));

	const BMessage record = ClipboardRecord();
	EXPECT_EQ(record.what, uint32('comp'));
	EXPECT_EQ(record.CountNames(B_ANY_TYPE), 4);
	EXPECT_STREQ(record.GetString("_ClassName", ""), "TButton");
	BRect frame;
	EXPECT_EQ(record.FindRect("_Frame", &frame), B_OK);
	EXPECT_EQ(frame, BRect(20, 30, 120, 60));
	BMessage properties;
	BMessage events;
	ASSERT_EQ(record.FindMessage("Properties", &properties), B_OK);
	ASSERT_EQ(record.FindMessage("Events", &events), B_OK);
	EXPECT_EQ(properties.what, uint32('prop'));
	EXPECT_EQ(events.what, uint32('evts'));
	EXPECT_STREQ(properties.GetString("Label", ""), "Press");
	EXPECT_STREQ(properties.GetString("Name", ""), "Button1");
	EXPECT_TRUE(events.GetBool("OnClick", false));
	EXPECT_FALSE(events.GetBool("OnDraw", true));
	Locked([&] {
		EXPECT_EQ(properties.CountNames(B_ANY_TYPE), button->CountProperties());
		EXPECT_EQ(events.CountNames(B_ANY_TYPE), button->CountEvents());
	});
}


TEST_F(DesignCommandsTest, PasteOnAnotherFormAddsAtThePointer)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	SetText(button, "Label", "Press");
	Locked([&] { button->SetEventSelection("OnClick", true); });
	ASSERT_TRUE(ChooseFromMenu(BPoint(60, 45), "Copy"));

	WorkOn(NewForm());
	SetModified(false);
	fRobot.MoveTo(BPoint(77, 88));
	ASSERT_TRUE(fRobot.Key("command+v"));
	fRobot.Settle();
	ASSERT_EQ(Names(), "Button11");
	TComponent* pasted = Find("Button11");
	EXPECT_EQ(Frame(pasted), BRect(77, 88, 177, 118));
	// The properties tell the frame that was copied.
	EXPECT_EQ(ToldFrame(pasted), BRect(20, 30, 120, 60));
	EXPECT_EQ(Value(pasted, "Label"), "Press");
	EXPECT_EQ(Value(pasted, "Name"), "Button11");
	Locked([&] {
		EXPECT_TRUE(pasted->EventSelection("OnClick"));
		EXPECT_FALSE(pasted->EventSelection("OnDraw"));
		EXPECT_EQ(pasted->Designer(), Form()->View());
	});
	EXPECT_TRUE(IsModified());

	ASSERT_TRUE(fRobot.Key("command+v"));
	fRobot.Settle();
	EXPECT_EQ(Names(), "Button11 Button12");
}


TEST_F(DesignCommandsTest, CutComesBackUnderANewName)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	SetText(button, "Label", "Press");
	ASSERT_TRUE(ChooseFromMenu(BPoint(60, 45), "Cut"));
	EXPECT_EQ(Names(), "");
	EXPECT_EQ(Shown(), Form());
	ASSERT_TRUE(ChooseFromMenu(BPoint(200, 200), "Paste"));
	EXPECT_EQ(Names(), "Button11");
	EXPECT_EQ(Value(Find("Button11"), "Label"), "Press");
}


TEST_F(DesignCommandsTest, PasteIsOfferedWhileThereIsARecord)
{
	EXPECT_FALSE(HasPasteEnabled());
	Draw("TButton", BRect(20, 30, 120, 60));
	ASSERT_TRUE(ChooseFromMenu(BPoint(60, 45), "Copy"));
	EXPECT_TRUE(HasPasteEnabled());
}


TEST_F(DesignCommandsTest, ADamagedRecordPastesNothing)
{
	Draw("TButton", BRect(20, 30, 120, 60));
	ASSERT_TRUE(ChooseFromMenu(BPoint(60, 45), "Copy"));
	const BMessage whole = ClipboardRecord();
	SetModified(false);
	const auto paste = [&](const BMessage& record) {
		BMallocIO buffer;
		record.Flatten(&buffer);
		PutOnClipboard(buffer.Buffer(), buffer.BufferLength());
		fRobot.Key("command+v");
		fRobot.Settle();
	};
	for (const char* field : {"_ClassName", "_Frame", "Properties", "Events"}) {
		BMessage record(whole);
		record.RemoveName(field);
		paste(record);
		EXPECT_EQ(Names(), "Button1") << field;
	}
	BMessage record(whole);
	record.ReplaceString("_ClassName", "TNobodys");
	paste(record);
	EXPECT_EQ(Names(), "Button1");
	record = whole;
	record.ReplaceRect("_Frame", BRect(10, 10, std::nanf(""), 30));
	paste(record);
	EXPECT_EQ(Names(), "Button1");

	BMallocIO buffer;
	whole.Flatten(&buffer);
	for (size_t size :
		{size_t(1), size_t(40), buffer.BufferLength() / 2, buffer.BufferLength() - 1}) {
		PutOnClipboard(buffer.Buffer(), size);
		fRobot.Key("command+v");
		fRobot.Settle();
		EXPECT_EQ(Names(), "Button1") << size;
	}
	EXPECT_FALSE(IsModified());

	paste(whole);
	EXPECT_EQ(Names(), "Button1 Button11");
}


// #pragma mark - The commands of the form


TEST_F(DesignCommandsTest, TheFormsMenuHasItsItems)
{
	fRobot.Click(BPoint(200, 200), 1, B_SECONDARY_MOUSE_BUTTON);
	BPoint middle;
	for (const char* label :
		{"Paste", "Save to file", "Lock components", "Delete all components", "Properties"})
		EXPECT_TRUE(fRobot.FindItem(label, &middle)) << label;
	fRobot.Key("escape");
	EXPECT_TRUE(fRobot.WaitForNoWindow("pmFormDesign"));
}


TEST_F(DesignCommandsTest, DeleteAllAsksFirst)
{
	Draw("TBox", BRect(50, 40, 250, 240));
	Draw("TButton", BRect(70, 60, 130, 90));
	Answer(1);
	ASSERT_TRUE(ChooseFromMenu(BPoint(280, 280), "Delete all components"));
	EXPECT_EQ(Names(), "Box1 Button1");
	ASSERT_EQ(Boxes().size(), 1u);
	EXPECT_EQ(Boxes()[0],
		"Are you sure you want to delete all components?|"
		"Are you sure you want to delete all components?");

	Answer(0);
	SetModified(false);
	ASSERT_TRUE(ChooseFromMenu(BPoint(280, 280), "Delete all components"));
	EXPECT_EQ(Names(), "");
	EXPECT_EQ(Shown(), Form());
	EXPECT_TRUE(IsModified());
	Locked([&] { EXPECT_EQ(Form()->View()->CountChildren(), 0); });
}


TEST_F(DesignCommandsTest, LockComponentsChangesNothing)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	ASSERT_TRUE(ChooseFromMenu(BPoint(200, 200), "Lock components"));
	fRobot.Key("command+l");
	fRobot.Drag(BPoint(33, 41), BPoint(163, 241));
	EXPECT_EQ(Frame(button), BRect(150, 230, 250, 260));
}


TEST_F(DesignCommandsTest, CommandRActivatesThePropertyWindow)
{
	fRobot.Key("command+r");
	fRobot.Settle();
	EXPECT_TRUE(Inspector()->IsActive());
}


TEST_F(DesignCommandsTest, SaveToFileAsksForANameOnce)
{
	TComponent* button = Draw("TButton", BRect(20, 30, 120, 60));
	std::filesystem::current_path(fFolder.Path());
	ASSERT_TRUE(fRobot.Key("command+s"));
	Robot panel;
	ASSERT_TRUE(panel.WaitForWindow("designer_surface_test: Save"));
	EXPECT_EQ(panel.Text("text view"), "Form1.frm");
	EXPECT_TRUE(IsModified());
	panel.Key("command+l");
	panel.Key("command+a");
	panel.Type(fFolder.Path().c_str());
	panel.Key("enter");
	ASSERT_TRUE(panel.WaitForText("path", fFolder.Path().c_str()));
	panel.ClickView("text view");
	panel.Key("command+a");
	panel.Type("mine.frm");
	panel.Key("enter");
	ASSERT_TRUE(panel.WaitForNoWindow("designer_surface_test: Save"));
	fRobot.Settle();
	EXPECT_TRUE(std::filesystem::exists(fFolder / "mine.frm"));
	EXPECT_FALSE(IsModified());
	Locked([&] { EXPECT_STREQ(Form()->Filename(), (fFolder / "mine.frm").c_str()); });

	SetText(button, "Label", "Other");
	EXPECT_TRUE(IsModified());
	ASSERT_TRUE(ChooseFromMenu(BPoint(200, 200), "Save to file"));
	EXPECT_FALSE(IsModified());
	EXPECT_TRUE(Boxes().empty());
}


TEST_F(DesignCommandsTest, AFormThatCannotBeSavedStaysAsItWas)
{
	Draw("TButton", BRect(20, 30, 120, 60));
	BMessage chosen(14);
	entry_ref folder;
	ASSERT_EQ(get_ref_for_path(fFolder.Path().c_str(), &folder), B_OK);
	chosen.AddRef("directory", &folder);
	chosen.AddString("name", "no/such/folder/form.frm");
	BMessenger(Form()).SendMessage(&chosen);
	fRobot.Settle();
	EXPECT_EQ(Boxes(), std::vector<std::string>{"Warning|Unable to save the form."});
	EXPECT_TRUE(IsModified());
	Locked([&] { EXPECT_STREQ(Form()->Filename(), ""); });

	Locked([&] { Form()->SetFilename((fFolder / "no/form.frm").c_str()); });
	ASSERT_TRUE(ChooseFromMenu(BPoint(200, 200), "Save to file"));
	EXPECT_EQ(Boxes().size(), 2u);
	EXPECT_TRUE(IsModified());
}


TEST_F(DesignCommandsTest, TheTestFormIsLoadedFromTheCurrentFolder)
{
	Draw("TButton", BRect(20, 30, 120, 60));
	std::filesystem::current_path(fFolder.Path());
	Send(9);
	EXPECT_EQ(Boxes(), std::vector<std::string>{"Warning|Unable to load the file."});
	EXPECT_EQ(Names(), "Button1");

	Locked([&] { ASSERT_TRUE(Form()->SaveToFile((fFolder / "doke.frm").c_str())); });
	ASSERT_TRUE(ChooseFromMenu(BPoint(60, 45), "Delete"));
	Send(9);
	EXPECT_EQ(Names(), "Button1");
	EXPECT_EQ(Boxes().size(), 1u);
}


TEST_F(DesignCommandsTest, LayingOutAfreshBringsAllToTheMiddle)
{
	TComponent* box = Draw("TBox", BRect(50, 40, 250, 240));
	TComponent* button = Draw("TButton", BRect(70, 60, 130, 90));
	Send(10);
	for (TComponent* component : {box, button}) {
		EXPECT_EQ(Frame(component), BRect(150, 150, 200, 200));
		EXPECT_EQ(ToldFrame(component), Frame(component));
		EXPECT_EQ(Parent(component), "");
	}
	EXPECT_EQ(Children(box), "");
	Locked([&] { EXPECT_EQ(button->Owner(), static_cast<TFormDesigner*>(Form()->View())); });
}
