// SPDX-License-Identifier: MIT
// BStringList.

#include <StringList.h>

#include <string.h>

#include <algorithm>

namespace {

bool
is_same(const BString& a, const BString& b, bool ignoreCase)
{
	return ignoreCase ? a.ICompare(b) == 0 : a == b;
}

} // namespace


BStringList::BStringList(int32 count)
{
	fStrings.reserve(std::clamp<int32>(count, 0, 1024));
}


BStringList::BStringList(const BStringList& other)
	: BFlattenable(other),
	  fStrings(other.fStrings)
{
}


BStringList::~BStringList() {}


bool
BStringList::Add(const BString& string, int32 index)
{
	if (index < 0 || index > CountStrings())
		return false;
	fStrings.insert(fStrings.begin() + index, string);
	return true;
}


bool
BStringList::Add(const BString& string)
{
	return Add(string, CountStrings());
}


bool
BStringList::Add(const BStringList& list, int32 index)
{
	if (index < 0 || index > CountStrings())
		return false;
	// The list may be this one.
	std::vector<BString> added = list.fStrings;
	fStrings.insert(fStrings.begin() + index, added.begin(), added.end());
	return true;
}


bool
BStringList::Add(const BStringList& list)
{
	return Add(list, CountStrings());
}


bool
BStringList::Remove(const BString& string, bool ignoreCase)
{
	// The text may be one of the list's own.
	BString sought(string);
	return std::erase_if(fStrings, [&](const BString& text) {
		return is_same(text, sought, ignoreCase);
	}) > 0;
}


bool
BStringList::Remove(const BStringList& list, bool ignoreCase)
{
	BStringList sought(list);
	return std::erase_if(fStrings, [&](const BString& text) {
		return sought.HasString(text, ignoreCase);
	}) > 0;
}


BString
BStringList::Remove(int32 index)
{
	if (index < 0 || index >= CountStrings())
		return BString();
	BString removed(std::move(fStrings[index]));
	fStrings.erase(fStrings.begin() + index);
	return removed;
}


bool
BStringList::Remove(int32 index, int32 count)
{
	if (index < 0 || index > CountStrings() || count < 0)
		return false;
	count = std::min(count, CountStrings() - index);
	fStrings.erase(fStrings.begin() + index, fStrings.begin() + index + count);
	return true;
}


bool
BStringList::Replace(int32 index, const BString& string)
{
	if (index < 0 || index >= CountStrings())
		return false;
	fStrings[index] = string;
	return true;
}


void
BStringList::MakeEmpty()
{
	fStrings.clear();
}


bool
BStringList::Swap(int32 indexA, int32 indexB)
{
	if (indexA < 0 || indexA >= CountStrings() || indexB < 0 || indexB >= CountStrings())
		return false;
	if (indexA != indexB)
		std::swap(fStrings[indexA], fStrings[indexB]);
	return true;
}


bool
BStringList::Move(int32 fromIndex, int32 toIndex)
{
	if (fromIndex < 0 || fromIndex >= CountStrings() || toIndex < 0 || toIndex >= CountStrings())
		return false;

	auto strings = fStrings.begin();
	if (fromIndex < toIndex)
		std::rotate(strings + fromIndex, strings + fromIndex + 1, strings + toIndex + 1);
	else
		std::rotate(strings + toIndex, strings + fromIndex, strings + fromIndex + 1);
	return true;
}


BString
BStringList::StringAt(int32 index) const
{
	return index >= 0 && index < CountStrings() ? fStrings[index] : BString();
}


BString
BStringList::First() const
{
	return StringAt(0);
}


BString
BStringList::Last() const
{
	return StringAt(CountStrings() - 1);
}


bool
BStringList::HasString(const BString& string, bool ignoreCase) const
{
	return IndexOf(string, ignoreCase) >= 0;
}


int32
BStringList::IndexOf(const BString& string, bool ignoreCase) const
{
	for (int32 i = 0; i < CountStrings(); i++) {
		if (is_same(fStrings[i], string, ignoreCase))
			return i;
	}
	return -1;
}


int32
BStringList::CountStrings() const
{
	return static_cast<int32>(fStrings.size());
}


bool
BStringList::IsEmpty() const
{
	return fStrings.empty();
}


BString
BStringList::Join(const char* separator, int32 length) const
{
	BString between(separator, length < 0 ? INT32_MAX : length);
	BString result;
	for (int32 i = 0; i < CountStrings(); i++) {
		if (i > 0)
			result << between;
		result << fStrings[i];
	}
	return result;
}


BStringList&
BStringList::operator=(const BStringList& other)
{
	fStrings = other.fStrings;
	return *this;
}


bool
BStringList::operator==(const BStringList& other) const
{
	return fStrings == other.fStrings;
}


bool
BStringList::operator!=(const BStringList& other) const
{
	return !(*this == other);
}


// #pragma mark - flattening


bool
BStringList::IsFixedSize() const
{
	return false;
}


type_code
BStringList::TypeCode() const
{
	return B_STRING_LIST_TYPE;
}


bool
BStringList::AllowsTypeCode(type_code code) const
{
	return code == B_STRING_LIST_TYPE;
}


ssize_t
BStringList::FlattenedSize() const
{
	// A text ends at its first null byte here, whatever it holds behind.
	ssize_t size = 0;
	for (const BString& string : fStrings)
		size += strlen(string.String()) + 1;
	return size;
}


status_t
BStringList::Flatten(void* buffer, ssize_t size) const
{
	if (buffer == nullptr || size < FlattenedSize())
		return B_BAD_VALUE;

	char* target = static_cast<char*>(buffer);
	for (const BString& string : fStrings) {
		size_t length = strlen(string.String()) + 1;
		memcpy(target, string.String(), length);
		target += length;
	}
	return B_OK;
}


status_t
BStringList::Unflatten(type_code code, const void* buffer, ssize_t size)
{
	if (!AllowsTypeCode(code))
		return B_BAD_TYPE;
	if (size < 0 || (buffer == nullptr && size > 0))
		return B_BAD_VALUE;

	std::vector<BString> strings;
	const char* text = static_cast<const char*>(buffer);
	const char* end = text + size;
	while (text < end) {
		const void* terminator = memchr(text, '\0', end - text);
		if (terminator == nullptr)
			return B_BAD_DATA;
		strings.emplace_back(text);
		text = static_cast<const char*>(terminator) + 1;
	}
	fStrings.swap(strings);
	return B_OK;
}
