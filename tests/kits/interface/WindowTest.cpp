// SPDX-License-Identifier: MIT
// Tests of BWindow: its life, frame, properties and the system's messages.
#include <Window.h>

#include <atomic>

#include <Button.h>
#include <OS.h>
#include <Screen.h>

#include "InterfaceFixture.h"
#include "display/HostWindow.h"
#include "interface/WindowPrivate.h"
#include "support/Printers.h"

namespace {

const uint32 kMsgTest = 'test';


// Writes down what its hooks get.
class HookWindow : public BWindow {
public:
	HookWindow(window_type type = B_TITLED_WINDOW, uint32 flags = 0)
		: BWindow(BRect(100, 100, 300, 200), "hooks", type, flags)
	{
	}

	~HookWindow() override
	{
		if (destroyed != nullptr)
			*destroyed = true;
	}

	void FrameMoved(BPoint where) override
	{
		EXPECT_EQ(Frame().LeftTop(), where);
		log.push_back("moved");
	}
	void FrameResized(float width, float height) override
	{
		EXPECT_EQ(Frame().Size(), BSize(width, height));
		log.push_back("resized");
	}
	void WindowActivated(bool active) override { log.push_back(active ? "active" : "inactive"); }
	void MenusBeginning() override { log.push_back("menus beginning"); }
	void MenusEnded() override { log.push_back("menus ended"); }
	void Zoom(BPoint origin, float width, float height) override
	{
		log.push_back("zoom");
		BWindow::Zoom(origin, width, height);
	}
	void Minimize(bool minimize) override
	{
		log.push_back(minimize ? "minimize" : "restore");
		BWindow::Minimize(minimize);
	}
	void ScreenChanged(BRect, color_space) override { log.push_back("screen"); }
	void WorkspacesChanged(uint32, uint32) override { log.push_back("workspaces"); }
	bool QuitRequested() override
	{
		log.push_back("quit requested");
		return mayQuit;
	}
	void MessageReceived(BMessage* message) override
	{
		if (message->what == kMsgTest) {
			EXPECT_TRUE(message->HasInt64("when"));
			EXPECT_TRUE(message->GetBool("shortcut", false));
			log.push_back("shortcut");
		} else if (message->what == B_KEY_DOWN)
			log.push_back("key");
		else
			BWindow::MessageReceived(message);
	}

	Log log;
	bool mayQuit = true;
	std::atomic<bool>* destroyed = nullptr;
};


class InputView : public BView {
public:
	InputView(const char* name, uint32 flags = B_NAVIGABLE, Log* log = nullptr)
		: BView(BRect(0, 0, 9, 9), name, B_FOLLOW_NONE, flags),
		  fLog(log)
	{
	}

	void KeyDown(const char* bytes, int32 numBytes) override
	{
		keys.append(bytes, numBytes);
		BView::KeyDown(bytes, numBytes);
	}
	void KeyUp(const char* bytes, int32 numBytes) override { released.append(bytes, numBytes); }
	void WindowActivated(bool) override
	{
		if (fLog != nullptr)
			fLog->push_back(std::string(Name()) + " activated");
	}
	void Pulse() override { pulses++; }

	std::string keys, released;
	std::atomic<int> pulses = 0;

private:
	Log* fLog;
};


BMessage
KeyMessage(char key, uint32 modifiers = 0, uint32 what = B_KEY_DOWN)
{
	const char bytes[] = {key, '\0'};
	BMessage message(what);
	message.AddInt64("when", system_time());
	message.AddInt32("raw_char", key);
	message.AddInt32("modifiers", modifiers);
	message.AddInt8("byte", key);
	message.AddString("bytes", bytes);
	return message;
}


class WindowTest : public InterfaceTest {
protected:
	void Press(BWindow* window, char key, uint32 modifiers = 0)
	{
		BMessage message = KeyMessage(key, modifiers);
		window->PostMessage(&message);
		Settle(window);
	}
};

} // namespace


TEST_F(WindowTest, NewWindowIsHiddenAndItsCreators)
{
	BWindow* window = MakeWindow();
	EXPECT_TRUE(window->IsLocked());
	EXPECT_TRUE(window->IsHidden());
	EXPECT_EQ(window->Frame(), BRect(100, 100, 300, 200));
	EXPECT_EQ(window->Bounds(), BRect(0, 0, 200, 100));
	EXPECT_STREQ(window->Title(), "test");
	EXPECT_EQ(window->CountChildren(), 0);
	EXPECT_NE(window->Flags() & B_ASYNCHRONOUS_CONTROLS, 0u);
	EXPECT_EQ(window->PulseRate(), 500000);
	EXPECT_FALSE(window->IsMinimized());
	window->Quit();
}


TEST_F(WindowTest, ShowStartsTheThreadAndGivesUpTheLock)
{
	BWindow* window = MakeWindow();
	window->Show();
	EXPECT_FALSE(window->IsLocked());
	EXPECT_FALSE(window->IsHidden());
	EXPECT_GE(window->Thread(), 0);
	EXPECT_NE(window->Thread(), find_thread(nullptr));
	Quit(window);
}


TEST_F(WindowTest, ShowAndHideCount)
{
	BWindow* window = MakeWindow();
	window->Show();
	window->Hide();
	window->Hide();
	EXPECT_TRUE(window->IsHidden());
	window->Show();
	EXPECT_TRUE(window->IsHidden());
	window->Show();
	EXPECT_FALSE(window->IsHidden());
	Quit(window);
}


TEST_F(WindowTest, AWindowThatNeverRanIsJustDeleted)
{
	std::atomic<bool> destroyed = false;
	auto* window = new HookWindow;
	window->destroyed = &destroyed;
	window->Quit();
	EXPECT_TRUE(destroyed);
}


TEST_F(WindowTest, QuitFromAnotherThreadReturnsWhenItIsGone)
{
	std::atomic<bool> destroyed = false;
	auto* window = new HookWindow;
	window->destroyed = &destroyed;
	window->Show();
	BMessenger messenger(window);
	Quit(window);
	EXPECT_TRUE(destroyed);
	EXPECT_FALSE(messenger.LockTarget());
}


TEST_F(WindowTest, ARefusedQuitRequestKeepsTheWindow)
{
	std::atomic<bool> destroyed = false;
	auto* window = new HookWindow;
	window->destroyed = &destroyed;
	window->mayQuit = false;
	window->Show();
	BMessenger messenger(window);
	BMessage reply;
	ASSERT_EQ(messenger.SendMessage(B_QUIT_REQUESTED, &reply), B_OK);
	EXPECT_FALSE(destroyed);
	EXPECT_FALSE(reply.GetBool("result", true));

	window->Lock();
	window->mayQuit = true;
	thread_id thread = window->Thread();
	window->Unlock();
	window->PostMessage(B_QUIT_REQUESTED);
	status_t result;
	wait_for_thread(thread, &result);
	EXPECT_TRUE(destroyed);
	EXPECT_FALSE(messenger.IsValid());
}


TEST_F(WindowTest, ClosingTheLastWindowMayEndTheApplication)
{
	BWindow* window = MakeWindow(B_QUIT_ON_WINDOW_CLOSE);
	window->Show();
	window->PostMessage(B_QUIT_REQUESTED);
	fApplication.Run();
	SUCCEED();
}


TEST_F(WindowTest, TypesStandForLooksAndFeels)
{
	struct {
		window_type type;
		window_look look;
		window_feel feel;
	} const rows[] = {
		{B_TITLED_WINDOW, B_TITLED_WINDOW_LOOK, B_NORMAL_WINDOW_FEEL},
		{B_DOCUMENT_WINDOW, B_DOCUMENT_WINDOW_LOOK, B_NORMAL_WINDOW_FEEL},
		{B_BORDERED_WINDOW, B_BORDERED_WINDOW_LOOK, B_NORMAL_WINDOW_FEEL},
		{B_MODAL_WINDOW, B_MODAL_WINDOW_LOOK, B_MODAL_APP_WINDOW_FEEL},
		{B_FLOATING_WINDOW, B_FLOATING_WINDOW_LOOK, B_FLOATING_APP_WINDOW_FEEL},
	};
	for (const auto& row : rows) {
		SCOPED_TRACE(row.type);
		BWindow* window = new BWindow(BRect(0, 0, 9, 9), "type", row.type, 0);
		EXPECT_EQ(window->Look(), row.look);
		EXPECT_EQ(window->Feel(), row.feel);
		EXPECT_EQ(window->Type(), row.type);
		EXPECT_EQ(window->IsModal(), row.type == B_MODAL_WINDOW);
		EXPECT_EQ(window->IsFloating(), row.type == B_FLOATING_WINDOW);
		window->SetLook(B_NO_BORDER_WINDOW_LOOK);
		EXPECT_EQ(window->Type(), B_UNTYPED_WINDOW);
		window->SetType(B_DOCUMENT_WINDOW);
		EXPECT_EQ(window->Look(), B_DOCUMENT_WINDOW_LOOK);
		window->Quit();
	}
	BWindow* untyped = new BWindow(BRect(0, 0, 9, 9), "type", B_UNTYPED_WINDOW, 0);
	EXPECT_EQ(untyped->Look(), B_TITLED_WINDOW_LOOK);
	untyped->Quit();
}


TEST_F(WindowTest, MovesAndResizesReachTheHooksLater)
{
	auto* window = new HookWindow;
	window->Show();
	window->Lock();
	window->log.clear();
	window->MoveTo(50.4f, 60.6f);
	window->ResizeBy(10, 20);
	EXPECT_EQ(window->Frame(), BRect(50, 61, 260, 181));
	EXPECT_TRUE(window->log.empty());
	window->Unlock();
	Settle(window);
	window->Lock();
	EXPECT_EQ(std::count(window->log.begin(), window->log.end(), "moved"), 1);
	EXPECT_EQ(std::count(window->log.begin(), window->log.end(), "resized"), 1);
	window->Unlock();
	Quit(window);
}


// The window's thread gets to the user's move only after the program has gone on.
TEST_F(WindowTest, APlaceThatTheProgramAsksForOutlivesAnOlderMoveOfTheUser)
{
	auto* window = new HookWindow;
	window->Show();
	window->Lock();
	window->log.clear();
	BPrivate::WindowData::Of(window).host->InjectFrame(BRect(10, 20, 210, 120));
	window->MoveTo(50, 60);
	window->Unlock();
	Settle(window);
	window->Lock();
	EXPECT_EQ(window->Frame(), BRect(50, 60, 250, 160));
	EXPECT_EQ(window->DecoratorFrame(), window->Frame());
	EXPECT_EQ(std::count(window->log.begin(), window->log.end(), "moved"), 1);
	window->Unlock();
	Quit(window);
}


TEST_F(WindowTest, AMoveOfTheUserOutlivesASizeThatTheProgramAsksFor)
{
	auto* window = new HookWindow;
	window->Show();
	window->Lock();
	window->log.clear();
	BPrivate::WindowData::Of(window).host->InjectFrame(BRect(10, 20, 210, 120));
	window->ResizeTo(250, 150);
	window->Unlock();
	Settle(window);
	window->Lock();
	EXPECT_EQ(window->Frame(), BRect(10, 20, 260, 170));
	EXPECT_EQ(window->DecoratorFrame(), window->Frame());
	EXPECT_EQ(std::count(window->log.begin(), window->log.end(), "moved"), 1);
	EXPECT_EQ(std::count(window->log.begin(), window->log.end(), "resized"), 1);
	window->Unlock();
	Quit(window);
}


TEST_F(WindowTest, SizesStayWithinTheLimits)
{
	BWindow* window = MakeWindow();
	float limits[4];
	window->GetSizeLimits(&limits[0], &limits[1], &limits[2], &limits[3]);
	EXPECT_EQ(limits[0], 0);
	EXPECT_EQ(limits[1], 32768);
	window->SetSizeLimits(150, 250, 50, 120);
	window->ResizeTo(10, 10);
	EXPECT_EQ(window->Size(), BSize(150, 50));
	window->ResizeTo(1000, 1000);
	EXPECT_EQ(window->Size(), BSize(250, 120));
	window->SetSizeLimits(0, 100, 0, 100);
	EXPECT_EQ(window->Size(), BSize(100, 100));
	window->Quit();
}


TEST_F(WindowTest, ResizingTheWindowResizesItsViews)
{
	BWindow* window = MakeWindow();
	BView* all = new BView(window->Bounds(), "all", B_FOLLOW_ALL, 0);
	window->AddChild(all);
	window->ResizeTo(300, 50);
	EXPECT_EQ(all->Frame(), BRect(0, 0, 300, 50));
	window->Quit();
}


TEST_F(WindowTest, ScreenCoordinatesStartAtTheFrame)
{
	BWindow* window = MakeWindow();
	BView* view = new BView(BRect(10, 20, 59, 59), "view", B_FOLLOW_NONE, 0);
	window->AddChild(view);
	EXPECT_EQ(window->ConvertToScreen(BPoint(1, 2)), BPoint(101, 102));
	EXPECT_EQ(window->ConvertFromScreen(BRect(100, 100, 110, 110)), BRect(0, 0, 10, 10));
	EXPECT_EQ(view->ConvertToScreen(BPoint(1, 2)), BPoint(111, 122));
	EXPECT_EQ(view->ConvertFromScreen(BPoint(111, 122)), BPoint(1, 2));
	window->Quit();
}


TEST_F(WindowTest, FindViewByPlaceGivesTheLowestChild)
{
	BWindow* window = MakeWindow();
	BView* outer = new BView(BRect(10, 10, 99, 99), "outer", B_FOLLOW_NONE, 0);
	BView* inner = new BView(BRect(5, 5, 20, 20), "inner", B_FOLLOW_NONE, 0);
	window->AddChild(outer);
	outer->AddChild(inner);
	EXPECT_EQ(window->FindView(BPoint(16, 16)), inner);
	EXPECT_EQ(window->FindView(BPoint(40, 40)), outer);
	EXPECT_EQ(window->FindView(BPoint(5, 5)), nullptr);
	EXPECT_EQ(window->FindView("inner"), inner);
	inner->Hide();
	EXPECT_EQ(window->FindView(BPoint(16, 16)), outer);
	window->Quit();
}


TEST_F(WindowTest, TheSecondZoomBringsTheFrameBack)
{
	auto* window = new HookWindow;
	window->SetZoomLimits(400, 350);
	BRect before = window->Frame();
	window->BWindow::Zoom();
	EXPECT_EQ(window->Size(), BSize(400, 350));
	window->BWindow::Zoom();
	EXPECT_EQ(window->Frame(), before);
	EXPECT_EQ(window->log, (Log{"zoom", "zoom"}));
	window->Quit();
}


TEST_F(WindowTest, MessagesOfTheSystemReachTheirHooks)
{
	auto* window = new HookWindow;
	window->Show();
	Settle(window);
	window->Lock();
	window->log.clear();
	window->Unlock();

	BMessage minimize(B_MINIMIZE);
	minimize.AddBool("minimize", true);
	window->PostMessage(&minimize);
	minimize.ReplaceBool("minimize", false);
	window->PostMessage(&minimize);
	window->PostMessage(B_SCREEN_CHANGED);
	window->PostMessage(B_WORKSPACES_CHANGED);
	window->PostMessage(B_ZOOM);
	Settle(window);
	window->Lock();
	std::erase(window->log, "moved");
	std::erase(window->log, "resized");
	std::erase(window->log, "active");
	std::erase(window->log, "inactive");
	EXPECT_EQ(window->log, (Log{"minimize", "restore", "screen", "workspaces", "zoom"}));
	window->Unlock();
	Quit(window);
}


TEST_F(WindowTest, ActivationIsToldToTheWindowThenToItsViews)
{
	auto* window = new HookWindow;
	auto* outer = new InputView("outer", 0, &window->log);
	outer->AddChild(new InputView("inner", 0, &window->log));
	window->AddChild(outer);
	window->Run();
	BMessage activated(B_WINDOW_ACTIVATED);
	activated.AddBool("active", true);
	window->PostMessage(&activated);
	Settle(window);
	window->Lock();
	EXPECT_EQ(window->log, (Log{"active", "outer activated", "inner activated"}));
	EXPECT_TRUE(window->IsActive());
	window->Unlock();
	Quit(window);
}


TEST_F(WindowTest, KeysGoToTheFocusElseToTheWindow)
{
	auto* window = new HookWindow;
	auto* view = new InputView("view");
	window->AddChild(view);
	window->Run();
	Press(window, 'a');
	window->Lock();
	EXPECT_EQ(window->log, (Log{"key"}));
	view->MakeFocus();
	window->Unlock();
	Press(window, 'b');
	BMessage up = KeyMessage('b', 0, B_KEY_UP);
	window->PostMessage(&up);
	Settle(window);
	window->Lock();
	EXPECT_EQ(view->keys, "b");
	EXPECT_EQ(view->released, "b");
	window->Unlock();
	Quit(window);
}


TEST_F(WindowTest, TabGoesAroundTheNavigableViews)
{
	auto* window = new HookWindow;
	auto* first = new InputView("first");
	auto* skipped = new InputView("skipped", 0);
	auto* hidden = new InputView("hidden");
	auto* last = new InputView("last");
	window->AddChild(first);
	window->AddChild(skipped);
	skipped->AddChild(hidden);
	hidden->Hide();
	window->AddChild(last);
	first->MakeFocus();
	window->Run();

	Press(window, B_TAB);
	EXPECT_EQ(window->CurrentFocus(), last);
	Press(window, B_TAB);
	EXPECT_EQ(window->CurrentFocus(), first);
	Press(window, B_TAB, B_SHIFT_KEY);
	EXPECT_EQ(window->CurrentFocus(), last);
	window->Lock();
	last->SetFlags(B_NAVIGABLE | B_NAVIGABLE_JUMP);
	first->SetFlags(B_NAVIGABLE | B_NAVIGABLE_JUMP);
	window->Unlock();
	Press(window, B_TAB, B_OPTION_KEY);
	EXPECT_EQ(window->CurrentFocus(), first);
	Quit(window);
}


TEST_F(WindowTest, ShortcutsFireForCommandAndTheirKey)
{
	struct {
		uint32 key;
		uint32 modifiers;
		char pressed;
		uint32 held;
		bool fires;
	} const rows[] = {
		{'k', 0, 'k', B_COMMAND_KEY, true},
		{'K', B_COMMAND_KEY, 'k', B_COMMAND_KEY, true},
		{'k', 0, 'K', B_COMMAND_KEY, true},
		{'k', 0, 'k', B_COMMAND_KEY | B_LEFT_COMMAND_KEY | B_CAPS_LOCK, true},
		{'k', 0, 'k', B_COMMAND_KEY | B_SHIFT_KEY, false},
		{'k', B_SHIFT_KEY, 'K', B_COMMAND_KEY | B_SHIFT_KEY, true},
		{'k', B_CONTROL_KEY, 'k', B_COMMAND_KEY, false},
		{'k', B_OPTION_KEY, 'k', B_COMMAND_KEY | B_OPTION_KEY, true},
		{'k', B_NO_COMMAND_KEY, 'k', 0, true},
		{'k', 0, 'k', 0, false},
	};
	for (size_t i = 0; i < std::size(rows); i++) {
		SCOPED_TRACE(i);
		auto* window = new HookWindow;
		window->AddShortcut(rows[i].key, rows[i].modifiers, new BMessage(kMsgTest));
		EXPECT_TRUE(window->HasShortcut(rows[i].key, rows[i].modifiers));
		window->Run();
		Press(window, rows[i].pressed, rows[i].held);
		window->Lock();
		EXPECT_EQ(std::count(window->log.begin(), window->log.end(), "shortcut"), rows[i].fires);
		bool isCommand = (rows[i].held & B_COMMAND_KEY) != 0;
		EXPECT_EQ(std::count(window->log.begin(), window->log.end(), "menus beginning"), isCommand);
		// Matched or not: a key with Command goes no further.
		EXPECT_EQ(std::count(window->log.begin(), window->log.end(), "key"),
			!isCommand && !rows[i].fires);
		window->RemoveShortcut(rows[i].key, rows[i].modifiers);
		EXPECT_FALSE(window->HasShortcut(rows[i].key, rows[i].modifiers));
		window->Unlock();
		Quit(window);
	}
}


TEST_F(WindowTest, MenusAreBroughtUpToDateAroundAShortcut)
{
	auto* window = new HookWindow;
	window->AddShortcut('k', 0, new BMessage('old '));
	window->AddShortcut('k', 0, new BMessage(kMsgTest));
	window->Run();
	Press(window, 'k', B_COMMAND_KEY);
	window->Lock();
	EXPECT_EQ(window->log, (Log{"menus beginning", "menus ended", "shortcut"}));
	window->Unlock();
	Quit(window);
}


TEST_F(WindowTest, CommandWClosesUnlessTheWindowMayNotBeClosed)
{
	for (uint32 flags : {uint32(0), uint32(B_NOT_CLOSABLE)}) {
		auto* window = new HookWindow(B_TITLED_WINDOW, flags);
		window->mayQuit = false;
		window->Run();
		Press(window, 'w', B_COMMAND_KEY);
		window->Lock();
		EXPECT_EQ(std::count(window->log.begin(), window->log.end(), "quit requested"), flags == 0);
		window->Unlock();
		Quit(window);
	}
}


TEST_F(WindowTest, EnterPressesTheDefaultButton)
{
	class PressedButton : public BButton {
	public:
		PressedButton()
			: BButton(BRect(10, 10, 80, 30), "button", "OK", new BMessage('pres'))
		{
		}
		void KeyDown(const char* bytes, int32 numBytes) override { keys.append(bytes, numBytes); }
		std::string keys;
	};

	auto* window = new HookWindow;
	auto* button = new PressedButton;
	auto* view = new InputView("view");
	window->AddChild(button);
	window->AddChild(view);
	view->MakeFocus();
	BRect before = button->Frame();
	window->SetDefaultButton(button);
	EXPECT_TRUE(button->IsDefault());
	EXPECT_EQ(button->Frame(), before.InsetByCopy(-3, -3));
	window->Run();
	Press(window, B_ENTER);
	Press(window, B_ENTER, B_SHIFT_KEY);
	window->Lock();
	EXPECT_EQ(button->keys, "\n");
	EXPECT_EQ(view->keys, "\n");
	window->RemoveChild(button);
	EXPECT_EQ(window->DefaultButton(), nullptr);
	EXPECT_FALSE(button->IsDefault());
	delete button;
	window->Unlock();
	Quit(window);
}


TEST_F(WindowTest, PulseReachesTheViewsThatNeedIt)
{
	auto* window = new HookWindow;
	auto* needs = new InputView("needs", B_PULSE_NEEDED);
	auto* needsNot = new InputView("needs not", 0);
	window->AddChild(needs);
	window->AddChild(needsNot);
	window->SetPulseRate(20000);
	window->Run();
	for (int i = 0; i < 500 && needs->pulses < 3; i++)
		snooze(10000);
	EXPECT_GE(needs->pulses, 3);
	EXPECT_EQ(needsNot->pulses, 0);
	Quit(window);
}


TEST_F(WindowTest, SetTitleRenamesTheThread)
{
	BWindow* window = MakeWindow();
	window->Run();
	window->Lock();
	window->SetTitle("other");
	EXPECT_STREQ(window->Title(), "other");
	thread_info info;
	ASSERT_EQ(get_thread_info(window->Thread(), &info), B_OK);
	EXPECT_STREQ(info.name, "w>other");
	window->Unlock();
	Quit(window);
}


TEST_F(WindowTest, ArchivesKeepTheWindow)
{
	BWindow* window = MakeWindow(B_NOT_RESIZABLE);
	window->SetSizeLimits(10, 500, 20, 400);
	window->AddChild(new BView(BRect(1, 1, 5, 5), "child", B_FOLLOW_NONE, 0));
	BMessage archive;
	ASSERT_EQ(window->Archive(&archive), B_OK);
	auto* copy = dynamic_cast<BWindow*>(BWindow::Instantiate(&archive));
	ASSERT_NE(copy, nullptr);
	EXPECT_EQ(copy->Frame(), window->Frame());
	EXPECT_STREQ(copy->Title(), "test");
	EXPECT_EQ(copy->Flags(), window->Flags());
	EXPECT_NE(copy->FindView("child"), nullptr);
	float minWidth, minHeight;
	copy->GetSizeLimits(&minWidth, nullptr, &minHeight, nullptr);
	EXPECT_EQ(minWidth, 10);
	EXPECT_EQ(minHeight, 20);
	copy->Quit();
	window->Quit();
}


TEST_F(WindowTest, TheScreenHasASize)
{
	BScreen screen;
	EXPECT_TRUE(screen.IsValid());
	EXPECT_EQ(screen.Frame().LeftTop(), B_ORIGIN);
	EXPECT_GE(screen.Frame().Width(), 320);
	BWindow* window = MakeWindow();
	EXPECT_EQ(BScreen(window).ID().id, 0);
	window->CenterOnScreen();
	BRect frame = window->Frame();
	EXPECT_NEAR(frame.left, screen.Frame().right - frame.right, 1);
	EXPECT_NEAR(frame.top, screen.Frame().bottom - frame.bottom, 1);
	window->Quit();
}
