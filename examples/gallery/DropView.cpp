// SPDX-License-Identifier: MIT

#include "DropView.h"

#include <cmath>
#include <cstring>

#include <Entry.h>
#include <Message.h>
#include <Window.h>

#include "Commands.h"

namespace {

const char* const kTextType = "text/plain";
const float kMargin = 8;

} // namespace

DropView::DropView(BRect frame, const char* name)
	: BView(frame, name, B_FOLLOW_LEFT_TOP, B_WILL_DRAW),
	  fLines("Drop files or a text here"),
	  fIsUnderDrag(false)
{
	SetViewColor(ui_color(B_DOCUMENT_BACKGROUND_COLOR));
}


void
DropView::Draw(BRect)
{
	SetHighColor(ui_color(fIsUnderDrag ? B_KEYBOARD_NAVIGATION_COLOR : B_CONTROL_BORDER_COLOR));
	StrokeRect(Bounds());
	if (fIsUnderDrag)
		StrokeRect(Bounds().InsetByCopy(1, 1));

	SetHighColor(ui_color(B_DOCUMENT_TEXT_COLOR));
	SetLowColor(ViewColor());
	font_height height;
	GetFontHeight(&height);
	const float line = std::ceil(height.ascent + height.descent + height.leading);
	float baseline = kMargin + std::ceil(height.ascent);
	int32 start = 0;
	while (start < fLines.Length()) {
		int32 end = fLines.FindFirst('\n', start);
		if (end < 0)
			end = fLines.Length();
		BString text(fLines.String() + start, end - start);
		TruncateString(&text, B_TRUNCATE_MIDDLE, Bounds().Width() - 2 * kMargin);
		DrawString(text.String(), BPoint(kMargin, baseline));
		baseline += line;
		start = end + 1;
	}
}


void
DropView::MouseDown(BPoint)
{
	BMessage drag(B_MIME_DATA);
	drag.AddData(kTextType, B_MIME_TYPE, fLines.String(), fLines.Length());
	DragMessage(&drag, Bounds());
}


void
DropView::MouseMoved(BPoint, uint32 code, const BMessage* dragMessage)
{
	const bool isUnderDrag =
		dragMessage != nullptr && (code == B_ENTERED_VIEW || code == B_INSIDE_VIEW);
	if (isUnderDrag == fIsUnderDrag)
		return;
	fIsUnderDrag = isUnderDrag;
	Invalidate();
}


void
DropView::MessageReceived(BMessage* message)
{
	if (!message->WasDropped()) {
		BView::MessageReceived(message);
		return;
	}
	fIsUnderDrag = false;
	Invalidate();
	if (message->HasRef("refs"))
		TakeFiles(message);
	else if (!TakeText(message))
		SetLines("Something that is neither a file nor a text");
	TellWindow();
}


void
DropView::TakeFiles(const BMessage* message)
{
	BString lines;
	entry_ref ref;
	for (int32 i = 0; message->FindRef("refs", i, &ref) == B_OK; i++)
		lines << ref.name << '\n';
	SetLines(lines);
}


bool
DropView::TakeText(const BMessage* message)
{
	const void* data;
	ssize_t size;
	if (message->FindData(kTextType, B_MIME_TYPE, &data, &size) != B_OK)
		return false;
	SetLines(BString(static_cast<const char*>(data), static_cast<int32>(size)));
	return true;
}


void
DropView::TellWindow()
{
	BString text("Dropped: ");
	text << fLines;
	text.ReplaceAll('\n', ' ');
	BMessage tell(GM_TELL);
	tell.AddString("text", text.Trim());
	Window()->PostMessage(&tell);
}


void
DropView::SetLines(const BString& lines)
{
	fLines = lines;
	Invalidate();
}
