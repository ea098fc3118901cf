// SPDX-License-Identifier: MIT
// Push buttons, check boxes, radio buttons and picture buttons.

#include <Box.h>
#include <Button.h>
#include <CheckBox.h>
#include <Message.h>
#include <Picture.h>
#include <PictureButton.h>
#include <RadioButton.h>

#include "Pages.h"
#include "PictureMaking.h"

namespace {

const rgb_color kGreen = {60, 180, 75, 255};

/// Makes its buttons when it is attached: pictures are drawn by a view of a window.
class PictureButtonsView : public BView {
public:
	explicit PictureButtonsView(BRect frame)
		: BView(frame, "pictureButtons", B_FOLLOW_LEFT_TOP, B_WILL_DRAW)
	{
	}

	void AttachedToWindow() override
	{
		SetViewColor(Parent()->ViewColor());
		if (CountChildren() > 0)
			return;
		AddLamp(0, "pbOne", B_ONE_STATE_BUTTON, true, false);
		AddLamp(50, "pbTwoOff", B_TWO_STATE_BUTTON, true, false);
		AddLamp(100, "pbTwoOn", B_TWO_STATE_BUTTON, true, true);
		AddLamp(150, "pbDisabled", B_TWO_STATE_BUTTON, false, true);
	}

private:
	void AddLamp(float left, const char* name, uint32 behavior, bool enabled, bool on)
	{
		const auto off = MakeLamp(this, kGreen, false);
		const auto lit = MakeLamp(this, kGreen, true);
		BPictureButton* button = new BPictureButton(BRect(left, 0, left + 31, 31), name, off.get(),
			lit.get(), new BMessage('lamp'), behavior);
		button->SetEnabled(enabled);
		button->SetValue(on ? B_CONTROL_ON : B_CONTROL_OFF);
		AddChild(button);
	}
};


template <typename Control>
Control*
Add(BView* page, Control* control, bool enabled = true, int32 value = B_CONTROL_OFF)
{
	page->AddChild(control);
	control->ResizeToPreferred();
	control->SetValue(value);
	control->SetEnabled(enabled);
	return control;
}


void
AddButtons(BView* page)
{
	AddCaption(page, 10, 8, "Buttons");
	const struct {
		const char* name;
		const char* label;
		float left;
		bool enabled;
		bool isDefault;
	} kButtons[] = {{"btnPlain", "Plain", 10, true, false},
		{"btnDefault", "Default", 110, true, true}, {"btnOff", "Disabled", 210, false, false},
		{"btnLong", "A label that does not fit", 310, true, false}};
	for (const auto& row : kButtons) {
		const BRect frame(row.left, 30, row.left + 80, 55);
		BButton* button =
			Add(page, new BButton(frame, row.name, row.label, new BMessage('push')), row.enabled);
		button->ResizeTo(80, button->Bounds().Height());
		button->MakeDefault(row.isDefault);
	}
}


void
AddCheckBoxes(BView* page)
{
	AddCaption(page, 10, 74, "Check boxes");
	const struct {
		const char* name;
		const char* label;
		int32 value;
		bool enabled;
	} kBoxes[] = {{"cbOff", "Off", 0, true}, {"cbOn", "On", 1, true},
		{"cbPartly", "Partly on", 2, true}, {"cbOffDisabled", "Off, disabled", 0, false},
		{"cbOnDisabled", "On, disabled", 1, false}};
	float top = 96;
	for (const auto& row : kBoxes) {
		Add(page,
			new BCheckBox(BRect(10, top, 160, top + 18), row.name, row.label, new BMessage('tick')),
			row.enabled, row.value);
		top += 22;
	}
}


void
AddRadioButtons(BView* page)
{
	BBox* box = new BBox(BRect(190, 80, 400, 206), "boxRadio");
	box->SetLabel("Radio buttons");
	page->AddChild(box);
	const struct {
		const char* name;
		const char* label;
		bool enabled;
	} kButtons[] = {
		{"rbOne", "One", true}, {"rbTwo", "Two", true}, {"rbThree", "Three, disabled", false}};
	float top = 26;
	for (const auto& row : kButtons) {
		Add(box,
			new BRadioButton(
				BRect(12, top, 180, top + 18), row.name, row.label, new BMessage('dial')),
			row.enabled, row.name == kButtons[1].name ? B_CONTROL_ON : B_CONTROL_OFF);
		top += 22;
	}
	BView* group = MakePage(BRect(12, top, 190, top + 22), "groupDisabled");
	box->AddChild(group);
	Add(group, new BRadioButton(BRect(0, 0, 170, 18), "rbOnDisabled", "On, disabled", nullptr),
		false, B_CONTROL_ON);
}

} // namespace


BView*
MakeButtonsPage(BRect frame)
{
	BView* page = MakePage(frame, "Buttons");
	AddButtons(page);
	AddCheckBoxes(page);
	AddRadioButtons(page);
	AddCaption(page, 10, 222, "Picture buttons: one state, two states (off, on), disabled");
	page->AddChild(new PictureButtonsView(BRect(10, 244, 210, 276)));
	return page;
}
