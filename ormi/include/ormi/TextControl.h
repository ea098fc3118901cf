// SPDX-License-Identifier: MIT
// The text field of generated programs.

#pragma once

#include <MessageFilter.h>
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
		this->SetMessage(new BMessage);
		this->SetModificationMessage(new BMessage);
		this->TextView()->AddFilter(new InputFilter(this));
	}

	/// The control sends itself its two messages through this operation.
	status_t Invoke(BMessage* message = nullptr) override
	{
		const status_t status = BTextControl::Invoke(message);
		const bool changed = message != nullptr && message == this->ModificationMessage();
		this->Call(changed ? OnChange : OnEnter);
		return status;
	}

	/// The mark of the focus is drawn anew when the focus comes or goes, which nothing else tells.
	void Draw(BRect updateRect) override
	{
		Part::Draw(updateRect);
		const bool focused = this->TextView()->IsFocus();
		if (focused == fFocused)
			return;
		fFocused = focused;
		this->Call(focused ? this->OnGotFocus : this->OnLostFocus);
	}

private:
	/// Looks at the input of the text view before the text view does.
	class InputFilter : public BMessageFilter {
	public:
		explicit InputFilter(TTextControl* control)
			: BMessageFilter(B_ANY_DELIVERY, B_ANY_SOURCE),
			  fControl(control)
		{
		}

		filter_result Filter(BMessage* message, BHandler**) override
		{
			fControl->InputReceived(message);
			return B_DISPATCH_MESSAGE;
		}

	private:
		TTextControl* fControl;
	};

	void InputReceived(const BMessage* message)
	{
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
				this->Call(this->OnMouseMoved, point, static_cast<uint32>(transit),
					static_cast<const BMessage*>(nullptr));
				break;
			}

			default:
				break;
		}
	}

	bool fFocused = false;
};
