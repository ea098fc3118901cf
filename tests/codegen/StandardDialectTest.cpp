// SPDX-License-Identifier: MIT
// Sources in standard C++, and projects that are generated in one dialect and then in the other.

#include <sstream>

#include "app/Preferences.h"
#include "codegen/DialectGenerator.h"
#include "codegen/ProjectCheck.h"
#include "codegen/SampleProject.h"
#include "codegen/TestFolder.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "model/Property.h"

namespace {

const char* const kGenerated[] = {"Form1.h", "Form1.cpp", "Form1.fcp", "MyApp.h", "MyApp.cpp"};
const char* const kKept[] = {"Form1.h", "Form1.cpp", "MyApp.h", "MyApp.cpp"};


void
Generate(SampleProject& project, const std::string& folder, source_dialect dialect)
{
	TDialectGenerator generator(dialect);
	generator.SetAppComponent(&project.App());
	generator.SetGenerationPath(folder.c_str());
	generator.GenerateApp();
}


/// What the file called \a name holds after generating \a project in standard C++ into a new folder.
std::string
StandardText(SampleProject& project, const std::string& name)
{
	TestFolder folder;
	Generate(project, folder.Path(), DIALECT_STANDARD);
	return ReadText(folder.At(name));
}


bool
Has(const std::string& text, const std::string& part)
{
	return text.find(part) != std::string::npos;
}


std::string
Replaced(std::string text, const std::string& part, const std::string& by)
{
	for (size_t at = text.find(part); at != std::string::npos; at = text.find(part, at + by.size()))
		text.replace(at, part.length(), by);
	return text;
}


/// The line of \a text that begins with \a start, blanks before it aside.
std::string
LineOf(const std::string& text, const std::string& start)
{
	std::istringstream lines(text);
	for (std::string line; std::getline(lines, line);) {
		const size_t first = line.find_first_not_of(' ');
		if (first != std::string::npos && line.compare(first, start.length(), start) == 0)
			return line.substr(first);
	}
	return "no such line: " + start;
}


/// \a text with a line of the user's before, between and behind all of its lines outside of machine sections.
std::string
WithUserLines(const std::string& text)
{
	std::istringstream lines(text);
	std::string result = "// the user's first line\n";
	bool isMachines = false;
	int count = 0;
	for (std::string line; std::getline(lines, line);) {
		if (line.rfind("// [", 0) == 0)
			isMachines = line.rfind("// [END_", 0) != 0;
		result += line + "\n";
		if (!isMachines)
			result += "// user's line " + std::to_string(++count) + ": \"mine\\\" {\n";
	}
	return result;
}


/// What the user may rely on: all but the contents of the machine sections, and the empty lines at the end.
std::string
OutsideOfSections(const std::string& text)
{
	std::istringstream lines(text);
	std::string result;
	bool isMachines = false;
	for (std::string line; std::getline(lines, line);) {
		if (line.rfind("// [END_", 0) == 0)
			isMachines = false;
		if (!isMachines)
			result += line + "\n";
		if (line.rfind("// [", 0) == 0 && line.rfind("// [END_", 0) != 0)
			isMachines = true;
	}
	return result.substr(0, result.find_last_not_of('\n') + 1);
}


std::string
WithoutEmptyEnd(const std::string& text)
{
	return text.substr(0, text.find_last_not_of('\n') + 1);
}

} // namespace


TEST(StandardDialectTest, WritesTheSameFilesInStandardCode)
{
	const auto project = SampleProject::MakeFull();
	TestFolder folder;
	Generate(*project, folder.Path(), DIALECT_STANDARD);
	for (const char* name : kGenerated)
		ExpectText(GoldenText(std::string("standard/") + name), ReadText(folder.At(name)), name);
	EXPECT_EQ(EntryNames(folder.Path()), "Form1.cpp Form1.fcp Form1.h MyApp.cpp MyApp.h");
}


TEST(StandardDialectTest, TheClassicDialectOfTheGeneratorIsThatOfTheClassicOne)
{
	const auto project = SampleProject::MakeFull();
	TestFolder folder;
	Generate(*project, folder.Path(), DIALECT_CLASSIC);
	for (const char* name : kGenerated)
		ExpectText(GoldenText(std::string("new/") + name), ReadText(folder.At(name)), name);
}


TEST(StandardDialectTest, TheUsersLinesStayWhateverDialectComesNext)
{
	const auto project = SampleProject::MakeFull();
	for (const source_dialect first : {DIALECT_CLASSIC, DIALECT_STANDARD}) {
		const source_dialect second = first == DIALECT_CLASSIC ? DIALECT_STANDARD : DIALECT_CLASSIC;
		TestFolder folder;
		Generate(*project, folder.Path(), first);
		std::string before[4];
		for (int i = 0; i < 4; i++) {
			const std::string path = folder.At(kKept[i]);
			WriteText(path, WithUserLines(ReadText(path)));
			before[i] = ReadText(path);
		}

		for (int round = 0; round < 3; round++) {
			Generate(*project, folder.Path(), second);
			for (int i = 0; i < 4; i++) {
				ExpectText(OutsideOfSections(before[i]),
					OutsideOfSections(ReadText(folder.At(kKept[i]))), kKept[i]);
			}
			Generate(*project, folder.Path(), first);
			for (int i = 0; i < 4; i++) {
				ExpectText(WithoutEmptyEnd(before[i]),
					WithoutEmptyEnd(ReadText(folder.At(kKept[i]))), kKept[i]);
			}
		}
	}
}


TEST(StandardDialectTest, TheSectionsAreThoseOfTheLatestDialect)
{
	const auto project = SampleProject::MakeFull();
	TestFolder folder;
	for (const source_dialect dialect :
		{DIALECT_CLASSIC, DIALECT_STANDARD, DIALECT_CLASSIC, DIALECT_STANDARD}) {
		Generate(*project, folder.Path(), dialect);
		const std::string golden = dialect == DIALECT_CLASSIC ? "new/" : "standard/";
		for (const char* name : {"Form1.h", "Form1.fcp", "MyApp.h"})
			ExpectText(WithoutEmptyEnd(GoldenText(golden + name)),
				WithoutEmptyEnd(ReadText(folder.At(name))), name);
		EXPECT_EQ(Has(ReadText(folder.At("MyApp.cpp")), ", m_MainForm(nullptr)\n"),
			dialect == DIALECT_STANDARD);
	}
}


TEST(StandardDialectTest, AHandlerWithOddSpacesKeepsItsBodyAndGetsPlainOnes)
{
	const auto project = SampleProject::MakeFull();
	TDesignForm* form = dynamic_cast<TDesignForm*>(project->App().ComponentAt(0));
	form->SetEventSelection("OnMouseMoved", true);
	form->View()->ComponentAt(0)->SetEventSelection("OnMouseMoved", true);
	TestFolder folder;
	Generate(*project, folder.Path(), DIALECT_CLASSIC);
	const std::string path = folder.At("Form1.cpp");
	const std::string odd = "const\xc2\xa0"
							"BMessage\xc2\xa0*message)";
	std::string text = WithUserLines(ReadText(path));
	EXPECT_TRUE(Has(text, "void TForm1::MouseMoved(BPoint point, uint32 transit, " + odd));
	EXPECT_TRUE(Has(text, "void TForm1::Button1MouseMoved(BPoint point, uint32 transit, " + odd));
	WriteText(path, text);

	Generate(*project, folder.Path(), DIALECT_STANDARD);
	ExpectText(OutsideOfSections(Replaced(text, "\xc2\xa0", " ")),
		OutsideOfSections(ReadText(path)), "Form1.cpp");
	const std::string header = ReadText(folder.At("Form1.h"));
	EXPECT_FALSE(Has(header, "\xc2\xa0"));
	EXPECT_TRUE(Has(header,
		"  virtual void MouseMoved(BPoint point, uint32 transit, const BMessage *message);\n"));
	// What compiles stays when the classic dialect follows.
	Generate(*project, folder.Path(), DIALECT_CLASSIC);
	EXPECT_FALSE(Has(ReadText(path), "\xc2\xa0"));
}


TEST(StandardDialectTest, TextsMayHoldAnything)
{
	const auto project = SampleProject::MakeFull();
	TDesignForm* form = dynamic_cast<TDesignForm*>(project->App().ComponentAt(0));
	SetText(form, "Title", "a \"b\" $FORMNAME\n?\?/");
	SetText(form->View()->ComponentAt(0), "Label", "C:\\ $TAB");
	SetText(&project->App(), "Signature", "x/\"$APPNAME\"");
	const std::string init = StandardText(*project, "Form1.fcp");
	EXPECT_TRUE(Has(init, "  , \"a \\\"b\\\" \\044FORMNAME\\n?\\?/\"\n"));
	EXPECT_EQ(LineOf(init, "Button1->SetLabel"), "Button1->SetLabel(\"C:\\\\ \\044TAB\");");
	EXPECT_EQ(LineOf(StandardText(*project, "MyApp.cpp"), "const char *APP_SIG"),
		"const char *APP_SIG = \"x/\\\"\\044APPNAME\\\"\";");
}


TEST(StandardDialectTest, StatementsOfLibrariesGetTheirValuesEscaped)
{
	const auto project = SampleProject::MakeFull();
	TDesignForm* form = dynamic_cast<TDesignForm*>(project->App().ComponentAt(0));
	TComponent* button = form->View()->ComponentAt(0);
	button->FindProperty("Label")->SetSetStatement("$COMPONENT->Say(\"$VALUE\");");
	SetText(button, "Label", "\"\\");
	EXPECT_EQ(
		LineOf(StandardText(*project, "Form1.fcp"), "Button1->Say"), "Button1->Say(\"\\\"\\\\\");");
}


TEST(StandardDialectTest, ValuesThatWouldNotCompileAreCompletedOrLeftOut)
{
	const auto project = SampleProject::MakeFull();
	TDesignForm* form = dynamic_cast<TDesignForm*>(project->App().ComponentAt(0));
	TComponent* button = form->View()->ComponentAt(0);
	SetText(button, "Flags", "");
	SetText(button, "FontSize", "");
	SetText(button, "ViewColor", "{1, 2,300}");
	SetText(button, "HighColor", "");
	const std::string init = StandardText(*project, "Form1.fcp");
	const std::string own = init.substr(init.find("// initialize Button1"),
		init.find("// end initialize Button1") - init.find("// initialize Button1"));
	EXPECT_EQ(LineOf(own, "Button1->SetFlags"), "Button1->SetFlags(0);");
	EXPECT_FALSE(Has(own, "SetFontSize"));
	EXPECT_FALSE(Has(own, "SetHighColor"));
	EXPECT_TRUE(Has(own, "{rgb_color clr = {1,2,44,0};\n  Button1->SetViewColor(clr);}\n"));
}


TEST(StandardDialectTest, AFormMayBeCalledLikeAPartOfAStatement)
{
	SampleProject project;
	project.AddForm("Set", "/projects/Set.frm");
	EXPECT_EQ(LineOf(StandardText(project, "Set.fcp"), "FormView()->SetFontSize"),
		"FormView()->SetFontSize(10);");
}


TEST(StandardDialectTest, ContainersAtAnyDepthComeBeforeWhatIsInThem)
{
	SampleProject project;
	TDesignForm* form = project.AddForm("Form1", "/projects/Form1.frm");
	auto* leaf = project.Place(form, new TSampleControl("TButton", "Leaf", 0, 0, 9, 9));
	auto* inner = project.Place(form, new TSampleContainer("TBox", "Inner", 0, 0, 9, 9));
	auto* middle = project.Place(form, new TSampleContainer("TBox", "Middle", 0, 0, 9, 9));
	auto* outer = project.Place(form, new TSampleContainer("TBox", "Outer", 0, 0, 9, 9));
	inner->AddComponent(leaf);
	middle->AddComponent(inner);
	outer->AddComponent(middle);
	const std::string init = StandardText(project, "Form1.fcp");
	size_t last = 0;
	for (const char* name : {"Outer", "Middle", "Inner", "Leaf"}) {
		const size_t at = init.find(std::string("// create ") + name + "\n");
		ASSERT_NE(at, std::string::npos) << name;
		EXPECT_GT(at, last) << name;
		EXPECT_EQ(init.find(std::string("// create ") + name + "\n", at + 1), std::string::npos);
		last = at;
	}
}


TEST(StandardDialectTest, ComponentsThatOwnEachOtherAreWrittenOnceAllTheSame)
{
	SampleProject project;
	TDesignForm* form = project.AddForm("Form1", "/projects/Form1.frm");
	auto* one = project.Place(form, new TSampleContainer("TBox", "One", 0, 0, 9, 9));
	auto* other = project.Place(form, new TSampleContainer("TBox", "Other", 0, 0, 9, 9));
	one->SetOwner(other);
	other->SetOwner(one);
	const std::string init = StandardText(project, "Form1.fcp");
	EXPECT_TRUE(Has(init, "// create One\n"));
	EXPECT_TRUE(Has(init, "// create Other\n"));
	one->SetOwner(form);
	other->SetOwner(form);
}


TEST(StandardDialectTest, NewHandlersCompileWithoutWarnings)
{
	SampleProject project;
	TDesignForm* form = project.AddForm("Form1", "/projects/Form1.frm");
	form->SetEventSelection("OnQuitRequested", true);
	auto* button = project.Place(form, new TSampleControl("TButton", "Button1", 0, 0, 9, 9));
	button->AddSelectedEvent("OnAsk", "std::pair<int, int> both, void (*call)(int, int)", "char *");
	button->AddSelectedEvent("OnMany", "int first, ...", nullptr);
	button->AddSelectedEvent("OnNone", "void", nullptr);
	project.App().SetEventSelection("OnArgvReceived", true);
	project.App().SetEventSelection("OnQuitRequested", true);
	const std::string source = StandardText(project, "Form1.cpp");
	EXPECT_TRUE(Has(source,
		"bool TForm1::QuitRequested(void)\n{\n  bool result = TForm::QuitRequested();\n\n"
		"  return result;\n}\n"));
	EXPECT_TRUE(Has(source,
		"char * TForm1::Button1Ask([[maybe_unused]] std::pair<int, int> both, "
		"[[maybe_unused]] void (*call)(int, int))\n{\n  char * result{};\n\n  return "
		"result;\n}\n"));
	EXPECT_TRUE(Has(source, "void TForm1::Button1Many([[maybe_unused]] int first, ...)\n{\n\n}\n"));
	EXPECT_TRUE(Has(source, "void TForm1::Button1None(void)\n{\n\n}\n"));
	const std::string app = StandardText(project, "MyApp.cpp");
	EXPECT_TRUE(Has(app,
		"void TMyApp::ArgvReceived([[maybe_unused]] int32 argc, [[maybe_unused]] char **argv)\n"));
	EXPECT_TRUE(Has(app, "  bool result = BApplication::QuitRequested();\n"));
}


TEST(StandardDialectTest, TheMembersOfAnAppWithoutFormsHaveValues)
{
	SampleProject project;
	EXPECT_TRUE(Has(StandardText(project, "MyApp.cpp"),
		"TMyApp::TMyApp(void)\n: BApplication(APP_SIG)\n, m_MainForm(nullptr)\n{\n}\n"));
}


TEST(StandardDialectTest, TheCheckTakesOddSpacesButNoBadNames)
{
	SampleProject project;
	TDesignForm* form = project.AddForm("Form 1", "/projects/Form1.frm");
	form->SetEventSelection("OnMouseMoved", true);
	EXPECT_EQ(TProjectCheck(&project.App(), "app", DIALECT_CLASSIC).Run().size(), 2u);
	TProjectCheck check(&project.App(), "app", DIALECT_STANDARD);
	const std::vector<project_problem> problems = check.Run();
	ASSERT_EQ(problems.size(), 1u);
	EXPECT_EQ(problems[0].text, "the name of the form 'Form 1' is no C++ identifier; rename it");
}


TEST(StandardDialectTest, TheCheckTakesNoOddSpacesInResults)
{
	SampleProject project;
	TDesignForm* form = project.AddForm("Form1", "/projects/Form1.frm");
	auto* button = project.Place(form, new TSampleControl("TButton", "Button1", 0, 0, 9, 9));
	// A handler is found by its result, so that cannot be another one in each dialect.
	button->AddSelectedEvent("OnAsk", nullptr, "char\xc2\xa0*");
	TProjectCheck check(&project.App(), "app", DIALECT_STANDARD);
	const std::vector<project_problem> problems = check.Run();
	ASSERT_EQ(problems.size(), 1u);
	EXPECT_TRUE(Has(problems[0].text, "it cannot return 'char\xc2\xa0*'"));
}


TEST(StandardDialectTest, TheDesignersGeneratorTakesThePreferredDialect)
{
	const auto project = SampleProject::MakeFull();
	EXPECT_EQ(PreferredDialect(), DIALECT_CLASSIC);
	TPreferredGenerator generator;
	generator.SetAppComponent(&project->App());
	TestFolder folder;
	generator.SetGenerationPath(folder.Path().c_str());
	generator.GenerateApp();
	EXPECT_TRUE(Has(ReadText(folder.At("Form1.fcp")), "Button1->OnClick = &Button1Click;"));

	SetPreferredDialect(DIALECT_STANDARD);
	BString stored;
	EXPECT_EQ(AppSettings.FindString("Dialect", &stored), B_OK);
	EXPECT_STREQ(stored.String(), "standard");
	generator.GenerateApp();
	EXPECT_TRUE(Has(ReadText(folder.At("Form1.fcp")), "Button1->OnClick = &TForm1::Button1Click;"));

	// A setting that is none is as good as none.
	AppSettings.SetString("Dialect", "latin");
	EXPECT_EQ(PreferredDialect(), DIALECT_CLASSIC);
	AppSettings.RemoveName("Dialect");
}
