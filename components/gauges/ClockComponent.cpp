// SPDX-License-Identifier: MIT

#include "ClockComponent.h"

#include <time.h>

#include <cstring>

#include <String.h>

#include "TimeEditor.h"

TClockComponent::TClockComponent(TFormDesigner* designer, BRect frame)
	: TViewComponent(nullptr, designer)
{
	SetComponentName("Clock");
	SetClassName("TClock");
	TClockComponent::InitPropertyList();
	TClockComponent::InitEventList();
	auto* view = new DesignView<Gauges::ClockView>(this, frame, "TClock", "");
	SetDTView(view);
	ShowIn(view);
}


void
TClockComponent::InitPropertyList()
{
	TViewComponent::InitPropertyList();

	// The constructor takes it.
	TProperty* property = new TProperty(this, "Time", "10:10:00", nullptr, false);
	AddPropAndEditor(property, new TTimeEditor(this, property), nullptr, nullptr, true);
	for (const char* name : {"Running", "Seconds"}) {
		property = new TProperty(this, name, "true", nullptr, true);
		AddPropAndEditor(property, new TBoolProperty(this, property), nullptr, nullptr, false);
	}
	property = new TProperty(this, "HandColor", "{40,40,40,255}", nullptr, true);
	AddPropAndEditor(property, new TViewColorProperty(this, property),
		"{rgb_color clr = $VALUE;\n$COMPONENT->SetHandColor(clr);}", nullptr, false);
	property = new TProperty(this, "ResizingMode", "B_FOLLOW_NONE", nullptr, true);
	AddPropAndEditor(property, new TResizingModeProperty(this, property), nullptr, nullptr, false);
}


void
TClockComponent::InitEventList()
{
	TViewComponent::InitEventList();
	AddEvent(new TEvent("OnClick", nullptr, nullptr, false));
	AddEvent(new TEvent("OnTick", nullptr, nullptr, false));
}


bool
TClockComponent::PropertyModified(const char* name, const char* oldValue, const char* newValue)
{
	Gauges::day_time time;
	if (newValue != nullptr && strcmp(name, "Time") == 0 && !Gauges::ReadTime(newValue, &time))
		return false;
	return TViewComponent::PropertyModified(name, oldValue, newValue);
}


void
TClockComponent::SetPropertyValue(const char* name, const char* value)
{
	TViewComponent::SetPropertyValue(name, value);
	BView* view = DTView();
	if (view == nullptr || !view->LockLooper())
		return;
	ShowIn(static_cast<Gauges::ClockView*>(view));
	view->UnlockLooper();
}


bool
TClockComponent::DefaultEditAction(BPoint)
{
	const time_t now = time(nullptr);
	struct tm local;
	char text[16];
	strftime(text, sizeof(text), "%H:%M:%S", localtime_r(&now, &local));
	FindProperty("Time")->Editor()->SetValue(text, true);
	return true;
}


const char*
TClockComponent::HeaderFile()
{
	return "gauges/Clock.h";
}


void
TClockComponent::OnSetConstructorParams(BString& text)
{
	// A time needs no escapes.
	text << "\"" << FindProperty("Time")->Value() << "\"";
}


void
TClockComponent::ShowIn(Gauges::ClockView* view)
{
	rgb_color color = {0, 0, 0, 255};
	view->SetTime(FindProperty("Time")->Value());
	view->SetSeconds(strcmp(FindProperty("Seconds")->Value(), "true") == 0);
	view->SetHandColor(StrToRGBColor(FindProperty("HandColor")->Value(), &color));
}
