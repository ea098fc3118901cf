// SPDX-License-Identifier: MIT
// Writes a project of one form with many buttons, for bench/compare.
//
// usage: bench_documents COUNT FOLDER

#include <cstdio>
#include <cstdlib>

#include <Application.h>
#include <String.h>

#include "ButtonForm.h"
#include "app/Preferences.h"
#include "model/AppComponent.h"
#include "project/Project.h"

int
main(int argc, char** argv)
{
	if (argc != 3) {
		fprintf(stderr, "usage: %s COUNT FOLDER\n", argv[0]);
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
	TDesignForm* form = project.NewForm();
	PlaceButtons(form, atoi(argv[1]));
	BString folder(argv[2]);
	BString path(folder);
	path << "/Form1.frm";
	form->SetFilename(path.String());
	path = folder;
	path << "/bench.plim";
	return project.SaveToFile(path.String(), true) ? 0 : 3;
}
