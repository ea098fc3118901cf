// SPDX-License-Identifier: MIT
// A list of rows that are selected and invoked.
#ifndef _LIST_VIEW_H
#define _LIST_VIEW_H

#include <memory>
#include <vector>

#include <Invoker.h>
#include <ListItem.h>
#include <View.h>

class BList;
class BScrollView;

enum list_view_type {
	B_SINGLE_SELECTION_LIST = 0,
	B_MULTIPLE_SELECTION_LIST = 1,
};

namespace BPrivate {
class ListTyping;
class PanelList;
} // namespace BPrivate

/// Items below each other, from y 0 without gaps. Indices count from 0.
///
/// The list owns its messages but never its items: removing, MakeEmpty() and the destructor leave them
/// alone. When it is attached without a target, its window becomes the target. Messages carry "index"
/// (int32) of each selected item, -1 in a single list without selection. Typed text selects the next
/// string item that begins with it. Lock the window as for any view.
class BListView : public BView, public BInvoker {
public:
	BListView(BRect frame, const char* name, list_view_type type = B_SINGLE_SELECTION_LIST,
		uint32 resizeMask = B_FOLLOW_LEFT_TOP,
		uint32 flags = B_WILL_DRAW | B_FRAME_EVENTS | B_NAVIGABLE);
	BListView(const char* name, list_view_type type = B_SINGLE_SELECTION_LIST,
		uint32 flags = B_WILL_DRAW | B_FRAME_EVENTS | B_NAVIGABLE);
	BListView(list_view_type type = B_SINGLE_SELECTION_LIST);
	BListView(BMessage* archive);
	virtual ~BListView();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void Draw(BRect updateRect) override;
	void AttachedToWindow() override;
	void DetachedFromWindow() override;
	void AllAttached() override;
	void AllDetached() override;
	void FrameResized(float newWidth, float newHeight) override;
	void FrameMoved(BPoint newPosition) override;
	void TargetedByScrollView(BScrollView* scrollView) override;
	void WindowActivated(bool active) override;
	void MessageReceived(BMessage* message) override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void MouseDown(BPoint where) override;
	void MouseUp(BPoint where) override;
	void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage) override;
	void ResizeToPreferred() override;
	/// The widest item, and the height of all.
	void GetPreferredSize(float* _width, float* _height) override;
	void MakeFocus(bool focus = true) override;
	/// Updates all items.
	void SetFont(const BFont* font, uint32 mask = B_FONT_ALL) override;
	void ScrollTo(BPoint where) override;
	void ScrollTo(float x, float y);

	/// False, nothing changed, for null, an item that is in the list already, or a bad index.
	virtual bool AddItem(BListItem* item);
	virtual bool AddItem(BListItem* item, int32 atIndex);
	/// \a newItems: of BListItem*; it stays the caller's.
	virtual bool AddList(BList* newItems);
	virtual bool AddList(BList* newItems, int32 atIndex);
	/// The item is the caller's again. A selected one is deselected before it goes.
	virtual bool RemoveItem(BListItem* item);
	/// Null for a bad index.
	virtual BListItem* RemoveItem(int32 index);
	/// \a count is cut at the list's end. False for a bad index or a count below 0.
	virtual bool RemoveItems(int32 index, int32 count);
	/// Sends no selection message.
	virtual void MakeEmpty();

	/// Both take over \a message, which may be null.
	virtual void SetSelectionMessage(BMessage* message);
	virtual void SetInvocationMessage(BMessage* message);
	BMessage* SelectionMessage() const;
	BMessage* InvocationMessage() const;
	/// The message's code, 0 without a message.
	uint32 SelectionCommand() const;
	uint32 InvocationCommand() const;

	/// A single list keeps the first of several selected items.
	virtual void SetListType(list_view_type type);
	list_view_type ListType() const;

	/// Null for a bad index.
	BListItem* ItemAt(int32 index) const;
	/// The row at \a point, view coordinates; -1 beyond the rows.
	int32 IndexOf(BPoint point) const;
	/// -1 when it is not in the list.
	int32 IndexOf(BListItem* item) const;
	BListItem* FirstItem() const;
	BListItem* LastItem() const;
	bool HasItem(BListItem* item) const;
	int32 CountItems() const;
	bool IsEmpty() const;
	/// Stops when \a func returns true.
	void DoForEach(bool (*func)(BListItem* item));
	void DoForEach(bool (*func)(BListItem* item, void* arg), void* arg);
	/// CountItems() pointers, valid until the list changes; null when it is empty.
	const BListItem** Items() const;

	/// Redraws a row, and moves those below it when its height changed.
	void InvalidateItem(int32 index);
	/// The row in view coordinates; an invalid rectangle for a bad index.
	BRect ItemFrame(int32 index);

	/// Scrolls as far as needed to show the row.
	void ScrollTo(int32 index);
	/// Shows the first selected row.
	void ScrollToSelection();

	/// Selects without scrolling; others are deselected unless \a extend in a multiple list. Disabled items
	/// and bad indices are left alone.
	void Select(int32 index, bool extend = false);
	/// Both ends included; in a single list only \a from.
	void Select(int32 from, int32 to, bool extend = false);
	bool IsItemSelected(int32 index) const;
	/// The index of the \a index th selected item, -1 when there are not so many.
	int32 CurrentSelection(int32 index = 0) const;
	void DeselectAll();
	void Deselect(int32 index);
	/// Deselects what is outside the range, both ends included.
	void DeselectExcept(int32 exceptFrom, int32 exceptTo);
	/// Called before the selection message is sent.
	virtual void SelectionChanged();

	/// \a cmp gets pointers to two BListItem*. Equal items keep their order; the selection stays.
	void SortItems(int (*cmp)(const void*, const void*));
	/// These three keep the selection with the items. False, nothing changed, for bad indices.
	bool SwapItems(int32 a, int32 b);
	bool MoveItem(int32 from, int32 to);
	/// The old item is the caller's again. False too for null or an item that is in the list already.
	bool ReplaceItem(int32 index, BListItem* item);

	/// The pointer moves with a button held on the row; \a where is where it was pressed. True when a drag
	/// was started.
	virtual bool InitiateDrag(BPoint where, int32 index, bool wasSelected);

	/// Sends a copy of \a message, null for the invocation message, with the fields above. B_BAD_VALUE
	/// when there is none.
	status_t Invoke(BMessage* message = NULL) override;

protected:
	virtual void DrawItem(BListItem* item, BRect itemRect, bool complete = false);

private:
	friend class BOutlineListView;
	friend class BPrivate::PanelList;

	/// A press that may become a drag.
	struct Press {
		int32 index = -1;
		BPoint where;
		bool wasSelected = false;
		bool selectOnRelease = false;
		bool mayDrag = false;
	};

	// What an outline list does in its own way, with checked indices of visible items.
	virtual void SortAll(int (*cmp)(const void*, const void*));
	virtual bool SwapChecked(int32 a, int32 b);
	virtual bool MoveChecked(int32 from, int32 to);
	virtual bool ReplaceChecked(int32 index, BListItem* item);
	virtual const std::vector<BListItem*>& ArchivedItems() const;
	// How far right of the list's edge a row begins.
	virtual float RowIndent(const BListItem* item) const;

	// Items
	void Stamp(BListItem* item);
	bool IsStamped(const BListItem* item) const;
	bool StampAll(const BList* list, std::vector<BListItem*>* items);
	void InsertAt(int32 index, BListItem* const* items, int32 count);
	void RemoveRange(int32 index, int32 count);
	void ReplaceAt(int32 index, BListItem* item);
	void OrderChanged(int32 first, int32 last);
	void ForgetAll();

	// Rows
	void UpdateItem(BListItem* item, const BFont& font);
	void UpdateAllItems();
	bool FitRow(BListItem* item);
	float TopOf(int32 index) const;
	float ContentHeight() const;
	float ContentWidth() const;
	int32 RowAt(float y) const;
	void InvalidateFrom(int32 index);
	void InvalidateRows(int32 first, int32 last);
	void FixScrollBars();
	bool DrawsOwnFocus() const;
	void FocusChanged();

	// Selection
	bool SelectRange(int32 from, int32 to);
	bool DeselectRange(int32 from, int32 to);
	bool SelectOnly(int32 from, int32 to);
	void FindSelectionAgain();
	void TellSelectionChanged();
	BMessage* AddSelection(BMessage* message) const;

	// Input
	void SelectByMouse(int32 index, uint32 modifiers);
	bool MoveByKey(char key, uint32 modifiers);
	void MoveCursor(int32 to, uint32 modifiers);
	void SetCursor(int32 index, bool shown);
	int32 EnabledFrom(int32 index, int32 step) const;
	int32 KeyboardRow() const;
	void ScrollByPage(int32 direction);
	bool SelectByTyping(const char* bytes, int32 numBytes);

	std::vector<BListItem*> fItems;
	std::unique_ptr<BMessage> fSelectMessage;
	std::unique_ptr<BPrivate::ListTyping> fTyping;
	BScrollView* fScrollView;
	uint64 fStamp;
	Press fPress;
	list_view_type fListType;
	// Rows before this one have their tops.
	mutable int32 fValidTops;
	double fContentHeight;
	// Below 0 when it must be looked for.
	mutable float fWidest;
	// All selected items lie between these two; -1 without.
	int32 fFirstSelected;
	int32 fLastSelected;
	int32 fAnchor;
	int32 fCursor;
	bool fShowsCursor;
};

#endif // _LIST_VIEW_H
