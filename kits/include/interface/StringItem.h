// SPDX-License-Identifier: MIT
// A row with a text.
#ifndef _STRING_ITEM_H
#define _STRING_ITEM_H

#include <ListItem.h>
#include <String.h>

/// A list row with one line of text, which is never shortened.
class BStringItem : public BListItem {
public:
	/// The text is copied; null stands for none.
	BStringItem(const char* text, uint32 outlineLevel = 0, bool expanded = true);
	BStringItem(BMessage* archive);
	virtual ~BStringItem();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void DrawItem(BView* owner, BRect frame, bool complete = false) override;
	/// A line and 4 pixels high, and as wide as the text with a margin at both sides.
	void Update(BView* owner, const BFont* font) override;

	/// Shows after BListView::InvalidateItem(); the width stays until the next Update().
	virtual void SetText(const char* text);
	/// Null without a text.
	const char* Text() const;

protected:
	/// The baseline's distance from the row's top, in pixels.
	float BaselineOffset() const;

private:
	BString fText;
	bool fHasText;
	float fBaselineOffset;
};

#endif // _STRING_ITEM_H
