// SPDX-License-Identifier: MIT
// Writes the source of the application class in standard C++.

#pragma once

#include "codegen/AppSourceEmitter.h"

/// The application's source as every compiler takes it, without warnings: the signature is escaped, the main
/// form's member always has a value, and handlers may leave their parameters unused.
class TStandardAppSourceEmitter : public TAppSourceEmitter {
public:
	void EmitSourceIncludes(BString& text) override;
	void EmitAppConstructor(BString& text) override;
	void EmitEventHandlerStart(TEvent* event, BString& text) override;
	void EmitEventHandlerBody(TEvent* event, BString& text) override;
};
