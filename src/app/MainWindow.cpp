// SPDX-License-Identifier: MIT

#include "app/MainWindow.h"

#include <Application.h>
#include <MenuBar.h>
#include <MenuItem.h>
#include <Message.h>
#include <Screen.h>

#include "app/Dialogs.h"
#include "app/PlimApp.h"
#include "app/PlimView.h"
#include "app/WindowFrame.h"
#include "app/WindowGuard.h"
#include "designer/DesignForm.h"
#include "palette/ComponentPalette.h"
#include "project/ProjectWin.h"
#include "props/PropertyWin.h"

namespace {

const BRect kFirstFrame(100, 100, 510, 510);
const BRect kMenuBarFrame(0, 0, 410, 20);
constexpr float kWidth = 300;
constexpr float kHeight = 40;
const BPoint kPlaceOnScreen(20, 40);
constexpr rgb_color kBackground = {216, 216, 216, 255};

/// A line of a menu: a command, or without a label a separator.
struct menu_line {
	const char* label;
	plim_command command;
	char shortcut;
	uint32 modifiers;
};

constexpr menu_line kSeparator = {nullptr, PLIM_HELP, 0, 0};

constexpr menu_line kFileMenu[] = {
	{"New Project", PLIM_NEW_PROJECT, 'N', 0},
	kSeparator,
	{"Open Project...", PLIM_OPEN_PROJECT, 'O', 0},
	{"Save Project", PLIM_SAVE_PROJECT, 'S', 0},
	{"Save Project As...", PLIM_SAVE_PROJECT_AS, 'S', B_SHIFT_KEY},
	kSeparator,
	{"Generate Code...", PLIM_GENERATE, 'G', 0},
	kSeparator,
	{"Quit", PLIM_QUIT, 0, 0},
};

constexpr menu_line kViewMenu[] = {
	{"Project", PLIM_SHOW_PROJECT, 'R', 0},
	{"Properties", PLIM_SHOW_PROPERTIES, 'P', 0},
	{"Palette", PLIM_SHOW_PALETTE, 'T', 0},
};

constexpr menu_line kHelpMenu[] = {
	{"Contents", PLIM_HELP, 0, 0},
	kSeparator,
	{"About", PLIM_ABOUT, 0, 0},
};


/// Whether the main window carries out \a command itself.
bool
IsWindowCommand(plim_command command)
{
	return command >= PLIM_QUIT && command <= PLIM_SHOW_PALETTE;
}


template <size_t kLength>
BMenu*
MakeMenu(const char* name, const menu_line (&lines)[kLength], BWindow* window)
{
	BMenu* menu = new BMenu(name);
	for (const menu_line& line : lines) {
		if (line.label == nullptr) {
			menu->AddSeparatorItem();
			continue;
		}
		BMenuItem* item =
			new BMenuItem(line.label, new BMessage(line.command), line.shortcut, line.modifiers);
		menu->AddItem(item);
		if (IsWindowCommand(line.command))
			item->SetTarget(window);
		else
			item->SetTarget(be_app);
	}
	return menu;
}


void
BringToFront(BWindow* window)
{
	WindowGuard guard(window);
	if (!guard.IsLocked())
		return;
	if (window->IsHidden())
		window->Show();
	window->Activate();
}


template <typename Window>
void
TellOfClosing(Window* window)
{
	if (window == nullptr)
		return;
	WindowGuard guard(window);
	if (guard.IsLocked())
		window->OKToClose(true);
}


void
QuitWindow(BWindow* window)
{
	if (window == nullptr)
		return;
	{
		WindowGuard guard(window);
		if (!guard.IsLocked() || !window->QuitRequested())
			return;
	}
	// Without a guard, which needs its window until it is left, and with no lock held while the window ends.
	WindowRelease release;
	if (window->Lock())
		window->Quit();
}

} // namespace


PlimWin::PlimWin()
	: BWindow(kFirstFrame, "Plimworks", B_TITLED_WINDOW, 0),
	  fMenuBar(nullptr),
	  fView(nullptr),
	  fProjectWindow(nullptr),
	  fPropertyWindow(nullptr),
	  fDesignForm(nullptr),
	  fPalette(nullptr),
	  fQuitting(false)
{
	SetFlags(Flags() | B_NOT_ZOOMABLE | B_NOT_V_RESIZABLE);
	InitMenu();
	InitControls();

	const BRect screen = BScreen(B_MAIN_SCREEN_ID).Frame();
	const BPoint corner = screen.LeftTop() + kPlaceOnScreen;
	if (screen.Contains(corner)) {
		MoveTo(corner);
		ResizeTo(kWidth, kHeight);
	}
	RestoreWindowFrame(this, "MainWindowFrame");
}


PlimWin::~PlimWin()
{
	PlimApp* app = dynamic_cast<PlimApp*>(be_app);
	if (app != nullptr)
		app->MainWindowQuit();
}


ProjectWin*
PlimWin::ProjectWindow()
{
	ProjectWin* made = fProjectWindow;
	if (made != nullptr)
		return made;

	made = MadeOnce(fProjectWindow, [] { return new ProjectWin; });
	// Only now, as the form's window asks for the project window.
	if (made != nullptr)
		made->NewProject(true);
	return made;
}


PropertyWin*
PlimWin::PropertyWindow()
{
	return MadeOnce(fPropertyWindow, [] { return new PropertyWin; });
}


ComponentPalette*
PlimWin::Palette()
{
	return MadeOnce(fPalette, [] { return new ComponentPalette; });
}


TDesignForm*
PlimWin::DesignForm()
{
	return MadeOnce(fDesignForm, [] { return new TDesignForm("Untitled"); });
}


void
PlimWin::Show()
{
	BWindow::Show();
	PropertyWindow()->Show();
	ProjectWindow()->Show();
	Palette()->Show();
	WindowGuard guard(this);
	if (guard.IsLocked())
		Activate();
}


void
PlimWin::MessageReceived(BMessage* message)
{
	switch (message->what) {
		case PLIM_NEW_PROJECT:
			MsgBox("Yeah", "Yeah", "Yeah");
			break;

		case PLIM_QUIT:
			if (ProjectWindow()->CloseProject())
				be_app->PostMessage(B_QUIT_REQUESTED);
			break;

		case PLIM_SHOW_PROJECT:
			BringToFront(ProjectWindow());
			break;

		case PLIM_SHOW_PROPERTIES:
			BringToFront(PropertyWindow());
			break;

		case PLIM_SHOW_DESIGN_FORM:
			BringToFront(DesignForm());
			break;

		case PLIM_SHOW_PALETTE:
			BringToFront(Palette());
			break;

		case PLIM_OPEN_PROJECT:
		case PLIM_SAVE_PROJECT:
		case PLIM_SAVE_PROJECT_AS:
		case PLIM_HELP:
		case PLIM_ABOUT:
			// The application's: the menu sends them there.
			break;

		default:
			BWindow::MessageReceived(message);
			break;
	}
}


bool
PlimWin::QuitRequested()
{
	// The application asks again when it ends the windows.
	if (fQuitting)
		return true;
	fQuitting = true;

	TellOfClosing(fDesignForm.load());
	TellOfClosing(fProjectWindow.load());
	TellOfClosing(fPropertyWindow.load());
	ComponentPalette* palette = fPalette;
	if (palette != nullptr) {
		WindowGuard guard(palette);
		if (guard.IsLocked())
			StoreWindowFrame(palette, "PaletteFrame");
		palette->OKToClose(true);
	}
	StoreWindowFrame(this, "MainWindowFrame");
	be_app->PostMessage(B_QUIT_REQUESTED);
	return true;
}


void
PlimWin::Quit()
{
	if (find_thread(nullptr) == Thread()) {
		if (!IsHidden())
			Hide();
		return;
	}
	BWindow::Quit();
}


void
PlimWin::QuitToolWindows()
{
	// First the one that shows what the project window owns. Those that are gone are handed out no more.
	QuitWindow(fPropertyWindow);
	fPropertyWindow = nullptr;
	QuitWindow(fProjectWindow);
	fProjectWindow = nullptr;
	QuitWindow(fDesignForm);
	fDesignForm = nullptr;
	QuitWindow(fPalette);
	fPalette = nullptr;
}


void
PlimWin::InitMenu()
{
	fMenuBar = new BMenuBar(kMenuBarFrame, "menubar");
	fMenuBar->AddItem(MakeMenu("File", kFileMenu, this));
	fMenuBar->AddItem(MakeMenu("View", kViewMenu, this));
	fMenuBar->AddItem(MakeMenu("Help", kHelpMenu, this));
	AddChild(fMenuBar);
}


void
PlimWin::InitControls()
{
	BRect frame = Bounds();
	frame.top = fMenuBar->Frame().bottom + 1;
	fView = new PlimView(frame, "PlimView");
	fView->SetViewColor(kBackground);
	AddChild(fView);
}


/// The window that \a window holds; the first time that which \a make makes.
template <typename Window, typename Make>
Window*
PlimWin::MadeOnce(std::atomic<Window*>& window, Make make)
{
	Window* made = window;
	if (made != nullptr || fQuitting)
		return made;

	// The new window may show itself, and may ask for others.
	WindowRelease release;
	std::lock_guard<std::recursive_mutex> lock(fMaking);
	if (window == nullptr)
		window = make();
	return window;
}


PlimWin*
MainWindow()
{
	PlimApp* app = dynamic_cast<PlimApp*>(be_app);
	return app != nullptr ? app->MainWindow() : nullptr;
}
