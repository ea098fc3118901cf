// SPDX-License-Identifier: MIT
// A list with subitems that can be hidden.
#ifndef _OUTLINE_LIST_VIEW_H
#define _OUTLINE_LIST_VIEW_H

#include <vector>

#include <ListView.h>

/// A list whose items lie under each other in levels.
///
/// The full list holds all items in order; a superitem comes before its subitems, which lie one or more
/// levels deeper. What BListView counts by index are the visible items only: those whose superitems are
/// all expanded. An item with subitems shows a latch, a triangle, at its left. Lock the window as for any view.
class BOutlineListView : public BListView {
public:
	BOutlineListView(BRect frame, const char* name, list_view_type type = B_SINGLE_SELECTION_LIST,
		uint32 resizingMode = B_FOLLOW_LEFT_TOP,
		uint32 flags = B_WILL_DRAW | B_FRAME_EVENTS | B_NAVIGABLE);
	BOutlineListView(const char* name, list_view_type type = B_SINGLE_SELECTION_LIST,
		uint32 flags = B_WILL_DRAW | B_FRAME_EVENTS | B_NAVIGABLE);
	BOutlineListView(BMessage* archive);
	virtual ~BOutlineListView();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void MouseDown(BPoint where) override;
	void MouseUp(BPoint where) override;
	void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage) override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void FrameMoved(BPoint newPosition) override;
	void FrameResized(float newWidth, float newHeight) override;
	void ResizeToPreferred() override;
	void GetPreferredSize(float* _width, float* _height) override;
	void MakeFocus(bool focus = true) override;
	void AllAttached() override;
	void AllDetached() override;
	void DetachedFromWindow() override;
	void MessageReceived(BMessage* message) override;

	/// \a item becomes the first subitem of \a superItem, one level deeper; of null: the first of all, at
	/// level 0. False for null, an item that is in the list already, or a superitem that is not.
	virtual bool AddUnder(BListItem* item, BListItem* superItem);
	/// At the end of the full list, or at an index of it, at the item's own level.
	bool AddItem(BListItem* item) override;
	bool AddItem(BListItem* item, int32 fullListIndex) override;
	bool AddList(BList* newItems) override;
	bool AddList(BList* newItems, int32 fullListIndex) override;
	/// Takes the subitems out too; all of them are the caller's again.
	bool RemoveItem(BListItem* item) override;
	BListItem* RemoveItem(int32 fullListIndex) override;
	/// \a count items of the full list, and the subitems of the last ones.
	bool RemoveItems(int32 fullListIndex, int32 count) override;
	void MakeEmpty() override;

	BListItem* FullListItemAt(int32 fullListIndex) const;
	/// The index in the full list of the row at \a where, -1 beyond the rows.
	int32 FullListIndexOf(BPoint where) const;
	int32 FullListIndexOf(BListItem* item) const;
	BListItem* FullListFirstItem() const;
	BListItem* FullListLastItem() const;
	bool FullListHasItem(BListItem* item) const;
	int32 FullListCountItems() const;
	bool FullListIsEmpty() const;
	/// The \a index th selected item's place in the full list, -1 when there are not so many.
	int32 FullListCurrentSelection(int32 index = 0) const;
	/// Stops when \a func returns true.
	void FullListDoForEach(bool (*func)(BListItem* item));
	void FullListDoForEach(bool (*func)(BListItem* item, void* arg), void* arg);
	/// Sorts the subitems of each item; all stay under their superitem. Equal items keep their order.
	void FullListSortItems(int (*compareFunc)(const BListItem* first, const BListItem* second));

	/// The next item before \a item with a lower level; null when there is none.
	BListItem* Superitem(const BListItem* item);
	/// An item that gets hidden is deselected.
	void Expand(BListItem* item);
	void Collapse(BListItem* item);
	/// False for a bad index.
	bool IsExpanded(int32 fullListIndex);

	/// Of all these, a null superitem stands for the whole list, whose top items are its one level.
	void SortItemsUnder(BListItem* superItem, bool oneLevelOnly,
		int (*compareFunc)(const BListItem* first, const BListItem* second));
	/// 0 for a superitem that is not in the list.
	int32 CountItemsUnder(BListItem* superItem, bool oneLevelOnly) const;
	/// Stops at the first item for which \a eachFunc returns an item, and returns that one; else null.
	BListItem* EachItemUnder(BListItem* superItem, bool oneLevelOnly,
		BListItem* (*eachFunc)(BListItem* item, void* arg), void* arg);
	BListItem* ItemUnderAt(BListItem* superItem, bool oneLevelOnly, int32 index) const;

protected:
	virtual void ExpandOrCollapse(BListItem* superItem, bool expand);
	/// Where the latch of an item in the row \a itemRect is.
	virtual BRect LatchRect(BRect itemRect, int32 level) const;
	/// \a misTracked: the button is held, but the pointer left the latch.
	virtual void DrawLatch(
		BRect itemRect, int32 level, bool collapsed, bool highlighted, bool misTracked);
	void DrawItem(BListItem* item, BRect itemRect, bool complete = false) override;

private:
	void SortAll(int (*cmp)(const void*, const void*)) override;
	bool SwapChecked(int32 a, int32 b) override;
	bool MoveChecked(int32 from, int32 to) override;
	bool ReplaceChecked(int32 index, BListItem* item) override;
	const std::vector<BListItem*>& ArchivedItems() const override;
	float RowIndent(const BListItem* item) const override;

	// Places in the full list
	int32 EndOfBranch(int32 fullIndex) const;
	int32 SuperIndex(int32 fullIndex) const;
	bool GetUnder(BListItem* superItem, int32* first, int32* end) const;
	int32 NextUnder(int32 fullIndex, bool oneLevelOnly) const;
	void InsertFull(int32 fullIndex, BListItem* item);
	void TakeOut(int32 first, int32 count);
	void FindSubitems(int32 fullIndex);
	template <typename Less>
	void SortBranches(int32 first, int32 end, bool oneLevelOnly, const Less& less);

	// Rows
	bool ShouldShow(int32 fullIndex) const;
	int32 RowFor(int32 fullIndex) const;
	int32 CountRows(int32 first, int32 end) const;
	void GetShown(int32 first, int32 end, std::vector<BListItem*>* shown) const;
	void RebuildRows();
	void ShowBranch(int32 fullIndex);
	void HideBranch(int32 fullIndex);

	bool MoveByOutlineKey(char key);
	BListItem* LatchAt(BPoint where);
	void ReleaseLatch();

	std::vector<BListItem*> fFullItems;
	mutable int32 fLastFound;
	BListItem* fPressedLatch;
	bool fLatchMisTracked;
};

#endif // _OUTLINE_LIST_VIEW_H
