// SPDX-License-Identifier: MIT
// A menu that opens anywhere: a context menu, or the choices of a menu field.
#ifndef _POP_UP_MENU_H
#define _POP_UP_MENU_H

#include <Menu.h>

/// A menu that Go() opens at a place of the screen, or a menu field in its bar.
///
/// In radio mode, unless told otherwise, with the marked item's label shown by the item that leads here.
class BPopUpMenu : public BMenu {
public:
	BPopUpMenu(const char* name, bool radioMode = true, bool labelFromMarked = true,
		menu_layout layout = B_ITEMS_IN_COLUMN);
	BPopUpMenu(BMessage* archive);
	virtual ~BPopUpMenu();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	/// Opens the menu with its left-top at \a where, in screen coordinates, and lets the user choose.
	///
	/// Returns the chosen item, null for none, once the menu is closed; the calling window is
	/// repainted meanwhile. With \a async it returns null at once, the choice is delivered by invoking
	/// the item, and the menu must live on.
	/// \a deliversMessage: the chosen item is invoked; otherwise that is left to the caller.
	/// \a keepOpen: releasing the button that opened the menu does not close it.
	BMenuItem* Go(
		BPoint where, bool deliversMessage = false, bool keepOpen = false, bool async = false);
	/// \a openRect: releasing the button in there keeps the menu open; screen coordinates.
	BMenuItem* Go(
		BPoint where, bool deliversMessage, bool keepOpen, BRect openRect, bool async = false);

	/// The menu deletes itself when it closes after an asynchronous Go().
	void SetAsyncAutoDestruct(bool on);
	bool AsyncAutoDestruct() const;

	void MessageReceived(BMessage* message) override;
	void MouseDown(BPoint where) override;
	void MouseUp(BPoint where) override;
	void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage) override;
	void AttachedToWindow() override;
	void DetachedFromWindow() override;
	void FrameMoved(BPoint newPosition) override;
	void FrameResized(float newWidth, float newHeight) override;
	void ResizeToPreferred() override;
	void GetPreferredSize(float* _width, float* _height) override;
	void MakeFocus(bool state = true) override;
	void AllAttached() override;
	void AllDetached() override;

protected:
	/// Inside Go() its place; under a menu field such that the marked item lies on the shown one.
	BPoint ScreenLocation() override;

private:
	BMenuItem* Open(BPoint where, bool delivers, bool keepOpen, const BRect* openRect, bool async);

	BPoint fWhere;
	bool fUseWhere;
	bool fAutoDestruct;
};

#endif // _POP_UP_MENU_H
