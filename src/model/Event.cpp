// SPDX-License-Identifier: MIT
// One event of a component.

#include "model/Event.h"

#include "model/BlockPool.h"


void*
TEvent::operator new(size_t size)
{
	return TBlockPool::Allocate(size);
}


void
TEvent::operator delete(void* memory)
{
	TBlockPool::Free(memory);
}
