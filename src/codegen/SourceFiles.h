// SPDX-License-Identifier: MIT
// Looking at, reading and making the files and folders that generation works on.

#pragma once

#include <vector>

#include <SupportDefs.h>

class BString;

/// True when \a path names an entry; links are followed.
bool PathExists(const char* path);

/// True when \a path is a folder or leads to one.
bool IsFolder(const char* path);

/// True when there is an entry at \a path, be it a link that leads nowhere.
bool FileExists(const char* path);

/// Creates the one directory \a path; its parent must exist.
///
/// Returns true when it was created or was there already.
bool CreatePath(const char* path);

/// Sets \a content to the bytes of the file at \a path; B_OK, or why it cannot be read.
status_t ReadContent(const char* path, std::vector<char>& content);

/// Sets \a text to the normalised content of the file at \a path.
///
/// Every line ends with one line break, tabs become two spaces, and text that ends with a line break gains an
/// empty line. A line of more than 1023 bytes is cut there, and the rest of the file is not read.
/// \a cutLine: set to the number (from 1) of the first line that lost bytes, or to 0; may be null.
/// Returns B_OK; otherwise the error of opening or reading, with \a text empty.
status_t ReadFileInto(BString& text, const char* path, int32* cutLine = nullptr);
