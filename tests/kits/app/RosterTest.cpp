// SPDX-License-Identifier: MIT
// BRoster: what it knows of this program, and starting others.

#include <Roster.h>

#include <cstdlib>
#include <fstream>
#include <string>

#include <sys/stat.h>
#include <unistd.h>

#include <gtest/gtest.h>

#include <Application.h>
#include <List.h>
#include <Path.h>

#include "Recorder.h"

static const char* const kSignature = "application/x-vnd.plim-roster-test";


TEST(RosterTest, KnowsNobodyWithoutAnApplication)
{
	app_info info;
	BList teams;
	EXPECT_EQ(be_roster->GetAppInfo(kSignature, &info), B_ERROR);
	EXPECT_FALSE(be_roster->IsRunning(kSignature));
	EXPECT_EQ(be_roster->GetRunningAppInfo(getpid(), &info), B_BAD_TEAM_ID);
	be_roster->GetAppList(&teams);
	EXPECT_TRUE(teams.IsEmpty());
	EXPECT_EQ(be_roster->GetAppInfo(static_cast<const char*>(NULL), &info), B_BAD_VALUE);
}


TEST(RosterTest, KnowsThisProgram)
{
	BApplication application(kSignature);
	app_info info;
	ASSERT_EQ(be_roster->GetAppInfo(kSignature, &info), B_OK);
	EXPECT_EQ(info.team, getpid());
	EXPECT_STREQ(info.signature, kSignature);
	EXPECT_EQ(info.thread, find_thread(NULL));

	char path[4096];
	ssize_t length = readlink("/proc/self/exe", path, sizeof(path) - 1);
	path[length] = '\0';
	EXPECT_STREQ(BPath(&info.ref).Path(), path);

	EXPECT_EQ(be_roster->TeamFor(kSignature), getpid());
	EXPECT_TRUE(be_roster->IsRunning(&info.ref));
	BList teams;
	be_roster->GetAppList(kSignature, &teams);
	EXPECT_EQ(teams.CountItems(), 1);
	app_info same;
	EXPECT_EQ(application.GetAppInfo(&same), B_OK);
	EXPECT_EQ(same.team, info.team);
	EXPECT_TRUE(BMessenger(kSignature).IsValid());
	EXPECT_TRUE(BMessenger(kSignature) == be_app_messenger);
}


TEST(RosterTest, AnUnknownSignatureCannotBeLaunched)
{
	team_id team = -7;
	EXPECT_EQ(be_roster->Launch("application/x-vnd.plim-nobody", (BMessage*)NULL, &team),
		B_LAUNCH_FAILED_APP_NOT_FOUND);
	EXPECT_EQ(be_roster->Launch("text/x-unheard-of", (BMessage*)NULL, &team),
		B_LAUNCH_FAILED_NO_PREFERRED_APP);
	EXPECT_EQ(team, -7);
}


TEST(RosterTest, WatchersHearOfTheStartAndTheEnd)
{
	RecordingLooper* watcher = new RecordingLooper;
	watcher->Run();
	ASSERT_EQ(be_roster->StartWatching(BMessenger(watcher)), B_OK);
	{
		BApplication application(kSignature);
		EXPECT_TRUE(watcher->record.Wait(1));
	}
	EXPECT_TRUE(watcher->record.Wait(2));
	EXPECT_EQ(watcher->record.Codes(), (std::vector<uint32>{B_SOME_APP_LAUNCHED, B_SOME_APP_QUIT}));
	EXPECT_EQ(be_roster->StopWatching(BMessenger(watcher)), B_OK);
	EXPECT_EQ(be_roster->StopWatching(BMessenger(watcher)), B_BAD_VALUE);
	QuitLooper(watcher);
}


/// A script that writes its arguments into a file.
class LaunchTest : public testing::Test {
protected:
	LaunchTest()
	{
		char name[] = "/tmp/launch-test-XXXXXX";
		folder = mkdtemp(name);
		script = folder + "/program";
		result = folder + "/result";
		std::ofstream(script) << "#!/bin/sh\n{ for a in \"$@\"; do echo \"$a\"; done; "
								 "echo \"files=$BE_ARGUMENTS_ARE_FILES\"; } > "
							  << result << ".new && mv " << result << ".new " << result << "\n";
		chmod(script.c_str(), 0755);
		get_ref_for_path(script.c_str(), &ref);
	}
	~LaunchTest() override
	{
		unlink(script.c_str());
		unlink(result.c_str());
		rmdir(folder.c_str());
	}

	std::string Result()
	{
		bigtime_t end = system_time() + kLimit;
		while (access(result.c_str(), F_OK) != 0 && system_time() < end)
			snooze(2000);
		std::ifstream file(result);
		return std::string(std::istreambuf_iterator<char>(file), {});
	}

	std::string folder;
	std::string script;
	std::string result;
	entry_ref ref;
};


TEST_F(LaunchTest, StartsAProgramWithArguments)
{
	const char* arguments[] = {"one", "two words"};
	team_id team = -1;
	EXPECT_EQ(be_roster->Launch(&ref, 2, arguments, &team), B_OK);
	EXPECT_GT(team, 0);
	EXPECT_EQ(Result(), "one\ntwo words\nfiles=\n");
}


TEST_F(LaunchTest, StartsAProgramWithFiles)
{
	BMessage message(B_REFS_RECEIVED);
	message.AddRef("refs", &ref);
	EXPECT_EQ(be_roster->Launch(&ref, &message), B_OK);
	EXPECT_EQ(Result(), script + "\nfiles=1\n");
}


TEST_F(LaunchTest, OtherMessagesCannotBeGivenToANewProgram)
{
	BMessage message('othr');
	EXPECT_EQ(be_roster->Launch(&ref, &message), B_NOT_SUPPORTED);
	EXPECT_NE(access(result.c_str(), F_OK), 0);
}


TEST_F(LaunchTest, WhatIsNoProgramFails)
{
	chmod(script.c_str(), 0644);
	EXPECT_EQ(be_roster->Launch(&ref, 0, NULL), B_LAUNCH_FAILED_NO_PREFERRED_APP);
	unlink(script.c_str());
	EXPECT_EQ(be_roster->Launch(&ref, 0, NULL), B_ENTRY_NOT_FOUND);
}
