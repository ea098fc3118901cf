// SPDX-License-Identifier: MIT
// Writes the header of the application class in standard C++.

#pragma once

#include "codegen/AppHeaderEmitter.h"

/// The application's header as every compiler takes it: with plain spaces in the events' parameters.
class TStandardAppHeaderEmitter : public TAppHeaderEmitter {
public:
	void EmitMachineSection(const char* name, BString& content, BString& text) override;
	void EmitHeaderComments(BString& text) override;
};
