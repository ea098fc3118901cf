// SPDX-License-Identifier: MIT
// Saving a form on a disk that fails, is full, or when the program is killed: the old document or the new one is there,
// whole, and nothing else.

#include <sched.h>
#include <sys/mount.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <chrono>
#include <csignal>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <random>
#include <thread>

#include "app/ReplacementFile.h"
#include "designer/DesignerTest.h"
#include "designer/FormFile.h"
#include "model/Diagnostics.h"
#include "support/CapturedOutput.h"
#include "support/FaultyDisk.h"

namespace {

constexpr int kMostCalls = 200;

/// How often the program is killed at any moment in the usual run; PLIM_KILLED_SAVES says otherwise.
constexpr int kUsualKills = 25;

constexpr int kNoDisk = 77;


class SaveFaultsTest : public DesignerTest {
protected:
	SaveFaultsTest()
		: fPath(fFolder.Make("documents") + "/Form1.frm"),
		  fForm(NewForm())
	{
		Place(fForm, "TButton", "First");
		Save(fForm, fPath);
		fOld = Content(fPath);
		Place(fForm, "TCheckBox", "Second");
		fNew = ContentOfNew();
	}

	static std::string Content(const std::string& path)
	{
		std::ifstream file(path, std::ios::binary);
		return std::string(std::istreambuf_iterator<char>(file), {});
	}

	/// What the changed form's document holds.
	std::string ContentOfNew()
	{
		TDesignForm* copy = NewForm();
		Load(copy, fPath);
		Place(copy, "TCheckBox", "Second");
		Save(copy, fFolder / "new.frm");
		return Content(fFolder / "new.frm");
	}

	/// As it was before the save, with a changed form.
	void StartAgain()
	{
		std::ofstream(fPath, std::ios::binary) << fOld;
		fForm->View()->SetModified(true);
	}

	/// Saves a form that grows until the disk is full; whether everything is then as it must be.
	bool FillsDisk(const std::string& disk)
	{
		const std::string path = disk + "/Form1.frm";
		std::string last;
		bool saved = true;
		for (int i = 0; saved && i < 200; i++) {
			last = Content(path);
			Place(fForm, "TButton", ("More" + std::to_string(i)).c_str());
			saved = (Save(fForm, path), fResult);
		}
		const std::filesystem::directory_iterator entries(disk);
		return !saved && !last.empty() && Content(path) == last && fForm->Modified()
			&& std::distance(begin(entries), end(entries)) == 1;
	}

	size_t CountEntries() const
	{
		const std::filesystem::directory_iterator entries(fFolder / "documents");
		return std::distance(begin(entries), end(entries));
	}

	bool SaveQuietly()
	{
		Save(fForm, fPath);
		return fResult;
	}

	const std::string fPath;
	TDesignForm* fForm;
	std::string fOld;
	std::string fNew;
};

} // namespace


TEST_F(SaveFaultsTest, WhicheverCallFailsTheDocumentIsTheOldOrTheNewOne)
{
	ASSERT_LT(fOld.size(), fNew.size());
	int failures = 0;
	for (int error : {EIO, ENOSPC}) {
		for (disk_fault fault : {DISK_CALL_FAILS, DISK_STAYS_FULL, DISK_WRITES_HALF}) {
			int call = 1;
			for (; call < kMostCalls; call++) {
				StartAgain();
				bool wasReached;
				std::string name;
				bool saved;
				{
					CapturedOutput output;
					FaultyDisk disk(call, fault, error);
					saved = fForm->SaveToFile(fPath.c_str());
					wasReached = disk.WasReached();
					name = wasReached ? disk.Calls()[call - 1] : "none";
				}
				SCOPED_TRACE("fault " + std::to_string(fault) + " at call " + std::to_string(call)
					+ ", " + name);
				EXPECT_TRUE(Content(fPath) == (saved ? fNew : fOld));
				EXPECT_EQ(fForm->Modified(), !saved);
				EXPECT_EQ(CountEntries(), 1u);
				if (!wasReached) {
					EXPECT_TRUE(saved);
					EXPECT_GT(call, 4);
					break;
				}
				failures += saved ? 0 : 1;
			}
			EXPECT_LT(call, kMostCalls);
		}
	}
	// Opening, each write, syncing and renaming fail the save, at the least.
	EXPECT_GT(failures, 20);
}


TEST_F(SaveFaultsTest, KilledBeforeAnyCallTheDocumentIsTheOldOrTheNewOne)
{
	bool sawOld = false;
	int call = 1;
	for (; call < kMostCalls; call++) {
		StartAgain();
		CapturedOutput output;
		const bool wasKilled = IsKilledAt(call, [this] { fForm->SaveToFile(fPath.c_str()); });
		const std::string content = Content(fPath);
		EXPECT_TRUE(content == fOld || content == fNew) << "call " << call;
		sawOld = sawOld || content == fOld;
		// One file that was about to take the document's place may be left behind.
		EXPECT_LE(CountEntries(), 2u) << "call " << call;
		if (!wasKilled)
			break;
	}
	EXPECT_TRUE(sawOld);
	EXPECT_GT(call, 5);
	EXPECT_LT(call, kMostCalls);
	EXPECT_TRUE(SaveQuietly());
	EXPECT_EQ(CountEntries(), 1u);
	EXPECT_TRUE(Content(fPath) == fNew);
}


TEST_F(SaveFaultsTest, KilledAtAnyMomentTheDocumentIsWhole)
{
	const char* setting = getenv("PLIM_KILLED_SAVES");
	const int kills = setting != nullptr ? atoi(setting) : kUsualKills;
	std::mt19937 random(1);
	std::string last;
	int progress = 0;
	for (int i = 0; i < kills && !HasFailure(); i++) {
		const std::string before = Content(fPath);
		fflush(nullptr);
		const pid_t child = fork();
		if (child == 0) {
			// What the robot's person does in seconds, without a pause.
			ShowDiagnostics(false);
			for (int number = 0;; number++) {
				const std::string text = std::to_string(i) + "." + std::to_string(number);
				fForm->SetPropertyValue("Title", text.c_str());
				Find(fForm, "Second")->SetPropertyValue("Label", text.c_str());
				fForm->SaveToFile(fPath.c_str());
			}
		}
		// On a busy machine the usual times are too short for a whole save.
		for (int wait = 0; i % 5 == 0 && Content(fPath) == before && wait < 30000; wait++)
			std::this_thread::sleep_for(std::chrono::milliseconds(1));
		std::this_thread::sleep_for(
			std::chrono::microseconds(std::uniform_int_distribution<int>(0, 12000)(random)));
		kill(child, SIGKILL);
		waitpid(child, nullptr, 0);

		const std::string content = Content(fPath);
		TPLIMFormFile file(fPath.c_str());
		ASSERT_EQ(file.InitCheck(), B_OK) << "kill " << i;
		BMessage part;
		BMessage record;
		ASSERT_EQ(file.FindMessage("_FormProperties", &part), B_OK);
		const std::string title = part.GetString("Title", "");
		if (file.FindMessage("Components", &part) == B_OK
			&& part.FindMessage("Second", &record) == B_OK) {
			ASSERT_EQ(record.FindMessage("Properties", &part), B_OK);
			// Written together, found together.
			EXPECT_EQ(part.GetString("Label", ""), title) << "kill " << i;
		} else
			EXPECT_TRUE(content == fOld) << "kill " << i;
		progress += title != last ? 1 : 0;
		last = title;
		EXPECT_LE(CountEntries(), 2u) << "kill " << i;
	}
	EXPECT_GT(progress, 0);
	printf("%d kills, %d of them after a save\n", kills, progress);
	EXPECT_TRUE(SaveQuietly());
	EXPECT_EQ(CountEntries(), 1u);
}


TEST_F(SaveFaultsTest, AFileSizeLimitLeavesTheOldDocument)
{
	// The host's own refusal, in the middle of the document.
	rlimit limit;
	getrlimit(RLIMIT_FSIZE, &limit);
	signal(SIGXFSZ, SIG_IGN);
	rlimit small = limit;
	small.rlim_cur = fNew.size() / 2;
	StartAgain();
	fForm->View()->SetModified(true);
	{
		TDiagnosticSilence silence;
		ASSERT_EQ(setrlimit(RLIMIT_FSIZE, &small), 0);
		fResult = fForm->SaveToFile(fPath.c_str());
		setrlimit(RLIMIT_FSIZE, &limit);
	}
	EXPECT_FALSE(fResult);
	EXPECT_TRUE(fForm->Modified());
	EXPECT_TRUE(Content(fPath) == fOld);
	EXPECT_EQ(CountEntries(), 1u);
}


TEST_F(SaveFaultsTest, ASmallDiskKeepsTheOldDocument)
{
	const std::string disk = fFolder.Make("disk");
	fflush(nullptr);
	const pid_t child = fork();
	if (child == 0) {
		// A file system that is really full, seen by this copy of the program alone.
		const bool isMade = (unshare(CLONE_NEWNS) == 0 || unshare(CLONE_NEWUSER | CLONE_NEWNS) == 0)
			&& mount("none", "/", nullptr, MS_REC | MS_PRIVATE, nullptr) == 0
			&& mount("tmpfs", disk.c_str(), "tmpfs", 0, "size=64k") == 0;
		_exit(isMade ? (FillsDisk(disk) ? 0 : 1) : kNoDisk);
	}
	int status = 0;
	ASSERT_EQ(waitpid(child, &status, 0), child);
	ASSERT_TRUE(WIFEXITED(status));
	if (WEXITSTATUS(status) == kNoDisk)
		GTEST_SKIP() << "this user may not mount a small file system";
	EXPECT_EQ(WEXITSTATUS(status), 0);
}


TEST_F(SaveFaultsTest, AFileThatIsBeingWrittenIsNotTakenForLeftBehind)
{
	TReplacementFile other((fFolder / "documents/other").c_str());
	ASSERT_EQ(other.InitCheck(), B_OK);
	EXPECT_TRUE(SaveQuietly());
	EXPECT_EQ(CountEntries(), 2u);
	EXPECT_EQ(other.Replace(), B_OK);
	EXPECT_TRUE(std::filesystem::exists(fFolder / "documents/other"));
	EXPECT_EQ(CountEntries(), 2u);
}


TEST_F(SaveFaultsTest, WhatLooksLikeLeftBehindButIsNoFileStays)
{
	const std::string name = "documents/" + std::string(kReplacementPrefix) + "1-0";
	fFolder.Make(name);
	fFolder.Link("nowhere", name + "0");
	ASSERT_EQ(mkfifo((fFolder / (name + "1")).c_str(), 0600), 0);
	EXPECT_TRUE(SaveQuietly());
	EXPECT_EQ(CountEntries(), 4u);
}


TEST_F(SaveFaultsTest, ADocumentWithTheLongestNameIsSaved)
{
	// As long as a name may be, in a path that is short enough for a document.
	const std::string folder = "/tmp/plim-" + std::to_string(getpid());
	std::filesystem::create_directory(folder);
	const std::string path = folder + "/" + std::string(255 - folder.size() - 1, 'n');
	EXPECT_TRUE((Save(fForm, path), fResult));
	EXPECT_TRUE((Save(fForm, path), fResult));
	EXPECT_FALSE(Content(path).empty());
	std::filesystem::remove_all(folder);
}


TEST_F(SaveFaultsTest, APartThatCouldNotBeReadIsKeptBesideTheFileWhateverFails)
{
	// The button's class becomes one that no library offers.
	const std::string path = fPath;
	std::string content = fOld;
	for (size_t at = content.find("TButton"); at != std::string::npos; at = content.find("TButton"))
		content.replace(at, 7, "TMissng");
	const std::string kept = path + ".orig";
	int call = 1;
	for (; call < kMostCalls; call++) {
		std::filesystem::remove(kept);
		std::ofstream(path, std::ios::binary | std::ios::trunc) << content;
		TDesignForm* form = NewForm();
		Load(form, path);
		ASSERT_TRUE(fResult);
		ASSERT_EQ(form->CountComponents(), 0);
		bool wasReached;
		{
			CapturedOutput output;
			FaultyDisk disk(call, DISK_CALL_FAILS, ENOSPC);
			fResult = form->SaveToFile(path.c_str());
			wasReached = disk.WasReached();
		}
		SCOPED_TRACE("call " + std::to_string(call));
		if (Content(path) != content)
			EXPECT_TRUE(Content(kept) == content);
		else
			EXPECT_FALSE(fResult);
		if (!wasReached) {
			EXPECT_TRUE(fResult);
			break;
		}
	}
	EXPECT_GT(call, 10);
	EXPECT_LT(call, kMostCalls);
}
