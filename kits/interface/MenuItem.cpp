// SPDX-License-Identifier: MIT
// BMenuItem: its states, its picture, and what choosing it does.
#include <MenuItem.h>

#include <algorithm>
#include <atomic>
#include <cmath>

#include <Message.h>
#include <OS.h>

#include "interface/MenuLook.h"
#include "interface/MenuPrivate.h"

using BPrivate::MenuData;
using BPrivate::MenuItemData;
using BPrivate::MenuLock;
using BPrivate::MenuModel;

namespace {

uint32
ShortcutModifiers(char shortcut, uint32 modifiers)
{
	if (shortcut == 0 || (modifiers & B_NO_COMMAND_KEY) != 0)
		return modifiers;
	return modifiers | B_COMMAND_KEY;
}

} // namespace


BMenuItem::BMenuItem(const char* label, BMessage* message, char shortcut, uint32 modifiers)
	: BInvoker(message, NULL),
	  fData(std::make_unique<MenuItemData>())
{
	static std::atomic<uint64> sLastSerial(0);
	fData->serial = ++sLastSerial;
	fData->label = label;
	fData->shortcut = shortcut;
	fData->modifiers = ShortcutModifiers(shortcut, modifiers);
}


BMenuItem::BMenuItem(BMenu* menu, BMessage* message)
	: BMenuItem(menu != NULL ? menu->Name() : NULL, message)
{
	if (menu == NULL)
		return;
	fData->submenu = menu;
	MenuModel::Of(menu).superitem = this;
	if (menu->IsLabelFromMarked() && menu->FindMarked() != NULL)
		fData->label = menu->FindMarked()->Label();
}


BMenuItem::BMenuItem(BMessage* archive)
	: BMenuItem(archive->GetString("_label", ""), NULL,
		static_cast<char>(archive->GetInt32("_shortcut", 0)), archive->GetInt32("_mods", 0))
{
	fData->enabled = !archive->GetBool("_disable", false);
	fData->marked = archive->GetBool("_marked", false);
	fData->wantedTrigger = static_cast<char>(archive->GetInt32("_user_trig", 0));

	BMessage message;
	if (archive->FindMessage("_msg", &message) == B_OK)
		SetMessage(new BMessage(message));
	BMessage submenu;
	if (archive->FindMessage("_submenu", &submenu) != B_OK)
		return;
	BArchivable* object = instantiate_object(&submenu);
	BMenu* menu = dynamic_cast<BMenu*>(object);
	if (menu == NULL) {
		delete object;
		return;
	}
	fData->submenu = menu;
	MenuModel::Of(menu).superitem = this;
}


BMenuItem::~BMenuItem()
{
	if (fData->super != NULL)
		fData->super->RemoveItem(this);
	delete fData->submenu;
}


BArchivable*
BMenuItem::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BMenuItem") ? new BMenuItem(archive) : NULL;
}


status_t
BMenuItem::Archive(BMessage* archive, bool deep) const
{
	status_t status = BArchivable::Archive(archive, deep);
	if (status == B_OK && !fData->label.IsEmpty())
		status = archive->AddString("_label", fData->label);
	if (status == B_OK && !fData->enabled)
		status = archive->AddBool("_disable", true);
	if (status == B_OK && fData->marked)
		status = archive->AddBool("_marked", true);
	if (status == B_OK && fData->wantedTrigger != 0)
		status = archive->AddInt32("_user_trig", fData->wantedTrigger);
	if (status == B_OK && fData->shortcut != 0) {
		status = archive->AddInt32("_shortcut", fData->shortcut);
		if (status == B_OK)
			status = archive->AddInt32("_mods", fData->modifiers);
	}
	if (status == B_OK && Message() != NULL)
		status = archive->AddMessage("_msg", Message());
	if (status != B_OK || !deep || fData->submenu == NULL)
		return status;

	BMessage submenu;
	status = fData->submenu->Archive(&submenu, true);
	return status == B_OK ? archive->AddMessage("_submenu", &submenu) : status;
}


void
BMenuItem::SetLabel(const char* name)
{
	MenuLock lock(fData->super);
	if (fData->label == (name != NULL ? name : ""))
		return;
	fData->label = name;
	if (fData->super != NULL)
		MenuModel::Changed(fData->super);
}


void
BMenuItem::SetEnabled(bool enable)
{
	MenuLock lock(fData->super);
	if (fData->enabled == enable)
		return;
	fData->enabled = enable;
	MenuModel::Redraw(this);
}


void
BMenuItem::SetMarked(bool mark)
{
	BMenu* super = fData->super;
	bool isShownAbove = false;
	BString label;
	{
		MenuLock lock(super);
		if (mark && super != NULL && super->IsRadioMode()) {
			for (BMenuItem* item : MenuModel::Of(super).items) {
				if (item != this && item->IsMarked())
					item->SetMarked(false);
			}
			isShownAbove = super->IsLabelFromMarked();
			label = fData->label;
		}
		if (fData->marked != mark) {
			fData->marked = mark;
			MenuModel::Redraw(this);
		}
	}
	// Not with the menu's own lock: the item above may be in another window.
	if (isShownAbove && super->Superitem() != NULL)
		super->Superitem()->SetLabel(label.String());
}


void
BMenuItem::SetTrigger(char trigger)
{
	MenuLock lock(fData->super);
	fData->wantedTrigger = trigger;
	if (fData->super != NULL)
		MenuModel::Changed(fData->super);
}


void
BMenuItem::SetShortcut(char shortcut, uint32 modifiers)
{
	MenuLock lock(fData->super);
	fData->shortcut = shortcut;
	fData->modifiers = ShortcutModifiers(shortcut, modifiers);
	if (fData->super == NULL)
		return;
	MenuModel::Changed(fData->super);
	MenuModel::InstallAgain(fData->super);
}


const char*
BMenuItem::Label() const
{
	return fData->label.String();
}


bool
BMenuItem::IsEnabled() const
{
	if (!fData->enabled || (fData->submenu != NULL && !MenuModel::Of(fData->submenu).enabled))
		return false;
	return fData->super == NULL || fData->super->IsEnabled();
}


bool
BMenuItem::IsMarked() const
{
	return fData->marked;
}


char
BMenuItem::Trigger() const
{
	return fData->wantedTrigger;
}


char
BMenuItem::Shortcut(uint32* _modifiers) const
{
	if (_modifiers != NULL)
		*_modifiers = fData->modifiers;
	return fData->shortcut;
}


BMenu*
BMenuItem::Submenu() const
{
	return fData->submenu;
}


BMenu*
BMenuItem::Menu() const
{
	return fData->super;
}


BRect
BMenuItem::Frame() const
{
	if (fData->super == NULL)
		return BRect();
	MenuLock lock(fData->super);
	MenuModel::LayOut(fData->super);
	return fData->frame;
}


void
BMenuItem::GetContentSize(float* _width, float* _height)
{
	float width = 0;
	float height = 0;
	if (fData->super != NULL) {
		font_height metrics;
		fData->super->GetFontHeight(&metrics);
		width = std::ceil(fData->super->StringWidth(fData->label.String()));
		height = std::ceil(metrics.ascent) + std::ceil(metrics.descent);
	}
	if (_width != NULL)
		*_width = width;
	if (_height != NULL)
		*_height = height;
}


BPoint
BMenuItem::ContentLocation() const
{
	if (fData->super == NULL)
		return fData->frame.LeftTop();
	const MenuData& menu = MenuModel::Of(fData->super);
	return BPoint(fData->frame.left + menu.left, fData->frame.top + menu.top);
}


void
BMenuItem::DrawContent()
{
	BMenu* super = fData->super;
	if (super == NULL)
		return;

	const MenuData& menu = MenuModel::Of(super);
	const BPoint where = ContentLocation();
	float room = fData->frame.right - menu.right - menu.shortcutWidth - where.x + 1;
	if (menu.maxContentWidth > 0)
		room = std::min(room, menu.maxContentWidth);
	BString label(fData->label);
	// A fraction of a pixel that is missing cuts nothing.
	const bool isCut = super->StringWidth(label.String()) > room + 1;
	if (isCut)
		super->TruncateString(&label, B_TRUNCATE_END, room);

	const BPoint baseline(where.x, where.y + menu.ascent);
	super->SetDrawingMode(B_OP_OVER);
	super->DrawString(label.String(), baseline);
	super->SetDrawingMode(B_OP_COPY);

	if (!menu.triggersEnabled || fData->triggerIndex < 0 || isCut)
		return;
	const float before = super->StringWidth(label.String(), fData->triggerIndex);
	const float width = super->StringWidth(label.String() + fData->triggerIndex, 1);
	const float left = std::floor(baseline.x + before);
	super->StrokeLine(BPoint(left, baseline.y + 2),
		BPoint(std::max(left, std::ceil(left + width) - 2), baseline.y + 2));
}


void
BMenuItem::Draw()
{
	BMenu* super = fData->super;
	if (super == NULL)
		return;

	const MenuData& menu = MenuModel::Of(super);
	const bool isEnabled = IsEnabled();
	const bool isSelected = fData->selected && (isEnabled || fData->submenu != NULL);
	const rgb_color background = BPrivate::MenuItemBackground(isSelected);
	const rgb_color text = BPrivate::MenuTextColor(isEnabled, isSelected);
	if (isSelected) {
		super->SetHighColor(background);
		super->FillRect(fData->frame);
	}
	super->SetLowColor(background);
	super->SetHighColor(text);
	super->MovePenTo(ContentLocation());
	DrawContent();

	const BRect frame = fData->frame;
	super->SetHighColor(text);
	if (fData->marked && !menu.isBar)
		BPrivate::DrawMenuTick(super,
			BRect(frame.left, frame.top, frame.left + BPrivate::kMarkWidth - 1, frame.bottom),
			text);
	if (menu.layout != B_ITEMS_IN_COLUMN || menu.isBar)
		return;
	if (fData->submenu != NULL)
		BPrivate::DrawMenuArrow(super,
			BRect(frame.right - BPrivate::kArrowWidth + 1, frame.top, frame.right, frame.bottom),
			text);
	const BString shortcut = BPrivate::ShortcutText(fData->shortcut, fData->modifiers);
	if (shortcut.IsEmpty())
		return;
	super->SetDrawingMode(B_OP_OVER);
	super->DrawString(shortcut.String(),
		BPoint(std::floor(
				   frame.right - menu.right + 1 - std::ceil(super->StringWidth(shortcut.String()))),
			frame.top + menu.top + menu.ascent));
	super->SetDrawingMode(B_OP_COPY);
}


void
BMenuItem::Highlight(bool highlight)
{
	fData->selected = highlight;
	MenuModel::Redraw(this);
}


bool
BMenuItem::IsSelected() const
{
	return fData->selected;
}


status_t
BMenuItem::Invoke(BMessage* message)
{
	if (!IsEnabled())
		return B_ERROR;
	BMenu* super = fData->super;
	if (super != NULL && super->IsRadioMode())
		SetMarked(true);

	bool notify;
	const uint32 kind = InvokeKind(&notify);
	if (message == NULL && !notify)
		message = Message();
	const bool isWatched = super != NULL && super->IsWatched();
	if (message == NULL && !isWatched)
		return B_BAD_VALUE;

	BMessage copy(kind);
	if (message != NULL)
		copy = *message;
	copy.AddInt32("index", super != NULL ? super->IndexOf(this) : -1);
	copy.AddInt64("when", system_time());
	copy.AddPointer("source", this);
	copy.AddMessenger("be:sender", super != NULL ? BMessenger(super) : BMessenger());

	// Not by BInvoker::Invoke(), which would add fields of its own, with the invoker as the source.
	status_t status = B_BAD_VALUE;
	if (message != NULL)
		status = Messenger().SendMessage(&copy, HandlerForReply(), Timeout());
	if (isWatched)
		super->SendNotices(kind, &copy);
	return status;
}
