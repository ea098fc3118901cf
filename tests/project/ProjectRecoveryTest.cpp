// SPDX-License-Identifier: MIT
// Recovery copies of a project's forms: when they are there, when they go, and how they come back.

#include <filesystem>
#include <optional>

#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "designer/LostWork.h"
#include "designer/Recovery.h"
#include "model/Property.h"
#include "palette/PaletteCatalog.h"
#include "project/Project.h"
#include "project/ProjectWinTest.h"
#include "props/PropertyEditor.h"

namespace {

/// A project window in a designer that keeps recovery copies.
class ProjectRecoveryTest : public ProjectWinTest {
protected:
	ProjectRecoveryTest()
		: fSettings("XDG_CONFIG_HOME", fFolder.Make("settings")),
		  fRecovery(std::in_place)
	{
	}

	void TearDown() override
	{
		ProjectWinTest::TearDown();
		fRecovery.reset();
	}

	/// How many copies there are, when all that are due are written.
	int CountCopies()
	{
		Settle();
		if (fRecovery)
			fRecovery->Flush();
		int count = 0;
		for (const auto& entry :
			std::filesystem::directory_iterator(fFolder / "settings/Plim_Recovery"))
			count += entry.path().extension() == ".copy" ? 1 : 0;
		return count;
	}

	/// What a person does in the property window.
	void SetTitle(int32 form, const char* title)
	{
		Change(FormAt(form),
			[&] { FormAt(form)->FindProperty("Title")->Editor()->SetValue(title, true); });
	}

	/// Adds a button to a form.
	void Place(int32 form, const char* name)
	{
		Change(FormAt(form), [&] {
			PaletteCatalog().SetDropEntry(PaletteCatalog().FindPalEntry("TButton"));
			TComponent* button =
				FormAt(form)->CreateComponent(FormAt(form)->View(), BRect(10, 10, 80, 40));
			FormAt(form)->DoneDroppingComponent();
			button->SetPropertyValue("Name", name);
		});
	}

	std::string Value(int32 form, const char* property)
	{
		std::string value;
		Change(FormAt(form), [&] { value = FormAt(form)->FindProperty(property)->Value(); });
		return value;
	}

	bool IsChanged(int32 form)
	{
		bool isChanged = false;
		Change(FormAt(form), [&] { isChanged = TProject::IsChanged(FormAt(form)); });
		return isChanged;
	}

	/// As if the program had been killed: the windows' project is another one, and nobody was asked.
	void Crash()
	{
		CountCopies();
		fRecovery.reset();
		fWindow->NewProject(true);
		Settle();
		fRecovery.emplace();
		ASSERT_EQ(fRecovery->InitCheck(), B_OK);
	}

	ScopedVariable fSettings;
	std::optional<TRecovery> fRecovery;
};

} // namespace


TEST_F(ProjectRecoveryTest, ACopyIsThereWhileAFormIsModified)
{
	fWindow->LoadFromFile(WriteProject("test.plim", 2).c_str());
	EXPECT_EQ(CountCopies(), 0);
	SetTitle(0, "Changed");
	EXPECT_EQ(CountCopies(), 1);
	Place(1, "Button1");
	EXPECT_EQ(CountCopies(), 2);
	// One more change makes no further file.
	SetTitle(0, "Changed again");
	EXPECT_EQ(CountCopies(), 2);
	ASSERT_TRUE(fWindow->SaveToFile(fWindow->Filename(), true));
	EXPECT_EQ(CountCopies(), 0);

	// An event that is ticked tells its component alone.
	Change(FormAt(1), [&] { FormAt(1)->ComponentAt(0)->SetModified(true); });
	EXPECT_EQ(CountCopies(), 1);
}


TEST_F(ProjectRecoveryTest, ACopyGoesWithTheUsersConsent)
{
	fWindow->LoadFromFile(WriteProject("test.plim", 2).c_str());
	SetTitle(0, "Changed");
	SetTitle(1, "Changed");
	EXPECT_EQ(CountCopies(), 2);
	SelectRow(1);
	SetAnswers({1});
	Send(4); // Remove From Project, without saving.
	EXPECT_EQ(CountCopies(), 1);
	SetAnswers({2});
	EXPECT_FALSE(fWindow->CloseProject());
	EXPECT_EQ(CountCopies(), 1);
	SetAnswers({1});
	EXPECT_TRUE(fWindow->CloseProject());
	EXPECT_EQ(CountCopies(), 0);
}


TEST_F(ProjectRecoveryTest, ACopyOutlivesAProjectThatIsReplacedWithoutAsking)
{
	const std::string path = WriteProject("test.plim", 1);
	fWindow->LoadFromFile(path.c_str());
	SetTitle(0, "First");
	fWindow->LoadFromFile(path.c_str());
	EXPECT_EQ(CountCopies(), 1);
	EXPECT_FALSE(IsChanged(0));
	SetTitle(0, "Second");
	EXPECT_EQ(CountCopies(), 2);

	Crash();
	std::optional<TLostWork> lost(std::in_place);
	ASSERT_EQ(lost->Projects().size(), 1u);
	fWindow->Project()->Recover(lost->Projects()[0]);
	EXPECT_EQ(Value(0, "Title"), "Second");
	// What the project was replaced over comes the next time.
	lost.reset();
	lost.emplace();
	ASSERT_EQ(lost->Projects().size(), 1u);
	fWindow->Project()->Recover(lost->Projects()[0]);
	EXPECT_EQ(Value(0, "Title"), "First");
}


TEST_F(ProjectRecoveryTest, TheLastGestureIsKeptWhenAFormIsClosedAtOnce)
{
	fWindow->LoadFromFile(WriteProject("test.plim", 1).c_str());
	// Its window's thread has no time to make the copy before it is told to close.
	ASSERT_TRUE(FormAt(0)->Lock());
	FormAt(0)->FindProperty("Title")->Editor()->SetValue("Changed", true);
	FormAt(0)->OKToClose(true);
	FormAt(0)->Unlock();
	fRecovery->Flush();
	EXPECT_EQ(CountCopies(), 1);
}


TEST_F(ProjectRecoveryTest, RecoveringPutsTheCopiesInThePlaceOfTheForms)
{
	const std::string path = WriteProject("test.plim", 3);
	fWindow->LoadFromFile(path.c_str());
	SetTitle(1, "Unsaved");
	Place(1, "Button7");
	Send(2); // New Form
	Place(3, "New");
	EXPECT_EQ(CountCopies(), 2);
	Crash();

	{
		TLostWork lost;
		ASSERT_EQ(lost.Projects().size(), 1u);
		EXPECT_STREQ(lost.Projects()[0].path.String(), path.c_str());
		fWindow->Project()->Recover(lost.Projects()[0]);
	}
	EXPECT_EQ(
		Rows(), (std::vector<std::string>{"Application", "Form1", "Form2", "Form3", "Form4"}));
	EXPECT_STREQ(fWindow->Filename(), path.c_str());
	EXPECT_EQ(Value(1, "Title"), "Unsaved");
	EXPECT_FALSE(IsChanged(0));
	EXPECT_TRUE(IsChanged(1));
	EXPECT_TRUE(IsChanged(3));
	EXPECT_EQ(FormAt(1)->Filename(), fFolder / "form2.frm");
	EXPECT_STREQ(FormAt(3)->Filename(), "");
	Change(FormAt(1), [&] {
		ASSERT_EQ(FormAt(1)->CountComponents(), 1);
		EXPECT_STREQ(FormAt(1)->ComponentAt(0)->ComponentName(), "Button7");
	});
	EXPECT_TRUE(fWindow->ProjectDirty());
	// They are this run's now, and go when they are saved. Nobody else has changed the files: no box asks.
	EXPECT_EQ(CountCopies(), 2);
	Change(FormAt(3), [&] { FormAt(3)->SetFilename((fFolder / "form4.frm").c_str()); });
	ASSERT_TRUE(fWindow->SaveToFile(fWindow->Filename(), true));
	EXPECT_EQ(CountCopies(), 0);
	EXPECT_EQ(Boxes(), std::vector<std::string>());
	EXPECT_TRUE(TLostWork().Projects().empty());
}


TEST_F(ProjectRecoveryTest, AFileThatChangedSinceIsNotOverwrittenUnasked)
{
	fWindow->LoadFromFile(WriteProject("test.plim", 1).c_str());
	SetTitle(0, "Mine");
	Crash();
	fFolder.Write("form1.frm", "somebody else's");
	{
		TLostWork lost;
		ASSERT_EQ(lost.Projects().size(), 1u);
		fWindow->Project()->Recover(lost.Projects()[0]);
	}
	EXPECT_EQ(Value(0, "Title"), "Mine");
	SetAnswers({0});
	ASSERT_TRUE(fWindow->SaveToFile(fWindow->Filename(), true));
	EXPECT_EQ(Boxes().size(), 1u);
	EXPECT_EQ(fFolder.Read("form1.frm"), "somebody else's");
	EXPECT_TRUE(IsChanged(0));
	EXPECT_EQ(CountCopies(), 1);
}


TEST_F(ProjectRecoveryTest, AProjectThatWasNeverSavedComesBackAsANewOne)
{
	Place(0, "Button1");
	Crash();
	{
		TLostWork lost;
		ASSERT_EQ(lost.Projects().size(), 1u);
		fWindow->Project()->Recover(lost.Projects()[0]);
	}
	EXPECT_EQ(Rows(), (std::vector<std::string>{"Application", "Form1"}));
	EXPECT_TRUE(fWindow->Project()->IsMainForm(FormAt(0)));
	EXPECT_TRUE(IsChanged(0));
	EXPECT_STREQ(fWindow->Filename(), "");
	EXPECT_EQ(CountCopies(), 1);
}
