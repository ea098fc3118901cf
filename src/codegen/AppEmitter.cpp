// SPDX-License-Identifier: MIT
// What the emitters of the application's files share.

#include "codegen/AppEmitter.h"

#include "codegen/SourceText.h"


TAppEmitter::TAppEmitter()
	: fApp(nullptr),
	  fFileExists(false)
{
}


TAppEmitter::~TAppEmitter() = default;


void
TAppEmitter::EmitUserSection(const char* name, BString& out)
{
	WriteUserSection(name, fFileExists, fFileText, out);
}


void
TAppEmitter::EmitMachineSection(const char* name, BString& content, BString& text)
{
	if (!WriteMachineSection(name, content, fFileExists, text))
		fSkippedSections.Add(name);
}
