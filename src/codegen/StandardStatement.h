// SPDX-License-Identifier: MIT
// The statements that set properties, and the handlers of events, as standard C++.

#pragma once

#include <String.h>

class TProperty;
struct TEvent;

/// The statement that gives \a object (a component's name, or an expression for a view) the property's value;
/// several lines for some. Empty when the property has no value that a program could set.
BString StandardSetStatement(const TProperty& property, const char* object);

/// The head of the definition of the handler \a name, up to the opening brace. Its parameters may stay unused.
BString StandardHandlerStart(const TEvent& event, const char* className, const char* name);

/// The body of a new handler. \a baseClass: the class whose hook of the same name OnQuitRequested asks; null for
/// events that are no hooks.
BString StandardHandlerBody(const TEvent& event, const char* baseClass);

/// The event's parameters without odd spaces in them.
BString PlainParameters(const TEvent& event);
