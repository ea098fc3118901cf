// SPDX-License-Identifier: MIT
// MenuModel: choosing items, and menus being in windows.
#include <algorithm>
#include <cctype>

#include <Looper.h>
#include <Window.h>

#include "interface/MenuPrivate.h"
#include "interface/MenuWindow.h"
#include "interface/WindowPrivate.h"

namespace BPrivate {

MenuLock::MenuLock(const BMenu* menu)
	: fLooper(nullptr)
{
	BMenu* locked = const_cast<BMenu*>(menu);
	if (locked != nullptr && locked->LockLooper())
		fLooper = locked->Looper();
}


MenuLock::~MenuLock()
{
	if (fLooper != nullptr)
		fLooper->Unlock();
}


// #pragma mark - choosing


bool
MenuModel::CanBeChosen(const BMenuItem* item)
{
	return item->IsEnabled() && dynamic_cast<const BSeparatorItem*>(item) == nullptr;
}


BMenuItem*
MenuModel::Next(BMenu* menu, const BMenuItem* from, bool forward)
{
	const std::vector<BMenuItem*>& items = Of(menu).items;
	const size_t count = items.size();
	const size_t place = std::find(items.begin(), items.end(), from) - items.begin();
	for (size_t step = 1; step <= count; step++) {
		size_t index = forward ? step - 1 : count - step;
		if (place < count)
			index = (forward ? place + step : place + count - step) % count;
		if (CanBeChosen(items[index]))
			return items[index];
	}
	return nullptr;
}


BMenuItem*
MenuModel::StartForKeys(BMenu* menu, bool forward)
{
	const BMenu* above = menu->Supermenu();
	if (menu->IsRadioMode() || (above != nullptr && Of(above).isFieldBar)) {
		BMenuItem* marked = menu->FindMarked();
		if (marked != nullptr && CanBeChosen(marked))
			return marked;
	}
	return Next(menu, nullptr, forward);
}


BMenuItem*
MenuModel::ItemForTrigger(BMenu* menu, char letter)
{
	LayOut(menu);
	const int wanted = std::tolower(static_cast<unsigned char>(letter));
	for (BMenuItem* item : Of(menu).items) {
		const char trigger = Of(item).trigger;
		if (trigger != 0 && std::tolower(static_cast<unsigned char>(trigger)) == wanted
			&& CanBeChosen(item))
			return item;
	}
	return nullptr;
}


void
MenuModel::Select(BMenu* menu, BMenuItem* item)
{
	MenuData& data = Of(menu);
	if (data.selected == item)
		return;
	BMenuItem* old = data.selected;
	data.selected = item;
	if (old != nullptr)
		old->Highlight(false);
	if (item != nullptr)
		item->Highlight(true);
}


bool
MenuModel::Contains(const BMenu* menu, const BMenuItem* item)
{
	for (const BMenuItem* candidate : Of(menu).items) {
		if (candidate == item)
			return true;
		if (candidate->Submenu() != nullptr && Contains(candidate->Submenu(), item))
			return true;
	}
	return false;
}


// #pragma mark - opening


void
MenuModel::AddDynamicItems(BMenu* menu, const std::atomic<bool>& aborted)
{
	if (!menu->AddDynamicItem(BMenu::B_INITIAL_ADD))
		return;
	do {
		if (aborted) {
			menu->AddDynamicItem(BMenu::B_ABORT);
			return;
		}
	} while (menu->AddDynamicItem(BMenu::B_PROCESSING));
}


// A menu's window is locked after that of the menu above it, and after any other window: never before.
void
MenuModel::CloseWindows(BMenu* menu)
{
	MenuLock lock(menu);
	// In no window, so that none is open below it either. Another thread may just have taken it out.
	if (!lock.IsLocked())
		return;
	auto window = dynamic_cast<MenuWindow*>(menu->Window());
	if (window == nullptr && !Of(menu).isBar)
		return;
	for (BMenuItem* item : Of(menu).items) {
		if (item->Submenu() != nullptr)
			CloseWindows(item->Submenu());
	}
	if (window != nullptr)
		window->Close(menu);
}


// #pragma mark - shortcuts and targets


void
MenuModel::InstallItems(BMenu* menu, BMenu* root, const BMessenger& target)
{
	Of(menu).root = root;
	Of(menu).target = target;
	for (BMenuItem* item : Of(menu).items) {
		if (!item->Messenger().IsValid())
			item->SetTarget(target);
		if (item->Submenu() != nullptr)
			InstallItems(item->Submenu(), root, target);
	}
}


// The table outlasts items that other threads take out of closed menus: each call looks whether its item is there.
void
MenuModel::AddShortcuts(BMenu* menu, BMenu* root, BWindow* window)
{
	for (BMenuItem* item : Of(menu).items) {
		if (item->Submenu() != nullptr)
			AddShortcuts(item->Submenu(), root, window);
		uint32 modifiers;
		const char key = item->Shortcut(&modifiers);
		if (key == 0)
			continue;
		Shortcut shortcut;
		shortcut.key = static_cast<uint8>(key);
		shortcut.modifiers = modifiers;
		shortcut.owner = root;
		shortcut.invoke = [item, serial = Of(item).serial, root] {
			if (Contains(root, item) && Of(item).serial == serial && item->IsEnabled())
				Invoke(item);
		};
		WindowData::Of(window).shortcuts.Add(std::move(shortcut));
	}
}


void
MenuModel::Install(BMenu* bar, BWindow* window)
{
	WindowData::Of(window).shortcuts.RemoveOwnedBy(bar);
	InstallItems(bar, bar, BMessenger(window));
	AddShortcuts(bar, bar, window);
}


void
MenuModel::UninstallItems(BMenu* menu)
{
	Of(menu).root = nullptr;
	for (BMenuItem* item : Of(menu).items) {
		if (item->Submenu() != nullptr)
			UninstallItems(item->Submenu());
	}
}


void
MenuModel::Uninstall(BMenu* bar, BWindow* window)
{
	WindowData::Of(window).shortcuts.RemoveOwnedBy(bar);
	UninstallItems(bar);
}


// Another thread than the window's, such as one that adds items while a menu opens, must not wait for the window.
void
MenuModel::InstallAgain(BMenu* menu)
{
	BMenu* root = Of(menu).root;
	if (root == nullptr)
		return;
	const BMessenger target = Of(menu).target;
	BLooper* looper = nullptr;
	target.Target(&looper);
	if (looper != nullptr && looper->IsLocked()) {
		Install(root, static_cast<BWindow*>(looper));
		return;
	}
	InstallItems(menu, root, target);
	BMessenger(root).SendMessage(kMsgInstallItems);
}

} // namespace BPrivate
