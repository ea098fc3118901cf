// SPDX-License-Identifier: MIT
// Writes the header of a form: its view class and its form class.

#include "codegen/FormHeaderEmitter.h"

#include <string>
#include <unordered_set>

#include "codegen/FormParts.h"
#include "codegen/HandlerNames.h"
#include "designer/DesignForm.h"
#include "model/Component.h"
#include "model/ComponentOwner.h"
#include "model/Event.h"


void
TFormHeaderEmitter::EmitHeaderComments(BString& text)
{
	if (FileExists())
		return;

	text << "//\n"
		 << "// $FORMFILE.h\n"
		 << "// T$FORMNAME class definition\n"
		 << "//\n\n";
}


void
TFormHeaderEmitter::EmitHeaderStart(BString& text)
{
	BString content;
	content << "#ifndef _$FORMFILE_H\n"
			<< "#define _$FORMFILE_H\n\n"
			<< "#include <Ormi.h>\n";
	AppendHeaderIncludes(content);
	AppendHeaderTopTexts(content);
	EmitMachineSection("FORM_HEADER_TOP", content, text);
}


void
TFormHeaderEmitter::EmitHeaderEnd(BString& text)
{
	BString content("#endif // _$FORMFILE_H\n");
	EmitMachineSection("FORM_HEADER_BOTTOM", content, text);
}


void
TFormHeaderEmitter::EmitViewClassStart(BString& text)
{
	BString content;
	content << "class T$FORMNAMEView: public TFormView {\n"
			<< "public:\n"
			<< "$TABT$FORMNAMEView(TForm *parent)\n"
			<< "$TAB: TFormView(parent, \"$FORMNAMEView\") {}\n"
			<< "$TABvirtual ~T$FORMNAMEView(void) {}\n";
	EmitMachineSection("FORM_VIEW_CLASS", content, text);
}


void
TFormHeaderEmitter::EmitViewClassBody(BString&)
{
}


void
TFormHeaderEmitter::EmitViewClassEnd(BString& text)
{
	if (!FileExists())
		text << "};\n\n";
}


void
TFormHeaderEmitter::EmitWindowClassStart(BString& text)
{
	BString content;
	content << "class T$FORMNAME: public TForm {\n"
			<< "$TABvoid _formInit(void);\n"
			<< "public:\n"
			<< "$TABT$FORMNAME(void);\n"
			<< "$TABvirtual ~T$FORMNAME(void);\n"
			<< "\n"
			<< "$TABvirtual void MessageReceived(BMessage *);\n"
			<< "$TABvirtual void FormCreate(void);\n"
			<< "$TABvirtual void FormDestroy(void);\n";
	EmitMachineSection("FORM_CLASS", content, text);
}


void
TFormHeaderEmitter::EmitWindowClassBody(BString& text)
{
	BString components;
	EmitComponentDecls(components);
	EmitMachineSection("FORM_COMPONENTS", components, text);

	BString formEvents;
	EmitFormEventHandlerPrototypes(formEvents);
	EmitMachineSection("FORM_EVENTS", formEvents, text);

	BString componentEvents;
	EmitComponentEventHandlerPrototypes(componentEvents);
	EmitMachineSection("COMPONENT_EVENTS", componentEvents, text);

	if (!FileExists())
		text << "\n";
}


void
TFormHeaderEmitter::EmitWindowClassEnd(BString& text)
{
	if (!FileExists())
		text << "};\n\n";
}


void
TFormHeaderEmitter::EmitTopViewClass(BString&)
{
}


void
TFormHeaderEmitter::EmitComponentDecls(BString& text)
{
	const TComponentOwner* components = FormComponents(Form());
	for (int32 i = 0; i < components->CountComponents(); i++)
		EmitComponentDecl(components->ComponentAt(i), text);
}


void
TFormHeaderEmitter::EmitComponentDecl(TComponent* component, BString& text)
{
	text << "$TAB" << component->ClassName() << "<T" << Form()->ComponentName() << "> *"
		 << component->ComponentName() << ";\n";
}


void
TFormHeaderEmitter::EmitComponentEventHandlerPrototypes(BString& text)
{
	const TComponentOwner* components = FormComponents(Form());
	for (int32 i = 0; i < components->CountComponents(); i++) {
		TComponent* component = components->ComponentAt(i);
		for (int32 j = 0; j < component->CountEvents(); j++) {
			TEvent* event = component->EventAt(j);
			if (IsSelected(event))
				EmitComponentEventHandlerPrototype(component, event, text);
		}
	}
}


void
TFormHeaderEmitter::EmitComponentEventHandlerPrototype(
	TComponent* component, TEvent* event, BString& text)
{
	text << HandlerPrototype(*event, HandlerName(*component, *event).String());
}


void
TFormHeaderEmitter::EmitFormEventHandlerPrototypes(BString& text)
{
	for (int32 i = 0; i < Form()->CountEvents(); i++) {
		TEvent* event = Form()->EventAt(i);
		if (IsSelected(event))
			EmitFormEventHandlerPrototype(event, text);
	}
}


void
TFormHeaderEmitter::EmitFormEventHandlerPrototype(TEvent* event, BString& text)
{
	text << HandlerPrototype(*event, HandlerName(*event).String());
}


void
TFormHeaderEmitter::AppendHeaderIncludes(BString& content)
{
	std::unordered_set<std::string> included;
	const TComponentOwner* components = FormComponents(Form());
	for (int32 i = 0; i < components->CountComponents(); i++) {
		const char* header = components->ComponentAt(i)->HeaderFile();
		if (header != nullptr && included.insert(header).second)
			content << "#include <" << header << ">\n";
	}
}


void
TFormHeaderEmitter::AppendHeaderTopTexts(BString& content)
{
	const TComponentOwner* components = FormComponents(Form());
	for (int32 i = 0; i < components->CountComponents(); i++) {
		BString headerTop;
		if (components->ComponentAt(i)->OnGenHeaderFileTop(headerTop))
			content << headerTop << "\n";
	}
}
