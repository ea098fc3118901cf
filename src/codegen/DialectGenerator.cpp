// SPDX-License-Identifier: MIT
// The generator for either dialect of the sources.

#include "codegen/DialectGenerator.h"

#include "codegen/StandardAppHeaderEmitter.h"
#include "codegen/StandardAppSourceEmitter.h"
#include "codegen/StandardFormHeaderEmitter.h"
#include "codegen/StandardFormSourceEmitter.h"


TDialectGenerator::TDialectGenerator(source_dialect dialect)
	: fDialect(dialect)
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


bool
TPreferredGenerator::GenerateApp()
{
	SetDialect(PreferredDialect());
	return TDialectGenerator::GenerateApp();
}
