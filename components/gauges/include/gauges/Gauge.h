// SPDX-License-Identifier: MIT
// A dial on a form.

#pragma once

#include <Ormi.h>

#include <gauges/DialView.h>

/// A dial. OnClick: pressed and released inside it. OnChange: it got another value.
template <class Form>
class TGauge : public TClickPart<Form, Gauges::DialView> {
public:
	typedef TClickPart<Form, Gauges::DialView> Part;

	typename Part::Event OnChange = nullptr;

	TGauge(Form* form, BRect frame, const char* name, int32 minimum, int32 maximum)
		: Part(form, frame, name, minimum, maximum)
	{
	}

protected:
	void ValueChanged() override { this->Call(OnChange); }
};
