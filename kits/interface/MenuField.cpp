// SPDX-License-Identifier: MIT
// BMenuField: a label beside the choice of a menu.
#include <MenuField.h>

#include <algorithm>
#include <cmath>

#include <MenuBar.h>
#include <MenuItem.h>
#include <Message.h>
#include <PopUpMenu.h>
#include <Window.h>

#include "interface/ArchivedEnum.h"
#include "interface/ControlLook.h"
#include "interface/MenuLook.h"
#include "interface/MenuPrivate.h"

using BPrivate::AlignmentOf;
using BPrivate::ControlState;
using BPrivate::MenuData;
using BPrivate::MenuModel;

namespace {

constexpr float kTextMargin = 8;
constexpr float kDropDownWidth = 22;
// Between the label and the divider.
constexpr float kLabelGap = 6;
constexpr float kLeastFieldWidth = 20;


/// The bar inside: a button that shows the choice.
class FieldBar : public BMenuBar {
public:
	FieldBar(BRect frame, BMenuField* field)
		: BMenuBar(frame, "_mc_mb_", B_FOLLOW_NONE, B_ITEMS_IN_ROW, false),
		  fField(field)
	{
		MenuModel::Of(this).isFieldBar = true;
		SetItemMargins(kTextMargin, 3, kDropDownWidth, 3);
		SetTriggersEnabled(false);
		SetFlags(Flags() | B_FULL_UPDATE_ON_RESIZE);
	}

	void AttachedToWindow() override
	{
		BMenuBar::AttachedToWindow();
		BPrivate::AdoptParentColors(this);
	}

	void FrameResized(float width, float height) override
	{
		BMenuBar::FrameResized(width, height);
		MenuModel::Changed(this);
	}

	void Draw(BRect) override
	{
		BMenuItem* item = ItemAt(0);
		if (item == NULL)
			return;
		MenuModel::LayOut(this);
		const bool isEnabled = fField->IsEnabled() && item->IsEnabled();
		const bool isOpen = MenuModel::Of(item).selected;
		const ControlState state = {
			isEnabled, fField->IsFocus() && Window()->IsActive(), isOpen && isEnabled};
		BPrivate::DrawButtonSurface(this, Bounds(), state, false);

		const rgb_color surface = BPrivate::ButtonSurfaceColor(state);
		const rgb_color text = BPrivate::ControlTextColor(isEnabled, surface);
		const BRect bounds = Bounds();
		BPrivate::DrawDropDownArrow(this,
			BRect(bounds.right - kDropDownWidth + 3, bounds.top, bounds.right - 1, bounds.bottom),
			text);
		const MenuData& data = MenuModel::Of(this);
		BString label(item->Label());
		const float room = bounds.Width() + 1 - kTextMargin - kDropDownWidth;
		if (StringWidth(label.String()) > room + 1)
			TruncateString(&label, B_TRUNCATE_END, room);
		SetHighColor(text);
		SetLowColor(surface);
		SetDrawingMode(B_OP_OVER);
		DrawString(label.String(),
			BPoint(bounds.left + kTextMargin,
				bounds.top + std::floor((bounds.Height() + 1 - data.textHeight) / 2)
					+ data.ascent));
	}

private:
	BMenuField* fField;
};


float
WidestLabel(BMenu* menu)
{
	float widest = 0;
	for (int32 i = 0; i < menu->CountItems(); i++) {
		float width = 0;
		MenuModel::GetContentSize(menu->ItemAt(i), &width, NULL);
		widest = std::max(widest, width);
	}
	return std::ceil(widest);
}

} // namespace


BMenuField::BMenuField(BRect frame, const char* name, const char* label, BMenu* menu,
	uint32 resizingMode, uint32 flags)
	: BMenuField(frame, name, label, menu, false, resizingMode, flags)
{
}


BMenuField::BMenuField(BRect frame, const char* name, const char* label, BMenu* menu,
	bool fixed_size, uint32 resizingMode, uint32 flags)
	: BView(frame, name, resizingMode, flags | B_FRAME_EVENTS | B_FULL_UPDATE_ON_RESIZE)
{
	Init(label, menu, fixed_size);
}


BMenuField::BMenuField(const char* name, const char* label, BMenu* menu, uint32 flags)
	: BMenuField(name, label, menu, false, flags)
{
}


BMenuField::BMenuField(
	const char* name, const char* label, BMenu* menu, bool fixed_size, uint32 flags)
	: BMenuField(BRect(0, 0, -1, -1), name, label, menu, fixed_size, B_FOLLOW_LEFT_TOP, flags)
{
	fDivider = fLabel.IsEmpty() ? 0 : std::ceil(StringWidth(fLabel.String())) + kLabelGap;
	ResizeToPreferred();
}


BMenuField::BMenuField(const char* label, BMenu* menu, uint32 flags)
	: BMenuField(NULL, label, menu, flags)
{
}


BMenuField::BMenuField(BMessage* archive)
	: BView(archive)
{
	BMessage archivedMenu;
	BMenu* menu = NULL;
	if (archive->FindMessage("_menu", &archivedMenu) == B_OK) {
		BArchivable* object = instantiate_object(&archivedMenu);
		menu = dynamic_cast<BMenu*>(object);
		if (menu == NULL)
			delete object;
	}
	if (menu == NULL)
		menu = new BPopUpMenu("");
	Init(archive->GetString("_label", ""), menu, archive->GetBool("_fixeds", false));
	fAlignment = AlignmentOf(archive->GetInt32("_align", B_ALIGN_LEFT));
	fDivider = archive->GetFloat("_divide", fDivider);
	if (archive->GetBool("_disable", false)) {
		SetEnabled(false);
		// The archived flags are those of a disabled field.
		fWantsNavigation = true;
	}
	PlaceBar();
}


BMenuField::~BMenuField() {}


BArchivable*
BMenuField::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BMenuField") ? new BMenuField(archive) : NULL;
}


status_t
BMenuField::Archive(BMessage* archive, bool deep) const
{
	// The bar is made anew, and is no part of the archive.
	status_t status = BView::Archive(archive, false);
	if (status == B_OK && !fLabel.IsEmpty())
		status = archive->AddString("_label", fLabel);
	if (status == B_OK && !fEnabled)
		status = archive->AddBool("_disable", true);
	if (status == B_OK)
		status = archive->AddInt32("_align", fAlignment);
	if (status == B_OK)
		status = archive->AddFloat("_divide", fDivider);
	if (status == B_OK && fFixedSize)
		status = archive->AddBool("_fixeds", true);
	if (status != B_OK || !deep || fMenu == NULL)
		return status;
	BMessage menu;
	status = fMenu->Archive(&menu, true);
	return status == B_OK ? archive->AddMessage("_menu", &menu) : status;
}


void
BMenuField::Init(const char* label, BMenu* menu, bool fixedSize)
{
	fLabel = label;
	fMenu = menu;
	fAlignment = B_ALIGN_LEFT;
	fDivider = fLabel.IsEmpty() ? 0 : std::floor(Frame().Width() / 2);
	fEnabled = true;
	fFixedSize = fixedSize;
	fWantsNavigation = (Flags() & B_NAVIGABLE) != 0;

	fMenuBar = new FieldBar(BRect(0, 0, 9, 9), this);
	AddChild(fMenuBar);
	if (menu == NULL)
		return;
	// A pop-up menu shows a choice from the beginning.
	if (dynamic_cast<BPopUpMenu*>(menu) != NULL && menu->IsRadioMode()
		&& menu->FindMarked() == NULL) {
		BMenuItem* first = MenuModel::Next(menu, NULL, true);
		if (first != NULL)
			first->SetMarked(true);
	}
	fMenuBar->AddItem(menu);
	PlaceBar();
}


// Right of the divider, as wide as the longest item unless it fills the field, and centred in the height.
void
BMenuField::PlaceBar()
{
	const BRect bounds = Bounds();
	float height;
	fMenuBar->GetPreferredSize(NULL, &height);
	float width = bounds.right - fDivider;
	if (!fFixedSize && fMenu != NULL)
		width = std::min(width, WidestLabel(fMenu) + kTextMargin + kDropDownWidth - 1);
	fMenuBar->MoveTo(fDivider, std::floor((bounds.Height() - height) / 2));
	fMenuBar->ResizeTo(std::max(width, kLeastFieldWidth), height);
	MenuModel::Changed(fMenuBar);
	if (fMenu != NULL)
		MenuModel::Of(fMenu).minWidth =
			fMenuBar->Frame().Width() + BPrivate::kMarkWidth - kTextMargin;
}


// #pragma mark - hooks


void
BMenuField::AttachedToWindow()
{
	BView::AttachedToWindow();
	BPrivate::AdoptParentColors(this);
	float height;
	GetPreferredSize(NULL, &height);
	ResizeTo(Frame().Width(), height);
}


void
BMenuField::AllAttached()
{
	BView::AllAttached();
	PlaceBar();
}


void
BMenuField::DetachedFromWindow()
{
	BView::DetachedFromWindow();
}


void
BMenuField::AllDetached()
{
	BView::AllDetached();
}


void
BMenuField::Draw(BRect)
{
	if (fLabel.IsEmpty())
		return;
	BString label(fLabel);
	const float room = std::max(fDivider - kLabelGap + 1, 0.0f);
	float width = std::ceil(StringWidth(label.String()));
	if (width > room + 1) {
		TruncateString(&label, B_TRUNCATE_END, room);
		width = std::ceil(StringWidth(label.String()));
	}
	float left = 0;
	if (fAlignment == B_ALIGN_RIGHT)
		left = std::max(0.0f, room - width);
	else if (fAlignment == B_ALIGN_CENTER)
		left = std::max(0.0f, std::floor((room - width) / 2));

	font_height height;
	GetFontHeight(&height);
	SetHighColor(BPrivate::ControlTextColor(fEnabled, ViewColor()));
	SetDrawingMode(B_OP_OVER);
	DrawString(label.String(),
		BPoint(left,
			std::floor(
				(Bounds().Height() + 1 - std::ceil(height.ascent) - std::ceil(height.descent)) / 2)
				+ std::ceil(height.ascent)));
	SetDrawingMode(B_OP_COPY);
}


void
BMenuField::MouseDown(BPoint)
{
	if (!fEnabled)
		return;
	// On the label, as on the bar.
	BRect field = ConvertToScreen(Bounds());
	SetMouseEventMask(B_POINTER_EVENTS, B_LOCK_WINDOW_FOCUS);
	fMenuBar->StartMenuBar(0, false, true, &field);
}


void
BMenuField::MouseUp(BPoint where)
{
	BView::MouseUp(where);
}


void
BMenuField::MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage)
{
	BView::MouseMoved(where, code, dragMessage);
}


void
BMenuField::KeyDown(const char* bytes, int32 numBytes)
{
	const char key = numBytes == 1 ? bytes[0] : '\0';
	if (!fEnabled
		|| (key != B_SPACE && key != B_ENTER && key != B_DOWN_ARROW && key != B_RIGHT_ARROW)) {
		BView::KeyDown(bytes, numBytes);
		return;
	}
	fMenuBar->StartMenuBar(0, true, true);
}


void
BMenuField::MakeFocus(bool focus)
{
	if (focus == IsFocus())
		return;
	BView::MakeFocus(focus);
	if (Window() != NULL)
		fMenuBar->Invalidate();
}


void
BMenuField::MessageReceived(BMessage* message)
{
	BView::MessageReceived(message);
}


void
BMenuField::WindowActivated(bool active)
{
	BView::WindowActivated(active);
	if (IsFocus())
		fMenuBar->Invalidate();
}


void
BMenuField::FrameMoved(BPoint newPosition)
{
	BView::FrameMoved(newPosition);
}


void
BMenuField::FrameResized(float newWidth, float newHeight)
{
	BView::FrameResized(newWidth, newHeight);
	PlaceBar();
}


void
BMenuField::ResizeToPreferred()
{
	BView::ResizeToPreferred();
	PlaceBar();
}


void
BMenuField::GetPreferredSize(float* _width, float* _height)
{
	float barHeight;
	fMenuBar->GetPreferredSize(NULL, &barHeight);
	if (_width != NULL) {
		const float label =
			fLabel.IsEmpty() ? 0 : std::ceil(StringWidth(fLabel.String())) + kLabelGap;
		const float bar = fMenu != NULL ? WidestLabel(fMenu) : 0;
		*_width = std::max(label, fDivider) + bar + kTextMargin + kDropDownWidth;
	}
	if (_height != NULL)
		*_height = barHeight + 2;
}


// #pragma mark - parts and states


BMenu*
BMenuField::Menu() const
{
	return fMenu;
}


BMenuBar*
BMenuField::MenuBar() const
{
	return fMenuBar;
}


BMenuItem*
BMenuField::MenuItem() const
{
	return fMenuBar->ItemAt(0);
}


void
BMenuField::SetLabel(const char* label)
{
	fLabel = label;
	if (Window() != NULL)
		Invalidate();
}


const char*
BMenuField::Label() const
{
	return fLabel.String();
}


void
BMenuField::SetEnabled(bool on)
{
	if (on == fEnabled)
		return;
	fEnabled = on;
	fMenuBar->SetEnabled(on);
	if (!on) {
		fWantsNavigation = (Flags() & B_NAVIGABLE) != 0;
		if (fWantsNavigation)
			SetFlags(Flags() & ~B_NAVIGABLE);
		if (IsFocus())
			MakeFocus(false);
	} else if (fWantsNavigation)
		SetFlags(Flags() | B_NAVIGABLE);
	if (Window() != NULL) {
		Invalidate();
		fMenuBar->Invalidate();
	}
}


bool
BMenuField::IsEnabled() const
{
	return fEnabled;
}


void
BMenuField::SetAlignment(alignment label)
{
	fAlignment = label;
	if (Window() != NULL)
		Invalidate();
}


alignment
BMenuField::Alignment() const
{
	return fAlignment;
}


void
BMenuField::SetDivider(float position)
{
	fDivider = std::round(position);
	PlaceBar();
	if (Window() != NULL)
		Invalidate();
}


float
BMenuField::Divider() const
{
	return fDivider;
}
