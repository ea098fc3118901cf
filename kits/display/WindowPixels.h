// SPDX-License-Identifier: MIT
// The memory of a window's picture: as its thread draws it, and as it was last finished.
#ifndef DISPLAY_WINDOW_PIXELS_H
#define DISPLAY_WINDOW_PIXELS_H

#include <cstddef>
#include <memory>
#include <mutex>

#include <SupportDefs.h>

namespace BPrivate {

/// Two pictures of the same size, all white at first. What is drawn goes into the one and is copied into the other when
/// it is finished. A large window's two pictures share the pages of memory that are the same: drawing takes a page of
/// its own, Rest() gives it back.
class WindowPixels {
public:
	explicit WindowPixels(size_t count);
	~WindowPixels();

	WindowPixels(const WindowPixels&) = delete;
	WindowPixels& operator=(const WindowPixels&) = delete;

	size_t Count() const { return fCount; }
	/// The file in memory that Finished() is a mapping of; -1 where nothing is shared.
	int File() const { return fFile; }
	/// Belongs to who draws.
	uint32* Drawn() { return fDrawn; }
	/// Belongs to who shows it: for as long as a Surface has it, use it under its lock only.
	uint32* Finished();

	/// Who draws, before every change of Drawn().
	void Begin()
	{
		if (!fIsBegun)
			BeginDrawing();
	}
	/// Who draws: all that has been drawn since Begin() is in Finished() now.
	void End();
	/// Any thread: gives back what Drawn() has in pages of its own, except while something is being drawn.
	void Rest();

private:
	bool Share();
	void BeginDrawing();

	const size_t fCount;
	int fFile;
	uint32* fDrawn;
	uint32* fFinished;
	/// Where nothing is shared.
	std::unique_ptr<uint32[]> fOwnDrawn;
	std::unique_ptr<uint32[]> fOwnFinished;
	/// Between BeginDrawing() or End() and Rest().
	std::mutex fMutex;
	/// Written by who draws, with the lock.
	bool fIsBegun;
};

} // namespace BPrivate

#endif // DISPLAY_WINDOW_PIXELS_H
