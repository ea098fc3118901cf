// SPDX-License-Identifier: MIT
// BChannelSlider: its state and its input. ChannelSliderDrawing.cpp has its layout and its look.
#include <ChannelSlider.h>

#include <algorithm>
#include <memory>

#include <Message.h>
#include <Window.h>

#include "ThumbTracking.h"
#include "interface/ArchivedEnum.h"

using BPrivate::EnumBetween;

namespace {

constexpr int32 kMostChannels = 32;

// A key goes this part of the way between the limits.
constexpr int64 kKeySteps = 100;


orientation
OrientationFor(BRect area)
{
	return area.Height() > area.Width() ? B_VERTICAL : B_HORIZONTAL;
}


/// What the message that the view's window is handling holds; 0 without one.
int32
MessageNumber(const BView* view, const char* name)
{
	const BMessage* message = view->Window() != NULL ? view->Window()->CurrentMessage() : NULL;
	return message != NULL ? message->GetInt32(name, 0) : 0;
}

} // namespace

/// Changes the value of the channel whose thumb is held, or by as much those of all, and has them sent.
class BChannelSlider::Thumb : public BPrivate::ThumbTracking {
public:
	explicit Thumb(BChannelSlider* slider)
		: ThumbTracking(slider),
		  fSlider(slider),
		  fMovesAll(false),
		  fValueBefore(0)
	{
	}

	bool MovesAll() const { return fMovesAll; }
	/// For the press that comes now, of the slider's current channel.
	void SetMovesAll(bool movesAll)
	{
		fMovesAll = movesAll;
		fValueBefore = fSlider->Value();
	}

protected:
	void ChangeBegins() override;
	void MoveThumb(BPoint middle) override;
	void ChangeEnds() override;

private:
	BChannelSlider* fSlider;
	bool fMovesAll;
	std::vector<int32> fValuesBefore;
	// Of the moved channel where the drag began.
	int32 fValueBefore;
};


void
BChannelSlider::Thumb::ChangeBegins()
{
	fValuesBefore.assign(fSlider->ValueList(), fSlider->ValueList() + fSlider->CountChannels());
}


void
BChannelSlider::Thumb::MoveThumb(BPoint middle)
{
	// The program may have taken channels away meanwhile.
	const int32 channel = fSlider->CurrentChannel();
	if (channel >= fSlider->CountChannels())
		return;
	const int32 value = fSlider->ValueAt(middle, channel);
	std::vector<int32> values(
		fSlider->ValueList(), fSlider->ValueList() + fSlider->CountChannels());
	values[channel] = value;
	if (fMovesAll) {
		const int64 way = static_cast<int64>(value) - fValueBefore;
		for (size_t i = 0; i < std::min(values.size(), fValuesBefore.size()); i++) {
			values[i] = static_cast<int32>(std::clamp<int64>(
				fValuesBefore[i] + way, fSlider->MinLimitList()[i], fSlider->MaxLimitList()[i]));
		}
	}
	fSlider->ChangeValues(values);
}


void
BChannelSlider::Thumb::ChangeEnds()
{
	const auto changed = std::make_unique<bool[]>(fSlider->CountChannels());
	bool anyChanged = false;
	for (int32 i = 0; i < fSlider->CountChannels(); i++) {
		const size_t place = static_cast<size_t>(i);
		changed[i] = place >= fValuesBefore.size() || fSlider->ValueFor(i) != fValuesBefore[place];
		anyChanged = anyChanged || changed[i];
	}
	if (anyChanged)
		fSlider->InvokeChannel(NULL, 0, -1, changed.get());
}


BChannelSlider::BChannelSlider(BRect area, const char* name, const char* label, BMessage* message,
	orientation orientation, int32 channels, uint32 resizeMode, uint32 flags)
	: BChannelControl(area, name, label, message, std::min(channels, kMostChannels), resizeMode,
		flags | B_FULL_UPDATE_ON_RESIZE),
	  fOrientation(orientation),
	  fThumb(std::make_unique<Thumb>(this))
{
}


BChannelSlider::BChannelSlider(BRect area, const char* name, const char* label, BMessage* message,
	int32 channels, uint32 resizeMode, uint32 flags)
	: BChannelSlider(area, name, label, message, OrientationFor(area), channels, resizeMode, flags)
{
}


BChannelSlider::BChannelSlider(const char* name, const char* label, BMessage* message,
	orientation orientation, int32 channels, uint32 flags)
	: BChannelSlider(
		BRect(0, 0, -1, -1), name, label, message, orientation, channels, B_FOLLOW_LEFT_TOP, flags)
{
}


BChannelSlider::BChannelSlider(BMessage* archive)
	: BChannelControl(archive),
	  fOrientation(EnumBetween(
		  archive->GetInt32("_orient", B_HORIZONTAL), B_HORIZONTAL, B_VERTICAL, B_HORIZONTAL)),
	  fThumb(std::make_unique<Thumb>(this))
{
	if (CountChannels() > kMostChannels)
		SetChannelCount(kMostChannels);
}


BChannelSlider::~BChannelSlider() {}


BArchivable*
BChannelSlider::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BChannelSlider") ? new BChannelSlider(archive) : NULL;
}


status_t
BChannelSlider::Archive(BMessage* archive, bool deep) const
{
	const status_t status = BChannelControl::Archive(archive, deep);
	return status == B_OK ? archive->AddInt32("_orient", fOrientation) : status;
}


void
BChannelSlider::DetachedFromWindow()
{
	fThumb->Cancel();
	BChannelControl::DetachedFromWindow();
}


void
BChannelSlider::MouseDown(BPoint where)
{
	const int32 channel = ChannelAt(where);
	if (!IsEnabled() || channel < 0)
		return;
	SetCurrentChannel(channel);
	fThumb->SetMovesAll(MessageNumber(this, "buttons") == B_SECONDARY_MOUSE_BUTTON
		|| (MessageNumber(this, "modifiers") & B_SHIFT_KEY) != 0);
	const BRect bar = BarFrame(channel);
	fThumb->MouseDown(where, ThumbFrame(bar, channel), ThumbPoint(bar, channel),
		B_NO_POINTER_HISTORY | B_LOCK_WINDOW_FOCUS);
}


void
BChannelSlider::MouseMoved(BPoint where, uint32, const BMessage*)
{
	fThumb->MouseMoved(where);
}


void
BChannelSlider::MouseUp(BPoint where)
{
	fThumb->MouseUp(where);
}


void
BChannelSlider::KeyDown(const char* bytes, int32 numBytes)
{
	const char key = numBytes == 1 ? bytes[0] : '\0';
	const bool isForward = key == B_RIGHT_ARROW || key == B_UP_ARROW;
	const bool isArrow = isForward || key == B_LEFT_ARROW || key == B_DOWN_ARROW;
	int32 minimum, maximum;
	if ((!isArrow && key != B_HOME && key != B_END) || GetLimits(&minimum, &maximum) != B_OK) {
		// Space and Enter have nothing to click here.
		BView::KeyDown(bytes, numBytes); // NOLINT(bugprone-parent-virtual-call): as said above
		return;
	}
	if (!IsEnabled())
		return;
	const bool isUpright = key == B_UP_ARROW || key == B_DOWN_ARROW;
	if (isArrow && isUpright != IsVertical()) {
		const bool next = key == B_RIGHT_ARROW || key == B_DOWN_ARROW;
		fThumb->FinishChange();
		SetCurrentChannel(CurrentChannel() + (next ? 1 : -1));
		return;
	}
	const int64 step = std::max<int64>((static_cast<int64>(maximum) - minimum) / kKeySteps, 1);
	int64 value = isForward ? Value() + step : Value() - step;
	if (!isArrow)
		value = key == B_HOME ? minimum : maximum;
	fThumb->BeginChange();
	std::vector<int32> values(ValueList(), ValueList() + CountChannels());
	values[CurrentChannel()] = static_cast<int32>(std::clamp<int64>(value, minimum, maximum));
	ChangeValues(values);
}


void
BChannelSlider::KeyUp(const char* bytes, int32 numBytes)
{
	BChannelControl::KeyUp(bytes, numBytes);
	fThumb->KeyReleased();
}


void
BChannelSlider::MakeFocus(bool focus)
{
	BChannelControl::MakeFocus(focus);
	if (!focus)
		fThumb->KeyReleased();
}


void
BChannelSlider::SetEnabled(bool on)
{
	if (!on)
		fThumb->Disabled();
	BChannelControl::SetEnabled(on);
}


int32
BChannelSlider::MaxChannelCount() const
{
	return kMostChannels;
}


bool
BChannelSlider::SupportsIndividualLimits() const
{
	return false;
}


orientation
BChannelSlider::Orientation() const
{
	return fOrientation;
}


void
BChannelSlider::SetOrientation(orientation orientation)
{
	fOrientation = orientation;
	if (Window() != NULL)
		Invalidate();
}


bool
BChannelSlider::IsVertical() const
{
	return fOrientation == B_VERTICAL;
}


/// Whether the thumbs move together.
bool
BChannelSlider::MovesAll() const
{
	return fThumb->MovesAll();
}


/// Takes the values, one for each channel and in its limits, and tells of them.
void
BChannelSlider::ChangeValues(const std::vector<int32>& values)
{
	// A class derived from this one may allow more channels.
	const auto changed = std::make_unique<bool[]>(CountChannels());
	bool anyChanged = false;
	for (int32 i = 0; i < CountChannels(); i++) {
		changed[i] = values[i] != ValueFor(i);
		if (!changed[i])
			continue;
		anyChanged = true;
		SetValueFor(i, values[i]);
	}
	if (!anyChanged || ModificationMessage() == NULL)
		return;
	BeginInvokeNotify(B_CONTROL_MODIFIED);
	InvokeChannel(ModificationMessage(), 0, -1, changed.get());
	EndInvokeNotify();
}
