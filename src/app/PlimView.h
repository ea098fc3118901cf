// SPDX-License-Identifier: MIT
// The background of the main window.

#pragma once

#include <View.h>

/// An empty view; files dropped on it are ignored. It prints each message that it receives.
class PlimView : public BView {
public:
	PlimView(BRect frame, const char* name);
	virtual ~PlimView();

	void MessageReceived(BMessage* message) override;
};
