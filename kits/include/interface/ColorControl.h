// SPDX-License-Identifier: MIT
// A choice of any colour.
#ifndef _COLOR_CONTROL_H
#define _COLOR_CONTROL_H

#include <Control.h>

class BTextControl;

/// The columns and rows of cells that the control's palette is as wide and high as.
enum color_control_layout {
	B_CELLS_4x64 = 4,
	B_CELLS_8x32 = 8,
	B_CELLS_16x16 = 16,
	B_CELLS_32x8 = 32,
	B_CELLS_64x4 = 64,
};

/// Four ramps (grey, red, green, blue) and three number fields that choose a colour.
///
/// The value is red << 24 | green << 16 | blue << 8. Clicks and drags on the ramps, keys and edited
/// numbers send the message each time they change it. Below the ramps is the chosen colour. The size follows from the layout, the cell size
/// and the font: read Frame().
class BColorControl : public BControl {
public:
	/// \a start: the frame's left-top, in the parent's coordinates. \a cellSize: pixels, at least 6.
	/// \a useOffscreen is taken for what it asks: drawing without flicker, which is always so.
	BColorControl(BPoint start, color_control_layout layout, float cellSize, const char* name,
		BMessage* message = NULL, bool useOffscreen = false);
	BColorControl(BMessage* archive);
	virtual ~BColorControl();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	/// Sends nothing, as SetValue() of any control.
	void SetValue(int32 color_value) override;
	/// Drops the alpha.
	void SetValue(rgb_color color);
	/// Opaque.
	rgb_color ValueAsColor();

	void SetEnabled(bool enabled) override;
	/// The control changes its size; its left-top stays.
	virtual void SetCellSize(float size);
	float CellSize() const;
	virtual void SetLayout(color_control_layout layout);
	color_control_layout Layout() const;

	void AttachedToWindow() override;
	void MessageReceived(BMessage* message) override;
	void Draw(BRect updateRect) override;
	void MouseDown(BPoint where) override;
	void MouseUp(BPoint where) override;
	void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage) override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void SetFont(const BFont* font, uint32 mask = B_FONT_ALL) override;
	void GetPreferredSize(float* _width, float* _height) override;
	void ResizeToPreferred() override;
	status_t Invoke(BMessage* message = NULL) override;

private:
	void Build();
	void LayOut();
	void ShowNumbers();
	void ChangeValue(int32 value);
	void NumberEntered();

	bool IsUpright() const;
	float PaletteWidth() const;
	float PaletteHeight() const;
	BRect RampFrame(int32 ramp) const;
	int32 RampAt(BPoint where) const;
	int32 LevelAt(int32 ramp, BPoint where) const;
	int32 LevelOf(int32 ramp) const;
	int32 ValueWith(int32 ramp, int32 level) const;

	void DrawRamp(int32 ramp);
	void DrawMarker(int32 ramp);

	color_control_layout fLayout;
	float fCellSize;
	bool fUseOffscreen;
	BTextControl* fNumbers[3] = {};
	BRect fSampleFrame;
	int32 fCurrentRamp;
	int32 fTrackedRamp;
};

#endif // _COLOR_CONTROL_H
