// SPDX-License-Identifier: MIT
// Small helpers for the diagnostics on standard output. Not for component libraries.

#pragma once

/// \a text, or what stands for a missing one.
inline const char*
ShownText(const char* text)
{
	return text != nullptr ? text : "(null)";
}
