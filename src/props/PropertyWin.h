// SPDX-License-Identifier: MIT
// The inspector: the properties and events of the selected component.

#pragma once

#include <atomic>
#include <memory>

#include <Window.h>

#include "props/PropertyEditor.h"
#include "props/PropertyWatch.h"

class BMessageRunner;
class TEditorPanes;
class TEventView;
class TForgottenEditors;
class TPropView;
class TabView;
struct TComponentRows;

/// The messages of the property window's own controls.
enum {
	PWM_MODAL_EDIT_FIELD = 3,
	PWM_MODAL_EDIT_BUTTON = 4, // "prop" (pointer to TProperty)
	PWM_STRING_EDIT = 5,
	PWM_LIST_EDIT_BUTTON = 6,
	PWM_LIST_EDIT_FIELD = 7,
	PWM_PROPERTY_SELECTED = 8,
	PWM_PROPERTY_INVOKED = 9,
	PWM_EVENT_SELECTED = 10,
	PWM_EVENT_INVOKED = 11,
	PWM_PICK = 12 // "prop" (pointer to TProperty), "caption" (string)
};

/// Does what UpdateDisplayValues() does, for who cannot know whether the window still exists.
enum { PWM_REFRESH = 'rfsh' };

/// The one window that shows and edits the selected component.
///
/// It owns neither the component nor its properties, and reads and writes them with the window of the design
/// view locked and its own lock given up meanwhile. Reach it through a WindowGuard; only UpdateDisplayValues()
/// needs none. Who destroys a component that is shown makes the window show another one, or none, before.
class PropertyWin : public BWindow {
public:
	PropertyWin();
	virtual ~PropertyWin();

	// BWindow
	bool QuitRequested() override;
	void MessageReceived(BMessage* message) override;

	virtual void MouseDown(BPoint where);

	/// Lets the window really close from now on.
	virtual void OKToClose(bool closing);

	/// Fill the pages, or empty them for null. SetComponent() does that when the component changes.
	virtual void LoadPropsFor(TComponent* component);
	virtual void LoadEventsFor(TComponent* component);

	/// Shows \a component, which may be null. Nothing happens when it is shown already.
	virtual void SetComponent(TComponent* component);
	virtual TComponent* Component();

	/// Shows the values as they are now, soon, and at most once a frame: calls until then cost nothing more. Any
	/// thread, no lock needed.
	virtual void UpdateDisplayValues();

	/// Whether the values are shown as they were when UpdateDisplayValues() or PWM_REFRESH was handled last: not while
	/// that waits for the next frame. The window is locked.
	bool ShowsLatestValues() const { return fDelayedRefresh == nullptr; }

	/// Destroys \a editors in the window's own thread, after the message that it is handling, with which it may still
	/// be about to use one. Any thread, no lock needed.
	void Bury(std::unique_ptr<TForgottenEditors> editors);

	/// The view whose window is locked around edits: that of the form that the component lives on, or null.
	virtual void SetDesignView(BView* view);

	BView* DesignView() const { return fDesignView; }

	/// Empties both lists.
	void ClearWindow();

	void InitControls();

	/// Fills the editor pane of that type.
	void InitEditorFor(TPropEditType type);

	/// Shows the pane of \a type for \a property, whose \a editor may be null. \a focus: the pane's control gets
	/// the keyboard focus.
	void SelectEditorFor(
		TProperty* property, TPropertyEditor* editor, TPropEditType type, bool focus);

	/// The same with focus, as for a double click: opens what the editor opens, and flips a boolean.
	void InvokeEditorFor(TProperty* property, TPropertyEditor* editor, TPropEditType type);

private:
	void PlaceWindow();
	void ShowRows(TComponentRows* rows);
	TPropertyEditor* CurrentEditor() const;
	TPropertyEditor* TakeSelectedProperty();
	bool ShowEditor(const TPropertyWatch& property, TPropertyEditor* editor, TPropEditType type,
		BLooper* lock, bool focus);
	void InvokeShownEditor(TPropertyEditor* editor, TPropEditType type);
	bool SetCurrentValue(const char* value, bool lockNeeded);
	bool TakeBackText();
	void EditModally();
	void FlipEvent();
	void RefreshInThisFrame();
	void RefreshDisplay();
	void UpdateRows();

	TabView* fTabView;
	TPropView* fPropView;
	TEventView* fEventView;
	TEditorPanes* fPanes;
	TComponent* fComponent;
	BLooper* fRowsLock; // that of the window of the form that the rows were read from
	TPropertyWatch fProperty;
	// Of the current property. An editor is destroyed in this window's thread only (Bury()), and its property before
	// it, so as long as the property was there in this message, this one may be asked for its type.
	TPropertyEditor* fEditor;
	BLooper* fPropertyLock;
	uint32 fPropertyCount; // what fShownCount was when the property became the current one
	BView* fDesignView;
	BLooper* fDesignWindow;
	bool fClosing;
	// How often another component was shown. The one counted last is not destroyed before this changes.
	std::atomic<uint32> fShownCount;
	std::atomic<bool> fRefreshWaits;
	bigtime_t fNextRefresh; // the end of the frame that was refreshed last
	std::unique_ptr<BMessageRunner> fDelayedRefresh;
};
