// SPDX-License-Identifier: MIT
// Generating on a disk that fails, is full, or when the program is killed: every source is the old or the new one.

#include <cerrno>
#include <filesystem>
#include <iterator>
#include <map>

#include "app/Dialogs.h"
#include "codegen/CodeGenerator.h"
#include "codegen/DialectGenerator.h"
#include "codegen/SampleProject.h"
#include "codegen/TestFolder.h"
#include "designer/DesignForm.h"
#include "model/Diagnostics.h"
#include "support/FaultyDisk.h"

namespace {

constexpr int kMostCalls = 300;
int sBoxes = 0;
const char* const kGenerated[] = {"Form1.h", "Form1.cpp", "Form1.fcp", "MyApp.h", "MyApp.cpp"};

int32
CountBox(const char*, const char*, const char*)
{
	sBoxes++;
	return 0;
}


class GenerateFaultsTest : public testing::Test {
protected:
	GenerateFaultsTest()
		: fProject(SampleProject::MakeFull())
	{
		Generate();
		for (const char* name : kGenerated) {
			// What the user adds is as precious as a document.
			std::string text = ReadText(fFolder.At(name));
			if (std::string(name) != "Form1.fcp")
				text += "// The user's own text.\n";
			fOld.push_back(text);
		}
		PutBack();
		SetText(&fProject->App(), "Signature", "application/x-vnd.changed");
		fProject->Place(static_cast<TDesignForm*>(fProject->App().ComponentAt(0)),
			new TSampleControl("TButton", "Another", 1, 2, 3, 4));
		Generate();
		for (const char* name : kGenerated)
			fNew.push_back(ReadText(fFolder.At(name)));
		PutBack();
	}

	/// Generates, and returns how many files it says it could not write.
	int Generate()
	{
		TCodeGenerator generator;
		generator.SetAppComponent(&fProject->App());
		generator.SetGenerationPath(fFolder.Path().c_str());
		generator.GenerateApp();
		int unwritable = 0;
		for (const generated_file& file : generator.Writer().Files())
			unwritable += file.outcome == GENERATED_UNWRITABLE ? 1 : 0;
		return unwritable;
	}

	void PutBack()
	{
		for (size_t i = 0; i < std::size(kGenerated); i++)
			WriteText(fFolder.At(kGenerated[i]), fOld[i]);
	}

	/// How many files are still the old ones; each must be the old or the new one.
	int CountOld()
	{
		int count = 0;
		for (size_t i = 0; i < std::size(kGenerated); i++) {
			const std::string text = ReadText(fFolder.At(kGenerated[i]));
			EXPECT_TRUE(text == fOld[i] || text == fNew[i]) << kGenerated[i];
			count += text == fOld[i] && text != fNew[i] ? 1 : 0;
		}
		return count;
	}

	TestFolder fFolder;
	std::unique_ptr<SampleProject> fProject;
	std::vector<std::string> fOld;
	std::vector<std::string> fNew;
};

} // namespace


TEST_F(GenerateFaultsTest, WhicheverCallFailsASourceIsTheOldOneAndSaysSo)
{
	int failures = 0;
	for (disk_fault fault : {DISK_CALL_FAILS, DISK_STAYS_FULL, DISK_WRITES_HALF}) {
		int call = 1;
		for (; call < kMostCalls; call++) {
			PutBack();
			int unwritable;
			bool wasReached;
			{
				FaultyDisk disk(call, fault, ENOSPC);
				TDiagnosticSilence silence;
				unwritable = Generate();
				wasReached = disk.WasReached();
			}
			SCOPED_TRACE("fault " + std::to_string(fault) + " at call " + std::to_string(call));
			EXPECT_EQ(CountOld(), unwritable);
			EXPECT_EQ(EntryNames(fFolder.Path()), "Form1.cpp Form1.fcp Form1.h MyApp.cpp MyApp.h");
			if (!wasReached) {
				EXPECT_EQ(unwritable, 0);
				break;
			}
			failures += unwritable > 0 ? 1 : 0;
		}
		EXPECT_LT(call, kMostCalls);
	}
	EXPECT_GT(failures, 20);
}


TEST_F(GenerateFaultsTest, KilledBeforeAnyCallEverySourceIsTheOldOrTheNewOne)
{
	int call = 1;
	for (; call < kMostCalls; call++) {
		PutBack();
		const bool wasKilled = IsKilledAt(call, [this] { Generate(); });
		SCOPED_TRACE("call " + std::to_string(call));
		const int old = CountOld();
		if (!wasKilled) {
			EXPECT_EQ(old, 0);
			break;
		}
	}
	EXPECT_GT(call, 15);
	EXPECT_LT(call, kMostCalls);
}


TEST_F(GenerateFaultsTest, OfAWholeNewFolderWhicheverCallFailsThereIsNothingHalf)
{
	SetMessageBoxHook(CountBox);
	const std::string folder = fFolder.At("sources");
	std::map<std::string, std::string> whole;
	int missing = 0;
	int folderFailures = 0;
	for (disk_fault fault : {DISK_CALL_FAILS, DISK_STAYS_FULL, DISK_WRITES_HALF}) {
		int call = 0; // nothing fails at first
		for (; call < kMostCalls; call++) {
			std::filesystem::remove_all(folder);
			TDialectGenerator generator;
			generator.SetDialect(DIALECT_STANDARD);
			generator.SetBuildFiles(true);
			generator.SetAppComponent(&fProject->App());
			generator.SetGenerationPath(folder.c_str());
			bool wasReached;
			sBoxes = 0;
			{
				FaultyDisk disk(call, fault, ENOSPC);
				TDiagnosticSilence silence;
				generator.GenerateApp();
				wasReached = call == 0 || disk.WasReached();
			}
			SCOPED_TRACE("fault " + std::to_string(fault) + " at call " + std::to_string(call));
			std::map<std::string, std::string> files;
			if (std::filesystem::exists(folder)) {
				for (const auto& entry : std::filesystem::directory_iterator(folder))
					files[entry.path().filename()] = ReadText(entry.path());
			}
			if (whole.empty())
				whole = files;
			for (const auto& [name, text] : files)
				EXPECT_TRUE(whole.count(name) > 0 && text == whole[name]) << name;
			// What is not there is told, file by file, or all at once when the folder could not be made.
			size_t unwritable = 0;
			for (const generated_file& file : generator.Writer().Files())
				unwritable += file.outcome == GENERATED_UNWRITABLE ? 1 : 0;
			if (sBoxes == 0)
				EXPECT_EQ(files.size() + unwritable, whole.size());
			else
				EXPECT_LT(files.size(), whole.size());
			folderFailures += sBoxes;
			missing += whole.size() - files.size();
			if (!wasReached)
				break;
		}
		EXPECT_LT(call, kMostCalls);
	}
	// There are the files that build the program, too.
	SetMessageBoxHook(nullptr);
	EXPECT_GT(whole.size(), 5u);
	EXPECT_GT(missing, 20);
	// Once for each kind of fault that a folder can have.
	EXPECT_GE(folderFailures, 2);
}


TEST_F(GenerateFaultsTest, WhatAKilledRunLeftBehindGoesWithTheNextOne)
{
	TestFolder other;
	ASSERT_TRUE(IsKilledAt(3, [this] { Generate(); }));
	EXPECT_NE(EntryNames(fFolder.Path()), "Form1.cpp Form1.fcp Form1.h MyApp.cpp MyApp.h");
	// This program looks into a folder when it comes there from another one.
	TCodeGenerator generator;
	generator.SetAppComponent(&fProject->App());
	generator.SetGenerationPath(other.Path().c_str());
	generator.GenerateApp();
	EXPECT_EQ(Generate(), 0);
	EXPECT_EQ(EntryNames(fFolder.Path()), "Form1.cpp Form1.fcp Form1.h MyApp.cpp MyApp.h");
}
