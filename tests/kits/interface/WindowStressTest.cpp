// SPDX-License-Identifier: MIT
// Many windows at once: posting to, locking, redrawing and closing each other.
//
// BE_STRESS_SECONDS is how long each test goes on, 1 if it is not set.
#include <Window.h>

#include <atomic>
#include <cstdlib>
#include <mutex>
#include <random>
#include <thread>
#include <vector>

#include <OS.h>

#include "InterfaceFixture.h"
#include "display/Display.h"

namespace {

const int32 kWindows = 8;
const uint32 kMsgWork = 'work';


bigtime_t
Duration()
{
	const char* seconds = getenv("BE_STRESS_SECONDS");
	double value = seconds != nullptr ? atof(seconds) : 0;
	return static_cast<bigtime_t>((value > 0 ? value : 1) * 1000000);
}


class StressView : public BView {
public:
	explicit StressView(BRect frame)
		: BView(frame, "stress", B_FOLLOW_ALL, B_WILL_DRAW | B_FULL_UPDATE_ON_RESIZE)
	{
	}

	void Draw(BRect) override
	{
		draws++;
		StrokeLine(Bounds().LeftTop(), Bounds().RightBottom());
		DrawString("stress", BPoint(10, 20));
	}

	static std::atomic<int64> draws;
};

std::atomic<int64> StressView::draws = 0;


class StressWindow;

/// The windows by their places; a window is only touched locked by its messenger.
class Places {
public:
	BMessenger At(int32 place)
	{
		std::lock_guard<std::mutex> lock(fMutex);
		return fWindows[place];
	}

	void Set(int32 place, const BMessenger& window)
	{
		std::lock_guard<std::mutex> lock(fMutex);
		fWindows[place] = window;
	}

	/// A locked window, null when it has gone. The caller holds no other one.
	static StressWindow* Locked(const BMessenger& messenger);

private:
	std::mutex fMutex;
	BMessenger fWindows[kWindows];
};


/// Handles each message by disturbing another window and posting to a third one.
class StressWindow : public BWindow {
public:
	StressWindow(Places& places, int32 place, bool mayClose)
		: BWindow(BRect(50 + 20 * place, 50 + 20 * place, 250 + 20 * place, 150 + 20 * place),
			"stress", B_TITLED_WINDOW, 0),
		  view(new StressView(Bounds())),
		  fPlaces(places),
		  fPlace(place),
		  fRandom(static_cast<uint32>(place)),
		  fMayClose(mayClose)
	{
		AddChild(view);
		alive++;
	}

	~StressWindow() override { alive--; }

	void MessageReceived(BMessage* message) override
	{
		if (message->what != kMsgWork) {
			BWindow::MessageReceived(message);
			return;
		}
		int32 sender = message->GetInt32("sender", 0);
		int32 number = message->GetInt32("number", 0);
		if (number <= fLastOf[sender])
			outOfOrder++;
		fLastOf[sender] = number;
		handled++;
		Disturb(*this);
		if (!stop)
			PassOn();
	}

	/// What needs the window's lock.
	static void Disturb(StressWindow& window)
	{
		switch (window.fRandom() % 6) {
			case 0:
				window.ResizeTo(150 + window.fRandom() % 80, 100 + window.fRandom() % 80);
				break;
			case 1:
				window.MoveBy(window.fRandom() % 2 == 0 ? 3 : -3, 1);
				break;
			case 2:
				window.SetTitle(window.fRandom() % 2 == 0 ? "stress" : "more stress");
				break;
			case 3:
				window.view->FillRect(BRect(5, 5, 15, 15));
				window.view->Flush();
				break;
			default:
				window.view->Invalidate();
				break;
		}
	}

	/// Counts what was posted, so that it can be told whether all of it was handled.
	static void PostTo(const BMessenger& target, int32 sender)
	{
		BMessage work(kMsgWork);
		work.AddInt32("sender", sender);
		std::lock_guard<std::mutex> lock(sSenders[sender].mutex);
		work.AddInt32("number", ++sSenders[sender].number);
		if (target.SendMessage(&work) == B_OK)
			posted++;
	}

	StressView* view;

	static std::atomic<int32> alive;
	static std::atomic<int64> posted;
	static std::atomic<int64> handled;
	static std::atomic<int64> outOfOrder;
	static std::atomic<bool> stop;

private:
	void PassOn()
	{
		BMessenger other = fPlaces.At(fRandom() % kWindows);
		BMessenger next = fPlaces.At(fRandom() % kWindows);
		int32 sender = fRandom() % kWindows;
		bool closes = fMayClose && fRandom() % 50 == 0;
		// The own lock is given up first: two locks at once could wait for each other.
		Unlock();
		StressWindow* locked = Places::Locked(other);
		// Two that wait for each other's end would do so for ever: only those behind are closed.
		if (locked != nullptr && closes && locked->fPlace > fPlace)
			locked->Quit();
		else if (locked != nullptr) {
			Disturb(*locked);
			locked->Unlock();
		}
		PostTo(next, sender);
		Lock();
		if (fMayClose && fRandom() % 100 == 0)
			PostMessage(B_QUIT_REQUESTED);
	}

	struct Sender {
		std::mutex mutex;
		int32 number = 0;
	};
	static Sender sSenders[kWindows];

	Places& fPlaces;
	const int32 fPlace;
	std::minstd_rand fRandom;
	const bool fMayClose;
	int32 fLastOf[kWindows] = {};
};

std::atomic<int32> StressWindow::alive = 0;
std::atomic<int64> StressWindow::posted = 0;
std::atomic<int64> StressWindow::handled = 0;
std::atomic<int64> StressWindow::outOfOrder = 0;
std::atomic<bool> StressWindow::stop = false;
StressWindow::Sender StressWindow::sSenders[kWindows];


StressWindow*
Places::Locked(const BMessenger& messenger)
{
	if (!messenger.LockTarget())
		return nullptr;
	BLooper* looper = nullptr;
	messenger.Target(&looper);
	return static_cast<StressWindow*>(looper);
}


class WindowStressTest : public InterfaceTest {
protected:
	void SetUp() override
	{
		StressView::draws = 0;
		StressWindow::posted = 0;
		StressWindow::handled = 0;
		StressWindow::outOfOrder = 0;
		StressWindow::stop = false;
	}

	void Open(int32 place, bool mayClose)
	{
		auto window = new StressWindow(fPlaces, place, mayClose);
		fPlaces.Set(place, BMessenger(window));
		window->Show();
	}

	void CloseAll()
	{
		for (int32 place = 0; place < kWindows; place++) {
			StressWindow* window = Places::Locked(fPlaces.At(place));
			if (window != nullptr)
				window->Quit();
		}
		while (StressWindow::alive > 0)
			snooze(1000);
	}

	Places fPlaces;
};

} // namespace


TEST_F(WindowStressTest, EightWindowsPostToLockAndRedrawEachOther)
{
	for (int32 place = 0; place < kWindows; place++)
		Open(place, false);
	for (int32 place = 0; place < kWindows; place++)
		StressWindow::PostTo(fPlaces.At(place), place);
	snooze(Duration());
	StressWindow::stop = true;
	// What is under way posts nothing more; each answer comes after all that was posted before.
	for (int32 round = 0; round < 2; round++) {
		for (int32 place = 0; place < kWindows; place++) {
			BMessage reply;
			EXPECT_EQ(fPlaces.At(place).SendMessage(static_cast<uint32>('sync'), &reply), B_OK);
		}
	}
	EXPECT_EQ(StressWindow::handled, StressWindow::posted);
	EXPECT_EQ(StressWindow::outOfOrder, 0);
	EXPECT_GT(StressWindow::handled, kWindows);
	// Where nothing is drawn, windows only ask for it.
	if (BPrivate::Display::Get().DrawsPixels()) {
		EXPECT_GT(StressView::draws, kWindows);
	}
	CloseAll();
	printf("%lld messages, %lld redraws\n", static_cast<long long>(StressWindow::handled),
		static_cast<long long>(StressView::draws));
}


TEST_F(WindowStressTest, WindowsMayBeClosedAtAnyMomentFromAnyThread)
{
	std::atomic<int32> opened = 0;
	std::atomic<bool> stop = false;
	for (int32 place = 0; place < kWindows; place++)
		Open(place, true);

	// Keeps the places filled; each place has one thread that may.
	auto fill = [&](int32 first) {
		while (!stop) {
			for (int32 place = first; place < kWindows; place += 2) {
				if (fPlaces.At(place).IsValid())
					continue;
				Open(place, true);
				opened++;
				StressWindow::PostTo(fPlaces.At(place), place);
			}
			snooze(500);
		}
	};
	auto disturb = [&](uint32 seed) {
		std::minstd_rand random(seed);
		while (!stop) {
			BMessenger messenger = fPlaces.At(random() % kWindows);
			StressWindow* window = Places::Locked(messenger);
			if (window == nullptr)
				continue;
			uint32 what = random() % 20;
			if (what == 0) {
				window->Quit();
				continue;
			}
			if (what == 1)
				window->Hide();
			else if (what == 2 && window->IsHidden())
				window->Show();
			else
				StressWindow::Disturb(*window);
			window->Unlock();
			if (what == 3)
				messenger.SendMessage(B_QUIT_REQUESTED);
			snooze(200);
		}
	};
	std::vector<std::thread> threads;
	for (int32 i = 0; i < 2; i++) {
		threads.emplace_back(fill, i);
		threads.emplace_back(disturb, i + 1);
	}
	snooze(Duration());
	StressWindow::stop = true;
	stop = true;
	for (std::thread& thread : threads)
		thread.join();
	CloseAll();
	EXPECT_GT(opened, 0);
	EXPECT_EQ(fApplication.CountWindows(), 0);
	printf("%d windows were opened again, %lld messages\n", opened.load(),
		static_cast<long long>(StressWindow::handled));
}
