// SPDX-License-Identifier: MIT
// The dialog before the sources are generated.

#pragma once

#include <Window.h>

class BButton;
class BCheckBox;
class BView;
class TAppComponent;
class TCodeGenerator;

/// Shows what is going to be generated, and generates in its own thread when the user agrees.
///
/// The values shown are those of the time when the dialog is made. It quits itself after either button. Beside the
/// buttons the user chooses the dialect of the sources, which is kept in the settings at once.
class ConfirmGenerateWin : public BWindow {
public:
	/// \a generator, \a app: not owned. Without \a app a box tells so, and the window stays empty and hidden:
	/// see IsComplete().
	ConfirmGenerateWin(TCodeGenerator* generator, TAppComponent* app);
	virtual ~ConfirmGenerateWin();

	/// Whether there is something to confirm. Do not show a dialog that is not complete.
	bool IsComplete() const { return fApp != nullptr; }

	void Show() override;
	void MessageReceived(BMessage* message) override;

private:
	void InitControls();
	void AddSettings(BView* parent);
	void AddForms(BView* parent);
	void AddDialect(BView* parent, BRect cancelFrame);
	void Generate();

	TCodeGenerator* fGenerator;
	TAppComponent* fApp;
	BButton* fGenerateButton;
	BButton* fCancelButton;
	BCheckBox* fStandardBox;
};
