// SPDX-License-Identifier: MIT
// What a package of the shared MIME database tells about types.

#ifndef _MIME_PACKAGE_H
#define _MIME_PACKAGE_H

#include <string>
#include <string_view>
#include <vector>

#include <SupportDefs.h>

namespace BPrivate {

/// Bytes to look for at the offsets \a from to \a to, and what must be there besides. An empty mask
/// compares every bit. A match without a value (a kind that is not known) never holds.
struct mime_match {
	std::string value;
	std::string mask;
	uint32 from = 0;
	uint32 to = 0;
	std::vector<mime_match> nested;

	/// Whether this match and, where it has nested ones, at least one of them hold.
	bool Holds(std::string_view content) const;
};

/// A rule for content: one of the matches has to hold.
struct mime_magic {
	int32 priority = 50;
	std::vector<mime_match> matches;

	bool Holds(std::string_view content) const;
};

/// A pattern of names, such as "*.txt".
struct mime_glob {
	std::string pattern;
	int32 weight = 50;
	bool isCaseSensitive = false;

	bool Holds(const std::string& name) const;
};

/// A type as one package describes it. Texts are empty where it tells nothing.
struct mime_description {
	std::string type;
	std::string comment;
	std::string longDescription;
	std::string preferredApp;
	std::vector<mime_glob> globs;
	std::vector<mime_magic> magics;
	/// Whether the rules of packages with less precedence are void.
	bool replacesGlobs = false;
	bool replacesMagics = false;
};

/// Adds the types of a package to \a types. B_BAD_DATA for a damaged document; the types before the
/// damage are there.
status_t read_mime_package(std::string_view document, std::vector<mime_description>* types);

/// A package with the one type. Rules for content are not written: programs cannot set them.
std::string write_mime_package(const mime_description& type);

/// Lower case, as types are compared.
std::string mime_key(std::string_view type);

} // namespace BPrivate

#endif
