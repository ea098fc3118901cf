// SPDX-License-Identifier: MIT
// A push button.
#ifndef _BUTTON_H
#define _BUTTON_H

#include <Control.h>

/// A button: its value is 1 while it is pressed, and releasing it inside sends its message.
class BButton : public BControl {
public:
	BButton(BRect frame, const char* name, const char* label, BMessage* message,
		uint32 resizingMode = B_FOLLOW_LEFT_TOP,
		uint32 flags = B_WILL_DRAW | B_NAVIGABLE | B_FULL_UPDATE_ON_RESIZE);
	BButton(const char* name, const char* label, BMessage* message,
		uint32 flags = B_WILL_DRAW | B_NAVIGABLE | B_FULL_UPDATE_ON_RESIZE);
	BButton(const char* label, BMessage* message = NULL);
	BButton(BMessage* archive);
	virtual ~BButton();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void Draw(BRect updateRect) override;
	void MouseDown(BPoint where) override;
	void MouseUp(BPoint where) override;
	void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage) override;
	void AttachedToWindow() override;
	void DetachedFromWindow() override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void GetPreferredSize(float* _width, float* _height) override;
	status_t Invoke(BMessage* message = NULL) override;

	/// Makes it the window's default button, which Enter presses; the frame grows by 3 pixels on each
	/// side for the mark, and shrinks back. A window has one: the one before stops being it.
	virtual void MakeDefault(bool flag);
	bool IsDefault() const;

	void SetLabel(const char* string) override;

private:
	friend class BWindow;

	bool fDefault;
};

#endif // _BUTTON_H
