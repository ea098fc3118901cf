// SPDX-License-Identifier: MIT

#include "TabViewComponent.h"

#include <algorithm>

#include <String.h>
#include <ormi/views/Containers.h>


namespace {

const char* const kPage = "Page";

constexpr choice kWidths[] = {{"B_WIDTH_AS_USUAL", B_WIDTH_AS_USUAL},
	{"B_WIDTH_FROM_WIDEST", B_WIDTH_FROM_WIDEST}, {"B_WIDTH_FROM_LABEL", B_WIDTH_FROM_LABEL}};
constexpr choice kSides[] = {{"BTabView::kTopSide", BTabView::kTopSide},
	{"BTabView::kBottomSide", BTabView::kBottomSide}, {"BTabView::kLeftSide", BTabView::kLeftSide},
	{"BTabView::kRightSide", BTabView::kRightSide}};

constexpr property_row kProperties[] = {
	ShownBy<&Ormi::TabPane::SetTabs>("Tabs", "Tab 1|Tab 2"),
	ShownBy<&BTabView::Select>("Selection", "0", "$COMPONENT->Select($VALUE);"),
	ShownBy<&BTabView::SetTabWidth>("TabWidth", "B_WIDTH_FROM_LABEL", nullptr, kWidths),
	ShownBy<&BTabView::SetTabSide>("TabSide", "BTabView::kTopSide", nullptr, kSides),
	ResizingModeRow(),
};

constexpr event_row kEvents[] = {{"OnChange", nullptr}};
constexpr component_description kDescription = {
	"TabView", "TTabView", "TabView.h", kProperties, kEvents};

/// The editor of the page that a component is on: the component goes there at once.
class TPageProperty : public TIntProperty {
public:
	using TIntProperty::TIntProperty;

	void SetValue(const char* value, bool notify) override
	{
		TIntProperty::SetValue(value, notify);
		TTabViewComponent* tabView = dynamic_cast<TTabViewComponent*>(Component()->Owner());
		if (tabView != nullptr)
			tabView->ShowPage();
	}
};

} // namespace

TTabViewComponent::TTabViewComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	BView* view = new DesignView<Ormi::TabPane>(this, frame, "TTabView");
	new DesignGlass(this, view);
	SetDesignView(view);
}


void
TTabViewComponent::SetPropertyValue(const char* name, const char* value)
{
	TStandardComponent::SetPropertyValue(name, value);
	ShowPage();
}


bool
TTabViewComponent::DefaultEditAction(BPoint where)
{
	const BTabView* view = static_cast<const BTabView*>(DTView());
	for (int32 i = 0; i < view->CountTabs(); i++) {
		if (!view->TabFrame(i).Contains(where))
			continue;
		BString page;
		page << i;
		FindProperty("Selection")->Editor()->SetValue(page.String(), true);
		return true;
	}
	return false;
}


bool
TTabViewComponent::OnGenInitForm(BString& text)
{
	BString pages;
	for (int32 i = 0; i < CountComponents(); i++) {
		TComponent* component = ComponentAt(i);
		if (PageOf(component) <= 0)
			continue;
		if (!pages.IsEmpty())
			pages << "\n";
		pages << "$COMPONENT->SetPage(" << component->ComponentName() << "," << PageOf(component)
			  << ");";
	}
	text << pages;
	return !pages.IsEmpty();
}


bool
TTabViewComponent::ComponentPropertyModified(
	TComponent* component, const char* name, const char*, const char* newValue)
{
	TProperty* property = component->FindProperty(name);
	if (property != nullptr && strcmp(name, kPage) == 0) {
		property->SetValue(newValue);
		ShowPage();
	}
	return true;
}


void
TTabViewComponent::AddComponent(TComponent* component)
{
	TComponentOwner::AddComponent(component);
	PutOnPage(component);
	ShowPage();
}


bool
TTabViewComponent::RemoveComponent(TComponent* component)
{
	const bool isRemoved = TComponentOwner::RemoveComponent(component);
	if (isRemoved)
		ShowAgain(component);
	return isRemoved;
}


TComponent*
TTabViewComponent::RemoveComponent(int32 index)
{
	TComponent* component = TComponentOwner::RemoveComponent(index);
	if (component != nullptr)
		ShowAgain(component);
	return component;
}


void
TTabViewComponent::ShowPage()
{
	const BTabView* view = static_cast<const BTabView*>(DTView());
	if (view == nullptr || CountComponents() == 0 || !DTView()->LockLooper())
		return;
	for (int32 i = 0; i < CountComponents(); i++) {
		BView* child = ComponentAt(i)->DTView();
		if (child == nullptr)
			continue;
		const bool isShown = PageOf(ComponentAt(i)) == view->Selection();
		if (isShown && child->IsHidden(child))
			child->Show();
		else if (!isShown && !child->IsHidden(child))
			child->Hide();
	}
	DTView()->UnlockLooper();
}


/// As the program takes it: the last page for one that is not there.
int32
TTabViewComponent::PageOf(TComponent* component) const
{
	const TProperty* property = component->FindProperty(kPage);
	const int32 page = property != nullptr ? atoi(property->Value()) : 0;
	const BTabView* view = static_cast<const BTabView*>(DTView());
	return std::clamp<int32>(page, 0, std::max<int32>(0, view->CountTabs() - 1));
}


/// Gives a component that came here its property: the page that a document has for it, or the one that
/// is shown.
void
TTabViewComponent::PutOnPage(TComponent* component)
{
	if (component == nullptr)
		return;
	BString page;
	page << std::max<int32>(0, static_cast<const BTabView*>(DTView())->Selection());
	if (component->FindProperty(kPage) == nullptr) {
		const char* stored;
		if (component->PropertyStore()->FindString(kPage, &stored) == B_OK)
			page = stored;
		TProperty* property = new TProperty(component, kPage, page.String(), nullptr, false);
		component->AddPropAndEditor(
			property, new TPageProperty(component, property), nullptr, nullptr, false);
	}
	component->StoreProperty(kPage, page.String());
}


/// A component that left may have been on a page that is not shown. Its property stays: the property
/// window may be showing it, and it does nothing elsewhere.
void
TTabViewComponent::ShowAgain(TComponent* component)
{
	BView* view = component->DTView();
	if (view == nullptr || !view->LockLooper())
		return;
	if (view->IsHidden(view))
		view->Show();
	view->UnlockLooper();
}
