// SPDX-License-Identifier: MIT
// Bitmaps of BTranslationUtils; StyledText.cpp has its texts.
#include <TranslationUtils.h>

#include <cstring>
#include <memory>

#include <Application.h>
#include <Bitmap.h>
#include <BitmapStream.h>
#include <File.h>
#include <Resources.h>

#include "display/Display.h"
#include "display/PixelBuffer.h"
#include "translation/StreamBytes.h"

namespace {

constexpr type_code kBitsResource = 'bits';

BBitmap*
BitmapOf(const BPrivate::Picture& picture)
{
	auto bitmap = std::make_unique<BBitmap>(
		BRect(0, 0, static_cast<float>(picture.width - 1), static_cast<float>(picture.height - 1)),
		B_RGBA32);
	if (bitmap->InitCheck() != B_OK)
		return nullptr;
	for (int32 y = 0; y < picture.height; y++) {
		uint8* row =
			static_cast<uint8*>(bitmap->Bits()) + static_cast<size_t>(y) * bitmap->BytesPerRow();
		const uint32* pixels = picture.pixels.data() + static_cast<size_t>(y) * picture.width;
		for (int32 x = 0; x < picture.width; x++) {
			const uint32 pixel = pixels[x] | (picture.hasAlpha ? 0 : 0xff000000);
			std::memcpy(row + 4 * x, &pixel, sizeof(pixel));
		}
	}
	return bitmap.release();
}


/// From a picture file's content, or that of a bitmap stream.
BBitmap*
DecodeBitmap(const void* data, size_t size)
{
	static const char kStreamMagic[] = {'b', 'i', 't', 's'};
	if (size >= sizeof(kStreamMagic)
		&& std::memcmp(data, kStreamMagic, sizeof(kStreamMagic)) == 0) {
		BBitmapStream stream;
		BBitmap* bitmap = nullptr;
		if (stream.Write(data, size) == static_cast<ssize_t>(size))
			stream.DetachBitmap(&bitmap);
		return bitmap;
	}
	BPrivate::Picture picture;
	if (size == 0 || BPrivate::Display::Get().DecodePicture(data, size, &picture) != B_OK)
		return nullptr;
	return BitmapOf(picture);
}

} // namespace


BBitmap*
BTranslationUtils::GetBitmap(const char* name, BTranslatorRoster* roster)
{
	BBitmap* bitmap = GetBitmapFile(name, roster);
	return bitmap != nullptr ? bitmap : GetBitmap(kBitsResource, name, roster);
}


BBitmap*
BTranslationUtils::GetBitmap(uint32 type, int32 id, BTranslatorRoster*)
{
	BResources* resources = BApplication::AppResources();
	size_t size = 0;
	const void* data = resources != nullptr ? resources->LoadResource(type, id, &size) : nullptr;
	return data != nullptr ? DecodeBitmap(data, size) : nullptr;
}


BBitmap*
BTranslationUtils::GetBitmap(uint32 type, const char* name, BTranslatorRoster*)
{
	BResources* resources = name != nullptr ? BApplication::AppResources() : nullptr;
	size_t size = 0;
	const void* data = resources != nullptr ? resources->LoadResource(type, name, &size) : nullptr;
	return data != nullptr ? DecodeBitmap(data, size) : nullptr;
}


BBitmap*
BTranslationUtils::GetBitmapFile(const char* name, BTranslatorRoster* roster)
{
	BFile file;
	if (name == nullptr || file.SetTo(name, B_READ_ONLY) != B_OK || !file.IsFile())
		return nullptr;
	return GetBitmap(&file, roster);
}


BBitmap*
BTranslationUtils::GetBitmap(const entry_ref* ref, BTranslatorRoster* roster)
{
	BFile file;
	if (ref == nullptr || file.SetTo(ref, B_READ_ONLY) != B_OK || !file.IsFile())
		return nullptr;
	return GetBitmap(&file, roster);
}


BBitmap*
BTranslationUtils::GetBitmap(BPositionIO* stream, BTranslatorRoster*)
{
	std::vector<uint8> bytes;
	if (stream == nullptr || BPrivate::ReadToEnd(stream, &bytes) != B_OK)
		return nullptr;
	return DecodeBitmap(bytes.data(), bytes.size());
}
