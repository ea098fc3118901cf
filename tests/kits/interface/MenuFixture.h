// SPDX-License-Identifier: MIT
// What the tests of open menus share: a window with a menu bar, and looking at what is open.
#ifndef TESTS_MENU_FIXTURE_H
#define TESTS_MENU_FIXTURE_H

#include <atomic>

#include <MenuBar.h>
#include <MenuItem.h>
#include <OS.h>

#include "ControlsFixture.h"

extern "C" int32 be_count_lock_violations();

/// Counts the hooks around menus.
class MenuSinkWindow : public SinkWindow {
public:
	void MenusBeginning() override { beginnings++; }
	void MenusEnded() override { endings++; }

	std::atomic<int32> beginnings{0};
	std::atomic<int32> endings{0};
};


/// The bar: File (Open, Save with Command-S, a line, Gone which is disabled, More), Edit (Copy, Paste), Act.
/// More: Deep, Deeper, which leads to Deepest. Each sends its label's first letters in lower case.
class OpenMenuTest : public ControlsTest {
protected:
	void SetUp() override
	{
		fWindow = fMenuWindow = new MenuSinkWindow;
		fBackground = new BView(fWindow->Bounds(), "background", B_FOLLOW_ALL, B_WILL_DRAW);
		fBackground->SetViewColor(ui_color(B_PANEL_BACKGROUND_COLOR));
		fWindow->AddChild(fBackground);

		fBar = new BMenuBar(BRect(0, 0, 9, 9), "bar");
		fFile = new BMenu("File");
		fFile->AddItem(new BMenuItem("Open", new BMessage('open')));
		fFile->AddItem(new BMenuItem("Save", new BMessage('save'), 'S'));
		fFile->AddSeparatorItem();
		fFile->AddItem(new BMenuItem("Gone", new BMessage('gone')));
		fFile->ItemAt(3)->SetEnabled(false);
		fMore = new BMenu("More");
		fMore->AddItem(new BMenuItem("Deep", new BMessage('deep')));
		fDeeper = new BMenu("Deeper");
		fDeeper->AddItem(new BMenuItem("Deepest", new BMessage('dpst')));
		fMore->AddItem(fDeeper);
		fFile->AddItem(fMore);
		fBar->AddItem(fFile);
		fEdit = new BMenu("Edit");
		fEdit->AddItem(new BMenuItem("Copy", new BMessage('copy')));
		fEdit->AddItem(new BMenuItem("Paste", new BMessage('past')));
		fBar->AddItem(fEdit);
		fBar->AddItem(new BMenuItem("Act", new BMessage('acts')));
		fBackground->AddChild(fBar);
	}

	/// Whether the menu is in a window, which the test's window is not.
	bool IsOpen(BMenu* menu)
	{
		fRobot->Settle();
		if (!menu->LockLooper())
			return false;
		bool isOpen = !menu->IsHidden();
		menu->UnlockLooper();
		return isOpen;
	}

	/// Waits for it.
	bool Opens(BMenu* menu)
	{
		return Becomes([&] { return IsOpen(menu); });
	}
	bool Closes(BMenu* menu)
	{
		return Becomes([&] { return !IsOpen(menu); });
	}

	/// No menu is open, and the window knows.
	bool AllClosed()
	{
		return Closes(fFile) && Closes(fMore) && Closes(fDeeper) && Closes(fEdit)
			&& Becomes([&] { return fMenuWindow->endings == fMenuWindow->beginnings; });
	}

	template <typename Condition>
	bool Becomes(Condition condition)
	{
		const bigtime_t limit = system_time() + 10000000;
		while (!condition()) {
			if (system_time() > limit)
				return false;
			snooze(5000);
		}
		return true;
	}

	BPoint MiddleOf(const char* label)
	{
		BPoint middle(-1000, -1000);
		EXPECT_TRUE(fRobot->FindItem(label, &middle)) << label;
		return middle;
	}

	/// Presses on the first, goes to the second, releases.
	void DragFromTo(const char* from, const char* to)
	{
		fRobot->MoveTo(MiddleOf(from));
		fRobot->Press();
		fRobot->MoveTo(MiddleOf(to));
		fRobot->Release();
	}

	MenuSinkWindow* fMenuWindow;
	BMenuBar* fBar;
	BMenu* fFile;
	BMenu* fMore;
	BMenu* fDeeper;
	BMenu* fEdit;
};


/// Menus in use: no thread may hold two windows' locks for them.
class MenuTrackingTest : public OpenMenuTest {
protected:
	void TearDown() override
	{
		OpenMenuTest::TearDown();
		EXPECT_EQ(be_count_lock_violations(), 0);
	}

	/// The label of the item that is selected in an open menu or the bar, "" for none.
	std::string Selected(BMenu* menu)
	{
		fRobot->Settle();
		if (!menu->LockLooper())
			return "closed";
		std::string label;
		for (int32 i = 0; i < menu->CountItems(); i++) {
			if (IsSelected(menu->ItemAt(i)))
				label = menu->ItemAt(i)->Label();
		}
		menu->UnlockLooper();
		return label;
	}

	static bool IsSelected(BMenuItem* item)
	{
		struct Opened : BMenuItem {
			using BMenuItem::IsSelected;
		};
		return (item->*&Opened::IsSelected)();
	}
};

#endif // TESTS_MENU_FIXTURE_H
