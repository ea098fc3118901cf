// SPDX-License-Identifier: MIT
// The flags that the flag dialogs offer, and their text.

#pragma once

#include <SupportDefs.h>

class BString;

/// One check box of a flags dialog.
struct TFlagBox {
	const char* label;

	/// The platform's bit.
	uint32 bit;

	/// The name that a ticked box writes; null for a box that writes none.
	const char* name;

	/// The name whose presence in a text ticks the box: the box's own but for one dead box.
	const char* tickedBy;
};


/// The boxes of one dialog, in order, and the text that stands for a choice of them.
///
/// A text is the names of the ticked boxes, in the order of the boxes, joined by "|". It is read by
/// looking for each name anywhere in it, so that "B_NAVIGABLE_JUMP" also ticks the box of
/// "B_NAVIGABLE"; names that no box knows are lost.
class TFlagSet {
public:
	static const TFlagSet& ViewFlags();
	static const TFlagSet& WindowFlags();

	int32 CountBoxes() const { return fCount; }

	/// \a index must be in range.
	const TFlagBox& BoxAt(int32 index) const { return fBoxes[index]; }

	/// The bits of the boxes that \a text ticks; 0 for null.
	uint32 BitsFor(const char* text) const;

	/// The text for the boxes whose bits are set in \a bits.
	BString TextFor(uint32 bits) const;

private:
	TFlagSet(const TFlagBox* boxes, int32 count)
		: fBoxes(boxes),
		  fCount(count)
	{
	}

	const TFlagBox* fBoxes;
	int32 fCount;
};
