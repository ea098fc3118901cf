// SPDX-License-Identifier: MIT
// The check boxes of a flags dialog.

#include "props/FlagBoxes.h"

#include <algorithm>

#include <CheckBox.h>
#include <View.h>

#include "props/DialogParts.h"
#include "props/FlagSet.h"


TFlagBoxes::TFlagBoxes(BView* parent, const TFlagSet& flags)
	: fFlags(flags),
	  fExtent(0, kDialogSpace)
{
	for (int32 i = 0; i < flags.CountBoxes(); i++) {
		const char* label = flags.BoxAt(i).label;
		BCheckBox* box = new BCheckBox(BRect(0, 0, 10, 10), label, label, nullptr);
		parent->AddChild(box);
		box->ResizeToPreferred();
		box->MoveTo(kDialogSpace, fExtent.y);
		fExtent.x = std::max(fExtent.x, box->Frame().right + kDialogSpace);
		fExtent.y = box->Frame().bottom + 1;
		fBoxes.push_back(box);
	}
}


void
TFlagBoxes::SetBits(uint32 bits)
{
	for (size_t i = 0; i < fBoxes.size(); i++) {
		const bool ticked = (bits & fFlags.BoxAt(static_cast<int32>(i)).bit) != 0;
		fBoxes[i]->SetValue(ticked ? B_CONTROL_ON : B_CONTROL_OFF);
	}
}


uint32
TFlagBoxes::Bits() const
{
	uint32 bits = 0;
	for (size_t i = 0; i < fBoxes.size(); i++) {
		if (fBoxes[i]->Value() == B_CONTROL_ON)
			bits |= fFlags.BoxAt(static_cast<int32>(i)).bit;
	}
	return bits;
}
