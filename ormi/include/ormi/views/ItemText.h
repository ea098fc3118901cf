// SPDX-License-Identifier: MIT
// Items that are written as one text: "File|>Open|>Save|Edit".

#pragma once

#include <algorithm>
#include <vector>

#include <String.h>

namespace Ormi {

/// An item of a list, an outline or a menu.
struct item_text {
	BString label;
	int32 level; ///< 0 for the top; at most one more than that of the item before it
};

/// The items of \a text: they are divided by "|", and each ">" before a label puts the item one level
/// deeper. Blanks around a label do not count. No items for null and the empty text.
inline std::vector<item_text>
ParseItems(const char* text)
{
	std::vector<item_text> items;
	if (text == nullptr || *text == '\0')
		return items;

	const BString all(text);
	int32 deepest = 0;
	for (int32 from = 0; from <= all.Length();) {
		int32 end = all.FindFirst('|', from);
		if (end < 0)
			end = all.Length();
		BString label;
		all.CopyInto(label, from, end - from);
		label.Trim();
		int32 level = 0;
		while (label.Length() > 0 && label[0] == '>') {
			level++;
			label.Remove(0, 1);
			label.Trim();
		}
		level = std::min(level, deepest);
		items.push_back({label, level});
		deepest = level + 1;
		from = end + 1;
	}
	return items;
}

} // namespace Ormi
