// SPDX-License-Identifier: MIT
// Designs the example project and writes its documents, as a user of the designer would.
//
// usage: design_hello COMPONENTS_FOLDER PROJECT_FOLDER

#include <cstdio>
#include <cstdlib>
#include <cstring>

#include <Application.h>

#include <unistd.h>

#include "app/Preferences.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "model/AppComponent.h"
#include "palette/LibraryLoader.h"
#include "palette/PaletteCatalog.h"
#include "project/Project.h"

namespace {

/// Places components on a form, each the way a drag after a choice on the palette does it.
class Designer {
public:
	explicit Designer(TDesignForm* form)
		: fForm(form)
	{
	}

	/// Places a component of the class on \a parent, the form's surface when it is none.
	TComponent* Place(
		const char* className, const char* name, BRect frame, TComponent* parent = nullptr)
	{
		PaletteCatalog().SetDropEntry(PaletteCatalog().FindPalEntry(className));
		BView* view = parent != nullptr ? parent->DTView() : fForm->View();
		TComponent* component = fForm->CreateComponent(view, frame);
		fForm->DoneDroppingComponent();
		if (parent != nullptr)
			dynamic_cast<TComponentOwner*>(parent)->AddComponent(component);
		component->SetPropertyValue("Name", name);
		component->SetPropertyValue("FontSize", "12");
		return component;
	}

	TComponent* PlaceText(
		const char* name, BRect frame, const char* text, TComponent* parent = nullptr)
	{
		TComponent* component = Place("TStringView", name, frame, parent);
		component->SetPropertyValue("Text", text);
		return component;
	}

	TComponent* PlaceControl(const char* className, const char* name, BRect frame,
		const char* label, const char* event, TComponent* parent = nullptr)
	{
		TComponent* component = Place(className, name, frame, parent);
		component->SetPropertyValue("Label", label);
		component->SetEventSelection(event, true);
		return component;
	}

private:
	TDesignForm* fForm;
};

/// Gives a form its name, title and place.
void
SetUpForm(TDesignForm* form, const char* name, const char* title, const char* const edges[4])
{
	const char* const kEdges[] = {"Left", "Top", "Right", "Bottom"};
	for (int32 i = 0; i < 4; i++)
		form->SetPropertyValue(kEdges[i], edges[i]);
	form->SetPropertyValue("Name", name);
	form->SetPropertyValue("Title", title);
	form->SetPropertyValue("WindowFlags", "B_NOT_RESIZABLE|B_NOT_ZOOMABLE");
	form->SetPropertyValue("FontSize", "12");
}


void
DesignMainForm(TDesignForm* form)
{
	const char* const edges[] = {"120", "120", "480", "400"};
	SetUpForm(form, "MainForm", "Hello", edges);

	Designer designer(form);
	TComponent* greeting = designer.Place("TBox", "GreetingBox", BRect(12, 12, 348, 128));
	greeting->SetPropertyValue("Label", "Greeting");
	TComponent* name = designer.PlaceControl(
		"TTextControl", "NameField", BRect(12, 26, 324, 50), "Your name:", "OnChange", greeting);
	name->SetPropertyValue("Divider", "90");
	designer.PlaceControl(
		"TCheckBox", "ShoutBox", BRect(12, 58, 150, 78), "Shout", "OnChange", greeting);
	designer.PlaceText("GreetingText", BRect(12, 84, 324, 106), "Hello!", greeting);

	designer.PlaceControl("TButton", "CountButton", BRect(12, 144, 112, 172), "Count", "OnClick");
	designer.PlaceText("CountText", BRect(128, 144, 348, 166), "No clicks yet");
	designer.PlaceControl("TButton", "NoteButton", BRect(12, 184, 112, 212), "Note...", "OnClick");
	designer.PlaceText("NoteText", BRect(128, 184, 348, 206), "Opens another form");
	designer.PlaceControl("TButton", "QuitButton", BRect(248, 236, 348, 264), "Quit", "OnClick");
}


void
DesignNoteForm(TDesignForm* form)
{
	const char* const edges[] = {"520", "120", "780", "250"};
	SetUpForm(form, "NoteForm", "Note", edges);

	Designer designer(form);
	designer.PlaceText("Prompt", BRect(12, 12, 248, 32), "Write something down:");
	designer.Place("TTextControl", "NoteField", BRect(12, 44, 248, 68));
	designer.PlaceControl("TButton", "CloseButton", BRect(148, 88, 248, 116), "Close", "OnClick");
}


int
Design(const char* components, const char* folder)
{
	TLibraryLoader loader(&PaletteCatalog());
	if (loader.LoadFolder(components) != B_OK || loader.CountEntries() == 0) {
		fprintf(stderr, "%s: no component library can be loaded from here\n", components);
		return 3;
	}
	// Forms are saved under names without a folder, so that the project can be moved.
	if (chdir(folder) != 0) {
		perror(folder);
		return 3;
	}

	TProject project(FORM_HIDDEN);
	TAppComponent* app = project.App();
	app->SetPropertyValue("Name", "Hello");
	app->SetPropertyValue("ClassName", "THello");
	app->SetPropertyValue("Signature", "application/x-vnd.Plimworks-Hello");
	app->SetPropertyValue("GenerationPath", ".");

	// Without the file's attribute, which a checkout does not have, the last form is the main form.
	TDesignForm* noteForm = project.NewForm();
	TDesignForm* mainForm = project.NewForm();
	DesignMainForm(mainForm);
	DesignNoteForm(noteForm);
	mainForm->SetFilename("MainForm.frm");
	noteForm->SetFilename("NoteForm.frm");
	project.SetMainForm(mainForm);
	if (!project.SaveToFile("hello.plim", true)) {
		fprintf(stderr, "%s/hello.plim: cannot be written: %s\n", folder,
			strerror(project.OpenStatus()));
		return 3;
	}
	return 0;
}

} // namespace

int
main(int argc, char** argv)
{
	if (argc != 3) {
		fprintf(stderr, "usage: %s COMPONENTS_FOLDER PROJECT_FOLDER\n", argv[0]);
		return 2;
	}
	setenv("BE_DISPLAY", "none", 1);
	AppSettings.LeaveFileAlone();
	BApplication app("application/x-vnd.Plimworks-DesignHello");
	return Design(argv[1], argv[2]);
}
