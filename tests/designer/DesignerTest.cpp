// SPDX-License-Identifier: MIT

#include "designer/DesignerTest.h"

#include <cstdlib>
#include <cstring>

#include <Application.h>
#include <Message.h>

#include "model/ViewComponent.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "support/CapturedOutput.h"
#include "support/ComponentLibraries.h"
#include "support/TracerComponent.h"

namespace {

class TracerEntry : public TPaletteEntry {
public:
	TracerEntry()
		: TPaletteEntry(0, "Tracer", "TTracer")
	{
	}

	TComponent* CreateComponent(BView* parent, TFormDesigner* designer, BRect frame) override
	{
		TracerComponent* component = new TracerComponent(designer, frame);
		parent->AddChild(component->DTView());
		return component;
	}
};

} // namespace

void
DesignerTest::SetUpTestSuite()
{
	setenv("BE_DISPLAY", "none", 1);
	static BApplication sApplication("application/x-vnd.Plimworks-DesignerTest");
	static TPaletteEntry sNone(0, "None", "TNone");
	static TracerEntry sTracer;
	if (PaletteCatalog().CountPalEntries() > 0)
		return;

	CapturedOutput output;
	LoadComponentLibraries();
	PaletteCatalog().AddPalEntry(&sNone);
	PaletteCatalog().AddPalEntry(&sTracer);
}


DesignerTest::DesignerTest() {}


DesignerTest::~DesignerTest()
{
	for (TDesignForm* form : fForms) {
		form->Lock();
		form->Quit();
	}
}


TDesignForm*
DesignerTest::NewForm(const char* name)
{
	CapturedOutput output;
	fForms.push_back(new TDesignForm(name, FORM_HIDDEN));
	return fForms.back();
}


TComponent*
DesignerTest::Place(
	TDesignForm* form, const char* className, const char* name, BRect frame, TComponent* parent)
{
	CapturedOutput output;
	PaletteCatalog().SetDropEntry(PaletteCatalog().FindPalEntry(className));
	BView* view = parent != nullptr ? parent->DTView() : form->View();
	TComponent* component = form->CreateComponent(view, frame);
	form->DoneDroppingComponent();
	if (component == nullptr)
		return nullptr;
	if (parent != nullptr)
		dynamic_cast<TComponentOwner*>(parent)->AddComponent(component);
	component->SetPropertyValue("Name", name);
	return component;
}


TComponent*
DesignerTest::Find(TDesignForm* form, const char* name)
{
	for (int32 i = 0; i < form->CountComponents(); i++) {
		if (strcmp(form->ComponentAt(i)->ComponentName(), name) == 0)
			return form->ComponentAt(i);
	}
	return nullptr;
}


std::string
DesignerTest::Save(TDesignForm* form, const std::string& path)
{
	CapturedOutput output;
	fResult = form->SaveToFile(path.c_str());
	return output.Text();
}


std::string
DesignerTest::Load(TDesignForm* form, const std::string& path, TLoadReport* report)
{
	CapturedOutput output;
	fResult = form->LoadFromFile(path.c_str(), report);
	return output.Text();
}
