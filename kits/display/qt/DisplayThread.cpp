// SPDX-License-Identifier: MIT
// The thread that Qt's application object lives in, and how work gets there.
#include "display/qt/DisplayThread.h"

#include <cerrno>
#include <chrono>
#include <clocale>

#include <pthread.h>
#include <unistd.h>

#include <QClipboard>
#include <QCoreApplication>
#include <QEvent>
#include <QGuiApplication>
#include <QObject>
#include <QPointingDevice>

namespace BPrivate {

namespace {

// How long the program has to end by itself after its display has gone.
const std::chrono::seconds kFarewellTime(10);


/// Lives in the display thread; its events say that tasks are waiting.
class Waker : public QObject {
public:
	explicit Waker(std::function<void()> woken)
		: fWoken(std::move(woken))
	{
	}

	bool event(QEvent* event) override
	{
		if (event->type() != QEvent::User)
			return QObject::event(event);
		fWoken();
		return true;
	}

private:
	std::function<void()> fWoken;
};


/// Qt takes over the user's locale for the whole program; all but the character set is put back.
class LocaleKeeper {
public:
	LocaleKeeper()
		: fBefore(setlocale(LC_ALL, nullptr))
	{
	}

	~LocaleKeeper()
	{
		std::string characters = setlocale(LC_CTYPE, nullptr);
		setlocale(LC_ALL, fBefore.c_str());
		setlocale(LC_CTYPE, characters.c_str());
	}

private:
	const std::string fBefore;
};

} // namespace


struct DisplayThread::Waiting {
	bool isDone = false;
};


DisplayThread::DisplayThread()
	: fWaker(nullptr),
	  fAccepts(false),
	  fHasStarted(false),
	  fHasEnded(false),
	  fWakeIsPending(false),
	  fRefused(false)
{
}


bool
DisplayThread::Start(const std::string& platforms, std::function<void()> started)
{
	fThread =
		std::thread([this, platforms, started = std::move(started)] { Main(platforms, started); });
	std::unique_lock<std::mutex> lock(fMutex);
	fCondition.wait(lock, [this] { return fHasStarted; });
	bool succeeded = fAccepts;
	lock.unlock();
	if (!succeeded)
		fThread.join();
	return succeeded;
}


void
DisplayThread::Main(const std::string& platforms, const std::function<void()>& started)
{
	pthread_setname_np(pthread_self(), "display");
	// Last in the list, so that Qt ends up there instead of ending the program.
	const std::string fallback = "offscreen";
	std::string tried = platforms == fallback ? platforms : platforms + ";" + fallback;
	std::string name = program_invocation_short_name;
	std::string arguments[] = {name, "-platform", tried, "-platformtheme", "generic"};
	int count = 0;
	char* argv[6] = {};
	for (std::string& argument : arguments)
		argv[count++] = argument.data();

	QCoreApplication::setAttribute(Qt::AA_Use96Dpi);
	QGuiApplication::setHighDpiScaleFactorRoundingPolicy(
		Qt::HighDpiScaleFactorRoundingPolicy::PassThrough);
	std::unique_ptr<QGuiApplication> application;
	{
		LocaleKeeper keeper;
		application = std::make_unique<QGuiApplication>(count, argv);
	}
	QGuiApplication::setQuitOnLastWindowClosed(false);
	// These make static objects when they are first asked for, which have to be there before the
	// display is stopped at the program's end.
	QPointingDevice::primaryPointingDevice();
	QInputDevice::primaryKeyboard();
	bool succeeded = QGuiApplication::platformName().toStdString() != fallback
		|| platforms.find(fallback) != std::string::npos;
	Waker waker([this] { RunTasks(); });
	{
		std::lock_guard<std::mutex> lock(fMutex);
		fId = std::this_thread::get_id();
		fWaker = &waker;
	}
	if (succeeded)
		started();
	{
		std::lock_guard<std::mutex> lock(fMutex);
		fAccepts = succeeded;
		fHasStarted = true;
	}
	fCondition.notify_all();
	if (succeeded)
		// Not QGuiApplication's, which only offers Qt's own widgets to screen readers before: a connection to the
		// session bus for windows that have none.
		QCoreApplication::exec();

	{
		std::lock_guard<std::mutex> lock(fMutex);
		fWaker = nullptr;
	}
	if (!succeeded)
		return;
	// The program is at its end, and static objects of Qt that came up late may be gone already: taking
	// Qt apart could meet them. Only what is on the clipboard has to be handed over to the host, which
	// the application object's destructor does.
	if (QGuiApplication::clipboard()->ownsClipboard()
		&& QGuiApplication::platformName() == QLatin1String("xcb"))
		application.reset();
	{
		std::lock_guard<std::mutex> lock(fMutex);
		fHasEnded = true;
	}
	fCondition.notify_all();
	// Threads of Qt's own still want to wake this one, which they could not once it has ended.
	for (;;)
		pause();
}


void
DisplayThread::RunTasks()
{
	std::unique_lock<std::mutex> lock(fMutex);
	fWakeIsPending = false;
	// Only what is there now: input and expose events get their turn in between.
	for (size_t left = fTasks.size(); left > 0 && !fTasks.empty(); left--) {
		std::function<void()> task = std::move(fTasks.front());
		fTasks.pop_front();
		lock.unlock();
		task();
		task = nullptr;
		lock.lock();
	}
}


bool
DisplayThread::Post(std::function<void()> task)
{
	std::lock_guard<std::mutex> lock(fMutex);
	if (!fAccepts)
		return false;
	fTasks.push_back(std::move(task));
	if (!fWakeIsPending && fWaker != nullptr) {
		fWakeIsPending = true;
		QCoreApplication::postEvent(fWaker, new QEvent(QEvent::User));
	}
	return true;
}


bool
DisplayThread::Run(const std::function<void()>& task, const std::function<void()>& meanwhile)
{
	if (IsCurrent()) {
		task();
		return true;
	}

	auto waiting = std::make_shared<Waiting>();
	bool isQueued = Post([this, waiting, &task] {
		task();
		std::lock_guard<std::mutex> lock(fMutex);
		waiting->isDone = true;
		fCondition.notify_all();
	});
	if (!isQueued)
		return false;
	if (meanwhile != nullptr)
		meanwhile();

	std::unique_lock<std::mutex> lock(fMutex);
	fCondition.wait(lock, [&] { return waiting->isDone || fRefused; });
	return waiting->isDone;
}


void
DisplayThread::Refuse()
{
	std::deque<std::function<void()>> dropped;
	{
		std::lock_guard<std::mutex> lock(fMutex);
		fAccepts = false;
		fRefused = true;
		dropped.swap(fTasks);
	}
	fCondition.notify_all();
}


void
DisplayThread::Stop(std::function<void()> ending)
{
	if (IsCurrent())
		return;
	bool isQueued = Post([this, ending = std::move(ending)] {
		// First, while others' tasks still wait: who is told that a task will not be run may at once delete what the
		// ending works on.
		ending();
		Refuse();
		// quit() would have Qt close what windows it has of its own, those of a drag for one.
		QCoreApplication::exit();
	});
	if (!isQueued)
		return;
	std::unique_lock<std::mutex> lock(fMutex);
	fCondition.wait(lock, [this] { return fHasEnded; });
}


void
DisplayThread::Abandon(const std::function<void()>& farewell)
{
	Refuse();
	farewell();
	std::this_thread::sleep_for(kFarewellTime);
	_exit(1);
}


bool
DisplayThread::IsCurrent() const
{
	return std::this_thread::get_id() == fId;
}

} // namespace BPrivate
