// SPDX-License-Identifier: MIT
// What the emitters of a form's files share.

#include "codegen/FormEmitter.h"

#include "codegen/SourceText.h"


TFormEmitter::TFormEmitter()
	: fForm(nullptr),
	  fFileExists(false)
{
}


TFormEmitter::~TFormEmitter() = default;


void
TFormEmitter::EmitUserSection(const char* name, BString& out)
{
	WriteUserSection(name, fFileExists, fFileText, out);
}


void
TFormEmitter::EmitMachineSection(const char* name, BString& content, BString& text)
{
	if (!WriteMachineSection(name, content, fFileExists, text))
		fSkippedSections.Add(name);
}
