// SPDX-License-Identifier: MIT
// What the program was started with.

#ifndef _START_ARGUMENTS_H
#define _START_ARGUMENTS_H

class BMessage;

namespace BPrivate {

/// Set in a program's environment: its arguments are files, to be opened as B_REFS_RECEIVED. A desktop entry sets it as
/// BRoster::Launch() does; the application object removes it, so that it does not reach the program's own children.
inline constexpr const char* kArgumentsAreFiles = "BE_ARGUMENTS_ARE_FILES";

/// Fills \a message with what the application gets before it is ready: B_ARGV_RECEIVED ("argc", "argv", "cwd") or
/// B_REFS_RECEIVED ("refs"; files that do not exist are left out). False when there are no arguments.
bool GetStartMessage(BMessage* message);

/// Fills \a message with arguments as B_ARGV_RECEIVED has them. The first is the program.
void MakeArgvMessage(int argc, const char* const* argv, BMessage* message);

} // namespace BPrivate

#endif // _START_ARGUMENTS_H
