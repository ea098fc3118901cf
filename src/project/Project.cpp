// SPDX-License-Identifier: MIT

#include "project/Project.h"

#include <algorithm>
#include <cstring>

#include <Messenger.h>

#include "app/WindowGuard.h"
#include "designer/DesignFormView.h"
#include "designer/Inspector.h"
#include "project/ProjectObserver.h"
#include "project/ProjectOperation.h"
#include "props/ForgottenEditors.h"

namespace {

constexpr int32 kNameSize = 80;
constexpr size_t kFilenameSize = 256;
// To no window: answered when the messages before it have been handled.
constexpr uint32 kMsgAreYouDone = '_don';

/// \a form, which is locked, and what is on it.
std::vector<const TComponent*>
ComponentsOf(const TDesignForm* form)
{
	std::vector<const TComponent*> components = {form};
	for (int32 i = 0; i < form->CountComponents(); i++)
		components.push_back(form->ComponentAt(i));
	return components;
}

} // namespace

TProject::AppOwner::AppOwner(TProject* project)
	: fProject(project)
{
}


bool
TProject::AppOwner::ComponentPropertyModified(
	TComponent* component, const char* name, const char*, const char* newValue)
{
	TProjectObserver* observer = fProject->fObserver;
	if (observer != nullptr && newValue != nullptr && strcmp(name, "Name") == 0)
		observer->NameChanged(component, newValue);
	return true;
}


TProject::TProject(form_visibility visibility)
	: fVisibility(visibility),
	  fOperation("project operation"),
	  fObserver(nullptr),
	  fAppLooper(nullptr),
	  fAppOwner(this),
	  fApp(MakeApp()),
	  fCurrentApp(fApp.get()),
	  fFilename(&*fFilenames.emplace().first),
	  fFilenameCut(false),
	  fStatus(B_NO_INIT)
{
}


TProject::~TProject()
{
	Close(Forms());
}


void
TProject::SetObserver(TProjectObserver* observer, BLooper* appLooper)
{
	fObserver = observer;
	fAppLooper = appLooper;
}


void
TProject::NewProject(bool withForm)
{
	TProjectOperation operation(this);
	const std::vector<TDesignForm*> oldForms = Forms();
	StopServing(oldForms);

	std::unique_ptr<TAppComponent> oldApp = std::move(fApp);
	fApp = MakeApp();
	fCurrentApp = fApp.get();
	{
		std::lock_guard<std::mutex> lock(fListLock);
		fForms.clear();
	}
	// It shows the new application, in the property window too, which so lets go of what is about to go.
	if (fObserver != nullptr)
		fObserver.load()->ProjectStarted(fApp.get());
	Quit(oldForms);
	std::unique_ptr<TForgottenEditors> editors = std::make_unique<TForgottenEditors>();
	{
		WindowGuard guard(fAppLooper, B_INFINITE_TIMEOUT);
		editors->Add(oldApp.get());
		oldApp.reset();
	}
	Inspector::Bury(std::move(editors));

	SetFilename("");
	if (withForm)
		SetMainForm(AddForm({nullptr, BString(), BString()}, "Form1"));
	MarkApp(false);
}


const char*
TProject::Filename() const
{
	std::lock_guard<std::mutex> lock(fListLock);
	return fFilename->c_str();
}


void
TProject::SetFilename(const char* name)
{
	if (name == nullptr)
		return;
	std::lock_guard<std::mutex> lock(fListLock);
	fFilename = &*fFilenames.emplace(name, strnlen(name, kFilenameSize - 1)).first;
	fFilenameCut = strlen(name) >= kFilenameSize;
}


bool
TProject::IsDirty()
{
	TProjectOperation operation(this);
	{
		WindowGuard guard(fAppLooper, B_INFINITE_TIMEOUT);
		if (fApp->Modified())
			return true;
	}
	for (TDesignForm* form : Forms()) {
		WindowGuard guard(form, B_INFINITE_TIMEOUT);
		if (guard.IsLocked() && (IsChanged(form) || *form->Filename() == '\0'))
			return true;
	}
	return false;
}


bool
TProject::IsChanged(const TDesignForm* form)
{
	return form->Modified() || form->TFormComponent::Modified();
}


bool
TProject::HasUnsavedForms()
{
	TProjectOperation operation(this);
	for (TDesignForm* form : Forms()) {
		WindowGuard guard(form, B_INFINITE_TIMEOUT);
		if (guard.IsLocked() && IsChanged(form) && *form->Filename() != '\0')
			return true;
	}
	return false;
}


BString
TProject::AppName()
{
	TProjectOperation operation(this);
	WindowGuard guard(fAppLooper, B_INFINITE_TIMEOUT);
	return fApp->ComponentName();
}


TDesignForm*
TProject::NewForm()
{
	TProjectOperation operation(this);
	TDesignForm* form = MakeForm("Form");
	const BString name = FreeNameFor(form);
	{
		WindowGuard guard(form, B_INFINITE_TIMEOUT);
		form->SetComponentName(name.String());
		form->SetPropertyValue("Name", name.String());
		// Nothing that the user would miss.
		form->TFormComponent::SetModified(false);
		form->View()->SetModified(false);
	}
	Enter({form, BString(), BString()}, name.String());
	MarkApp(true);
	return form;
}


bool
TProject::RemoveForm(TDesignForm* form)
{
	TProjectOperation operation(this);
	if (!HasForm(form))
		return false;
	{
		std::lock_guard<std::mutex> lock(fListLock);
		fForms.erase(std::find_if(fForms.begin(), fForms.end(),
			[form](const form_entry& entry) { return entry.form == form; }));
	}
	if (fObserver != nullptr)
		fObserver.load()->FormRemoved(form);
	{
		WindowGuard guard(form, B_INFINITE_TIMEOUT);
		if (guard.IsLocked()) {
			fApp->RemoveComponent(form);
			form->View()->ForgetCopy();
		}
	}
	Close({form});
	return true;
}


std::vector<TDesignForm*>
TProject::Forms() const
{
	std::lock_guard<std::mutex> lock(fListLock);
	std::vector<TDesignForm*> forms;
	forms.reserve(fForms.size());
	for (const form_entry& entry : fForms)
		forms.push_back(entry.form);
	return forms;
}


void
TProject::ObjectNameChanged(TComponent* object)
{
	if (fObserver != nullptr)
		fObserver.load()->NameChanged(object, object->ComponentName());
}


int32
TProject::CountForms() const
{
	std::lock_guard<std::mutex> lock(fListLock);
	return static_cast<int32>(fForms.size());
}


TDesignForm*
TProject::FormAt(int32 index) const
{
	std::lock_guard<std::mutex> lock(fListLock);
	const bool exists = index >= 0 && index < static_cast<int32>(fForms.size());
	return exists ? fForms[index].form : nullptr;
}


bool
TProject::HasForm(const TDesignForm* form) const
{
	const std::vector<TDesignForm*> forms = Forms();
	return std::find(forms.begin(), forms.end(), form) != forms.end();
}


TDesignForm*
TProject::FindForm(const char* name) const
{
	for (TDesignForm* form : Forms()) {
		WindowGuard guard(form, B_INFINITE_TIMEOUT);
		if (guard.IsLocked() && strcmp(form->ComponentName(), name) == 0)
			return form;
	}
	return nullptr;
}


void
TProject::SetMainForm(TDesignForm* form)
{
	TProjectOperation operation(this);
	for (TDesignForm* each : Forms()) {
		WindowGuard guard(each, B_INFINITE_TIMEOUT);
		if (guard.IsLocked())
			each->SetAsMainForm(each == form);
	}
}


bool
TProject::IsMainForm(TDesignForm* form)
{
	TProjectOperation operation(this);
	WindowGuard guard(form, B_INFINITE_TIMEOUT);
	return guard.IsLocked() && form->IsMainForm();
}


void
TProject::SetFormsClosing(bool closing)
{
	for (TDesignForm* form : Forms()) {
		WindowGuard guard(form);
		if (guard.IsLocked())
			form->OKToClose(closing);
	}
}


bool
TProject::BeginOperation(bigtime_t patience)
{
	if (fOperation.LockWithTimeout(0) == B_OK)
		return true;
	if (patience <= 0)
		return false;
	// The other thread may need the window whose lock this one has.
	WindowRelease release;
	return fOperation.LockWithTimeout(patience) == B_OK;
}


void
TProject::EndOperation()
{
	const bool isOver = fOperation.CountLocks() == 1;
	fOperation.Unlock();
	if (isOver && fObserver != nullptr)
		fObserver.load()->OperationEnded();
}


std::unique_ptr<TAppComponent>
TProject::MakeApp()
{
	std::unique_ptr<TAppComponent> app = std::make_unique<TAppComponent>();
	app->SetClassName("TMyApplication");
	app->SetComponentName("Application");
	app->SetPropertyValue("Name", "Application");
	app->SetModified(false);
	app->SetOwner(&fAppOwner);
	return app;
}


void
TProject::MarkApp(bool modified)
{
	WindowGuard guard(fAppLooper, B_INFINITE_TIMEOUT);
	fApp->SetModified(modified);
}


/// A new form, which is not in the list yet. It shows itself, and so must be made with no window locked.
TDesignForm*
TProject::MakeForm(const char* name)
{
	WindowRelease release;
	return new TDesignForm(name, fVisibility, this);
}


/// Puts a form at the end of the list, called \a name there.
void
TProject::Enter(const form_entry& entry, const char* name)
{
	{
		WindowGuard guard(entry.form, B_INFINITE_TIMEOUT);
		fApp->AddComponent(entry.form);
	}
	{
		std::lock_guard<std::mutex> lock(fListLock);
		fForms.push_back(entry);
	}
	if (fObserver != nullptr)
		fObserver.load()->FormAdded(entry.form, name);
}


/// Makes the entry's form, and puts it in the list.
TDesignForm*
TProject::AddForm(const form_entry& entry, const char* name)
{
	TDesignForm* form = MakeForm(name);
	Enter({form, entry.storedPath, entry.resolvedPath}, name);
	return form;
}


std::vector<TProject::form_entry>
TProject::Entries() const
{
	std::lock_guard<std::mutex> lock(fListLock);
	return fForms;
}


/// Whether a form of the project has that file.
bool
TProject::HasFormFile(const char* path) const
{
	for (TDesignForm* form : Forms()) {
		WindowGuard guard(form, B_INFINITE_TIMEOUT);
		if (guard.IsLocked() && strcmp(form->Filename(), path) == 0)
			return true;
	}
	return false;
}


/// The form's present name with the first number that makes it a new one among the project's forms.
BString
TProject::FreeNameFor(const TDesignForm* form) const
{
	// The names, taken from each form with its lock.
	TComponentOwner taken;
	std::vector<std::unique_ptr<TComponent>> names;
	for (TDesignForm* each : Forms()) {
		WindowGuard guard(each, B_INFINITE_TIMEOUT);
		if (!guard.IsLocked())
			continue;
		names.push_back(std::make_unique<TComponent>(nullptr, nullptr, CT_VISUAL));
		names.back()->SetComponentName(each->ComponentName());
		taken.AddComponent(names.back().get());
	}
	char name[kNameSize];
	GetNewComponentName(form, &taken, name, sizeof(name));
	return name;
}


/// Ends the windows of forms that are in no list any longer.
void
TProject::Close(const std::vector<TDesignForm*>& forms)
{
	StopServing(forms);
	Quit(forms);
}


/// From here on the forms do not turn to other windows any more: what forgets them now does so for good.
void
TProject::StopServing(const std::vector<TDesignForm*>& forms)
{
	for (TDesignForm* form : forms) {
		WindowGuard guard(form, B_INFINITE_TIMEOUT);
		if (guard.IsLocked())
			form->OKToClose(true);
	}
	if (fVisibility == FORM_HIDDEN)
		return;
	// A form may be in the middle of a message, and have asked before whether it is closing.
	WindowRelease release;
	for (TDesignForm* form : forms) {
		BMessage reply;
		BMessenger(form).SendMessage(kMsgAreYouDone, &reply);
	}
}


void
TProject::Quit(const std::vector<TDesignForm*>& forms)
{
	for (TDesignForm* form : forms) {
		std::vector<const TComponent*> components;
		const BView* view = nullptr;
		{
			WindowGuard guard(form);
			if (guard.IsLocked()) {
				components = ComponentsOf(form);
				view = form->View();
			}
		}
		if (view != nullptr)
			Inspector::Forget(components, view);
		{
			WindowGuard guard(form, B_INFINITE_TIMEOUT);
			if (guard.IsLocked())
				form->Quit();
		}
		// The user may have chosen something of it with the last clicks that it handled.
		if (view != nullptr)
			Inspector::Forget(components, view);
	}
}
