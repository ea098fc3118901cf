// SPDX-License-Identifier: MIT
// BView: the graphics state: colours, pen, modes, font, origin and clipping, and the stack of it.
#include <View.h>

#include <Cursor.h>
#include <Region.h>
#include <String.h>
#include <Window.h>

#include "display/Canvas.h"
#include "interface/PictureCanvas.h"
#include "interface/ViewPrivate.h"
#include "interface/WindowPrivate.h"

namespace {

rgb_color
Resolved(color_which which, float tint)
{
	rgb_color color = ui_color(which);
	return tint == B_NO_TINT ? color : tint_color(color, tint);
}

} // namespace


BPrivate::ViewDrawing::ViewDrawing() = default;


BPrivate::ViewDrawing::~ViewDrawing() = default;


BPrivate::CanvasState
BPrivate::ToCanvasState(const BView& view, const GraphicsState& state, BPoint offset)
{
	CanvasState result;
	result.highColor = view.HighColor();
	result.lowColor = view.LowColor();
	result.mode = state.mode;
	result.alphaSource = state.alphaSource;
	result.alphaFunction = state.alphaFunction;
	result.penSize = state.penSize;
	result.origin = offset + state.baseOrigin + state.origin;
	result.font = state.font;
	return result;
}


BPrivate::ViewDrawing&
BView::Drawing()
{
	if (fDrawing == nullptr)
		fDrawing = std::make_unique<BPrivate::ViewDrawing>();
	fDrawing->serial++;
	return *fDrawing;
}


const BPrivate::GraphicsState&
BView::State() const
{
	static const auto* newViewState = new BPrivate::GraphicsState;
	return fDrawing != nullptr ? fDrawing->state : *newViewState;
}


void
BView::SetViewColor(rgb_color color)
{
	CheckLock();
	fViewColor = color;
	fViewUIColor = B_NO_COLOR;
}


void
BView::SetViewColor(uchar red, uchar green, uchar blue, uchar alpha)
{
	SetViewColor(make_color(red, green, blue, alpha));
}


rgb_color
BView::ViewColor() const
{
	CheckLock();
	if (fViewUIColor != B_NO_COLOR)
		return Resolved(static_cast<color_which>(fViewUIColor), fViewTint);
	return fViewColor;
}


void
BView::SetViewUIColor(color_which which, float tint)
{
	CheckLock();
	fViewUIColor = static_cast<uint8>(which);
	fViewTint = tint;
}


color_which
BView::ViewUIColor(float* tint) const
{
	if (tint != nullptr)
		*tint = fViewUIColor != B_NO_COLOR ? fViewTint : B_NO_TINT;
	return static_cast<color_which>(fViewUIColor);
}


void
BView::SetHighColor(rgb_color color)
{
	CheckLock();
	BPrivate::GraphicsState& state = Drawing().state;
	state.highColor = color;
	state.highUIColor = B_NO_COLOR;
}


void
BView::SetHighColor(uchar red, uchar green, uchar blue, uchar alpha)
{
	SetHighColor(make_color(red, green, blue, alpha));
}


rgb_color
BView::HighColor() const
{
	CheckLock();
	const BPrivate::GraphicsState& state = State();
	if (state.highUIColor != B_NO_COLOR)
		return Resolved(state.highUIColor, state.highTint);
	return state.highColor;
}


void
BView::SetHighUIColor(color_which which, float tint)
{
	CheckLock();
	BPrivate::GraphicsState& state = Drawing().state;
	state.highUIColor = which;
	state.highTint = tint;
}


color_which
BView::HighUIColor(float* tint) const
{
	const BPrivate::GraphicsState& state = State();
	if (tint != nullptr)
		*tint = state.highUIColor != B_NO_COLOR ? state.highTint : B_NO_TINT;
	return state.highUIColor;
}


void
BView::SetLowColor(rgb_color color)
{
	CheckLock();
	BPrivate::GraphicsState& state = Drawing().state;
	state.lowColor = color;
	state.lowUIColor = B_NO_COLOR;
}


void
BView::SetLowColor(uchar red, uchar green, uchar blue, uchar alpha)
{
	SetLowColor(make_color(red, green, blue, alpha));
}


rgb_color
BView::LowColor() const
{
	CheckLock();
	const BPrivate::GraphicsState& state = State();
	if (state.lowUIColor != B_NO_COLOR)
		return Resolved(state.lowUIColor, state.lowTint);
	return state.lowColor;
}


void
BView::SetLowUIColor(color_which which, float tint)
{
	CheckLock();
	BPrivate::GraphicsState& state = Drawing().state;
	state.lowUIColor = which;
	state.lowTint = tint;
}


color_which
BView::LowUIColor(float* tint) const
{
	const BPrivate::GraphicsState& state = State();
	if (tint != nullptr)
		*tint = state.lowUIColor != B_NO_COLOR ? state.lowTint : B_NO_TINT;
	return state.lowUIColor;
}


void
BView::SetDrawingMode(drawing_mode mode)
{
	CheckLock();
	Drawing().state.mode = mode;
}


drawing_mode
BView::DrawingMode() const
{
	return State().mode;
}


void
BView::SetBlendingMode(source_alpha srcAlpha, alpha_function alphaFunc)
{
	CheckLock();
	BPrivate::GraphicsState& state = Drawing().state;
	state.alphaSource = srcAlpha;
	state.alphaFunction = alphaFunc;
}


void
BView::GetBlendingMode(source_alpha* srcAlpha, alpha_function* alphaFunc) const
{
	if (srcAlpha != nullptr)
		*srcAlpha = State().alphaSource;
	if (alphaFunc != nullptr)
		*alphaFunc = State().alphaFunction;
}


void
BView::SetPenSize(float size)
{
	CheckLock();
	Drawing().state.penSize = size;
}


float
BView::PenSize() const
{
	return State().penSize;
}


void
BView::MovePenTo(BPoint pt)
{
	CheckLock();
	SetPenLocation(pt);
}


void
BView::MovePenTo(float x, float y)
{
	MovePenTo(BPoint(x, y));
}


void
BView::MovePenBy(float x, float y)
{
	MovePenTo(PenLocation() + BPoint(x, y));
}


BPoint
BView::PenLocation() const
{
	CheckLock();
	return State().penLocation;
}


void
BView::SetOrigin(BPoint where)
{
	CheckLock();
	Drawing().state.origin = where;
}


void
BView::SetOrigin(float x, float y)
{
	SetOrigin(BPoint(x, y));
}


BPoint
BView::Origin() const
{
	return State().origin;
}


void
BView::PushState()
{
	CheckLock();
	BPrivate::ViewDrawing& drawing = Drawing();
	drawing.savedStates.push_back(drawing.state);
	drawing.state.baseOrigin += drawing.state.origin;
	drawing.state.origin = B_ORIGIN;
}


void
BView::PopState()
{
	CheckLock();
	BPrivate::ViewDrawing& drawing = Drawing();
	if (drawing.savedStates.empty())
		return;
	drawing.state = std::move(drawing.savedStates.back());
	drawing.savedStates.pop_back();
}


void
BView::ConstrainClippingRegion(BRegion* region)
{
	CheckLock();
	BPrivate::ViewDrawing& drawing = Drawing();
	std::optional<BRegion> below;
	if (!drawing.savedStates.empty())
		below = drawing.savedStates.back().clipping;

	if (region == nullptr) {
		drawing.state.clipping = std::move(below);
		return;
	}
	BRegion clipping(*region);
	clipping.OffsetBy(drawing.state.baseOrigin + drawing.state.origin);
	if (below)
		clipping.IntersectWith(&*below);
	drawing.state.clipping = std::move(clipping);
}


void
BView::SetFont(const BFont* font, uint32 mask)
{
	CheckLock();
	if (font == nullptr || mask == 0)
		return;

	BFont& own = Drawing().state.font;
	if ((mask & B_FONT_ALL) == B_FONT_ALL) {
		own = *font;
		return;
	}
	if ((mask & B_FONT_FAMILY_AND_STYLE) != 0)
		own.SetFamilyAndStyle(font->FamilyAndStyle());
	if ((mask & B_FONT_SIZE) != 0)
		own.SetSize(font->Size());
	if ((mask & B_FONT_SHEAR) != 0)
		own.SetShear(font->Shear());
	if ((mask & B_FONT_ROTATION) != 0)
		own.SetRotation(font->Rotation());
	if ((mask & B_FONT_SPACING) != 0)
		own.SetSpacing(font->Spacing());
	if ((mask & B_FONT_ENCODING) != 0)
		own.SetEncoding(font->Encoding());
	if ((mask & B_FONT_FACE) != 0)
		own.SetFace(font->Face());
	if ((mask & B_FONT_FLAGS) != 0)
		own.SetFlags(font->Flags());
}


void
BView::GetFont(BFont* font) const
{
	CheckLock();
	*font = State().font;
}


void
BView::SetFontSize(float size)
{
	BFont font;
	font.SetSize(size);
	SetFont(&font, B_FONT_SIZE);
}


void
BView::GetFontHeight(font_height* height) const
{
	State().font.GetHeight(height);
}


void
BView::TruncateString(BString* in_out, uint32 mode, float width) const
{
	State().font.TruncateString(in_out, mode, width);
}


float
BView::StringWidth(const char* string) const
{
	return State().font.StringWidth(string);
}


float
BView::StringWidth(const char* string, int32 length) const
{
	return State().font.StringWidth(string, length);
}


void
BView::GetStringWidths(
	char* stringArray[], int32 lengthArray[], int32 numStrings, float widthArray[]) const
{
	State().font.GetStringWidths(
		const_cast<const char**>(stringArray), lengthArray, numStrings, widthArray);
}


void
BView::SetViewCursor(const BCursor* cursor, bool)
{
	CheckLock();
	Drawing().cursor = cursor != nullptr ? std::make_unique<BCursor>(*cursor) : nullptr;
	if (fOwner != nullptr)
		fOwner->fData->input.CursorChanged(this);
}
