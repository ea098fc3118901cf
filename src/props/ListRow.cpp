// SPDX-License-Identifier: MIT
// What the rows of the property window's lists have in common.

#include "props/ListRow.h"

#include <GraphicsDefs.h>
#include <String.h>
#include <View.h>

const rgb_color kPageColor = {216, 216, 216, 255};
const rgb_color kRowValueColor = {108, 108, 108, 255};

namespace {

constexpr rgb_color kGroundColor = {255, 255, 255, 255};
constexpr rgb_color kSelectedGroundColor = {178, 178, 178, 255};
constexpr rgb_color kLineColor = {222, 222, 222, 255};
constexpr rgb_color kNameColor = {0, 0, 0, 255};
constexpr rgb_color kDisabledNameColor = {100, 100, 100, 255};

constexpr float kNameLeft = 4;
constexpr float kNameMargin = 2; // before the line between the columns
constexpr float kBaseline = 2;   // above the bottom

} // namespace

void
DrawListRow(BView* owner, BRect frame, const BListItem* item, const char* name, float separator)
{
	const rgb_color ground = item->IsSelected() ? kSelectedGroundColor : kGroundColor;
	owner->SetLowColor(ground);
	owner->SetHighColor(ground);
	owner->FillRect(frame);
	owner->SetHighColor(kLineColor);
	owner->StrokeLine(frame.LeftBottom(), frame.RightBottom());
	owner->SetHighColor(item->IsEnabled() ? kNameColor : kDisabledNameColor);
	BString shownName(name);
	owner->TruncateString(&shownName, B_TRUNCATE_END, separator - kNameLeft - kNameMargin);
	owner->DrawString(shownName.String(), BPoint(frame.left + kNameLeft, frame.bottom - kBaseline));
	owner->SetHighColor(kLineColor);
	owner->StrokeLine(
		BPoint(frame.left + separator, frame.bottom), BPoint(frame.left + separator, frame.top));
}


void
DeleteRows(BListView* list)
{
	std::vector<std::unique_ptr<BListItem>> rows;
	for (int32 i = 0; i < list->CountItems(); i++)
		rows.emplace_back(list->ItemAt(i));
	list->MakeEmpty();
}
