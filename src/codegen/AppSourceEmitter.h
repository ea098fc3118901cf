// SPDX-License-Identifier: MIT
// Writes the source of the application class, with the program's main function.

#pragma once

#include "codegen/AppEmitter.h"

struct TEvent;

/// Emits the source of the generated program's application class.
///
/// Its constructor creates and shows the main form; see FindMainForm() for which one that is.
class TAppSourceEmitter : public TAppEmitter {
public:
	virtual void EmitSourceComments(BString& text);
	virtual void EmitSourceIncludes(BString& text);
	virtual void EmitSourceGlobals(BString& text);

	virtual void EmitAppConstructor(BString& text);
	virtual void EmitAppDestructor(BString& text);
	virtual void EmitAppInit(BString& text);
	virtual void EmitMain(BString& text);

	virtual void EmitEventHandlers(BString& text);
	virtual void EmitEventHandlerStart(TEvent* event, BString& text);
	virtual void EmitEventHandlerBody(TEvent* event, BString& text);
	virtual void EmitEventHandlerEnd(TEvent* event, BString& text);

	virtual void EmitMessageProc(BString& text);
	virtual void EmitMessageProcStart(BString& text);
	virtual void EmitMessageProcEnd(BString& text);

protected:
	/// Appends the statements that make and show the main form; none when there is no form.
	void AppendMainForm(BString& text);
};
