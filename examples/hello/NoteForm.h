//
// NoteForm.h
// TNoteForm class definition
//

// [FORM_HEADER_TOP]
#ifndef _NoteForm_H
#define _NoteForm_H

#include <Ormi.h>
#include <StringView.h>
#include <TextControl.h>
#include <Button.h>
// [END_FORM_HEADER_TOP]

// [FORM_VIEW_CLASS]
class TNoteFormView: public TFormView {
public:
  TNoteFormView(TForm *parent)
  : TFormView(parent, "NoteFormView") {}
  virtual ~TNoteFormView(void) {}
// [END_FORM_VIEW_CLASS]

};

// [FORM_CLASS]
class TNoteForm: public TForm {
  void _formInit(void);
public:
  TNoteForm(void);
  virtual ~TNoteForm(void);

  virtual void MessageReceived(BMessage *);
  virtual void FormCreate(void);
  virtual void FormDestroy(void);
// [END_FORM_CLASS]

// [FORM_COMPONENTS]
  TStringView<TNoteForm> *Prompt;
  TTextControl<TNoteForm> *NoteField;
  TButton<TNoteForm> *CloseButton;
// [END_FORM_COMPONENTS]

// [FORM_EVENTS]
// [END_FORM_EVENTS]

// [COMPONENT_EVENTS]
  virtual void CloseButtonClick(void);
// [END_COMPONENT_EVENTS]


};

// [FORM_HEADER_BOTTOM]
#endif // _NoteForm_H
// [END_FORM_HEADER_BOTTOM]


