// SPDX-License-Identifier: MIT
// Saving a project on a disk that fails, is full, or when the program is killed; and when somebody else saves, too.

#include <algorithm>
#include <cerrno>
#include <filesystem>
#include <fstream>
#include <iterator>

#include "app/Dialogs.h"
#include "designer/DesignerTest.h"
#include "model/AppComponent.h"
#include "project/Project.h"
#include "support/CapturedOutput.h"
#include "support/FaultyDisk.h"

namespace {

constexpr int kMostCalls = 300;

std::vector<std::string> sBoxes;
int32 sAnswer;


int32
NoteBox(const char* title, const char* text, const char* button)
{
	sBoxes.push_back(std::string(title) + "|" + text + "|" + button);
	return sAnswer;
}


std::string
Content(const std::string& path)
{
	std::ifstream file(path, std::ios::binary);
	return std::string(std::istreambuf_iterator<char>(file), {});
}


/// A project of two forms in files, "one.frm" and "two.frm".
class ProjectFaultsTest : public DesignerTest {
protected:
	ProjectFaultsTest()
		: fDocuments(fFolder.Make("documents")),
		  fPath(fDocuments + "/test.plim"),
		  fFiles{fPath, fDocuments + "/one.frm", fDocuments + "/two.frm"},
		  fProject(FORM_HIDDEN)
	{
		sBoxes.clear();
		sAnswer = 0;
		SetMessageBoxHook(NoteBox);
		CapturedOutput output;
		for (int i : {1, 2})
			fProject.NewForm()->SetFilename(fFiles[i].c_str());
		fProject.SetMainForm(fProject.FormAt(0));
		EXPECT_TRUE(fProject.SaveToFile(fPath.c_str(), true));
		for (const std::string& file : fFiles)
			fOld.push_back(Content(file));
	}

	~ProjectFaultsTest() { SetMessageBoxHook(nullptr); }

	/// Makes everything in the project longer than it was.
	void Change(TProject& project)
	{
		CapturedOutput output;
		project.App()->SetPropertyValue("Signature", "application/x-vnd.a-longer-signature");
		for (int i : {0, 1})
			project.FormAt(i)->SetPropertyValue("Title", "A longer title than it had");
	}

	bool Save(TProject& project)
	{
		CapturedOutput output;
		return project.SaveToFile(fPath.c_str(), true);
	}

	void PutBack()
	{
		for (size_t i = 0; i < fFiles.size(); i++)
			std::ofstream(fFiles[i], std::ios::binary) << fOld[i];
	}

	size_t CountEntries() const
	{
		const std::filesystem::directory_iterator entries(fDocuments);
		return std::distance(begin(entries), end(entries));
	}

	const std::string fDocuments;
	const std::string fPath;
	const std::vector<std::string> fFiles;
	TProject fProject;
	std::vector<std::string> fOld;
};

} // namespace


TEST_F(ProjectFaultsTest, WhicheverCallFailsNothingIsLostAndTheUserIsTold)
{
	Change(fProject);
	// A save that works tells what the new files are.
	ASSERT_TRUE(Save(fProject));
	std::vector<std::string> changed;
	for (const std::string& file : fFiles)
		changed.push_back(Content(file));
	ASSERT_NE(changed[0], fOld[0]);

	int failures = 0;
	for (disk_fault fault : {DISK_CALL_FAILS, DISK_STAYS_FULL, DISK_WRITES_HALF}) {
		// A document is a document: the form's own tests try the other faults at every call.
		const int step = fault == DISK_CALL_FAILS ? 1 : 3;
		int call = 1;
		for (; call < kMostCalls; call += step) {
			PutBack();
			sBoxes.clear();
			sAnswer = 1; // Others have put the files back: overwrite them.
			CapturedOutput output;
			for (int i : {0, 1})
				fProject.FormAt(i)->View()->SetModified(true);
			fProject.App()->SetModified(true);
			bool wasReached;
			bool saved;
			{
				FaultyDisk disk(call, fault, ENOSPC);
				saved = fProject.SaveToFile(fPath.c_str(), true);
				wasReached = disk.WasReached();
			}
			SCOPED_TRACE("fault " + std::to_string(fault) + " at call " + std::to_string(call));
			EXPECT_TRUE(Content(fPath) == (saved ? changed[0] : fOld[0]));
			EXPECT_EQ(fProject.App()->Modified(), !saved);
			size_t unsaved = 0;
			for (int i : {1, 2}) {
				const bool isModified = fProject.FormAt(i - 1)->Modified();
				EXPECT_TRUE(Content(fFiles[i]) == (isModified ? fOld[i] : changed[i]));
				unsaved += isModified ? 1 : 0;
			}
			const size_t told = std::count(
				sBoxes.begin(), sBoxes.end(), std::string("Warning|Unable to save the form.|OK"));
			EXPECT_EQ(told, unsaved);
			EXPECT_EQ(fProject.HasUnsavedForms(), unsaved > 0);
			EXPECT_EQ(CountEntries(), 3u);
			if (!wasReached) {
				EXPECT_TRUE(saved);
				EXPECT_EQ(unsaved, 0u);
				break;
			}
			failures += saved && unsaved == 0 ? 0 : 1;
		}
		EXPECT_LT(call, kMostCalls);
	}
	EXPECT_GT(failures, 20);
}


TEST_F(ProjectFaultsTest, KilledBeforeAnyCallEveryDocumentIsTheOldOrTheNewOne)
{
	Change(fProject);
	sAnswer = 1;
	std::vector<std::vector<std::string>> seen(fFiles.size());
	int call = 1;
	for (; call < kMostCalls; call++) {
		PutBack();
		CapturedOutput output;
		const bool wasKilled =
			IsKilledAt(call, [this] { fProject.SaveToFile(fPath.c_str(), true); });
		for (size_t i = 0; i < fFiles.size(); i++) {
			const std::string content = Content(fFiles[i]);
			if (content != fOld[i])
				seen[i].push_back(content);
		}
		TProject again(FORM_HIDDEN);
		EXPECT_TRUE(again.LoadFromFile(fPath.c_str())) << "call " << call;
		EXPECT_EQ(again.CountForms(), 2) << "call " << call;
		EXPECT_TRUE(again.IsMainForm(again.FormAt(0))) << "call " << call;
		EXPECT_LE(CountEntries(), 4u) << "call " << call;
		if (!wasKilled)
			break;
	}
	EXPECT_LT(call, kMostCalls);
	for (const std::vector<std::string>& contents : seen) {
		ASSERT_FALSE(contents.empty());
		for (const std::string& content : contents)
			EXPECT_TRUE(content == contents.back());
	}
	EXPECT_TRUE(Save(fProject));
	EXPECT_EQ(CountEntries(), 3u);
}


TEST_F(ProjectFaultsTest, TheSecondOfTwoDesignersIsAskedBeforeItOverwrites)
{
	TProject other(FORM_HIDDEN);
	{
		CapturedOutput output;
		ASSERT_TRUE(other.LoadFromFile(fPath.c_str()));
	}
	Change(other);
	ASSERT_TRUE(Save(other));
	EXPECT_TRUE(sBoxes.empty());
	std::vector<std::string> others;
	for (const std::string& file : fFiles)
		others.push_back(Content(file));

	// The first box is about the project's file: nothing is saved when that is to stay.
	for (int i : {0, 1})
		fProject.FormAt(i)->View()->SetModified(true);
	sAnswer = 0;
	EXPECT_FALSE(Save(fProject));
	EXPECT_EQ(fProject.OpenStatus(), B_CANCELED);
	ASSERT_EQ(sBoxes.size(), 1u);
	EXPECT_EQ(sBoxes[0],
		"Warning|Another program has changed the project file '" + fPath
			+ "' since it was opened or saved here. Overwriting it loses those changes.|Cancel");
	for (size_t i = 0; i < fFiles.size(); i++)
		EXPECT_TRUE(Content(fFiles[i]) == others[i]);
	EXPECT_TRUE(fProject.HasUnsavedForms());

	// Then one for each form.
	sBoxes.clear();
	sAnswer = 1;
	EXPECT_TRUE(Save(fProject));
	ASSERT_EQ(sBoxes.size(), 3u);
	EXPECT_EQ(sBoxes[1],
		"Warning|Another program has changed the file '" + fFiles[1]
			+ "' since the form 'Form1' was opened or saved here. Overwriting it loses those "
			  "changes.|Cancel");
	for (size_t i = 0; i < fFiles.size(); i++)
		EXPECT_FALSE(Content(fFiles[i]) == others[i]);

	// From here on it is the other one that would overwrite.
	sBoxes.clear();
	EXPECT_TRUE(Save(fProject));
	EXPECT_TRUE(sBoxes.empty());
	sAnswer = 0;
	EXPECT_FALSE(Save(other));
	EXPECT_EQ(sBoxes.size(), 1u);
}


TEST_F(ProjectFaultsTest, AFormThatIsNotToBeOverwrittenStaysModifiedAndInTheProject)
{
	std::ofstream(fFiles[1], std::ios::binary | std::ios::app) << "somebody else's";
	const std::string others = Content(fFiles[1]);
	Change(fProject);
	EXPECT_TRUE(Save(fProject));
	// No further box tells that it was not saved.
	EXPECT_EQ(sBoxes.size(), 1u);
	EXPECT_TRUE(Content(fFiles[1]) == others);
	EXPECT_TRUE(fProject.FormAt(0)->Modified());
	EXPECT_FALSE(fProject.FormAt(1)->Modified());
	TProject again(FORM_HIDDEN);
	CapturedOutput output;
	EXPECT_TRUE(again.LoadFromFile(fPath.c_str()));
	EXPECT_EQ(again.CountForms(), 2);
}


TEST_F(ProjectFaultsTest, FilesThatAreTouchedGoneOrPutBackAreNotAskedAbout)
{
	for (const std::string& file : fFiles)
		std::filesystem::last_write_time(file, std::filesystem::file_time_type::clock::now());
	EXPECT_TRUE(Save(fProject));
	for (const std::string& file : fFiles)
		std::filesystem::remove(file);
	EXPECT_TRUE(Save(fProject));
	PutBack();
	EXPECT_TRUE(Save(fProject));
	// Saved to another place, where a file panel has asked.
	std::ofstream(fDocuments + "/other.plim") << "another project";
	CapturedOutput output;
	EXPECT_TRUE(fProject.SaveToFile((fDocuments + "/other.plim").c_str(), true));
	EXPECT_TRUE(sBoxes.empty());
}
