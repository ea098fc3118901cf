// SPDX-License-Identifier: MIT
// The in-place editors of the property window.

#include "props/EditorPanes.h"

#include <algorithm>
#include <cmath>

#include <Box.h>
#include <Button.h>
#include <MenuField.h>
#include <MenuItem.h>
#include <PopUpMenu.h>
#include <TextControl.h>
#include <TextView.h>
#include <Window.h>

#include "model/Property.h"
#include "props/PropertyWin.h"
#include "props/ShownValue.h"
#include "props/StringList.h"

namespace {

constexpr float kInset = 5;
constexpr float kButtonWidth = 25;
constexpr float kLabelGap = 6;
constexpr float kLabelPart = 0.6f; // at most, of a field's width
constexpr const char* kPaneNames[] = {"String", "Modal", "List", "PickList", "None"};


/// Labels a text or menu field and leaves the rest of its width to what is edited.
template <typename Field>
void
SetLabel(Field* field, const BString& label)
{
	field->SetLabel(label.String());
	const float width = field->StringWidth(label.String()) + kLabelGap;
	field->SetDivider(std::min(width, std::floor(field->Bounds().Width() * kLabelPart)));
}


/// Gives the field the text that the editor shows, cut to what may be typed.
void
SetLimitedText(BTextControl* field, const TEditorState& state)
{
	// The limit of the property before must not keep any of the text out.
	field->TextView()->SetMaxBytes(TPropertyText::kSize);
	field->SetText(state.displayValue.String());
	field->TextView()->SetMaxBytes(state.limit);
}

} // namespace

TEditorState::TEditorState(TProperty* property, TPropertyEditor* editor, TPropEditType type)
	: property(property),
	  name(property->Name()),
	  value(ShownValue(property->Value())),
	  limit(TPropertyText::kSize),
	  hasEditor(editor != nullptr)
{
	if (editor == nullptr)
		return;
	displayValue = ShownValue(editor->GetDisplayValue());
	limit = static_cast<int32>(editor->EditLimit());
	if (type != PET_PICKLIST)
		return;
	TStringList list(20);
	editor->GetValuePickList(&list);
	for (int32 i = 0; i < list.CountItems(); i++)
		choices.emplace_back(list.StringAt(i));
}


TEditorPanes::TEditorPanes(BView* page, BRect frame)
	: fPanes(),
	  fShown(PET_NONE),
	  fStringField(nullptr),
	  fModalField(nullptr),
	  fModalButton(nullptr),
	  fListField(nullptr),
	  fListButton(nullptr),
	  fPickField(nullptr),
	  fPickMenu(nullptr)
{
	for (int32 type = PET_STRING; type < kCount; type++) {
		fPanes[type] = new BBox(frame, kPaneNames[type], B_FOLLOW_LEFT_RIGHT | B_FOLLOW_TOP);
		if (type != fShown)
			fPanes[type]->Hide();
		page->AddChild(fPanes[type]);
	}
}


void
TEditorPanes::InitEditorFor(TPropEditType type)
{
	const float width = fPanes[type]->Bounds().Width() - 2 * kInset;
	switch (type) {
		case PET_STRING:
			fStringField = AddField(type, "efStringEdit", width, PWM_STRING_EDIT);
			break;

		case PET_MODAL:
			fModalField = AddField(type, "efModalEdit", width - kButtonWidth, PWM_MODAL_EDIT_FIELD);
			fModalField->TextView()->MakeEditable(false);
			fModalField->SetFlags(fModalField->Flags() & ~B_NAVIGABLE);
			fModalButton = AddButton(type, "btnModalEdit", PWM_MODAL_EDIT_BUTTON);
			break;

		case PET_LIST:
			fListField = AddField(type, "efListEdit", width - kButtonWidth, PWM_LIST_EDIT_FIELD);
			fListButton = AddButton(type, "btnListEdit", PWM_LIST_EDIT_BUTTON);
			break;

		case PET_PICKLIST:
		{
			fPickMenu = new BPopUpMenu("mnuPickEdit");
			const BRect frame = fPanes[type]->Bounds().InsetByCopy(kInset, kInset);
			fPickField = new BMenuField(frame, "mfPickEdit", "String:", fPickMenu, true,
				B_FOLLOW_LEFT_RIGHT | B_FOLLOW_TOP);
			fPanes[type]->AddChild(fPickField);
			break;
		}

		case PET_NONE:
			break;
	}
}


bool
TEditorPanes::Show(TPropEditType type, const TEditorState& state)
{
	const bool focusLost = ShowPane(type);
	BString label(state.name);
	label << ":";
	switch (type) {
		case PET_STRING:
			SetLabel(fStringField, label);
			SetLimitedText(fStringField, state);
			break;

		case PET_MODAL:
		{
			SetLabel(fModalField, label);
			SetLimitedText(fModalField, state);
			fModalField->TextView()->MakeEditable(false);
			BMessage* message = new BMessage(PWM_MODAL_EDIT_BUTTON);
			message->AddPointer("prop", state.property);
			fModalButton->SetMessage(message);
			break;
		}

		case PET_LIST:
			SetLabel(fListField, label);
			fListField->SetText(state.displayValue.String());
			break;

		case PET_PICKLIST:
			SetLabel(fPickField, label);
			FillPickMenu(state);
			break;

		case PET_NONE:
			break;
	}
	return focusLost;
}


void
TEditorPanes::Focus()
{
	BView* const controls[] = {fStringField, fModalButton, fListField, fPickField, nullptr};
	if (controls[fShown] != nullptr)
		controls[fShown]->MakeFocus(true);
}


void
TEditorPanes::PressButton()
{
	if (fShown == PET_MODAL)
		fModalButton->Invoke();
	else if (fShown == PET_LIST)
		fListButton->Invoke();
}


void
TEditorPanes::FlipPick()
{
	BMenuItem* first = fPickMenu->ItemAt(0);
	BMenuItem* second = fPickMenu->ItemAt(1);
	if (first == nullptr || second == nullptr)
		return;
	BMenuItem* other = first->IsMarked() ? second : first;
	other->SetMarked(true);
	if (other->Message() != nullptr)
		fPickField->Window()->PostMessage(other->Message());
}


BTextControl*
TEditorPanes::FocusedField() const
{
	for (BTextControl* field : {fStringField, fListField}) {
		if (field->TextView()->IsFocus())
			return field;
	}
	return nullptr;
}


const char*
TEditorPanes::StringText() const
{
	return fStringField->Text();
}


void
TEditorPanes::SetModalText(const char* text)
{
	fModalField->SetText(ShownValue(text).String());
}


bool
TEditorPanes::ShowPane(TPropEditType type)
{
	bool focusLost = false;
	if (fShown != type) {
		focusLost = TakeFocus(fShown);
		fPanes[fShown]->Hide();
		fShown = type;
		fPanes[fShown]->Show();
	}
	fPanes[fShown]->Invalidate();
	return focusLost;
}


/// Takes the keyboard focus from a pane that is about to be hidden. True when the pane had it.
bool
TEditorPanes::TakeFocus(TPropEditType type)
{
	const BWindow* window = fPanes[type]->Window();
	BView* focus = window != nullptr ? window->CurrentFocus() : nullptr;
	for (const BView* view = focus; view != fPanes[type]; view = view->Parent()) {
		if (view == nullptr)
			return false;
	}
	// A field tells of a change when it loses the focus, and this one is for a property that is shown no more.
	for (BTextControl* field : {fStringField, fListField})
		field->SetText("");
	focus->MakeFocus(false);
	return true;
}


BTextControl*
TEditorPanes::AddField(TPropEditType type, const char* name, float width, uint32 command)
{
	const BRect inside = fPanes[type]->Bounds().InsetByCopy(kInset, kInset);
	const BRect frame(inside.left, inside.top, inside.left + width, inside.bottom);
	BTextControl* field = new BTextControl(
		frame, name, "String:", "", new BMessage(command), B_FOLLOW_LEFT_RIGHT | B_FOLLOW_TOP);
	fPanes[type]->AddChild(field);
	return field;
}


BButton*
TEditorPanes::AddButton(TPropEditType type, const char* name, uint32 command)
{
	BRect frame = fPanes[type]->Bounds().InsetByCopy(kInset, kInset);
	frame.left = frame.right - kButtonWidth + kInset;
	BButton* button =
		new BButton(frame, name, "...", new BMessage(command), B_FOLLOW_RIGHT | B_FOLLOW_TOP);
	fPanes[type]->AddChild(button);
	return button;
}


/// Whether the menu's items are those for \a state. What is marked may differ.
bool
TEditorPanes::PickMenuOffers(const TEditorState& state) const
{
	const int32 count = fPickMenu->CountItems();
	if (!state.hasEditor || count != static_cast<int32>(state.choices.size()))
		return false;
	for (int32 i = 0; i < count; i++) {
		const BMenuItem* item = fPickMenu->ItemAt(i);
		void* property;
		if (state.choices[i] != item->Label() || item->Message() == nullptr
			|| item->Message()->FindPointer("prop", &property) != B_OK
			|| property != state.property)
			return false;
	}
	return true;
}


/// Offers the editor's choices, the one that is the property's value marked.
void
TEditorPanes::FillPickMenu(const TEditorState& state)
{
	// A menu that is open keeps the items that the user is choosing from.
	if (PickMenuOffers(state)) {
		fPickField->MenuItem()->SetLabel(state.value.String());
		for (int32 i = 0; i < fPickMenu->CountItems(); i++)
			fPickMenu->ItemAt(i)->SetMarked(state.choices[i] == state.value);
		return;
	}

	fPickMenu->RemoveItems(0, fPickMenu->CountItems(), true);
	// What the field shows while no item is marked.
	fPickField->MenuItem()->SetLabel(state.value.String());
	if (!state.hasEditor) {
		fPickMenu->AddItem(new BMenuItem("No editor!", nullptr));
		return;
	}

	for (const BString& choice : state.choices) {
		BMessage* message = new BMessage(PWM_PICK);
		message->AddPointer("prop", state.property);
		message->AddString("caption", choice);
		BMenuItem* item = new BMenuItem(choice.String(), message);
		fPickMenu->AddItem(item);
		if (choice == state.value)
			item->SetMarked(true);
	}
	fPickMenu->SetTargetForItems(fPickField->Window());
}
