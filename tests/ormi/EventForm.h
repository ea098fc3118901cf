// SPDX-License-Identifier: MIT
// A form as the designer generates them, with a component of each class and a handler for every event.

#pragma once

#include <Ormi.h>

#include "EventLog.h"

// The handlers of the events that every component has.
#define VIEW_EVENT_HANDLERS(component)                                                             \
	virtual void component##AllAttached(void);                                                     \
	virtual void component##AttachedToWindow(void);                                                \
	virtual void component##AllDetached(void);                                                     \
	virtual void component##Draw(BRect updateRect);                                                \
	virtual void component##FrameMoved(BPoint parentPoint);                                        \
	virtual void component##FrameResized(float width, float height);                               \
	virtual void component##KeyDown(void);                                                         \
	virtual void component##KeyUp(void);                                                           \
	virtual void component##GotFocus(void);                                                        \
	virtual void component##LostFocus(void);                                                       \
	virtual void component##MouseUp(BPoint point);                                                 \
	virtual void component##MouseDown(BPoint point);                                               \
	virtual void component##MouseMoved(BPoint point, uint32 transit, const BMessage* message);

class TEventFormView : public TFormView {
public:
	TEventFormView(TForm* parent)
		: TFormView(parent, "EventFormView")
	{
	}
	virtual ~TEventFormView(void) {}
};

class TEventForm : public TForm {
	void _formInit(void);

public:
	TEventForm(void);
	virtual ~TEventForm(void);

	virtual void MessageReceived(BMessage*);
	virtual void FormCreate(void);
	virtual void FormDestroy(void);

	TButton<TEventForm>* Button1;
	TCheckBox<TEventForm>* CheckBox1;
	TTextControl<TEventForm>* TextControl1;
	TStringView<TEventForm>* StringView1;
	TBox<TEventForm>* Box1;
	TButton<TEventForm>* Button2;

	VIEW_EVENT_HANDLERS()
	virtual void MenusBeginning(void);
	virtual void MenusEnded(void);
	virtual void OpenViewTransaction(void);
	virtual void CommitViewTransaction(void);
	virtual void Quit(void);
	virtual void ScreenChanged(BRect frame, color_space mode);
	virtual void Show(void);
	virtual void Hide(void);
	virtual void Minimize(bool minimize);
	virtual void Zoom(BPoint origin, float width, float height);
	virtual void WindowActivated(bool active);
	virtual void WorkspaceActivated(int32 workspace, bool active);
	virtual void WorkspacesChanged(uint32 oldWorkspaces, uint32 newWorkspaces);
	virtual bool QuitRequested(void);

	VIEW_EVENT_HANDLERS(Button1)
	VIEW_EVENT_HANDLERS(CheckBox1)
	VIEW_EVENT_HANDLERS(TextControl1)
	VIEW_EVENT_HANDLERS(StringView1)
	VIEW_EVENT_HANDLERS(Box1)
	VIEW_EVENT_HANDLERS(Button2)
	virtual void Button1Click(void);
	virtual void CheckBox1Change(void);
	virtual void TextControl1Change(void);
	virtual void TextControl1Enter(void);
	virtual void StringView1Click(void);
	virtual void Box1Click(void);

	// The developer's own members.
	bool mayQuit = true;
	bool quitsOnClick = false;
	bool opensOnClick = false;
	std::string name;
};
