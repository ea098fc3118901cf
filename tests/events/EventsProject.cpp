// SPDX-License-Identifier: MIT

#include "EventsProject.h"

#include <cstdio>
#include <cstring>
#include <iterator>

#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "model/AppComponent.h"
#include "model/Event.h"
#include "model/Property.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "project/Project.h"

namespace {

struct setting {
	const char* className;
	const char* property;
	const char* value;
};

// What a component needs so that something can happen to it.
const setting kSettings[] = {
	{"TMenuBar", "Items",
		"Forms|>New note|Window|>Hide and show|>Draw at once|>Elsewhere|>Post|Help|>About"},
	{"TMenuField", "Items", "Red|Green|Blue"},
	{"TListView", "Items", "One|Two|Three"},
	{"TOutlineListView", "Items", "Fruit|>Apple|>Pear|Nuts"},
	{"TTabView", "Tabs", "One|Two"},
	{"TSlider", "Value", "50"},
	{"TTextControl", "Text", "text"},
	{"TColorControl", "CellSize", "3"},
	{"TClock", "Running", "false"},
};

// Columns and rows of the main form, below its menu bar.
const int32 kColumns = 5;
const BRect kCell(10, 30, 129, 109);
const BPoint kStep(135, 95);
const BRect kBar(0, 0, 689, 21);


void
SetFrame(TDesignForm* form, BRect frame)
{
	const std::pair<const char*, float> kEdges[] = {
		{"Left", frame.left}, {"Top", frame.top}, {"Right", frame.right}, {"Bottom", frame.bottom}};
	for (const auto& [name, edge] : kEdges)
		form->SetPropertyValue(name, std::to_string(static_cast<int>(edge)).c_str());
}


TComponent*
Place(TDesignForm* form, const char* className, BRect frame)
{
	PaletteCatalog().SetDropEntry(PaletteCatalog().FindPalEntry(className));
	TComponent* component = form->CreateComponent(form->View(), frame);
	form->DoneDroppingComponent();
	return component;
}


/// Ticks all events of \a component that can be generated.
void
Tick(TComponent* component, source_dialect dialect, project_event about,
	std::vector<project_event>* events)
{
	for (int32 i = 0; i < component->CountEvents(); i++) {
		about.event = component->EventAt(i);
		const char* parameters = about.event->parameters;
		about.isTicked = dialect == DIALECT_STANDARD || parameters == nullptr
			|| strstr(parameters, "\xC2\xA0") == nullptr;
		component->SetEventSelection(about.event->name, about.isTicked);
		events->push_back(about);
	}
}


/// Those of the standard library first, wherever it lies in its folder: scripts know their places.
std::vector<const char*>
ClassesInOrder()
{
	std::vector<const char*> classes;
	std::vector<const char*> others;
	for (int32 i = 0; i < PaletteCatalog().CountPalEntries(); i++) {
		const TPaletteEntry* entry = PaletteCatalog().PalEntryAt(i);
		const bool isStandard = strstr(entry->Copyright(), "standard") != nullptr;
		(isStandard ? classes : others).push_back(entry->ClassName());
	}
	classes.insert(classes.end(), others.begin(), others.end());
	return classes;
}


bool
DesignMain(TDesignForm* form, source_dialect dialect, std::vector<project_event>* events)
{
	const int32 rows = (PaletteCatalog().CountPalEntries() + kColumns - 1) / kColumns;
	const BRect frame(100, 80, 789, 80 + kCell.top + static_cast<float>(rows) * kStep.y);
	SetFrame(form, frame);
	Tick(form, dialect, {"Main", "", "TForm", frame, nullptr, true}, events);
	int32 cell = 0;
	for (const char* className : ClassesInOrder()) {
		BRect frame = kBar;
		if (strcmp(className, "TMenuBar") != 0) {
			frame = kCell.OffsetByCopy(
				(cell % kColumns) * kStep.x, static_cast<float>(cell / kColumns) * kStep.y);
			cell++;
		}
		TComponent* component = Place(form, className, frame);
		if (component == nullptr) {
			fprintf(stderr, "%s: cannot be placed\n", className);
			return false;
		}
		// It moves and grows when the form grows.
		component->SetPropertyValue("ResizingMode", "B_FOLLOW_LEFT_RIGHT|B_FOLLOW_BOTTOM");
		if (component->FindProperty("Label") != nullptr)
			component->SetPropertyValue("Label", className + 1);
		for (const setting& one : kSettings) {
			if (strcmp(one.className, className) == 0)
				component->SetPropertyValue(one.property, one.value);
		}
		Tick(component, dialect,
			{"Main", component->ComponentName(), className, frame, nullptr, true}, events);
	}
	return true;
}


void
Tick(TComponent* component, const char* event, project_event about,
	std::vector<project_event>* events)
{
	component->SetEventSelection(event, true);
	about.event = component->FindEvent(event);
	events->push_back(about);
}


void
DesignNote(TDesignForm* form, std::vector<project_event>* events)
{
	SetFrame(form, BRect(300, 500, 499, 619));
	Tick(form, "OnQuitRequested", {"Note", "", "TForm", BRect(), nullptr, true}, events);
	const struct {
		const char* className;
		const char* name;
		const char* label;
		const char* event;
	} kComponents[] = {
		{"TTextControl", "Text", "", "OnChange"},
		{"TCheckBox", "Keep", "Keep", "OnChange"},
		{"TButton", "Close", "Close", "OnClick"},
		{"TButton", "Vanish", "Vanish", "OnClick"},
	};
	BRect frame(10, 5, 120, 29);
	for (const auto& one : kComponents) {
		TComponent* component = Place(form, one.className, frame);
		component->SetPropertyValue("Name", one.name);
		component->SetPropertyValue("Label", one.label);
		Tick(component, one.event, {"Note", one.name, one.className, frame, nullptr, true}, events);
		frame.OffsetBy(0, 28);
	}
}

} // namespace

bool
DesignEvents(TProject* project, source_dialect dialect, std::vector<project_event>* events)
{
	TAppComponent* app = project->App();
	app->SetPropertyValue("Name", "Events");
	app->SetPropertyValue("Signature", "application/x-vnd.plimworks-events");
	Tick(app, dialect, {"Events", "", "TApp", BRect(), nullptr, true}, events);

	TDesignForm* note = project->NewForm();
	note->SetPropertyValue("Name", "Note");
	note->SetPropertyValue("Title", "Note");
	DesignNote(note, events);
	TDesignForm* main = project->NewForm();
	main->SetPropertyValue("Name", "Main");
	main->SetPropertyValue("Title", "Main");
	project->SetMainForm(main);
	return DesignMain(main, dialect, events);
}
