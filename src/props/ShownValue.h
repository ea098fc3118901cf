// SPDX-License-Identifier: MIT
// The texts of editors as the property window shows them.

#pragma once

class BString;

/// A copy of \a text, which may be null, of at most what a property holds: a text filled to its last byte has no
/// terminator of its own.
BString ShownValue(const char* text);
