// SPDX-License-Identifier: MIT
// Tests of the stamp by which a file is known to be another than before.

#include "designer/FileStamp.h"

#include <gtest/gtest.h>

#include <set>
#include <string>

#include <File.h>

#include "support/TemporaryFolder.h"

class FileStampTest : public testing::Test {
protected:
	TFileStamp StampOf(const std::string& content)
	{
		fFolder.Write("file", content);
		BFile file((fFolder / "file").c_str(), B_READ_ONLY);
		TFileStamp stamp;
		stamp.Take(&file);
		return stamp;
	}

	TemporaryFolder fFolder;
};


TEST_F(FileStampTest, TheSameContentHasTheSameStamp)
{
	for (size_t size : {0, 1, 31, 32, 33, 65535, 65536, 65537, 200000}) {
		const std::string content(size, 'a');
		const TFileStamp stamp = StampOf(content);
		EXPECT_TRUE(stamp.IsTaken());
		EXPECT_EQ(stamp.Size(), static_cast<off_t>(size));
		EXPECT_EQ(StampOf(content).Fingerprint(), stamp.Fingerprint());
		EXPECT_FALSE(stamp.Differs((fFolder / "file").c_str()));
	}
}


TEST_F(FileStampTest, EveryByteCounts)
{
	const std::string content(70, 'a');
	std::set<uint64> fingerprints = {StampOf(content).Fingerprint()};
	for (size_t i = 0; i < content.size(); i++) {
		for (int bit : {0x01, 0x80}) {
			std::string other = content;
			other[i] = static_cast<char>(other[i] ^ bit);
			fingerprints.insert(StampOf(other).Fingerprint());
		}
	}
	EXPECT_EQ(fingerprints.size(), 2 * content.size() + 1);
}


TEST_F(FileStampTest, ChangesDoNotMakeUpForEachOther)
{
	// The highest bits of two words that go into one sum.
	std::string one(64, 'a');
	std::string other = one;
	other[7] = static_cast<char>(other[7] ^ 0x80);
	other[39] = static_cast<char>(other[39] ^ 0x80);
	EXPECT_NE(StampOf(one).Fingerprint(), StampOf(other).Fingerprint());

	// Words that changed places.
	one = "first...second..third...fourth..first2..second2.third2..fourth2.";
	other = "second..first...third...fourth..first2..second2.third2..fourth2.";
	EXPECT_NE(StampOf(one).Fingerprint(), StampOf(other).Fingerprint());
	other = "first2..second..third...fourth..first...second2.third2..fourth2.";
	EXPECT_NE(StampOf(one).Fingerprint(), StampOf(other).Fingerprint());
}


TEST_F(FileStampTest, ZerosAtTheEndCount)
{
	std::set<uint64> fingerprints;
	for (size_t size = 0; size < 70; size++)
		fingerprints.insert(StampOf(std::string(size, '\0')).Fingerprint());
	EXPECT_EQ(fingerprints.size(), 70u);
}


TEST_F(FileStampTest, AnotherContentDiffers)
{
	const TFileStamp stamp = StampOf("what was there");
	fFolder.Write("file", "what is there!");
	EXPECT_TRUE(stamp.Differs((fFolder / "file").c_str()));
	fFolder.Write("file", "what was there");
	EXPECT_FALSE(stamp.Differs((fFolder / "file").c_str()));
}


TEST_F(FileStampTest, WhatCannotBeReadHasNoContent)
{
	const TFileStamp stamp = StampOf("what was there");
	EXPECT_FALSE(stamp.Differs((fFolder / "gone").c_str()));
	EXPECT_FALSE(stamp.Differs(fFolder.Path().c_str()));
	EXPECT_FALSE(TFileStamp().Differs((fFolder / "file").c_str()));

	BFile closed;
	TFileStamp none = stamp;
	none.Take(&closed);
	EXPECT_FALSE(none.IsTaken());
}
