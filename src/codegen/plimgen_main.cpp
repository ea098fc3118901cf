// SPDX-License-Identifier: MIT
// plimgen: generates the sources of a project without a display.

#include <errno.h>
#include <stdio.h>
#include <stdlib.h>
#include <string.h>
#include <unistd.h>

#include <string>
#include <vector>

#include <CLI/CLI.hpp>

#include <Application.h>

#include "app/Preferences.h"
#include "codegen/GenerationRun.h"
#include "model/Diagnostics.h"

namespace {

/// The command line as it was given.
struct command_line {
	std::string project;
	std::string output;
	std::vector<std::string> componentFolders;
	std::string mainForm;
	generation_options options;
};


void
DescribeOptions(CLI::App& parser, command_line* line)
{
	generation_options& options = line->options;
	parser.add_option("PROJECT", line->project, "the project file (.plim)")->required();
	const auto notEmpty = [](const std::string& text) {
		return text.empty() ? std::string("a name is missing") : std::string();
	};
	parser.add_option("-o,--output", line->output, "generate into this folder")
		->type_name("DIR")
		->check(notEmpty);
	parser
		.add_option("--components", line->componentFolders,
			"load component libraries from this folder; may be given again"
			" (default: Components beside the program)")
		->type_name("DIR")
		->allow_extra_args(false)
		->check(notEmpty);
	parser.add_option("--main", line->mainForm, "make this form the main form")
		->type_name("FORM")
		->check(notEmpty);
	parser
		.add_option_function<std::string>(
			"--dialect",
			[&options](const std::string& name) { FindDialect(name.c_str(), &options.dialect); },
			"write classic sources, which need GCC and -fpermissive, or standard C++"
			" (default: classic)")
		->type_name("classic|standard")
		->check([](const std::string& name) {
			source_dialect dialect;
			return FindDialect(name.c_str(), &dialect)
				? std::string()
				: "there is no dialect '" + name + "'; give classic or standard";
		});
	parser.add_flag("--build-files", options.buildFiles,
		"write a CMakeLists.txt, a makefile and resources for Haiku, too, where there are none");
	parser.add_flag("--check", options.check, "report the project's problems, write nothing");
	parser.add_flag(
		"--allow-missing", options.allowMissing, "generate although components lack their library");
	CLI::Option* dryRun = parser.add_flag(
		"--dry-run", options.dryRun, "list the files that would be written, write nothing");
	parser.add_flag("--diff", options.diff, "with --dry-run: show how files would change")
		->needs(dryRun);
	parser.add_flag("-v,--verbose", options.verbose,
		"list unchanged files, too, and show the program's diagnostics");
	parser.set_version_flag("--version", "plimgen " PLIM_VERSION);
	parser.footer("Exit codes: 0 done, 1 the project has problems, 2 wrong usage,\n"
				  "3 a file could not be read or written.");
}


void
CompleteOptions(command_line* line)
{
	line->options.project = line->project.c_str();
	line->options.output = line->output.c_str();
	line->options.mainForm = line->mainForm.c_str();
	for (const std::string& folder : line->componentFolders)
		line->options.componentFolders.emplace_back(folder.c_str());
}


/// Makes standard output plimgen's own: what the rest of the program prints there goes nowhere.
FILE*
TakeStandardOutput()
{
	const int own = dup(STDOUT_FILENO);
	FILE* out = own >= 0 ? fdopen(own, "w") : nullptr;
	if (out == nullptr || freopen("/dev/null", "w", stdout) == nullptr)
		return nullptr;
	ShowDiagnostics(false);
	return out;
}


/// Ends the program without taking the project apart, which would take as long as loading it.
[[noreturn]] void
Leave(generation_result result)
{
	fflush(nullptr);
	_exit(result);
}


[[noreturn]] void
Generate(const generation_options& options)
{
	FILE* out = options.verbose ? stdout : TakeStandardOutput();
	if (out == nullptr) {
		fprintf(stderr, "plimgen: standard output: it cannot be used (%s); redirect it\n",
			strerror(errno));
		Leave(GENERATION_FILE_BAD);
	}

	// Windows have no pictures here, whatever display there is, and the designer's settings are not ours.
	setenv("BE_DISPLAY", "none", 1);
	AppSettings.LeaveFileAlone();
	BApplication application("application/x-qtx.Plimgen");
	TGenerationRun run(options, out, stderr);
	generation_result result = run.Run();
	if (fflush(out) != 0 || ferror(out) != 0) {
		fprintf(stderr, "plimgen: standard output: it cannot be written (%s); free some space\n",
			strerror(errno));
		result = GENERATION_FILE_BAD;
	}
	Leave(result);
}

} // namespace


// Without memory, or with options that contradict each other in the source, it ends where that happens.
int
main(int argc, char** argv) // NOLINT(bugprone-exception-escape): as said above
{
	command_line line;
	CLI::App parser("Generates the C++ sources of a project.", "plimgen");
	DescribeOptions(parser, &line);
	try {
		parser.parse(argc, argv);
	} catch (const CLI::Success& information) {
		return parser.exit(information);
	} catch (const CLI::ParseError& error) {
		fprintf(stderr, "plimgen: %s; see plimgen --help\n", error.what());
		return GENERATION_USAGE_BAD;
	}
	CompleteOptions(&line);
	Generate(line.options);
}
