// SPDX-License-Identifier: MIT
// A picture in memory, which views can draw into.
#ifndef _BITMAP_H
#define _BITMAP_H

#include <memory>

#include <Archivable.h>
#include <GraphicsDefs.h>
#include <OS.h>
#include <Rect.h>

class BView;
class BWindow;

enum {
	B_BITMAP_CLEAR_TO_WHITE = 1,
	B_BITMAP_ACCEPTS_VIEWS = 2,
	B_BITMAP_IS_AREA = 4,
	B_BITMAP_IS_LOCKED = 12,
	B_BITMAP_IS_CONTIGUOUS = 28,
	B_BITMAP_IS_OFFSCREEN = 32,
	B_BITMAP_WILL_OVERLAY = 96,
	B_BITMAP_RESERVE_OVERLAY_CHANNEL = 128,
	B_BITMAP_NO_SERVER_LINK = 256,
};


#define B_ANY_BYTES_PER_ROW (-1)

/// Rows from the top, each BytesPerRow() bytes (a multiple of 4 unless asked otherwise). B_RGBA32
/// pixels are blue, green, red, alpha. To draw into it: accept views, add a child view, Lock(), draw,
/// view->Sync(), Unlock().
class BBitmap : public BArchivable {
public:
	BBitmap(BRect bounds, uint32 flags, color_space colorSpace,
		int32 bytesPerRow = B_ANY_BYTES_PER_ROW, screen_id screenID = B_MAIN_SCREEN_ID);
	BBitmap(BRect bounds, color_space colorSpace, bool acceptsViews = false,
		bool needsContiguous = false);
	BBitmap(const BBitmap& source, uint32 flags);
	BBitmap(const BBitmap& source);
	BBitmap(const BBitmap* source, bool acceptsViews = false, bool needsContiguous = false);
	/// The pixels live in \a area, \a areaOffset bytes from its start.
	BBitmap(area_id area, ptrdiff_t areaOffset, BRect bounds, uint32 flags, color_space colorSpace,
		int32 bytesPerRow = B_ANY_BYTES_PER_ROW, screen_id screenID = B_MAIN_SCREEN_ID);
	BBitmap(BMessage* archive);
	virtual ~BBitmap();

	BBitmap& operator=(const BBitmap& source);

	static BArchivable* Instantiate(BMessage* archive);
	virtual status_t Archive(BMessage* archive, bool deep = true) const override;

	/// B_OK; B_BAD_VALUE for invalid bounds or colour space; B_NO_MEMORY.
	status_t InitCheck() const;
	bool IsValid() const;

	void* Bits() const;
	int32 BitsLength() const;
	int32 BytesPerRow() const;
	color_space ColorSpace() const;
	BRect Bounds() const;
	uint32 Flags() const;

	/// Copies pixels of \a colorSpace, at most \a length bytes, to \a offset bytes from the start,
	/// converting them. B_RGB32 data of older programs may come without padding: three bytes a pixel.
	void SetBits(const void* data, int32 length, int32 offset, color_space colorSpace);

	/// As SetBits(), without that exception; \a bpr bytes a row, B_ANY_BYTES_PER_ROW: padded to 4.
	/// Returns B_OK; B_NO_INIT; B_BAD_VALUE, nothing written, for what cannot be converted.
	status_t ImportBits(
		const void* data, int32 length, int32 bpr, int32 offset, color_space colorSpace);
	/// Only \a size (right - left sense) pixels, from \a from in the data to \a to in the bitmap.
	status_t ImportBits(const void* data, int32 length, int32 bpr, color_space colorSpace,
		BPoint from, BPoint to, BSize size);
	status_t ImportBits(const BBitmap* bitmap);
	status_t ImportBits(const BBitmap* bitmap, BPoint from, BPoint to, BSize size);

	/// The view belongs to the bitmap until it is removed. Bitmaps that accept no views ignore it.
	virtual void AddChild(BView* view);
	virtual bool RemoveChild(BView* view);
	int32 CountChildren() const;
	BView* ChildAt(int32 index) const;
	BView* FindView(const char* viewName) const;
	BView* FindView(BPoint point) const;

	bool Lock();
	void Unlock();
	bool IsLocked() const;

private:
	friend class BView;

	void Init(BRect bounds, color_space colorSpace, uint32 flags, int32 bytesPerRow);
	void CopyFrom(const BBitmap& source, uint32 flags);

	uint8* fBits;
	int32 fBitsLength;
	int32 fBytesPerRow;
	BRect fBounds;
	color_space fColorSpace;
	uint32 fFlags;
	status_t fInitStatus;
	std::unique_ptr<uint8[]> fMemory;
	BWindow* fWindow;
};

#endif // _BITMAP_H
