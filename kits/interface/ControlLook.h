// SPDX-License-Identifier: MIT
// How controls are drawn: one quiet look, derived from the system colours.
#ifndef KITS_INTERFACE_CONTROL_LOOK_H
#define KITS_INTERFACE_CONTROL_LOOK_H

#include <GraphicsDefs.h>
#include <Rect.h>

class BView;

namespace BPrivate {

/// What a control's picture depends on.
struct ControlState {
	bool enabled;
	bool focused;
	bool pressed;
};

/// \a amount of \a over, from 0 to 1, laid on \a under.
rgb_color BlendColors(rgb_color under, rgb_color over, float amount);

/// The colour of a control's text on \a background.
rgb_color ControlTextColor(bool enabled, rgb_color background);

/// The surface of a push button with its border and its focus ring.
void DrawButtonSurface(BView* view, BRect frame, ControlState state, bool isDefault);

/// The sunken field that text is edited in, and that ticks and dots stand in.
void DrawFieldSurface(BView* view, BRect frame, ControlState state);

/// The tick of a check box in its field \a frame; a dash when it is only partly on.
void DrawTick(BView* view, BRect frame, ControlState state, bool partly);

/// A view's colours become those of what it lies on. Only for attached views.
void AdoptParentColors(BView* view);

} // namespace BPrivate

#endif // KITS_INTERFACE_CONTROL_LOOK_H
