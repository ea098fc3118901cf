// SPDX-License-Identifier: MIT
// What a view keeps for drawing, made when something differs from a new view's.
#ifndef INTERFACE_VIEW_PRIVATE_H
#define INTERFACE_VIEW_PRIVATE_H

#include <memory>
#include <optional>
#include <vector>

#include <Bitmap.h>
#include <Cursor.h>
#include <Font.h>
#include <Region.h>
#include <View.h>

namespace BPrivate {

class Canvas;
class PictureCanvas;
struct CanvasState;

/// What PushState() saves.
struct GraphicsState {
	rgb_color highColor = {0, 0, 0, 255};
	rgb_color lowColor = {255, 255, 255, 255};
	color_which highUIColor = B_NO_COLOR;
	color_which lowUIColor = B_NO_COLOR;
	float highTint = B_NO_TINT;
	float lowTint = B_NO_TINT;
	drawing_mode mode = B_OP_COPY;
	source_alpha alphaSource = B_PIXEL_ALPHA;
	alpha_function alphaFunction = B_ALPHA_OVERLAY;
	float penSize = 1;
	BPoint penLocation;
	/// Relative to the state below.
	BPoint origin;
	/// The sum of the origins of the states below.
	BPoint baseOrigin;
	BFont font;
	/// View coordinates without any origin; narrows those of the states below.
	std::optional<BRegion> clipping;
};


/// As a canvas takes it: \a offset of the view in the canvas.
CanvasState ToCanvasState(const BView& view, const GraphicsState& state, BPoint offset);


/// A line of a line array.
struct ColoredLine {
	BPoint start;
	BPoint end;
	rgb_color color;
};


/// The picture behind a view.
struct ViewBackground {
	std::unique_ptr<BBitmap> bitmap;
	BRect source;
	BRect destination;
	uint32 followFlags;
	uint32 options;

	/// \a offset: of the view in the window. The canvas is clipped already.
	void Draw(Canvas& canvas, BRect bounds, BPoint offset) const;
};


/// A picture that is being recorded.
struct Recording {
	BPicture* picture = nullptr;
	std::unique_ptr<PictureCanvas> canvas;
	/// The state that it was last told.
	uint32 serial = 0;
};


class ViewDrawing {
public:
	ViewDrawing();
	~ViewDrawing();

	GraphicsState state;
	/// Counts the changes of the state.
	uint32 serial = 0;
	std::vector<GraphicsState> savedStates;
	std::vector<ColoredLine> lines;
	size_t maxLines = 0;
	std::unique_ptr<ViewBackground> background;
	std::unique_ptr<BCursor> cursor;
	/// The last one records.
	std::vector<Recording> recordings;
};

} // namespace BPrivate

#endif // INTERFACE_VIEW_PRIVATE_H
