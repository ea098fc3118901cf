// SPDX-License-Identifier: MIT
// Tests of the bitmaps of BTranslationUtils: files, streams, and what is no picture.
#include <TranslationUtils.h>

#include <cstdlib>
#include <cstring>
#include <memory>

#include <gtest/gtest.h>

#include <Application.h>
#include <Bitmap.h>
#include <BitmapStream.h>
#include <DataIO.h>
#include <Entry.h>

#include "support/Printers.h"
#include "support/TemporaryFolder.h"

namespace {

// Two pixels, red and green; the format's simplest form.
const char kPpm[] = "P6\n2 1\n255\n\xff\0\0\0\xff\0";
const size_t kPpmSize = sizeof(kPpm) - 1;

bool
DrawsPixels()
{
	const char* display = std::getenv("BE_DISPLAY");
	return display != nullptr && std::strcmp(display, "qt") == 0;
}


class TranslationUtilsTest : public ::testing::Test {
protected:
	/// On a display without pixels there is none.
	static void ExpectRedAndGreen(BBitmap* bitmap)
	{
		std::unique_ptr<BBitmap> owned(bitmap);
		if (!DrawsPixels()) {
			EXPECT_EQ(bitmap, nullptr);
			return;
		}
		ASSERT_NE(bitmap, nullptr);
		EXPECT_EQ(bitmap->Bounds(), BRect(0, 0, 1, 0));
		EXPECT_EQ(bitmap->ColorSpace(), B_RGBA32);
		const uint8 kPixels[] = {0, 0, 255, 255, 0, 255, 0, 255};
		EXPECT_EQ(std::memcmp(bitmap->Bits(), kPixels, sizeof(kPixels)), 0);
	}

	BApplication fApplication{"application/x-vnd.plimworks-translation-test"};
	TemporaryFolder fFolder;
};

} // namespace


TEST_F(TranslationUtilsTest, PictureFileBecomesABitmap)
{
	const std::string path = fFolder.Write("picture", std::string(kPpm, kPpmSize));
	ExpectRedAndGreen(BTranslationUtils::GetBitmapFile(path.c_str()));
	ExpectRedAndGreen(BTranslationUtils::GetBitmap(path.c_str()));
	entry_ref ref;
	ASSERT_EQ(get_ref_for_path(path.c_str(), &ref), B_OK);
	ExpectRedAndGreen(BTranslationUtils::GetBitmap(&ref));
}


TEST_F(TranslationUtilsTest, StreamIsReadFromItsPosition)
{
	std::string bytes = "before";
	bytes.append(kPpm, kPpmSize);
	BMemoryIO stream(static_cast<const void*>(bytes.data()), bytes.size());
	stream.Seek(6, SEEK_SET);
	ExpectRedAndGreen(BTranslationUtils::GetBitmap(&stream));
}


TEST_F(TranslationUtilsTest, BitmapStreamNeedsNoReaderOfPictures)
{
	BBitmapStream stream(new BBitmap(BRect(0, 0, 4, 5), 0, B_RGB32));
	std::unique_ptr<BBitmap> bitmap(BTranslationUtils::GetBitmap(&stream));
	ASSERT_NE(bitmap, nullptr);
	EXPECT_EQ(bitmap->Bounds(), BRect(0, 0, 4, 5));
	EXPECT_EQ(bitmap->ColorSpace(), B_RGB32);
}


TEST_F(TranslationUtilsTest, WhatIsNoPictureGivesNone)
{
	const std::string text = fFolder.Write("text", "just a text");
	const std::string empty = fFolder.Write("empty");
	for (const std::string& path :
		{text, empty, fFolder / "missing", std::string("/"), std::string()}) {
		EXPECT_EQ(BTranslationUtils::GetBitmapFile(path.c_str()), nullptr) << path;
		EXPECT_EQ(BTranslationUtils::GetBitmap(path.c_str()), nullptr) << path;
	}
	EXPECT_EQ(BTranslationUtils::GetBitmap(static_cast<const char*>(nullptr)), nullptr);
	EXPECT_EQ(BTranslationUtils::GetBitmap(static_cast<const entry_ref*>(nullptr)), nullptr);
	EXPECT_EQ(BTranslationUtils::GetBitmap(static_cast<BPositionIO*>(nullptr)), nullptr);
	EXPECT_EQ(BTranslationUtils::GetBitmap(static_cast<uint32>('bits'), 1), nullptr);
	EXPECT_EQ(BTranslationUtils::GetBitmap(static_cast<uint32>('bits'), "missing"), nullptr);
}


TEST_F(TranslationUtilsTest, CutPictureDoesNoHarm)
{
	for (size_t size = 0; size < kPpmSize - 6; size++) {
		BMemoryIO stream(static_cast<const void*>(kPpm), size);
		EXPECT_EQ(BTranslationUtils::GetBitmap(&stream), nullptr) << size;
	}
}
