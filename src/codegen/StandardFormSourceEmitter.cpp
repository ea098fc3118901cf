// SPDX-License-Identifier: MIT
// Writes the two sources of a form in standard C++.

#include "codegen/StandardFormSourceEmitter.h"

#include <unordered_set>
#include <vector>

#include "codegen/FormParts.h"
#include "codegen/HandlerNames.h"
#include "codegen/StandardStatement.h"
#include "codegen/StandardText.h"
#include "designer/DesignForm.h"
#include "model/Component.h"
#include "model/ComponentOwner.h"
#include "model/Event.h"
#include "model/Property.h"

namespace {

/// Gives the parameters of an existing handler plain spaces, wherever its definition stands in \a text.
void
PlainHandlerParameters(const TEvent& event, BString& text)
{
	const BString plain = PlainParameters(event);
	if (event.parameters != nullptr && plain != event.parameters)
		text.ReplaceAll(event.parameters, plain.String());
}


/// The components of \a form in the order of creation: every container before what is in it, and otherwise as the
/// form lists them.
std::vector<TComponent*>
InOrderOfCreation(TDesignForm* form)
{
	const TComponentOwner* components = FormComponents(form);
	std::vector<TComponent*> waiting;
	for (int32 i = 0; i < components->CountComponents(); i++)
		waiting.push_back(components->ComponentAt(i));

	std::vector<TComponent*> ordered;
	std::unordered_set<const TComponentOwner*> created;
	while (!waiting.empty()) {
		std::vector<TComponent*> later;
		std::vector<TComponent*> now;
		for (TComponent* component : waiting) {
			const bool canBeCreated =
				IsOwnedByForm(form, component) || created.count(component->Owner()) > 0;
			(canBeCreated ? now : later).push_back(component);
		}
		// Without an owner on the form there is nothing to wait for.
		if (now.empty())
			now.swap(later);
		for (TComponent* component : now)
			created.insert(dynamic_cast<TComponentOwner*>(component));
		ordered.insert(ordered.end(), now.begin(), now.end());
		waiting.swap(later);
	}
	return ordered;
}

} // namespace


void
TStandardFormSourceEmitter::EmitSourceComments(BString& text)
{
	if (FileExists())
		return;

	const BString name = CommentText(Form()->ComponentName());
	text << "//\n"
		 << "// " << name << ".cpp\n"
		 << "// T" << name << " implementation\n"
		 << "//\n\n";
}


void
TStandardFormSourceEmitter::EmitFormConstructStart(BString& text)
{
	BString flags = PropertyText(Form(), "WindowFlags");
	if (flags.IsEmpty())
		flags = "0";

	const BString title = PropertyText(Form(), "Title");
	text << "T$FORMNAME::T$FORMNAME(void)\n"
		 << ": TForm(\n"
		 << "    " << FrameExpression(Form()) << "\n"
		 << "  , " << StringLiteral(title.String()) << "\n"
		 << "  , " << PropertyText(Form(), "WindowLook") << "\n"
		 << "  , " << PropertyText(Form(), "WindowFeel") << "\n"
		 << "  , " << flags << "\n"
		 << "  )\n"
		 << "{\n";
}


void
TStandardFormSourceEmitter::EmitFormConstructBody(BString& text)
{
	text << "$TABSetFormView(new T$FORMNAMEView(this));\n\n";
	for (const char* name : {"ViewColor", "HighColor", "LowColor", "Font", "FontSize"}) {
		const TProperty* property = Form()->FindProperty(name);
		const BString statement =
			property != nullptr ? StandardSetStatement(*property, "FormView()") : BString();
		if (!statement.IsEmpty())
			text << "$TAB" << statement << "\n";
	}
	text << "\n";
}


void
TStandardFormSourceEmitter::EmitFormInitBody(BString& text)
{
	text << "\n";
	const std::vector<TComponent*> components = InOrderOfCreation(Form());
	for (TComponent* component : components)
		EmitComponentParts(component, text);
	const TComponentOwner* listed = FormComponents(Form());
	for (int32 i = 0; i < listed->CountComponents(); i++)
		EmitComponentExtendedInit(listed->ComponentAt(i), text);
}


void
TStandardFormSourceEmitter::EmitFormEventHandlers(BString& text)
{
	for (int32 i = 0; i < Form()->CountEvents(); i++) {
		const TEvent* event = Form()->EventAt(i);
		if (IsSelected(event))
			PlainHandlerParameters(*event, text);
	}
	TFormSourceEmitter::EmitFormEventHandlers(text);
}


void
TStandardFormSourceEmitter::EmitFormEventHandlerStart(TEvent* event, BString& text)
{
	text << StandardHandlerStart(*event, "T$FORMNAME", HandlerName(*event).String());
}


void
TStandardFormSourceEmitter::EmitFormEventHandlerBody(TEvent* event, BString& text)
{
	text << StandardHandlerBody(*event, "TForm");
}


void
TStandardFormSourceEmitter::EmitComponentEventHandlers(BString& text)
{
	const TComponentOwner* components = FormComponents(Form());
	for (int32 i = 0; FileExists() && i < components->CountComponents(); i++) {
		const TComponent* component = components->ComponentAt(i);
		for (int32 j = 0; j < component->CountEvents(); j++) {
			const TEvent* event = component->EventAt(j);
			if (IsSelected(event))
				PlainHandlerParameters(*event, text);
		}
	}
	TFormSourceEmitter::EmitComponentEventHandlers(text);
}


void
TStandardFormSourceEmitter::EmitComponentEventHandlerStart(
	TComponent* component, TEvent* event, BString& text)
{
	text << StandardHandlerStart(*event, "T$FORMNAME", HandlerName(*component, *event).String());
}


void
TStandardFormSourceEmitter::EmitComponentEventHandlerBody(TComponent*, TEvent* event, BString& text)
{
	text << StandardHandlerBody(*event, nullptr);
}


void
TStandardFormSourceEmitter::EmitComponentConstructor(TComponent* component, BString& text)
{
	BString statement;
	TFormSourceEmitter::EmitComponentConstructor(component, statement);
	text << PlainSource(statement.String());
}


void
TStandardFormSourceEmitter::EmitComponentPropSet(TComponent* component, BString& text)
{
	text << "$TAB// initialize " << CommentText(component->ComponentName()) << "\n";
	for (int32 i = 0; i < component->CountProperties(); i++) {
		const TProperty* property = component->PropertyAt(i);
		if (property == nullptr || !property->IsGenerated())
			continue;
		const BString statement = StandardSetStatement(*property, component->ComponentName());
		if (!statement.IsEmpty())
			text << "$TAB" << statement << "\n";
	}
}


void
TStandardFormSourceEmitter::EmitComponentEventAssign(TComponent* component, BString& text)
{
	for (int32 i = 0; i < component->CountEvents(); i++) {
		const TEvent* event = component->EventAt(i);
		if (IsSelected(event)) {
			text << "$TAB" << component->ComponentName() << "->" << event->name
				 << " = &T$FORMNAME::" << HandlerName(*component, *event) << ";\n";
		}
	}
}


void
TStandardFormSourceEmitter::EmitComponentExtendedInit(TComponent* component, BString& text)
{
	BString init;
	TFormSourceEmitter::EmitComponentExtendedInit(component, init);
	text << PlainSource(init.String());
}


/// All that makes one component what it is, but what it needs of others.
void
TStandardFormSourceEmitter::EmitComponentParts(TComponent* component, BString& text)
{
	EmitComponentConstructor(component, text);
	EmitComponentPropSet(component, text);
	EmitComponentEventAssign(component, text);
	text << "$TAB// end initialize " << CommentText(component->ComponentName()) << "\n\n";
}
