// SPDX-License-Identifier: MIT

#include "app/PlimApp.h"

#include <cstdio>

#include <Alert.h>
#include <Entry.h>
#include <FilePanel.h>
#include <MimeType.h>
#include <Path.h>
#include <String.h>

#include "app/Dialogs.h"
#include "app/MainWindow.h"
#include "app/WindowGuard.h"
#include "codegen/CodeGenerator.h"
#include "designer/FormFile.h"
#include "designer/LostWork.h"
#include "designer/Recovery.h"
#include "designer/RefFilters.h"
#include "palette/ComponentPalette.h"
#include "palette/ComponentPaletteView.h"
#include "palette/LibraryLoader.h"
#include "palette/LibraryTrial.h"
#include "palette/PaletteCatalog.h"
#include "project/Project.h"
#include "project/ProjectOperation.h"
#include "project/ProjectView.h"
#include "project/ProjectWin.h"

const char* const APP_SIG = "application/x-qtx.Plim";

namespace {

constexpr const char* kFormDescription = "Plim++ Form";
constexpr const char* kProjectDescription = "Plim++ Project";
constexpr const char* kProposedName = "Project1.plim";
constexpr size_t kWarningSize = 286;
constexpr uint32 kMsgOfferLostWork = 'lost';
constexpr int32 kMostFormsNamed = 10;

// The palette takes the height of its column when it has this many entries at most.
constexpr int32 kMostEntriesShown = 19;
constexpr float kFullPaletteWidth = 113;

constexpr const char* kAboutText = "Plimworks\n"
								   "1999, the Plimworks authors\n"
								   "https://plimworks.example";


void
InstallDocumentType(const char* type, const char* description)
{
	BMimeType mimeType(type);
	if (mimeType.IsInstalled())
		return;
	mimeType.SetShortDescription(description);
	mimeType.SetLongDescription(description);
	mimeType.Install();
}


BString
QuestionAbout(const lost_project& project)
{
	BString text("The designer ended before all work was saved. Of ");
	if (project.path.IsEmpty())
		text << "a new project";
	else
		text << "the project '" << project.path << "'";
	text << " there are unsaved forms:";
	int32 count = 0;
	for (const lost_form& form : project.forms) {
		if (count == kMostFormsNamed) {
			text << " and " << static_cast<int32>(project.forms.size()) - count << " more";
			break;
		}
		text << (count++ == 0 ? " " : ", ") << form.name;
	}
	text << ".\n\nRecover opens the project with them; nothing is saved by that. "
		 << "Later asks again at the next start.";
	return text;
}


void
OpenProject(ProjectWin* project, const entry_ref& ref)
{
	const BPath path(&ref);
	if (path.InitCheck() != B_OK)
		return;

	printf("Opening %s\n", path.Path());
	if (project->LoadFromFile(path.Path()))
		return;

	char text[kWarningSize];
	snprintf(text, sizeof(text), "Unable to open project file '%s'.", path.Path());
	MsgBox("Warning", text, "OK", nullptr, nullptr, B_WIDTH_AS_USUAL, B_WARNING_ALERT);
}

} // namespace


PlimApp::PlimApp()
	: BApplication(APP_SIG),
	  fProjectFilter(std::make_unique<TProjectRefFilter>()),
	  fOpenPanel(new BFilePanel(
		  B_OPEN_PANEL, nullptr, nullptr, B_FILE_NODE, false, nullptr, nullptr, false, true)),
	  fSavePanel(nullptr),
	  fMainWindow(nullptr),
	  fMainWindowMade(false)
{
	InstallDocumentType(kFormFileType, kFormDescription);
	InstallDocumentType(kProjectFileType, kProjectDescription);
	fOpenPanel->Window()->SetTitle("Open Project");
	fOpenPanel->SetRefFilter(fProjectFilter.get());
	LoadComponentPalette();
	MainWindow()->Show();
}


PlimApp::~PlimApp()
{
	delete fSavePanel;
	delete fOpenPanel;
}


void
PlimApp::ReadyToRun()
{
}


void
PlimApp::ArgvReceived(int32 argc, char** argv)
{
	BMessage refs(B_REFS_RECEIVED);
	for (int32 i = 1; i < argc; i++) {
		entry_ref ref;
		// A path whose last part is missing makes a reference, too.
		if (get_ref_for_path(argv[i], &ref) == B_OK && BEntry(&ref).Exists())
			refs.AddRef("refs", &ref);
	}
	if (refs.HasRef("refs"))
		RefsReceived(&refs);
}


void
PlimApp::RefsReceived(BMessage* message)
{
	PlimWin* window = MainWindow();
	if (window == nullptr)
		return;

	entry_ref ref;
	for (int32 i = 0; message->FindRef("refs", i, &ref) == B_OK; i++)
		OpenProject(window->ProjectWindow(), ref);
	printf("Unable to locate refs in message\n");
}


void
PlimApp::MessageReceived(BMessage* message)
{
	// The dialog keeps the user from the windows, but not what was chosen while it opened.
	if (Generator()->IsConfirming() && message->what <= PLIM_GENERATE)
		return;

	switch (message->what) {
		case PLIM_NEW_PROJECT:
			NewProject();
			break;

		case PLIM_OPEN_PROJECT:
			fOpenPanel->Show();
			break;

		case PLIM_SAVE_PROJECT:
			SaveProject();
			break;

		case PLIM_SAVE_PROJECT_AS:
			SaveProjectAs();
			break;

		case B_SAVE_REQUESTED:
			SaveRequested(message);
			break;

		case PLIM_GENERATE:
			GenerateCode();
			break;

		case PLIM_ABOUT:
			AboutRequested();
			break;

		case kMsgOfferLostWork:
			OfferLostWork();
			break;

		default:
			BApplication::MessageReceived(message);
			break;
	}
}


void
PlimApp::AboutRequested()
{
	(new BAlert("Plim App", kAboutText, "Good Enough"))->Go(nullptr);
}


bool
PlimApp::QuitRequested()
{
	// The windows use the main window until they go, so it is told first and ends last.
	PlimWin* window = fMainWindow;
	if (window != nullptr) {
		{
			WindowGuard guard(window);
			if (guard.IsLocked())
				window->QuitRequested();
		}
		window->QuitToolWindows();
	}
	BApplication::QuitRequested();
	return true;
}


PlimWin*
PlimApp::MainWindow()
{
	if (fMainWindow == nullptr && !fMainWindowMade) {
		fMainWindowMade = true;
		fMainWindow = new PlimWin;
	}
	return fMainWindow;
}


void
PlimApp::LoadComponentPalette()
{
	ComponentPalette* palette = MainWindow()->Palette();
	TLibraryTrial trial;
	TLibraryLoader loader(&PaletteCatalog(), palette->View(), &trial);
	BPath folder;
	// Without the folder there are no components; the designer starts all the same.
	if (FindComponentsFolder(&folder) == B_OK)
		loader.LoadFolder(folder.Path());

	WindowGuard guard(palette);
	if (!guard.IsLocked())
		return;
	if (loader.CountEntries() > 0 && loader.CountEntries() <= kMostEntriesShown)
		palette->ResizeTo(kFullPaletteWidth, loader.ColumnHeight());
	palette->View()->SetColumnHeight(loader.ColumnHeight());
}


void
PlimApp::NewProject()
{
	ProjectWin* project = MainWindow()->ProjectWindow();
	if (project->CloseProject())
		project->NewProject(true);
}


void
PlimApp::SaveProject()
{
	ProjectWin* project = MainWindow()->ProjectWindow();
	const BString name(project->Filename());
	if (name.IsEmpty()) {
		SaveProjectAs();
		return;
	}
	if (!project->SaveToFile(name.String(), true) && project->Project()->OpenStatus() != B_CANCELED)
		MsgBox("Error", "Unable to save the file.", "OK", nullptr, nullptr, B_WIDTH_AS_USUAL,
			B_STOP_ALERT);
}


void
PlimApp::SaveProjectAs()
{
	delete fSavePanel;
	BMessage request(B_SAVE_REQUESTED);
	fSavePanel = new BFilePanel(
		B_SAVE_PANEL, nullptr, nullptr, B_FILE_NODE, false, &request, nullptr, false, true);
	fSavePanel->SetSaveText(kProposedName);
	fSavePanel->Window()->SetTitle("Save Project");
	fSavePanel->Show();
}


void
PlimApp::SaveRequested(BMessage* message)
{
	delete fSavePanel;
	fSavePanel = nullptr;

	entry_ref folder;
	const char* name;
	if (message->FindRef("directory", &folder) != B_OK
		|| message->FindString("name", &name) != B_OK)
		return;
	BPath path(&folder);
	if (path.InitCheck() != B_OK || path.Append(name) != B_OK)
		return;
	MainWindow()->ProjectWindow()->SetFilename(path.Path());
	PostMessage(PLIM_SAVE_PROJECT);
}


void
PlimApp::GenerateCode()
{
	ProjectWin* project = MainWindow()->ProjectWindow();
	TProjectOperation operation(project->Project());
	Generator()->SetAppComponent(project->View()->AppComponent());
	Generator()->ConfirmSettings();
}


void
PlimApp::KeepRecoveryCopies()
{
	fRecovery = std::make_unique<TRecovery>();
	// Comes after the messages that the application starts with.
	if (fRecovery->InitCheck() == B_OK)
		PostMessage(kMsgOfferLostWork);
}


/// Asks about the work that earlier runs have lost, one project after the other, until the user takes one.
void
PlimApp::OfferLostWork()
{
	TLostWork lostWork;
	for (const lost_project& project : lostWork.Projects()) {
		const int32 answer = MsgBox("Recovery", QuestionAbout(project).String(), "Later", "Discard",
			"Recover", B_WIDTH_AS_USUAL, B_WARNING_ALERT);
		if (answer == 1)
			TLostWork::Discard(project);
		if (answer == 2) {
			MainWindow()->ProjectWindow()->Project()->Recover(project);
			return;
		}
	}
}


/// The main window is gone for good.
void
PlimApp::MainWindowQuit()
{
	fMainWindow = nullptr;
}
