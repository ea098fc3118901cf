// SPDX-License-Identifier: MIT
// Tests of the texts of status codes.

#include <gtest/gtest.h>

#include <errno.h>
#include <string.h>

#include <string>

#include <Errors.h>
#include <SupportDefs.h>

TEST(ErrorTextTest, AStatusHasTheTextOfTheHostsNumber)
{
	EXPECT_STREQ(strerror(B_ENTRY_NOT_FOUND), "No such file or directory");
	EXPECT_STREQ(strerror(B_PERMISSION_DENIED), "Permission denied");
	EXPECT_STREQ(strerror(B_IS_A_DIRECTORY), "Is a directory");
	EXPECT_STREQ(strerror(B_DEVICE_FULL), "No space left on device");
	EXPECT_STREQ(strerror(B_NAME_TOO_LONG), "File name too long");
}


TEST(ErrorTextTest, AStatusThatTheHostDoesNotKnowHasATextOfItsOwn)
{
	EXPECT_STREQ(strerror(B_ERROR), "General error");
	EXPECT_STREQ(strerror(B_NOT_A_MESSAGE), "Not a message");
	EXPECT_STREQ(strerror(B_MISMATCHED_VALUES), "Values do not match");
}


TEST(ErrorTextTest, EveryStatusHasAText)
{
	// Without gaps from the first to the last of each family.
	const struct {
		status_t first;
		status_t last;
	} families[] = {
		{B_ERROR, B_ERROR},
		{B_NO_MEMORY, B_DONT_DO_THAT},
		{B_BAD_SEM_ID, B_NO_MORE_SEMS},
		{B_BAD_THREAD_ID, B_NO_MORE_TEAMS},
		{B_BAD_PORT_ID, B_NO_MORE_PORTS},
		{B_BAD_IMAGE_ID, B_LEGACY_EXECUTABLE},
		{B_BAD_REPLY, B_SHUTTING_DOWN},
		{B_TRANSLATION_BASE_ERROR, B_ILLEGAL_DATA},
		{B_FILE_EXISTS, B_PARTIAL_WRITE},
		{B_POSIX_ENOMEM, B_POSIX_ENOMEM + 0x8},
		{B_BUFFER_OVERFLOW, B_NOT_SUPPORTED},
	};
	for (const auto& family : families) {
		for (status_t status = family.first; status <= family.last; status++)
			EXPECT_EQ(std::string(strerror(status)).find("Unknown error"), std::string::npos)
				<< status;
	}
}


TEST(ErrorTextTest, TheHostsOwnNumbersKeepTheirTexts)
{
	EXPECT_STREQ(strerror(ENOENT), "No such file or directory");
	EXPECT_STREQ(strerror(EINVAL), "Invalid argument");
	EXPECT_STREQ(strerror(0), "Success");
}


TEST(ErrorTextTest, AnUnknownNumberIsNamed)
{
	EXPECT_STREQ(strerror(B_ERRORS_END), ("Unknown error " + std::to_string(B_ERRORS_END)).c_str());
	EXPECT_STREQ(strerror(99999), "Unknown error 99999");
}
