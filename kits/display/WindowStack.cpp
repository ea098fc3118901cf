// SPDX-License-Identifier: MIT
// The program's windows from the lowest to the topmost, and which of them block which.
#include "display/WindowStack.h"

#include <algorithm>

#include <Window.h>

namespace BPrivate {

namespace {

int
Layer(const StackedWindow* window)
{
	if (window->style.isMenu)
		return 3;
	if (window->IsModal())
		return 2;
	return window->IsFloating() ? 1 : 0;
}


bool
HasInSubset(const StackedWindow* window, const StackedWindow* member)
{
	return std::find(window->subset.begin(), window->subset.end(), member) != window->subset.end();
}

} // namespace


bool
StackedWindow::IsModal() const
{
	return style.feel == B_MODAL_APP_WINDOW_FEEL || style.feel == B_MODAL_ALL_WINDOW_FEEL
		|| style.feel == B_MODAL_SUBSET_WINDOW_FEEL;
}


bool
StackedWindow::IsFloating() const
{
	return style.feel == B_FLOATING_APP_WINDOW_FEEL || style.feel == B_FLOATING_ALL_WINDOW_FEEL
		|| style.feel == B_FLOATING_SUBSET_WINDOW_FEEL;
}


bool
StackedWindow::TakesFocus() const
{
	return !style.isMenu && (style.flags & B_AVOID_FOCUS) == 0;
}


void
WindowStack::Add(StackedWindow* window)
{
	fWindows.push_back(window);
	Reorder();
}


void
WindowStack::Remove(StackedWindow* window)
{
	std::erase(fWindows, window);
	for (StackedWindow* other : fWindows)
		std::erase(other->subset, window);
}


bool
WindowStack::Has(const StackedWindow* window) const
{
	return std::find(fWindows.begin(), fWindows.end(), window) != fWindows.end();
}


void
WindowStack::Raise(StackedWindow* window)
{
	std::erase(fWindows, window);
	Add(window);
}


void
WindowStack::SendBehind(StackedWindow* window, const StackedWindow* other)
{
	std::erase(fWindows, window);
	auto place = fWindows.begin();
	if (other != nullptr)
		place = std::find(fWindows.begin(), fWindows.end(), other);
	fWindows.insert(place, window);
	Reorder();
}


// Each window keeps its place unless one that it has to stay above is still to come: then it follows that.
void
WindowStack::Reorder()
{
	std::vector<StackedWindow*> left;
	left.swap(fWindows);
	while (!left.empty()) {
		auto isFree = [&](const StackedWindow* window) {
			return std::none_of(left.begin(), left.end(),
				[&](const StackedWindow* other) { return StaysAbove(window, other); });
		};
		// The lowest kind that is left is always free.
		auto next = std::find_if(left.begin(), left.end(), isFree);
		fWindows.push_back(*next);
		left.erase(next);
	}
}


bool
WindowStack::StaysAbove(const StackedWindow* upper, const StackedWindow* lower)
{
	if (Layer(upper) <= Layer(lower))
		return false;
	bool hasSubset = !upper->style.isMenu
		&& (upper->style.feel == B_MODAL_SUBSET_WINDOW_FEEL
			|| upper->style.feel == B_FLOATING_SUBSET_WINDOW_FEEL);
	return !hasSubset || HasInSubset(upper, lower);
}


StackedWindow*
WindowStack::WindowAt(BPoint screenWhere) const
{
	for (auto window = fWindows.rbegin(); window != fWindows.rend(); ++window) {
		// The frame names pixel centres; the last column ends half a pixel behind its centre.
		BRect area = (*window)->frame;
		bool inside = screenWhere.x >= area.left && screenWhere.x < area.right + 1
			&& screenWhere.y >= area.top && screenWhere.y < area.bottom + 1;
		if ((*window)->IsShown() && inside)
			return *window;
	}
	return nullptr;
}


StackedWindow*
WindowStack::TopFocus() const
{
	for (auto window = fWindows.rbegin(); window != fWindows.rend(); ++window) {
		if ((*window)->IsShown() && (*window)->TakesFocus() && !(*window)->IsFloating()
			&& BlockerOf(*window) == nullptr)
			return *window;
	}
	return nullptr;
}


bool
WindowStack::IsFront(const StackedWindow* window) const
{
	if (!window->IsShown())
		return false;
	for (auto other = fWindows.rbegin(); other != fWindows.rend() && *other != window; ++other) {
		bool isBeside = (*other)->style.isMenu || ((*other)->IsFloating() && !window->IsFloating());
		if ((*other)->IsShown() && !isBeside)
			return false;
	}
	return true;
}


StackedWindow*
WindowStack::BlockerOf(const StackedWindow* window) const
{
	if (window->style.isMenu)
		return nullptr;

	for (auto other = fWindows.rbegin(); other != fWindows.rend(); ++other) {
		if (*other == window) {
			// Modal windows above this one would have been met already; those below do not block another modal one.
			if (window->IsModal())
				return nullptr;
			continue;
		}
		if (!(*other)->IsShown() || !(*other)->IsModal())
			continue;
		if ((*other)->style.feel == B_MODAL_SUBSET_WINDOW_FEEL && !HasInSubset(*other, window))
			continue;
		return *other;
	}
	return nullptr;
}

} // namespace BPrivate
