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

/// \a color, or what stands for it when it takes no input, on \a background.
rgb_color StrengthOf(bool enabled, rgb_color color, rgb_color background);

/// The colour of a control's text on \a background.
rgb_color ControlTextColor(bool enabled, rgb_color background);

/// What a push button, and what a field for text or a tick, is filled with.
rgb_color ButtonSurfaceColor(ControlState state);
rgb_color FieldColor(ControlState state);

/// The border of a button or a field.
rgb_color ControlBorderColor(ControlState state);

/// The surface of a push button with its border and its focus ring.
void DrawButtonSurface(BView* view, BRect frame, ControlState state, bool isDefault);

/// Two lines side by side, \a inner within \a outer, which lies on the sides of \a frame.
void DrawDoubleFrame(BView* view, BRect frame, rgb_color outer, rgb_color inner);

/// The field that text is edited in, and that ticks stand in.
void DrawFieldSurface(BView* view, BRect frame, ControlState state);

/// The round field of a radio button, and its dot.
void DrawRoundField(BView* view, BRect frame, ControlState state, bool on);

/// The tick of a check box in its field \a frame; a dash when it is only partly on.
void DrawTick(BView* view, BRect frame, ControlState state, bool partly);

/// The square at the left of a view that a tick or a dot stands in.
BRect MarkFrame(const BView* view);

/// The label right of the mark, cut at the view's edge. Null for none.
void DrawMarkLabel(BView* view, const char* label, bool enabled);

/// What a mark and its label need.
void GetMarkSize(const BView* view, const char* label, float* _width, float* _height);

/// A view's colours become those of what it lies on. Only for attached views.
void AdoptParentColors(BView* view);

} // namespace BPrivate

#endif // KITS_INTERFACE_CONTROL_LOOK_H
