// SPDX-License-Identifier: MIT
// The content of a document that the designer could not read completely.

#pragma once

#include <SupportDefs.h>

/// Copies the file at \a path beside itself, before it is saved over: as "PATH.orig", or where that is taken as
/// "PATH.orig2", "PATH.orig3" and so on.
///
/// None of these is ever replaced: each may hold what is nowhere else. B_OK, too, when one of them has the file's
/// content already, and when there is no file. On failure nothing has changed.
status_t KeepOriginal(const char* path);
