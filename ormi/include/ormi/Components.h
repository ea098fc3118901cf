// SPDX-License-Identifier: MIT
// The components of the standard library, as generated programs use them.
//
// Each is constructed from its form, its frame in its parent's coordinates, its name, and what its
// designer component gives as further arguments. The events beside those of every view are the pointers
// declared here.

#pragma once

#include <Box.h>
#include <Button.h>
#include <CheckBox.h>
#include <StringView.h>

#include <ormi/Choices.h>
#include <ormi/Containers.h>
#include <ormi/Displays.h>
#include <ormi/Lists.h>
#include <ormi/Part.h>
#include <ormi/TextControl.h>
#include <ormi/TextView.h>

/// A push button. OnClick: pressed by mouse or keyboard.
template <class Form>
class TButton : public TInvokePart<Form, BButton> {
public:
	typedef TInvokePart<Form, BButton> Part;

	typename Part::Event OnClick = nullptr;

	TButton(Form* form, BRect frame, const char* name, const char* label)
		: Part(form, frame, name, label, static_cast<BMessage*>(nullptr))
	{
	}

protected:
	typename Part::Event EventOf(const BMessage*) const override { return OnClick; }
};

/// A check box. OnChange: ticked or unticked by the user; Value() has the new state.
template <class Form>
class TCheckBox : public TInvokePart<Form, BCheckBox> {
public:
	typedef TInvokePart<Form, BCheckBox> Part;

	typename Part::Event OnChange = nullptr;

	TCheckBox(Form* form, BRect frame, const char* name, const char* label)
		: Part(form, frame, name, label, static_cast<BMessage*>(nullptr))
	{
	}

protected:
	typename Part::Event EventOf(const BMessage*) const override { return OnChange; }
};

/// A line of text.
template <class Form>
class TStringView : public TClickPart<Form, BStringView> {
public:
	TStringView(Form* form, BRect frame, const char* name, const char* text)
		: TClickPart<Form, BStringView>(form, frame, name, text)
	{
	}
};

/// A box around other components.
template <class Form>
class TBox : public TClickPart<Form, BBox> {
public:
	TBox(Form* form, BRect frame, const char* name, const char* label)
		: TClickPart<Form, BBox>(form, frame, name)
	{
		this->SetLabel(label);
	}
};
