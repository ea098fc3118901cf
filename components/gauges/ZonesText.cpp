// SPDX-License-Identifier: MIT

#include "ZonesText.h"

#include <cstdio>
#include <sstream>
#include <string>

#include <ComponentKit.h>

namespace {

bool
ReadZone(const std::string& text, Gauges::zone* zone)
{
	int from;
	int to;
	unsigned parts[4];
	int length = 0;
	const int count = sscanf(text.c_str(), " %d..%d {%3u,%3u,%3u,%3u} %n", &from, &to, &parts[0],
		&parts[1], &parts[2], &parts[3], &length);
	if (count != 6 || static_cast<size_t>(length) != text.length() || from > to)
		return false;
	for (const unsigned part : parts) {
		if (part > 255)
			return false;
	}
	*zone = {from, to,
		make_color(static_cast<uint8>(parts[0]), static_cast<uint8>(parts[1]),
			static_cast<uint8>(parts[2]), static_cast<uint8>(parts[3]))};
	return true;
}

} // namespace

bool
ReadZones(const char* text, char divider, std::vector<Gauges::zone>* zones)
{
	std::vector<Gauges::zone> read;
	std::istringstream stream(text);
	for (std::string part; std::getline(stream, part, divider);) {
		Gauges::zone zone;
		if (part.find_first_not_of(' ') == std::string::npos)
			continue;
		if (!ReadZone(part, &zone))
			return false;
		read.push_back(zone);
	}
	zones->swap(read);
	return true;
}


BString
ZonesText(const std::vector<Gauges::zone>& zones, char divider)
{
	BString text;
	for (const Gauges::zone& zone : zones) {
		char color[32];
		if (!text.IsEmpty())
			text.Append(divider, 1);
		text << zone.from << ".." << zone.to << " " << RGBColorToStr(zone.color, color);
	}
	return text;
}
