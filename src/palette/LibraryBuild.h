// SPDX-License-Identifier: MIT
// What a component library was built for.

#pragma once

#include <cstring>

#include <SupportDefs.h>

#include "model/Component.h"
#include "model/ComponentOwner.h"
#include "model/FormDesigner.h"
#include "model/Property.h"
#include "model/PropertyStore.h"
#include "palette/PaletteEntry.h"
#include "props/PropertyEditor.h"

/// The version of the classes that component libraries derive from. It grows with each change after which libraries
/// must be built again: another order of virtual operations or fields, an operation that is gone.
constexpr uint32 kComponentInterface = 1;

/// A library that exports such a record as kLibraryBuildSymbol is used only by designers with the same one. Libraries
/// without it are taken as they are.
struct library_build {
	uint32 size;
	uint32 interfaceVersion;
	char standardLibrary[24]; ///< of C++: its types are in the headers
	uint32 classSizes[7];
};

/// The data symbol, unmangled. The CMake function for component libraries puts it into each.
constexpr const char* kLibraryBuildSymbol = "PlimComponentLibraryBuild";

/// The record of what is compiled here.
constexpr library_build
ThisLibraryBuild()
{
	return
	{
		sizeof(library_build), kComponentInterface,
#if defined(_LIBCPP_VERSION)
			"libc++",
#elif defined(_GLIBCXX_USE_CXX11_ABI) && !_GLIBCXX_USE_CXX11_ABI
			"libstdc++, old strings",
#else
			"libstdc++",
#endif
		{
			sizeof(TComponent), sizeof(TComponentOwner), sizeof(TFormDesigner), sizeof(TProperty),
				sizeof(TPropertyStore), sizeof(TPropertyEditor), sizeof(TPaletteEntry)
		}
	};
}


inline bool
operator==(const library_build& left, const library_build& right)
{
	return left.size == right.size && left.interfaceVersion == right.interfaceVersion
		&& strncmp(left.standardLibrary, right.standardLibrary, sizeof(left.standardLibrary)) == 0
		&& memcmp(left.classSizes, right.classSizes, sizeof(left.classSizes)) == 0;
}
