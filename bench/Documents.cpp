// SPDX-License-Identifier: MIT
// Writes a project of forms with many buttons, for bench/compare.
//
// usage: bench_documents COUNT FOLDER [FORMS]
//
// COUNT: of the buttons on each form. FORMS: how many, one to begin with.

#include <cstdio>
#include <cstdlib>

#include <unistd.h>

#include <Application.h>
#include <Path.h>
#include <String.h>

#include "ButtonForm.h"
#include "app/Preferences.h"
#include "model/AppComponent.h"
#include "project/Project.h"

int
main(int argc, char** argv)
{
	if (argc != 3 && argc != 4) {
		fprintf(stderr, "usage: %s COUNT FOLDER [FORMS]\n", argv[0]);
		return 2;
	}
	// Relative names would be those of the documents' folder, and a file that cannot be saved would be asked about.
	BPath folder(argv[2], nullptr, true);
	if (folder.InitCheck() != B_OK || access(folder.Path(), W_OK) != 0) {
		fprintf(stderr, "bench_documents: cannot write into the folder '%s'\n", argv[2]);
		return 2;
	}
	setenv("BE_DISPLAY", "none", 1);
	AppSettings.LeaveFileAlone();
	BApplication app("application/x-vnd.Plimworks-Bench");
	SilenceOutput();
	if (!LoadStandardComponents())
		return 3;

	TProject project(FORM_HIDDEN);
	project.App()->SetPropertyValue("Name", "Bench");
	const int formCount = argc == 4 ? atoi(argv[3]) : 1;
	for (int i = 0; i < formCount; i++) {
		TDesignForm* form = project.NewForm();
		PlaceButtons(form, atoi(argv[1]));
		BString path(folder.Path());
		path << "/" << form->ComponentName() << ".frm";
		form->SetFilename(path.String());
	}
	BString path(folder.Path());
	path << "/bench.plim";
	return project.SaveToFile(path.String(), true) ? 0 : 3;
}
