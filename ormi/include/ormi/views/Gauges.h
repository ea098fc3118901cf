// SPDX-License-Identifier: MIT
// Views of a value, each of whose settings can be set alone.

#pragma once

#include <algorithm>

#include <ColorControl.h>
#include <Slider.h>
#include <StatusBar.h>

#include <ormi/views/FrameKeeper.h>

namespace Ormi {

/// A BSlider.
class RangeSlider : public BSlider {
public:
	RangeSlider(BRect frame, const char* name, const char* label)
		: BSlider(frame, name, label, nullptr, 0, 100, B_BLOCK_THUMB, B_FOLLOW_NONE)
	{
	}

	/// The other limit gives way.
	void SetMinimum(int32 minimum)
	{
		int32 before, maximum;
		GetLimits(&before, &maximum);
		SetLimits(minimum, std::max(minimum, maximum));
	}

	void SetMaximum(int32 maximum)
	{
		int32 minimum, before;
		GetLimits(&minimum, &before);
		SetLimits(std::min(minimum, maximum), maximum);
	}

	/// Shown when both ends have one.
	void SetMinimumLabel(const char* label)
	{
		const BString maximum(MaxLimitLabel());
		SetLimitLabels(label, maximum.String());
	}

	void SetMaximumLabel(const char* label)
	{
		const BString minimum(MinLimitLabel());
		SetLimitLabels(minimum.String(), label);
	}

	/// Whether the bar has the fill colour up to the value.
	void SetFilled(bool filled) { UseFillColor(filled); }

	void SetFillColor(rgb_color color) { UseFillColor(FillColor(nullptr), &color); }
};

/// A BStatusBar in a frame of its own: what does not fit is cut off.
class ProgressBar : public BStatusBar {
public:
	ProgressBar(BRect frame, const char* name)
		: BStatusBar(frame, name)
	{
	}

	void SetLabel(const char* label)
	{
		const BString trailing(TrailingLabel());
		SetLabels(label, trailing.String());
	}

	void SetTrailingLabel(const char* trailing)
	{
		const BString label(Label());
		SetLabels(label.String(), trailing);
	}

	void SetBarHeight(float height) override
	{
		FrameKeeper keeper(this);
		BStatusBar::SetBarHeight(height);
	}

	void SetText(const char* text) override
	{
		FrameKeeper keeper(this);
		BStatusBar::SetText(text);
	}

	void SetTrailingText(const char* text) override
	{
		FrameKeeper keeper(this);
		BStatusBar::SetTrailingText(text);
	}

	void Update(
		float delta, const char* text = nullptr, const char* trailingText = nullptr) override
	{
		FrameKeeper keeper(this);
		BStatusBar::Update(delta, text, trailingText);
	}

	void Reset(const char* label = nullptr, const char* trailingLabel = nullptr) override
	{
		FrameKeeper keeper(this);
		BStatusBar::Reset(label, trailingLabel);
	}

	void SetTo(float value, const char* text = nullptr, const char* trailingText = nullptr) override
	{
		FrameKeeper keeper(this);
		BStatusBar::SetTo(value, text, trailingText);
	}

	/// From 0 to the greatest value; the texts stay.
	void SetValue(float value)
	{
		const BString text(Text());
		const BString trailing(TrailingText());
		SetTo(value, text.String(), trailing.String());
	}

private:
	void SetLabels(const char* label, const char* trailing)
	{
		const float value = CurrentValue();
		const float greatest = MaxValue();
		const BString text(Text());
		const BString trailingText(TrailingText());
		Reset(label, trailing);
		SetMaxValue(greatest);
		SetTo(value, text.String(), trailingText.String());
	}
};

/// A BColorControl in a frame of its own: what does not fit is cut off.
class ColorPanel : public BColorControl {
public:
	ColorPanel(BRect frame, const char* name)
		: BColorControl(frame.LeftTop(), B_CELLS_32x8, 8, name)
	{
		ResizeTo(frame.Width(), frame.Height());
	}

	void SetCellSize(float size) override
	{
		FrameKeeper keeper(this);
		BColorControl::SetCellSize(size);
	}

	void SetLayout(color_control_layout layout) override
	{
		FrameKeeper keeper(this);
		BColorControl::SetLayout(layout);
	}

	void SetColor(rgb_color color) { SetValue(color); }
};

} // namespace Ormi
