// SPDX-License-Identifier: MIT
// The settings of menus: the user's plain font and colours until the program sets others.
#include "interface/MenuInfo.h"

#include <mutex>
#include <optional>

#include <Menu.h>

namespace {

std::mutex sInfoLock;


std::optional<menu_info>&
ChosenInfo()
{
	static std::optional<menu_info> info;
	return info;
}

} // namespace


status_t
set_menu_info(menu_info* info)
{
	if (info == NULL)
		return B_BAD_VALUE;
	std::lock_guard lock(sInfoLock);
	ChosenInfo() = *info;
	set_ui_color(B_MENU_BACKGROUND_COLOR, info->background_color);
	return B_OK;
}


status_t
get_menu_info(menu_info* info)
{
	if (info == NULL)
		return B_BAD_VALUE;
	std::lock_guard lock(sInfoLock);
	if (ChosenInfo().has_value()) {
		*info = *ChosenInfo();
	} else {
		*info = menu_info();
		info->font_size = be_plain_font->Size();
		be_plain_font->GetFamilyAndStyle(&info->f_family, &info->f_style);
		info->click_to_open = true;
		info->triggers_always_shown = true;
	}
	info->background_color = ui_color(B_MENU_BACKGROUND_COLOR);
	return B_OK;
}


BFont
BPrivate::MenuFont()
{
	std::lock_guard lock(sInfoLock);
	BFont font(*be_plain_font);
	if (ChosenInfo().has_value()) {
		font.SetFamilyAndStyle(ChosenInfo()->f_family, ChosenInfo()->f_style);
		font.SetSize(ChosenInfo()->font_size);
	}
	return font;
}
