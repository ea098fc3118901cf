// SPDX-License-Identifier: MIT

#include "app/DesignerRun.h"

#include <mutex>
#include <thread>

#include "app/Dialogs.h"
#include "app/Preferences.h"

extern "C" int32 be_count_lock_violations();

namespace {

constexpr bigtime_t kLimit = 60 * 1000000;

std::mutex sLock;
std::vector<std::string> sBoxes;
int32 sAnswer;


int32
NoteBox(const char* title, const char* text, const char*)
{
	std::lock_guard<std::mutex> lock(sLock);
	sBoxes.push_back(std::string(title) + "|" + text);
	return sAnswer;
}

} // namespace


DesignerTest::DesignerTest()
{
	// Before the first look at them: each test has types of its own.
	setenv("XDG_DATA_HOME", fFolder.Make("data").c_str(), 1);
	AppSettings.LeaveFileAlone();
	AppSettings.MakeEmpty();
	sBoxes.clear();
	sAnswer = 0;
	SetMessageBoxHook(NoteBox);
}


DesignerTest::~DesignerTest()
{
	SetMessageBoxHook(nullptr);
	EXPECT_EQ(be_count_lock_violations(), 0);
}


void
DesignerTest::Run(const std::function<void()>& user)
{
	PlimApp app;
	std::thread thread([&user] {
		user();
		be_app_messenger.SendMessage(B_QUIT_REQUESTED);
	});
	app.Run();
	thread.join();
}


void
DesignerTest::Answer(int32 button)
{
	std::lock_guard<std::mutex> lock(sLock);
	sAnswer = button;
}


std::vector<std::string>
DesignerTest::Boxes()
{
	std::lock_guard<std::mutex> lock(sLock);
	return sBoxes;
}


void
DesignerTest::Tell(const BMessenger& target, BMessage* message)
{
	BMessage reply;
	EXPECT_EQ(target.SendMessage(message, &reply, kLimit, kLimit), B_OK);
}


void
DesignerTest::Tell(const BMessenger& target, uint32 what)
{
	BMessage message(what);
	Tell(target, &message);
}
