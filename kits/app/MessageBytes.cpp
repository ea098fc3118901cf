// SPDX-License-Identifier: MIT
// The bytes of a flattened message, for the messages that read them where they lie.

#include "app/MessageBytes.h"

#include <cstdlib>
#include <new>


MessageBytes*
MessageBytes::Adopt(uint8* bytes, size_t size)
{
	return new (std::nothrow) MessageBytes(bytes, size);
}


MessageBytes::MessageBytes(uint8* bytes, size_t size)
	: fBytes(bytes),
	  fSize(size),
	  fUsers(1)
{
}


MessageBytes::~MessageBytes()
{
	free(fBytes);
}


void
MessageBytes::Release()
{
	if (fUsers.fetch_sub(1, std::memory_order_acq_rel) == 1)
		delete this;
}
