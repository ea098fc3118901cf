// SPDX-License-Identifier: MIT
// The look of menus in the window's own pixels.
#include "interface/MenuLook.h"

#include <cmath>

#include <InterfaceDefs.h>
#include <View.h>

#include "interface/ControlLook.h"

namespace BPrivate {

namespace {

struct NamedKey {
	char key;
	const char* name;
};

const NamedKey kNamedKeys[] = {{B_ENTER, "Enter"}, {B_TAB, "Tab"}, {B_ESCAPE, "Esc"},
	{B_SPACE, "Space"}, {B_BACKSPACE, "Backspace"}, {B_DELETE, "Del"}, {B_INSERT, "Ins"},
	{B_HOME, "Home"}, {B_END, "End"}, {B_PAGE_UP, "Page up"}, {B_PAGE_DOWN, "Page down"},
	{B_LEFT_ARROW, "Left"}, {B_RIGHT_ARROW, "Right"}, {B_UP_ARROW, "Up"}, {B_DOWN_ARROW, "Down"}};


BPoint
Middle(BRect square)
{
	return BPoint(
		std::floor((square.left + square.right) / 2), std::floor((square.top + square.bottom) / 2));
}

} // namespace


rgb_color
MenuBackgroundColor()
{
	return ui_color(B_MENU_BACKGROUND_COLOR);
}


rgb_color
MenuItemBackground(bool selected)
{
	return selected ? ui_color(B_MENU_SELECTED_BACKGROUND_COLOR) : MenuBackgroundColor();
}


rgb_color
MenuTextColor(bool enabled, bool selected)
{
	rgb_color text = ui_color(selected ? B_MENU_SELECTED_ITEM_TEXT_COLOR : B_MENU_ITEM_TEXT_COLOR);
	return StrengthOf(enabled, text, MenuItemBackground(selected));
}


rgb_color
MenuLineColor()
{
	return tint_color(MenuBackgroundColor(), B_DARKEN_2_TINT);
}


rgb_color
MenuBorderColor()
{
	return tint_color(MenuBackgroundColor(), B_DARKEN_3_TINT);
}


// The host's keyboard has these names on its keys.
BString
ShortcutText(char shortcut, uint32 modifiers)
{
	BString text;
	if (shortcut == 0)
		return text;

	if ((modifiers & B_COMMAND_KEY) != 0)
		text << "Ctrl+";
	if ((modifiers & B_CONTROL_KEY) != 0)
		text << "Alt+";
	if ((modifiers & B_OPTION_KEY) != 0)
		text << "Super+";
	if ((modifiers & B_SHIFT_KEY) != 0)
		text << "Shift+";

	for (const NamedKey& key : kNamedKeys) {
		if (key.key == shortcut)
			return text << key.name;
	}
	const char letter = shortcut >= 'a' && shortcut <= 'z' ? shortcut - 'a' + 'A' : shortcut;
	text.Append(letter, 1);
	return text;
}


void
DrawMenuTick(BView* view, BRect square, rgb_color color)
{
	const BPoint middle = Middle(square);
	view->SetHighColor(color);
	view->SetPenSize(2);
	const BPoint corner(middle.x - 1, middle.y + 3);
	view->StrokeLine(BPoint(middle.x - 4, middle.y), corner);
	view->StrokeLine(corner, BPoint(middle.x + 4, middle.y - 4));
	view->SetPenSize(1);
}


void
DrawMenuArrow(BView* view, BRect square, rgb_color color)
{
	const BPoint middle = Middle(square);
	view->SetHighColor(color);
	view->FillTriangle(BPoint(middle.x - 2, middle.y - 4), BPoint(middle.x - 2, middle.y + 4),
		BPoint(middle.x + 2, middle.y));
}


void
DrawDropDownArrow(BView* view, BRect square, rgb_color color)
{
	const BPoint middle = Middle(square);
	view->SetHighColor(color);
	view->FillTriangle(BPoint(middle.x - 4, middle.y - 1), BPoint(middle.x + 4, middle.y - 1),
		BPoint(middle.x, middle.y + 3));
}


void
DrawScrollArrow(BView* view, BRect frame, bool up, bool active)
{
	const BPoint middle = Middle(frame);
	const float tip = up ? -2 : 2;
	view->SetHighColor(MenuTextColor(active, false));
	view->FillTriangle(BPoint(middle.x - 4, middle.y - tip), BPoint(middle.x + 4, middle.y - tip),
		BPoint(middle.x, middle.y + tip));
}

} // namespace BPrivate
