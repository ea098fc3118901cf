// SPDX-License-Identifier: MIT
// One event of a component.

#pragma once

#include <stddef.h>

/// An event that the user may ask a handler for.
///
/// The texts are not copied: they are constants of the program, or of the component library that
/// made the component. The component owns its events.
struct TEvent {
	TEvent(const char* name, const char* parameters, const char* returnType, bool selected)
		: name(name),
		  parameters(parameters),
		  returnType(returnType),
		  selected(selected)
	{
	}

	/// From the memory that the parts of components share.
	static void* operator new(size_t size);
	static void operator delete(void* memory);

	/// For example "OnQuitRequested".
	const char* name;

	/// The handler's parameters as source text, for example "bool active"; null stands for none.
	const char* parameters;

	/// The handler's result, for example "bool"; null stands for void.
	const char* returnType;

	/// The user wants a handler.
	bool selected;
};
