// SPDX-License-Identifier: MIT

#include <StatusBar.h>

#include <algorithm>
#include <cmath>

#include <Message.h>
#include <Window.h>

#include "BarLook.h"

namespace {

constexpr float kDefaultMax = 100;
// Between two texts that stand beside each other.
constexpr float kTextGap = 6;

const char*
TextOrNull(const BString& text)
{
	return text.IsEmpty() ? NULL : text.String();
}


/// Two texts as one, with a space between.
BString
Joined(const BString& first, const BString& second)
{
	BString both(first);
	if (!first.IsEmpty() && !second.IsEmpty())
		both << ' ';
	return both << second;
}

} // namespace

BStatusBar::BStatusBar(BRect frame, const char* name, const char* label, const char* trailingLabel)
	: BView(frame, name, B_FOLLOW_LEFT_TOP, B_WILL_DRAW | B_FULL_UPDATE_ON_RESIZE),
	  fLabel(label),
	  fTrailingLabel(trailingLabel),
	  fMax(kDefaultMax),
	  fCurrent(0),
	  fBarHeight(0),
	  fBarColor(make_color(0, 0, 0)),
	  fUsesBarColor(false),
	  fKeepsTextLine(false)
{
	NoteTexts();
}


BStatusBar::BStatusBar(const char* name, const char* label, const char* trailingLabel)
	: BStatusBar(BRect(0, 0, -1, -1), name, label, trailingLabel)
{
}


BStatusBar::BStatusBar(BMessage* archive)
	: BView(archive),
	  fMax(archive->GetFloat("_max", kDefaultMax)),
	  fCurrent(0),
	  fBarHeight(std::max(archive->GetFloat("_high", 0.0f), 0.0f)),
	  fBarColor(make_color(0, 0, 0)),
	  fUsesBarColor(archive->FindColor("_bcolor", &fBarColor) == B_OK),
	  fKeepsTextLine(false)
{
	archive->FindString("_label", &fLabel);
	archive->FindString("_tlabel", &fTrailingLabel);
	archive->FindString("_text", &fText);
	archive->FindString("_ttext", &fTrailingText);
	SetCurrent(archive->GetFloat("_val", 0.0f));
	NoteTexts();
}


BStatusBar::~BStatusBar() {}


BArchivable*
BStatusBar::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BStatusBar") ? new BStatusBar(archive) : NULL;
}


status_t
BStatusBar::Archive(BMessage* archive, bool deep) const
{
	status_t status = BView::Archive(archive, deep);
	if (status == B_OK && fBarHeight > 0)
		status = archive->AddFloat("_high", fBarHeight);
	if (status == B_OK && fUsesBarColor)
		status = archive->AddColor("_bcolor", fBarColor);
	if (status == B_OK && fCurrent != 0)
		status = archive->AddFloat("_val", fCurrent);
	if (status == B_OK && fMax != kDefaultMax)
		status = archive->AddFloat("_max", fMax);

	const struct {
		const char* field;
		const BString& text;
	} kTexts[] = {{"_label", fLabel}, {"_tlabel", fTrailingLabel}, {"_text", fText},
		{"_ttext", fTrailingText}};
	for (const auto& entry : kTexts) {
		if (status == B_OK && !entry.text.IsEmpty())
			status = archive->AddString(entry.field, entry.text);
	}
	return status;
}


void
BStatusBar::AttachedToWindow()
{
	BPrivate::AdoptParentColors(this);
	FitHeight();
	BView::AttachedToWindow();
}


void
BStatusBar::MessageReceived(BMessage* message)
{
	switch (message->what) {
		case B_UPDATE_STATUS_BAR:
			Update(message->GetFloat("delta", 0.0f), message->GetString("text", NULL),
				message->GetString("trailing_text", NULL));
			break;

		case B_RESET_STATUS_BAR:
			Reset(message->GetString("label", NULL), message->GetString("trailing_label", NULL));
			break;

		default:
			BView::MessageReceived(message);
			break;
	}
}


void
BStatusBar::Draw(BRect)
{
	if (fKeepsTextLine)
		DrawTexts();

	const BRect bar = BarFrame();
	if (!bar.IsValid())
		return;
	const rgb_color trough = BPrivate::FieldColor({true, false, false});
	BRect filled;
	if (FilledWidth(fCurrent) > 0)
		filled.Set(bar.left, bar.top, bar.left + FilledWidth(fCurrent), bar.bottom);
	BPrivate::DrawBar(this, bar, trough, filled, BarColor());
}


void
BStatusBar::GetPreferredSize(float* _width, float* _height)
{
	if (_width != NULL) {
		const BString left = Joined(fLabel, fText);
		const BString right = Joined(fTrailingText, fTrailingLabel);
		*_width = std::ceil(StringWidth(left.String())) + std::ceil(StringWidth(right.String()))
			+ kTextGap;
		*_width = std::max(*_width, 5 * BarHeight());
	}
	if (_height != NULL)
		*_height = TextHeight() + BarHeight();
}


void
BStatusBar::SetFont(const BFont* font, uint32 mask)
{
	BView::SetFont(font, mask);
	if (Window() == NULL)
		return;
	FitHeight();
	Invalidate();
}


void
BStatusBar::SetBarColor(rgb_color color)
{
	fBarColor = color;
	fUsesBarColor = true;
	if (Window() != NULL)
		Invalidate();
}


void
BStatusBar::SetBarHeight(float height)
{
	fBarHeight = std::max(std::floor(height), 1.0f);
	if (Window() == NULL)
		return;
	FitHeight();
	Invalidate();
}


void
BStatusBar::SetText(const char* string)
{
	SetString(&fText, string);
}


void
BStatusBar::SetTrailingText(const char* string)
{
	SetString(&fTrailingText, string);
}


void
BStatusBar::SetMaxValue(float max)
{
	if (!(max >= 0))
		max = 0;
	if (max == fMax)
		return;
	fMax = max;
	fCurrent = std::min(fCurrent, fMax);
	if (Window() != NULL)
		Invalidate();
}


void
BStatusBar::Update(float delta, const char* text, const char* trailingText)
{
	// By way of SetTo(), where classes that derive from this one hook in.
	SetTo(fCurrent + delta, text != NULL ? text : fText.String(),
		trailingText != NULL ? trailingText : fTrailingText.String());
}


void
BStatusBar::Reset(const char* label, const char* trailingLabel)
{
	SetString(&fLabel, label);
	SetString(&fTrailingLabel, trailingLabel);
	SetMaxValue(kDefaultMax);
	SetTo(0);
}


void
BStatusBar::SetTo(float value, const char* text, const char* trailingText)
{
	SetText(text);
	SetTrailingText(trailingText);
	SetCurrent(value);
}


float
BStatusBar::CurrentValue() const
{
	return fCurrent;
}


float
BStatusBar::MaxValue() const
{
	return fMax;
}


rgb_color
BStatusBar::BarColor() const
{
	return fUsesBarColor ? fBarColor : ui_color(B_STATUS_BAR_COLOR);
}


float
BStatusBar::BarHeight() const
{
	if (fBarHeight > 0)
		return fBarHeight;
	BFont font;
	GetFont(&font);
	return std::ceil(font.Size() * 4 / 3);
}


const char*
BStatusBar::Text() const
{
	return TextOrNull(fText);
}


const char*
BStatusBar::TrailingText() const
{
	return TextOrNull(fTrailingText);
}


const char*
BStatusBar::Label() const
{
	return TextOrNull(fLabel);
}


const char*
BStatusBar::TrailingLabel() const
{
	return TextOrNull(fTrailingLabel);
}


void
BStatusBar::SetCurrent(float value)
{
	// What is no number counts as 0.
	value = value > 0 ? std::min(value, fMax) : 0;
	const float before = FilledWidth(fCurrent);
	const float after = FilledWidth(value);
	fCurrent = value;
	if (Window() == NULL || before == after)
		return;

	// Only what the bar gains or loses.
	BRect changed = BarFrame();
	changed.right = changed.left + std::max(before, after) + 1;
	changed.left += std::min(before, after) - 1;
	Invalidate(changed);
}


void
BStatusBar::SetString(BString* text, const char* string)
{
	// The text may be the present one's.
	const BString given(string);
	if (given == *text)
		return;
	*text = given;
	NoteTexts();
	if (Window() == NULL)
		return;
	BRect line = Bounds();
	line.bottom = line.top + TextHeight();
	Invalidate(line);
}


/// Once there has been a text, its line stays: a bar whose text comes and goes does not jump.
void
BStatusBar::NoteTexts()
{
	if (fKeepsTextLine
		|| (fLabel.IsEmpty() && fTrailingLabel.IsEmpty() && fText.IsEmpty()
			&& fTrailingText.IsEmpty()))
		return;
	fKeepsTextLine = true;
	if (Window() == NULL)
		return;
	FitHeight();
	Invalidate();
}


void
BStatusBar::FitHeight()
{
	float height;
	GetPreferredSize(NULL, &height);
	ResizeTo(Bounds().Width(), height);
}


float
BStatusBar::TextHeight() const
{
	return fKeepsTextLine ? BPrivate::TextLineHeight(this) : 0;
}


BRect
BStatusBar::BarFrame() const
{
	BRect bar = Bounds();
	bar.top += TextHeight();
	bar.bottom = std::min(bar.bottom, bar.top + BarHeight());
	return bar;
}


/// In whole pixels, right minus left; 0 when nothing is filled.
float
BStatusBar::FilledWidth(float value) const
{
	if (fMax <= 0)
		return 0;
	return std::floor(BarFrame().Width() * (value / fMax) + 0.5f);
}


void
BStatusBar::DrawTexts()
{
	font_height height;
	GetFontHeight(&height);
	const BRect bounds = Bounds();
	const float baseline = bounds.top + std::ceil(height.ascent);

	BString right = Joined(fTrailingText, fTrailingLabel);
	const float rightWidth = std::min(StringWidth(right.String()), bounds.Width());
	BString left = Joined(fLabel, fText);
	const float room = bounds.Width() - (right.IsEmpty() ? 0 : rightWidth + kTextGap);
	TruncateString(&right, B_TRUNCATE_END, bounds.Width() + 1);
	// A fraction of a pixel that is missing cuts nothing.
	TruncateString(&left, B_TRUNCATE_END, std::max(room, 0.0f) + 1);

	SetHighColor(BPrivate::ControlTextColor(true, ViewColor()));
	SetDrawingMode(B_OP_OVER);
	if (room > 0)
		DrawString(left.String(), BPoint(bounds.left, baseline));
	DrawString(right.String(), BPoint(std::floor(bounds.right - rightWidth), baseline));
	SetDrawingMode(B_OP_COPY);
}
