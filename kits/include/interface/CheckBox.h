// SPDX-License-Identifier: MIT
// A box that is ticked or not.
#ifndef _CHECK_BOX_H
#define _CHECK_BOX_H

#include <memory>

#include <Control.h>

/// A check box: a click toggles its value between 0 and 1 and sends its message.
class BCheckBox : public BControl {
public:
	BCheckBox(BRect frame, const char* name, const char* label, BMessage* message,
		uint32 resizingMode = B_FOLLOW_LEFT_TOP, uint32 flags = B_WILL_DRAW | B_NAVIGABLE);
	BCheckBox(const char* name, const char* label, BMessage* message,
		uint32 flags = B_WILL_DRAW | B_NAVIGABLE);
	BCheckBox(const char* label, BMessage* message = NULL);
	BCheckBox(BMessage* archive);
	virtual ~BCheckBox();

	static BArchivable* Instantiate(BMessage* archive);

	void Draw(BRect updateRect) override;
	void DetachedFromWindow() override;
	void MouseDown(BPoint where) override;
	void MouseUp(BPoint where) override;
	void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage) override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void GetPreferredSize(float* _width, float* _height) override;

	/// 0, 1, or 2 for partly on.
	void SetValue(int32 value) override;

private:
	void Toggle();

	std::unique_ptr<BPrivate::ClickTracking> fTracking;
};

#endif // _CHECK_BOX_H
