// SPDX-License-Identifier: MIT
// Writes the header of a form in standard C++.

#pragma once

#include "codegen/FormHeaderEmitter.h"

/// The form's header as every compiler takes it: what differs are the spaces in the events' parameters and what
/// component libraries put at its top.
class TStandardFormHeaderEmitter : public TFormHeaderEmitter {
public:
	void EmitMachineSection(const char* name, BString& content, BString& text) override;
	void EmitHeaderComments(BString& text) override;
};
