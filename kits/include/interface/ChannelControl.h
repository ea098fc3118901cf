// SPDX-License-Identifier: MIT
// The base of controls with several values.
#ifndef _CHANNEL_CONTROL_H
#define _CHANNEL_CONTROL_H

#include <vector>

#include <Control.h>

/// A control with channels, each of which has a value between limits of its own; 0 and 10000 to begin with.
///
/// One channel is the current one: Value() is its value. Channels count from 0; operations with a channel that
/// is not there, or with fewer channels behind it than are asked for, return B_BAD_INDEX and change nothing.
class BChannelControl : public BControl {
public:
	/// \a channelCount: at least 0.
	BChannelControl(BRect frame, const char* name, const char* label, BMessage* model,
		int32 channelCount = 1, uint32 resizingMode = B_FOLLOW_LEFT_TOP,
		uint32 flags = B_WILL_DRAW);
	BChannelControl(const char* name, const char* label, BMessage* model, int32 channelCount = 1,
		uint32 flags = B_WILL_DRAW);
	BChannelControl(BMessage* archive);
	virtual ~BChannelControl();

	/// Null: only classes derived from this one can be made.
	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void MessageReceived(BMessage* message) override;
	/// Adds "be:current_channel" (int32) to what BControl sends.
	status_t Invoke(BMessage* message = NULL) override;
	/// As Invoke(), with "be:channel_value" (int32) and "be:channel_changed" (bool) for each of the channels,
	/// all from \a fromChannel on for a count below 0. \a _mask: which have changed; null for all.
	virtual status_t InvokeChannel(BMessage* message = NULL, int32 fromChannel = 0,
		int32 channelCount = -1, const bool* _mask = NULL);

	/// Sent while the user changes values; the control takes it over.
	virtual void SetModificationMessage(BMessage* message);
	BMessage* ModificationMessage() const;

	virtual status_t SetCurrentChannel(int32 index);
	int32 CurrentChannel() const;
	virtual int32 CountChannels() const;
	virtual int32 MaxChannelCount() const = 0;
	/// B_BAD_VALUE below 0 or beyond MaxChannelCount(). The channels that stay keep what they have.
	virtual status_t SetChannelCount(int32 count);

	/// Of the current channel. Brought into its limits, as all values.
	void SetValue(int32 value) override;
	/// 0 for a channel that is not there.
	int32 ValueFor(int32 channel) const;
	/// Returns how many were copied: as many of those asked for as there are.
	virtual int32 GetValue(int32* _values, int32 fromChannel, int32 channelCount) const;
	status_t SetValueFor(int32 channel, int32 value);
	status_t SetAllValue(int32 values);

	/// B_BAD_VALUE when a lower limit is greater than the upper one. Values are brought into the new limits.
	status_t SetLimitsFor(int32 channel, int32 minimum, int32 maximum);
	status_t GetLimitsFor(int32 channel, int32* _minimum, int32* _maximum) const;
	virtual status_t SetLimitsFor(
		int32 fromChannel, int32 channelCount, const int32* minima, const int32* maxima);
	virtual status_t GetLimitsFor(
		int32 fromChannel, int32 channelCount, int32* minima, int32* maxima) const;
	/// Of all channels.
	status_t SetLimits(int32 minimum, int32 maximum);
	/// Of the current channel.
	status_t GetLimits(int32* _minimum, int32* _maximum) const;
	/// Whether the control is meant for channels with limits of their own.
	virtual bool SupportsIndividualLimits() const = 0;

	/// Copied; null for none. Those of the control, and those of single channels.
	virtual status_t SetLimitLabels(const char* minLabel, const char* maxLabel);
	const char* MinLimitLabel() const;
	const char* MaxLimitLabel() const;
	virtual status_t SetLimitLabelsFor(int32 channel, const char* minLabel, const char* maxLabel);
	virtual status_t SetLimitLabelsFor(
		int32 fromChannel, int32 channelCount, const char* minLabel, const char* maxLabel);
	const char* MinLimitLabelFor(int32 channel) const;
	const char* MaxLimitLabelFor(int32 channel) const;

protected:
	/// CountChannels() numbers each, valid until the count changes.
	int32* const& MinLimitList() const;
	int32* const& MaxLimitList() const;
	int32* const& ValueList() const;

private:
	bool HasChannels(int32 from, int32 count) const;
	void Resize(int32 count);
	void KeepValue(int32 channel, int32 value);
	void Redraw();

	BMessage* fModificationMessage;
	int32 fCurrentChannel;
	std::vector<int32> fMinima;
	std::vector<int32> fMaxima;
	std::vector<int32> fValues;
	int32* fMinimumList;
	int32* fMaximumList;
	int32* fValueList;
	BString fMinLabel;
	BString fMaxLabel;
	std::vector<BString> fMinLabels;
	std::vector<BString> fMaxLabels;
};

#endif // _CHANNEL_CONTROL_H
