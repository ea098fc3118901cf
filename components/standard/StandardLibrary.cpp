// SPDX-License-Identifier: MIT
// The standard component library: its entries, and the functions that the designer looks up.

#include <ComponentKit.h>
#include <View.h>
#include <image.h>

#include "BoxComponent.h"
#include "ButtonComponent.h"
#include "CheckBoxComponent.h"
#include "StringViewComponent.h"
#include "TextControlComponent.h"

namespace {

/// Makes components of the class \a Class, which is constructed from its designer and its frame.
template <class Class>
class TStandardEntry : public TPaletteEntry {
public:
	using TPaletteEntry::TPaletteEntry;

	TComponent* CreateComponent(BView* parent, TFormDesigner* designer, BRect frame) override
	{
		if (parent == nullptr)
			return nullptr;
		TComponent* component = new Class(designer, frame);
		parent->AddChild(component->DTView());
		return component;
	}

	const char* Copyright() const override { return "The standard components of Plimworks"; }
};

TStandardEntry<TButtonComponent> sButton(0, "Button", "TButton");
TStandardEntry<TCheckBoxComponent> sCheckBox(1, "CheckBox", "TCheckBox");
TStandardEntry<TTextControlComponent> sTextControl(2, "TextControl", "TTextControl");
TStandardEntry<TStringViewComponent> sStringView(3, "StringView", "TStringView");
TStandardEntry<TBoxComponent> sBox(4, "Box", "TBox");

TPaletteEntry* const kEntries[] = {&sButton, &sCheckBox, &sTextControl, &sStringView, &sBox};
constexpr uint32 kEntryCount = sizeof(kEntries) / sizeof(kEntries[0]);

} // namespace

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
	return kEntryCount;
}


extern "C" TPaletteEntry*
EntryAt(uint32 index)
{
	return index < kEntryCount ? kEntries[index] : nullptr;
}
