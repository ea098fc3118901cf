// SPDX-License-Identifier: MIT
// BTextView: the text, its attributes and its picture.

#include <TextView.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <cstring>

#include <Cursor.h>
#include <File.h>
#include <Message.h>
#include <MessageRunner.h>
#include <ScrollView.h>
#include <Window.h>

#include "ControlLook.h"
#include "TextLayout.h"
#include "TextStyles.h"
#include "TextUndo.h"
#include "interface/ArchivedEnum.h"

using BPrivate::AlignmentOf;

namespace {

constexpr float kDefaultTabWidth = 28;

std::unique_ptr<BPrivate::TextStyles>
StartStyles(const BFont* font, const rgb_color* color)
{
	return std::make_unique<BPrivate::TextStyles>(
		BPrivate::TextStyle{font != NULL ? *font : *be_plain_font,
			color != NULL ? *color : ui_color(B_DOCUMENT_TEXT_COLOR)});
}


void
AddEditingShortcut(BWindow* window, uint32 key, uint32 modifiers, uint32 what)
{
	if (!window->HasShortcut(key, modifiers))
		window->AddShortcut(key, modifiers, new BMessage(what), NULL);
}

} // namespace

BTextView::BTextView(BRect frame, const char* name, BRect textRect, uint32 resizeMask, uint32 flags)
	: BTextView(frame, name, textRect, NULL, NULL, resizeMask, flags)
{
}


BTextView::BTextView(BRect frame, const char* name, BRect textRect, const BFont* initialFont,
	const rgb_color* initialColor, uint32 resizeMask, uint32 flags)
	: BView(frame, name, resizeMask, flags | B_FRAME_EVENTS),
	  fStyles(StartStyles(initialFont, initialColor)),
	  fLayout(std::make_unique<BPrivate::TextLayout>(fText, *fStyles)),
	  fUndo(std::make_unique<BPrivate::TextUndo>()),
	  fTextRect(textRect),
	  fScrollView(NULL),
	  fChanged(false),
	  fAnchor(0),
	  fCaret(0),
	  fMaxBytes(INT32_MAX),
	  fTabWidth(kDefaultTabWidth),
	  fWantedX(-1),
	  fAlignment(B_ALIGN_LEFT),
	  fEditable(true),
	  fSelectable(true),
	  fWordWrap(true),
	  fStylable(false),
	  fAutoindent(false),
	  fSelecting(false),
	  fMayDrag(false),
	  fDragId(0),
	  fDropPlace(-1)
{
	SetViewColor(ui_color(B_DOCUMENT_BACKGROUND_COLOR));
	SetLowColor(ViewColor());
	BView::SetFont(&fStyles->At(0).font);
	Relayout();
}


BTextView::BTextView(const char* name, uint32 flags)
	: BTextView(name, NULL, NULL, flags)
{
}


BTextView::BTextView(
	const char* name, const BFont* initialFont, const rgb_color* initialColor, uint32 flags)
	: BTextView(BRect(0, 0, -1, -1), name, BRect(0, 0, 100, 100), initialFont, initialColor,
		B_FOLLOW_LEFT_TOP, flags)
{
}


BTextView::BTextView(BMessage* archive)
	: BView(archive),
	  fStyles(StartStyles(NULL, NULL)),
	  fLayout(std::make_unique<BPrivate::TextLayout>(fText, *fStyles)),
	  fUndo(std::make_unique<BPrivate::TextUndo>()),
	  fTextRect(Bounds()),
	  fScrollView(NULL),
	  fChanged(false),
	  fAnchor(0),
	  fCaret(0),
	  fMaxBytes(INT32_MAX),
	  fTabWidth(kDefaultTabWidth),
	  fWantedX(-1),
	  fAlignment(B_ALIGN_LEFT),
	  fEditable(true),
	  fSelectable(true),
	  fWordWrap(true),
	  fStylable(false),
	  fAutoindent(false),
	  fSelecting(false),
	  fMayDrag(false),
	  fDragId(0),
	  fDropPlace(-1)
{
	archive->FindRect("_trect", &fTextRect);
	BPrivate::TextStyle style = fStyles->At(0);
	GetFont(&style.font);
	archive->FindColor("_tcolor", &style.color);
	fStyles->SetAll(style);
	archive->FindBool("_stylable", &fStylable);
	const char* text;
	if (archive->FindString("_text", &text) == B_OK)
		SetText(text);
	const void* data;
	ssize_t size;
	if (archive->FindData("_runs", B_RAW_TYPE, &data, &size) == B_OK) {
		if (const BPrivate::RunArray runs = BPrivate::ReadFlatRuns(data, size))
			SetRunArray(0, TextLength(), runs.get());
	}
	int32 number;
	if (archive->FindInt32("_max", &number) == B_OK)
		fMaxBytes = number;
	if (archive->FindInt32("_align", &number) == B_OK)
		fAlignment = AlignmentOf(number);
	bool flag;
	if (archive->FindBool("_nedit", &flag) == B_OK)
		fEditable = !flag;
	if (archive->FindBool("_nsel", &flag) == B_OK)
		fSelectable = !flag;
	if (archive->FindBool("_wrap", &flag) == B_OK)
		fWordWrap = flag;
	if (archive->FindBool("_auto", &flag) == B_OK)
		fAutoindent = flag;
	float tabWidth;
	if (archive->FindFloat("_tab", &tabWidth) == B_OK)
		SetTabWidth(tabWidth);
	Relayout();
}


BTextView::~BTextView() {}


BArchivable*
BTextView::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BTextView") ? new BTextView(archive) : NULL;
}


status_t
BTextView::Archive(BMessage* archive, bool deep) const
{
	status_t status = BView::Archive(archive, deep);
	if (status == B_OK)
		status = archive->AddRect("_trect", fTextRect);
	if (status == B_OK)
		status = archive->AddString("_text", Text());
	if (status == B_OK && fMaxBytes != INT32_MAX)
		status = archive->AddInt32("_max", fMaxBytes);
	if (status == B_OK)
		status = archive->AddBool("_nedit", !fEditable);
	if (status == B_OK)
		status = archive->AddBool("_nsel", !fSelectable);
	if (status == B_OK)
		status = archive->AddBool("_wrap", fWordWrap);
	if (status == B_OK)
		status = archive->AddBool("_auto", fAutoindent);
	if (status == B_OK)
		status = archive->AddInt32("_align", fAlignment);
	if (status == B_OK)
		status = archive->AddFloat("_tab", fTabWidth);
	if (status == B_OK)
		status = archive->AddColor("_tcolor", fStyles->At(0).color);
	if (status == B_OK && fStylable)
		status = archive->AddBool("_stylable", true);
	if (status != B_OK || fStyles->IsOneStyle())
		return status;
	const BPrivate::RunArray runs = BPrivate::CopyRuns(*fStyles, 0, TextLength());
	int32 size = 0;
	void* data = FlattenRunArray(runs.get(), &size);
	status = data != NULL ? archive->AddData("_runs", B_RAW_TYPE, data, size) : B_NO_MEMORY;
	free(data);
	return status;
}


void
BTextView::AttachedToWindow()
{
	BView::AttachedToWindow();
	if (fSelectable || fEditable)
		SetViewCursor(B_CURSOR_I_BEAM);
	Relayout();
}


void
BTextView::DetachedFromWindow()
{
	StopSelecting();
	BView::DetachedFromWindow();
}


void
BTextView::WindowActivated(bool active)
{
	BView::WindowActivated(active);
	if (IsFocus())
		FocusChanged();
}


void
BTextView::FrameResized(float newWidth, float newHeight)
{
	BView::FrameResized(newWidth, newHeight);
	FixScrollBars();
	InvalidateText();
}


void
BTextView::TargetedByScrollView(BScrollView* scrollView)
{
	fScrollView = scrollView;
	BView::TargetedByScrollView(scrollView);
	FixScrollBars();
}


void
BTextView::MakeFocus(bool focus)
{
	const bool had = IsFocus();
	BView::MakeFocus(focus);
	SealUndo();
	if (IsFocus() == had)
		return;
	// Windows know the other editing shortcuts; a program's own one takes their place.
	if (focus && fEditable) {
		AddEditingShortcut(Window(), 'z', B_COMMAND_KEY, B_UNDO);
		AddEditingShortcut(Window(), 'z', B_COMMAND_KEY | B_SHIFT_KEY, B_REDO);
	}
	FocusChanged();
}


void
BTextView::GetPreferredSize(float* _width, float* _height)
{
	if (_width != NULL)
		*_width = Bounds().Width();
	if (_height != NULL) {
		const float insets = fTextRect.top - Bounds().top;
		*_height = TextHeight(0, CountLines() - 1) + 2 * std::max(insets, 0.0f);
	}
}


void
BTextView::SetFont(const BFont* font, uint32 mask)
{
	BView::SetFont(font, mask);
	if (font == NULL)
		return;
	fStyles->Apply(0, std::max<int32>(TextLength(), 1), font, mask, NULL);
	fNextStyle.reset();
	Relayout();
}


void
BTextView::SetText(const char* text, const text_run_array* runs)
{
	SetText(text, text != NULL ? static_cast<int32>(strlen(text)) : 0, runs);
}


void
BTextView::SetText(const char* text, int32 length, const text_run_array* runs)
{
	// A copy: the text may be this view's own.
	std::string newText;
	if (text != NULL && length > 0)
		newText.assign(text, strnlen(text, length));
	fAnchor = 0;
	fCaret = 0;
	if (!fText.empty())
		DeleteText(0, TextLength());
	if (!newText.empty())
		InsertText(newText.data(), static_cast<int32>(newText.size()), 0, runs);
	if (fUndo != NULL)
		fUndo->Forget();
	TextChanged();
	ScrollToOffset(0);
}


void
BTextView::SetText(BFile* file, int32 offset, int32 length, const text_run_array* runs)
{
	if (file == NULL || length < 0)
		return;
	off_t size;
	if (file->GetSize(&size) != B_OK || offset < 0 || offset > size)
		return;
	std::string text(std::min<off_t>(length, size - offset), '\0');
	const ssize_t read = file->ReadAt(offset, text.data(), text.size());
	if (read >= 0)
		SetText(text.data(), static_cast<int32>(read), runs);
}


const char*
BTextView::Text() const
{
	return fText.c_str();
}


int32
BTextView::TextLength() const
{
	return static_cast<int32>(fText.size());
}


void
BTextView::GetText(int32 offset, int32 length, char* buffer) const
{
	const int32 start = std::clamp<int32>(offset, 0, TextLength());
	const int32 count = std::clamp<int32>(length, 0, TextLength() - start);
	memcpy(buffer, fText.data() + start, count);
	buffer[count] = '\0';
}


int32
BTextView::CountLines() const
{
	return fLayout->CountLines();
}


int32
BTextView::CurrentLine() const
{
	return LineAt(fCaret);
}


int32
BTextView::LineAt(int32 offset) const
{
	return fLayout->LineAt(std::clamp<int32>(offset, 0, TextLength()));
}


int32
BTextView::LineAt(BPoint point) const
{
	return fLayout->LineAtHeight(point.y - fTextRect.top);
}


BPoint
BTextView::PointAt(int32 offset, float* _height) const
{
	offset = std::clamp<int32>(offset, 0, TextLength());
	const int32 line = LineAt(offset);
	if (_height != NULL)
		*_height = fLayout->LineHeight(line);

	float left = fTextRect.left;
	if (fAlignment != B_ALIGN_LEFT) {
		// A line that does not fit begins at the left, where it can be scrolled to.
		const float space = std::max(fTextRect.Width() - fLayout->LineWidth(line), 0.0f);
		left += std::floor(fAlignment == B_ALIGN_RIGHT ? space : space / 2);
	}
	return BPoint(left + fLayout->XAt(line, offset), fTextRect.top + fLayout->LineTop(line));
}


int32
BTextView::OffsetAt(BPoint point) const
{
	const int32 line = LineAt(point);
	if (point.y < fTextRect.top)
		return 0;
	if (point.y >= fTextRect.top + fLayout->Height() && CountLines() > 1)
		return TextLength();
	const float left = PointAt(fLayout->LineStart(line)).x;
	return fLayout->OffsetAt(line, point.x - left);
}


int32
BTextView::OffsetAt(int32 line) const
{
	if (line < 0)
		return 0;
	return line < CountLines() ? fLayout->LineStart(line) : TextLength();
}


float
BTextView::LineWidth(int32 lineNumber) const
{
	return lineNumber >= 0 && lineNumber < CountLines() ? fLayout->LineWidth(lineNumber) : 0;
}


float
BTextView::LineHeight(int32 lineNumber) const
{
	return lineNumber >= 0 && lineNumber < CountLines() ? fLayout->LineHeight(lineNumber) : 0;
}


float
BTextView::TextHeight(int32 startLine, int32 endLine) const
{
	const int32 first = std::max<int32>(startLine, 0);
	const int32 last = std::min(endLine, CountLines() - 1);
	if (last < first)
		return 0;
	return fLayout->LineTop(last) + fLayout->LineHeight(last) - fLayout->LineTop(first);
}


void
BTextView::SetTextRect(BRect rect)
{
	fTextRect = rect;
	Relayout();
}


BRect
BTextView::TextRect() const
{
	return fTextRect;
}


void
BTextView::SetInsets(float left, float top, float right, float bottom)
{
	const BRect bounds = Bounds();
	SetTextRect(
		BRect(bounds.left + left, bounds.top + top, bounds.right - right, bounds.bottom - bottom));
}


void
BTextView::GetInsets(float* _left, float* _top, float* _right, float* _bottom) const
{
	const BRect bounds = Bounds();
	if (_left != NULL)
		*_left = fTextRect.left - bounds.left;
	if (_top != NULL)
		*_top = fTextRect.top - bounds.top;
	if (_right != NULL)
		*_right = bounds.right - fTextRect.right;
	if (_bottom != NULL)
		*_bottom = bounds.bottom - fTextRect.bottom;
}


void
BTextView::SetStylable(bool stylable)
{
	if (stylable == fStylable)
		return;
	fStylable = stylable;
	fNextStyle.reset();
	if (stylable || fStyles->IsOneStyle())
		return;
	const BPrivate::TextStyle style = fStyles->At(0);
	fStyles->SetAll(style);
	Relayout();
}


bool
BTextView::IsStylable() const
{
	return fStylable;
}


void
BTextView::SetTabWidth(float width)
{
	if (width <= 0)
		return;
	fTabWidth = width;
	Relayout();
}


float
BTextView::TabWidth() const
{
	return fTabWidth;
}


void
BTextView::MakeSelectable(bool selectable)
{
	fSelectable = selectable;
	InvalidateText();
}


bool
BTextView::IsSelectable() const
{
	return fSelectable;
}


void
BTextView::MakeEditable(bool editable)
{
	fEditable = editable;
	InvalidateText();
}


bool
BTextView::IsEditable() const
{
	return fEditable;
}


void
BTextView::SetWordWrap(bool wrap)
{
	if (wrap == fWordWrap)
		return;
	fWordWrap = wrap;
	Relayout();
}


bool
BTextView::DoesWordWrap() const
{
	return fWordWrap;
}


int32
BTextView::MaxBytes() const
{
	return fMaxBytes;
}


void
BTextView::SetMaxBytes(int32 max)
{
	fMaxBytes = max;
	if (TextLength() <= max || max < 0)
		return;
	int32 end = max;
	while (end > 0 && (static_cast<unsigned char>(fText[end]) & 0xc0) == 0x80)
		end--;
	const int32 anchor = fAnchor;
	const int32 caret = fCaret;
	Delete(end, TextLength());
	// Taking it back would go beyond again.
	if (fUndo != NULL)
		fUndo->Forget();
	fAnchor = std::min(anchor, end);
	fCaret = std::min(caret, end);
}


void
BTextView::DisallowChar(uint32 character)
{
	fDisallowed.insert(character);
}


void
BTextView::AllowChar(uint32 character)
{
	fDisallowed.erase(character);
}


void
BTextView::SetAlignment(alignment align)
{
	fAlignment = align;
	InvalidateText();
}


alignment
BTextView::Alignment() const
{
	return fAlignment;
}


void
BTextView::SetAutoindent(bool state)
{
	fAutoindent = state;
}


bool
BTextView::DoesAutoindent() const
{
	return fAutoindent;
}


void
BTextView::Draw(BRect updateRect)
{
	SetDrawingMode(B_OP_OVER);
	SetLowColor(ViewColor());
	const int32 first = LineAt(updateRect.LeftTop());
	const int32 last = LineAt(updateRect.RightBottom());
	for (int32 line = first; line <= last; line++)
		DrawLine(line, updateRect);

	if (fDropPlace >= 0)
		DrawCaret(fDropPlace);
	else if (ShowsCaret())
		DrawCaret(fCaret);
	SetDrawingMode(B_OP_COPY);
}


void
BTextView::DrawLine(int32 line, BRect updateRect)
{
	const BPoint top = PointAt(fLayout->LineStart(line));
	const BRect marked = SelectionIn(line);
	if (marked.IsValid()) {
		const rgb_color mark = ui_color(B_LIST_SELECTED_BACKGROUND_COLOR);
		SetHighColor(BPrivate::BlendColors(ViewColor(), mark, Window()->IsActive() ? 1.0f : 0.5f));
		FillRect(marked);
	}

	// Of a long line only what is seen, and what reaches into it.
	const float reach = fLayout->LineHeight(line);
	for (const BPrivate::TextLayout::Piece& piece : fLayout->LinePieces(line)) {
		if (top.x + piece.x > updateRect.right + reach)
			break;
		if (piece.style == NULL || top.x + piece.x + piece.width < updateRect.left - reach)
			continue;
		// Not by the own SetFont(), which is that of the text.
		BView::SetFont(&piece.style->font);
		SetHighColor(DrawnColor(piece.style->color));
		const std::string text = fLayout->Shown(piece.offset, piece.length);
		DrawString(text.data(), static_cast<int32>(text.size()),
			BPoint(top.x + piece.x, top.y + fLayout->Ascent(line)));
	}
}


void
BTextView::DrawCaret(int32 offset)
{
	float height;
	const BPoint top = PointAt(offset, &height);
	const float x = std::floor(top.x);
	SetHighColor(DrawnColor(fStyles->At(std::max<int32>(offset - 1, 0)).color));
	StrokeLine(BPoint(x, top.y), BPoint(x, top.y + height - 1));
}


bool
BTextView::ShowsCaret() const
{
	return fEditable && fCaret == fAnchor && IsFocus() && Window()->IsActive();
}


void
BTextView::Relayout()
{
	fLayout->SetTo(fWordWrap ? std::max(fTextRect.Width(), 1.0f) : 0, fTabWidth);
	FixScrollBars();
	InvalidateText();
}


void
BTextView::FocusChanged()
{
	if (fScrollView != NULL)
		fScrollView->SetBorderHighlighted(IsFocus() && Window() != NULL && Window()->IsActive());
	InvalidateText();
}


void
BTextView::InvalidateText()
{
	if (Window() != NULL)
		Invalidate();
}


/// Called when a change of the text is complete.
void
BTextView::ChangeEnded()
{
}


/// How a colour of the text is shown.
rgb_color
BTextView::DrawnColor(rgb_color color) const
{
	return color;
}
