// SPDX-License-Identifier: MIT
// BBitmap: pixel memory, and the window without a place on the screen that its views draw in.
#include <Bitmap.h>

#include <algorithm>
#include <cmath>
#include <cstring>
#include <new>

#include <Message.h>
#include <View.h>
#include <Window.h>

#include "interface/PixelFormat.h"
#include "interface/WholePixels.h"
#include "interface/WindowPrivate.h"

using BPrivate::ColorSpaceOf;
using BPrivate::ConvertPixels;
using BPrivate::PixelRows;
using BPrivate::RowLength;
using BPrivate::WholePixels;

BBitmap::BBitmap(BRect bounds, uint32 flags, color_space colorSpace, int32 bytesPerRow, screen_id)
{
	Init(bounds, colorSpace, flags, bytesPerRow);
}


BBitmap::BBitmap(BRect bounds, color_space colorSpace, bool acceptsViews, bool needsContiguous)
{
	uint32 flags = (acceptsViews ? B_BITMAP_ACCEPTS_VIEWS : 0)
		| (needsContiguous ? B_BITMAP_IS_CONTIGUOUS : 0);
	Init(bounds, colorSpace, flags, B_ANY_BYTES_PER_ROW);
}


BBitmap::BBitmap(const BBitmap& source, uint32 flags)
{
	CopyFrom(source, flags);
}


BBitmap::BBitmap(const BBitmap& source)
	: BArchivable()
{
	CopyFrom(source, source.fFlags);
}


BBitmap::BBitmap(const BBitmap* source, bool acceptsViews, bool needsContiguous)
{
	uint32 flags = (acceptsViews ? B_BITMAP_ACCEPTS_VIEWS : 0)
		| (needsContiguous ? B_BITMAP_IS_CONTIGUOUS : 0);
	if (source != nullptr)
		CopyFrom(*source, flags);
	else
		Init(BRect(), B_NO_COLOR_SPACE, flags, B_ANY_BYTES_PER_ROW);
}


// There are no areas here, so no identifier is one.
BBitmap::BBitmap(
	area_id, ptrdiff_t, BRect, uint32 flags, color_space colorSpace, int32 bytesPerRow, screen_id)
{
	Init(BRect(), colorSpace, flags, bytesPerRow);
}


BBitmap::BBitmap(BMessage* archive)
	: BArchivable(archive)
{
	Init(archive->GetRect("_frame", BRect()),
		ColorSpaceOf(archive->GetInt32("_cspace", B_NO_COLOR_SPACE)),
		archive->GetInt32("_bmflags", 0), archive->GetInt32("_rowbytes", B_ANY_BYTES_PER_ROW));
	const void* data;
	ssize_t size;
	if (fInitStatus == B_OK && archive->FindData("_data", B_RAW_TYPE, &data, &size) == B_OK)
		std::memcpy(fBits, data, std::min<size_t>(size, fBitsLength));

	BMessage child;
	for (int32 i = 0; fWindow != nullptr && archive->FindMessage("_views", i, &child) == B_OK;
		 i++) {
		BArchivable* object = instantiate_object(&child);
		if (BView* view = dynamic_cast<BView*>(object))
			AddChild(view);
		else
			delete object;
	}
}


BBitmap::~BBitmap()
{
	if (fWindow != nullptr && fWindow->Lock())
		fWindow->BLooper::Quit();
}


BBitmap&
BBitmap::operator=(const BBitmap& source)
{
	if (this == &source)
		return *this;

	if (fWindow != nullptr && fWindow->Lock())
		fWindow->BLooper::Quit();
	fMemory.reset();
	CopyFrom(source, source.fFlags);
	return *this;
}


BArchivable*
BBitmap::Instantiate(BMessage* archive)
{
	if (!validate_instantiation(archive, "BBitmap"))
		return nullptr;
	return new BBitmap(archive);
}


status_t
BBitmap::Archive(BMessage* archive, bool deep) const
{
	status_t status = BArchivable::Archive(archive, deep);
	if (status == B_OK)
		status = archive->AddRect("_frame", fBounds);
	if (status == B_OK)
		status = archive->AddInt32("_cspace", fColorSpace);
	if (status == B_OK)
		status = archive->AddInt32("_bmflags", fFlags);
	if (status == B_OK)
		status = archive->AddInt32("_rowbytes", fBytesPerRow);
	if (status == B_OK && fInitStatus == B_OK)
		status = archive->AddData("_data", B_RAW_TYPE, fBits, fBitsLength);
	for (int32 i = 0; status == B_OK && deep && i < CountChildren(); i++) {
		BMessage child;
		status = ChildAt(i)->Archive(&child, deep);
		if (status == B_OK)
			status = archive->AddMessage("_views", &child);
	}
	return status;
}


status_t
BBitmap::InitCheck() const
{
	return fInitStatus;
}


bool
BBitmap::IsValid() const
{
	return fInitStatus == B_OK;
}


void*
BBitmap::Bits() const
{
	return fBits;
}


int32
BBitmap::BitsLength() const
{
	return fBitsLength;
}


int32
BBitmap::BytesPerRow() const
{
	return fBytesPerRow;
}


color_space
BBitmap::ColorSpace() const
{
	return fColorSpace;
}


BRect
BBitmap::Bounds() const
{
	return fBounds;
}


uint32
BBitmap::Flags() const
{
	return fFlags;
}


void
BBitmap::SetBits(const void* data, int32 length, int32 offset, color_space colorSpace)
{
	// Older programs give packed red, green, blue bytes and call them B_RGB32.
	int32 width = fBounds.IntegerWidth() + 1;
	int32 height = fBounds.IntegerHeight() + 1;
	if (colorSpace == B_RGB32 && fInitStatus == B_OK && length == width * height * 3) {
		std::vector<uint8> padded(static_cast<size_t>(width) * height * 4, 255);
		const uint8* from = static_cast<const uint8*>(data);
		for (size_t i = 0; i < static_cast<size_t>(width) * height; i++) {
			padded[i * 4] = from[i * 3 + 2];
			padded[i * 4 + 1] = from[i * 3 + 1];
			padded[i * 4 + 2] = from[i * 3];
		}
		ImportBits(padded.data(), static_cast<int32>(padded.size()), width * 4, offset, colorSpace);
		return;
	}
	if (colorSpace == B_CMAP8 && fColorSpace != B_CMAP8) {
		ImportBits(data, length, width, offset, colorSpace);
		return;
	}
	ImportBits(data, length, B_ANY_BYTES_PER_ROW, offset, colorSpace);
}


status_t
BBitmap::ImportBits(const void* data, int32 length, int32 bpr, int32 offset, color_space colorSpace)
{
	if (fInitStatus != B_OK)
		return B_NO_INIT;
	if (data == nullptr || length < 0 || offset < 0 || offset > fBitsLength)
		return B_BAD_VALUE;

	int32 width = fBounds.IntegerWidth() + 1;
	int32 height = fBounds.IntegerHeight() + 1;
	if (bpr == B_ANY_BYTES_PER_ROW)
		bpr = RowLength(width, colorSpace);
	if (bpr <= 0)
		return B_BAD_VALUE;
	if (colorSpace == fColorSpace && bpr == fBytesPerRow) {
		std::memcpy(fBits + offset, data, std::min(length, fBitsLength - offset));
		return B_OK;
	}

	// Whole rows from the row that the offset is in.
	int32 firstRow = offset / fBytesPerRow;
	PixelRows from{static_cast<uint8*>(const_cast<void*>(data)), length, bpr, colorSpace};
	PixelRows to{fBits, fBitsLength, fBytesPerRow, fColorSpace};
	return ConvertPixels(from, 0, 0, to, 0, firstRow, width, height - firstRow);
}


status_t
BBitmap::ImportBits(const void* data, int32 length, int32 bpr, color_space colorSpace, BPoint from,
	BPoint to, BSize size)
{
	if (fInitStatus != B_OK)
		return B_NO_INIT;
	if (data == nullptr || length < 0 || size.width < 0 || size.height < 0)
		return B_BAD_VALUE;

	int32 width = WholePixels(size.width) + 1;
	int32 height = WholePixels(size.height) + 1;
	if (bpr == B_ANY_BYTES_PER_ROW)
		bpr = RowLength(WholePixels(from.x) + width, colorSpace);
	PixelRows source{static_cast<uint8*>(const_cast<void*>(data)), length, bpr, colorSpace};
	PixelRows target{fBits, fBitsLength, fBytesPerRow, fColorSpace};

	// What lies outside of the bitmap on the left and top is left out on both sides.
	int32 fromX = WholePixels(from.x), fromY = WholePixels(from.y);
	int32 toX = WholePixels(to.x - fBounds.left), toY = WholePixels(to.y - fBounds.top);
	int32 skipX = std::max({0, -toX, -fromX}), skipY = std::max({0, -toY, -fromY});
	width = std::min(width - skipX, fBounds.IntegerWidth() + 1 - toX - skipX);
	height = std::min(height - skipY, fBounds.IntegerHeight() + 1 - toY - skipY);
	if (width <= 0 || height <= 0)
		return B_OK;
	return ConvertPixels(
		source, fromX + skipX, fromY + skipY, target, toX + skipX, toY + skipY, width, height);
}


status_t
BBitmap::ImportBits(const BBitmap* bitmap)
{
	if (bitmap == nullptr || bitmap->InitCheck() != B_OK || bitmap->Bounds() != fBounds)
		return B_BAD_VALUE;
	return ImportBits(
		bitmap->Bits(), bitmap->BitsLength(), bitmap->BytesPerRow(), 0, bitmap->ColorSpace());
}


status_t
BBitmap::ImportBits(const BBitmap* bitmap, BPoint from, BPoint to, BSize size)
{
	if (bitmap == nullptr || bitmap->InitCheck() != B_OK)
		return B_BAD_VALUE;

	size.width = std::min(size.width, bitmap->Bounds().right - from.x);
	size.height = std::min(size.height, bitmap->Bounds().bottom - from.y);
	return ImportBits(bitmap->Bits(), bitmap->BitsLength(), bitmap->BytesPerRow(),
		bitmap->ColorSpace(), from - bitmap->Bounds().LeftTop(), to, size);
}


void
BBitmap::AddChild(BView* view)
{
	if (fWindow != nullptr)
		fWindow->AddChild(view);
}


bool
BBitmap::RemoveChild(BView* view)
{
	return fWindow != nullptr && fWindow->RemoveChild(view);
}


int32
BBitmap::CountChildren() const
{
	return fWindow != nullptr ? fWindow->CountChildren() : 0;
}


BView*
BBitmap::ChildAt(int32 index) const
{
	return fWindow != nullptr ? fWindow->ChildAt(index) : nullptr;
}


BView*
BBitmap::FindView(const char* viewName) const
{
	return fWindow != nullptr ? fWindow->FindView(viewName) : nullptr;
}


BView*
BBitmap::FindView(BPoint point) const
{
	return fWindow != nullptr ? fWindow->FindView(point) : nullptr;
}


bool
BBitmap::Lock()
{
	return fWindow != nullptr && fWindow->Lock();
}


void
BBitmap::Unlock()
{
	if (fWindow != nullptr)
		fWindow->Unlock();
}


bool
BBitmap::IsLocked() const
{
	return fWindow != nullptr && fWindow->IsLocked();
}


void
BBitmap::Init(BRect bounds, color_space colorSpace, uint32 flags, int32 bytesPerRow)
{
	fBits = nullptr;
	fBitsLength = 0;
	fBytesPerRow = 0;
	fBounds = bounds;
	fColorSpace = colorSpace;
	fFlags = flags;
	fInitStatus = B_BAD_VALUE;
	fWindow = nullptr;

	const float kMaxSide = 1 << 20;
	if (!bounds.IsValid() || bounds.Width() > kMaxSide || bounds.Height() > kMaxSide)
		return;

	int32 least = RowLength(bounds.IntegerWidth() + 1, colorSpace);
	if (least <= 0)
		return;
	fBytesPerRow = std::max(least, bytesPerRow);
	int64 size = static_cast<int64>(fBytesPerRow) * (bounds.IntegerHeight() + 1);
	if (size > INT32_MAX) {
		fInitStatus = B_NO_MEMORY;
		return;
	}
	fMemory.reset(new (std::nothrow) uint8[size]);
	if (fMemory == nullptr) {
		fInitStatus = B_NO_MEMORY;
		return;
	}

	fBits = fMemory.get();
	fBitsLength = static_cast<int32>(size);
	bool white = (flags & (B_BITMAP_CLEAR_TO_WHITE | B_BITMAP_ACCEPTS_VIEWS)) != 0;
	std::memset(fBits, white ? 255 : 0, fBitsLength);
	fInitStatus = B_OK;

	if ((flags & B_BITMAP_ACCEPTS_VIEWS) != 0) {
		fWindow = new BWindow(this);
		fWindow->Unlock();
	}
}


void
BBitmap::CopyFrom(const BBitmap& source, uint32 flags)
{
	Init(source.fBounds, source.fColorSpace, flags, source.fBytesPerRow);
	if (fInitStatus == B_OK && source.fInitStatus == B_OK)
		std::memcpy(fBits, source.fBits, std::min(fBitsLength, source.fBitsLength));
}
