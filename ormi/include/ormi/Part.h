// SPDX-License-Identifier: MIT
// A view on a form that calls the form's event handlers.

#pragma once

#include <utility>

#include <Message.h>
#include <View.h>

#include <ormi/views/FrameKeeper.h>

/// What a form knows of its view and its components.
class TFormPart {
public:
	/// The form is shown for the first time: the part was attached before it had handlers.
	virtual void FormAttached() = 0;
	virtual void FormAllAttached() = 0;

	/// The part, or a view in it that is of no other part, has the form's focus or lost it. Tells nothing new
	/// when that is so already.
	virtual void FormFocusChanged(bool hasFocus) = 0;

	/// \a inner, a view in the part that is of no other part, got \a message.
	virtual void FormInnerDispatched(const BView* inner, const BMessage* message) = 0;

protected:
	~TFormPart() = default;
};

/// A \a View whose events call member functions of the form of class \a Form.
///
/// An event is a pointer to such a member, null when the form has no handler for it. Handlers run in the
/// window's thread with the window locked, after what the view itself does, and only while the form is
/// open. Keys, mouse and focus of the views that the view is made of are its own.
template <class Form, class View>
class TPart : public View, public TFormPart {
public:
	typedef void (Form::*Event)();

	Event OnAllAttached = nullptr;
	Event OnAttachedToWindow = nullptr;
	Event OnAllDetached = nullptr;
	void (Form::*OnDraw)(BRect updateRect) = nullptr;
	void (Form::*OnFrameMoved)(BPoint parentPoint) = nullptr;
	void (Form::*OnFrameResized)(float width, float height) = nullptr;
	Event OnKeyDown = nullptr;
	Event OnKeyUp = nullptr;
	Event OnGotFocus = nullptr;
	Event OnLostFocus = nullptr;
	void (Form::*OnMouseUp)(BPoint point) = nullptr;
	void (Form::*OnMouseDown)(BPoint point) = nullptr;
	void (Form::*OnMouseMoved)(BPoint point, uint32 transit, const BMessage* message) = nullptr;

	/// \a form: the form that the part lies on; it outlives the part. The other arguments are those of
	/// \a View's constructor.
	template <class... Arguments>
	explicit TPart(Form* form, Arguments&&... arguments)
		: View(std::forward<Arguments>(arguments)...),
		  fForm(form),
		  fNeededFlags((this->Flags() & ~(B_WILL_DRAW | B_NAVIGABLE)) | B_FRAME_EVENTS)
	{
		View::SetFlags(this->Flags() | B_FRAME_EVENTS);
	}

	Form* ParentForm() const { return fForm; }

	/// Shows or hides the part; calls with the present state do nothing.
	void SetVisible(bool visible)
	{
		if (visible == !this->IsHidden(this))
			return;
		if (visible)
			this->Show();
		else
			this->Hide();
	}

	/// Sets the flags that a designer chooses; those that the part's events and the view need stay.
	void SetFlags(uint32 flags) override { View::SetFlags(flags | fNeededFlags); }

	/// The frame stays as it was designed, however large the font is.
	void SetFont(const BFont* font, uint32 mask = B_FONT_ALL) override
	{
		Ormi::FrameKeeper keeper(this);
		View::SetFont(font, mask);
	}

	void FormAttached() override
	{
		fToldFrame = this->Frame();
		Call(OnAttachedToWindow);
	}

	void FormAllAttached() override { Call(OnAllAttached); }

	void FormFocusChanged(bool hasFocus) override
	{
		if (hasFocus == fHasFocus)
			return;
		fHasFocus = hasFocus;
		Call(hasFocus ? OnGotFocus : OnLostFocus);
	}

	void FormInnerDispatched(const BView* inner, const BMessage* message) override
	{
		switch (message->what) {
			case B_KEY_DOWN:
				Call(OnKeyDown);
				break;

			case B_KEY_UP:
				Call(OnKeyUp);
				break;

			case B_MOUSE_DOWN:
				if (OnMouseDown != nullptr)
					Call(OnMouseDown, PointOf(inner, message));
				break;

			case B_MOUSE_UP:
				if (OnMouseUp != nullptr)
					Call(OnMouseUp, PointOf(inner, message));
				break;

			case B_MOUSE_MOVED:
				if (OnMouseMoved != nullptr)
					InnerMouseMoved(PointOf(inner, message), message);
				break;

			default:
				break;
		}
	}

	void AllAttached() override
	{
		View::AllAttached();
		Call(OnAllAttached);
	}

	void AttachedToWindow() override
	{
		{
			Ormi::FrameKeeper keeper(this);
			View::AttachedToWindow();
		}
		fToldFrame = this->Frame();
		Call(OnAttachedToWindow);
	}

	void AllDetached() override
	{
		View::AllDetached();
		fHasFocus = false;
		Call(OnAllDetached);
	}

	void Draw(BRect updateRect) override
	{
		View::Draw(updateRect);
		Call(OnDraw, updateRect);
	}

	void FrameMoved(BPoint parentPoint) override
	{
		View::FrameMoved(parentPoint);
		const BPoint place = this->Frame().LeftTop();
		if (place == fToldFrame.LeftTop())
			return;
		fToldFrame.OffsetTo(place);
		Call(OnFrameMoved, place);
	}

	void FrameResized(float width, float height) override
	{
		View::FrameResized(width, height);
		// A view that sized itself and got its frame back tells of both.
		const BRect frame = this->Frame();
		if (frame.Size() == fToldFrame.Size())
			return;
		fToldFrame = BRect(fToldFrame.LeftTop(), frame.Size());
		Call(OnFrameResized, frame.Width(), frame.Height());
	}

	void KeyDown(const char* bytes, int32 numBytes) override
	{
		View::KeyDown(bytes, numBytes);
		Call(OnKeyDown);
	}

	void KeyUp(const char* bytes, int32 numBytes) override
	{
		View::KeyUp(bytes, numBytes);
		Call(OnKeyUp);
	}

	void MouseUp(BPoint point) override
	{
		View::MouseUp(point);
		Call(OnMouseUp, point);
	}

	void MouseDown(BPoint point) override
	{
		View::MouseDown(point);
		Call(OnMouseDown, point);
	}

	void MouseMoved(BPoint point, uint32 transit, const BMessage* message) override
	{
		View::MouseMoved(point, transit, message);
		Call(OnMouseMoved, point, transit, message);
	}

protected:
	/// Calls the handler of an event, if the form is open and has one.
	template <class... Parameters, class... Arguments>
	void Call(void (Form::*handler)(Parameters...), Arguments... arguments)
	{
		if (handler != nullptr && fForm->IsOpen())
			(fForm->*handler)(arguments...);
	}

private:
	/// Where the mouse is that \a inner got \a message of.
	BPoint PointOf(const BView* inner, const BMessage* message) const
	{
		BPoint point;
		message->FindPoint("be:view_where", &point);
		return this->ConvertFromScreen(inner->ConvertToScreen(point));
	}

	void InnerMouseMoved(BPoint point, const BMessage* message)
	{
		int32 transit = B_INSIDE_VIEW;
		message->FindInt32("be:transit", &transit);
		BMessage dragged;
		const bool isDrag = message->FindMessage("be:drag_message", &dragged) == B_OK;
		Call(OnMouseMoved, point, static_cast<uint32>(transit),
			static_cast<const BMessage*>(isDrag ? &dragged : nullptr));
	}

	Form* fForm;
	uint32 fNeededFlags;
	BRect fToldFrame;
	bool fHasFocus = false;
};

/// A part that is no control, with an event for a press and release of the mouse inside it.
template <class Form, class View>
class TClickPart : public TPart<Form, View> {
public:
	typename TPart<Form, View>::Event OnClick = nullptr;

	using TPart<Form, View>::TPart;

	void MouseDown(BPoint point) override
	{
		TPart<Form, View>::MouseDown(point);
		fPressed = true;
	}

	void MouseUp(BPoint point) override
	{
		TPart<Form, View>::MouseUp(point);
		if (fPressed && this->Bounds().Contains(point))
			this->Call(OnClick);
		fPressed = false;
	}

	void MouseMoved(BPoint point, uint32 transit, const BMessage* message) override
	{
		TPart<Form, View>::MouseMoved(point, transit, message);
		// The button may be released where no message tells of it.
		if (transit == B_EXITED_VIEW)
			fPressed = false;
	}

private:
	bool fPressed = false;
};

/// A part that invokes itself when its user pressed, changed or chose something: its class says which event
/// that is.
template <class Form, class View>
class TInvokePart : public TPart<Form, View> {
public:
	using TPart<Form, View>::TPart;

	status_t Invoke(BMessage* message = nullptr) override
	{
		const status_t status = View::Invoke(message);
		this->Call(EventOf(message));
		return status;
	}

protected:
	/// The handler of Invoke() with \a message, which may be null. Controls send both their messages by it.
	virtual typename TPart<Form, View>::Event EventOf(const BMessage* message) const = 0;
};
