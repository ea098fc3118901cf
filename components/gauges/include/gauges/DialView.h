// SPDX-License-Identifier: MIT
// A dial with a needle.

#pragma once

#include <algorithm>
#include <cmath>
#include <vector>

#include <String.h>
#include <View.h>

namespace Gauges {

/// A part of a scale, in a colour of its own.
struct zone {
	int32 from;
	int32 to;
	rgb_color color;
};

/// A round scale from one number to another, and a needle that shows a value on it.
///
/// Lock the window, if it is in one.
class DialView : public BView {
public:
	DialView(BRect frame, const char* name, int32 minimum, int32 maximum)
		: BView(frame, name, B_FOLLOW_NONE, B_WILL_DRAW | B_FULL_UPDATE_ON_RESIZE),
		  fMinimum(minimum),
		  fMaximum(maximum),
		  fValue(0),
		  fTicks(10),
		  fNeedleColor(make_color(200, 40, 40))
	{
	}

	int32 Minimum() const { return fMinimum; }
	int32 Maximum() const { return fMaximum; }

	void SetRange(int32 minimum, int32 maximum)
	{
		fMinimum = minimum;
		fMaximum = maximum;
		Invalidate();
	}

	/// As it was set: the needle shows the nearest value that is on the scale.
	int32 Value() const { return fValue; }

	void SetValue(int32 value)
	{
		if (value == fValue)
			return;
		fValue = value;
		Invalidate();
		ValueChanged();
	}

	/// What is written after the value.
	const char* Unit() const { return fUnit.String(); }

	void SetUnit(const char* unit)
	{
		fUnit = unit;
		Invalidate();
	}

	/// How many parts the marks divide the scale into; none for 0.
	void SetTicks(int32 count)
	{
		fTicks = count;
		Invalidate();
	}

	void SetNeedleColor(rgb_color color)
	{
		fNeedleColor = color;
		Invalidate();
	}

	void AddZone(int32 from, int32 to, rgb_color color)
	{
		fZones.push_back({from, to, color});
		Invalidate();
	}

	void RemoveZones()
	{
		fZones.clear();
		Invalidate();
	}

	void Draw(BRect) override
	{
		const BRect bounds = Bounds();
		const BPoint center((bounds.left + bounds.right) / 2, (bounds.top + bounds.bottom) / 2);
		const float radius = std::min(bounds.Width(), bounds.Height()) / 2 - 2;
		if (radius < kLeastRadius)
			return;
		const rgb_color ink = HighColor();
		DrawScale(center, radius);
		DrawText(BPoint(center.x, center.y + radius * 0.75f));
		DrawNeedle(center, radius);
		SetHighColor(ink);
		SetPenSize(1);
	}

protected:
	/// Called after each change of the value. Nothing here.
	virtual void ValueChanged() {}

private:
	static constexpr float kLeastRadius = 8;
	static constexpr float kMostTicks = 200;
	// From lower left to lower right, over the top; degrees against the clock, 0 at the right.
	static constexpr float kFirstAngle = 225;
	static constexpr float kSweep = 270;

	float AngleOf(int32 value) const
	{
		const float length = float(fMaximum) - float(fMinimum);
		const float part = length > 0 ? (float(value) - float(fMinimum)) / length : 0;
		return kFirstAngle - kSweep * std::clamp(part, 0.0f, 1.0f);
	}

	static BPoint At(BPoint center, float radius, float angle)
	{
		const float radians = angle * float(M_PI) / 180;
		return BPoint(center.x + radius * cosf(radians), center.y - radius * sinf(radians));
	}

	void DrawScale(BPoint center, float radius)
	{
		SetPenSize(1);
		StrokeEllipse(center, radius, radius);
		const float width = std::max(2.0f, radius / 8);
		const float middle = radius - width;
		SetPenSize(width);
		for (const zone& part : fZones) {
			const float start = AngleOf(part.to);
			const rgb_color ink = HighColor();
			SetHighColor(part.color);
			StrokeArc(center, middle, middle, start, AngleOf(part.from) - start);
			SetHighColor(ink);
		}
		SetPenSize(1);
		const float ticks = std::min<float>(fTicks, kMostTicks);
		for (int32 i = 0; ticks > 0 && i <= ticks; i++) {
			const float angle = kFirstAngle - kSweep * i / ticks;
			StrokeLine(
				At(center, radius - 2 * width, angle), At(center, radius - width / 2, angle));
		}
	}

	void DrawText(BPoint middle)
	{
		BString text;
		text << fValue;
		if (!fUnit.IsEmpty())
			text << " " << fUnit;
		// Whole pixels: the text looks the same wherever the view lies.
		const float left = floorf(middle.x - StringWidth(text.String()) / 2);
		DrawString(text.String(), BPoint(left, floorf(middle.y)));
	}

	void DrawNeedle(BPoint center, float radius)
	{
		const float angle = AngleOf(fValue);
		const float hub = std::max(2.0f, radius / 12);
		SetHighColor(fNeedleColor);
		FillTriangle(At(center, radius * 0.8f, angle), At(center, hub, angle + 90),
			At(center, hub, angle - 90));
		FillEllipse(center, hub, hub);
	}

	int32 fMinimum;
	int32 fMaximum;
	int32 fValue;
	int32 fTicks;
	rgb_color fNeedleColor;
	BString fUnit;
	std::vector<zone> fZones;
};

} // namespace Gauges
