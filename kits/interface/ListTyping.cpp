// SPDX-License-Identifier: MIT

#include "ListTyping.h"

#include <strings.h>

namespace BPrivate {

namespace {

constexpr bigtime_t kPause = 1000000;

} // namespace


void
ListTyping::Add(const char* bytes, int32 numBytes, bigtime_t when)
{
	const std::string typed(bytes, static_cast<size_t>(numBytes));
	if (!GoesOn(when)) {
		fText.clear();
		fFirst = typed;
		fRepeats = true;
	}
	fRepeats = fRepeats && typed == fFirst;
	fText += typed;
	fLast = when;
}


bool
ListTyping::GoesOn(bigtime_t when) const
{
	return !fText.empty() && when - fLast < kPause;
}


bool
ListTyping::Matches(const char* text) const
{
	return text != nullptr && strncasecmp(text, fText.c_str(), fText.size()) == 0;
}


bool
ListTyping::IsRepeated() const
{
	return fRepeats;
}


bool
ListTyping::MatchesFirst(const char* text) const
{
	return text != nullptr && strncasecmp(text, fFirst.c_str(), fFirst.size()) == 0;
}

} // namespace BPrivate
