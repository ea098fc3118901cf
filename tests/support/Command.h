// SPDX-License-Identifier: MIT
// Running other programs from a test.

#pragma once

#include <sys/wait.h>

#include <cstdio>
#include <string>

#include "support/Patience.h"

/// What a command printed, on both its outputs together, and its exit code (-1 when it was killed).
struct command_result {
	int code = -1;
	std::string output;
};

/// What comes before a command that may hang: it is ended after so many seconds.
inline std::string
Within(int seconds)
{
	return "timeout " + std::to_string(seconds * Patience()) + " ";
}


/// Runs a shell command to its end. Commands that may hang bring their own time limit.
inline command_result
RunCommand(const std::string& command)
{
	command_result result;
	FILE* pipe = popen(("( " + command + " ) 2>&1").c_str(), "r");
	if (pipe == nullptr)
		return result;
	char block[4096];
	for (size_t length = fread(block, 1, sizeof(block), pipe); length > 0;
		 length = fread(block, 1, sizeof(block), pipe))
		result.output.append(block, length);
	const int status = pclose(pipe);
	result.code = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
	return result;
}
