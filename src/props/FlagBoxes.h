// SPDX-License-Identifier: MIT
// The check boxes of a flags dialog.

#pragma once

#include <vector>

#include <Point.h>
#include <SupportDefs.h>

class BCheckBox;
class BView;
class TFlagSet;

/// A check box for each flag of a set, one below the other. Lock the window.
class TFlagBoxes {
public:
	/// Adds the boxes to \a parent, which owns them; \a flags lives longer.
	TFlagBoxes(BView* parent, const TFlagSet& flags);

	/// How far right and down they reach, with the space around them, in the parent's coordinates.
	BPoint Extent() const { return fExtent; }

	/// Ticks the boxes whose bits are set, and no other.
	void SetBits(uint32 bits);
	uint32 Bits() const;

private:
	const TFlagSet& fFlags;
	std::vector<BCheckBox*> fBoxes;
	BPoint fExtent;
};
