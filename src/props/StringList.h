// SPDX-License-Identifier: MIT
// A list of texts.

#pragma once

#include <List.h>

/// A list of pointers to texts, which are neither copied nor owned and must outlive it.
class TStringList : public BList {
public:
	explicit TStringList(int32 blockSize = 20);
	virtual ~TStringList();

	/// Appends the pointer; null is ignored.
	void Add(const char* text);

	/// Null when \a index is out of range.
	const char* StringAt(int32 index) const;
};
