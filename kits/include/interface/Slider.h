// SPDX-License-Identifier: MIT
// A number in a range, chosen by moving a thumb along a bar.
#ifndef _SLIDER_H
#define _SLIDER_H

#include <memory>

#include <Control.h>

enum hash_mark_location {
	B_HASH_MARKS_NONE = 0,
	B_HASH_MARKS_TOP = 1,
	B_HASH_MARKS_LEFT = 1,
	B_HASH_MARKS_BOTTOM = 2,
	B_HASH_MARKS_RIGHT = 2,
	B_HASH_MARKS_BOTH = 3,
};

enum thumb_style {
	B_BLOCK_THUMB = 0,
	B_TRIANGLE_THUMB = 1,
};

/// A slider: values from a lower to an upper limit, in a horizontal bar from left to right or in a
/// vertical one from bottom to top.
///
/// While the thumb is dragged each change sends the modification message; the release sends the
/// message when the value is another one than before. Arrow keys change the value by the key
/// increment, Home and End go to the limits. Draw() calls DrawSlider(), which calls the other drawing hooks.
class BSlider : public BControl {
public:
	BSlider(BRect frame, const char* name, const char* label, BMessage* message, int32 minValue,
		int32 maxValue, thumb_style thumbType = B_BLOCK_THUMB,
		uint32 resizingMode = B_FOLLOW_LEFT_TOP,
		uint32 flags = B_NAVIGABLE | B_WILL_DRAW | B_FRAME_EVENTS);
	BSlider(BRect frame, const char* name, const char* label, BMessage* message, int32 minValue,
		int32 maxValue, orientation posture, thumb_style thumbType = B_BLOCK_THUMB,
		uint32 resizingMode = B_FOLLOW_LEFT_TOP,
		uint32 flags = B_NAVIGABLE | B_WILL_DRAW | B_FRAME_EVENTS);
	BSlider(const char* name, const char* label, BMessage* message, int32 minValue, int32 maxValue,
		orientation posture, thumb_style thumbType = B_BLOCK_THUMB,
		uint32 flags = B_NAVIGABLE | B_WILL_DRAW | B_FRAME_EVENTS);
	BSlider(BMessage* archive);
	virtual ~BSlider();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void DetachedFromWindow() override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void KeyUp(const char* bytes, int32 numBytes) override;
	void MouseDown(BPoint where) override;
	void MouseUp(BPoint where) override;
	void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage) override;
	void MakeFocus(bool focus = true) override;
	void GetPreferredSize(float* _width, float* _height) override;
	void ResizeToPreferred() override;
	void SetFont(const BFont* font, uint32 mask = B_FONT_ALL) override;
	status_t Invoke(BMessage* message = NULL) override;

	void SetLabel(const char* label) override;
	/// Shown at the ends of the bar. Copied; null for none.
	virtual void SetLimitLabels(const char* minLabel, const char* maxLabel);
	const char* MinLimitLabel() const;
	const char* MaxLimitLabel() const;

	/// Brought into the limits.
	void SetValue(int32 value) override;
	/// The value that the thumb would have with its middle at \a point (view coordinates), in the limits.
	virtual int32 ValueForPoint(BPoint point) const;
	/// From 0, the lower limit, to 1.
	virtual void SetPosition(float position);
	float Position() const;
	/// Ignored when \a minimum is greater than \a maximum. The value is brought into the limits.
	virtual void SetLimits(int32 minimum, int32 maximum);
	void GetLimits(int32* minimum, int32* maximum) const;
	void SetEnabled(bool enable) override;

	void Draw(BRect updateRect) override;
	virtual void DrawSlider();
	virtual void DrawBar();
	virtual void DrawHashMarks();
	virtual void DrawThumb();
	/// Called when the slider has the focus of the active window.
	virtual void DrawFocusMark();
	virtual void DrawText();

	/// A text that tells the value, shown opposite of the label; null, as here, for none. It must stay
	/// valid until the next call. Call UpdateTextChanged() when it changes other than with the value.
	virtual const char* UpdateText() const;
	void UpdateTextChanged();
	/// The widest text that UpdateText() will give, in pixels.
	virtual float MaxUpdateTextWidth();

	/// View coordinates.
	virtual BRect BarFrame() const;
	virtual BRect HashMarksFrame() const;
	virtual BRect ThumbFrame() const;

	/// Takes over the message.
	virtual void SetModificationMessage(BMessage* message);
	BMessage* ModificationMessage() const;
	/// Microseconds, at most a second. The thumb follows the pointer's messages and needs no such
	/// pauses: it is kept for those who ask.
	virtual void SetSnoozeAmount(int32 microSeconds);
	int32 SnoozeAmount() const;
	virtual void SetKeyIncrementValue(int32 value);
	int32 KeyIncrementValue() const;

	/// Marks at equal distances, the first and the last at the limits; one alone is at the lower limit.
	virtual void SetHashMarkCount(int32 count);
	int32 HashMarkCount() const;
	virtual void SetHashMarks(hash_mark_location where);
	hash_mark_location HashMarks() const;
	virtual void SetStyle(thumb_style style);
	thumb_style Style() const;
	virtual void SetBarColor(rgb_color color);
	rgb_color BarColor() const;
	/// The part of the bar below the value gets a colour of its own; null keeps the one it has.
	virtual void UseFillColor(bool useFill, const rgb_color* color = NULL);
	/// Whether it is used; \a color may be null.
	bool FillColor(rgb_color* color) const;
	orientation Orientation() const;
	virtual void SetOrientation(orientation posture);
	/// Pixels, at least 1.
	float BarThickness() const;
	virtual void SetBarThickness(float thickness);

private:
	class Thumb;

	void ChangeValue(int32 value);
	void Redraw();

	bool IsHorizontal() const;
	bool HasTitleLine() const;
	bool HasLimitLine() const;
	int32 TopLines() const;
	int32 BottomLines() const;
	BPoint ThumbPoint() const;
	void DrawTextIn(float top, alignment align, const char* text);

	BMessage* fModificationMessage;
	int32 fSnoozeAmount;
	int32 fKeyIncrement;
	int32 fMinimum;
	int32 fMaximum;
	int32 fHashMarkCount;
	hash_mark_location fHashMarks;
	thumb_style fStyle;
	orientation fOrientation;
	float fBarThickness;
	BString fMinLimitLabel;
	BString fMaxLimitLabel;
	rgb_color fBarColor;
	rgb_color fFillColor;
	bool fUsesBarColor;
	bool fUsesFillColor;
	bool fHasFillColor;
	std::unique_ptr<Thumb> fThumb;
};

#endif // _SLIDER_H
