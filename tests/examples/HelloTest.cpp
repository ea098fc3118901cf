// SPDX-License-Identifier: MIT
// The whole road: documents to sources, sources to a program, and the program reacts to a click.

#include <algorithm>
#include <filesystem>
#include <sstream>

#include <gtest/gtest.h>

#include "support/Command.h"
#include "support/TemporaryFolder.h"

namespace {

const std::string kExample = PLIM_SOURCE_DIR "/examples/hello";
const std::string kPlimgen = PLIM_BUILD_DIR "/bin/plimgen";
const char* const kSources[] = {"Hello.h", "Hello.cpp", "MainForm.h", "MainForm.cpp",
	"MainForm.fcp", "NoteForm.h", "NoteForm.cpp", "NoteForm.fcp"};

std::string
ReadFile(const std::string& path)
{
	std::ifstream file(path, std::ios::binary);
	std::ostringstream text;
	text << file.rdbuf();
	return text.str();
}


/// Without the empty lines at its end: every regeneration of a file adds one.
std::string
Trimmed(const std::string& text)
{
	return text.substr(0, text.find_last_not_of('\n') + 1);
}


command_result
Generate(const std::string& project, const std::string& folder)
{
	return RunCommand(kPlimgen + " --output " + folder + " " + project);
}

} // namespace

class HelloTest : public testing::Test {
protected:
	HelloTest() { std::filesystem::copy(kExample, fFolder.Path(), kOptions); }

	/// Runs a hello program offscreen and uses it.
	void ExpectReactions(const std::string& program)
	{
		const command_result ran = RunCommand("PICTURES=" + fFolder.Path()
			+ " BE_ROBOT_SCRIPT=" PLIM_SOURCE_DIR "/tests/examples/hello.robot " + Within(60)
			+ program);
		EXPECT_EQ(ran.code, 0) << ran.output;
		EXPECT_NE(ran.output.find("GreetingText: Hello!\n"), std::string::npos) << ran.output;
		EXPECT_NE(ran.output.find("CountText: No clicks yet\n"), std::string::npos) << ran.output;
		EXPECT_NE(ran.output.find("CountText: 3 clicks\n"), std::string::npos) << ran.output;
		EXPECT_GT(std::filesystem::file_size(fFolder / "hello.png"), 1000u);
	}

	static constexpr auto kOptions = std::filesystem::copy_options::recursive
		| std::filesystem::copy_options::overwrite_existing;
	TemporaryFolder fFolder;
};


TEST_F(HelloTest, TheDocumentsAreThoseThatTheDesignerWrites)
{
	TemporaryFolder designed;
	const command_result result = RunCommand(
		PLIM_BUILD_DIR "/bin/design_hello " PLIM_BUILD_DIR "/bin/Components " + designed.Path());
	ASSERT_EQ(result.code, 0) << result.output;
	for (const char* name : {"hello.plim", "MainForm.frm", "NoteForm.frm"})
		EXPECT_TRUE(ReadFile(designed / name) == ReadFile(kExample + "/" + name)) << name;
}


TEST_F(HelloTest, RegeneratingKeepsEveryLineOfTheSources)
{
	const command_result result = Generate(fFolder / "hello.plim", fFolder.Path());
	ASSERT_EQ(result.code, 0) << result.output;
	for (const char* name : kSources)
		EXPECT_EQ(Trimmed(fFolder.Read(name)), Trimmed(ReadFile(kExample + "/" + name))) << name;
}


TEST_F(HelloTest, GeneratingFromNothingGivesWhatTheHandWrittenPartsStandIn)
{
	for (const char* name : kSources)
		std::filesystem::remove(fFolder / name);
	const command_result result = Generate(fFolder / "hello.plim", fFolder.Path());
	ASSERT_EQ(result.code, 0) << result.output;
	for (const char* name : {"Hello.h", "Hello.cpp", "MainForm.fcp", "NoteForm.h", "NoteForm.fcp"})
		EXPECT_EQ(Trimmed(fFolder.Read(name)), Trimmed(ReadFile(kExample + "/" + name))) << name;
	EXPECT_NE(fFolder.Read("MainForm.cpp").find("void TMainForm::CountButtonClick(void)\n{\n\n}\n"),
		std::string::npos);
}


TEST_F(HelloTest, TheGeneratedProgramCompilesRunsAndReactsToClicks)
{
	ASSERT_EQ(Generate(fFolder / "hello.plim", fFolder.Path()).code, 0);
	const command_result built =
		RunCommand("cmake -S " + fFolder.Path() + " -B " + (fFolder / "build")
			+ " -G Ninja -DOrmi_DIR=" PLIM_BUILD_DIR " " GENERATED_FLAGS " && cmake --build "
			+ (fFolder / "build"));
	ASSERT_EQ(built.code, 0) << built.output;

	ExpectReactions(fFolder / "build/hello");
}


TEST_F(HelloTest, TheProgramOfTheStandardDialectReactsToTheSameClicks)
{
	// The tree has generated and compiled it, which takes no warning.
	const std::string init = ReadFile(PLIM_BUILD_DIR "/examples/hello/standard/MainForm.fcp");
	EXPECT_NE(init.find("CountButton->OnClick = &TMainForm::CountButtonClick;"), std::string::npos);
	ExpectReactions(PLIM_BUILD_DIR "/bin/hello_standard");
}
