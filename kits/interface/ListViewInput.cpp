// SPDX-License-Identifier: MIT
// BListView: mouse and keyboard.
#include <ListView.h>

#include <algorithm>
#include <cmath>

#include <Message.h>
#include <OS.h>
#include <Window.h>

#include "ListTyping.h"

namespace {

// How far the pointer goes before a press becomes a drag, in pixels.
constexpr float kDragDistance = 4;

constexpr uint32 kToggleKeys = B_COMMAND_KEY | B_OPTION_KEY;


uint32
ModifiersOf(const BMessage* message)
{
	int32 keys;
	if (message != NULL && message->FindInt32("modifiers", &keys) == B_OK)
		return static_cast<uint32>(keys);
	return modifiers();
}

} // namespace


void
BListView::MessageReceived(BMessage* message)
{
	switch (message->what) {
		case B_SELECT_ALL:
			if (fListType == B_MULTIPLE_SELECTION_LIST && !IsEmpty())
				Select(0, CountItems() - 1);
			break;

		default:
			BView::MessageReceived(message);
			break;
	}
}


void
BListView::MouseDown(BPoint where)
{
	MakeFocus(true);
	const BMessage* message = Window()->CurrentMessage();
	const uint32 keys = ModifiersOf(message);
	const int32 clicks = message != NULL ? message->GetInt32("clicks", 1) : 1;
	const int32 index = IndexOf(where);
	if (index < 0) {
		fPress = Press();
		if (fListType == B_SINGLE_SELECTION_LIST || (keys & (B_SHIFT_KEY | kToggleKeys)) == 0)
			DeselectAll();
		return;
	}

	const bool again = clicks > 1 && clicks % 2 == 0 && fPress.index == index;
	fPress = Press();
	fPress.index = index;
	fPress.where = where;
	fPress.wasSelected = IsItemSelected(index);
	if (again && fPress.wasSelected && (keys & (B_SHIFT_KEY | kToggleKeys)) == 0) {
		Invoke();
		return;
	}
	fPress.mayDrag = true;
	SetMouseEventMask(B_POINTER_EVENTS, B_NO_POINTER_HISTORY);
	SelectByMouse(index, keys);
}


void
BListView::MouseMoved(BPoint where, uint32, const BMessage* dragMessage)
{
	if (!fPress.mayDrag || dragMessage != NULL)
		return;
	const BPoint way = where - fPress.where;
	if (std::fabs(way.x) < kDragDistance && std::fabs(way.y) < kDragDistance)
		return;
	fPress.mayDrag = false;
	if (InitiateDrag(fPress.where, fPress.index, fPress.wasSelected))
		fPress.selectOnRelease = false;
}


void
BListView::MouseUp(BPoint where)
{
	const bool select = fPress.selectOnRelease;
	const int32 index = fPress.index;
	// The row stays: the next press may be the second of a double click. Not after the pointer was moved.
	if (!fPress.mayDrag)
		fPress = Press();
	fPress.selectOnRelease = false;
	fPress.mayDrag = false;
	BView::MouseUp(where);
	if (select)
		Select(index);
}


bool
BListView::InitiateDrag(BPoint, int32, bool)
{
	return false;
}


void
BListView::SelectByMouse(int32 index, uint32 keys)
{
	const bool wasSelected = IsItemSelected(index);
	if (fListType == B_SINGLE_SELECTION_LIST) {
		if ((keys & kToggleKeys) != 0 && wasSelected)
			Deselect(index);
		else
			Select(index);
		return;
	}

	if ((keys & B_SHIFT_KEY) != 0) {
		const int32 anchor = fAnchor >= 0 ? fAnchor : index;
		const bool changed = SelectOnly(std::min(anchor, index), std::max(anchor, index));
		fAnchor = anchor;
		SetCursor(index, false);
		if (changed)
			TellSelectionChanged();
	} else if ((keys & kToggleKeys) != 0) {
		fAnchor = index;
		SetCursor(index, false);
		if (wasSelected)
			Deselect(index);
		else
			Select(index, true);
	} else if (wasSelected && CurrentSelection(1) >= 0) {
		// All that are selected may be about to be dragged.
		fPress.selectOnRelease = true;
	} else
		Select(index);
}


void
BListView::KeyDown(const char* bytes, int32 numBytes)
{
	const BMessage* message = Window() != NULL ? Window()->CurrentMessage() : NULL;
	const uint32 keys = ModifiersOf(message);
	if (numBytes == 1) {
		switch (bytes[0]) {
			case B_UP_ARROW:
			case B_DOWN_ARROW:
			case B_HOME:
			case B_END:
			case B_PAGE_UP:
			case B_PAGE_DOWN:
				fTyping->Clear();
				MoveByKey(bytes[0], keys);
				return;

			case B_ENTER:
				fTyping->Clear();
				Invoke();
				return;

			case B_SPACE:
				if (fTyping->GoesOn(system_time()))
					break;
				// A cursor away from the selection is there to pick rows one by one.
				if (fListType == B_MULTIPLE_SELECTION_LIST && fShowsCursor) {
					const int32 row = fCursor;
					if (IsItemSelected(row))
						Deselect(row);
					else
						Select(row, true);
					SetCursor(row, true);
				} else
					Invoke();
				return;
		}
	}
	if ((keys & (B_CONTROL_KEY | kToggleKeys)) != 0 || !SelectByTyping(bytes, numBytes))
		BView::KeyDown(bytes, numBytes);
}


// The row that keys start from; -1 without.
int32
BListView::KeyboardRow() const
{
	if (fCursor >= 0 && (fShowsCursor || IsItemSelected(fCursor)))
		return fCursor;
	return CurrentSelection();
}


// The first one from \a index on, itself included, that can be selected; -1 when there is none.
int32
BListView::EnabledFrom(int32 index, int32 step) const
{
	while (index >= 0 && index < CountItems() && !fItems[index]->fEnabled)
		index += step;
	return index >= 0 && index < CountItems() ? index : -1;
}


bool
BListView::MoveByKey(char key, uint32 keys)
{
	const int32 row = KeyboardRow();
	const int32 last = CountItems() - 1;
	switch (key) {
		case B_UP_ARROW:
			MoveCursor(EnabledFrom(row < 0 ? last : row - 1, -1), keys);
			return true;
		case B_DOWN_ARROW:
			MoveCursor(EnabledFrom(row + 1, 1), keys);
			return true;
		case B_HOME:
			MoveCursor(EnabledFrom(0, 1), keys);
			return true;
		case B_END:
			MoveCursor(EnabledFrom(last, -1), keys);
			return true;
		case B_PAGE_UP:
			ScrollByPage(-1);
			return true;
		case B_PAGE_DOWN:
			ScrollByPage(1);
			return true;
		default:
			return false;
	}
}


void
BListView::MoveCursor(int32 to, uint32 keys)
{
	if (to < 0) {
		// Nothing further that way: what there is comes into sight.
		ScrollTo(KeyboardRow());
		return;
	}

	const bool multiple = fListType == B_MULTIPLE_SELECTION_LIST;
	if (multiple && (keys & B_SHIFT_KEY) != 0) {
		const int32 anchor = fAnchor >= 0 ? fAnchor : to;
		const bool changed = SelectOnly(std::min(anchor, to), std::max(anchor, to));
		fAnchor = anchor;
		SetCursor(to, false);
		if (changed)
			TellSelectionChanged();
	} else if (multiple && (keys & kToggleKeys) != 0)
		SetCursor(to, true);
	else
		Select(to);
	ScrollTo(to);
}


void
BListView::SetCursor(int32 index, bool shown)
{
	if (index == fCursor && shown == fShowsCursor)
		return;
	if (fShowsCursor && fCursor >= 0 && fCursor < CountItems())
		InvalidateRows(fCursor, fCursor);
	fCursor = index;
	fShowsCursor = shown;
	if (shown)
		InvalidateRows(index, index);
}


void
BListView::ScrollByPage(int32 direction)
{
	const BRect bounds = Bounds();
	const float lowest = std::max(ContentHeight() - 1 - bounds.Height(), 0.0f);
	const float top = bounds.top + static_cast<float>(direction) * bounds.Height();
	ScrollTo(BPoint(bounds.left, std::clamp(top, 0.0f, lowest)));
}


// False when the key is no text, or nothing begins with what was typed.
bool
BListView::SelectByTyping(const char* bytes, int32 numBytes)
{
	if (numBytes < 1 || static_cast<uint8>(bytes[0]) < ' ' || bytes[0] == B_DELETE || IsEmpty())
		return false;

	const bool first = !fTyping->GoesOn(system_time());
	fTyping->Add(bytes, numBytes, system_time());
	const auto find = [this](int32 from, bool onlyFirst) {
		for (int32 i = 0; i < CountItems(); i++) {
			const int32 row = (from + i) % CountItems();
			const BStringItem* item = dynamic_cast<BStringItem*>(fItems[row]);
			if (item == NULL || !item->fEnabled)
				continue;
			if (onlyFirst ? fTyping->MatchesFirst(item->Text()) : fTyping->Matches(item->Text()))
				return row;
		}
		return int32(-1);
	};

	const int32 current = KeyboardRow();
	int32 row = find(first ? current + 1 : std::max(current, int32(0)), false);
	if (row < 0 && fTyping->IsRepeated())
		row = find(current + 1, true);
	if (row < 0)
		return false;
	Select(row);
	ScrollTo(row);
	return true;
}
