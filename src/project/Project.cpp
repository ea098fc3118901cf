// SPDX-License-Identifier: MIT

#include "project/Project.h"

#include <cstdio>
#include <cstring>

#include <Entry.h>
#include <Node.h>
#include <Path.h>

#include "app/Dialogs.h"
#include "designer/DesignFormView.h"
#include "designer/FormFile.h"
#include "designer/LoadReport.h"
#include "model/AppComponent.h"
#include "model/Event.h"
#include "model/Property.h"

namespace {

constexpr const char* kMainFormAttribute = "PLIM:MainForm";
constexpr int32 kNameSize = 80;

} // namespace

TProject::TProject(form_visibility visibility)
	: fVisibility(visibility),
	  fFilename(),
	  fStatus(B_NO_INIT)
{
	NewProject(false);
}


TProject::~TProject()
{
	CloseForms();
}


void
TProject::NewProject(bool withForm)
{
	CloseForms();
	fApp = std::make_unique<TAppComponent>();
	fApp->SetClassName("TMyApplication");
	fApp->SetComponentName("Application");
	fApp->SetPropertyValue("Name", "Application");
	SetFilename("");
	if (withForm)
		AddForm("Form1")->SetAsMainForm(true);
	fApp->SetModified(false);
}


bool
TProject::LoadFromFile(const char* path, TLoadReport* report)
{
	printf("** filename = '%s'\n", path);
	TPLIMFile document(kProjectFileType);
	document.SetFilename(path);
	// The path may be the project's own, which a new project forgets.
	const BString filename(path);
	NewProject(false);
	const bool opened = document.OpenFile();
	fStatus = document.InitCheck();
	if (!opened)
		return false;

	SetFilename(filename.String());
	LoadApp(document);
	LoadForms(document, report);
	ReadMainForm();
	fApp->SetModified(false);
	return true;
}


bool
TProject::SaveToFile(const char* path, bool saveForms)
{
	TPLIMFile document(kProjectFileType);
	document.what = 'PPrj';
	if (!AddAppTo(&document))
		return false;
	if (saveForms)
		SaveForms(&document);

	document.SetFilename(path);
	const bool saved = document.SaveFile();
	fStatus = document.InitCheck();
	if (!saved)
		return false;

	SetFilename(path);
	WriteMainForm();
	fApp->SetModified(false);
	return true;
}


void
TProject::SetFilename(const char* name)
{
	if (name == nullptr)
		return;
	// The name may be this very one.
	const size_t length = strnlen(name, sizeof(fFilename) - 1);
	memmove(fFilename, name, length);
	fFilename[length] = '\0';
}


TDesignForm*
TProject::NewForm()
{
	TDesignForm* form = new TDesignForm("Form", fVisibility, this);
	char name[kNameSize];
	GetNewComponentName(form, fApp.get(), name, sizeof(name));
	form->SetComponentName(name);
	form->SetPropertyValue("Name", name);
	fForms.push_back({form, BString(), BString()});
	fApp->AddComponent(form);
	fApp->SetModified(true);
	return form;
}


std::vector<TDesignForm*>
TProject::Forms() const
{
	std::vector<TDesignForm*> forms;
	for (const form_entry& entry : fForms)
		forms.push_back(entry.form);
	return forms;
}


void
TProject::ObjectNameChanged(TComponent*)
{
	// The names are the components' own.
}


int32
TProject::CountForms() const
{
	return static_cast<int32>(fForms.size());
}


TDesignForm*
TProject::FormAt(int32 index) const
{
	return index >= 0 && index < CountForms() ? fForms[index].form : nullptr;
}


TDesignForm*
TProject::FindForm(const char* name) const
{
	for (const form_entry& entry : fForms) {
		if (strcmp(entry.form->ComponentName(), name) == 0)
			return entry.form;
	}
	return nullptr;
}


void
TProject::SetMainForm(TDesignForm* form)
{
	for (const form_entry& entry : fForms)
		entry.form->SetAsMainForm(entry.form == form);
}


TDesignForm*
TProject::AddForm(const char* name)
{
	TDesignForm* form = new TDesignForm(name, fVisibility, this);
	fForms.push_back({form, BString(), BString()});
	fApp->AddComponent(form);
	return form;
}


void
TProject::CloseForms()
{
	if (fApp != nullptr)
		fApp->ClearComponents(false);
	for (const form_entry& entry : fForms) {
		entry.form->OKToClose(true);
		if (entry.form->Lock())
			entry.form->Quit();
	}
	fForms.clear();
}


void
TProject::LoadApp(const BMessage& document)
{
	char* name;
	type_code type;
	BMessage properties;
	if (document.FindMessage("AppProperties", &properties) != B_OK)
		printf("Warning: Unable to load app properties.\n");
	for (int32 i = 0; properties.GetInfo(B_STRING_TYPE, i, &name, &type) == B_OK; i++) {
		const char* value = nullptr;
		TProperty* property = fApp->FindProperty(name);
		if (properties.FindString(name, &value) == B_OK && property != nullptr)
			property->SetValue(value);
		fApp->SetPropertyValue(name, value);
	}

	BMessage events;
	if (document.FindMessage("AppEvents", &events) != B_OK)
		printf("Warning: Unable to load app events.\n");
	for (int32 i = 0; events.GetInfo(B_BOOL_TYPE, i, &name, &type) == B_OK; i++) {
		bool selected;
		if (events.FindBool(name, &selected) == B_OK)
			fApp->SetEventSelection(name, selected);
	}
}


void
TProject::LoadForms(const BMessage& document, TLoadReport* report)
{
	char* name;
	type_code type;
	for (int32 i = 0; document.GetInfo(B_STRING_TYPE, i, &name, &type) == B_OK; i++) {
		const char* path;
		if (document.FindString(name, &path) != B_OK)
			continue;
		AddForm(name);
		form_entry& entry = fForms.back();
		entry.storedPath = path;
		entry.resolvedPath = ResolvePath(path);
		LoadForm(entry, report);
	}
}


void
TProject::LoadForm(form_entry& entry, TLoadReport* report)
{
	const char* path = entry.resolvedPath.String();
	if (entry.form->LoadFromFile(path, report))
		return;

	BString text;
	text << "the form '" << entry.form->ComponentName() << "' cannot be read";
	if (report != nullptr)
		report->Add(LOAD_FILE_UNREADABLE, path, text);
	text = "";
	text << "Unable to load the file '" << path << "'. Sorry.";
	MsgBox("Error", text.String(), "OK");
}


bool
TProject::AddAppTo(TPLIMFile* document)
{
	BMessage properties('appP');
	for (int32 i = 0; i < fApp->CountProperties(); i++) {
		TProperty* property = fApp->PropertyAt(i);
		properties.AddString(property->Name(), property->Value());
	}
	BMessage events('appE');
	for (int32 i = 0; i < fApp->CountEvents(); i++) {
		TEvent* event = fApp->EventAt(i);
		events.AddBool(event->name, event->selected);
	}

	if (document->AddMessage("AppProperties", &properties) != B_OK) {
		printf("Warning: Unable to save app properties.\n");
		return false;
	}
	if (document->AddMessage("AppEvents", &events) != B_OK) {
		printf("Warning: Unable to save app events.\n");
		return false;
	}
	return true;
}


void
TProject::SaveForms(TPLIMFile* document)
{
	for (const form_entry& entry : fForms) {
		const BString path(entry.form->Filename());
		if (path.IsEmpty()) {
			MsgBox("Information", "There's a form with no filename. Better save that.", "OK");
			continue;
		}
		if (!entry.form->SaveToFile(path.String()))
			MsgBox("Warning", "Unable to save the form.", "OK");
		const bool asRead = path == entry.resolvedPath;
		document->AddString(entry.form->ComponentName(), asRead ? entry.storedPath : path);
	}
}


void
TProject::ReadMainForm()
{
	BNode node(fFilename);
	char name[1024];
	const ssize_t length =
		node.ReadAttr(kMainFormAttribute, B_STRING_TYPE, 0, name, sizeof(name) - 1);
	if (length <= 0)
		return;
	name[length] = '\0';
	SetMainForm(FindForm(name));
}


void
TProject::WriteMainForm()
{
	BNode node(fFilename);
	node.RemoveAttr(kMainFormAttribute);
	for (const form_entry& entry : fForms) {
		if (!entry.form->IsMainForm())
			continue;
		const char* name = entry.form->ComponentName();
		node.WriteAttr(kMainFormAttribute, B_STRING_TYPE, 0, name, strlen(name) + 1);
		return;
	}
}


/// A form's path as the document has it, made to start at the project's folder unless it is absolute.
BString
TProject::ResolvePath(const char* path) const
{
	BPath file(fFilename);
	BPath folder;
	BPath resolved;
	if (*path == '/' || file.GetParent(&folder) != B_OK
		|| resolved.SetTo(folder.Path(), path) != B_OK)
		return path;
	return resolved.Path();
}
