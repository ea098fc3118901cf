// SPDX-License-Identifier: MIT

#include "GaugeComponent.h"

#include <cstdlib>
#include <cstring>

#include <MenuItem.h>
#include <PopUpMenu.h>
#include <String.h>

#include "SampleProperty.h"
#include "ZonesEditor.h"
#include "ZonesText.h"

namespace {

// The designer's own commands are small numbers.
constexpr uint32 kShowMinimum = 'gMin';
constexpr uint32 kShowMaximum = 'gMax';
constexpr uint32 kShowValue = 'gVal';

constexpr const char* kNumbers[] = {"Minimum", "Maximum", "Value", "Ticks"};
constexpr const char* kDefaultZones =
	"0..60 {60,160,60,255}|60..80 {230,170,40,255}|80..100 {200,50,50,255}";

bool
IsInt32(const char* text)
{
	char* end;
	const long long number = strtoll(text, &end, 10);
	return end != text && *end == '\0' && number == static_cast<int32>(number);
}


bool
IsNumber(const char* property)
{
	for (const char* name : kNumbers) {
		if (strcmp(name, property) == 0)
			return true;
	}
	return false;
}

} // namespace

TGaugeComponent::TGaugeComponent(TFormDesigner* designer, BRect frame)
	: TViewComponent(nullptr, designer)
{
	SetComponentName("Gauge");
	SetClassName("TGauge");
	TGaugeComponent::InitPropertyList();
	TGaugeComponent::InitEventList();
	auto* view = new DesignView<Gauges::DialView>(this, frame, "TGauge", 0, 100);
	SetDTView(view);
	ShowIn(view);
}


void
TGaugeComponent::InitPropertyList()
{
	TViewComponent::InitPropertyList();

	// The constructor takes these two.
	for (const char* const* row : {kNumbers, kNumbers + 1}) {
		const char* value = row == kNumbers ? "0" : "100";
		TProperty* property = new TProperty(this, *row, value, nullptr, false);
		AddPropAndEditor(property, new TIntProperty(this, property), nullptr, nullptr, false);
	}
	TProperty* property = new TSampleProperty(this, "Value", "0");
	AddPropAndEditor(property, new TIntProperty(this, property), nullptr, nullptr, false);
	property = new TProperty(this, "Unit", "", nullptr, true);
	AddPropAndEditor(property, new TStringProperty(this, property), nullptr, nullptr, true);
	property = new TProperty(this, "Ticks", "10", nullptr, true);
	AddPropAndEditor(property, new TIntProperty(this, property), nullptr, nullptr, false);
	property = new TProperty(this, "NeedleColor", "{200,40,40,255}", nullptr, true);
	AddPropAndEditor(property, new TViewColorProperty(this, property),
		"{rgb_color clr = $VALUE;\n$COMPONENT->SetNeedleColor(clr);}", nullptr, false);
	// OnGenInitForm() writes them.
	property = new TProperty(this, "Zones", kDefaultZones, nullptr, false);
	AddPropAndEditor(property, new TZonesEditor(this, property), nullptr, nullptr, false);
	property = new TProperty(this, "ResizingMode", "B_FOLLOW_NONE", nullptr, true);
	AddPropAndEditor(property, new TResizingModeProperty(this, property), nullptr, nullptr, false);
}


void
TGaugeComponent::InitEventList()
{
	TViewComponent::InitEventList();
	AddEvent(new TEvent("OnClick", nullptr, nullptr, false));
	AddEvent(new TEvent("OnChange", nullptr, nullptr, false));
}


bool
TGaugeComponent::PropertyModified(const char* name, const char* oldValue, const char* newValue)
{
	std::vector<Gauges::zone> zones;
	if (newValue != nullptr && IsNumber(name) && !IsInt32(newValue))
		return false;
	if (newValue != nullptr && strcmp(name, "Zones") == 0 && !ReadZones(newValue, '|', &zones))
		return false;
	return TViewComponent::PropertyModified(name, oldValue, newValue);
}


void
TGaugeComponent::SetPropertyValue(const char* name, const char* value)
{
	TViewComponent::SetPropertyValue(name, value);
	Show();
}


void
TGaugeComponent::AddComponentContextMenuItems(BPopUpMenu* menu)
{
	menu->AddSeparatorItem();
	menu->AddItem(new BMenuItem("Show the minimum", new BMessage(kShowMinimum)));
	menu->AddItem(new BMenuItem("Show the maximum", new BMessage(kShowMaximum)));
	BMenuItem* item = new BMenuItem("Show the value", new BMessage(kShowValue));
	item->SetMarked(!ValueProperty()->HasSample());
	menu->AddItem(item);
}


bool
TGaugeComponent::HandleComponentContextMessage(BMessage* message)
{
	TSampleProperty* value = ValueProperty();
	switch (message->what) {
		case kShowMinimum:
			value->SetSample(Number("Minimum"));
			break;

		case kShowMaximum:
			value->SetSample(Number("Maximum"));
			break;

		case kShowValue:
			value->RemoveSample();
			break;

		default:
			return TViewComponent::HandleComponentContextMessage(message);
	}
	SetModified(true);
	Show();
	return true;
}


/// Which property is asked for its data depends on where the component stands on the form, so the component keeps
/// that of its own.
void
TGaugeComponent::WriteExtendedComponentDataTo(BMessage* message)
{
	ValueProperty()->WriteExtendedData(message);
}


void
TGaugeComponent::ReadExtendedComponentDataFrom(const BMessage* message)
{
	ValueProperty()->ReadExtendedData(message);
	Show();
}


const char*
TGaugeComponent::HeaderFile()
{
	return "gauges/Gauge.h";
}


void
TGaugeComponent::OnSetConstructorParams(BString& text)
{
	text << Number("Minimum") << "," << Number("Maximum");
}


bool
TGaugeComponent::OnGenHeaderFileTop(BString& text)
{
	// With the form's name: a program includes the headers of all forms.
	text << "enum { k$FORMNAME" << ComponentName() << "Minimum = " << Number("Minimum")
		 << ", k$FORMNAME" << ComponentName() << "Maximum = " << Number("Maximum") << " };";
	return true;
}


bool
TGaugeComponent::OnGenInitForm(BString& text)
{
	std::vector<Gauges::zone> zones;
	ReadZones(FindProperty("Zones")->Value(), '|', &zones);
	const char* lineBreak = "";
	for (const Gauges::zone& zone : zones) {
		text << lineBreak << "$COMPONENT->AddZone(" << zone.from << "," << zone.to << ",make_color("
			 << static_cast<int32>(zone.color.red) << "," << static_cast<int32>(zone.color.green)
			 << "," << static_cast<int32>(zone.color.blue) << ","
			 << static_cast<int32>(zone.color.alpha) << "));";
		lineBreak = "\n";
	}
	return !zones.empty();
}


TSampleProperty*
TGaugeComponent::ValueProperty()
{
	return static_cast<TSampleProperty*>(FindProperty("Value"));
}


int32
TGaugeComponent::Number(const char* name)
{
	return static_cast<int32>(strtol(FindProperty(name)->Value(), nullptr, 10));
}


void
TGaugeComponent::ShowIn(Gauges::DialView* view)
{
	std::vector<Gauges::zone> zones;
	ReadZones(FindProperty("Zones")->Value(), '|', &zones);
	rgb_color color = {0, 0, 0, 255};
	view->SetRange(Number("Minimum"), Number("Maximum"));
	view->SetValue(ValueProperty()->Shown());
	view->SetUnit(FindProperty("Unit")->Value());
	view->SetTicks(Number("Ticks"));
	view->SetNeedleColor(StrToRGBColor(FindProperty("NeedleColor")->Value(), &color));
	view->RemoveZones();
	for (const Gauges::zone& zone : zones)
		view->AddZone(zone.from, zone.to, zone.color);
}


void
TGaugeComponent::Show()
{
	BView* view = DTView();
	if (view == nullptr || !view->LockLooper())
		return;
	ShowIn(static_cast<Gauges::DialView*>(view));
	view->UnlockLooper();
}
