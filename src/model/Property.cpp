// SPDX-License-Identifier: MIT
// One named property of a component.

#include "model/Property.h"

#include <cstdio>
#include <cstring>
#include <string_view>

#include <String.h>

#include "model/BlockPool.h"
#include "model/Component.h"
#include "props/PropertyWatch.h"

/// The longest set statement, in bytes.
static const int32 kMaxSetStatement = 1103;


static const char*
NameOf(const TComponent* component)
{
	return component != nullptr ? component->ComponentName() : "";
}


static bool
HasText(const TRarePropertyText& text)
{
	return text.IsSet() && text.Text()[0] != '\0';
}


TProperty::TProperty(TComponent* component, const char* name, const char* value,
	TPropertyEditor* editor, bool generated)
	: fComponent(component),
	  fEditor(editor),
	  fQuoted(false),
	  fGenerated(generated),
	  fNextStored(nullptr)
{
	const size_t length = name != nullptr ? strnlen(name, sizeof(fName) - 1) : 0;
	if (length > 0)
		memcpy(fName, name, length);
	fName[length] = '\0';
	fValue.SetTo(value);
}


TProperty::TProperty(const TProperty& other)
	: fComponent(other.fComponent),
	  fEditor(other.fEditor),
	  fQuoted(other.fQuoted),
	  fGenerated(other.fGenerated),
	  fNextStored(nullptr)
{
	memcpy(fName, other.fName, sizeof(fName));
	fValue.Fill(other.fValue.Text());
	fDefValue.SetTo(other.fDefValue.Text());
	fSetStatement.SetTo(other.fSetStatement.Text());
	fGetStatement.SetTo(other.fGetStatement.Text());
}


TProperty::~TProperty()
{
	KeepStored();
	TPropertyWatch::PropertyGone(this);
}


void*
TProperty::operator new(size_t size)
{
	return TBlockPool::Allocate(size);
}


void
TProperty::operator delete(void* memory)
{
	TBlockPool::Free(memory);
}


TComponent*
TProperty::Owner() const
{
	return fComponent;
}


const char*
TProperty::Name() const
{
	return fName;
}


TPropertyEditor*
TProperty::Editor() const
{
	return fEditor;
}


void
TProperty::SetEditor(TPropertyEditor* editor)
{
	fEditor = editor;
}


void
TProperty::SetSetStatement(const char* statement)
{
	fSetStatement.SetTo(statement);
}


BString
TProperty::SetStatement() const
{
	if (HasText(fSetStatement))
		return BString(fSetStatement.Text());

	const std::string_view quote = fQuoted ? "\"" : "";
	const std::string_view parts[] = {
		NameOf(fComponent), "->Set", Name(), "(", quote, Value(), quote, ");"};
	char statement[kMaxSetStatement];
	size_t length = 0;
	for (const std::string_view& part : parts)
		length += part.copy(statement + length, kMaxSetStatement - length);
	return BString(statement, static_cast<int32>(length));
}


bool
TProperty::HasSetStatement() const
{
	return HasText(fSetStatement);
}


void
TProperty::SetGetStatement(const char* statement)
{
	fGetStatement.SetTo(statement);
}


BString
TProperty::GetStatement() const
{
	if (HasText(fGetStatement))
		return BString(fGetStatement.Text());

	BString statement;
	statement << NameOf(fComponent) << "->" << Name() << "()";
	return statement;
}


void
TProperty::WriteExtendedData(BMessage*) const
{
}


void
TProperty::ReadExtendedData(const BMessage*)
{
}


void
TProperty::SetValue(const char* value)
{
	KeepStored();
	TakeValue(value);
}


void
TProperty::FillValue(const char* value)
{
	KeepStored();
	KeepDefault(value);
	fValue.Fill(value);
}


bool
TProperty::IsDefValue() const
{
	return strcmp(Value(), DefValue()) == 0;
}


void
TProperty::KeepDefault(const char* newValue)
{
	if (newValue != nullptr && !fDefValue.IsSet() && strcmp(newValue, Value()) != 0)
		fDefValue.SetTo(Value());
}


/// The store keeps the old value, whatever becomes of the property.
void
TProperty::KeepStored()
{
	if (fNextStored != nullptr)
		fComponent->PropertyStore();
}


void
TProperty::TakeValue(const char* value)
{
	KeepDefault(value);
	fValue.SetTo(value);
}
