// SPDX-License-Identifier: MIT
// MenuModel: where the items of a menu are, and which letters are their triggers.
#include <algorithm>
#include <cctype>
#include <cmath>
#include <cstring>
#include <string>

#include <Font.h>
#include <MenuBar.h>
#include <Window.h>

#include "interface/MenuLook.h"
#include "interface/MenuPrivate.h"
#include "interface/MenuWindow.h"

namespace BPrivate {

namespace {

BRect
Bounding(const std::vector<BMenuItem*>& items)
{
	BRect frame;
	for (const BMenuItem* item : items) {
		const BRect other = MenuModel::Of(item).frame;
		frame = frame.IsValid() ? frame | other : other;
	}
	return frame;
}

} // namespace


void
MenuModel::LayOut(BMenu* menu)
{
	MenuData& data = Of(menu);
	if (data.isLaidOut)
		return;
	data.isLaidOut = true;

	font_height metrics;
	menu->GetFontHeight(&metrics);
	data.ascent = std::ceil(metrics.ascent);
	data.textHeight = data.ascent + std::ceil(metrics.descent);
	switch (data.layout) {
		case B_ITEMS_IN_ROW:
			LayOutRow(menu);
			break;
		case B_ITEMS_IN_COLUMN:
			LayOutColumn(menu);
			break;
		case B_ITEMS_IN_MATRIX:
			data.size = data.matrixSize;
			if (data.size.width <= 0 || data.size.height <= 0) {
				const BRect all = Bounding(data.items);
				data.size = BSize(all.right, all.bottom);
			}
			break;
	}
	ChooseTriggers(menu);
}


void
MenuModel::LayOutColumn(BMenu* menu)
{
	MenuData& data = Of(menu);
	float content = 0;
	float shortcuts = 0;
	float y = 0;
	for (BMenuItem* item : data.items) {
		float width = 0;
		float height = 0;
		item->GetContentSize(&width, &height);
		if (data.maxContentWidth > 0)
			width = std::min(width, data.maxContentWidth);
		content = std::max(content, std::ceil(width));
		const BString text = ShortcutText(Of(item).shortcut, Of(item).modifiers);
		if (!text.IsEmpty())
			shortcuts = std::max(shortcuts, std::ceil(menu->StringWidth(text.String())));
		height = std::ceil(height) + data.top + data.bottom;
		Of(item).frame.Set(0, y, 0, y + height - 1);
		y += height;
	}

	data.shortcutWidth = shortcuts > 0 && !data.isBar ? kShortcutGap + shortcuts : 0;
	float width = data.left + content + data.shortcutWidth + data.right;
	width = std::max(width, data.minWidth + 1);
	if (data.isBar && menu->Window() != nullptr && !data.resizeToFit)
		width = std::max(width, menu->Bounds().Width() + 1);
	for (BMenuItem* item : data.items)
		Of(item).frame.right = width - 1;
	data.size = BSize(width - 1, std::max(y, data.textHeight + data.top + data.bottom) - 1);
}


// The bottom line of a bar is its border.
void
MenuModel::LayOutRow(BMenu* menu)
{
	MenuData& data = Of(menu);
	data.shortcutWidth = 0;
	float tallest = data.textHeight;
	float x = 0;
	for (BMenuItem* item : data.items) {
		float width = 0;
		float height = 0;
		item->GetContentSize(&width, &height);
		if (data.maxContentWidth > 0)
			width = std::min(width, data.maxContentWidth);
		width = std::ceil(width) + data.left + data.right;
		Of(item).frame.Set(x, 0, x + width - 1, 0);
		tallest = std::max(tallest, std::ceil(height));
		x += width;
	}
	const float bottom = tallest + data.top + data.bottom - 1;
	for (BMenuItem* item : data.items)
		Of(item).frame.bottom = bottom;
	data.size = BSize(x - 1, bottom + (data.isBar && !data.isFieldBar ? 1 : 0));
	if (data.isFieldBar && !data.items.empty() && menu->Window() != nullptr)
		Of(data.items[0]).frame = menu->Bounds();
}


// What the program chose comes first; then each item gets the first capital, else the first letter, that is left.
void
MenuModel::ChooseTriggers(BMenu* menu)
{
	std::string taken;
	const auto fold = [](char letter) {
		return static_cast<char>(std::tolower(static_cast<unsigned char>(letter)));
	};
	const auto isFree = [&](char letter) {
		return std::isalnum(static_cast<unsigned char>(letter)) != 0
			&& taken.find(fold(letter)) == std::string::npos;
	};
	const auto give = [&](MenuItemData& item, char letter, int32 index) {
		item.trigger = letter;
		item.triggerIndex = index;
		taken.push_back(fold(letter));
	};

	MenuData& data = Of(menu);
	for (BMenuItem* item : data.items) {
		MenuItemData& fields = Of(item);
		fields.trigger = 0;
		fields.triggerIndex = -1;
		if (fields.wantedTrigger == 0 || !data.triggersEnabled)
			continue;
		int32 index = fields.label.FindFirst(fields.wantedTrigger);
		for (int32 i = 0; index < 0 && i < fields.label.Length(); i++) {
			if (fold(fields.label[i]) == fold(fields.wantedTrigger))
				index = i;
		}
		give(fields, fields.wantedTrigger, index);
	}
	if (!data.triggersEnabled)
		return;

	for (BMenuItem* item : data.items) {
		MenuItemData& fields = Of(item);
		const bool isSeparator = dynamic_cast<BSeparatorItem*>(item) != nullptr;
		for (int32 pass = 0; pass < 2 && fields.trigger == 0 && !isSeparator; pass++) {
			for (int32 i = 0; i < fields.label.Length() && fields.trigger == 0; i++) {
				const char letter = fields.label[i];
				const bool fits = pass == 1 || std::isupper(static_cast<unsigned char>(letter));
				if (fits && isFree(letter))
					give(fields, letter, i);
			}
		}
	}
}


void
MenuModel::Changed(BMenu* menu)
{
	MenuData& data = Of(menu);
	data.isLaidOut = false;
	if (menu->Window() == nullptr)
		return;
	auto window = dynamic_cast<MenuWindow*>(menu->Window());
	if (window != nullptr) {
		window->Refit(menu);
		return;
	}
	if (data.isBar && data.resizeToFit && !data.isFieldBar)
		menu->ResizeToPreferred();
	menu->Invalidate();
}


void
MenuModel::Redraw(BMenuItem* item)
{
	BMenu* menu = Of(item).super;
	if (menu != nullptr && menu->Window() != nullptr)
		menu->Invalidate(Of(item).frame);
}


BMenuItem*
MenuModel::ItemAt(BMenu* menu, BPoint where)
{
	LayOut(menu);
	const BPoint pixel(std::floor(where.x), std::floor(where.y));
	if (!menu->Bounds().Contains(pixel))
		return nullptr;
	for (BMenuItem* item : Of(menu).items) {
		if (Of(item).frame.Contains(pixel))
			return item;
	}
	return nullptr;
}

} // namespace BPrivate
