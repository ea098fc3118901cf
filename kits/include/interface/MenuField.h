// SPDX-License-Identifier: MIT
// A label, and a menu that shows what is chosen.
#ifndef _MENU_FIELD_H
#define _MENU_FIELD_H

#include <String.h>
#include <View.h>

class BMenu;
class BMenuBar;
class BMenuItem;

/// A label at the left, and from the divider on a bar that shows the chosen item of a menu.
///
/// It owns the menu; the items go to the window unless they have a target. The bar shows the marked
/// item of a pop-up menu, which is made the first enabled one when none is marked, and the name of
/// another menu. The height is that of the font once it is attached.
class BMenuField : public BView {
public:
	BMenuField(BRect frame, const char* name, const char* label, BMenu* menu,
		uint32 resizingMode = B_FOLLOW_LEFT_TOP, uint32 flags = B_WILL_DRAW | B_NAVIGABLE);
	/// \a fixed_size: the bar fills the frame right of the divider; else it is as wide as the longest item.
	BMenuField(BRect frame, const char* name, const char* label, BMenu* menu, bool fixed_size,
		uint32 resizingMode = B_FOLLOW_LEFT_TOP, uint32 flags = B_WILL_DRAW | B_NAVIGABLE);
	BMenuField(
		const char* name, const char* label, BMenu* menu, uint32 flags = B_WILL_DRAW | B_NAVIGABLE);
	BMenuField(const char* name, const char* label, BMenu* menu, bool fixed_size,
		uint32 flags = B_WILL_DRAW | B_NAVIGABLE);
	BMenuField(const char* label, BMenu* menu, uint32 flags = B_WILL_DRAW | B_NAVIGABLE);
	BMenuField(BMessage* archive);
	virtual ~BMenuField();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void Draw(BRect updateRect) override;
	void AttachedToWindow() override;
	void AllAttached() override;
	void MouseDown(BPoint where) override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void MakeFocus(bool focus = true) override;
	void MessageReceived(BMessage* message) override;
	void WindowActivated(bool active) override;
	void MouseUp(BPoint where) override;
	void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage) override;
	void DetachedFromWindow() override;
	void AllDetached() override;
	void FrameMoved(BPoint newPosition) override;
	void FrameResized(float newWidth, float newHeight) override;
	void ResizeToPreferred() override;
	void GetPreferredSize(float* _width, float* _height) override;

	/// The menu given to the constructor.
	BMenu* Menu() const;
	/// The bar inside, and its item that leads to the menu.
	BMenuBar* MenuBar() const;
	BMenuItem* MenuItem() const;

	/// Copied; null is no label.
	virtual void SetLabel(const char* label);
	const char* Label() const;
	virtual void SetEnabled(bool on);
	bool IsEnabled() const;
	/// Of the label, left of the divider.
	virtual void SetAlignment(alignment label);
	alignment Alignment() const;
	/// Where the bar begins, in pixels from the left.
	virtual void SetDivider(float position);
	float Divider() const;

private:
	void Init(const char* label, BMenu* menu, bool fixedSize);
	void PlaceBar();

	BString fLabel;
	BMenu* fMenu;
	BMenuBar* fMenuBar;
	alignment fAlignment;
	float fDivider;
	bool fEnabled;
	bool fFixedSize;
	bool fWantsNavigation;
};

#endif // _MENU_FIELD_H
