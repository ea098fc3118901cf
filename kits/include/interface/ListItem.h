// SPDX-License-Identifier: MIT
// The rows of list views.
#ifndef _LIST_ITEM_H
#define _LIST_ITEM_H

#include <Archivable.h>
#include <Rect.h>

class BFont;
class BListView;
class BOutlineListView;
class BView;

/// A row of a list view, which never owns it: delete it after it was removed.
///
/// Use an item of an attached list with that list's window locked. Changes show after
/// BListView::InvalidateItem(). An item belongs to one list at a time.
class BListItem : public BArchivable {
public:
	/// \a outlineLevel: how deep the item lies in an outline list, 0 for the top.
	BListItem(uint32 outlineLevel = 0, bool expanded = true);
	BListItem(BMessage* archive);
	virtual ~BListItem();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	/// Pixels in the right-left sense: a row of height 15 covers 16 pixels.
	float Height() const;
	float Width() const;
	void SetHeight(float height);
	void SetWidth(float width);

	bool IsSelected() const;
	/// The flag alone: nothing is sent, and no other item deselected. Lists are told by BListView::Select().
	void Select();
	void Deselect();

	/// A disabled item cannot be selected.
	virtual void SetEnabled(bool enabled);
	bool IsEnabled() const;

	/// Draws the row \a frame, \a owner's coordinates, within \a owner's Draw(); leave the colours as they
	/// were. The background is there already unless \a complete is true or the item is selected.
	virtual void DrawItem(BView* owner, BRect frame, bool complete = false) = 0;
	/// Sets height and width for \a font: those of a line, and the owner's width. Called when the item
	/// gets into an attached list, and when the list's font changes.
	virtual void Update(BView* owner, const BFont* font);

	/// Whether the subitems are shown. In a list, use BOutlineListView::Expand() and Collapse().
	bool IsExpanded() const;
	void SetExpanded(bool expanded);
	uint32 OutlineLevel() const;
	/// Only while the item is in no list.
	void SetOutlineLevel(uint32 level);

private:
	friend class BListView;
	friend class BOutlineListView;

	BListItem(const BListItem&) = delete;
	BListItem& operator=(const BListItem&) = delete;

	// The list that it was put in last, at that time.
	uint64 fStamp;
	float fTop;
	float fRowHeight;
	float fHeight;
	float fWidth;
	uint32 fLevel;
	bool fSelected;
	bool fEnabled;
	bool fExpanded;
	bool fHasSubitems;
	bool fVisible;
};

#include <StringItem.h>

#endif // _LIST_ITEM_H
