// SPDX-License-Identifier: MIT
// A recorded sequence of drawing operations.
#ifndef _PICTURE_H
#define _PICTURE_H

#include <vector>

#include <Archivable.h>

class BDataIO;

/// Recorded between BView::BeginPicture() and EndPicture(), played by BView::DrawPicture(). A value.
class BPicture : public BArchivable {
public:
	BPicture();
	BPicture(const BPicture& other);
	BPicture(BMessage* archive);
	virtual ~BPicture();

	static BArchivable* Instantiate(BMessage* archive);
	virtual status_t Archive(BMessage* archive, bool deep = true) const override;

	/// Writes the operations. Returns B_OK; B_BAD_VALUE for null; the stream's error.
	status_t Flatten(BDataIO* stream);
	/// Replaces the operations. Returns B_OK; B_BAD_VALUE for null; B_BAD_DATA, nothing changed, for what
	/// Flatten() did not write; the stream's error.
	status_t Unflatten(BDataIO* stream);

private:
	friend class BView;

	std::vector<uint8> fOperations;
};

#endif // _PICTURE_H
