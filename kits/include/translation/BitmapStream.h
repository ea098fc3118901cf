// SPDX-License-Identifier: MIT
// A bitmap in the form of a stream.
#ifndef _BITMAP_STREAM_H
#define _BITMAP_STREAM_H

#include <memory>
#include <vector>

#include <DataIO.h>

class BBitmap;

/// The bitmap as translators pass it on: a header of eight words, high byte first ('bits', the bounds
/// as four floats, bytes a row, colour space, bytes of pixels), then the pixels.
class BBitmapStream : public BPositionIO {
public:
	/// Takes over \a bitmap. Null: what is written becomes the bitmap.
	BBitmapStream(BBitmap* bitmap = NULL);
	/// Deletes the bitmap unless it was detached.
	virtual ~BBitmapStream();

	ssize_t ReadAt(off_t position, void* buffer, size_t size) override;
	ssize_t WriteAt(off_t position, const void* buffer, size_t size) override;
	off_t Seek(off_t position, uint32 seekMode) override;
	off_t Position() const override;
	virtual off_t Size() const;
	status_t SetSize(off_t size) override;

	/// The bitmap becomes the caller's and the stream empty. Returns B_OK; B_BAD_VALUE for null;
	/// B_BAD_DATA when the stream holds no whole bitmap; B_ERROR when it was detached before.
	status_t DetachBitmap(BBitmap** _bitmap);

private:
	bool IsWritten() const;
	void BeginWriting();

	std::unique_ptr<BBitmap> fBitmap;
	std::vector<uint8> fHeader;
	std::vector<uint8> fData;
	off_t fPosition;
	bool fDetached;
};

#endif // _BITMAP_STREAM_H
