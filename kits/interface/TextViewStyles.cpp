// SPDX-License-Identifier: MIT
// BTextView: the fonts and colours of its text.
#include <TextView.h>

#include <algorithm>

#include <Window.h>

#include "TextLayout.h"
#include "TextStyles.h"

namespace {

// Which attributes two fonts share, as B_FONT_SIZE and so on.
uint32
SharedAttributes(const BFont& a, const BFont& b)
{
	uint32 shared = B_FONT_ALL;
	const auto differs = [&shared](bool differ, uint32 attribute) {
		if (differ)
			shared &= ~attribute;
	};
	differs(a.FamilyAndStyle() != b.FamilyAndStyle(), B_FONT_FAMILY_AND_STYLE);
	differs(a.Size() != b.Size(), B_FONT_SIZE);
	differs(a.Shear() != b.Shear(), B_FONT_SHEAR);
	differs(a.Rotation() != b.Rotation(), B_FONT_ROTATION);
	differs(a.Spacing() != b.Spacing(), B_FONT_SPACING);
	differs(a.Encoding() != b.Encoding(), B_FONT_ENCODING);
	differs(a.Face() != b.Face(), B_FONT_FACE);
	differs(a.Flags() != b.Flags(), B_FONT_FLAGS);
	return shared;
}

} // namespace


void
BTextView::SetFontAndColor(const BFont* font, uint32 mode, const rgb_color* color)
{
	int32 start, end;
	GetSelection(&start, &end);
	if (!fStylable || start < end || TextLength() == 0) {
		SetFontAndColor(start, end, font, mode, color);
		return;
	}
	BPrivate::TextStyle style = fStyles->At(std::max<int32>(start - 1, 0));
	if (fNextStyle != NULL)
		style = {fNextStyle->font, fNextStyle->color};
	style.Apply(font, mode, color);
	fNextStyle = std::make_unique<text_run>(text_run{0, style.font, style.color});
}


void
BTextView::SetFontAndColor(
	int32 startOffset, int32 endOffset, const BFont* font, uint32 mode, const rgb_color* color)
{
	if (font == NULL && color == NULL)
		return;
	int32 start = std::clamp<int32>(startOffset, 0, TextLength());
	int32 end = std::clamp<int32>(endOffset, 0, TextLength());
	if (!fStylable || TextLength() == 0) {
		// The view's font is that of a text with one.
		if (font != NULL)
			BView::SetFont(font, mode);
		start = 0;
		end = std::max<int32>(TextLength(), 1);
	}
	if (start >= end)
		return;
	fStyles->Apply(start, end, font, mode, color);
	StylesChanged(start, std::min(end, TextLength()));
}


void
BTextView::GetFontAndColor(int32 offset, BFont* _font, rgb_color* _color) const
{
	const BPrivate::TextStyle& style = fStyles->At(std::clamp<int32>(offset, 0, TextLength()));
	if (_font != NULL)
		*_font = style.font;
	if (_color != NULL)
		*_color = style.color;
}


void
BTextView::GetFontAndColor(BFont* _font, uint32* _mode, rgb_color* _color, bool* _sameColor) const
{
	int32 start, end;
	GetSelection(&start, &end);
	BPrivate::TextStyle style = fStyles->At(start < end ? start : std::max<int32>(start - 1, 0));
	if (start == end && fNextStyle != NULL)
		style = {fNextStyle->font, fNextStyle->color};

	uint32 mode = B_FONT_ALL;
	bool sameColor = true;
	for (int32 i = fStyles->IndexAt(start); start < end && i <= fStyles->IndexAt(end - 1); i++) {
		const BPrivate::TextStyle& other = fStyles->Runs()[i].style;
		mode &= SharedAttributes(style.font, other.font);
		sameColor = sameColor && other.color == style.color;
	}
	if (_font != NULL)
		*_font = style.font;
	if (_mode != NULL)
		*_mode = mode;
	if (_color != NULL)
		*_color = style.color;
	if (_sameColor != NULL)
		*_sameColor = sameColor;
}


void
BTextView::ApplyRuns(int32 from, int32 to, const text_run_array* runs)
{
	if (fStylable)
		fStyles->SetRuns(from, to, *runs);
	else if (runs->count > 0)
		fStyles->SetAll({runs->runs[0].font, runs->runs[0].color});
}


void
BTextView::StylesChanged(int32 from, int32 to)
{
	// A text of one style has it from its start on.
	if (!fStylable) {
		from = 0;
		to = TextLength();
	}
	fLayout->Update(from, to - from, to - from);
	FixScrollBars();
	InvalidateText();
}


void
BTextView::HideTyping(bool enabled)
{
	if (enabled == fLayout->IsHidden())
		return;
	fLayout->SetHidden(enabled);
	FixScrollBars();
	InvalidateText();
}


bool
BTextView::IsTypingHidden() const
{
	return fLayout->IsHidden();
}
