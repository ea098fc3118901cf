// SPDX-License-Identifier: MIT
// BTextView: dragging what is selected, and what is dropped.

#include <algorithm>
#include <atomic>
#include <cmath>
#include <string>

#include <Message.h>
#include <TextView.h>
#include <Window.h>

#include "TextLayout.h"
#include "TextStyles.h"

namespace {

// How far the pointer goes, in pixels, before it drags.
constexpr float kDragDistance = 4;

// int64: which drag it is, to the view that began it. Other views, and other programs', have other ones.
constexpr const char* kTextDrag = "be:text_drag";


int64
NextDragId(const BView* view)
{
	static std::atomic<int32> sCount = 0;
	return static_cast<int64>(view->Looper()->Team()) << 32 | ++sCount;
}

} // namespace

/// What is marked of a line, in view coordinates; invalid for nothing.
BRect
BTextView::SelectionIn(int32 line) const
{
	int32 selectionStart;
	int32 selectionEnd;
	GetSelection(&selectionStart, &selectionEnd);
	const int32 start = fLayout->LineStart(line);
	const int32 end = fLayout->LineEnd(line);
	const int32 from = std::max(start, selectionStart);
	const int32 to = std::min(end, selectionEnd);
	// A selection that goes on in the next line includes the line break.
	const bool breakSelected = selectionStart <= end && selectionEnd > end;
	if (!fSelectable || !IsFocus() || from > to || (from == to && !breakSelected))
		return BRect();

	const BPoint top = PointAt(start);
	const float right = breakSelected ? std::max(fTextRect.right, Bounds().right)
									  : std::ceil(top.x + fLayout->XAt(line, to)) - 1;
	return BRect(std::floor(top.x + fLayout->XAt(line, from)), top.y, right,
		top.y + fLayout->LineHeight(line) - 1);
}


/// A press on what is selected drags it, or puts the caret there when nothing comes of that. False when the
/// press is none of this kind.
bool
BTextView::BeginPressOnSelection(BPoint where)
{
	if (IsTypingHidden() || !SelectionIn(LineAt(where)).Contains(where))
		return false;
	fPressed = where;
	fMayDrag = true;
	SetMouseEventMask(B_POINTER_EVENTS, B_NO_POINTER_HISTORY | B_LOCK_WINDOW_FOCUS);
	return true;
}


void
BTextView::DragWhenFarEnough(BPoint where)
{
	const BPoint way = where - fPressed;
	if (std::fabs(way.x) < kDragDistance && std::fabs(way.y) < kDragDistance)
		return;
	fMayDrag = false;
	int32 start;
	int32 end;
	GetSelection(&start, &end);
	const BRect bounds = Bounds();
	BRect marked;
	const int32 last = LineAt(bounds.RightBottom());
	for (int32 line = LineAt(bounds.LeftTop()); line <= last; line++) {
		const BRect part = SelectionIn(line) & bounds;
		if (part.IsValid())
			marked = marked.IsValid() ? marked | part : part;
	}
	// The text may have been changed since the press.
	if (start == end || !marked.IsValid())
		return;

	BMessage message(B_MIME_DATA);
	AddSelection(&message);
	fDragId = NextDragId(this);
	message.AddInt64(kTextDrag, fDragId);
	DragMessage(&message, marked);
}


/// Shows where what is dragged over the view would go.
void
BTextView::FollowDrag(BPoint where, uint32 code, const BMessage* dragMessage)
{
	int32 place = -1;
	if (dragMessage != NULL && code != B_EXITED_VIEW && code != B_OUTSIDE_VIEW
		&& AcceptsDrop(dragMessage))
		place = OffsetAt(where);
	if (place == fDropPlace)
		return;
	fDropPlace = place;
	InvalidateText();
}


/// Takes over the text that was dropped. What was dragged here from here moves.
void
BTextView::TakeDrop(const BMessage* message)
{
	FollowDrag(BPoint(), B_EXITED_VIEW, NULL);
	const int32 offset = OffsetAt(ConvertFromScreen(message->DropPoint()));
	int64 drag = 0;
	if (message->FindInt64(kTextDrag, &drag) == B_OK && drag == fDragId && MoveSelection(offset))
		return;

	std::string text;
	BPrivate::RunArray runs;
	ReadText(*message, &text, &runs);
	PutInPlace(offset, offset, text, runs.get());
}


/// Puts what is selected, which stays so, to another offset. False when nothing is selected.
bool
BTextView::MoveSelection(int32 offset)
{
	int32 start;
	int32 end;
	GetSelection(&start, &end);
	if (start == end)
		return false;
	if (offset >= start && offset <= end)
		return true;

	// One change, which is taken back as one: what was passed over goes to the other side.
	const bool back = offset < start;
	const int32 from = back ? offset : start;
	const int32 middle = back ? start : end;
	const int32 to = back ? end : offset;
	const std::string text = fText.substr(middle, to - middle) + fText.substr(from, middle - from);
	BPrivate::RunArray runs;
	if (!fStyles->IsOneStyle()) {
		const BPrivate::RunArray first = BPrivate::CopyRuns(*fStyles, middle, to);
		const BPrivate::RunArray second = BPrivate::CopyRuns(*fStyles, from, middle);
		if (first != nullptr && second != nullptr)
			runs = BPrivate::JoinRuns(*first, to - middle, *second);
	}
	SealUndo();
	Replace(from, to, text.data(), static_cast<int32>(text.size()), runs.get());
	SealUndo();
	const int32 moved = back ? from : to - (end - start);
	Select(moved, moved + end - start);
	ScrollToSelection();
	return true;
}
