// SPDX-License-Identifier: MIT
// The in-place editors of the property window.

#include "props/EditorPanes.h"

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
#include "props/StringList.h"

namespace {

constexpr float kInset = 5;
constexpr float kButtonWidth = 25;
constexpr float kLabelGap = 6;
constexpr const char* kPaneNames[] = {"String", "Modal", "List", "PickList", "None"};

/// At most what a property's text holds: one filled to its last byte has no terminator of its own.
BString
ShownText(const char* text)
{
	return text != nullptr ? BString(text, TPropertyText::kSize) : BString();
}


/// Labels a text or menu field and leaves the rest of its width to what is edited.
template <typename Field>
void
SetLabel(Field* field, const BString& label)
{
	field->SetLabel(label.String());
	field->SetDivider(field->StringWidth(label.String()) + kLabelGap);
}

} // namespace

TEditorState::TEditorState(TProperty* property, TPropertyEditor* editor, TPropEditType type)
	: name(property->Name()),
	  value(ShownText(property->Value())),
	  limit(TPropertyText::kSize),
	  hasEditor(editor != nullptr)
{
	if (editor == nullptr)
		return;
	displayValue = ShownText(editor->GetDisplayValue());
	limit = static_cast<int32>(editor->EditLimit());
	if (type != PET_PICKLIST)
		return;
	TStringList list(20);
	editor->GetValuePickList(&list);
	for (int32 i = 0; i < list.CountItems(); i++)
		choices.push_back(list.StringAt(i));
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
			fModalField->TextView()->SetFlags(fModalField->TextView()->Flags() & ~B_NAVIGABLE);
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


void
TEditorPanes::Show(TPropEditType type, TProperty* property, const TEditorState& state)
{
	ShowPane(type);
	BString label(state.name);
	label << ":";
	switch (type) {
		case PET_STRING:
			SetLabel(fStringField, label);
			fStringField->TextView()->SetMaxBytes(state.limit);
			fStringField->SetText(state.displayValue.String());
			break;

		case PET_MODAL:
		{
			SetLabel(fModalField, label);
			fModalField->SetText(state.displayValue.String());
			fModalField->TextView()->SetMaxBytes(state.limit);
			fModalField->TextView()->MakeEditable(false);
			BMessage* message = new BMessage(PWM_MODAL_EDIT_BUTTON);
			message->AddPointer("prop", property);
			fModalButton->SetMessage(message);
			break;
		}

		case PET_LIST:
			SetLabel(fListField, label);
			fListField->SetText(state.displayValue.String());
			break;

		case PET_PICKLIST:
			SetLabel(fPickField, label);
			FillPickMenu(property, state);
			break;

		case PET_NONE:
			break;
	}
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


const char*
TEditorPanes::StringText() const
{
	return fStringField->Text();
}


void
TEditorPanes::SetModalText(const char* text)
{
	fModalField->SetText(ShownText(text).String());
}


void
TEditorPanes::ShowPane(TPropEditType type)
{
	if (fShown != type) {
		fPanes[fShown]->Hide();
		fShown = type;
		fPanes[fShown]->Show();
	}
	fPanes[fShown]->Invalidate();
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


/// Offers the editor's choices, the one that is the property's value marked.
void
TEditorPanes::FillPickMenu(TProperty* property, const TEditorState& state)
{
	fPickMenu->RemoveItems(0, fPickMenu->CountItems(), true);
	if (!state.hasEditor) {
		fPickMenu->AddItem(new BMenuItem("No editor!", nullptr));
		return;
	}

	for (const BString& choice : state.choices) {
		BMessage* message = new BMessage(PWM_PICK);
		message->AddPointer("prop", property);
		message->AddString("caption", choice);
		BMenuItem* item = new BMenuItem(choice.String(), message);
		fPickMenu->AddItem(item);
		if (choice == state.value)
			item->SetMarked(true);
	}
	fPickMenu->SetTargetForItems(fPickField->Window());
}
