// SPDX-License-Identifier: MIT
// Questions about the tree of views. Not for component libraries.

#pragma once

#include <View.h>

/// Whether \a view is \a ancestor or lies inside it. Either may be null; a null \a view lies in nothing. The views'
/// windows are locked.
inline bool
IsInside(const BView* view, const BView* ancestor)
{
	while (view != nullptr && view != ancestor)
		view = view->Parent();
	return view != nullptr;
}
