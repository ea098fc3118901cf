// SPDX-License-Identifier: MIT
// BMenuBar: its size, its picture, and how its menus are opened.
#include <MenuBar.h>

#include <algorithm>

#include <MenuItem.h>
#include <Message.h>
#include <Window.h>

#include "interface/ArchivedEnum.h"
#include "interface/MenuLook.h"
#include "interface/MenuPrivate.h"
#include "interface/MenuTracker.h"
#include "interface/WindowPrivate.h"

using BPrivate::EnumBetween;
using BPrivate::MenuData;
using BPrivate::MenuModel;
using BPrivate::MenuTracker;
using BPrivate::WindowData;

namespace {

constexpr float kBarMargin = 8;

} // namespace


BMenuBar::BMenuBar(
	BRect frame, const char* name, uint32 resizingMode, menu_layout layout, bool resizeToFit)
	: BMenu(frame, name, resizingMode, B_WILL_DRAW | B_FRAME_EVENTS, layout, resizeToFit),
	  fBorder(B_BORDER_FRAME)
{
	MenuModel::Of(this).isBar = true;
	SetItemMargins(kBarMargin, 2, kBarMargin, 2);
}


BMenuBar::BMenuBar(const char* name, menu_layout layout, uint32 flags)
	: BMenu(BRect(0, 0, 0, 0), name, B_FOLLOW_LEFT_RIGHT | B_FOLLOW_TOP, flags, layout, true),
	  fBorder(B_BORDER_FRAME)
{
	MenuModel::Of(this).isBar = true;
	SetItemMargins(kBarMargin, 2, kBarMargin, 2);
}


BMenuBar::BMenuBar(BMessage* archive)
	: BMenu(archive),
	  fBorder(EnumBetween(archive->GetInt32("_border", B_BORDER_FRAME), B_BORDER_FRAME,
		  B_BORDER_EACH_ITEM, B_BORDER_FRAME))
{
	MenuModel::Of(this).isBar = true;
	MenuModel::Of(this).resizeToFit = archive->GetBool("_rsize_to_fit", true);
	SetItemMargins(kBarMargin, 2, kBarMargin, 2);
}


BMenuBar::~BMenuBar() {}


BArchivable*
BMenuBar::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BMenuBar") ? new BMenuBar(archive) : NULL;
}


status_t
BMenuBar::Archive(BMessage* archive, bool deep) const
{
	status_t status = BMenu::Archive(archive, deep);
	if (status == B_OK)
		status = archive->AddBool("_rsize_to_fit", MenuModel::Of(this).resizeToFit);
	if (status == B_OK && fBorder != B_BORDER_FRAME)
		status = archive->AddInt32("_border", fBorder);
	return status;
}


void
BMenuBar::AttachedToWindow()
{
	MenuModel::Install(this, Window());
	if (!MenuModel::Of(this).isFieldBar)
		Window()->SetKeyMenuBar(this);
	BMenu::AttachedToWindow();
	if (!MenuModel::Of(this).isFieldBar)
		ResizeToPreferred();
}


void
BMenuBar::DetachedFromWindow()
{
	BWindow* window = Window();
	WindowData& data = WindowData::Of(window);
	if (data.openBar == this) {
		// The menus go at once: what they belong to may be deleted next.
		MenuTracker::End(data.menuTracker);
		data.openBar = nullptr;
		data.menuTracker = BMessenger();
		window->PostMessage(_MENUS_DONE_);
	}
	MenuModel::CloseWindows(this);
	MenuModel::Uninstall(this, window);
	BMenu::DetachedFromWindow();
}


void
BMenuBar::AllAttached()
{
	BMenu::AllAttached();
}


void
BMenuBar::AllDetached()
{
	BMenu::AllDetached();
}


void
BMenuBar::WindowActivated(bool state)
{
	BMenu::WindowActivated(state);
}


void
BMenuBar::MakeFocus(bool state)
{
	BMenu::MakeFocus(state);
}


void
BMenuBar::FrameMoved(BPoint newPosition)
{
	BMenu::FrameMoved(newPosition);
}


void
BMenuBar::FrameResized(float newWidth, float newHeight)
{
	BMenu::FrameResized(newWidth, newHeight);
}


void
BMenuBar::Show()
{
	BMenu::Show();
}


void
BMenuBar::Hide()
{
	BMenu::Hide();
}


// As high as its items; as wide as what it lies in where it keeps to both sides, else as its items.
void
BMenuBar::GetPreferredSize(float* _width, float* _height)
{
	BMenu::GetPreferredSize(_width, _height);
	const MenuData& data = MenuModel::Of(this);
	if (_width == NULL || data.isFieldBar)
		return;
	const bool followsSides = (ResizingMode() & B_FOLLOW_LEFT_RIGHT) == B_FOLLOW_LEFT_RIGHT;
	if (!data.resizeToFit)
		*_width = Frame().Width();
	else if (followsSides && Window() != NULL)
		*_width = Parent() != NULL ? Parent()->Bounds().Width() : Window()->Bounds().Width();
}


void
BMenuBar::ResizeToPreferred()
{
	float width, height;
	GetPreferredSize(&width, &height);
	if (Layout() == B_ITEMS_IN_COLUMN && !MenuModel::Of(this).resizeToFit)
		height = std::max(height, Frame().Height());
	ResizeTo(width, height);
}


void
BMenuBar::Draw(BRect updateRect)
{
	const BRect bounds = Bounds();
	SetHighColor(BPrivate::MenuLineColor());
	switch (fBorder) {
		case B_BORDER_CONTENTS:
		case B_BORDER_FRAME:
			StrokeLine(bounds.LeftBottom(), bounds.RightBottom());
			break;
		case B_BORDER_EACH_ITEM:
			StrokeLine(bounds.LeftBottom(), bounds.RightBottom());
			for (int32 i = 0; i < CountItems(); i++) {
				const BRect item = ItemAt(i)->Frame();
				StrokeLine(item.RightTop(), item.RightBottom());
			}
			break;
	}
	BMenu::Draw(updateRect);
}


void
BMenuBar::MessageReceived(BMessage* message)
{
	switch (message->what) {
		case BPrivate::kMsgOpenMenuBar:
			StartMenuBar(-1, true, false);
			break;

		case BPrivate::kMsgInstallItems:
			MenuModel::Install(this, Window());
			break;

		default:
			BMenu::MessageReceived(message);
			break;
	}
}


void
BMenuBar::MouseDown(BPoint where)
{
	BMenuItem* item = MenuModel::ItemAt(this, where);
	if (item == NULL || !MenuModel::CanBeChosen(item))
		return;
	SetMouseEventMask(B_POINTER_EVENTS, B_LOCK_WINDOW_FOCUS);
	StartMenuBar(IndexOf(item), false, true);
}


void
BMenuBar::MouseUp(BPoint where)
{
	BMenu::MouseUp(where);
}


void
BMenuBar::MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage)
{
	BMenu::MouseMoved(where, code, dragMessage);
}


void
BMenuBar::SetBorder(menu_bar_border border)
{
	fBorder = border;
	if (Window() != NULL)
		Invalidate();
}


menu_bar_border
BMenuBar::Border() const
{
	return fBorder;
}


void
BMenuBar::StartMenuBar(int32 menuIndex, bool sticky, bool showMenu, BRect* special_rect)
{
	if (Window() == NULL || !IsEnabled() || MenuModel::Next(this, NULL, true) == NULL)
		return;

	BPrivate::MenuStart start;
	start.menu = this;
	start.index = menuIndex;
	start.opensItem = showMenu;
	start.selectsFirst = sticky && showMenu;
	start.staysOpen = sticky;
	if (special_rect != NULL)
		start.clickThrough = *special_rect;
	MenuTracker::Start(start);
}
