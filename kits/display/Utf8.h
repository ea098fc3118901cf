// SPDX-License-Identifier: MIT
// Walking through UTF-8 that may be damaged.
#ifndef DISPLAY_UTF8_H
#define DISPLAY_UTF8_H

#include <SupportDefs.h>

namespace BPrivate {

/// The character at \a *text, which is moved behind it and never beyond \a end. Damaged bytes give
/// U+FFFD, one for each.
inline uint32
NextCharacter(const char** text, const char* end)
{
	uint8 first = static_cast<uint8>(*(*text)++);
	if (first < 0x80)
		return first;

	int32 more = first >= 0xf0 ? 3 : first >= 0xe0 ? 2 : first >= 0xc2 ? 1 : 0;
	if (more == 0 || first > 0xf4 || end - *text < more)
		return 0xfffd;
	uint32 code = first & (0x3f >> more);
	for (int32 i = 0; i < more; i++) {
		uint8 byte = static_cast<uint8>((*text)[i]);
		if ((byte & 0xc0) != 0x80)
			return 0xfffd;
		code = code << 6 | (byte & 0x3f);
	}
	*text += more;
	return code;
}

} // namespace BPrivate

#endif // DISPLAY_UTF8_H
