// SPDX-License-Identifier: MIT
// The dialog for the flags of a view.

#include "props/ViewFlagsWin.h"

#include <cstdio>

#include "props/DialogParts.h"
#include "props/FlagBoxes.h"
#include "props/FlagSet.h"


ViewFlagsWin::ViewFlagsWin(const char* value, const TPendingEdit& edit)
	: TPropertyModalEdit(BRect(0, 0, 100, 100), "View Flags", value, edit)
{
}


ViewFlagsWin::~ViewFlagsWin() {}


void
ViewFlagsWin::InitWindow()
{
	BView* ground = AddDialogGround(this);
	fBoxes = std::make_unique<TFlagBoxes>(ground, TFlagSet::ViewFlags());
	AddDialogButtons(this, ground, fBoxes->Extent(), PME_OK, PME_CANCEL);
}


void
ViewFlagsWin::InitControls()
{
	fBoxes->SetBits(TFlagSet::ViewFlags().BitsFor(Text()));
}


void
ViewFlagsWin::OnApply()
{
	SetText(TFlagSet::ViewFlags().TextFor(fBoxes->Bits()).String());
	printf("%s\n", Text());
}
