// SPDX-License-Identifier: MIT
// An ordered list of pointers.

#ifndef _BE_LIST_H
#define _BE_LIST_H

#include <vector>

#include <SupportDefs.h>

/// An ordered list of pointers, which it never owns. Not locked.
class BList {
public:
	BList(int32 blockSize = 20);
	BList(const BList& other);
	virtual ~BList();

	BList& operator=(const BList& other);
	bool operator==(const BList& other) const;
	bool operator!=(const BList& other) const;

	/// False, nothing changed, unless 0 <= \a index <= CountItems().
	bool AddItem(void* item, int32 index);
	bool AddItem(void* item);
	bool AddList(const BList* list, int32 index);
	bool AddList(const BList* list);

	/// Removes the first match only.
	bool RemoveItem(void* item);
	/// The removed pointer, null when there is no such index.
	void* RemoveItem(int32 index);
	/// \a count is clipped to the end of the list.
	bool RemoveItems(int32 index, int32 count);
	bool ReplaceItem(int32 index, void* item);
	/// Forgets the pointers; frees none of what they point to.
	void MakeEmpty();

	/// \a compareFunc gets pointers to two of the stored pointers.
	void SortItems(int (*compareFunc)(const void*, const void*));
	bool SwapItems(int32 indexA, int32 indexB);
	/// Shifts the items between.
	bool MoveItem(int32 from, int32 to);

	void* ItemAt(int32 index) const
	{
		return index >= 0 && index < CountItems() ? fItems[index] : nullptr;
	}
	void* FirstItem() const;
	void* LastItem() const;
	/// Without a check of the index.
	void* ItemAtFast(int32 index) const;
	/// The stored pointers, valid until the list changes; null when it is empty.
	void* Items() const;

	bool HasItem(void* item) const;
	bool HasItem(const void* item) const;
	int32 IndexOf(void* item) const;
	int32 IndexOf(const void* item) const;
	int32 CountItems() const { return static_cast<int32>(fItems.size()); }
	bool IsEmpty() const;

	/// Stops when \a func returns true.
	void DoForEach(bool (*func)(void* item));
	void DoForEach(bool (*func)(void* item, void* arg2), void* arg2);

private:
	std::vector<void*> fItems;
};

#endif // _BE_LIST_H
