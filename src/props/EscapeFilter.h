// SPDX-License-Identifier: MIT
// The Escape key, taken before the view that has the keyboard focus gets it.

#pragma once

#include <functional>

#include <MessageFilter.h>

/// Calls a function for each press of Escape, in the window's thread, and keeps the key from the others.
class TEscapeFilter : public BMessageFilter {
public:
	/// \a action returns whether the press was meant for it; the key goes on if not.
	explicit TEscapeFilter(std::function<bool()> action);

	filter_result Filter(BMessage* message, BHandler** target) override;

private:
	std::function<bool()> fAction;
};
