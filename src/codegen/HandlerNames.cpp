// SPDX-License-Identifier: MIT
// The names that generated code gives to files and event handlers.

#include "codegen/HandlerNames.h"

#include <string.h>

#include "designer/DesignForm.h"
#include "model/Component.h"
#include "model/Event.h"

namespace {

/// Copies \a length bytes of \a text, or as many as a caller's buffer takes.
char*
CopyName(const char* text, size_t length, char* out)
{
	const size_t room = kGeneratedNameSize - 1;
	const size_t copied = length < room ? length : room;
	memcpy(out, text, copied);
	out[copied] = '\0';
	return out;
}


const char*
WithoutOn(const char* eventName)
{
	return strncmp(eventName, "On", 2) == 0 ? eventName + 2 : eventName;
}


const char*
HandlerParameters(const TEvent& event)
{
	return event.parameters != nullptr ? event.parameters : "void";
}

} // namespace


char*
BaseFilename(const char* path, char* out)
{
	const char* slash = strrchr(path, '/');
	const char* name = slash != nullptr ? slash + 1 : path;
	return CopyName(name, strcspn(name, "."), out);
}


const char*
BaseFormFilename(TDesignForm* form, char* out)
{
	const char* path = form->Filename();
	if (path == nullptr || path[0] == '\0')
		return form->ComponentName();
	return BaseFilename(path, out);
}


char*
EventHandlerName(TEvent* event, char* out)
{
	const BString name = HandlerName(*event);
	return CopyName(name.String(), name.Length(), out);
}


char*
ComponentEventHandlerName(TComponent* component, TEvent* event, char* out)
{
	const BString name = HandlerName(*component, *event);
	return CopyName(name.String(), name.Length(), out);
}


bool
IsSelected(const TEvent* event)
{
	return event != nullptr && event->selected;
}


BString
HandlerName(const TEvent& event)
{
	return BString(WithoutOn(event.name));
}


BString
HandlerName(TComponent& component, const TEvent& event)
{
	BString name(component.ComponentName());
	name << WithoutOn(event.name);
	return name;
}


const char*
HandlerReturnType(const TEvent& event)
{
	return event.returnType != nullptr ? event.returnType : "void";
}


BString
HandlerPrototype(const TEvent& event, const char* name)
{
	BString text("$TABvirtual ");
	text << HandlerReturnType(event) << " " << name << "(" << HandlerParameters(event) << ");\n";
	return text;
}


BString
HandlerStart(const TEvent& event, const char* className, const char* name)
{
	BString text(HandlerReturnType(event));
	text << " " << className << "::" << name << "(" << HandlerParameters(event) << ")\n{\n";
	return text;
}


BString
HandlerBody(const TEvent& event)
{
	if (event.returnType == nullptr)
		return BString("\n");

	BString text("$TAB");
	text << event.returnType << " result;\n\n"
		 << "$TABreturn result;\n";
	return text;
}


BString
HandlerEnd()
{
	return BString("}\n\n");
}
