// SPDX-License-Identifier: MIT
// What must hold for any text that is read as a colour, as flags, or as a property's value.

#pragma once

#include <cstddef>
#include <cstdint>

/// Reads the bytes as a colour, as flags of views and windows, and as the values of a form's and a button's
/// properties. Aborts when something that must hold does not. Needs PrepareFormChecks().
void CheckPropertyText(const uint8_t* bytes, size_t size);
