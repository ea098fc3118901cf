// SPDX-License-Identifier: MIT
// The files that build a generated program: written once, and never over a file of the user's.

#include "codegen/BuildFiles.h"

#include "codegen/DialectGenerator.h"
#include "codegen/SampleProject.h"
#include "codegen/TestFolder.h"

namespace {

/// Generates a project with its build files; returns what became of each file, "NAME:outcome ...".
std::string
Generate(SampleProject& project, const TestFolder& folder,
	source_dialect dialect = DIALECT_STANDARD, bool dryRun = false)
{
	TDialectGenerator generator(dialect);
	generator.SetBuildFiles(true);
	generator.Writer().SetDryRun(dryRun);
	generator.SetAppComponent(&project.App());
	generator.SetGenerationPath(folder.Path().c_str());
	generator.GenerateApp();
	std::string outcomes;
	for (const generated_file& file : generator.Writer().Files()) {
		static const char* const kNames[] = {
			"created", "changed", "unchanged", "kept", "unreadable", "unwritable"};
		const std::string path = file.path.String();
		outcomes += path.substr(path.rfind('/') + 1) + ":" + kNames[file.outcome] + " ";
	}
	for (const BString& remark : generator.Writer().Remarks())
		outcomes += std::string("remark:") + remark.String() + " ";
	return outcomes;
}


bool
Has(const std::string& text, const std::string& part)
{
	return text.find(part) != std::string::npos;
}


build_plan
PlanNamed(const char* name)
{
	build_plan plan;
	plan.name = name;
	plan.sources = {"a.cpp"};
	return plan;
}

} // namespace


TEST(BuildFilesTest, AreWrittenBesideTheSources)
{
	const auto project = SampleProject::MakeFull();
	project->AddForm("Second", "/projects/Other.frm");
	TestFolder folder;
	const std::string outcomes = Generate(*project, folder);
	EXPECT_TRUE(Has(outcomes, "CMakeLists.txt:created makefile:created MyApp.rdef:created "))
		<< outcomes;
	for (const char* name : {"CMakeLists.txt", "makefile", "MyApp.rdef"})
		ExpectText(GoldenText(std::string("build/") + name), ReadText(folder.At(name)), name);
}


TEST(BuildFilesTest, AreNotWrittenUnlessAskedFor)
{
	const auto project = SampleProject::MakeFull();
	TestFolder folder;
	TDialectGenerator generator(DIALECT_STANDARD);
	generator.SetAppComponent(&project->App());
	generator.SetGenerationPath(folder.Path().c_str());
	generator.GenerateApp();
	EXPECT_EQ(EntryNames(folder.Path()), "Form1.cpp Form1.fcp Form1.h MyApp.cpp MyApp.h");
}


TEST(BuildFilesTest, FilesThatAreThereAreLeftAlone)
{
	const auto project = SampleProject::MakeFull();
	TestFolder folder;
	WriteText(folder.At("CMakeLists.txt"), "mine");
	std::filesystem::create_symlink("nowhere", folder.At("MyApp.rdef"));
	const std::string outcomes = Generate(*project, folder);
	EXPECT_TRUE(Has(outcomes, "CMakeLists.txt:kept makefile:created MyApp.rdef:kept ")) << outcomes;
	EXPECT_EQ(ReadText(folder.At("CMakeLists.txt")), "mine");
	EXPECT_TRUE(std::filesystem::is_symlink(folder.At("MyApp.rdef")));
	EXPECT_FALSE(std::filesystem::exists(folder.At("nowhere")));

	// What was made the first time is the user's the second time.
	WriteText(folder.At("makefile"), "edited");
	EXPECT_TRUE(Has(Generate(*project, folder), "makefile:kept "));
	EXPECT_EQ(ReadText(folder.At("makefile")), "edited");
}


TEST(BuildFilesTest, AMakefileOfAnotherNameIsNotHidden)
{
	for (const char* name : {"GNUmakefile", "Makefile"}) {
		const auto project = SampleProject::MakeFull();
		TestFolder folder;
		WriteText(folder.At(name), "mine");
		EXPECT_TRUE(Has(Generate(*project, folder), std::string(name) + ":kept "));
		EXPECT_FALSE(std::filesystem::exists(folder.At("makefile")));
		EXPECT_EQ(ReadText(folder.At(name)), "mine");
	}
}


TEST(BuildFilesTest, ADryRunWritesNone)
{
	const auto project = SampleProject::MakeFull();
	TestFolder folder;
	const std::string outcomes = Generate(*project, folder, DIALECT_STANDARD, true);
	EXPECT_TRUE(Has(outcomes, "CMakeLists.txt:created makefile:created MyApp.rdef:created "));
	EXPECT_EQ(EntryNames(folder.Path()), "");
}


TEST(BuildFilesTest, AFileThatCannotBeWrittenIsNotedAndTheOthersAreWritten)
{
	SampleProject project;
	// No folder takes a name that long.
	project.App().SetComponentName(std::string(400, 'a').c_str());
	TestFolder folder;
	const std::string outcomes = Generate(project, folder);
	EXPECT_TRUE(Has(outcomes, "CMakeLists.txt:created makefile:created ")) << outcomes;
	EXPECT_TRUE(Has(outcomes, "a.rdef:unwritable ")) << outcomes;
}


TEST(BuildFilesTest, LaunchFlagsThatAreNoneAreLeftOutWithARemark)
{
	const auto project = SampleProject::MakeFull();
	SetText(&project->App(), "LaunchFlags", "B_FAST; evil");
	TestFolder folder;
	const std::string outcomes = Generate(*project, folder);
	EXPECT_TRUE(Has(outcomes, "the launch flags 'B_FAST; evil' are left out")) << outcomes;
	EXPECT_FALSE(Has(ReadText(folder.At("MyApp.rdef")), "app_flags"));
}


TEST(BuildFilesTest, LaunchFlagsMayBeJoined)
{
	for (const char* flags : {"B_SINGLE_LAUNCH", "B_MULTIPLE_LAUNCH", "B_EXCLUSIVE_LAUNCH",
			 "B_SINGLE_LAUNCH|B_ARGV_ONLY|B_BACKGROUND_APP"})
		EXPECT_TRUE(AreLaunchFlags(flags)) << flags;
	for (const char* flags : {"", "B_SINGLE_LAUNCH|", "|", "b_single_launch", "B_SINGLE_LAUNCH "})
		EXPECT_FALSE(AreLaunchFlags(flags)) << flags;
}


TEST(BuildFilesTest, ProgramsCalledLikeATargetOfCMakeGetAnotherOne)
{
	EXPECT_TRUE(Has(CMakeText(PlanNamed("test")).String(), "add_executable(test_program\n"));
	EXPECT_TRUE(Has(CMakeText(PlanNamed("")).String(), "add_executable(_program\n"));
	EXPECT_TRUE(Has(CMakeText(PlanNamed("My App")).String(), "add_executable(My_App\n"));
	EXPECT_TRUE(Has(CMakeText(PlanNamed("Hello")).String(), "add_executable(Hello\n"));
}


TEST(BuildFilesTest, TextsCannotBreakOut)
{
	build_plan plan = PlanNamed("a\nb");
	plan.sources = {"my \"$file\\.cpp"};
	plan.signature = "x/\"$(shell)\\\n#";
	const std::string cmake = CMakeText(plan).String();
	EXPECT_TRUE(Has(cmake, "# Builds a b. "));
	EXPECT_TRUE(Has(cmake, "  \"my \\\"\\$file\\\\.cpp\"\n"));
	const std::string makefile = MakefileText(plan).String();
	EXPECT_TRUE(Has(makefile, "NAME = a b\n"));
	EXPECT_TRUE(Has(makefile, "APP_MIME_SIG = x/\"$$(shell)\\ \\#\n"));
	EXPECT_TRUE(
		Has(ResourceText(plan).String(), "resource app_signature \"x/\\\"$(shell)\\\\ #\";\n"));
}


TEST(BuildFilesTest, TheMakefileOfTheClassicDialectAllowsWhatThatNeeds)
{
	build_plan plan = PlanNamed("Hello");
	EXPECT_TRUE(Has(MakefileText(plan).String(), " -fpermissive\n"));
	plan.dialect = DIALECT_STANDARD;
	EXPECT_FALSE(Has(MakefileText(plan).String(), "permissive"));
}
