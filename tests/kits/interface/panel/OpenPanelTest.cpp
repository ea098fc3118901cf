// SPDX-License-Identifier: MIT
// Tests of panels for opening: what is chosen, and what the program hears of it.

#include "PanelFixture.h"

namespace {

/// Refuses some names, and only keeps folders and one type.
class NameFilter : public BRefFilter {
public:
	bool Filter(const entry_ref* ref, BNode*, struct stat_beos*, const char* mimeType) override
	{
		if (std::string(mimeType) == "application/x-vnd.Be-directory")
			return true;
		return accepted.load() == nullptr || std::string(ref->name).ends_with(accepted.load());
	}

	std::atomic<const char*> accepted{nullptr};
};


/// Answers once for each token that the test gives.
class GatedFilter : public BRefFilter {
public:
	~GatedFilter() override { delete_sem(tokens); }

	bool Filter(const entry_ref*, BNode*, struct stat_beos*, const char*) override
	{
		asked++;
		acquire_sem(tokens);
		return true;
	}

	const sem_id tokens = create_sem(0, "filter tokens");
	std::atomic<int32> asked{0};
};


class OpenPanelTest : public FilePanelTest {};

} // namespace


TEST_F(OpenPanelTest, TheSelectedFileIsSentAndThePanelHides)
{
	fFolder.Write("a.txt");
	fFolder.Write("b.txt");
	Open();
	EXPECT_TRUE(fPanel->IsShowing());
	EXPECT_FALSE(CanChoose());
	fRobot.Type("b");
	EXPECT_EQ(Selected(), List{"b.txt"});
	EXPECT_TRUE(CanChoose());
	fRobot.Key("enter");

	const BMessage refs = fTarget->Next();
	EXPECT_EQ(refs.what, uint32(B_REFS_RECEIVED));
	EXPECT_EQ(PathOf(refs, "refs"), fFolder / "b.txt");
	EXPECT_FALSE(refs.HasRef("refs", 1));
	const BMessage cancel = fTarget->Next();
	EXPECT_EQ(cancel.what, uint32(B_CANCEL));
	EXPECT_EQ(cancel.GetInt32("old_what", 0), int32(B_REFS_RECEIVED));
	void* source;
	ASSERT_EQ(cancel.FindPointer("source", &source), B_OK);
	EXPECT_EQ(source, static_cast<BFilePanel*>(fPanel.get()));
	EXPECT_FALSE(fPanel->IsShowing());
	EXPECT_EQ(fPanel->sent, 1);
	EXPECT_EQ(fPanel->hidden, 1);
}


TEST_F(OpenPanelTest, TheGivenMessageIsCopied)
{
	fFolder.Write("file");
	BMessage message('mine');
	message.AddString("extra", "kept");
	Make(B_OPEN_PANEL, 0, true, &message);
	message.MakeEmpty();
	Show();
	fRobot.Key("down");
	fRobot.ClickView("default button");
	const BMessage refs = fTarget->Next();
	EXPECT_EQ(refs.what, uint32('mine'));
	EXPECT_STREQ(refs.GetString("extra", ""), "kept");
	EXPECT_EQ(PathOf(refs, "refs"), fFolder / "file");
	EXPECT_EQ(fTarget->Next().GetInt32("old_what", 0), int32('mine'));
}


TEST_F(OpenPanelTest, SeveralFilesAreSentInTheOrderOfTheRows)
{
	fFolder.Write("file10");
	fFolder.Write("file9");
	fFolder.Write("other");
	Open();
	fRobot.Key("down");
	fRobot.Key("shift+down");
	EXPECT_EQ(Selected(), (List{"file9", "file10"}));
	fRobot.Key("enter");
	const BMessage refs = fTarget->Next();
	EXPECT_EQ(PathOf(refs, "refs", 0), fFolder / "file9");
	EXPECT_EQ(PathOf(refs, "refs", 1), fFolder / "file10");
	EXPECT_FALSE(refs.HasRef("refs", 2));
}


TEST_F(OpenPanelTest, OnlyOneFileIsSelectedWhereOneIsWanted)
{
	fFolder.Write("a");
	fFolder.Write("b");
	Open(0, false);
	fRobot.Key("down");
	fRobot.Key("shift+down");
	EXPECT_EQ(Selected().size(), 1u);
	fRobot.Key("command+a");
	EXPECT_EQ(Selected().size(), 1u);
}


TEST_F(OpenPanelTest, AllAreSelectedByCommandAButFoldersAreNotSent)
{
	fFolder.Make("folder");
	fFolder.Write("a");
	fFolder.Write("b");
	Open();
	fRobot.Key("command+a");
	EXPECT_EQ(Selected().size(), 3u);
	fRobot.Key("enter");
	const BMessage refs = fTarget->Next();
	EXPECT_EQ(PathOf(refs, "refs", 0), fFolder / "a");
	EXPECT_EQ(PathOf(refs, "refs", 1), fFolder / "b");
	EXPECT_FALSE(refs.HasRef("refs", 2));
}


TEST_F(OpenPanelTest, SeveralFoldersAreNoChoice)
{
	fFolder.Make("a");
	fFolder.Make("b");
	Open();
	fRobot.Key("command+a");
	EXPECT_FALSE(CanChoose());
	fRobot.Key("enter");
	fRobot.Settle();
	EXPECT_TRUE(fPanel->IsShowing());
	EXPECT_EQ(ShownFolder(), fFolder.Path());
}


TEST_F(OpenPanelTest, EnterGoesIntoFoldersAndBackspaceOut)
{
	fFolder.Make("middle");
	fFolder.Make("zlast");
	fFolder.Write("middle/inner");
	Open();
	fRobot.Type("mi");
	fRobot.Key("enter");
	EXPECT_TRUE(WaitForRows({"inner"}));
	EXPECT_EQ(ShownFolder(), fFolder / "middle");
	EXPECT_EQ(fRobot.Text("path"), fFolder / "middle");
	fRobot.Key("backspace");
	EXPECT_TRUE(WaitForRows({"middle", "zlast"}));
	// Where one comes from is selected.
	EXPECT_EQ(Selected(), List{"middle"});
	EXPECT_EQ(fTarget->Count(), 0u);
}


TEST_F(OpenPanelTest, CommandAndTheArrowsWalkThroughFolders)
{
	fFolder.Make("a/b");
	Open();
	fRobot.Key("down");
	fRobot.Key("command+down");
	EXPECT_TRUE(WaitForRows({"b"}));
	fRobot.Key("command+up");
	EXPECT_TRUE(WaitForRows({"a"}));
	fRobot.Key("control+down");
	EXPECT_TRUE(WaitForRows({"b"}));
	fRobot.Key("control+up");
	EXPECT_TRUE(WaitForRows({"a"}));
	EXPECT_TRUE(fRobot.ClickView("up"));
	EXPECT_TRUE(WaitUntil([&] { return ShownFolder() != fFolder.Path(); }));
}


TEST_F(OpenPanelTest, ADoubleClickOpens)
{
	fFolder.Make("folder");
	fFolder.Write("folder/file");
	Open();
	BPoint row;
	Do([&] {
		BListView* list = dynamic_cast<BListView*>(fPanel->Window()->FindView("PoseView"));
		const BRect frame = list->ItemFrame(0);
		row = fPanel->Window()->ConvertFromScreen(
			list->ConvertToScreen(BPoint(40, frame.top + frame.Height() / 2)));
	});
	fRobot.Click(row, 2);
	ASSERT_TRUE(WaitForRows({"file"}));
	fRobot.Click(row, 2);
	EXPECT_EQ(PathOf(fTarget->Next(), "refs"), fFolder / "folder/file");
}


TEST_F(OpenPanelTest, AFolderIsChosenWhereFoldersAreWanted)
{
	fFolder.Make("folder/inner");
	fFolder.Write("file");
	Open(B_DIRECTORY_NODE);
	EXPECT_EQ(Rows(), List{"folder"});
	fRobot.Key("down");
	fRobot.Key("command+down");
	EXPECT_TRUE(WaitForRows({"inner"}));
	fRobot.Key("down");
	fRobot.Key("enter");
	EXPECT_EQ(PathOf(fTarget->Next(), "refs"), fFolder / "folder/inner");
}


TEST_F(OpenPanelTest, TheShownFolderIsChosenWhenNothingIsSelected)
{
	fFolder.Make("folder");
	Open(B_DIRECTORY_NODE | B_FILE_NODE);
	EXPECT_TRUE(CanChoose());
	fRobot.ClickView("default button");
	EXPECT_EQ(PathOf(fTarget->Next(), "refs"), fFolder.Path());
}


TEST_F(OpenPanelTest, LinksAreNotResolved)
{
	fFolder.Write("file");
	fFolder.Link("file", "zlink");
	fFolder.Link("nowhere", "broken");
	Open();
	EXPECT_EQ(Rows(), (List{"file", "zlink"}));
	fRobot.Key("end");
	fRobot.Key("enter");
	EXPECT_EQ(PathOf(fTarget->Next(), "refs"), fFolder / "zlink");
}


TEST_F(OpenPanelTest, BrokenLinksCanBeChosenAsLinks)
{
	fFolder.Link("nowhere", "broken");
	Open(B_SYMLINK_NODE);
	fRobot.Key("down");
	fRobot.Key("enter");
	entry_ref ref;
	ASSERT_EQ(fTarget->Next().FindRef("refs", &ref), B_OK);
	EXPECT_STREQ(ref.name, "broken");
}


TEST_F(OpenPanelTest, TheFilterDecidesWhatIsShown)
{
	fFolder.Write("a.plim");
	fFolder.Write("b.txt");
	fFolder.Make("folder");
	NameFilter filter;
	filter.accepted = ".plim";
	Make(B_OPEN_PANEL, 0, true, nullptr, &filter);
	EXPECT_EQ(fPanel->RefFilter(), &filter);
	Show();
	EXPECT_TRUE(WaitForRows({"folder", "a.plim"}));
	filter.accepted = ".txt";
	fPanel->Refresh();
	EXPECT_TRUE(WaitForRows({"folder", "b.txt"}));
	fPanel->SetRefFilter(nullptr);
	EXPECT_TRUE(WaitForRows({"folder", "a.plim", "b.txt"}));
	fPanel.reset();
}


TEST_F(OpenPanelTest, FlavorsCanBeChanged)
{
	fFolder.Make("folder");
	fFolder.Write("file");
	Open();
	EXPECT_EQ(Rows(), (List{"folder", "file"}));
	fPanel->SetNodeFlavors(B_DIRECTORY_NODE);
	EXPECT_TRUE(WaitForRows({"folder"}));
	EXPECT_TRUE(CanChoose());
}


TEST_F(OpenPanelTest, AFileThatHasGoneIsNotSent)
{
	fFolder.Write("file");
	Open();
	fRobot.Key("down");
	// The window knows nothing of it while it is locked.
	Do([&] {
		std::filesystem::remove(fFolder / "file");
		fPanel->Window()->PostMessage(
			dynamic_cast<BButton*>(fPanel->Window()->FindView("default button"))->Message());
	});
	EXPECT_EQ(TakeNotice(), "\"file\" does not exist any more.");
	EXPECT_TRUE(fPanel->IsShowing());
	EXPECT_TRUE(WaitForRows({}));
	EXPECT_EQ(fTarget->Count(), 0u);
}


TEST_F(OpenPanelTest, NamesThatAreNoTextAreSentAsTheyAre)
{
	fFolder.Write("caf\xe9");
	Open();
	EXPECT_EQ(Rows(), List{"caf\xef\xbf\xbd"});
	fRobot.Key("down");
	fRobot.Key("enter");
	entry_ref ref;
	ASSERT_EQ(fTarget->Next().FindRef("refs", &ref), B_OK);
	EXPECT_STREQ(ref.name, "caf\xe9");
}


TEST_F(OpenPanelTest, TheSelectionCanBeWalked)
{
	fFolder.Make("a");
	fFolder.Write("b");
	Open();
	entry_ref ref;
	EXPECT_EQ(fPanel->GetNextSelectedRef(&ref), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(fPanel->GetNextSelectedRef(nullptr), B_BAD_VALUE);
	const int32 before = fPanel->selections;
	fRobot.Key("command+a");
	EXPECT_GT(fPanel->selections, before);
	for (int pass = 0; pass < 2; pass++) {
		fPanel->Rewind();
		ASSERT_EQ(fPanel->GetNextSelectedRef(&ref), B_OK);
		EXPECT_STREQ(ref.name, "a");
		ASSERT_EQ(fPanel->GetNextSelectedRef(&ref), B_OK);
		EXPECT_STREQ(ref.name, "b");
		EXPECT_EQ(fPanel->GetNextSelectedRef(&ref), B_ENTRY_NOT_FOUND);
	}
}


TEST_F(OpenPanelTest, TheTargetCanBeChanged)
{
	fFolder.Write("file");
	Make(B_OPEN_PANEL);
	PanelTarget* other = new PanelTarget;
	other->Run();
	fPanel->SetTarget(BMessenger(other));
	EXPECT_TRUE(fPanel->Messenger() == BMessenger(other));
	BMessage message('new1');
	fPanel->SetMessage(&message);
	Show();
	fRobot.Key("down");
	fRobot.Key("enter");
	EXPECT_EQ(other->Next().what, uint32('new1'));
	EXPECT_EQ(other->Next().what, uint32(B_CANCEL));
	EXPECT_EQ(fTarget->Count(), 0u);
	fPanel->SetMessage(nullptr);
	Show();
	fRobot.Key("enter");
	EXPECT_EQ(other->Next().what, uint32(B_REFS_RECEIVED));
	if (other->Lock())
		other->Quit();
}


TEST_F(OpenPanelTest, AFullFolderIsListed)
{
	for (int i = 0; i < 20000; i++)
		fFolder.Write("f" + std::to_string(i));
	Open();
	EXPECT_TRUE(WaitUntil([&] { return Rows().size() == 20000; }));
	EXPECT_TRUE(fRobot.WaitForText("status", "20000 items"));
	fRobot.Key("end");
	EXPECT_EQ(Selected(), List{"f19999"});
	fRobot.Key("enter");
	EXPECT_EQ(PathOf(fTarget->Next(), "refs"), fFolder / "f19999");
}


TEST_F(OpenPanelTest, ItCanBeCancelledWhileItReads)
{
	for (int i = 0; i < 100; i++)
		fFolder.Write(std::to_string(i));
	GatedFilter filter;
	Make(B_OPEN_PANEL, 0, true, nullptr, &filter);
	fPanel->Show();
	release_sem_etc(filter.tokens, 5, 0);
	ASSERT_TRUE(WaitUntil([&] { return filter.asked == 6; }));
	// Its next slice of reading comes after what it was told before.
	fPanel->Window()->PostMessage(B_QUIT_REQUESTED);
	snooze(30000);
	release_sem(filter.tokens);
	EXPECT_EQ(fTarget->Next().what, uint32(B_CANCEL));
	EXPECT_FALSE(fPanel->IsShowing());
	fRobot.Settle();
	EXPECT_EQ(filter.asked, 6);
	// Shown again it reads all.
	release_sem_etc(filter.tokens, 1000, 0);
	Show();
	EXPECT_TRUE(WaitUntil([&] { return Rows().size() == 100; }));
	fPanel.reset();
}


TEST_F(OpenPanelTest, ManyChangesAtOnceAreAllShown)
{
	Open();
	for (int i = 0; i < 3000; i++)
		fFolder.Write("f" + std::to_string(i));
	for (int i = 0; i < 3000; i += 2)
		std::filesystem::remove(fFolder / ("f" + std::to_string(i)));
	EXPECT_TRUE(WaitUntil([&] { return Rows().size() == 1500 && Rows()[0] == "f1"; }));
}
