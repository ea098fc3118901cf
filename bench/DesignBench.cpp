// SPDX-License-Identifier: MIT
// Working on a large form: placing one more component, selecting, and drawing all of them anew.

#include <cstdlib>
#include <iostream>

#include <benchmark/benchmark.h>

#include <Application.h>
#include <OS.h>

#include "ButtonForm.h"
#include "app/Preferences.h"
#include "app/WindowGuard.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "model/Diagnostics.h"
#include "palette/PaletteCatalog.h"

namespace {

/// A form that is shown and has that many buttons, locked while it lives.
class LockedForm {
public:
	explicit LockedForm(int32 count)
		: fForm(new TDesignForm("Form1", FORM_SHOWN)),
		  fGuard(fForm)
	{
		PlaceButtons(fForm, count);
		fForm->ResizeTo(790, 700);
		fForm->UpdateIfNeeded();
	}

	~LockedForm() { fForm->Quit(); }

	TDesignForm* operator->() const { return fForm; }

private:
	TDesignForm* fForm;
	WindowGuard fGuard;
};


/// From the end of the rubber band to the named component in the form's list, without drawing.
void
PlaceOne(benchmark::State& state)
{
	LockedForm form(static_cast<int32>(state.range(0)));
	TPaletteEntry* entry = PaletteCatalog().FindPalEntry("TButton");
	for (auto _ : state) {
		PaletteCatalog().SetDropEntry(entry);
		TComponent* component = form->CreateComponent(form->View(), BRect(5, 5, 60, 30));
		form->DoneDroppingComponent();
		state.PauseTiming();
		BView* view = component->DTView();
		view->RemoveSelf();
		form->RemoveComponent(component);
		delete component;
		delete view;
		state.ResumeTiming();
	}
}


/// A click on a component when another is selected, up to the drawn window.
void
SelectOne(benchmark::State& state)
{
	LockedForm form(static_cast<int32>(state.range(0)));
	int32 next = 0;
	for (auto _ : state) {
		TComponent* component = form->ComponentAt(next++ % 2);
		component->DesignerSelect(true);
		form->ComponentSelected(component);
		form->UpdateIfNeeded();
	}
}


/// All components selected and drawn, then none selected and drawn.
void
SelectAllAndNone(benchmark::State& state)
{
	LockedForm form(static_cast<int32>(state.range(0)));
	for (auto _ : state) {
		for (const bool selected : {true, false}) {
			for (int32 i = 0; i < form->CountComponents(); i++)
				form->ComponentAt(i)->DesignerSelect(selected);
			form->View()->RepaintChildren();
			form->UpdateIfNeeded();
		}
	}
	state.SetItemsProcessed(state.iterations() * 2 * state.range(0));
}

BENCHMARK(PlaceOne)
	->RangeMultiplier(10)
	->Range(10, 1000)
	->Unit(benchmark::kMicrosecond)
	->UseRealTime();
BENCHMARK(SelectOne)
	->RangeMultiplier(10)
	->Range(10, 1000)
	->Unit(benchmark::kMillisecond)
	->UseRealTime();
BENCHMARK(SelectAllAndNone)
	->RangeMultiplier(10)
	->Range(10, 1000)
	->Unit(benchmark::kMillisecond)
	->UseRealTime();

} // namespace

int
main(int argc, char** argv)
{
	setenv("QT_QPA_PLATFORM", "offscreen", 0);
	AppSettings.LeaveFileAlone();
	BApplication app("application/x-vnd.Plimworks-Bench");
	benchmark::Initialize(&argc, argv);
	// The program's diagnostics go nowhere; the report goes to standard error instead.
	SilenceOutput();
	ShowDiagnostics(false);
	if (!LoadStandardComponents())
		return 3;
	benchmark::ConsoleReporter reporter(benchmark::ConsoleReporter::OO_Tabular);
	reporter.SetOutputStream(&std::cerr);
	reporter.SetErrorStream(&std::cerr);
	benchmark::RunSpecifiedBenchmarks(&reporter);
	return 0;
}
