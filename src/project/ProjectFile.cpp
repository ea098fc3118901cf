// SPDX-License-Identifier: MIT
// The document of a project, and those of its forms.

#include <algorithm>
#include <cstring>

#include <Entry.h>
#include <Messenger.h>
#include <Node.h>
#include <Path.h>

#include "app/Dialogs.h"
#include "app/WindowGuard.h"
#include "designer/DesignFormView.h"
#include "designer/FormFile.h"
#include "designer/Inspector.h"
#include "designer/LoadReport.h"
#include "designer/LostWork.h"
#include "designer/Recovery.h"
#include "model/Diagnostics.h"
#include "model/Event.h"
#include "model/Property.h"
#include "project/Project.h"
#include "project/ProjectOperation.h"

namespace {

constexpr const char* kMainFormAttribute = "PLIM:MainForm";


/// Whether the document is that of a form. Codes do not tell: older documents may have any.
bool
IsForm(const BMessage& document)
{
	for (const char* part : {"_FormProperties", "_FormEvents", "Components"}) {
		if (document.HasMessage(part))
			return true;
	}
	return false;
}


/// Sends a request to a form and waits for the "result" of its reply. No window may be locked.
bool
Ask(TDesignForm* form, BMessage* request, BMessage* reply)
{
	bool result = false;
	return BMessenger(form).SendMessage(request, reply) == B_OK
		&& reply->FindBool("result", &result) == B_OK && result;
}

} // namespace

bool
TProject::LoadFromFile(const char* path, TLoadReport* report)
{
	TProjectOperation operation(this);
	PrintDiagnostic("** filename = '%s'\n", path);
	NewProject(false);

	TPLIMFile document(kProjectFileType);
	document.SetFilename(path);
	const bool opened = document.OpenFile();
	fStatus = document.InitCheck();
	if (!opened)
		return false;
	if (IsForm(document) && !document.HasMessage("AppProperties")) {
		// Saved under its name, the project would replace the form.
		fStatus = B_MISMATCHED_VALUES;
		return false;
	}

	SetFilename(path);
	fStamp = document.Stamp();
	fStampedFile = path;
	LoadApp(document);
	LoadForms(document, report);
	ReadMainForm();
	MarkApp(false);
	return true;
}


bool
TProject::SaveToFile(const char* path, bool saveForms)
{
	TProjectOperation operation(this);
	if (IsCutFilename(path)) {
		fStatus = B_NAME_TOO_LONG;
		return false;
	}
	if (!MayOverwrite(path)) {
		fStatus = B_CANCELED;
		return false;
	}
	TPLIMFile document(kProjectFileType);
	document.what = 'PPrj';
	if (!AddAppTo(&document))
		return false;
	if (saveForms && !SaveForms(&document))
		return false;

	document.SetFilename(path);
	document.SetAttribute(kMainFormAttribute, MainFormName().String());
	const bool saved = document.SaveFile();
	fStatus = document.InitCheck();
	if (!saved)
		return false;

	SetFilename(path);
	fStamp = document.Stamp();
	fStampedFile = path;
	MarkApp(false);
	return true;
}


void
TProject::Recover(const lost_project& lost)
{
	TProjectOperation operation(this);
	for (const lost_form& form : lost.forms)
		fLostForms.push_back(&form);
	if (lost.path.IsEmpty() || !LoadFromFile(lost.path.String()))
		NewProject(false);
	AddLostForms();
	fLostForms.clear();
}


void
TProject::ForgetCopies()
{
	TProjectOperation operation(this);
	for (TDesignForm* form : Forms()) {
		WindowGuard guard(form, B_INFINITE_TIMEOUT);
		if (guard.IsLocked())
			form->View()->ForgetCopy();
	}
}


/// Asks about a file that somebody else has changed.
bool
TProject::MayOverwrite(const char* path)
{
	if (fStampedFile != path || !fStamp.Differs(path))
		return true;
	BString text("Another program has changed the project file '");
	text << path << "' since it was opened or saved here. Overwriting it loses those changes.";
	WindowRelease release;
	return MsgBox("Warning", text.String(), "Cancel", "Overwrite", nullptr, B_WIDTH_AS_USUAL,
			   B_WARNING_ALERT)
		== 1;
}


bool
TProject::IsCutFilename(const char* path) const
{
	std::lock_guard<std::mutex> lock(fListLock);
	return fFilenameCut && *fFilename == path;
}


TDesignForm*
TProject::AddFormFile(const char* path)
{
	TProjectOperation operation(this);
	WindowRelease release;
	{
		// Every document opens as an empty form.
		TPLIMFormFile document;
		document.SetFilename(path);
		if (!document.OpenFile() || !IsForm(document) || HasFormFile(path))
			return nullptr;
	}

	TDesignForm* form = MakeForm("Form");
	BString name;
	if (!ReadForm(form, path, nullptr, &name)) {
		Close({form});
		return nullptr;
	}
	Enter({form, BString(), BString()}, name.String());
	MarkApp(true);
	return form;
}


bool
TProject::SaveForm(TDesignForm* form, bool* canceled)
{
	TProjectOperation operation(this);
	if (canceled != nullptr)
		*canceled = false;
	if (fVisibility == FORM_HIDDEN) {
		const form_save_result result = *form->Filename() != '\0'
			? form->View()->SaveAfterAsking(form->Filename())
			: FORM_NOT_SAVED;
		if (canceled != nullptr)
			*canceled = result == FORM_SAVE_CANCELED;
		return result == FORM_SAVED;
	}
	WindowRelease release;
	BMessage request(DFM_SAVEFILE);
	BMessage reply;
	const bool saved = Ask(form, &request, &reply);
	if (canceled != nullptr)
		*canceled = reply.GetBool("canceled", false);
	return saved;
}


void
TProject::LoadApp(const BMessage& document)
{
	WindowGuard guard(fAppLooper, B_INFINITE_TIMEOUT);
	char* name;
	type_code type;
	BMessage properties;
	if (document.FindMessage("AppProperties", &properties) != B_OK)
		PrintDiagnostic("Warning: Unable to load app properties.\n");
	for (int32 i = 0; properties.GetInfo(B_STRING_TYPE, i, &name, &type) == B_OK; i++) {
		const char* value = nullptr;
		TProperty* property = fApp->FindProperty(name);
		if (properties.FindString(name, &value) == B_OK && property != nullptr)
			property->SetValue(value);
		fApp->SetPropertyValue(name, value);
	}

	BMessage events;
	if (document.FindMessage("AppEvents", &events) != B_OK)
		PrintDiagnostic("Warning: Unable to load app events.\n");
	for (int32 i = 0; events.GetInfo(B_BOOL_TYPE, i, &name, &type) == B_OK; i++) {
		bool selected;
		if (events.FindBool(name, &selected) == B_OK)
			fApp->SetEventSelection(name, selected);
	}
	ObjectNameChanged(fApp.get());
	Inspector::Refresh();
}


void
TProject::LoadForms(const BMessage& document, TLoadReport* report)
{
	char* name;
	type_code type;
	int32 count;
	for (int32 i = 0; document.GetInfo(B_STRING_TYPE, i, &name, &type, &count) == B_OK; i++) {
		const char* path;
		for (int32 j = 0; j < count && document.FindString(name, j, &path) == B_OK; j++) {
			const BString resolved = ResolvePath(path);
			TDesignForm* form = AddForm({nullptr, path, resolved}, name);
			LoadForm(form, resolved.String(), report);
		}
	}
}


void
TProject::LoadForm(TDesignForm* form, const char* path, TLoadReport* report)
{
	BString name;
	const auto lost = std::find_if(fLostForms.begin(), fLostForms.end(),
		[path](const lost_form* each) { return each->path == path; });
	const bool recovered = lost != fLostForms.end() && LoadCopy(form, **lost, &name);
	if (recovered)
		fLostForms.erase(lost);
	if (!recovered && !ReadForm(form, path, report, &name)) {
		BString text;
		text << "the form '" << name << "' cannot be read";
		if (report != nullptr)
			report->Add(LOAD_FILE_UNREADABLE, path, text);
		text = "";
		text << "Unable to load the file '" << path << "'. Sorry.";
		MsgBox("Error", text.String(), "OK");
	}
	WindowGuard guard(form, B_INFINITE_TIMEOUT);
	if (guard.IsLocked())
		ObjectNameChanged(form);
}


/// Has the form, which is shown, read its recovery copy, which becomes one of this run's. \a name gets its name.
bool
TProject::LoadCopy(TDesignForm* form, const lost_form& lost, BString* name)
{
	TRecovery* recovery = TRecovery::Current();
	const int32 id = recovery != nullptr ? recovery->TakeOver(lost.copyPath.String()) : 0;
	if (id == 0)
		return false;
	WindowRelease release;
	BMessage request(DFM_LOADCOPY);
	request.AddMessage("copy", &lost.copy);
	request.AddInt32("id", id);
	BMessage reply;
	const bool loaded = Ask(form, &request, &reply);
	const char* formName = "";
	reply.FindString("formname", &formName);
	*name = formName;
	return loaded;
}


/// Adds the forms whose copies are left over: the project's file has not heard of them.
void
TProject::AddLostForms()
{
	for (const lost_form* lost : fLostForms) {
		TDesignForm* form = MakeForm(lost->name.String());
		BString name;
		if (!LoadCopy(form, *lost, &name)) {
			Close({form});
			continue;
		}
		Enter({form, BString(), BString()}, name.String());
		if (lost->path.IsEmpty() && lost->copy.GetBool("main", false))
			SetMainForm(form);
		MarkApp(true);
	}
}


/// Has the form read its file, in its own thread when it has one. \a name gets its name, in any case.
bool
TProject::ReadForm(TDesignForm* form, const char* path, TLoadReport* report, BString* name)
{
	// A report is filled by the thread that waits for it.
	if (fVisibility == FORM_HIDDEN || report != nullptr) {
		const bool loaded = form->LoadFromFile(path, report);
		WindowGuard guard(form, B_INFINITE_TIMEOUT);
		*name = form->ComponentName();
		return loaded;
	}
	WindowRelease release;
	BMessage request(DFM_LOADFILE);
	request.AddString("filename", path);
	BMessage reply;
	const bool loaded = Ask(form, &request, &reply);
	const char* formName = "";
	reply.FindString("formname", &formName);
	*name = formName;
	return loaded;
}


bool
TProject::AddAppTo(TPLIMFile* document)
{
	BMessage properties('appP');
	BMessage events('appE');
	{
		WindowGuard guard(fAppLooper, B_INFINITE_TIMEOUT);
		for (int32 i = 0; i < fApp->CountProperties(); i++) {
			TProperty* property = fApp->PropertyAt(i);
			properties.AddString(property->Name(), property->Value());
		}
		for (int32 i = 0; i < fApp->CountEvents(); i++) {
			TEvent* event = fApp->EventAt(i);
			events.AddBool(event->name, event->selected);
		}
	}

	if (document->AddMessage("AppProperties", &properties) != B_OK) {
		PrintDiagnostic("Warning: Unable to save app properties.\n");
		return false;
	}
	if (document->AddMessage("AppEvents", &events) != B_OK) {
		PrintDiagnostic("Warning: Unable to save app events.\n");
		return false;
	}
	return true;
}


bool
TProject::SaveForms(TPLIMFile* document)
{
	for (const form_entry& entry : Entries()) {
		BString path;
		BString name;
		{
			WindowGuard guard(entry.form, B_INFINITE_TIMEOUT);
			if (!guard.IsLocked())
				continue;
			path = entry.form->Filename();
			name = entry.form->ComponentName();
		}
		if (path.IsEmpty()) {
			MsgBox("Information", "There's a form with no filename. Better save that.", "OK");
			continue;
		}
		bool canceled;
		if (!SaveForm(entry.form, &canceled) && !canceled)
			MsgBox("Warning", "Unable to save the form.", "OK");
		const bool asRead = path == entry.resolvedPath;
		// A name that the document uses itself cannot stand for a form, which would be lost.
		if (document->AddString(name.String(), asRead ? entry.storedPath : path) != B_OK) {
			PrintDiagnostic(
				"Warning: Unable to save the form '%s' under that name.\n", name.String());
			return false;
		}
	}
	return true;
}


void
TProject::ReadMainForm()
{
	BNode node(Filename());
	char name[1024];
	const ssize_t length =
		node.ReadAttr(kMainFormAttribute, B_STRING_TYPE, 0, name, sizeof(name) - 1);
	if (length <= 0)
		return;
	name[length] = '\0';
	if (*name != '\0')
		SetMainForm(FindForm(name));
}


BString
TProject::MainFormName()
{
	for (TDesignForm* form : Forms()) {
		WindowGuard guard(form, B_INFINITE_TIMEOUT);
		if (guard.IsLocked() && form->IsMainForm())
			return form->ComponentName();
	}
	return BString();
}


/// A form's path as the document has it, made to start at the project's folder unless it is absolute.
BString
TProject::ResolvePath(const char* path) const
{
	BPath file(Filename());
	BPath folder;
	BPath resolved;
	if (*path == '/' || file.GetParent(&folder) != B_OK
		|| resolved.SetTo(folder.Path(), path) != B_OK)
		return path;
	return resolved.Path();
}
