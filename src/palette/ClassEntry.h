// SPDX-License-Identifier: MIT
// A palette entry for component classes that are all made the same way.

#pragma once

#include <View.h>

#include "model/Component.h"
#include "palette/PaletteEntry.h"

/// Makes components of the class \a Class, which is constructed from its designer and its frame and makes its view.
template <class Class>
class TClassEntry : public TPaletteEntry {
public:
	using TPaletteEntry::TPaletteEntry;

	/// A component whose view is in \a parent; none without \a parent.
	TComponent* CreateComponent(BView* parent, TFormDesigner* designer, BRect frame) override
	{
		if (parent == nullptr)
			return nullptr;
		TComponent* component = new Class(designer, frame);
		parent->AddChild(component->DTView());
		return component;
	}
};
