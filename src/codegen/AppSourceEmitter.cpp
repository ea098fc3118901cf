// SPDX-License-Identifier: MIT
// Writes the source of the application class, with the program's main function.

#include "codegen/AppSourceEmitter.h"

#include "app/WindowGuard.h"
#include "codegen/FormParts.h"
#include "codegen/HandlerIndex.h"
#include "codegen/HandlerNames.h"
#include "designer/DesignForm.h"
#include "model/AppComponent.h"
#include "model/Event.h"

namespace {

BString
AppClassName(const TAppComponent* app)
{
	BString name("T");
	name << app->ComponentName();
	return name;
}

} // namespace


void
TAppSourceEmitter::EmitSourceComments(BString& text)
{
	if (!FileExists())
		text << "//\n// Application implementation\n//\n\n";
}


void
TAppSourceEmitter::EmitSourceIncludes(BString& text)
{
	BString content;
	content << "#include <Ormi.h>\n"
			<< "#include <Application.h>\n"
			<< "\n"
			<< "#include \"$APPNAME.h\"\n"
			<< "\n"
			<< "const char *APP_SIG = \"$APPSIG\";\n";
	EmitMachineSection("APP_IMPL_TOP", content, text);
}


void
TAppSourceEmitter::EmitSourceGlobals(BString&)
{
}


void
TAppSourceEmitter::EmitAppConstructor(BString& text)
{
	BString content;
	content << "T$APPNAME::T$APPNAME(void)\n"
			<< ": BApplication(APP_SIG)\n"
			<< "{\n";
	AppendMainForm(content);
	content << "}\n";
	EmitMachineSection("APP_CONSTRUCT", content, text);
}


void
TAppSourceEmitter::EmitAppDestructor(BString& text)
{
	BString content;
	content << "T$APPNAME::~T$APPNAME(void)\n"
			<< "{\n"
			<< "}\n";
	EmitMachineSection("APP_DESTRUCT", content, text);
}


void
TAppSourceEmitter::EmitAppInit(BString&)
{
}


void
TAppSourceEmitter::EmitMain(BString& text)
{
	BString content;
	content << "int main(void)\n"
			<< "{\n"
			<< "$TABT$APPNAME app;\n"
			<< "$TABapp.Run();\n"
			<< "$TABreturn 0;\n"
			<< "}\n";
	EmitMachineSection("APP_MAIN", content, text);
}


void
TAppSourceEmitter::EmitEventHandlers(BString& text)
{
	const THandlerIndex present(FileText().String(), AppClassName(App()).String());
	for (int32 i = 0; i < App()->CountEvents(); i++) {
		TEvent* event = App()->EventAt(i);
		if (!IsSelected(event))
			continue;
		if (FileExists()
			&& present.Contains(HandlerReturnType(*event), HandlerName(*event).String()))
			continue;

		EmitEventHandlerStart(event, text);
		EmitEventHandlerBody(event, text);
		EmitEventHandlerEnd(event, text);
	}
}


void
TAppSourceEmitter::EmitEventHandlerStart(TEvent* event, BString& text)
{
	text << HandlerStart(*event, "T$APPNAME", HandlerName(*event).String());
}


void
TAppSourceEmitter::EmitEventHandlerBody(TEvent* event, BString& text)
{
	text << HandlerBody(*event);
}


void
TAppSourceEmitter::EmitEventHandlerEnd(TEvent*, BString& text)
{
	text << HandlerEnd();
}


void
TAppSourceEmitter::EmitMessageProc(BString& text)
{
	BString key("void ");
	key << AppClassName(App()) << "::MessageReceived";
	if (FileExists() && FileText().IFindFirst(key) >= 0)
		return;

	EmitMessageProcStart(text);
	EmitMessageProcEnd(text);
}


void
TAppSourceEmitter::EmitMessageProcStart(BString& text)
{
	text << "void T$APPNAME::MessageReceived(BMessage *message)\n"
		 << "{\n"
		 << "$TABswitch(message->what)\n"
		 << "$TAB{\n";
}


void
TAppSourceEmitter::EmitMessageProcEnd(BString& text)
{
	text << "$TAB$TABdefault:\n"
		 << "$TAB$TAB{\n"
		 << "$TAB$TAB$TABBApplication::MessageReceived(message);\n"
		 << "$TAB$TAB}\n"
		 << "$TAB}\n"
		 << "}\n"
		 << "\n";
}


void
TAppSourceEmitter::AppendMainForm(BString& text)
{
	TDesignForm* mainForm = FindMainForm(App());
	WindowGuard guard(mainForm);
	if (!guard.IsLocked())
		return;
	text << "$TABm_MainForm = new T" << mainForm->ComponentName() << "();\n"
		 << "$TABm_MainForm->MakeMainForm(true);\n"
		 << "$TABm_MainForm->Show();\n";
}
