// SPDX-License-Identifier: MIT
// The list of a component's properties, or of its events. Not for component libraries.

#pragma once

#include <atomic>
#include <cstring>

#include <List.h>

#include "model/NameCompare.h"

/// A list that knows whether a name occurs twice in it, so that a look-up may begin at any of its entries.
///
/// Who adds an entry tells its name first; who removes one calls SetLast(-1). Several threads may look for names at the same time.
class TNamedList : public BList {
public:
	/// \a step: as for BList.
	explicit TNamedList(int32 step)
		: BList(step)
	{
	}

	/// Takes note of a name. True when there may be an entry of that name already.
	bool NoteName(const char* name)
	{
		const size_t length = strlen(name);
		size_t sum = length;
		if (length > 0)
			sum += size_t(static_cast<unsigned char>(name[length - 1])) * 5
				+ size_t(static_cast<unsigned char>(name[length / 2])) * 3
				+ static_cast<unsigned char>(name[0]);
		uint64& noted = fNoted[sum / 64 % kWords];
		const uint64 bit = uint64(1) << sum % 64;
		const bool wasNoted = (noted & bit) != 0;
		noted |= bit;
		return wasNoted;
	}

	/// Empties the list.
	void Forget()
	{
		MakeEmpty();
		for (uint64& noted : fNoted)
			noted = 0;
		fRepeats = false;
		SetLast(-1);
	}

	/// A name occurs twice: the first entry of each name is looked for from now on.
	void SetRepeats() { fRepeats = true; }
	bool Repeats() const { return fRepeats; }

	/// The entry that was found last, or -1: names are mostly asked for in the order of the list.
	int32 Last() const { return fLast.load(std::memory_order_relaxed); }
	void SetLast(int32 index) const { fLast.store(index, std::memory_order_relaxed); }

private:
	static const size_t kWords = 2;

	uint64 fNoted[kWords] = {};
	mutable std::atomic<int32> fLast = -1;
	bool fRepeats = false;
};


/// The first entry of \a list, of class \a Entry, with that name; null when there is none.
///
/// \a nameOf gives an entry's name, which may be null.
template <typename Entry, typename NameOf>
Entry*
FindNamed(const TNamedList* list, const char* name, NameOf nameOf)
{
	const int32 count = list->CountItems();
	void* const* const entries = static_cast<void* const*>(list->Items());
	const auto isIt = [&](int32 index) {
		const Entry* entry = static_cast<const Entry*>(entries[index]);
		const char* other = entry != nullptr ? nameOf(entry) : nullptr;
		return other != nullptr && IsSameName(other, name);
	};

	// While a form is loaded, the one behind what was found last is asked for, or that again.
	const int32 last = list->Last();
	if (!list->Repeats() && last + 1 < count && isIt(last + 1)) {
		list->SetLast(last + 1);
		return static_cast<Entry*>(entries[last + 1]);
	}
	if (last >= 0 && last < count && isIt(last))
		return static_cast<Entry*>(entries[last]);
	for (int32 i = 0; i < count; i++) {
		if (isIt(i)) {
			list->SetLast(i);
			return static_cast<Entry*>(entries[i]);
		}
	}
	return nullptr;
}
