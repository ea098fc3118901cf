// SPDX-License-Identifier: MIT
// Sliders side by side.
#ifndef _CHANNEL_SLIDER_H
#define _CHANNEL_SLIDER_H

#include <memory>

#include <ChannelControl.h>

/// A thumb for each channel, on bars side by side or, when it is horizontal, one below the other.
///
/// A press takes the channel below the pointer and makes it the current one; with Shift, or with the secondary
/// button, all channels move by the same distance. While they move InvokeChannel() sends the modification
/// message; the release sends the message when a value is another one than before. With the focus, the arrows
/// along the bars change the current channel's value, those across choose another channel, and Home and End go to
/// the limits.
class BChannelSlider : public BChannelControl {
public:
	/// Without an orientation: vertical for an area that is higher than wide.
	BChannelSlider(BRect area, const char* name, const char* label, BMessage* message,
		int32 channels = 1, uint32 resizeMode = B_FOLLOW_LEFT_TOP, uint32 flags = B_WILL_DRAW);
	BChannelSlider(BRect area, const char* name, const char* label, BMessage* message,
		orientation orientation, int32 channels = 1, uint32 resizeMode = B_FOLLOW_LEFT_TOP,
		uint32 flags = B_WILL_DRAW);
	BChannelSlider(const char* name, const char* label, BMessage* message, orientation orientation,
		int32 channels = 1, uint32 flags = B_WILL_DRAW);
	BChannelSlider(BMessage* archive);
	virtual ~BChannelSlider();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void DetachedFromWindow() override;
	void Draw(BRect updateRect) override;
	void MouseDown(BPoint where) override;
	void MouseUp(BPoint where) override;
	void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage) override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void KeyUp(const char* bytes, int32 numBytes) override;
	void SetFont(const BFont* font, uint32 mask = B_FONT_ALL) override;
	void SetEnabled(bool on) override;
	void MakeFocus(bool focus = true) override;
	void GetPreferredSize(float* _width, float* _height) override;

	/// 32.
	int32 MaxChannelCount() const override;
	/// False, though each channel keeps to the limits it was given.
	bool SupportsIndividualLimits() const override;

	virtual orientation Orientation() const;
	void SetOrientation(orientation orientation);

private:
	struct Places;
	class Thumb;

	bool IsVertical() const;
	bool MovesAll() const;
	Places PlacesOf() const;
	BRect BarFrame(int32 channel) const;
	BRect BarFrame(const Places& places, int32 channel) const;
	BRect ThumbFrame(BRect bar, int32 channel) const;
	BPoint ThumbPoint(BRect bar, int32 channel) const;
	int32 ChannelAt(BPoint where) const;
	int32 ValueAt(BPoint where, int32 channel) const;
	float WidestLabel(bool ofMaximum) const;
	void DrawChannel(const Places& places, int32 channel);
	void DrawLabels(const Places& places);
	void DrawLine(const char* text, BPoint middle);

	void ChangeValues(const std::vector<int32>& values);

	orientation fOrientation;
	std::unique_ptr<Thumb> fThumb;
};

#endif // _CHANNEL_SLIDER_H
