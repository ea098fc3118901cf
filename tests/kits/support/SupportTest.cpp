// SPDX-License-Identifier: MIT
// The kit's small things: atomics, byte order, archives, stop watch, beep, errors of the host.

#include <errno.h>
#include <string.h>

#include <memory>

#include <Archivable.h>
#include <Beep.h>
#include <ByteOrder.h>
#include <Flattenable.h>
#include <Message.h>
#include <StopWatch.h>

#include <gtest/gtest.h>

#include "support/HostError.h"

namespace {

TEST(AtomicTest, EachGivesTheValueFromBefore)
{
	int32 value = 5;
	EXPECT_EQ(atomic_add(&value, 3), 5);
	EXPECT_EQ(atomic_and(&value, 0xc), 8);
	EXPECT_EQ(atomic_or(&value, 1), 8);
	EXPECT_EQ(atomic_get(&value), 9);
	EXPECT_EQ(atomic_test_and_set(&value, 20, 7), 9);
	EXPECT_EQ(value, 9);
	EXPECT_EQ(atomic_test_and_set(&value, 20, 9), 9);
	EXPECT_EQ(value, 20);
	EXPECT_EQ(atomic_get_and_set(&value, 1), 20);
	atomic_set(&value, -1);
	EXPECT_EQ(value, -1);

	int64 wide = int64(1) << 40;
	EXPECT_EQ(atomic_add64(&wide, 1), int64(1) << 40);
	EXPECT_EQ(atomic_test_and_set64(&wide, 3, (int64(1) << 40) + 1), (int64(1) << 40) + 1);
	EXPECT_EQ(atomic_or64(&wide, 4), 3);
	EXPECT_EQ(atomic_and64(&wide, 5), 7);
	EXPECT_EQ(atomic_get_and_set64(&wide, 9), 5);
	atomic_set64(&wide, 11);
	EXPECT_EQ(atomic_get64(&wide), 11);
}


TEST(ByteOrderTest, SwapsValuesOneByOne)
{
	uint32 words[] = {0x01020304, 0x0a0b0c0d};
	EXPECT_EQ(swap_data(B_INT32_TYPE, words, sizeof(words), B_SWAP_ALWAYS), B_OK);
	EXPECT_EQ(words[0], 0x04030201u);
	EXPECT_EQ(words[1], 0x0d0c0b0au);
	EXPECT_EQ(swap_data(B_INT32_TYPE, words, sizeof(words), B_SWAP_HOST_TO_LENDIAN), B_OK);
	EXPECT_EQ(words[0], B_HOST_TO_LENDIAN_INT32(0x04030201u));
	EXPECT_EQ(swap_data(B_INT32_TYPE, words, 7, B_SWAP_ALWAYS), B_BAD_VALUE);
	EXPECT_EQ(swap_data('none', words, 8, B_SWAP_ALWAYS), B_BAD_VALUE);
	EXPECT_EQ(swap_data(B_INT32_TYPE, nullptr, 8, B_SWAP_ALWAYS), B_BAD_VALUE);
	EXPECT_TRUE(is_type_swapped(B_RECT_TYPE));
	EXPECT_FALSE(is_type_swapped(B_MESSAGE_TYPE));
	EXPECT_EQ(B_SWAP_INT16(0x0102), 0x0201);
	EXPECT_EQ(B_SWAP_DOUBLE(B_SWAP_DOUBLE(1.5)), 1.5);
	EXPECT_EQ(B_SWAP_FLOAT(B_SWAP_FLOAT(-2.25f)), -2.25f);
}


class Number : public BFlattenable {
public:
	bool IsFixedSize() const override { return true; }
	type_code TypeCode() const override { return 'numb'; }
	ssize_t FlattenedSize() const override { return 0; }
	status_t Flatten(void*, ssize_t) const override { return B_OK; }
	status_t Unflatten(type_code, const void*, ssize_t) override { return B_OK; }
};


TEST(FlattenableTest, AllowsItsOwnTypeOnly)
{
	Number number;
	EXPECT_TRUE(number.AllowsTypeCode('numb'));
	EXPECT_FALSE(number.AllowsTypeCode('Numb'));
}

} // namespace


/// Outside the unnamed name space, since it is found by its linker name.
class TestThing : public BArchivable {
public:
	TestThing() = default;
	TestThing(BMessage* archive)
		: BArchivable(archive),
		  fValue(archive->FindInt32("value"))
	{
	}

	status_t Archive(BMessage* into, bool deep = true) const override
	{
		status_t status = BArchivable::Archive(into, deep);
		if (status != B_OK || into == nullptr)
			return status;
		return into->AddInt32("value", fValue);
	}
	static BArchivable* Instantiate(BMessage* archive);

	int32 fValue = 0;
};


BArchivable*
TestThing::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "TestThing") ? new TestThing(archive) : nullptr;
}


namespace {

TEST(ArchivableTest, AnArchiveNamesItsClass)
{
	TestThing thing;
	thing.fValue = 7;
	BMessage archive;
	ASSERT_EQ(thing.Archive(&archive), B_OK);
	EXPECT_STREQ(archive.FindString("class"), "TestThing");
	EXPECT_TRUE(validate_instantiation(&archive, "TestThing"));
	EXPECT_FALSE(validate_instantiation(&archive, "Other"));
	EXPECT_FALSE(validate_instantiation(nullptr, "TestThing"));
	EXPECT_EQ(thing.Archive(nullptr), B_BAD_VALUE);
}


TEST(ArchivableTest, AnObjectIsMadeFromItsArchive)
{
	TestThing thing;
	thing.fValue = 42;
	BMessage archive;
	ASSERT_EQ(thing.Archive(&archive), B_OK);

	image_id image = -1;
	std::unique_ptr<BArchivable> made(instantiate_object(&archive, &image));
	ASSERT_NE(dynamic_cast<TestThing*>(made.get()), nullptr);
	EXPECT_EQ(static_cast<TestThing*>(made.get())->fValue, 42);
	EXPECT_GT(image, 0);
	EXPECT_EQ(find_instantiation_func("TestThing"), &TestThing::Instantiate);
}


TEST(ArchivableTest, TheFirstKnownClassIsTaken)
{
	BMessage archive;
	archive.AddString("class", "some::UnknownThing");
	archive.AddString("class", "TestThing");
	std::unique_ptr<BArchivable> made(instantiate_object(&archive));
	EXPECT_NE(dynamic_cast<TestThing*>(made.get()), nullptr);
}


TEST(ArchivableTest, AnUnknownClassGivesNothing)
{
	BMessage archive;
	image_id image = 1;
	EXPECT_EQ(instantiate_object(&archive, &image), nullptr);
	EXPECT_LT(image, 0);
	archive.AddString("class", "UnknownThing");
	EXPECT_EQ(instantiate_object(&archive, &image), nullptr);
	EXPECT_EQ(image, B_ENTRY_NOT_FOUND);
	EXPECT_EQ(instantiate_object(nullptr), nullptr);
	EXPECT_EQ(find_instantiation_func(""), nullptr);
	EXPECT_EQ(BArchivable::Instantiate(&archive), nullptr);
}


TEST(StopWatchTest, MeasuresWithoutItsPauses)
{
	BStopWatch watch("test", true);
	EXPECT_STREQ(watch.Name(), "test");
	snooze(5000);
	watch.Suspend();
	bigtime_t suspended = watch.ElapsedTime();
	EXPECT_GE(suspended, 5000);
	EXPECT_EQ(watch.Lap(), 0);
	snooze(20000);
	EXPECT_EQ(watch.ElapsedTime(), suspended);
	watch.Resume();
	EXPECT_GE(watch.Lap(), suspended);
	watch.Reset();
	EXPECT_LT(watch.ElapsedTime(), suspended + 5000000);
}


TEST(StopWatchTest, TellsItsNameAtTheEnd)
{
	testing::internal::CaptureStdout();
	{
		BStopWatch watch("loud");
		watch.Lap();
	}
	std::string output = testing::internal::GetCapturedStdout();
	EXPECT_EQ(output.find("StopWatch \"loud\": "), 0u) << output;

	testing::internal::CaptureStdout();
	{
		BStopWatch watch("silent", true);
	}
	EXPECT_EQ(testing::internal::GetCapturedStdout(), "");
}


TEST(BeepTest, KnowsItsEvents)
{
	EXPECT_EQ(system_beep("an event that nobody added"), B_NAME_NOT_FOUND);
	EXPECT_EQ(system_beep(nullptr), B_BAD_VALUE);
	EXPECT_EQ(add_system_beep_event(nullptr), B_BAD_VALUE);
	ASSERT_EQ(add_system_beep_event("Test event"), B_OK);
	EXPECT_NE(system_beep("Test event"), B_NAME_NOT_FOUND);
}


TEST(HostErrorTest, TranslatesTheHostsNumbers)
{
	const struct {
		int host;
		status_t status;
	} kCases[] = {
		{0, B_OK},
		{ENOENT, B_ENTRY_NOT_FOUND},
		{-ENOENT, B_ENTRY_NOT_FOUND},
		{EACCES, B_PERMISSION_DENIED},
		{EPERM, B_NOT_ALLOWED},
		{EEXIST, B_FILE_EXISTS},
		{ENOTDIR, B_NOT_A_DIRECTORY},
		{EISDIR, B_IS_A_DIRECTORY},
		{ENOTEMPTY, B_DIRECTORY_NOT_EMPTY},
		{ENOSPC, B_DEVICE_FULL},
		{EROFS, B_READ_ONLY_DEVICE},
		{EMFILE, B_NO_MORE_FDS},
		{ELOOP, B_LINK_LIMIT},
		{ENOMEM, B_NO_MEMORY},
		{EINVAL, B_BAD_VALUE},
		{EBADF, B_FILE_ERROR},
		{EWOULDBLOCK, B_WOULD_BLOCK},
		{ETIMEDOUT, B_TIMED_OUT},
		{EOPNOTSUPP, B_NOT_SUPPORTED},
		{EDQUOT, B_POSIX_ERROR_BASE + 0x31},
		{99999, B_ERROR},
	};
	for (const auto& row : kCases)
		EXPECT_EQ(BPrivate::host_error(row.host), row.status) << row.host;
	for (int error = 1; error < 140; error++)
		EXPECT_LT(BPrivate::host_error(error), 0) << error;

	errno = ENOENT;
	EXPECT_EQ(BPrivate::host_error(), B_ENTRY_NOT_FOUND);
	errno = 0;
	EXPECT_EQ(BPrivate::host_error(), B_ERROR);
}

} // namespace
