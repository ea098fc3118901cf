// SPDX-License-Identifier: MIT
// What the handlers of the tests' forms write down, from all windows' threads.

#pragma once

#include <mutex>
#include <string>
#include <utility>
#include <vector>

using Lines = std::vector<std::string>;

/// The lines of all forms of a test, in the order in which they came. Any thread.
class EventLog {
public:
	void Add(const std::string& line)
	{
		std::lock_guard lock(fMutex);
		fLines.push_back(line);
	}

	/// The lines since the last call.
	Lines Take()
	{
		std::lock_guard lock(fMutex);
		return std::exchange(fLines, Lines());
	}

private:
	std::mutex fMutex;
	Lines fLines;
};

inline EventLog gEvents;
