// SPDX-License-Identifier: MIT
// The base of everything that can be designed: what stands on a form, the form, the application.

#pragma once

#include <atomic>

#include <List.h>

class BMenuItem;
class BMessage;
class BPoint;
class BPopUpMenu;
class BRect;
class BString;
class BView;
class TComponentOwner;
class TFormDesigner;
class TProperty;
class TPropertyEditor;
class TPropertyStore;
struct TEvent;

/// What a component stands for. Libraries may have values of their own.
enum TComponentType : int32 {
	CT_VISUAL = 0, ///< a view, a control or a form
	CT_APPLICATION = 1
};

/// Stored for component libraries; the system does not interpret it.
enum TComponentMode : int32 { CM_DESIGN = 1 };

/// A component: its properties and events as text, its place in the tree of owners, the view that shows
/// it at design time, and the hooks by which a component library gives it behaviour.
///
/// It owns its properties, its events and its property store, but neither the editors of its properties
/// nor its view. Component libraries derive from it: the order of the fields and of the virtual
/// operations is a binary interface, and new operations go to the end. Use it in the thread of the form
/// that it lives on; operations that touch the view lock its window where they say so.
class TComponent {
public:
	/// Neither \a owner nor \a designer is told; both may be null. The names and the lists are empty:
	/// each concrete class calls its own InitPropertyList() and InitEventList().
	TComponent(TComponentOwner* owner, TFormDesigner* designer, TComponentType type);
	virtual ~TComponent();
	TComponent(const TComponent&) = delete;
	TComponent& operator=(const TComponent&) = delete;

	/// The name that the user sees, and of the member in generated source: at most 1023 bytes, longer
	/// names are cut. Null is ignored.
	virtual void SetComponentName(const char* name);
	virtual const char* ComponentName() const;

	virtual void SetComponentType(TComponentType type);
	virtual TComponentType ComponentType() const;

	/// What lists this component as its child, or null. The owner's AddComponent() sets it.
	virtual void SetOwner(TComponentOwner* owner);
	virtual TComponentOwner* Owner() const;

	virtual void SetComponentMode(TComponentMode mode);
	virtual TComponentMode ComponentMode() const;

	/// The form that the component lives on, or null.
	virtual void SetDesigner(TFormDesigner* designer);
	virtual TFormDesigner* Designer() const;

	/// A plain flag: it neither redraws nor deselects another component.
	virtual void DesignerSelect(bool selected);
	virtual bool IsDesignerSelected() const;

	/// Changed since it was last saved.
	virtual void SetModified(bool modified);
	virtual bool Modified() const;

	/// Asked before the value of a property changes; false keeps the old one. \a newValue may be null.
	/// True here.
	virtual bool PropertyModified(const char* name, const char* oldValue, const char* newValue);

	/// Draws the frame and the resize handle over a selected component's view. Locks the window.
	virtual void DesignerDrawSelection();

	/// Adds the component's own items to its context menu; a chosen item's message comes to
	/// HandleComponentContextMessage(), which returns whether it handled it.
	virtual void AddComponentContextMenuItems(BPopUpMenu* menu);
	virtual bool HandleComponentContextMessage(BMessage* message);

	/// A double click at \a where, in the view's coordinates. False here.
	virtual bool DefaultEditAction(BPoint where);

	/// Offers a message that reached the component's view. True when it was handled here: a
	/// DTM_COMPONENT_MOVE, which takes the dragged component into this one's view.
	virtual bool HandleComponentDesignMessage(BMessage* message);

	virtual bool CanDropOnDesignerAt(BPoint point);
	virtual void DroppedOnFormDesigner(BRect frame);
	virtual void SelectedInFormDesigner();
	virtual void InvokedInFormDesigner();
	virtual void PopupMenuInvokedInFormDesigner(BPopUpMenu* menu);
	virtual void MenuItemSelectedInFormDesigner(BMenuItem* item);
	virtual void DeletedFromFormDesigner();

	virtual void AddedToPalette();
	virtual void PopupMenuInvokedInPalette(BPopUpMenu* menu);
	virtual void MenuItemSelectedInPalette(BMenuItem* item);
	virtual void DeletedFromPalette();

	/// A mouse press in the component's view: selects the component and then edits, creates a child,
	/// opens the context menu, resizes or drags. \a where and \a frame (the component's) are in the
	/// coordinates of \a view, the design-time view. Only inside the view's MouseDown().
	virtual void DesignerMouseDown(BPoint where, BRect frame, BView* view);

	/// Moves a view's left-top corner to \a point, in its parent's coordinates. The second form takes
	/// the design-time view and locks its window; without a view or a lock nothing happens.
	virtual void MoveComponentTo(BView* view, BPoint point);
	virtual void MoveComponentTo(BPoint point);

	/// Gives a view the width and height of \a frame (right minus left, bottom minus top). The second
	/// form takes the design-time view. Neither locks.
	virtual void ResizeComponentTo(BView* view, BRect frame);
	virtual void ResizeComponentTo(BRect frame);

	/// The current value of the property, or null when none has been stored. Valid until a property of
	/// this component changes.
	virtual const char* GetPropertyValue(const char* name);

	/// Applies the value to the design-time view and stores it. Nothing happens when either is null.
	virtual void SetPropertyValue(const char* name, const char* value);

	/// Whether the user wants a handler for the event; false when there is no such event.
	virtual bool EventSelection(const char* name);
	virtual void SetEventSelection(const char* name, bool selected);

	/// Empties the list, deleting what it holds, and builds it anew with the default values.
	virtual void InitPropertyList();
	virtual void InitEventList();

	/// Hands the current value of every property to its editor.
	virtual void InitPropertyValues();
	virtual void InitEventValues();

	/// Called with the component's record when the form is saved and loaded.
	virtual void WriteExtendedComponentDataTo(BMessage* message);
	virtual void ReadExtendedComponentDataFrom(const BMessage* message);

	/// The header that generated source needs for this component, or null.
	virtual const char* HeaderFile();

	/// Code generation: each hook appends to \a text. False stands for the standard text.
	virtual bool OnGenConstructorCall(BString& text);
	virtual void OnSetConstructorParams(BString& text);
	virtual bool OnGenHeaderFileTop(BString& text);
	virtual bool OnGenInitForm(BString& text);
	virtual bool OnGenDestroyForm(BString& text);

	virtual void AddProperty(TProperty* property);

	/// Appends the property after linking it with its editor, which is not owned. Statements that are
	/// null are left as they are. Without \a editor the property is appended and nothing else happens.
	virtual void AddPropAndEditor(TProperty* property, TPropertyEditor* editor,
		const char* setStatement, const char* getStatement, bool quoted);

	/// Takes the entry out of the list without deleting it. False, or null, when it is not there.
	virtual bool RemoveProperty(TProperty* property);
	virtual TProperty* RemoveProperty(int32 index);

	/// Empties the list; with \a deleteProperties deletes them first, in list order up to the first
	/// empty entry.
	virtual void ClearProperties(bool deleteProperties);

	virtual void AddEvent(TEvent* event);
	virtual bool RemoveEvent(TEvent* event);
	virtual TEvent* RemoveEvent(int32 index);
	virtual void ClearEvents(bool deleteEvents);

	/// The class that generated source names for this component: at most 31 bytes. Null is ignored.
	void SetClassName(const char* name);
	const char* ClassName() const { return fClassName; }

	TPropertyStore* PropertyStore() const
	{
		if (fStoreIsLate.load(std::memory_order_acquire))
			FillStore();
		return fPropertyStore;
	}

	/// The view that shows the component on the design surface, or null.
	BView* DTView() const { return fDTView; }
	void SetDTView(BView* view) { fDTView = view; }

	int32 CountProperties() const;

	/// Null when \a index is out of range.
	TProperty* PropertyAt(int32 index) const;

	/// The first property of exactly that name, or null.
	TProperty* FindProperty(const char* name) const;

	int32 CountEvents() const;
	TEvent* EventAt(int32 index) const;
	TEvent* FindEvent(const char* name) const;

	/// Puts \a value into the property and into the store. A change is asked of PropertyModified(),
	/// which may refuse it, and of the owner, whose refusal only keeps the component from being marked
	/// modified. Without such a property the store alone takes the value, without questions.
	void StoreProperty(const char* name, const char* value);

private:
	void FillStore() const;
	void KeepStored();
	bool IsOnSameForm(const TComponent* component) const;
	void TakeIn(TComponent* component);
	void SelectAlone();
	void CreateChild(TComponentOwner* container, BPoint where, BView* view);
	void AskForContextMenu(BPoint where, BView* view);
	void ResizeByMouse(BRect frame, BView* view);

	static const size_t kComponentNameSize = 1024;
	static const size_t kShortNameSize = 40;
	static const size_t kClassNameSize = 32;

	char fShortName[kShortNameSize];
	// Room for the longest name, once there was one that is not short.
	char* fLongName;
	char fClassName[kClassNameSize];
	TComponentOwner* fOwner;
	TFormDesigner* fDesigner;
	TComponentType fComponentType;
	BList* fProperties;
	BList* fEvents;
	TComponentMode fComponentMode;
	bool fModified;
	// Nobody has asked for the store yet: the properties alone keep what is stored. Where the alignment left a gap.
	mutable std::atomic<bool> fStoreIsLate;
	TPropertyStore* fPropertyStore;
	bool fDesignerSelected;
	// The property that was stored last since; that one leads to the first. Null for none.
	mutable TProperty* fLastStored;
	BView* fDTView;
};

/// Finds a name for a new component: its present name followed by the first number, from 1 on, that
/// gives a name which no component of \a owner has.
///
/// \a buffer: at most \a size bytes are written, with the terminator. False, nothing written, without a
/// component or a buffer.
bool GetNewComponentName(
	const TComponent* component, const TComponentOwner* owner, char* buffer, int32 size);

/// The plain name of the component's C++ class, for diagnostics.
BString ClassTypeName(const TComponent* component);
