// SPDX-License-Identifier: MIT
// The files that build a generated program.

#pragma once

#include <vector>

#include <String.h>

#include "codegen/Dialect.h"

/// What the build files of a program say.
struct build_plan {
	BString name;                 // of the program
	BString signature;            // empty: none
	BString launchFlags;          // as source text; empty: the platform's choice
	std::vector<BString> sources; // file names, each once
	source_dialect dialect = DIALECT_CLASSIC;
};

/// The text of a CMakeLists.txt, which finds the runtime library by its package.
BString CMakeText(const build_plan& plan);

/// The text of a makefile for Haiku, which includes the system's makefile engine.
BString MakefileText(const build_plan& plan);

/// The text of a definition of the program's resources for Haiku: its signature and its launch flags.
BString ResourceText(const build_plan& plan);

/// Whether \a flags are launch flags, one or several joined by "|".
bool AreLaunchFlags(const BString& flags);
