// SPDX-License-Identifier: MIT

#include "project/ProjectOperation.h"

#include "project/Project.h"

TProjectOperation::TProjectOperation(TProject* project, bigtime_t patience)
	: fProject(project),
	  fIsBegun(project->BeginOperation(patience))
{
}


TProjectOperation::~TProjectOperation()
{
	if (fIsBegun)
		fProject->EndOperation();
}
