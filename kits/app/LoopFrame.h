// SPDX-License-Identifier: MIT
// The place to which a loop that has ended returns.

#ifndef _LOOP_FRAME_H
#define _LOOP_FRAME_H

#include <csetjmp>

class BLooper;

namespace BPrivate {

/// One running loop of the calling thread; the innermost is found first.
///
/// BLooper::Quit() in the looper's own thread must not come back to its caller, whose object is gone. As on the
/// platform it leaves for good, without running the destructors of what lies between.
struct LoopFrame {
	explicit LoopFrame(BLooper* looper);
	~LoopFrame();

	/// The frame of \a looper in the calling thread, NULL when it does not run there.
	static LoopFrame* Find(const BLooper* looper);
	/// Makes \a frame the innermost again, those within it having been left.
	static void ReturnTo(LoopFrame* frame);

	jmp_buf place;
	BLooper* const looper;
	LoopFrame* const outer;
};

} // namespace BPrivate

#endif // _LOOP_FRAME_H
