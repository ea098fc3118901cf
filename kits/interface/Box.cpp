// SPDX-License-Identifier: MIT

#include <Box.h>

#include <algorithm>
#include <cmath>

#include <Message.h>
#include <Window.h>

#include "ControlLook.h"
#include "interface/ArchivedEnum.h"

using BPrivate::EnumBetween;

namespace {

constexpr float kLabelLeft = 10;
constexpr float kLabelGap = 4;

} // namespace

BBox::BBox(BRect frame, const char* name, uint32 resizingMode, uint32 flags, border_style border)
	: BView(frame, name, resizingMode, flags | B_WILL_DRAW | B_FRAME_EVENTS),
	  fLabelView(NULL),
	  fBorder(border),
	  fDrawnWidth(frame.Width()),
	  fDrawnHeight(frame.Height())
{
	SetFont(be_bold_font);
}


BBox::BBox(const char* name, uint32 flags, border_style border, BView* child)
	: BBox(BRect(0, 0, -1, -1), name, B_FOLLOW_LEFT_TOP, flags, border)
{
	if (child != NULL)
		AddChild(child);
}


BBox::BBox(border_style border, BView* child)
	: BBox(NULL, B_WILL_DRAW | B_FRAME_EVENTS | B_NAVIGABLE_JUMP, border, child)
{
}


BBox::BBox(BMessage* archive)
	: BView(archive),
	  fLabelView(NULL),
	  fBorder(B_FANCY_BORDER),
	  fDrawnWidth(Bounds().Width()),
	  fDrawnHeight(Bounds().Height())
{
	archive->FindString("_label", &fLabel);
	int32 style;
	if (archive->FindInt32("_style", &style) == B_OK)
		fBorder = EnumBetween(style, B_PLAIN_BORDER, B_NO_BORDER, B_FANCY_BORDER);
	bool hasLabelView = false;
	if (archive->FindBool("_lblview", &hasLabelView) == B_OK && hasLabelView)
		fLabelView = ChildAt(0);
}


BBox::~BBox() {}


BArchivable*
BBox::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BBox") ? new BBox(archive) : NULL;
}


status_t
BBox::Archive(BMessage* archive, bool deep) const
{
	status_t status = BView::Archive(archive, deep);
	if (status == B_OK && !fLabel.IsEmpty())
		status = archive->AddString("_label", fLabel);
	if (status == B_OK && LabelView() != NULL)
		status = archive->AddBool("_lblview", true);
	if (status == B_OK)
		status = archive->AddInt32("_style", fBorder);
	return status;
}


void
BBox::AttachedToWindow()
{
	BPrivate::AdoptParentColors(this);
	BView::AttachedToWindow();
}


void
BBox::Draw(BRect)
{
	BRect border = Bounds();
	border.top += TopBorderOffset();
	const rgb_color low = ViewColor();
	const rgb_color line = tint_color(low, B_DARKEN_2_TINT);
	if (fBorder == B_FANCY_BORDER) {
		SetHighColor(tint_color(low, B_LIGHTEN_2_TINT));
		StrokeRect(BRect(border.left + 1, border.top + 1, border.right, border.bottom));
		SetHighColor(line);
		StrokeRect(BRect(border.left, border.top, border.right - 1, border.bottom - 1));
	} else if (fBorder == B_PLAIN_BORDER) {
		SetHighColor(line);
		StrokeRect(border);
	}

	if (fLabel.IsEmpty())
		return;
	font_height height;
	GetFontHeight(&height);
	SetHighColor(low);
	FillRect(BRect(kLabelLeft - kLabelGap, 0,
		kLabelLeft + std::ceil(StringWidth(fLabel.String())) + kLabelGap, LabelHeight()));
	SetHighColor(BPrivate::ControlTextColor(true, low));
	DrawString(fLabel.String(), BPoint(kLabelLeft, std::ceil(height.ascent)));
}


void
BBox::FrameResized(float newWidth, float newHeight)
{
	BView::FrameResized(newWidth, newHeight);
	// What lay on the border before, and what lies there now.
	const float right = std::min(fDrawnWidth, newWidth) - 2;
	const float bottom = std::min(fDrawnHeight, newHeight) - 2;
	fDrawnWidth = newWidth;
	fDrawnHeight = newHeight;
	Invalidate(BRect(right, 0, newWidth, newHeight));
	Invalidate(BRect(0, bottom, newWidth, newHeight));
}


void
BBox::GetPreferredSize(float* _width, float* _height)
{
	const float label = fLabel.IsEmpty() ? 0 : StringWidth(fLabel.String()) + 2 * kLabelLeft;
	if (_width != NULL)
		*_width = std::ceil(label) + 4;
	if (_height != NULL)
		*_height = LabelHeight() + 4;
}


void
BBox::SetBorder(border_style border)
{
	if (border == fBorder)
		return;
	fBorder = border;
	if (Window() != NULL)
		Invalidate();
}


border_style
BBox::Border() const
{
	return fBorder;
}


void
BBox::SetLabel(const char* string)
{
	// The text may be the present one's.
	const BString label(string);
	ClearLabel();
	fLabel = label;
	if (Window() != NULL)
		Invalidate();
}


status_t
BBox::SetLabel(BView* viewLabel)
{
	if (viewLabel != NULL && viewLabel == LabelView())
		return B_OK;
	if (viewLabel != NULL && viewLabel->Parent() != NULL)
		return B_BAD_VALUE;
	ClearLabel();
	if (viewLabel != NULL) {
		fLabelView = viewLabel;
		viewLabel->MoveTo(kLabelLeft, 0);
		AddChild(viewLabel, ChildAt(0));
	}
	if (Window() != NULL)
		Invalidate();
	return B_OK;
}


const char*
BBox::Label() const
{
	return fLabel.IsEmpty() ? NULL : fLabel.String();
}


BView*
BBox::LabelView() const
{
	// It may have been removed, and even deleted, like any other child.
	for (BView* child = ChildAt(0); child != NULL; child = child->NextSibling()) {
		if (child == fLabelView)
			return fLabelView;
	}
	return NULL;
}


float
BBox::TopBorderOffset()
{
	return std::floor(LabelHeight() / 2);
}


BRect
BBox::InnerFrame()
{
	const float border = fBorder == B_FANCY_BORDER ? 2 : fBorder == B_PLAIN_BORDER ? 1 : 0;
	BRect inner = Bounds().InsetByCopy(border, border);
	inner.top = std::max(inner.top + TopBorderOffset(), LabelHeight());
	return inner;
}


void
BBox::ClearLabel()
{
	fLabel = "";
	BView* labelView = LabelView();
	fLabelView = NULL;
	if (labelView == NULL)
		return;
	labelView->RemoveSelf();
	delete labelView;
}


/// The height of the label, 0 without one.
float
BBox::LabelHeight() const
{
	const BView* labelView = LabelView();
	if (labelView != NULL)
		return labelView->Bounds().Height();
	if (fLabel.IsEmpty())
		return 0;
	font_height height;
	GetFontHeight(&height);
	return std::ceil(height.ascent) + std::ceil(height.descent);
}
