// SPDX-License-Identifier: MIT
// The names that generated code gives to files and event handlers.

#pragma once

#include <String.h>

class TComponent;
class TDesignForm;
struct TEvent;

/// Room that the functions below expect behind \a out, in bytes, the terminator included.
inline constexpr int32 kGeneratedNameSize = 256;

/// Copies what follows the last "/" of \a path to \a out, up to its first "."; returns \a out.
char* BaseFilename(const char* path, char* out);

/// The name that \a form's generated files share: the base name of its file.
///
/// Returns \a out, or, for a form without a file, the form's component name with \a out left alone.
const char* BaseFormFilename(TDesignForm* form, char* out);

/// The event's name without a leading "On" (exactly these letters), at most 255 bytes; returns \a out.
char* EventHandlerName(TEvent* event, char* out);

/// The component's name followed by the event's handler name, at most 255 bytes; returns \a out.
char* ComponentEventHandlerName(TComponent* component, TEvent* event, char* out);

/// Whether the user wants a handler for \a event; not for a null one.
bool IsSelected(const TEvent* event);

/// The handler names without a limit of length, as the emitters write them.
BString HandlerName(const TEvent& event);
BString HandlerName(TComponent& component, const TEvent& event);

/// The event's return type as source text, "void" when it has none.
const char* HandlerReturnType(const TEvent& event);

/// The declaration of the handler \a name inside its class, with its line break.
BString HandlerPrototype(const TEvent& event, const char* name);

/// The parts of a handler's definition: its head up to the opening brace, its body, its closing brace.
BString HandlerStart(const TEvent& event, const char* className, const char* name);
BString HandlerBody(const TEvent& event);
BString HandlerEnd();
