// SPDX-License-Identifier: MIT
// Writes the header of the application class in standard C++.

#include "codegen/StandardAppHeaderEmitter.h"

#include "codegen/StandardText.h"
#include "model/AppComponent.h"


void
TStandardAppHeaderEmitter::EmitMachineSection(const char* name, BString& content, BString& text)
{
	content = PlainSource(content.String());
	TAppHeaderEmitter::EmitMachineSection(name, content, text);
}


void
TStandardAppHeaderEmitter::EmitHeaderComments(BString& text)
{
	if (!FileExists())
		text << "//\n// T" << CommentText(App()->ComponentName()) << " class definition\n//\n\n";
}
