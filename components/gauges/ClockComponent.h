// SPDX-License-Identifier: MIT
// The component for a clock.

#pragma once

#include <ComponentKit.h>
#include <gauges/ClockView.h>

/// A Gauges::ClockView. Properties beside those of every view: "Time" ("10:10:00"), "Running" (bool: the program shows
/// the present time), "Seconds" (bool: there is a hand for them), "HandColor", "ResizingMode". Events: "OnClick",
/// "OnTick". While designing it shows "Time".
class TClockComponent : public TViewComponent {
public:
	TClockComponent(TFormDesigner* designer, BRect frame);

	void InitPropertyList() override;
	void InitEventList() override;
	/// Refuses what is no time.
	bool PropertyModified(const char* name, const char* oldValue, const char* newValue) override;
	void SetPropertyValue(const char* name, const char* value) override;

	/// Takes the present time.
	bool DefaultEditAction(BPoint where) override;

	const char* HeaderFile() override;
	void OnSetConstructorParams(BString& text) override;

private:
	void ShowIn(Gauges::ClockView* view);
};
