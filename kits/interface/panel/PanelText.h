// SPDX-License-Identifier: MIT
// Names, sizes and times of files as a file panel shows and orders them.
#ifndef INTERFACE_PANEL_TEXT_H
#define INTERFACE_PANEL_TEXT_H

#include <ctime>
#include <string>

#include <SupportDefs.h>

namespace BPrivate {

/// Whether all of it is well-formed UTF-8.
bool IsValidText(const std::string& text);

/// A file's name as it can be drawn: what is no UTF-8 and control characters become U+FFFD.
std::string DisplayName(const std::string& name);

/// What orders names as people do: without regard to case, numbers by their value.
struct NameKey {
	explicit NameKey(const std::string& name);

	bool operator<(const NameKey& other) const;

	std::u32string folded;
	/// Decides between names that fold to the same.
	std::string name;
};

/// Whether \a name begins with \a prefix, without regard to case.
bool BeginsWith(const std::string& name, const std::string& prefix);

/// "0 bytes", "12.3 KiB", ...
std::string SizeText(off_t size);

/// The local date and time, "2024-03-09 17:05".
std::string TimeText(time_t time);

/// Why something about a file failed, "Permission denied." and the like.
std::string StatusSentence(status_t status);

} // namespace BPrivate

#endif // INTERFACE_PANEL_TEXT_H
