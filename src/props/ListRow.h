// SPDX-License-Identifier: MIT
// What the rows of the property window's lists have in common.

#pragma once

#include <Rect.h>

class BListItem;
class BView;

struct rgb_color;

/// The ground of the property window's pages.
extern const rgb_color kPageColor;

/// The colour of values and marks.
extern const rgb_color kRowValueColor;

/// Draws a row's ground, the line below it, its \a name, and the line between the columns.
///
/// \a frame, in \a owner's coordinates; \a separator: pixels from its left. The high and low colours are the
/// caller's to restore.
void DrawListRow(
	BView* owner, BRect frame, const BListItem* item, const char* name, float separator);
