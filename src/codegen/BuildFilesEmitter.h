// SPDX-License-Identifier: MIT
// Writes the files that build a generated program.

#pragma once

#include <String.h>

#include "codegen/Dialect.h"
#include "codegen/ProjectEmitter.h"

class TAppComponent;
class TSourceWriter;
struct build_plan;

/// Writes a CMakeLists.txt, and for Haiku a makefile and a definition of resources, into the folder of the sources:
/// each once. A file of that name that is there already is its user's and stays as it is.
class TBuildFilesEmitter : public TProjectEmitter {
public:
	/// \a app, \a writer: not owned. \a folder: that of the sources.
	TBuildFilesEmitter(
		TAppComponent* app, const char* folder, source_dialect dialect, TSourceWriter* writer);

	/// Locks the forms one by one.
	void EmitProject() override;

private:
	build_plan Plan();
	void EmitMakefile(const build_plan& plan);
	BString PathOf(const char* name) const;

	TAppComponent* fApp;
	BString fFolder;
	source_dialect fDialect;
	TSourceWriter* fWriter;
};
