// SPDX-License-Identifier: MIT
// Lists that own their rows.

#pragma once

#include <ListView.h>
#include <OutlineListView.h>
#include <StringItem.h>

#include <ormi/views/ItemText.h>

namespace Ormi {

/// A \a List, a BListView or BOutlineListView, of string items that can be given as one text.
///
/// It owns the items that are in it: they are deleted with it. A removed item is its remover's.
template <class List>
class ItemList : public List {
public:
	ItemList(BRect frame, const char* name)
		: List(frame, name)
	{
	}

	virtual ~ItemList() { DeleteItems(); }

	/// Deletes the items so far and makes those of \a text (see ParseItems()). Levels count in outlines.
	void SetItems(const char* text)
	{
		DeleteItems();
		for (const item_text& item : ParseItems(text))
			this->AddItem(new BStringItem(item.label.String(), item.level));
	}

private:
	void DeleteItems()
	{
		std::vector<BListItem*> items;
		for (int32 i = CountOf(this); i > 0; i--)
			items.push_back(ItemOf(this, i - 1));
		this->MakeEmpty();
		for (BListItem* item : items)
			delete item;
	}

	static int32 CountOf(BListView* list) { return list->CountItems(); }
	static int32 CountOf(BOutlineListView* list) { return list->FullListCountItems(); }
	static BListItem* ItemOf(BListView* list, int32 index) { return list->ItemAt(index); }
	static BListItem* ItemOf(BOutlineListView* list, int32 index)
	{
		return list->FullListItemAt(index);
	}
};

} // namespace Ormi
