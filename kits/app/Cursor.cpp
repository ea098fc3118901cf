// SPDX-License-Identifier: MIT
// The picture of the pointer.

#include <Cursor.h>

#include <cstring>

#include <AppDefs.h>
#include <Bitmap.h>
#include <Message.h>

#include "app/CursorPrivate.h"

using BPrivate::CursorShape;

// Size, depth, row and column of the hot spot; 16 rows of image, 16 rows of mask.
const unsigned char B_HAND_CURSOR[] = {
	0x10,
	0x01,
	0x02,
	0x02,
	0x00,
	0x00,
	0x00,
	0x00,
	0x38,
	0x00,
	0x24,
	0x00,
	0x24,
	0x00,
	0x13,
	0xe0,
	0x12,
	0x5c,
	0x09,
	0x2a,
	0x08,
	0x01,
	0x3c,
	0x01,
	0x4c,
	0x01,
	0x42,
	0x01,
	0x30,
	0x01,
	0x0c,
	0x01,
	0x02,
	0x00,
	0x01,
	0x00,
	0x00,
	0x00,
	0x00,
	0x00,
	0x38,
	0x00,
	0x3c,
	0x00,
	0x3c,
	0x00,
	0x1f,
	0xe0,
	0x1f,
	0xfc,
	0x0f,
	0xfe,
	0x0f,
	0xff,
	0x3f,
	0xff,
	0x7f,
	0xff,
	0x7f,
	0xff,
	0x3f,
	0xff,
	0x0f,
	0xff,
	0x03,
	0xfe,
	0x01,
	0xf8,
};
const unsigned char B_I_BEAM_CURSOR[] = {
	0x10,
	0x01,
	0x05,
	0x08,
	0x06,
	0xc0,
	0x03,
	0x80,
	0x01,
	0x00,
	0x01,
	0x00,
	0x01,
	0x00,
	0x01,
	0x00,
	0x01,
	0x00,
	0x01,
	0x00,
	0x01,
	0x00,
	0x01,
	0x00,
	0x01,
	0x00,
	0x01,
	0x00,
	0x01,
	0x00,
	0x01,
	0x00,
	0x03,
	0x80,
	0x06,
	0xc0,
	0x0f,
	0xc0,
	0x07,
	0x80,
	0x03,
	0x00,
	0x03,
	0x00,
	0x03,
	0x00,
	0x03,
	0x00,
	0x03,
	0x00,
	0x03,
	0x00,
	0x03,
	0x00,
	0x03,
	0x00,
	0x03,
	0x00,
	0x03,
	0x00,
	0x03,
	0x00,
	0x03,
	0x00,
	0x07,
	0x80,
	0x0f,
	0xc0,
};

static const BCursor kDefaultCursor(B_CURSOR_ID_SYSTEM_DEFAULT);
static const BCursor kTextCursor(B_CURSOR_ID_I_BEAM);

const BCursor* B_CURSOR_SYSTEM_DEFAULT = &kDefaultCursor;
const BCursor* B_CURSOR_I_BEAM = &kTextCursor;

static constexpr int32 kClassicSize = 16;
static constexpr int32 kClassicHeader = 4;
static constexpr int32 kClassicPlane = 2 * kClassicSize;


static std::shared_ptr<const CursorShape>
ClassicShape(const void* cursorData)
{
	const uint8* data = static_cast<const uint8*>(cursorData);
	if (data == nullptr || data[0] != kClassicSize || data[1] != 1 || data[2] >= kClassicSize
		|| data[3] >= kClassicSize)
		return nullptr;

	auto shape = std::make_shared<CursorShape>();
	shape->width = kClassicSize;
	shape->height = kClassicSize;
	shape->hotY = data[2];
	shape->hotX = data[3];
	for (int32 i = 0; i < kClassicSize * kClassicSize; i++) {
		const uint8* image = data + kClassicHeader + i / 8;
		uint8 bit = 0x80 >> (i % 8);
		uint32 pixel = 0;
		if ((image[kClassicPlane] & bit) != 0)
			pixel = (*image & bit) != 0 ? 0xff000000 : 0xffffffff;
		shape->pixels.push_back(pixel);
	}
	return shape;
}


/// \a row of a bitmap as words 0xAARRGGBB.
static bool
AppendRow(const uint8* row, int32 width, color_space space, std::vector<uint32>& pixels)
{
	if (space != B_RGBA32 && space != B_RGB32)
		return false;

	const uint32 opaque = space == B_RGB32 ? 0xff000000 : 0;
	for (int32 x = 0; x < width; x++) {
		const uint8* pixel = row + 4 * x;
		pixels.push_back(
			pixel[0] | pixel[1] << 8 | pixel[2] << 16 | uint32(pixel[3]) << 24 | opaque);
	}
	return true;
}


static std::shared_ptr<const CursorShape>
BitmapShape(const BBitmap* bitmap, const BPoint& hotspot)
{
	if (bitmap == nullptr || bitmap->InitCheck() != B_OK || !bitmap->Bounds().Contains(hotspot))
		return nullptr;

	auto shape = std::make_shared<CursorShape>();
	shape->width = bitmap->Bounds().IntegerWidth() + 1;
	shape->height = bitmap->Bounds().IntegerHeight() + 1;
	shape->hotX = int32(hotspot.x);
	shape->hotY = int32(hotspot.y);
	const uint8* bits = static_cast<const uint8*>(bitmap->Bits());
	for (int32 y = 0; y < shape->height; y++) {
		if (!AppendRow(bits + y * bitmap->BytesPerRow(), shape->width, bitmap->ColorSpace(),
				shape->pixels))
			return nullptr;
	}
	return shape;
}


BCursor::BCursor(const void* cursorData)
	: fShape(ClassicShape(cursorData))
{
}


BCursor::BCursor(const BCursor& other)
	: BArchivable(),
	  fShape(other.fShape)
{
}


BCursor::BCursor(BCursorID id)
{
	if (id < B_CURSOR_ID_SYSTEM_DEFAULT || id > B_CURSOR_ID_CREATE_LINK)
		return;
	auto shape = std::make_shared<CursorShape>();
	shape->id = id;
	fShape = shape;
}


BCursor::BCursor(const BBitmap* bitmap, const BPoint& hotspot)
	: fShape(BitmapShape(bitmap, hotspot))
{
}


BCursor::BCursor(BMessage*)
{
	// Cursors are not kept in archives, as on the platform: what comes from one is no cursor.
}


BCursor::~BCursor() {}


BArchivable*
BCursor::Instantiate(BMessage*)
{
	return nullptr;
}


status_t
BCursor::Archive(BMessage*, bool) const
{
	return B_NOT_SUPPORTED;
}


status_t
BCursor::InitCheck() const
{
	return fShape != nullptr ? B_OK : B_BAD_VALUE;
}


BCursor& BCursor::operator=(const BCursor& other) = default;


std::shared_ptr<const CursorShape>
BPrivate::CursorAccess::Shape(const BCursor& cursor)
{
	return cursor.fShape != nullptr ? cursor.fShape : std::make_shared<const CursorShape>();
}
