// SPDX-License-Identifier: MIT

#include "TimeEditor.h"

#include <cstdio>

#include <gauges/ClockView.h>

namespace {

constexpr long kTimeLength = 8;

} // namespace

long
TTimeEditor::EditLimit()
{
	return kTimeLength;
}


/// What is no time goes on as it is: the component refuses it.
void
TTimeEditor::SetValue(const char* value, bool notify)
{
	Gauges::day_time time;
	char text[40];
	if (Gauges::ReadTime(value, &time)) {
		snprintf(text, sizeof(text), "%02d:%02d:%02d", static_cast<int>(time.hour),
			static_cast<int>(time.minute), static_cast<int>(time.second));
		value = text;
	}
	TStringProperty::SetValue(value, notify);
}
