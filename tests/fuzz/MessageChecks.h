// SPDX-License-Identifier: MIT
// What must hold for any bytes that are read as a message.
#ifndef TESTS_FUZZ_MESSAGE_CHECKS_H
#define TESTS_FUZZ_MESSAGE_CHECKS_H

#include <cstddef>
#include <cstdint>

/// Reads the bytes as a message in every way there is, finds everything in it, edits it by the bytes
/// that follow the message, and writes it again. Aborts with a line on standard error when something
/// that must hold does not.
void CheckMessageBytes(const uint8_t* bytes, size_t size);

#endif // TESTS_FUZZ_MESSAGE_CHECKS_H
