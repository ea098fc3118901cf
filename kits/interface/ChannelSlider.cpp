// SPDX-License-Identifier: MIT
// BChannelSlider: its state and its input. ChannelSliderDrawing.cpp has its layout and its look.
#include <ChannelSlider.h>

#include <algorithm>
#include <memory>

#include <Message.h>
#include <Window.h>

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

BChannelSlider::BChannelSlider(BRect area, const char* name, const char* label, BMessage* message,
	orientation orientation, int32 channels, uint32 resizeMode, uint32 flags)
	: BChannelControl(area, name, label, message, std::min(channels, kMostChannels), resizeMode,
		flags | B_FULL_UPDATE_ON_RESIZE),
	  fOrientation(orientation),
	  fIsChanging(false),
	  fMovesAll(false),
	  fGrabOffset(0),
	  fValueBefore(0)
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
	  fOrientation(static_cast<orientation>(archive->GetInt32("_orient", B_HORIZONTAL))),
	  fIsChanging(false),
	  fMovesAll(false),
	  fGrabOffset(0),
	  fValueBefore(0)
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
	fIsChanging = false;
	BChannelControl::DetachedFromWindow();
}


void
BChannelSlider::MouseDown(BPoint where)
{
	const int32 channel = ChannelAt(where);
	if (!IsEnabled() || channel < 0)
		return;
	SetCurrentChannel(channel);
	SetMouseEventMask(B_POINTER_EVENTS, B_NO_POINTER_HISTORY | B_LOCK_WINDOW_FOCUS);
	SetTracking(true);
	fMovesAll = MessageNumber(this, "buttons") == B_SECONDARY_MOUSE_BUTTON
		|| (MessageNumber(this, "modifiers") & B_SHIFT_KEY) != 0;
	BeginChange();
	fValueBefore = ValueFor(channel);
	// A thumb that is taken hold of stays under the pointer; beside it, it comes there.
	const BRect bar = BarFrame(channel);
	const BPoint middle = ThumbPoint(bar, channel);
	const bool holdsThumb = ThumbFrame(bar, channel).Contains(where);
	fGrabOffset = !holdsThumb ? 0 : IsVertical() ? middle.y - where.y : middle.x - where.x;
	if (!holdsThumb)
		TrackTo(where);
	Invalidate();
}


void
BChannelSlider::MouseMoved(BPoint where, uint32, const BMessage*)
{
	if (IsTracking())
		TrackTo(where);
}


void
BChannelSlider::MouseUp(BPoint where)
{
	if (!IsTracking())
		return;
	TrackTo(where);
	SetTracking(false);
	Invalidate();
	FinishChange();
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
		BView::KeyDown(bytes, numBytes);
		return;
	}
	if (!IsEnabled())
		return;
	const bool isUpright = key == B_UP_ARROW || key == B_DOWN_ARROW;
	if (isArrow && isUpright != IsVertical()) {
		const bool next = key == B_RIGHT_ARROW || key == B_DOWN_ARROW;
		FinishChange();
		SetCurrentChannel(CurrentChannel() + (next ? 1 : -1));
		return;
	}
	const int64 step = std::max<int64>((static_cast<int64>(maximum) - minimum) / kKeySteps, 1);
	int64 value = isForward ? Value() + step : Value() - step;
	if (!isArrow)
		value = key == B_HOME ? minimum : maximum;
	BeginChange();
	std::vector<int32> values(ValueList(), ValueList() + CountChannels());
	values[CurrentChannel()] = static_cast<int32>(std::clamp<int64>(value, minimum, maximum));
	ChangeValues(values);
}


void
BChannelSlider::KeyUp(const char* bytes, int32 numBytes)
{
	BChannelControl::KeyUp(bytes, numBytes);
	if (!IsTracking())
		FinishChange();
}


void
BChannelSlider::MakeFocus(bool focus)
{
	BChannelControl::MakeFocus(focus);
	// The release of the key that moved the thumb goes elsewhere.
	if (!focus && !IsTracking())
		FinishChange();
}


void
BChannelSlider::SetEnabled(bool on)
{
	if (!on && IsTracking()) {
		SetTracking(false);
		FinishChange();
	}
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


/// Notes what the values are before the user changes them, until FinishChange().
void
BChannelSlider::BeginChange()
{
	if (fIsChanging)
		return;
	fIsChanging = true;
	fValuesBefore.assign(ValueList(), ValueList() + CountChannels());
}


void
BChannelSlider::TrackTo(BPoint where)
{
	// The program may have taken channels away meanwhile.
	const int32 channel = CurrentChannel();
	if (channel >= CountChannels())
		return;
	where += IsVertical() ? BPoint(0, fGrabOffset) : BPoint(fGrabOffset, 0);
	const int32 value = ValueAt(where, channel);
	std::vector<int32> values(ValueList(), ValueList() + CountChannels());
	values[channel] = value;
	if (fMovesAll) {
		const int64 way = static_cast<int64>(value) - fValueBefore;
		for (size_t i = 0; i < std::min(values.size(), fValuesBefore.size()); i++) {
			values[i] = static_cast<int32>(
				std::clamp<int64>(fValuesBefore[i] + way, MinLimitList()[i], MaxLimitList()[i]));
		}
	}
	ChangeValues(values);
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


void
BChannelSlider::FinishChange()
{
	if (!fIsChanging)
		return;
	fIsChanging = false;
	const auto changed = std::make_unique<bool[]>(CountChannels());
	bool anyChanged = false;
	for (int32 i = 0; i < CountChannels(); i++) {
		const size_t place = static_cast<size_t>(i);
		changed[i] = place >= fValuesBefore.size() || ValueFor(i) != fValuesBefore[place];
		anyChanged = anyChanged || changed[i];
	}
	// What is sent may have the control deleted: nothing comes after it.
	if (anyChanged)
		InvokeChannel(NULL, 0, -1, changed.get());
}
