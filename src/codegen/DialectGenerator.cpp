// SPDX-License-Identifier: MIT
// The generator for either dialect of the sources.

#include "codegen/DialectGenerator.h"

#include <memory>

#include "codegen/BuildFilesEmitter.h"
#include "codegen/StandardAppHeaderEmitter.h"
#include "codegen/StandardAppSourceEmitter.h"
#include "codegen/StandardFormHeaderEmitter.h"
#include "codegen/StandardFormSourceEmitter.h"


TDialectGenerator::TDialectGenerator(source_dialect dialect)
	: fDialect(dialect),
	  fBuildFiles(false)
{
}


TFormHeaderEmitter*
TDialectGenerator::FormHeaderEmitter(TDesignForm* form)
{
	if (fDialect == DIALECT_CLASSIC)
		return TCodeGenerator::FormHeaderEmitter(form);

	TFormHeaderEmitter* emitter = new TStandardFormHeaderEmitter;
	emitter->SetForm(form);
	return emitter;
}


TFormSourceEmitter*
TDialectGenerator::FormSourceEmitter(TDesignForm* form)
{
	if (fDialect == DIALECT_CLASSIC)
		return TCodeGenerator::FormSourceEmitter(form);

	TFormSourceEmitter* emitter = new TStandardFormSourceEmitter;
	emitter->SetForm(form);
	return emitter;
}


TAppHeaderEmitter*
TDialectGenerator::AppHeaderEmitter(TAppComponent* app)
{
	if (fDialect == DIALECT_CLASSIC)
		return TCodeGenerator::AppHeaderEmitter(app);

	TAppHeaderEmitter* emitter = new TStandardAppHeaderEmitter;
	emitter->SetApp(app);
	return emitter;
}


TAppSourceEmitter*
TDialectGenerator::AppSourceEmitter(TAppComponent* app)
{
	if (fDialect == DIALECT_CLASSIC)
		return TCodeGenerator::AppSourceEmitter(app);

	TAppSourceEmitter* emitter = new TStandardAppSourceEmitter;
	emitter->SetApp(app);
	return emitter;
}


TProjectEmitter*
TDialectGenerator::ProjectEmitter(TAppComponent* app)
{
	if (!fBuildFiles)
		return TCodeGenerator::ProjectEmitter(app);
	return new TBuildFilesEmitter(app, GenerationPath(), fDialect, &Writer());
}


bool
TDialectGenerator::GenerateApp()
{
	const bool result = TCodeGenerator::GenerateApp();
	if (AppComponent() == nullptr)
		return result;

	const std::unique_ptr<TProjectEmitter> emitter(ProjectEmitter(AppComponent()));
	if (emitter != nullptr)
		emitter->EmitProject();
	return result;
}


bool
TPreferredGenerator::GenerateApp()
{
	SetDialect(PreferredDialect());
	return TDialectGenerator::GenerateApp();
}
