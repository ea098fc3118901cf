// SPDX-License-Identifier: MIT
// Part of each component library that plimworks_add_component_library() builds: what it was built for.

#include <palette/LibraryBuild.h>

extern "C" {
extern const library_build PlimComponentLibraryBuild __attribute__((visibility("default")));
const library_build PlimComponentLibraryBuild = ThisLibraryBuild();
}
