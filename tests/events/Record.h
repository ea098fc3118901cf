// SPDX-License-Identifier: MIT
// What the handlers of the generated program tell: a line on standard output for each call.

#pragma once

#include <cstdio>
#include <mutex>
#include <sstream>
#include <string>

#include <Entry.h>
#include <Ormi.h>

inline std::ostream&
operator<<(std::ostream& stream, BPoint point)
{
	return stream << point.x << "," << point.y;
}


inline std::ostream&
operator<<(std::ostream& stream, BRect rect)
{
	return stream << rect.left << "," << rect.top << "," << rect.right << "," << rect.bottom;
}


inline std::ostream&
operator<<(std::ostream& stream, const BMessage* message)
{
	if (message == nullptr)
		return stream << "none";
	for (int shift = 24; shift >= 0; shift -= 8)
		stream << static_cast<char>(message->what >> shift);
	entry_ref ref;
	return message->FindRef("refs", &ref) == B_OK ? stream << "," << ref.name : stream;
}


inline std::ostream&
operator<<(std::ostream& stream, BMenuItem* item)
{
	return stream << item->Label();
}


inline std::ostream&
operator<<(std::ostream& stream, BListItem* item)
{
	return stream << static_cast<BStringItem*>(item)->Text();
}


inline std::ostream&
operator<<(std::ostream& stream, char** arguments)
{
	return stream << (arguments[0] != nullptr && arguments[1] != nullptr ? arguments[1] : "");
}


/// Prints "! NAME ARGUMENTS". \a looper runs the handler: it is an error when it is not locked then.
template <class... Arguments>
void
Record(BLooper* looper, const std::string& name, const Arguments&... arguments)
{
	std::ostringstream line;
	line << "! " << name;
	((line << " " << arguments), ...);
	if (!looper->IsLocked())
		line << " (not locked)";
	static std::mutex sMutex;
	std::lock_guard lock(sMutex);
	printf("%s\n", line.str().c_str());
	fflush(stdout);
}
