// SPDX-License-Identifier: MIT

#include "designer/DesignForm.h"

#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <vector>

#include <Message.h>

#include "app/Dialogs.h"
#include "app/WindowGuard.h"
#include "designer/DesignFormView.h"
#include "designer/FormHost.h"
#include "designer/Inspector.h"
#include "model/ColorText.h"
#include "model/Diagnostics.h"
#include "model/Property.h"
#include "model/PropertyStore.h"
#include "props/PropertyEditor.h"

namespace {

const BRect kFirstFrame(120, 120, 420, 420);

// The codes of the form's commands, which the shortcuts send to the design view.
struct form_shortcut {
	uint32 key;
	uint32 command;
};
constexpr form_shortcut kShortcuts[] = {{'S', 8}, {'R', 13}, {'L', 11}, {'V', 6}};
constexpr uint32 kMsgPaste = 6;
constexpr uint32 kMsgSavePanel = 14;

/// Returns whether the property has another text now.
bool
WriteEdge(TComponent* component, const char* name, float edge)
{
	const TProperty* property = component->FindProperty(name);
	if (property == nullptr || property->Editor() == nullptr)
		return false;
	char text[1024];
	snprintf(text, sizeof(text), "%d", static_cast<int>(lroundf(edge)));
	const bool isOther = strcmp(property->Value(), text) != 0;
	property->Editor()->SetValue(text, false);

	// The component may have refused, and may have built its properties anew when it was asked.
	property = component->FindProperty(name);
	if (property == nullptr || strcmp(property->Value(), text) != 0)
		return false;
	// The editor wrote the property alone.
	component->PropertyStore()->SetString(name, text);
	return isOther;
}


/// Returns whether a property has another text now.
bool
WriteEdges(TComponent* component, BRect frame)
{
	const bool left = WriteEdge(component, "Left", frame.left);
	const bool top = WriteEdge(component, "Top", frame.top);
	const bool right = WriteEdge(component, "Right", frame.right);
	const bool bottom = WriteEdge(component, "Bottom", frame.bottom);
	return left || top || right || bottom;
}

} // namespace

TDesignForm::TDesignForm(const char* name, form_visibility visibility, TFormHost* host)
	: BWindow(kFirstFrame, name, B_TITLED_WINDOW, 0),
	  fHost(host),
	  fDesignView(nullptr),
	  fClosing(false)
{
	SetComponentName(name);
	SetClassName("TForm");
	SetFlags(Flags() | B_WILL_ACCEPT_FIRST_CLICK);
	InitPropertyList();
	InitEventList();
	InitPropertyValues();
	InitEventValues();
	InitControls();
	SetDTView(fDesignView);
	CenterWindowOnScreen(this);
	if (visibility == FORM_SHOWN)
		Show();
	else
		UpdateWindowPosition();
}


TDesignForm::~TDesignForm()
{
	// The view is destroyed after this component.
	fDesignView->NoteEditors(this);
}


void
TDesignForm::Show()
{
	BWindow::Show();
	{
		WindowGuard guard(this);
		if (guard.IsLocked())
			UpdateWindowPosition();
	}
	DesignFormShown(true);
}


void
TDesignForm::Hide()
{
	BWindow::Hide();
	if (!fClosing)
		DesignFormShown(false);
}


void
TDesignForm::MessageReceived(BMessage* message)
{
	switch (message->what) {
		case DFM_LOADFILE:
			ReplyToLoad(message);
			break;

		case DFM_SAVEFILE:
			ReplyToSave(message);
			break;

		case DFM_LOADCOPY:
			ReplyToLoadCopy(message);
			break;

		case DFM_KEEPCOPY:
			fDesignView->KeepDueCopy();
			break;

		case kMsgPaste:
		case kMsgSavePanel:
			fDesignView->MessageReceived(message);
			break;

		case B_SIMPLE_DATA:
			// Files dropped on a form are not opened.
			if (!message->HasRef("refs"))
				BWindow::MessageReceived(message);
			break;

		default:
			BWindow::MessageReceived(message);
			break;
	}
}


bool
TDesignForm::QuitRequested()
{
	if (fClosing)
		return true;
	Hide();
	return false;
}


void
TDesignForm::WindowActivated(bool active)
{
	BWindow::WindowActivated(active);
	DesignFormActivated(active);
}


void
TDesignForm::MouseDown(BPoint)
{
	ShowInInspector();
}


void
TDesignForm::FrameMoved(BPoint origin)
{
	BWindow::FrameMoved(origin);
	FollowWindow();
}


void
TDesignForm::FrameResized(float width, float height)
{
	fDesignView->Invalidate();
	BWindow::FrameResized(width, height);
	FollowWindow();
}


const char*
TDesignForm::GetPropertyValue(const char* name)
{
	PrintDiagnostic("TDesignForm::GetPropertyValue('%s')\n", name);
	return TFormComponent::GetPropertyValue(name);
}


void
TDesignForm::SetPropertyValue(const char* name, const char* value)
{
	PrintDiagnostic("TDesignForm::SetPropertyValue('%s', '%s')\n", name, value);
	if (name == nullptr || value == nullptr)
		return;

	WindowGuard guard(this);
	if (!guard.IsLocked())
		return;

	if (strcmp(name, "Title") == 0) {
		SetTitle(value);
		StoreProperty(name, value);
	} else if (ApplyEdge(name, value) || ApplyColor(name, value))
		StoreProperty(name, value);
	else
		TFormComponent::SetPropertyValue(name, value);
}


bool
TDesignForm::PropertyModified(const char* name, const char* oldValue, const char* newValue)
{
	return fDesignView == nullptr || fDesignView->PropertyModified(name, oldValue, newValue);
}


bool
TDesignForm::Modified() const
{
	return fDesignView->Modified();
}


void
TDesignForm::SetModified(bool modified)
{
	TFormComponent::SetModified(modified);
	if (modified && fDesignView != nullptr)
		fDesignView->SetModified(true);
}


bool
TDesignForm::HandleComponentContextMessage(BMessage* message)
{
	return fDesignView->HandleComponentCommand(message);
}


bool
TDesignForm::ComponentPropertyModified(
	TComponent* component, const char* name, const char* oldValue, const char* newValue)
{
	return fDesignView->ComponentPropertyModified(component, name, oldValue, newValue);
}


int32
TDesignForm::CountComponents() const
{
	return fDesignView->CountComponents();
}


TComponent*
TDesignForm::ComponentAt(int32 index) const
{
	return fDesignView->ComponentAt(index);
}


void
TDesignForm::AddComponent(TComponent* component)
{
	fDesignView->AddComponent(component);
}


bool
TDesignForm::RemoveComponent(TComponent* component)
{
	return fDesignView->RemoveComponent(component);
}


TComponent*
TDesignForm::RemoveComponent(int32 index)
{
	return fDesignView->RemoveComponent(index);
}


void
TDesignForm::ClearComponents(bool deleteComponents)
{
	fDesignView->ClearComponents(deleteComponents);
}


void
TDesignForm::DesignFormShown(bool shown)
{
	if (shown) {
		if (!fClosing)
			Inspector::Show(this, fDesignView);
		return;
	}

	std::vector<const TComponent*> components;
	for (int32 i = 0; i < CountComponents(); i++)
		components.push_back(ComponentAt(i));
	Inspector::LeaveForm(this, components);
}


void
TDesignForm::DesignFormActivated(bool active)
{
	if (fClosing)
		return;
	if (!active) {
		SelectInForm(false);
		return;
	}
	fDesignView->DeselectForms();
	SelectInForm(true);
	ShowInInspector();
}


void
TDesignForm::ComponentSelected(TComponent* component)
{
	fDesignView->ComponentSelected(component);
}


void
TDesignForm::ComponentMoved(TComponent* component, BPoint point)
{
	fDesignView->ComponentMoved(component, point);
}


bool
TDesignForm::IsDropWaiting()
{
	return fDesignView->IsDropWaiting();
}


TComponent*
TDesignForm::CreateComponent(BView* parent, BRect frame)
{
	return fDesignView->CreateComponent(parent, frame);
}


void
TDesignForm::DoneDroppingComponent()
{
	fDesignView->DoneDroppingComponent();
}


bool
TDesignForm::AdoptComponent(TComponent* component)
{
	return fDesignView->AdoptComponent(component);
}


void
TDesignForm::ComponentModified(TComponent* component)
{
	fDesignView->ComponentModified(component);
}


void
TDesignForm::OKToClose(bool closing)
{
	fClosing = closing;
	if (closing)
		fDesignView->KeepDueCopy();
}


void
TDesignForm::UpdateWindowPosition()
{
	WriteFrame(this, Frame());
}


void
TDesignForm::UpdateComponentPosition(TComponent* component, BRect frame)
{
	if (WriteFrame(component, frame))
		fDesignView->SetModified(true);
}


const char*
TDesignForm::Filename() const
{
	return fDesignView->Filename();
}


void
TDesignForm::SetFilename(const char* name)
{
	fDesignView->SetFilename(name);
}


bool
TDesignForm::SaveToFile(const char* path)
{
	return fDesignView->SaveToFile(path);
}


bool
TDesignForm::LoadFromFile(const char* path, TLoadReport* report)
{
	return fDesignView->LoadFromFile(path, report);
}


bool
TDesignForm::IsMainForm() const
{
	return fDesignView->IsMainForm();
}


void
TDesignForm::SetAsMainForm(bool isMainForm)
{
	fDesignView->SetAsMainForm(isMainForm);
}


void
TDesignForm::InitControls()
{
	fDesignView = new TDesignFormView(Bounds(), this);
	AddChild(fDesignView);
	SetDTFormView(fDesignView);
	for (const form_shortcut& shortcut : kShortcuts)
		AddShortcut(shortcut.key, B_COMMAND_KEY, new BMessage(shortcut.command), fDesignView);
}


/// Writes the edges of \a frame into the component's properties, and has them shown. Returns whether a text changed.
bool
TDesignForm::WriteFrame(TComponent* component, BRect frame)
{
	const bool isOther = WriteEdges(component, frame);
	// The property window goes before the forms do when the program ends.
	if (!fClosing)
		Inspector::Refresh();
	return isOther;
}


/// The window has another frame: it was moved by the user, or by its properties, or placed by the window system.
void
TDesignForm::FollowWindow()
{
	if (WriteFrame(this, Frame()) && IsActive())
		fDesignView->SetModified(true);
}


/// Selects the form's component, or not, and none of the components on it.
void
TDesignForm::SelectInForm(bool formSelected)
{
	fDesignView->MarkForm(formSelected);
	fDesignView->DeselectComponents(nullptr);
}


/// Points the property window at the form, unless it shows the form already.
void
TDesignForm::ShowInInspector()
{
	Inspector::ShowUnlessShown(this, fDesignView);
}


/// Moves or resizes the window when \a name is one of its edges; false when it is none.
bool
TDesignForm::ApplyEdge(const char* name, const char* value)
{
	const BRect frame = Frame();
	const float edge = static_cast<float>(strtol(value, nullptr, 10));
	if (strcmp(name, "Left") == 0)
		MoveTo(edge, frame.top);
	else if (strcmp(name, "Top") == 0)
		MoveTo(frame.left, edge);
	else if (strcmp(name, "Right") == 0)
		ResizeTo(edge - frame.left, frame.Height());
	else if (strcmp(name, "Bottom") == 0)
		ResizeTo(frame.Width(), edge - frame.top);
	else
		return false;
	return true;
}


/// Gives the design view a colour when \a name is one of its three; false when it is none.
bool
TDesignForm::ApplyColor(const char* name, const char* value)
{
	void (BView::*setColor)(rgb_color) = nullptr;
	if (strcmp(name, "ViewColor") == 0)
		setColor = &BView::SetViewColor;
	else if (strcmp(name, "HighColor") == 0)
		setColor = &BView::SetHighColor;
	else if (strcmp(name, "LowColor") == 0)
		setColor = &BView::SetLowColor;
	if (setColor == nullptr || fDesignView == nullptr)
		return false;

	rgb_color color = {0, 0, 0, 255};
	(fDesignView->*setColor)(StrToRGBColor(value, &color));
	fDesignView->Invalidate();
	return true;
}


void
TDesignForm::ReplyToLoad(BMessage* message)
{
	const char* path = nullptr;
	ReplyToLoad(message, message->FindString("filename", &path) == B_OK && LoadFromFile(path));
}


void
TDesignForm::ReplyToLoadCopy(BMessage* message)
{
	BMessage copy;
	ReplyToLoad(message,
		message->FindMessage("copy", &copy) == B_OK
			&& fDesignView->LoadCopy(copy, message->GetInt32("id", 0)));
}


void
TDesignForm::ReplyToLoad(BMessage* message, bool loaded)
{
	BMessage reply(message->what);
	reply.AddBool("result", loaded);
	reply.AddString("formname", ComponentName());
	message->SendReply(&reply);
}


void
TDesignForm::ReplyToSave(BMessage* message)
{
	const form_save_result result =
		*Filename() != '\0' ? fDesignView->SaveAfterAsking(Filename()) : FORM_NOT_SAVED;

	BMessage reply(DFM_SAVEFILE);
	reply.AddBool("result", result == FORM_SAVED);
	if (result == FORM_SAVE_CANCELED)
		reply.AddBool("canceled", true);
	message->SendReply(&reply);
}
