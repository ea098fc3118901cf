// SPDX-License-Identifier: MIT
// The generator: its five kinds of file, new ones and those that the user has edited.

#include "codegen/CodeGenerator.h"

#include <algorithm>

#include "app/Dialogs.h"
#include "codegen/AppHeaderEmitter.h"
#include "codegen/AppSourceEmitter.h"
#include "codegen/FormHeaderEmitter.h"
#include "codegen/FormSourceEmitter.h"
#include "codegen/ProjectEmitter.h"
#include "codegen/SampleProject.h"
#include "codegen/TestFolder.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "model/Event.h"
#include "model/Property.h"

namespace {

const char* const kGenerated[] = {"Form1.h", "Form1.cpp", "Form1.fcp", "MyApp.h", "MyApp.cpp"};

std::string sBoxText;


int32
NoteBox(const char* title, const char* text, const char* button)
{
	sBoxText = std::string(title) + "|" + text + "|" + button;
	return 0;
}


void
Generate(SampleProject& project, const std::string& folder)
{
	TCodeGenerator generator;
	generator.SetAppComponent(&project.App());
	generator.SetGenerationPath(folder.c_str());
	generator.GenerateApp();
}


/// What the file called \a name holds after generating \a project into a new folder.
std::string
GeneratedText(SampleProject& project, const std::string& name)
{
	TestFolder folder;
	Generate(project, folder.Path());
	return ReadText(folder.At(name));
}


/// What becomes of a file called \a name that holds \a text.
std::string
Regenerated(SampleProject& project, const std::string& name, const std::string& text)
{
	TestFolder folder;
	WriteText(folder.At(name), text);
	Generate(project, folder.Path());
	return ReadText(folder.At(name));
}


bool
Has(const std::string& text, const std::string& part)
{
	return text.find(part) != std::string::npos;
}


int
CountOf(const std::string& text, const std::string& part)
{
	int count = 0;
	for (size_t at = text.find(part); at != std::string::npos; at = text.find(part, at + 1))
		count++;
	return count;
}


std::string
Without(std::string text, const std::string& part)
{
	const size_t at = text.find(part);
	EXPECT_NE(at, std::string::npos) << part;
	return text.erase(at, part.length());
}


std::string
Replaced(std::string text, const std::string& part, const std::string& by)
{
	const size_t at = text.find(part);
	EXPECT_NE(at, std::string::npos) << part;
	return text.replace(at, part.length(), by);
}


/// The form that the application's constructor makes.
std::string
MainFormIn(const std::string& source)
{
	const std::string start = "m_MainForm = new T";
	const size_t at = source.find(start);
	if (at == std::string::npos)
		return "none";
	const size_t name = at + start.length();
	return source.substr(name, source.find('(', name) - name);
}

} // namespace


TEST(CodeGeneratorTest, WritesTheFiveFilesOfAnApplicationWithOneForm)
{
	const auto project = SampleProject::MakeFull();
	TestFolder folder;
	Generate(*project, folder.Path());
	for (const char* name : kGenerated)
		ExpectText(GoldenText(std::string("new/") + name), ReadText(folder.At(name)), name);
	EXPECT_EQ(EntryNames(folder.Path()), "Form1.cpp Form1.fcp Form1.h MyApp.cpp MyApp.h");
}


TEST(CodeGeneratorTest, WritesAFormWithoutComponents)
{
	SampleProject project;
	project.AddForm("Empty", "/projects/Empty.frm");
	TestFolder folder;
	Generate(project, folder.Path());
	for (const char* name : {"Empty.h", "Empty.cpp", "Empty.fcp"})
		ExpectText(GoldenText(std::string("empty/") + name), ReadText(folder.At(name)), name);
}


TEST(CodeGeneratorTest, KeepsWhatTheUserWroteAroundTheSections)
{
	const auto project = SampleProject::MakeFull();
	TDesignForm* form = dynamic_cast<TDesignForm*>(project->App().ComponentAt(0));
	form->View()->ComponentAt(0)->SetComponentName("Ok");
	form->SetEventSelection("OnHide", true);
	project->AddForm("Form2", "/projects/Form2.frm")->SetAsMainForm(true);
	project->App().SetEventSelection("OnReadyToRun", true);

	TestFolder folder;
	for (const char* name : {"Form1.h", "Form1.cpp", "MyApp.h", "MyApp.cpp"})
		WriteText(folder.At(name), GoldenText(std::string("edited/") + name));
	Generate(*project, folder.Path());
	for (const char* name : {"Form1.h", "Form1.cpp", "MyApp.h", "MyApp.cpp"})
		ExpectText(GoldenText(std::string("merged/") + name), ReadText(folder.At(name)), name);
}


TEST(CodeGeneratorTest, GeneratingTwiceAddsOneEmptyLineToAllButTheInitFile)
{
	const auto project = SampleProject::MakeFull();
	TestFolder folder;
	Generate(*project, folder.Path());
	Generate(*project, folder.Path());
	for (const char* name : kGenerated) {
		const char* added = std::string(name) == "Form1.fcp" ? "" : "\n";
		ExpectText(GoldenText(std::string("new/") + name) + added, ReadText(folder.At(name)), name);
	}
}


TEST(CodeGeneratorTest, TheInitFileIsOverwrittenWithoutBeingRead)
{
	const auto project = SampleProject::MakeFull();
	ExpectText(GoldenText("new/Form1.fcp"),
		Regenerated(
			*project, "Form1.fcp", "edited by mistake, and longer\n" + std::string(9000, 'x')),
		"Form1.fcp");
}


TEST(CodeGeneratorTest, AFormNeverSavedIsGeneratedUnderItsName)
{
	SampleProject project;
	project.AddForm("Form1", "");
	TestFolder folder;
	Generate(project, folder.Path());
	EXPECT_EQ(EntryNames(folder.Path()), "Form1.cpp Form1.fcp Form1.h MyApp.cpp MyApp.h");
}


TEST(CodeGeneratorTest, FilesAreNamedAfterTheFormsFileAndTheSourceCommentAfterTheForm)
{
	SampleProject project;
	project.AddForm("Form1", "/x/my.form.b");
	TestFolder folder;
	Generate(project, folder.Path());
	EXPECT_EQ(EntryNames(folder.Path()), "MyApp.cpp MyApp.h my.cpp my.fcp my.h");
	const std::string header = ReadText(folder.At("my.h"));
	EXPECT_EQ(header.find("//\n// my.h\n// TForm1 class definition\n//\n\n"), 0u);
	EXPECT_TRUE(Has(header, "#ifndef _my_H\n#define _my_H\n\n"));
	EXPECT_TRUE(Has(header, "#endif // _my_H\n"));
	const std::string source = ReadText(folder.At("my.cpp"));
	EXPECT_EQ(source.find("//\n// Form1.cpp\n// TForm1 implementation\n//\n\n"), 0u);
	EXPECT_TRUE(Has(source, "#include \"my.h\"\n#include \"my.fcp\"\n"));
	EXPECT_TRUE(Has(ReadText(folder.At("MyApp.h")), "#include \"my.h\"\n"));
}


TEST(CodeGeneratorTest, TwoComponentsWithOneHeaderGiveOneInclude)
{
	const std::string header = GeneratedText(*SampleProject::MakeFull(), "Form1.h");
	EXPECT_EQ(CountOf(header, "#include <Button.h>"), 1);
}


TEST(CodeGeneratorTest, HeaderNamesAreComparedExactly)
{
	SampleProject project;
	TDesignForm* form = project.AddForm("Form1", "");
	const char* const headers[] = {"b.h", "a.h", "B.h", "b.h", nullptr, "a.h"};
	for (const char* header : headers)
		project.Place(form, new TSampleControl("TButton", "B", 0, 0, 1, 1))->header = header;
	EXPECT_TRUE(Has(GeneratedText(project, "Form1.h"),
		"#include <Ormi.h>\n#include <b.h>\n#include <a.h>\n#include <B.h>\n// [END"));
}


TEST(CodeGeneratorTest, RenamingAFormRewritesItsClassesAndLeavesTheTopComment)
{
	SampleProject project;
	TDesignForm* form = project.AddForm("Form1", "/x/window.frm");
	TestFolder folder;
	Generate(project, folder.Path());
	form->SetComponentName("Renamed");
	Generate(project, folder.Path());
	const std::string header = ReadText(folder.At("window.h"));
	EXPECT_TRUE(Has(header, "// TForm1 class definition"));
	EXPECT_TRUE(Has(header, "class TRenamed: public TForm {"));
	EXPECT_TRUE(Has(header, "class TRenamedView: public TFormView {"));
	EXPECT_FALSE(Has(header, "class TForm1"));
}


TEST(CodeGeneratorTest, ADeletedEndMarkerKeepsThatSectionAndUpdatesTheOthers)
{
	const auto project = SampleProject::MakeFull();
	std::string header = GoldenText("new/Form1.h");
	header = Without(header, "// [END_FORM_CLASS]\n");
	header = Without(header, "  TBox<TForm1> *Box1;\n");
	header = Replaced(header, "  TForm1(void);\n", "  TForm1(int mine);\n");
	const std::string result = Regenerated(*project, "Form1.h", header);
	EXPECT_TRUE(Has(result, "  TForm1(int mine);\n"));
	EXPECT_TRUE(Has(result, "  TBox<TForm1> *Box1;\n"));
}


TEST(CodeGeneratorTest, AMissingMarkerIsRemarkedWithItsFileAndSection)
{
	const auto project = SampleProject::MakeFull();
	TestFolder folder;
	WriteText(folder.At("Form1.h"), Without(GoldenText("new/Form1.h"), "// [END_FORM_CLASS]\n"));
	TCodeGenerator generator;
	generator.SetAppComponent(&project->App());
	generator.SetGenerationPath(folder.Path().c_str());
	generator.GenerateApp();
	ASSERT_EQ(generator.Writer().Remarks().size(), 1u);
	const std::string remark = generator.Writer().Remarks()[0].String();
	EXPECT_EQ(remark.find(folder.At("Form1.h: the section FORM_CLASS was left as it is")), 0u);
}


TEST(CodeGeneratorTest, MarkersInLowerCaseAreFound)
{
	const auto project = SampleProject::MakeFull();
	const std::string header =
		Replaced(Without(GoldenText("new/Form1.h"), "  TBox<TForm1> *Box1;\n"),
			"// [FORM_COMPONENTS]", "// [form_components]");
	const std::string result = Regenerated(*project, "Form1.h", header);
	EXPECT_TRUE(Has(result, "// [form_components]\n  TButton<TForm1> *Button1;\n"));
	EXPECT_TRUE(Has(result, "  TBox<TForm1> *Box1;\n"));
}


TEST(CodeGeneratorTest, TypedTabsBecomeTwoSpaces)
{
	const auto project = SampleProject::MakeFull();
	const std::string result =
		Regenerated(*project, "Form1.cpp", GoldenText("new/Form1.cpp") + "\tint\tx;\n");
	EXPECT_TRUE(Has(result, "\n  int  x;\n"));
}


TEST(CodeGeneratorTest, PlaceholdersInTheUsersTextAreReplacedInAnyLetterCase)
{
	const auto project = SampleProject::MakeFull();
	const std::string source =
		GoldenText("new/Form1.cpp") + "// $FORMNAME $formfile $Tab| $APPNAME $VALUE\n";
	EXPECT_TRUE(
		Has(Regenerated(*project, "Form1.cpp", source), "// Form1 Form1   | $APPNAME $VALUE\n"));
	EXPECT_TRUE(Has(Regenerated(*project, "MyApp.h", "// $appname $APPSIG $tab| $FORMNAME\n"),
		"// MyApp application/x-vnd.Sample   | $FORMNAME\n"));
}


TEST(CodeGeneratorTest, ADisabledEventLosesItsPrototypeAndAssignmentAndKeepsItsHandler)
{
	const auto project = SampleProject::MakeFull();
	TestFolder folder;
	Generate(*project, folder.Path());
	TDesignForm* form = dynamic_cast<TDesignForm*>(project->App().ComponentAt(0));
	form->View()->ComponentAt(0)->SetEventSelection("OnClick", false);
	Generate(*project, folder.Path());
	EXPECT_FALSE(Has(ReadText(folder.At("Form1.h")), "Button1Click"));
	EXPECT_FALSE(Has(ReadText(folder.At("Form1.fcp")), "Button1Click"));
	EXPECT_TRUE(Has(ReadText(folder.At("Form1.cpp")), "void TForm1::Button1Click(void)"));

	form->View()->ComponentAt(0)->SetEventSelection("OnClick", true);
	Generate(*project, folder.Path());
	EXPECT_TRUE(Has(ReadText(folder.At("Form1.h")),
		"// [COMPONENT_EVENTS]\n  virtual void Button1Click(void);\n"));
	EXPECT_EQ(CountOf(ReadText(folder.At("Form1.cpp")), "void TForm1::Button1Click(void)"), 1);
}


TEST(CodeGeneratorTest, DeletedFunctionsAreAppendedAtTheEnd)
{
	const auto project = SampleProject::MakeFull();
	const std::string functions[] = {
		"void TForm1::FormCreate(void)\n{\n\n}\n\n",
		"void TForm1::FormDestroy(void)\n{\n\n}\n\n",
		"void TForm1::MessageReceived(BMessage *msg)\n{\n  switch(msg->what)\n  {\n    default:\n"
		"      TForm::MessageReceived(msg);\n      break;\n  }\n}\n\n",
		"bool TForm1::QuitRequested(void)\n{\n  bool result;\n\n  return result;\n}\n\n",
		"void TForm1::Button1Click(void)\n{\n\n}\n\n",
	};
	for (const std::string& function : functions) {
		const std::string source = Without(GoldenText("new/Form1.cpp"), function);
		ExpectText(
			source + "\n" + function, Regenerated(*project, "Form1.cpp", source), "Form1.cpp");
	}
}


TEST(CodeGeneratorTest, AHandlerWithAnotherReturnTypeGetsAFreshOneBesideIt)
{
	const auto project = SampleProject::MakeFull();
	const std::string source = Replaced(
		GoldenText("new/Form1.cpp"), "void TForm1::Button1Click", "status_t TForm1::Button1Click");
	ExpectText(source + "\nvoid TForm1::Button1Click(void)\n{\n\n}\n\n",
		Regenerated(*project, "Form1.cpp", source), "Form1.cpp");
}


TEST(CodeGeneratorTest, ACommentThatNamesAFunctionSuppressesIt)
{
	const auto project = SampleProject::MakeFull();
	const std::string source = Replaced(GoldenText("new/Form1.cpp"),
		"void TForm1::FormCreate(void)\n{\n\n}\n", "// VOID tform1::FORMCREATE\n");
	ExpectText(source + "\n", Regenerated(*project, "Form1.cpp", source), "Form1.cpp");
}


TEST(CodeGeneratorTest, AComponentInAContainerComesAfterTheFormsOwn)
{
	const std::string init = GeneratedText(*SampleProject::MakeFull(), "Form1.fcp");
	EXPECT_LT(init.find("// create List1\n"), init.find("// create CheckBox1\n"));
	EXPECT_TRUE(Has(init, "  Box1->AddChild(\n    CheckBox1 = new TCheckBox<TForm1>(this,"));
}


TEST(CodeGeneratorTest, ContainersInContainersFollowTheListsOrder)
{
	SampleProject project;
	TDesignForm* form = project.AddForm("Form1", "");
	TSampleControl* button =
		project.Place(form, new TSampleControl("TButton", "Inner", 0, 0, 1, 1));
	TSampleContainer* inner =
		project.Place(form, new TSampleContainer("TBox", "Middle", 0, 0, 1, 1));
	TSampleContainer* outer =
		project.Place(form, new TSampleContainer("TBox", "Outer", 0, 0, 1, 1));
	inner->AddComponent(button);
	outer->AddComponent(inner);
	const std::string init = GeneratedText(project, "Form1.fcp");
	EXPECT_LT(
		init.find("FormView()->AddChild(\n    Outer"), init.find("Middle->AddChild(\n    Inner"));
	EXPECT_LT(init.find("Middle->AddChild(\n    Inner"), init.find("Outer->AddChild(\n    Middle"));
}


TEST(CodeGeneratorTest, OnlyFlaggedPropertiesAreWrittenWhateverTheirValue)
{
	SampleProject project;
	TDesignForm* form = project.AddForm("Form1", "");
	TSampleControl* button = project.Place(form, new TSampleControl("TButton", "B", 0, 0, 1, 1));
	while (button->CountProperties() > 0)
		button->RemoveProperty(button->CountProperties() - 1);
	TProperty* generated = new TProperty(button, "Yes", "default", nullptr, true);
	TProperty* silent = new TProperty(button, "No", "default", nullptr, false);
	TProperty* multiline = new TProperty(button, "Text", "1\n2", nullptr, true);
	multiline->SetSetStatement("{x = $value;\n$Component->Set(x);}");
	button->AddProperty(generated);
	button->AddProperty(silent);
	button->AddProperty(multiline);
	EXPECT_TRUE(Has(GeneratedText(project, "Form1.fcp"),
		"  // initialize B\n  B->SetYes(default);\n  {x = 1\n  2;\n  B->Set(x);}\n"
		"  // end initialize B\n\n"));
}


TEST(CodeGeneratorTest, WindowFlagsThatAreSetReplaceTheZero)
{
	SampleProject project;
	TDesignForm* form = project.AddForm("Form1", "");
	SetText(form, "WindowFlags", "B_NOT_ZOOMABLE|B_NOT_RESIZABLE");
	SetText(form, "WindowLook", "B_FLOATING_WINDOW_LOOK");
	SetText(form, "WindowFeel", "B_FLOATING_APP_WINDOW_FEEL");
	EXPECT_TRUE(Has(GeneratedText(project, "Form1.fcp"),
		"  , \"Form\"\n  , B_FLOATING_WINDOW_LOOK\n  , B_FLOATING_APP_WINDOW_FEEL\n"
		"  , B_NOT_ZOOMABLE|B_NOT_RESIZABLE\n  )\n{\n"));
}


TEST(CodeGeneratorTest, MissingPropertiesCountAsEmpty)
{
	SampleProject project;
	TDesignForm* form = project.AddForm("Form1", "");
	std::vector<TProperty*> removed;
	for (const char* name : {"Title", "Left", "WindowLook", "LowColor", "FontSize"}) {
		removed.push_back(form->FindProperty(name));
		form->RemoveProperty(removed.back());
	}
	const std::string init = GeneratedText(project, "Form1.fcp");
	for (TProperty* property : removed)
		form->AddProperty(property);
	EXPECT_TRUE(Has(init,
		": TForm(\n    BRect(,100,400,300)\n  , \"\"\n  , \n  , B_NORMAL_WINDOW_FEEL\n  , 0\n"));
	EXPECT_TRUE(Has(init, "  FormView()->SetFont(be_plain_font);\n  \n\n  _formInit();\n"));
}


TEST(CodeGeneratorTest, FontStatementsReplaceTheFormsNameWhereverItStands)
{
	SampleProject project;
	TDesignForm* form = project.AddForm("Set", "");
	EXPECT_TRUE(Has(GeneratedText(project, "Set.fcp"),
		"  FormView()->FormView()Font(be_plain_font);\n  FormView()->FormView()FontSize(10);\n"));
	(void)form;
}


TEST(CodeGeneratorTest, AnApplicationWithoutFormsShowsNoWindow)
{
	SampleProject project;
	EXPECT_TRUE(
		Has(GeneratedText(project, "MyApp.cpp"), ": BApplication(APP_SIG)\n{\n}\n// [END_"));
}


TEST(CodeGeneratorTest, TheMarkedFormIsTheMainForm)
{
	SampleProject project;
	project.AddForm("First", "");
	project.AddForm("Second", "")->SetAsMainForm(true);
	project.AddForm("Third", "")->SetAsMainForm(true);
	EXPECT_EQ(MainFormIn(GeneratedText(project, "MyApp.cpp")), "Second");
}


TEST(CodeGeneratorTest, WithoutAMarkedFormTheLastIsTheMainForm)
{
	SampleProject project;
	project.AddForm("First", "");
	project.AddForm("Second", "");
	EXPECT_EQ(MainFormIn(GeneratedText(project, "MyApp.cpp")), "Second");
}


TEST(CodeGeneratorTest, WhenTheLastItemIsNoFormTheFirstIsTheMainForm)
{
	SampleProject project;
	project.AddForm("First", "");
	project.AddForm("Second", "");
	TSampleControl other("TButton", "Other", 0, 0, 1, 1);
	project.App().AddComponent(&other);
	EXPECT_EQ(MainFormIn(GeneratedText(project, "MyApp.cpp")), "First");
}


TEST(CodeGeneratorTest, WhenNeitherEndIsAFormThereIsNoMainForm)
{
	SampleProject project;
	TSampleControl first("TButton", "Other", 0, 0, 1, 1);
	TSampleControl last("TButton", "Other2", 0, 0, 1, 1);
	project.App().AddComponent(&first);
	project.AddForm("Form1", "");
	project.App().AddComponent(&last);
	EXPECT_EQ(MainFormIn(GeneratedText(project, "MyApp.cpp")), "none");
}


TEST(CodeGeneratorTest, AnotherMainFormRewritesTheConstructorAndNoHandler)
{
	SampleProject project;
	TDesignForm* first = project.AddForm("First", "");
	TDesignForm* second = project.AddForm("Second", "");
	first->SetAsMainForm(true);
	project.App().SetEventSelection("OnQuitRequested", true);
	const std::string edited = Replaced(
		GeneratedText(project, "MyApp.cpp"), "  bool result;\n", "  bool result = true;\n");
	first->SetAsMainForm(false);
	second->SetAsMainForm(true);
	ExpectText(Replaced(edited, "new TFirst()", "new TSecond()") + "\n",
		Regenerated(project, "MyApp.cpp", edited), "MyApp.cpp");
}


TEST(CodeGeneratorTest, RenamingTheApplicationWritesNewFilesAndLeavesTheOld)
{
	SampleProject project;
	TestFolder folder;
	Generate(project, folder.Path());
	project.App().SetComponentName("Other");
	Generate(project, folder.Path());
	EXPECT_EQ(EntryNames(folder.Path()), "MyApp.cpp MyApp.h Other.cpp Other.h");
}


TEST(CodeGeneratorTest, AddingAFormAddsItsInclude)
{
	SampleProject project;
	project.AddForm("Form1", "");
	TestFolder folder;
	Generate(project, folder.Path());
	project.AddForm("Form2", "");
	Generate(project, folder.Path());
	EXPECT_TRUE(
		Has(ReadText(folder.At("MyApp.h")), "#include \"Form1.h\"\n#include \"Form2.h\"\n"));
}


TEST(CodeGeneratorTest, TracesThePrototypesOfTheApplication)
{
	const auto project = SampleProject::MakeFull();
	testing::internal::CaptureStdout();
	GeneratedText(*project, "MyApp.h");
	EXPECT_TRUE(Has(testing::internal::GetCapturedStdout(),
		"EmitEventhandlerPrototype: $TABvirtual bool QuitRequested(void);\n\n"
		"EmitEventhandlerPrototype: $TABvirtual bool QuitRequested(void);\n"
		"$TABvirtual void RefsReceived(BMessage *message);\n\n"));
}


TEST(CodeGeneratorTest, ALineTooLongIsCutAndTheWholeFileKeptBeside)
{
	const auto project = SampleProject::MakeFull();
	TestFolder folder;
	const std::string source = "// " + std::string(1500, 'x') + "\nvoid TForm1::FormCreate() {}\n";
	WriteText(folder.At("Form1.cpp"), source);
	Generate(*project, folder.Path());
	const std::string result = ReadText(folder.At("Form1.cpp"));
	EXPECT_EQ(result.find("// " + std::string(1020, 'x') + "\nvoid TForm1::MessageReceived"), 0u);
	EXPECT_TRUE(Has(result, "void TForm1::FormCreate(void)\n"));
	EXPECT_EQ(ReadText(folder.At("Form1.cpp~")), source);
}


TEST(CodeGeneratorTest, DamagedOldFilesAreKeptAsFarAsTheyGo)
{
	const auto project = SampleProject::MakeFull();
	EXPECT_EQ(Regenerated(*project, "Form1.h", ""), "\n");
	const std::string header = GoldenText("new/Form1.h");
	const std::string half = header.substr(0, header.find("*CheckBox1;"));
	ExpectText(half + "\n", Regenerated(*project, "Form1.h", half), "Form1.h");
}


TEST(CodeGeneratorTest, FilesWithCarriageReturnsStayStable)
{
	const auto project = SampleProject::MakeFull();
	std::string header = GoldenText("new/Form1.h");
	for (size_t at = 0; (at = header.find('\n', at)) != std::string::npos; at += 2)
		header.insert(at, "\r");
	const std::string once = Regenerated(*project, "Form1.h", header);
	EXPECT_TRUE(Has(once,
		"// [FORM_COMPONENTS]\r"
		"  TButton<TForm1> *Button1;\n"));
	EXPECT_EQ(Regenerated(*project, "Form1.h", once), once + "\n");
}


TEST(CodeGeneratorTest, AFileThatCannotBeReadIsLeftAlone)
{
	const auto project = SampleProject::MakeFull();
	TestFolder folder;
	std::filesystem::create_directory(folder.At("Form1.cpp"));
	TCodeGenerator generator;
	generator.SetAppComponent(&project->App());
	generator.SetGenerationPath(folder.Path().c_str());
	EXPECT_TRUE(
		generator.GenerateFormSource(dynamic_cast<TDesignForm*>(project->App().ComponentAt(0))));
	ASSERT_EQ(generator.Writer().Files().size(), 1u);
	EXPECT_EQ(generator.Writer().Files()[0].outcome, GENERATED_UNREADABLE);
	EXPECT_TRUE(std::filesystem::is_directory(folder.At("Form1.cpp")));
}


TEST(CodeGeneratorTest, AnUnwritableFolderChangesNothingAndCountsAsDone)
{
	const auto project = SampleProject::MakeFull();
	TestFolder folder;
	TCodeGenerator generator;
	generator.SetAppComponent(&project->App());
	generator.SetGenerationPath(folder.At("missing").c_str());
	TDesignForm* form = dynamic_cast<TDesignForm*>(project->App().ComponentAt(0));
	EXPECT_TRUE(generator.GenerateForm(form));
	EXPECT_TRUE(generator.GenerateAppHeader());
	EXPECT_TRUE(generator.GenerateAppSource());
	EXPECT_EQ(generator.Writer().Files().size(), 5u);
	for (const generated_file& file : generator.Writer().Files())
		EXPECT_EQ(file.outcome, GENERATED_UNWRITABLE) << file.path.String();
	EXPECT_EQ(EntryNames(folder.Path()), "");
}


TEST(CodeGeneratorTest, GenerateAppCreatesItsFolderAndIsAlwaysFalse)
{
	SampleProject project;
	TestFolder folder;
	TCodeGenerator generator;
	generator.SetAppComponent(&project.App());
	generator.SetGenerationPath(folder.At("new").c_str());
	EXPECT_FALSE(generator.GenerateApp());
	EXPECT_EQ(EntryNames(folder.At("new")), "MyApp.cpp MyApp.h");
}


TEST(CodeGeneratorTest, AFolderThatCannotBeCreatedIsToldAndNothingGenerated)
{
	SampleProject project;
	TestFolder folder;
	TCodeGenerator generator;
	generator.SetAppComponent(&project.App());
	const std::string path = folder.At("missing/new");
	generator.SetGenerationPath(path.c_str());
	const message_box_hook previous = SetMessageBoxHook(NoteBox);
	EXPECT_FALSE(generator.GenerateApp());
	SetMessageBoxHook(previous);
	EXPECT_EQ(sBoxText, "Error|Unable to create directory " + path + ".|OK");
	EXPECT_EQ(generator.Writer().Files().size(), 0u);
}


TEST(CodeGeneratorTest, ItemsThatAreNoFormsAreNotGenerated)
{
	SampleProject project;
	TSampleControl other("TButton", "Other", 0, 0, 1, 1);
	project.App().AddComponent(&other);
	TestFolder folder;
	Generate(project, folder.Path());
	EXPECT_EQ(EntryNames(folder.Path()), "MyApp.cpp MyApp.h");
	EXPECT_FALSE(Has(ReadText(folder.At("MyApp.h")), "Other"));
}


TEST(CodeGeneratorTest, StartsWithoutApplicationAndPath)
{
	TCodeGenerator generator;
	EXPECT_EQ(generator.AppComponent(), nullptr);
	EXPECT_STREQ(generator.GenerationPath(), "");
	EXPECT_FALSE(generator.GenerateApp());
}


TEST(CodeGeneratorTest, TakesItsPathFromTheApplicationOnce)
{
	SampleProject project;
	SetText(&project.App(), "GenerationPath", "/first");
	TCodeGenerator generator;
	generator.SetAppComponent(&project.App());
	EXPECT_STREQ(generator.GenerationPath(), "/first");
	SetText(&project.App(), "GenerationPath", "/second");
	EXPECT_STREQ(generator.GenerationPath(), "/first");
	generator.SetAppComponent(nullptr);
	EXPECT_EQ(generator.AppComponent(), nullptr);
	EXPECT_STREQ(generator.GenerationPath(), "/first");
}


TEST(CodeGeneratorTest, CutsAPathTooLongForIt)
{
	TCodeGenerator generator;
	generator.SetGenerationPath(std::string(400, 'p').c_str());
	EXPECT_EQ(generator.GenerationPath(), std::string(255, 'p'));
}


TEST(CodeGeneratorTest, FactoriesMakeEmittersForTheirSubject)
{
	SampleProject project;
	TDesignForm* form = project.AddForm("Form1", "");
	TCodeGenerator generator;
	const std::unique_ptr<TFormHeaderEmitter> header(generator.FormHeaderEmitter(form));
	const std::unique_ptr<TFormSourceEmitter> source(generator.FormSourceEmitter(form));
	const std::unique_ptr<TAppHeaderEmitter> appHeader(generator.AppHeaderEmitter(&project.App()));
	const std::unique_ptr<TAppSourceEmitter> appSource(generator.AppSourceEmitter(&project.App()));
	const std::unique_ptr<TProjectEmitter> projectEmitter(generator.ProjectEmitter(&project.App()));
	EXPECT_EQ(header->Form(), form);
	EXPECT_EQ(source->Form(), form);
	EXPECT_EQ(appHeader->App(), &project.App());
	EXPECT_EQ(appSource->App(), &project.App());
	EXPECT_FALSE(header->FileExists());
	EXPECT_EQ(header->FileText(), "");
	ASSERT_NE(projectEmitter, nullptr);
	projectEmitter->EmitProject();
}


TEST(CodeGeneratorTest, WithoutAnEmitterNoFileIsWrittenAndTheStepSucceeds)
{
	class NoEmitters : public TCodeGenerator {
	public:
		TFormHeaderEmitter* FormHeaderEmitter(TDesignForm*) override { return nullptr; }
		TFormSourceEmitter* FormSourceEmitter(TDesignForm*) override { return nullptr; }
		TAppHeaderEmitter* AppHeaderEmitter(TAppComponent*) override { return nullptr; }
		TAppSourceEmitter* AppSourceEmitter(TAppComponent*) override { return nullptr; }
	};

	SampleProject project;
	TDesignForm* form = project.AddForm("Form1", "");
	TestFolder folder;
	NoEmitters generator;
	generator.SetAppComponent(&project.App());
	generator.SetGenerationPath(folder.Path().c_str());
	EXPECT_TRUE(generator.GenerateForm(form));
	EXPECT_TRUE(generator.GenerateAppHeader());
	EXPECT_TRUE(generator.GenerateAppSource());
	EXPECT_EQ(EntryNames(folder.Path()), "");
}


TEST(CodeGeneratorTest, DerivedEmittersChangeTheTextAndMayKeepUserSections)
{
	class DialectHeader : public TFormHeaderEmitter {
	public:
		void EmitComponentDecl(TComponent* component, BString& text) override
		{
			text << "$TABWidget " << component->ComponentName() << ";\n";
		}
		void EmitTopViewClass(BString& text) override { text << "unused"; }
		void EmitHeaderEnd(BString& text) override
		{
			BString section;
			EmitUserSection("MINE", section);
			text << "// appended:\n" << section;
			TFormHeaderEmitter::EmitHeaderEnd(text);
		}
	};
	class Dialect : public TCodeGenerator {
	public:
		TFormHeaderEmitter* FormHeaderEmitter(TDesignForm*) override { return new DialectHeader; }
	};

	const auto project = SampleProject::MakeFull();
	TestFolder folder;
	Dialect generator;
	generator.SetAppComponent(&project->App());
	generator.SetGenerationPath(folder.Path().c_str());
	TDesignForm* form = dynamic_cast<TDesignForm*>(project->App().ComponentAt(0));
	generator.GenerateFormHeader(form);
	const std::string text = ReadText(folder.At("Form1.h"));
	EXPECT_TRUE(Has(text, "// [FORM_COMPONENTS]\n  Widget Button1;\n"));
	EXPECT_TRUE(Has(text, "// appended:\n// [MINE]\n// [END_MINE]\n\n// [FORM_HEADER_BOTTOM]\n"));

	WriteText(folder.At("Form1.h"), Replaced(text, "// [MINE]\n", "// [MINE]\n  kept;\n"));
	generator.GenerateFormHeader(form);
	EXPECT_TRUE(
		Has(ReadText(folder.At("Form1.h")), "// appended:\n// [MINE]\n  kept;\n// [END_MINE]\n\n"));
}
