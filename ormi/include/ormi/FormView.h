// SPDX-License-Identifier: MIT
// The view that fills a form.

#pragma once

#include <View.h>

#include <ormi/Part.h>

class TForm;

/// The background of a form, on which its components lie. It hands its events to the form's hooks while
/// the form is open.
class TFormView : public BView, public TFormPart {
public:
	/// As large as \a parent, which adds it with SetFormView().
	TFormView(TForm* parent, const char* name);
	virtual ~TFormView();

	TForm* ParentForm() const { return fForm; }

	void FormAttached() override;
	void FormAllAttached() override;
	void FormFocusChanged(bool hasFocus) override;
	void FormInnerDispatched(const BView* inner, const BMessage* message) override;

	void AllAttached() override;
	void AttachedToWindow() override;
	void AllDetached() override;
	void Draw(BRect updateRect) override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void KeyUp(const char* bytes, int32 numBytes) override;
	void MouseUp(BPoint where) override;
	void MouseDown(BPoint where) override;
	void MouseMoved(BPoint where, uint32 transit, const BMessage* message) override;

private:
	TForm* fForm;
	bool fHasFocus;
};
