// SPDX-License-Identifier: MIT
// Fuzzing of project files whose forms are there: the entry points that libFuzzer calls with its inputs.

#include "fuzz/FormChecks.h"
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
	CheckWholeProject(data, size);
	DeleteForgottenEditors();
	return 0;
}
