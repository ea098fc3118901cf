// SPDX-License-Identifier: MIT
// Writes the header of a form in standard C++.

#include "codegen/StandardFormHeaderEmitter.h"

#include "codegen/HandlerNames.h"
#include "codegen/StandardText.h"
#include "designer/DesignForm.h"


void
TStandardFormHeaderEmitter::EmitMachineSection(const char* name, BString& content, BString& text)
{
	content = PlainSource(content.String());
	TFormHeaderEmitter::EmitMachineSection(name, content, text);
}


void
TStandardFormHeaderEmitter::EmitHeaderComments(BString& text)
{
	if (FileExists())
		return;

	char buffer[kGeneratedNameSize];
	text << "//\n"
		 << "// " << CommentText(BaseFormFilename(Form(), buffer)) << ".h\n"
		 << "// T" << CommentText(Form()->ComponentName()) << " class definition\n"
		 << "//\n\n";
}
