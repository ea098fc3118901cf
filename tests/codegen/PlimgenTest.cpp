// SPDX-License-Identifier: MIT
// plimgen as a process: its options, what it prints, and its exit codes.

#include <fcntl.h>
#include <signal.h>
#include <sys/resource.h>
#include <sys/wait.h>

#include <functional>
#include <vector>

#include <gtest/gtest.h>

#include <Message.h>
#include <Node.h>
#include <Rect.h>

#include "codegen/TestFolder.h"
#include "designer/DocumentFile.h"
#include "designer/FormFile.h"

namespace {

/// What a run of the program left behind.
struct program_result {
	int code;
	std::string out;
	std::string err;
	long peakKilobytes;
};


/// A component's entry in a form's document.
BMessage
ComponentRecord(const char* className, const char* name, BRect frame, const char* event = nullptr)
{
	BMessage properties('cprp');
	properties.AddString("_ClassName", className);
	properties.AddRect("_Frame", frame);
	properties.AddString("Name", name);
	properties.AddString("Left", std::to_string(static_cast<int>(frame.left)).c_str());
	properties.AddString("Top", std::to_string(static_cast<int>(frame.top)).c_str());
	properties.AddString("Right", std::to_string(static_cast<int>(frame.right)).c_str());
	properties.AddString("Bottom", std::to_string(static_cast<int>(frame.bottom)).c_str());
	BMessage events('evts');
	if (event != nullptr)
		events.AddBool(event, true);
	BMessage record('info');
	record.AddMessage("Properties", &properties);
	record.AddMessage("Events", &events);
	return record;
}


/// A project of "Application" with the documents of its forms, in a folder of its own.
class ProjectFolder : public TestFolder {
public:
	ProjectFolder()
		: fProject(kProjectFileType)
	{
		fProject.what = 'PPrj';
		BMessage properties('appP');
		properties.AddString("Name", "Sample");
		properties.AddString("Signature", "application/x-vnd.Sample");
		properties.AddString("GenerationPath", At("out").c_str());
		fProject.SetMessage("AppProperties", &properties);
		BMessage events('appE');
		fProject.SetMessage("AppEvents", &events);
	}

	void SetAppProperty(const char* name, const std::string& value)
	{
		BMessage properties;
		fProject.FindMessage("AppProperties", &properties);
		if (properties.ReplaceString(name, 0, value.c_str()) != B_OK)
			properties.AddString(name, value.c_str());
		fProject.SetMessage("AppProperties", &properties);
	}

	/// Writes a form's document with these components, and lists it in the project.
	void AddForm(const char* name, const std::vector<std::pair<std::string, BMessage>>& components,
		const char* event = nullptr)
	{
		TPLIMFormFile form;
		BMessage properties('cprp');
		properties.AddString("Name", name);
		properties.AddString("Title", name);
		form.SetMessage("_FormProperties", &properties);
		BMessage events('evts');
		if (event != nullptr)
			events.AddBool(event, true);
		form.SetMessage("_FormEvents", &events);
		BMessage collection('PCmp');
		for (const auto& [componentName, record] : components)
			collection.AddMessage(componentName.c_str(), &record);
		form.AddMessage("Components", &collection);
		const std::string path = At(std::string(name) + ".frm");
		form.SetFilename(path.c_str());
		ASSERT_TRUE(form.SaveFile());
		fProject.AddString(name, path.c_str());
	}

	/// Writes the project's document; returns its path.
	std::string Save()
	{
		const std::string path = At("sample.plim");
		fProject.SetFilename(path.c_str());
		EXPECT_TRUE(fProject.SaveFile());
		return path;
	}

	/// A project with the form "Form1", which has the button "Button1".
	std::string SaveSimple()
	{
		AddForm("Form1",
			{{"Button1", ComponentRecord("TButton", "Button1", BRect(10, 20, 90, 44), "OnClick")}});
		return Save();
	}

	std::string OutText(const std::string& name) const { return ReadText(At("out/" + name)); }

private:
	TPLIMFile fProject;
};


program_result
Plimgen(const std::vector<std::string>& arguments, const std::string& folder = "",
	const std::function<void()>& inChild = nullptr)
{
	TestFolder streams;
	const std::string program = PLIM_BUILD_DIR "/bin/plimgen";
	std::vector<char*> argv = {const_cast<char*>(program.c_str())};
	for (const std::string& argument : arguments)
		argv.push_back(const_cast<char*>(argument.c_str()));
	argv.push_back(nullptr);
	const std::string out = streams.At("out");
	const std::string err = streams.At("err");

	const pid_t child = fork();
	if (child == 0) {
		dup2(open(out.c_str(), O_WRONLY | O_CREAT, 0600), STDOUT_FILENO);
		dup2(open(err.c_str(), O_WRONLY | O_CREAT, 0600), STDERR_FILENO);
		// A display that is not there must not matter.
		setenv("BE_DISPLAY", "qt", 1);
		setenv("QT_QPA_PLATFORM", "xcb", 1);
		unsetenv("DISPLAY");
		if (!folder.empty() && chdir(folder.c_str()) != 0)
			_exit(126);
		if (inChild)
			inChild();
		execv(program.c_str(), argv.data());
		_exit(127);
	}
	int status = 0;
	rusage usage = {};
	wait4(child, &status, 0, &usage);
	return {WIFEXITED(status) ? WEXITSTATUS(status) : -WTERMSIG(status), ReadText(out),
		ReadText(err), usage.ru_maxrss};
}


bool
Has(const std::string& text, const std::string& part)
{
	return text.find(part) != std::string::npos;
}


/// A form with \a count buttons, each with a handler, and the run that generates it.
program_result
GenerateButtons(int count)
{
	ProjectFolder folder;
	std::vector<std::pair<std::string, BMessage>> components;
	for (int i = 1; i <= count; i++) {
		const std::string name = "Button" + std::to_string(i);
		components.emplace_back(name,
			ComponentRecord("TButton", name.c_str(),
				BRect(i % 100, i % 90, i % 100 + 80, i % 90 + 24), "OnClick"));
	}
	folder.AddForm("Form1", components);
	const std::string project = folder.Save();
	program_result result = Plimgen({project});
	EXPECT_EQ(result.code, 0) << result.err;
	EXPECT_TRUE(Has(folder.OutText("Form1.cpp"), "::Button" + std::to_string(count) + "Click("));
	return result;
}

} // namespace


TEST(PlimgenTest, GeneratesIntoTheProjectsFolder)
{
	ProjectFolder folder;
	const program_result result = Plimgen({folder.SaveSimple()});
	EXPECT_EQ(result.code, 0) << result.err;
	EXPECT_EQ(result.err, "");
	const std::string out = folder.At("out/");
	EXPECT_EQ(result.out,
		"created " + out + "Form1.h\ncreated " + out + "Form1.fcp\ncreated " + out
			+ "Form1.cpp\ncreated " + out + "Sample.h\ncreated " + out + "Sample.cpp\n");
	EXPECT_TRUE(Has(folder.OutText("Form1.h"), "  TButton<TForm1> *Button1;\n"));
	EXPECT_TRUE(Has(folder.OutText("Form1.fcp"), "(this,BRect(10,20,90,44),\"Button1\""));
	EXPECT_TRUE(Has(folder.OutText("Form1.cpp"), "void TForm1::Button1Click("));
	EXPECT_TRUE(Has(folder.OutText("Sample.cpp"), "m_MainForm = new TForm1();"));
	EXPECT_TRUE(Has(folder.OutText("Sample.cpp"), "APP_SIG = \"application/x-vnd.Sample\";"));
}


TEST(PlimgenTest, OutputOverridesTheProjectsFolder)
{
	for (const char* option : {"-o", "--output"}) {
		ProjectFolder folder;
		const program_result result = Plimgen({folder.SaveSimple(), option, folder.At("other")});
		EXPECT_EQ(result.code, 0) << result.err;
		EXPECT_EQ(
			EntryNames(folder.At("other")), "Form1.cpp Form1.fcp Form1.h Sample.cpp Sample.h");
		EXPECT_FALSE(std::filesystem::exists(folder.At("out")));
	}
}


TEST(PlimgenTest, OutputMayBeARelativePath)
{
	ProjectFolder folder;
	folder.SaveSimple();
	const program_result result = Plimgen({"-o", "here", "sample.plim"}, folder.Path());
	EXPECT_EQ(result.code, 0) << result.err;
	EXPECT_TRUE(Has(result.out, "created here/Form1.h\n"));
	EXPECT_EQ(EntryNames(folder.At("here")), "Form1.cpp Form1.fcp Form1.h Sample.cpp Sample.h");
}


TEST(PlimgenTest, FilesThatStayTheSameAreNotTouched)
{
	ProjectFolder folder;
	const std::string project = folder.SaveSimple();
	Plimgen({project});
	const auto before = std::filesystem::last_write_time(folder.At("out/Form1.fcp"));
	const program_result result = Plimgen({project});
	EXPECT_EQ(result.code, 0);
	EXPECT_EQ(std::filesystem::last_write_time(folder.At("out/Form1.fcp")), before);
	EXPECT_FALSE(Has(result.out, "Form1.fcp"));
	EXPECT_TRUE(Has(result.out, "changed " + folder.At("out/Form1.h") + "\n"));
}


TEST(PlimgenTest, MainMakesAFormTheMainFormForThisRun)
{
	ProjectFolder folder;
	folder.AddForm("First", {});
	folder.AddForm("Second", {});
	const std::string project = folder.Save();
	EXPECT_EQ(Plimgen({project}).code, 0);
	EXPECT_TRUE(Has(folder.OutText("Sample.cpp"), "new TSecond()"));
	EXPECT_EQ(Plimgen({project, "--main", "First"}).code, 0);
	EXPECT_TRUE(Has(folder.OutText("Sample.cpp"), "new TFirst()"));
	EXPECT_EQ(Plimgen({project}).code, 0);
	EXPECT_TRUE(Has(folder.OutText("Sample.cpp"), "new TSecond()"));
}


TEST(PlimgenTest, TheProjectsOwnMainFormIsUsedUnlessMainSaysOtherwise)
{
	ProjectFolder folder;
	folder.AddForm("First", {});
	folder.AddForm("Second", {});
	folder.AddForm("Third", {});
	const std::string project = folder.Save();
	BNode node(project.c_str());
	if (node.WriteAttr("PLIM:MainForm", B_STRING_TYPE, 0, "First", 6) != 6)
		GTEST_SKIP() << "no attributes in " << folder.Path();
	EXPECT_EQ(Plimgen({project}).code, 0);
	EXPECT_TRUE(Has(folder.OutText("Sample.cpp"), "new TFirst()"));
	EXPECT_EQ(Plimgen({project, "--main", "Second"}).code, 0);
	EXPECT_TRUE(Has(folder.OutText("Sample.cpp"), "new TSecond()"));
}


TEST(PlimgenTest, MainWithAnUnknownFormIsWrongUsage)
{
	ProjectFolder folder;
	const program_result result = Plimgen({folder.SaveSimple(), "--main", "Nowhere"});
	EXPECT_EQ(result.code, 2);
	EXPECT_EQ(result.out, "");
	EXPECT_EQ(result.err,
		"plimgen: " + folder.At("sample.plim")
			+ ": the project has no form 'Nowhere'; give one of its forms to --main: Form1\n");
	EXPECT_FALSE(std::filesystem::exists(folder.At("out")));
}


TEST(PlimgenTest, CheckOfASoundProjectFindsNothingAndWritesNothing)
{
	ProjectFolder folder;
	const std::string project = folder.SaveSimple();
	const program_result result = Plimgen({"--check", project});
	EXPECT_EQ(result.code, 0);
	EXPECT_EQ(result.out, project + ": no problems\n");
	EXPECT_EQ(result.err, "");
	EXPECT_FALSE(std::filesystem::exists(folder.At("out")));
}


TEST(PlimgenTest, CheckReportsEveryProblemAndWritesNothing)
{
	ProjectFolder folder;
	folder.SetAppProperty("Name", "My App");
	folder.AddForm("Form1",
		{{"Bad name", ComponentRecord("TButton", "Bad name", BRect(0, 0, 9, 9))},
			{"Gone", ComponentRecord("TNoSuchClass", "Gone", BRect(0, 0, 9, 9))},
			{"Twin", ComponentRecord("TButton", "Twin", BRect(0, 0, 9, 9))},
			{"Twin2", ComponentRecord("TButton", "Twin", BRect(0, 0, 9, 9))}},
		"OnMouseMoved");
	folder.AddForm("Lost", {});
	const std::string project = folder.Save();
	std::filesystem::remove(folder.At("Lost.frm"));

	const program_result result = Plimgen({project, "--check"});
	EXPECT_EQ(result.code, 1);
	EXPECT_EQ(result.out, project + ": 6 problems\n");
	const std::string form = "plimgen: " + folder.At("Form1.frm") + ": ";
	EXPECT_TRUE(Has(result.err, "plimgen: " + project + ": the name of the application 'My App'"));
	EXPECT_TRUE(
		Has(result.err, form + "the name of the component 'Bad name' is no C++ identifier"));
	EXPECT_TRUE(
		Has(result.err, form + "component 'Gone' is left out: no component library offers"));
	EXPECT_TRUE(Has(result.err, form + "the component 'Twin' and the component 'Twin'"));
	EXPECT_TRUE(Has(result.err, form + "the handler 'MouseMoved'"));
	EXPECT_TRUE(
		Has(result.err, "plimgen: " + folder.At("Lost.frm") + ": the form 'Lost' cannot be read;"));
	EXPECT_FALSE(std::filesystem::exists(folder.At("out")));
}


TEST(PlimgenTest, WithoutCheckBadNamesOnlyGiveAWarning)
{
	ProjectFolder folder;
	folder.AddForm(
		"Form1", {{"Bad name", ComponentRecord("TButton", "Bad name", BRect(0, 0, 9, 9))}});
	const program_result result = Plimgen({folder.Save()});
	EXPECT_EQ(result.code, 0);
	EXPECT_EQ(result.err,
		"plimgen: warning: " + folder.At("Form1.frm")
			+ ": the name of the component 'Bad name' is no C++ identifier; rename it\n");
	EXPECT_TRUE(Has(folder.OutText("Form1.h"), "  TButton<TForm1> *Bad name;\n"));
}


TEST(PlimgenTest, AComponentWithoutItsLibraryIsAnErrorUnlessItMayBeMissing)
{
	ProjectFolder folder;
	folder.AddForm("Form1",
		{{"Gone", ComponentRecord("TNoSuchClass", "Gone", BRect(0, 0, 9, 9))},
			{"Button1", ComponentRecord("TButton", "Button1", BRect(0, 0, 9, 9))}});
	const std::string project = folder.Save();
	const program_result refused = Plimgen({project});
	EXPECT_EQ(refused.code, 1);
	EXPECT_EQ(refused.out, "");
	EXPECT_TRUE(
		Has(refused.err, "plimgen: " + folder.At("Form1.frm") + ": component 'Gone' is left out"));
	EXPECT_TRUE(Has(refused.err, "--allow-missing"));
	EXPECT_FALSE(std::filesystem::exists(folder.At("out")));

	const program_result allowed = Plimgen({project, "--allow-missing"});
	EXPECT_EQ(allowed.code, 0);
	EXPECT_TRUE(
		Has(allowed.err, "plimgen: warning: " + folder.At("Form1.frm") + ": component 'Gone'"));
	EXPECT_TRUE(Has(folder.OutText("Form1.h"), "*Button1;"));
	EXPECT_FALSE(Has(folder.OutText("Form1.h"), "Gone"));
}


TEST(PlimgenTest, ADamagedComponentIsAnErrorEvenWhenLibrariesMayBeMissing)
{
	ProjectFolder folder;
	folder.AddForm("Form1", {{"Bad", BMessage('info')}});
	const program_result result = Plimgen({folder.Save(), "--allow-missing"});
	EXPECT_EQ(result.code, 1);
	EXPECT_TRUE(Has(result.err, "plimgen: " + folder.At("Form1.frm") + ": "));
	EXPECT_TRUE(Has(result.err, "'Bad'"));
	EXPECT_FALSE(std::filesystem::exists(folder.At("out")));
}


TEST(PlimgenTest, ComponentsReplacesTheFolderOfLibraries)
{
	ProjectFolder folder;
	const std::string project = folder.SaveSimple();
	std::filesystem::create_directory(folder.At("none"));
	EXPECT_EQ(Plimgen({project, "--components", folder.At("none")}).code, 1);
	EXPECT_EQ(Plimgen({project, "--components", PLIM_BUILD_DIR "/bin/Components"}).code, 0);
	EXPECT_EQ(Plimgen({"--components", folder.At("none"), "--components",
						  PLIM_BUILD_DIR "/bin/Components", project})
				  .code,
		0);
}


TEST(PlimgenTest, AFolderOfLibrariesThatIsMissingIsAnError)
{
	ProjectFolder folder;
	const program_result result =
		Plimgen({folder.SaveSimple(), "--components", folder.At("missing")});
	EXPECT_EQ(result.code, 3);
	EXPECT_TRUE(Has(
		result.err, "plimgen: " + folder.At("missing") + ": the folder of component libraries"));
	EXPECT_FALSE(std::filesystem::exists(folder.At("out")));
}


TEST(PlimgenTest, ADryRunListsTheFilesAndWritesNone)
{
	ProjectFolder folder;
	const std::string project = folder.SaveSimple();
	const program_result fresh = Plimgen({project, "--dry-run"});
	EXPECT_EQ(fresh.code, 0);
	const std::string out = folder.At("out/");
	EXPECT_EQ(fresh.out,
		"would create " + out + "Form1.h\nwould create " + out + "Form1.fcp\nwould create " + out
			+ "Form1.cpp\nwould create " + out + "Sample.h\nwould create " + out + "Sample.cpp\n");
	EXPECT_FALSE(std::filesystem::exists(folder.At("out")));

	Plimgen({project});
	const std::string before = folder.OutText("Form1.h");
	const program_result again = Plimgen({project, "--dry-run"});
	EXPECT_EQ(again.out,
		"would change " + out + "Form1.h\nwould change " + out + "Form1.cpp\nwould change " + out
			+ "Sample.h\nwould change " + out + "Sample.cpp\n");
	EXPECT_EQ(folder.OutText("Form1.h"), before);
}


TEST(PlimgenTest, TheDiffOfADryRunIsWhatARunThenChanges)
{
	ProjectFolder folder;
	const std::string project = folder.SaveSimple();
	Plimgen({project});
	WriteText(folder.At("out/Form1.h"), "// mine\n" + folder.OutText("Form1.h"));
	WriteText(folder.At("out/Sample.cpp"),
		"// [APP_MAIN]\nold\n// [END_APP_MAIN]\n// void TSample::MessageReceived\n");
	const program_result diff = Plimgen({project, "--dry-run", "--diff"});
	EXPECT_EQ(diff.code, 0);
	const std::string path = folder.At("out/Sample.cpp");
	EXPECT_TRUE(Has(diff.out,
		"would change " + path + "\n--- " + path + "\n+++ " + path
			+ "\n@@ -1,4 +1,10 @@\n // [APP_MAIN]\n-old\n+int main(void)\n+{\n+  TSample app;\n"
			  "+  app.Run();\n+  return 0;\n+}\n // [END_APP_MAIN]\n // void "
			  "TSample::MessageReceived\n+\n"))
		<< diff.out;

	Plimgen({project});
	EXPECT_EQ(folder.OutText("Sample.cpp"),
		"// [APP_MAIN]\nint main(void)\n{\n  TSample app;\n  app.Run();\n  return 0;\n}\n"
		"// [END_APP_MAIN]\n// void TSample::MessageReceived\n\n");
}


TEST(PlimgenTest, TheDiffOfANewFileStartsFromNothing)
{
	ProjectFolder folder;
	const program_result result = Plimgen({folder.SaveSimple(), "--dry-run", "--diff"});
	EXPECT_TRUE(Has(result.out,
		"would create " + folder.At("out/Sample.h") + "\n--- /dev/null\n+++ "
			+ folder.At("out/Sample.h") + "\n@@ -0,0 +1,"));
}


TEST(PlimgenTest, VerboseLetsTheProgramsDiagnosticsThrough)
{
	ProjectFolder folder;
	const std::string project = folder.SaveSimple();
	for (const char* option : {"-v", "--verbose"}) {
		const program_result result = Plimgen({project, option});
		EXPECT_EQ(result.code, 0);
		EXPECT_TRUE(Has(result.out, "** filename = '" + project + "'\n"));
		EXPECT_TRUE(Has(result.out, "TAppComponent::SetPropertyValue('Signature', "));
		EXPECT_TRUE(Has(result.out, "Form1.h\n"));
	}
	EXPECT_TRUE(
		Has(Plimgen({project, "-v"}).out, "unchanged " + folder.At("out/Form1.fcp") + "\n"));
}


TEST(PlimgenTest, WhatLibrariesPrintStaysOutOfTheOutput)
{
	ProjectFolder folder;
	const std::string project = folder.SaveSimple();
	const program_result result = Plimgen({project, "--components",
		PLIM_BUILD_DIR "/bin/Components", "--components", PLIM_BUILD_DIR "/tests/libraries/noisy"});
	EXPECT_EQ(result.code, 0) << result.err;
	EXPECT_EQ(result.err, "");
	EXPECT_EQ(result.out,
		"created " + folder.At("out/Form1.h") + "\ncreated " + folder.At("out/Form1.fcp")
			+ "\ncreated " + folder.At("out/Form1.cpp") + "\ncreated " + folder.At("out/Sample.h")
			+ "\ncreated " + folder.At("out/Sample.cpp") + "\n");

	const program_result verbose = Plimgen({project, "-v", "--components",
		PLIM_BUILD_DIR "/bin/Components", "--components", PLIM_BUILD_DIR "/tests/libraries/noisy"});
	EXPECT_TRUE(
		Has(verbose.out, "noise of printf\nnoise of puts\nnoise of a stream\nnoise of write\n"));
}


TEST(PlimgenTest, VersionAndHelpAreDone)
{
	const program_result version = Plimgen({"--version"});
	EXPECT_EQ(version.code, 0);
	EXPECT_EQ(version.out.find("plimgen "), 0u);
	EXPECT_EQ(std::count(version.out.begin(), version.out.end(), '\n'), 1);

	const program_result help = Plimgen({"--help"});
	EXPECT_EQ(help.code, 0);
	for (const char* option : {"PROJECT", "-o", "--output", "--components", "--main", "--check",
			 "--allow-missing", "--dry-run", "--diff", "-v", "--verbose", "--version", "--help"})
		EXPECT_TRUE(Has(help.out, option)) << option;
}


TEST(PlimgenTest, TheDialectIsClassicUnlessAnotherIsGiven)
{
	ProjectFolder folder;
	const std::string project = folder.SaveSimple();
	EXPECT_EQ(Plimgen({project}).code, 0);
	const std::string classic = folder.OutText("Form1.fcp");
	EXPECT_TRUE(Has(classic, "Button1->OnClick = &Button1Click;"));
	EXPECT_EQ(Plimgen({project, "--dialect", "standard"}).code, 0);
	EXPECT_TRUE(Has(folder.OutText("Form1.fcp"), "Button1->OnClick = &TForm1::Button1Click;"));
	EXPECT_EQ(Plimgen({project, "--dialect", "classic"}).code, 0);
	EXPECT_EQ(folder.OutText("Form1.fcp"), classic);
}


TEST(PlimgenTest, TheCheckIsThatOfTheDialect)
{
	ProjectFolder folder;
	folder.AddForm("Form1", {}, "OnMouseMoved");
	const std::string project = folder.Save();
	EXPECT_EQ(Plimgen({project, "--check"}).code, 1);
	EXPECT_EQ(Plimgen({project, "--check", "--dialect", "standard"}).code, 0);
	EXPECT_TRUE(Has(Plimgen({project, "--dry-run"}).err, "would not compile"));
	EXPECT_EQ(Plimgen({project, "--dry-run", "--dialect", "standard"}).err, "");
}


TEST(PlimgenTest, BuildFilesAreMadeOnceAndThenLeftAlone)
{
	ProjectFolder folder;
	folder.SetAppProperty("LaunchFlags", "B_EXCLUSIVE_LAUNCH");
	const std::string project = folder.SaveSimple();
	EXPECT_EQ(EntryNames(folder.Path()), "Form1.frm sample.plim");
	EXPECT_FALSE(Has(Plimgen({project, "--dry-run"}).out, "CMakeLists.txt"));

	const std::string out = folder.At("out/");
	const program_result first = Plimgen({project, "--build-files"});
	EXPECT_EQ(first.code, 0) << first.err;
	EXPECT_TRUE(Has(first.out,
		"created " + out + "CMakeLists.txt\ncreated " + out + "makefile\ncreated " + out
			+ "Sample.rdef\n"))
		<< first.out;
	EXPECT_TRUE(Has(folder.OutText("Sample.rdef"), "resource app_flags B_EXCLUSIVE_LAUNCH;\n"));

	WriteText(out + "CMakeLists.txt", "# mine\n");
	const program_result second = Plimgen({project, "--build-files"});
	EXPECT_EQ(second.code, 0) << second.err;
	EXPECT_TRUE(Has(second.out,
		"left alone " + out + "CMakeLists.txt\nleft alone " + out + "makefile\nleft alone " + out
			+ "Sample.rdef\n"))
		<< second.out;
	EXPECT_EQ(folder.OutText("CMakeLists.txt"), "# mine\n");
}


TEST(PlimgenTest, WrongUsageIsToldAndDoesNothing)
{
	ProjectFolder folder;
	const std::string project = folder.SaveSimple();
	const std::vector<std::vector<std::string>> wrong = {
		{},
		{project, "--no-such-option"},
		{project, "--diff"},
		{project, "second.plim"},
		{project, "--output"},
		{project, "--output", ""},
		{project, "--main"},
		{project, "--dialect"},
		{project, "--dialect", "latin"},
		{project, "-o", folder.At(std::string(260, 'd'))},
	};
	for (const auto& arguments : wrong) {
		const program_result result = Plimgen(arguments);
		std::string line;
		for (const std::string& argument : arguments)
			line += argument + " ";
		EXPECT_EQ(result.code, 2) << line;
		EXPECT_EQ(result.out, "") << line;
		EXPECT_EQ(result.err.find("plimgen: "), 0u) << line << result.err;
		EXPECT_FALSE(std::filesystem::exists(folder.At("out"))) << line;
	}
}


TEST(PlimgenTest, AProjectThatCannotBeReadIsToldByName)
{
	ProjectFolder folder;
	WriteText(folder.At("text.plim"), "this is no document\n");
	WriteText(folder.At("empty.plim"), "");
	const std::string sound = folder.SaveSimple();
	const std::string whole = ReadText(sound);
	WriteText(folder.At("half.plim"), whole.substr(0, whole.length() / 2));
	for (const char* name : {"missing.plim", "text.plim", "empty.plim", "half.plim", "."}) {
		for (const bool check : {false, true}) {
			std::vector<std::string> arguments = {folder.At(name)};
			if (check)
				arguments.push_back("--check");
			const program_result result = Plimgen(arguments);
			EXPECT_EQ(result.code, 3) << name;
			EXPECT_EQ(result.out, "") << name;
			EXPECT_TRUE(
				Has(result.err, "plimgen: " + folder.At(name) + ": the project cannot be read"))
				<< result.err;
			EXPECT_FALSE(Has(result.err, "Unknown error")) << result.err;
		}
	}
}


TEST(PlimgenTest, WhyAFileCannotBeReadIsToldInWords)
{
	ProjectFolder folder;
	EXPECT_TRUE(Has(Plimgen({folder.At("missing.plim")}).err,
		"cannot be read (No such file or directory); name a project file"));
	EXPECT_TRUE(Has(Plimgen({folder.SaveSimple(), "--components", folder.At("missing")}).err,
		"cannot be read (No such file or directory); check the option"));
}


TEST(PlimgenTest, AFormInPlaceOfAProjectIsToldByName)
{
	ProjectFolder folder;
	folder.SaveSimple();
	const program_result result = Plimgen({folder.At("Form1.frm"), "-o", folder.At("out")});
	EXPECT_EQ(result.code, 3);
	EXPECT_EQ(result.err,
		"plimgen: " + folder.At("Form1.frm")
			+ ": this is a form and no project; name the project file (.plim)\n");
	EXPECT_FALSE(std::filesystem::exists(folder.At("out")));
}


TEST(PlimgenTest, AFormFileThatIsMissingOrDamagedWritesNothing)
{
	for (const bool damaged : {false, true}) {
		ProjectFolder folder;
		const std::string project = folder.SaveSimple();
		if (damaged)
			WriteText(folder.At("Form1.frm"), "no document");
		else
			std::filesystem::remove(folder.At("Form1.frm"));
		const program_result result = Plimgen({project});
		EXPECT_EQ(result.code, 3);
		EXPECT_EQ(result.out, "");
		EXPECT_TRUE(Has(
			result.err, "plimgen: " + folder.At("Form1.frm") + ": the form 'Form1' cannot be read"))
			<< result.err;
		EXPECT_FALSE(std::filesystem::exists(folder.At("out")));
	}
}


TEST(PlimgenTest, AFolderThatCannotBeMadeIsAnError)
{
	ProjectFolder folder;
	const std::string project = folder.SaveSimple();
	WriteText(folder.At("file"), "in the way\n");
	for (const char* name : {"missing/out", "file", "file/out"}) {
		const program_result result = Plimgen({project, "-o", folder.At(name)});
		EXPECT_EQ(result.code, 3) << name;
		EXPECT_EQ(result.out, "") << name;
		EXPECT_TRUE(Has(result.err, "plimgen: " + folder.At(name) + ": ")) << result.err;
	}
	EXPECT_EQ(ReadText(folder.At("file")), "in the way\n");
}


TEST(PlimgenTest, AProjectWithoutAFolderNeedsOutput)
{
	ProjectFolder folder;
	folder.SetAppProperty("GenerationPath", "");
	const std::string project = folder.SaveSimple();
	const program_result result = Plimgen({project});
	EXPECT_EQ(result.code, 1);
	EXPECT_TRUE(Has(result.err, "plimgen: " + project + ": the project names no folder"));
	EXPECT_EQ(Plimgen({project, "-o", folder.At("out")}).code, 0);
}


TEST(PlimgenTest, AProjectFolderTooLongForTheGeneratorIsAProblem)
{
	ProjectFolder folder;
	folder.SetAppProperty("GenerationPath", folder.At(std::string(300, 'd')));
	const program_result result = Plimgen({folder.SaveSimple()});
	EXPECT_EQ(result.code, 1);
	EXPECT_TRUE(Has(result.err, "longer than 255 bytes"));
}


TEST(PlimgenTest, AFileThatCannotBeReadIsLeftAloneAndTheOthersWritten)
{
	ProjectFolder folder;
	const std::string project = folder.SaveSimple();
	std::filesystem::create_directories(folder.At("out/Form1.cpp"));
	const program_result result = Plimgen({project});
	EXPECT_EQ(result.code, 3);
	EXPECT_TRUE(Has(result.err,
		"plimgen: " + folder.At("out/Form1.cpp") + ": the file cannot be read (Is a directory)"));
	EXPECT_TRUE(Has(result.out, "created " + folder.At("out/Form1.h")));
	EXPECT_TRUE(std::filesystem::is_directory(folder.At("out/Form1.cpp")));
}


TEST(PlimgenTest, AFullDiskLeavesTheUsersFileAsItWas)
{
	ProjectFolder folder;
	const std::string project = folder.SaveSimple();
	std::filesystem::create_directory(folder.At("out"));
	const std::string mine = "// mine\n" + std::string(200, '\n');
	WriteText(folder.At("out/Form1.cpp"), mine);
	const program_result result = Plimgen({project}, "", [] {
		signal(SIGXFSZ, SIG_IGN);
		const rlimit limit = {100, 100};
		setrlimit(RLIMIT_FSIZE, &limit);
	});
	EXPECT_EQ(result.code, 3);
	EXPECT_EQ(ReadText(folder.At("out/Form1.cpp")), mine);
	EXPECT_EQ(EntryNames(folder.At("out")), "Form1.cpp");
}


TEST(PlimgenTest, StandardOutputThatCannotBeWrittenIsAnError)
{
	ProjectFolder folder;
	const std::string project = folder.SaveSimple();
	const program_result result =
		Plimgen({project}, "", [] { dup2(open("/dev/full", O_WRONLY), STDOUT_FILENO); });
	EXPECT_EQ(result.code, 3);
	EXPECT_TRUE(Has(result.err, "plimgen: standard output: it cannot be written"));
}


TEST(PlimgenTest, AMissingMarkerGivesAWarning)
{
	ProjectFolder folder;
	const std::string project = folder.SaveSimple();
	std::filesystem::create_directory(folder.At("out"));
	WriteText(folder.At("out/Form1.cpp"), "// mine\n");
	const program_result result = Plimgen({project});
	EXPECT_EQ(result.code, 0);
	EXPECT_EQ(result.err,
		"plimgen: warning: " + folder.At("out/Form1.cpp")
			+ ": the section FORM_IMPL_INCLUDES was left as it is, for want of a marker; put both "
			  "markers "
			  "back to have it updated\n");
	EXPECT_EQ(folder.OutText("Form1.cpp").find("// mine\n\nvoid TForm1::MessageReceived"), 0u);
}


TEST(PlimgenTest, ALineTooLongGivesAWarningAndKeepsTheOldFile)
{
	ProjectFolder folder;
	const std::string project = folder.SaveSimple();
	std::filesystem::create_directory(folder.At("out"));
	const std::string mine = "//" + std::string(2000, 'x') + "\nint mine;\n";
	WriteText(folder.At("out/Form1.cpp"), mine);
	const program_result result = Plimgen({project});
	EXPECT_EQ(result.code, 0);
	EXPECT_TRUE(
		Has(result.err, "plimgen: warning: " + folder.At("out/Form1.cpp") + ": line 1 is longer"));
	EXPECT_EQ(folder.OutText("Form1.cpp~"), mine);
}


TEST(PlimgenTest, LeavesTheDesignersSettingsAlone)
{
	ProjectFolder folder;
	const std::string project = folder.SaveSimple();
	std::filesystem::create_directory(folder.At("config"));
	const program_result result = Plimgen(
		{project}, "", [&folder] { setenv("XDG_CONFIG_HOME", folder.At("config").c_str(), 1); });
	EXPECT_EQ(result.code, 0);
	for (const auto& entry : std::filesystem::recursive_directory_iterator(folder.At("config")))
		EXPECT_NE(entry.path().filename(), "Plim_Settings");
}


TEST(PlimgenTest, AComponentTakesAtMostEightyKilobytes)
{
	const program_result small = GenerateButtons(1000);
	const program_result large = GenerateButtons(10000);
	EXPECT_LT((large.peakKilobytes - small.peakKilobytes) / 9000.0, 80.0) << "KiB a component";
}
