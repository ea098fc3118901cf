// SPDX-License-Identifier: MIT
// The designer's main window, through which every window finds the others.

#pragma once

#include <atomic>
#include <mutex>

#include <Window.h>

class BMenuBar;
class ComponentPalette;
class PlimView;
class ProjectWin;
class PropertyWin;
class TDesignForm;

/// The small window with the menu bar; it makes and hands out the designer's other windows.
///
/// The accessors may be called from any thread without a lock. What they hand out is locked by a
/// WindowGuard; it lives until the program quits, and the main window outlives it. From then on they return null.
class PlimWin : public BWindow {
public:
	PlimWin();
	virtual ~PlimWin();

	/// Make their window, hidden, on the first call; a new project window starts a project with one form.
	ProjectWin* ProjectWindow();
	PropertyWin* PropertyWindow();
	ComponentPalette* Palette();

	/// A form of no project, "Untitled", made and shown on the first call.
	TDesignForm* DesignForm();

	/// The empty background.
	PlimView* View() const { return fView; }

	/// Shows this window, the property window, the project window and the palette, and activates this one.
	/// Call it once, without the lock of another window.
	void Show() override;

	void MessageReceived(BMessage* message) override;

	/// Tells the other windows that the program ends, stores the frames and asks the application to quit.
	bool QuitRequested() override;

	/// In the window's own thread hides it only: the application ends it, after the windows that may still use it.
	void Quit() override;

	/// Quits the windows that this one handed out, and waits until they are gone. Application thread, once, after
	/// QuitRequested().
	void QuitToolWindows();

private:
	void InitMenu();
	void InitControls();

	template <typename Window, typename Make>
	Window* MadeOnce(std::atomic<Window*>& window, Make make);

	BMenuBar* fMenuBar;
	PlimView* fView;
	std::atomic<ProjectWin*> fProjectWindow;
	std::atomic<PropertyWin*> fPropertyWindow;
	std::atomic<TDesignForm*> fDesignForm;
	std::atomic<ComponentPalette*> fPalette;
	// Held while a window is made; its constructor may ask for other windows.
	std::recursive_mutex fMaking;
	std::atomic<bool> fQuitting;
};

/// The main window, made on the first call; null in programs that are not the designer, and when it has quit.
PlimWin* MainWindow();
