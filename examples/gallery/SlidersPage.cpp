// SPDX-License-Identifier: MIT
// Sliders, horizontal and vertical.

#include <ChannelSlider.h>
#include <Message.h>
#include <Slider.h>
#include <String.h>

#include "Pages.h"

namespace {

/// Shows its value.
class PercentSlider : public BSlider {
public:
	PercentSlider(BRect frame, const char* name, orientation posture, thumb_style style)
		: BSlider(frame, name, "Volume", new BMessage('slid'), 0, 100, posture, style)
	{
		SetLimitLabels("silent", "loud");
	}

	const char* UpdateText() const override
	{
		fText = "";
		fText << Value() << " %";
		return fText.String();
	}

private:
	mutable BString fText;
};


void
AddHorizontal(BView* page)
{
	BSlider* block =
		new PercentSlider(BRect(10, 8, 250, 60), "slBlock", B_HORIZONTAL, B_BLOCK_THUMB);
	block->SetHashMarks(B_HASH_MARKS_BOTH);
	block->SetHashMarkCount(11);
	block->SetValue(30);

	BSlider* triangle =
		new PercentSlider(BRect(10, 78, 250, 130), "slTriangle", B_HORIZONTAL, B_TRIANGLE_THUMB);
	triangle->SetHashMarks(B_HASH_MARKS_BOTTOM);
	triangle->SetHashMarkCount(5);
	triangle->UseFillColor(true);
	triangle->SetValue(60);

	BSlider* thick = new BSlider(
		BRect(10, 148, 250, 190), "slThick", "A thick bar", new BMessage('slid'), -10, 10);
	thick->SetBarThickness(12);
	thick->SetBarColor(make_color(240, 220, 150));
	const rgb_color fill = make_color(200, 90, 60);
	thick->UseFillColor(true, &fill);
	thick->SetValue(4);

	BSlider* disabled =
		new BSlider(BRect(10, 208, 250, 250), "slDisabled", "Disabled", nullptr, 0, 10);
	disabled->SetLimitLabels("0", "10");
	disabled->UseFillColor(true);
	disabled->SetValue(7);
	disabled->SetEnabled(false);

	for (BSlider* slider : {block, triangle, thick, disabled}) {
		page->AddChild(slider);
		slider->ResizeToPreferred();
	}
}


void
AddVertical(BView* page)
{
	BSlider* block =
		new PercentSlider(BRect(290, 8, 350, 268), "slUpright", B_VERTICAL, B_BLOCK_THUMB);
	block->SetHashMarks(B_HASH_MARKS_LEFT);
	block->SetHashMarkCount(6);
	block->SetValue(80);

	BSlider* triangle = new PercentSlider(
		BRect(370, 8, 430, 268), "slUprightTriangle", B_VERTICAL, B_TRIANGLE_THUMB);
	triangle->SetHashMarks(B_HASH_MARKS_RIGHT);
	triangle->SetHashMarkCount(3);
	triangle->UseFillColor(true);
	triangle->SetValue(40);
	for (BSlider* slider : {block, triangle})
		page->AddChild(slider);
}

/// Six channels at different places.
BChannelSlider*
MakeChannels(BRect frame, const char* name, const char* label, orientation posture)
{
	BChannelSlider* slider = new BChannelSlider(frame, name, label, new BMessage('slid'), posture,
		6, B_FOLLOW_LEFT_TOP, B_WILL_DRAW | B_NAVIGABLE);
	slider->SetLimits(0, 100);
	for (int32 i = 0; i < slider->CountChannels(); i++)
		slider->SetValueFor(i, 20 + 13 * i);
	slider->SetCurrentChannel(2);
	return slider;
}


void
AddChannels(BView* page)
{
	BChannelSlider* upright =
		MakeChannels(BRect(440, 8, 575, 140), "slChannels", "Channels", B_VERTICAL);
	upright->SetLimitLabels("soft", "loud");
	BChannelSlider* named = MakeChannels(BRect(440, 152, 575, 268), "slNamed", NULL, B_VERTICAL);
	for (int32 i = 0; i < named->CountChannels(); i++) {
		const char name[] = {static_cast<char>('a' + i), '\0'};
		named->SetLimitLabelsFor(i, name, NULL);
	}
	named->SetEnabled(false);
	page->AddChild(upright);
	page->AddChild(named);
}

} // namespace


BView*
MakeSlidersPage(BRect frame)
{
	BView* page = MakePage(frame, "Sliders");
	AddHorizontal(page);
	AddVertical(page);
	AddChannels(page);
	return page;
}
