// SPDX-License-Identifier: MIT
#include <OptionPopUp.h>

#include <cmath>

#include <MenuField.h>
#include <MenuItem.h>
#include <Message.h>
#include <PopUpMenu.h>
#include <Window.h>

namespace {

constexpr float kLabelGap = 6;


int32
ValueOf(const BMenuItem* item)
{
	const BMessage* message = item->Message();
	return message != NULL ? message->GetInt32("be:value", 0) : 0;
}

} // namespace

BOptionPopUp::BOptionPopUp(BRect frame, const char* name, const char* label, BMessage* message,
	bool fixed, uint32 resizeMask, uint32 flags)
	: BOptionControl(frame, name, label, message, resizeMask, flags),
	  fMenuField(new BMenuField(
		  frame.OffsetToCopy(B_ORIGIN), "_menu", label, new BPopUpMenu(""), fixed, B_FOLLOW_ALL))
{
	AddChild(fMenuField);
	PlaceField();
}


BOptionPopUp::BOptionPopUp(BRect frame, const char* name, const char* label, BMessage* message,
	uint32 resizeMask, uint32 flags)
	: BOptionPopUp(frame, name, label, message, false, resizeMask, flags)
{
}


BOptionPopUp::BOptionPopUp(const char* name, const char* label, BMessage* message, uint32 flags)
	: BOptionPopUp(BRect(0, 0, -1, -1), name, label, message, false, B_FOLLOW_LEFT_TOP, flags)
{
}


BOptionPopUp::~BOptionPopUp() {}


// The label stands directly before the field, which is as wide as its options want.
void
BOptionPopUp::PlaceField()
{
	fMenuField->SetDivider(
		Label() != NULL ? std::ceil(fMenuField->StringWidth(Label())) + kLabelGap : 0);
}


void
BOptionPopUp::AttachedToWindow()
{
	BOptionControl::AttachedToWindow();
	PlaceField();
}


void
BOptionPopUp::AllAttached()
{
	BOptionControl::AllAttached();
	fMenuField->Menu()->SetTargetForItems(this);
}


void
BOptionPopUp::MessageReceived(BMessage* message)
{
	BOptionControl::MessageReceived(message);
}


void
BOptionPopUp::GetPreferredSize(float* _width, float* _height)
{
	fMenuField->GetPreferredSize(_width, _height);
}


void
BOptionPopUp::ResizeToPreferred()
{
	float width, height;
	GetPreferredSize(&width, &height);
	ResizeTo(width, height);
	fMenuField->ResizeTo(width, height);
	PlaceField();
}


BMenuField*
BOptionPopUp::MenuField()
{
	return fMenuField;
}


bool
BOptionPopUp::GetOptionAt(int32 index, const char** _name, int32* _value)
{
	const BMenuItem* item = fMenuField->Menu()->ItemAt(index);
	if (item == NULL)
		return false;
	if (_name != NULL)
		*_name = item->Label();
	if (_value != NULL)
		*_value = ValueOf(item);
	return true;
}


void
BOptionPopUp::RemoveOptionAt(int32 index)
{
	delete fMenuField->Menu()->RemoveItem(index);
	PlaceField();
}


int32
BOptionPopUp::CountOptions() const
{
	return fMenuField->Menu()->CountItems();
}


status_t
BOptionPopUp::AddOptionAt(const char* name, int32 value, int32 index)
{
	const int32 count = CountOptions();
	if (name == NULL || index < 0 || index > count)
		return B_BAD_VALUE;
	BMenuItem* item = new BMenuItem(name, MakeValueMessage(value));
	if (!fMenuField->Menu()->AddItem(item, index)) {
		delete item;
		return B_NO_MEMORY;
	}
	if (Window() != NULL)
		item->SetTarget(this);
	if (count == 0) {
		item->SetMarked(true);
		SetValueNoUpdate(value);
	}
	PlaceField();
	return B_OK;
}


int32
BOptionPopUp::SelectedOption(const char** name, int32* outValue) const
{
	const BMenu* menu = fMenuField->Menu();
	for (int32 i = 0; i < menu->CountItems(); i++) {
		const BMenuItem* item = menu->ItemAt(i);
		if (!item->IsMarked())
			continue;
		if (name != NULL)
			*name = item->Label();
		if (outValue != NULL)
			*outValue = ValueOf(item);
		return i;
	}
	return B_ERROR;
}


void
BOptionPopUp::SetLabel(const char* label)
{
	BOptionControl::SetLabel(label);
	fMenuField->SetLabel(label);
	PlaceField();
}


void
BOptionPopUp::SetValue(int32 value)
{
	BOptionControl::SetValue(value);
	BMenu* menu = fMenuField->Menu();
	BMenuItem* marked = menu->FindMarked();
	// Of several options with this value the chosen one stays.
	if (marked != NULL && ValueOf(marked) == value)
		return;
	if (marked != NULL)
		marked->SetMarked(false);
	for (int32 i = 0; i < menu->CountItems(); i++) {
		if (ValueOf(menu->ItemAt(i)) == value) {
			menu->ItemAt(i)->SetMarked(true);
			return;
		}
	}
}


void
BOptionPopUp::SetEnabled(bool enabled)
{
	BOptionControl::SetEnabled(enabled);
	fMenuField->SetEnabled(enabled);
}
