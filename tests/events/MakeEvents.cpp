// SPDX-License-Identifier: MIT
// Generates the program with every event, and writes into its handlers what a developer would write: a line that
// tells of the call, and what the forms do.
//
// usage: make_events COMPONENTS_FOLDER FOLDER classic|standard
//
// Besides the sources FOLDER gets events.tsv, which names each event: owner, component, class, frame, event,
// parameters, result.

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <map>
#include <sstream>
#include <string>

#include <Application.h>

#include "EventsProject.h"
#include "app/Preferences.h"
#include "codegen/DialectGenerator.h"
#include "codegen/HandlerNames.h"
#include "model/AppComponent.h"
#include "model/Event.h"
#include "palette/LibraryLoader.h"
#include "palette/PaletteCatalog.h"
#include "project/Project.h"

namespace {

/// What handlers do besides telling that they were called. The events of a form that are operations need
/// the call of the base class.
const std::map<std::string, std::string> kActions = {
	{"Main.OnShow", "TForm::Show();"},
	{"Main.OnHide", "TForm::Hide();"},
	{"Main.OnQuit", "TForm::Quit();"},
	{"Main.OnMinimize", "TForm::Minimize(minimize);"},
	{"Main.OnZoom", "TForm::Zoom(origin, width, height);"},
	{"Main.OnOpenViewTransaction", "TForm::OpenViewTransaction();"},
	{"Main.OnCommitViewTransaction", "TForm::CommitViewTransaction();"},
	{"Main.PictureView1.OnMouseDown",
		"BMessage dragged('drag'); PictureView1->DragMessage(&dragged, PictureView1->Frame());"},
	{"Main.MenuBar1.OnInvoke", "Do(item->Label());"},
	{"Events.OnReadyToRun", "SetPulseRate(100000);"},
	{"Main.Gauge1.OnClick", "Gauge1->SetValue(Gauge1->Value() + 10);"},
	{"Main.Clock1.OnClick",
		"Clock1->SetRunning(true);\n  Clock1->Pulse();\n  Clock1->SetRunning(false);"},
	{"Note.Close.OnClick", "PostMessage(B_QUIT_REQUESTED);"},
	{"Note.Vanish.OnClick", "Quit();"},
};

/// What those with a result answer.
const std::map<std::string, std::string> kResults = {
	{"Main.OnQuitRequested", "true"},
	{"Note.OnQuitRequested", "Keep->Value() == B_CONTROL_OFF"},
	{"Events.OnQuitRequested", "BApplication::QuitRequested()"},
};

const char* const kMainMembers = R"(
  void Do(const BString& command);
)";

const char* const kMainFunctions = R"(
#include "Note.h"

void TMain::Do(const BString& command)
{
  if (command == "New note")
    (new TNote())->Show();
  else if (command == "Hide and show") {
    Hide();
    Show();
  } else if (command == "Draw at once") {
    OpenViewTransaction();
    FormView()->Invalidate();
    CommitViewTransaction();
  } else if (command == "Elsewhere") {
    SetWorkspaces(Workspaces() << 1);
  }
}
)";

// The items that are messages of the system to the form or the application.
const char* const kMainCreate = R"(
  BMessage *screen = new BMessage(B_SCREEN_CHANGED);
  screen->AddRect("frame", BRect(0, 0, 1279, 1023));
  screen->AddInt32("mode", B_RGB32);
  BMessage *workspace = new BMessage(B_WORKSPACE_ACTIVATED);
  workspace->AddInt32("workspace", 3);
  workspace->AddBool("active", true);
  BMenu *system = new BMenu("System");
  BMenuItem *about = new BMenuItem("About", new BMessage(B_ABOUT_REQUESTED));
  about->SetTarget(be_app);
  system->AddItem(about);
  system->AddItem(new BMenuItem("Another screen", screen));
  system->AddItem(new BMenuItem("Another workspace", workspace));
  MenuBar1->AddItem(system);
)";

const char* const kNoteCreate = R"(
  static int sNotes = 0;
  SetTitle((BString("Note ") << ++sNotes).String());
)";

std::string
Name(const project_event& event)
{
	return event.owner + "." + (event.component.empty() ? "" : event.component + ".")
		+ event.event->name;
}


/// The names in a parameter list.
std::string
ParameterNames(const char* parameters)
{
	std::istringstream list(parameters != nullptr ? parameters : "");
	std::string names;
	for (std::string one; std::getline(list, one, ',');)
		names += ", " + one.substr(one.find_last_of(" *\xA0") + 1);
	return names;
}


std::string
Value(const std::map<std::string, std::string>& map, const std::string& key)
{
	const auto found = map.find(key);
	return found != map.end() ? found->second : "";
}


/// A generated file that is edited.
class Source {
public:
	explicit Source(const std::filesystem::path& path)
		: fPath(path)
	{
		std::ifstream file(path);
		fText.assign(std::istreambuf_iterator<char>(file), {});
	}

	~Source() { std::ofstream(fPath) << fText; }

	/// Puts \a text behind the first \a mark after \a start, or before the last \a mark. Without one the
	/// generated text is not what it should be.
	void InsertAfter(const std::string& start, const std::string& mark, const std::string& text)
	{
		fText.insert(Find(start, mark) + mark.size(), text);
	}

	void InsertBeforeLast(const std::string& mark, const std::string& text)
	{
		fText.insert(Checked(fText.rfind(mark), mark), text);
	}

	void Append(const std::string& text) { fText += text; }

	/// Puts \a text between the first \a from and the first \a to after \a start.
	void Replace(const std::string& start, const std::string& from, const std::string& to,
		const std::string& text)
	{
		const size_t begin = Find(start, from) + from.size();
		fText.replace(begin, Checked(fText.find(to, begin), to) - begin, text);
	}

private:
	size_t Find(const std::string& start, const std::string& mark) const
	{
		return Checked(fText.find(mark, Checked(fText.find(start), start)), mark);
	}

	size_t Checked(size_t found, const std::string& mark) const
	{
		if (found == std::string::npos)
			Fail(mark);
		return found;
	}

	[[noreturn]] void Fail(const std::string& mark) const
	{
		fprintf(stderr, "%s: has no \"%s\"\n", fPath.c_str(), mark.c_str());
		exit(1);
	}

	std::filesystem::path fPath;
	std::string fText;
};


/// The handler of \a event, which is in \a source: it tells of the call, and does what it is for.
void
FillHandler(Source& source, const project_event& event, const std::string& handler)
{
	const char* parameters = event.event->parameters;
	const char* result = event.event->returnType;
	const std::string start = std::string(result != nullptr ? result : "void") + " T" + event.owner
		+ "::" + handler + "(";
	const std::string name = Name(event);
	const std::string self = event.owner == "Note"
		? "std::string(Title()) + \"." + name.substr(name.find('.') + 1) + "\""
		: "\"" + name + "\"";
	std::string extra = ParameterNames(parameters);
	if (name == "Note.Text.OnChange")
		extra = ", Text->Text()";
	source.InsertAfter(
		start, "\n{\n", "  Record(this, " + self + extra + ");\n  " + Value(kActions, name) + "\n");
	if (result != nullptr)
		source.Replace(start, " result", ";", " = " + Value(kResults, name));
}


/// Declares, defines and assigns the handler by hand.
void
WriteHandler(Source& header, Source& source, const project_event& event, const std::string& handler)
{
	std::string parameters = event.event->parameters;
	for (size_t space; (space = parameters.find("\xC2\xA0")) != std::string::npos;)
		parameters.replace(space, 2, " ");
	header.InsertBeforeLast("};", "  void " + handler + "(" + parameters + ");\n");
	source.Append("\nvoid T" + event.owner + "::" + handler + "(" + parameters
		+ ")\n{\n  Record(this, \"" + Name(event) + "\"" + ParameterNames(event.event->parameters)
		+ ");\n}\n");
	if (!event.component.empty()) {
		source.InsertAfter("void T" + event.owner + "::FormCreate(", "{\n",
			"  " + event.component + "->" + event.event->name + " = &T" + event.owner
				+ "::" + handler + ";\n");
	}
}


std::string
HandlerOf(const project_event& event)
{
	char name[256];
	return event.component + EventHandlerName(const_cast<TEvent*>(event.event), name);
}


void
Complete(const std::filesystem::path& folder, const std::vector<project_event>& events)
{
	std::map<std::string, std::unique_ptr<Source>> headers;
	std::map<std::string, std::unique_ptr<Source>> sources;
	for (const char* name : {"Events", "Main", "Note"}) {
		headers[name] = std::make_unique<Source>(folder / (std::string(name) + ".h"));
		sources[name] = std::make_unique<Source>(folder / (std::string(name) + ".cpp"));
	}
	for (const project_event& event : events) {
		if (event.isTicked)
			FillHandler(*sources[event.owner], event, HandlerOf(event));
		else
			WriteHandler(*headers[event.owner], *sources[event.owner], event, HandlerOf(event));
	}
	headers["Main"]->InsertBeforeLast("};", kMainMembers);
	sources["Main"]->Append(kMainFunctions);
	sources["Main"]->InsertAfter("void TMain::FormCreate(", "{\n", kMainCreate);
	sources["Note"]->InsertAfter("void TNote::FormCreate(", "{\n", kNoteCreate);
	for (const char* name : {"Main", "Note"}) {
		const std::string start = std::string("void T") + name + "::";
		sources[name]->InsertAfter(start + "FormDestroy(", "{\n",
			"  Record(this, std::string(Title()) + \".FormDestroy\");\n");
		sources[name]->InsertAfter(start + "FormCreate(", "{\n",
			"  Record(this, std::string(Title()) + \".FormCreate\");\n");
	}
	for (auto& [name, source] : sources)
		source->InsertAfter("", "", "#include \"Record.h\"\n");
}


void
WriteList(const std::filesystem::path& folder, const std::vector<project_event>& events)
{
	std::ofstream list(folder / "events.tsv");
	for (const project_event& event : events) {
		const BRect& frame = event.frame;
		list << event.owner << '\t' << event.component << '\t' << event.className << '\t'
			 << frame.left << ' ' << frame.top << ' ' << frame.right << ' ' << frame.bottom << '\t'
			 << event.event->name << '\n';
	}
}


int
Make(char** components, const std::filesystem::path& folder, source_dialect dialect)
{
	for (; *components != nullptr; components++) {
		TLibraryLoader loader(&PaletteCatalog());
		if (loader.LoadFolder(*components) != B_OK || loader.CountEntries() == 0) {
			fprintf(stderr, "%s: no component library can be loaded from here\n", *components);
			return 1;
		}
	}
	// What is there would be kept.
	for (const char* name : {"Events", "Main", "Note"}) {
		for (const char* ending : {".h", ".cpp", ".fcp"})
			std::filesystem::remove(folder / (std::string(name) + ending));
	}

	TProject project(FORM_HIDDEN);
	std::vector<project_event> events;
	if (!DesignEvents(&project, dialect, &events))
		return 1;
	project.App()->SetPropertyValue("GenerationPath", folder.c_str());
	TDialectGenerator generator(dialect);
	generator.SetAppComponent(project.App());
	generator.SetGenerationPath(folder.c_str());
	generator.GenerateApp();
	Complete(folder, events);
	WriteList(folder, events);
	return 0;
}

} // namespace

int
main(int argc, char** argv)
{
	source_dialect dialect;
	if (argc < 4 || !FindDialect(argv[2], &dialect)) {
		fprintf(stderr, "usage: %s FOLDER classic|standard COMPONENTS_FOLDER...\n", argv[0]);
		return 2;
	}
	setenv("BE_DISPLAY", "none", 1);
	AppSettings.LeaveFileAlone();
	BApplication app("application/x-vnd.Plimworks-MakeEvents");
	return Make(argv + 3, argv[1], dialect);
}
