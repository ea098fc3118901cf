// SPDX-License-Identifier: MIT
// The text field of generated programs.

#pragma once

#include <Message.h>
#include <TextControl.h>
#include <TextView.h>

#include <ormi/Part.h>

/// A text field. OnChange: the text changed, by the user or by program. OnEnter: Enter was pressed, or
/// the focus left, after a change.
///
/// Keys and mouse go to the field's text view; its events are those of the text field all the same.
template <class Form>
class TTextControl : public TPart<Form, BTextControl> {
public:
	typedef TPart<Form, BTextControl> Part;

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

	/// The control sends itself its two messages through this operation.
	status_t Invoke(BMessage* message = nullptr) override
	{
		const status_t status = BTextControl::Invoke(message);
		const bool changed = message != nullptr && message == this->ModificationMessage();
		this->Call(changed ? OnChange : OnEnter);
		return status;
	}

	void FormChildDispatched(const BView* child, const BMessage* message) override
	{
		if (child != this->TextView())
			return;
		BPoint point;
		message->FindPoint("be:view_where", &point);
		this->TextView()->ConvertToParent(&point);
		switch (message->what) {
			case B_KEY_DOWN:
				this->Call(this->OnKeyDown);
				break;

			case B_KEY_UP:
				this->Call(this->OnKeyUp);
				break;

			case B_MOUSE_DOWN:
				this->Call(this->OnMouseDown, point);
				break;

			case B_MOUSE_UP:
				this->Call(this->OnMouseUp, point);
				break;

			case B_MOUSE_MOVED:
			{
				int32 transit = B_INSIDE_VIEW;
				message->FindInt32("be:transit", &transit);
				BMessage dragged;
				const bool isDrag = message->FindMessage("be:drag_message", &dragged) == B_OK;
				this->Call(this->OnMouseMoved, point, static_cast<uint32>(transit),
					static_cast<const BMessage*>(isDrag ? &dragged : nullptr));
				break;
			}

			default:
				break;
		}
	}

protected:
	const BView* FocusView() const override { return this->TextView(); }
};
