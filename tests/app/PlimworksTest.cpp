// SPDX-License-Identifier: MIT
// The designer as a program of its own: its command line, its component libraries and its settings.

#include <filesystem>

#include <gtest/gtest.h>

#include <File.h>
#include <Message.h>
#include <Rect.h>

#include "support/Command.h"
#include "support/Printers.h"
#include "support/TemporaryFolder.h"

namespace {

const std::string kPrograms = PLIM_BUILD_DIR "/bin/";
const std::string kProgram = kPrograms + "plimworks";
const std::string kLibraries = PLIM_BUILD_DIR "/tests/libraries/";

/// Runs the designer with a home, and settings, of its own.
class PlimworksTest : public testing::Test {
protected:
	/// A program like the designer beside which the libraries of tests lie.
	std::string ProgramWith(const std::vector<std::string>& libraries)
	{
		const std::string folder = fFolder.Make("program");
		for (const char* program : {"plimworks", "plimcheck"})
			std::filesystem::copy_file(kPrograms + program, folder + "/" + program);
		for (const std::string& library : libraries) {
			fFolder.Make("program/Components");
			std::filesystem::copy(kLibraries + library, folder + "/Components",
				std::filesystem::copy_options::recursive);
		}
		return folder + "/plimworks";
	}

	command_result RunScript(const std::string& script, const std::string& arguments = "",
		const std::string& program = kProgram)
	{
		return RunCommand(Prepare(script) + " " + Within(100) + program + " " + arguments);
	}

	/// The same, but as soon as there is a file \a path in the settings, the designer is killed.
	command_result RunAndKill(
		const std::string& script, const std::string& arguments, const std::string& path)
	{
		return RunCommand(Prepare(script) + " " + kProgram + " " + arguments
			+ " & plim=$!; for i in " + "$(seq 600); do for f in settings/" + path
			+ "; do [ -e \"$f\" ] && break 2; done; sleep 0.1; done; kill -9 $plim; wait $plim");
	}

	std::string Prepare(const std::string& script)
	{
		const std::string file = fFolder.Write("script", "limit 60\n" + script);
		return "cd " + fFolder.Path() + "; HOME=" + fFolder.Path() + " XDG_CONFIG_HOME="
			+ fFolder.Make("settings") + " XDG_DATA_HOME=" + fFolder.Make("data")
			+ " LD_LIBRARY_PATH=" PLIM_BUILD_DIR "/lib BE_ROBOT_SCRIPT=" + file + " "
			+ fEnvironment;
	}

	BRect StoredFrame(const char* key)
	{
		BFile file((fFolder / "settings/Plim_Settings").c_str(), B_READ_ONLY);
		BMessage settings;
		BRect frame;
		EXPECT_EQ(settings.Unflatten(&file), B_OK);
		EXPECT_EQ(settings.FindRect(key, &frame), B_OK) << key;
		return frame;
	}

	static void ExpectCleanEnd(const command_result& result)
	{
		EXPECT_EQ(result.code, 0) << result.output;
		EXPECT_EQ(result.output.find("BE_CHECK_LOCKS"), std::string::npos) << result.output;
	}

	TemporaryFolder fFolder;
	std::string fEnvironment;
};


bool
Contains(const std::string& text, const std::string& part)
{
	return text.find(part) != std::string::npos;
}

} // namespace


TEST_F(PlimworksTest, HelpAndVersionAreAnsweredWithoutAWindow)
{
	fEnvironment = "QT_QPA_PLATFORM=nosuchplatform";
	const command_result help = RunScript("", "--help");
	EXPECT_EQ(help.code, 0);
	EXPECT_TRUE(Contains(help.output, "Usage: plimworks [PROJECT]...")) << help.output;
	const command_result version = RunScript("", "--version");
	EXPECT_EQ(version.code, 0);
	EXPECT_EQ(version.output.find("plimworks "), 0u) << version.output;
	EXPECT_FALSE(Contains(help.output + version.output, "libbe:"));
	EXPECT_FALSE(std::filesystem::exists(fFolder / "settings/Plim_Settings"));
}


TEST_F(PlimworksTest, AfterTheFirstRunTheSettingsHoldTheFourFrames)
{
	ExpectCleanEnd(RunScript("wait-window Plimworks\nquit\n"));
	EXPECT_EQ(StoredFrame("MainWindowFrame"), BRect(20, 40, 320, 80));
	for (const char* key : {"PaletteFrame", "PropertyWinFrame", "ProjectWinFrame"})
		EXPECT_TRUE(StoredFrame(key).IsValid()) << key;
}


TEST_F(PlimworksTest, SettingsOfRubbishDoNoHarm)
{
	fFolder.Make("settings");
	fFolder.Write("settings/Plim_Settings", std::string(5000, '\xee'));
	ExpectCleanEnd(RunScript("wait-window Plimworks\nquit\n"));
	EXPECT_EQ(StoredFrame("MainWindowFrame"), BRect(20, 40, 320, 80));
	// The old, longer file keeps its tail.
	EXPECT_EQ(std::filesystem::file_size(fFolder / "settings/Plim_Settings"), 5000u);
}


TEST_F(PlimworksTest, SettingsThatCannotBeWrittenDoNoHarm)
{
	fFolder.Make("settings/Plim_Settings");
	ExpectCleanEnd(RunScript("wait-window Plimworks\nquit\n"));
}


TEST_F(PlimworksTest, WithoutAFolderOfComponentsThePaletteIsEmptyAndOfItsFirstSize)
{
	const command_result result =
		RunScript("wait-window Components\nprint-views\nquit\n", "", ProgramWith({}));
	ExpectCleanEnd(result);
	EXPECT_FALSE(Contains(result.output, "load_add_on("));
	EXPECT_EQ(StoredFrame("PaletteFrame").Width(), 115);
	EXPECT_EQ(StoredFrame("PaletteFrame").Height(), 300);
}


TEST_F(PlimworksTest, APaletteOfFewEntriesTakesTheHeightOfItsColumn)
{
	fEnvironment = "TEST_ENTRIES=19";
	const command_result result = RunScript(
		"wait-window Components\nclick-view Entry19\nquit\n", "", ProgramWith({"counted"}));
	ExpectCleanEnd(result);
	EXPECT_TRUE(Contains(result.output, "19 Components in ")) << result.output;
	EXPECT_EQ(StoredFrame("PaletteFrame").Width(), 113);
	EXPECT_GT(StoredFrame("PaletteFrame").Height(), 400);
}


TEST_F(PlimworksTest, APaletteOfTwentyEntriesKeepsItsSizeAndScrolls)
{
	fEnvironment = "TEST_ENTRIES=20";
	const command_result result = RunScript("wait-window Components\nclick-view Entry1\nmove 40 "
											"100\nwheel 200\nclick-view Entry20\nquit\n",
		"", ProgramWith({"counted"}));
	ExpectCleanEnd(result);
	EXPECT_TRUE(Contains(result.output, "20 Components in ")) << result.output;
	EXPECT_EQ(StoredFrame("PaletteFrame").Width(), 115);
	EXPECT_EQ(StoredFrame("PaletteFrame").Height(), 300);
}


TEST_F(PlimworksTest, ALibraryThatCannotBeUsedIsLeftOut)
{
	const command_result result = RunScript("wait-window Components\nclick-view First\nquit\n", "",
		ProgramWith({"no_uninit", "refuses_init", "crashes", "missing_entry"}));
	ExpectCleanEnd(result);
	EXPECT_TRUE(Contains(result.output, "get_image_symbol() failed\n"));
	EXPECT_TRUE(Contains(result.output, "Failed to initialize component library "));
	EXPECT_TRUE(Contains(result.output, "Failed to create palette entry 1\n"));
	EXPECT_TRUE(Contains(result.output, "test_library_crashes.so is left out: it crashed"))
		<< result.output;
	EXPECT_LT(StoredFrame("PaletteFrame").Height(), 100);
}


TEST_F(PlimworksTest, OfTwoProjectsTheSecondStaysOpen)
{
	std::filesystem::copy(PLIM_SOURCE_DIR "/examples/hello", fFolder / "one");
	std::filesystem::copy(PLIM_SOURCE_DIR "/examples/hello", fFolder / "two");
	const command_result result =
		RunScript("wait-window Hello\nwait-window Plimworks\nclick 250 30\n"
				  "key command+s\nquit\n",
			"one/hello.plim missing.plim two/hello.plim");
	ExpectCleanEnd(result);
	const size_t first = result.output.find("Opening " + (fFolder / "one/hello.plim") + "\n");
	const size_t second = result.output.find("Opening " + (fFolder / "two/hello.plim") + "\n");
	EXPECT_NE(first, std::string::npos) << result.output;
	EXPECT_LT(first, second);
	EXPECT_NE(second, std::string::npos);
	EXPECT_FALSE(Contains(result.output, "Opening " + fFolder.Path() + "/missing.plim"));
}


TEST_F(PlimworksTest, TheBoxAboutABadProjectIsAnsweredByEscape)
{
	fFolder.Write("bad.plim", "no project");
	ExpectCleanEnd(RunScript("wait-window Warning\nkey escape\nwait-no-window Warning\n"
							 "wait-window Plimworks\nquit\n",
		"bad.plim"));
}


TEST_F(PlimworksTest, KilledItOffersTheUnsavedWorkAtTheNextStart)
{
	std::filesystem::copy(PLIM_SOURCE_DIR "/examples/hello", fFolder / "one");
	const std::string saved = fFolder.Read("one/MainForm.frm");
	RunAndKill("wait-window Hello\ndrag-view Count 20 10\npause 60000\n", "one/hello.plim",
		"Plim_Recovery/*.copy");
	EXPECT_TRUE(fFolder.Read("one/MainForm.frm") == saved);

	// Somebody else changes the form meanwhile, and is not overwritten without a question.
	std::ofstream(fFolder / "one/MainForm.frm", std::ios::binary | std::ios::app) << "more";
	const std::string picture = fFolder / "recovery.png";
	ExpectCleanEnd(RunScript("wait-window Recovery\nsave-png " + picture
			+ "\nclick-view Recover\nwait-window Hello\nwait-window Plimworks\nclick 250 30\n"
			  "key command+s\nwait-window Warning\nclick-view Cancel\nwait-no-window Warning\n"
			  "wait-window Plimworks\nclick 250 30\nkey command+s\nwait-window Warning\n"
			  "click-view Overwrite\nwait-no-window Warning\nquit\n",
		"one/hello.plim"));
	EXPECT_FALSE(fFolder.Read("one/MainForm.frm").substr(0, saved.size()) == saved);
	EXPECT_TRUE(std::filesystem::is_empty(fFolder / "settings/Plim_Recovery"));
}


TEST_F(PlimworksTest, GeneratesFromTheMenu)
{
	std::filesystem::copy(PLIM_SOURCE_DIR "/examples/hello", fFolder / "one");
	const command_result result =
		RunScript("wait-window Hello\nwait-window Plimworks\nclick 250 30\nclick-item File\n"
				  "click-item \"Generate Code...\"\nwait-window \"Generate Source files\"\n"
				  "expect-view efName Hello\nclick-view Generate\n"
				  "wait-no-window \"Generate Source files\"\nquit\n",
			"one/hello.plim");
	ExpectCleanEnd(result);
	// The project says ".", which is where the designer was started.
	EXPECT_TRUE(std::filesystem::exists(fFolder / "MainForm.fcp"));
	EXPECT_TRUE(std::filesystem::exists(fFolder / "Hello.cpp"));
}
