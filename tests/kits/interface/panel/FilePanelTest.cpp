// SPDX-License-Identifier: MIT
// Tests of what all file panels do: showing and hiding, folders, what changes in them, and who may call them.

#include <sys/stat.h>

#include <Directory.h>

#include "PanelFixture.h"
#include "app/LockChecker.h"
#include "interface/panel/PanelMemory.h"

TEST_F(FilePanelTest, APanelIsHiddenUntilItIsShown)
{
	Make(B_OPEN_PANEL);
	EXPECT_FALSE(fPanel->IsShowing());
	EXPECT_EQ(fPanel->PanelMode(), B_OPEN_PANEL);
	EXPECT_TRUE(fPanel->HidesWhenDone());
	EXPECT_EQ(fPanel->RefFilter(), nullptr);
	EXPECT_TRUE(fPanel->Messenger() == BMessenger(fTarget));
	fPanel->Hide();
	Show();
	EXPECT_TRUE(fPanel->IsShowing());
	EXPECT_EQ(fPanel->hidden, 0);
	EXPECT_EQ(fTarget->Count(), 0u);
}


TEST_F(FilePanelTest, TheTitleNamesTheProgram)
{
	BFilePanel open;
	BFilePanel save(B_SAVE_PANEL);
	ASSERT_TRUE(open.Window()->Lock());
	EXPECT_TRUE(std::string(open.Window()->Title()).ends_with(": Open")) << open.Window()->Title();
	open.Window()->Unlock();
	ASSERT_TRUE(save.Window()->Lock());
	EXPECT_TRUE(std::string(save.Window()->Title()).ends_with(": Save")) << save.Window()->Title();
	save.Window()->Unlock();
	EXPECT_TRUE(open.Messenger() == be_app_messenger);
}


TEST_F(FilePanelTest, ModalPanelsHoldTheProgram)
{
	BFilePanel panel(B_OPEN_PANEL, nullptr, nullptr, 0, true, nullptr, nullptr, true);
	ASSERT_TRUE(panel.Window()->Lock());
	EXPECT_EQ(panel.Window()->Feel(), B_MODAL_APP_WINDOW_FEEL);
	panel.Window()->Unlock();
}


TEST_F(FilePanelTest, CancelIsToldWhicheverWayItIsCancelled)
{
	for (const char* way : {"button", "escape", "close", "w", "hide"}) {
		Make(B_OPEN_PANEL);
		Show();
		if (std::string(way) == "button")
			fRobot.ClickView("cancel button");
		else if (std::string(way) == "escape")
			fRobot.Key("escape");
		else if (std::string(way) == "close")
			fPanel->Window()->PostMessage(B_QUIT_REQUESTED);
		else if (std::string(way) == "w")
			fRobot.Key("command+w");
		else
			fPanel->Hide();
		const BMessage cancel = fTarget->Next();
		EXPECT_EQ(cancel.what, uint32(B_CANCEL)) << way;
		EXPECT_EQ(cancel.GetInt32("old_what", 0), int32(B_REFS_RECEIVED)) << way;
		void* source;
		ASSERT_EQ(cancel.FindPointer("source", &source), B_OK) << way;
		EXPECT_EQ(source, static_cast<BFilePanel*>(fPanel.get())) << way;
		ASSERT_TRUE(fRobot.WaitForNoWindow("panel"));
		EXPECT_FALSE(fPanel->IsShowing()) << way;
		EXPECT_EQ(fPanel->hidden, 1) << way;
		EXPECT_EQ(fPanel->sent, 0) << way;
		EXPECT_EQ(fTarget->Count(), 0u) << way;
	}
}


TEST_F(FilePanelTest, APanelThatStaysIsShownAfterAChoice)
{
	fFolder.Write("file");
	Make(B_OPEN_PANEL);
	fPanel->SetHideWhenDone(false);
	EXPECT_FALSE(fPanel->HidesWhenDone());
	Show();
	fRobot.Key("down");
	fRobot.Key("enter");
	EXPECT_EQ(fTarget->Next().what, uint32(B_REFS_RECEIVED));
	fRobot.Key("enter");
	EXPECT_EQ(fTarget->Next().what, uint32(B_REFS_RECEIVED));
	EXPECT_TRUE(fPanel->IsShowing());
	EXPECT_EQ(fPanel->hidden, 0);
}


TEST_F(FilePanelTest, TheFolderIsKeptBetweenShowings)
{
	fFolder.Make("sub");
	fFolder.Write("sub/inner");
	Open();
	fRobot.Key("down");
	fRobot.Key("enter");
	ASSERT_TRUE(WaitForRows({"inner"}));
	fRobot.Key("escape");
	ASSERT_TRUE(fRobot.WaitForNoWindow("panel"));
	fFolder.Write("sub/new");
	Show();
	EXPECT_TRUE(WaitForRows({"inner", "new"}));
	EXPECT_EQ(ShownFolder(), fFolder / "sub");
}


TEST_F(FilePanelTest, AFolderOfAChoiceIsRememberedForTheNextRun)
{
	fFolder.Write("file");
	Open();
	fRobot.Key("down");
	fRobot.Key("enter");
	EXPECT_EQ(fTarget->Next().what, uint32(B_REFS_RECEIVED));
	BPrivate::PanelMemory memory("application/x-vnd.plimworks-panel-test");
	ASSERT_EQ(memory.Load(), B_OK);
	EXPECT_EQ(memory.Folders(), List{fFolder.Path()});
}


TEST_F(FilePanelTest, TheFolderCanBeSetInEveryWay)
{
	Make(B_OPEN_PANEL);
	EXPECT_EQ(ShownFolder(), fFolder.Path());
	const std::string one = fFolder.Make("one");
	const std::string two = fFolder.Make("two");
	const BEntry entry(one.c_str());
	fPanel->SetPanelDirectory(&entry);
	EXPECT_EQ(ShownFolder(), one);
	const BDirectory directory(two.c_str());
	fPanel->SetPanelDirectory(&directory);
	EXPECT_EQ(ShownFolder(), two);
	entry_ref ref;
	ASSERT_EQ(get_ref_for_path(one.c_str(), &ref), B_OK);
	fPanel->SetPanelDirectory(&ref);
	EXPECT_EQ(ShownFolder(), one);
	fPanel->SetPanelDirectory(two.c_str());
	EXPECT_EQ(ShownFolder(), two);
	fFolder.Link("one", "link");
	fPanel->SetPanelDirectory((fFolder / "link").c_str());
	EXPECT_EQ(ShownFolder(), one);
	Show();
	fFolder.Write("two/file");
	fPanel->SetPanelDirectory(two.c_str());
	EXPECT_TRUE(WaitForRows({"file"}));
}


TEST_F(FilePanelTest, WhatIsNoFolderChangesNothing)
{
	fFolder.Write("file");
	Open();
	fPanel->SetPanelDirectory(static_cast<const char*>(nullptr));
	fPanel->SetPanelDirectory(static_cast<const entry_ref*>(nullptr));
	fPanel->SetPanelDirectory(static_cast<const BEntry*>(nullptr));
	fPanel->SetPanelDirectory(static_cast<const BDirectory*>(nullptr));
	const BEntry unset;
	fPanel->SetPanelDirectory(&unset);
	const BDirectory none("/no/such/folder");
	fPanel->SetPanelDirectory(&none);
	fPanel->GetPanelDirectory(nullptr);
	EXPECT_EQ(ShownFolder(), fFolder.Path());
	fPanel->SetPanelDirectory((fFolder / "file").c_str());
	EXPECT_TRUE(fRobot.WaitForText("status",
		("The folder \"" + fFolder / "file" + "\" cannot be opened. It is no folder.").c_str()));
	EXPECT_EQ(ShownFolder(), fFolder.Path());
	EXPECT_EQ(Rows(), List{"file"});
}


TEST_F(FilePanelTest, AFolderThatDoesNotExistGivesTheUsualOne)
{
	const entry_ref ref;
	BFilePanel panel(B_OPEN_PANEL, nullptr, &ref);
	entry_ref shown;
	panel.GetPanelDirectory(&shown);
	EXPECT_EQ(std::string(BPath(&shown).Path()), std::filesystem::current_path());
}


TEST_F(FilePanelTest, AFolderThatCannotBeReadIsNotEntered)
{
	ASSERT_EQ(chmod(fFolder.Path().c_str(), 0755), 0);
	const std::string path = fFolder.Make("closed");
	Open();
	ASSERT_EQ(chmod(path.c_str(), 0), 0);
	fRobot.Key("down");
	{
		OrdinaryUser user;
		fRobot.Key("enter");
		EXPECT_EQ(TakeNotice(), "The folder \"" + path + "\" cannot be opened. Permission denied.");
	}
	chmod(path.c_str(), 0755);
	EXPECT_EQ(ShownFolder(), fFolder.Path());
	EXPECT_EQ(Rows(), List{"closed"});
}


TEST_F(FilePanelTest, NewAndRemovedFilesShowByThemselves)
{
	fFolder.Write("b");
	fFolder.Write("d");
	Open();
	fRobot.Key("end");
	EXPECT_EQ(Selected(), List{"d"});
	fFolder.Write("a");
	fFolder.Write("c");
	EXPECT_TRUE(WaitForRows({"a", "b", "c", "d"}));
	EXPECT_EQ(Selected(), List{"d"});
	std::filesystem::remove(fFolder / "b");
	EXPECT_TRUE(WaitForRows({"a", "c", "d"}));
	const int32 before = fPanel->selections;
	std::filesystem::remove(fFolder / "d");
	EXPECT_TRUE(WaitForRows({"a", "c"}));
	EXPECT_EQ(Selected(), List{});
	EXPECT_GT(fPanel->selections, before);
	EXPECT_FALSE(CanChoose());
}


TEST_F(FilePanelTest, ARenamedFileShowsByItself)
{
	fFolder.Write("old");
	Open();
	std::filesystem::rename(fFolder / "old", fFolder / "new");
	EXPECT_TRUE(WaitForRows({"new"}));
}


TEST_F(FilePanelTest, AFolderThatVanishesGivesWayToTheOneAbove)
{
	const std::string path = fFolder.Make("sub/inner");
	fFolder.Write("sub/inner/file");
	Open();
	fPanel->SetPanelDirectory(path.c_str());
	ASSERT_TRUE(WaitForRows({"file"}));
	std::filesystem::remove_all(fFolder / "sub");
	EXPECT_TRUE(WaitUntil([&] { return ShownFolder() == fFolder.Path(); }));
	EXPECT_TRUE(fRobot.WaitForText("status", "The folder \"inner\" is gone."));
	EXPECT_EQ(fRobot.Text("path"), fFolder.Path());
}


TEST_F(FilePanelTest, AFolderThatVanishedWhileHiddenGivesWayToo)
{
	const std::string path = fFolder.Make("sub");
	Open();
	fPanel->SetPanelDirectory(path.c_str());
	fRobot.Settle();
	fPanel->Hide();
	ASSERT_TRUE(fRobot.WaitForNoWindow("panel"));
	std::filesystem::remove(path);
	Show();
	EXPECT_TRUE(WaitUntil([&] { return ShownFolder() == fFolder.Path(); }));
}


TEST_F(FilePanelTest, HiddenFilesAreShownOnDemand)
{
	fFolder.Write(".hidden");
	fFolder.Write("seen");
	Open();
	EXPECT_EQ(Rows(), List{"seen"});
	fRobot.ClickView("hidden files");
	EXPECT_TRUE(WaitForRows({".hidden", "seen"}));
	fRobot.Key("command+h");
	EXPECT_TRUE(WaitForRows({"seen"}));
	EXPECT_EQ(fRobot.Value("hidden files"), 0);
}


TEST_F(FilePanelTest, AClickOnAColumnOrdersByIt)
{
	fFolder.Write("a", "12345");
	fFolder.Write("b", "1");
	Open();
	BRect header;
	Do([&] { header = fPanel->Window()->FindView("columns")->Frame(); });
	fRobot.Click(BPoint(header.left + 20, header.top + 8));
	EXPECT_EQ(Rows(), (List{"b", "a"}));
	fRobot.Click(BPoint(header.right - 170, header.top + 8));
	EXPECT_EQ(Rows(), (List{"b", "a"}));
	fRobot.Click(BPoint(header.right - 170, header.top + 8));
	EXPECT_EQ(Rows(), (List{"a", "b"}));
}


TEST_F(FilePanelTest, TypingBeginsAnewInAnotherFolder)
{
	fFolder.Make("sub");
	fFolder.Write("sub/one");
	fFolder.Write("sub/two");
	Open();
	fRobot.Type("su");
	EXPECT_EQ(Selected(), List{"sub"});
	fRobot.Key("enter");
	EXPECT_TRUE(WaitForRows({"one", "two"}));
	// However soon it comes.
	fRobot.Type("tw");
	EXPECT_EQ(Selected(), List{"two"});
}


TEST_F(FilePanelTest, APathCanBeTyped)
{
	fFolder.Make("sub");
	fFolder.Write("sub/one");
	fFolder.Write("sub/two");
	Open();
	fRobot.Key("command+l");
	fRobot.Key("command+a");
	fRobot.Type((fFolder / "sub").c_str());
	fRobot.Key("enter");
	EXPECT_TRUE(WaitForRows({"one", "two"}));
	EXPECT_EQ(ShownFolder(), fFolder / "sub");
	// That of a file leads to it.
	fRobot.Key("command+l");
	fRobot.Type((fFolder / "sub/two").c_str());
	fRobot.Key("enter");
	EXPECT_TRUE(WaitUntil([&] { return Selected() == List{"two"}; }));
	EXPECT_EQ(fTarget->Count(), 0u);
}


TEST_F(FilePanelTest, ATypedPathIsCompleted)
{
	fFolder.Make("a long name");
	Open();
	fRobot.Type("/");
	EXPECT_EQ(fRobot.Text("path"), "/");
	fRobot.Type((fFolder / "a l").substr(1).c_str());
	EXPECT_EQ(fRobot.Text("path"), fFolder / "a long name/");
	fRobot.Key("enter");
	EXPECT_TRUE(WaitUntil([&] { return ShownFolder() == fFolder / "a long name"; }));
}


TEST_F(FilePanelTest, KeysThatWaitGoWhereTheKeysBeforeThemLead)
{
	fFolder.Make("other");
	fFolder.Write("other/banana");
	fFolder.Write("other/cherry");
	Open();
	// The first slash leads to the path's field.
	TypeInOneGo(fFolder / "other/x");
	EXPECT_EQ(fRobot.Text("path"), fFolder / "other/x");
	// Enter leads to the list again, Backspace there to the folder above.
	TypeInOneGo("\b\nch");
	EXPECT_TRUE(WaitForRows({"banana", "cherry"}));
	EXPECT_TRUE(WaitUntil([&] { return Selected() == List{"cherry"}; }));
	TypeInOneGo("\bot\nba");
	EXPECT_TRUE(WaitForRows({"banana", "cherry"}));
	EXPECT_TRUE(WaitUntil([&] { return Selected() == List{"banana"}; }));
	TypeInOneGo("\b~/x");
	EXPECT_EQ(fRobot.Text("path"), "~/x");
	EXPECT_EQ(ShownFolder(), fFolder.Path());
}


TEST_F(FilePanelTest, ATypedPathThatLeadsNowhereIsExplained)
{
	Open();
	fRobot.Key("command+l");
	fRobot.Type("no/such");
	fRobot.Key("enter");
	EXPECT_EQ(TakeNotice(), "\"no/such\" cannot be opened. It does not exist.");
	EXPECT_EQ(fRobot.Text("path"), "no/such");
	EXPECT_EQ(ShownFolder(), fFolder.Path());
}


TEST_F(FilePanelTest, EscapeTakesBackATypedPathBeforeItCancels)
{
	Open();
	fRobot.Key("command+l");
	fRobot.Type("/no/such");
	fRobot.Key("escape");
	EXPECT_EQ(fRobot.Text("path"), fFolder.Path());
	EXPECT_TRUE(fPanel->IsShowing());
	fRobot.Key("escape");
	EXPECT_EQ(fTarget->Next().what, uint32(B_CANCEL));
}


TEST_F(FilePanelTest, AFolderIsMadeAndSelected)
{
	fFolder.Make("New folder");
	Open();
	fRobot.ClickView("new folder");
	ASSERT_TRUE(fRobot.WaitForWindow("New folder"));
	EXPECT_EQ(fRobot.Text("name"), "New folder 2");
	fRobot.Type("mine");
	fRobot.Key("enter");
	ASSERT_TRUE(fRobot.WaitForNoWindow("New folder"));
	ASSERT_TRUE(fRobot.WaitForWindow("panel"));
	EXPECT_TRUE(WaitForRows({"mine", "New folder"}));
	EXPECT_TRUE(WaitUntil([&] { return Selected() == List{"mine"}; }));
	EXPECT_TRUE(std::filesystem::is_directory(fFolder / "mine"));
}


TEST_F(FilePanelTest, AFolderThatCannotBeMadeKeepsItsTypedName)
{
	fFolder.Write("taken", "content");
	Open();
	fRobot.Key("command+n");
	ASSERT_TRUE(fRobot.WaitForWindow("New folder"));
	for (const char* name : {"taken", "a/b"}) {
		fRobot.Key("command+a");
		fRobot.Type(name);
		fRobot.Key("enter");
		ASSERT_TRUE(fRobot.WaitForWindow("File panel"));
		EXPECT_EQ(fRobot.Text("_tv_"),
			std::string(name) == "taken" ? "The folder \"taken\" could not be made. Something with "
										   "this name is there already."
										 : "A name cannot contain a slash (\"/\").");
		fRobot.Key("escape");
		ASSERT_TRUE(fRobot.WaitForNoWindow("File panel"));
		ASSERT_TRUE(fRobot.WaitForWindow("New folder"));
		EXPECT_EQ(fRobot.Text("name"), name);
	}
	EXPECT_EQ(fFolder.Read("taken"), "content");
	// It goes with its panel.
	fPanel.reset();
	EXPECT_TRUE(fRobot.WaitForNoWindow("New folder"));
}


TEST_F(FilePanelTest, NoFolderIsMadeWhereNothingMayBeWritten)
{
	ASSERT_EQ(chmod(fFolder.Path().c_str(), 0755), 0);
	const std::string path = fFolder.Make("closed");
	ASSERT_EQ(chmod(path.c_str(), 0555), 0);
	Open();
	fPanel->SetPanelDirectory(path.c_str());
	fRobot.Settle();
	fRobot.Key("command+n");
	ASSERT_TRUE(fRobot.WaitForWindow("New folder"));
	{
		OrdinaryUser user;
		fRobot.Key("enter");
		ASSERT_TRUE(fRobot.WaitForWindow("File panel"));
	}
	chmod(path.c_str(), 0755);
	EXPECT_EQ(
		fRobot.Text("_tv_"), "The folder \"New folder\" could not be made. Permission denied.");
	EXPECT_TRUE(std::filesystem::is_empty(path));
}


TEST_F(FilePanelTest, ButtonsGetTheGivenLabels)
{
	Make(B_OPEN_PANEL);
	fPanel->SetButtonLabel(B_DEFAULT_BUTTON, "Add to the project");
	fPanel->SetButtonLabel(B_CANCEL_BUTTON, "Never mind");
	Show();
	EXPECT_TRUE(fRobot.WaitForText("default button", "Add to the project"));
	EXPECT_TRUE(fRobot.WaitForText("cancel button", "Never mind"));
	Do([&] {
		BView* cancel = fPanel->Window()->FindView("cancel button");
		BView* button = fPanel->Window()->FindView("default button");
		EXPECT_GE(button->Frame().Width(), button->StringWidth("Add to the project"));
		EXPECT_LT(cancel->Frame().right, button->Frame().left);
		EXPECT_LE(button->Frame().right, fPanel->Window()->Bounds().right);
	});
}


TEST_F(FilePanelTest, FilesThatAreDroppedAreGoneTo)
{
	fFolder.Make("sub");
	fFolder.Write("sub/file");
	Open();
	entry_ref ref;
	ASSERT_EQ(get_ref_for_path((fFolder / "sub/file").c_str(), &ref), B_OK);
	BMessage drop(B_SIMPLE_DATA);
	drop.AddRef("refs", &ref);
	fPanel->Window()->PostMessage(&drop);
	EXPECT_TRUE(WaitUntil([&] { return Selected() == List{"file"}; }));
	EXPECT_EQ(ShownFolder(), fFolder / "sub");
}


TEST_F(FilePanelTest, ItCanBeCalledWithAnotherWindowLocked)
{
	fFolder.Write("file");
	BWindow* other = new BWindow(BRect(0, 0, 50, 50), "other", B_TITLED_WINDOW, 0);
	other->Show();
	const int32 before = be_count_lock_violations();
	ASSERT_TRUE(other->Lock());
	BMessenger target(fTarget);
	HookedPanel* panel = new HookedPanel(B_SAVE_PANEL, &target);
	panel->SetPanelDirectory(fFolder.Path().c_str());
	panel->SetSaveText("name");
	panel->SetRefFilter(nullptr);
	panel->SetButtonLabel(B_DEFAULT_BUTTON, "Keep");
	panel->Show();
	EXPECT_TRUE(panel->IsShowing());
	panel->Refresh();
	panel->Rewind();
	entry_ref ref;
	panel->GetNextSelectedRef(&ref);
	panel->Hide();
	EXPECT_EQ(fTarget->Next().what, uint32(B_CANCEL));
	panel->Show();
	delete panel;
	other->Quit();
	EXPECT_EQ(be_count_lock_violations(), before);
}


TEST_F(FilePanelTest, AShownPanelThatIsDeletedCloses)
{
	Open();
	fPanel.reset();
	EXPECT_TRUE(fRobot.WaitForNoWindow("panel"));
	EXPECT_EQ(fTarget->Count(), 0u);
}


TEST_F(FilePanelTest, ItMayBeDeletedWhileItsMessageIsHandled)
{
	class Deleter : public BLooper {
	public:
		void MessageReceived(BMessage* message) override
		{
			if (message->what == B_SAVE_REQUESTED) {
				delete panel;
				panel = nullptr;
				done = true;
			}
		}
		BFilePanel* panel = nullptr;
		std::atomic<bool> done{false};
	};
	for (int i = 0; i < 10; i++) {
		Deleter* deleter = new Deleter;
		deleter->Run();
		BMessenger target(deleter);
		deleter->panel = new BFilePanel(B_SAVE_PANEL, &target);
		deleter->panel->SetPanelDirectory(fFolder.Path().c_str());
		deleter->panel->SetSaveText("name");
		ASSERT_TRUE(deleter->panel->Window()->Lock());
		deleter->panel->Window()->SetTitle("short");
		deleter->panel->Window()->Unlock();
		deleter->panel->Show();
		ASSERT_TRUE(fRobot.WaitForWindow("short"));
		fRobot.Key("enter");
		EXPECT_TRUE(WaitUntil([&] { return deleter->done.load(); }));
		EXPECT_TRUE(fRobot.WaitForNoWindow("short"));
		if (deleter->Lock())
			deleter->Quit();
	}
}


TEST_F(FilePanelTest, APanelOutlivesItsWindow)
{
	Open();
	ASSERT_TRUE(fPanel->Window()->Lock());
	fPanel->Window()->Quit();
	EXPECT_TRUE(fRobot.WaitForNoWindow("panel"));
	fPanel->Show();
	fPanel->SetSaveText("x");
	fPanel->Refresh();
	fPanel.reset();
}
