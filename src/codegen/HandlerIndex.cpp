// SPDX-License-Identifier: MIT
// Which functions of a class an existing source file already holds.

#include "codegen/HandlerIndex.h"

#include <algorithm>

namespace {

/// Function names are ordered by this many bytes at most; no name in use is longer, and a text that repeats
/// itself without end must not make sorting slow.
constexpr size_t kComparedLength = 2048;


std::string
LowerCase(std::string text)
{
	for (char& c : text) {
		if (c >= 'A' && c <= 'Z')
			c = static_cast<char>(c - 'A' + 'a');
	}
	return text;
}

} // namespace


THandlerIndex::THandlerIndex(const char* text, const char* className)
	: fText(LowerCase(text)),
	  fQualifierLength(0)
{
	const std::string qualifier = LowerCase(std::string(" ") + className + "::");
	fQualifierLength = qualifier.length();
	for (size_t at = fText.find(qualifier); at != std::string::npos;
		 at = fText.find(qualifier, at + 1))
		fFunctions.push_back(at + fQualifierLength);

	std::sort(fFunctions.begin(), fFunctions.end(), [this](size_t a, size_t b) {
		return fText.compare(a, kComparedLength, fText, b, kComparedLength) < 0;
	});
}


bool
THandlerIndex::Contains(const char* returnType, const char* function) const
{
	const std::string result = LowerCase(returnType);
	const std::string name = LowerCase(function);
	auto at = std::lower_bound(fFunctions.begin(), fFunctions.end(), name,
		[this](size_t position, const std::string& key) {
			return fText.compare(position, key.length(), key) < 0;
		});
	for (; at != fFunctions.end() && fText.compare(*at, name.length(), name) == 0; ++at) {
		const size_t qualifier = *at - fQualifierLength;
		if (qualifier >= result.length()
			&& fText.compare(qualifier - result.length(), result.length(), result) == 0)
			return true;
	}
	return false;
}
