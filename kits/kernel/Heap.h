// SPDX-License-Identifier: MIT
// How the C library's heap grows on this host.
#ifndef _KERNEL_HEAP_H
#define _KERNEL_HEAP_H

namespace BPrivate {

/// Prepares the heap for programs that keep many small objects. The first call in a process counts; any
/// thread. Does nothing where the host has no such settings.
void PrepareHeap();

} // namespace BPrivate

#endif // _KERNEL_HEAP_H
