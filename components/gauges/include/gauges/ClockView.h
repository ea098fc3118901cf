// SPDX-License-Identifier: MIT
// A clock with hands.

#pragma once

#include <time.h>

#include <algorithm>
#include <cmath>
#include <cstdio>

#include <View.h>

namespace Gauges {

/// A time of the day.
struct day_time {
	int32 hour;
	int32 minute;
	int32 second;

	bool operator==(const day_time& other) const
	{
		return hour == other.hour && minute == other.minute && second == other.second;
	}
};

/// Reads "HH:MM" or "HH:MM:SS"; false, \a time not written, for anything else.
inline bool
ReadTime(const char* text, day_time* time)
{
	int hour = 0;
	int minute = 0;
	int second = 0;
	int length = 0;
	if (text == nullptr || sscanf(text, "%2d:%2d%n", &hour, &minute, &length) != 2)
		return false;
	if (text[length] == ':') {
		const char* rest = text + length;
		if (sscanf(rest, ":%2d%n", &second, &length) != 1 || rest[length] != '\0')
			return false;
	} else if (text[length] != '\0')
		return false;
	if (hour < 0 || hour > 23 || minute < 0 || minute > 59 || second < 0 || second > 59)
		return false;
	*time = {hour, minute, second};
	return true;
}


/// Shows a time of the day: one that was set, or the present one while it is running.
///
/// It runs by the pulses of its window. Lock the window, if it is in one.
class ClockView : public BView {
public:
	/// \a time: shown at first, "HH:MM:SS"; twelve o'clock when it is none.
	ClockView(BRect frame, const char* name, const char* time)
		: BView(frame, name, B_FOLLOW_NONE, B_WILL_DRAW | B_PULSE_NEEDED | B_FULL_UPDATE_ON_RESIZE),
		  fTime({0, 0, 0}),
		  fIsRunning(false),
		  fHasSeconds(true),
		  fHandColor(make_color(40, 40, 40))
	{
		ReadTime(time, &fTime);
	}

	const day_time& Time() const { return fTime; }

	void SetTime(const char* text)
	{
		if (ReadTime(text, &fTime))
			Invalidate();
	}

	bool IsRunning() const { return fIsRunning; }
	void SetRunning(bool running) { fIsRunning = running; }

	void SetSeconds(bool shown)
	{
		fHasSeconds = shown;
		Invalidate();
	}

	void SetHandColor(rgb_color color)
	{
		fHandColor = color;
		Invalidate();
	}

	void Pulse() override
	{
		BView::Pulse();
		if (!fIsRunning)
			return;
		const time_t now = time(nullptr);
		struct tm local;
		localtime_r(&now, &local);
		const day_time present = {local.tm_hour, local.tm_min, local.tm_sec};
		if (present == fTime)
			return;
		fTime = present;
		Invalidate();
		TimeChanged();
	}

	void Draw(BRect) override
	{
		const BRect bounds = Bounds();
		const BPoint center((bounds.left + bounds.right) / 2, (bounds.top + bounds.bottom) / 2);
		const float radius = std::min(bounds.Width(), bounds.Height()) / 2 - 2;
		if (radius < kLeastRadius)
			return;
		const rgb_color ink = HighColor();
		StrokeEllipse(center, radius, radius);
		for (int32 hour = 0; hour < 12; hour++)
			DrawRay(
				center, radius * (hour % 3 == 0 ? 0.8f : 0.9f), radius * 0.96f, hour / 12.0f, 1);

		SetHighColor(fHandColor);
		const float minutes = fTime.minute + fTime.second / 60.0f;
		DrawRay(center, 0, radius * 0.5f, (fTime.hour % 12 + minutes / 60) / 12, 3);
		DrawRay(center, 0, radius * 0.78f, minutes / 60, 2);
		if (fHasSeconds)
			DrawRay(center, 0, radius * 0.88f, fTime.second / 60.0f, 1);
		FillEllipse(center, 2, 2);
		SetHighColor(ink);
		SetPenSize(1);
	}

protected:
	/// Called when another second is shown while the clock is running. Nothing here.
	virtual void TimeChanged() {}

private:
	static constexpr float kLeastRadius = 8;

	/// A line from one distance to another, \a turn of the way around from the top.
	void DrawRay(BPoint center, float from, float to, float turn, float width)
	{
		const float angle = turn * 2 * float(M_PI);
		const BPoint direction(sinf(angle), -cosf(angle));
		SetPenSize(width);
		StrokeLine(BPoint(center.x + from * direction.x, center.y + from * direction.y),
			BPoint(center.x + to * direction.x, center.y + to * direction.y));
		SetPenSize(1);
	}

	day_time fTime;
	bool fIsRunning;
	bool fHasSeconds;
	rgb_color fHandColor;
};

} // namespace Gauges
