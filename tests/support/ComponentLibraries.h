// SPDX-License-Identifier: MIT
// The component libraries of this tree, for tests that are about all of them.

#pragma once

#include <string>

#include "palette/LibraryLoader.h"
#include "palette/PaletteCatalog.h"

/// Loads the libraries that the designer finds beside it, and those that users may put there, into the palette's catalog.
inline void
LoadComponentLibraries()
{
	TLibraryLoader loader(&PaletteCatalog());
	for (const char* folder : {"/bin/Components", "/bin/MoreComponents"})
		loader.LoadFolder((std::string(PLIM_BUILD_DIR) + folder).c_str());
}
