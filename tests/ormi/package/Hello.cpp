// SPDX-License-Identifier: MIT
// A program in the style of generated ones, in one file: its form presses its own button and closes.

#include <stdio.h>

#include <Ormi.h>

class TForm1View : public TFormView {
public:
	TForm1View(TForm* parent)
		: TFormView(parent, "Form1View")
	{
	}
	virtual ~TForm1View(void) {}
};

class TForm1 : public TForm {
	void _formInit(void);

public:
	TForm1(void);
	virtual ~TForm1(void);

	virtual void MessageReceived(BMessage*);
	virtual void FormCreate(void);
	virtual void FormDestroy(void);
	TButton<TForm1>* Button1;
	virtual void AllAttached(void);
	virtual void Button1Click(void);
};


TForm1::TForm1(void)
	: TForm(BRect(100, 100, 299, 199), "Hello", B_TITLED_WINDOW_LOOK, B_NORMAL_WINDOW_FEEL, 0)
{
	SetFormView(new TForm1View(this));
	_formInit();
	FormCreate();
}


TForm1::~TForm1(void)
{
	FormDestroy();
}


void
TForm1::_formInit(void)
{
	FormView()->AddChild(
		Button1 = new TButton<TForm1>(this, BRect(10, 10, 89, 34), "Button1", "Press"));
	Button1->SetFont(be_plain_font);
	Button1->OnClick = &Button1Click;
}


void
TForm1::MessageReceived(BMessage* msg)
{
	switch (msg->what) {
		case 'pres':
			Button1->Invoke();
			break;

		default:
			TForm::MessageReceived(msg);
			break;
	}
}


void
TForm1::FormCreate(void)
{
	printf("created\n");
}


void
TForm1::FormDestroy(void)
{
	printf("destroyed\n");
}


void
TForm1::AllAttached(void)
{
	PostMessage('pres');
}


void
TForm1::Button1Click(void)
{
	printf("%s clicked\n", Button1->Name());
	PostMessage(B_QUIT_REQUESTED);
}


class THello : public BApplication {
	TForm* m_MainForm;

public:
	THello(void)
		: BApplication("application/x-vnd.plimworks-hello")
	{
		m_MainForm = new TForm1();
		m_MainForm->MakeMainForm(true);
		m_MainForm->Show();
	}
};


int
main(void)
{
	THello app;
	app.Run();
	return 0;
}
