// SPDX-License-Identifier: MIT
// One run of the generator from a command line.

#include "codegen/GenerationRun.h"

#include <string.h>

#include <string>

#include <Path.h>

#include "app/Dialogs.h"
#include "codegen/DialectGenerator.h"
#include "codegen/ProjectCheck.h"
#include "codegen/SourceFiles.h"
#include "codegen/UnifiedDiff.h"
#include "designer/LoadReport.h"
#include "model/AppComponent.h"
#include "model/Property.h"
#include "palette/LibraryLoader.h"
#include "palette/PaletteCatalog.h"
#include "project/Project.h"

namespace {

/// The generator keeps this much of a folder's name.
constexpr size_t kMostPathBytes = 255;


/// Answers the boxes that would be shown with windows: what they say is in the load report, too.
int32
AnswerBox(const char*, const char*, const char*)
{
	return 0;
}


const char*
Advice(load_problem_kind kind)
{
	switch (kind) {
		case LOAD_FILE_UNREADABLE:
			return "put the file there, or take the form out of the project";
		case LOAD_CLASS_UNKNOWN:
			return "name the folder of its library with --components";
		case LOAD_COMPONENT_DAMAGED:
			return "open the form in the designer and save it";
		default:
			return "move it in the designer and save the form";
	}
}


std::string
WithAdvice(const load_problem& problem)
{
	return std::string(problem.text.String()) + "; " + Advice(problem.kind);
}

} // namespace


TGenerationRun::TGenerationRun(const generation_options& options, FILE* out, FILE* err)
	: fOptions(options),
	  fOut(out),
	  fErr(err),
	  fProblemCount(0)
{
}


TGenerationRun::~TGenerationRun() = default;


generation_result
TGenerationRun::Run()
{
	const message_box_hook previous = SetMessageBoxHook(AnswerBox);
	generation_result result = LoadLibraries();
	if (result == GENERATION_DONE) {
		fProject = std::make_unique<TProject>(FORM_HIDDEN);
		result = LoadProject();
	}
	SetMessageBoxHook(previous);
	return result;
}


generation_result
TGenerationRun::LoadLibraries()
{
	TLibraryLoader loader(&PaletteCatalog());
	if (fOptions.componentFolders.empty()) {
		BPath folder;
		// Without libraries beside the program there are no components, and the load says which are missed.
		if (FindComponentsFolder(&folder) == B_OK)
			loader.LoadFolder(folder.Path());
		return GENERATION_DONE;
	}

	for (const BString& folder : fOptions.componentFolders) {
		const status_t status = loader.LoadFolder(folder.String());
		if (status != B_OK) {
			BString text("the folder of component libraries cannot be read (");
			text << strerror(status) << "); check the option --components";
			TellProblem(folder.String(), text.String());
			return GENERATION_FILE_BAD;
		}
	}
	return GENERATION_DONE;
}


generation_result
TGenerationRun::LoadProject()
{
	const char* path = fOptions.project.String();
	TLoadReport report;
	if (!fProject->LoadFromFile(path, &report)) {
		if (fProject->OpenStatus() == B_MISMATCHED_VALUES) {
			TellProblem(path, "this is a form and no project; name the project file (.plim)");
			return GENERATION_FILE_BAD;
		}
		BString text("the project cannot be read (");
		text << strerror(fProject->OpenStatus()) << "); name a project file (.plim)";
		TellProblem(path, text.String());
		return GENERATION_FILE_BAD;
	}

	const generation_result result = SetMainForm();
	if (result != GENERATION_DONE)
		return result;
	if (fOptions.check)
		return Check(report);

	const generation_result judged = JudgeLoad(report);
	if (judged != GENERATION_DONE)
		return judged;

	TProjectCheck check(fProject->App(), path, fOptions.dialect);
	for (const project_problem& problem : check.Run())
		Warn(problem.file.c_str(), problem.text.c_str());
	return Generate();
}


/// Tells what the load had to leave out, and whether sources can be generated without it.
generation_result
TGenerationRun::JudgeLoad(const TLoadReport& report)
{
	generation_result result = GENERATION_DONE;
	for (const load_problem& problem : report.Problems()) {
		std::string text = WithAdvice(problem);
		const bool isAllowed = problem.kind == LOAD_OWNER_REFUSED
			|| (problem.kind == LOAD_CLASS_UNKNOWN && fOptions.allowMissing);
		if (isAllowed) {
			Warn(problem.file.String(), text.c_str());
			continue;
		}

		if (problem.kind == LOAD_CLASS_UNKNOWN)
			text += ", or generate without it with --allow-missing";
		TellProblem(problem.file.String(), text.c_str());
		if (problem.kind == LOAD_FILE_UNREADABLE)
			result = GENERATION_FILE_BAD;
		else if (result == GENERATION_DONE)
			result = GENERATION_PROJECT_BAD;
	}
	return result;
}


generation_result
TGenerationRun::SetMainForm()
{
	if (fOptions.mainForm.Length() == 0)
		return GENERATION_DONE;

	TDesignForm* form = fProject->FindForm(fOptions.mainForm.String());
	if (form == nullptr) {
		BString text("the project has no form '");
		text << fOptions.mainForm << "'; give one of its forms to --main:";
		for (int32 i = 0; i < fProject->CountForms(); i++)
			text << " " << fProject->FormAt(i)->ComponentName();
		TellProblem(fOptions.project.String(), text.String());
		return GENERATION_USAGE_BAD;
	}
	fProject->SetMainForm(form);
	return GENERATION_DONE;
}


generation_result
TGenerationRun::Check(const TLoadReport& report)
{
	for (const load_problem& problem : report.Problems())
		TellProblem(problem.file.String(), WithAdvice(problem).c_str());
	TProjectCheck check(fProject->App(), fOptions.project.String(), fOptions.dialect);
	for (const project_problem& problem : check.Run())
		TellProblem(problem.file.c_str(), problem.text.c_str());

	if (fProblemCount == 0) {
		fprintf(fOut, "%s: no problems\n", fOptions.project.String());
		return GENERATION_DONE;
	}
	fprintf(fOut, "%s: %d %s\n", fOptions.project.String(), static_cast<int>(fProblemCount),
		fProblemCount == 1 ? "problem" : "problems");
	return GENERATION_PROJECT_BAD;
}


generation_result
TGenerationRun::Generate()
{
	TDialectGenerator generator(fOptions.dialect);
	generator.SetBuildFiles(fOptions.buildFiles);
	generator.Writer().SetDryRun(fOptions.dryRun);
	generator.SetAppComponent(fProject->App());
	const generation_result result = SetFolder(&generator);
	if (result != GENERATION_DONE)
		return result;

	generator.GenerateApp();
	return Tell(&generator);
}


/// Settles and makes the folder before the generator does, which could only tell of a failure in a box.
generation_result
TGenerationRun::SetFolder(TCodeGenerator* generator)
{
	const bool isGiven = fOptions.output.Length() > 0;
	const TProperty* property = generator->AppComponent()->FindProperty("GenerationPath");
	const char* folder = isGiven ? fOptions.output.String() : property->Value();
	if (folder[0] == '\0') {
		TellProblem(fOptions.project.String(),
			"the project names no folder to generate into; name one with --output");
		return GENERATION_PROJECT_BAD;
	}
	if (strlen(folder) > kMostPathBytes) {
		TellProblem(folder, "the folder's name is longer than 255 bytes; choose a shorter one");
		return isGiven ? GENERATION_USAGE_BAD : GENERATION_PROJECT_BAD;
	}

	generator->SetGenerationPath(folder);
	if (!generator->Writer().PrepareFolder(folder)) {
		TellProblem(folder,
			"the folder cannot be created; create the folder that it is to be in, make that "
			"writable,"
			" or choose another with --output");
		return GENERATION_FILE_BAD;
	}
	if (PathExists(folder) && !IsFolder(folder)) {
		TellProblem(folder, "this is no folder; choose another with --output");
		return GENERATION_FILE_BAD;
	}
	return GENERATION_DONE;
}


generation_result
TGenerationRun::Tell(TCodeGenerator* generator)
{
	for (const BString& remark : generator->Writer().Remarks())
		fprintf(fErr, "plimgen: warning: %s\n", remark.String());
	for (const generated_file& file : generator->Writer().Files())
		TellFile(file);
	return fProblemCount == 0 ? GENERATION_DONE : GENERATION_FILE_BAD;
}


void
TGenerationRun::TellFile(const generated_file& file)
{
	BString text;
	switch (file.outcome) {
		case GENERATED_CREATED:
		case GENERATED_CHANGED:
		{
			const bool isNew = file.outcome == GENERATED_CREATED;
			if (!fOptions.dryRun)
				fprintf(fOut, "%s %s\n", isNew ? "created" : "changed", file.path.String());
			else
				fprintf(fOut, "would %s %s\n", isNew ? "create" : "change", file.path.String());
			if (fOptions.diff)
				TellDifference(file);
			break;
		}

		case GENERATED_UNCHANGED:
			if (fOptions.verbose)
				fprintf(fOut, "unchanged %s\n", file.path.String());
			break;

		case GENERATED_KEPT:
			fprintf(fOut, "left alone %s\n", file.path.String());
			break;

		case GENERATED_UNREADABLE:
			text << "the file cannot be read (" << strerror(file.status)
				 << ") and was left alone; make it readable or move it away";
			TellProblem(file.path.String(), text.String());
			break;

		case GENERATED_UNWRITABLE:
			text << "the file cannot be written (" << strerror(file.status)
				 << ") and is as it was; make it and its folder writable, or free some space";
			TellProblem(file.path.String(), text.String());
			break;
	}
}


void
TGenerationRun::TellDifference(const generated_file& file)
{
	std::vector<char> present;
	const bool isNew = file.outcome == GENERATED_CREATED;
	if (!isNew)
		ReadContent(file.path.String(), present);
	const std::string diff = UnifiedDiff(isNew ? "/dev/null" : file.path.String(),
		file.path.String(), std::string_view(present.data(), present.size()), file.text.String());
	fwrite(diff.data(), 1, diff.length(), fOut);
}


void
TGenerationRun::TellProblem(const char* file, const char* text)
{
	fProblemCount++;
	fprintf(fErr, "plimgen: %s: %s\n", file, text);
}


void
TGenerationRun::Warn(const char* file, const char* text)
{
	fprintf(fErr, "plimgen: warning: %s: %s\n", file, text);
}
