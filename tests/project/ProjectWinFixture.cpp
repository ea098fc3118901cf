// SPDX-License-Identifier: MIT

#include <deque>
#include <mutex>

#include <Application.h>
#include <MenuItem.h>
#include <OS.h>
#include <PopUpMenu.h>

#include "app/Dialogs.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "palette/LibraryLoader.h"
#include "palette/PaletteCatalog.h"
#include "project/Project.h"
#include "project/ProjectViewItem.h"
#include "project/ProjectWinTest.h"
#include "support/CapturedOutput.h"

extern "C" int32 be_count_lock_violations();

namespace {

std::mutex sLock;
std::deque<int32> sAnswers;
std::vector<std::string> sBoxes;


int32
AnswerBox(const char* title, const char* text, const char* button)
{
	std::lock_guard<std::mutex> lock(sLock);
	sBoxes.push_back(std::string(title) + "|" + text + "|" + button);
	if (sAnswers.empty())
		return 0;
	const int32 answer = sAnswers.front();
	sAnswers.pop_front();
	return answer;
}

} // namespace

void
ProjectWinTest::SetUpTestSuite()
{
	static BApplication sApplication("application/x-vnd.Plimworks-ProjectWinTest");
	if (PaletteCatalog().CountPalEntries() > 0)
		return;
	CapturedOutput output;
	TLibraryLoader(&PaletteCatalog()).LoadFolder(PLIM_BUILD_DIR "/bin/Components");
}


ProjectWinTest::ProjectWinTest()
	: fWindow(nullptr),
	  fViolationsBefore(be_count_lock_violations())
{
	std::lock_guard<std::mutex> lock(sLock);
	sBoxes.clear();
	sAnswers.clear();
}


ProjectWinTest::~ProjectWinTest()
{
	EXPECT_EQ(be_count_lock_violations(), fViolationsBefore);
}


void
ProjectWinTest::SetUp()
{
	SetMessageBoxHook(AnswerBox);
	fWindow = new ProjectWin;
	fMessenger = BMessenger(fWindow);
	fWindow->NewProject(true);
	fWindow->Show();
	Settle();
}


void
ProjectWinTest::TearDown()
{
	fWindow->OKToClose(true);
	if (fMessenger.LockTarget())
		fWindow->Quit();
	// A file panel goes by itself.
	EXPECT_TRUE(WaitFor([] { return be_app->CountWindows() == 0; }));
	SetMessageBoxHook(nullptr);
}


void
ProjectWinTest::Send(uint32 what)
{
	BMessage message(what);
	Send(&message);
}


void
ProjectWinTest::Send(BMessage* message)
{
	BMessage reply;
	ASSERT_EQ(fMessenger.SendMessage(message, &reply), B_OK);
	Settle();
}


void
ProjectWinTest::Settle()
{
	// A window that opens on a busy machine takes longer than the robot waits for it.
	EXPECT_TRUE(WaitFor([this] { return Robot(fWindow).Settle(); }));
}


std::vector<std::string>
ProjectWinTest::Rows()
{
	std::vector<std::string> rows;
	EXPECT_TRUE(fWindow->Lock());
	for (int32 i = 0; i < fWindow->View()->FullListCountItems(); i++)
		rows.push_back(fWindow->View()->RowAt(i)->Text());
	fWindow->Unlock();
	return rows;
}


void
ProjectWinTest::SelectRow(int32 index)
{
	ASSERT_TRUE(fWindow->Lock());
	fWindow->View()->Select(index);
	fWindow->Unlock();
	Settle();
}


TDesignForm*
ProjectWinTest::FormAt(int32 index)
{
	return fWindow->Project()->FormAt(index);
}


std::string
ProjectWinTest::WriteForm(const std::string& file, const char* name)
{
	TDesignForm* form = new TDesignForm(name, FORM_HIDDEN);
	EXPECT_TRUE(form->SaveToFile((fFolder / file).c_str()));
	form->Lock();
	form->Quit();
	return fFolder / file;
}


std::string
ProjectWinTest::WriteProject(const std::string& file, int32 forms)
{
	TProject project(FORM_HIDDEN);
	for (int32 i = 1; i <= forms; i++) {
		TDesignForm* form = project.NewForm();
		form->SetFilename((fFolder / ("form" + std::to_string(i) + ".frm")).c_str());
	}
	EXPECT_TRUE(project.SaveToFile((fFolder / file).c_str(), true));
	return fFolder / file;
}


void
ProjectWinTest::SaveNewProject(const std::string& file)
{
	fWindow->NewProject(true);
	Change(FormAt(0), [&] { FormAt(0)->SetFilename((fFolder / "Form1.frm").c_str()); });
	ASSERT_TRUE(fWindow->SaveToFile((fFolder / file).c_str(), true));
	Settle();
}


void
ProjectWinTest::Change(TDesignForm* form, const std::function<void()>& change)
{
	ASSERT_TRUE(form->Lock());
	change();
	form->Unlock();
	Settle();
}


bool
ProjectWinTest::IsEnabled(uint32 command)
{
	EXPECT_TRUE(fWindow->Lock());
	const bool enabled = fWindow->View()->Menu()->FindItem(command)->IsEnabled();
	fWindow->Unlock();
	return enabled;
}


bool
ProjectWinTest::IsMarked(uint32 command)
{
	EXPECT_TRUE(fWindow->Lock());
	const bool marked = fWindow->View()->Menu()->FindItem(command)->IsMarked();
	fWindow->Unlock();
	return marked;
}


void
ProjectWinTest::SetAnswers(std::vector<int32> answers)
{
	std::lock_guard<std::mutex> lock(sLock);
	sAnswers.assign(answers.begin(), answers.end());
}


std::vector<std::string>
ProjectWinTest::Boxes()
{
	std::lock_guard<std::mutex> lock(sLock);
	return sBoxes;
}


bool
ProjectWinTest::WaitFor(const std::function<bool()>& condition)
{
	const bigtime_t end = system_time() + 30 * 1000000;
	while (!condition()) {
		if (system_time() > end)
			return false;
		snooze(2000);
	}
	return true;
}
