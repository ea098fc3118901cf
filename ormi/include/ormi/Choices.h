// SPDX-License-Identifier: MIT
// The components with which the user of a generated program chooses something.

#pragma once

#include <RadioButton.h>

#include <ormi/Part.h>
#include <ormi/views/FileButton.h>
#include <ormi/views/Gauges.h>
#include <ormi/views/MenuItems.h>

/// A radio button. OnChange: chosen by the user; those of the same container are off then.
template <class Form>
class TRadioButton : public TInvokePart<Form, BRadioButton> {
public:
	typedef TInvokePart<Form, BRadioButton> Part;

	typename Part::Event OnChange = nullptr;

	TRadioButton(Form* form, BRect frame, const char* name, const char* label)
		: Part(form, frame, name, label, static_cast<BMessage*>(nullptr))
	{
	}

protected:
	typename Part::Event EventOf(const BMessage*) const override { return OnChange; }
};

/// A button with pictures. OnClick: pressed by mouse or keyboard.
template <class Form>
class TPictureButton : public TInvokePart<Form, Ormi::FileButton> {
public:
	typedef TInvokePart<Form, Ormi::FileButton> Part;

	typename Part::Event OnClick = nullptr;

	TPictureButton(Form* form, BRect frame, const char* name)
		: Part(form, frame, name)
	{
	}

protected:
	typename Part::Event EventOf(const BMessage*) const override { return OnClick; }
};

/// A slider. OnChange: the user gave it another value. OnModify: the value follows the thumb that the
/// user holds.
template <class Form>
class TSlider : public TInvokePart<Form, Ormi::RangeSlider> {
public:
	typedef TInvokePart<Form, Ormi::RangeSlider> Part;

	typename Part::Event OnChange = nullptr;
	typename Part::Event OnModify = nullptr;

	TSlider(Form* form, BRect frame, const char* name, const char* label)
		: Part(form, frame, name, label)
	{
		this->SetModificationMessage(new BMessage);
	}

protected:
	typename Part::Event EventOf(const BMessage* message) const override
	{
		return message != nullptr && message == this->ModificationMessage() ? OnModify : OnChange;
	}
};

/// A choice of a colour. OnChange: the user changed it; ValueAsColor() has it.
template <class Form>
class TColorControl : public TInvokePart<Form, Ormi::ColorPanel> {
public:
	typedef TInvokePart<Form, Ormi::ColorPanel> Part;

	typename Part::Event OnChange = nullptr;

	TColorControl(Form* form, BRect frame, const char* name)
		: Part(form, frame, name)
	{
	}

protected:
	typename Part::Event EventOf(const BMessage*) const override { return OnChange; }
};

/// A menu that shows what is chosen. OnChange: the user chose an item; Selected() has its index.
template <class Form>
class TMenuField : public TPart<Form, Ormi::ChoiceField> {
public:
	typedef TPart<Form, Ormi::ChoiceField> Part;

	typename Part::Event OnChange = nullptr;

	TMenuField(Form* form, BRect frame, const char* name, const char* label)
		: Part(form, frame, name, label)
	{
	}

	void MessageReceived(BMessage* message) override
	{
		if (message->what != Ormi::kMenuItemChosen)
			Part::MessageReceived(message);
		else if (Ormi::ChosenMenuItem(this->Menu(), message) != nullptr)
			this->Call(OnChange);
	}
};

/// The menus of a form. OnInvoke: the user chose \a item.
template <class Form>
class TMenuBar : public TPart<Form, Ormi::MenuRow> {
public:
	typedef TPart<Form, Ormi::MenuRow> Part;

	void (Form::*OnInvoke)(BMenuItem* item) = nullptr;

	TMenuBar(Form* form, BRect frame, const char* name)
		: Part(form, frame, name)
	{
	}

	void MessageReceived(BMessage* message) override
	{
		if (message->what != Ormi::kMenuItemChosen) {
			Part::MessageReceived(message);
			return;
		}
		BMenuItem* item = Ormi::ChosenMenuItem(this, message);
		if (item != nullptr)
			this->Call(OnInvoke, item);
	}
};
