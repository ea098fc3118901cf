// SPDX-License-Identifier: MIT
// The base of the components that are seen on a form.

#include "model/VisualComponent.h"

#include <cstdio>
#include <cstring>

#include <Font.h>
#include <View.h>

#include "model/ColorText.h"
#include "model/Diagnostics.h"
#include "model/NameCompare.h"
#include "model/NumberText.h"
#include "model/PropertyStore.h"
#include "model/PropertyTable.h"
#include "model/ViewLock.h"
#include "props/FlagsProperty.h"
#include "props/PickListProperty.h"
#include "props/RGBColorProperty.h"
#include "props/StringProperty.h"

static const char* const kEdgeNames[] = {"Left", "Top", "Right", "Bottom"};

static const struct {
	const char* name;
	const char* value;
	const char* setStatement;
} kColors[] = {
	{"ViewColor", "{216,216,216,255}", "{rgb_color clr = $VALUE;\n$COMPONENT->SetViewColor(clr);}"},
	{"HighColor", "{0,0,0,0}", "{rgb_color clr = $VALUE;\n$COMPONENT->SetHighColor(clr);}"},
	{"LowColor", "{255,255,255,255}", "{rgb_color clr = $VALUE;\n$COMPONENT->SetLowColor(clr);}"},
};

// The parameters of "OnMouseMoved" hold no-break spaces. Generated sources out there have them, and the
// generator finds a handler by its text.
static const EventRow kEvents[] = {
	{"OnAllAttached", nullptr, nullptr},
	{"OnAttachedToWindow", nullptr, nullptr},
	{"OnAllDetached", nullptr, nullptr},
	{"OnDraw", "BRect updateRect", nullptr},
	{"OnFrameMoved", "BPoint parentPoint", nullptr},
	{"OnFrameResized", "float width, float height", nullptr},
	{"OnKeyDown", nullptr, nullptr},
	{"OnKeyUp", nullptr, nullptr},
	{"OnGotFocus", nullptr, nullptr},
	{"OnLostFocus", nullptr, nullptr},
	{"OnMouseUp", "BPoint point", nullptr},
	{"OnMouseDown", "BPoint point", nullptr},
	{"OnMouseMoved",
		"BPoint point, uint32 transit, const\xc2\xa0"
		"BMessage\xc2\xa0*message",
		nullptr},
};


static int
EdgeIndex(const char* name)
{
	for (int i = 0; i < 4; i++) {
		if (IsSameName(name, kEdgeNames[i]))
			return i;
	}
	return -1;
}


static void
SetEdge(BView* view, int edge, float position)
{
	const BRect frame = view->Frame();
	switch (edge) {
		case 0:
			view->MoveTo(position, frame.top);
			break;

		case 1:
			view->MoveTo(frame.left, position);
			break;

		case 2:
			view->ResizeTo(position - frame.left, frame.Height());
			break;

		default:
			view->ResizeTo(frame.Width(), position - frame.top);
			break;
	}
}


static const BFont*
FontNamed(const char* name)
{
	if (IsSameName(name, "be_plain_font"))
		return be_plain_font;
	if (IsSameName(name, "be_bold_font"))
		return be_bold_font;
	if (IsSameName(name, "be_fixed_font"))
		return be_fixed_font;
	return nullptr;
}


static void
SetFontSize(BView* view, float size)
{
	BFont font;
	view->GetFont(&font);
	font.SetSize(size);
	view->SetFont(&font);
}


static void
SetColor(BView* view, const char* name, const char* value)
{
	// Channels that the text leaves out stay as they are.
	if (IsSameName(name, "ViewColor")) {
		rgb_color color = view->ViewColor();
		view->SetViewColor(StrToRGBColor(value, &color));
	} else if (IsSameName(name, "HighColor")) {
		rgb_color color = view->HighColor();
		view->SetHighColor(StrToRGBColor(value, &color));
	} else if (IsSameName(name, "LowColor")) {
		rgb_color color = view->LowColor();
		view->SetLowColor(StrToRGBColor(value, &color));
	}
}


TVisualComponent::TVisualComponent(TComponentOwner* owner, TFormDesigner* designer)
	: TComponent(owner, designer, CT_VISUAL)
{
}


void
TVisualComponent::InitPropertyList()
{
	TComponent::InitPropertyList();
	AddEditedProperty<TBoolProperty>(this, "Visible", "true", Generation::kPlain);
	// Generated code places the view through its frame.
	for (const char* edge : kEdgeNames)
		AddEditedProperty<TIntProperty>(this, edge, "0", Generation::kNone);
	AddEditedProperty<TViewFlagsProperty>(
		this, "Flags", "B_WILL_DRAW|B_NAVIGABLE", Generation::kPlain);
	for (const auto& color : kColors) {
		AddEditedProperty<TViewColorProperty>(
			this, color.name, color.value, Generation::kPlain, color.setStatement);
	}
	AddEditedProperty<TFontProperty>(this, "Font", "be_plain_font", Generation::kPlain);
	AddEditedProperty<TFontSizeProperty>(this, "FontSize", "10", Generation::kPlain);
}


void
TVisualComponent::InitEventList()
{
	TComponent::InitEventList();
	AddEvents(this, kEvents);
}


const char*
TVisualComponent::GetPropertyValue(const char* name)
{
	PrintDiagnostic("TVisualComponent::GetPropertyValue('%s')\n", ShownText(name));
	if (name == nullptr)
		return TComponent::GetPropertyValue(name);

	for (const auto& color : kColors) {
		if (IsSameName(name, color.name)) {
			const char* value;
			return PropertyStore()->FindString(name, &value) == B_OK ? value : color.value;
		}
	}

	const int edge = EdgeIndex(name);
	BRect frame;
	if (edge >= 0 && PropertyStore()->FindRect("Frame", &frame) == B_OK) {
		// One text for each edge: callers want all four at once.
		static thread_local char sTexts[4][32];
		const float edges[] = {frame.left, frame.top, frame.right, frame.bottom};
		snprintf(sTexts[edge], sizeof(sTexts[edge]), "%ld", static_cast<long>(edges[edge]));
		return sTexts[edge];
	}
	return TComponent::GetPropertyValue(name);
}


void
TVisualComponent::SetPropertyValue(const char* name, const char* value)
{
	TViewLock lock(DTView());
	if (lock.IsLocked() && name != nullptr && value != nullptr)
		ApplyToView(name, value);
	TComponent::SetPropertyValue(name, value);
	if (lock.IsLocked())
		DTView()->Invalidate();
}


void
TVisualComponent::OnSetConstructorParams(BString&)
{
}


void
TVisualComponent::ApplyToView(const char* name, const char* value)
{
	const int edge = EdgeIndex(name);
	if (edge >= 0)
		SetEdge(DTView(), edge, NumberIn(value));
	else if (IsSameName(name, "FontSize"))
		SetFontSize(DTView(), NumberIn(value));
	else if (IsSameName(name, "Font") && FontNamed(value) != nullptr)
		DTView()->SetFont(FontNamed(value));
	else
		SetColor(DTView(), name, value);
}
