// SPDX-License-Identifier: MIT
// The base of views with a label and a value that send a message.
#ifndef _CONTROL_H
#define _CONTROL_H

#include <Invoker.h>
#include <String.h>
#include <View.h>

namespace BPrivate {
class ClickTracking;
class ThumbTracking;
} // namespace BPrivate

enum {
	B_CONTROL_OFF = 0,
	B_CONTROL_ON = 1,
	B_CONTROL_PARTIALLY_ON = 2,
};

/// A view with a label, a value, an enabled state and a message that it sends when the user works it.
///
/// When it is attached without a target, its window becomes the target. Lock the window as for any view.
class BControl : public BView, public BInvoker {
public:
	/// Takes over \a message, which may be null.
	BControl(BRect frame, const char* name, const char* label, BMessage* message,
		uint32 resizingMode, uint32 flags);
	BControl(const char* name, const char* label, BMessage* message, uint32 flags);
	BControl(BMessage* archive);
	virtual ~BControl();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void WindowActivated(bool active) override;
	void AttachedToWindow() override;
	void DetachedFromWindow() override;
	void AllAttached() override;
	void AllDetached() override;
	void MessageReceived(BMessage* message) override;
	void MakeFocus(bool focus = true) override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void MouseDown(BPoint where) override;
	void MouseUp(BPoint where) override;
	void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage) override;
	void GetPreferredSize(float* _width, float* _height) override;
	void ResizeToPreferred() override;

	/// Copied; null and "" stand for no label. Redraws, and never resizes.
	virtual void SetLabel(const char* string);
	/// Null without a label.
	const char* Label() const;

	/// Changes the state and redraws; sends nothing.
	virtual void SetValue(int32 value);
	int32 Value() const;

	/// A disabled control takes no input and is left out of keyboard navigation.
	virtual void SetEnabled(bool enabled);
	bool IsEnabled() const;

	/// Sends a copy of \a message, null for the own one, with "when", "source" (this control),
	/// "be:value" and "be:sender" added. B_BAD_VALUE when there is no message.
	status_t Invoke(BMessage* message = NULL) override;

protected:
	/// True while MakeFocus() marks the control for being drawn with its new focus.
	bool IsFocusChanging() const;
	/// Whether a mouse button is held on the control.
	bool IsTracking() const;
	void SetTracking(bool state);
	void SetValueNoUpdate(int32 value);

private:
	friend class BPrivate::ClickTracking;
	friend class BPrivate::ThumbTracking;

	BString fLabel;
	int32 fValue;
	bool fEnabled;
	bool fFocusChanging;
	bool fTracking;
	bool fWantsNavigation;
};

#endif // _CONTROL_H
