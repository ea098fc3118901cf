// SPDX-License-Identifier: MIT
// The columns of a file panel's list, and the row above it that names them.

#include "interface/panel/PanelColumns.h"

#include <algorithm>
#include <cmath>

#include <Message.h>
#include <ScrollBar.h>
#include <Window.h>

#include "interface/ControlLook.h"
#include "interface/panel/PanelIcons.h"

namespace BPrivate {

namespace {

constexpr float kEdge = 6;
constexpr float kGap = 16;
constexpr float kSmallestName = 120;
constexpr float kArrowWidth = 12;
// The list below begins behind its border, and ends before its scroll bar and the border there.
constexpr float kListLeft = 1;
const float kListRight = 1 + B_V_SCROLL_BAR_WIDTH;


/// The columns of the list that the header belongs to, in the header's coordinates.
PanelColumns
ListColumns(const PanelHeader* header)
{
	PanelColumns columns(header, header->Bounds().Width() - kListLeft - kListRight);
	for (float* x : {&columns.icon, &columns.name, &columns.nameRight, &columns.sizeRight,
			 &columns.modified, &columns.right})
		*x += kListLeft;
	return columns;
}

} // namespace


PanelColumns::PanelColumns(const BView* view, float width)
{
	const float timeWidth = std::ceil(view->StringWidth("2000-00-00 00:00"));
	const float sizeWidth = std::ceil(view->StringWidth("1000.0 MiB"));
	icon = kEdge;
	name = icon + kPanelIconSize + kEdge;
	right = std::max(width - kEdge, name + kSmallestName + 2 * kGap + sizeWidth + timeWidth);
	modified = right - timeWidth;
	sizeRight = modified - kGap;
	nameRight = sizeRight - sizeWidth - kGap;
}


PanelHeader::PanelHeader(BRect frame)
	: BView(frame, "columns", B_FOLLOW_LEFT_RIGHT | B_FOLLOW_TOP,
		B_WILL_DRAW | B_FULL_UPDATE_ON_RESIZE),
	  fOrder(FolderOrder::kName),
	  fDescending(false)
{
	SetViewColor(ui_color(B_PANEL_BACKGROUND_COLOR));
	SetLowColor(ViewColor());
}


void
PanelHeader::SetOrder(FolderOrder order, bool descending)
{
	fOrder = order;
	fDescending = descending;
	Invalidate();
}


float
PanelHeader::NeededHeight(const BView* view)
{
	font_height height;
	view->GetFontHeight(&height);
	return std::ceil(height.ascent + height.descent) + 6;
}


void
PanelHeader::Draw(BRect)
{
	const BRect bounds = Bounds();
	SetHighColor(tint_color(ViewColor(), B_DARKEN_2_TINT));
	StrokeRect(bounds);
	const PanelColumns columns = ListColumns(this);
	DrawLabel(FolderOrder::kName, "Name", columns.icon, columns.nameRight, false);
	DrawLabel(FolderOrder::kSize, "Size", columns.nameRight, columns.sizeRight, true);
	DrawLabel(FolderOrder::kModified, "Modified", columns.modified, columns.right, false);
}


void
PanelHeader::MouseDown(BPoint where)
{
	const PanelColumns columns = ListColumns(this);
	FolderOrder order = FolderOrder::kName;
	if (where.x >= columns.modified - kGap / 2)
		order = FolderOrder::kModified;
	else if (where.x >= columns.nameRight + kGap / 2)
		order = FolderOrder::kSize;
	BMessage chosen(kMsgOrderChosen);
	chosen.AddInt32("order", static_cast<int32>(order));
	Window()->PostMessage(&chosen);
}


/// The label, with an arrow beside it where the list is ordered by it.
void
PanelHeader::DrawLabel(FolderOrder order, const char* label, float left, float right, bool atRight)
{
	font_height height;
	GetFontHeight(&height);
	const BRect bounds = Bounds();
	const float baseline =
		std::floor((bounds.Height() + height.ascent - height.descent) / 2 + 0.5f);
	const float width = std::ceil(StringWidth(label));
	const float x = atRight ? right - width : left;
	SetHighColor(ControlTextColor(true, ViewColor()));
	SetDrawingMode(B_OP_OVER);
	DrawString(label, BPoint(x, baseline));
	SetDrawingMode(B_OP_COPY);
	if (order != fOrder)
		return;

	const float middle = atRight ? x - kArrowWidth / 2 - 1 : x + width + kArrowWidth / 2 + 1;
	const float y = std::floor(bounds.Height() / 2);
	const float tip = fDescending ? y + 2 : y - 2;
	const float base = fDescending ? y - 2 : y + 2;
	SetHighColor(tint_color(ViewColor(), B_DARKEN_4_TINT));
	FillTriangle(BPoint(middle - 4, base), BPoint(middle + 4, base), BPoint(middle, tip));
}

} // namespace BPrivate
