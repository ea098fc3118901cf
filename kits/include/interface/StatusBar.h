// SPDX-License-Identifier: MIT
// How far something has come.
#ifndef _STATUS_BAR_H
#define _STATUS_BAR_H

#include <String.h>
#include <View.h>

/// A bar that fills from 0 to a greatest value, with texts above it: the label and the text at the
/// left, the trailing text and the trailing label at the right.
///
/// Messages drive it, too: B_UPDATE_STATUS_BAR ("delta" float, "text" and "trailing_text" string) and
/// B_RESET_STATUS_BAR ("label" and "trailing_label" string). When it is attached, it gets the height it needs.
class BStatusBar : public BView {
public:
	BStatusBar(
		BRect frame, const char* name, const char* label = NULL, const char* trailingLabel = NULL);
	BStatusBar(const char* name, const char* label = NULL, const char* trailingLabel = NULL);
	BStatusBar(BMessage* archive);
	virtual ~BStatusBar();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void AttachedToWindow() override;
	void MessageReceived(BMessage* message) override;
	void Draw(BRect updateRect) override;
	void GetPreferredSize(float* _width, float* _height) override;
	void SetFont(const BFont* font, uint32 mask = B_FONT_ALL) override;

	virtual void SetBarColor(rgb_color color);
	/// The bar with its border, in pixels; the view's height follows.
	virtual void SetBarHeight(float height);
	/// Copied; null takes the text away.
	virtual void SetText(const char* string);
	virtual void SetTrailingText(const char* string);
	/// The value is brought into 0 to \a max.
	virtual void SetMaxValue(float max);

	/// Adds to the value. Null keeps a text.
	virtual void Update(float delta, const char* text = NULL, const char* trailingText = NULL);
	/// The value becomes 0, the greatest one 100; the texts are taken away and the labels set.
	virtual void Reset(const char* label = NULL, const char* trailingLabel = NULL);
	/// Null takes a text away.
	virtual void SetTo(float value, const char* text = NULL, const char* trailingText = NULL);

	float CurrentValue() const;
	float MaxValue() const;
	rgb_color BarColor() const;
	float BarHeight() const;
	/// These four are null for none.
	const char* Text() const;
	const char* TrailingText() const;
	const char* Label() const;
	const char* TrailingLabel() const;

private:
	void SetCurrent(float value);
	void SetString(BString* text, const char* string);
	void NoteTexts();
	void FitHeight();
	float TextHeight() const;
	float FilledWidth(float value) const;
	BRect BarFrame() const;
	void DrawTexts();

	BString fLabel;
	BString fTrailingLabel;
	BString fText;
	BString fTrailingText;
	float fMax;
	float fCurrent;
	float fBarHeight;
	rgb_color fBarColor;
	bool fUsesBarColor;
	bool fKeepsTextLine;
};

#endif // _STATUS_BAR_H
