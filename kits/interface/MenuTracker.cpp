// SPDX-License-Identifier: MIT
// MenuTracker: beginning and end of a session, and the menus that are open in it.
#include "interface/MenuTracker.h"

#include <cmath>
#include <mutex>

#include <AppDefs.h>
#include <MenuBar.h>
#include <MenuItem.h>
#include <Message.h>
#include <MessageRunner.h>
#include <OS.h>
#include <Window.h>

#include "app/LooperPrivate.h"
#include "display/Display.h"
#include "interface/LockedMenu.h"
#include "interface/MenuPrivate.h"
#include "interface/MenuWindow.h"
#include "interface/UserWait.h"
#include "interface/WindowPrivate.h"

namespace BPrivate {

namespace {

const uint32 kMsgBegin = '_MBg';
const uint32 kMsgEnd = '_MEn';
const uint32 kMsgTimePassed = '_MTm'; // "serial" (int32)

// The running sessions; recursive, as telling the program of a choice may delete menus.
std::recursive_mutex sSessionsLock;
MenuTracker* sSession = nullptr;
const BMenu* sSessionMenu = nullptr;

} // namespace


/// What the thread in TrackAndWait() waits for. The tracker ends it, at the latest with itself.
struct MenuTracker::Outcome {
	UserWait wait;
	std::atomic<BMenuItem*> chosen{nullptr};
};


MenuTracker::MenuTracker(const MenuStart& start)
	: BLooper("menu tracking", B_DISPLAY_PRIORITY),
	  fStart(start),
	  fIsBar(MenuModel::Of(start.menu).isBar),
	  fTimerSerial(0),
	  fAborted(false),
	  fRootIsGone(false),
	  fEnded(false),
	  fIsPressed(false),
	  fIsOpeningPress(false),
	  fClosesOnRelease(false),
	  fPressWhen(system_time()),
	  fHasWandered(false),
	  fNow(fPressWhen),
	  fLastWhen(0)
{
	LooperAccess::SetKind(this, kMenuWindowLooper);
	uint32 buttons;
	Display::Get().GetPointer(&fWhere, &buttons);
	fIsPressed = fIsOpeningPress = buttons != 0 && !start.staysOpen;
	fPressWhere = fLastOnSelected = fWhere;
}


MenuTracker::~MenuTracker()
{
	{
		std::lock_guard lock(sSessionsLock);
		if (sSession == this)
			sSession = nullptr;
	}
	// The program ends while the menu is open.
	if (fOutcome != nullptr)
		fOutcome->wait.End();
}


void
MenuTracker::Launch(MenuTracker* tracker)
{
	{
		std::lock_guard lock(sSessionsLock);
		if (sSession != nullptr) {
			sSession->fAborted = true;
			sSession->PostMessage(kMsgEnd);
		}
		sSession = tracker;
		sSessionMenu = tracker->fStart.menu;
	}
	tracker->PostMessage(kMsgBegin);
	static_cast<BLooper*>(tracker)->Run();
}


void
MenuTracker::Start(const MenuStart& start)
{
	MenuTracker* tracker = new MenuTracker(start);
	if (tracker->fIsBar) {
		Level bar;
		bar.menu = BMessenger(start.menu);
		bar.frame = start.menu->ConvertToScreen(start.menu->Bounds());
		tracker->fLevels.push_back(bar);

		BWindow* window = start.menu->Window();
		WindowData& data = WindowData::Of(window);
		if (data.openBar != nullptr)
			window->PostMessage(_MENUS_DONE_);
		data.openBar = start.menu;
		data.menuTracker = BMessenger(tracker);
		window->MenusBeginning();
	}
	Launch(tracker);
}


BMenuItem*
MenuTracker::TrackAndWait(const MenuStart& start)
{
	const auto outcome = std::make_shared<Outcome>();
	if (outcome->wait.InitCheck() != B_OK)
		return nullptr;
	MenuTracker* tracker = new MenuTracker(start);
	tracker->fOutcome = outcome;
	Launch(tracker);

	outcome->wait.Wait("a menu");
	return outcome->chosen;
}


void
MenuTracker::MenuGoes(const BMenu* menu)
{
	std::lock_guard lock(sSessionsLock);
	if (sSession == nullptr || sSessionMenu != menu)
		return;
	sSession->fRootIsGone = true;
	sSession->fAborted = true;
	sSession->PostMessage(kMsgEnd);
}


void
MenuTracker::End(const BMessenger& tracker)
{
	tracker.SendMessage(kMsgEnd);
}


bool
MenuTracker::QuitRequested()
{
	return true;
}


void
MenuTracker::MessageReceived(BMessage* message)
{
	switch (message->what) {
		case kMsgBegin:
			Begin();
			break;

		case kMsgEnd:
			Finish(nullptr, 0);
			break;

		case kMsgTimePassed:
			if (message->GetInt32("serial", 0) == fTimerSerial)
				TimePassed();
			break;

		case kMsgMenuPlaced:
		{
			BMessenger window;
			message->FindMessenger("window", &window);
			for (Level& level : fLevels) {
				if (level.window == window)
					level.frame = message->GetRect("frame", level.frame);
			}
			break;
		}

		case B_MOUSE_DOWN:
		case B_MOUSE_UP:
		case B_MOUSE_MOVED:
		case B_MOUSE_WHEEL_CHANGED:
			PointerMessage(*message);
			break;

		case B_KEY_DOWN:
			KeyPressed(*message);
			break;

		case B_KEY_UP:
		case B_UNMAPPED_KEY_DOWN:
		case B_UNMAPPED_KEY_UP:
		case B_MODIFIERS_CHANGED:
			break;

		default:
			BLooper::MessageReceived(message);
			break;
	}
}


// #pragma mark - the session


void
MenuTracker::Begin()
{
	if (!fIsBar) {
		if (!OpenRoot())
			Finish(nullptr, 0);
		return;
	}

	LockedMenu bar(fLevels[0].menu);
	if (bar == nullptr) {
		Finish(nullptr, 0);
		return;
	}
	BMenuItem* item = bar->ItemAt(fStart.index);
	if (item == nullptr && !fIsPressed)
		item = MenuModel::Next(bar, nullptr, true);
	if (item == nullptr || !MenuModel::CanBeChosen(item))
		return;
	SelectItem(0, bar, item, false);
	if (fStart.opensItem && item->Submenu() != nullptr)
		OpenSubmenu(0, item, fStart.selectsFirst);
}


// The choice is told when all menus are closed and no lock is held, as it may reach into any window.
void
MenuTracker::Finish(const BMenuItem* chosen, uint64 serial)
{
	if (fEnded)
		return;
	fEnded = true;
	fTimer.reset();
	while (fLevels.size() > (fIsBar ? 1 : 0))
		CloseLevel();
	if (fIsBar)
		FinishBar(chosen, serial);
	else
		FinishPopUp(const_cast<BMenuItem*>(chosen));
	PostMessage(B_QUIT_REQUESTED);
}


void
MenuTracker::FinishBar(const BMenuItem* chosen, uint64 serial)
{
	LockedMenu bar(fLevels[0].menu);
	if (bar == nullptr)
		return;
	MenuModel::Select(bar, nullptr);
	BWindow* window = bar->Window();
	// Its program may have taken it away meanwhile.
	if (chosen != nullptr && MenuModel::Contains(bar, chosen)
		&& MenuModel::Of(chosen).serial == serial)
		MenuModel::Invoke(const_cast<BMenuItem*>(chosen));

	WindowData& data = WindowData::Of(window);
	if (data.menuTracker != BMessenger(this))
		return;
	data.menuTracker = BMessenger();
	data.openBar = nullptr;
	window->PostMessage(_MENUS_DONE_);
}


void
MenuTracker::FinishPopUp(BMenuItem* chosen)
{
	std::lock_guard lock(sSessionsLock);
	if (sSession == this)
		sSession = nullptr;
	if (fRootIsGone)
		chosen = nullptr;
	if (fOutcome != nullptr) {
		// Who waits invokes it, in its own thread.
		fOutcome->chosen = chosen;
		fOutcome->wait.End();
		fOutcome.reset();
		return;
	}
	if (chosen != nullptr && fStart.delivers)
		MenuModel::Invoke(chosen);
	if (fStart.deletesMenu && !fRootIsGone)
		delete fStart.menu;
}


// #pragma mark - menus


bool
MenuTracker::OpenRoot()
{
	BMenu* menu = fStart.menu;
	MenuModel::AddDynamicItems(menu, fAborted);
	MenuWindow* window = MenuWindow::Open(menu, MenuModel::ScreenLocation(menu), BMessenger(this));
	if (window == nullptr)
		return false;
	fLevels.push_back({BMessenger(menu), BMessenger(window), BRect()});

	LockedMenu opened(fLevels[0].menu);
	if (opened == nullptr)
		return false;
	fLevels[0].frame = opened->Window()->Frame();
	window->GrabInput();
	// A release before the grab was told to the window of the press alone: it was a short click.
	BPoint where;
	uint32 buttons;
	Display::Get().GetPointer(&where, &buttons);
	if (buttons == 0)
		fIsPressed = fIsOpeningPress = false;
	return true;
}


// The menu with the item is locked: nobody takes it away meanwhile.
void
MenuTracker::OpenSubmenu(size_t level, BMenuItem* item, bool selectFirst)
{
	CloseAbove(level);
	BMenu* submenu = item->Submenu();
	MenuModel::AddDynamicItems(submenu, fAborted);
	MenuWindow* window =
		MenuWindow::Open(submenu, MenuModel::ScreenLocation(submenu), BMessenger(this));
	if (window == nullptr)
		return;
	fLevels.push_back({BMessenger(submenu), BMessenger(window), BRect()});

	LockedMenu opened(fLevels.back().menu);
	if (opened == nullptr)
		return;
	fLevels.back().frame = opened->Window()->Frame();
	// One window gets all the input: that of the first menu, which stays until the end or the next one.
	if (fLevels.size() == (fIsBar ? 2 : 1))
		window->GrabInput();
	if (!selectFirst)
		return;
	BMenuItem* first = MenuModel::StartForKeys(opened, true);
	MenuModel::Select(opened, first);
	if (first != nullptr)
		window->Reveal(first);
}


void
MenuTracker::CloseAbove(size_t level)
{
	while (fLevels.size() > level + 1)
		CloseLevel();
}


void
MenuTracker::CloseLevel()
{
	const Level level = fLevels.back();
	fLevels.pop_back();
	LockedMenu menu(level.menu);
	if (menu != nullptr) {
		MenuModel::CloseWindows(menu);
		return;
	}
	// The program has taken the menu out.
	level.window.SendMessage(B_QUIT_REQUESTED);
}


void
MenuTracker::SelectItem(size_t level, BMenu* menu, BMenuItem* item, bool opens)
{
	CloseAbove(level);
	MenuModel::Select(menu, item);
	fLastOnSelected = fWhere;
	fTimer.reset();
	if (item != nullptr && item->Submenu() != nullptr && opens)
		OpenSubmenu(level, item, false);
}


int32
MenuTracker::LevelAt(BPoint where) const
{
	const BPoint pixel(std::floor(where.x), std::floor(where.y));
	for (size_t i = fLevels.size(); i > 0; i--) {
		if (fLevels[i - 1].frame.Contains(pixel))
			return static_cast<int32>(i - 1);
	}
	return -1;
}


void
MenuTracker::StartTimer(bigtime_t time)
{
	BMessage passed(kMsgTimePassed);
	passed.AddInt32("serial", ++fTimerSerial);
	fTimer = std::make_unique<BMessageRunner>(BMessenger(this), &passed, time, 1);
}

} // namespace BPrivate
