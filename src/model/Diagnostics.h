// SPDX-License-Identifier: MIT
// The diagnostics on standard output. Not for component libraries.

#pragma once

/// \a text, or what stands for a missing one.
inline const char*
ShownText(const char* text)
{
	return text != nullptr ? text : "(null)";
}


/// What ShowDiagnostics() was told last, and the rest of PrintCall(): for that alone.
extern bool gDiagnosticsShown;
void PrintShownCall(const char* function, const char* first, const char* second);


/// Prints a diagnostic on standard output, as printf() does. \a format brings its line break.
void PrintDiagnostic(const char* format, ...) __attribute__((format(printf, 1, 2)));

/// Prints a call of \a function with the two texts, either of which may be null:
/// TComponent::SetPropertyValue('Label', 'OK'). Every property of a form has two of these lines while the form
/// is loaded.
inline void
PrintCall(const char* function, const char* first, const char* second)
{
	if (gDiagnosticsShown)
		PrintShownCall(function, first, second);
}


/// Whether diagnostics are printed, as they are at first. For programs whose standard output nobody sees, which
/// need not wait for the texts to be put together: call it before there are other threads.
void ShowDiagnostics(bool shown);

/// Keeps the diagnostics of this thread back for the length of a block: of work that the user did not ask for.
class TDiagnosticSilence {
public:
	TDiagnosticSilence();
	~TDiagnosticSilence();

	TDiagnosticSilence(const TDiagnosticSilence&) = delete;
	TDiagnosticSilence& operator=(const TDiagnosticSilence&) = delete;

private:
	bool fWasSilent;
};
