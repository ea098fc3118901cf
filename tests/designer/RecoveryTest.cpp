// SPDX-License-Identifier: MIT
// Recovery copies: written, removed, found again, and left alone while their designer runs.

#include "designer/Recovery.h"

#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <filesystem>
#include <set>
#include <string>

#include <gtest/gtest.h>

#include "designer/LostWork.h"
#include "support/CapturedOutput.h"
#include "support/TemporaryFolder.h"

namespace {

std::unique_ptr<BMessage>
MakeCopy(const char* project, const char* path, const char* name, int32 index = 0)
{
	std::unique_ptr<BMessage> copy = std::make_unique<BMessage>(RECOVERY_COPY);
	copy->AddString("project", project);
	copy->AddString("path", path);
	copy->AddString("name", name);
	copy->AddInt32("index", index);
	const BMessage form('PFrm');
	copy->AddMessage("form", &form);
	return copy;
}


/// "PROJECT: FORM FORM" of each, divided by "; ".
std::string
Told(const TLostWork& lost)
{
	std::string text;
	for (const lost_project& project : lost.Projects()) {
		text += (text.empty() ? "" : "; ") + std::string(project.path.String()) + ":";
		for (const lost_form& form : project.forms)
			text += " " + std::string(form.name.String());
	}
	return text;
}


/// Settings of its own.
class RecoveryTest : public testing::Test {
protected:
	RecoveryTest()
		: fSettings("XDG_CONFIG_HOME", fFolder.Path())
	{
	}

	/// The names of the files, those of sessions left out: "1.copy 2.copy lock".
	std::string Files() const
	{
		std::multiset<std::string> names;
		for (const auto& entry : std::filesystem::directory_iterator(fFolder / "Plim_Recovery")) {
			const std::string name = entry.path().filename();
			names.insert(name.substr(name.find_first_of("-.") + 1));
		}
		std::string text;
		for (const std::string& name : names)
			text += (text.empty() ? "" : " ") + name;
		return text;
	}

	TemporaryFolder fFolder;
	ScopedVariable fSettings;
};

} // namespace


TEST_F(RecoveryTest, ACopyIsWrittenAndRemovedAgain)
{
	{
		TRecovery recovery;
		ASSERT_EQ(recovery.InitCheck(), B_OK);
		EXPECT_EQ(TRecovery::Current(), &recovery);
		EXPECT_EQ(Files(), "lock");
		const int32 first = recovery.NewId();
		const int32 second = recovery.NewId();
		recovery.Keep(first, MakeCopy("p", "a", "A"));
		recovery.Keep(second, MakeCopy("p", "b", "B"));
		recovery.Flush();
		EXPECT_EQ(Files(), "1.copy 2.copy lock");
		recovery.Forget(first);
		EXPECT_EQ(Files(), "2.copy lock");
		// One that waits to be written is not written any more.
		for (int i = 0; i < 50; i++)
			recovery.Keep(first, MakeCopy("p", "a", "A"));
		recovery.Forget(first);
		recovery.Flush();
		EXPECT_EQ(Files(), "2.copy lock");
		recovery.Forget(second);
		EXPECT_EQ(Files(), "lock");
	}
	EXPECT_EQ(TRecovery::Current(), nullptr);
	EXPECT_EQ(Files(), "");
}


TEST_F(RecoveryTest, WhatIsNotRemovedIsFoundByTheNextDesigner)
{
	{
		TRecovery recovery;
		for (const char* name : {"A", "B"})
			recovery.Keep(recovery.NewId(), MakeCopy("/p.plim", "", name, *name == 'A' ? 1 : 0));
		recovery.Keep(recovery.NewId(), MakeCopy("", "", "C"));
		// Without waiting: the end waits for the writing.
	}
	TRecovery next;
	{
		TLostWork lost;
		EXPECT_EQ(Told(lost), ": C; /p.plim: B A");
		// One designer at a time looks at them.
		EXPECT_EQ(Told(TLostWork()), "");
		TLostWork::Discard(lost.Projects()[1]);
	}
	// What was neither discarded nor taken over is found again.
	TLostWork lost;
	ASSERT_EQ(Told(lost), ": C");
	EXPECT_GT(next.TakeOver(lost.Projects()[0].forms[0].copyPath.String()), 0);
	EXPECT_EQ(next.TakeOver((fFolder / "missing").c_str()), 0);
	EXPECT_EQ(Told(TLostWork()), "");
}


TEST_F(RecoveryTest, OfTwoCopiesOfAFormTheLaterOneComesFirst)
{
	{
		TRecovery recovery;
		recovery.Keep(recovery.NewId(), MakeCopy("p", "a", "Early"));
		recovery.Keep(recovery.NewId(), MakeCopy("p", "a", "Late"));
		recovery.Keep(recovery.NewId(), MakeCopy("p", "", "New1"));
		recovery.Keep(recovery.NewId(), MakeCopy("p", "", "New2"));
	}
	{
		TLostWork lost;
		EXPECT_EQ(Told(lost), "p: Late New1 New2");
		TLostWork::Discard(lost.Projects()[0]);
	}
	EXPECT_EQ(Told(TLostWork()), "p: Early");
}


TEST_F(RecoveryTest, CopiesOfARunningDesignerAreItsOwnUntilItIsKilled)
{
	int ready[2];
	ASSERT_EQ(pipe(ready), 0);
	const pid_t child = fork();
	if (child == 0) {
		TRecovery recovery;
		recovery.Keep(recovery.NewId(), MakeCopy("p", "a", "A"));
		recovery.Flush();
		if (write(ready[1], "!", 1) == 1)
			pause();
		_exit(0);
	}
	char byte;
	ASSERT_EQ(read(ready[0], &byte, 1), 1);
	EXPECT_EQ(Told(TLostWork()), "");
	EXPECT_EQ(Files(), "1.copy lock");
	kill(child, SIGKILL);
	waitpid(child, nullptr, 0);
	EXPECT_EQ(Told(TLostWork()), "p: A");
	close(ready[0]);
	close(ready[1]);
}


TEST_F(RecoveryTest, DamagedCopiesAndForeignFilesAreLeftAlone)
{
	fFolder.Make("Plim_Recovery");
	fFolder.Write("Plim_Recovery/1-1.copy", "damaged");
	fFolder.Write("Plim_Recovery/1-x.copy", "none");
	fFolder.Write("Plim_Recovery/-1.copy", "none");
	fFolder.Make("Plim_Recovery/2-1.copy");
	fFolder.Write("Plim_Recovery/3.lock", "of no copies");
	CapturedOutput output;
	EXPECT_EQ(Told(TLostWork()), "");
	EXPECT_NE(output.Text().find("Warning: Unable to read the recovery copy '"), std::string::npos);
	for (const char* name : {"1-1.copy", "1-x.copy", "-1.copy", "2-1.copy"})
		EXPECT_TRUE(std::filesystem::exists(fFolder / ("Plim_Recovery/" + std::string(name))));
	EXPECT_FALSE(std::filesystem::exists(fFolder / "Plim_Recovery/3.lock"));
}


TEST_F(RecoveryTest, WithoutAFolderNothingIsKept)
{
	fFolder.Write("Plim_Recovery", "in the way");
	TRecovery recovery;
	EXPECT_NE(recovery.InitCheck(), B_OK);
	EXPECT_EQ(TRecovery::Current(), nullptr);
	EXPECT_EQ(Told(TLostWork()), "");
}


TEST_F(RecoveryTest, ACopyThatCannotBeWrittenIsToldOnce)
{
	CapturedOutput output;
	{
		TRecovery recovery;
		// Somebody has put a folder where the copy is to be.
		fFolder.Make("Plim_Recovery/" + std::string(recovery.Session().String()) + "-1.copy/in");
		const int32 id = recovery.NewId();
		for (int i = 0; i < 3; i++) {
			recovery.Keep(id, MakeCopy("p", "a", "A"));
			recovery.Flush();
		}
	}
	const std::string text = output.Text();
	const size_t first = text.find("Warning: Unable to write recovery copies: ");
	EXPECT_NE(first, std::string::npos);
	EXPECT_EQ(text.find("Warning", first + 1), std::string::npos) << text;
}
