// SPDX-License-Identifier: MIT
// The components of generated programs that hold others.

#pragma once

#include <ormi/Part.h>
#include <ormi/views/Containers.h>

/// A plain view around other components.
template <class Form>
class TView : public TClickPart<Form, BView> {
public:
	TView(Form* form, BRect frame, const char* name)
		: TClickPart<Form, BView>(form, frame, name, B_FOLLOW_NONE, B_WILL_DRAW)
	{
	}
};

/// A view that scrolls the component in it, or several.
template <class Form>
class TScrollView : public TPart<Form, Ormi::ScrollPane> {
public:
	TScrollView(Form* form, BRect frame, const char* name, bool horizontal, bool vertical,
		border_style border)
		: TPart<Form, Ormi::ScrollPane>(form, frame, name, horizontal, vertical, border)
	{
	}
};

/// Components on several pages, of which one is seen. OnChange: another page is selected, by the user or
/// by program; Selection() has its index.
template <class Form>
class TTabView : public TPart<Form, Ormi::TabPane> {
public:
	typedef TPart<Form, Ormi::TabPane> Part;

	typename Part::Event OnChange = nullptr;

	TTabView(Form* form, BRect frame, const char* name)
		: Part(form, frame, name)
	{
	}

	void Select(int32 index) override
	{
		const int32 before = this->Selection();
		Part::Select(index);
		if (this->Selection() != before)
			this->Call(OnChange);
	}
};
