// SPDX-License-Identifier: MIT
// A rectangle of a window that draws itself and takes input.
#ifndef _VIEW_H
#define _VIEW_H

#include <memory>

#include <Font.h>
#include <Handler.h>
#include <InterfaceDefs.h>
#include <Rect.h>

class BBitmap;
class BCursor;
class BMessage;
class BPicture;
class BPolygon;
class BRegion;
class BScrollBar;
class BScrollView;
class BShape;
class BString;
class BWindow;

namespace BPrivate {
class Canvas;
class ScrollBarLink;
class ViewDrawing;
class WindowData;
class WindowInput;
class WindowPainter;
struct GraphicsState;
} // namespace BPrivate

enum {
	B_PRIMARY_MOUSE_BUTTON = 1,
	B_SECONDARY_MOUSE_BUTTON = 2,
	B_TERTIARY_MOUSE_BUTTON = 4,
};

enum {
	B_ENTERED_VIEW = 0,
	B_INSIDE_VIEW = 1,
	B_EXITED_VIEW = 2,
	B_OUTSIDE_VIEW = 3,
};

enum {
	B_POINTER_EVENTS = 1,
	B_KEYBOARD_EVENTS = 2,
};

enum {
	B_LOCK_WINDOW_FOCUS = 1,
	B_SUSPEND_VIEW_FOCUS = 2,
	B_NO_POINTER_HISTORY = 4,
	B_FULL_POINTER_HISTORY = 8,
};

enum rect_tracking_style {
	B_TRACK_WHOLE_RECT = 0,
	B_TRACK_RECT_CORNER = 1,
};

enum set_font_mask {
	B_FONT_FAMILY_AND_STYLE = 1,
	B_FONT_SIZE = 2,
	B_FONT_SHEAR = 4,
	B_FONT_ROTATION = 8,
	B_FONT_SPACING = 16,
	B_FONT_ENCODING = 32,
	B_FONT_FACE = 64,
	B_FONT_FLAGS = 128,
	B_FONT_FALSE_BOLD_WIDTH = 256,
	B_FONT_ALL = 511,
};

enum {
	B_CURRENT_STATE_COORDINATES = 0,
	B_PREVIOUS_STATE_COORDINATES = 1,
	B_VIEW_COORDINATES = 2,
	B_PARENT_VIEW_DRAW_COORDINATES = 3,
	B_PARENT_VIEW_COORDINATES = 4,
	B_WINDOW_COORDINATES = 5,
	B_SCREEN_COORDINATES = 6,
};

const uint32 B_FULL_UPDATE_ON_RESIZE = 0x80000000;
const uint32 B_WILL_DRAW = 0x20000000;
const uint32 B_PULSE_NEEDED = 0x10000000;
const uint32 B_NAVIGABLE_JUMP = 0x08000000;
const uint32 B_FRAME_EVENTS = 0x04000000;
const uint32 B_NAVIGABLE = 0x02000000;
const uint32 B_SUBPIXEL_PRECISE = 0x01000000;
const uint32 B_DRAW_ON_CHILDREN = 0x00800000;
const uint32 B_INPUT_METHOD_AWARE = 0x00400000;
const uint32 B_SCROLL_VIEW_AWARE = 0x00200000;
const uint32 B_SUPPORTS_LAYOUT = 0x00100000;
const uint32 B_INVALIDATE_AFTER_LAYOUT = 0x00080000;
const uint32 B_TRANSPARENT_BACKGROUND = 0x00040000;
const uint32 _VIEW_TOP_ = 0x00000001;
const uint32 _VIEW_LEFT_ = 0x00000002;
const uint32 _VIEW_BOTTOM_ = 0x00000003;
const uint32 _VIEW_RIGHT_ = 0x00000004;
const uint32 _VIEW_CENTER_ = 0x00000005;
const uint32 B_FOLLOW_NONE = 0x00000000;
const uint32 B_FOLLOW_ALL_SIDES = 0x00001234;
const uint32 B_FOLLOW_ALL = 0x00001234;
const uint32 B_FOLLOW_LEFT = 0x00000202;
const uint32 B_FOLLOW_RIGHT = 0x00000404;
const uint32 B_FOLLOW_LEFT_RIGHT = 0x00000204;
const uint32 B_FOLLOW_H_CENTER = 0x00000505;
const uint32 B_FOLLOW_TOP = 0x00001010;
const uint32 B_FOLLOW_BOTTOM = 0x00003030;
const uint32 B_FOLLOW_TOP_BOTTOM = 0x00001030;
const uint32 B_FOLLOW_V_CENTER = 0x00005050;
const uint32 B_FOLLOW_LEFT_TOP = 0x00001212;

/// A node of a window's view tree.
///
/// Coordinates are the view's own (its Bounds()) unless said otherwise; Frame() is in the parent's.
/// Once attached to a window, use it with that window locked: its hooks run so. A view that belongs
/// to no window needs no lock. A deleted view deletes its children; remove a view before deleting it.
class BView : public BHandler {
public:
	BView(BRect frame, const char* name, uint32 resizingMode, uint32 flags);
	BView(BMessage* archive);
	virtual ~BView();

	static BArchivable* Instantiate(BMessage* archive);
	virtual status_t Archive(BMessage* archive, bool deep = true) const override;

	/// Parent before children; AllAttached() of a view after all of its descendants are attached.
	virtual void AttachedToWindow();
	virtual void AllAttached();
	/// Window() is still valid in these two.
	virtual void DetachedFromWindow();
	virtual void AllDetached();
	virtual void MessageReceived(BMessage* message) override;

	/// \a child must have no parent; it goes before \a before, else to the end (on top).
	void AddChild(BView* child, BView* before = NULL);
	/// Detaches without deleting. False when \a child is no child of this view.
	bool RemoveChild(BView* child);
	int32 CountChildren() const;
	BView* ChildAt(int32 index) const;
	BView* NextSibling() const;
	BView* PreviousSibling() const;
	bool RemoveSelf();
	BWindow* Window() const;
	/// Null for a view directly under its window.
	BView* Parent() const;
	/// This view or a descendant, depth first, by exact name; null when there is none.
	BView* FindView(const char* name) const;

	virtual void Draw(BRect updateRect);
	virtual void DrawAfterChildren(BRect updateRect);
	virtual void MouseDown(BPoint where);
	virtual void MouseUp(BPoint where);
	virtual void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage);
	virtual void WindowActivated(bool active);
	virtual void KeyDown(const char* bytes, int32 numBytes);
	virtual void KeyUp(const char* bytes, int32 numBytes);
	virtual void Pulse();
	virtual void FrameMoved(BPoint newPosition);
	virtual void FrameResized(float newWidth, float newHeight);
	virtual void TargetedByScrollView(BScrollView* scrollView);

	/// The system draws an outline that follows the mouse until EndRectTracking(); it reports nothing.
	void BeginRectTracking(BRect startRect, uint32 style = B_TRACK_WHOLE_RECT);
	void EndRectTracking();
	/// \a location: view coordinates, outside the bounds too. With \a checkMessageQueue pending
	/// updates are drawn and the oldest waiting mouse message is taken from the queue.
	void GetMouse(BPoint* location, uint32* buttons, bool checkMessageQueue = true);
	/// Starts a drag from inside a mouse hook and returns at once. The message is copied.
	void DragMessage(BMessage* message, BRect dragRect, BHandler* replyTo = NULL);
	/// Takes over \a bitmap; \a offset is the pointer's place in it.
	void DragMessage(BMessage* message, BBitmap* bitmap, BPoint offset, BHandler* replyTo = NULL);
	void DragMessage(BMessage* message, BBitmap* bitmap, drawing_mode dragMode, BPoint offset,
		BHandler* replyTo = NULL);

	BRect Bounds() const;
	BRect Frame() const;
	BPoint LeftTop() const;
	void ConvertToScreen(BPoint* point) const;
	BPoint ConvertToScreen(BPoint point) const;
	void ConvertFromScreen(BPoint* point) const;
	BPoint ConvertFromScreen(BPoint point) const;
	void ConvertToScreen(BRect* rect) const;
	BRect ConvertToScreen(BRect rect) const;
	void ConvertFromScreen(BRect* rect) const;
	BRect ConvertFromScreen(BRect rect) const;
	void ConvertToParent(BPoint* point) const;
	BPoint ConvertToParent(BPoint point) const;
	void ConvertFromParent(BPoint* point) const;
	BPoint ConvertFromParent(BPoint point) const;
	void ConvertToParent(BRect* rect) const;
	BRect ConvertToParent(BRect rect) const;
	void ConvertFromParent(BRect* rect) const;
	BRect ConvertFromParent(BRect rect) const;

	/// The visible part; inside Draw() the part that is being updated.
	void GetClippingRegion(BRegion* region) const;
	/// Limits drawing to \a region; null lifts the limit. Belongs to the state of PushState().
	virtual void ConstrainClippingRegion(BRegion* region);
	void ClipToPicture(BPicture* picture, BPoint where = B_ORIGIN, bool sync = true);
	void ClipToInversePicture(BPicture* picture, BPoint where = B_ORIGIN, bool sync = true);

	virtual void SetDrawingMode(drawing_mode mode);
	drawing_mode DrawingMode() const;
	void SetBlendingMode(source_alpha srcAlpha, alpha_function alphaFunc);
	void GetBlendingMode(source_alpha* srcAlpha, alpha_function* alphaFunc) const;
	virtual void SetPenSize(float size);
	float PenSize() const;
	void SetViewCursor(const BCursor* cursor, bool sync = true);

	/// The background; does not repaint. B_TRANSPARENT_COLOR: the view paints all itself.
	virtual void SetViewColor(rgb_color color);
	void SetViewColor(uchar red, uchar green, uchar blue, uchar alpha = 255);
	rgb_color ViewColor() const;
	void SetViewUIColor(color_which which, float tint = B_NO_TINT);
	color_which ViewUIColor(float* tint = NULL) const;
	void SetViewBitmap(const BBitmap* bitmap, BRect srcRect, BRect dstRect,
		uint32 followFlags = B_FOLLOW_LEFT_TOP, uint32 options = B_TILE_BITMAP);
	void SetViewBitmap(const BBitmap* bitmap, uint32 followFlags = B_FOLLOW_LEFT_TOP,
		uint32 options = B_TILE_BITMAP);
	void ClearViewBitmap();
	virtual void SetHighColor(rgb_color color);
	void SetHighColor(uchar red, uchar green, uchar blue, uchar alpha = 255);
	rgb_color HighColor() const;
	void SetHighUIColor(color_which which, float tint = B_NO_TINT);
	color_which HighUIColor(float* tint = NULL) const;
	virtual void SetLowColor(rgb_color color);
	void SetLowColor(uchar red, uchar green, uchar blue, uchar alpha = 255);
	rgb_color LowColor() const;
	void SetLowUIColor(color_which which, float tint = B_NO_TINT);
	color_which LowUIColor(float* tint = NULL) const;
	void SetOrigin(BPoint where);
	void SetOrigin(float x, float y);
	BPoint Origin() const;
	/// Saves the graphics state; the new one starts as a copy with the origin at (0, 0) of the old.
	void PushState();
	void PopState();

	void MovePenTo(BPoint pt);
	void MovePenTo(float x, float y);
	void MovePenBy(float x, float y);
	BPoint PenLocation() const;
	void StrokeLine(BPoint toPoint, ::pattern pattern = B_SOLID_HIGH);
	void StrokeLine(BPoint start, BPoint end, ::pattern pattern = B_SOLID_HIGH);
	/// Lines in their own colours, drawn by EndLineArray(); lines beyond \a count are dropped.
	void BeginLineArray(int32 count);
	void AddLine(BPoint start, BPoint end, rgb_color color);
	void EndLineArray();
	void StrokePolygon(
		const BPolygon* polygon, bool closed = true, ::pattern pattern = B_SOLID_HIGH);
	void StrokePolygon(const BPoint* pointArray, int32 numPoints, bool closed = true,
		::pattern pattern = B_SOLID_HIGH);
	void StrokePolygon(const BPoint* pointArray, int32 numPoints, BRect bounds, bool closed = true,
		::pattern pattern = B_SOLID_HIGH);
	void FillPolygon(const BPolygon* polygon, ::pattern pattern = B_SOLID_HIGH);
	void FillPolygon(const BPoint* pointArray, int32 numPoints, ::pattern pattern = B_SOLID_HIGH);
	/// The points are moved and stretched from their own frame to \a bounds.
	void FillPolygon(
		const BPoint* pointArray, int32 numPoints, BRect bounds, ::pattern pattern = B_SOLID_HIGH);
	void StrokeTriangle(BPoint point1, BPoint point2, BPoint point3, BRect bounds,
		::pattern pattern = B_SOLID_HIGH);
	void StrokeTriangle(
		BPoint point1, BPoint point2, BPoint point3, ::pattern pattern = B_SOLID_HIGH);
	void FillTriangle(
		BPoint point1, BPoint point2, BPoint point3, ::pattern pattern = B_SOLID_HIGH);
	void FillTriangle(BPoint point1, BPoint point2, BPoint point3, BRect bounds,
		::pattern pattern = B_SOLID_HIGH);
	void StrokeRect(BRect rect, ::pattern pattern = B_SOLID_HIGH);
	void FillRect(BRect rect, ::pattern pattern = B_SOLID_HIGH);
	void FillRegion(BRegion* region, ::pattern pattern = B_SOLID_HIGH);
	void InvertRect(BRect rect);
	void StrokeRoundRect(
		BRect rect, float xRadius, float yRadius, ::pattern pattern = B_SOLID_HIGH);
	void FillRoundRect(BRect rect, float xRadius, float yRadius, ::pattern pattern = B_SOLID_HIGH);
	void StrokeEllipse(
		BPoint center, float xRadius, float yRadius, ::pattern pattern = B_SOLID_HIGH);
	void StrokeEllipse(BRect rect, ::pattern pattern = B_SOLID_HIGH);
	void FillEllipse(BPoint center, float xRadius, float yRadius, ::pattern pattern = B_SOLID_HIGH);
	void FillEllipse(BRect rect, ::pattern pattern = B_SOLID_HIGH);
	/// Angles in degrees, counter-clockwise from three o'clock.
	void StrokeArc(BPoint center, float xRadius, float yRadius, float startAngle, float arcAngle,
		::pattern pattern = B_SOLID_HIGH);
	void StrokeArc(BRect rect, float startAngle, float arcAngle, ::pattern pattern = B_SOLID_HIGH);
	void FillArc(BPoint center, float xRadius, float yRadius, float startAngle, float arcAngle,
		::pattern pattern = B_SOLID_HIGH);
	void FillArc(BRect rect, float startAngle, float arcAngle, ::pattern pattern = B_SOLID_HIGH);
	void StrokeBezier(BPoint* controlPoints, ::pattern pattern = B_SOLID_HIGH);
	void FillBezier(BPoint* controlPoints, ::pattern pattern = B_SOLID_HIGH);
	void StrokeShape(BShape* shape, ::pattern pattern = B_SOLID_HIGH);
	void FillShape(BShape* shape, ::pattern pattern = B_SOLID_HIGH);

	/// \a location is the baseline's left end; the pen ends after the text.
	void DrawString(const char* string, escapement_delta* delta = NULL);
	void DrawString(const char* string, BPoint location, escapement_delta* delta = NULL);
	void DrawString(const char* string, int32 length, escapement_delta* delta = NULL);
	void DrawString(
		const char* string, int32 length, BPoint location, escapement_delta* delta = 0L);
	void DrawString(const char* string, const BPoint* locations, int32 locationCount);
	void DrawString(const char* string, int32 length, const BPoint* locations, int32 locationCount);

	virtual void SetFont(const BFont* font, uint32 mask = B_FONT_ALL);
	void GetFont(BFont* font) const;
	void SetFontSize(float size);
	void GetFontHeight(font_height* height) const;
	void TruncateString(BString* in_out, uint32 mode, float width) const;
	float StringWidth(const char* string) const;
	float StringWidth(const char* string, int32 length) const;
	void GetStringWidths(
		char* stringArray[], int32 lengthArray[], int32 numStrings, float widthArray[]) const;

	/// Copies what is visible of \a src, stretching it when the sizes differ, and invalidates the
	/// rest of \a dst.
	void CopyBits(BRect src, BRect dst);
	void DrawBitmapAsync(const BBitmap* aBitmap, BRect bitmapRect, BRect viewRect, uint32 options);
	void DrawBitmapAsync(const BBitmap* aBitmap, BRect bitmapRect, BRect viewRect);
	void DrawBitmapAsync(const BBitmap* aBitmap, BRect viewRect);
	void DrawBitmapAsync(const BBitmap* aBitmap, BPoint where);
	void DrawBitmapAsync(const BBitmap* aBitmap);
	void DrawBitmap(const BBitmap* aBitmap, BRect bitmapRect, BRect viewRect, uint32 options);
	void DrawBitmap(const BBitmap* aBitmap, BRect bitmapRect, BRect viewRect);
	void DrawBitmap(const BBitmap* aBitmap, BRect viewRect);
	void DrawBitmap(const BBitmap* aBitmap, BPoint where);
	/// At the pen's place.
	void DrawBitmap(const BBitmap* aBitmap);
	void DrawTiledBitmap(const BBitmap* aBitmap, BRect viewRect, BPoint phase = B_ORIGIN);
	void BeginPicture(BPicture* a_picture);
	void AppendToPicture(BPicture* a_picture);
	BPicture* EndPicture();
	void DrawPicture(const BPicture* a_picture);
	void DrawPicture(const BPicture* a_picture, BPoint where);
	void DrawPicture(const char* filename, long offset, BPoint where);
	void DrawPictureAsync(const BPicture* a_picture);
	void DrawPictureAsync(const BPicture* a_picture, BPoint where);
	void DrawPictureAsync(const char* filename, long offset, BPoint where);

	/// Marks for redraw and returns; fractions are cut off.
	void Invalidate(BRect invalRect);
	void Invalidate(const BRegion* invalRegion);
	void Invalidate();
	/// What is drawn reaches the screen; Sync() returns when it did.
	void Flush() const;
	void Sync() const;

	/// B_POINTER_EVENTS and B_KEYBOARD_EVENTS wherever they go, until set to 0.
	status_t SetEventMask(uint32 mask, uint32 options = 0);
	uint32 EventMask();
	/// The same until the buttons are released; B_ERROR outside MouseDown().
	status_t SetMouseEventMask(uint32 mask, uint32 options = 0);

	virtual void SetFlags(uint32 flags);
	uint32 Flags() const;
	virtual void SetResizingMode(uint32 mode);
	uint32 ResizingMode() const;

	/// The frame changes at once; the hooks follow as messages.
	void MoveBy(float dh, float dv);
	void MoveTo(BPoint where);
	void MoveTo(float x, float y);
	void ResizeBy(float dh, float dv);
	void ResizeTo(float width, float height);
	void ResizeTo(BSize size);
	void ScrollBy(float dh, float dv);
	void ScrollTo(float x, float y);
	/// Makes \a where the left-top of the bounds, within the scroll bars' ranges.
	virtual void ScrollTo(BPoint where);
	virtual void MakeFocus(bool focus = true);
	bool IsFocus() const;
	/// Count: a view hidden twice needs two Show().
	virtual void Show();
	virtual void Hide();
	bool IsHidden() const;
	/// Up to \a looking_from, which still counts; with the view itself: its own state only.
	bool IsHidden(const BView* looking_from) const;

	/// Right-left sense; either pointer may be null.
	virtual void GetPreferredSize(float* _width, float* _height);
	virtual void ResizeToPreferred();
	BScrollBar* ScrollBar(orientation direction) const;

private:
	friend class BBitmap;
	friend class BScrollBar;
	friend class BWindow;
	friend class BPrivate::ViewDrawing;
	friend class BPrivate::WindowData;
	friend class BPrivate::WindowInput;
	friend class BPrivate::WindowPainter;

	BView(const BView&) = delete;
	BView& operator=(const BView&) = delete;

	// Tree
	void LinkChild(BView* child, BView* before);
	void UnlinkChild(BView* child);
	void SetOwner(BWindow* window);
	void ClearOwner();
	void CallAttachedHooks();
	void CallDetachedHooks();
	void CheckLock() const;

	// Geometry
	BPoint OffsetInWindow() const;
	void ParentResized(int32 dx, int32 dy);
	void SetFrame(BPoint leftTop, float width, float height);
	void PostFrameMessages(bool moved, bool resized);
	void InvalidateFrame(BRect frame);
	void SetScrollBar(orientation direction, BPrivate::ScrollBarLink* bar);

	// Drawing
	BPrivate::ViewDrawing& Drawing();
	const BPrivate::GraphicsState& State() const;
	BPrivate::Canvas* BeginDrawing() const;
	void EndDrawing(BRect rect) const;
	bool IsRecording() const;
	BPrivate::Canvas* BeginRecording() const;
	void ClipTo(BPicture* picture, BPoint where, bool inverse);
	void EndStroking(BRect rect) const;
	BRect TextFrame(BPoint start, BPoint end) const;
	void SetPenLocation(BPoint where);

	BView* fParent;
	BView* fPreviousSibling;
	BView* fNextSibling;
	BView* fFirstChild;
	BView* fLastChild;
	BWindow* fOwner;
	BPrivate::ScrollBarLink* fHorizontalBar;
	BPrivate::ScrollBarLink* fVerticalBar;
	// Made when something differs from a new view's state: most views of a large tree never draw.
	std::unique_ptr<BPrivate::ViewDrawing> fDrawing;
	BPoint fLeftTop;
	BRect fBounds;
	uint32 fFlags;
	rgb_color fViewColor;
	float fViewTint;
	uint8 fViewUIColor;
	uint8 fEventMask;
	uint8 fEventOptions;
	uint8 fMouseEventMask;
	uint8 fMouseEventOptions;
	bool fTopLevel;
	bool fAttached;
	int16 fShowLevel;
};

#endif // _VIEW_H
