// SPDX-License-Identifier: MIT
// BTextView: which part of the text is seen.

#include <algorithm>
#include <cmath>

#include <Message.h>
#include <MessageRunner.h>
#include <Messenger.h>
#include <ScrollBar.h>
#include <TextView.h>
#include <Window.h>

#include "TextLayout.h"
#include "TextScroll.h"

namespace {

constexpr bigtime_t kScrollInterval = 40000;


/// How far the text moves at once while the pointer is that place on an axis: farther from the view, faster. Never
/// by more than the view shows.
float
ScrollStep(float place, float first, float last)
{
	const float beyond = place < first ? place - first : std::max(place - last, 0.0f);
	if (beyond == 0)
		return 0;
	const float step = std::min(2 + std::fabs(beyond) / 2, std::max(last - first, 1.0f));
	return std::copysign(std::round(step), beyond);
}

} // namespace

void
BTextView::ScrollToOffset(int32 offset)
{
	if (Window() == NULL)
		return;
	float height;
	BPoint top = PointAt(offset, &height);
	// With the first line, and at the left edge, the margin is shown, too.
	if (top.x <= fTextRect.left)
		top.x = 0;
	if (top.y <= fTextRect.top)
		top.y = 0;
	const BRect bounds = Bounds();
	BPoint where = bounds.LeftTop();
	// Without word wrap a caret at the right edge brings some of what follows with it.
	const float ahead = std::min(bounds.Width() / 4, 30.0f);
	if (top.x < bounds.left)
		where.x = std::max(top.x - ahead, 0.0f);
	else if (top.x > bounds.right - 1)
		where.x = top.x - bounds.Width() + ahead;
	if (top.y < bounds.top)
		where.y = std::max(top.y, 0.0f);
	else if (top.y + height > bounds.bottom + 1 && height <= bounds.Height())
		where.y = top.y + height - bounds.Height();
	// A single line leaves no empty space behind its end that its beginning could have.
	if (CountLines() == 1) {
		const float end = PointAt(TextLength()).x + std::max(fTextRect.left, 0.0f) + 1;
		where.x = std::clamp(where.x, 0.0f, std::max(std::ceil(end - bounds.Width()), 0.0f));
	}
	if (where != bounds.LeftTop())
		ScrollTo(where);
}


void
BTextView::ScrollToSelection()
{
	ScrollToOffset(fCaret);
}


/// Text that is only read moves instead of a caret that nobody sees; false for any other key.
bool
BTextView::ScrollByKey(char key)
{
	const BRect bounds = Bounds();
	const float line = fLayout->LineHeight(0);
	const float page = std::max(bounds.Height() - line, line);
	float by;
	switch (key) {
		case B_UP_ARROW:
			by = -line;
			break;

		case B_DOWN_ARROW:
			by = line;
			break;

		case B_PAGE_UP:
			by = -page;
			break;

		case B_PAGE_DOWN:
			by = page;
			break;

		case B_HOME:
			by = -bounds.top;
			break;

		case B_END:
			by = fLayout->Height();
			break;

		default:
			return false;
	}
	const float lowest = fTextRect.top + fLayout->Height() - bounds.Height();
	ScrollTo(BPoint(bounds.left, std::clamp(bounds.top + by, 0.0f, std::max(lowest, 0.0f))));
	return true;
}


/// How large the text is with what lies around it: as much as at the top and at the left is there at the other
/// ends, too.
BSize
BTextView::ContentSize() const
{
	// A wrapped text is as wide as its rectangle. The caret needs a pixel behind the text.
	const float width = fWordWrap ? fTextRect.Width() : fLayout->Width() + 1;
	return BSize(width + 1 + 2 * std::max(fTextRect.left, 0.0f),
		fLayout->Height() + 2 * std::max(fTextRect.top, 0.0f));
}


void
BTextView::FixScrollBars()
{
	const auto fit = [](BScrollBar* bar, float content, float seen, float step) {
		seen = std::max(seen, 0.0f);
		bar->SetRange(0, std::max(std::ceil(content) - 1 - seen, 0.0f));
		bar->SetProportion(content > 0 ? (seen + 1) / content : 1);
		bar->SetSteps(step, std::max(seen - step, step));
	};
	BScrollBar* vertical = ScrollBar(B_VERTICAL);
	BScrollBar* horizontal = ScrollBar(B_HORIZONTAL);
	if (vertical == NULL && horizontal == NULL)
		return;
	const BRect bounds = Bounds();
	const float line = fLayout->LineHeight(0);
	const BSize content = ContentSize();
	if (vertical != NULL)
		fit(vertical, content.height, bounds.Height(), line);
	if (horizontal != NULL)
		fit(horizontal, content.width, bounds.Width(), line);
}


/// The left-top of the view when it shows the end of the text, and what is widest.
BPoint
BTextView::LastPlace() const
{
	const BRect bounds = Bounds();
	const BSize content = ContentSize();
	const float x = std::max(std::ceil(content.width) - 1 - bounds.Width(), 0.0f);
	// A single line moves sideways only.
	const float y =
		CountLines() > 1 ? std::max(std::ceil(content.height) - 1 - bounds.Height(), 0.0f) : 0;
	return BPoint(x, y);
}


/// Selects up to where the pointer is. Beyond an edge that hides more of the text it goes no farther than what is
/// seen; the rest comes into sight as long as the pointer stays there.
void
BTextView::SelectTo(BPoint where)
{
	const BRect bounds = Bounds();
	const BPoint last = LastPlace();
	const auto seen = [](float place, float first, float end, float furthest) {
		const bool hidesMore = place < first ? first > 0 : place > end && first < furthest;
		return hidesMore ? std::clamp(place, first, end) : place;
	};
	const BPoint target(seen(where.x, bounds.left, bounds.right, last.x),
		seen(where.y, bounds.top, bounds.bottom, last.y));
	MoveCaret(OffsetAt(target), true);
	if (target == where) {
		fScrollOn.reset();
		ScrollToSelection();
		return;
	}
	if (fScrollOn == NULL) {
		fScrollOn = std::make_unique<BMessageRunner>(
			BMessenger(this), BMessage(BPrivate::kMsgScrollOn), kScrollInterval);
	}
}


/// The pointer has been beyond the edge for a while.
void
BTextView::ScrollOn()
{
	BPoint where;
	uint32 buttons = 0;
	GetMouse(&where, &buttons, false);
	if (!fSelecting || buttons == 0) {
		fScrollOn.reset();
		return;
	}
	const BRect bounds = Bounds();
	const BPoint last = LastPlace();
	const BPoint step(ScrollStep(where.x, bounds.left, bounds.right),
		ScrollStep(where.y, bounds.top, bounds.bottom));
	const auto moved = [](float place, float by, float furthest) {
		return by < 0 ? std::max(place + by, std::min(place, 0.0f))
					  : std::min(place + by, std::max(place, furthest));
	};
	const BPoint place(moved(bounds.left, step.x, last.x), moved(bounds.top, step.y, last.y));
	if (place != bounds.LeftTop())
		ScrollTo(place);
	SelectTo(where + Bounds().LeftTop() - bounds.LeftTop());
}


void
BTextView::StopSelecting()
{
	fSelecting = false;
	fMayDrag = false;
	fScrollOn.reset();
}
