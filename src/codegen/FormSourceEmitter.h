// SPDX-License-Identifier: MIT
// Writes the two sources of a form: the user's and the one that creates the components.

#pragma once

#include "codegen/FormEmitter.h"

class TComponent;
struct TEvent;

/// Emits the two implementation files of one form.
///
/// The ".fcp" file holds the constructor, the destructor and _formInit(), and is written anew on every run.
/// The ".cpp" file is the user's: only its include section is rewritten, and functions that it lacks are
/// appended. FileExists() and FileText() refer to the ".cpp" file.
class TFormSourceEmitter : public TFormEmitter {
public:
	virtual void EmitSourceComments(BString& text);
	virtual void EmitSourceIncludes(BString& text);

	virtual void EmitMachineBlockStart(BString& text);
	virtual void EmitMachineBlockEnd(BString& text);

	virtual void EmitFormConstructor(BString& text);
	virtual void EmitFormConstructStart(BString& text);
	virtual void EmitFormConstructBody(BString& text);
	virtual void EmitFormConstructEnd(BString& text);

	virtual void EmitFormDestructor(BString& text);
	virtual void EmitFormDestructStart(BString& text);
	virtual void EmitFormDestructBody(BString& text);
	virtual void EmitFormDestructEnd(BString& text);

	/// Creates the components: those on the form itself first, then those in containers.
	virtual void EmitFormInit(BString& text);
	virtual void EmitFormInitStart(BString& text);
	virtual void EmitFormInitBody(BString& text);
	virtual void EmitFormInitEnd(BString& text);

	virtual void EmitFormCreate(BString& text);
	virtual void EmitFormDestroy(BString& text);

	virtual void EmitFormEventHandlers(BString& text);
	virtual void EmitFormEventHandlerStart(TEvent* event, BString& text);
	virtual void EmitFormEventHandlerBody(TEvent* event, BString& text);
	virtual void EmitFormEventHandlerEnd(TEvent* event, BString& text);

	virtual void EmitComponentEventHandlers(BString& text);
	virtual void EmitComponentEventHandlerStart(
		TComponent* component, TEvent* event, BString& text);
	virtual void EmitComponentEventHandlerBody(TComponent* component, TEvent* event, BString& text);
	virtual void EmitComponentEventHandlerEnd(TComponent* component, TEvent* event, BString& text);

	virtual void EmitMessageProc(BString& text);
	virtual void EmitMessageProcStart(BString& text);
	virtual void EmitMessageEventDispatch(TComponent* component, TEvent* event, BString& text);
	virtual void EmitMessageProcEnd(BString& text);

	virtual void EmitComponentConstructor(TComponent* component, BString& text);
	virtual void EmitComponentPropSet(TComponent* component, BString& text);
	virtual void EmitComponentEventAssign(TComponent* component, BString& text);
	virtual void EmitComponentExtendedInit(TComponent* component, BString& text);

private:
	bool IsFunctionMissing(const char* function) const;
	void EmitFormColor(const char* property, BString& text);
	void EmitFormFont(const char* property, BString& text);
	void EmitComponentInit(TComponent* component, BString& text);
};
