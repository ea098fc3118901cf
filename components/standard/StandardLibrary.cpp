// SPDX-License-Identifier: MIT
// The standard component library: its entries, and the functions that the designer looks up.

#include <ComponentKit.h>
#include <image.h>

#include "BoxComponent.h"
#include "ButtonComponent.h"
#include "CheckBoxComponent.h"
#include "ColorControlComponent.h"
#include "ListViewComponent.h"
#include "MenuBarComponent.h"
#include "MenuFieldComponent.h"
#include "OutlineListViewComponent.h"
#include "PictureButtonComponent.h"
#include "PictureViewComponent.h"
#include "PlainViewComponent.h"
#include "RadioButtonComponent.h"
#include "ScrollViewComponent.h"
#include "SliderComponent.h"
#include "StatusBarComponent.h"
#include "StringViewComponent.h"
#include "TabViewComponent.h"
#include "TextControlComponent.h"
#include "TextViewComponent.h"

namespace {

template <class Class>
class TStandardEntry : public TClassEntry<Class> {
public:
	using TClassEntry<Class>::TClassEntry;

	const char* Copyright() const override { return "The standard components of Plimworks"; }
};

TStandardEntry<TButtonComponent> sButton(0, "Button", "TButton");
TStandardEntry<TCheckBoxComponent> sCheckBox(1, "CheckBox", "TCheckBox");
TStandardEntry<TTextControlComponent> sTextControl(2, "TextControl", "TTextControl");
TStandardEntry<TStringViewComponent> sStringView(3, "StringView", "TStringView");
TStandardEntry<TBoxComponent> sBox(4, "Box", "TBox");
TStandardEntry<TRadioButtonComponent> sRadioButton(5, "RadioButton", "TRadioButton");
TStandardEntry<TTextViewComponent> sTextView(6, "TextView", "TTextView");
TStandardEntry<TPlainViewComponent> sView(7, "View", "TView");
TStandardEntry<TListViewComponent> sListView(8, "ListView", "TListView");
TStandardEntry<TOutlineListViewComponent> sOutlineListView(
	9, "OutlineListView", "TOutlineListView");
TStandardEntry<TMenuFieldComponent> sMenuField(10, "MenuField", "TMenuField");
TStandardEntry<TMenuBarComponent> sMenuBar(11, "MenuBar", "TMenuBar");
TStandardEntry<TSliderComponent> sSlider(12, "Slider", "TSlider");
TStandardEntry<TStatusBarComponent> sStatusBar(13, "StatusBar", "TStatusBar");
TStandardEntry<TColorControlComponent> sColorControl(14, "ColorControl", "TColorControl");
TStandardEntry<TPictureViewComponent> sPictureView(15, "PictureView", "TPictureView");
TStandardEntry<TPictureButtonComponent> sPictureButton(16, "PictureButton", "TPictureButton");
TStandardEntry<TScrollViewComponent> sScrollView(17, "ScrollView", "TScrollView");
TStandardEntry<TTabViewComponent> sTabView(18, "TabView", "TTabView");

TPaletteEntry* const kEntries[] = {&sButton, &sCheckBox, &sTextControl, &sStringView, &sBox,
	&sRadioButton, &sTextView, &sView, &sListView, &sOutlineListView, &sMenuField, &sMenuBar,
	&sSlider, &sStatusBar, &sColorControl, &sPictureView, &sPictureButton, &sScrollView, &sTabView};
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
