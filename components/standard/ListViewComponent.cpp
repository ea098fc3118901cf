// SPDX-License-Identifier: MIT

#include "ListViewComponent.h"

#include <ormi/views/ItemList.h>


namespace {

typedef Ormi::ItemList<BListView> List;

constexpr choice kTypes[] = {{"B_SINGLE_SELECTION_LIST", B_SINGLE_SELECTION_LIST},
	{"B_MULTIPLE_SELECTION_LIST", B_MULTIPLE_SELECTION_LIST}};

constexpr property_row kProperties[] = {
	ShownBy<&List::SetItems>("Items", ""),
	ShownBy<&BListView::SetListType>("ListType", "B_SINGLE_SELECTION_LIST", nullptr, kTypes),
	ResizingModeRow(),
};

constexpr event_row kEvents[] = {{"OnSelect", nullptr}, {"OnInvoke", nullptr}};
constexpr default_row kDefaults[] = {{"ViewColor", "{255,255,255,255}"}};
constexpr component_description kDescription = {
	"ListView", "TListView", "ListView.h", kProperties, kEvents, {}, kDefaults};

} // namespace

TListViewComponent::TListViewComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	SetDesignView(new DesignView<List>(this, frame, "TListView"));
}
