// SPDX-License-Identifier: MIT
// What must hold for any bytes that are read as a form file or a project file.
#ifndef TESTS_FUZZ_FORM_CHECKS_H
#define TESTS_FUZZ_FORM_CHECKS_H

#include <cstddef>
#include <cstdint>

/// Makes the application, without a display, and loads the standard components from \a folder. Once,
/// before the checks.
void PrepareFormChecks(const char* folder);

/// Loads the bytes as a form file into a hidden form: it loads, and then saves and loads again as the
/// same, or the form stays as it was. Aborts with a line on standard error when something that must
/// hold does not. Returns whether it loaded.
bool CheckFormBytes(const uint8_t* bytes, size_t size);

/// The same for a project file and a project of hidden forms. The forms that the document names are
/// looked for, too, but never written.
bool CheckProjectBytes(const uint8_t* bytes, size_t size);

/// Loads the bytes as a project file beside which the forms of the example lie, looks for problems in it, and
/// generates it without writing. Documents are only read. Returns whether it loaded.
bool CheckWholeProject(const uint8_t* bytes, size_t size);

#endif // TESTS_FUZZ_FORM_CHECKS_H
