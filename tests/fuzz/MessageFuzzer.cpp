// SPDX-License-Identifier: MIT
// Fuzzing of flattened messages: the entry point that libFuzzer calls with its inputs.

#include "fuzz/MessageChecks.h"

extern "C" int
LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
	CheckMessageBytes(data, size);
	return 0;
}
