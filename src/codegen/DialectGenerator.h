// SPDX-License-Identifier: MIT
// The generator for either dialect of the sources.

#pragma once

#include "codegen/CodeGenerator.h"
#include "codegen/Dialect.h"

/// Writes the sources in the dialect that it is told: it makes the emitters of that one.
class TDialectGenerator : public TCodeGenerator {
public:
	explicit TDialectGenerator(source_dialect dialect = DIALECT_CLASSIC);

	source_dialect Dialect() const { return fDialect; }
	void SetDialect(source_dialect dialect) { fDialect = dialect; }

	/// Whether generating the application writes the files that build it, too: those that are not there.
	void SetBuildFiles(bool buildFiles) { fBuildFiles = buildFiles; }

	TFormHeaderEmitter* FormHeaderEmitter(TDesignForm* form) override;
	TFormSourceEmitter* FormSourceEmitter(TDesignForm* form) override;
	TAppHeaderEmitter* AppHeaderEmitter(TAppComponent* app) override;
	TAppSourceEmitter* AppSourceEmitter(TAppComponent* app) override;
	TProjectEmitter* ProjectEmitter(TAppComponent* app) override;

	bool GenerateApp() override;

private:
	source_dialect fDialect;
	bool fBuildFiles;
};

/// The designer's generator: each time that it generates it takes the dialect that the user prefers.
class TPreferredGenerator : public TDialectGenerator {
public:
	bool GenerateApp() override;
};
