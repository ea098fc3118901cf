// SPDX-License-Identifier: MIT
// Which functions of a class an existing source file already holds.

#pragma once

#include <stddef.h>

#include <string>
#include <vector>

/// Answers, for many functions of one class, whether the start of their definition stands in a source text.
///
/// The text is searched once, when the index is made; a look-up costs the logarithm of the number of functions.
/// Letters are compared without regard to case (ASCII), and a match anywhere counts, in comments too.
class THandlerIndex {
public:
	/// \a className: with its leading "T". The text is copied.
	THandlerIndex(const char* text, const char* className);

	/// True when "returnType className::function" occurs in the text. A longer function name that begins with
	/// \a function counts as well.
	bool Contains(const char* returnType, const char* function) const;

private:
	std::string fText;
	size_t fQualifierLength;
	/// Where the text behind each " className::" begins, in the order of that text.
	std::vector<size_t> fFunctions;
};
