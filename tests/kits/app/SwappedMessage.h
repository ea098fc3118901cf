// SPDX-License-Identifier: MIT
// What a machine of the other byte order would have written in the R5 format.
#ifndef TESTS_KITS_APP_SWAPPED_MESSAGE_H
#define TESTS_KITS_APP_SWAPPED_MESSAGE_H

#include <string>

/// Turns a sound little-endian R5 message with 4-byte counts into the big-endian form.
std::string SwapR5(std::string bytes);

#endif // TESTS_KITS_APP_SWAPPED_MESSAGE_H
