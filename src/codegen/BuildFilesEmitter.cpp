// SPDX-License-Identifier: MIT
// Writes the files that build a generated program.

#include "codegen/BuildFilesEmitter.h"

#include <algorithm>

#include "app/WindowGuard.h"
#include "codegen/BuildFiles.h"
#include "codegen/FormParts.h"
#include "codegen/HandlerNames.h"
#include "codegen/SourceFiles.h"
#include "codegen/SourceWriter.h"
#include "designer/DesignForm.h"
#include "model/AppComponent.h"

namespace {

/// What make looks for, in this order.
constexpr const char* kMakefiles[] = {"GNUmakefile", "makefile", "Makefile"};
constexpr const char* kMakefile = "makefile";


void
AddSource(build_plan* plan, const char* baseName)
{
	BString source(baseName);
	source << ".cpp";
	if (std::find(plan->sources.begin(), plan->sources.end(), source) == plan->sources.end())
		plan->sources.push_back(source);
}

} // namespace


TBuildFilesEmitter::TBuildFilesEmitter(
	TAppComponent* app, const char* folder, source_dialect dialect, TSourceWriter* writer)
	: fApp(app),
	  fFolder(folder),
	  fDialect(dialect),
	  fWriter(writer)
{
}


void
TBuildFilesEmitter::EmitProject()
{
	if (!fWriter->PrepareFolder(fFolder.String()))
		return;

	const build_plan plan = Plan();
	fWriter->WriteOnce(PathOf("CMakeLists.txt").String(), CMakeText(plan));
	EmitMakefile(plan);
	BString resources(plan.name);
	resources << ".rdef";
	fWriter->WriteOnce(PathOf(resources.String()).String(), ResourceText(plan));
}


build_plan
TBuildFilesEmitter::Plan()
{
	build_plan plan;
	plan.name = fApp->ComponentName();
	plan.signature = PropertyText(fApp, "Signature");
	plan.launchFlags = PropertyText(fApp, "LaunchFlags");
	plan.dialect = fDialect;
	if (!plan.launchFlags.IsEmpty() && !AreLaunchFlags(plan.launchFlags)) {
		BString sentence("the launch flags '");
		sentence << plan.launchFlags << "' are left out of the resources: there are no such flags";
		fWriter->AddRemark(fFolder.String(), sentence);
		plan.launchFlags = "";
	}

	AddSource(&plan, fApp->ComponentName());
	for (int32 i = 0; i < fApp->CountComponents(); i++) {
		TDesignForm* form = FormAt(fApp, i);
		WindowGuard guard(form);
		char buffer[kGeneratedNameSize];
		if (guard.IsLocked())
			AddSource(&plan, BaseFormFilename(form, buffer));
	}
	return plan;
}


/// A makefile under any name that make takes is the user's choice: another one could hide it.
void
TBuildFilesEmitter::EmitMakefile(const build_plan& plan)
{
	for (const char* name : kMakefiles) {
		const BString path = PathOf(name);
		if (FileExists(path.String())) {
			fWriter->AddKept(path.String());
			return;
		}
	}
	fWriter->WriteOnce(PathOf(kMakefile).String(), MakefileText(plan));
}


BString
TBuildFilesEmitter::PathOf(const char* name) const
{
	BString path(fFolder);
	path << "/" << name;
	return path;
}
