// SPDX-License-Identifier: MIT
// Writes the two sources of a form in standard C++.

#pragma once

#include "codegen/FormSourceEmitter.h"

class TProperty;

/// The form's sources as every compiler takes them, without warnings: handlers are assigned as qualified members,
/// texts are escaped, and new handlers may leave their parameters unused. Containers at any depth are created before
/// what is in them.
///
/// In the user's source nothing changes but the parameters that another dialect wrote with odd spaces, which no
/// compiler takes.
class TStandardFormSourceEmitter : public TFormSourceEmitter {
public:
	void EmitSourceComments(BString& text) override;

	void EmitFormConstructStart(BString& text) override;
	void EmitFormConstructBody(BString& text) override;
	void EmitFormInitBody(BString& text) override;

	void EmitFormEventHandlers(BString& text) override;
	void EmitFormEventHandlerStart(TEvent* event, BString& text) override;
	void EmitFormEventHandlerBody(TEvent* event, BString& text) override;

	void EmitComponentEventHandlers(BString& text) override;
	void EmitComponentEventHandlerStart(
		TComponent* component, TEvent* event, BString& text) override;
	void EmitComponentEventHandlerBody(
		TComponent* component, TEvent* event, BString& text) override;

	void EmitComponentConstructor(TComponent* component, BString& text) override;
	void EmitComponentPropSet(TComponent* component, BString& text) override;
	void EmitComponentEventAssign(TComponent* component, BString& text) override;
	void EmitComponentExtendedInit(TComponent* component, BString& text) override;

private:
	void EmitComponentParts(TComponent* component, BString& text);
};
