// SPDX-License-Identifier: MIT
// Colour controls in their layouts.

#include <ColorControl.h>
#include <Message.h>

#include "Pages.h"

BView*
MakeColorsPage(BRect frame)
{
	BView* page = MakePage(frame, "Colours");
	const struct {
		const char* name;
		BPoint start;
		color_control_layout layout;
		float cellSize;
		rgb_color color;
		bool enabled;
	} kControls[] = {
		{"ccWide", BPoint(10, 10), B_CELLS_32x8, 8, {220, 120, 40, 255}, true},
		{"ccSquare", BPoint(10, 110), B_CELLS_16x16, 6, {90, 90, 90, 255}, true},
		{"ccDisabled", BPoint(10, 230), B_CELLS_32x8, 6, {30, 130, 200, 255}, false},
		{"ccTall", BPoint(384, 10), B_CELLS_8x32, 6, {0, 160, 90, 255}, true},
	};
	for (const auto& row : kControls) {
		BColorControl* control =
			new BColorControl(row.start, row.layout, row.cellSize, row.name, new BMessage('clrC'));
		control->SetValue(row.color);
		control->SetEnabled(row.enabled);
		page->AddChild(control);
	}
	return page;
}
