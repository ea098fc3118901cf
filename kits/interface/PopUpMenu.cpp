// SPDX-License-Identifier: MIT
// BPopUpMenu: opening at a place.
#include <PopUpMenu.h>

#include <cmath>

#include <MenuItem.h>
#include <Message.h>

#include "interface/MenuPrivate.h"
#include "interface/MenuTracker.h"

using BPrivate::MenuModel;
using BPrivate::MenuTracker;

BPopUpMenu::BPopUpMenu(const char* name, bool radioMode, bool labelFromMarked, menu_layout layout)
	: BMenu(name, layout),
	  fUseWhere(false),
	  fAutoDestruct(false)
{
	if (radioMode)
		SetRadioMode(true);
	if (labelFromMarked)
		SetLabelFromMarked(true);
}


BPopUpMenu::BPopUpMenu(BMessage* archive)
	: BMenu(archive),
	  fUseWhere(false),
	  fAutoDestruct(false)
{
}


BPopUpMenu::~BPopUpMenu() {}


BArchivable*
BPopUpMenu::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BPopUpMenu") ? new BPopUpMenu(archive) : NULL;
}


status_t
BPopUpMenu::Archive(BMessage* archive, bool deep) const
{
	return BMenu::Archive(archive, deep);
}


BMenuItem*
BPopUpMenu::Go(BPoint where, bool deliversMessage, bool keepOpen, bool async)
{
	return Open(where, deliversMessage, keepOpen, NULL, async);
}


BMenuItem*
BPopUpMenu::Go(BPoint where, bool deliversMessage, bool keepOpen, BRect openRect, bool async)
{
	return Open(where, deliversMessage, keepOpen, &openRect, async);
}


BMenuItem*
BPopUpMenu::Open(BPoint where, bool delivers, bool keepOpen, const BRect* openRect, bool async)
{
	if (Window() != NULL)
		return NULL;
	fWhere = where;
	fUseWhere = true;

	BPrivate::MenuStart start;
	start.menu = this;
	start.staysOpen = keepOpen;
	if (openRect != NULL)
		start.clickThrough = *openRect;
	start.delivers = delivers;
	start.deletesMenu = async && fAutoDestruct;
	if (async) {
		MenuTracker::Start(start);
		return NULL;
	}

	BMenuItem* chosen = MenuTracker::TrackAndWait(start);
	if (chosen != NULL && delivers)
		MenuModel::Invoke(chosen);
	return chosen;
}


void
BPopUpMenu::SetAsyncAutoDestruct(bool on)
{
	fAutoDestruct = on;
}


bool
BPopUpMenu::AsyncAutoDestruct() const
{
	return fAutoDestruct;
}


// In a menu field the marked item's label lies on the field's, so that choosing it again takes no way.
BPoint
BPopUpMenu::ScreenLocation()
{
	if (fUseWhere)
		return fWhere;
	BMenu* super = Supermenu();
	BMenuItem* marked = FindMarked();
	if (super == NULL || !MenuModel::Of(super).isFieldBar)
		return BMenu::ScreenLocation();

	const BRect field = super->ConvertToScreen(Superitem()->Frame());
	const float x = field.left + MenuModel::Of(super).left - MenuModel::Of(this).left;
	if (marked == NULL)
		return BPoint(x, field.top);
	const BRect item = marked->Frame();
	return BPoint(x, field.top + std::floor((field.Height() - item.Height()) / 2) - item.top);
}


void
BPopUpMenu::MessageReceived(BMessage* message)
{
	BMenu::MessageReceived(message);
}


void
BPopUpMenu::MouseDown(BPoint where)
{
	BMenu::MouseDown(where);
}


void
BPopUpMenu::MouseUp(BPoint where)
{
	BMenu::MouseUp(where);
}


void
BPopUpMenu::MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage)
{
	BMenu::MouseMoved(where, code, dragMessage);
}


void
BPopUpMenu::AttachedToWindow()
{
	BMenu::AttachedToWindow();
}


void
BPopUpMenu::DetachedFromWindow()
{
	fUseWhere = false;
	BMenu::DetachedFromWindow();
}


void
BPopUpMenu::FrameMoved(BPoint newPosition)
{
	BMenu::FrameMoved(newPosition);
}


void
BPopUpMenu::FrameResized(float newWidth, float newHeight)
{
	BMenu::FrameResized(newWidth, newHeight);
}


void
BPopUpMenu::ResizeToPreferred()
{
	BMenu::ResizeToPreferred();
}


void
BPopUpMenu::GetPreferredSize(float* _width, float* _height)
{
	BMenu::GetPreferredSize(_width, _height);
}


void
BPopUpMenu::MakeFocus(bool state)
{
	BMenu::MakeFocus(state);
}


void
BPopUpMenu::AllAttached()
{
	BMenu::AllAttached();
}


void
BPopUpMenu::AllDetached()
{
	BMenu::AllDetached();
}
