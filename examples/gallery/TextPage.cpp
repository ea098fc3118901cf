// SPDX-License-Identifier: MIT
// Text controls, a text view with several lines, and string views.

#include <Message.h>
#include <StringView.h>
#include <TextControl.h>
#include <TextView.h>

#include "Pages.h"

namespace {

void
AddTextControls(BView* page)
{
	BTextControl* name = new BTextControl(
		BRect(10, 10, 250, 30), "efName", "Name:", "Ada Lovelace", new BMessage('text'));
	BTextControl* centred = new BTextControl(
		BRect(10, 40, 250, 60), "efCentred", "Centred:", "in the middle", new BMessage('text'));
	centred->SetAlignment(B_ALIGN_RIGHT, B_ALIGN_CENTER);
	BTextControl* disabled = new BTextControl(
		BRect(10, 70, 250, 90), "efDisabled", "Disabled:", "cannot be edited", nullptr);
	disabled->SetEnabled(false);
	BTextControl* secret = new BTextControl(
		BRect(10, 100, 250, 120), "efBare", nullptr, "without a label", new BMessage('text'));
	for (BTextControl* control : {name, centred, disabled, secret}) {
		control->SetDivider(control->Label() != nullptr ? 70 : 0);
		page->AddChild(control);
	}
}


void
AddStringViews(BView* page)
{
	const struct {
		const char* text;
		alignment align;
		uint32 truncation;
	} kRows[] = {{"To the left", B_ALIGN_LEFT, B_NO_TRUNCATION},
		{"In the middle", B_ALIGN_CENTER, B_NO_TRUNCATION},
		{"To the right", B_ALIGN_RIGHT, B_NO_TRUNCATION},
		{"A text that is much longer than its view", B_ALIGN_LEFT, B_TRUNCATE_END},
		{"A text that is much longer than its view", B_ALIGN_LEFT, B_TRUNCATE_MIDDLE}};
	float top = 10;
	for (const auto& row : kRows) {
		BStringView* view = new BStringView(BRect(280, top, 450, top + 18), nullptr, row.text);
		view->SetAlignment(row.align);
		view->SetTruncation(row.truncation);
		page->AddChild(view);
		top += 22;
	}
}

} // namespace


BView*
MakeTextPage(BRect frame)
{
	BView* page = MakePage(frame, "Text");
	AddTextControls(page);
	AddStringViews(page);

	AddCaption(
		page, 10, 138, "A text view: cut, copy and paste work by key and from the menu Edit");
	const BRect textFrame(10, 160, 450, 276);
	BTextView* text =
		new BTextView(textFrame, "text", textFrame.OffsetToCopy(B_ORIGIN).InsetByCopy(4, 4),
			B_FOLLOW_LEFT_TOP, B_WILL_DRAW | B_NAVIGABLE);
	text->SetText(
		"The quick brown fox jumps over the lazy dog.\n\n"
		"Text flows from one line to the next where the view ends, and can be selected, cut, "
		"copied, pasted and undone.\n\tUmlauts \xc3\xa4\xc3\xb6\xc3\xbc, \xce\xa9 and "
		"\xe2\x82\xac are one character each.");
	page->AddChild(text);
	return page;
}
