// SPDX-License-Identifier: MIT
// A script that uses the running program like a person: BE_ROBOT_SCRIPT names its file.
#ifndef DISPLAY_ROBOT_SCRIPT_H
#define DISPLAY_ROBOT_SCRIPT_H

namespace BPrivate {

/// Starts the script that the environment names, in a thread of its own; nothing without one.
void StartRobotScript();

} // namespace BPrivate

#endif // DISPLAY_ROBOT_SCRIPT_H
