// SPDX-License-Identifier: MIT
// Forms and components for tests of the generator, made without documents and component libraries.

#include "codegen/SampleProject.h"

#include <Application.h>
#include <String.h>

#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "model/Event.h"
#include "model/Property.h"


BApplication&
TestApplication()
{
	static BApplication* const application =
		new BApplication("application/x-vnd.plim-codegen-test");
	return *application;
}


TSampleControl::TSampleControl(
	const char* className, const char* name, int left, int top, int right, int bottom)
	: TControlComponent(nullptr, nullptr)
{
	SetClassName(className);
	SetComponentName(name);
	InitPropertyList();
	InitEventList();
	SetText(this, "Left", std::to_string(left).c_str());
	SetText(this, "Top", std::to_string(top).c_str());
	SetText(this, "Right", std::to_string(right).c_str());
	SetText(this, "Bottom", std::to_string(bottom).c_str());
}


bool
TSampleControl::OnGenHeaderFileTop(BString& text)
{
	text << headerTop.c_str();
	return !headerTop.empty();
}


void
TSampleControl::OnSetConstructorParams(BString& text)
{
	text << params.c_str();
}


bool
TSampleControl::OnGenInitForm(BString& text)
{
	text << init.c_str();
	return !init.empty();
}


void
TSampleControl::AddSelectedEvent(const char* name, const char* parameters, const char* returnType)
{
	AddEvent(new TEvent(name, parameters, returnType, true));
}


void
SetText(TComponent* component, const char* property, const char* value)
{
	component->FindProperty(property)->SetValue(value);
}


SampleProject::SampleProject()
{
	TestApplication();
	fApp.SetComponentName("MyApp");
	SetText(&fApp, "Signature", "application/x-vnd.Sample");
}


SampleProject::~SampleProject()
{
	fApp.ClearComponents(false);
	for (TDesignForm* form : fForms) {
		form->OKToClose(true);
		if (form->Lock())
			form->Quit();
	}
}


TDesignForm*
SampleProject::AddForm(const char* name, const char* path)
{
	TDesignForm* form = new TDesignForm(name, FORM_HIDDEN);
	form->SetFilename(path);
	SetText(form, "Left", "100");
	SetText(form, "Top", "100");
	SetText(form, "Right", "400");
	SetText(form, "Bottom", "300");
	fForms.push_back(form);
	fApp.AddComponent(form);
	return form;
}


std::unique_ptr<SampleProject>
SampleProject::MakeFull()
{
	std::unique_ptr<SampleProject> project(new SampleProject);
	project->fApp.SetEventSelection("OnQuitRequested", true);
	project->fApp.SetEventSelection("OnRefsReceived", true);

	TDesignForm* form = project->AddForm("Form1", "/projects/Form1.frm");
	SetText(form, "Title", "Main window");
	form->SetEventSelection("OnShow", true);
	form->SetEventSelection("OnQuitRequested", true);
	form->SetEventSelection("OnScreenChanged", true);

	TSampleControl* button =
		project->Place(form, new TSampleControl("TButton", "Button1", 10, 10, 90, 34));
	button->header = "Button.h";
	SetText(button, "Label", "OK");
	button->AddSelectedEvent("OnClick");

	TSampleControl* checkBox =
		project->Place(form, new TSampleControl("TCheckBox", "CheckBox1", 5, 20, 120, 38));
	checkBox->header = "CheckBox.h";
	checkBox->params = "B_FOLLOW_ALL,$COMPONENT";
	checkBox->AddSelectedEvent("OnAccept", "float value, bool *done", "bool");

	TSampleContainer* box =
		project->Place(form, new TSampleContainer("TBox", "Box1", 10, 50, 200, 120));
	box->header = "Button.h";
	box->headerTop = "class BBitmap;";
	box->AddComponent(checkBox);

	TSampleControl* list =
		project->Place(form, new TSampleControl("TListView", "List1", 210, 10, 290, 120));
	list->init = "$COMPONENT->AddItem(new BStringItem(\"one\"));\n"
				 "$component->AddItem(new BStringItem(\"two\"));";
	list->FindProperty("ViewColor")->SetSetStatement("");
	return project;
}


void
SampleProject::AddToForm(TDesignForm* form, TComponent* component)
{
	form->View()->AddComponent(component);
}
