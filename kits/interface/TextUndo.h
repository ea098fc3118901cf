// SPDX-License-Identifier: MIT
// The changes of a text that can be taken back.
#ifndef KITS_INTERFACE_TEXT_UNDO_H
#define KITS_INTERFACE_TEXT_UNDO_H

#include <deque>
#include <memory>
#include <string>

#include "TextStyles.h"

namespace BPrivate {

/// At \a offset \a removed, which had \a styles, gave way to \a inserted.
struct TextChange {
	int32 offset;
	std::string removed;
	RunArray styles;
	std::string inserted;
};


/// The changes of a text, to go back and forth among. Typing without a break counts as one, and so do deletions side
/// by side.
///
/// Taking back is a change, too: between StartUndo() or StartRedo() and End() what is noted goes to the other side. Any
/// other change ends what could be done again. There is no limit to the number of changes, but to their size.
class TextUndo {
public:
	void Note(TextChange change);
	/// The next change begins anew.
	void Seal() { fSealed = true; }
	void Forget();

	/// What is to be taken back of \a text as it is; null for nothing. When it is not there, as the text was changed
	/// unnoticed, all is forgotten.
	std::unique_ptr<TextChange> StartUndo(const std::string& text);
	std::unique_ptr<TextChange> StartRedo(const std::string& text);
	void End();

private:
	enum Direction { kNew, kBack, kForth };
	typedef std::deque<std::unique_ptr<TextChange>> Changes;

	static size_t SizeOf(const TextChange& change);
	bool Join(const TextChange& change);
	std::unique_ptr<TextChange> Take(Changes* changes, const std::string& text);

	Changes fDone;
	Changes fUndone;
	Direction fDirection = kNew;
	bool fSealed = true;
	// Bytes of both sides.
	size_t fSize = 0;
};

} // namespace BPrivate

#endif // KITS_INTERFACE_TEXT_UNDO_H
