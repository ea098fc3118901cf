// SPDX-License-Identifier: MIT
// What must hold for any bytes that are read as a form file or a project file.

#include "fuzz/FormChecks.h"

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <string>

#include <Application.h>
#include <String.h>

#include "app/Dialogs.h"
#include "codegen/CodeGenerator.h"
#include "codegen/ProjectCheck.h"
#include "designer/DesignForm.h"
#include "designer/LoadReport.h"
#include "fuzz/Require.h"
#include "model/AppComponent.h"
#include "palette/LibraryLoader.h"
#include "palette/PaletteCatalog.h"
#include "project/Project.h"
#include "support/TemporaryFolder.h"

namespace {

const TemporaryFolder&
Folder()
{
	static const TemporaryFolder sFolder;
	return sFolder;
}


int32
TakeFirstButton(const char*, const char*, const char*)
{
	return 0;
}


/// A hidden form, closed at the end.
class HiddenForm {
public:
	HiddenForm()
		: fForm(new TDesignForm("Form1", FORM_HIDDEN))
	{
	}

	~HiddenForm()
	{
		fForm->Lock();
		fForm->Quit();
	}

	TDesignForm* operator->() const { return fForm; }

private:
	TDesignForm* fForm;
};


std::string
Bytes(const uint8_t* bytes, size_t size)
{
	return std::string(reinterpret_cast<const char*>(bytes), size);
}


/// The folder of a project, with the forms of the example in it.
const TemporaryFolder&
FolderWithForms()
{
	static const TemporaryFolder sFolder;
	static const bool sIsFilled = [] {
		for (const char* name : {"MainForm.frm", "NoteForm.frm"})
			std::filesystem::copy(
				PLIM_SOURCE_DIR "/examples/hello/" + std::string(name), sFolder / name);
		return true;
	}();
	REQUIRE(sIsFilled);
	return sFolder;
}


void
CheckReport(const TLoadReport& report)
{
	for (const load_problem& problem : report.Problems())
		REQUIRE(!problem.file.IsEmpty() && !problem.text.IsEmpty());
}

} // namespace


void
PrepareFormChecks(const char* folder)
{
	setenv("BE_DISPLAY", "none", 1);
	static BApplication sApplication("application/x-vnd.Plimworks-FormChecks");
	SetMessageBoxHook(TakeFirstButton);
	TLibraryLoader(&PaletteCatalog()).LoadFolder(folder);
	REQUIRE(PaletteCatalog().FindPalEntry("TButton") != nullptr);
}


bool
CheckFormBytes(const uint8_t* bytes, size_t size)
{
	const std::string path = Folder().Write("form.frm", Bytes(bytes, size));
	HiddenForm form;
	TLoadReport report;
	const bool loaded = form->LoadFromFile(path.c_str(), &report);
	CheckReport(report);
	if (!loaded) {
		REQUIRE(form->CountComponents() == 0);
		REQUIRE(strcmp(form->ComponentName(), "Form1") == 0);
		REQUIRE(*form->Filename() == '\0');
		return false;
	}

	REQUIRE(path == form->Filename());
	const std::string saved = Folder() / "saved.frm";
	remove(saved.c_str());
	REQUIRE(form->SaveToFile(saved.c_str()));
	HiddenForm again;
	REQUIRE(again->LoadFromFile(saved.c_str()));
	// Components of one name are one in a document.
	REQUIRE(again->CountComponents() <= form->CountComponents());
	if (again->CountComponents() < form->CountComponents())
		return true;
	for (int32 i = 0; i < form->CountComponents(); i++) {
		const char* name = form->ComponentAt(i)->ComponentName();
		REQUIRE(strcmp(again->ComponentAt(i)->ComponentName(), name) == 0);
	}
	return true;
}


bool
CheckProjectBytes(const uint8_t* bytes, size_t size)
{
	const std::string path = Folder().Write("project.plim", Bytes(bytes, size));
	TProject project(FORM_HIDDEN);
	TLoadReport report;
	const bool loaded = project.LoadFromFile(path.c_str(), &report);
	CheckReport(report);
	REQUIRE((project.OpenStatus() == B_OK) == loaded);
	REQUIRE(project.App()->CountComponents() == project.CountForms());
	if (!loaded) {
		REQUIRE(project.CountForms() == 0);
		REQUIRE(*project.Filename() == '\0');
		return false;
	}

	REQUIRE(path == project.Filename());
	const std::string saved = Folder() / "saved.plim";
	remove(saved.c_str());
	REQUIRE(project.SaveToFile(saved.c_str(), false));
	TProject again(FORM_HIDDEN);
	REQUIRE(again.LoadFromFile(saved.c_str()));
	REQUIRE(again.CountForms() == 0);
	REQUIRE(strcmp(again.App()->ComponentName(), project.App()->ComponentName()) == 0);
	return true;
}


bool
CheckWholeProject(const uint8_t* bytes, size_t size)
{
	const TemporaryFolder& folder = FolderWithForms();
	const std::string path = folder.Write("project.plim", Bytes(bytes, size));
	TProject project(FORM_HIDDEN);
	TLoadReport report;
	const bool loaded = project.LoadFromFile(path.c_str(), &report);
	CheckReport(report);
	REQUIRE(project.App()->CountComponents() == project.CountForms());
	if (!loaded) {
		REQUIRE(project.CountForms() == 0);
		return false;
	}
	for (int32 i = 0; i < project.CountForms(); i++)
		REQUIRE(!TProject::IsChanged(project.FormAt(i)));

	TProjectCheck check(project.App(), path.c_str());
	for (const project_problem& problem : check.Run())
		REQUIRE(!problem.text.empty());

	TCodeGenerator generator;
	generator.Writer().SetDryRun(true);
	generator.SetAppComponent(project.App());
	// Not where the document says.
	generator.SetGenerationPath((folder / "sources").c_str());
	generator.GenerateApp();
	REQUIRE(!generator.Writer().Files().empty());
	REQUIRE(!std::filesystem::exists(folder / "sources"));
	return true;
}
