// SPDX-License-Identifier: MIT
// A project: an application and its forms, and their document.

#pragma once

#include <memory>
#include <vector>

#include <String.h>

#include "designer/DesignForm.h"
#include "designer/FormHost.h"

class BMessage;
class TAppComponent;
class TLoadReport;
class TPLIMFile;

/// An application component and the design forms of its windows.
///
/// The document is a TPLIMFile of type "application/x-plim-project" with the code 'PPrj' and these
/// fields: "AppProperties" (message 'appP': a string for each property of the application), "AppEvents"
/// (message 'appE': a bool for each event), then a string for each form: under the form's name, the
/// path of its file. Two forms must not share a name. A form's path that is not absolute starts at the
/// project's folder. Which form is the main form is the file's attribute "PLIM:MainForm" (a string).
///
/// Use a project from one thread; operations lock its forms one at a time.
class TProject : public TFormHost {
public:
	/// \a visibility: of the forms that the project makes.
	explicit TProject(form_visibility visibility = FORM_SHOWN);
	/// Closes the forms and destroys the application component.
	virtual ~TProject();

	TProject(const TProject&) = delete;
	TProject& operator=(const TProject&) = delete;

	/// Closes the forms and starts anew with an application called "Application", with one form, "Form1",
	/// as its main form when \a withForm is true.
	void NewProject(bool withForm);

	/// Reads the project from \a path, which becomes its file.
	///
	/// A form whose file cannot be read is told about in a box and stays in the project, empty. False,
	/// with a new, empty project, when the document cannot be opened; OpenStatus() tells why.
	bool LoadFromFile(const char* path, TLoadReport* report = nullptr);

	/// Writes the project to \a path, which becomes its file, and with \a saveForms each form to its own.
	///
	/// A form without a file is told about in a box and left out. Without \a saveForms no form is
	/// recorded. False when the document cannot be written; it is then as it was.
	bool SaveToFile(const char* path, bool saveForms);

	/// The result of the last opening or writing of a document.
	status_t OpenStatus() const { return fStatus; }

	/// The project's file; empty when it was never saved. At most 255 bytes are kept.
	const char* Filename() const { return fFilename; }
	void SetFilename(const char* name);

	TAppComponent* App() const { return fApp.get(); }

	/// Adds a new, empty form with the first free name of "Form1", "Form2", ... and returns it.
	TDesignForm* NewForm();

	// TFormHost
	std::vector<TDesignForm*> Forms() const override;
	void ObjectNameChanged(TComponent* object) override;

	int32 CountForms() const;
	TDesignForm* FormAt(int32 index) const;

	/// The form called \a name exactly; none when there is none.
	TDesignForm* FindForm(const char* name) const;

	/// Makes \a form the only main form; none is one when \a form is none.
	void SetMainForm(TDesignForm* form);

private:
	struct form_entry {
		TDesignForm* form;
		// The path as the document has it, and what it led to: it is written again as it was read.
		BString storedPath;
		BString resolvedPath;
	};

	TDesignForm* AddForm(const char* name);
	void CloseForms();
	void LoadApp(const BMessage& document);
	void LoadForms(const BMessage& document, TLoadReport* report);
	void LoadForm(form_entry& entry, TLoadReport* report);
	bool AddAppTo(TPLIMFile* document);
	void SaveForms(TPLIMFile* document);
	void ReadMainForm();
	void WriteMainForm();
	BString ResolvePath(const char* path) const;

	form_visibility fVisibility;
	std::unique_ptr<TAppComponent> fApp;
	std::vector<form_entry> fForms;
	char fFilename[256];
	status_t fStatus;
};
