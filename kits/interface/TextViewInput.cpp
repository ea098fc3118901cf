// SPDX-License-Identifier: MIT
// BTextView: keyboard and mouse.

#include <algorithm>
#include <cctype>

#include <Message.h>
#include <TextView.h>
#include <Window.h>

#include "TextLayout.h"
#include "interface/WholePixels.h"

using BPrivate::WholePixels;

namespace {

bool
IsWordByte(char byte)
{
	return isalnum(static_cast<unsigned char>(byte)) || byte == '_'
		|| static_cast<unsigned char>(byte) >= 0x80;
}


/// An int32 of the message that the view's window is handling; 0 when there is none.
int32
MessageNumber(const BView* view, const char* name)
{
	const BMessage* message = view->Window() != NULL ? view->Window()->CurrentMessage() : NULL;
	int32 number = 0;
	if (message != NULL)
		message->FindInt32(name, &number);
	return number;
}

} // namespace

void
BTextView::KeyDown(const char* bytes, int32 numBytes)
{
	const int32 held = MessageNumber(this, "modifiers");
	const bool byWord = (held & (B_CONTROL_KEY | B_COMMAND_KEY | B_OPTION_KEY)) != 0;
	const bool extend = fSelectable && (held & B_SHIFT_KEY) != 0;
	if (numBytes == 1) {
		if (!fEditable && !extend && ScrollByKey(bytes[0]))
			return;
		if ((fSelectable || fEditable) && MoveByKey(bytes[0], extend, byWord))
			return;
	}
	// Of the keys that give control characters two are text, and two delete.
	const unsigned char first = bytes[0];
	const bool isText =
		numBytes > 1 || (first >= ' ' && first != B_DELETE) || first == B_ENTER || first == B_TAB;
	if (!fEditable || (!isText && first != B_BACKSPACE && first != B_DELETE)) {
		BView::KeyDown(bytes, numBytes);
		return;
	}

	switch (bytes[0]) {
		case B_BACKSPACE:
		case B_DELETE:
			DeleteByKey(bytes[0] == B_DELETE, byWord);
			break;

		default:
		{
			int32 start;
			int32 end;
			GetSelection(&start, &end);
			std::string text(bytes, numBytes);
			if (bytes[0] == B_ENTER && fAutoindent) {
				for (int32 i = OffsetAt(LineAt(start)); i < start; i++) {
					if (fText[i] != ' ' && fText[i] != '\t')
						break;
					text += fText[i];
				}
			}
			if (IsAllowed(text.data(), static_cast<int32>(text.size()), end - start))
				Replace(start, end, text.data(), static_cast<int32>(text.size()));
			break;
		}
	}
	ScrollToSelection();
}


/// Moves the caret when the key is one that does; false for any other key.
bool
BTextView::MoveByKey(char key, bool extend, bool byWord)
{
	int32 start;
	int32 end;
	GetSelection(&start, &end);
	const bool collapse = start != end && !extend && !byWord;
	const float wantedX = fWantedX >= 0 ? fWantedX : PointAt(fCaret).x;
	const int32 page =
		std::max<int32>(1, WholePixels(Bounds().Height() / std::max(LineHeight(0), 1.0f)) - 1);

	switch (key) {
		case B_LEFT_ARROW:
			MoveCaret(collapse ? start
					: byWord   ? WordStart(fCaret)
							   : PreviousOffset(fCaret),
				extend);
			break;

		case B_RIGHT_ARROW:
			MoveCaret(collapse ? end : byWord ? WordEnd(fCaret) : NextOffset(fCaret), extend);
			break;

		case B_UP_ARROW:
		case B_DOWN_ARROW:
		case B_PAGE_UP:
		case B_PAGE_DOWN:
		{
			const int32 lines = key == B_UP_ARROW ? -1
				: key == B_DOWN_ARROW             ? 1
				: key == B_PAGE_UP                ? -page
												  : page;
			fWantedX = wantedX;
			MoveCaret(VerticalTarget(lines), extend);
			fWantedX = wantedX;
			break;
		}

		case B_HOME:
			MoveCaret(byWord ? 0 : OffsetAt(CurrentLine()), extend);
			break;

		case B_END:
			MoveCaret(byWord ? TextLength() : fLayout->LastOffset(CurrentLine()), extend);
			break;

		default:
			return false;
	}
	ScrollToSelection();
	return true;
}


void
BTextView::MoveCaret(int32 offset, bool extend)
{
	fCaret = std::clamp<int32>(offset, 0, TextLength());
	if (!extend)
		fAnchor = fCaret;
	fWantedX = -1;
	fNextStyle.reset();
	SealUndo();
	InvalidateText();
}


void
BTextView::DeleteByKey(bool forward, bool byWord)
{
	int32 start;
	int32 end;
	GetSelection(&start, &end);
	if (start == end) {
		if (forward)
			end = byWord ? WordEnd(fCaret) : NextOffset(fCaret);
		else
			start = byWord ? WordStart(fCaret) : PreviousOffset(fCaret);
	}
	Delete(start, end);
}


/// Where the caret goes when it moves by so many lines, as near as possible to the column wanted.
int32
BTextView::VerticalTarget(int32 lines)
{
	const int32 line = CurrentLine() + lines;
	if (line < 0)
		return 0;
	if (line >= CountLines())
		return TextLength();
	return fLayout->OffsetAt(line, fWantedX - PointAt(fLayout->LineStart(line)).x);
}


int32
BTextView::WordStart(int32 offset) const
{
	// Where words begin is part of what is hidden.
	if (IsTypingHidden())
		return 0;
	while (offset > 0 && !IsWordByte(fText[offset - 1]))
		offset--;
	while (offset > 0 && IsWordByte(fText[offset - 1]))
		offset--;
	return offset;
}


int32
BTextView::WordEnd(int32 offset) const
{
	if (IsTypingHidden())
		return TextLength();
	while (offset < TextLength() && !IsWordByte(fText[offset]))
		offset++;
	while (offset < TextLength() && IsWordByte(fText[offset]))
		offset++;
	return offset;
}


int32
BTextView::NextOffset(int32 offset) const
{
	return offset + BPrivate::CharacterLength(fText, offset);
}


int32
BTextView::PreviousOffset(int32 offset) const
{
	return BPrivate::CharacterBefore(fText, offset);
}


void
BTextView::MouseDown(BPoint where)
{
	if (!fSelectable && !fEditable)
		return;
	// What the press itself selects, by giving the focus, is not what it is on.
	const bool showedSelection = IsFocus();
	if (!showedSelection)
		MakeFocus(true);

	const int32 offset = OffsetAt(where);
	const int32 clicks = MessageNumber(this, "clicks");
	const bool extend = (MessageNumber(this, "modifiers") & B_SHIFT_KEY) != 0;
	if (fSelectable && clicks == 2) {
		int32 start = IsTypingHidden() ? 0 : offset;
		int32 end = IsTypingHidden() ? TextLength() : offset;
		while (start > 0 && IsWordByte(fText[start - 1]))
			start--;
		while (end < TextLength() && IsWordByte(fText[end]))
			end++;
		Select(start, end);
	} else if (fSelectable && clicks >= 3) {
		const int32 line = LineAt(offset);
		Select(OffsetAt(line), fLayout->LineEnd(line));
	} else if (extend || !showedSelection
		|| (MessageNumber(this, "buttons") & B_PRIMARY_MOUSE_BUTTON) == 0
		|| !BeginPressOnSelection(where)) {
		MoveCaret(offset, extend && fSelectable);
		fSelecting = fSelectable;
		SetMouseEventMask(B_POINTER_EVENTS, B_NO_POINTER_HISTORY | B_LOCK_WINDOW_FOCUS);
	}
}


void
BTextView::MouseUp(BPoint)
{
	if (fMayDrag)
		MoveCaret(OffsetAt(fPressed), false);
	StopSelecting();
}


void
BTextView::MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage)
{
	BView::MouseMoved(where, code, dragMessage);
	FollowDrag(where, code, dragMessage);
	if (fSelecting)
		SelectTo(where);
	else if (fMayDrag && dragMessage == NULL)
		DragWhenFarEnough(where);
}
