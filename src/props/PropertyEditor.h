// SPDX-License-Identifier: MIT
// How the property window edits one property.

#pragma once

#include <stddef.h>

class BString;
class TComponent;
class TProperty;
class TStringList;

/// The in-place editor that the property window shows.
enum TPropEditType {
	PET_STRING = 0,   ///< a text field
	PET_MODAL = 1,    ///< the display text, and a button that calls ModalEdit()
	PET_LIST = 2,     ///< a text field and a button, for a list of strings
	PET_PICKLIST = 3, ///< a menu with GetValuePickList()
	PET_NONE = 4      ///< nothing
};

/// The editor of one property of one component.
///
/// It has no text of its own: its value is the property's. Nobody owns it: it lives on when component
/// and property are gone, until the designer, having deleted the component, deletes it as well. Component libraries derive from it: the order of the fields and of the virtual
/// operations is a binary interface. Use it in the thread of the form that the component lives on, or
/// with that form's window locked.
class TPropertyEditor {
public:
	/// \a component may be null: the editor then writes the property and notifies nobody. \a property
	/// may be null: TComponent::AddPropAndEditor() sets it.
	TPropertyEditor(TComponent* component, TProperty* property, TPropEditType type);
	virtual ~TPropertyEditor();

	/// From the memory that the parts of components share.
	static void* operator new(size_t size);
	static void operator delete(void* memory);
	TPropertyEditor(const TPropertyEditor&) = delete;
	TPropertyEditor& operator=(const TPropertyEditor&) = delete;

	virtual void Activate();

	/// Opens the editor's dialog. False when there is none, or nothing was edited.
	virtual bool ModalEdit();

	virtual void Modified();
	virtual void Initialize();

	/// The longest text that may be typed, in bytes.
	virtual long EditLimit();

	/// Gives the property the new text, when the component's PropertyModified() allows it: at most 1024
	/// bytes are copied, and a null \a value leaves the text as it is. With \a notify the component's
	/// SetPropertyValue() then applies it, and a text that changed marks the component modified, unless
	/// its owner's ComponentPropertyModified() is against.
	virtual void SetValue(const char* value, bool notify);

	/// The property's text, or null without a property.
	virtual const char* GetValue() const;

	/// The text that the property window shows in place of the value.
	virtual const char* GetDisplayValue() const;

	/// Fills \a list (the caller's) with constant texts, nothing here.
	virtual void GetValuePickList(TStringList* list);
	virtual void GetValueList(TStringList* list);

	/// The way of dialogs: gives the property \a value and lets the component apply it, without asking the
	/// component first. A null \a value is ignored.
	void ApplyValue(const char* value);

	TPropEditType Type() const { return fType; }
	TComponent* Component() const { return fComponent; }
	TProperty* Property() const { return fProperty; }
	void SetProperty(TProperty* property) { fProperty = property; }

private:
	void TakeValue(const char* value, bool notify);
	void ApplyChange(const BString& oldValue, const BString& newValue);

	TComponent* fComponent;
	TProperty* fProperty;
	TPropEditType fType;
};
