// SPDX-License-Identifier: MIT

#include <StringView.h>

#include <cmath>

#include <Message.h>
#include <Window.h>

#include "ControlLook.h"
#include "interface/ArchivedEnum.h"

using BPrivate::AlignmentOf;

BStringView::BStringView(
	BRect frame, const char* name, const char* text, uint32 resizingMode, uint32 flags)
	: BView(frame, name, resizingMode, flags | B_FULL_UPDATE_ON_RESIZE),
	  fText(text),
	  fHasText(text != NULL),
	  fAlignment(B_ALIGN_LEFT),
	  fTruncation(B_NO_TRUNCATION)
{
}


BStringView::BStringView(const char* name, const char* text, uint32 flags)
	: BStringView(BRect(0, 0, -1, -1), name, text, B_FOLLOW_LEFT_TOP, flags)
{
}


BStringView::BStringView(BMessage* archive)
	: BView(archive),
	  fHasText(archive->FindString("_text", &fText) == B_OK),
	  fAlignment(B_ALIGN_LEFT),
	  fTruncation(B_NO_TRUNCATION)
{
	int32 value;
	if (archive->FindInt32("_align", &value) == B_OK)
		fAlignment = AlignmentOf(value);
	if (archive->FindInt32("_truncation", &value) == B_OK)
		fTruncation = static_cast<uint32>(value);
}


BStringView::~BStringView() {}


BArchivable*
BStringView::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BStringView") ? new BStringView(archive) : NULL;
}


status_t
BStringView::Archive(BMessage* archive, bool deep) const
{
	status_t status = BView::Archive(archive, deep);
	if (status == B_OK && fHasText)
		status = archive->AddString("_text", fText);
	if (status == B_OK)
		status = archive->AddInt32("_align", fAlignment);
	if (status == B_OK)
		status = archive->AddInt32("_truncation", static_cast<int32>(fTruncation));
	return status;
}


void
BStringView::AttachedToWindow()
{
	BPrivate::AdoptParentColors(this);
	BView::AttachedToWindow();
}


void
BStringView::Draw(BRect)
{
	if (!fHasText)
		return;
	const BRect bounds = Bounds();
	BString text(fText);
	if (fTruncation != B_NO_TRUNCATION)
		TruncateString(&text, fTruncation, bounds.Width());

	float x = bounds.left;
	if (fAlignment != B_ALIGN_LEFT) {
		const float space = bounds.Width() - StringWidth(text.String());
		x += std::floor(fAlignment == B_ALIGN_RIGHT ? space : space / 2);
	}
	font_height height;
	GetFontHeight(&height);
	SetDrawingMode(B_OP_OVER);
	DrawString(text.String(), BPoint(x, bounds.bottom - std::ceil(height.descent)));
	SetDrawingMode(B_OP_COPY);
}


void
BStringView::GetPreferredSize(float* _width, float* _height)
{
	font_height height;
	GetFontHeight(&height);
	if (_width != NULL)
		*_width = std::ceil(StringWidth(fText.String()));
	if (_height != NULL)
		*_height = std::ceil(height.ascent) + std::ceil(height.descent);
}


void
BStringView::SetFont(const BFont* font, uint32 mask)
{
	BView::SetFont(font, mask);
	if (Window() != NULL)
		Invalidate();
}


void
BStringView::SetText(const char* text)
{
	if (fHasText == (text != NULL) && fText == text)
		return;
	fHasText = text != NULL;
	fText = text;
	if (Window() != NULL)
		Invalidate();
}


const char*
BStringView::Text() const
{
	return fHasText ? fText.String() : NULL;
}


void
BStringView::SetAlignment(alignment flag)
{
	fAlignment = flag;
	if (Window() != NULL)
		Invalidate();
}


alignment
BStringView::Alignment() const
{
	return fAlignment;
}


void
BStringView::SetTruncation(uint32 truncationMode)
{
	fTruncation = truncationMode;
	if (Window() != NULL)
		Invalidate();
}


uint32
BStringView::Truncation() const
{
	return fTruncation;
}
