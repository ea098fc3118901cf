// SPDX-License-Identifier: MIT
// One choice of a menu.
#ifndef _MENU_ITEM_H
#define _MENU_ITEM_H

#include <memory>

#include <Archivable.h>
#include <Invoker.h>
#include <Menu.h>

class BMessage;
class BWindow;

namespace BPrivate {
class MenuItemData;
class MenuModel;
} // namespace BPrivate

/// A choice of a menu: a label, a mark, a shortcut, and a message that choosing it sends; or the way to
/// a submenu.
///
/// An item belongs to the menu that it was added to, and owns its message and its submenu. As long as
/// its menu is in no window it needs no lock; then its setters take the lock of the menu's own
/// little window themselves, but an item of a menu bar needs its window locked.
class BMenuItem : public BArchivable, public BInvoker {
public:
	/// Takes over \a message, which may be null. \a shortcut 0: none; Command is implied in
	/// \a modifiers unless they have B_NO_COMMAND_KEY.
	BMenuItem(const char* label, BMessage* message, char shortcut = 0, uint32 modifiers = 0);
	/// The way to \a menu, which the item owns from here on; its name becomes the label.
	BMenuItem(BMenu* menu, BMessage* message = NULL);
	BMenuItem(BMessage* archive);
	virtual ~BMenuItem();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	/// Copied; null is an empty label.
	virtual void SetLabel(const char* name);
	virtual void SetEnabled(bool enable);
	/// In a menu of radio mode the other items lose their marks.
	virtual void SetMarked(bool mark);
	/// The letter that chooses the item while its menu is open, and is underlined; 0: one is chosen.
	virtual void SetTrigger(char trigger);
	/// Works while the menu is attached to a window by a menu bar, also when it is a submenu of it.
	virtual void SetShortcut(char shortcut, uint32 modifiers);

	const char* Label() const;
	/// False also when the menu is disabled, or the item's submenu.
	bool IsEnabled() const;
	bool IsMarked() const;
	char Trigger() const;
	char Shortcut(uint32* _modifiers = NULL) const;
	/// Null when the item is a choice itself.
	BMenu* Submenu() const;
	/// The menu that the item was added to, null for none.
	BMenu* Menu() const;
	/// In the coordinates of the menu; laid out when that is needed.
	BRect Frame() const;

protected:
	/// What the content needs, in pixels: the menu adds its margins, the mark, the shortcut and the arrow.
	virtual void GetContentSize(float* _width, float* _height);
	/// Draws the label at ContentLocation(), in the menu's high colour. The menu's looper is locked.
	virtual void DrawContent();
	/// Draws all of the item: background, content, mark, shortcut, arrow.
	virtual void Draw();
	/// The item becomes the selected one, or is it no longer; redraws.
	virtual void Highlight(bool highlight);
	bool IsSelected() const;
	/// Left-top of the content, in the coordinates of the menu.
	BPoint ContentLocation() const;

	/// Marks the item in a menu of radio mode, and sends a copy of \a message (null: its own) with
	/// "when" (int64), "source" (this item), "index" (int32) and "be:sender". B_BAD_VALUE without a message.
	status_t Invoke(BMessage* message = NULL) override;

private:
	friend class BMenu;
	friend class BPrivate::MenuModel;

	BMenuItem(const BMenuItem&) = delete;
	BMenuItem& operator=(const BMenuItem&) = delete;

	std::unique_ptr<BPrivate::MenuItemData> fData;
};

// A separator is at hand wherever items are.
#include <SeparatorItem.h>

#endif // _MENU_ITEM_H
