// SPDX-License-Identifier: MIT
// A button that shows pictures.
#ifndef _PICTURE_BUTTON_H
#define _PICTURE_BUTTON_H

#include <memory>

#include <Control.h>
#include <Picture.h>

enum picture_button_behavior {
	B_ONE_STATE_BUTTON = 0,
	B_TWO_STATE_BUTTON = 1,
};

/// A button with a picture for each of its states, drawn at (0, 0).
///
/// A button with one state has the value 1 while it is pressed; one with two toggles its value at each
/// click. Pictures are copied; without a picture for the disabled state the enabled one's is shown faded.
class BPictureButton : public BControl {
public:
	BPictureButton(BRect frame, const char* name, BPicture* off, BPicture* on, BMessage* message,
		uint32 behavior = B_ONE_STATE_BUTTON, uint32 resizingMode = B_FOLLOW_LEFT_TOP,
		uint32 flags = B_WILL_DRAW | B_NAVIGABLE);
	BPictureButton(BMessage* archive);
	virtual ~BPictureButton();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void Draw(BRect updateRect) override;
	void DetachedFromWindow() override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void MouseDown(BPoint where) override;
	void MouseUp(BPoint where) override;
	void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage) override;
	status_t Invoke(BMessage* message = NULL) override;

	/// Copied; null takes the picture away.
	virtual void SetEnabledOn(BPicture* picture);
	virtual void SetEnabledOff(BPicture* picture);
	virtual void SetDisabledOn(BPicture* picture);
	virtual void SetDisabledOff(BPicture* picture);
	/// The button's own; null for none.
	BPicture* EnabledOn() const;
	BPicture* EnabledOff() const;
	BPicture* DisabledOn() const;
	BPicture* DisabledOff() const;

	/// B_ONE_STATE_BUTTON or B_TWO_STATE_BUTTON.
	virtual void SetBehavior(uint32 behavior);
	uint32 Behavior() const;

private:
	void SetPicture(std::unique_ptr<BPicture>* place, BPicture* picture);
	int32 PressedValue() const;

	std::unique_ptr<BPicture> fEnabledOff;
	std::unique_ptr<BPicture> fEnabledOn;
	std::unique_ptr<BPicture> fDisabledOff;
	std::unique_ptr<BPicture> fDisabledOn;
	uint32 fBehavior;
	int32 fValueBefore;
};

#endif // _PICTURE_BUTTON_H
