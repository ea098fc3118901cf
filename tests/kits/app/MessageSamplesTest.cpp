// SPDX-License-Identifier: MIT
// Reading and rebuilding the platform's own files, in both formats and both byte orders.

#include <DataIO.h>
#include <Message.h>
#include <gtest/gtest.h>

#include "app/MessagePrivate.h"
#include "kits/app/MessageText.h"
#include "kits/app/SwappedMessage.h"

class MessageSamplesTest : public testing::TestWithParam<const char*> {
protected:
	std::string Sample(const char* suffix) { return ReadSample(std::string(GetParam()) + suffix); }
};


static std::string
FlatR5Bytes(BMessage message)
{
	BMessage::Private r5(message);
	std::string bytes(r5.R5FlattenedSize(), '\0');
	EXPECT_EQ(r5.FlattenR5(bytes.data(), ssize_t(bytes.size())), B_OK);
	return bytes;
}


TEST_P(MessageSamplesTest, HaikuFileReadsAsItsText)
{
	BMessage message;
	ASSERT_EQ(message.Unflatten(Sample(".hmf1").c_str()), B_OK);
	EXPECT_EQ(MessageText(message), Sample(".txt"));
}


TEST_P(MessageSamplesTest, HaikuFileReadsFromAStreamAsItsText)
{
	const std::string bytes = Sample(".hmf1") + "tail";
	BMemoryIO stream(bytes.data(), bytes.size());
	BMessage message;
	ASSERT_EQ(message.Unflatten(&stream), B_OK);
	EXPECT_EQ(MessageText(message), Sample(".txt"));
	EXPECT_EQ(stream.Position(), off_t(bytes.size()) - 4);
}


TEST_P(MessageSamplesTest, R5FileReadsAsItsText)
{
	BMessage message;
	ASSERT_EQ(message.Unflatten(Sample(".fob1").c_str()), B_OK);
	EXPECT_EQ(MessageText(message), Sample(".txt"));
}


TEST_P(MessageSamplesTest, R5FileReadsFromAStreamAsItsText)
{
	const std::string bytes = Sample(".fob1") + "tail";
	BMemoryIO stream(bytes.data(), bytes.size());
	BMessage message;
	ASSERT_EQ(message.Unflatten(&stream), B_OK);
	EXPECT_EQ(MessageText(message), Sample(".txt"));
	EXPECT_EQ(stream.Position(), off_t(bytes.size()) - 4);
}


TEST_P(MessageSamplesTest, BigEndianFileReadsAsItsText)
{
	const std::string bytes = SwapR5(Sample(".fob1"));
	ASSERT_EQ(bytes.substr(0, 4), "FOB1");
	BMessage message;
	ASSERT_EQ(message.Unflatten(bytes.c_str()), B_OK);
	EXPECT_EQ(MessageText(message), Sample(".txt"));

	BMemoryIO stream(bytes.data(), bytes.size());
	BMessage streamed;
	ASSERT_EQ(streamed.Unflatten(&stream), B_OK);
	EXPECT_EQ(FlatBytes(streamed), Sample(".hmf1"));
}


TEST_P(MessageSamplesTest, RebuildingFromTheTextGivesTheHaikuFile)
{
	BMessage message;
	ASSERT_TRUE(BuildMessage(Sample(".txt"), &message));
	EXPECT_EQ(FlatBytes(message), Sample(".hmf1"));
}


TEST_P(MessageSamplesTest, RebuildingFromTheTextGivesTheR5File)
{
	BMessage message;
	ASSERT_TRUE(BuildMessage(Sample(".txt"), &message));
	EXPECT_EQ(FlatR5Bytes(message), Sample(".fob1"));
}


TEST_P(MessageSamplesTest, ReadingAndWritingGivesTheSameBytes)
{
	BMessage message;
	ASSERT_EQ(message.Unflatten(Sample(".hmf1").c_str()), B_OK);
	EXPECT_EQ(FlatBytes(message), Sample(".hmf1"));
	EXPECT_EQ(FlatR5Bytes(message), Sample(".fob1"));

	BMessage fromR5;
	ASSERT_EQ(fromR5.Unflatten(Sample(".fob1").c_str()), B_OK);
	EXPECT_EQ(FlatBytes(fromR5), Sample(".hmf1"));
	EXPECT_TRUE(fromR5.HasSameData(message));

	BMallocIO stream;
	ssize_t size = 0;
	ASSERT_EQ(message.Flatten(&stream, &size), B_OK);
	EXPECT_EQ(size, message.FlattenedSize());
	EXPECT_EQ(std::string(static_cast<const char*>(stream.Buffer()), stream.BufferLength()),
		Sample(".hmf1"));
}


TEST_P(MessageSamplesTest, EveryCutOffFileIsRefused)
{
	for (const char* suffix : {".hmf1", ".fob1"}) {
		const std::string bytes = Sample(suffix);
		const std::string swapped = suffix[1] == 'f' ? SwapR5(bytes) : bytes;
		for (size_t size = 0; size < bytes.size(); size++) {
			for (const std::string& whole : {bytes, swapped}) {
				BMessage message('kept');
				message.AddBool("field", true);
				// A copy of just these bytes lets the address sanitizer see any step beyond them.
				const std::vector<char> cut(whole.begin(), whole.begin() + size);
				BMemoryIO stream(cut.data(), cut.size());
				const bool hasFormat = size >= 4;
				ASSERT_EQ(message.Unflatten(&stream), hasFormat ? B_BAD_VALUE : B_NOT_A_MESSAGE)
					<< suffix << " cut off after " << size;
				ASSERT_EQ(message.IsEmpty(), hasFormat) << suffix << " cut off after " << size;
				ASSERT_NE(BMessage::Private(message).Unflatten(cut.data(), size), B_OK)
					<< suffix << " cut off after " << size;
			}
		}
	}
}


INSTANTIATE_TEST_SUITE_P(All, MessageSamplesTest,
	testing::Values("empty", "strings", "multi", "types", "form", "project", "settings", "nested"),
	[](const auto& info) { return std::string(info.param); });
