// SPDX-License-Identifier: MIT
// Writes the header of the application class.

#include "codegen/AppHeaderEmitter.h"

#include "app/WindowGuard.h"
#include "codegen/FormParts.h"
#include "codegen/HandlerNames.h"
#include "designer/DesignForm.h"
#include "model/AppComponent.h"
#include "model/Diagnostics.h"
#include "model/Event.h"


void
TAppHeaderEmitter::EmitHeaderComments(BString& text)
{
	if (!FileExists())
		text << "//\n// T$APPNAME class definition\n//\n\n";
}


void
TAppHeaderEmitter::EmitHeaderIncludes(BString& text)
{
	BString content("#include <Ormi.h>\n");
	for (int32 i = 0; i < App()->CountComponents(); i++) {
		TDesignForm* form = FormAt(App(), i);
		if (form == nullptr)
			continue;

		WindowGuard guard(form);
		if (!guard.IsLocked())
			continue;
		char buffer[kGeneratedNameSize];
		content << "#include \"" << BaseFormFilename(form, buffer) << ".h\"\n";
	}
	EmitMachineSection("APP_HEADER_INCLUDES", content, text);
}


void
TAppHeaderEmitter::EmitHeaderStart(BString& text)
{
	BString content;
	content << "#ifndef _$APPNAME_H\n"
			<< "#define _$APPNAME_H\n";
	EmitMachineSection("APP_HEADER_TOP", content, text);
}


void
TAppHeaderEmitter::EmitAppClassStart(BString& text)
{
	BString content;
	content << "extern const char *APP_SIG;\n\n"
			<< "class T$APPNAME: public BApplication {\n"
			<< "$TABTForm *m_MainForm;\n"
			<< "public:\n"
			<< "$TABT$APPNAME(void);\n"
			<< "$TABvirtual ~T$APPNAME(void);\n\n"
			<< "$TABvirtual TForm *MainForm() const { return m_MainForm; }\n"
			<< "$TABvirtual void MessageReceived(BMessage *);\n";
	EmitMachineSection("APP_CLASS", content, text);
}


void
TAppHeaderEmitter::EmitAppClassBody(BString& text)
{
	BString content;
	for (int32 i = 0; i < App()->CountEvents(); i++) {
		TEvent* event = App()->EventAt(i);
		if (IsSelected(event))
			EmitEventHandlerPrototype(event, content);
	}
	EmitMachineSection("APP_EVENTS", content, text);
}


void
TAppHeaderEmitter::EmitAppClassEnd(BString& text)
{
	if (!FileExists())
		text << "};\n\n";
}


void
TAppHeaderEmitter::EmitEventHandlerPrototype(TEvent* event, BString& text)
{
	text << HandlerPrototype(*event, HandlerName(*event).String());
	PrintDiagnostic("EmitEventhandlerPrototype: %s\n", text.String());
}


void
TAppHeaderEmitter::EmitHeaderEnd(BString& text)
{
	BString content("#endif // _$APPNAME_H\n");
	EmitMachineSection("APP_HEADER_BOTTOM", content, text);
}
