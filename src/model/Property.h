// SPDX-License-Identifier: MIT
// One named property of a component.

#pragma once

#include <stddef.h>

#include "model/PropertyText.h"

class BMessage;
class BString;
class TComponent;
class TPropertyEditor;

/// One property of a component, held as text: its value, its default, and the two statements that
/// write and read it in generated source.
///
/// The name holds at most 31 bytes, every other text 1023; longer text is cut. A property belongs to
/// its component; its editor is not owned. Component libraries derive from it and override the virtual
/// operations, whose order is a binary interface. The destructor is not virtual, so a derived class
/// holds nothing that needs one. Use it in the thread of the form that the component lives on.
class TProperty {
public:
	/// \a value becomes both the value and the default; null gives empty ones. \a name and \a value
	/// are copied, \a component and \a editor (may be null) are kept as they are.
	TProperty(TComponent* component, const char* name, const char* value, TPropertyEditor* editor,
		bool generated);

	/// A copy refers to the same component and the same editor.
	TProperty(const TProperty& other);
	/// Watches of this property (TPropertyWatch) refer to none from now on.
	~TProperty();
	TProperty& operator=(const TProperty&) = delete;

	/// From the memory that the parts of components share, which does not ask for the size of what is
	/// deleted: a derived property may be deleted through this class.
	static void* operator new(size_t size);
	static void operator delete(void* memory);

	virtual TComponent* Owner() const;
	virtual const char* Name() const;
	virtual TPropertyEditor* Editor() const;

	/// Stores the pointer only: TComponent::AddPropAndEditor() links both ways.
	virtual void SetEditor(TPropertyEditor* editor);

	/// Sets the template of the statement that writes the property; null is ignored, "" stands for
	/// the standard form. "$COMPONENT" and "$VALUE" in it are replaced by the code generator.
	virtual void SetSetStatement(const char* statement);

	/// The stored template, or the standard form: Button1->SetLabel("OK"); with the component's name,
	/// the property's and the value, in double quotes when the property is quoted. Nothing is escaped.
	/// At most 1103 bytes.
	virtual BString SetStatement() const;

	/// Whether a template was set, so that SetStatement() does not give the standard form.
	bool HasSetStatement() const;

	/// Sets the template of the expression that reads the property; null is ignored.
	virtual void SetGetStatement(const char* statement);

	/// The stored template, or the standard form: Button1->Label().
	virtual BString GetStatement() const;

	/// Called when the component is saved and loaded, with the message that holds its properties, so
	/// that a derived property can keep fields of its own there. Nothing here.
	virtual void WriteExtendedData(BMessage* message) const;
	virtual void ReadExtendedData(const BMessage* message);

	/// The value: never null, always terminated, at most 1024 bytes; valid until the value changes.
	const char* Value() const { return fValue.Text(); }

	/// Null is ignored.
	void SetValue(const char* value);

	/// The editors' way to set the value: copies at most 1024 bytes, the last one not kept free for a
	/// terminator. Null is ignored.
	void FillValue(const char* value);

	/// The value that the property was created with; never null, valid until value or default change.
	const char* DefValue() const { return fDefValue.IsSet() ? fDefValue.Text() : fValue.Text(); }

	/// Null is ignored.
	void SetDefValue(const char* value) { fDefValue.SetTo(value); }

	/// Whether value and default are the same, byte for byte.
	bool IsDefValue() const;

	/// Whether the value is a string literal in generated source.
	bool IsQuoted() const { return fQuoted; }
	void SetQuoted(bool quoted) { fQuoted = quoted; }

	/// Whether the generators emit the set statement.
	bool IsGenerated() const { return fGenerated; }
	void SetGenerated(bool generated) { fGenerated = generated; }

private:
	// Which puts values into its store.
	friend class TComponent;

	void KeepDefault(const char* newValue);
	void KeepStored();
	void TakeValue(const char* value);

	static const size_t kNameSize = 32;

	char fName[kNameSize];
	TComponent* fComponent;
	TPropertyEditor* fEditor;
	TPropertyText fValue;
	TRarePropertyText fDefValue; // not set while the value has never changed
	TRarePropertyText fSetStatement;
	TRarePropertyText fGetStatement;
	bool fQuoted;
	bool fGenerated;
	// While the component has not put the value into its store: the property that was stored next, or, behind the last one,
	// the first. Null otherwise.
	TProperty* fNextStored;
};
