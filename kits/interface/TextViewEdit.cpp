// SPDX-License-Identifier: MIT
// BTextView: changes of the text, the selection and the clipboard.

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <cstring>

#include <Beep.h>
#include <Clipboard.h>
#include <Message.h>
#include <TextView.h>
#include <Window.h>

#include "TextLayout.h"
#include "TextScroll.h"
#include "TextStyles.h"
#include "TextUndo.h"

namespace {

constexpr const char* kPlainText = "text/plain";
constexpr const char* kRunArray = "application/x-vnd.Be-text_run_array";

/// The code point of the UTF-8 character of that length; bytes that are none count as themselves.
uint32
CodePoint(const char* text, int32 length)
{
	const unsigned char first = text[0];
	if (length == 1)
		return first;
	uint32 code = first & (0xff >> (length + 1));
	for (int32 i = 1; i < length; i++)
		code = code << 6 | (text[i] & 0x3f);
	return code;
}

} // namespace

void
BTextView::Insert(const char* text, const text_run_array* runs)
{
	if (text != NULL)
		Insert(text, static_cast<int32>(strlen(text)), runs);
}


void
BTextView::Insert(const char* text, int32 length, const text_run_array* runs)
{
	int32 start;
	GetSelection(&start, NULL);
	Insert(start, text, length, runs);
}


void
BTextView::Insert(int32 offset, const char* text, int32 length, const text_run_array* runs)
{
	if (text == NULL || length <= 0)
		return;
	// A copy: the text may be this view's own.
	const std::string inserted(text, strnlen(text, length));
	if (!inserted.empty()) {
		InsertAt(std::clamp<int32>(offset, 0, TextLength()), inserted.data(),
			static_cast<int32>(inserted.size()), runs);
	}
}


void
BTextView::InsertAt(int32 offset, const char* text, int32 length, const text_run_array* runs)
{
	const int32 before = TextLength();
	InsertText(text, length, offset, runs);
	// A subclass may have inserted more, or less.
	const int32 grown = TextLength() - before;
	if (fCaret >= offset)
		fCaret += grown;
	if (fAnchor >= offset)
		fAnchor += grown;
	SealUndo();
	if (fUndo != NULL && grown > 0)
		fUndo->Note({offset, "", NULL, fText.substr(offset, grown)});
	SealUndo();
	TextChanged();
}


void
BTextView::Delete()
{
	int32 start;
	int32 end;
	GetSelection(&start, &end);
	Delete(start, end);
}


void
BTextView::Delete(int32 startOffset, int32 endOffset)
{
	const int32 start = std::clamp<int32>(startOffset, 0, TextLength());
	const int32 end = std::clamp<int32>(endOffset, 0, TextLength());
	if (start < end)
		Replace(start, end, "", 0);
}


void
BTextView::InsertText(const char* text, int32 length, int32 offset, const text_run_array* runs)
{
	// Text without styles of its own goes on in the style that is before it.
	BPrivate::TextStyle style = fStyles->At(std::max<int32>(offset - 1, 0));
	if (fNextStyle != NULL)
		style = {fNextStyle->font, fNextStyle->color};
	fText.insert(offset, text, length);
	fStyles->Insert(offset, length, style);
	if (fStylable && runs != NULL)
		ApplyRuns(offset, offset + length, runs);
	fChanged = true;
	fLayout->Update(offset, 0, length);
	FixScrollBars();
	InvalidateText();
}


void
BTextView::DeleteText(int32 fromOffset, int32 toOffset)
{
	fText.erase(fromOffset, toOffset - fromOffset);
	fStyles->Remove(fromOffset, toOffset);
	fChanged = true;
	fLayout->Update(fromOffset, toOffset - fromOffset, 0);
	FixScrollBars();
	InvalidateText();
}


/// Puts a text in place of a range, and the caret behind it.
void
BTextView::Replace(int32 from, int32 to, const char* text, int32 length, const text_run_array* runs)
{
	const std::string removed = fText.substr(from, to - from);
	const std::string wanted(text, length);
	BPrivate::RunArray removedRuns;
	if (from < to && !fStyles->IsOneStyle())
		removedRuns = BPrivate::CopyRuns(*fStyles, from, to);
	// What takes the place of a text looks like its start.
	if (from < to && fNextStyle == NULL && fStylable) {
		const BPrivate::TextStyle& style = fStyles->At(from);
		fNextStyle = std::make_unique<text_run>(text_run{0, style.font, style.color});
	}
	if (from < to)
		DeleteText(from, to);
	const int32 before = TextLength();
	if (length > 0)
		InsertText(wanted.data(), length, from, runs);
	fNextStyle.reset();
	// A subclass may have inserted another text.
	const int32 grown = std::max<int32>(TextLength() - before, 0);
	if (fUndo != NULL)
		fUndo->Note({from, removed, std::move(removedRuns), fText.substr(from, grown)});
	fCaret = from + grown;
	fAnchor = fCaret;
	TextChanged();
}


/// Whether the user may put the text in place of so many bytes.
bool
BTextView::IsAllowed(const char* text, int32 length, int32 replaced)
{
	if (TextLength() - replaced + length > fMaxBytes)
		return false;
	if (fDisallowed.empty())
		return true;
	const std::string characters(text, length);
	for (int32 i = 0; i < length; i += BPrivate::CharacterLength(characters, i)) {
		const int32 size = BPrivate::CharacterLength(characters, i);
		if (fDisallowed.count(CodePoint(text + i, size)) != 0) {
			beep();
			return false;
		}
	}
	return true;
}


void
BTextView::TextChanged()
{
	fWantedX = -1;
	fCaret = std::clamp<int32>(fCaret, 0, TextLength());
	fAnchor = std::clamp<int32>(fAnchor, 0, TextLength());
	InvalidateText();
	if (!fChanged)
		return;
	fChanged = false;
	ChangeEnded();
}


void
BTextView::Select(int32 startOffset, int32 endOffset)
{
	if (startOffset > endOffset)
		return;
	fAnchor = std::clamp<int32>(startOffset, 0, TextLength());
	fCaret = std::clamp<int32>(endOffset, 0, TextLength());
	fWantedX = -1;
	fNextStyle.reset();
	SealUndo();
	InvalidateText();
}


void
BTextView::SelectAll()
{
	Select(0, TextLength());
}


void
BTextView::GetSelection(int32* _start, int32* _end) const
{
	if (_start != NULL)
		*_start = std::min(fAnchor, fCaret);
	if (_end != NULL)
		*_end = std::max(fAnchor, fCaret);
}


void
BTextView::Cut(BClipboard* clipboard)
{
	if (!fEditable || IsTypingHidden())
		return;
	Copy(clipboard);
	Clear();
}


void
BTextView::Copy(BClipboard* clipboard)
{
	int32 start;
	int32 end;
	GetSelection(&start, &end);
	if (start == end || IsTypingHidden() || clipboard == NULL || !clipboard->Lock())
		return;
	clipboard->Clear();
	AddSelection(clipboard->Data());
	clipboard->Commit();
	clipboard->Unlock();
}


/// As the clipboard and drags carry it.
void
BTextView::AddSelection(BMessage* message) const
{
	int32 start;
	int32 end;
	GetSelection(&start, &end);
	message->AddData(kPlainText, B_MIME_TYPE, fText.data() + start, end - start);
	if (!fStylable)
		return;
	const BPrivate::RunArray runs = BPrivate::CopyRuns(*fStyles, start, end);
	int32 size = 0;
	if (void* data = FlattenRunArray(runs.get(), &size)) {
		message->AddData(kRunArray, B_MIME_TYPE, data, size);
		free(data);
	}
}


/// No runs for a text that is not stylable, or when there are none.
void
BTextView::ReadText(const BMessage& message, std::string* text, BPrivate::RunArray* runs) const
{
	const void* data = NULL;
	ssize_t size = 0;
	if (fStylable && message.FindData(kRunArray, B_MIME_TYPE, &data, &size) == B_OK)
		*runs = BPrivate::ReadFlatRuns(data, size);
	if (message.FindData(kPlainText, B_MIME_TYPE, &data, &size) == B_OK)
		text->assign(static_cast<const char*>(data), strnlen(static_cast<const char*>(data), size));
}


void
BTextView::Paste(BClipboard* clipboard)
{
	if (!fEditable || clipboard == NULL || !clipboard->Lock())
		return;
	std::string text;
	BPrivate::RunArray runs;
	ReadText(*clipboard->Data(), &text, &runs);
	clipboard->Unlock();

	int32 start;
	int32 end;
	GetSelection(&start, &end);
	PutInPlace(start, end, text, runs.get());
}


/// Puts text that comes from elsewhere in the place of other text, as one change, if it is allowed.
void
BTextView::PutInPlace(int32 from, int32 to, const std::string& text, const text_run_array* runs)
{
	const int32 length = static_cast<int32>(text.size());
	if (length == 0 || !IsAllowed(text.data(), length, to - from))
		return;
	SealUndo();
	Replace(from, to, text.data(), length, runs);
	SealUndo();
	ScrollToSelection();
}


void
BTextView::Clear()
{
	SealUndo();
	Delete();
	SealUndo();
}


bool
BTextView::AcceptsPaste(BClipboard* clipboard)
{
	if (!fEditable || clipboard == NULL || !clipboard->Lock())
		return false;
	const bool accepts = clipboard->Data()->HasData(kPlainText, B_MIME_TYPE);
	clipboard->Unlock();
	return accepts;
}


bool
BTextView::AcceptsDrop(const BMessage* message)
{
	return fEditable && message != NULL && message->HasData(kPlainText, B_MIME_TYPE);
}


void
BTextView::SetDoesUndo(bool undo)
{
	if (!undo)
		fUndo.reset();
	else if (fUndo == NULL)
		fUndo = std::make_unique<BPrivate::TextUndo>();
}


bool
BTextView::DoesUndo() const
{
	return fUndo != NULL;
}


void
BTextView::Undo(BClipboard*)
{
	if (fEditable && fUndo != NULL)
		GoBack(fUndo->StartUndo(fText).get());
}


void
BTextView::Redo()
{
	if (fEditable && fUndo != NULL)
		GoBack(fUndo->StartRedo(fText).get());
}


/// Takes back a change that the history has begun to take back; null for none.
void
BTextView::GoBack(const BPrivate::TextChange* change)
{
	if (change == NULL)
		return;
	Replace(change->offset, change->offset + static_cast<int32>(change->inserted.size()),
		change->removed.data(), static_cast<int32>(change->removed.size()), change->styles.get());
	// What a subclass did with it may have set the history aside.
	if (fUndo != NULL)
		fUndo->End();
	ScrollToSelection();
}


void
BTextView::MessageReceived(BMessage* message)
{
	if (message->WasDropped() && AcceptsDrop(message)) {
		TakeDrop(message);
		return;
	}

	switch (message->what) {
		case B_CUT:
			Cut(be_clipboard);
			break;

		case B_COPY:
			Copy(be_clipboard);
			break;

		case B_PASTE:
			Paste(be_clipboard);
			break;

		case B_SELECT_ALL:
			if (fSelectable)
				SelectAll();
			break;

		case B_UNDO:
			Undo(be_clipboard);
			break;

		case B_REDO:
			Redo();
			break;

		case BPrivate::kMsgScrollOn:
			ScrollOn();
			break;

		default:
			BView::MessageReceived(message);
			break;
	}
}


void
BTextView::SealUndo()
{
	if (fUndo != NULL)
		fUndo->Seal();
}
