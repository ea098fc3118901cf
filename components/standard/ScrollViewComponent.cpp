// SPDX-License-Identifier: MIT

#include "ScrollViewComponent.h"

#include <cstdio>

#include <ormi/views/Containers.h>

#include "Choices.h"

namespace {

/// A scroll view is made with its bars, so this one makes another inside when they change.
class DesignScrollView : public DesignView<BView> {
public:
	DesignScrollView(TScrollViewComponent* component, BRect frame)
		: DesignView(component, frame, "TScrollView", B_FOLLOW_NONE, B_WILL_DRAW | B_FRAME_EVENTS),
		  fComponent(component),
		  fGlass(new DesignGlass(component, this))
	{
		Rebuild();
	}

	void FrameResized(float newWidth, float newHeight) override
	{
		DesignView::FrameResized(newWidth, newHeight);
		fComponent->Fit();
	}

	using BView::SetViewColor;

	void SetViewColor(rgb_color color) override
	{
		DesignView::SetViewColor(color);
		fPane->SetViewColor(color);
		fPane->Invalidate();
	}

	void SetHorizontal(bool horizontal)
	{
		fHorizontal = horizontal;
		Rebuild();
	}

	void SetVertical(bool vertical)
	{
		fVertical = vertical;
		Rebuild();
	}

	void SetBorder(border_style border)
	{
		fBorder = border;
		Rebuild();
	}

	/// What is inside the border and the bars.
	BRect Inside() const { return Ormi::ScrolledFrame(Bounds(), fHorizontal, fVertical, fBorder); }

	BScrollBar* Bar(orientation direction) const { return fPane->ScrollBar(direction); }

private:
	void Rebuild()
	{
		if (fPane != nullptr) {
			fPane->RemoveSelf();
			delete fPane;
		}
		fPane = new Ormi::ScrollPane(Bounds(), "pane", fHorizontal, fVertical, fBorder);
		fPane->SetResizingMode(B_FOLLOW_ALL_SIDES);
		AddChild(fPane, fGlass);
		fPane->SetViewColor(ViewColor());
		TakeFromKeyboard(fPane);
	}

	TScrollViewComponent* fComponent;
	BView* fGlass;
	Ormi::ScrollPane* fPane = nullptr;
	bool fHorizontal = true;
	bool fVertical = true;
	border_style fBorder = B_FANCY_BORDER;
};

constexpr property_row
AtConstruction(property_row row)
{
	row.isGenerated = false;
	return row;
}


constexpr property_row kProperties[] = {
	AtConstruction(ShownBy<&DesignScrollView::SetHorizontal>("Horizontal", "true")),
	AtConstruction(ShownBy<&DesignScrollView::SetVertical>("Vertical", "true")),
	ShownBy<&DesignScrollView::SetBorder>("Border", "B_FANCY_BORDER", nullptr, kBorders),
	ResizingModeRow(),
};

constexpr const char* kParameters[] = {"Horizontal", "Vertical", "Border"};
constexpr component_description kDescription = {
	"ScrollView", "TScrollView", "ScrollView.h", kProperties, {}, kParameters};

} // namespace

TScrollViewComponent::TScrollViewComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	SetDesignView(new DesignScrollView(this, frame));
}


void
TScrollViewComponent::SetPropertyValue(const char* name, const char* value)
{
	TStandardComponent::SetPropertyValue(name, value);
	Fit();
}


bool
TScrollViewComponent::HandleComponentDesignMessage(BMessage* message)
{
	const bool isHandled = TStandardComponent::HandleComponentDesignMessage(message);
	if (message->what != DTM_COMPONENT_MOVE && message->what != DTM_COMPONENT_RESIZE)
		return isHandled;

	Fit();
	void* resized;
	const TComponent* filler = Filler();
	// The form notes the frame that the message tells.
	if (message->what == DTM_COMPONENT_RESIZE && filler != nullptr
		&& message->FindPointer("component", &resized) == B_OK && resized == filler)
		message->ReplaceRect("frame", filler->DTView()->Frame());
	return isHandled;
}


void
TScrollViewComponent::AddComponent(TComponent* component)
{
	TComponentOwner::AddComponent(component);
	Fit();
}


bool
TScrollViewComponent::RemoveComponent(TComponent* component)
{
	ReleaseBars();
	return TComponentOwner::RemoveComponent(component);
}


TComponent*
TScrollViewComponent::RemoveComponent(int32 index)
{
	ReleaseBars();
	return TComponentOwner::RemoveComponent(index);
}


/// The bars let go of what they scroll. What is left keeps its frame for now: the view may be about to
/// lose all of it.
void
TScrollViewComponent::ReleaseBars()
{
	DesignScrollView* view = static_cast<DesignScrollView*>(DTView());
	if (view == nullptr || !view->LockLooper())
		return;
	for (orientation direction : {B_HORIZONTAL, B_VERTICAL}) {
		if (view->Bar(direction) != nullptr)
			view->Bar(direction)->SetTarget(static_cast<BView*>(nullptr));
	}
	view->UnlockLooper();
}


void
TScrollViewComponent::Fit()
{
	DesignScrollView* view = static_cast<DesignScrollView*>(DTView());
	if (view == nullptr || !view->LockLooper())
		return;
	const BRect inside = view->Inside();
	TComponent* filler = Filler();
	BRect used(0, 0, -1, -1);
	for (int32 i = 0; i < CountComponents(); i++) {
		if (ComponentAt(i)->DTView() != nullptr)
			used = used | ComponentAt(i)->DTView()->Frame();
	}
	for (orientation direction : {B_HORIZONTAL, B_VERTICAL}) {
		BScrollBar* bar = view->Bar(direction);
		if (bar == nullptr)
			continue;
		bar->SetTarget(filler != nullptr ? filler->DTView() : nullptr);
		if (filler == nullptr && direction == B_HORIZONTAL)
			Ormi::FitScrollBar(bar, used.right - inside.left, inside.Width());
		else if (filler == nullptr)
			Ormi::FitScrollBar(bar, used.bottom - inside.top, inside.Height());
	}
	view->UnlockLooper();
	if (filler != nullptr)
		FitFiller(filler, inside);
}


/// The component that fills the view; null when there is none.
TComponent*
TScrollViewComponent::Filler() const
{
	TComponent* first = ComponentAt(0);
	return first != nullptr && Ormi::IsScrollable(first->DTView()) ? first : nullptr;
}


void
TScrollViewComponent::FitFiller(TComponent* filler, BRect frame)
{
	const struct {
		const char* name;
		float position;
	} kEdges[] = {
		{"Left", frame.left}, {"Top", frame.top}, {"Right", frame.right}, {"Bottom", frame.bottom}};
	for (const auto& edge : kEdges) {
		char value[16];
		snprintf(value, sizeof(value), "%d", static_cast<int>(edge.position));
		TProperty* property = filler->FindProperty(edge.name);
		if (property != nullptr && strcmp(property->Value(), value) != 0)
			filler->SetPropertyValue(edge.name, value);
	}
	if (filler->DTView()->LockLooper()) {
		filler->DTView()->MoveTo(frame.LeftTop());
		filler->DTView()->ResizeTo(frame.Width(), frame.Height());
		filler->DTView()->UnlockLooper();
	}
}
