// SPDX-License-Identifier: MIT
// The text view inside a text control.
#ifndef KITS_INTERFACE_TEXT_INPUT_H
#define KITS_INTERFACE_TEXT_INPUT_H

#include <TextView.h>

class BTextControl;

namespace BPrivate {

/// One line of text that tells its control what happens to it.
class TextInput : public BTextView {
public:
	TextInput(BTextControl* control, BRect frame, uint32 flags);

	void DetachedFromWindow() override;
	void MouseDown(BPoint where) override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void MakeFocus(bool focus = true) override;
	bool AcceptsDrop(const BMessage* message) override;

protected:
	/// Line breaks become blanks.
	void InsertText(
		const char* text, int32 length, int32 offset, const text_run_array* runs) override;

private:
	void ChangeEnded() override;
	rgb_color DrawnColor(rgb_color color) const override;

	BTextControl* fControl;
};

} // namespace BPrivate

#endif // KITS_INTERFACE_TEXT_INPUT_H
