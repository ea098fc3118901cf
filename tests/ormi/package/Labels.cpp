// SPDX-License-Identifier: MIT
// A component library of one component, to see that all it needs is found.

#include <ComponentKit.h>
#include <StringView.h>
#include <image.h>

class TLabelComponent : public TViewComponent {
public:
	TLabelComponent(TFormDesigner* designer, BRect frame)
		: TViewComponent(nullptr, designer)
	{
		SetComponentName("Label");
		SetClassName("TLabel");
		InitPropertyList();
		InitEventList();
		SetDTView(new BStringView(frame, "TLabel", "Label"));
	}

	void InitPropertyList() override
	{
		TViewComponent::InitPropertyList();
		TProperty* text = new TProperty(this, "Text", "", nullptr, true);
		AddPropAndEditor(text, new TStringProperty(this, text), nullptr, nullptr, true);
	}
};


class TLabelEntry : public TPaletteEntry {
public:
	using TPaletteEntry::TPaletteEntry;

	TComponent* CreateComponent(BView* parent, TFormDesigner* designer, BRect frame) override
	{
		TComponent* component = new TLabelComponent(designer, frame);
		parent->AddChild(component->DTView());
		return component;
	}
};

static TLabelEntry sEntry(0, "Label", "TLabel");


extern "C" bool
InitComponentLib(image_id)
{
	return true;
}


extern "C" void
UnInitComponentLib()
{
}


extern "C" uint32
CountComponents()
{
	return 1;
}


extern "C" TPaletteEntry*
EntryAt(uint32 index)
{
	return index == 0 ? &sEntry : nullptr;
}
