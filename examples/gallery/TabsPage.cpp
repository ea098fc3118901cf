// SPDX-License-Identifier: MIT
// Tab views inside the tab view.

#include <StringView.h>
#include <TabView.h>

#include "Pages.h"

namespace {

BTabView*
AddTabs(BView* page, BRect frame, const char* name, button_width width,
	std::initializer_list<const char*> labels)
{
	BTabView* tabs = new BTabView(frame, name, width, B_FOLLOW_LEFT_TOP);
	for (const char* label : labels) {
		BView* contents = MakePage(tabs->ContainerView()->Bounds(), label);
		contents->AddChild(new BStringView(BRect(8, 8, 180, 26), nullptr, label));
		tabs->AddTab(contents);
	}
	page->AddChild(tabs);
	return tabs;
}

} // namespace


BView*
MakeTabsPage(BRect frame)
{
	BView* page = MakePage(frame, "Tabs");
	BTabView* labels = AddTabs(page, BRect(10, 10, 250, 90), "tvLabels", B_WIDTH_FROM_LABEL,
		{"One", "The second", "Disabled"});
	labels->TabAt(2)->SetEnabled(false);
	labels->Select(1);
	AddTabs(page, BRect(270, 10, 510, 90), "tvMany", B_WIDTH_FROM_WIDEST,
		{"Red", "Orange", "Yellow", "Green", "Blue", "Violet"});
	AddTabs(page, BRect(10, 110, 250, 190), "tvBottom", B_WIDTH_AS_USUAL, {"Below", "Here"})
		->SetTabSide(BTabView::kBottomSide);
	AddTabs(page, BRect(270, 110, 510, 190), "tvLeft", B_WIDTH_FROM_WIDEST, {"Left", "Beside"})
		->SetTabSide(BTabView::kLeftSide);
	AddTabs(page, BRect(10, 210, 250, 290), "tvPlain", B_WIDTH_FROM_WIDEST, {"Plain", "Border"})
		->SetBorder(B_PLAIN_BORDER);
	BTabView* right = AddTabs(
		page, BRect(270, 210, 510, 290), "tvRight", B_WIDTH_FROM_WIDEST, {"Right", "No border"});
	right->SetTabSide(BTabView::kRightSide);
	right->SetBorder(B_NO_BORDER);
	return page;
}
