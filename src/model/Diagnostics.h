// SPDX-License-Identifier: MIT
// Small helpers for the diagnostics on standard output. Not for component libraries.

#pragma once

/// \a text, or what stands for a missing one.
inline const char*
ShownText(const char* text)
{
	return text != nullptr ? text : "(null)";
}


/// Prints a call of \a function with the two texts, either of which may be null:
/// TComponent::SetPropertyValue('Label', 'OK'). Every property of a form has two of these lines while the form
/// is loaded.
void PrintCall(const char* function, const char* first, const char* second);

/// From now on, PrintCall() prints nothing. For programs whose standard output nobody sees; call it before
/// there are other threads.
void DiscardCalls();
