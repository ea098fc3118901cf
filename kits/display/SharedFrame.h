// SPDX-License-Identifier: MIT
// The frame of a window as its program and its host have to agree upon it.
#ifndef DISPLAY_SHARED_FRAME_H
#define DISPLAY_SHARED_FRAME_H

#include <optional>

#include <Rect.h>
#include <SupportDefs.h>

namespace BPrivate {

class InputHub;
struct StackedWindow;

/// Keeps what a program knows of its window's frame, and decides what the host has to be asked for and what the program
/// has to be told, so that in the end the program knows the frame that the host has.
///
/// Place and size are each changed by the program and by the host, which may refuse, at any time. Two roads cross:
///
/// - Program and display: a report that was sent before the program asked for something else comes after it. Each report
///   has the number of requests that were known then, of places or of sizes; the program leaves out one with another
///   number than its own. What becomes of its request it is told with the right one.
/// - Display and host: the host tells of older frames after it was asked for a newer one. It is asked for one frame at a
///   time, and not believed until it has answered all that it was asked. Then it has the last word, but for what the
///   program has asked for in the meantime, which it is asked for next.
///
/// So a program's request is never undone by an old report, and the user's change of the place outlives the program's of
/// the size. Calls from one thread at a time.
class SharedFrame {
public:
	explicit SharedFrame(BRect frame);

	/// What the program asked for, or what it was told since.
	BRect Known() const { return fKnown; }
	/// How often the program asked for a place, and for a size.
	int32 MovesAsked() const { return fMovesAsked; }
	int32 SizesAsked() const { return fSizesAsked; }

	/// The program's requests.
	void MoveTo(BPoint leftTop);
	void ResizeTo(BSize size);

	/// The host is asked for Known() now, and may tell of older frames until it has answered.
	void BeginAsking();
	bool IsAsking() const { return fIsAsking; }
	/// The host has answered, and has \a frame now, where that counts. Returns whether the program has asked for something
	/// else meanwhile: then the host has to be asked again.
	bool EndAsking(std::optional<BRect> frame);
	/// The host says that it has \a frame. Not believed before it has answered.
	void HostHas(BRect frame);

private:
	BRect fKnown;
	/// What Known() was when the host was asked.
	BRect fAsked;
	bool fIsAsking;
	int32 fMovesAsked;
	int32 fSizesAsked;
};


/// Tells the hub and, if it differs from \a before, the window's client what is known of the frame.
void TellFrame(InputHub& hub, StackedWindow* window, const SharedFrame& frame, BRect before);

} // namespace BPrivate

#endif // DISPLAY_SHARED_FRAME_H
