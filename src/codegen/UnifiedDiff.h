// SPDX-License-Identifier: MIT
// The difference of two texts as a patch.

#pragma once

#include <string>
#include <string_view>

/// The unified diff, with three lines of context, that turns \a oldText into \a newText.
///
/// \a oldName, \a newName: the files as the patch names them. Empty when the texts are equal. Texts that differ
/// very much give a correct patch, but not the shortest.
std::string UnifiedDiff(const std::string& oldName, const std::string& newName,
	std::string_view oldText, std::string_view newText);
