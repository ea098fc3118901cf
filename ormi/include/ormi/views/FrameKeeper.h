// SPDX-License-Identifier: MIT
// Views that stay as large as they were designed.

#pragma once

#include <View.h>

namespace Ormi {

/// Gives a view its frame back at the end of a block. Several views size themselves by their font when
/// they are attached or get another one, but on a form the frame is what was designed.
class FrameKeeper {
public:
	explicit FrameKeeper(BView* view)
		: fView(view),
		  fFrame(view->Frame())
	{
	}

	~FrameKeeper()
	{
		if (fView->Frame() == fFrame)
			return;
		fView->MoveTo(fFrame.LeftTop());
		fView->ResizeTo(fFrame.Width(), fFrame.Height());
	}

	FrameKeeper(const FrameKeeper&) = delete;
	FrameKeeper& operator=(const FrameKeeper&) = delete;

private:
	BView* fView;
	BRect fFrame;
};

} // namespace Ormi
