// SPDX-License-Identifier: MIT
// Writes the source of the application class in standard C++.

#include "codegen/StandardAppSourceEmitter.h"

#include "codegen/FormParts.h"
#include "codegen/HandlerNames.h"
#include "codegen/StandardStatement.h"
#include "codegen/StandardText.h"
#include "model/AppComponent.h"


void
TStandardAppSourceEmitter::EmitSourceIncludes(BString& text)
{
	const BString signature = PropertyText(App(), "Signature");
	BString content;
	content << "#include <Ormi.h>\n"
			<< "#include <Application.h>\n"
			<< "\n"
			<< "#include \"$APPNAME.h\"\n"
			<< "\n"
			<< "const char *APP_SIG = " << StringLiteral(signature.String()) << ";\n";
	EmitMachineSection("APP_IMPL_TOP", content, text);
}


void
TStandardAppSourceEmitter::EmitAppConstructor(BString& text)
{
	BString content;
	content << "T$APPNAME::T$APPNAME(void)\n"
			<< ": BApplication(APP_SIG)\n"
			<< ", m_MainForm(nullptr)\n"
			<< "{\n";
	AppendMainForm(content);
	content << "}\n";
	EmitMachineSection("APP_CONSTRUCT", content, text);
}


void
TStandardAppSourceEmitter::EmitEventHandlerStart(TEvent* event, BString& text)
{
	text << StandardHandlerStart(*event, "T$APPNAME", HandlerName(*event).String());
}


void
TStandardAppSourceEmitter::EmitEventHandlerBody(TEvent* event, BString& text)
{
	text << StandardHandlerBody(*event, "BApplication");
}
