// SPDX-License-Identifier: MIT
// What a window keeps, and what the kit's classes do with windows beyond the public class.
#ifndef INTERFACE_WINDOW_PRIVATE_H
#define INTERFACE_WINDOW_PRIVATE_H

#include <memory>
#include <string>
#include <vector>

#include <Messenger.h>
#include <Window.h>

#include "interface/ShortcutTable.h"
#include "interface/WindowInput.h"
#include "interface/WindowPainter.h"

class BMenu;
class BMessageRunner;

namespace BPrivate {

class HostWindow;
class WindowClient;
struct HostWindowStyle;

/// Internal messages to a window, or to its menu bar.
enum {
	kMsgCanvasOutdated = '_CnO',
	kMsgOpenMenuBar = '_OMB',
};

/// Marks what the host reports: "be:host" (bool).
inline const char* const kFromHost = "be:host";

/// A call against the rules: says so on standard error, and ends the program where checks are on.
void ReportMisuse(const char* what, const char* name);


/// The fields of a window. Window locked.
class WindowData {
public:
	explicit WindowData(BWindow* window);
	~WindowData();

	/// For the rest of the kits; \a window locked.
	static WindowData& Of(BWindow* window) { return *window->fData; }

	void ViewAdded(BView* view);
	void ViewRemoved(BView* view);
	/// Starts or stops the pulse as the rate and the views ask.
	void UpdatePulse();
	BView* DefaultButtonView() const;
	void OpenKeyMenuBar();
	/// The frame became another one, by the program or the user: lays out the views. Posts no message.
	void AdoptFrame(BRect frame);
	void PostMoved();
	void PostResized();
	/// \a width and \a height within the size limits.
	BSize Limited(float width, float height) const;
	void Activated(bool active);
	HostWindowStyle Style() const;
	void SendStyle();

	/// Each handles its messages and says whether it did.
	bool DispatchWindowMessage(BMessage* message, BHandler* handler);
	bool DispatchViewMessage(BMessage* message, BHandler* handler);

	void FrameReported(BMessage* message);
	void Pulse(BView* view);

	BWindow* window;
	std::string title;
	BRect frame;
	/// How often the host was asked for a place, and for a size.
	int32 movesAsked = 0;
	int32 sizesAsked = 0;
	BRect frameBeforeZoom;
	window_look look = B_TITLED_WINDOW_LOOK;
	window_feel feel = B_NORMAL_WINDOW_FEEL;
	uint32 flags = 0;
	uint32 workspaces = B_CURRENT_WORKSPACE;
	float minWidth = 0;
	float maxWidth = 32768;
	float minHeight = 0;
	float maxHeight = 32768;
	float maxZoomWidth = 32768;
	float maxZoomHeight = 32768;
	/// 0 and less: shown. A window begins hidden.
	int32 hideLevel = 1;
	bool active = false;
	bool minimized = false;
	int32 transactions = 0;

	bigtime_t pulseRate = 500000;
	std::unique_ptr<BMessageRunner> pulseRunner;

	BView* topView = nullptr;
	BView* focus = nullptr;
	BButton* defaultButton = nullptr;
	BMenuBar* keyMenuBar = nullptr;
	/// The bar that the user chooses from now, and who gets the window's input meanwhile.
	const BMenu* openBar = nullptr;
	BMessenger menuTracker;

	ShortcutTable shortcuts;
	WindowInput input;
	WindowPainter painter;
	/// The host's window and who hears from it; null for the views of a bitmap. Destroyed in this order.
	std::unique_ptr<WindowClient> client;
	std::unique_ptr<HostWindow> host;
	bool isOffscreen = false;
};

} // namespace BPrivate

#endif // INTERFACE_WINDOW_PRIVATE_H
