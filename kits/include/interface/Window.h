// SPDX-License-Identifier: MIT
// A window: a frame on the screen, a thread, and a tree of views.
#ifndef _WINDOW_H
#define _WINDOW_H

#include <memory>

#include <Looper.h>
#include <View.h>

class BBitmap;
class BButton;
class BMenuBar;
class BMenuItem;
class BMessage;

namespace BPrivate {
class WindowData;
} // namespace BPrivate

enum window_type {
	B_UNTYPED_WINDOW = 0,
	B_TITLED_WINDOW = 1,
	B_MODAL_WINDOW = 3,
	B_DOCUMENT_WINDOW = 11,
	B_BORDERED_WINDOW = 20,
	B_FLOATING_WINDOW = 21,
};

enum window_look {
	B_BORDERED_WINDOW_LOOK = 20,
	B_NO_BORDER_WINDOW_LOOK = 19,
	B_TITLED_WINDOW_LOOK = 1,
	B_DOCUMENT_WINDOW_LOOK = 11,
	B_MODAL_WINDOW_LOOK = 3,
	B_FLOATING_WINDOW_LOOK = 7,
};

enum window_feel {
	B_NORMAL_WINDOW_FEEL = 0,
	B_MODAL_SUBSET_WINDOW_FEEL = 2,
	B_MODAL_APP_WINDOW_FEEL = 1,
	B_MODAL_ALL_WINDOW_FEEL = 3,
	B_FLOATING_SUBSET_WINDOW_FEEL = 5,
	B_FLOATING_APP_WINDOW_FEEL = 4,
	B_FLOATING_ALL_WINDOW_FEEL = 6,
};

enum window_alignment {
	B_BYTE_ALIGNMENT = 0,
	B_PIXEL_ALIGNMENT = 1,
};

enum {
	B_NOT_MOVABLE = 1,
	B_NOT_CLOSABLE = 32,
	B_NOT_ZOOMABLE = 64,
	B_NOT_MINIMIZABLE = 16384,
	B_NOT_RESIZABLE = 2,
	B_NOT_H_RESIZABLE = 4,
	B_NOT_V_RESIZABLE = 8,
	B_AVOID_FRONT = 128,
	B_AVOID_FOCUS = 8192,
	B_WILL_ACCEPT_FIRST_CLICK = 16,
	B_OUTLINE_RESIZE = 4096,
	B_NO_WORKSPACE_ACTIVATION = 256,
	B_NOT_ANCHORED_ON_ACTIVATE = 131072,
	B_ASYNCHRONOUS_CONTROLS = 524288,
	B_QUIT_ON_WINDOW_CLOSE = 1048576,
	B_SAME_POSITION_IN_ALL_WORKSPACES = 2097152,
	B_AUTO_UPDATE_SIZE_LIMITS = 4194304,
	B_CLOSE_ON_ESCAPE = 8388608,
	B_NO_SERVER_SIDE_WINDOW_MODIFIERS = 512,
};

enum {
	B_DO_NOT_RESIZE_TO_FIT = 1,
	B_MOVE_IF_PARTIALLY_OFFSCREEN = 2,
};

#define B_CURRENT_WORKSPACE 0
#define B_ALL_WORKSPACES 0xffffffff

/// A looper with a place on the screen.
///
/// Created hidden and locked by the creating thread; the first Show() makes it visible, unlocks it
/// and starts its thread. From then on other threads lock it before they touch it or its views.
/// Frame() is the content area in screen coordinates, without tab and border. End it with Quit()
/// (locked) or B_QUIT_REQUESTED; never delete it. It deletes its views.
class BWindow : public BLooper {
public:
	BWindow(BRect frame, const char* title, window_type type, uint32 flags,
		uint32 workspace = B_CURRENT_WORKSPACE);
	BWindow(BRect frame, const char* title, window_look look, window_feel feel, uint32 flags,
		uint32 workspace = B_CURRENT_WORKSPACE);
	BWindow(BMessage* archive);
	virtual ~BWindow();

	static BArchivable* Instantiate(BMessage* archive);
	virtual status_t Archive(BMessage* archive, bool deep = true) const override;

	virtual thread_id Run() override;
	/// Needs the lock; does not return in the window's own thread.
	virtual void Quit() override;
	void Close() { Quit(); }
	virtual bool QuitRequested() override;

	void AddChild(BView* child, BView* before = NULL);
	bool RemoveChild(BView* child);
	int32 CountChildren() const;
	BView* ChildAt(int32 index) const;
	BView* FindView(const char* viewName) const;
	/// Window coordinates; the lowest child that contains the point.
	BView* FindView(BPoint) const;
	BView* CurrentFocus() const;

	virtual void DispatchMessage(BMessage* message, BHandler* handler) override;
	virtual void MessageReceived(BMessage* message) override;
	virtual void FrameMoved(BPoint newPosition);
	virtual void WorkspacesChanged(uint32 oldWorkspaces, uint32 newWorkspaces);
	virtual void WorkspaceActivated(int32 workspace, bool state);
	virtual void FrameResized(float newWidth, float newHeight);
	virtual void Minimize(bool minimize);
	virtual void Zoom(BPoint origin, float width, float height);
	void Zoom();
	void SetZoomLimits(float maxWidth, float maxHeight);
	virtual void ScreenChanged(BRect screenSize, color_space depth);
	virtual void WindowActivated(bool focus);
	virtual void MenusBeginning();
	virtual void MenusEnded();

	/// Microseconds; 0 turns the pulse off. 500000 by default.
	void SetPulseRate(bigtime_t rate);
	bigtime_t PulseRate() const;

	/// Command is implied unless B_NO_COMMAND_KEY is given. The window owns \a message. A null
	/// \a target is the focus view.
	void AddShortcut(uint32 key, uint32 modifiers, BMessage* message);
	void AddShortcut(uint32 key, uint32 modifiers, BMessage* message, BHandler* target);
	bool HasShortcut(uint32 key, uint32 modifiers);
	void RemoveShortcut(uint32 key, uint32 modifiers);
	void SetDefaultButton(BButton* button);
	BButton* DefaultButton() const;
	void SetKeyMenuBar(BMenuBar* bar);
	BMenuBar* KeyMenuBar() const;

	bool NeedsUpdate() const;
	/// In the window's thread: draws what waits for it now.
	void UpdateIfNeeded();
	void DisableUpdates();
	void EnableUpdates();
	void BeginViewTransaction();
	void EndViewTransaction();
	bool InViewTransaction() const;
	void Flush() const;
	void Sync() const;

	void ConvertToScreen(BPoint* point) const;
	BPoint ConvertToScreen(BPoint point) const;
	void ConvertFromScreen(BPoint* point) const;
	BPoint ConvertFromScreen(BPoint point) const;
	void ConvertToScreen(BRect* rect) const;
	BRect ConvertToScreen(BRect rect) const;
	void ConvertFromScreen(BRect* rect) const;
	BRect ConvertFromScreen(BRect rect) const;

	void MoveBy(float dx, float dy);
	void MoveTo(BPoint);
	void MoveTo(float x, float y);
	void ResizeBy(float dx, float dy);
	/// Keeps within the size limits.
	void ResizeTo(float width, float height);
	void CenterOnScreen();
	void CenterOnScreen(screen_id id);
	BRect Bounds() const;
	BRect Frame() const;
	BRect DecoratorFrame() const;
	BSize Size() const;
	void SetSizeLimits(float minWidth, float maxWidth, float minHeight, float maxHeight);
	void GetSizeLimits(float* minWidth, float* maxWidth, float* minHeight, float* maxHeight);

	/// Count: a window hidden twice needs two Show().
	virtual void Show();
	virtual void Hide();
	bool IsHidden() const;
	bool IsMinimized() const;
	void Activate(bool = true);
	bool IsFront() const;
	bool IsActive() const;
	status_t SendBehind(const BWindow* window);

	const char* Title() const;
	/// Renames the thread too.
	void SetTitle(const char* title);
	status_t SetType(window_type type);
	window_type Type() const;
	status_t SetLook(window_look look);
	window_look Look() const;
	status_t SetFeel(window_feel feel);
	window_feel Feel() const;
	status_t SetFlags(uint32);
	uint32 Flags() const;
	bool IsModal() const;
	bool IsFloating() const;
	status_t AddToSubset(BWindow* window);
	status_t RemoveFromSubset(BWindow* window);
	uint32 Workspaces() const;
	void SetWorkspaces(uint32);

private:
	friend class BBitmap;
	friend class BButton;
	friend class BMenuBar;
	friend class BMenuItem;
	friend class BView;
	friend class BPrivate::WindowData;
	friend class BPrivate::WindowInput;
	friend class BPrivate::WindowPainter;

	// A window without a place on the screen, whose views draw into \a bitmap.
	BWindow(BBitmap* bitmap);
	BWindow(const BWindow&) = delete;
	BWindow& operator=(const BWindow&) = delete;

	virtual BHandler* ChooseTarget(BMessage* message, BHandler* target, bool preferred) override;
	virtual void QueueRanEmpty() override;
	void Init(BRect frame, const char* title, window_look look, window_feel feel, uint32 flags,
		uint32 workspace);
	void SetFocus(BView* focus);
	void ViewDetached(BView* view);

	std::unique_ptr<BPrivate::WindowData> fData;
};

#endif // _WINDOW_H
