// SPDX-License-Identifier: MIT

#include "codegen/ConfirmGenerateWin.h"

#include <filesystem>

#include <gtest/gtest.h>

#include <Application.h>
#include <Autolock.h>
#include <Button.h>
#include <ListView.h>
#include <StringItem.h>
#include <TextControl.h>
#include <TextView.h>

#include "app/Dialogs.h"
#include "app/Preferences.h"
#include "codegen/CodeGenerator.h"
#include "codegen/Dialect.h"
#include "model/AppComponent.h"
#include "model/Property.h"
#include "project/Project.h"
#include "support/Printers.h"
#include "support/Robot.h"
#include "support/TemporaryFolder.h"

extern "C" int32 be_count_lock_violations();

namespace {

constexpr const char* kTitle = "Generate Source files";

std::string sBox;


int32
NoteBox(const char* title, const char* text, const char* button)
{
	sBox += std::string(title) + "|" + text + "|" + button;
	return 0;
}

} // namespace

class ConfirmGenerateWinTest : public testing::Test {
protected:
	ConfirmGenerateWinTest()
	{
		sBox.clear();
		SetMessageBoxHook(NoteBox);
		fProject.NewProject(true);
		SetValue("GenerationPath", (fFolder / "generated").c_str());
		SetValue("Signature", "application/x-vnd.Sample");
	}

	~ConfirmGenerateWinTest()
	{
		SetMessageBoxHook(nullptr);
		EXPECT_EQ(be_count_lock_violations(), 0);
	}

	void SetValue(const char* property, const char* value)
	{
		fProject.App()->FindProperty(property)->SetValue(value);
		fProject.App()->SetPropertyValue(property, value);
	}

	void OpenDialog()
	{
		fGenerator.SetAppComponent(fProject.App());
		EXPECT_TRUE(fGenerator.ConfirmSettings());
		ASSERT_TRUE(fRobot.WaitForWindow(kTitle));
	}

	bool WasGenerated(const std::string& name) const
	{
		return std::filesystem::exists(fFolder / ("generated/" + name));
	}

	BApplication fApplication{"application/x-vnd.Plimworks-ConfirmGenerateWinTest"};
	TemporaryFolder fFolder;
	TProject fProject{FORM_SHOWN};
	TCodeGenerator fGenerator;
	Robot fRobot;
};


TEST_F(ConfirmGenerateWinTest, ShowsTheSettingsAndTheForms)
{
	fProject.NewForm();
	OpenDialog();
	EXPECT_EQ(fRobot.Text("efName"), "Application");
	EXPECT_EQ(fRobot.Text("efClass"), "TMyApplication");
	EXPECT_EQ(fRobot.Text("efSig"), "application/x-vnd.Sample");
	EXPECT_EQ(fRobot.Text("efGenPath"), fFolder / "generated");
	EXPECT_EQ(fRobot.Text("efAppType"), fProject.App()->FindProperty("LaunchFlags")->Value());

	BLooper* looper;
	fRobot.Window().Target(&looper);
	BWindow* dialog = dynamic_cast<BWindow*>(looper);
	ASSERT_NE(dialog, nullptr);
	{
		BAutolock lock(dialog);
		EXPECT_EQ(dialog->Feel(), B_MODAL_APP_WINDOW_FEEL);
		EXPECT_EQ(dialog->FindView("btnOK")->Frame(), BRect(5, 263, 75, 288));
		EXPECT_EQ(dialog->FindView("btnCancel")->Frame(), BRect(85, 263, 155, 288));
		EXPECT_NE(dialog->FindView("svFormList"), nullptr);
		BTextView* name = dynamic_cast<BTextControl*>(dialog->FindView("efName"))->TextView();
		EXPECT_FALSE(name->IsEditable());
		EXPECT_FALSE(name->IsSelectable());
		BListView* forms = dynamic_cast<BListView*>(dialog->FindView("lvForms"));
		ASSERT_EQ(forms->CountItems(), 2);
		EXPECT_STREQ(static_cast<BStringItem*>(forms->ItemAt(0))->Text(), "Form1 ('Form')");
		EXPECT_STREQ(static_cast<BStringItem*>(forms->ItemAt(1))->Text(), "Form2 ('Form')");
		EXPECT_EQ(forms->ListType(), B_SINGLE_SELECTION_LIST);
	}
	EXPECT_TRUE(fRobot.ClickView("Cancel"));
	EXPECT_TRUE(fRobot.WaitForNoWindow(kTitle));
}


TEST_F(ConfirmGenerateWinTest, CancelWritesNothing)
{
	OpenDialog();
	EXPECT_TRUE(fGenerator.IsConfirming());
	EXPECT_TRUE(fRobot.ClickView("btnCancel"));
	EXPECT_TRUE(fRobot.WaitForNoWindow(kTitle));
	EXPECT_FALSE(std::filesystem::exists(fFolder / "generated"));
	EXPECT_FALSE(fGenerator.IsConfirming());
}


TEST_F(ConfirmGenerateWinTest, GenerateWritesTheFormsAndTheApplicationAndCloses)
{
	OpenDialog();
	EXPECT_TRUE(fRobot.ClickView("btnOK"));
	EXPECT_TRUE(fRobot.WaitForNoWindow(kTitle));
	for (const char* name :
		{"Form1.h", "Form1.cpp", "Form1.fcp", "Application.h", "Application.cpp"})
		EXPECT_TRUE(WasGenerated(name)) << name;
	EXPECT_EQ(sBox, "");
}


TEST_F(ConfirmGenerateWinTest, AnApplicationWithoutFormsHasAnEmptyListAndIsGenerated)
{
	fProject.NewProject(false);
	SetValue("GenerationPath", (fFolder / "generated").c_str());
	OpenDialog();
	BLooper* looper;
	fRobot.Window().Target(&looper);
	{
		BAutolock lock(looper);
		BWindow* dialog = dynamic_cast<BWindow*>(looper);
		EXPECT_EQ(dynamic_cast<BListView*>(dialog->FindView("lvForms"))->CountItems(), 0);
	}
	EXPECT_TRUE(fRobot.ClickView("Generate"));
	EXPECT_TRUE(fRobot.WaitForNoWindow(kTitle));
	EXPECT_TRUE(WasGenerated("Application.h"));
	EXPECT_TRUE(WasGenerated("Application.cpp"));
}


TEST_F(ConfirmGenerateWinTest, LaterEditsAreNotShownButGeneratedExceptForTheFolder)
{
	OpenDialog();
	SetValue("Signature", "application/x-vnd.Later");
	SetValue("GenerationPath", (fFolder / "elsewhere").c_str());
	EXPECT_EQ(fRobot.Text("efSig"), "application/x-vnd.Sample");
	EXPECT_EQ(fRobot.Text("efGenPath"), fFolder / "generated");

	EXPECT_TRUE(fRobot.ClickView("Generate"));
	EXPECT_TRUE(fRobot.WaitForNoWindow(kTitle));
	EXPECT_FALSE(std::filesystem::exists(fFolder / "elsewhere"));
	const std::string sources =
		fFolder.Read("generated/Application.h") + fFolder.Read("generated/Application.cpp");
	EXPECT_NE(sources.find("application/x-vnd.Later"), std::string::npos);
	EXPECT_EQ(sources.find("application/x-vnd.Sample"), std::string::npos);
}


TEST_F(ConfirmGenerateWinTest, AFolderThatCannotBeMadeIsToldAndTheDialogCloses)
{
	fFolder.Write("file");
	const std::string path = fFolder / "file/generated";
	SetValue("GenerationPath", path.c_str());
	OpenDialog();
	EXPECT_TRUE(fRobot.ClickView("Generate"));
	EXPECT_TRUE(fRobot.WaitForNoWindow(kTitle));
	EXPECT_EQ(sBox, "Error|Unable to create directory " + path + ".|OK");
}


TEST_F(ConfirmGenerateWinTest, WithoutAnApplicationABoxTellsAndNothingIsShown)
{
	fGenerator.SetAppComponent(nullptr);
	EXPECT_TRUE(fGenerator.ConfirmSettings());
	EXPECT_EQ(sBox, "Error|Error: No App component specified!|OK");
	EXPECT_FALSE(fGenerator.IsConfirming());
	EXPECT_EQ(be_app->CountWindows(), 1);
}


TEST_F(ConfirmGenerateWinTest, TheDialectIsChosenInTheDialogAndKept)
{
	TCodeGenerator& generator = *Generator();
	generator.SetAppComponent(fProject.App());
	ASSERT_EQ(PreferredDialect(), DIALECT_CLASSIC);
	EXPECT_TRUE(generator.ConfirmSettings());
	ASSERT_TRUE(fRobot.WaitForWindow(kTitle));
	EXPECT_EQ(fRobot.Value("cbStandard"), 0);
	EXPECT_TRUE(fRobot.ClickView("Standard C++"));
	EXPECT_TRUE(fRobot.ClickView("Generate"));
	EXPECT_TRUE(fRobot.WaitForNoWindow(kTitle));
	const std::string path = "generated/Application.cpp";
	EXPECT_NE(fFolder.Read(path).find(", m_MainForm(nullptr)\n"), std::string::npos);

	EXPECT_TRUE(generator.ConfirmSettings());
	ASSERT_TRUE(fRobot.WaitForWindow(kTitle));
	EXPECT_EQ(fRobot.Value("cbStandard"), 1);
	EXPECT_TRUE(fRobot.ClickView("cbStandard"));
	EXPECT_TRUE(fRobot.ClickView("Cancel"));
	EXPECT_TRUE(fRobot.WaitForNoWindow(kTitle));
	EXPECT_EQ(PreferredDialect(), DIALECT_CLASSIC);
	generator.GenerateApp();
	EXPECT_EQ(fFolder.Read(path).find("nullptr"), std::string::npos);
	AppSettings.RemoveName("Dialect");
	generator.SetAppComponent(nullptr);
}
