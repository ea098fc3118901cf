// SPDX-License-Identifier: MIT
// BMenu: its making, its hooks and its modes.
#include <Menu.h>

#include <algorithm>
#include <cmath>

#include <Font.h>
#include <MenuItem.h>
#include <Message.h>
#include <Region.h>
#include <Screen.h>
#include <Window.h>

#include "interface/ArchivedEnum.h"
#include "interface/MenuInfo.h"
#include "interface/MenuLook.h"
#include "interface/MenuPrivate.h"
#include "interface/MenuTracker.h"
#include "interface/MenuWindow.h"

using BPrivate::EnumBetween;
using BPrivate::MenuData;
using BPrivate::MenuLock;
using BPrivate::MenuModel;
using BPrivate::MenuWindow;

namespace {

constexpr float kMarginAbove = 2;
constexpr float kMarginBelow = 2;

} // namespace


BMenu::BMenu(BRect frame, const char* name, uint32 resizeMask, uint32 flags, menu_layout layout,
	bool resizeToFit)
	: BView(frame, name, resizeMask, flags | B_FULL_UPDATE_ON_RESIZE),
	  fData(std::make_unique<MenuData>(layout))
{
	fData->resizeToFit = resizeToFit;
	SetItemMargins(BPrivate::kMarkWidth, kMarginAbove, BPrivate::kArrowWidth, kMarginBelow);
	SetViewColor(BPrivate::MenuBackgroundColor());
	SetLowColor(BPrivate::MenuBackgroundColor());
	const BFont font = BPrivate::MenuFont();
	SetFont(&font, B_FONT_FAMILY_AND_STYLE | B_FONT_SIZE);
}


BMenu::BMenu(const char* name, menu_layout layout)
	: BMenu(BRect(0, 0, 0, 0), name, B_FOLLOW_NONE, B_WILL_DRAW, layout, true)
{
}


BMenu::BMenu(const char* name, float width, float height)
	: BMenu(BRect(0, 0, 0, 0), name, B_FOLLOW_NONE, B_WILL_DRAW, B_ITEMS_IN_MATRIX, false)
{
	fData->matrixSize = BSize(width, height);
}


BMenu::BMenu(BMessage* archive)
	: BView(archive),
	  fData(std::make_unique<MenuData>(EnumBetween(archive->GetInt32("_layout", B_ITEMS_IN_ROW),
		  B_ITEMS_IN_ROW, B_ITEMS_IN_MATRIX, B_ITEMS_IN_ROW)))
{
	SetItemMargins(BPrivate::kMarkWidth, kMarginAbove, BPrivate::kArrowWidth, kMarginBelow);
	fData->matrixSize = Bounds().Size();
	fData->enabled = !archive->GetBool("_disable", false);
	fData->radioMode = archive->GetBool("_radio", false);
	fData->triggersEnabled = !archive->GetBool("_trig_disabled", false);
	fData->labelFromMarked = archive->GetBool("_dyn_label", false);
	fData->maxContentWidth = archive->GetFloat("_maxwidth", 0);

	BMessage archived;
	for (int32 i = 0; archive->FindMessage("_items", i, &archived) == B_OK; i++) {
		BArchivable* object = instantiate_object(&archived);
		BMenuItem* item = dynamic_cast<BMenuItem*>(object);
		BRect frame;
		bool added = false;
		if (item != NULL && fData->layout == B_ITEMS_IN_MATRIX
			&& archive->FindRect("_i_frames", i, &frame) == B_OK)
			added = AddItem(item, frame);
		else if (item != NULL)
			added = AddItem(item);
		if (!added)
			delete object;
	}
}


BMenu::~BMenu()
{
	BPrivate::MenuTracker::MenuGoes(this);
	MenuModel::CloseWindows(this);
	RemoveItems(0, CountItems(), true);
	if (fData->superitem != NULL)
		MenuModel::Of(fData->superitem).submenu = NULL;
}


BArchivable*
BMenu::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BMenu") ? new BMenu(archive) : NULL;
}


status_t
BMenu::Archive(BMessage* archive, bool deep) const
{
	status_t status = BView::Archive(archive, deep);
	if (status == B_OK && fData->layout != B_ITEMS_IN_ROW)
		status = archive->AddInt32("_layout", fData->layout);
	if (status == B_OK && !fData->enabled)
		status = archive->AddBool("_disable", true);
	if (status == B_OK)
		status = archive->AddBool("_radio", fData->radioMode);
	if (status == B_OK)
		status = archive->AddBool("_trig_disabled", !fData->triggersEnabled);
	if (status == B_OK)
		status = archive->AddBool("_dyn_label", fData->labelFromMarked);
	if (status == B_OK)
		status = archive->AddFloat("_maxwidth", fData->maxContentWidth);
	if (!deep)
		return status;

	for (const BMenuItem* item : fData->items) {
		if (status != B_OK)
			return status;
		BMessage archived;
		status = item->Archive(&archived, true);
		if (status == B_OK)
			status = archive->AddMessage("_items", &archived);
		if (status == B_OK && fData->layout == B_ITEMS_IN_MATRIX)
			status = archive->AddRect("_i_frames", MenuModel::Of(item).frame);
	}
	return status;
}


// #pragma mark - hooks


void
BMenu::AttachedToWindow()
{
	BView::AttachedToWindow();
	MenuModel::LayOut(this);
}


void
BMenu::DetachedFromWindow()
{
	MenuModel::Select(this, NULL);
	BView::DetachedFromWindow();
}


void
BMenu::AllAttached()
{
	BView::AllAttached();
}


void
BMenu::AllDetached()
{
	BView::AllDetached();
}


void
BMenu::Draw(BRect updateRect)
{
	MenuModel::LayOut(this);
	DrawBackground(updateRect);
	// The update may be several small places: only the items that lie there are drawn.
	BRegion region;
	GetClippingRegion(&region);
	for (BMenuItem* item : fData->items) {
		if (region.Intersects(MenuModel::Of(item).frame))
			MenuModel::DrawItem(item);
	}
}


void
BMenu::DrawBackground(BRect)
{
}


void
BMenu::MessageReceived(BMessage* message)
{
	BView::MessageReceived(message);
}


void
BMenu::KeyDown(const char* bytes, int32 numBytes)
{
	BView::KeyDown(bytes, numBytes);
}


void
BMenu::GetPreferredSize(float* _width, float* _height)
{
	MenuModel::LayOut(this);
	if (_width != NULL)
		*_width = fData->size.width;
	if (_height != NULL)
		*_height = fData->size.height;
}


void
BMenu::ResizeToPreferred()
{
	BView::ResizeToPreferred();
}


void
BMenu::FrameMoved(BPoint newPosition)
{
	BView::FrameMoved(newPosition);
}


void
BMenu::FrameResized(float newWidth, float newHeight)
{
	BView::FrameResized(newWidth, newHeight);
}


void
BMenu::MakeFocus(bool focus)
{
	BView::MakeFocus(focus);
}


bool
BMenu::AddDynamicItem(add_state)
{
	return false;
}


// #pragma mark - opening


// Beside the item that leads here, or below it where items stand in a row.
BPoint
BMenu::ScreenLocation()
{
	BMenu* super = Supermenu();
	if (super == NULL)
		return BPoint(0, 0);

	const BRect item = Superitem()->Frame();
	if (MenuModel::Of(super).layout == B_ITEMS_IN_ROW)
		return super->ConvertToScreen(BPoint(item.left + BPrivate::kMenuBorder,
			item.bottom + 1 + BPrivate::kMenuBorder + BPrivate::kMenuPadding));
	return super->ConvertToScreen(BPoint(item.right + 1 + BPrivate::kMenuBorder, item.top));
}


void
BMenu::Show()
{
	BView::Show();
}


void
BMenu::Show(bool selectFirstItem)
{
	if (Window() == NULL && !MenuWindow::Open(this, ScreenLocation()))
		return;
	MenuLock lock(this);
	if (selectFirstItem)
		MenuModel::Select(this, MenuModel::Next(this, NULL, true));
}


void
BMenu::Hide()
{
	if (dynamic_cast<MenuWindow*>(Window()) != NULL)
		MenuModel::CloseWindows(this);
	else
		BView::Hide();
}


BMenuItem*
BMenu::Track(bool startOpened, BRect* specialRect)
{
	BPrivate::MenuStart start;
	start.menu = this;
	start.staysOpen = startOpened;
	if (specialRect != NULL)
		start.clickThrough = *specialRect;
	return BPrivate::MenuTracker::TrackAndWait(start);
}


// #pragma mark - modes


status_t
BMenu::SetTargetForItems(BHandler* target)
{
	status_t status = B_OK;
	for (size_t i = 0; i < fData->items.size() && status == B_OK; i++)
		status = fData->items[i]->SetTarget(target);
	return status;
}


status_t
BMenu::SetTargetForItems(BMessenger messenger)
{
	status_t status = B_OK;
	for (size_t i = 0; i < fData->items.size() && status == B_OK; i++)
		status = fData->items[i]->SetTarget(messenger);
	return status;
}


void
BMenu::SetEnabled(bool enable)
{
	if (fData->enabled == enable)
		return;
	{
		MenuLock lock(this);
		fData->enabled = enable;
		if (Window() != NULL)
			Invalidate();
	}
	if (fData->superitem != NULL && Supermenu() != NULL) {
		MenuLock lock(Supermenu());
		MenuModel::Redraw(fData->superitem);
	}
}


bool
BMenu::IsEnabled() const
{
	if (!fData->enabled)
		return false;
	return Supermenu() == NULL || Supermenu()->IsEnabled();
}


void
BMenu::SetRadioMode(bool on)
{
	fData->radioMode = on;
	if (!on)
		SetLabelFromMarked(false);
}


bool
BMenu::IsRadioMode() const
{
	return fData->radioMode;
}


void
BMenu::SetLabelFromMarked(bool on)
{
	fData->labelFromMarked = on;
	if (on)
		SetRadioMode(true);
}


bool
BMenu::IsLabelFromMarked()
{
	return fData->labelFromMarked;
}


void
BMenu::SetTriggersEnabled(bool enable)
{
	MenuLock lock(this);
	fData->triggersEnabled = enable;
	MenuModel::Changed(this);
}


bool
BMenu::AreTriggersEnabled() const
{
	return fData->triggersEnabled;
}


void
BMenu::SetMaxContentWidth(float maxWidth)
{
	MenuLock lock(this);
	fData->maxContentWidth = maxWidth;
	MenuModel::Changed(this);
}


float
BMenu::MaxContentWidth() const
{
	return fData->maxContentWidth;
}


void
BMenu::SetItemMargins(float left, float top, float right, float bottom)
{
	MenuLock lock(this);
	fData->left = left;
	fData->top = top;
	fData->right = right;
	fData->bottom = bottom;
	MenuModel::Changed(this);
}


void
BMenu::GetItemMargins(float* _left, float* _top, float* _right, float* _bottom) const
{
	if (_left != NULL)
		*_left = fData->left;
	if (_top != NULL)
		*_top = fData->top;
	if (_right != NULL)
		*_right = fData->right;
	if (_bottom != NULL)
		*_bottom = fData->bottom;
}


menu_layout
BMenu::Layout() const
{
	return fData->layout;
}
