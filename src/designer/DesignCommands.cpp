// SPDX-License-Identifier: MIT
// The commands of the design surface: the two menus, the clipboard, saving.

#include <cstdio>
#include <cstring>
#include <vector>

#include <Clipboard.h>
#include <DataIO.h>
#include <Entry.h>
#include <FilePanel.h>
#include <MenuItem.h>
#include <Message.h>
#include <Messenger.h>
#include <Path.h>
#include <PopUpMenu.h>
#include <String.h>
#include <Window.h>

#include "app/Dialogs.h"
#include "app/WindowGuard.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "designer/Inspector.h"
#include "designer/RefFilters.h"
#include "model/DesignMessages.h"
#include "model/Diagnostics.h"
#include "model/Event.h"
#include "model/FiniteRect.h"
#include "model/Property.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "props/ForgottenEditors.h"

namespace {

enum {
	DFC_COMPONENT_PROPERTIES = 2,
	DFC_DELETE = 3,
	DFC_CUT = 4,
	DFC_COPY = 5,
	DFC_PASTE = 6,
	DFC_DUPLICATE = 7,
	DFC_SAVE = 8,
	DFC_LOAD_TEST_FORM = 9,
	DFC_LAY_OUT_AFRESH = 10,
	DFC_LOCK_COMPONENTS = 11,
	DFC_DELETE_ALL = 12,
	DFC_FORM_PROPERTIES = 13,
	DFC_SAVE_CHOSEN = 14
};

constexpr const char* kComponentType = "application/x-plim-component";
constexpr const char* kTestForm = "./doke.frm";

struct menu_row {
	const char* label;
	uint32 command;
	char shortcut;
};
constexpr menu_row kComponentRows[] = {
	{"Properties", DFC_COMPONENT_PROPERTIES, 'R'},
	{"Delete", DFC_DELETE, 0},
	{"Cut", DFC_CUT, 'X'},
	{"Copy", DFC_COPY, 'C'},
};
constexpr menu_row kFormRows[] = {
	{"Paste", DFC_PASTE, 'V'},
	{"Save to file", DFC_SAVE, 'S'},
	{"Lock components", DFC_LOCK_COMPONENTS, 'L'},
	{"Delete all components", DFC_DELETE_ALL, 0},
	{"Properties", DFC_FORM_PROPERTIES, 'R'},
};


template <size_t Count>
void
FillMenu(BPopUpMenu* menu, const menu_row (&rows)[Count], BHandler* target)
{
	menu->RemoveItems(0, menu->CountItems(), true);
	for (const menu_row& row : rows)
		menu->AddItem(new BMenuItem(row.label, new BMessage(row.command), row.shortcut));
	menu->SetTargetForItems(target);
}


/// Calls \a use with the clipboard's component record; false when it holds none, or cannot be locked.
template <typename Use>
bool
WithClipboardRecord(Use use)
{
	if (!be_clipboard->Lock())
		return false;
	const void* data = nullptr;
	ssize_t size = 0;
	const BMessage* content = be_clipboard->Data();
	const bool found =
		content != nullptr && content->FindData(kComponentType, B_MIME_TYPE, &data, &size) == B_OK;
	if (found)
		use(data, size);
	be_clipboard->Unlock();
	return found;
}


/// Opens \a menu at \a where, in screen coordinates; false when nothing is chosen.
///
/// The window's lock is given up meanwhile.
bool
LetChoose(BPopUpMenu* menu, BPoint where, BMessage* command)
{
	WindowRelease release;
	const BMenuItem* item = menu->Go(where, false, true);
	if (item == nullptr || item->Message() == nullptr)
		return false;
	*command = *item->Message();
	return true;
}

} // namespace

void
TDesignFormView::KeyDown(const char* bytes, int32 numBytes)
{
	BView::KeyDown(bytes, numBytes);
	PrintDiagnostic("KeyDown: bytes = '%s'\n", bytes);
}


void
TDesignFormView::MessageReceived(BMessage* message)
{
	switch (message->what) {
		case DTM_COMPONENT_MOVE:
			MoveComponent(message);
			break;

		case DTM_COMPONENT_RESIZE:
			ResizeComponent(message);
			break;

		case DTM_COMPONENT_CONTEXTMENU:
			OpenComponentMenu(message);
			break;

		case DFC_PASTE:
			Paste();
			break;

		case DFC_SAVE:
			SaveToItsFile();
			break;

		case DFC_LOAD_TEST_FORM:
			LoadTestForm();
			break;

		case DFC_LAY_OUT_AFRESH:
			LayOutAfresh();
			break;

		case DFC_LOCK_COMPONENTS:
			break;

		case DFC_DELETE_ALL:
			DeleteAllComponents();
			break;

		case DFC_FORM_PROPERTIES:
			Inspector::Activate();
			break;

		case DFC_SAVE_CHOSEN:
			SaveAsChosen(message);
			break;

		default:
			BView::MessageReceived(message);
			break;
	}
}


void
TDesignFormView::InitComponentMenu()
{
	if (fComponentMenu == nullptr)
		fComponentMenu = std::make_unique<BPopUpMenu>("pmComponentDesign", false, false);
	FillMenu(fComponentMenu.get(), kComponentRows, this);
}


void
TDesignFormView::InitFormMenu()
{
	if (fFormMenu == nullptr)
		fFormMenu = std::make_unique<BPopUpMenu>("pmFormDesign", false, false);
	FillMenu(fFormMenu.get(), kFormRows, this);
	fFormMenu->FindItem(DFC_PASTE)->SetEnabled(WithClipboardRecord([](const void*, ssize_t) {}));
}


void
TDesignFormView::OpenFormMenu(BPoint where)
{
	InitFormMenu();
	// A copy: a command may open the menu anew.
	BMessage command;
	if (LetChoose(fFormMenu.get(), ConvertToScreen(where), &command))
		MessageReceived(&command);
}


void
TDesignFormView::OpenComponentMenu(BMessage* message)
{
	void* pointer;
	if (message->FindPointer("component", &pointer) != B_OK
		|| !Lists(static_cast<TComponent*>(pointer)))
		return;
	PrintDiagnostic("TDesignFormView Got DTM_COMPONENT_CONTEXTMENU message\n");
	TComponent* component = static_cast<TComponent*>(pointer);
	BPoint where;
	if (message->FindPoint("where", &where) != B_OK || component->DTView() == nullptr)
		return;

	InitComponentMenu();
	component->AddComponentContextMenuItems(fComponentMenu.get());
	component->DTView()->ConvertToScreen(&where);
	BMessage command;
	if (!LetChoose(fComponentMenu.get(), where, &command) || !Lists(component))
		return;
	if (!fForm->HandleComponentContextMessage(&command) && Lists(component))
		component->HandleComponentContextMessage(&command);
}


void
TDesignFormView::StoreComponent(TComponent* component, BMessage* message)
{
	message->MakeEmpty();
	message->AddString("_ClassName", component->ClassName());
	message->AddRect(
		"_Frame", component->DTView() != nullptr ? component->DTView()->Frame() : BRect());

	BMessage properties('prop');
	for (int32 i = 0; i < component->CountProperties(); i++) {
		const TProperty* property = component->PropertyAt(i);
		properties.AddString(property->Name(), property->Value());
	}
	BMessage events('evts');
	for (int32 i = 0; i < component->CountEvents(); i++) {
		const TEvent* event = component->EventAt(i);
		events.AddBool(event->name, event->selected);
	}
	message->AddMessage("Properties", &properties);
	message->AddMessage("Events", &events);
}


TComponent*
TDesignFormView::RetrieveComponent(const void* record, ssize_t size)
{
	BMessage message('comp');
	BMessage properties;
	BMessage events;
	const char* className;
	BRect frame(0, 0, -1, -1);
	BMemoryIO stream(record, size);
	if (message.Unflatten(&stream) != B_OK || message.FindMessage("Properties", &properties) != B_OK
		|| message.FindMessage("Events", &events) != B_OK
		|| message.FindString("_ClassName", &className) != B_OK
		|| message.FindRect("_Frame", &frame) != B_OK || !IsFinite(frame))
		return nullptr;
	TPaletteEntry* entry = PaletteCatalog().FindPalEntry(className);
	TComponent* component = entry != nullptr ? entry->CreateComponent(this, this, frame) : nullptr;
	if (component == nullptr)
		return nullptr;

	// Copies: a component may build its list of properties anew when one is set.
	std::vector<BString> names;
	for (int32 i = 0; i < component->CountProperties(); i++)
		names.emplace_back(component->PropertyAt(i)->Name());
	for (const BString& name : names) {
		const char* value;
		if (properties.FindString(name.String(), &value) == B_OK)
			component->SetPropertyValue(name.String(), value);
	}
	for (int32 i = 0; i < component->CountEvents(); i++) {
		TEvent* event = component->EventAt(i);
		bool selected;
		if (events.FindBool(event->name, &selected) == B_OK)
			component->SetEventSelection(event->name, selected);
	}

	BPoint pointer;
	uint32 buttons;
	GetMouse(&pointer, &buttons, false);
	if (component->DTView() != nullptr)
		component->DTView()->MoveTo(pointer);
	NameComponent(component, frame);
	AddComponent(component);
	SetModified(true);
	return component;
}


void
TDesignFormView::Paste()
{
	WithClipboardRecord([this](const void* data, ssize_t size) { RetrieveComponent(data, size); });
}


void
TDesignFormView::SaveToItsFile()
{
	if (*Filename() != '\0') {
		SaveOrWarn(Filename());
		return;
	}

	if (fSavePanel == nullptr) {
		BMessenger target(fForm);
		BMessage reply(DFC_SAVE_CHOSEN);
		static TFormRefFilter sFilter;
		fSavePanel = std::make_unique<BFilePanel>(
			B_SAVE_PANEL, &target, nullptr, 0, false, &reply, &sFilter);
	}
	std::vector<char> fileName(strlen(fForm->ComponentName()) + sizeof(".frm"));
	MakeFormFileName(fForm->ComponentName(), fileName.data());
	fSavePanel->SetSaveText(fileName.data());
	WindowRelease release;
	fSavePanel->Show();
}


void
TDesignFormView::SaveAsChosen(BMessage* message)
{
	{
		WindowRelease release;
		fSavePanel.reset();
	}
	entry_ref directory;
	const char* name;
	BPath path;
	if (message->FindRef("directory", &directory) != B_OK
		|| message->FindString("name", &name) != B_OK || path.SetTo(&directory) != B_OK
		|| path.Append(name) != B_OK)
		return;
	SaveOrWarn(path.Path());
}


/// Saves to \a path, which becomes the form's file if that works.
void
TDesignFormView::SaveOrWarn(const char* path)
{
	if (SaveAfterAsking(path) != FORM_NOT_SAVED)
		return;
	WindowRelease release;
	MsgBox("Warning", "Unable to save the form.", "OK", nullptr, nullptr, B_WIDTH_AS_USUAL,
		B_WARNING_ALERT);
}


/// Kept for trying things out: no menu has it.
void
TDesignFormView::LoadTestForm()
{
	if (LoadFromFile(kTestForm))
		return;
	WindowRelease release;
	MsgBox("Warning", "Unable to load the file.", "OK", nullptr, nullptr, B_WIDTH_AS_USUAL,
		B_WARNING_ALERT);
}


/// Brings every component onto the surface itself, to its middle, in one size. No menu has it.
void
TDesignFormView::LayOutAfresh()
{
	const BRect bounds = Bounds();
	for (int32 i = 0; i < TFormDesigner::CountComponents(); i++) {
		TComponent* component = TFormDesigner::ComponentAt(i);
		BView* view = component->DTView();
		if (view == nullptr)
			continue;
		view->MoveTo(bounds.Width() / 2, bounds.Height() / 2);
		view->ResizeTo(50, 50);
		if (component->Owner() != nullptr && !IsForm(component->Owner()))
			component->Owner()->RemoveComponent(component);
		component->SetOwner(this);
		view->RemoveSelf();
		AddChild(view);
		fForm->UpdateComponentPosition(component, view->Frame());
	}
	SetModified(true);
}


void
TDesignFormView::DeleteAllComponents()
{
	{
		WindowRelease release;
		if (YesNoBox("Are you sure you want to delete all components?") != 0)
			return;
	}
	Inspector::Show(fForm, this);

	// Each view leaves its parent before any is deleted: a container's view would take those inside with it.
	std::vector<TComponent*> components;
	std::vector<BView*> views;
	while (TComponent* component = TFormDesigner::ComponentAt(0)) {
		if (component->DTView() != nullptr) {
			component->DTView()->RemoveSelf();
			views.push_back(component->DTView());
		}
		RemoveComponent(component);
		components.push_back(component);
	}
	std::unique_ptr<TForgottenEditors> editors = std::make_unique<TForgottenEditors>();
	for (TComponent* component : components) {
		component->DeletedFromFormDesigner();
		editors->Add(component);
		delete component;
	}
	Inspector::Bury(std::move(editors));
	for (BView* view : views)
		delete view;
	SetModified(true);
}


bool
TDesignFormView::HandleComponentCommand(BMessage* message)
{
	if (message->what == DFC_COMPONENT_PROPERTIES) {
		Inspector::Activate();
		return true;
	}

	TComponent* component = Inspector::Component();
	if (!Lists(component))
		component = nullptr;
	switch (message->what) {
		case DFC_DELETE:
			return DeleteComponent(component);

		case DFC_CUT:
			if (component != nullptr && CopyComponent(component))
				DeleteComponent(component);
			return false;

		case DFC_COPY:
			if (component != nullptr)
				CopyComponent(component);
			return false;

		case DFC_DUPLICATE:
			if (component != nullptr && CopyComponent(component)) {
				BMessage paste(DFC_PASTE);
				fForm->MessageReceived(&paste);
			}
			return false;

		default:
			return false;
	}
}


/// Deletes \a component, which may be null, and leaves what is inside it to what it is in. Always true.
bool
TDesignFormView::DeleteComponent(TComponent* component)
{
	PrintDiagnostic("%s got PMI_COMPONENTDELETE\n", fForm->Name());
	if (component == nullptr)
		return true;

	BView* view = component->DTView();
	BView* parent = view != nullptr ? view->Parent() : nullptr;
	MoveChildrenUp(component, parent);

	TComponentOwner* owner = component->Owner();
	if (owner != nullptr && !IsForm(owner))
		owner->RemoveComponent(component);
	// Nothing may show the component from here on.
	Inspector::Show(fForm, this);
	if (view != nullptr)
		view->RemoveSelf();
	RemoveComponent(component);
	component->DeletedFromFormDesigner();
	std::unique_ptr<TForgottenEditors> editors = std::make_unique<TForgottenEditors>();
	editors->Add(component);
	delete component;
	delete view;
	Inspector::Bury(std::move(editors));
	SetModified(true);
	return true;
}


/// Takes what is inside \a component into \a parent, the view that it lies in, and into the list of its component.
void
TDesignFormView::MoveChildrenUp(TComponent* component, BView* parent)
{
	TComponentOwner* container = dynamic_cast<TComponentOwner*>(component);
	TComponentOwner* newOwner = nullptr;
	std::vector<TComponent*> children;
	for (int32 i = 0; container != nullptr && i < container->CountComponents(); i++)
		children.push_back(container->ComponentAt(i));
	for (int32 i = 0; i < TFormDesigner::CountComponents(); i++) {
		TComponent* other = TFormDesigner::ComponentAt(i);
		if (other->DTView() == nullptr)
			continue;
		if (parent != this && other->DTView() == parent)
			newOwner = dynamic_cast<TComponentOwner*>(other);
		// A component that is no container may have views of others in its own, and lists none.
		if (container == nullptr && other->DTView()->Parent() == component->DTView())
			children.push_back(other);
	}

	for (TComponent* child : children) {
		if (child->DTView() != nullptr && parent != nullptr) {
			child->DTView()->RemoveSelf();
			parent->AddChild(child->DTView());
		}
		if (container != nullptr)
			container->RemoveComponent(child);
		if (container != nullptr && newOwner != nullptr)
			newOwner->AddComponent(child);
	}
}


/// Puts a record of \a component on the clipboard; false when the clipboard cannot be used.
bool
TDesignFormView::CopyComponent(TComponent* component)
{
	BMessage record('comp');
	StoreComponent(component, &record);
	BMallocIO buffer;
	if (record.Flatten(&buffer) != B_OK || !be_clipboard->Lock())
		return false;
	be_clipboard->Clear();
	BMessage* content = be_clipboard->Data();
	const bool added = content != nullptr
		&& content->AddData(kComponentType, B_MIME_TYPE, buffer.Buffer(),
			   static_cast<ssize_t>(buffer.BufferLength()), true, 1)
			== B_OK;
	const bool committed = added && be_clipboard->Commit() == B_OK;
	be_clipboard->Unlock();
	return committed;
}
