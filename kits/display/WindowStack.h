// SPDX-License-Identifier: MIT
// The program's windows from the lowest to the topmost, and which of them block which.
#ifndef DISPLAY_WINDOW_STACK_H
#define DISPLAY_WINDOW_STACK_H

#include <vector>

#include <Rect.h>

#include "display/HostWindow.h"

namespace BPrivate {

/// What the stack knows of a window.
struct StackedWindow {
	HostWindowClient* client = nullptr;
	BRect frame;
	HostWindowStyle style;
	bool isVisible = false;
	bool isMinimized = false;
	std::vector<const StackedWindow*> subset;

	bool IsShown() const { return isVisible && !isMinimized; }
	bool IsModal() const;
	bool IsFloating() const;
	/// Whether it may have the keyboard.
	bool TakesFocus() const;
};


/// The order of windows: by who came last, but modal windows stay above what they block, floating ones
/// above what they float over and below modal ones, and menus above all. Not locked.
class WindowStack {
public:
	void Add(StackedWindow* window);
	void Remove(StackedWindow* window);
	bool Has(const StackedWindow* window) const;
	const std::vector<StackedWindow*>& Windows() const { return fWindows; }

	void Raise(StackedWindow* window);
	/// Below \a other; null: below all of its kind.
	void SendBehind(StackedWindow* window, const StackedWindow* other);
	/// After a window's style or subset has changed.
	void Reorder();

	/// The topmost shown window that contains the point, null if none does.
	StackedWindow* WindowAt(BPoint screenWhere) const;
	/// The topmost shown window that takes focus and is not blocked.
	StackedWindow* TopFocus() const;
	/// No shown window is above it but menus and, unless it floats itself, floating ones.
	bool IsFront(const StackedWindow* window) const;
	/// The modal window that keeps \a window from input, null if none does.
	StackedWindow* BlockerOf(const StackedWindow* window) const;

private:
	static bool StaysAbove(const StackedWindow* upper, const StackedWindow* lower);

	std::vector<StackedWindow*> fWindows;
};

} // namespace BPrivate

#endif // DISPLAY_WINDOW_STACK_H
