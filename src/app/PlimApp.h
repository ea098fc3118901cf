// SPDX-License-Identifier: MIT
// The designer's application object.

#pragma once

#include <atomic>
#include <memory>

#include <Application.h>

class BFilePanel;
class PlimWin;
class TProjectRefFilter;
class TRecovery;

/// The signature of the designer.
extern const char* const APP_SIG;

/// The commands of the main window's menus.
enum plim_command {
	PLIM_NEW_PROJECT = 1,
	PLIM_OPEN_PROJECT = 2,
	PLIM_SAVE_PROJECT = 3,
	PLIM_SAVE_PROJECT_AS = 4,
	PLIM_GENERATE = 5,
	PLIM_QUIT = 6,
	PLIM_SHOW_PROJECT = 7,
	PLIM_SHOW_PROPERTIES = 8,
	PLIM_SHOW_DESIGN_FORM = 9,
	PLIM_SHOW_PALETTE = 10,
	PLIM_HELP = 11,
	PLIM_ABOUT = 12
};

/// The designer: registers the document types, loads the component libraries, and carries out the commands
/// that concern the whole project.
///
/// The commands run in the application's thread, so that the windows stay alive meanwhile.
class PlimApp : public BApplication {
public:
	/// Makes and shows all windows.
	PlimApp();
	virtual ~PlimApp();

	void ReadyToRun() override;
	/// Opens each argument that names an existing file or folder entry as a project.
	void ArgvReceived(int32 argc, char** argv) override;
	/// Opens each of "refs" as a project.
	void RefsReceived(BMessage* message) override;
	void MessageReceived(BMessage* message) override;
	void AboutRequested() override;
	/// Quits all windows; true, whatever they answer.
	bool QuitRequested() override;

	/// The main window, made on the first call; null when it has quit. Any thread.
	PlimWin* MainWindow();
	const char* AppSignature() const { return APP_SIG; }

	/// Loads the component libraries beside the program into the palette. Once.
	void LoadComponentPalette();

	/// From now on forms that are not saved yet have recovery copies, and those of designers that are no more are
	/// offered to the user, after what the command line names was opened. Call it before Run(), once.
	void KeepRecoveryCopies();

private:
	friend class PlimWin;

	void NewProject();
	void SaveProject();
	void SaveProjectAs();
	void SaveRequested(BMessage* message);
	void GenerateCode();
	void OfferLostWork();
	void MainWindowQuit();

	std::unique_ptr<TProjectRefFilter> fProjectFilter;
	std::unique_ptr<TRecovery> fRecovery;
	BFilePanel* fOpenPanel;
	BFilePanel* fSavePanel;
	std::atomic<PlimWin*> fMainWindow;
	bool fMainWindowMade;
};
