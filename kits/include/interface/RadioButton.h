// SPDX-License-Identifier: MIT
// A choice of which only one in its group is on.
#ifndef _RADIO_BUTTON_H
#define _RADIO_BUTTON_H

#include <memory>

#include <Control.h>

/// A radio button: a click turns it on, the others of its group off, and sends its message.
///
/// The radio buttons that are children of one view are a group.
class BRadioButton : public BControl {
public:
	BRadioButton(BRect frame, const char* name, const char* label, BMessage* message,
		uint32 resizingMode = B_FOLLOW_LEFT_TOP, uint32 flags = B_WILL_DRAW | B_NAVIGABLE);
	BRadioButton(const char* name, const char* label, BMessage* message,
		uint32 flags = B_WILL_DRAW | B_NAVIGABLE);
	BRadioButton(const char* label, BMessage* message);
	BRadioButton(BMessage* archive);
	virtual ~BRadioButton();

	static BArchivable* Instantiate(BMessage* archive);

	void Draw(BRect updateRect) override;
	void DetachedFromWindow() override;
	void MouseDown(BPoint where) override;
	void MouseUp(BPoint where) override;
	void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage) override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void GetPreferredSize(float* _width, float* _height) override;

	/// 1 sets every other radio button of the group to 0; 0 touches no other.
	void SetValue(int32 value) override;

private:
	void Choose();

	std::unique_ptr<BPrivate::ClickTracking> fTracking;
};

#endif // _RADIO_BUTTON_H
