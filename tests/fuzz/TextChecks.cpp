// SPDX-License-Identifier: MIT
// What must hold for any text that is read as a colour, as flags, or as a property's value.

#include "fuzz/TextChecks.h"

#include <cstring>
#include <string>

#include <String.h>

#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "fuzz/Require.h"
#include "model/ColorText.h"
#include "model/Property.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "props/FlagSet.h"
#include "props/PropertyEditor.h"

namespace {

constexpr size_t kValueSize = 1024;


void
CheckColor(const char* text)
{
	rgb_color color = {1, 2, 3, 4};
	const rgb_color read = StrToRGBColor(text, &color);
	REQUIRE(memcmp(&read, &color, sizeof(color)) == 0);
	char written[kColorTextSize];
	REQUIRE(RGBColorToStr(color, written) == written);
	REQUIRE(strlen(written) < sizeof(written));
	rgb_color again = {5, 6, 7, 8};
	StrToRGBColor(written, &again);
	REQUIRE(memcmp(&again, &color, sizeof(color)) == 0);
}


void
CheckFlags(const TFlagSet& flags, const char* text)
{
	const uint32 bits = flags.BitsFor(text);
	const BString written = flags.TextFor(bits);
	REQUIRE(flags.BitsFor(written.String()) == bits);
}


/// Sets every property, as a document and as the property window do.
void
CheckProperties(TComponent* component, const char* text)
{
	for (int32 i = 0; i < component->CountProperties(); i++) {
		const BString name(component->PropertyAt(i)->Name());
		component->SetPropertyValue(name.String(), text);
		TProperty* property = component->FindProperty(name.String());
		REQUIRE(property != nullptr);
		REQUIRE(strnlen(property->Value(), kValueSize + 1) <= kValueSize);
		if (property->Editor() != nullptr)
			property->Editor()->SetValue(text, true);
		property = component->FindProperty(name.String());
		REQUIRE(property != nullptr);
		REQUIRE(strnlen(property->Value(), kValueSize + 1) <= kValueSize);
	}
}

} // namespace


void
CheckPropertyText(const uint8_t* bytes, size_t size)
{
	const std::string text(reinterpret_cast<const char*>(bytes), size);
	CheckColor(text.c_str());
	CheckFlags(TFlagSet::ViewFlags(), text.c_str());
	CheckFlags(TFlagSet::WindowFlags(), text.c_str());

	TDesignForm* form = new TDesignForm("Form1", FORM_HIDDEN);
	PaletteCatalog().SetDropEntry(PaletteCatalog().FindPalEntry("TButton"));
	TComponent* button = form->CreateComponent(form->View(), BRect(10, 10, 60, 40));
	form->DoneDroppingComponent();
	REQUIRE(button != nullptr);
	CheckProperties(form, text.c_str());
	CheckProperties(button, text.c_str());
	form->Lock();
	form->Quit();
}
