// SPDX-License-Identifier: MIT
// A view for text that is read, selected and edited.
#ifndef _TEXT_VIEW_H
#define _TEXT_VIEW_H

#include <memory>
#include <set>
#include <string>
#include <vector>

#include <View.h>

class BClipboard;
class BFile;
class BMessageRunner;
class BScrollView;

/// One style from an offset on.
struct text_run {
	int32 offset;
	BFont font;
	rgb_color color;
};

/// \a count runs that follow each other; the array is as long as the count says.
struct text_run_array {
	int32 count;
	text_run runs[1];
};

namespace BPrivate {
class TextInput;
struct TextChange;
class TextLayout;
class TextStyles;
class TextUndo;
struct RunArrayDeleter;
typedef std::unique_ptr<text_run_array, RunArrayDeleter> RunArray;
} // namespace BPrivate

/// UTF-8 text in lines. Offsets are bytes; a selection without length is the caret.
///
/// Every insertion and deletion passes InsertText() and DeleteText(), where subclasses hook in. The text
/// has one font and one colour, unless it is stylable: then each range may have its own. Lock the window
/// as for any view.
class BTextView : public BView {
public:
	/// \a textRect: where the text is laid out, in view coordinates; keep its width in step with the
	/// view's.
	BTextView(BRect frame, const char* name, BRect textRect, uint32 resizeMask,
		uint32 flags = B_WILL_DRAW | B_PULSE_NEEDED);
	BTextView(BRect frame, const char* name, BRect textRect, const BFont* initialFont,
		const rgb_color* initialColor, uint32 resizeMask, uint32 flags);
	BTextView(const char* name, uint32 flags = B_WILL_DRAW | B_PULSE_NEEDED);
	BTextView(
		const char* name, const BFont* initialFont, const rgb_color* initialColor, uint32 flags);
	BTextView(BMessage* archive);
	virtual ~BTextView();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void AttachedToWindow() override;
	void DetachedFromWindow() override;
	void Draw(BRect updateRect) override;
	void MouseDown(BPoint where) override;
	void MouseUp(BPoint where) override;
	void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage) override;
	void WindowActivated(bool active) override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void FrameResized(float newWidth, float newHeight) override;
	void MakeFocus(bool focus = true) override;
	void MessageReceived(BMessage* message) override;
	void GetPreferredSize(float* _width, float* _height) override;
	/// Of the whole text.
	void SetFont(const BFont* font, uint32 mask = B_FONT_ALL) override;
	void TargetedByScrollView(BScrollView* scrollView) override;

	/// Replaces the whole text, which no limit applies to, and puts the caret at its start.
	void SetText(const char* text, const text_run_array* runs = NULL);
	void SetText(const char* text, int32 length, const text_run_array* runs = NULL);
	void SetText(BFile* file, int32 offset, int32 length, const text_run_array* runs = NULL);
	/// Inserts at the selection's start, or at \a offset. What was selected moves along and stays.
	void Insert(const char* text, const text_run_array* runs = NULL);
	void Insert(const char* text, int32 length, const text_run_array* runs = NULL);
	void Insert(int32 offset, const char* text, int32 length, const text_run_array* runs = NULL);
	/// Deletes the selection, or a range.
	void Delete();
	void Delete(int32 startOffset, int32 endOffset);

	/// Valid until the text changes.
	const char* Text() const;
	int32 TextLength() const;
	/// \a buffer holds \a length bytes and a terminator.
	void GetText(int32 offset, int32 length, char* buffer) const;

	virtual void Select(int32 startOffset, int32 endOffset);
	void SelectAll();
	void GetSelection(int32* _start, int32* _end) const;

	virtual void Cut(BClipboard* clipboard);
	virtual void Copy(BClipboard* clipboard);
	virtual void Paste(BClipboard* clipboard);
	/// Deletes the selection.
	void Clear();
	virtual bool AcceptsPaste(BClipboard* clipboard);
	virtual bool AcceptsDrop(const BMessage* message);

	/// Of the selection, and without one of what is typed next; of the whole text when it is not stylable.
	void SetFontAndColor(
		const BFont* font, uint32 mode = B_FONT_ALL, const rgb_color* color = NULL);
	/// Of a range, in bytes; of the whole text when it is not stylable.
	void SetFontAndColor(int32 startOffset, int32 endOffset, const BFont* font,
		uint32 mode = B_FONT_ALL, const rgb_color* color = NULL);
	void GetFontAndColor(int32 offset, BFont* _font, rgb_color* _color = NULL) const;
	/// Of the selection's start. \a _mode: what of the font is the same in the whole selection.
	void GetFontAndColor(
		BFont* _font, uint32* _mode, rgb_color* _color = NULL, bool* _sameColor = NULL) const;

	/// Offsets of the runs are counted from \a startOffset. A text that is not stylable takes the first.
	void SetRunArray(int32 startOffset, int32 endOffset, const text_run_array* runs);
	/// The caller's, for FreeRunArray(); \a _size gets its length in bytes.
	text_run_array* RunArray(int32 startOffset, int32 endOffset, int32* _size = NULL) const;
	/// Null when there is no memory or the count is below 0.
	static text_run_array* AllocRunArray(int32 entryCount, int32* outSize = NULL);
	/// With so many runs more or less.
	static text_run_array* CopyRunArray(const text_run_array* original, int32 countDelta = 0);
	static void FreeRunArray(text_run_array* array);
	/// As bytes for files and the clipboard, the caller's to free(). Null without a run array.
	static void* FlattenRunArray(const text_run_array* runArray, int32* _size = NULL);
	/// For FreeRunArray(). Null when the data begins otherwise; its length is not checked.
	static text_run_array* UnflattenRunArray(const void* data, int32* _size = NULL);

	int32 CountLines() const;
	/// The line that the caret is in, from 0.
	int32 CurrentLine() const;
	int32 LineAt(int32 offset) const;
	int32 LineAt(BPoint point) const;
	/// The left top of the character at \a offset, in view coordinates.
	BPoint PointAt(int32 offset, float* _height = NULL) const;
	int32 OffsetAt(BPoint point) const;
	int32 OffsetAt(int32 line) const;
	float LineWidth(int32 lineNumber = 0) const;
	float LineHeight(int32 lineNumber = 0) const;
	float TextHeight(int32 startLine, int32 endLine) const;

	virtual void ScrollToOffset(int32 offset);
	void ScrollToSelection();

	void SetTextRect(BRect rect);
	BRect TextRect() const;
	void SetInsets(float left, float top, float right, float bottom);
	void GetInsets(float* _left, float* _top, float* _right, float* _bottom) const;

	/// A text that is no longer stylable takes the style of its start.
	void SetStylable(bool stylable);
	bool IsStylable() const;
	/// For passwords: each character is shown as a dot, and nothing is copied.
	void HideTyping(bool enabled);
	bool IsTypingHidden() const;
	void SetTabWidth(float width);
	float TabWidth() const;
	void MakeSelectable(bool selectable = true);
	bool IsSelectable() const;
	void MakeEditable(bool editable = true);
	bool IsEditable() const;
	void SetWordWrap(bool wrap);
	bool DoesWordWrap() const;
	/// Cuts a longer text at once; typing and pasting that would go beyond is refused as a whole.
	void SetMaxBytes(int32 max);
	int32 MaxBytes() const;
	void DisallowChar(uint32 character);
	void AllowChar(uint32 character);
	void SetAlignment(alignment align);
	alignment Alignment() const;
	void SetAutoindent(bool state);
	bool DoesAutoindent() const;
	void SetDoesUndo(bool undo);
	bool DoesUndo() const;
	/// Takes back the last change that was not taken back yet. The messages B_UNDO and B_REDO (Command-Z and
	/// Command-Shift-Z) go back and forth among the changes.
	virtual void Undo(BClipboard* clipboard);

protected:
	virtual void InsertText(
		const char* text, int32 length, int32 offset, const text_run_array* runs);
	virtual void DeleteText(int32 fromOffset, int32 toOffset);

private:
	friend class BPrivate::TextInput;

	// What a text control wants to know: the text is another one, and complete.
	virtual void ChangeEnded();
	virtual rgb_color DrawnColor(rgb_color color) const;

	// Changes
	void Replace(
		int32 from, int32 to, const char* text, int32 length, const text_run_array* runs = NULL);
	void InsertAt(int32 offset, const char* text, int32 length, const text_run_array* runs);
	bool IsAllowed(const char* text, int32 length, int32 replaced);
	void PutInPlace(int32 from, int32 to, const std::string& text, const text_run_array* runs);
	void TextChanged();
	void SealUndo();
	void Redo();
	void GoBack(const BPrivate::TextChange* change);
	void ApplyRuns(int32 from, int32 to, const text_run_array* runs);
	void StylesChanged(int32 from, int32 to);

	// Keys
	bool MoveByKey(char key, bool extend, bool byWord);
	bool ScrollByKey(char key);
	void MoveCaret(int32 offset, bool extend);
	void DeleteByKey(bool forward, bool byWord);
	int32 VerticalTarget(int32 lines);
	int32 WordStart(int32 offset) const;
	int32 WordEnd(int32 offset) const;
	int32 NextOffset(int32 offset) const;
	int32 PreviousOffset(int32 offset) const;

	// Mouse
	void SelectTo(BPoint where);
	void ScrollOn();
	void StopSelecting();

	// Dragging
	BRect SelectionIn(int32 line) const;
	bool BeginPressOnSelection(BPoint where);
	void DragWhenFarEnough(BPoint where);
	void FollowDrag(BPoint where, uint32 code, const BMessage* dragMessage);
	void TakeDrop(const BMessage* message);
	bool MoveSelection(int32 offset);
	void AddSelection(BMessage* message) const;
	void ReadText(const BMessage& message, std::string* text, BPrivate::RunArray* runs) const;

	// Picture
	void Relayout();
	void InvalidateText();
	void DrawLine(int32 line, BRect updateRect);
	void DrawCaret(int32 offset);
	bool ShowsCaret() const;
	BSize ContentSize() const;
	BPoint LastPlace() const;
	void FixScrollBars();
	void FocusChanged();

	std::string fText;
	std::unique_ptr<BPrivate::TextStyles> fStyles;
	// What is typed next, when it was chosen.
	std::unique_ptr<text_run> fNextStyle;
	std::unique_ptr<BPrivate::TextLayout> fLayout;
	std::unique_ptr<BPrivate::TextUndo> fUndo;
	// While the pointer is beyond the edge in selecting.
	std::unique_ptr<BMessageRunner> fScrollOn;
	std::set<uint32> fDisallowed;
	BRect fTextRect;
	BScrollView* fScrollView;
	bool fChanged;
	int32 fAnchor;
	int32 fCaret;
	int32 fMaxBytes;
	float fTabWidth;
	float fWantedX;
	alignment fAlignment;
	bool fEditable;
	bool fSelectable;
	bool fWordWrap;
	bool fStylable;
	bool fAutoindent;
	bool fSelecting;
	// The press was on what is selected, and nothing has come of it yet.
	bool fMayDrag;
	BPoint fPressed;
	// The last one that began here, and where one over the view would be dropped, or -1.
	int64 fDragId;
	int32 fDropPlace;
};

#endif // _TEXT_VIEW_H
