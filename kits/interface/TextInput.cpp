// SPDX-License-Identifier: MIT

#include "TextInput.h"

#include <algorithm>
#include <string>

#include <TextControl.h>

#include "ControlLook.h"

namespace BPrivate {

TextInput::TextInput(BTextControl* control, BRect frame, uint32 flags)
	: BTextView(frame, "_input_", frame.OffsetToCopy(0, 0), B_FOLLOW_LEFT_RIGHT | B_FOLLOW_TOP,
		B_WILL_DRAW | B_FRAME_EVENTS | flags),
	  fControl(control)
{
	SetWordWrap(false);
}


void
TextInput::DetachedFromWindow()
{
	// With its window the focus goes, too: nothing is sent then.
	fControl->ForgetChange();
	BTextView::DetachedFromWindow();
}


void
TextInput::MouseDown(BPoint where)
{
	if (fControl->IsEnabled())
		BTextView::MouseDown(where);
}


void
TextInput::KeyDown(const char* bytes, int32 numBytes)
{
	if (!fControl->IsEnabled()) {
		// NOLINTNEXTLINE(bugprone-parent-virtual-call): the text is left alone
		BView::KeyDown(bytes, numBytes);
		return;
	}
	switch (bytes[0]) {
		case B_ENTER:
			if (!IsEditable())
				break;
			SelectAll();
			// What is sent may have the control deleted: nothing comes after it.
			fControl->InputCommitted();
			break;

		case B_TAB:
			// Navigation, not a character.
			BView::KeyDown(bytes, numBytes); // NOLINT(bugprone-parent-virtual-call): as said above
			break;

		default:
			BTextView::KeyDown(bytes, numBytes);
			break;
	}
}


void
TextInput::MakeFocus(bool focus)
{
	if (focus && !fControl->IsEnabled())
		return;
	const bool had = IsFocus();
	BTextView::MakeFocus(focus);
	if (IsFocus() == had)
		return;
	if (focus)
		SelectAll();
	else
		ScrollToOffset(0);
	fControl->InputFocusChanged(focus);
}


bool
TextInput::AcceptsDrop(const BMessage* message)
{
	return fControl->IsEnabled() && BTextView::AcceptsDrop(message);
}


void
TextInput::InsertText(const char* text, int32 length, int32 offset, const text_run_array* runs)
{
	std::string line(text, length);
	std::replace(line.begin(), line.end(), '\n', ' ');
	std::replace(line.begin(), line.end(), '\r', ' ');
	BTextView::InsertText(line.data(), length, offset, runs);
}


void
TextInput::ChangeEnded()
{
	fControl->InputChanged();
}


rgb_color
TextInput::DrawnColor(rgb_color color) const
{
	return StrengthOf(fControl->IsEnabled(), color, ViewColor());
}

} // namespace BPrivate
