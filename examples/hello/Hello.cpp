//
// Application implementation
//

// [APP_IMPL_TOP]
#include <Ormi.h>
#include <Application.h>

#include "Hello.h"

const char *APP_SIG = "application/x-vnd.Plimworks-Hello";
// [END_APP_IMPL_TOP]

// [APP_CONSTRUCT]
THello::THello(void)
: BApplication(APP_SIG)
{
  m_MainForm = new TMainForm();
  m_MainForm->MakeMainForm(true);
  m_MainForm->Show();
}
// [END_APP_CONSTRUCT]

// [APP_DESTRUCT]
THello::~THello(void)
{
}
// [END_APP_DESTRUCT]

void THello::MessageReceived(BMessage *message)
{
  switch(message->what)
  {
    default:
    {
      BApplication::MessageReceived(message);
    }
  }
}

// [APP_MAIN]
int main(void)
{
  THello app;
  app.Run();
  return 0;
}
// [END_APP_MAIN]


