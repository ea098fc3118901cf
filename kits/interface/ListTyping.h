// SPDX-License-Identifier: MIT
// What is typed into a list to find a row.
#ifndef INTERFACE_LIST_TYPING_H
#define INTERFACE_LIST_TYPING_H

#include <string>

#include <SupportDefs.h>

namespace BPrivate {

/// Collects the keys that are typed shortly after each other.
class ListTyping {
public:
	/// \a when: microseconds. A pause begins a new text.
	void Add(const char* bytes, int32 numBytes, bigtime_t when);
	/// Whether a key at this time would go on with what was typed.
	bool GoesOn(bigtime_t when) const;
	void Clear() { fText.clear(); }

	/// Whether \a text begins with what was typed; case does not count.
	bool Matches(const char* text) const;
	/// The same character again and again goes from one row that begins with it to the next.
	bool IsRepeated() const;
	bool MatchesFirst(const char* text) const;

private:
	std::string fText;
	std::string fFirst;
	bool fRepeats = true;
	bigtime_t fLast = 0;
};

} // namespace BPrivate

#endif // INTERFACE_LIST_TYPING_H
