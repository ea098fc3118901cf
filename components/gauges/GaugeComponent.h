// SPDX-License-Identifier: MIT
// The component for a dial.

#pragma once

#include <ComponentKit.h>
#include <gauges/DialView.h>

class TSampleProperty;

/// A Gauges::DialView. Properties beside those of every view: "Minimum", "Maximum", "Value", "Unit", "Ticks",
/// "NeedleColor", "Zones" ("0..60 {60,160,60,255}|60..80 {230,170,40,255}"), "ResizingMode". Events: "OnClick",
/// "OnChange".
///
/// Its context menu shows other values while designing. The header of the form gets constants for the range, as
/// kForm1Gauge1Minimum and kForm1Gauge1Maximum.
class TGaugeComponent : public TViewComponent {
public:
	TGaugeComponent(TFormDesigner* designer, BRect frame);

	void InitPropertyList() override;
	void InitEventList() override;
	/// Refuses what is no number, and zones that cannot be read.
	bool PropertyModified(const char* name, const char* oldValue, const char* newValue) override;
	void SetPropertyValue(const char* name, const char* value) override;

	void AddComponentContextMenuItems(BPopUpMenu* menu) override;
	bool HandleComponentContextMessage(BMessage* message) override;

	void WriteExtendedComponentDataTo(BMessage* message) override;
	void ReadExtendedComponentDataFrom(const BMessage* message) override;

	const char* HeaderFile() override;
	void OnSetConstructorParams(BString& text) override;
	bool OnGenHeaderFileTop(BString& text) override;
	bool OnGenInitForm(BString& text) override;

private:
	TSampleProperty* ValueProperty();
	int32 Number(const char* name);
	void ShowIn(Gauges::DialView* view);
	void Show();
};
