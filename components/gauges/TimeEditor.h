// SPDX-License-Identifier: MIT
// The editor of a time.

#pragma once

#include <ComponentKit.h>

/// A text field that takes "9:5" and makes "09:05:00" of it.
class TTimeEditor : public TStringProperty {
public:
	using TStringProperty::TStringProperty;

	long EditLimit() override;
	void SetValue(const char* value, bool notify) override;
};
