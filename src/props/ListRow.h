// SPDX-License-Identifier: MIT
// What the rows of the property window's lists have in common.

#pragma once

#include <memory>
#include <vector>

#include <List.h>
#include <ListItem.h>
#include <ListView.h>
#include <Rect.h>

class BView;

struct rgb_color;

/// The ground of the property window's pages.
extern const rgb_color kPageColor;

/// The colour of values and marks.
extern const rgb_color kRowValueColor;

/// Draws a row's ground, the line below it, its \a name, cut to its column, and the line between the columns.
///
/// \a frame, in \a owner's coordinates; \a separator: pixels from its left. The high and low colours are the
/// caller's to restore.
void DrawListRow(
	BView* owner, BRect frame, const BListItem* item, const char* name, float separator);

/// Moves \a rows to the end of \a list, all at once.
template <typename Row>
void
AddRows(BListView* list, std::vector<std::unique_ptr<Row>>* rows)
{
	BList items(static_cast<int32>(rows->size()));
	for (auto& row : *rows) {
		BListItem* item = row.release();
		items.AddItem(item);
	}
	rows->clear();
	list->AddList(&items);
}

/// Removes and deletes all rows of \a list. No selection message is sent.
void DeleteRows(BListView* list);
