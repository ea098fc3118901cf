// SPDX-License-Identifier: MIT

#include "TextInput.h"

#include <algorithm>
#include <string>

#include <TextControl.h>

namespace BPrivate {

TextInput::TextInput(BTextControl* control, BRect frame, uint32 flags)
	: BTextView(frame, "_input_", frame.OffsetToCopy(0, 0), B_FOLLOW_LEFT_RIGHT | B_FOLLOW_TOP,
		B_WILL_DRAW | B_FRAME_EVENTS | flags),
	  fControl(control)
{
	SetWordWrap(false);
}


void
TextInput::KeyDown(const char* bytes, int32 numBytes)
{
	switch (bytes[0]) {
		case B_ENTER:
			if (IsEditable()) {
				fControl->InputCommitted();
				SelectAll();
			}
			break;

		case B_TAB:
			// Navigation, not a character.
			BView::KeyDown(bytes, numBytes);
			break;

		default:
			BTextView::KeyDown(bytes, numBytes);
			break;
	}
}


void
TextInput::MakeFocus(bool focus)
{
	const bool had = IsFocus();
	BTextView::MakeFocus(focus);
	if (IsFocus() == had)
		return;
	if (focus)
		SelectAll();
	fControl->InputFocusChanged(focus);
}


void
TextInput::InsertText(const char* text, int32 length, int32 offset, const text_run_array* runs)
{
	std::string line(text, length);
	std::replace(line.begin(), line.end(), '\n', ' ');
	std::replace(line.begin(), line.end(), '\r', ' ');
	BTextView::InsertText(line.data(), length, offset, runs);
	fControl->InputChanged();
}


void
TextInput::DeleteText(int32 fromOffset, int32 toOffset)
{
	BTextView::DeleteText(fromOffset, toOffset);
	fControl->InputChanged();
}

} // namespace BPrivate
