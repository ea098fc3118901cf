// SPDX-License-Identifier: MIT
// The inspector: the properties and events of the selected component.

#include "props/PropertyWin.h"

#include <cstdio>
#include <memory>

#include <ListView.h>
#include <Screen.h>

#include "app/WindowFrame.h"
#include "app/WindowGuard.h"
#include "model/Component.h"
#include "model/Event.h"
#include "model/Property.h"
#include "props/ComponentRows.h"
#include "props/EditorPanes.h"
#include "props/EventListItem.h"
#include "props/EventView.h"
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

constexpr uint32 kMsgRefresh = 'rfsh';

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
	  fDesignView(nullptr),
	  fDesignWindow(nullptr),
	  fClosing(false),
	  fShownCount(0),
	  fRefreshWaits(false)
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
	if (message->what == kMsgRefresh) {
		RefreshDisplay();
		return;
	}

	message->PrintToStream();
	switch (message->what) {
		case PWM_PROPERTY_SELECTED:
		{
			TPropertyEditor* editor = TakeSelectedProperty();
			if (editor != nullptr)
				SelectEditorFor(fProperty.Property(), editor, editor->Type(), false);
			break;
		}

		case PWM_PROPERTY_INVOKED:
		{
			TPropertyEditor* editor = TakeSelectedProperty();
			if (editor != nullptr)
				InvokeEditorFor(fProperty.Property(), editor, editor->Type());
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

	// Both pages at once: while the component is read, another thread may show another one here.
	fComponent = component;
	const uint32 count = ++fShownCount;
	TComponentRows rows;
	if (component == nullptr)
		fProperty.SetTo(nullptr);
	else if (!rows.Read(component, fDesignWindow, fShownCount) || fShownCount != count)
		return;
	fPropView->SetRows(&rows);
	fEventView->SetRows(&rows);
}


TComponent*
PropertyWin::Component()
{
	return fComponent;
}


void
PropertyWin::UpdateDisplayValues()
{
	if (!fRefreshWaits.exchange(true) && PostMessage(kMsgRefresh) != B_OK)
		fRefreshWaits = false;
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
	if (property == nullptr)
		return;
	TPropertyWatch watch(property);
	const uint32 count = fShownCount;
	std::unique_ptr<TEditorState> state;
	{
		WindowGuard guard(fDesignWindow);
		if (watch.Property() != nullptr && fShownCount == count)
			state = std::make_unique<TEditorState>(property, editor, type);
	}
	if (state == nullptr || fShownCount != count)
		return;
	fPanes->Show(type, property, *state);
	if (focus)
		fPanes->Focus();
}


void
PropertyWin::InvokeEditorFor(TProperty* property, TPropertyEditor* editor, TPropEditType type)
{
	SelectEditorFor(property, editor, type, true);
	if (type == PET_MODAL || type == PET_LIST)
		fPanes->PressButton();
	else if (type == PET_PICKLIST && dynamic_cast<TBoolProperty*>(editor) != nullptr)
		fPanes->FlipPick();
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


/// The editor of the current property; none without one.
TPropertyEditor*
PropertyWin::CurrentEditor() const
{
	const TProperty* property = fProperty.Property();
	return property != nullptr ? property->Editor() : nullptr;
}


/// Makes the property of the selected row the current one and returns its editor, if any.
TPropertyEditor*
PropertyWin::TakeSelectedProperty()
{
	const TPropertyListItem* row = SelectedRow<TPropertyListItem>(fPropView->List());
	if (row == nullptr || row->Property() == nullptr)
		return nullptr;
	fProperty.SetTo(row->Property());
	return CurrentEditor();
}


/// Hands \a value to the current property's editor with the design view locked.
///
/// The property must still be there once the lock is. Without a design view to lock, the result is false and
/// nothing changes when \a lockNeeded.
bool
PropertyWin::SetCurrentValue(const char* value, bool lockNeeded)
{
	const uint32 count = fShownCount;
	BView* designView = fDesignView;
	const TProperty* property = fProperty.Property();
	WindowGuard guard(fDesignWindow);
	if (!guard.IsLocked() && lockNeeded)
		return false;

	TPropertyEditor* editor = CurrentEditor();
	if (editor == nullptr || fShownCount != count || fProperty.Property() != property)
		return true;
	editor->SetValue(value, true);
	if (guard.IsLocked() && lockNeeded)
		designView->Invalidate();
	return true;
}


void
PropertyWin::EditModally()
{
	TPropertyEditor* editor = CurrentEditor();
	if (editor == nullptr || !editor->ModalEdit())
		return;
	// The current property may be another one by now.
	if (CurrentEditor() == editor)
		fPanes->SetModalText(editor->GetDisplayValue());
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


void
PropertyWin::RefreshDisplay()
{
	fRefreshWaits = false;
	TPropertyEditor* editor = CurrentEditor();
	if (editor != nullptr)
		SelectEditorFor(fProperty.Property(), editor, editor->Type(), false);
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
	fPropView->UpdateRows(&rows);
	fEventView->UpdateRows(&rows);
}
