// SPDX-License-Identifier: MIT
// Tests of panels for saving: names, what exists already, and where nothing can be written.

#include <sys/stat.h>

#include "PanelFixture.h"

namespace {

class SavePanelTest : public FilePanelTest {
protected:
	/// Types \a name in place of what is in the field, and presses Enter.
	void SaveAs(const char* name)
	{
		fRobot.ClickView("text view");
		fRobot.Key("command+a");
		if (*name == '\0')
			fRobot.Key("backspace");
		fRobot.Type(name);
		fRobot.Key("enter");
	}

	std::string QuestionText()
	{
		return fRobot.WaitForWindow("File panel") ? fRobot.Text("_tv_") : "";
	}

	void ExpectSaved(const std::string& folder, const char* name)
	{
		const BMessage saved = fTarget->Next();
		EXPECT_EQ(saved.what, uint32(B_SAVE_REQUESTED));
		EXPECT_EQ(PathOf(saved, "directory"), folder);
		EXPECT_STREQ(saved.GetString("name", ""), name);
		const BMessage cancel = fTarget->Next();
		EXPECT_EQ(cancel.what, uint32(B_CANCEL));
		EXPECT_EQ(cancel.GetInt32("old_what", 0), int32(B_SAVE_REQUESTED));
	}
};

} // namespace


TEST_F(SavePanelTest, TheProposedNameIsSelectedAndSent)
{
	Save("Project1.plim");
	EXPECT_EQ(fRobot.Text("text view"), "Project1.plim");
	fRobot.Key("enter");
	ExpectSaved(fFolder.Path(), "Project1.plim");
	EXPECT_FALSE(fPanel->IsShowing());
	EXPECT_EQ(fPanel->sent, 1);
}


TEST_F(SavePanelTest, TypingReplacesTheProposedName)
{
	Save("Project1.plim");
	fRobot.Type("other");
	fRobot.Key("enter");
	ExpectSaved(fFolder.Path(), "other");
}


TEST_F(SavePanelTest, TheGivenMessageGetsFolderAndName)
{
	BMessage message(14);
	message.AddInt32("form", 3);
	Make(B_SAVE_PANEL, 0, false, &message);
	fPanel->SetSaveText("Form1.frm");
	Show();
	fRobot.ClickView("default button");
	const BMessage saved = fTarget->Next();
	EXPECT_EQ(saved.what, 14u);
	EXPECT_EQ(saved.GetInt32("form", 0), 3);
	EXPECT_EQ(PathOf(saved, "directory"), fFolder.Path());
	EXPECT_STREQ(saved.GetString("name", ""), "Form1.frm");
}


TEST_F(SavePanelTest, NamesThatNoFileCanHaveAreExplained)
{
	const struct {
		const char* name;
		const char* notice;
	} kCases[] = {
		{"", "Please type a name."},
		{"   ", "Please type a name."},
		{"a/b", "A name cannot contain a slash (\"/\")."},
		{"..", "\"..\" is no name for a file."},
	};
	Save("name");
	for (const auto& testCase : kCases) {
		SaveAs(testCase.name);
		EXPECT_EQ(TakeNotice(), testCase.notice);
		EXPECT_EQ(fRobot.Text("text view"), testCase.name);
		EXPECT_TRUE(fPanel->IsShowing());
	}
	EXPECT_EQ(fTarget->Count(), 0u);
	SaveAs("good");
	ExpectSaved(fFolder.Path(), "good");
}


TEST_F(SavePanelTest, AnExistingFileIsAskedAbout)
{
	fFolder.Write("old", "content");
	Save("old");
	fRobot.Key("enter");
	EXPECT_EQ(QuestionText(), "The file \"old\" exists already. Do you want to replace it?");
	fRobot.ClickView("Cancel");
	ASSERT_TRUE(fRobot.WaitForNoWindow("File panel"));
	EXPECT_TRUE(fPanel->IsShowing());
	EXPECT_EQ(fTarget->Count(), 0u);
	ASSERT_TRUE(fRobot.WaitForWindow("panel"));
	fRobot.ClickView("default button");
	ASSERT_NE(QuestionText(), "");
	fRobot.ClickView("Replace");
	ExpectSaved(fFolder.Path(), "old");
	// Replacing it is up to the program.
	EXPECT_EQ(fFolder.Read("old"), "content");
}


TEST_F(SavePanelTest, EscapeDoesNotReplace)
{
	fFolder.Write("old");
	Save("old");
	fRobot.Key("enter");
	ASSERT_NE(QuestionText(), "");
	fRobot.Key("escape");
	ASSERT_TRUE(fRobot.WaitForNoWindow("File panel"));
	fRobot.Settle();
	EXPECT_TRUE(fPanel->IsShowing());
	EXPECT_EQ(fTarget->Count(), 0u);
}


TEST_F(SavePanelTest, AHiddenPanelDoesNotReplace)
{
	fFolder.Write("old");
	Save("old");
	fRobot.Key("enter");
	ASSERT_NE(QuestionText(), "");
	fPanel->Hide();
	ASSERT_TRUE(fRobot.WaitForNoWindow("File panel"));
	EXPECT_EQ(fTarget->Next().what, uint32(B_CANCEL));
	EXPECT_EQ(fTarget->Count(), 0u);
}


TEST_F(SavePanelTest, AFolderIsNotReplaced)
{
	fFolder.Make("folder");
	Save("folder");
	fRobot.Key("enter");
	EXPECT_EQ(
		TakeNotice(), "There is a folder named \"folder\" already. Please choose another name.");
	EXPECT_EQ(fTarget->Count(), 0u);
}


TEST_F(SavePanelTest, ASelectedFilesNameIsTakenOver)
{
	fFolder.Write("caf\xe9");
	fFolder.Make("folder");
	Save("proposed");
	fRobot.Key("shift+tab");
	Do([&] { fPanel->Window()->FindView("PoseView")->MakeFocus(true); });
	fRobot.Key("down");
	EXPECT_EQ(Selected(), List{"folder"});
	EXPECT_EQ(fRobot.Text("text view"), "proposed");
	fRobot.Key("down");
	EXPECT_EQ(fRobot.Text("text view"), "caf\xef\xbf\xbd");
	fRobot.Key("enter");
	ASSERT_NE(QuestionText(), "");
	fRobot.ClickView("Replace");
	ExpectSaved(fFolder.Path(), "caf\xe9");
}


TEST_F(SavePanelTest, EnterInTheListGoesIntoFolders)
{
	fFolder.Make("folder");
	Save("name");
	Do([&] { fPanel->Window()->FindView("PoseView")->MakeFocus(true); });
	fRobot.Key("down");
	fRobot.Key("enter");
	EXPECT_TRUE(WaitUntil([&] { return ShownFolder() == fFolder / "folder"; }));
	EXPECT_EQ(fTarget->Count(), 0u);
	fRobot.ClickView("default button");
	ExpectSaved(fFolder / "folder", "name");
}


TEST_F(SavePanelTest, AFolderThatCannotBeWrittenToIsRefused)
{
	ASSERT_EQ(chmod(fFolder.Path().c_str(), 0755), 0);
	const std::string path = fFolder.Make("closed");
	ASSERT_EQ(chmod(path.c_str(), 0555), 0);
	Save("name");
	fPanel->SetPanelDirectory(path.c_str());
	fRobot.Settle();
	{
		OrdinaryUser user;
		fRobot.Key("enter");
		EXPECT_EQ(TakeNotice(),
			"Nothing can be saved in the folder \"closed\": you may not write there. "
			"Please choose another folder.");
	}
	chmod(path.c_str(), 0755);
	EXPECT_EQ(fRobot.Text("text view"), "name");
	EXPECT_EQ(fTarget->Count(), 0u);
}


TEST_F(SavePanelTest, AFolderThatHasGoneIsNotSavedIn)
{
	const std::string path = fFolder.Make("short-lived");
	Save("name");
	fPanel->SetPanelDirectory(path.c_str());
	fRobot.Settle();
	Do([&] {
		std::filesystem::remove(path);
		fPanel->Window()->PostMessage(
			dynamic_cast<BButton*>(fPanel->Window()->FindView("default button"))->Message());
	});
	EXPECT_EQ(TakeNotice(), "The folder \"" + path + "\" cannot be used. It does not exist.");
	EXPECT_TRUE(WaitUntil([&] { return ShownFolder() == fFolder.Path(); }));
	EXPECT_EQ(fRobot.Text("text view"), "name");
	EXPECT_EQ(fTarget->Count(), 0u);
}


TEST_F(SavePanelTest, AProposedNameThatIsNoTextIsSentAsItIs)
{
	Save("caf\xe9");
	EXPECT_EQ(fRobot.Text("text view"), "caf\xef\xbf\xbd");
	fRobot.Key("enter");
	ExpectSaved(fFolder.Path(), "caf\xe9");
}
