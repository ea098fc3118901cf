// SPDX-License-Identifier: MIT
// Cuts C++ source into code, literals and comments.

#pragma once

#include <stddef.h>

#include <string_view>

enum source_part_kind {
	SOURCE_CODE,
	SOURCE_STRING,     // "...", with its quotes
	SOURCE_RAW_STRING, // R"x(...)x", from its first quote on
	SOURCE_CHARACTER,  // '...', with its quotes
	SOURCE_COMMENT     // up to the line break that ends it, or with its closing mark
};

struct source_part {
	source_part_kind kind;
	std::string_view text;
};

/// The parts of a source text, one after the other; together they are the whole text.
///
/// A literal or comment that is not closed goes on to the end.
class TSourceParts {
public:
	/// \a source must outlive this object and the parts.
	explicit TSourceParts(std::string_view source);

	/// The next part, which is not empty; false at the end.
	bool Next(source_part* part);

private:
	source_part_kind KindAt(size_t position) const;
	size_t EndOf(source_part_kind kind, size_t start) const;
	size_t EndOfCode(size_t start) const;
	size_t EndOfLiteral(size_t start) const;
	size_t EndOfRawString(size_t start) const;
	size_t EndOfComment(size_t start) const;

	std::string_view fSource;
	size_t fPosition;
	size_t
		fCodeStart; // of the code that the next part follows, the next part's start when there is none
};
