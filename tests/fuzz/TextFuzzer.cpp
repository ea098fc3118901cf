// SPDX-License-Identifier: MIT
// Fuzzing of the texts of properties: the entry points that libFuzzer calls with its inputs.

#include "fuzz/FormChecks.h"
#include "fuzz/TextChecks.h"
#include "support/EditorKeeper.h"

extern "C" int
LLVMFuzzerInitialize(int*, char***)
{
	PrepareFormChecks(PLIM_BUILD_DIR "/bin/Components");
	return 0;
}


extern "C" int
LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
	CheckPropertyText(data, size);
	DeleteForgottenEditors();
	return 0;
}
