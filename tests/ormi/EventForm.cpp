// SPDX-License-Identifier: MIT
// The generated part and the handlers of the form with all events. The unqualified addresses of members
// are what generated sources have.

#include "EventForm.h"

#include <cstdio>

#define ASSIGN_VIEW_EVENTS(component)                                                              \
	component->OnAllAttached = &component##AllAttached;                                            \
	component->OnAttachedToWindow = &component##AttachedToWindow;                                  \
	component->OnAllDetached = &component##AllDetached;                                            \
	component->OnDraw = &component##Draw;                                                          \
	component->OnFrameMoved = &component##FrameMoved;                                              \
	component->OnFrameResized = &component##FrameResized;                                          \
	component->OnKeyDown = &component##KeyDown;                                                    \
	component->OnKeyUp = &component##KeyUp;                                                        \
	component->OnGotFocus = &component##GotFocus;                                                  \
	component->OnLostFocus = &component##LostFocus;                                                \
	component->OnMouseUp = &component##MouseUp;                                                    \
	component->OnMouseDown = &component##MouseDown;                                                \
	component->OnMouseMoved = &component##MouseMoved;

#define SET_VIEW_PROPERTIES(component)                                                             \
	component->SetVisible(true);                                                                   \
	component->SetFlags(B_WILL_DRAW | B_NAVIGABLE);                                                \
	{                                                                                              \
		rgb_color clr = {216, 216, 216, 255};                                                      \
		component->SetViewColor(clr);                                                              \
	}                                                                                              \
	{                                                                                              \
		rgb_color clr = {0, 0, 0, 0};                                                              \
		component->SetHighColor(clr);                                                              \
	}                                                                                              \
	{                                                                                              \
		rgb_color clr = {255, 255, 255, 255};                                                      \
		component->SetLowColor(clr);                                                               \
	}                                                                                              \
	component->SetFont(be_plain_font);                                                             \
	component->SetFontSize(10);

TEventForm::TEventForm(void)
	: TForm(BRect(100, 100, 399, 299), "Events", B_TITLED_WINDOW_LOOK, B_NORMAL_WINDOW_FEEL, 0)
{
	SetFormView(new TEventFormView(this));

	{
		rgb_color clr = {216, 216, 216, 255};
		FormView()->SetViewColor(clr);
	}
	{
		rgb_color clr = {0, 0, 0, 0};
		FormView()->SetHighColor(clr);
	}
	{
		rgb_color clr = {255, 255, 255, 255};
		FormView()->SetLowColor(clr);
	}
	FormView()->SetFont(be_plain_font);
	FormView()->SetFontSize(10);

	_formInit();
	FormCreate();
}


TEventForm::~TEventForm(void)
{
	FormDestroy();
}


void
TEventForm::_formInit(void)
{
	FormView()->AddChild(
		Button1 = new TButton<TEventForm>(this, BRect(10, 10, 89, 34), "Button1", "Press"));
	SET_VIEW_PROPERTIES(Button1)
	Button1->SetEnabled(true);
	Button1->SetLabel("Press");
	Button1->SetResizingMode(B_FOLLOW_NONE);
	Button1->MakeDefault(false);
	ASSIGN_VIEW_EVENTS(Button1)
	Button1->OnClick = &Button1Click;

	FormView()->AddChild(
		CheckBox1 = new TCheckBox<TEventForm>(this, BRect(10, 40, 149, 60), "CheckBox1", "Tick"));
	SET_VIEW_PROPERTIES(CheckBox1)
	CheckBox1->SetEnabled(true);
	CheckBox1->SetLabel("Tick");
	CheckBox1->SetResizingMode(B_FOLLOW_NONE);
	CheckBox1->SetValue(true);
	ASSIGN_VIEW_EVENTS(CheckBox1)
	CheckBox1->OnChange = &CheckBox1Change;

	FormView()->AddChild(TextControl1 = new TTextControl<TEventForm>(
							 this, BRect(10, 70, 189, 90), "TextControl1", "", "text"));
	SET_VIEW_PROPERTIES(TextControl1)
	TextControl1->SetEnabled(true);
	TextControl1->SetLabel("");
	TextControl1->SetResizingMode(B_FOLLOW_NONE);
	TextControl1->SetText("text");
	TextControl1->SetDivider(0);
	ASSIGN_VIEW_EVENTS(TextControl1)
	TextControl1->OnChange = &TextControl1Change;
	TextControl1->OnEnter = &TextControl1Enter;

	FormView()->AddChild(StringView1 = new TStringView<TEventForm>(
							 this, BRect(10, 100, 149, 120), "StringView1", "String"));
	SET_VIEW_PROPERTIES(StringView1)
	StringView1->SetText("String");
	StringView1->SetAlignment(B_ALIGN_RIGHT);
	StringView1->SetResizingMode(B_FOLLOW_NONE);
	ASSIGN_VIEW_EVENTS(StringView1)
	StringView1->OnClick = &StringView1Click;

	FormView()->AddChild(Box1 = new TBox<TEventForm>(this, BRect(160, 10, 289, 60), "Box1", "Box"));
	SET_VIEW_PROPERTIES(Box1)
	Box1->SetLabel("Box");
	Box1->SetBorder(B_PLAIN_BORDER);
	Box1->SetResizingMode(B_FOLLOW_LEFT | B_FOLLOW_TOP);
	ASSIGN_VIEW_EVENTS(Box1)
	Box1->OnClick = &Box1Click;

	Box1->AddChild(
		Button2 = new TButton<TEventForm>(this, BRect(10, 15, 69, 39), "Button2", "Inside"));
	SET_VIEW_PROPERTIES(Button2)
	Button2->SetEnabled(false);
	Button2->SetLabel("Inside");
	Button2->SetResizingMode(B_FOLLOW_NONE);
	Button2->MakeDefault(false);
	ASSIGN_VIEW_EVENTS(Button2)
}


namespace {

std::string
Numbers(std::initializer_list<double> numbers)
{
	std::string text;
	for (double number : numbers) {
		char piece[32];
		snprintf(piece, sizeof(piece), "%s%g", text.empty() ? " " : ",", number);
		text += piece;
	}
	return text;
}

} // namespace

// Draws come when the display wants them: they are written down by name alone.
#define DEFINE_VIEW_EVENTS(component)                                                              \
	void TEventForm::component##AllAttached(void)                                                  \
	{                                                                                              \
		gEvents.Add(#component "AllAttached");                                                     \
	}                                                                                              \
	void TEventForm::component##AttachedToWindow(void)                                             \
	{                                                                                              \
		gEvents.Add(#component "AttachedToWindow");                                                \
	}                                                                                              \
	void TEventForm::component##AllDetached(void)                                                  \
	{                                                                                              \
		gEvents.Add(#component "AllDetached");                                                     \
	}                                                                                              \
	void TEventForm::component##Draw(BRect)                                                        \
	{                                                                                              \
		gEvents.Add(#component "Draw");                                                            \
	}                                                                                              \
	void TEventForm::component##FrameMoved(BPoint point)                                           \
	{                                                                                              \
		gEvents.Add(#component "FrameMoved" + Numbers({point.x, point.y}));                        \
	}                                                                                              \
	void TEventForm::component##FrameResized(float width, float height)                            \
	{                                                                                              \
		gEvents.Add(#component "FrameResized" + Numbers({width, height}));                         \
	}                                                                                              \
	void TEventForm::component##KeyDown(void)                                                      \
	{                                                                                              \
		gEvents.Add(#component "KeyDown");                                                         \
	}                                                                                              \
	void TEventForm::component##KeyUp(void)                                                        \
	{                                                                                              \
		gEvents.Add(#component "KeyUp");                                                           \
	}                                                                                              \
	void TEventForm::component##GotFocus(void)                                                     \
	{                                                                                              \
		gEvents.Add(#component "GotFocus");                                                        \
	}                                                                                              \
	void TEventForm::component##LostFocus(void)                                                    \
	{                                                                                              \
		gEvents.Add(#component "LostFocus");                                                       \
	}                                                                                              \
	void TEventForm::component##MouseUp(BPoint point)                                              \
	{                                                                                              \
		gEvents.Add(#component "MouseUp" + Numbers({point.x, point.y}));                           \
	}                                                                                              \
	void TEventForm::component##MouseDown(BPoint point)                                            \
	{                                                                                              \
		gEvents.Add(#component "MouseDown" + Numbers({point.x, point.y}));                         \
	}                                                                                              \
	void TEventForm::component##MouseMoved(BPoint point, uint32 transit, const BMessage*)          \
	{                                                                                              \
		gEvents.Add(#component "MouseMoved" + Numbers({point.x, point.y, double(transit)}));       \
	}

DEFINE_VIEW_EVENTS()
DEFINE_VIEW_EVENTS(Button1)
DEFINE_VIEW_EVENTS(CheckBox1)
DEFINE_VIEW_EVENTS(TextControl1)
DEFINE_VIEW_EVENTS(StringView1)
DEFINE_VIEW_EVENTS(Box1)
DEFINE_VIEW_EVENTS(Button2)


void
TEventForm::MessageReceived(BMessage* msg)
{
	switch (msg->what) {
		case 'mine':
			gEvents.Add("MessageReceived");
			break;

		default:
			TForm::MessageReceived(msg);
			break;
	}
}


void
TEventForm::FormCreate(void)
{
	gEvents.Add("FormCreate");
}


void
TEventForm::FormDestroy(void)
{
	// The components are still there, if no longer in the window.
	gEvents.Add("FormDestroy " + std::string(TextControl1->Text()));
}


void
TEventForm::MenusBeginning(void)
{
	gEvents.Add("MenusBeginning");
}


void
TEventForm::MenusEnded(void)
{
	gEvents.Add("MenusEnded");
}


void
TEventForm::OpenViewTransaction(void)
{
	gEvents.Add("OpenViewTransaction");
	TForm::OpenViewTransaction();
}


void
TEventForm::CommitViewTransaction(void)
{
	gEvents.Add("CommitViewTransaction");
	TForm::CommitViewTransaction();
}


void
TEventForm::Quit(void)
{
	gEvents.Add("Quit");
	TForm::Quit();
}


void
TEventForm::ScreenChanged(BRect frame, color_space mode)
{
	gEvents.Add("ScreenChanged" + Numbers({frame.right, frame.bottom, double(mode)}));
}


void
TEventForm::Show(void)
{
	gEvents.Add("Show");
	TForm::Show();
}


void
TEventForm::Hide(void)
{
	gEvents.Add("Hide");
	TForm::Hide();
}


void
TEventForm::Minimize(bool minimize)
{
	gEvents.Add(minimize ? "Minimize" : "Minimize back");
	TForm::Minimize(minimize);
}


void
TEventForm::Zoom(BPoint origin, float width, float height)
{
	gEvents.Add("Zoom");
	TForm::Zoom(origin, width, height);
}


void
TEventForm::WindowActivated(bool active)
{
	gEvents.Add(active ? "WindowActivated" : "WindowActivated no more");
}


void
TEventForm::WorkspaceActivated(int32 workspace, bool active)
{
	gEvents.Add("WorkspaceActivated" + Numbers({double(workspace), double(active)}));
}


void
TEventForm::WorkspacesChanged(uint32 oldWorkspaces, uint32 newWorkspaces)
{
	gEvents.Add("WorkspacesChanged" + Numbers({double(oldWorkspaces), double(newWorkspaces)}));
}


bool
TEventForm::QuitRequested(void)
{
	bool result;

	result = mayQuit;
	gEvents.Add("QuitRequested");
	return result;
}


void
TEventForm::Button1Click(void)
{
	gEvents.Add(name + "Button1Click");
	if (opensOnClick) {
		TEventForm* other = new TEventForm;
		other->SetTitle("opened");
		other->Show();
	}
	if (quitsOnClick)
		Quit();
}


void
TEventForm::CheckBox1Change(void)
{
	gEvents.Add("CheckBox1Change" + Numbers({double(CheckBox1->Value())}));
}


void
TEventForm::TextControl1Change(void)
{
	gEvents.Add("TextControl1Change " + std::string(TextControl1->Text()));
}


void
TEventForm::TextControl1Enter(void)
{
	gEvents.Add("TextControl1Enter " + std::string(TextControl1->Text()));
}


void
TEventForm::StringView1Click(void)
{
	gEvents.Add("StringView1Click");
}


void
TEventForm::Box1Click(void)
{
	gEvents.Add("Box1Click");
}
