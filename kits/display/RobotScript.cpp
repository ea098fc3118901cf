// SPDX-License-Identifier: MIT
// A script that uses the running program like a person.
#include "display/RobotScript.h"

namespace BPrivate {

void
StartRobotScript()
{
}

} // namespace BPrivate
