// SPDX-License-Identifier: MIT
// The inspector: the properties and events of the selected component.

#include "props/PropertyWin.h"

#include <cstdio>
#include <memory>

#include <ListView.h>
#include <MessageRunner.h>
#include <OS.h>
#include <Screen.h>
#include <TextControl.h>

#include "app/WindowFrame.h"
#include "app/WindowGuard.h"
#include "model/Component.h"
#include "model/Event.h"
#include "model/Property.h"
#include "props/ComponentRows.h"
#include "props/EditorPanes.h"
#include "props/EscapeFilter.h"
#include "props/EventListItem.h"
#include "props/EventView.h"
#include "props/ForgottenEditors.h"
#include "props/PickListProperty.h"
#include "props/PropView.h"
#include "props/PropertyListItem.h"
#include "props/TabView.h"

namespace {

const BRect kFirstFrame(100, 100, 300, 500);
const BPoint kPlaceOnScreen(30, 150);
constexpr float kWidth = 200;
constexpr float kHeight = 300;
constexpr const char* kFrameSetting = "PropertyWinFrame";

constexpr uint32 kMsgBury = 'bury';     // "editors" (pointer): the receiver's
constexpr bigtime_t kFrameTime = 16000; // microseconds

template <typename Row>
Row*
SelectedRow(const BListView* list)
{
	return dynamic_cast<Row*>(list->ItemAt(list->CurrentSelection()));
}

} // namespace

PropertyWin::PropertyWin()
	: BWindow(kFirstFrame, "Properties", B_TITLED_WINDOW, B_NOT_ZOOMABLE),
	  fTabView(nullptr),
	  fPropView(nullptr),
	  fEventView(nullptr),
	  fPanes(nullptr),
	  fComponent(nullptr),
	  fRowsLock(nullptr),
	  fEditor(nullptr),
	  fPropertyLock(nullptr),
	  fPropertyCount(0),
	  fDesignView(nullptr),
	  fDesignWindow(nullptr),
	  fClosing(false),
	  fShownCount(0),
	  fRefreshWaits(false),
	  fNextRefresh(0)
{
	PlaceWindow();
	InitControls();
}


PropertyWin::~PropertyWin()
{
	delete fPanes;
}


bool
PropertyWin::QuitRequested()
{
	if (!fClosing) {
		Hide();
		return false;
	}
	StoreWindowFrame(this, kFrameSetting);
	return true;
}


void
PropertyWin::MessageReceived(BMessage* message)
{
	if (message->what == PWM_REFRESH) {
		RefreshInThisFrame();
		return;
	}
	if (message->what == kMsgBury) {
		void* editors;
		if (message->FindPointer("editors", &editors) == B_OK)
			delete static_cast<TForgottenEditors*>(editors);
		return;
	}

	message->PrintToStream();
	switch (message->what) {
		case PWM_PROPERTY_SELECTED:
		{
			TPropertyEditor* editor = TakeSelectedProperty();
			if (editor != nullptr)
				ShowEditor(fProperty, editor, editor->Type(), fPropertyLock, false);
			break;
		}

		case PWM_PROPERTY_INVOKED:
		{
			TPropertyEditor* editor = TakeSelectedProperty();
			if (editor != nullptr
				&& ShowEditor(fProperty, editor, editor->Type(), fPropertyLock, true))
				InvokeShownEditor(editor, editor->Type());
			break;
		}

		case PWM_STRING_EDIT:
		{
			// A copy: the field may show something else while the lock is given up.
			const BString text(fPanes->StringText());
			if (CurrentEditor() != nullptr && !SetCurrentValue(text.String(), true))
				printf("Unable to lock the design view\n");
			UpdateRows();
			break;
		}

		case PWM_PICK:
		{
			const char* caption;
			if (message->FindString("caption", &caption) == B_OK && CurrentEditor() != nullptr)
				SetCurrentValue(caption, false);
			UpdateRows();
			break;
		}

		case PWM_MODAL_EDIT_BUTTON:
			EditModally();
			break;

		case PWM_MODAL_EDIT_FIELD:
		case PWM_LIST_EDIT_FIELD:
			UpdateRows();
			break;

		case PWM_LIST_EDIT_BUTTON:
		case PWM_EVENT_SELECTED:
			break;

		case PWM_EVENT_INVOKED:
			FlipEvent();
			break;

		case B_SIMPLE_DATA:
			// Dropped files are not taken.
			if (!message->HasRef("refs"))
				BWindow::MessageReceived(message);
			break;

		default:
			BWindow::MessageReceived(message);
			break;
	}
}


void
PropertyWin::MouseDown(BPoint)
{
}


void
PropertyWin::OKToClose(bool closing)
{
	fClosing = closing;
}


void
PropertyWin::LoadPropsFor(TComponent* component)
{
	TComponentRows rows;
	if (component == nullptr || rows.Read(component, fDesignWindow, fShownCount))
		fPropView->SetRows(&rows);
}


void
PropertyWin::LoadEventsFor(TComponent* component)
{
	TComponentRows rows;
	if (component == nullptr || rows.Read(component, fDesignWindow, fShownCount))
		fEventView->SetRows(&rows);
}


void
PropertyWin::SetComponent(TComponent* component)
{
	if (component == fComponent)
		return;

	// While the component is read, another thread may show another one here, and destroy the one before:
	// no row of that may be left, and both pages change at once.
	fComponent = component;
	const uint32 count = ++fShownCount;
	ClearWindow();
	if (component == nullptr) {
		fProperty.SetTo(nullptr);
		return;
	}
	TComponentRows rows;
	if (rows.Read(component, fDesignWindow, fShownCount) && fShownCount == count)
		ShowRows(&rows);
}


TComponent*
PropertyWin::Component()
{
	return fComponent;
}


void
PropertyWin::UpdateDisplayValues()
{
	if (!fRefreshWaits.exchange(true) && PostMessage(PWM_REFRESH) != B_OK)
		fRefreshWaits = false;
}


void
PropertyWin::Bury(std::unique_ptr<TForgottenEditors> editors)
{
	BMessage message(kMsgBury);
	message.AddPointer("editors", editors.get());
	if (PostMessage(&message) != B_OK)
		editors->Spare();
	else
		static_cast<void>(editors.release());
}


void
PropertyWin::SetDesignView(BView* view)
{
	fDesignView = view;
	fDesignWindow = view != nullptr ? view->Looper() : nullptr;
}


void
PropertyWin::ClearWindow()
{
	fPropView->ClearItems();
	fEventView->ClearItems();
}


void
PropertyWin::InitControls()
{
	const char* labels[] = {"Properties", "Events"};
	fTabView = new TabView(Bounds(), "tabView", labels, 2, B_FOLLOW_ALL_SIDES,
		B_WILL_DRAW | B_NAVIGABLE, be_plain_font);
	fPropView = new TPropView(fTabView->GetContentArea());
	fEventView = new TEventView(fTabView->GetContentArea());
	BView* pages[] = {fPropView, fEventView};
	fTabView->AddViews(pages);

	fPanes = new TEditorPanes(fPropView, fPropView->PaneFrame());
	for (int32 type = PET_STRING; type <= PET_NONE; type++)
		InitEditorFor(static_cast<TPropEditType>(type));
	AddChild(fTabView);
	AddCommonFilter(new TEscapeFilter([this] { return TakeBackText(); }));
}


void
PropertyWin::InitEditorFor(TPropEditType type)
{
	fPanes->InitEditorFor(type);
}


void
PropertyWin::SelectEditorFor(
	TProperty* property, TPropertyEditor* editor, TPropEditType type, bool focus)
{
	ShowEditor(TPropertyWatch(property), editor, type, fDesignWindow, focus);
}


void
PropertyWin::InvokeEditorFor(TProperty* property, TPropertyEditor* editor, TPropEditType type)
{
	if (ShowEditor(TPropertyWatch(property), editor, type, fDesignWindow, true))
		InvokeShownEditor(editor, type);
}


void
PropertyWin::PlaceWindow()
{
	const BRect screen = BScreen(this).Frame();
	const BPoint place = screen.LeftTop() + kPlaceOnScreen;
	if (screen.Contains(place)) {
		MoveTo(place);
		ResizeTo(kWidth, kHeight);
	}
	RestoreWindowFrame(this, kFrameSetting);
}


/// Fills both pages.
void
PropertyWin::ShowRows(TComponentRows* rows)
{
	fRowsLock = rows->lock;
	fPropView->SetRows(rows);
	fEventView->SetRows(rows);
}


/// The editor of the current property; none without one. Only the lock of the property's form keeps the property.
TPropertyEditor*
PropertyWin::CurrentEditor() const
{
	return fProperty.Property() != nullptr ? fEditor : nullptr;
}


/// Makes the property of the selected row the current one and returns its editor, if any.
TPropertyEditor*
PropertyWin::TakeSelectedProperty()
{
	const TPropertyListItem* row = SelectedRow<TPropertyListItem>(fPropView->List());
	if (row == nullptr)
		return nullptr;
	row->GetProperty(&fProperty, &fEditor);
	fPropertyLock = fRowsLock;
	fPropertyCount = fShownCount;
	return CurrentEditor();
}


/// Shows the pane of \a type, filled with \a lock locked and the own lock given up.
///
/// The pane stays as it is, and the result is false, when the property is gone by then, or another component shown.
bool
PropertyWin::ShowEditor(const TPropertyWatch& property, TPropertyEditor* editor, TPropEditType type,
	BLooper* lock, bool focus)
{
	TPropertyWatch watch;
	watch.SetTo(property);
	if (watch.Property() == nullptr)
		return false; // and its form may be gone, too
	const uint32 count = fShownCount;
	std::unique_ptr<TEditorState> state;
	{
		WindowGuard guard(lock);
		TProperty* locked = watch.Property();
		if (locked != nullptr && fShownCount == count)
			state = std::make_unique<TEditorState>(locked, editor, type);
	}
	if (state == nullptr || fShownCount != count)
		return false;
	if (fPanes->Show(type, *state))
		fPropView->List()->MakeFocus(true);
	if (focus)
		fPanes->Focus();
	return true;
}


/// What a double click does beside showing the editor.
void
PropertyWin::InvokeShownEditor(TPropertyEditor* editor, TPropEditType type)
{
	if (type == PET_MODAL || type == PET_LIST)
		fPanes->PressButton();
	else if (type == PET_PICKLIST && dynamic_cast<TBoolProperty*>(editor) != nullptr)
		fPanes->FlipPick();
}


/// Hands \a value to the current property's editor with the lock of the property's form.
///
/// The property must still be there once the lock is. Without a design view to lock, the result is false and
/// nothing changes when \a lockNeeded.
bool
PropertyWin::SetCurrentValue(const char* value, bool lockNeeded)
{
	// Copies: another property may become the current one while the own lock is given up.
	TPropertyEditor* editor = fEditor;
	TPropertyWatch property;
	property.SetTo(fProperty);
	BView* designView = fDesignView;
	BLooper* designWindow = fDesignWindow;
	BLooper* propertyLock = fPropertyLock != nullptr ? fPropertyLock : designWindow;
	if (lockNeeded) {
		WindowGuard guard(designWindow);
		if (!guard.IsLocked())
			return false;
		if (propertyLock == designWindow) {
			if (property.Property() != nullptr)
				editor->SetValue(value, true);
			designView->Invalidate();
			return true;
		}
	}

	// The property's component was shown before the one on the design view, or needs no design view. Its form may be
	// gone with it.
	if (property.Property() == nullptr)
		return true;
	WindowGuard guard(propertyLock);
	if (property.Property() != nullptr)
		editor->SetValue(value, true);
	return true;
}


/// Shows the property's value in place of what was typed. Where nothing was, the list gets the keyboard focus back.
///
/// False when no text is being typed. It is done before the next key arrives, which belongs to the text shown then.
bool
PropertyWin::TakeBackText()
{
	const BTextControl* field = fPanes->FocusedField();
	if (field == nullptr)
		return false;
	const BString typed(field->Text());
	TPropertyEditor* editor = CurrentEditor();
	if (editor != nullptr)
		ShowEditor(fProperty, editor, editor->Type(), fPropertyLock, false);
	// Another property may be shown by now, and its editor have no field.
	if (fPanes->FocusedField() == field && typed == field->Text())
		fPropView->List()->MakeFocus(true);
	return true;
}


void
PropertyWin::EditModally()
{
	TPropertyEditor* editor = CurrentEditor();
	if (editor == nullptr)
		return;
	// A component that is shown stays. One that is not any more needs the lock of its form for that.
	const bool isShown = fShownCount == fPropertyCount;
	bool edited;
	BString text;
	{
		WindowGuard guard(isShown ? nullptr : fPropertyLock);
		if (fProperty.Property() == nullptr)
			return;
		edited = editor->ModalEdit();
		if (edited)
			text = editor->GetDisplayValue();
	}
	// The current property may be another one by now.
	if (edited && CurrentEditor() == editor)
		fPanes->SetModalText(text.String());
}


/// Asks for a handler of the selected event, or takes that back.
void
PropertyWin::FlipEvent()
{
	const TEventListItem* row = SelectedRow<TEventListItem>(fEventView->List());
	if (row == nullptr || row->Event() == nullptr || fComponent == nullptr)
		return;
	const uint32 count = fShownCount;
	TComponent* component = fComponent;
	const char* name = row->Name();
	{
		const BView* view = component->DTView();
		WindowGuard guard(view != nullptr ? view->Looper() : fDesignWindow);
		TEvent* event = fShownCount == count ? component->FindEvent(name) : nullptr;
		if (event != nullptr) {
			event->selected = !event->selected;
			component->SetModified(true);
		}
	}
	UpdateRows();
}


/// Refreshes now, or at the end of the frame in which it was done already. The last refresh asked for is always done.
void
PropertyWin::RefreshInThisFrame()
{
	const bigtime_t now = system_time();
	if (now < fNextRefresh && fDelayedRefresh == nullptr) {
		const BMessage refresh(PWM_REFRESH);
		fDelayedRefresh =
			std::make_unique<BMessageRunner>(BMessenger(this), refresh, fNextRefresh - now, 1);
		if (fDelayedRefresh->InitCheck() == B_OK)
			return;
	}
	fDelayedRefresh.reset();
	fNextRefresh = now + kFrameTime;
	RefreshDisplay();
}


void
PropertyWin::RefreshDisplay()
{
	// First: what changes from here on is shown by another refresh.
	fRefreshWaits = false;
	TPropertyEditor* editor = CurrentEditor();
	if (editor != nullptr)
		ShowEditor(fProperty, editor, editor->Type(), fPropertyLock, false);
	UpdateRows();
}


/// Reads the component again and redraws what has changed in the lists.
void
PropertyWin::UpdateRows()
{
	if (fComponent == nullptr)
		return;
	const uint32 count = fShownCount;
	TComponentRows rows;
	if (!rows.Read(fComponent, fDesignWindow, fShownCount) || fShownCount != count)
		return;
	fRowsLock = rows.lock;
	fPropView->UpdateRows(&rows);
	fEventView->UpdateRows(&rows);
}
