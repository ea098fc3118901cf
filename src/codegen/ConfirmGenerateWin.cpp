// SPDX-License-Identifier: MIT

#include "codegen/ConfirmGenerateWin.h"

#include <math.h>

#include <algorithm>

#include <Box.h>
#include <Button.h>
#include <CheckBox.h>
#include <ListView.h>
#include <Message.h>
#include <ScrollView.h>
#include <String.h>
#include <StringItem.h>
#include <TextControl.h>
#include <TextView.h>

#include "app/Dialogs.h"
#include "app/MainWindow.h"
#include "app/WindowGuard.h"
#include "codegen/CodeGenerator.h"
#include "codegen/Dialect.h"
#include "codegen/FormParts.h"
#include "designer/DesignForm.h"
#include "model/AppComponent.h"
#include "project/Project.h"
#include "project/ProjectOperation.h"
#include "project/ProjectWin.h"

namespace {

constexpr uint32 kMsgGenerate = 1;
constexpr uint32 kMsgCancel = 2;
constexpr uint32 kMsgDialect = 3;

const BRect kFirstFrame(100, 100, 440, 393);
const BRect kGenerateFrame(5, 263, 75, 288);
constexpr float kButtonGap = 10;
constexpr float kSettingsTop = 5;
constexpr float kSettingsBottom = 152;
constexpr float kFormsTop = 157;
constexpr float kFormsBottom = 257;
constexpr float kMargin = 5;
constexpr float kBoxInset = 8;
constexpr float kFirstFieldTop = 18;
constexpr float kFieldStep = 25;
constexpr float kLabelGap = 8;

struct setting_field {
	const char* viewName;
	const char* label;
	const char* property; // none: the component's name
};

constexpr setting_field kSettings[] = {
	{"efName", "Name:", nullptr},
	{"efClass", "Class Name:", "ClassName"},
	{"efSig", "Signature:", "Signature"},
	{"efGenPath", "Generate files in:", "GenerationPath"},
	{"efAppType", "Launch Flags:", "LaunchFlags"},
};


const char*
ValueOf(const setting_field& setting, const TAppComponent* app)
{
	return setting.property != nullptr ? PropertyText(app, setting.property) : app->ComponentName();
}


/// The line for \a form in the list; empty when its window has gone.
BString
LineFor(TDesignForm* form)
{
	BString line;
	WindowGuard guard(form);
	if (guard.IsLocked())
		line << form->ComponentName() << " ('" << PropertyText(form, "Title") << "')";
	return line;
}


/// Owns its items.
class LineList : public BListView {
public:
	using BListView::BListView;
	~LineList() override
	{
		for (int32 i = 0; i < CountItems(); i++)
			delete ItemAt(i);
	}
};


BBox*
MakeBox(BRect frame, const char* label)
{
	BBox* box = new BBox(frame);
	box->SetLabel(label);
	return box;
}

} // namespace


ConfirmGenerateWin::ConfirmGenerateWin(TCodeGenerator* generator, TAppComponent* app)
	: BWindow(
		kFirstFrame, "Generate Source files", B_TITLED_WINDOW, B_NOT_ZOOMABLE | B_NOT_RESIZABLE),
	  fGenerator(generator),
	  fApp(app),
	  fGenerateButton(nullptr),
	  fCancelButton(nullptr),
	  fStandardBox(nullptr)
{
	SetFeel(B_MODAL_APP_WINDOW_FEEL);
	if (fApp == nullptr) {
		MsgBox("Error", "Error: No App component specified!", "OK");
		return;
	}
	InitControls();
	CenterWindowOnScreen(this);
}


ConfirmGenerateWin::~ConfirmGenerateWin() = default;


void
ConfirmGenerateWin::Show()
{
	BWindow::Show();
}


void
ConfirmGenerateWin::MessageReceived(BMessage* message)
{
	switch (message->what) {
		case kMsgGenerate:
			Generate();
			PostMessage(B_QUIT_REQUESTED);
			break;

		case kMsgCancel:
			PostMessage(B_QUIT_REQUESTED);
			break;

		case kMsgDialect:
			SetPreferredDialect(
				fStandardBox->Value() == B_CONTROL_ON ? DIALECT_STANDARD : DIALECT_CLASSIC);
			break;

		default:
			BWindow::MessageReceived(message);
			break;
	}
}


void
ConfirmGenerateWin::InitControls()
{
	BView* background = new BView(Bounds(), "background", B_FOLLOW_ALL_SIDES, B_WILL_DRAW);
	background->SetViewColor(216, 216, 216);
	AddChild(background);
	AddSettings(background);
	AddForms(background);

	fGenerateButton = new BButton(kGenerateFrame, "btnOK", "Generate", new BMessage(kMsgGenerate));
	const BRect cancelFrame = kGenerateFrame.OffsetByCopy(kGenerateFrame.Width() + kButtonGap, 0);
	fCancelButton = new BButton(cancelFrame, "btnCancel", "Cancel", new BMessage(kMsgCancel));
	background->AddChild(fGenerateButton);
	background->AddChild(fCancelButton);
	AddDialect(background, cancelFrame);
	fGenerateButton->MakeFocus();
}


void
ConfirmGenerateWin::AddSettings(BView* parent)
{
	const float right = parent->Bounds().right - kMargin;
	BBox* box =
		MakeBox(BRect(kMargin, kSettingsTop, right, kSettingsBottom), "Application Settings:");
	parent->AddChild(box);

	float divider = 0;
	for (const setting_field& setting : kSettings)
		divider = std::max(divider, box->StringWidth(setting.label) + kLabelGap);

	BRect frame(
		kBoxInset, kFirstFieldTop, box->Bounds().right - kBoxInset, kFirstFieldTop + kFieldStep);
	for (const setting_field& setting : kSettings) {
		const BString value = ValueOf(setting, fApp);
		BTextControl* field =
			new BTextControl(frame, setting.viewName, setting.label, value.String(), nullptr);
		box->AddChild(field);
		field->SetDivider(divider);
		field->TextView()->MakeEditable(false);
		field->TextView()->MakeSelectable(false);
		frame.OffsetBy(0, kFieldStep);
	}
}


void
ConfirmGenerateWin::AddForms(BView* parent)
{
	const float right = parent->Bounds().right - kMargin;
	BBox* box = MakeBox(BRect(kMargin, kFormsTop, right, kFormsBottom), "Forms:");
	parent->AddChild(box);

	BRect frame(kBoxInset, kFirstFieldTop, box->Bounds().right - kBoxInset - B_V_SCROLL_BAR_WIDTH,
		box->Bounds().bottom - kBoxInset);
	BListView* list = new LineList(frame, "lvForms", B_SINGLE_SELECTION_LIST);
	for (int32 i = 0; i < fApp->CountComponents(); i++) {
		TDesignForm* form = FormAt(fApp, i);
		const BString line = form != nullptr ? LineFor(form) : BString();
		if (!line.IsEmpty())
			list->AddItem(new BStringItem(line.String()));
	}
	box->AddChild(new BScrollView("svFormList", list, B_FOLLOW_LEFT_TOP, 0, false, true));
}


/// Puts the choice of the dialect into the row of buttons, which leaves room behind \a cancelFrame.
void
ConfirmGenerateWin::AddDialect(BView* parent, BRect cancelFrame)
{
	BRect frame = cancelFrame;
	frame.left = cancelFrame.right + 2 * kButtonGap;
	frame.right = parent->Bounds().right - kMargin;
	fStandardBox = new BCheckBox(frame, "cbStandard", "Standard C++", new BMessage(kMsgDialect));
	parent->AddChild(fStandardBox);
	fStandardBox->SetValue(PreferredDialect() == DIALECT_STANDARD ? B_CONTROL_ON : B_CONTROL_OFF);
	// It took the height of its font; its label stands level with those of the buttons.
	const float free = cancelFrame.Height() - fStandardBox->Frame().Height();
	fStandardBox->MoveTo(frame.left, cancelFrame.top + std::max(0.0f, floorf(free / 2)));
}


void
ConfirmGenerateWin::Generate()
{
	// A second press, made while the thread is busy, must not generate again.
	fGenerateButton->SetEnabled(false);
	fCancelButton->SetEnabled(false);
	UpdateIfNeeded();

	WindowRelease release;
	PlimWin* mainWindow = MainWindow();
	if (mainWindow == nullptr) {
		fGenerator->GenerateApp();
		return;
	}
	TProject* project = mainWindow->ProjectWindow()->Project();
	TProjectOperation operation(project);
	// The project that was shown may have been closed.
	if (operation.IsBegun() && project->App() == fApp)
		fGenerator->GenerateApp();
}
