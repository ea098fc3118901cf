// SPDX-License-Identifier: MIT
// The surface of a design form, on which its components lie.

#pragma once

#include <memory>

#include <View.h>

#include "designer/FileStamp.h"
#include "model/FormComponent.h"
#include "model/FormDesigner.h"

class BFilePanel;
class BMenu;
class BPopUpMenu;
class TDesignForm;
class TForgottenEditors;
class TLoadReport;
class TPaletteEntry;

/// What came of saving a form.
enum form_save_result { FORM_SAVED, FORM_NOT_SAVED, FORM_SAVE_CANCELED };

/// The view that fills a design form: it owns the form's components, which are its child views.
///
/// As a TFormDesigner it is what palette entries and components talk to, and its component list is the
/// list of every component of the form, those inside other components included. Lock the design form's
/// window for everything that is not said to lock by itself.
class TDesignFormView : public BView, public TFormComponent, public TFormDesigner {
public:
	/// \a frame: the bounds of \a form, which adds the view to itself.
	TDesignFormView(BRect frame, TDesignForm* form);
	/// Destroys the components.
	virtual ~TDesignFormView();

	// BView
	void Draw(BRect updateRect) override;
	/// Places the waiting palette entry's component, selects the form, or opens the form's menu.
	void MouseDown(BPoint where) override;
	/// Prints the key: the surface has no keyboard commands but the window's shortcuts.
	void KeyDown(const char* bytes, int32 numBytes) override;
	void MessageReceived(BMessage* message) override;

	// TComponent
	/// A new value of "Name" becomes the form's name. Always true.
	bool PropertyModified(const char* name, const char* oldValue, const char* newValue) override;
	/// Clearing it clears the flag of every component, too.
	void SetModified(bool modified) override;
	/// True when this view or one of the components was changed.
	bool Modified() const override;

	// TComponentOwner
	/// Marks the form modified. Always true.
	bool ComponentPropertyModified(TComponent* component, const char* name, const char* oldValue,
		const char* newValue) override;

	// TFormDesigner
	bool IsDropWaiting() override;
	/// Makes a component of the waiting palette entry in \a parent, names it and adds it to the form.
	///
	/// \a frame: in \a parent's coordinates. Returns none when no entry waits or it makes none.
	TComponent* CreateComponent(BView* parent, BRect frame) override;
	void DoneDroppingComponent() override;
	bool AdoptComponent(TComponent* component) override;
	void ComponentModified(TComponent* component) override;
	/// Makes \a component the only selected one, and shows it in the property window.
	void ComponentSelected(TComponent* component) override;
	/// Shows the new place of \a component in the property window, if that shows it.
	void ComponentMoved(TComponent* component, BPoint point) override;
	using TFormDesigner::DeselectComponents;

	/// Whether \a component is one of this form's, at any depth; it may be gone.
	bool Lists(const TComponent* component) const;

	/// Selects the form's component, or not. The frame that marks it is drawn anew when that changes.
	void MarkForm(bool selected);

	/// Deselects every form of the project. Locks each in turn; this window's lock is given up meanwhile.
	void DeselectForms();

	/// Fill the two menus anew.
	void InitComponentMenu();
	void InitFormMenu();

	/// Writes \a component's class, frame, properties and events into \a message, for the clipboard.
	void StoreComponent(TComponent* component, BMessage* message);

	/// Makes a component from a flattened record of StoreComponent(), at the pointer, under a new name.
	///
	/// Null, with nothing changed, when the record is damaged or no component library offers its class.
	TComponent* RetrieveComponent(const void* record, ssize_t size);

	/// A command of a component's menu, on the component that the property window shows.
	///
	/// True when it was finished here; false for those that the component may answer too.
	bool HandleComponentCommand(BMessage* message);

	/// Writes the form to \a path, which becomes its file. Locks the window where it reads views.
	///
	/// False, with nothing changed, when the file cannot be written.
	bool SaveToFile(const char* path);

	/// Reads the form from \a path, which becomes its file. Locks the window step by step.
	///
	/// What cannot be used is left out, reported on standard output and added to \a report. False, with
	/// nothing changed, when the file cannot be read.
	bool LoadFromFile(const char* path, TLoadReport* report = nullptr);

	/// Saves, unless somebody else has changed the file since it was loaded or saved here and the user does not want
	/// that overwritten. The window's lock is given up while the user is asked.
	form_save_result SaveAfterAsking(const char* path);

	/// Writes a recovery copy of the form, if it was changed. It is written by another thread, a little later.
	void KeepCopy();
	/// The same, if one is due.
	void KeepDueCopy();

	/// Removes the recovery copy: the user does not want what was changed.
	void ForgetCopy();

	/// Reads the form from a recovery copy (TRecovery), as a changed one. \a id: the copy's number; see
	/// TRecovery::TakeOver(). False, with nothing changed, when it holds no form.
	bool LoadCopy(const BMessage& copy, int32 id);

	/// The form's file; empty when it was never saved. At most 255 bytes are kept.
	const char* Filename() const { return fFilename; }
	void SetFilename(const char* name);

	/// Notes the editors of \a component, which is about to be destroyed; they follow when the view is destroyed.
	void NoteEditors(const TComponent* component);

	TDesignForm* DesignWindow() const { return fForm; }

	/// Whether the generated application opens this form first.
	bool IsMainForm() const { return fIsMainForm; }
	void SetAsMainForm(bool isMainForm) { fIsMainForm = isMainForm; }

private:
	// Placing, selecting and moving with the mouse
	void PlaceComponent(BPoint where);
	void NameComponent(TComponent* component, BRect frame);
	void SelectNew(TComponent* component);
	void SelectForm();
	void MoveComponent(BMessage* message);
	void ResizeComponent(BMessage* message);
	void TakeFromContainer(TComponent* component);
	TComponent* FindComponent(const BMessage* message, bool* dropped, BPoint* corner) const;

	// Commands
	void OpenFormMenu(BPoint where);
	void OpenComponentMenu(BMessage* message);
	void Paste();
	void SaveToItsFile();
	void SaveAsChosen(BMessage* message);
	void SaveOrWarn(const char* path);
	void LoadTestForm();
	void LayOutAfresh();
	void DeleteAllComponents();
	bool DeleteComponent(TComponent* component);
	void MoveChildrenUp(TComponent* component, BView* parent);
	bool CopyComponent(TComponent* component);

	// The document and its recovery copy
	bool IsChangedOnDisk(const char* path) const;
	void WantCopy();

	std::unique_ptr<BPopUpMenu> fComponentMenu;
	std::unique_ptr<BPopUpMenu> fFormMenu;
	std::unique_ptr<BFilePanel> fSavePanel;
	TDesignForm* fForm;
	char fFilename[256];
	std::unique_ptr<TForgottenEditors> fEditors; // of those that are destroyed with the form
	// What the file held when it was loaded or saved, and whether components of it were left out.
	TFileStamp fStamp;
	bool fIsIncomplete;
	int32 fCopyId; // 0: there is no recovery copy
	bool fCopyIsDue;
	bool fModified;
	bool fIsMainForm;
};
