// SPDX-License-Identifier: MIT
// Makes a project with a component of each class, and prints what documents hold. For tests that use the designer from
// outside.

#include <cstdio>
#include <cstring>
#include <string>

#include <Application.h>
#include <String.h>

#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "designer/DocumentFile.h"
#include "model/Property.h"
#include "palette/LibraryLoader.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "project/Project.h"
#include "props/PropertyEditor.h"
#include "props/StringList.h"
#include "props/StringProperty.h"

namespace {

const char* const kUsage = "usage: property_program make FOLDER LIBRARIES\n"
						   "       property_program print DOCUMENT\n"
						   "\n"
						   "make: writes all.plim and all.frm, a form with one component of each "
						   "class that the add-ons in the folder\n"
						   "LIBRARIES offer. Prints \"component NAME CLASS\" for the application, "
						   "the form and each component, each\n"
						   "followed by \"property NAME TYPE KIND VALUE CHOICE...\" for its "
						   "properties, with tabs between the words.\n"
						   "TYPE is the editor's, as a number; KIND is \"number\" or \"text\".\n"
						   "print: prints \"COMPONENT PROPERTY VALUE\", with tabs between, for "
						   "each property in a project or form file.\n";

// The form stands where the designer has no other window, and its components where they can be clicked.
constexpr int kFormFrame[] = {590, 60, 1010, 730};
constexpr int kColumns = 3;
constexpr int kColumnWidth = 138;
constexpr int kRowHeight = 92;

void
PrintProperties(TComponent* component)
{
	printf("component\t%s\t%s\n", component->ComponentName(), component->ClassName());
	for (int32 i = 0; i < component->CountProperties(); i++) {
		const TProperty* property = component->PropertyAt(i);
		TPropertyEditor* editor = property->Editor();
		const bool isNumber = dynamic_cast<TIntProperty*>(editor) != nullptr;
		printf("property\t%s\t%d\t%s\t%s", property->Name(), editor->Type(),
			isNumber ? "number" : "text", property->Value());
		TStringList choices(20);
		editor->GetValuePickList(&choices);
		for (int32 j = 0; j < choices.CountItems(); j++)
			printf("\t%s", choices.StringAt(j));
		printf("\n");
	}
}


void
SetEdges(TComponent* component, const int edges[4])
{
	const char* const names[] = {"Left", "Top", "Right", "Bottom"};
	for (int i = 0; i < 4; i++) {
		BString text;
		text << edges[i];
		component->SetPropertyValue(names[i], text.String());
	}
}


bool
Make(const char* folder, const char* libraries)
{
	// The model tells on standard output what it does; what is asked for comes last.
	TLibraryLoader(&PaletteCatalog()).LoadFolder(libraries);
	TProject project(FORM_HIDDEN);
	project.NewProject(false);
	TDesignForm* form = project.NewForm();
	const std::string path(folder);
	form->SetFilename((path + "/all.frm").c_str());
	SetEdges(form, kFormFrame);
	for (int32 i = 0; i < PaletteCatalog().CountPalEntries(); i++) {
		const float left = 8 + static_cast<float>(i % kColumns) * kColumnWidth;
		const float top = 8 + static_cast<float>(i / kColumns) * kRowHeight;
		PaletteCatalog().SetDropEntry(PaletteCatalog().PalEntryAt(i));
		form->CreateComponent(form->View(), BRect(left, top, left + 100, top + 60));
		form->DoneDroppingComponent();
	}
	if (!project.SaveToFile((path + "/all.plim").c_str(), true))
		return false;
	printf("\n");
	PrintProperties(project.App());
	PrintProperties(form);
	for (int32 i = 0; i < form->CountComponents(); i++)
		PrintProperties(form->ComponentAt(i));
	return true;
}


void
PrintStrings(const char* name, const BMessage& message, const char* field)
{
	BMessage record;
	if (message.FindMessage(field, &record) != B_OK)
		return;
	char* property;
	type_code type;
	int32 count;
	for (int32 i = 0; record.GetInfo(B_STRING_TYPE, i, &property, &type, &count) == B_OK; i++) {
		const char* value;
		for (int32 j = 0; record.FindString(property, j, &value) == B_OK; j++)
			printf("%s\t%s\t%s\n", name, property, value);
	}
}


bool
Print(const char* path)
{
	TPLIMFile document(nullptr, path);
	if (document.InitCheck() != B_OK)
		return false;
	PrintStrings("application", document, "AppProperties");
	PrintStrings("form", document, "_FormProperties");
	BMessage components;
	document.FindMessage("Components", &components);
	char* name;
	type_code type;
	for (int32 i = 0; components.GetInfo(B_MESSAGE_TYPE, i, &name, &type) == B_OK; i++) {
		BMessage component;
		if (components.FindMessage(name, &component) == B_OK)
			PrintStrings(name, component, "Properties");
	}
	return true;
}

} // namespace

int
main(int argc, char** argv)
{
	BApplication application("application/x-vnd.plim-property-program");
	bool isDone = false;
	if (argc == 4 && strcmp(argv[1], "make") == 0) {
		isDone = Make(argv[2], argv[3]);
	} else if (argc == 3 && strcmp(argv[1], "print") == 0) {
		isDone = Print(argv[2]);
	} else {
		fputs(kUsage, stderr);
		return 2;
	}
	return isDone ? 0 : 1;
}
