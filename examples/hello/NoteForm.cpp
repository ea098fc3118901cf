//
// NoteForm.cpp
// TNoteForm implementation
//

// [FORM_IMPL_INCLUDES]
#include "NoteForm.h"
#include "NoteForm.fcp"
// [END_FORM_IMPL_INCLUDES]

void TNoteForm::MessageReceived(BMessage *msg)
{
  switch(msg->what)
  {
    default:
      TForm::MessageReceived(msg);
      break;
  }
}

void TNoteForm::FormCreate(void)
{
  NoteField->MakeFocus();
}

void TNoteForm::FormDestroy(void)
{

}

void TNoteForm::CloseButtonClick(void)
{
  PostMessage(B_QUIT_REQUESTED);
}


