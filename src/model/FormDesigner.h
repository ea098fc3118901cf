// SPDX-License-Identifier: MIT
// The designer of a form, as its components and the palette entries see it.

#pragma once

#include "model/ComponentOwner.h"

class BPoint;
class BRect;
class BView;

/// The designer of one form: it lists every component of the form and hears of what happens to them.
///
/// The design window and its design surface are both one; they stand for the same form. The operations
/// do nothing, and answer false or null, until they are overridden. Their order is a binary interface.
/// Use it in the thread of the form's window.
class TFormDesigner : public TComponentOwner {
public:
	TFormDesigner();

	virtual void DesignFormShown(bool shown);
	virtual void DesignFormActivated(bool active);

	virtual void ComponentSelected(TComponent* component);

	/// \a point: the new left-top corner of the component's view, in its parent's coordinates.
	virtual void ComponentMoved(TComponent* component, BPoint point);

	/// \a width, \a height: right minus left and bottom minus top of the component's view.
	virtual void ComponentResized(TComponent* component, float width, float height);

	/// Whether a palette entry waits to be dropped.
	virtual bool IsDropWaiting();

	/// Lets the waiting entry make its component in \a frame (coordinates of \a parent), names it and
	/// adds it to the form. Null when no entry waits or the entry makes none.
	virtual TComponent* CreateComponent(BView* parent, BRect frame);

	/// The waiting entry is used up.
	virtual void DoneDroppingComponent();

	/// Records the view on which the form is designed; not owned.
	virtual void SetDTFormView(BView* view);

	/// Makes \a component, with what is inside it, one of this form's when it is another form's so far: it has no
	/// owner and its view no parent then. False when it cannot be had. True here.
	virtual bool AdoptComponent(TComponent* component);

	/// \a component was marked as changed. Nothing here.
	virtual void ComponentModified(TComponent* component);

	BView* DTFormView() const { return fDTFormView; }

	/// Whether \a owner is the form itself, seen as its window or as its design surface, and not a
	/// component on it.
	bool IsForm(const TComponentOwner* owner) const;

private:
	BView* fDTFormView;
};
