//
// THello class definition
//

// [APP_HEADER_TOP]
#ifndef _Hello_H
#define _Hello_H
// [END_APP_HEADER_TOP]

// [APP_HEADER_INCLUDES]
#include <Ormi.h>
#include "NoteForm.h"
#include "MainForm.h"
// [END_APP_HEADER_INCLUDES]

// [APP_CLASS]
extern const char *APP_SIG;

class THello: public BApplication {
  TForm *m_MainForm;
public:
  THello(void);
  virtual ~THello(void);

  virtual TForm *MainForm() const { return m_MainForm; }
  virtual void MessageReceived(BMessage *);
// [END_APP_CLASS]

// [APP_EVENTS]
// [END_APP_EVENTS]

};

// [APP_HEADER_BOTTOM]
#endif // _Hello_H
// [END_APP_HEADER_BOTTOM]


