// SPDX-License-Identifier: MIT
// What must hold for any source that a user has edited and that is generated again.

#pragma once

#include <cstddef>
#include <cstdint>

/// Takes the first byte for the kind of file and the rest for its text, generates into it again and again, and works
/// on the text with what the emitters use. Aborts when something that must hold does not. Makes the application, without
/// a display, when it is called first.
void CheckSourceBytes(const uint8_t* bytes, size_t size);
