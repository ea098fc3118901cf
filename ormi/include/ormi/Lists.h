// SPDX-License-Identifier: MIT
// The lists of generated programs.

#pragma once

#include <ormi/Part.h>
#include <ormi/views/ItemList.h>

/// A list that owns its items. OnSelect: another selection, by the user or by program. OnInvoke: a double
/// click or Enter on the selection.
template <class Form, class List>
class TListPart : public TInvokePart<Form, Ormi::ItemList<List>> {
public:
	typedef TInvokePart<Form, Ormi::ItemList<List>> Part;

	typename Part::Event OnSelect = nullptr;
	typename Part::Event OnInvoke = nullptr;

	TListPart(Form* form, BRect frame, const char* name)
		: Part(form, frame, name)
	{
	}

	void SelectionChanged() override
	{
		Part::SelectionChanged();
		this->Call(OnSelect);
	}

protected:
	/// The list invokes itself without a message, also when it has none.
	typename Part::Event EventOf(const BMessage* message) const override
	{
		return message == nullptr ? OnInvoke : nullptr;
	}
};

/// A list.
template <class Form>
class TListView : public TListPart<Form, BListView> {
public:
	using TListPart<Form, BListView>::TListPart;
};

/// A list in levels. OnExpand: the items under \a item are shown now, or no longer.
template <class Form>
class TOutlineListView : public TListPart<Form, BOutlineListView> {
public:
	void (Form::*OnExpand)(BListItem* item, bool expanded) = nullptr;

	using TListPart<Form, BOutlineListView>::TListPart;

protected:
	void ExpandOrCollapse(BListItem* item, bool expand) override
	{
		TListPart<Form, BOutlineListView>::ExpandOrCollapse(item, expand);
		this->Call(OnExpand, item, expand);
	}
};
