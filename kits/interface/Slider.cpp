// SPDX-License-Identifier: MIT
// BSlider: its state and its input. SliderDrawing.cpp has its layout and its look.
#include <Slider.h>

#include <algorithm>
#include <cmath>

#include <Message.h>
#include <Window.h>

#include "ThumbTracking.h"
#include "interface/ArchivedEnum.h"

using BPrivate::EnumBetween;

namespace {

constexpr float kDefaultBarThickness = 6;
constexpr int32 kDefaultSnooze = 20000;

} // namespace

/// Changes the slider's value, and has it sent.
class BSlider::Thumb : public BPrivate::ThumbTracking {
public:
	explicit Thumb(BSlider* slider)
		: ThumbTracking(slider),
		  fSlider(slider),
		  fValueBefore(0)
	{
	}

protected:
	void ChangeBegins() override { fValueBefore = fSlider->Value(); }

	void MoveThumb(BPoint middle) override
	{
		const int32 value = fSlider->ValueForPoint(middle);
		if (value != fSlider->Value())
			fSlider->ChangeValue(value);
	}

	void ChangeEnds() override
	{
		if (fSlider->Value() != fValueBefore)
			fSlider->Invoke();
	}

private:
	BSlider* fSlider;
	int32 fValueBefore;
};


BSlider::BSlider(BRect frame, const char* name, const char* label, BMessage* message,
	int32 minValue, int32 maxValue, orientation posture, thumb_style thumbType, uint32 resizingMode,
	uint32 flags)
	: BControl(frame, name, label, message, resizingMode, flags | B_FULL_UPDATE_ON_RESIZE),
	  fModificationMessage(NULL),
	  fSnoozeAmount(kDefaultSnooze),
	  fKeyIncrement(1),
	  fMinimum(minValue),
	  fMaximum(std::max(minValue, maxValue)),
	  fHashMarkCount(0),
	  fHashMarks(B_HASH_MARKS_NONE),
	  fStyle(thumbType),
	  fOrientation(posture),
	  fBarThickness(kDefaultBarThickness),
	  fBarColor(make_color(0, 0, 0)),
	  fFillColor(make_color(0, 0, 0)),
	  fUsesBarColor(false),
	  fUsesFillColor(false),
	  fHasFillColor(false),
	  fThumb(std::make_unique<Thumb>(this))
{
	SetValueNoUpdate(minValue);
}


BSlider::BSlider(BRect frame, const char* name, const char* label, BMessage* message,
	int32 minValue, int32 maxValue, thumb_style thumbType, uint32 resizingMode, uint32 flags)
	: BSlider(frame, name, label, message, minValue, maxValue, B_HORIZONTAL, thumbType,
		resizingMode, flags)
{
}


BSlider::BSlider(const char* name, const char* label, BMessage* message, int32 minValue,
	int32 maxValue, orientation posture, thumb_style thumbType, uint32 flags)
	: BSlider(BRect(0, 0, -1, -1), name, label, message, minValue, maxValue, posture, thumbType,
		B_FOLLOW_LEFT_TOP, flags)
{
}


BSlider::BSlider(BMessage* archive)
	: BControl(archive),
	  fModificationMessage(NULL),
	  fSnoozeAmount(archive->GetInt32("_sdelay", kDefaultSnooze)),
	  fKeyIncrement(archive->GetInt32("_incrementvalue", 1)),
	  fMinimum(archive->GetInt32("_min", 0)),
	  fMaximum(std::max(fMinimum, archive->GetInt32("_max", 100))),
	  fHashMarkCount(std::max<int32>(archive->GetInt32("_hashcount", 0), 0)),
	  fHashMarks(EnumBetween(archive->GetInt16("_hashloc", 0), B_HASH_MARKS_NONE, B_HASH_MARKS_BOTH,
		  B_HASH_MARKS_NONE)),
	  fStyle(EnumBetween(archive->GetInt16("_sstyle", B_BLOCK_THUMB), B_BLOCK_THUMB,
		  B_TRIANGLE_THUMB, B_BLOCK_THUMB)),
	  fOrientation(EnumBetween(
		  archive->GetInt32("_orient", B_HORIZONTAL), B_HORIZONTAL, B_VERTICAL, B_HORIZONTAL)),
	  fBarThickness(std::max(archive->GetFloat("_bthickness", kDefaultBarThickness), 1.0f)),
	  fBarColor(make_color(0, 0, 0)),
	  fFillColor(make_color(0, 0, 0)),
	  fUsesBarColor(archive->FindColor("_bcolor", &fBarColor) == B_OK),
	  fUsesFillColor(archive->GetBool("_usefill", false)),
	  fHasFillColor(archive->FindColor("_fcolor", &fFillColor) == B_OK),
	  fThumb(std::make_unique<Thumb>(this))
{
	archive->FindString("_minlbl", &fMinLimitLabel);
	archive->FindString("_maxlbl", &fMaxLimitLabel);
	BMessage message;
	if (archive->FindMessage("_mod_msg", &message) == B_OK)
		fModificationMessage = new BMessage(message);
	SetValueNoUpdate(std::clamp(Value(), fMinimum, fMaximum));
}


BSlider::~BSlider()
{
	delete fModificationMessage;
}


BArchivable*
BSlider::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BSlider") ? new BSlider(archive) : NULL;
}


status_t
BSlider::Archive(BMessage* archive, bool deep) const
{
	status_t status = BControl::Archive(archive, deep);
	if (status == B_OK && fModificationMessage != NULL)
		status = archive->AddMessage("_mod_msg", fModificationMessage);

	const struct {
		const char* field;
		int32 value;
	} kNumbers[] = {{"_sdelay", fSnoozeAmount}, {"_incrementvalue", fKeyIncrement},
		{"_min", fMinimum}, {"_max", fMaximum}, {"_hashcount", fHashMarkCount},
		{"_orient", fOrientation}};
	for (const auto& number : kNumbers) {
		if (status == B_OK)
			status = archive->AddInt32(number.field, number.value);
	}
	if (status == B_OK)
		status = archive->AddInt16("_hashloc", static_cast<int16>(fHashMarks));
	if (status == B_OK)
		status = archive->AddInt16("_sstyle", static_cast<int16>(fStyle));
	if (status == B_OK)
		status = archive->AddFloat("_bthickness", fBarThickness);

	if (status == B_OK && fUsesBarColor)
		status = archive->AddColor("_bcolor", fBarColor);
	if (status == B_OK && fHasFillColor)
		status = archive->AddColor("_fcolor", fFillColor);
	if (status == B_OK && fUsesFillColor)
		status = archive->AddBool("_usefill", true);
	if (status == B_OK && MinLimitLabel() != NULL)
		status = archive->AddString("_minlbl", fMinLimitLabel);
	if (status == B_OK && MaxLimitLabel() != NULL)
		status = archive->AddString("_maxlbl", fMaxLimitLabel);
	return status;
}


void
BSlider::DetachedFromWindow()
{
	fThumb->Cancel();
	BControl::DetachedFromWindow();
}


void
BSlider::KeyDown(const char* bytes, int32 numBytes)
{
	int64 value = Value();
	switch (numBytes == 1 ? bytes[0] : 0) {
		case B_LEFT_ARROW:
		case B_DOWN_ARROW:
			value -= fKeyIncrement;
			break;
		case B_RIGHT_ARROW:
		case B_UP_ARROW:
			value += fKeyIncrement;
			break;
		case B_HOME:
			value = fMinimum;
			break;
		case B_END:
			value = fMaximum;
			break;
		default:
			// Space and Enter have nothing to click here.
			BView::KeyDown(bytes, numBytes); // NOLINT(bugprone-parent-virtual-call): as said above
			return;
	}
	if (!IsEnabled())
		return;
	fThumb->BeginChange();
	ChangeValue(static_cast<int32>(std::clamp<int64>(value, fMinimum, fMaximum)));
}


void
BSlider::KeyUp(const char* bytes, int32 numBytes)
{
	BControl::KeyUp(bytes, numBytes);
	fThumb->KeyReleased();
}


void
BSlider::MakeFocus(bool focus)
{
	BControl::MakeFocus(focus);
	if (!focus)
		fThumb->KeyReleased();
}


void
BSlider::MouseDown(BPoint where)
{
	if (IsEnabled()) {
		fThumb->MouseDown(
			where, ThumbFrame(), ThumbPoint(), B_NO_POINTER_HISTORY | B_SUSPEND_VIEW_FOCUS);
	}
}


void
BSlider::MouseMoved(BPoint where, uint32, const BMessage*)
{
	fThumb->MouseMoved(where);
}


void
BSlider::MouseUp(BPoint where)
{
	fThumb->MouseUp(where);
}


status_t
BSlider::Invoke(BMessage* message)
{
	return BControl::Invoke(message);
}


void
BSlider::SetLabel(const char* label)
{
	BControl::SetLabel(label);
}


void
BSlider::SetLimitLabels(const char* minLabel, const char* maxLabel)
{
	fMinLimitLabel = minLabel;
	fMaxLimitLabel = maxLabel;
	Redraw();
}


const char*
BSlider::MinLimitLabel() const
{
	return fMinLimitLabel.IsEmpty() ? NULL : fMinLimitLabel.String();
}


const char*
BSlider::MaxLimitLabel() const
{
	return fMaxLimitLabel.IsEmpty() ? NULL : fMaxLimitLabel.String();
}


void
BSlider::SetValue(int32 value)
{
	BControl::SetValue(std::clamp(value, fMinimum, fMaximum));
}


void
BSlider::SetPosition(float position)
{
	const double range = static_cast<double>(fMaximum) - fMinimum;
	const double place = position > 0 ? std::min(position, 1.0f) : 0;
	SetValue(static_cast<int32>(std::floor(fMinimum + range * place + 0.5)));
}


float
BSlider::Position() const
{
	const double range = static_cast<double>(fMaximum) - fMinimum;
	if (range <= 0)
		return 0;
	return static_cast<float>((static_cast<double>(Value()) - fMinimum) / range);
}


void
BSlider::SetLimits(int32 minimum, int32 maximum)
{
	if (minimum > maximum)
		return;
	fMinimum = minimum;
	fMaximum = maximum;
	SetValue(Value());
	Redraw();
}


void
BSlider::GetLimits(int32* minimum, int32* maximum) const
{
	if (minimum != NULL)
		*minimum = fMinimum;
	if (maximum != NULL)
		*maximum = fMaximum;
}


void
BSlider::SetEnabled(bool enable)
{
	if (!enable)
		fThumb->Disabled();
	BControl::SetEnabled(enable);
}


void
BSlider::SetModificationMessage(BMessage* message)
{
	if (message == fModificationMessage)
		return;
	delete fModificationMessage;
	fModificationMessage = message;
}


BMessage*
BSlider::ModificationMessage() const
{
	return fModificationMessage;
}


void
BSlider::SetSnoozeAmount(int32 microSeconds)
{
	fSnoozeAmount = std::clamp<int32>(microSeconds, 0, 1000000);
}


int32
BSlider::SnoozeAmount() const
{
	return fSnoozeAmount;
}


void
BSlider::SetKeyIncrementValue(int32 value)
{
	fKeyIncrement = value;
}


int32
BSlider::KeyIncrementValue() const
{
	return fKeyIncrement;
}


void
BSlider::SetHashMarkCount(int32 count)
{
	fHashMarkCount = std::max<int32>(count, 0);
	Redraw();
}


int32
BSlider::HashMarkCount() const
{
	return fHashMarkCount;
}


void
BSlider::SetHashMarks(hash_mark_location where)
{
	fHashMarks = where;
	Redraw();
}


hash_mark_location
BSlider::HashMarks() const
{
	return fHashMarks;
}


void
BSlider::SetStyle(thumb_style style)
{
	fStyle = style;
	Redraw();
}


thumb_style
BSlider::Style() const
{
	return fStyle;
}


void
BSlider::SetBarColor(rgb_color color)
{
	fBarColor = color;
	fUsesBarColor = true;
	Redraw();
}


rgb_color
BSlider::BarColor() const
{
	return fUsesBarColor ? fBarColor
						 : tint_color(ui_color(B_PANEL_BACKGROUND_COLOR), B_DARKEN_1_TINT);
}


void
BSlider::UseFillColor(bool useFill, const rgb_color* color)
{
	fUsesFillColor = useFill;
	if (color != NULL) {
		fFillColor = *color;
		fHasFillColor = true;
	}
	Redraw();
}


bool
BSlider::FillColor(rgb_color* color) const
{
	if (color != NULL)
		*color = fHasFillColor ? fFillColor : ui_color(B_STATUS_BAR_COLOR);
	return fUsesFillColor;
}


orientation
BSlider::Orientation() const
{
	return fOrientation;
}


void
BSlider::SetOrientation(orientation posture)
{
	fOrientation = posture;
	Redraw();
}


float
BSlider::BarThickness() const
{
	return fBarThickness;
}


void
BSlider::SetBarThickness(float thickness)
{
	fBarThickness = std::max(std::floor(thickness + 0.5f), 1.0f);
	Redraw();
}


void
BSlider::ChangeValue(int32 value)
{
	const int32 before = Value();
	SetValue(value);
	if (Value() != before && fModificationMessage != NULL)
		InvokeNotify(fModificationMessage, B_CONTROL_MODIFIED);
}


void
BSlider::Redraw()
{
	if (Window() != NULL)
		Invalidate();
}
