// SPDX-License-Identifier: MIT
// Sounds of the system: the terminal's bell.

#include <Beep.h>

#include <fcntl.h>
#include <unistd.h>

#include <mutex>
#include <set>
#include <string>

namespace {

constexpr const char* kBeepEvent = "Beep";


struct EventTable {
	std::mutex lock;
	std::set<std::string> names = {kBeepEvent};
};


EventTable&
events()
{
	static EventTable* sEvents = new EventTable;
	return *sEvents;
}


status_t
ring_bell()
{
	int terminal = open("/dev/tty", O_WRONLY | O_CLOEXEC | O_NOCTTY | O_NONBLOCK);
	if (terminal < 0)
		return B_ERROR;
	bool rung = write(terminal, "\a", 1) == 1;
	close(terminal);
	return rung ? B_OK : B_ERROR;
}

} // namespace


status_t
beep()
{
	return system_beep(kBeepEvent);
}


status_t
system_beep(const char* eventName)
{
	if (eventName == nullptr)
		return B_BAD_VALUE;
	{
		std::lock_guard lock(events().lock);
		if (events().names.count(eventName) == 0)
			return B_NAME_NOT_FOUND;
	}
	return ring_bell();
}


status_t
add_system_beep_event(const char* eventName, uint32)
{
	if (eventName == nullptr || eventName[0] == '\0')
		return B_BAD_VALUE;
	std::lock_guard lock(events().lock);
	events().names.insert(eventName);
	return B_OK;
}
