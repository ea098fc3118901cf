// SPDX-License-Identifier: MIT

#include <BitmapStream.h>

#include <algorithm>
#include <cstdio>
#include <cstring>

#include <Bitmap.h>
#include <ByteOrder.h>

#include "interface/PixelFormat.h"

namespace {

constexpr uint32 kBitmapMagic = 'bits';
constexpr size_t kHeaderSize = 32;
// No bitmap is larger, so no stream needs to be.
constexpr off_t kMaxSize = static_cast<off_t>(INT32_MAX) + static_cast<off_t>(kHeaderSize);

void
PutWord(uint8* place, uint32 value)
{
	value = B_HOST_TO_BENDIAN_INT32(value);
	std::memcpy(place, &value, sizeof(value));
}


uint32
WordAt(const uint8* place)
{
	uint32 value;
	std::memcpy(&value, place, sizeof(value));
	return B_BENDIAN_TO_HOST_INT32(value);
}


void
PutFloat(uint8* place, float value)
{
	uint32 word;
	std::memcpy(&word, &value, sizeof(word));
	PutWord(place, word);
}


float
FloatAt(const uint8* place)
{
	const uint32 word = WordAt(place);
	float value;
	std::memcpy(&value, &word, sizeof(value));
	return value;
}


std::vector<uint8>
HeaderOf(const BBitmap& bitmap)
{
	std::vector<uint8> header(kHeaderSize);
	const BRect bounds = bitmap.Bounds();
	PutWord(&header[0], kBitmapMagic);
	PutFloat(&header[4], bounds.left);
	PutFloat(&header[8], bounds.top);
	PutFloat(&header[12], bounds.right);
	PutFloat(&header[16], bounds.bottom);
	PutWord(&header[20], static_cast<uint32>(bitmap.BytesPerRow()));
	PutWord(&header[24], static_cast<uint32>(bitmap.ColorSpace()));
	PutWord(&header[28], static_cast<uint32>(bitmap.BitsLength()));
	return header;
}


/// Null when the bytes are no whole bitmap.
std::unique_ptr<BBitmap>
BitmapOf(const std::vector<uint8>& data)
{
	if (data.size() < kHeaderSize || WordAt(&data[0]) != kBitmapMagic)
		return nullptr;
	const BRect bounds(
		FloatAt(&data[4]), FloatAt(&data[8]), FloatAt(&data[12]), FloatAt(&data[16]));
	const uint32 bytesPerRow = WordAt(&data[20]);
	const uint32 length = WordAt(&data[28]);
	// Checked before the bitmap is made: a damaged header must not cost memory.
	const double rows = static_cast<double>(bounds.bottom) - bounds.top + 1;
	if (length > data.size() - kHeaderSize || !(rows >= 1) || rows * bytesPerRow != length)
		return nullptr;

	const color_space space = BPrivate::ColorSpaceOf(WordAt(&data[24]));
	auto bitmap = std::make_unique<BBitmap>(bounds, 0, space, static_cast<int32>(bytesPerRow));
	if (bitmap->InitCheck() != B_OK || static_cast<uint32>(bitmap->BitsLength()) != length)
		return nullptr;
	std::memcpy(bitmap->Bits(), &data[kHeaderSize], length);
	return bitmap;
}

} // namespace

BBitmapStream::BBitmapStream(BBitmap* bitmap)
	: fBitmap(bitmap),
	  fPosition(0),
	  fDetached(false)
{
	if (bitmap != nullptr && bitmap->InitCheck() == B_OK)
		fHeader = HeaderOf(*bitmap);
}


BBitmapStream::~BBitmapStream() {}


ssize_t
BBitmapStream::ReadAt(off_t position, void* buffer, size_t size)
{
	if (position < 0 || (buffer == nullptr && size > 0))
		return B_BAD_VALUE;
	if (position >= Size())
		return 0;
	size = static_cast<size_t>(std::min<off_t>(static_cast<off_t>(size), Size() - position));
	uint8* bytes = static_cast<uint8*>(buffer);
	for (size_t done = 0; done < size;) {
		const size_t place = static_cast<size_t>(position) + done;
		size_t count = size - done;
		const uint8* from;
		if (IsWritten())
			from = &fData[place];
		else if (place < kHeaderSize) {
			from = &fHeader[place];
			count = std::min(count, kHeaderSize - place);
		} else
			from = static_cast<const uint8*>(fBitmap->Bits()) + (place - kHeaderSize);
		std::memcpy(bytes + done, from, count);
		done += count;
	}
	return static_cast<ssize_t>(size);
}


ssize_t
BBitmapStream::WriteAt(off_t position, const void* buffer, size_t size)
{
	if (position < 0 || (buffer == nullptr && size > 0))
		return B_BAD_VALUE;
	if (fDetached)
		return B_ERROR;
	if (size == 0)
		return 0;
	if (position > kMaxSize || size > static_cast<size_t>(kMaxSize - position))
		return B_NO_MEMORY;

	BeginWriting();
	const size_t end = static_cast<size_t>(position) + size;
	if (end > fData.size())
		fData.resize(end);
	std::memcpy(&fData[static_cast<size_t>(position)], buffer, size);
	return static_cast<ssize_t>(size);
}


off_t
BBitmapStream::Seek(off_t position, uint32 seekMode)
{
	off_t base = 0;
	if (seekMode == SEEK_CUR)
		base = fPosition;
	else if (seekMode == SEEK_END)
		base = Size();
	else if (seekMode != SEEK_SET)
		return B_BAD_VALUE;
	off_t place;
	if (__builtin_add_overflow(base, position, &place) || place < 0)
		return B_BAD_VALUE;
	fPosition = place;
	return fPosition;
}


off_t
BBitmapStream::Position() const
{
	return fPosition;
}


off_t
BBitmapStream::Size() const
{
	if (IsWritten())
		return static_cast<off_t>(fData.size());
	return fHeader.empty() ? 0 : static_cast<off_t>(kHeaderSize) + fBitmap->BitsLength();
}


status_t
BBitmapStream::SetSize(off_t size)
{
	if (size < 0)
		return B_BAD_VALUE;
	if (fDetached)
		return B_ERROR;
	if (size > kMaxSize)
		return B_NO_MEMORY;
	if (size == Size())
		return B_OK;
	BeginWriting();
	fData.resize(static_cast<size_t>(size));
	return B_OK;
}


status_t
BBitmapStream::DetachBitmap(BBitmap** _bitmap)
{
	if (_bitmap == nullptr)
		return B_BAD_VALUE;
	*_bitmap = nullptr;
	if (fDetached)
		return B_ERROR;

	std::unique_ptr<BBitmap> bitmap = IsWritten() ? BitmapOf(fData) : std::move(fBitmap);
	if (bitmap == nullptr)
		return B_BAD_DATA;
	*_bitmap = bitmap.release();
	fBitmap.reset();
	fHeader.clear();
	fData.clear();
	fDetached = true;
	return B_OK;
}


/// Whether the bytes are no more those of the bitmap that the stream was made with.
bool
BBitmapStream::IsWritten() const
{
	return !fData.empty();
}


void
BBitmapStream::BeginWriting()
{
	if (IsWritten() || fHeader.empty())
		return;
	fData = fHeader;
	const uint8* bits = static_cast<const uint8*>(fBitmap->Bits());
	fData.insert(fData.end(), bits, bits + fBitmap->BitsLength());
}
