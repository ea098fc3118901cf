// SPDX-License-Identifier: MIT
// BListView: which rows are selected, and who is told.
#include <ListView.h>

#include <algorithm>

#include <Message.h>
#include <Window.h>

void
BListView::SetListType(list_view_type type)
{
	if (type == fListType)
		return;
	fListType = type;
	if (type == B_SINGLE_SELECTION_LIST && fFirstSelected >= 0
		&& DeselectRange(fFirstSelected + 1, fLastSelected))
		TellSelectionChanged();
}


void
BListView::Select(int32 index, bool extend)
{
	Select(index, index, extend);
}


void
BListView::Select(int32 from, int32 to, bool extend)
{
	if (from > to)
		std::swap(from, to);
	if (from < 0 || from >= CountItems())
		return;
	to = std::min(to, CountItems() - 1);
	if (fListType == B_SINGLE_SELECTION_LIST) {
		// Alone, it must not go for one that cannot be selected.
		if (!fItems[from]->fEnabled)
			return;
		to = from;
		extend = false;
	}

	bool changed;
	if (extend)
		changed = SelectRange(from, to);
	else if (from == to && !fItems[from]->fEnabled)
		return;
	else
		changed = SelectOnly(from, to);
	fAnchor = from;
	SetCursor(to, false);
	if (changed)
		TellSelectionChanged();
}


bool
BListView::IsItemSelected(int32 index) const
{
	const BListItem* item = ItemAt(index);
	return item != NULL && item->fSelected;
}


int32
BListView::CurrentSelection(int32 index) const
{
	if (fFirstSelected < 0 || index < 0)
		return -1;
	for (int32 i = fFirstSelected; i <= fLastSelected; i++) {
		if (fItems[i]->fSelected && index-- == 0)
			return i;
	}
	return -1;
}


void
BListView::DeselectAll()
{
	if (fFirstSelected >= 0 && DeselectRange(fFirstSelected, fLastSelected))
		TellSelectionChanged();
}


void
BListView::Deselect(int32 index)
{
	if (IsItemSelected(index) && DeselectRange(index, index))
		TellSelectionChanged();
}


void
BListView::DeselectExcept(int32 exceptFrom, int32 exceptTo)
{
	if (fFirstSelected < 0 || exceptFrom > exceptTo)
		return;
	bool changed = DeselectRange(fFirstSelected, exceptFrom - 1);
	if (fFirstSelected >= 0)
		changed = DeselectRange(exceptTo + 1, fLastSelected) || changed;
	if (changed)
		TellSelectionChanged();
}


void
BListView::SelectionChanged()
{
	// For subclasses.
}


// The following change rows without telling, and return whether there was a change. Ranges may reach
// beyond the list and may be empty.
bool
BListView::SelectRange(int32 from, int32 to)
{
	bool changed = false;
	for (int32 i = std::max(from, int32(0)); i <= to && i < CountItems(); i++) {
		BListItem* item = fItems[i];
		if (item->fSelected || !item->fEnabled)
			continue;
		item->fSelected = true;
		fFirstSelected = fFirstSelected < 0 ? i : std::min(fFirstSelected, i);
		fLastSelected = std::max(fLastSelected, i);
		InvalidateRows(i, i);
		changed = true;
	}
	return changed;
}


bool
BListView::DeselectRange(int32 from, int32 to)
{
	if (fFirstSelected < 0)
		return false;
	bool changed = false;
	from = std::max(from, fFirstSelected);
	to = std::min(to, fLastSelected);
	for (int32 i = from; i <= to; i++) {
		if (!fItems[i]->fSelected)
			continue;
		fItems[i]->fSelected = false;
		InvalidateRows(i, i);
		changed = true;
	}
	if (!changed)
		return false;

	while (fFirstSelected <= fLastSelected && !fItems[fFirstSelected]->fSelected)
		fFirstSelected++;
	while (fLastSelected >= fFirstSelected && !fItems[fLastSelected]->fSelected)
		fLastSelected--;
	if (fFirstSelected > fLastSelected) {
		fFirstSelected = -1;
		fLastSelected = -1;
	}
	return true;
}


bool
BListView::SelectOnly(int32 from, int32 to)
{
	const bool deselectedBefore = DeselectRange(0, from - 1);
	const bool deselectedAfter = DeselectRange(to + 1, CountItems() - 1);
	return SelectRange(from, to) || deselectedBefore || deselectedAfter;
}


void
BListView::FindSelectionAgain()
{
	fFirstSelected = -1;
	fLastSelected = -1;
	for (int32 i = 0; i < CountItems(); i++) {
		if (!fItems[i]->fSelected)
			continue;
		if (fFirstSelected < 0)
			fFirstSelected = i;
		fLastSelected = i;
	}
}


void
BListView::TellSelectionChanged()
{
	SelectionChanged();
	if (fSelectMessage != NULL || IsWatched())
		InvokeNotify(fSelectMessage.get(), B_CONTROL_MODIFIED);
}
