// SPDX-License-Identifier: MIT
#include <ChannelControl.h>

#include <algorithm>

#include <Message.h>
#include <Window.h>

namespace {

constexpr int32 kDefaultMaximum = 10000;

// More come from no sound archive.
constexpr int32 kMostArchived = 1000;


const char*
TextOf(const BString& label)
{
	return label.IsEmpty() ? NULL : label.String();
}

} // namespace

BChannelControl::BChannelControl(BRect frame, const char* name, const char* label, BMessage* model,
	int32 channelCount, uint32 resizingMode, uint32 flags)
	: BControl(frame, name, label, model, resizingMode, flags),
	  fModificationMessage(NULL),
	  fCurrentChannel(0)
{
	Resize(std::max<int32>(channelCount, 0));
}


BChannelControl::BChannelControl(
	const char* name, const char* label, BMessage* model, int32 channelCount, uint32 flags)
	: BChannelControl(
		BRect(0, 0, -1, -1), name, label, model, channelCount, B_FOLLOW_LEFT_TOP, flags)
{
}


BChannelControl::BChannelControl(BMessage* archive)
	: BControl(archive),
	  fModificationMessage(NULL),
	  fCurrentChannel(0)
{
	Resize(std::clamp<int32>(archive->GetInt32("be:_m_channel_count", 0), 0, kMostArchived));
	archive->FindString("be:_m_min_label", &fMinLabel);
	archive->FindString("be:_m_max_label", &fMaxLabel);
	for (int32 i = 0; i < CountChannels(); i++) {
		const int32 minimum = archive->GetInt32("be:_m_channel_min", i, 0);
		const int32 maximum = archive->GetInt32("be:_m_channel_max", i, kDefaultMaximum);
		if (minimum <= maximum) {
			fMinima[i] = minimum;
			fMaxima[i] = maximum;
		}
		KeepValue(i, archive->GetInt32("be:_m_channel_val", i, 0));
		archive->FindString("be:_m_channel_min_label", i, &fMinLabels[i]);
		archive->FindString("be:_m_channel_max_label", i, &fMaxLabels[i]);
	}
	BMessage message;
	if (archive->FindMessage("_mod_msg", &message) == B_OK)
		fModificationMessage = new BMessage(message);
	SetCurrentChannel(archive->GetInt32("be:_m_value_channel", 0));
}


BChannelControl::~BChannelControl()
{
	delete fModificationMessage;
}


BArchivable*
BChannelControl::Instantiate(BMessage*)
{
	return NULL;
}


status_t
BChannelControl::Archive(BMessage* archive, bool deep) const
{
	status_t status = BControl::Archive(archive, deep);
	if (status == B_OK)
		status = archive->AddInt32("be:_m_channel_count", CountChannels());
	if (status == B_OK)
		status = archive->AddInt32("be:_m_value_channel", fCurrentChannel);
	if (status == B_OK && MinLimitLabel() != NULL)
		status = archive->AddString("be:_m_min_label", fMinLabel);
	if (status == B_OK && MaxLimitLabel() != NULL)
		status = archive->AddString("be:_m_max_label", fMaxLabel);
	for (int32 i = 0; i < CountChannels() && status == B_OK; i++) {
		status = archive->AddInt32("be:_m_channel_min", fMinima[i]);
		if (status == B_OK)
			status = archive->AddInt32("be:_m_channel_max", fMaxima[i]);
		if (status == B_OK)
			status = archive->AddInt32("be:_m_channel_val", fValues[i]);
		if (status == B_OK)
			status = archive->AddString("be:_m_channel_min_label", fMinLabels[i]);
		if (status == B_OK)
			status = archive->AddString("be:_m_channel_max_label", fMaxLabels[i]);
	}
	if (status == B_OK && fModificationMessage != NULL)
		status = archive->AddMessage("_mod_msg", fModificationMessage);
	return status;
}


void
BChannelControl::MessageReceived(BMessage* message)
{
	BControl::MessageReceived(message);
}


status_t
BChannelControl::Invoke(BMessage* message)
{
	const BMessage* model = message != NULL ? message : Message();
	if (model == NULL)
		return B_BAD_VALUE;
	BMessage sent(*model);
	if (!sent.HasInt32("be:current_channel"))
		sent.AddInt32("be:current_channel", fCurrentChannel);
	return BControl::Invoke(&sent);
}


status_t
BChannelControl::InvokeChannel(
	BMessage* message, int32 fromChannel, int32 channelCount, const bool* _mask)
{
	const BMessage* model = message != NULL ? message : Message();
	if (model == NULL)
		return B_BAD_VALUE;
	if (!HasChannels(fromChannel, std::max<int32>(channelCount, 0)))
		return B_BAD_INDEX;
	if (channelCount < 0)
		channelCount = CountChannels() - fromChannel;
	BMessage sent(*model);
	for (int32 i = 0; i < channelCount; i++) {
		sent.AddInt32("be:channel_value", fValues[fromChannel + i]);
		sent.AddBool("be:channel_changed", _mask == NULL || _mask[i]);
	}
	return Invoke(&sent);
}


void
BChannelControl::SetModificationMessage(BMessage* message)
{
	if (message == fModificationMessage)
		return;
	delete fModificationMessage;
	fModificationMessage = message;
}


BMessage*
BChannelControl::ModificationMessage() const
{
	return fModificationMessage;
}


status_t
BChannelControl::SetCurrentChannel(int32 index)
{
	if (!HasChannels(index, 1))
		return B_BAD_INDEX;
	fCurrentChannel = index;
	SetValueNoUpdate(fValues[index]);
	Redraw();
	return B_OK;
}


int32
BChannelControl::CurrentChannel() const
{
	return fCurrentChannel;
}


int32
BChannelControl::CountChannels() const
{
	return static_cast<int32>(fValues.size());
}


status_t
BChannelControl::SetChannelCount(int32 count)
{
	if (count < 0 || count > MaxChannelCount())
		return B_BAD_VALUE;
	Resize(count);
	Redraw();
	return B_OK;
}


void
BChannelControl::SetValue(int32 value)
{
	SetValueFor(fCurrentChannel, value);
}


int32
BChannelControl::ValueFor(int32 channel) const
{
	return HasChannels(channel, 1) ? fValues[channel] : 0;
}


int32
BChannelControl::GetValue(int32* _values, int32 fromChannel, int32 channelCount) const
{
	if (_values == NULL || fromChannel < 0)
		return 0;
	const int32 count = std::min(channelCount, CountChannels() - fromChannel);
	for (int32 i = 0; i < count; i++)
		_values[i] = fValues[fromChannel + i];
	return std::max<int32>(count, 0);
}


status_t
BChannelControl::SetValueFor(int32 channel, int32 value)
{
	if (!HasChannels(channel, 1))
		return B_BAD_INDEX;
	KeepValue(channel, value);
	Redraw();
	return B_OK;
}


status_t
BChannelControl::SetAllValue(int32 values)
{
	for (int32 i = 0; i < CountChannels(); i++)
		KeepValue(i, values);
	Redraw();
	return B_OK;
}


status_t
BChannelControl::SetLimitsFor(int32 channel, int32 minimum, int32 maximum)
{
	return SetLimitsFor(channel, 1, &minimum, &maximum);
}


status_t
BChannelControl::GetLimitsFor(int32 channel, int32* _minimum, int32* _maximum) const
{
	return GetLimitsFor(channel, 1, _minimum, _maximum);
}


status_t
BChannelControl::SetLimitsFor(
	int32 fromChannel, int32 channelCount, const int32* minima, const int32* maxima)
{
	if (!HasChannels(fromChannel, channelCount))
		return B_BAD_INDEX;
	if (minima == NULL || maxima == NULL)
		return B_BAD_VALUE;
	for (int32 i = 0; i < channelCount; i++) {
		if (minima[i] > maxima[i])
			return B_BAD_VALUE;
	}
	for (int32 i = 0; i < channelCount; i++) {
		const int32 channel = fromChannel + i;
		fMinima[channel] = minima[i];
		fMaxima[channel] = maxima[i];
		KeepValue(channel, fValues[channel]);
	}
	Redraw();
	return B_OK;
}


status_t
BChannelControl::GetLimitsFor(
	int32 fromChannel, int32 channelCount, int32* minima, int32* maxima) const
{
	if (!HasChannels(fromChannel, channelCount))
		return B_BAD_INDEX;
	for (int32 i = 0; i < channelCount; i++) {
		if (minima != NULL)
			minima[i] = fMinima[fromChannel + i];
		if (maxima != NULL)
			maxima[i] = fMaxima[fromChannel + i];
	}
	return B_OK;
}


status_t
BChannelControl::SetLimits(int32 minimum, int32 maximum)
{
	const std::vector<int32> minima(fValues.size(), minimum);
	const std::vector<int32> maxima(fValues.size(), maximum);
	return SetLimitsFor(0, CountChannels(), minima.data(), maxima.data());
}


status_t
BChannelControl::GetLimits(int32* _minimum, int32* _maximum) const
{
	return GetLimitsFor(fCurrentChannel, _minimum, _maximum);
}


status_t
BChannelControl::SetLimitLabels(const char* minLabel, const char* maxLabel)
{
	fMinLabel = minLabel;
	fMaxLabel = maxLabel;
	Redraw();
	return B_OK;
}


const char*
BChannelControl::MinLimitLabel() const
{
	return TextOf(fMinLabel);
}


const char*
BChannelControl::MaxLimitLabel() const
{
	return TextOf(fMaxLabel);
}


status_t
BChannelControl::SetLimitLabelsFor(int32 channel, const char* minLabel, const char* maxLabel)
{
	return SetLimitLabelsFor(channel, 1, minLabel, maxLabel);
}


status_t
BChannelControl::SetLimitLabelsFor(
	int32 fromChannel, int32 channelCount, const char* minLabel, const char* maxLabel)
{
	if (!HasChannels(fromChannel, channelCount))
		return B_BAD_INDEX;
	for (int32 i = 0; i < channelCount; i++) {
		fMinLabels[fromChannel + i] = minLabel;
		fMaxLabels[fromChannel + i] = maxLabel;
	}
	Redraw();
	return B_OK;
}


const char*
BChannelControl::MinLimitLabelFor(int32 channel) const
{
	return HasChannels(channel, 1) ? TextOf(fMinLabels[channel]) : NULL;
}


const char*
BChannelControl::MaxLimitLabelFor(int32 channel) const
{
	return HasChannels(channel, 1) ? TextOf(fMaxLabels[channel]) : NULL;
}


int32* const&
BChannelControl::MinLimitList() const
{
	return fMinimumList;
}


int32* const&
BChannelControl::MaxLimitList() const
{
	return fMaximumList;
}


int32* const&
BChannelControl::ValueList() const
{
	return fValueList;
}


bool
BChannelControl::HasChannels(int32 from, int32 count) const
{
	return from >= 0 && count >= 0 && from <= CountChannels() && count <= CountChannels() - from;
}


void
BChannelControl::Resize(int32 count)
{
	fMinima.resize(count, 0);
	fMaxima.resize(count, kDefaultMaximum);
	fValues.resize(count, 0);
	fMinLabels.resize(count);
	fMaxLabels.resize(count);
	fMinimumList = fMinima.data();
	fMaximumList = fMaxima.data();
	fValueList = fValues.data();
	fCurrentChannel = std::clamp<int32>(fCurrentChannel, 0, std::max<int32>(count - 1, 0));
	SetValueNoUpdate(ValueFor(fCurrentChannel));
}


void
BChannelControl::KeepValue(int32 channel, int32 value)
{
	fValues[channel] = std::clamp(value, fMinima[channel], fMaxima[channel]);
	if (channel == fCurrentChannel)
		SetValueNoUpdate(fValues[channel]);
}


void
BChannelControl::Redraw()
{
	if (Window() != NULL)
		Invalidate();
}
