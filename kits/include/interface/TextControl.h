// SPDX-License-Identifier: MIT
// A labelled field for one line of text.
#ifndef _TEXT_CONTROL_H
#define _TEXT_CONTROL_H

#include <Control.h>

class BTextView;

namespace BPrivate {
class TextInput;
}

/// A label and, from the divider on, a text view of one line that has the keyboard.
///
/// The message is sent when Enter is pressed or the focus leaves, after a change; the modification
/// message at each change of the text, also by program. Its height is what the font needs, whatever the frame says.
class BTextControl : public BControl {
public:
	BTextControl(BRect frame, const char* name, const char* label, const char* initialText,
		BMessage* message, uint32 resizeMask = B_FOLLOW_LEFT_TOP,
		uint32 flags = B_WILL_DRAW | B_NAVIGABLE);
	BTextControl(const char* name, const char* label, const char* initialText, BMessage* message,
		uint32 flags = B_WILL_DRAW | B_NAVIGABLE);
	BTextControl(const char* label, const char* initialText, BMessage* message);
	BTextControl(BMessage* archive);
	virtual ~BTextControl();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void AttachedToWindow() override;
	void Draw(BRect updateRect) override;
	void MouseDown(BPoint where) override;
	void FrameResized(float newWidth, float newHeight) override;
	void WindowActivated(bool active) override;
	void GetPreferredSize(float* _width, float* _height) override;
	void SetFont(const BFont* font, uint32 mask = B_FONT_ALL) override;

	/// Null is the empty text.
	virtual void SetText(const char* text);
	/// Valid until the text changes.
	const char* Text() const;
	int32 TextLength() const;
	BTextView* TextView() const;

	/// Takes over the message.
	virtual void SetModificationMessage(BMessage* message);
	BMessage* ModificationMessage() const;

	virtual void SetAlignment(alignment label, alignment text);
	void GetAlignment(alignment* _label, alignment* _text) const;

	/// Where the field begins, in view coordinates.
	virtual void SetDivider(float position);
	float Divider() const;

	/// Gives the focus to the text view and selects all.
	void MakeFocus(bool focus = true) override;
	void SetEnabled(bool enable) override;
	/// B_NAVIGABLE goes to the text view.
	void SetFlags(uint32 flags) override;

	status_t Invoke(BMessage* message = NULL) override;

private:
	friend class BPrivate::TextInput;

	void Build(const char* text);
	void LayOutField();
	float NeededHeight() const;
	void UpdateInput();

	// What the text view tells.
	void InputChanged();
	void InputCommitted();
	void InputFocusChanged(bool focused);
	void ForgetChange();

	BPrivate::TextInput* fInput;
	BMessage* fModificationMessage;
	BString fCommittedText;
	alignment fLabelAlignment;
	alignment fTextAlignment;
	float fDivider;
	bool fWantsInputNavigation;
};

#endif // _TEXT_CONTROL_H
