// SPDX-License-Identifier: MIT
// The changes of a text that can be taken back.
#ifndef KITS_INTERFACE_TEXT_UNDO_H
#define KITS_INTERFACE_TEXT_UNDO_H

#include <string>

#include "TextStyles.h"

namespace BPrivate {

/// The last change of a text: typing without a break counts as one. Taking it back is a change, too.
class TextUndo {
public:
	/// \a removed, with its styles, gave way to \a inserted at \a offset.
	void Note(
		int32 offset, const std::string& removed, RunArray styles, const std::string& inserted)
	{
		const bool typedOn = fValid && !fSealed && removed.empty() && !inserted.empty()
			&& offset == fOffset + static_cast<int32>(fInserted.size());
		if (typedOn) {
			fInserted += inserted;
			return;
		}
		fOffset = offset;
		fRemoved = removed;
		fStyles = std::move(styles);
		fInserted = inserted;
		fValid = true;
		fSealed = false;
	}

	/// The next change begins anew.
	void Seal() { fSealed = true; }

	void Forget() { fValid = false; }

	bool IsEmpty() const { return !fValid; }
	int32 Offset() const { return fOffset; }
	const std::string& Removed() const { return fRemoved; }
	/// Null when nothing was removed. The caller's; the next change is noted before another undo.
	RunArray TakeStyles() { return std::move(fStyles); }
	const std::string& Inserted() const { return fInserted; }

private:
	bool fValid = false;
	bool fSealed = false;
	int32 fOffset = 0;
	std::string fRemoved;
	RunArray fStyles;
	std::string fInserted;
};

} // namespace BPrivate

#endif // KITS_INTERFACE_TEXT_UNDO_H
