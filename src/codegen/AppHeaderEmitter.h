// SPDX-License-Identifier: MIT
// Writes the header of the application class.

#pragma once

#include "codegen/AppEmitter.h"

struct TEvent;

/// Emits the header of the generated program's application class.
class TAppHeaderEmitter : public TAppEmitter {
public:
	virtual void EmitHeaderComments(BString& text);
	virtual void EmitHeaderIncludes(BString& text);
	virtual void EmitHeaderStart(BString& text);

	virtual void EmitAppClassStart(BString& text);

	/// One member function for each selected event. Prints a trace line for each on standard output.
	virtual void EmitAppClassBody(BString& text);
	virtual void EmitAppClassEnd(BString& text);
	virtual void EmitEventHandlerPrototype(TEvent* event, BString& text);

	virtual void EmitHeaderEnd(BString& text);
};
