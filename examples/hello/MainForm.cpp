//
// MainForm.cpp
// TMainForm implementation
//

// [FORM_IMPL_INCLUDES]
#include "MainForm.h"
#include "MainForm.fcp"
// [END_FORM_IMPL_INCLUDES]

#include "NoteForm.h"

#include <String.h>

void TMainForm::MessageReceived(BMessage *msg)
{
  switch(msg->what)
  {
    default:
      TForm::MessageReceived(msg);
      break;
  }
}

void TMainForm::FormCreate(void)
{
  m_Clicks = 0;
  Greet();
}

void TMainForm::FormDestroy(void)
{

}

void TMainForm::NameFieldChange(void)
{
  Greet();
}

void TMainForm::ShoutBoxChange(void)
{
  Greet();
}

void TMainForm::CountButtonClick(void)
{
  m_Clicks++;
  BString text;
  text << m_Clicks << (m_Clicks == 1 ? " click" : " clicks");
  CountText->SetText(text.String());
}

void TMainForm::NoteButtonClick(void)
{
  TNoteForm *note = new TNoteForm();
  note->Show();
}

void TMainForm::QuitButtonClick(void)
{
  PostMessage(B_QUIT_REQUESTED);
}

// Greets whoever is named in the field.
void TMainForm::Greet(void)
{
  BString text("Hello");
  if (NameField->TextLength() > 0)
    text << ", " << NameField->Text();
  text << "!";
  if (ShoutBox->Value() == B_CONTROL_ON)
    text.ToUpper();
  GreetingText->SetText(text.String());
}

