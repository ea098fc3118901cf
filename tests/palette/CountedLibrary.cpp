// SPDX-License-Identifier: MIT
// A component library for tests with as many palette entries as the environment variable TEST_ENTRIES says.

#include <cstdlib>
#include <memory>
#include <string>
#include <vector>

#include <ComponentKit.h>
#include <image.h>

namespace {

struct named_entry {
	explicit named_entry(int32 number)
		: name("Entry" + std::to_string(number)),
		  className("T" + name),
		  entry(number, name.c_str(), className.c_str())
	{
	}

	std::string name;
	std::string className;
	TPaletteEntry entry;
};

std::vector<std::unique_ptr<named_entry>> sEntries;

} // namespace

extern "C" bool
InitComponentLib(image_id)
{
	const char* count = getenv("TEST_ENTRIES");
	for (int32 i = 1; count != nullptr && i <= atoi(count); i++)
		sEntries.push_back(std::make_unique<named_entry>(i));
	return true;
}


extern "C" void
UnInitComponentLib()
{
}


extern "C" uint32
CountComponents()
{
	return sEntries.size();
}


extern "C" TPaletteEntry*
EntryAt(uint32 index)
{
	return &sEntries[index]->entry;
}
