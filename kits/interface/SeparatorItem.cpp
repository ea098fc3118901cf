// SPDX-License-Identifier: MIT

#include <SeparatorItem.h>

#include <cmath>

#include <Menu.h>

#include "interface/MenuLook.h"
#include "interface/MenuPrivate.h"

namespace {

constexpr float kSeparatorHeight = 6;

} // namespace


BSeparatorItem::BSeparatorItem()
	: BMenuItem("", NULL)
{
	BMenuItem::SetEnabled(false);
}


BSeparatorItem::BSeparatorItem(BMessage* archive)
	: BMenuItem(archive)
{
	BMenuItem::SetEnabled(false);
}


BSeparatorItem::~BSeparatorItem() {}


BArchivable*
BSeparatorItem::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BSeparatorItem") ? new BSeparatorItem(archive) : NULL;
}


status_t
BSeparatorItem::Archive(BMessage* archive, bool deep) const
{
	return BMenuItem::Archive(archive, deep);
}


void
BSeparatorItem::SetEnabled(bool)
{
}


void
BSeparatorItem::GetContentSize(float* _width, float* _height)
{
	if (_width != NULL)
		*_width = 2;
	// The menu's margins come on top.
	if (_height != NULL)
		*_height = kSeparatorHeight - 4;
}


void
BSeparatorItem::Draw()
{
	BMenu* menu = Menu();
	if (menu == NULL)
		return;

	const BRect frame = Frame();
	menu->SetHighColor(BPrivate::MenuLineColor());
	if (BPrivate::MenuModel::Of(menu).layout == B_ITEMS_IN_ROW) {
		const float x = std::floor((frame.left + frame.right) / 2);
		menu->StrokeLine(BPoint(x, frame.top + 3), BPoint(x, frame.bottom - 3));
		return;
	}
	const float y = std::floor((frame.top + frame.bottom) / 2);
	menu->StrokeLine(BPoint(frame.left + 3, y), BPoint(frame.right - 3, y));
}
