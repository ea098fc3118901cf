// SPDX-License-Identifier: MIT
// A project: an application and its forms, and their document.

#pragma once

#include <atomic>
#include <memory>
#include <mutex>
#include <set>
#include <string>
#include <vector>

#include <Locker.h>
#include <String.h>

#include "designer/DesignForm.h"
#include "designer/FileStamp.h"
#include "designer/FormHost.h"
#include "model/AppComponent.h"

class BLooper;
class BMessage;
class TLoadReport;
class TPLIMFile;
class TProjectObserver;
class TProjectOperation;
struct lost_form;
struct lost_project;

/// An application component and the design forms of its windows.
///
/// The document is a TPLIMFile of type "application/x-plim-project" with the code 'PPrj' and these
/// fields: "AppProperties" (message 'appP': a string for each property of the application), "AppEvents"
/// (message 'appE': a bool for each event), then a string for each form: under the form's name, the
/// path of its file. Forms that share a name share the field, which then has several values. A form's path
/// that is not absolute starts at the project's folder. Which form is the main form is the file's attribute
/// "PLIM:MainForm" (a string).
///
/// Threads: whatever changes the project, and all that does not say "any thread", is a TProjectOperation,
/// which these functions begin by themselves. They wait for other threads' operations and for the threads of
/// the forms, and lock the forms one at a time; the lock that a WindowGuard, or the thread's own looper, holds is
/// given up meanwhile. The application component's values are protected by the lock of the looper that
/// SetObserver() was given.
class TProject : public TFormHost {
public:
	/// \a visibility: of the forms that the project makes.
	explicit TProject(form_visibility visibility = FORM_SHOWN);
	/// Closes the forms and destroys the application component.
	virtual ~TProject();

	TProject(const TProject&) = delete;
	TProject& operator=(const TProject&) = delete;

	/// Tells \a observer of all changes from now on; null for none. \a appLooper: whose lock protects the application
	/// component. No operation may be under way.
	void SetObserver(TProjectObserver* observer, BLooper* appLooper);

	/// Closes the forms and starts anew with an application called "Application", with one form, "Form1",
	/// as its main form when \a withForm is true.
	void NewProject(bool withForm);

	/// Reads the project from \a path, which becomes its file.
	///
	/// A form whose file cannot be read is told about in a box and stays in the project, empty. False,
	/// with a new, empty project, when the document cannot be opened or is a form's; OpenStatus() tells why.
	bool LoadFromFile(const char* path, TLoadReport* report = nullptr);

	/// Writes the project to \a path, which becomes its file, and with \a saveForms each form to its own.
	///
	/// A form without a file is told about in a box and left out. Without \a saveForms no form is
	/// recorded. False when the document cannot be written, or cannot record a form; it is then as it was.
	/// A file that somebody else has changed since it was opened or saved here is asked about first. If the user does
	/// not want the project's overwritten, the result is false, and OpenStatus() B_CANCELED.
	bool SaveToFile(const char* path, bool saveForms);

	/// Starts anew with what an earlier run of the designer left unsaved: opens its project, or a new one, with the
	/// recovery copies in place of the forms' files. They become this run's. Forms that the project's file does not
	/// have are added. Needs a TRecovery.
	void Recover(const lost_project& lost);

	/// Removes the recovery copies of all forms: the user does not want what was changed.
	void ForgetCopies();

	/// The result of the last opening or writing of a document.
	status_t OpenStatus() const { return fStatus; }

	/// The project's file; empty when it was never saved. At most 255 bytes are kept; saving to a name that was cut
	/// is refused. Any thread; the result stays
	/// valid as long as the project.
	const char* Filename() const;
	/// Any thread.
	void SetFilename(const char* name);

	/// Any thread; another operation may replace it.
	TAppComponent* App() const { return fCurrentApp; }

	/// Whether the application or a form was changed, or a form has no file.
	bool IsDirty();

	/// Whether the form was changed since it was saved. Lock it.
	static bool IsChanged(const TDesignForm* form);

	/// Whether a form was changed that has a file.
	bool HasUnsavedForms();

	/// The application's name as it is now.
	BString AppName();

	/// Adds a new, empty form with the first free name of "Form1", "Form2", ... and returns it.
	TDesignForm* NewForm();

	/// Adds the form in the file at \a path; none, with nothing added, when it is no form file, cannot be read or is
	/// a form of the project already: two forms would overwrite each other.
	TDesignForm* AddFormFile(const char* path);

	/// Takes \a form out of the project and closes it, and its recovery copy goes; false when it is no form of the
	/// project.
	bool RemoveForm(TDesignForm* form);

	/// Has \a form write itself to its file; false when it has none or that fails.
	///
	/// A file that somebody else has changed is asked about. \a canceled, if not null, tells that the user did not
	/// want it overwritten.
	bool SaveForm(TDesignForm* form, bool* canceled = nullptr);

	// TFormHost
	std::vector<TDesignForm*> Forms() const override;
	const char* ProjectFile() const override { return Filename(); }
	void ObjectNameChanged(TComponent* object) override;

	/// Any thread.
	int32 CountForms() const;
	TDesignForm* FormAt(int32 index) const;
	bool HasForm(const TDesignForm* form) const;

	/// The form called \a name exactly; none when there is none.
	TDesignForm* FindForm(const char* name) const;

	/// Makes \a form the only main form; none is one when \a form is none.
	void SetMainForm(TDesignForm* form);

	/// Whether the form is the main form.
	bool IsMainForm(TDesignForm* form);

	/// Lets the forms' windows really close, or not. Any thread.
	void SetFormsClosing(bool closing);

private:
	friend class TProjectOperation;

	struct form_entry {
		TDesignForm* form;
		// The path as the document has it, and what it led to: it is written again as it was read.
		BString storedPath;
		BString resolvedPath;
	};

	/// Hears of the application's new names.
	class AppOwner : public TComponentOwner {
	public:
		explicit AppOwner(TProject* project);
		bool ComponentPropertyModified(TComponent* component, const char* name,
			const char* oldValue, const char* newValue) override;

	private:
		TProject* fProject;
	};

	bool BeginOperation(bigtime_t patience);
	void EndOperation();

	std::unique_ptr<TAppComponent> MakeApp();
	void MarkApp(bool modified);
	TDesignForm* MakeForm(const char* name);
	void Enter(const form_entry& entry, const char* name);
	TDesignForm* AddForm(const form_entry& entry, const char* name);
	std::vector<form_entry> Entries() const;
	bool HasFormFile(const char* path) const;
	bool IsCutFilename(const char* path) const;
	BString FreeNameFor(const TDesignForm* form) const;
	void Close(const std::vector<TDesignForm*>& forms);
	void StopServing(const std::vector<TDesignForm*>& forms);
	void Quit(const std::vector<TDesignForm*>& forms);

	void LoadApp(const BMessage& document);
	void LoadForms(const BMessage& document, TLoadReport* report);
	void LoadForm(TDesignForm* form, const char* path, TLoadReport* report);
	bool ReadForm(TDesignForm* form, const char* path, TLoadReport* report, BString* name);
	bool AddAppTo(TPLIMFile* document);
	bool SaveForms(TPLIMFile* document);
	bool LoadCopy(TDesignForm* form, const lost_form& lost, BString* name);
	void AddLostForms();
	bool MayOverwrite(const char* path);
	void ReadMainForm();
	BString MainFormName();
	BString ResolvePath(const char* path) const;

	const form_visibility fVisibility;
	BLocker fOperation;
	std::atomic<TProjectObserver*> fObserver;
	BLooper* fAppLooper;
	AppOwner fAppOwner;
	std::unique_ptr<TAppComponent> fApp;
	std::atomic<TAppComponent*> fCurrentApp;

	// Short sections, in which nothing else is called. Only operations change what it protects.
	mutable std::mutex fListLock;
	std::vector<form_entry> fForms;
	// All names that the project's file has had: they are handed out, and other threads may still read them.
	std::set<std::string> fFilenames;
	const std::string* fFilename;
	// The file would be another one than the one that was asked for.
	bool fFilenameCut;

	status_t fStatus;

	// What fStampedFile held when it was loaded or saved. Only operations use it.
	TFileStamp fStamp;
	BString fStampedFile;
	// During Recover(): the copies that no form has taken yet.
	std::vector<const lost_form*> fLostForms;
};
