// SPDX-License-Identifier: MIT

#include <TextControl.h>

#include <cmath>

#include <Message.h>
#include <Window.h>

#include "ControlLook.h"
#include "TextInput.h"
#include "interface/ArchivedEnum.h"

using BPrivate::AlignmentOf;

namespace {

// Between the control's edges (and the divider) and the text.
constexpr float kInset = 2;
// Between the label's end and the field.
constexpr float kLabelGap = 4;
// Between the text view's edges and the text.
constexpr float kTextMargin = 2;

} // namespace

BTextControl::BTextControl(BRect frame, const char* name, const char* label,
	const char* initialText, BMessage* message, uint32 resizeMask, uint32 flags)
	: BControl(frame, name, label, message, resizeMask, (flags & ~B_NAVIGABLE) | B_FRAME_EVENTS),
	  fInput(NULL),
	  fModificationMessage(NULL),
	  fLabelAlignment(B_ALIGN_LEFT),
	  fTextAlignment(B_ALIGN_LEFT),
	  fDivider(Label() != NULL ? std::floor(frame.Width() / 2) : 0),
	  fWantsInputNavigation((flags & B_NAVIGABLE) != 0)
{
	Build(initialText);
}


BTextControl::BTextControl(
	const char* name, const char* label, const char* initialText, BMessage* message, uint32 flags)
	: BTextControl(
		BRect(0, 0, 100, 20), name, label, initialText, message, B_FOLLOW_LEFT_TOP, flags)
{
}


BTextControl::BTextControl(const char* label, const char* initialText, BMessage* message)
	: BTextControl(NULL, label, initialText, message)
{
}


BTextControl::BTextControl(BMessage* archive)
	: BControl(archive),
	  fInput(NULL),
	  fModificationMessage(NULL),
	  fLabelAlignment(B_ALIGN_LEFT),
	  fTextAlignment(B_ALIGN_LEFT),
	  fDivider(0),
	  fWantsInputNavigation(true)
{
	int32 number;
	if (archive->FindInt32("_a_label", &number) == B_OK)
		fLabelAlignment = AlignmentOf(number);
	if (archive->FindInt32("_a_text", &number) == B_OK)
		fTextAlignment = AlignmentOf(number);
	archive->FindFloat("_divide", &fDivider);
	BMessage message;
	if (archive->FindMessage("_mod_msg", &message) == B_OK)
		fModificationMessage = new BMessage(message);
	Build(archive->FindString("_text"));
}


BTextControl::~BTextControl()
{
	delete fModificationMessage;
}


BArchivable*
BTextControl::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BTextControl") ? new BTextControl(archive) : NULL;
}


status_t
BTextControl::Archive(BMessage* archive, bool) const
{
	// The text view is made anew and is no part of the archive.
	status_t status = BControl::Archive(archive, false);
	if (status == B_OK)
		status = archive->AddInt32("_a_label", fLabelAlignment);
	if (status == B_OK)
		status = archive->AddInt32("_a_text", fTextAlignment);
	if (status == B_OK)
		status = archive->AddFloat("_divide", fDivider);
	if (status == B_OK)
		status = archive->AddString("_text", Text());
	if (status == B_OK && fModificationMessage != NULL)
		status = archive->AddMessage("_mod_msg", fModificationMessage);
	return status;
}


void
BTextControl::AttachedToWindow()
{
	BControl::AttachedToWindow();
	// As long as it was not attached, a new size did not reach it.
	LayOutField();
	UpdateInput();
}


void
BTextControl::Draw(BRect)
{
	const BRect bounds = Bounds();
	const bool focused = fInput->IsFocus() && Window()->IsActive();
	BPrivate::DrawFieldSurface(this,
		BRect(bounds.left + fDivider, bounds.top, bounds.right, bounds.bottom),
		{IsEnabled(), focused, false});
	if (Label() == NULL || fDivider <= 0)
		return;

	font_height height;
	GetFontHeight(&height);
	BString label(Label());
	const float width = fDivider - kLabelGap;
	// A fraction of a pixel that is missing cuts nothing.
	if (StringWidth(label.String()) > width + 1)
		TruncateString(&label, B_TRUNCATE_END, width);
	float left = bounds.left;
	if (fLabelAlignment != B_ALIGN_LEFT) {
		const float space = width - StringWidth(label.String());
		left += std::floor(fLabelAlignment == B_ALIGN_RIGHT ? space : space / 2);
	}
	SetHighColor(BPrivate::ControlTextColor(IsEnabled(), ViewColor()));
	SetDrawingMode(B_OP_OVER);
	DrawString(label.String(),
		BPoint(left, fInput->Frame().top + fInput->TextRect().top + std::ceil(height.ascent)));
	SetDrawingMode(B_OP_COPY);
}


void
BTextControl::MouseDown(BPoint)
{
	if (IsEnabled() && !fInput->IsFocus())
		fInput->MakeFocus(true);
}


void
BTextControl::FrameResized(float newWidth, float newHeight)
{
	BControl::FrameResized(newWidth, newHeight);
	LayOutField();
	Invalidate();
}


void
BTextControl::WindowActivated(bool active)
{
	BControl::WindowActivated(active);
	if (fInput->IsFocus())
		Invalidate();
}


void
BTextControl::GetPreferredSize(float* _width, float* _height)
{
	if (_width != NULL) {
		const float label = Label() != NULL ? std::ceil(StringWidth(Label())) + kLabelGap : 0;
		*_width = label + std::ceil(StringWidth(Text())) + 2 * (kInset + kTextMargin) + 40;
	}
	if (_height != NULL)
		*_height = NeededHeight();
}


void
BTextControl::SetFont(const BFont* font, uint32 mask)
{
	BControl::SetFont(font, mask);
	if (fInput == NULL)
		return;
	fInput->SetFont(font, mask);
	LayOutField();
}


void
BTextControl::SetText(const char* text)
{
	fInput->SetText(text);
	fCommittedText = fInput->Text();
	if (fInput->IsFocus())
		fInput->SelectAll();
}


const char*
BTextControl::Text() const
{
	return fInput->Text();
}


int32
BTextControl::TextLength() const
{
	return fInput->TextLength();
}


BTextView*
BTextControl::TextView() const
{
	return fInput;
}


void
BTextControl::SetModificationMessage(BMessage* message)
{
	delete fModificationMessage;
	fModificationMessage = message;
}


BMessage*
BTextControl::ModificationMessage() const
{
	return fModificationMessage;
}


void
BTextControl::SetAlignment(alignment label, alignment text)
{
	fLabelAlignment = label;
	fTextAlignment = text;
	fInput->SetAlignment(text);
	if (Window() != NULL)
		Invalidate();
}


void
BTextControl::GetAlignment(alignment* _label, alignment* _text) const
{
	if (_label != NULL)
		*_label = fLabelAlignment;
	if (_text != NULL)
		*_text = fTextAlignment;
}


void
BTextControl::SetDivider(float position)
{
	fDivider = std::floor(position + 0.5f);
	LayOutField();
	if (Window() != NULL)
		Invalidate();
}


float
BTextControl::Divider() const
{
	return fDivider;
}


void
BTextControl::MakeFocus(bool focus)
{
	if (focus != fInput->IsFocus())
		fInput->MakeFocus(focus);
	else if (focus)
		fInput->SelectAll();
}


void
BTextControl::SetEnabled(bool enable)
{
	if (enable == IsEnabled())
		return;
	BControl::SetEnabled(enable);
	UpdateInput();
	// Last: what was changed is sent with this.
	if (!enable && fInput->IsFocus())
		fInput->MakeFocus(false);
}


void
BTextControl::SetFlags(uint32 flags)
{
	fWantsInputNavigation = (flags & B_NAVIGABLE) != 0;
	if (fInput != NULL)
		UpdateInput();
	BControl::SetFlags(flags & ~B_NAVIGABLE);
}


status_t
BTextControl::Invoke(BMessage* message)
{
	return BControl::Invoke(message);
}


void
BTextControl::Build(const char* text)
{
	ResizeTo(Bounds().Width(), NeededHeight());
	BControl::SetFlags((Flags() & ~B_NAVIGABLE) | B_FRAME_EVENTS);
	fInput =
		new BPrivate::TextInput(this, BRect(0, 0, 10, 10), fWantsInputNavigation ? B_NAVIGABLE : 0);
	AddChild(fInput);
	fInput->SetAlignment(fTextAlignment);
	LayOutField();
	UpdateInput();
	fInput->SetText(text);
	fCommittedText = fInput->Text();
}


/// What the text view needs to know of the control's state.
void
BTextControl::UpdateInput()
{
	const uint32 navigable = IsEnabled() && fWantsInputNavigation ? B_NAVIGABLE : 0;
	fInput->SetFlags((fInput->Flags() & ~B_NAVIGABLE) | navigable);
	fInput->SetViewColor(BPrivate::FieldColor({IsEnabled(), false, false}));
	fInput->SetLowColor(fInput->ViewColor());
	if (fInput->Window() != NULL)
		fInput->Invalidate();
}


/// Places the text view in the field, which reaches from the divider to the right edge.
void
BTextControl::LayOutField()
{
	if (fInput == NULL)
		return;
	const BRect bounds = Bounds();
	fInput->MoveTo(fDivider + kInset, kInset);
	fInput->ResizeTo(std::fmax(bounds.Width() - fDivider - 2 * kInset, 0),
		std::fmax(bounds.Height() - 2 * kInset, 0));
	// One line, in the middle of the height.
	BRect textRect = fInput->Bounds().OffsetToCopy(0, 0).InsetByCopy(kTextMargin, 0);
	textRect.top = std::fmax(std::floor((textRect.Height() + 1 - fInput->LineHeight()) / 2), 0);
	fInput->SetTextRect(textRect);
}


float
BTextControl::NeededHeight() const
{
	font_height height;
	GetFontHeight(&height);
	return std::ceil(height.ascent) + std::ceil(height.descent) + 2 * kInset + 2;
}


void
BTextControl::InputChanged()
{
	// Who is told of a change and makes another one is not told again: that would never end.
	if (fModificationMessage != NULL && InvokeKind() != B_CONTROL_MODIFIED)
		InvokeNotify(fModificationMessage, B_CONTROL_MODIFIED);
}


/// The text is final for now: tells it unless it was told before.
void
BTextControl::InputCommitted()
{
	if (fCommittedText == fInput->Text())
		return;
	fCommittedText = fInput->Text();
	Invoke();
}


void
BTextControl::InputFocusChanged(bool focused)
{
	if (Window() != NULL)
		Invalidate();
	if (focused)
		fCommittedText = fInput->Text();
	else
		InputCommitted();
}


void
BTextControl::ForgetChange()
{
	fCommittedText = fInput->Text();
}
