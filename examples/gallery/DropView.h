// SPDX-License-Identifier: MIT
// A view that takes dropped files and texts and tells what it got.
#ifndef GALLERY_DROP_VIEW_H
#define GALLERY_DROP_VIEW_H

#include <String.h>
#include <View.h>

/// Shows the names of the files, or the text, that was dropped last. Its text can be dragged away.
class DropView : public BView {
public:
	DropView(BRect frame, const char* name);

	void Draw(BRect updateRect) override;
	void MouseDown(BPoint where) override;
	void MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage) override;
	void MessageReceived(BMessage* message) override;

private:
	void TakeFiles(const BMessage* message);
	bool TakeText(const BMessage* message);
	void TellWindow();
	void SetLines(const BString& lines);

	BString fLines;
	bool fIsUnderDrag;
};

#endif // GALLERY_DROP_VIEW_H
