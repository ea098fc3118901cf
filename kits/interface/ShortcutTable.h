// SPDX-License-Identifier: MIT
// The keys of a window that send messages.
#ifndef INTERFACE_SHORTCUT_TABLE_H
#define INTERFACE_SHORTCUT_TABLE_H

#include <functional>
#include <memory>
#include <vector>

#include <Message.h>
#include <SupportDefs.h>

class BMessage;

namespace BPrivate {

/// Who gets a shortcut's message.
enum class ShortcutTarget { kWindow, kFocus, kHandler };


struct Shortcut {
	/// In lower case.
	uint32 key = 0;
	/// Of Shift, Command, Control and Option, the general bits only.
	uint32 modifiers = 0;
	std::unique_ptr<BMessage> message;
	ShortcutTarget target = ShortcutTarget::kWindow;
	int32 handlerToken = -1;
	/// Instead of a message: what a menu item does. \a owner names it for removal.
	std::function<void()> invoke;
	const void* owner = nullptr;
};


/// The shortcuts of one window. One key with one set of modifiers has one shortcut: a later one replaces
/// an earlier one. Window locked.
class ShortcutTable {
public:
	/// Command is implied in \a shortcut.modifiers unless they have B_NO_COMMAND_KEY.
	void Add(Shortcut shortcut);
	bool Remove(uint32 key, uint32 modifiers);
	void RemoveOwnedBy(const void* owner);
	bool Has(uint32 key, uint32 modifiers) const;

	/// For a key press: \a modifiers are exactly those held; other bits do not count.
	const Shortcut* Find(uint32 key, uint32 modifiers) const;

private:
	std::vector<Shortcut> fShortcuts;
};

} // namespace BPrivate

#endif // INTERFACE_SHORTCUT_TABLE_H
