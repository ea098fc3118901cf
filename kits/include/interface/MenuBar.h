// SPDX-License-Identifier: MIT
// The row of menus at the top of a window.
#ifndef _MENU_BAR_H
#define _MENU_BAR_H

#include <Menu.h>

enum menu_bar_border {
	B_BORDER_FRAME = 0,
	B_BORDER_CONTENTS = 1,
	B_BORDER_EACH_ITEM = 2,
};

/// A menu that is always there: a row, seldom a column, of items that mostly lead to menus.
///
/// When it is attached it takes the height of its font and, with resizeToFit, the width of its window,
/// and becomes the window's key menu bar. Its items' shortcuts work in the window.
class BMenuBar : public BMenu {
public:
	BMenuBar(BRect frame, const char* name,
		uint32 resizingMode = B_FOLLOW_LEFT_RIGHT | B_FOLLOW_TOP,
		menu_layout layout = B_ITEMS_IN_ROW, bool resizeToFit = true);
	BMenuBar(const char* name, menu_layout layout = B_ITEMS_IN_ROW,
		uint32 flags = B_WILL_DRAW | B_FRAME_EVENTS);
	BMenuBar(BMessage* archive);
	virtual ~BMenuBar();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void AttachedToWindow() override;
	void DetachedFromWindow() override;
	void AllAttached() override;
	void AllDetached() override;
	void WindowActivated(bool state) override;
	void MakeFocus(bool state = true) override;
	void ResizeToPreferred() override;
	void GetPreferredSize(float* _width, float* _height) override;
	void FrameMoved(BPoint newPosition) override;
	void FrameResized(float newWidth, float newHeight) override;
	void Show() override;
	void Hide() override;
	void Draw(BRect updateRect) override;
	void MessageReceived(BMessage* message) override;
	void MouseDown(BPoint where) override;
	void MouseUp(BPoint where) override;
	void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage) override;

	virtual void SetBorder(menu_bar_border border);
	menu_bar_border Border() const;

protected:
	/// Lets the user choose from the bar, and returns at once.
	///
	/// \a menuIndex: the item that is selected, -1 for none; with \a showMenu its menu opens.
	/// \a sticky: the menus stay open without a button held. \a special_rect: releasing the button in
	/// there keeps them open; screen coordinates.
	void StartMenuBar(
		int32 menuIndex, bool sticky = true, bool showMenu = false, BRect* special_rect = NULL);

private:
	friend class BMenuField;

	menu_bar_border fBorder;
};

#endif // _MENU_BAR_H
