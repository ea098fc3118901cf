// SPDX-License-Identifier: MIT
// BColorControl: its value and its input. ColorControlDrawing.cpp has its layout and its look.
#include <ColorControl.h>

#include <algorithm>
#include <cstdlib>

#include <Message.h>
#include <TextControl.h>
#include <TextView.h>
#include <Window.h>

#include "interface/ArchivedEnum.h"

using BPrivate::EnumAmong;

namespace {

constexpr uint32 kMsgNumberEntered = 'cNum';
constexpr float kLeastCellSize = 6;
constexpr int32 kGreyRamp = 0;
constexpr int32 kRampCount = 4;
constexpr int32 kPageStep = 16;

int32
ClampLevel(int64 level)
{
	return static_cast<int32>(std::clamp<int64>(level, 0, 255));
}


int32
ValueOfColor(int32 red, int32 green, int32 blue)
{
	const uint32 value = static_cast<uint32>(red) << 24 | static_cast<uint32>(green) << 16
		| static_cast<uint32>(blue) << 8;
	return static_cast<int32>(value);
}

} // namespace

BColorControl::BColorControl(BPoint start, color_control_layout layout, float cellSize,
	const char* name, BMessage* message, bool useOffscreen)
	: BControl(BRect(start, start), name, NULL, message, B_FOLLOW_LEFT_TOP,
		B_WILL_DRAW | B_NAVIGABLE | B_FULL_UPDATE_ON_RESIZE),
	  fLayout(layout),
	  fCellSize(std::max(cellSize, kLeastCellSize)),
	  fUseOffscreen(useOffscreen),
	  fCurrentRamp(kGreyRamp),
	  fTrackedRamp(-1)
{
	Build();
}


BColorControl::BColorControl(BMessage* archive)
	: BControl(archive),
	  fLayout(EnumAmong(archive->GetInt32("_layout", B_CELLS_32x8),
		  {B_CELLS_4x64, B_CELLS_8x32, B_CELLS_16x16, B_CELLS_32x8, B_CELLS_64x4}, B_CELLS_32x8)),
	  fCellSize(std::max(archive->GetFloat("_csize", kLeastCellSize), kLeastCellSize)),
	  fUseOffscreen(archive->GetBool("_use_off", false)),
	  fCurrentRamp(kGreyRamp),
	  fTrackedRamp(-1)
{
	Build();
	if (!IsEnabled()) {
		for (BTextControl* number : fNumbers)
			number->SetEnabled(false);
	}
}


BColorControl::~BColorControl() {}


BArchivable*
BColorControl::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BColorControl") ? new BColorControl(archive) : NULL;
}


status_t
BColorControl::Archive(BMessage* archive, bool) const
{
	// The number fields are made anew and are no part of the archive.
	status_t status = BControl::Archive(archive, false);
	if (status == B_OK)
		status = archive->AddInt32("_layout", fLayout);
	if (status == B_OK)
		status = archive->AddFloat("_csize", fCellSize);
	if (status == B_OK)
		status = archive->AddBool("_use_off", fUseOffscreen);
	return status;
}


void
BColorControl::SetValue(int32 color_value)
{
	// The lowest byte means nothing: two values of one colour are the same.
	BControl::SetValue(static_cast<int32>(static_cast<uint32>(color_value) & 0xffffff00));
	ShowNumbers();
}


void
BColorControl::SetValue(rgb_color color)
{
	SetValue(ValueOfColor(color.red, color.green, color.blue));
}


rgb_color
BColorControl::ValueAsColor()
{
	const uint32 value = static_cast<uint32>(Value());
	return make_color(static_cast<uint8>(value >> 24), static_cast<uint8>(value >> 16),
		static_cast<uint8>(value >> 8));
}


void
BColorControl::SetEnabled(bool enabled)
{
	BControl::SetEnabled(enabled);
	for (BTextControl* number : fNumbers)
		number->SetEnabled(enabled);
}


void
BColorControl::SetCellSize(float size)
{
	fCellSize = std::max(size, kLeastCellSize);
	LayOut();
}


float
BColorControl::CellSize() const
{
	return fCellSize;
}


void
BColorControl::SetLayout(color_control_layout layout)
{
	fLayout = layout;
	LayOut();
}


color_control_layout
BColorControl::Layout() const
{
	return fLayout;
}


void
BColorControl::AttachedToWindow()
{
	BControl::AttachedToWindow();
	for (BTextControl* number : fNumbers)
		number->SetTarget(this);
}


void
BColorControl::MessageReceived(BMessage* message)
{
	if (message->what == kMsgNumberEntered)
		NumberEntered();
	else
		BControl::MessageReceived(message);
}


void
BColorControl::MouseDown(BPoint where)
{
	const int32 ramp = RampAt(where);
	if (!IsEnabled() || ramp < 0)
		return;
	SetMouseEventMask(B_POINTER_EVENTS, B_NO_POINTER_HISTORY | B_SUSPEND_VIEW_FOCUS);
	SetTracking(true);
	fTrackedRamp = ramp;
	fCurrentRamp = ramp;
	ChangeValue(ValueWith(ramp, LevelAt(ramp, where)));
}


void
BColorControl::MouseMoved(BPoint where, uint32, const BMessage*)
{
	if (IsTracking() && IsEnabled())
		ChangeValue(ValueWith(fTrackedRamp, LevelAt(fTrackedRamp, where)));
}


void
BColorControl::MouseUp(BPoint where)
{
	if (!IsTracking())
		return;
	SetTracking(false);
	if (IsEnabled())
		ChangeValue(ValueWith(fTrackedRamp, LevelAt(fTrackedRamp, where)));
}


void
BColorControl::KeyDown(const char* bytes, int32 numBytes)
{
	const char key = numBytes == 1 ? bytes[0] : 0;
	// Along the ramps the level changes, across them the ramp.
	const char less = IsUpright() ? B_DOWN_ARROW : B_LEFT_ARROW;
	const char more = IsUpright() ? B_UP_ARROW : B_RIGHT_ARROW;
	const char previous = IsUpright() ? B_LEFT_ARROW : B_UP_ARROW;
	const char next = IsUpright() ? B_RIGHT_ARROW : B_DOWN_ARROW;

	int32 level = LevelOf(fCurrentRamp);
	if (key == less)
		level--;
	else if (key == more)
		level++;
	else if (key == B_PAGE_DOWN)
		level -= kPageStep;
	else if (key == B_PAGE_UP)
		level += kPageStep;
	else if (key == B_HOME)
		level = 0;
	else if (key == B_END)
		level = 255;
	else if (key == previous || key == next) {
		const int32 step = key == next ? 1 : -1;
		fCurrentRamp = std::clamp<int32>(fCurrentRamp + step, 0, kRampCount - 1);
		Invalidate();
		return;
	} else {
		// Space and Enter have nothing to click here.
		BView::KeyDown(bytes, numBytes); // NOLINT(bugprone-parent-virtual-call): as said above
		return;
	}
	if (IsEnabled())
		ChangeValue(ValueWith(fCurrentRamp, ClampLevel(level)));
}


status_t
BColorControl::Invoke(BMessage* message)
{
	return BControl::Invoke(message);
}


void
BColorControl::Build()
{
	const char* const kNames[] = {"_red", "_green", "_blue"};
	const char* const kLabels[] = {"Red:", "Green:", "Blue:"};
	for (int i = 0; i < 3; i++) {
		fNumbers[i] = new BTextControl(
			BRect(0, 0, 80, 20), kNames[i], kLabels[i], "0", new BMessage(kMsgNumberEntered));
		BTextView* text = fNumbers[i]->TextView();
		text->SetMaxBytes(3);
		for (uint32 character = 0; character < 256; character++) {
			if (character < '0' || character > '9')
				text->DisallowChar(character);
		}
		text->AllowChar(B_BACKSPACE);
		AddChild(fNumbers[i]);
	}
	LayOut();
	ShowNumbers();
}


/// The number fields tell the value.
void
BColorControl::ShowNumbers()
{
	const rgb_color color = ValueAsColor();
	const int32 levels[] = {color.red, color.green, color.blue};
	for (int i = 0; i < 3; i++) {
		BString text;
		text << levels[i];
		if (text != fNumbers[i]->Text())
			fNumbers[i]->SetText(text.String());
	}
}


/// The user's change.
void
BColorControl::ChangeValue(int32 value)
{
	if (value == Value())
		return;
	SetValue(value);
	Invoke();
}


void
BColorControl::NumberEntered()
{
	int32 levels[3];
	for (int i = 0; i < 3; i++)
		levels[i] = ClampLevel(std::strtol(fNumbers[i]->Text(), NULL, 10));
	const int32 value = ValueOfColor(levels[0], levels[1], levels[2]);
	// "007" and "300" are shown as what they count for.
	if (value == Value())
		ShowNumbers();
	ChangeValue(value);
}


/// 0 to 255. The grey of a colour is the mean of its parts.
int32
BColorControl::LevelOf(int32 ramp) const
{
	const uint32 value = static_cast<uint32>(Value());
	const int32 levels[] = {static_cast<int32>(value >> 24), static_cast<int32>(value >> 16 & 0xff),
		static_cast<int32>(value >> 8 & 0xff)};
	if (ramp == kGreyRamp)
		return (levels[0] + levels[1] + levels[2] + 1) / 3;
	return levels[ramp - 1];
}


/// The value after the ramp's level was chosen.
int32
BColorControl::ValueWith(int32 ramp, int32 level) const
{
	if (ramp == kGreyRamp)
		return ValueOfColor(level, level, level);
	int32 levels[] = {LevelOf(1), LevelOf(2), LevelOf(3)};
	levels[ramp - 1] = level;
	return ValueOfColor(levels[0], levels[1], levels[2]);
}
