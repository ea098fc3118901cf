// SPDX-License-Identifier: MIT
// How the property window edits one property.

#include "props/PropertyEditor.h"

#include <cstring>

#include <String.h>

#include "model/BlockPool.h"
#include "model/Component.h"
#include "model/ComponentOwner.h"
#include "model/Property.h"
#include "props/ForgottenEditors.h"


TPropertyEditor::TPropertyEditor(TComponent* component, TProperty* property, TPropEditType type)
	: fComponent(component),
	  fProperty(property),
	  fType(type)
{
}


TPropertyEditor::~TPropertyEditor()
{
	TForgottenEditors::EditorGone(this);
}


void*
TPropertyEditor::operator new(size_t size)
{
	return TBlockPool::Allocate(size);
}


void
TPropertyEditor::operator delete(void* memory)
{
	TBlockPool::Free(memory);
}


void
TPropertyEditor::Activate()
{
}


bool
TPropertyEditor::ModalEdit()
{
	return false;
}


void
TPropertyEditor::Modified()
{
}


void
TPropertyEditor::Initialize()
{
}


long
TPropertyEditor::EditLimit()
{
	return 1024;
}


void
TPropertyEditor::SetValue(const char* value, bool notify)
{
	if (fProperty == nullptr)
		return;
	if (fComponent == nullptr) {
		fProperty->FillValue(value);
		return;
	}
	if (fComponent->PropertyModified(fProperty->Name(), fProperty->Value(), value))
		TakeValue(value, notify);
}


void
TPropertyEditor::ApplyValue(const char* value)
{
	if (fProperty == nullptr || value == nullptr)
		return;
	if (fComponent == nullptr)
		fProperty->FillValue(value);
	else
		TakeValue(value, true);
}


void
TPropertyEditor::TakeValue(const char* value, bool notify)
{
	if (value == nullptr || strncmp(fProperty->Value(), value, TPropertyText::kSize) == 0) {
		if (notify)
			fComponent->SetPropertyValue(fProperty->Name(), value);
		return;
	}

	// Copies: the value may be a part of the text that it replaces, or of the component's store.
	const BString oldValue(fProperty->Value());
	const BString newValue(value);
	fProperty->FillValue(newValue.String());
	if (notify)
		ApplyChange(oldValue, newValue);
}


void
TPropertyEditor::ApplyChange(const BString& oldValue, const BString& newValue)
{
	// A copy: the component may build its list of properties anew.
	const BString name(fProperty->Name());
	fComponent->SetPropertyValue(name.String(), newValue.String());

	// The component saw no change, as the property had the new text already. If it has another one by
	// now, then the component has stored that itself, and the change has been asked about.
	const TProperty* property = fComponent->FindProperty(name.String());
	if (property != nullptr
		&& strncmp(property->Value(), newValue.String(), TPropertyText::kSize - 1) != 0)
		return;

	TComponentOwner* owner = fComponent->Owner();
	if (owner == nullptr
		|| owner->ComponentPropertyModified(
			fComponent, name.String(), oldValue.String(), newValue.String()))
		fComponent->SetModified(true);
}


const char*
TPropertyEditor::GetValue() const
{
	return fProperty != nullptr ? fProperty->Value() : nullptr;
}


const char*
TPropertyEditor::GetDisplayValue() const
{
	return GetValue();
}


void
TPropertyEditor::GetValuePickList(TStringList*)
{
}


void
TPropertyEditor::GetValueList(TStringList*)
{
}
