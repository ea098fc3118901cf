// SPDX-License-Identifier: MIT

#include "OutlineListViewComponent.h"

#include <ormi/views/ItemList.h>


namespace {

typedef Ormi::ItemList<BOutlineListView> List;

constexpr choice kTypes[] = {{"B_SINGLE_SELECTION_LIST", B_SINGLE_SELECTION_LIST},
	{"B_MULTIPLE_SELECTION_LIST", B_MULTIPLE_SELECTION_LIST}};

constexpr property_row kProperties[] = {
	ShownBy<&List::SetItems>("Items", ""),
	ShownBy<&BListView::SetListType>("ListType", "B_SINGLE_SELECTION_LIST", nullptr, kTypes),
	ResizingModeRow(),
};

constexpr event_row kEvents[] = {
	{"OnSelect", nullptr}, {"OnInvoke", nullptr}, {"OnExpand", "BListItem *item, bool expanded"}};
constexpr default_row kDefaults[] = {{"ViewColor", "{255,255,255,255}"}};
constexpr component_description kDescription = {"OutlineListView", "TOutlineListView",
	"OutlineListView.h", kProperties, kEvents, {}, kDefaults};

} // namespace

TOutlineListViewComponent::TOutlineListViewComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	SetDesignView(new DesignView<List>(this, frame, "TOutlineListView"));
}
