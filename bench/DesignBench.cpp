// SPDX-License-Identifier: MIT
// Working on a large form: placing one more component, selecting, drawing all of them anew, and the outlines of drags.

#include <cstdlib>
#include <functional>
#include <iostream>
#include <vector>

#include <benchmark/benchmark.h>

#include <Application.h>
#include <Handler.h>
#include <Messenger.h>
#include <OS.h>

#include "ButtonForm.h"
#include "app/Preferences.h"
#include "app/WindowGuard.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "display/Display.h"
#include "display/PixelBuffer.h"
#include "model/Diagnostics.h"
#include "palette/PaletteCatalog.h"

namespace {

/// So large that 1,000 buttons are to be seen.
constexpr float kWidth = 2215;
constexpr float kHeight = 1319;

/// Runs tasks in the thread of the window that it is added to.
class Worker : public BHandler {
public:
	void MessageReceived(BMessage* message) override
	{
		void* task;
		if (message->FindPointer("task", &task) == B_OK)
			(*static_cast<const std::function<void()>*>(task))();
		else
			BHandler::MessageReceived(message);
	}
};


/// A form that is shown at the screen's corner and has that many buttons.
class ShownForm {
public:
	explicit ShownForm(int32 count)
		: fForm(new TDesignForm("Form1", FORM_SHOWN))
	{
		{
			WindowGuard guard(fForm);
			fForm->AddHandler(&fWorker);
			PlaceButtons(fForm, count);
			fForm->ResizeTo(kWidth, kHeight);
			fForm->MoveTo(0, 0);
			fForm->Activate();
		}
		// What shows the window, and what that causes in turn.
		for (int round = 0; round < 3; round++)
			Run([] {});
	}

	~ShownForm()
	{
		fForm->Lock();
		fForm->RemoveHandler(&fWorker);
		fForm->Quit();
	}

	/// Runs \a task in the window's thread and waits until what it changed is drawn. Input that came before, and be it a
	/// whole drag, has been handled then.
	void Run(const std::function<void()>& task)
	{
		const std::function<void()> all = [&] {
			task();
			fForm->UpdateIfNeeded();
		};
		BMessage message('task');
		message.AddPointer("task", &all);
		BMessage reply;
		BMessenger(&fWorker).SendMessage(&message, &reply);
	}

	TDesignForm* operator->() const { return fForm; }

	static void Point(BPoint where, uint32 buttons)
	{
		BPrivate::Display::Get().InjectPointer(where, buttons);
	}

private:
	TDesignForm* fForm;
	Worker fWorker;
};


/// From the end of the rubber band to the named component in the form's list, without drawing.
void
PlaceOne(benchmark::State& state)
{
	ShownForm form(static_cast<int32>(state.range(0)));
	WindowGuard guard(form.operator->());
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


/// What the screen shows around \a where.
std::vector<uint32>
ScreenAround(BPoint where)
{
	BPrivate::Picture picture;
	BPrivate::Display::Get().ReadScreen(
		BRect(where - BPoint(90, 40), where + BPoint(90, 40)), &picture);
	return picture.pixels;
}


/// From a pointer's motion until the outline is drawn at its new place.
///
/// What the press at \a start takes hold of follows the pointer; with \a places it begins a rubber band.
void
MotionToOutline(benchmark::State& state, BPoint start, bool places)
{
	ShownForm form(static_cast<int32>(state.range(0)));
	form.Run([] {});
	const BPoint far(500, 400);
	const std::vector<uint32> before = ScreenAround(far);
	if (places)
		PaletteCatalog().SetDropEntry(PaletteCatalog().FindPalEntry("TButton"));
	ShownForm::Point(start, 1);
	// The window's thread begins the drag, and may then sit in a loop.
	bool follows = false;
	for (int32 i = 0; i < 100 && !follows; i++) {
		snooze(20000);
		ShownForm::Point(far + BPoint(i % 2, 0), 1);
		follows = !before.empty() && ScreenAround(far) != before;
	}
	if (!follows)
		state.SkipWithError("no outline follows the pointer");

	int32 step = 0;
	for (auto _ : state) {
		step++;
		const BPoint where = start + BPoint(20 + step * 37 % 600, 20 + step * 23 % 500);
		ShownForm::Point(where, 1);
		// The display's thread draws the outline before it takes the next input.
		ShownForm::Point(where, 1);
	}
	PaletteCatalog().SetDropEntry(nullptr);
	ShownForm::Point(start, 0);
	form.Run([] {});
}


/// A rubber band, from the press to the drawn component that it places, below the others.
void
PlaceByMouse(benchmark::State& state)
{
	ShownForm form(static_cast<int32>(state.range(0)));
	TPaletteEntry* entry = PaletteCatalog().FindPalEntry("TButton");
	const int32 before = form->CountComponents();
	BPoint place(2, kHeight - 22);
	for (auto _ : state) {
		PaletteCatalog().SetDropEntry(entry);
		ShownForm::Point(place, 1);
		ShownForm::Point(place + BPoint(20, 15), 1);
		ShownForm::Point(place + BPoint(20, 15), 0);
		form.Run([] {});
		place.x += 24;
	}
	int32 after = 0;
	form.Run([&] { after = form->CountComponents(); });
	if (after != before + static_cast<int32>(state.iterations()))
		state.SkipWithError("not every rubber band placed a component");
}


/// A click on a component when another is selected, up to the drawn window.
void
SelectOne(benchmark::State& state)
{
	ShownForm form(static_cast<int32>(state.range(0)));
	int32 next = 0;
	for (auto _ : state) {
		form.Run([&] {
			TComponent* component = form->ComponentAt(next++ % 2);
			component->DesignerSelect(true);
			form->ComponentSelected(component);
		});
	}
}


/// All components selected and drawn, or none selected and drawn, by turns.
void
SelectAllOrNone(benchmark::State& state)
{
	ShownForm form(static_cast<int32>(state.range(0)));
	const BPoint corner(8, 8);
	const std::vector<uint32> before = ScreenAround(corner);
	bool selected = false;
	const std::function<void()> selectOrNot = [&] {
		selected = !selected;
		if (!selected) {
			form->View()->DeselectComponents(nullptr);
			return;
		}
		for (int32 i = 0; i < form->CountComponents(); i++) {
			form->ComponentAt(i)->DesignerSelect(true);
			form->ComponentAt(i)->DTView()->Invalidate();
		}
	};
	form.Run(selectOrNot);
	if (before.empty() || ScreenAround(corner) == before)
		state.SkipWithError("what is selected is not marked");
	for (auto _ : state)
		form.Run(selectOrNot);
	state.SetItemsProcessed(state.iterations() * state.range(0));
}

BENCHMARK(PlaceOne)
	->RangeMultiplier(10)
	->Range(10, 1000)
	->Unit(benchmark::kMicrosecond)
	->UseRealTime();
BENCHMARK(PlaceByMouse)
	->Arg(10)
	->Arg(1000)
	->Iterations(30)
	->Unit(benchmark::kMillisecond)
	->MeasureProcessCPUTime()
	->UseRealTime();
BENCHMARK_CAPTURE(MotionToOutline, rubber_band, BPoint(2, 2), true)
	->Arg(10)
	->Arg(1000)
	->Unit(benchmark::kMillisecond)
	->MeasureProcessCPUTime()
	->UseRealTime();
BENCHMARK_CAPTURE(MotionToOutline, drag, BPoint(40, 20), false)
	->Arg(10)
	->Arg(1000)
	->Unit(benchmark::kMillisecond)
	->MeasureProcessCPUTime()
	->UseRealTime();
BENCHMARK_CAPTURE(MotionToOutline, resize, BPoint(86, 30), false)
	->Arg(10)
	->Arg(1000)
	->Unit(benchmark::kMillisecond)
	->MeasureProcessCPUTime()
	->UseRealTime();
BENCHMARK(SelectOne)
	->RangeMultiplier(10)
	->Range(10, 1000)
	->Unit(benchmark::kMillisecond)
	->MeasureProcessCPUTime()
	->UseRealTime();
BENCHMARK(SelectAllOrNone)
	->RangeMultiplier(10)
	->Range(10, 1000)
	->Unit(benchmark::kMillisecond)
	->MeasureProcessCPUTime()
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
