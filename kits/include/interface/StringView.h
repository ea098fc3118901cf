// SPDX-License-Identifier: MIT
// A line of text.
#ifndef _STRING_VIEW_H
#define _STRING_VIEW_H

#include <String.h>
#include <View.h>

/// One line of text at the bottom of its frame. It takes its background from its parent.
class BStringView : public BView {
public:
	BStringView(BRect frame, const char* name, const char* text,
		uint32 resizingMode = B_FOLLOW_LEFT_TOP, uint32 flags = B_WILL_DRAW);
	BStringView(const char* name, const char* text, uint32 flags = B_WILL_DRAW);
	BStringView(BMessage* archive);
	virtual ~BStringView();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void AttachedToWindow() override;
	void Draw(BRect updateRect) override;
	void GetPreferredSize(float* _width, float* _height) override;
	void SetFont(const BFont* font, uint32 mask = B_FONT_ALL) override;

	/// Copied; never resizes the view.
	void SetText(const char* text);
	/// Null when it was set to null.
	const char* Text() const;

	void SetAlignment(alignment flag);
	alignment Alignment() const;

	/// How a text that does not fit is cut: B_TRUNCATE_END and kin; B_NO_TRUNCATION at first.
	void SetTruncation(uint32 truncationMode);
	uint32 Truncation() const;

private:
	BString fText;
	bool fHasText;
	alignment fAlignment;
	uint32 fTruncation;
};

#endif // _STRING_VIEW_H
