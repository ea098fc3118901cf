// SPDX-License-Identifier: MIT
// Writes the sources of a designed application.

#include "codegen/CodeGenerator.h"

#include <memory>

#include "app/Dialogs.h"
#include "app/WindowGuard.h"
#include "codegen/AppHeaderEmitter.h"
#include "codegen/AppSourceEmitter.h"
#include "codegen/ConfirmGenerateWin.h"
#include "codegen/DialectGenerator.h"
#include "codegen/FormHeaderEmitter.h"
#include "codegen/FormParts.h"
#include "codegen/FormSourceEmitter.h"
#include "codegen/HandlerNames.h"
#include "codegen/ProjectEmitter.h"
#include "codegen/SourceFiles.h"
#include "codegen/SourceText.h"
#include "designer/DesignForm.h"
#include "model/AppComponent.h"
#include "model/FixedText.h"
#include "model/Property.h"

namespace {

void
SetSubject(TAppEmitter* emitter, TAppComponent* app)
{
	emitter->SetApp(app);
}


void
SetSubject(TFormEmitter* emitter, TDesignForm* form)
{
	emitter->SetForm(form);
}

} // namespace


TCodeGenerator::TCodeGenerator()
	: fAppComponent(nullptr),
	  fReserved(),
	  fGenerationPath()
{
}


TCodeGenerator::~TCodeGenerator() = default;


TFormHeaderEmitter*
TCodeGenerator::FormHeaderEmitter(TDesignForm* form)
{
	TFormHeaderEmitter* emitter = new TFormHeaderEmitter;
	emitter->SetForm(form);
	return emitter;
}


TFormSourceEmitter*
TCodeGenerator::FormSourceEmitter(TDesignForm* form)
{
	TFormSourceEmitter* emitter = new TFormSourceEmitter;
	emitter->SetForm(form);
	return emitter;
}


TAppHeaderEmitter*
TCodeGenerator::AppHeaderEmitter(TAppComponent* app)
{
	TAppHeaderEmitter* emitter = new TAppHeaderEmitter;
	emitter->SetApp(app);
	return emitter;
}


TAppSourceEmitter*
TCodeGenerator::AppSourceEmitter(TAppComponent* app)
{
	TAppSourceEmitter* emitter = new TAppSourceEmitter;
	emitter->SetApp(app);
	return emitter;
}


TProjectEmitter*
TCodeGenerator::ProjectEmitter(TAppComponent*)
{
	return new TProjectEmitter;
}


bool
TCodeGenerator::ConfirmSettings()
{
	ConfirmGenerateWin* dialog = new ConfirmGenerateWin(this, fAppComponent);
	if (!dialog->IsComplete()) {
		dialog->Quit();
		return true;
	}
	fDialog = BMessenger(dialog);
	dialog->Show();
	return true;
}


bool
TCodeGenerator::GenerateApp()
{
	if (fAppComponent == nullptr)
		return false;

	if (!fWriter.PrepareFolder(fGenerationPath)) {
		BString text;
		text << "Unable to create directory " << fGenerationPath << ".";
		MsgBox("Error", text.String(), "OK");
		return false;
	}

	// The steps are joined to a result that is false from the start; callers know not to ask for it.
	bool result = false;
	for (int32 i = 0; i < fAppComponent->CountComponents(); i++) {
		TDesignForm* form = FormAt(fAppComponent, i);
		if (form == nullptr)
			continue;
		// The form's window lives on while its form is read.
		WindowGuard guard(form);
		if (guard.IsLocked())
			result = GenerateForm(form) && result;
	}
	result = GenerateAppHeader() && result;
	result = GenerateAppSource() && result;
	return result;
}


bool
TCodeGenerator::GenerateAppHeader()
{
	const BString path = TargetPath(fAppComponent->ComponentName(), ".h");
	const std::unique_ptr<TAppHeaderEmitter> emitter(AppHeaderEmitter(fAppComponent));
	BString text;
	if (!StartTarget(emitter.get(), fAppComponent, path, text))
		return true;

	emitter->EmitHeaderComments(text);
	emitter->EmitHeaderStart(text);
	emitter->EmitHeaderIncludes(text);
	emitter->EmitAppClassStart(text);
	emitter->EmitAppClassBody(text);
	emitter->EmitAppClassEnd(text);
	emitter->EmitHeaderEnd(text);
	WriteAppText(path, text);
	RemarkSkippedSections(path, emitter->SkippedSections());
	return true;
}


bool
TCodeGenerator::GenerateAppSource()
{
	const BString path = TargetPath(fAppComponent->ComponentName(), ".cpp");
	const std::unique_ptr<TAppSourceEmitter> emitter(AppSourceEmitter(fAppComponent));
	BString text;
	if (!StartTarget(emitter.get(), fAppComponent, path, text))
		return true;

	emitter->EmitSourceComments(text);
	emitter->EmitSourceIncludes(text);
	emitter->EmitSourceGlobals(text);
	emitter->EmitAppConstructor(text);
	emitter->EmitAppDestructor(text);
	emitter->EmitMessageProc(text);
	emitter->EmitEventHandlers(text);
	emitter->EmitAppInit(text);
	emitter->EmitMain(text);
	WriteAppText(path, text);
	RemarkSkippedSections(path, emitter->SkippedSections());
	return true;
}


bool
TCodeGenerator::GenerateForm(TDesignForm* form)
{
	return GenerateFormHeader(form) && GenerateFormSource(form);
}


bool
TCodeGenerator::GenerateFormHeader(TDesignForm* form)
{
	char buffer[kGeneratedNameSize];
	const BString path = TargetPath(BaseFormFilename(form, buffer), ".h");
	const std::unique_ptr<TFormHeaderEmitter> emitter(FormHeaderEmitter(form));
	BString text;
	if (!StartTarget(emitter.get(), form, path, text))
		return true;

	emitter->EmitHeaderComments(text);
	emitter->EmitHeaderStart(text);
	emitter->EmitViewClassStart(text);
	emitter->EmitViewClassBody(text);
	emitter->EmitViewClassEnd(text);
	emitter->EmitWindowClassStart(text);
	emitter->EmitWindowClassBody(text);
	emitter->EmitWindowClassEnd(text);
	emitter->EmitHeaderEnd(text);
	WriteFormText(form, path, text);
	RemarkSkippedSections(path, emitter->SkippedSections());
	return true;
}


bool
TCodeGenerator::GenerateFormSource(TDesignForm* form)
{
	char buffer[kGeneratedNameSize];
	const char* baseName = BaseFormFilename(form, buffer);
	const BString path = TargetPath(baseName, ".cpp");
	const BString initPath = TargetPath(baseName, ".fcp");
	const std::unique_ptr<TFormSourceEmitter> emitter(FormSourceEmitter(form));
	BString text;
	if (!StartTarget(emitter.get(), form, path, text))
		return true;

	emitter->EmitSourceComments(text);
	emitter->EmitSourceIncludes(text);

	BString initText;
	emitter->EmitMachineBlockStart(initText);
	emitter->EmitFormConstructor(initText);
	emitter->EmitFormDestructor(initText);
	emitter->EmitFormInit(initText);
	emitter->EmitMachineBlockEnd(initText);
	WriteFormText(form, initPath, initText);

	emitter->EmitMessageProc(text);
	emitter->EmitFormCreate(text);
	emitter->EmitFormDestroy(text);
	emitter->EmitFormEventHandlers(text);
	emitter->EmitComponentEventHandlers(text);
	WriteFormText(form, path, text);
	RemarkSkippedSections(path, emitter->SkippedSections());
	return true;
}


void
TCodeGenerator::SetAppComponent(TAppComponent* app)
{
	fAppComponent = app;
	if (app == nullptr)
		return;

	const TProperty* path = app->FindProperty("GenerationPath");
	if (path != nullptr)
		SetGenerationPath(path->Value());
}


void
TCodeGenerator::SetGenerationPath(const char* path)
{
	SetFixedText(fGenerationPath, path);
}


BString
TCodeGenerator::TargetPath(const char* baseName, const char* ending) const
{
	BString path(fGenerationPath);
	path << "/" << baseName << ending;
	return path;
}


/// Has \a emitter edit the file at \a path, whose old content comes into \a text. False when nothing is to be written:
/// without an emitter, or when the file cannot be read.
template <typename Emitter, typename Subject>
bool
TCodeGenerator::StartTarget(Emitter* emitter, Subject* subject, const BString& path, BString& text)
{
	if (emitter == nullptr)
		return false;

	SetSubject(emitter, subject);
	bool exists;
	if (!ReadTarget(path.String(), &exists, text))
		return false;

	emitter->SetFileExists(exists);
	emitter->SetFileText(text);
	return true;
}


/// Reads the file that is to be edited. False when it is there but cannot be read: what it holds is the user's,
/// and not to be replaced by a new file.
bool
TCodeGenerator::ReadTarget(const char* path, bool* exists, BString& text)
{
	*exists = FileExists(path);
	if (!*exists)
		return true;

	int32 cutLine;
	const status_t status = ReadFileInto(text, path, &cutLine);
	if (status != B_OK) {
		fWriter.AddUnreadable(path, status);
		return false;
	}
	if (cutLine == 0)
		return true;

	// The lines that can be read are all that stays in the file, so its old self goes beside it.
	BString sentence;
	sentence << "line " << cutLine
			 << " is longer than 1023 bytes or holds a zero byte, and is cut there; "
			 << "the whole old file is kept with ~ behind its name";
	fWriter.AddRemark(path, sentence);
	return fWriter.KeepCopy(path);
}


void
TCodeGenerator::WriteFormText(TDesignForm* form, const BString& path, BString& text)
{
	char buffer[kGeneratedNameSize];
	ReplacePlaceholders(text,
		{{"$FORMNAME", form->ComponentName()}, {"$FORMFILE", BaseFormFilename(form, buffer)},
			{"$TAB", "  "}});
	fWriter.WriteText(path.String(), text);
}


void
TCodeGenerator::WriteAppText(const BString& path, BString& text)
{
	ReplacePlaceholders(text,
		{{"$APPNAME", fAppComponent->ComponentName()},
			{"$APPSIG", PropertyText(fAppComponent, "Signature")}, {"$TAB", "  "}});
	fWriter.WriteText(path.String(), text);
}


void
TCodeGenerator::RemarkSkippedSections(const BString& path, const BStringList& sections)
{
	for (int32 i = 0; i < sections.CountStrings(); i++) {
		BString sentence;
		sentence
			<< "the section " << sections.StringAt(i)
			<< " was left as it is, for want of a marker; put both markers back to have it updated";
		fWriter.AddRemark(path.String(), sentence);
	}
}


TCodeGenerator*
Generator()
{
	static TPreferredGenerator sGenerator;
	return &sGenerator;
}
