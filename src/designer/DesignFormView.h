// SPDX-License-Identifier: MIT
// The surface of a design form, on which its components lie.

#pragma once

#include <View.h>

#include "model/FormComponent.h"
#include "model/FormDesigner.h"

class TDesignForm;
class TLoadReport;
class TPaletteEntry;

/// The view that fills a design form: it owns the form's components, which are its child views.
///
/// As a TFormDesigner it is what palette entries and components talk to, and its component list is the
/// list of every component of the form, those inside other components included. Lock the design form's
/// window for everything that is not said to lock by itself.
class TDesignFormView : public BView, public TFormComponent, public TFormDesigner {
public:
	/// \a frame: the bounds of \a form, which adds the view to itself.
	TDesignFormView(BRect frame, TDesignForm* form);
	/// Destroys the components.
	virtual ~TDesignFormView();

	// BView
	void Draw(BRect updateRect) override;

	// TComponent
	/// A new value of "Name" becomes the form's name. Always true.
	bool PropertyModified(const char* name, const char* oldValue, const char* newValue) override;
	/// Clearing it clears the flag of every component, too.
	void SetModified(bool modified) override;
	/// True when this view or one of the components was changed.
	bool Modified() const override;

	// TComponentOwner
	/// Marks the form modified. Always true.
	bool ComponentPropertyModified(TComponent* component, const char* name, const char* oldValue,
		const char* newValue) override;

	// TFormDesigner
	bool IsDropWaiting() override;
	/// Makes a component of the waiting palette entry in \a parent, names it and adds it to the form.
	///
	/// \a frame: in \a parent's coordinates. Returns none when no entry waits or it makes none.
	TComponent* CreateComponent(BView* parent, BRect frame) override;
	void DoneDroppingComponent() override;

	/// Writes the form to \a path, which becomes its file. Locks the window where it reads views.
	///
	/// False, with nothing changed, when the file cannot be written.
	bool SaveToFile(const char* path);

	/// Reads the form from \a path, which becomes its file. Locks the window step by step.
	///
	/// What cannot be used is left out, reported on standard output and added to \a report. False, with
	/// nothing changed, when the file cannot be read.
	bool LoadFromFile(const char* path, TLoadReport* report = nullptr);

	/// The form's file; empty when it was never saved. At most 255 bytes are kept.
	const char* Filename() const { return fFilename; }
	void SetFilename(const char* name);

	TDesignForm* DesignWindow() const { return fForm; }

	/// Whether the generated application opens this form first.
	bool IsMainForm() const { return fIsMainForm; }
	void SetAsMainForm(bool isMainForm) { fIsMainForm = isMainForm; }

private:
	TDesignForm* fForm;
	char fFilename[256];
	bool fModified;
	bool fIsMainForm;
};
