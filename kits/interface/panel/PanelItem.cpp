// SPDX-License-Identifier: MIT
// The rows of a file panel: files in its list, and places beside it.

#include "interface/panel/PanelItem.h"

#include <algorithm>
#include <cmath>

#include <Font.h>
#include <InterfaceDefs.h>
#include <String.h>
#include <View.h>

#include "interface/ControlLook.h"
#include "interface/panel/PanelColumns.h"

namespace BPrivate {

namespace {

constexpr float kEdge = 6;

/// Rows are as high as their icon and text need.
float
RowHeight(const BFont* font)
{
	font_height height;
	font->GetHeight(&height);
	return std::max(std::ceil(height.ascent + height.descent) + 4, kPanelIconSize + 3);
}


/// Draws the parts of one row, each with the colours of its state, and puts the view's own back.
class RowPainter {
public:
	RowPainter(BView* view, BRect frame, bool selected, bool complete)
		: fView(view),
		  fFrame(frame),
		  fSelected(selected),
		  fHigh(view->HighColor()),
		  fLow(view->LowColor())
	{
		fBackground =
			ui_color(selected ? B_LIST_SELECTED_BACKGROUND_COLOR : B_LIST_BACKGROUND_COLOR);
		fText = ui_color(selected ? B_LIST_SELECTED_ITEM_TEXT_COLOR : B_LIST_ITEM_TEXT_COLOR);
		view->SetLowColor(fBackground);
		if (selected || complete)
			view->FillRect(frame, B_SOLID_LOW);
		font_height height;
		view->GetFontHeight(&height);
		fBaseline =
			std::floor(frame.top + (frame.Height() + height.ascent - height.descent) / 2 + 0.5f);
	}

	~RowPainter()
	{
		fView->SetHighColor(fHigh);
		fView->SetLowColor(fLow);
	}

	void Icon(float left, PanelIcon icon, bool isLink)
	{
		const float top = fFrame.top + std::floor((fFrame.Height() - kPanelIconSize) / 2 + 0.5f);
		DrawPanelIcon(fView, BPoint(left, top), icon, isLink);
	}

	/// Cut in the middle, where the endings of names stay.
	void Text(const std::string& text, float left, float right)
	{
		BString shown(text.c_str());
		if (fView->StringWidth(shown.String()) > right - left)
			fView->TruncateString(&shown, B_TRUNCATE_MIDDLE, right - left);
		Draw(shown.String(), left, fText);
	}

	void QuietText(const std::string& text, float left)
	{
		Draw(text.c_str(), left, fSelected ? fText : BlendColors(fBackground, fText, 0.65f));
	}

	void QuietTextToRight(const std::string& text, float right)
	{
		QuietText(text, std::floor(right - fView->StringWidth(text.c_str())));
	}

private:
	void Draw(const char* text, float left, rgb_color color)
	{
		fView->SetHighColor(color);
		fView->SetDrawingMode(B_OP_OVER);
		fView->DrawString(text, BPoint(left, fBaseline));
		fView->SetDrawingMode(B_OP_COPY);
	}

	BView* fView;
	const BRect fFrame;
	const bool fSelected;
	const rgb_color fHigh;
	const rgb_color fLow;
	rgb_color fBackground;
	rgb_color fText;
	float fBaseline;
};

} // namespace


PanelItem::PanelItem(const FolderEntry* entry)
	: BStringItem(entry->shownName.c_str()),
	  fEntry(entry)
{
}


void
PanelItem::DrawItem(BView* owner, BRect frame, bool complete)
{
	const PanelColumns columns(owner, owner->Bounds().Width());
	RowPainter painter(owner, frame, IsSelected(), complete);
	PanelIcon icon = fEntry->isProgram ? PanelIcon::kProgram : PanelIcon::kFile;
	if (fEntry->isFolder)
		icon = PanelIcon::kFolder;
	painter.Icon(columns.icon, icon, fEntry->isLink);
	painter.Text(fEntry->shownName, columns.name, columns.nameRight);
	if (fEntry->isBroken)
		return;
	if (!fEntry->isFolder)
		painter.QuietTextToRight(SizeText(fEntry->size), columns.sizeRight);
	painter.QuietText(TimeText(fEntry->modified), columns.modified);
}


void
PanelItem::Update(BView* owner, const BFont* font)
{
	SetHeight(RowHeight(font));
	SetWidth(owner->Bounds().Width());
}


PlaceItem::PlaceItem(const std::string& label, const std::string& path, PanelIcon icon)
	: BStringItem(label.c_str()),
	  fPath(path),
	  fIcon(icon)
{
}


void
PlaceItem::DrawItem(BView* owner, BRect frame, bool complete)
{
	RowPainter painter(owner, frame, IsSelected(), complete);
	painter.Icon(frame.left + kEdge, fIcon, false);
	const float left = frame.left + 2 * kEdge + kPanelIconSize;
	painter.Text(Text(), left, std::max(left, owner->Bounds().right - kEdge));
}


void
PlaceItem::Update(BView* owner, const BFont* font)
{
	SetHeight(RowHeight(font));
	SetWidth(owner->Bounds().Width());
}

} // namespace BPrivate
