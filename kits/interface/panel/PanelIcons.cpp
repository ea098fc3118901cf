// SPDX-License-Identifier: MIT
// The small pictures of files and places in a file panel.

#include "interface/panel/PanelIcons.h"

#include <View.h>

namespace BPrivate {

namespace {

const rgb_color kFolderFront = {246, 200, 92, 255};
const rgb_color kFolderBack = {222, 168, 56, 255};
const rgb_color kFolderEdge = {158, 112, 24, 255};
const rgb_color kPaper = {252, 252, 252, 255};
const rgb_color kPaperEdge = {128, 132, 140, 255};
const rgb_color kPaperLine = {176, 182, 192, 255};
const rgb_color kBlue = {92, 140, 204, 255};
const rgb_color kBlueEdge = {48, 84, 140, 255};
const rgb_color kMetal = {190, 196, 206, 255};

/// Draws in the square of an icon: coordinates are those of its 16 pixels.
class IconPainter {
public:
	IconPainter(BView* view, BPoint origin)
		: fView(view),
		  fOrigin(origin)
	{
	}

	void Box(BRect rect, rgb_color fill, rgb_color edge)
	{
		rect.OffsetBy(fOrigin);
		fView->SetHighColor(fill);
		fView->FillRect(rect);
		fView->SetHighColor(edge);
		fView->StrokeRect(rect);
	}

	void Fill(BRect rect, rgb_color color)
	{
		fView->SetHighColor(color);
		fView->FillRect(rect.OffsetByCopy(fOrigin));
	}

	void Line(BPoint from, BPoint to, rgb_color color)
	{
		fView->SetHighColor(color);
		fView->StrokeLine(from + fOrigin, to + fOrigin);
	}

	template <int count>
	void Shape(const BPoint (&points)[count], rgb_color fill, rgb_color edge)
	{
		BPoint moved[count];
		for (int i = 0; i < count; i++)
			moved[i] = points[i] + fOrigin;
		fView->SetHighColor(fill);
		fView->FillPolygon(moved, count);
		fView->SetHighColor(edge);
		fView->StrokePolygon(moved, count);
	}

private:
	BView* fView;
	BPoint fOrigin;
};


void
DrawPage(IconPainter& painter)
{
	const BPoint kPage[] = {{3, 1}, {9, 1}, {13, 5}, {13, 15}, {3, 15}};
	painter.Shape(kPage, kPaper, kPaperEdge);
	painter.Line(BPoint(9, 1), BPoint(9, 5), kPaperEdge);
	painter.Line(BPoint(9, 5), BPoint(13, 5), kPaperEdge);
	for (float y = 8; y <= 12; y += 2)
		painter.Line(BPoint(5, y), BPoint(11, y), kPaperLine);
}


void
DrawProgram(IconPainter& painter)
{
	painter.Box(BRect(1, 2, 15, 14), kPaper, kPaperEdge);
	painter.Box(BRect(1, 2, 15, 5), kBlue, kBlueEdge);
	painter.Line(BPoint(4, 8), BPoint(6, 10), kBlueEdge);
	painter.Line(BPoint(6, 10), BPoint(4, 12), kBlueEdge);
	painter.Line(BPoint(8, 12), BPoint(12, 12), kBlueEdge);
}


void
DrawFolder(IconPainter& painter)
{
	const BPoint kBack[] = {{1, 3}, {6, 3}, {8, 5}, {15, 5}, {15, 13}, {1, 13}};
	painter.Shape(kBack, kFolderBack, kFolderEdge);
	painter.Box(BRect(1, 7, 15, 13), kFolderFront, kFolderEdge);
}


void
DrawHome(IconPainter& painter)
{
	painter.Box(BRect(3, 8, 13, 15), kPaper, kPaperEdge);
	const BPoint kRoof[] = {{0, 8}, {8, 1}, {16, 8}};
	painter.Shape(kRoof, kBlue, kBlueEdge);
	painter.Box(BRect(7, 11, 9, 15), kFolderFront, kFolderEdge);
}


void
DrawDesktop(IconPainter& painter)
{
	painter.Box(BRect(1, 2, 15, 11), kBlue, kBlueEdge);
	painter.Fill(BRect(7, 12, 9, 13), kPaperEdge);
	painter.Line(BPoint(4, 14), BPoint(12, 14), kPaperEdge);
}


void
DrawDisk(IconPainter& painter)
{
	painter.Box(BRect(1, 4, 15, 13), kMetal, kPaperEdge);
	painter.Line(BPoint(1, 9), BPoint(15, 9), kPaperEdge);
	painter.Fill(BRect(11, 11, 12, 11), kBlueEdge);
}

} // namespace


void
DrawPanelIcon(BView* view, BPoint where, PanelIcon icon, bool isLink)
{
	IconPainter painter(view, where);
	switch (icon) {
		case PanelIcon::kFile:
			DrawPage(painter);
			break;
		case PanelIcon::kProgram:
			DrawProgram(painter);
			break;
		case PanelIcon::kFolder:
			DrawFolder(painter);
			break;
		case PanelIcon::kHome:
			DrawHome(painter);
			break;
		case PanelIcon::kDesktop:
			DrawDesktop(painter);
			break;
		case PanelIcon::kDisk:
			DrawDisk(painter);
			break;
	}
	if (isLink) {
		painter.Box(BRect(0, 9, 6, 15), kPaper, kPaperEdge);
		painter.Line(BPoint(2, 13), BPoint(4, 11), kBlueEdge);
		painter.Line(BPoint(2, 11), BPoint(4, 11), kBlueEdge);
		painter.Line(BPoint(4, 11), BPoint(4, 13), kBlueEdge);
	}
}

} // namespace BPrivate
