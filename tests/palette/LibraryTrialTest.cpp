// SPDX-License-Identifier: MIT

#include "palette/LibraryTrial.h"

#include <filesystem>

#include <gtest/gtest.h>

#include <Application.h>

#include "palette/LibraryLoader.h"
#include "palette/PaletteCatalog.h"
#include "support/CapturedOutput.h"
#include "support/Command.h"
#include "support/TemporaryFolder.h"

namespace {

const std::string kCheck = PLIM_BUILD_DIR "/bin/plimcheck";

std::string
Library(const std::string& name)
{
	return PLIM_BUILD_DIR "/tests/libraries/" + name + "/test_library_" + name + ".so";
}


bool
Contains(const std::string& text, const std::string& part)
{
	return text.find(part) != std::string::npos;
}

} // namespace


class LibraryTrialTest : public testing::Test {
protected:
	static void SetUpTestSuite()
	{
		setenv("BE_DISPLAY", "none", 1);
		if (be_app == nullptr)
			new BApplication("application/x-vnd.Plimworks-PaletteTest");
	}

	/// Loads a folder with these libraries, and returns what was printed.
	std::string Load(TLibraryTrial& trial, const std::vector<std::string>& names)
	{
		TemporaryFolder folder;
		for (const std::string& name : names)
			folder.Link(Library(name), name + ".so");
		CapturedOutput output;
		EXPECT_EQ(
			TLibraryLoader(&fCatalog, nullptr, &trial).LoadFolder(folder.Path().c_str()), B_OK);
		return output.Text();
	}

	/// How often a library was initialized in processes that had the variable.
	size_t CountInits() { return fFolder.Read("notes").size() / strlen("init\n"); }

	TLibraryTrial NewTrial() { return TLibraryTrial(kCheck.c_str(), fRecord.c_str()); }

	TemporaryFolder fFolder;
	std::string fRecord = fFolder / "record";
	TPaletteCatalog fCatalog;
};


TEST_F(LibraryTrialTest, ALibraryThatCrashesIsToldAndTheOthersAreLoaded)
{
	TLibraryTrial trial = NewTrial();
	const std::string output = Load(trial, {"crashes", "good", "crashes_on_load"});
	EXPECT_TRUE(Contains(output,
		"Component library " + Library("crashes")
			+ " is left out: it crashed when it was tried (Aborted)\n"))
		<< output;
	EXPECT_TRUE(
		Contains(output, "Component library " + Library("crashes_on_load") + " is left out: "))
		<< output;
	EXPECT_FALSE(Contains(output, "load_add_on(" + Library("crashes")));
	EXPECT_TRUE(Contains(output, "3 Components in " + Library("good") + "\n")) << output;
	EXPECT_EQ(fCatalog.CountPalEntries(), 3);
}


TEST_F(LibraryTrialTest, ALibraryThatDoesNotReturnIsToldAndTheOthersAreLoaded)
{
	// The good one is known and needs no time.
	NewTrial().TryAll({Library("good")});
	TLibraryTrial trial = NewTrial();
	trial.SetPatience(100000);
	const std::string output = Load(trial, {"good", "hangs"});
	EXPECT_TRUE(Contains(output,
		"Component library " + Library("hangs")
			+ " is left out: it did not come to an end when it was tried\n"))
		<< output;
	EXPECT_EQ(fCatalog.CountPalEntries(), 3);
}


TEST_F(LibraryTrialTest, WhatTheLoaderRefusesItTellsAsWithoutATrial)
{
	TLibraryTrial trial = NewTrial();
	const std::string output = Load(trial, {"no_uninit", "refuses_init", "throws", "other_build"});
	EXPECT_TRUE(Contains(output, "get_image_symbol() failed\n")) << output;
	for (const char* name : {"refuses_init", "throws"})
		EXPECT_TRUE(
			Contains(output, "Failed to initialize component library " + Library(name) + "\n"))
			<< output;
	EXPECT_TRUE(Contains(output, Library("other_build") + " was built for another designer: "))
		<< output;
	EXPECT_FALSE(Contains(output, "is left out"));
}


TEST_F(LibraryTrialTest, AGoodLibraryIsTriedOnceUntilItChanges)
{
	const std::string library = fFolder / "library.so";
	std::filesystem::copy(Library("good"), library);
	const ScopedVariable notes("TEST_NOTES", fFolder / "notes");
	std::string reason;

	NewTrial().TryAll({library});
	EXPECT_EQ(CountInits(), 1u);
	TLibraryTrial again = NewTrial();
	again.TryAll({library});
	EXPECT_TRUE(again.IsSafe(library.c_str(), &reason));
	EXPECT_EQ(CountInits(), 1u);

	// Another file of that name, as after an update of the library.
	std::filesystem::remove(library);
	std::filesystem::copy(Library("crashes"), library);
	TLibraryTrial changed = NewTrial();
	changed.TryAll({library});
	EXPECT_FALSE(changed.IsSafe(library.c_str(), &reason));
	EXPECT_EQ(CountInits(), 2u);

	// What crashed is tried at each start: it may have been mended by something else.
	NewTrial().TryAll({library});
	EXPECT_EQ(CountInits(), 3u);
}


TEST_F(LibraryTrialTest, ARecordOfAnotherDesignerOrOfRubbishIsNotBelieved)
{
	const ScopedVariable notes("TEST_NOTES", fFolder / "notes");
	NewTrial().TryAll({Library("good")});
	EXPECT_EQ(CountInits(), 1u);

	std::filesystem::copy(kCheck, fFolder / "plimcheck");
	const ScopedVariable path("LD_LIBRARY_PATH", PLIM_BUILD_DIR "/lib");
	TLibraryTrial((fFolder / "plimcheck").c_str(), fRecord.c_str()).TryAll({Library("good")});
	EXPECT_EQ(CountInits(), 2u);

	fFolder.Write("record", std::string(3000, '\xee'));
	NewTrial().TryAll({Library("good")});
	EXPECT_EQ(CountInits(), 3u);
	NewTrial().TryAll({Library("good")});
	EXPECT_EQ(CountInits(), 3u);
}


TEST_F(LibraryTrialTest, WithoutAPlaceForTheRecordLibrariesAreTriedEachTime)
{
	const ScopedVariable notes("TEST_NOTES", fFolder / "notes");
	fRecord = fFolder / "no/such/folder/record";
	for (int i = 0; i < 2; i++) {
		TLibraryTrial trial = NewTrial();
		trial.TryAll({Library("good")});
		std::string reason;
		EXPECT_TRUE(trial.IsSafe(Library("good").c_str(), &reason));
	}
	EXPECT_EQ(CountInits(), 2u);
}


TEST_F(LibraryTrialTest, WithoutTheProgramEverythingIsLoadedAsItIs)
{
	TLibraryTrial trial((fFolder / "nothing").c_str(), fRecord.c_str());
	Load(trial, {"good"});
	EXPECT_EQ(fCatalog.CountPalEntries(), 3);
	EXPECT_FALSE(std::filesystem::exists(fRecord));
}


TEST_F(LibraryTrialTest, TheCheckTellsWhatALibraryOffersOrWhyItCannotBeUsed)
{
	const std::string good = Library("good");
	const command_result all = RunCommand(kCheck + " " + good);
	EXPECT_EQ(all.code, 0);
	EXPECT_EQ(all.output,
		good + ": good, components: 3\n  First (TFirst)\n  Second (TSecond)\n  Third (TThird)\n");

	const struct {
		std::string file;
		const char* reason;
	} kCases[] = {
		{Library("no_uninit"), "it exports no function UnInitComponentLib"},
		{Library("refuses_init"), "its InitComponentLib() failed"},
		{Library("throws"), "its InitComponentLib() failed"},
		{Library("other_build"),
			"it was built for another designer: interface 42, libstdc++, and not interface 1, "
			"libstdc++"},
		{fFolder.Write("text.so", "no library"), "it is no library for this machine"},
		{fFolder / "nothing", "there is no such file"},
	};
	for (const auto& row : kCases) {
		const command_result result = RunCommand(kCheck + " " + row.file + " " + good);
		EXPECT_EQ(result.code, 1) << row.file;
		EXPECT_EQ(result.output, row.file + ": cannot be used: " + row.reason + "\n" + all.output);
	}

	const command_result partly = RunCommand(kCheck + " " + Library("missing_entry"));
	EXPECT_EQ(partly.code, 1);
	EXPECT_TRUE(Contains(partly.output, "  there is no entry 1\n")) << partly.output;
	EXPECT_EQ(RunCommand(kCheck).code, 2);
	EXPECT_EQ(RunCommand(kCheck + " --help").output.find("Usage: plimcheck LIBRARY..."), 0u);
}
