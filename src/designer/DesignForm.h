// SPDX-License-Identifier: MIT
// The window in which the user lays out one form.

#pragma once

#include <Window.h>

#include "model/FormComponent.h"
#include "model/FormDesigner.h"

class TDesignFormView;
class TFormHost;
class TLoadReport;

enum {
	DFM_LOADFILE = 'f_lF', // "filename" (string); reply: "result" (bool), "formname" (string)
	DFM_SAVEFILE =
		'f_sF', // reply: "result" (bool), "canceled" (bool) when the user did not want to overwrite
	DFM_LOADCOPY =
		'f_lC', // "copy" (message), "id" (int32): see TDesignFormView::LoadCopy(); replies as DFM_LOADFILE
	DFM_KEEPCOPY = 'f_kC' // a recovery copy is due
};

/// Whether a design form's window appears. A hidden one is a document without a window thread, for
/// programs that only load, save and generate.
enum form_visibility { FORM_SHOWN, FORM_HIDDEN };

/// A form being designed: a window, the form's own component, and the designer of its components.
///
/// Its component list is the design view's. Closing the window hides it until OKToClose(true). Lock
/// the window unless an operation says that it locks by itself; a hidden form is locked by the thread
/// that made it.
class TDesignForm : public BWindow, public TFormComponent, public TFormDesigner {
public:
	/// \a name: the form's name and first title; null leaves both empty. \a host: the project that the form
	/// belongs to and that lives longer; may be null.
	explicit TDesignForm(
		const char* name, form_visibility visibility = FORM_SHOWN, TFormHost* host = nullptr);
	virtual ~TDesignForm();

	// BWindow
	/// Also points the property window at the form.
	void Show() override;
	void Hide() override;
	void MessageReceived(BMessage* message) override;
	bool QuitRequested() override;
	void WindowActivated(bool active) override;
	void FrameMoved(BPoint origin) override;
	void FrameResized(float width, float height) override;

	// TComponent
	const char* GetPropertyValue(const char* name) override;
	/// Applies the value to the window or its view and stores it. Locks the window.
	///
	/// Nothing is stored when the window cannot be locked. Edges are base-10 integers in screen
	/// coordinates; text that is no number counts as 0.
	void SetPropertyValue(const char* name, const char* value) override;
	bool PropertyModified(const char* name, const char* oldValue, const char* newValue) override;
	bool Modified() const override;
	void SetModified(bool modified) override;
	/// A command of a component's menu; see TDesignFormView::HandleComponentCommand().
	bool HandleComponentContextMessage(BMessage* message) override;

	// TComponentOwner, all forwarded to the design view
	bool ComponentPropertyModified(TComponent* component, const char* name, const char* oldValue,
		const char* newValue) override;
	int32 CountComponents() const override;
	TComponent* ComponentAt(int32 index) const override;
	void AddComponent(TComponent* component) override;
	bool RemoveComponent(TComponent* component) override;
	TComponent* RemoveComponent(int32 index) override;
	void ClearComponents(bool deleteComponents) override;

	// TFormDesigner
	/// Points the property window at the form, or away from it and its components.
	void DesignFormShown(bool shown) override;
	/// Selects the form itself and no component, here and in the project's other forms; selects nothing when the
	/// window is no longer active.
	void DesignFormActivated(bool active) override;

	// TFormDesigner, forwarded to the design view
	void ComponentSelected(TComponent* component) override;
	void ComponentMoved(TComponent* component, BPoint point) override;
	bool IsDropWaiting() override;
	TComponent* CreateComponent(BView* parent, BRect frame) override;
	void DoneDroppingComponent() override;
	bool AdoptComponent(TComponent* component) override;
	void ComponentModified(TComponent* component) override;

	/// A press beside the components: points the property window at the form.
	virtual void MouseDown(BPoint where);

	/// Lets the window really close from now on. A recovery copy that is due is made.
	void OKToClose(bool closing);

	/// Writes the window's edges, rounded, into the editors of "Left", "Top", "Right" and "Bottom".
	void UpdateWindowPosition();

	/// The same for \a component and \a frame, in its parent's coordinates. Marks the form modified if that is new.
	void UpdateComponentPosition(TComponent* component, BRect frame);

	// Forwarded to the design view
	const char* Filename() const;
	void SetFilename(const char* name);
	bool SaveToFile(const char* path);
	bool LoadFromFile(const char* path, TLoadReport* report = nullptr);
	bool IsMainForm() const;
	void SetAsMainForm(bool isMainForm);

	TDesignFormView* View() const { return fDesignView; }

	/// The project that the form belongs to; null when it belongs to none.
	TFormHost* Host() const { return fHost; }

private:
	void InitControls();
	bool WriteFrame(TComponent* component, BRect frame);
	void FollowWindow();
	void SelectInForm(bool formSelected);
	void ShowInInspector();
	bool ApplyEdge(const char* name, const char* value);
	bool ApplyColor(const char* name, const char* value);
	void ReplyToLoad(BMessage* message);
	void ReplyToSave(BMessage* message);
	void ReplyToLoadCopy(BMessage* message);
	void ReplyToLoad(BMessage* message, bool loaded);

	TFormHost* fHost;
	TDesignFormView* fDesignView;
	bool fClosing;
};
