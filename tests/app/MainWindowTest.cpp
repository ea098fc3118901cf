// SPDX-License-Identifier: MIT

#include "app/MainWindow.h"

#include <cmath>

#include <Autolock.h>
#include <Entry.h>
#include <MenuBar.h>
#include <MenuItem.h>
#include <Screen.h>

#include "app/DesignerRun.h"
#include "app/PlimView.h"
#include "app/Preferences.h"
#include "designer/DesignForm.h"
#include "model/AppComponent.h"
#include "palette/ComponentPalette.h"
#include "project/Project.h"
#include "project/ProjectWin.h"
#include "props/PropertyWin.h"
#include "support/Printers.h"

namespace {

class MainWindowTest : public DesignerTest {};

struct expected_item {
	const char* label; // null: a separator
	uint32 what;
	char shortcut;
	uint32 modifiers;
	bool goesToApplication;
};

constexpr expected_item kSeparator = {nullptr, 0, 0, 0, false};

constexpr expected_item kFile[] = {
	{"New Project", 1, 'N', B_COMMAND_KEY, true},
	kSeparator,
	{"Open Project...", 2, 'O', B_COMMAND_KEY, true},
	{"Save Project", 3, 'S', B_COMMAND_KEY, true},
	{"Save Project As...", 4, 'S', B_COMMAND_KEY | B_SHIFT_KEY, true},
	kSeparator,
	{"Generate Code...", 5, 'G', B_COMMAND_KEY, true},
	kSeparator,
	{"Quit", 6, 0, 0, false},
};
constexpr expected_item kView[] = {
	{"Project", 7, 'R', B_COMMAND_KEY, false},
	{"Properties", 8, 'P', B_COMMAND_KEY, false},
	{"Palette", 10, 'T', B_COMMAND_KEY, false},
};
constexpr expected_item kHelp[] = {
	{"Contents", 11, 0, 0, true},
	kSeparator,
	{"About", 12, 0, 0, true},
};


template <size_t kLength>
void
CheckMenu(BMenuItem* title, const char* label, const expected_item (&expected)[kLength])
{
	ASSERT_NE(title, nullptr);
	EXPECT_STREQ(title->Label(), label);
	BMenu* menu = title->Submenu();
	ASSERT_NE(menu, nullptr);
	ASSERT_EQ(menu->CountItems(), static_cast<int32>(kLength));
	for (int32 i = 0; i < menu->CountItems(); i++) {
		BMenuItem* item = menu->ItemAt(i);
		if (expected[i].label == nullptr) {
			EXPECT_NE(dynamic_cast<BSeparatorItem*>(item), nullptr) << label << i;
			continue;
		}
		EXPECT_STREQ(item->Label(), expected[i].label);
		EXPECT_EQ(item->Message()->what, expected[i].what) << item->Label();
		uint32 modifiers = 0;
		EXPECT_EQ(item->Shortcut(&modifiers), expected[i].shortcut) << item->Label();
		EXPECT_EQ(expected[i].shortcut != 0 ? modifiers : 0, expected[i].modifiers)
			<< item->Label();
		BLooper* application = be_app;
		BLooper* looper = expected[i].goesToApplication ? application : MainWindow();
		BLooper* target;
		item->Target(&target);
		EXPECT_EQ(target, looper) << item->Label();
	}
}


bool
IsShown(BWindow* window)
{
	BAutolock lock(window);
	return lock.IsLocked() && !window->IsHidden();
}


BRect
FrameOf(BWindow* window)
{
	BAutolock lock(window);
	return window->Frame();
}


BRect
Stored(const char* key)
{
	BRect frame;
	return AppSettings.FindRect(key, &frame) == B_OK ? frame : BRect();
}


void
SetModified()
{
	MainWindow()->ProjectWindow()->Project()->App()->SetModified(true);
}

} // namespace


TEST(MainWindowAccessorTest, IsNullInOtherPrograms)
{
	EXPECT_EQ(MainWindow(), nullptr);
	BApplication application("application/x-vnd.Plimworks-OtherProgram");
	EXPECT_EQ(MainWindow(), nullptr);
}


TEST_F(MainWindowTest, WithoutSettingsTheWindowsAppearAtTheirFirstFrames)
{
	Run([] {
		PlimWin* window = MainWindow();
		EXPECT_STREQ(window->Title(), "Plimworks");
		EXPECT_EQ(FrameOf(window), BRect(20, 40, 320, 80));
		EXPECT_EQ(window->Flags() & (B_NOT_ZOOMABLE | B_NOT_V_RESIZABLE),
			static_cast<uint32>(B_NOT_ZOOMABLE | B_NOT_V_RESIZABLE));
		EXPECT_TRUE(IsShown(window));
		EXPECT_TRUE(IsShown(window->PropertyWindow()));
		EXPECT_TRUE(IsShown(window->ProjectWindow()));
		EXPECT_TRUE(IsShown(window->Palette()));
		EXPECT_EQ(window->ProjectWindow()->Project()->CountForms(), 1);

		// There is no folder of libraries beside the test.
		const BRect screen = BScreen(B_MAIN_SCREEN_ID).Frame();
		const float left = std::round((screen.right - screen.left) / 2 - 50);
		EXPECT_EQ(FrameOf(window->Palette()), BRect(left, 120, left + 115, 420));
	});
}


TEST_F(MainWindowTest, TheBackgroundFillsTheWindowBelowTheMenus)
{
	Run([] {
		BAutolock lock(MainWindow());
		PlimView* view = MainWindow()->View();
		EXPECT_STREQ(view->Name(), "PlimView");
		EXPECT_EQ(view->ViewColor(), (rgb_color{216, 216, 216, 255}));
		EXPECT_EQ(view->Frame().bottom, MainWindow()->Bounds().bottom);
		EXPECT_EQ(view->Frame().Width(), MainWindow()->Bounds().Width());
		EXPECT_NE(MainWindow()->FindView("menubar"), nullptr);
	});
}


TEST_F(MainWindowTest, TheMenusHaveTheirItemsInOrder)
{
	Run([] {
		BAutolock lock(MainWindow());
		BMenuBar* bar = MainWindow()->KeyMenuBar();
		ASSERT_NE(bar, nullptr);
		ASSERT_EQ(bar->CountItems(), 3);
		CheckMenu(bar->ItemAt(0), "File", kFile);
		CheckMenu(bar->ItemAt(1), "View", kView);
		CheckMenu(bar->ItemAt(2), "Help", kHelp);
	});
}


TEST_F(MainWindowTest, EachWindowIsMadeOnce)
{
	Run([] {
		PlimWin* window = MainWindow();
		EXPECT_EQ(MainWindow(), window);
		EXPECT_EQ(window->ProjectWindow(), window->ProjectWindow());
		EXPECT_EQ(window->PropertyWindow(), window->PropertyWindow());
		EXPECT_EQ(window->Palette(), window->Palette());
		EXPECT_EQ(window->DesignForm(), window->DesignForm());
	});
}


TEST_F(MainWindowTest, TheViewMenuBringsClosedWindowsBack)
{
	Run([this] {
		PlimWin* window = MainWindow();
		const struct {
			BWindow* window;
			uint32 command;
		} rows[] = {
			{window->ProjectWindow(), 7}, {window->PropertyWindow(), 8}, {window->Palette(), 10}};
		for (const auto& row : rows) {
			Tell(BMessenger(row.window), B_QUIT_REQUESTED);
			EXPECT_FALSE(IsShown(row.window)) << row.command;
			Tell(BMessenger(window), row.command);
			EXPECT_TRUE(IsShown(row.window)) << row.command;
			// A window that is shown stays, and can be closed as before.
			Tell(BMessenger(window), row.command);
			EXPECT_TRUE(IsShown(row.window)) << row.command;
			Tell(BMessenger(row.window), B_QUIT_REQUESTED);
			EXPECT_FALSE(IsShown(row.window)) << row.command;
		}
	});
}


TEST_F(MainWindowTest, Code9ShowsAFormOfNoProject)
{
	Run([] {
		Tell(BMessenger(MainWindow()), 9);
		EXPECT_TRUE(IsShown(MainWindow()->DesignForm()));
		EXPECT_STREQ(MainWindow()->DesignForm()->ComponentName(), "Untitled");
		EXPECT_EQ(MainWindow()->ProjectWindow()->Project()->CountForms(), 1);
	});
}


TEST_F(MainWindowTest, CommandsOfTheApplicationDoNothingHere)
{
	Run([] {
		for (const uint32 command : {2, 3, 4, 11, 12})
			Tell(BMessenger(MainWindow()), command);
		EXPECT_TRUE(Boxes().empty());
		Tell(BMessenger(MainWindow()), 1);
		EXPECT_EQ(Boxes(), (std::vector<std::string>{"Yeah|Yeah"}));
	});
}


TEST_F(MainWindowTest, DroppedFilesAreIgnored)
{
	Run([] {
		BMessage drop(B_SIMPLE_DATA);
		entry_ref ref;
		get_ref_for_path("/tmp", &ref);
		drop.AddRef("refs", &ref);
		Tell(BMessenger(MainWindow()->View()), &drop);
		EXPECT_TRUE(Boxes().empty());
	});
}


TEST_F(MainWindowTest, StoredFramesWin)
{
	AppSettings.SetRect("MainWindowFrame", BRect(60, 70, 360, 130));
	AppSettings.SetRect("PaletteFrame", BRect(200, 210, 320, 500));
	AppSettings.SetRect("ProjectWinFrame", BRect(300, 310, 500, 610));
	AppSettings.SetRect("PropertyWinFrame", BRect(10, 310, 230, 610));
	Run([] {
		PlimWin* window = MainWindow();
		EXPECT_EQ(FrameOf(window), BRect(60, 70, 360, 130));
		EXPECT_EQ(FrameOf(window->Palette()), BRect(200, 210, 320, 500));
		EXPECT_EQ(FrameOf(window->ProjectWindow()), BRect(300, 310, 500, 610));
		EXPECT_EQ(FrameOf(window->PropertyWindow()), BRect(10, 310, 230, 610));
	});
}


TEST_F(MainWindowTest, WindowsThatNoScreenShowsAreBroughtBack)
{
	const BRect outside(9000, 9000, 9200, 9300);
	for (const char* key :
		{"MainWindowFrame", "PaletteFrame", "ProjectWinFrame", "PropertyWinFrame"})
		AppSettings.SetRect(key, outside);
	Run([] {
		const BRect screen = BScreen(B_MAIN_SCREEN_ID).Frame();
		PlimWin* window = MainWindow();
		for (BWindow* each :
			{static_cast<BWindow*>(window), static_cast<BWindow*>(window->Palette()),
				static_cast<BWindow*>(window->ProjectWindow()),
				static_cast<BWindow*>(window->PropertyWindow())})
			EXPECT_TRUE(screen.Contains(FrameOf(each))) << each->Title();
	});
}


TEST_F(MainWindowTest, QuittingStoresTheFramesAndEndsAllWindows)
{
	BMessenger windows[4];
	Run([&windows] {
		PlimWin* window = MainWindow();
		windows[0] = BMessenger(window);
		windows[1] = BMessenger(window->Palette());
		windows[2] = BMessenger(window->ProjectWindow());
		windows[3] = BMessenger(window->PropertyWindow());
		float left = 30;
		for (BWindow* each :
			{static_cast<BWindow*>(window), static_cast<BWindow*>(window->Palette()),
				static_cast<BWindow*>(window->ProjectWindow()),
				static_cast<BWindow*>(window->PropertyWindow())}) {
			BAutolock lock(each);
			each->MoveTo(left, 90);
			left += 10;
		}
	});
	EXPECT_EQ(Stored("MainWindowFrame").LeftTop(), BPoint(30, 90));
	EXPECT_EQ(Stored("PaletteFrame").LeftTop(), BPoint(40, 90));
	EXPECT_EQ(Stored("ProjectWinFrame").LeftTop(), BPoint(50, 90));
	EXPECT_EQ(Stored("PropertyWinFrame").LeftTop(), BPoint(60, 90));
	for (const BMessenger& window : windows)
		EXPECT_FALSE(window.IsValid());
	EXPECT_EQ(MainWindow(), nullptr);
}


TEST_F(MainWindowTest, TheCloseBoxQuitsWithoutAsking)
{
	Run([] {
		SetModified();
		Tell(BMessenger(MainWindow()), B_QUIT_REQUESTED);
	});
	EXPECT_TRUE(Boxes().empty());
	EXPECT_TRUE(Stored("MainWindowFrame").IsValid());
}


TEST_F(MainWindowTest, QuitAsksAboutAChangedProjectAndCancelKeepsEverything)
{
	Run([] {
		SetModified();
		Answer(2);
		Tell(BMessenger(MainWindow()), 6);
		EXPECT_EQ(Boxes(),
			(std::vector<std::string>{
				"The 'Application' project has changed. Save before closing?|"
				"The 'Application' project has changed. Save before closing?"}));
		EXPECT_TRUE(IsShown(MainWindow()));
		EXPECT_EQ(MainWindow()->ProjectWindow()->Project()->CountForms(), 1);
		EXPECT_FALSE(Stored("MainWindowFrame").IsValid());

		Answer(1);
		const BMessenger window(MainWindow());
		Tell(window, 6);
	});
	EXPECT_EQ(Boxes().size(), 2u);
}
