// SPDX-License-Identifier: MIT
// Status bars.

#include <StatusBar.h>

#include "Pages.h"

BView*
MakeBarsPage(BRect frame)
{
	BView* page = MakePage(frame, "Status bars");

	BStatusBar* empty = new BStatusBar(BRect(10, 10, 440, 40), "sbEmpty", "Empty");
	BStatusBar* half = new BStatusBar(BRect(10, 60, 440, 90), "sbHalf", "Copying", "of 100");
	half->SetTo(42, "letter.txt", "42");
	BStatusBar* full = new BStatusBar(BRect(10, 110, 440, 140), "sbFull", nullptr, "Done");
	full->SetBarColor(make_color(60, 180, 75));
	full->SetTo(100);
	BStatusBar* bare = new BStatusBar(BRect(10, 160, 440, 190), "sbBare");
	bare->SetTo(70);
	BStatusBar* thick = new BStatusBar(BRect(10, 200, 440, 230), "sbThick",
		"A label that is cut off where the trailing text begins, since both do not fit",
		"75 of 300");
	thick->SetMaxValue(300);
	thick->SetBarHeight(28);
	thick->SetTo(75);

	for (BStatusBar* bar : {empty, half, full, bare, thick})
		page->AddChild(bar);
	return page;
}
