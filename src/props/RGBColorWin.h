// SPDX-License-Identifier: MIT
// The dialog for a colour.

#pragma once

#include "props/PropertyModalEdit.h"

class BBox;
class BColorControl;

/// A colour control, and a box that shows the chosen colour.
class RGBColorWin : public TPropertyModalEdit {
public:
	RGBColorWin(const char* value, const TPendingEdit& edit);
	virtual ~RGBColorWin();

	void InitWindow() override;
	/// Also prints the text on standard output, as OnApply() does.
	void InitControls() override;
	void OnApply() override;
	bool OnMessage(BMessage* message) override;

private:
	void ShowColor();

	BColorControl* fColors;
	BBox* fPreview;
};
