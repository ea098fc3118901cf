// SPDX-License-Identifier: MIT
// A platform view that shows a component on the design surface.

#pragma once

#include <utility>

#include <ComponentKit.h>
#include <View.h>

/// Offers a message of the design surface to \a component, whose view got it. True when that was all it needs.
///
/// What is dropped on a component that holds no others goes to the view beneath.
bool OfferDesignMessage(TComponent* component, BMessage* message);

/// A view of class \a View that looks like itself but does not act like it: what the mouse does to it
/// goes to its component, and it never takes the keyboard.
///
/// It refers to the component only inside its hooks, so the component may be deleted first.
template <class View>
class DesignView : public View {
public:
	/// The arguments after \a component are those of \a View's constructor.
	template <class... Arguments>
	DesignView(TComponent* component, Arguments&&... arguments)
		: View(std::forward<Arguments>(arguments)...),
		  fComponent(component)
	{
	}

	void Draw(BRect updateRect) override
	{
		View::Draw(updateRect);
		fComponent->DesignerDrawSelection();
	}

	void MouseDown(BPoint where) override
	{
		fComponent->DesignerMouseDown(where, this->Bounds(), this);
	}

	void MouseUp(BPoint) override {}
	void MouseMoved(BPoint, uint32, const BMessage*) override {}
	void KeyDown(const char*, int32) override {}
	void MakeFocus(bool) override {}

	void MessageReceived(BMessage* message) override
	{
		if (!OfferDesignMessage(fComponent, message))
			View::MessageReceived(message);
	}

private:
	TComponent* fComponent;
};

/// An invisible view over a control that has child views of its own: it keeps the mouse from them and
/// hands it to the control's component.
class DesignGlass : public BView {
public:
	/// Covers \a covered, which it is added to.
	DesignGlass(TComponent* component, BView* covered);

	void MouseDown(BPoint where) override;
	void MessageReceived(BMessage* message) override;

private:
	TComponent* fComponent;
};
