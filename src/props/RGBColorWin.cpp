// SPDX-License-Identifier: MIT
// The dialog for a colour.

#include "props/RGBColorWin.h"

#include <cstdio>

#include <Box.h>
#include <ColorControl.h>

#include "model/ColorText.h"
#include "props/DialogParts.h"

namespace {

constexpr uint32 kMsgColorChanged = 'clrC';
constexpr float kCellSize = 8;
constexpr float kPreviewHeight = 30;

} // namespace

RGBColorWin::RGBColorWin(const char* value, const TPendingEdit& edit)
	: TPropertyModalEdit(BRect(0, 0, 100, 100), "Color", value, edit),
	  fColors(nullptr),
	  fPreview(nullptr)
{
}


RGBColorWin::~RGBColorWin() {}


void
RGBColorWin::InitWindow()
{
	BView* ground = AddDialogGround(this);
	BBox* box = new BBox(BRect(kDialogSpace, kDialogSpace, 100, 100), "boxColors");
	ground->AddChild(box);
	fColors = new BColorControl(BPoint(kDialogSpace, kDialogSpace), B_CELLS_32x8, kCellSize,
		"ccColors", new BMessage(kMsgColorChanged));
	box->AddChild(fColors);
	const BRect colors = fColors->Frame();
	box->ResizeTo(colors.right + kDialogSpace, colors.bottom + kDialogSpace);

	BRect frame = box->Frame();
	frame.top = frame.bottom + kDialogSpace;
	frame.bottom = frame.top + kPreviewHeight;
	fPreview = new BBox(frame, "boxPreview");
	ground->AddChild(fPreview);
	AddDialogButtons(
		this, ground, BPoint(frame.right + kDialogSpace, frame.bottom), PME_OK, PME_CANCEL);
}


void
RGBColorWin::InitControls()
{
	rgb_color color = {0, 0, 0, 255};
	StrToRGBColor(Text(), &color);
	printf("rgb_color = %s\n", Text());
	fColors->SetValue(color);
	ShowColor();
}


void
RGBColorWin::OnApply()
{
	char text[kColorTextSize];
	SetText(RGBColorToStr(fColors->ValueAsColor(), text));
	printf("%s\n", Text());
}


bool
RGBColorWin::OnMessage(BMessage* message)
{
	if (message->what != kMsgColorChanged)
		return false;
	ShowColor();
	return true;
}


void
RGBColorWin::ShowColor()
{
	fPreview->SetViewColor(fColors->ValueAsColor());
	fPreview->Invalidate();
}
