// SPDX-License-Identifier: MIT
// The streams in memory, and what all streams have in common.

#include <DataIO.h>

#include <stdio.h>
#include <string.h>

#include <gtest/gtest.h>

namespace {

TEST(DataIOTest, APlainStreamDoesNothing)
{
	class Plain : public BDataIO {
	} plain;
	char byte = 0;
	EXPECT_EQ(plain.Read(&byte, 1), B_NOT_SUPPORTED);
	EXPECT_EQ(plain.Write(&byte, 1), B_NOT_SUPPORTED);
	EXPECT_EQ(plain.Flush(), B_OK);
	EXPECT_EQ(plain.ReadExactly(&byte, 1), B_NOT_SUPPORTED);
}


/// Gives three bytes at a time, and may lie about it.
class Dribble : public BDataIO {
public:
	explicit Dribble(size_t left, ssize_t lie = 0)
		: fLeft(left),
		  fLie(lie)
	{
	}

	ssize_t Read(void* buffer, size_t size) override
	{
		if (fLie != 0)
			return fLie;
		size = std::min({size, fLeft, size_t(3)});
		memset(buffer, 'x', size);
		fLeft -= size;
		return size;
	}
	ssize_t Write(const void*, size_t size) override
	{
		size = std::min({size, fLeft, size_t(3)});
		fLeft -= size;
		return size;
	}

private:
	size_t fLeft;
	ssize_t fLie;
};


TEST(DataIOTest, ReadExactlyGoesOnAfterShortReads)
{
	char buffer[10];
	size_t done = 99;
	EXPECT_EQ(Dribble(10).ReadExactly(buffer, 10, &done), B_OK);
	EXPECT_EQ(done, 10u);
	EXPECT_EQ(Dribble(7).ReadExactly(buffer, 10, &done), B_PARTIAL_READ);
	EXPECT_EQ(done, 7u);
	EXPECT_EQ(Dribble(7).WriteExactly(buffer, 10, &done), B_PARTIAL_WRITE);
	EXPECT_EQ(done, 7u);
	EXPECT_EQ(Dribble(7).ReadExactly(buffer, 0), B_OK);
}


TEST(DataIOTest, ReadExactlyDoesNotTrustTheStream)
{
	char buffer[4];
	size_t done;
	EXPECT_EQ(Dribble(9, 1000).ReadExactly(buffer, 4, &done), B_IO_ERROR);
	EXPECT_EQ(done, 0u);
	EXPECT_EQ(Dribble(9, B_BUSY).ReadExactly(buffer, 4, &done), B_BUSY);
}


TEST(MemoryIOTest, ReadsAndWritesWhatFits)
{
	char memory[8] = "abcdefg";
	BMemoryIO stream(memory, 7);
	char buffer[16] = "";
	EXPECT_EQ(stream.Read(buffer, 3), 3);
	EXPECT_EQ(stream.Position(), 3);
	EXPECT_EQ(stream.ReadAt(5, buffer, 16), 2);
	EXPECT_EQ(stream.Position(), 3);
	EXPECT_EQ(stream.Write("1234567", 7), 4);
	EXPECT_STREQ(memory, "abc1234");
	EXPECT_EQ(stream.Write("x", 1), 0);
	EXPECT_EQ(stream.Read(buffer, 1), 0);
	EXPECT_EQ(stream.WriteAt(INT64_MAX, "x", 1), 0);
	EXPECT_EQ(stream.ReadAt(-1, buffer, 1), B_BAD_VALUE);
	EXPECT_EQ(stream.WriteAt(-1, "x", 1), B_BAD_VALUE);
	EXPECT_EQ(stream.ReadAt(0, nullptr, 1), B_BAD_VALUE);
	size_t done;
	EXPECT_EQ(stream.ReadAtExactly(4, buffer, 9, &done), B_PARTIAL_READ);
	EXPECT_EQ(done, 3u);
	EXPECT_EQ(stream.WriteAtExactly(4, "yyyyyy", 6, &done), B_PARTIAL_WRITE);
	EXPECT_EQ(done, 3u);
}


TEST(MemoryIOTest, ConstMemoryStaysAsItIs)
{
	const char memory[] = "abc";
	BMemoryIO stream(static_cast<const void*>(memory), 3);
	EXPECT_EQ(stream.Write("x", 1), B_NOT_ALLOWED);
	EXPECT_EQ(stream.SetSize(1), B_NOT_ALLOWED);
	off_t size;
	EXPECT_EQ(stream.GetSize(&size), B_OK);
	EXPECT_EQ(size, 3);
}


TEST(MemoryIOTest, SeeksFromEverywhere)
{
	char memory[10] = {};
	BMemoryIO stream(memory, 10);
	EXPECT_EQ(stream.Seek(4, SEEK_SET), 4);
	EXPECT_EQ(stream.Seek(2, SEEK_CUR), 6);
	EXPECT_EQ(stream.Seek(-1, SEEK_END), 9);
	EXPECT_EQ(stream.Seek(-1, SEEK_SET), B_BAD_VALUE);
	EXPECT_EQ(stream.Seek(INT64_MAX, SEEK_CUR), B_BAD_VALUE);
	EXPECT_EQ(stream.Seek(0, 77), B_BAD_VALUE);
	EXPECT_EQ(stream.Position(), 9);
}


TEST(MemoryIOTest, ShrinksAndGrowsInsideItsMemory)
{
	char memory[4] = {'a', 'b', 'c', 'd'};
	BMemoryIO stream(memory, 4);
	EXPECT_EQ(stream.SetSize(5), B_ERROR);
	EXPECT_EQ(stream.SetSize(-1), B_BAD_VALUE);
	EXPECT_EQ(stream.SetSize(1), B_OK);
	char buffer[4];
	EXPECT_EQ(stream.ReadAt(0, buffer, 4), 1);
	EXPECT_EQ(stream.WriteAt(3, "z", 1), 1);
	EXPECT_EQ(memcmp(memory, "a\0\0z", 4), 0);
	EXPECT_EQ(stream.ReadAt(0, buffer, 4), 4);
}


TEST(MallocIOTest, GrowsByItself)
{
	BMallocIO stream;
	EXPECT_EQ(stream.BufferLength(), 0u);
	for (int i = 0; i < 1000; i++)
		ASSERT_EQ(stream.Write("0123456789", 10), 10);
	EXPECT_EQ(stream.BufferLength(), 10000u);
	EXPECT_EQ(memcmp(static_cast<const char*>(stream.Buffer()) + 9990, "0123456789", 10), 0);
	EXPECT_EQ(stream.Position(), 10000);
	EXPECT_EQ(stream.Seek(-10, SEEK_END), 9990);
	char buffer[20];
	EXPECT_EQ(stream.Read(buffer, 20), 10);
}


TEST(MallocIOTest, FillsGapsWithZero)
{
	BMallocIO stream;
	stream.Write("abc", 3);
	EXPECT_EQ(stream.SetSize(1), B_OK);
	EXPECT_EQ(stream.WriteAt(5, "z", 1), 1);
	EXPECT_EQ(memcmp(stream.Buffer(), "a\0\0\0\0z", 6), 0);
	EXPECT_EQ(stream.SetSize(8), B_OK);
	EXPECT_EQ(memcmp(stream.Buffer(), "a\0\0\0\0z\0\0", 8), 0);
}


TEST(MallocIOTest, RefusesWhatCannotBe)
{
	BMallocIO stream;
	stream.SetBlockSize(0);
	EXPECT_EQ(stream.Write("abc", 3), 3);
	EXPECT_EQ(stream.WriteAt(INT64_MAX, "abc", 3), B_NO_MEMORY);
	EXPECT_EQ(stream.SetSize(INT64_MAX - 1), B_NO_MEMORY);
	EXPECT_EQ(stream.SetSize(-1), B_BAD_VALUE);
	EXPECT_EQ(stream.WriteAt(-1, "abc", 3), B_BAD_VALUE);
	EXPECT_EQ(stream.WriteAt(0, nullptr, 3), B_BAD_VALUE);
	EXPECT_EQ(stream.WriteAt(100, "", 0), 0);
	EXPECT_EQ(stream.BufferLength(), 3u);
	EXPECT_EQ(memcmp(stream.Buffer(), "abc", 3), 0);
}


TEST(PositionIOTest, TheSizeIsAskedWithoutMoving)
{
	BMallocIO stream;
	stream.Write("abcdef", 6);
	stream.Seek(2, SEEK_SET);
	off_t size = 0;
	EXPECT_EQ(stream.GetSize(&size), B_OK);
	EXPECT_EQ(size, 6);
	EXPECT_EQ(stream.Position(), 2);
	EXPECT_EQ(stream.GetSize(nullptr), B_BAD_VALUE);
}

} // namespace
