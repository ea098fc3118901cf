//
// MainForm.h
// TMainForm class definition
//

// [FORM_HEADER_TOP]
#ifndef _MainForm_H
#define _MainForm_H

#include <Ormi.h>
#include <Box.h>
#include <TextControl.h>
#include <CheckBox.h>
#include <StringView.h>
#include <Button.h>
// [END_FORM_HEADER_TOP]

// [FORM_VIEW_CLASS]
class TMainFormView: public TFormView {
public:
  TMainFormView(TForm *parent)
  : TFormView(parent, "MainFormView") {}
  virtual ~TMainFormView(void) {}
// [END_FORM_VIEW_CLASS]

};

// [FORM_CLASS]
class TMainForm: public TForm {
  void _formInit(void);
public:
  TMainForm(void);
  virtual ~TMainForm(void);

  virtual void MessageReceived(BMessage *);
  virtual void FormCreate(void);
  virtual void FormDestroy(void);
// [END_FORM_CLASS]

// [FORM_COMPONENTS]
  TBox<TMainForm> *GreetingBox;
  TTextControl<TMainForm> *NameField;
  TCheckBox<TMainForm> *ShoutBox;
  TStringView<TMainForm> *GreetingText;
  TButton<TMainForm> *CountButton;
  TStringView<TMainForm> *CountText;
  TButton<TMainForm> *NoteButton;
  TStringView<TMainForm> *NoteText;
  TButton<TMainForm> *QuitButton;
// [END_FORM_COMPONENTS]

// [FORM_EVENTS]
// [END_FORM_EVENTS]

// [COMPONENT_EVENTS]
  virtual void NameFieldChange(void);
  virtual void ShoutBoxChange(void);
  virtual void CountButtonClick(void);
  virtual void NoteButtonClick(void);
  virtual void QuitButtonClick(void);
// [END_COMPONENT_EVENTS]

private:
  void Greet(void);

  int32 m_Clicks;

};

// [FORM_HEADER_BOTTOM]
#endif // _MainForm_H
// [END_FORM_HEADER_BOTTOM]


