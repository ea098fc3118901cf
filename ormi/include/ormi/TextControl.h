// SPDX-License-Identifier: MIT
// The text field of generated programs.

#pragma once

#include <Message.h>
#include <TextControl.h>

#include <ormi/Part.h>

/// A text field. OnChange: the text changed, by the user or by program. OnEnter: Enter was pressed, or
/// the focus left, after a change.
template <class Form>
class TTextControl : public TInvokePart<Form, BTextControl> {
public:
	typedef TInvokePart<Form, BTextControl> Part;

	typename Part::Event OnChange = nullptr;
	typename Part::Event OnEnter = nullptr;

	TTextControl(Form* form, BRect frame, const char* name, const char* label, const char* text)
		: Part(form, frame, name, label, text, static_cast<BMessage*>(nullptr))
	{
		if (*label == '\0')
			this->SetDivider(0);
		// It made itself as high as its font needs.
		this->ResizeTo(frame.Width(), frame.Height());
		this->SetMessage(new BMessage);
		this->SetModificationMessage(new BMessage);
	}

protected:
	typename Part::Event EventOf(const BMessage* message) const override
	{
		return message != nullptr && message == this->ModificationMessage() ? OnChange : OnEnter;
	}
};
