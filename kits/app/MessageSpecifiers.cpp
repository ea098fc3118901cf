// SPDX-License-Identifier: MIT
// The specifiers of a scripting message: which property of which object it is about.

#include <Errors.h>

#include "app/MessagePrivate.h"

namespace {

constexpr char kSpecifiersField[] = "specifiers";
constexpr char kPropertyField[] = "property";
constexpr char kNameField[] = "name";
constexpr char kIndexField[] = "index";
constexpr char kRangeField[] = "range";

} // namespace


status_t
BMessage::AddSpecifier(const char* property)
{
	BMessage specifier(B_DIRECT_SPECIFIER);
	const status_t status = specifier.AddString(kPropertyField, property);
	return status == B_OK ? AddSpecifier(&specifier) : status;
}


status_t
BMessage::AddSpecifier(const char* property, int32 index)
{
	BMessage specifier(B_INDEX_SPECIFIER);
	status_t status = specifier.AddString(kPropertyField, property);
	if (status == B_OK)
		status = specifier.AddInt32(kIndexField, index);
	return status == B_OK ? AddSpecifier(&specifier) : status;
}


status_t
BMessage::AddSpecifier(const char* property, int32 index, int32 range)
{
	if (range < 0)
		return B_BAD_VALUE;

	BMessage specifier(B_RANGE_SPECIFIER);
	status_t status = specifier.AddString(kPropertyField, property);
	if (status == B_OK)
		status = specifier.AddInt32(kIndexField, index);
	if (status == B_OK)
		status = specifier.AddInt32(kRangeField, range);
	return status == B_OK ? AddSpecifier(&specifier) : status;
}


status_t
BMessage::AddSpecifier(const char* property, const char* name)
{
	BMessage specifier(B_NAME_SPECIFIER);
	status_t status = specifier.AddString(kPropertyField, property);
	if (status == B_OK)
		status = specifier.AddString(kNameField, name);
	return status == B_OK ? AddSpecifier(&specifier) : status;
}


status_t
BMessage::AddSpecifier(const BMessage* specifier)
{
	const status_t status = AddMessage(kSpecifiersField, specifier);
	if (status != B_OK)
		return status;
	fCurrentSpecifier++;
	fFlags |= Private::kHasSpecifiers;
	return B_OK;
}


status_t
BMessage::SetCurrentSpecifier(int32 index)
{
	type_code type;
	int32 count;
	const status_t status = GetInfo(kSpecifiersField, &type, &count);
	if (status != B_OK)
		return status;
	if (index < 0 || index >= count)
		return B_BAD_INDEX;
	fCurrentSpecifier = index;
	return B_OK;
}


status_t
BMessage::GetCurrentSpecifier(
	int32* index, BMessage* specifier, int32* what, const char** property) const
{
	if (index != nullptr)
		*index = fCurrentSpecifier;
	if (fCurrentSpecifier < 0 || !WasDelivered())
		return B_BAD_SCRIPT_SYNTAX;
	// The property's name points into the specifier, so there must be one that stays.
	if (specifier == nullptr && property != nullptr)
		return B_BAD_VALUE;

	BMessage scratch;
	if (specifier == nullptr)
		specifier = &scratch;
	if (FindMessage(kSpecifiersField, fCurrentSpecifier, specifier) != B_OK)
		return B_BAD_SCRIPT_SYNTAX;
	if (what != nullptr)
		*what = int32(specifier->what);
	if (property != nullptr && specifier->FindString(kPropertyField, property) != B_OK)
		return B_BAD_SCRIPT_SYNTAX;
	return B_OK;
}


bool
BMessage::HasSpecifiers() const
{
	return (fFlags & Private::kHasSpecifiers) != 0;
}


status_t
BMessage::PopSpecifier()
{
	if (fCurrentSpecifier < 0 || !WasDelivered())
		return B_BAD_VALUE;
	fCurrentSpecifier--;
	return B_OK;
}
