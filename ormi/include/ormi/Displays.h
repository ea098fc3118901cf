// SPDX-License-Identifier: MIT
// The components of generated programs that only show something.

#pragma once

#include <ormi/Part.h>
#include <ormi/views/Gauges.h>
#include <ormi/views/PicturePane.h>

/// A bar that tells how far something has come.
template <class Form>
class TStatusBar : public TClickPart<Form, Ormi::ProgressBar> {
public:
	TStatusBar(Form* form, BRect frame, const char* name)
		: TClickPart<Form, Ormi::ProgressBar>(form, frame, name)
	{
		this->SetResizingMode(B_FOLLOW_NONE);
		this->ResizeTo(frame.Width(), frame.Height());
	}
};

/// A picture from a file.
template <class Form>
class TPictureView : public TClickPart<Form, Ormi::PicturePane> {
public:
	TPictureView(Form* form, BRect frame, const char* name)
		: TClickPart<Form, Ormi::PicturePane>(form, frame, name)
	{
	}
};
