// SPDX-License-Identifier: MIT
// A project whose forms have every component class there is, with every event ticked.

#pragma once

#include <string>
#include <vector>

#include <Rect.h>

#include "codegen/Dialect.h"

class TComponent;
class TDesignForm;
class TEvent;
class TProject;

/// An event of the project, and what it is about.
struct project_event {
	std::string owner;     ///< the form's name, or the application's
	std::string component; ///< "" for an event of the form or the application itself
	std::string className; ///< of the component
	BRect frame;           ///< of the component, on the form
	const TEvent* event;
	bool isTicked; ///< false when the compiler does not take what would be generated
};

/// Designs the project: the main form "Main" with one component of each entry of the palette, and the form
/// "Note". Says on standard error what could not be done; false then.
///
/// In the classic dialect an event whose parameters no compiler can read is not ticked.
bool DesignEvents(TProject* project, source_dialect dialect, std::vector<project_event>* events);
