// SPDX-License-Identifier: MIT
// Follows the pointer and the keys from the opening of a menu to the choice.
#ifndef INTERFACE_MENU_TRACKER_H
#define INTERFACE_MENU_TRACKER_H

#include <atomic>
#include <memory>
#include <vector>

#include <Looper.h>
#include <Menu.h>
#include <MessageRunner.h>
#include <Messenger.h>
#include <Rect.h>

namespace BPrivate {

/// How a menu is opened.
struct MenuStart {
	BMenu* menu = nullptr;
	/// An item of the bar \a menu that is selected, -1 for none; and whether its menu opens.
	int32 index = -1;
	bool opensItem = false;
	/// The first item of that menu, or its present choice, is selected, for those who go on by keyboard.
	bool selectsFirst = false;
	/// Releasing the button that opened the menu keeps it open; in the rect, if that is valid, in any case.
	bool staysOpen = false;
	BRect clickThrough;
	/// Of a menu that is no bar: the choice is invoked; the menu is deleted then.
	bool delivers = false;
	bool deletesMenu = false;
};


/// The session of one open menu with all its submenus, in a thread of its own.
///
/// It gets the input as messages from the menus' windows and the bar's. It locks one menu to look at it,
/// and the window of a submenu it opens besides, but never a window the other way round; it
/// holds none when it tells the program of the choice. There is one session at a time: a new one ends the old.
class MenuTracker : public BLooper {
public:
	/// For a bar: in its window's thread, window locked.
	static void Start(const MenuStart& start);
	/// Returns the choice, null for none. A window's thread keeps its picture up to date meanwhile.
	static BMenuItem* TrackAndWait(const MenuStart& start);
	/// \a menu is being deleted. Any thread.
	static void MenuGoes(const BMenu* menu);
	/// Ends the session that \a tracker is.
	static void End(const BMessenger& tracker);

	~MenuTracker() override;

	void MessageReceived(BMessage* message) override;
	bool QuitRequested() override;

private:
	struct Outcome;
	class LockedMenu;
	friend class LockedMenu;

	// An open menu, from the bar or the pop-up menu to the submenus.
	struct Level {
		BMessenger menu;
		BMessenger window;
		BRect frame;
	};

	explicit MenuTracker(const MenuStart& start);

	static void Launch(MenuTracker* tracker);

	// The session
	void Begin();
	void Finish(const BMenuItem* chosen, uint64 serial);
	void FinishBar(const BMenuItem* chosen, uint64 serial);
	void FinishPopUp(BMenuItem* chosen);

	// Menus
	bool OpenRoot();
	void OpenSubmenu(size_t level, BMenuItem* item, bool selectFirst);
	void CloseAbove(size_t level);
	void CloseLevel();
	void SelectItem(size_t level, BMenu* menu, BMenuItem* item, bool opens);
	int32 LevelAt(BPoint where) const;

	// Pointer
	void PointerMessage(const BMessage& message);
	bool IsNews(const BMessage& message);
	void Pressed(BPoint where);
	void Released(BPoint where);
	void Hover(BPoint where);
	bool HeadsForSubmenu(size_t level, BPoint where) const;
	void Wheel(BPoint where, float delta);
	void TimePassed();
	void StartTimer(bigtime_t time);

	// Keys
	void KeyPressed(const BMessage& message);
	void SelectByKey(bool forward, bool fromEnd);
	void GoIn();
	void GoOut();
	void MoveInBar(bool forward);
	void ChooseByKey();
	void ChooseByTrigger(char letter);

	const MenuStart fStart;
	const bool fIsBar;
	std::shared_ptr<Outcome> fOutcome;
	std::vector<Level> fLevels;
	std::unique_ptr<BMessageRunner> fTimer;
	int32 fTimerSerial;
	// Set by other threads.
	std::atomic<bool> fAborted;
	std::atomic<bool> fRootIsGone;
	bool fEnded;

	BPoint fWhere;
	// Where the pointer was when it last pointed at the selected item.
	BPoint fLastOnSelected;
	bool fIsPressed;
	// The press that opened the menus is still being held.
	bool fIsOpeningPress;
	// The press was on the item of the bar whose menu was open.
	bool fClosesOnRelease;
	BPoint fPressWhere;
	bigtime_t fPressWhen;
	bool fHasWandered;
	bigtime_t fNow;
	bigtime_t fLastWhen;
	std::vector<uint32> fSeen;
};

} // namespace BPrivate

#endif // INTERFACE_MENU_TRACKER_H
