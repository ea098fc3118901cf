// SPDX-License-Identifier: MIT
// Text for generated sources.

#pragma once

class BString;

/// Appends \a text to \a source as a string literal; null stands for the empty text.
void AppendLiteral(BString& source, const char* text);
