// SPDX-License-Identifier: MIT
// The form that the benchmarks work on.

#pragma once

#include <SupportDefs.h>

class TDesignForm;

/// Loads the component libraries beside the program; false, with a line on standard error, without any.
bool LoadStandardComponents();

/// Places \a count buttons on \a form, in rows of 25.
void PlaceButtons(TDesignForm* form, int32 count);

/// Sends what is printed on standard output nowhere.
void SilenceOutput();
