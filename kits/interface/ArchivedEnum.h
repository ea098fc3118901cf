// SPDX-License-Identifier: MIT
// Numbers of archives and pictures that stand for a value of an enumeration.
#ifndef INTERFACE_ARCHIVED_ENUM_H
#define INTERFACE_ARCHIVED_ENUM_H

#include <initializer_list>

#include <InterfaceDefs.h>
#include <SupportDefs.h>

namespace BPrivate {

/// The value that has \a number, which may be anything; \a otherwise when it is none of \a known.
template <typename Enum>
Enum
EnumAmong(int32 number, std::initializer_list<Enum> known, Enum otherwise)
{
	for (Enum value : known) {
		if (number == static_cast<int32>(value))
			return value;
	}
	return otherwise;
}


/// The same for values that follow each other, from \a first to \a last.
template <typename Enum>
Enum
EnumBetween(int32 number, Enum first, Enum last, Enum otherwise)
{
	const bool isKnown = number >= static_cast<int32>(first) && number <= static_cast<int32>(last);
	return isKnown ? static_cast<Enum>(number) : otherwise;
}


/// The alignment that has \a number; B_ALIGN_LEFT when it is none.
inline alignment
AlignmentOf(int32 number)
{
	return EnumBetween(number, B_ALIGN_USE_FULL_WIDTH, B_ALIGN_CENTER, B_ALIGN_LEFT);
}

} // namespace BPrivate

#endif // INTERFACE_ARCHIVED_ENUM_H
