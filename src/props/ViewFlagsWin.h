// SPDX-License-Identifier: MIT
// The dialog for the flags of a view.

#pragma once

#include <memory>

#include "props/PropertyModalEdit.h"

class TFlagBoxes;

/// A check box for each flag of TFlagSet::ViewFlags().
class ViewFlagsWin : public TPropertyModalEdit {
public:
	ViewFlagsWin(const char* value, const TPendingEdit& edit);
	virtual ~ViewFlagsWin();

	void InitWindow() override;
	void InitControls() override;
	/// Also prints the text on standard output.
	void OnApply() override;

private:
	std::unique_ptr<TFlagBoxes> fBoxes;
};
