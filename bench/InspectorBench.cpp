// SPDX-License-Identifier: MIT
// What the property window costs: showing another component, and keeping up with a drag.

#include <atomic>
#include <cstdlib>
#include <ctime>
#include <iostream>
#include <memory>
#include <string>

#include <benchmark/benchmark.h>

#include <Application.h>
#include <MessageQueue.h>
#include <OS.h>
#include <View.h>

#include "ButtonForm.h"
#include "app/Preferences.h"
#include "app/WindowGuard.h"
#include "model/ControlComponent.h"
#include "model/Property.h"
#include "props/PropertyEditor.h"
#include "props/PropertyWin.h"
#include "props/StringProperty.h"

namespace {

constexpr int32 kProperties = 40;
constexpr int kMoves = 1000;
constexpr bigtime_t kMoveTime = 500; // microseconds between two moves of the pointer

std::atomic<int> sReads = 0;


/// Counts how often the inspector reads its property.
class CountedProperty : public TStringProperty {
public:
	using TStringProperty::TStringProperty;

	const char* GetDisplayValue() const override
	{
		sReads++;
		return TStringProperty::GetDisplayValue();
	}
};


/// A control with properties of its own up to the number wanted.
class BenchControl : public TControlComponent {
public:
	BenchControl(BView* surface, const char* name)
		: TControlComponent(nullptr, nullptr)
	{
		SetComponentName(name);
		BView* view = new BView(BRect(10, 10, 109, 59), name, B_FOLLOW_NONE, B_WILL_DRAW);
		surface->AddChild(view);
		SetDTView(view);
		InitPropertyList();
		InitEventList();
		InitPropertyValues();
		SetPropertyValue("Name", name);
		AddOwnProperty<CountedProperty>("Counted");
		for (int32 i = CountProperties(); i < kProperties; i++)
			AddOwnProperty<TStringProperty>(("Property" + std::to_string(i)).c_str());
	}

private:
	template <typename Editor>
	void AddOwnProperty(const char* name)
	{
		TProperty* property = new TProperty(this, name, "A value of some length", nullptr, true);
		property->SetEditor(new Editor(this, property));
		AddProperty(property);
	}
};


/// A form's window and the inspector, both shown.
class Desk {
public:
	Desk()
		: fForm(new BWindow(BRect(500, 100, 799, 299), "Form", B_TITLED_WINDOW, 0)),
		  fSurface(new BView(fForm->Bounds(), "surface", B_FOLLOW_ALL_SIDES, B_WILL_DRAW)),
		  fInspector(new PropertyWin)
	{
		fForm->AddChild(fSurface);
		first = std::make_unique<BenchControl>(fSurface, "First");
		second = std::make_unique<BenchControl>(fSurface, "Second");
		fForm->Show();
		fInspector->Show();
		ShowComponent(first.get());
		Settle();
	}

	~Desk()
	{
		ShowComponent(nullptr);
		for (BWindow* window : {static_cast<BWindow*>(fInspector), fForm}) {
			if (window->Lock())
				window->Quit();
		}
	}

	void ShowComponent(TComponent* component)
	{
		WindowGuard guard(fInspector);
		fInspector->SetDesignView(fSurface);
		fInspector->SetComponent(component);
	}

	void Move(int step)
	{
		{
			WindowGuard guard(fForm);
			first->FindProperty("Left")->Editor()->SetValue(std::to_string(step).c_str(), false);
			first->FindProperty("Top")->Editor()->SetValue(std::to_string(step).c_str(), false);
		}
		fInspector->UpdateDisplayValues();
	}

	/// Waits until the inspector has handled its messages and drawn.
	void Settle()
	{
		for (;;) {
			{
				WindowGuard guard(fInspector);
				if (fInspector->MessageQueue()->IsEmpty() && !fInspector->NeedsUpdate())
					return;
			}
			snooze(200);
		}
	}

	std::unique_ptr<BenchControl> first;
	std::unique_ptr<BenchControl> second;

private:
	BWindow* fForm;
	BView* fSurface;
	PropertyWin* fInspector;
};


/// Seconds of processor time of the whole program.
double
ProcessorTime()
{
	timespec time;
	clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &time);
	return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_nsec) / 1e9;
}


void
SelectComponent(benchmark::State& state)
{
	Desk desk;
	bool isFirst = true;
	for (auto _ : state) {
		const double start = ProcessorTime();
		isFirst = !isFirst;
		desk.ShowComponent(isFirst ? desk.first.get() : desk.second.get());
		desk.Settle();
		state.SetIterationTime(ProcessorTime() - start);
	}
}

BENCHMARK(SelectComponent)->UseManualTime()->Unit(benchmark::kMillisecond);


/// A drag of 1,000 moves; what moving itself costs is a part of it.
void
Drag(benchmark::State& state)
{
	Desk desk;
	int refreshes = 0;
	for (auto _ : state) {
		const int before = sReads;
		const double start = ProcessorTime();
		const bigtime_t startTime = system_time();
		for (int i = 0; i < kMoves; i++) {
			desk.Move(i);
			snooze(kMoveTime);
		}
		snooze(50000);
		desk.Settle();
		state.SetIterationTime(ProcessorTime() - start);
		state.counters["frames"] = static_cast<double>(system_time() - startTime) / 16000;
		refreshes += sReads - before;
	}
	state.counters["refreshes"] = benchmark::Counter(refreshes, benchmark::Counter::kAvgIterations);
}

BENCHMARK(Drag)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(3);

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
	benchmark::ConsoleReporter reporter(benchmark::ConsoleReporter::OO_Tabular);
	reporter.SetOutputStream(&std::cerr);
	reporter.SetErrorStream(&std::cerr);
	benchmark::RunSpecifiedBenchmarks(&reporter);
	return 0;
}
