// SPDX-License-Identifier: MIT
// One run of the generator from a command line.

#pragma once

#include <stdio.h>

#include <memory>
#include <vector>

#include <String.h>

#include "codegen/Dialect.h"

class TCodeGenerator;
class TLoadReport;
class TProject;
struct generated_file;
struct project_problem;

/// What a run is to do.
struct generation_options {
	BString project;                          // the project's file
	BString output;                           // empty: the project's own folder
	std::vector<BString> componentFolders;    // empty: the folder beside the program
	BString mainForm;                         // empty: the project's own choice
	source_dialect dialect = DIALECT_CLASSIC; // of the sources
	bool buildFiles = false;                  // with the files that build the program
	bool check = false;                       // only report problems
	bool allowMissing = false;                // go on without components that have no library
	bool dryRun = false;                      // only list what would be written
	bool diff = false;                        // with the differences
	bool verbose = false;                     // list files that stay as they are, too
};

/// What a run ends with, as the program's exit code.
enum generation_result {
	GENERATION_DONE = 0,
	GENERATION_PROJECT_BAD = 1, // the project has problems; nothing was written
	GENERATION_USAGE_BAD = 2,   // an option does not fit the project
	GENERATION_FILE_BAD = 3     // a file could not be read or written
};

/// Loads a project and generates its sources, telling what happens line by line.
///
/// Needs an application object. Used once, from one thread.
class TGenerationRun {
public:
	/// \a out gets the result, \a err what is wrong; both stay the caller's.
	TGenerationRun(const generation_options& options, FILE* out, FILE* err);
	/// Closes the project, which takes about as long as loading it.
	~TGenerationRun();
	TGenerationRun(const TGenerationRun&) = delete;
	TGenerationRun& operator=(const TGenerationRun&) = delete;

	generation_result Run();

private:
	generation_result LoadLibraries();
	generation_result LoadProject();
	generation_result JudgeLoad(const TLoadReport& report);
	generation_result SetMainForm();
	generation_result Check(const TLoadReport& report);
	generation_result Generate();
	generation_result SetFolder(TCodeGenerator* generator);
	generation_result Tell(TCodeGenerator* generator);
	void TellFile(const generated_file& file);
	void TellDifference(const generated_file& file);
	void TellProblem(const char* file, const char* text);
	void Warn(const char* file, const char* text);

	const generation_options& fOptions;
	FILE* fOut;
	FILE* fErr;
	std::unique_ptr<TProject> fProject;
	int32 fProblemCount;
};
