// SPDX-License-Identifier: MIT
// The messages that components send to the design surface.

#pragma once

#include <SupportDefs.h>

class BMessage;
class BPoint;
class BView;

enum {
	/// "component" (pointer to TComponent): the dragged one. Dropped on the view under the pointer.
	DTM_COMPONENT_MOVE = 2457,

	/// "component" (pointer to TComponent); "frame" (BRect): its view's frame after the attempt, in
	/// the coordinates of the view's parent.
	DTM_COMPONENT_RESIZE = 2458,

	/// "component" (pointer to TComponent); "view" (pointer to BView): its view; "where" (BPoint): the
	/// pointer, in the view's coordinates.
	DTM_COMPONENT_CONTEXTMENU = 2459
};

/// Where a dropped \a message puts the left-top corner of what was dragged.
///
/// \a view: attached to a window; \a corner is in its coordinates: the drop point less the place within
/// the dragged rectangle at which the drag began. A posted copy of a dropped message counts too: a
/// component that is dropped on itself passes the drop on that way. Any thread, window locked.
/// Returns false, \a corner not written, when the message was not dropped.
bool FindDroppedCorner(const BMessage* message, const BView* view, BPoint* corner);
