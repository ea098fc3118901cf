// SPDX-License-Identifier: MIT
// A platform view that shows a component on the design surface.

#pragma once

#include <utility>

#include <Font.h>
#include <InterfaceDefs.h>
#include <Message.h>
#include <View.h>

#include "model/Component.h"

/// Gives \a view the colours and the font that \a component has as properties, and that the program
/// will have: when it gets into a window, a view takes its parent's.
void ShowLook(TComponent* component, BView* view);

/// \a font, but one of the system's three in the size that \a component has as a property: the program
/// sets the size after the font.
BFont InDesignedSize(TComponent* component, const BFont* font);

/// Gives \a view \a frame (in its parent's coordinates) back, if it sized itself by its font.
void RestoreFrame(BView* view, BRect frame);

/// Takes \a view and what is in it out of the keyboard's reach.
void TakeFromKeyboard(BView* view);

/// Offers a message of the design surface to \a component, whose view got it. True when that was all it needs.
///
/// What is dropped on a component that holds no others goes to the view beneath.
bool OfferDesignMessage(TComponent* component, BMessage* message);

/// A view of class \a View that looks like itself but does not act like it: what the mouse does to it
/// goes to its component, and it never takes the keyboard. Its frame is what the user drew: it does not
/// size itself. The selection is drawn over what is in it. Component libraries make their components' views with it.
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
		this->SetFlags(this->Flags() | B_WILL_DRAW | B_DRAW_ON_CHILDREN);
	}

	void AttachedToWindow() override
	{
		const BRect frame = this->Frame();
		View::AttachedToWindow();
		RestoreFrame(this, frame);
		ShowLook(fComponent, this);
	}

	void AllAttached() override
	{
		View::AllAttached();
		TakeFromKeyboard(this);
	}

	void SetFont(const BFont* font, uint32 mask = B_FONT_ALL) override
	{
		const BRect frame = this->Frame();
		const BFont sized = InDesignedSize(fComponent, font);
		View::SetFont(&sized, mask);
		RestoreFrame(this, frame);
	}

	void DrawAfterChildren(BRect updateRect) override
	{
		View::DrawAfterChildren(updateRect);
		fComponent->DesignerDrawSelection();
	}

	void MouseDown(BPoint where) override
	{
		fComponent->DesignerMouseDown(where, this->Bounds(), this);
	}

	void MouseUp(BPoint) override {}
	void MouseMoved(BPoint, uint32, const BMessage*) override {}
	void KeyDown(const char*, int32) override {}
	void KeyUp(const char*, int32) override {}
	void MakeFocus(bool) override {}

	/// What the view itself would do with a message, such as scrolling or taking a dropped text, it does
	/// in the program only.
	void MessageReceived(BMessage* message) override
	{
		if (message->what == B_MOUSE_WHEEL_CHANGED)
			return;
		if (!OfferDesignMessage(fComponent, message))
			BView::MessageReceived(message); // NOLINT(bugprone-parent-virtual-call): as said above
	}

private:
	TComponent* fComponent;
};

/// An invisible view over a control that has child views of its own: it keeps the mouse from them and
/// hands it to the control's component, and shows over them that the component is selected.
class DesignGlass : public BView {
public:
	/// Covers \a covered, which it is added to.
	DesignGlass(TComponent* component, BView* covered);

	void Draw(BRect updateRect) override;
	void MouseDown(BPoint where) override;
	void MessageReceived(BMessage* message) override;

private:
	TComponent* fComponent;
};
