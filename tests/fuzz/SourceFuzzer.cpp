// SPDX-License-Identifier: MIT
// Fuzzing of edited sources: the entry point that libFuzzer calls with its inputs.

#include "fuzz/SourceChecks.h"

extern "C" int
LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
	CheckSourceBytes(data, size);
	return 0;
}
