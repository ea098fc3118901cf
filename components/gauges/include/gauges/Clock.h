// SPDX-License-Identifier: MIT
// A clock on a form.

#pragma once

#include <Ormi.h>

#include <gauges/ClockView.h>

/// A clock. OnClick: pressed and released inside it. OnTick: another second, while it is running.
template <class Form>
class TClock : public TClickPart<Form, Gauges::ClockView> {
public:
	typedef TClickPart<Form, Gauges::ClockView> Part;

	typename Part::Event OnTick = nullptr;

	TClock(Form* form, BRect frame, const char* name, const char* time)
		: Part(form, frame, name, time)
	{
	}

protected:
	void TimeChanged() override { this->Call(OnTick); }
};
