// SPDX-License-Identifier: MIT
// What a machine of the other byte order would have written in the R5 format.

#include "kits/app/SwappedMessage.h"

#include <algorithm>
#include <cstring>
#include <map>

#include <SupportDefs.h>

namespace {

/// Turns the word at \a offset round, and gives its value.
uint32
SwapWord(std::string* bytes, size_t offset)
{
	uint32 word;
	memcpy(&word, bytes->data() + offset, sizeof(word));
	std::reverse(bytes->begin() + offset, bytes->begin() + offset + 4);
	return word;
}

} // namespace


std::string
SwapR5(std::string bytes)
{
	// Types by the characters of their codes, as they stand in a big-endian file.
	const std::map<std::string, size_t> units = {{"SHRT", 2}, {"USHT", 2}, {"LONG", 4}, {"ULNG", 4},
		{"FLOT", 4}, {"TIME", 4}, {"BPNT", 4}, {"RECT", 4}, {"LLNG", 8}, {"ULLG", 8}, {"DBLE", 8},
		{"OFFT", 8}};

	for (size_t offset : {0, 8, 12})
		SwapWord(&bytes, offset);
	// The checksum is of the bytes as they stand in the file; its own byte order is the file's.
	uint32 sum = uint8(bytes[16]);
	for (size_t i = 8; i < 16; i++)
		sum += uint32(uint8(bytes[i])) << (24 - i % 4 * 8);
	for (size_t i = 0; i < 4; i++)
		bytes[4 + i] = char(sum >> (24 - i * 8));

	size_t at = 17;
	while ((bytes[at] & 1) != 0) {
		const uint8 flags = uint8(bytes[at++]);
		SwapWord(&bytes, at);
		const auto unit = units.find(bytes.substr(at, 4));
		const size_t unitSize = unit != units.end() ? unit->second : 1;
		at += 4;
		if ((flags & 0x8) == 0) {
			SwapWord(&bytes, at);
			at += 4;
		}
		const uint32 dataSize = SwapWord(&bytes, at);
		at += 4;
		at += 1 + uint8(bytes[at]);

		const size_t end = at + dataSize;
		while (at < end) {
			const bool isFixed = (flags & 0x4) != 0;
			const size_t size = isFixed ? dataSize : SwapWord(&bytes, at);
			const size_t start = isFixed ? at : at + 4;
			for (size_t i = start; i + unitSize <= start + size; i += unitSize)
				std::reverse(bytes.begin() + i, bytes.begin() + i + unitSize);
			at += isFixed ? size : (size + 4 + 7) / 8 * 8;
		}
	}
	return bytes;
}
