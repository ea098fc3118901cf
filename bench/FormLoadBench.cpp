// SPDX-License-Identifier: MIT
// Loading a form into the model: CPU time for a number of buttons.

#include <cstdlib>
#include <filesystem>
#include <iostream>
#include <string>

#include <benchmark/benchmark.h>

#include <Application.h>

#include "ButtonForm.h"
#include "app/Preferences.h"
#include "designer/DesignForm.h"
#include "model/Diagnostics.h"

namespace {

/// The document of a form with that many buttons, written on the first call.
std::string
FormFile(int32 count)
{
	const std::filesystem::path path = std::filesystem::temp_directory_path()
		/ ("plimworks-bench-" + std::to_string(count) + ".frm");
	TDesignForm* form = new TDesignForm("Form1", FORM_HIDDEN);
	PlaceButtons(form, count);
	form->SaveToFile(path.c_str());
	form->Quit();
	return path.string();
}


void
Load(benchmark::State& state)
{
	const std::string path = FormFile(state.range(0));
	for (auto _ : state) {
		TDesignForm* form = new TDesignForm("Form1", FORM_HIDDEN);
		if (!form->LoadFromFile(path.c_str()))
			state.SkipWithError("the form cannot be loaded");
		state.PauseTiming();
		form->Quit();
		state.ResumeTiming();
	}
	state.SetItemsProcessed(state.iterations() * state.range(0));
	std::filesystem::remove(path);
}

/// As plimgen loads: nobody sees the diagnostics, so they are not put together.
void
LoadForm(benchmark::State& state)
{
	ShowDiagnostics(false);
	Load(state);
}


/// With the diagnostics of the designer, some fifty lines for each button, into /dev/null.
void
LoadFormTalking(benchmark::State& state)
{
	ShowDiagnostics(true);
	Load(state);
}

BENCHMARK(LoadForm)->RangeMultiplier(10)->Range(10, 10000)->Unit(benchmark::kMillisecond);
BENCHMARK(LoadFormTalking)->Arg(1000)->Unit(benchmark::kMillisecond);

} // namespace

int
main(int argc, char** argv)
{
	setenv("BE_DISPLAY", "none", 1);
	AppSettings.LeaveFileAlone();
	BApplication app("application/x-vnd.Plimworks-Bench");
	benchmark::Initialize(&argc, argv);
	// The program's diagnostics go nowhere; the report goes to standard error instead.
	SilenceOutput();
	if (!LoadStandardComponents())
		return 3;
	benchmark::ConsoleReporter reporter(benchmark::ConsoleReporter::OO_Tabular);
	reporter.SetOutputStream(&std::cerr);
	reporter.SetErrorStream(&std::cerr);
	benchmark::RunSpecifiedBenchmarks(&reporter);
	return 0;
}
