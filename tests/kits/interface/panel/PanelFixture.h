// SPDX-License-Identifier: MIT
// What the tests of file panels share: a folder to choose in, a target that keeps what it is sent, and a robot.
#ifndef TESTS_PANEL_FIXTURE_H
#define TESTS_PANEL_FIXTURE_H

#include <atomic>
#include <chrono>
#include <condition_variable>
#include <future>
#include <memory>
#include <mutex>
#include <string>
#include <thread>
#include <vector>

#include <gtest/gtest.h>

#include <Application.h>
#include <Button.h>
#include <Entry.h>
#include <FilePanel.h>
#include <ListView.h>
#include <Looper.h>
#include <Path.h>
#include <StringItem.h>
#include <Window.h>

#include "../../storage/OrdinaryUser.h"
#include "support/Printers.h"
#include "support/Robot.h"
#include "support/TemporaryFolder.h"

/// Keeps the messages that it gets.
class PanelTarget : public BLooper {
public:
	void MessageReceived(BMessage* message) override
	{
		std::lock_guard<std::mutex> lock(fMutex);
		fMessages.push_back(*message);
		fCondition.notify_all();
	}

	/// The next message, waited for; one without a code when none comes in time.
	BMessage Next()
	{
		std::unique_lock<std::mutex> lock(fMutex);
		if (!fCondition.wait_for(
				lock, std::chrono::seconds(20), [&] { return !fMessages.empty(); }))
			return BMessage(static_cast<uint32>(0));
		const BMessage next = fMessages.front();
		fMessages.erase(fMessages.begin());
		return next;
	}

	size_t Count()
	{
		std::lock_guard<std::mutex> lock(fMutex);
		return fMessages.size();
	}

private:
	std::mutex fMutex;
	std::condition_variable fCondition;
	std::vector<BMessage> fMessages;
};


/// Counts its hooks.
class HookedPanel : public BFilePanel {
public:
	using BFilePanel::BFilePanel;

	void WasHidden() override { hidden++; }
	void SelectionChanged() override { selections++; }
	void SendMessage(const BMessenger* target, BMessage* message) override
	{
		sent++;
		BFilePanel::SendMessage(target, message);
	}

	std::atomic<int32> hidden{0};
	std::atomic<int32> selections{0};
	std::atomic<int32> sent{0};
};


class FilePanelTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		fTarget = new PanelTarget;
		fTarget->Run();
	}

	void TearDown() override
	{
		fPanel.reset();
		if (fTarget->Lock())
			fTarget->Quit();
	}

	/// A panel in the folder, titled "panel". Its target is fTarget.
	void Make(file_panel_mode mode, uint32 flavors = 0, bool multiple = true,
		BMessage* message = nullptr, BRefFilter* filter = nullptr)
	{
		entry_ref folder;
		ASSERT_EQ(get_ref_for_path(fFolder.Path().c_str(), &folder), B_OK);
		BMessenger target(fTarget);
		fPanel = std::make_unique<HookedPanel>(
			mode, &target, &folder, flavors, multiple, message, filter);
		Do([&] { fPanel->Window()->SetTitle("panel"); });
	}

	/// Shows it; the robot works on it when the folder is listed.
	void Show()
	{
		fPanel->Show();
		ASSERT_TRUE(fRobot.WaitForWindow("panel"));
		ASSERT_TRUE(fRobot.Settle());
	}

	void Open(uint32 flavors = 0, bool multiple = true)
	{
		Make(B_OPEN_PANEL, flavors, multiple);
		Show();
	}

	void Save(const char* name = "")
	{
		Make(B_SAVE_PANEL);
		fPanel->SetSaveText(name);
		Show();
	}

	/// Does something with the panel's window locked.
	template <typename Function>
	void Do(Function function)
	{
		ASSERT_TRUE(fPanel->Window()->Lock());
		function();
		fPanel->Window()->Unlock();
	}

	/// All keys wait by the time that the panel's window handles the first one.
	void TypeInOneGo(const std::string& text)
	{
		std::promise<void> held;
		std::thread holder([&] {
			const bool isLocked = fPanel->Window()->Lock();
			held.set_value();
			snooze(20'000);
			if (isLocked)
				fPanel->Window()->Unlock();
		});
		held.get_future().wait();
		fRobot.Type(text.c_str());
		holder.join();
	}

	/// Waits for a condition, with a limit.
	template <typename Condition>
	bool WaitUntil(Condition condition)
	{
		const bigtime_t end = system_time() + 20'000'000;
		while (!condition()) {
			if (system_time() > end)
				return false;
			snooze(5000);
		}
		return true;
	}

	typedef std::vector<std::string> List;

	/// The rows as they are shown; \a selected: only those.
	List Rows(bool selected = false)
	{
		List rows;
		if (!fPanel->Window()->Lock())
			return rows;
		BListView* list = dynamic_cast<BListView*>(fPanel->Window()->FindView("PoseView"));
		for (int32 i = 0; list != nullptr && i < list->CountItems(); i++) {
			if (!selected || list->IsItemSelected(i))
				rows.push_back(static_cast<BStringItem*>(list->ItemAt(i))->Text());
		}
		fPanel->Window()->Unlock();
		return rows;
	}

	List Selected() { return Rows(true); }

	bool WaitForRows(const List& rows)
	{
		return WaitUntil([&] { return Rows() == rows; });
	}

	bool CanChoose()
	{
		fRobot.Settle();
		bool enabled = false;
		Do([&] {
			enabled =
				dynamic_cast<BButton*>(fPanel->Window()->FindView("default button"))->IsEnabled();
		});
		return enabled;
	}

	/// The notice that is shown; then it is closed.
	std::string TakeNotice()
	{
		if (!fRobot.WaitForWindow("File panel"))
			return "";
		const std::string text = fRobot.Text("_tv_");
		fRobot.Key("escape");
		fRobot.WaitForNoWindow("File panel");
		fRobot.WaitForWindow("panel");
		return text;
	}

	static std::string PathOf(const BMessage& message, const char* field, int32 index = 0)
	{
		entry_ref ref;
		if (message.FindRef(field, index, &ref) != B_OK)
			return "";
		const BPath path(&ref);
		return path.InitCheck() == B_OK ? path.Path() : "";
	}

	std::string ShownFolder()
	{
		entry_ref ref;
		fPanel->GetPanelDirectory(&ref);
		const BPath path(&ref);
		return path.InitCheck() == B_OK ? path.Path() : "";
	}

	TemporaryFolder fFolder;
	TemporaryFolder fSettings;
	const ScopedVariable fConfig{"XDG_CONFIG_HOME", fSettings.Path()};
	BApplication fApplication{"application/x-vnd.plimworks-panel-test"};
	PanelTarget* fTarget = nullptr;
	std::unique_ptr<HookedPanel> fPanel;
	Robot fRobot;
};

#endif // TESTS_PANEL_FIXTURE_H
