// SPDX-License-Identifier: MIT
// Programs of their own: which display they get, and what a script makes them do.
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include "support/Command.h"

using testing::HasSubstr;
using testing::Not;

namespace {

const std::string kClean =
	"env -u DISPLAY -u WAYLAND_DISPLAY -u QT_QPA_PLATFORM -u BE_DISPLAY -u BE_ROBOT_SCRIPT ";

using Result = command_result;


/// Standard output and error of the demo program; \a environment: NAME=value words.
Result
RunProgram(const std::string& environment, const std::string& arguments = "")
{
	return RunCommand(kClean + environment + " " + Within(60) + DISPLAY_PROGRAM + " " + arguments);
}


class RobotScriptTest : public testing::Test {
protected:
	RobotScriptTest()
		: fFolder(
			std::filesystem::temp_directory_path() / ("robot-script-" + std::to_string(getpid())))
	{
		std::filesystem::create_directories(fFolder);
	}

	~RobotScriptTest() override { std::filesystem::remove_all(fFolder); }

	Result RunScript(const std::string& script, const std::string& environment = "")
	{
		std::string path = fFolder / "test.robot";
		std::ofstream(path) << script;
		return RunProgram(
			environment + " OUT=" + fFolder.string() + " BE_ROBOT_SCRIPT=" + path, "stay");
	}

	const std::filesystem::path fFolder;
};

} // namespace


TEST(DisplayChoiceTest, WithoutADisplayWindowsAreKeptOffscreen)
{
	Result result = RunProgram("");
	EXPECT_EQ(result.code, 0) << result.output;
	EXPECT_THAT(result.output, HasSubstr("display qt\n"));
	EXPECT_THAT(result.output, HasSubstr("clean end\n"));
}


class EndingTest : public testing::TestWithParam<const char*> {};

TEST_P(EndingTest, AProgramEndsWellWhileItsWindowsDraw)
{
	// What could go wrong depends on who comes first. What is freed is overwritten, so that its use is noticed.
	const Result result =
		RunCommand("seq 20 | " + kClean + "MALLOC_PERTURB_=165 xargs -P 4 -I NUMBER " + Within(60)
			+ ENDING_PROGRAM + " " + GetParam());
	EXPECT_EQ(result.code, 0) << result.output;
}

INSTANTIATE_TEST_SUITE_P(Ways, EndingTest, testing::Values("return", "exit", "quit", "close"),
	[](const auto& info) { return std::string(info.param); });


TEST(DisplayChoiceTest, NoneIsTheBuiltInOne)
{
	Result result = RunProgram("BE_DISPLAY=none");
	EXPECT_EQ(result.code, 0) << result.output;
	EXPECT_EQ(result.output, "display none\nclean end\n");
}


TEST(DisplayChoiceTest, ADisplayThatDoesNotAnswerIsNamedAndEndsInTheBuiltInOne)
{
	Result result = RunProgram("DISPLAY=:12345");
	EXPECT_EQ(result.code, 0) << result.output;
	EXPECT_THAT(result.output,
		HasSubstr("libbe: no display: no X server answers at \":12345\"; nothing will be shown\n"));
	EXPECT_THAT(result.output, HasSubstr("display none\n"));
	EXPECT_THAT(result.output, HasSubstr("clean end\n"));
}


TEST(DisplayChoiceTest, AWaylandCompositorThatDoesNotAnswerIsNamed)
{
	Result result = RunProgram("WAYLAND_DISPLAY=wayland-nobody XDG_RUNTIME_DIR=/tmp");
	EXPECT_EQ(result.code, 0) << result.output;
	EXPECT_THAT(result.output, HasSubstr("no Wayland compositor answers at \"wayland-nobody\""));
	EXPECT_THAT(result.output, HasSubstr("display none\n"));
}


TEST(DisplayChoiceTest, AnUnknownPlatformEndsInTheBuiltInDisplay)
{
	Result result = RunProgram("QT_QPA_PLATFORM=nosuchplatform");
	EXPECT_EQ(result.code, 0) << result.output;
	EXPECT_THAT(result.output, HasSubstr("Qt has no platform \"nosuchplatform\""));
	EXPECT_THAT(result.output, HasSubstr("display none\n"));
}


TEST(DisplayChoiceTest, AnUnknownChoiceIsReported)
{
	Result result = RunProgram("BE_DISPLAY=curtain");
	EXPECT_EQ(result.code, 0) << result.output;
	EXPECT_THAT(result.output, HasSubstr("BE_DISPLAY is \"curtain\""));
	EXPECT_THAT(result.output, HasSubstr("display qt\n"));
}


TEST(DisplayChoiceTest, WithoutTheModuleBesideTheLibraryNothingIsShown)
{
	// A copy of the library alone.
	auto folder =
		std::filesystem::temp_directory_path() / ("display-choice-" + std::to_string(getpid()));
	std::filesystem::create_directories(folder);
	std::filesystem::copy_file(BE_LIBRARY, folder / std::filesystem::path(BE_LIBRARY).filename());
	Result result = RunProgram("LD_LIBRARY_PATH=" + folder.string());
	std::filesystem::remove_all(folder);
	EXPECT_EQ(result.code, 0) << result.output;
	EXPECT_THAT(result.output, HasSubstr("libbe: no display: "));
	EXPECT_THAT(result.output, HasSubstr("libbe_display_qt.so"));
	EXPECT_THAT(result.output, HasSubstr("display none\n"));
}


// #pragma mark - scripts


TEST_F(RobotScriptTest, AScriptClicksTypesReadsAndQuits)
{
	Result result = RunScript("# a comment\n"
							  "wait-window \"Robot demo\"\n"
							  "print-view answer\n"
							  "click-view greet\n"
							  "expect-view answer Hello\n"
							  "print-view answer\n"
							  "click-view Loud\n"
							  "print-value box\n"
							  "expect-value box 1\n"
							  "click-view name\n"
							  "type \"J\\\"rgen x\"\n"
							  "key backspace\n"
							  "print-view name\n"
							  "print-windows\n"
							  "save-png ${OUT}/demo.png\n"
							  "quit\n");
	EXPECT_EQ(result.code, 0) << result.output;
	EXPECT_EQ(result.output,
		"display qt\nanswer: nothing yet\nanswer: Hello\nbox: 1\nname: J\"rgen \n"
		"window: Robot demo\nclean end\n");
	EXPECT_GT(std::filesystem::file_size(fFolder / "demo.png"), 500u);
}


TEST_F(RobotScriptTest, ItWorksWithoutPixelsToo)
{
	Result result = RunScript("wait-window Robot*\n"
							  "click-view greet\n"
							  "expect-view answer Hello\n"
							  "quit\n",
		"BE_DISPLAY=none");
	EXPECT_EQ(result.code, 0) << result.output;
	EXPECT_EQ(result.output, "display none\nclean end\n");
}


TEST_F(RobotScriptTest, ItWorksAtOtherScales)
{
	for (const char* scale : {"1.5", "2"}) {
		Result result = RunScript("wait-window Robot*\n"
								  "click-view greet\n"
								  "expect-view answer Hello\n"
								  "save-png ${OUT}/scaled.png\n"
								  "quit\n",
			std::string("QT_SCALE_FACTOR=") + scale);
		EXPECT_EQ(result.code, 0) << result.output;
	}
}


TEST_F(RobotScriptTest, ClosingTheLastWindowEndsTheProgram)
{
	Result result = RunScript("wait-window Robot*\nclose-window\nwait-no-window Robot*\n");
	EXPECT_EQ(result.code, 0) << result.output;
	EXPECT_THAT(result.output, HasSubstr("clean end\n"));
}


TEST_F(RobotScriptTest, WhatFailsIsNamedWithItsLine)
{
	struct {
		const char* script;
		const char* reason;
	} cases[] = {
		{"dance\n", ":1: \"dance\" is no command\n"},
		{"\nclick 1\n", ":2: \"click\" takes another number of words"},
		{"limit 0.2\nwait-window Nobody\n", ":2: \"wait-window Nobody\" failed: "},
		{"wait-window Robot*\nlimit 0.2\nclick-view nowhere\n",
			"the window has no view \"nowhere\""},
		{"wait-window Robot*\nlimit 0.2\nexpect-view answer Bye\n",
			"the view shows \"nothing yet\""},
		{"wait-window Robot*\nprint-value answer\n", "the view \"answer\" has none"},
		{"wait-window Robot*\nexpect-value box 1\n", "the value is 0"},
		{"wait-window Robot*\nkey f99\n", "there is no key \"f99\""},
		{"click 1 1\n", "no window: wait for one first"},
	};
	for (const auto& one : cases) {
		Result result = RunScript(one.script);
		EXPECT_EQ(result.code, 2) << one.script << result.output;
		EXPECT_THAT(result.output, HasSubstr(one.reason)) << one.script;
		EXPECT_THAT(result.output, Not(HasSubstr("clean end")));
	}
}


TEST_F(RobotScriptTest, AMissingScriptIsReported)
{
	Result result = RunProgram("BE_ROBOT_SCRIPT=/no/such/script", "stay");
	EXPECT_EQ(result.code, 2);
	EXPECT_THAT(result.output, HasSubstr("robot: /no/such/script:0: the script cannot be read"));
}
