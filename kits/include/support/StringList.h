// SPDX-License-Identifier: MIT
// An ordered list of texts.

#ifndef _STRING_LIST_H
#define _STRING_LIST_H

#include <vector>

#include <Flattenable.h>
#include <String.h>

/// An ordered list of texts, which it copies. Not locked.
class BStringList : public BFlattenable {
public:
	BStringList(int32 count = 20);
	BStringList(const BStringList& other);
	virtual ~BStringList();

	/// False, nothing changed, unless 0 <= \a index <= CountStrings().
	bool Add(const BString& string, int32 index);
	bool Add(const BString& string);
	bool Add(const BStringList& list, int32 index);
	bool Add(const BStringList& list);

	/// Removes every match; false when there was none.
	bool Remove(const BString& string, bool ignoreCase = false);
	/// Removes every text that is in \a list; false when there was none.
	bool Remove(const BStringList& list, bool ignoreCase = false);
	/// The removed text, empty when there is no such index.
	BString Remove(int32 index);
	/// \a count is clipped to the end of the list.
	bool Remove(int32 index, int32 count);
	bool Replace(int32 index, const BString& string);
	void MakeEmpty();

	bool Swap(int32 indexA, int32 indexB);
	bool Move(int32 fromIndex, int32 toIndex);

	/// The empty text when there is none.
	BString StringAt(int32 index) const;
	BString First() const;
	BString Last() const;

	bool HasString(const BString& string, bool ignoreCase = false) const;
	/// The first match, -1 when there is none.
	int32 IndexOf(const BString& string, bool ignoreCase = false) const;
	int32 CountStrings() const;
	bool IsEmpty() const;

	/// All texts with \a separator between; \a length: the bytes of it to use, -1 for all.
	BString Join(const char* separator, int32 length = -1) const;

	BStringList& operator=(const BStringList& other);
	bool operator==(const BStringList& other) const;
	bool operator!=(const BStringList& other) const;

	bool IsFixedSize() const override;
	type_code TypeCode() const override;
	bool AllowsTypeCode(type_code code) const override;
	ssize_t FlattenedSize() const override;
	/// The texts one after another, each with its null byte.
	status_t Flatten(void* buffer, ssize_t size) const override;
	/// B_BAD_TYPE for another type, B_BAD_DATA for a text without an end; the list is unchanged then.
	status_t Unflatten(type_code code, const void* buffer, ssize_t size) override;

private:
	std::vector<BString> fStrings;
};

#endif // _STRING_LIST_H
