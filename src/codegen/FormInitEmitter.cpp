// SPDX-License-Identifier: MIT
// Writes the machine's source of a form: its constructor, destructor and the creation of its components.

#include "codegen/FormSourceEmitter.h"

#include <string>
#include <string_view>

#include "codegen/FormParts.h"
#include "codegen/HandlerNames.h"
#include "codegen/SourceText.h"
#include "designer/DesignForm.h"
#include "model/Component.h"
#include "model/ComponentOwner.h"
#include "model/Event.h"
#include "model/Property.h"

namespace {

/// The set statement of a property with its later lines indented; empty when there is no such property.
BString
IndentedSetStatement(const TComponent* component, const char* name)
{
	const TProperty* property = component->FindProperty(name);
	BString statement;
	if (property != nullptr)
		statement = property->SetStatement();
	IndentContinuationLines(statement);
	return statement;
}

} // namespace


void
TFormSourceEmitter::EmitMachineBlockStart(BString&)
{
}


void
TFormSourceEmitter::EmitMachineBlockEnd(BString&)
{
}


void
TFormSourceEmitter::EmitFormConstructor(BString& text)
{
	EmitFormConstructStart(text);
	EmitFormConstructBody(text);
	EmitFormConstructEnd(text);
}


void
TFormSourceEmitter::EmitFormConstructStart(BString& text)
{
	const char* flags = PropertyText(Form(), "WindowFlags");
	if (flags[0] == '\0')
		flags = "0";

	text << "T$FORMNAME::T$FORMNAME(void)\n"
		 << ": TForm(\n"
		 << "    " << FrameExpression(Form()) << "\n"
		 << "  , \"" << PropertyText(Form(), "Title") << "\"\n"
		 << "  , " << PropertyText(Form(), "WindowLook") << "\n"
		 << "  , " << PropertyText(Form(), "WindowFeel") << "\n"
		 << "  , " << flags << "\n"
		 << "  )\n"
		 << "{\n";
}


void
TFormSourceEmitter::EmitFormConstructBody(BString& text)
{
	text << "$TABSetFormView(new T$FORMNAMEView(this));\n\n";
	EmitFormColor("ViewColor", text);
	EmitFormColor("HighColor", text);
	EmitFormColor("LowColor", text);
	EmitFormFont("Font", text);
	EmitFormFont("FontSize", text);
	text << "\n";
}


void
TFormSourceEmitter::EmitFormConstructEnd(BString& text)
{
	text << "$TAB_formInit();\n"
		 << "$TABFormCreate();\n"
		 << "}\n\n";
}


void
TFormSourceEmitter::EmitFormDestructor(BString& text)
{
	EmitFormDestructStart(text);
	EmitFormDestructBody(text);
	EmitFormDestructEnd(text);
}


void
TFormSourceEmitter::EmitFormDestructStart(BString& text)
{
	text << "T$FORMNAME::~T$FORMNAME(void)\n"
		 << "{\n";
}


void
TFormSourceEmitter::EmitFormDestructBody(BString& text)
{
	text << "$TABFormDestroy();\n";
}


void
TFormSourceEmitter::EmitFormDestructEnd(BString& text)
{
	text << "}\n\n";
}


void
TFormSourceEmitter::EmitFormInit(BString& text)
{
	EmitFormInitStart(text);
	EmitFormInitBody(text);
	EmitFormInitEnd(text);
}


void
TFormSourceEmitter::EmitFormInitStart(BString& text)
{
	text << "void T$FORMNAME::_formInit(void)\n"
		 << "{\n";
}


void
TFormSourceEmitter::EmitFormInitBody(BString& text)
{
	text << "\n";
	const TComponentOwner* components = FormComponents(Form());
	const int32 count = components->CountComponents();
	// A container must exist before what it contains.
	for (int32 i = 0; i < count; i++) {
		TComponent* component = components->ComponentAt(i);
		if (IsOwnedByForm(Form(), component))
			EmitComponentInit(component, text);
	}
	for (int32 i = 0; i < count; i++) {
		TComponent* component = components->ComponentAt(i);
		if (!IsOwnedByForm(Form(), component))
			EmitComponentInit(component, text);
	}
	for (int32 i = 0; i < count; i++)
		EmitComponentExtendedInit(components->ComponentAt(i), text);
}


void
TFormSourceEmitter::EmitFormInitEnd(BString& text)
{
	text << "}\n\n";
}


void
TFormSourceEmitter::EmitComponentConstructor(TComponent* component, BString& text)
{
	BString params;
	component->OnSetConstructorParams(params);

	BString statement("$TAB$PARENT->AddChild(\n"
					  "$TAB$TAB$COMPONENT = new $CLSNAME<T$FORMNAME>(this,$RECT,\"$COMPONENT\"");
	if (params.Length() > 0)
		statement << ",$PARAMS";
	statement << ")\n  );\n";

	const BString frame = FrameExpression(component);
	ReplacePlaceholders(statement,
		{{"$FORMNAME", Form()->ComponentName()}, {"$PARENT", ParentExpression(Form(), component)},
			{"$COMPONENT", component->ComponentName()}, {"$CLSNAME", component->ClassName()},
			{"$RECT", frame.String()}, {"$PARAMS", params.String()}});
	text << "$TAB// create " << component->ComponentName() << "\n" << statement;
}


void
TFormSourceEmitter::EmitComponentPropSet(TComponent* component, BString& text)
{
	const std::string_view name = component->ComponentName();
	text << "$TAB// initialize " << component->ComponentName() << "\n";
	std::string statements;
	statements.reserve(1024);
	const int32 count = component->CountProperties();
	for (int32 i = 0; i < count; i++) {
		const TProperty* property = component->PropertyAt(i);
		if (property == nullptr || !property->IsGenerated())
			continue;

		AppendStatement(statements, property->SetStatement(),
			{{"$COMPONENT", name}, {"$VALUE", property->Value()}});
	}
	text.Append(statements.data(), static_cast<int32>(statements.length()));
}


void
TFormSourceEmitter::EmitComponentEventAssign(TComponent* component, BString& text)
{
	for (int32 i = 0; i < component->CountEvents(); i++) {
		const TEvent* event = component->EventAt(i);
		if (IsSelected(event)) {
			text << "$TAB" << component->ComponentName() << "->" << event->name << " = &"
				 << HandlerName(*component, *event) << ";\n";
		}
	}
}


void
TFormSourceEmitter::EmitComponentExtendedInit(TComponent* component, BString& text)
{
	BString init;
	if (!component->OnGenInitForm(init))
		return;

	std::string statement;
	AppendStatement(statement, init, {{"$COMPONENT", component->ComponentName()}});
	text << "$TAB// Extended init for " << component->ComponentName() << "\n" << statement.c_str();
}


void
TFormSourceEmitter::EmitFormColor(const char* property, BString& text)
{
	BString statement = IndentedSetStatement(Form(), property);
	ReplacePlaceholder(statement, "$COMPONENT", "FormView()");
	ReplacePlaceholder(statement, "$VALUE", PropertyText(Form(), property));
	text << "$TAB" << statement << "\n";
}


void
TFormSourceEmitter::EmitFormFont(const char* property, BString& text)
{
	// The standard statement names the form, where its view is meant.
	BString statement = IndentedSetStatement(Form(), property);
	const char* name = Form()->ComponentName();
	if (name[0] != '\0')
		statement.ReplaceAll(name, "FormView()");
	ReplacePlaceholder(statement, "$VALUE", PropertyText(Form(), property));
	text << "$TAB" << statement << "\n";
}


void
TFormSourceEmitter::EmitComponentInit(TComponent* component, BString& text)
{
	EmitComponentConstructor(component, text);
	EmitComponentPropSet(component, text);
	EmitComponentEventAssign(component, text);
	text << "$TAB// end initialize " << component->ComponentName() << "\n\n";
}
