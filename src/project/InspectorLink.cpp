// SPDX-License-Identifier: MIT

#include "project/InspectorLink.h"

#include "app/MainWindow.h"
#include "app/WindowGuard.h"
#include "designer/DesignForm.h"

void
ShowInInspector(TComponent*, BView*)
{
}


void
ForgetInInspector(TDesignForm*)
{
}


void
RefreshInspector()
{
}
