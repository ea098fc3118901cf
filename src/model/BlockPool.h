// SPDX-License-Identifier: MIT
// The memory of the small objects that components consist of.

#pragma once

#include <cstddef>

/// Allocates the properties, events and editors of components, some fifty for each, side by side.
///
/// The heap would take longer, and worse: editors outlive the properties that lie between them, so that closing a
/// form would leave it holes that every later form has to be fitted into. Freed memory is kept for the next
/// objects of its size. May be used by several threads at once.
class TBlockPool {
public:
	/// A block of \a size bytes, aligned for everything. Throws std::bad_alloc without memory.
	static void* Allocate(size_t size);

	/// Whether \a block came from Allocate(), as far as it is known: false for a large one. Under the sanitizers whether
	/// a block of the heap begins there.
	static bool Owns(const void* block);

	/// Takes back a block of Allocate(); null is ignored.
	static void Free(void* block);
};
