// SPDX-License-Identifier: MIT
// Writes the header of a form: its view class and its form class.

#pragma once

#include "codegen/FormEmitter.h"

class TComponent;
struct TEvent;

/// Emits the header of one form.
///
/// Everything generated stands in machine sections, so that declarations that the user adds outside of
/// them stay. A new file also gets what stands between the sections: the comment at its top and the ends of
/// the two classes.
class TFormHeaderEmitter : public TFormEmitter {
public:
	virtual void EmitHeaderComments(BString& text);
	virtual void EmitHeaderStart(BString& text);
	virtual void EmitHeaderEnd(BString& text);

	virtual void EmitViewClassStart(BString& text);
	virtual void EmitViewClassBody(BString& text);
	virtual void EmitViewClassEnd(BString& text);

	virtual void EmitWindowClassStart(BString& text);
	virtual void EmitWindowClassBody(BString& text);
	virtual void EmitWindowClassEnd(BString& text);

	virtual void EmitTopViewClass(BString& text);

	/// One member for each component of the form.
	virtual void EmitComponentDecls(BString& text);
	virtual void EmitComponentDecl(TComponent* component, BString& text);

	/// One member function for each selected event.
	virtual void EmitComponentEventHandlerPrototypes(BString& text);
	virtual void EmitComponentEventHandlerPrototype(
		TComponent* component, TEvent* event, BString& text);
	virtual void EmitFormEventHandlerPrototypes(BString& text);
	virtual void EmitFormEventHandlerPrototype(TEvent* event, BString& text);

private:
	void AppendHeaderIncludes(BString& content);
	void AppendHeaderTopTexts(BString& content);
};
