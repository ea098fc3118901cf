// SPDX-License-Identifier: MIT
// The text of several lines in generated programs.

#pragma once

#include <ormi/Part.h>
#include <ormi/views/TextPane.h>

/// A text of several lines. OnChange: the text changed, by the user or by program.
template <class Form>
class TTextView : public TPart<Form, Ormi::TextPane> {
public:
	typedef TPart<Form, Ormi::TextPane> Part;

	typename Part::Event OnChange = nullptr;

	TTextView(Form* form, BRect frame, const char* name)
		: Part(form, frame, name)
	{
	}

protected:
	void InsertText(
		const char* text, int32 length, int32 offset, const text_run_array* runs) override
	{
		Part::InsertText(text, length, offset, runs);
		this->Call(OnChange);
	}

	void DeleteText(int32 fromOffset, int32 toOffset) override
	{
		Part::DeleteText(fromOffset, toOffset);
		this->Call(OnChange);
	}
};
