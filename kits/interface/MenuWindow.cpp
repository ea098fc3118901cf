// SPDX-License-Identifier: MIT
// The little window of an open menu.
#include "interface/MenuWindow.h"

#include <algorithm>
#include <cmath>

#include <Menu.h>
#include <MenuItem.h>
#include <Message.h>
#include <Screen.h>

#include "app/LooperPrivate.h"
#include "display/HostWindow.h"
#include "interface/MenuLook.h"
#include "interface/MenuPrivate.h"
#include "interface/WindowClient.h"
#include "interface/WindowPrivate.h"

namespace BPrivate {

namespace {

// The strip at either end of a menu that is longer than the screen.
const float kScrollerHeight = 14;


bool
IsInput(uint32 what)
{
	switch (what) {
		case B_MOUSE_DOWN:
		case B_MOUSE_UP:
		case B_MOUSE_MOVED:
		case B_MOUSE_WHEEL_CHANGED:
		case B_KEY_DOWN:
		case B_KEY_UP:
		case B_UNMAPPED_KEY_DOWN:
		case B_UNMAPPED_KEY_UP:
		case B_MODIFIERS_CHANGED:
			return true;

		default:
			return false;
	}
}

} // namespace


/// The border, and the arrows of a long menu. The menu is its only child.
class MenuWindow::FrameView : public BView {
public:
	explicit FrameView(BRect frame)
		: BView(frame, "menu frame", B_FOLLOW_ALL, B_WILL_DRAW | B_FULL_UPDATE_ON_RESIZE)
	{
		SetViewColor(MenuBackgroundColor());
	}

	void Draw(BRect) override
	{
		SetHighColor(MenuBorderColor());
		StrokeRect(Bounds());
		if (!scrolls)
			return;
		DrawScrollArrow(this, Scroller(-1), true, CanScroll(-1));
		DrawScrollArrow(this, Scroller(1), false, CanScroll(1));
	}

	BMenu* Menu() const { return dynamic_cast<BMenu*>(ChildAt(0)); }

	BRect Scroller(int32 direction) const
	{
		BRect frame = Bounds().InsetByCopy(kMenuBorder, kMenuBorder);
		if (direction < 0)
			frame.bottom = frame.top + kScrollerHeight - 1;
		else
			frame.top = frame.bottom - kScrollerHeight + 1;
		return frame;
	}

	bool CanScroll(int32 direction) const
	{
		const BMenu* menu = Menu();
		if (!scrolls || menu == nullptr)
			return false;
		if (direction < 0)
			return menu->Bounds().top > 0;
		return menu->Bounds().bottom < MenuModel::Of(menu).size.height;
	}

	bool scrolls = false;
};


MenuWindow::MenuWindow(BMenu* menu, const BMessenger& tracker)
	: BWindow(BRect(0, 0, 9, 9), menu->Name() != nullptr ? menu->Name() : "menu",
		B_NO_BORDER_WINDOW_LOOK, B_NORMAL_WINDOW_FEEL,
		B_NOT_MOVABLE | B_NOT_CLOSABLE | B_NOT_ZOOMABLE | B_NOT_MINIMIZABLE | B_AVOID_FOCUS),
	  fFrameView(new FrameView(Bounds())),
	  fTracker(tracker),
	  fIsBelowItem(false)
{
	LooperAccess::SetKind(this, kMenuWindowLooper);
	// The host's window learns its kind with its flags.
	SetFlags(Flags());
	AddChild(fFrameView);
}


MenuWindow::~MenuWindow()
{
	// The menu is its item's, or the program's.
	if (BMenu* menu = fFrameView->Menu())
		menu->RemoveSelf();
}


MenuWindow*
MenuWindow::Open(BMenu* menu, BPoint location, const BMessenger& tracker)
{
	if (menu->Window() != nullptr || menu->Parent() != nullptr)
		return nullptr;
	MenuWindow* window = new MenuWindow(menu, tracker);
	window->fLocation = location;
	const BMenu* super = menu->Supermenu();
	if (super != nullptr && super->Window() != nullptr && !MenuModel::Of(super).isFieldBar) {
		window->fItem = super->ConvertToScreen(menu->Superitem()->Frame());
		window->fIsBelowItem = MenuModel::Of(super).layout == B_ITEMS_IN_ROW;
	}
	window->MoveTo(location);
	window->fFrameView->AddChild(menu);
	window->Refit(menu);
	window->Show();
	return window;
}


void
MenuWindow::Close(BMenu* menu)
{
	menu->RemoveSelf();
	if (!IsHidden())
		Hide();
	PostMessage(B_QUIT_REQUESTED);
}


bool
MenuWindow::QuitRequested()
{
	return true;
}


// The tracker decides by the place on the screen; keys have no other receiver while a menu is open.
void
MenuWindow::DispatchMessage(BMessage* message, BHandler* handler)
{
	if (IsInput(message->what))
		fTracker.SendMessage(message);
	else
		BWindow::DispatchMessage(message, handler);
}


void
MenuWindow::GrabInput()
{
	WindowData::Of(this).host->SetPointerGrab(true);
}


// #pragma mark - place


void
MenuWindow::Refit(BMenu* menu)
{
	MenuModel::LayOut(menu);
	const BRect frame = FittingFrame(menu);
	MoveTo(frame.LeftTop());
	ResizeTo(frame.Width(), frame.Height());
	PlaceMenu(menu);
	fFrameView->Invalidate();
	menu->Invalidate();

	BMessage placed(kMsgMenuPlaced);
	placed.AddMessenger("window", BMessenger(this));
	placed.AddRect("frame", frame);
	fTracker.SendMessage(&placed);
}


// On the screen: a submenu goes to the other side of its item where it does not fit, a long menu is cut.
BRect
MenuWindow::FittingFrame(BMenu* menu) const
{
	const BSize size = MenuModel::Of(menu).size;
	const BRect screen = BScreen(const_cast<MenuWindow*>(this)).Frame();
	const float edge = kMenuBorder + kMenuPadding;
	BRect frame(fLocation - BPoint(kMenuBorder, edge),
		BSize(size.width + 2 * kMenuBorder, size.height + 2 * edge));

	if (fItem.IsValid() && fIsBelowItem) {
		// Not over its item: on the side with more room, cut there.
		const float above = fItem.top - 1 - frame.Height();
		const bool isAbove =
			frame.bottom > screen.bottom && fItem.top - screen.top > screen.bottom - fItem.bottom;
		if (isAbove)
			frame.OffsetTo(frame.left, above);
		if (frame.top < screen.top)
			frame.top = screen.top;
		if (frame.bottom > screen.bottom)
			frame.bottom = screen.bottom;
	} else if (fItem.IsValid()) {
		const float leftOf = fItem.left - 1 - frame.Width();
		if (frame.right > screen.right && leftOf >= screen.left)
			frame.OffsetTo(leftOf, frame.top);
	}
	if (frame.right > screen.right)
		frame.OffsetBy(screen.right - frame.right, 0);
	if (frame.left < screen.left)
		frame.OffsetTo(screen.left, frame.top);
	if (frame.bottom > screen.bottom)
		frame.OffsetBy(0, screen.bottom - frame.bottom);
	if (frame.top < screen.top) {
		frame.OffsetTo(frame.left, screen.top);
		frame.bottom = std::min(frame.bottom, screen.bottom);
	}
	return frame;
}


void
MenuWindow::PlaceMenu(BMenu* menu)
{
	const MenuData& data = MenuModel::Of(menu);
	BRect room = Bounds().InsetByCopy(kMenuBorder, kMenuBorder + kMenuPadding);
	fFrameView->scrolls = data.size.height > room.Height();
	if (fFrameView->scrolls) {
		room.top = fFrameView->Scroller(-1).bottom + 1;
		room.bottom = fFrameView->Scroller(1).top - 1;
	}
	menu->MoveTo(room.LeftTop());
	menu->ResizeTo(room.Width(), room.Height());
	if (!fFrameView->scrolls) {
		menu->ScrollTo(0, 0);
		return;
	}
	ScrollItems(0);
	for (const BMenuItem* item : data.items) {
		if (item->IsMarked())
			Reveal(item);
	}
}


// #pragma mark - scrolling


int32
MenuWindow::ScrollDirectionAt(BPoint where) const
{
	const BPoint inside = fFrameView->ConvertFromScreen(where);
	for (int32 direction : {-1, 1}) {
		// Beyond the end of the screen there is nothing to point at: the edge counts.
		BRect area = fFrameView->Scroller(direction);
		area.InsetBy(-kMenuBorder, -kMenuBorder);
		if (fFrameView->CanScroll(direction) && area.Contains(inside))
			return direction;
	}
	return 0;
}


void
MenuWindow::ScrollItems(float distance)
{
	BMenu* menu = fFrameView->Menu();
	if (menu == nullptr || !fFrameView->scrolls)
		return;
	const BRect bounds = menu->Bounds();
	const float last = MenuModel::Of(menu).size.height - bounds.Height();
	const float top = std::clamp(bounds.top + distance, 0.0f, std::max(0.0f, last));
	if (top == bounds.top)
		return;
	menu->ScrollTo(0, top);
	fFrameView->Invalidate(fFrameView->Scroller(-1));
	fFrameView->Invalidate(fFrameView->Scroller(1));
}


void
MenuWindow::Reveal(const BMenuItem* item)
{
	const BMenu* menu = fFrameView->Menu();
	if (menu == nullptr)
		return;
	const BRect frame = MenuModel::Of(item).frame;
	const BRect bounds = menu->Bounds();
	if (frame.top < bounds.top)
		ScrollItems(frame.top - bounds.top);
	else if (frame.bottom > bounds.bottom)
		ScrollItems(frame.bottom - bounds.bottom);
}

} // namespace BPrivate
