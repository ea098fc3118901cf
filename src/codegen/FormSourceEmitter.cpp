// SPDX-License-Identifier: MIT
// Writes the user's source of a form: its includes, message function and event handlers.

#include "codegen/FormSourceEmitter.h"

#include "codegen/FormParts.h"
#include "codegen/HandlerIndex.h"
#include "codegen/HandlerNames.h"
#include "designer/DesignForm.h"
#include "model/Component.h"
#include "model/ComponentOwner.h"
#include "model/Event.h"

namespace {

BString
FormClassName(TDesignForm* form)
{
	BString name("T");
	name << form->ComponentName();
	return name;
}

} // namespace


void
TFormSourceEmitter::EmitSourceComments(BString& text)
{
	if (FileExists())
		return;

	// The header is named after the form's file here, this file after the form.
	const char* name = Form()->ComponentName();
	text << "//\n"
		 << "// " << name << ".cpp\n"
		 << "// T" << name << " implementation\n"
		 << "//\n\n";
}


void
TFormSourceEmitter::EmitSourceIncludes(BString& text)
{
	char buffer[kGeneratedNameSize];
	const char* file = BaseFormFilename(Form(), buffer);

	BString content;
	content << "#include \"" << file << ".h\"\n"
			<< "#include \"" << file << ".fcp\"\n";
	EmitMachineSection("FORM_IMPL_INCLUDES", content, text);
}


void
TFormSourceEmitter::EmitFormCreate(BString& text)
{
	if (!IsFunctionMissing("FormCreate"))
		return;

	text << "void T$FORMNAME::FormCreate(void)\n"
		 << "{\n"
		 << "\n"
		 << "}\n\n";
}


void
TFormSourceEmitter::EmitFormDestroy(BString& text)
{
	if (!IsFunctionMissing("FormDestroy"))
		return;

	text << "void T$FORMNAME::FormDestroy(void)\n"
		 << "{\n\n}\n\n";
}


void
TFormSourceEmitter::EmitFormEventHandlers(BString& text)
{
	const THandlerIndex present(FileText().String(), FormClassName(Form()).String());
	for (int32 i = 0; i < Form()->CountEvents(); i++) {
		TEvent* event = Form()->EventAt(i);
		if (!IsSelected(event))
			continue;
		if (FileExists()
			&& present.Contains(HandlerReturnType(*event), HandlerName(*event).String()))
			continue;

		EmitFormEventHandlerStart(event, text);
		EmitFormEventHandlerBody(event, text);
		EmitFormEventHandlerEnd(event, text);
	}
}


void
TFormSourceEmitter::EmitFormEventHandlerStart(TEvent* event, BString& text)
{
	text << HandlerStart(*event, "T$FORMNAME", HandlerName(*event).String());
}


void
TFormSourceEmitter::EmitFormEventHandlerBody(TEvent* event, BString& text)
{
	text << HandlerBody(*event);
}


void
TFormSourceEmitter::EmitFormEventHandlerEnd(TEvent*, BString& text)
{
	text << HandlerEnd();
}


void
TFormSourceEmitter::EmitComponentEventHandlers(BString& text)
{
	// A large form has thousands of handlers: the old text is searched once for all of them.
	const THandlerIndex present(FileText().String(), FormClassName(Form()).String());
	const TComponentOwner* components = FormComponents(Form());
	for (int32 i = 0; i < components->CountComponents(); i++) {
		TComponent* component = components->ComponentAt(i);
		for (int32 j = 0; j < component->CountEvents(); j++) {
			TEvent* event = component->EventAt(j);
			if (!IsSelected(event))
				continue;
			if (FileExists()
				&& present.Contains(
					HandlerReturnType(*event), HandlerName(*component, *event).String()))
				continue;

			EmitComponentEventHandlerStart(component, event, text);
			EmitComponentEventHandlerBody(component, event, text);
			EmitComponentEventHandlerEnd(component, event, text);
		}
	}
}


void
TFormSourceEmitter::EmitComponentEventHandlerStart(
	TComponent* component, TEvent* event, BString& text)
{
	text << HandlerStart(*event, "T$FORMNAME", HandlerName(*component, *event).String());
}


void
TFormSourceEmitter::EmitComponentEventHandlerBody(TComponent*, TEvent* event, BString& text)
{
	text << HandlerBody(*event);
}


void
TFormSourceEmitter::EmitComponentEventHandlerEnd(TComponent*, TEvent*, BString& text)
{
	text << HandlerEnd();
}


void
TFormSourceEmitter::EmitMessageProc(BString& text)
{
	if (!IsFunctionMissing("MessageReceived"))
		return;

	EmitMessageProcStart(text);
	EmitMessageEventDispatch(nullptr, nullptr, text);
	EmitMessageProcEnd(text);
}


void
TFormSourceEmitter::EmitMessageProcStart(BString& text)
{
	text << "void T$FORMNAME::MessageReceived(BMessage *msg)\n"
		 << "{\n"
		 << "$TABswitch(msg->what)\n"
		 << "$TAB{\n";
}


void
TFormSourceEmitter::EmitMessageEventDispatch(TComponent*, TEvent*, BString&)
{
}


void
TFormSourceEmitter::EmitMessageProcEnd(BString& text)
{
	text << "$TAB$TABdefault:\n"
		 << "$TAB$TAB$TABTForm::MessageReceived(msg);\n"
		 << "$TAB$TAB$TABbreak;\n"
		 << "$TAB}\n"
		 << "}\n\n";
}


/// Whether the user's file lacks "void TForm::function", here for the form's own name.
bool
TFormSourceEmitter::IsFunctionMissing(const char* function) const
{
	if (!FileExists())
		return true;

	BString key("void ");
	key << FormClassName(Form()) << "::" << function;
	return FileText().IFindFirst(key) < 0;
}
