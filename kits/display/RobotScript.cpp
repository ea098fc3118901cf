// SPDX-License-Identifier: MIT
// A script that uses the running program like a person; docs/robot.md describes its commands.
#include "display/RobotScript.h"

#include <chrono>
#include <condition_variable>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <mutex>
#include <string>
#include <thread>
#include <vector>

#include <unistd.h>

#include <Application.h>
#include <Control.h>
#include <OS.h>
#include <View.h>
#include <Window.h>

#include "display/Display.h"
#include "display/PixelBuffer.h"
#include "display/Robot.h"

namespace BPrivate {

namespace {

typedef std::vector<std::string> Arguments;

// What the program ends with when a command fails, and when it does not quit.
const int kExitFailed = 2;
const int kExitDidNotQuit = 3;


std::string
ReasonFor(status_t status)
{
	switch (status) {
		case B_TIMED_OUT:
			return "it did not happen in time";
		case B_UNSUPPORTED:
			return "this display draws nothing, or does not tell";
		case B_BAD_VALUE:
			return "there is no such window";
		default:
			return strerror(status);
	}
}


/// Lets the program's end wait for the script's thread, which must not be in the middle of the kits
/// while their static objects go.
class ScriptEnd {
public:
	/// Between two commands: does not return once the program ends.
	void LeaveIfEnding()
	{
		std::unique_lock<std::mutex> lock(fMutex);
		if (!fEnding)
			return;
		fHasLeft = true;
		fCondition.notify_all();
		lock.unlock();
		for (;;)
			pause();
	}

	void HasLeft()
	{
		std::lock_guard<std::mutex> lock(fMutex);
		fHasLeft = true;
		fCondition.notify_all();
	}

	/// While the program ends: waits for the running command, but no longer than it may take to see that
	/// there is nobody left to talk to.
	void Wait()
	{
		std::unique_lock<std::mutex> lock(fMutex);
		fEnding = true;
		fCondition.wait_for(lock, std::chrono::seconds(3), [this] { return fHasLeft; });
	}

private:
	std::mutex fMutex;
	std::condition_variable fCondition;
	bool fEnding = false;
	bool fHasLeft = false;
};


ScriptEnd&
End()
{
	static auto end = new ScriptEnd;
	return *end;
}


class ScriptRunner {
public:
	explicit ScriptRunner(const char* path)
		: fPath(path),
		  fLine(0)
	{
	}

	void Run();

private:
	struct Command {
		const char* name;
		size_t least;
		size_t most;
		status_t (ScriptRunner::*run)(const Arguments& arguments);
	};

	static const Command kCommands[];

	void RunLine(const std::string& line);
	[[noreturn]] void Fail(const std::string& reason);
	std::string Expand(const std::string& text) const;
	Arguments Split(const std::string& line) const;
	BPoint Place(const Arguments& arguments, size_t first);
	status_t ViewDoesNot(const Arguments& arguments, status_t status);
	status_t ItemDoesNot(const Arguments& arguments, status_t status);

	status_t WaitWindow(const Arguments& arguments);
	status_t WaitNoWindow(const Arguments& arguments);
	status_t Click(const Arguments& arguments);
	status_t DoubleClick(const Arguments& arguments);
	status_t ClickView(const Arguments& arguments);
	status_t DoubleClickView(const Arguments& arguments);
	status_t ClickItem(const Arguments& arguments);
	status_t Move(const Arguments& arguments);
	status_t Press(const Arguments& arguments);
	status_t Release(const Arguments& arguments);
	status_t Drag(const Arguments& arguments);
	status_t DragView(const Arguments& arguments);
	status_t Wheel(const Arguments& arguments);
	status_t Type(const Arguments& arguments);
	status_t Key(const Arguments& arguments);
	status_t PrintView(const Arguments& arguments);
	status_t PrintValue(const Arguments& arguments);
	status_t PrintFrame(const Arguments& arguments);
	status_t PrintItemFrame(const Arguments& arguments);
	status_t ExpectView(const Arguments& arguments);
	status_t ExpectValue(const Arguments& arguments);
	status_t PrintWindows(const Arguments& arguments);
	status_t PrintViews(const Arguments& arguments);
	status_t SavePng(const Arguments& arguments);
	status_t SaveScreen(const Arguments& arguments);
	status_t Pause(const Arguments& arguments);
	status_t Limit(const Arguments& arguments);
	status_t CloseWindow(const Arguments& arguments);
	status_t MoveWindow(const Arguments& arguments);
	status_t ResizeWindow(const Arguments& arguments);
	status_t MinimizeWindow(const Arguments& arguments);
	status_t RestoreWindow(const Arguments& arguments);
	status_t ZoomWindow(const Arguments& arguments);
	status_t Print(const Arguments& arguments);
	status_t Quit(const Arguments& arguments);

	const std::string fPath;
	int fLine;
	Robot fRobot;
	BMessenger fWindow;
	std::string fFound;
};


const ScriptRunner::Command ScriptRunner::kCommands[] = {
	{"wait-window", 1, 1, &ScriptRunner::WaitWindow},
	{"wait-no-window", 1, 1, &ScriptRunner::WaitNoWindow},
	{"click", 2, 3, &ScriptRunner::Click},
	{"double-click", 2, 2, &ScriptRunner::DoubleClick},
	{"click-view", 1, 1, &ScriptRunner::ClickView},
	{"double-click-view", 1, 1, &ScriptRunner::DoubleClickView},
	{"click-item", 1, 1, &ScriptRunner::ClickItem},
	{"move", 2, 2, &ScriptRunner::Move},
	{"press", 0, 1, &ScriptRunner::Press},
	{"release", 0, 0, &ScriptRunner::Release},
	{"drag", 4, 4, &ScriptRunner::Drag},
	{"drag-view", 3, 3, &ScriptRunner::DragView},
	{"wheel", 1, 2, &ScriptRunner::Wheel},
	{"type", 1, 1, &ScriptRunner::Type},
	{"key", 1, 1, &ScriptRunner::Key},
	{"print-view", 1, 1, &ScriptRunner::PrintView},
	{"print-value", 1, 1, &ScriptRunner::PrintValue},
	{"print-frame", 1, 1, &ScriptRunner::PrintFrame},
	{"print-item-frame", 1, 1, &ScriptRunner::PrintItemFrame},
	{"expect-view", 2, 2, &ScriptRunner::ExpectView},
	{"expect-value", 2, 2, &ScriptRunner::ExpectValue},
	{"print-windows", 0, 0, &ScriptRunner::PrintWindows},
	{"print-views", 0, 0, &ScriptRunner::PrintViews},
	{"save-png", 1, 1, &ScriptRunner::SavePng},
	{"save-screen", 1, 1, &ScriptRunner::SaveScreen},
	{"pause", 1, 1, &ScriptRunner::Pause},
	{"limit", 1, 1, &ScriptRunner::Limit},
	{"close-window", 0, 0, &ScriptRunner::CloseWindow},
	{"move-window", 2, 2, &ScriptRunner::MoveWindow},
	{"resize-window", 2, 2, &ScriptRunner::ResizeWindow},
	{"minimize-window", 0, 0, &ScriptRunner::MinimizeWindow},
	{"restore-window", 0, 0, &ScriptRunner::RestoreWindow},
	{"zoom-window", 0, 0, &ScriptRunner::ZoomWindow},
	{"print", 1, 1, &ScriptRunner::Print},
	{"quit", 0, 0, &ScriptRunner::Quit},
};


void
ScriptRunner::Run()
{
	std::ifstream file(fPath);
	if (!file)
		Fail("the script cannot be read");

	std::string line;
	while (std::getline(file, line)) {
		fLine++;
		RunLine(line);
		End().LeaveIfEnding();
	}
}


void
ScriptRunner::RunLine(const std::string& line)
{
	Arguments arguments = Split(Expand(line));
	if (arguments.empty())
		return;

	std::string name = arguments[0];
	arguments.erase(arguments.begin());
	for (const Command& command : kCommands) {
		if (name != command.name)
			continue;
		if (arguments.size() < command.least || arguments.size() > command.most)
			Fail("\"" + name + "\" takes another number of words (quote those with spaces)");
		fFound.clear();
		status_t status = (this->*command.run)(arguments);
		// Another program may be waiting for what was printed.
		fflush(stdout);
		if (status != B_OK)
			Fail("\"" + line + "\" failed: " + (fFound.empty() ? ReasonFor(status) : fFound));
		return;
	}
	Fail("\"" + name + "\" is no command");
}


void
ScriptRunner::Fail(const std::string& reason)
{
	fflush(stdout);
	fprintf(stderr, "robot: %s:%d: %s\n", fPath.c_str(), fLine, reason.c_str());
	for (const BString& title : fRobot.WindowTitles())
		fprintf(stderr, "robot: a window is open: \"%s\"\n", title.String());
	_exit(kExitFailed);
}


/// ${NAME} becomes the environment's value.
std::string
ScriptRunner::Expand(const std::string& text) const
{
	std::string result;
	size_t from = 0;
	for (size_t start = text.find("${"); start != std::string::npos;
		 start = text.find("${", from)) {
		size_t end = text.find('}', start);
		if (end == std::string::npos)
			break;
		const char* value = getenv(text.substr(start + 2, end - start - 2).c_str());
		result += text.substr(from, start - from);
		result += value != nullptr ? value : "";
		from = end + 1;
	}
	return result + text.substr(from);
}


/// Words between spaces; "..." is one word, with \" and \\ in it. From # on it is a comment.
Arguments
ScriptRunner::Split(const std::string& line) const
{
	Arguments words;
	size_t i = 0;
	while (i < line.size()) {
		if (isspace(static_cast<unsigned char>(line[i]))) {
			i++;
			continue;
		}
		if (line[i] == '#')
			break;
		std::string word;
		bool isQuoted = line[i] == '"';
		if (isQuoted)
			i++;
		while (i < line.size()
			&& (isQuoted ? line[i] != '"' : !isspace(static_cast<unsigned char>(line[i])))) {
			if (isQuoted && line[i] == '\\' && i + 1 < line.size())
				i++;
			word += line[i++];
		}
		if (isQuoted)
			i++;
		words.push_back(word);
	}
	return words;
}


/// Window coordinates on the screen.
BPoint
ScriptRunner::Place(const Arguments& arguments, size_t first)
{
	BRect frame;
	if (fRobot.GetWindowFrame(fWindow, &frame) != B_OK)
		Fail("no window: wait for one first");
	return frame.LeftTop()
		+ BPoint(strtof(arguments[first].c_str(), nullptr),
			strtof(arguments[first + 1].c_str(), nullptr));
}


// #pragma mark - commands


status_t
ScriptRunner::WaitWindow(const Arguments& arguments)
{
	return fRobot.WaitForWindow(arguments[0].c_str(), &fWindow);
}


status_t
ScriptRunner::WaitNoWindow(const Arguments& arguments)
{
	return fRobot.WaitForNoWindow(arguments[0].c_str());
}


status_t
ScriptRunner::Click(const Arguments& arguments)
{
	uint32 button = B_PRIMARY_MOUSE_BUTTON;
	if (arguments.size() == 3)
		button = B_MOUSE_BUTTON(atoi(arguments[2].c_str()));
	fRobot.Click(Place(arguments, 0), 1, button);
	return B_OK;
}


status_t
ScriptRunner::DoubleClick(const Arguments& arguments)
{
	fRobot.Click(Place(arguments, 0), 2);
	return B_OK;
}


status_t
ScriptRunner::ClickView(const Arguments& arguments)
{
	return ViewDoesNot(arguments, fRobot.ClickView(fWindow, arguments[0].c_str()));
}


status_t
ScriptRunner::DoubleClickView(const Arguments& arguments)
{
	return ViewDoesNot(arguments, fRobot.ClickView(fWindow, arguments[0].c_str(), 2));
}


status_t
ScriptRunner::ClickItem(const Arguments& arguments)
{
	return ItemDoesNot(arguments, fRobot.ClickItem(arguments[0].c_str()));
}


status_t
ScriptRunner::ItemDoesNot(const Arguments& arguments, status_t status)
{
	if (status == B_NAME_NOT_FOUND)
		fFound = "no open menu and no menu bar has an item \"" + arguments[0] + "\"";
	return status;
}


status_t
ScriptRunner::ViewDoesNot(const Arguments& arguments, status_t status)
{
	if (status == B_NAME_NOT_FOUND)
		fFound = "the window has no view \"" + arguments[0] + "\"";
	else if (status == B_BAD_TYPE)
		fFound = "the view \"" + arguments[0] + "\" has none";
	else if (status == B_BAD_VALUE)
		fFound = "the window is gone, or nothing of the view can be seen";
	return status;
}


status_t
ScriptRunner::Move(const Arguments& arguments)
{
	fRobot.MoveTo(Place(arguments, 0));
	return B_OK;
}


status_t
ScriptRunner::Press(const Arguments& arguments)
{
	uint32 button = B_PRIMARY_MOUSE_BUTTON;
	if (!arguments.empty())
		button = B_MOUSE_BUTTON(atoi(arguments[0].c_str()));
	fRobot.Press(button);
	return B_OK;
}


status_t
ScriptRunner::Release(const Arguments&)
{
	fRobot.Release();
	return B_OK;
}


status_t
ScriptRunner::Drag(const Arguments& arguments)
{
	fRobot.Drag(Place(arguments, 0), Place(arguments, 2));
	return B_OK;
}


status_t
ScriptRunner::DragView(const Arguments& arguments)
{
	BRect frame;
	status_t status = fRobot.GetViewFrame(fWindow, arguments[0].c_str(), &frame);
	if (status != B_OK)
		return ViewDoesNot(arguments, status);
	BPoint from((frame.left + frame.right) / 2, (frame.top + frame.bottom) / 2);
	fRobot.Drag(from,
		from
			+ BPoint(strtof(arguments[1].c_str(), nullptr), strtof(arguments[2].c_str(), nullptr)));
	return B_OK;
}


status_t
ScriptRunner::Wheel(const Arguments& arguments)
{
	float across = arguments.size() == 2 ? strtof(arguments[1].c_str(), nullptr) : 0;
	fRobot.Wheel(across, strtof(arguments[0].c_str(), nullptr));
	return B_OK;
}


status_t
ScriptRunner::Type(const Arguments& arguments)
{
	fRobot.Type(arguments[0].c_str());
	return B_OK;
}


status_t
ScriptRunner::Key(const Arguments& arguments)
{
	status_t status = fRobot.Key(arguments[0].c_str());
	if (status != B_OK)
		fFound = "there is no key \"" + arguments[0] + "\"";
	return status;
}


status_t
ScriptRunner::PrintView(const Arguments& arguments)
{
	BString text;
	status_t status = fRobot.GetText(fWindow, arguments[0].c_str(), &text);
	if (status == B_OK)
		printf("%s: %s\n", arguments[0].c_str(), text.String());
	return ViewDoesNot(arguments, status);
}


status_t
ScriptRunner::PrintValue(const Arguments& arguments)
{
	int32 value;
	status_t status = fRobot.GetValue(fWindow, arguments[0].c_str(), &value);
	if (status == B_OK)
		printf("%s: %" B_PRId32 "\n", arguments[0].c_str(), value);
	return ViewDoesNot(arguments, status);
}


static void
PrintRect(const std::string& name, BRect frame)
{
	printf("%s: %g %g %g %g\n", name.c_str(), frame.left, frame.top, frame.right, frame.bottom);
}


status_t
ScriptRunner::PrintFrame(const Arguments& arguments)
{
	BRect frame;
	status_t status = fRobot.GetViewFrame(fWindow, arguments[0].c_str(), &frame);
	if (status == B_OK && !frame.IsValid())
		status = B_BAD_VALUE;
	if (status == B_OK)
		PrintRect(arguments[0], frame);
	return ViewDoesNot(arguments, status);
}


status_t
ScriptRunner::PrintItemFrame(const Arguments& arguments)
{
	BRect frame;
	status_t status = fRobot.GetItemFrame(arguments[0].c_str(), &frame);
	if (status == B_OK)
		PrintRect(arguments[0], frame);
	return ItemDoesNot(arguments, status);
}


status_t
ScriptRunner::ExpectView(const Arguments& arguments)
{
	BString found;
	status_t status =
		fRobot.WaitForText(fWindow, arguments[0].c_str(), arguments[1].c_str(), &found);
	if (status == B_TIMED_OUT)
		fFound = std::string("the view shows \"") + found.String() + "\"";
	return ViewDoesNot(arguments, status);
}


status_t
ScriptRunner::ExpectValue(const Arguments& arguments)
{
	int32 value = 0;
	status_t status = fRobot.GetValue(fWindow, arguments[0].c_str(), &value);
	if (status == B_OK && value != atoi(arguments[1].c_str())) {
		fFound = "the value is " + std::to_string(value);
		return B_ERROR;
	}
	return ViewDoesNot(arguments, status);
}


status_t
ScriptRunner::PrintWindows(const Arguments&)
{
	for (const BString& title : fRobot.WindowTitles())
		printf("window: %s\n", title.String());
	return B_OK;
}


static void
PrintTree(BView* view, int depth)
{
	BRect frame = view->Frame();
	auto control = dynamic_cast<BControl*>(view);
	bool hasLabel = control != nullptr && control->Label() != nullptr;
	printf("%*s%s (%g, %g, %g, %g)%s%s%s\n", depth * 2, "",
		view->Name() != nullptr ? view->Name() : "-", frame.left, frame.top, frame.right,
		frame.bottom, hasLabel ? " \"" : "", hasLabel ? control->Label() : "",
		hasLabel ? "\"" : "");
	for (int32 i = 0; i < view->CountChildren(); i++)
		PrintTree(view->ChildAt(i), depth + 1);
}


status_t
ScriptRunner::PrintViews(const Arguments&)
{
	return fRobot.WithWindow(fWindow, [](BWindow* window) {
		for (int32 i = 0; i < window->CountChildren(); i++)
			PrintTree(window->ChildAt(i), 0);
	});
}


status_t
ScriptRunner::SavePng(const Arguments& arguments)
{
	fRobot.Settle();
	return fRobot.SaveWindow(fWindow, arguments[0].c_str());
}


status_t
ScriptRunner::SaveScreen(const Arguments& arguments)
{
	fRobot.Settle();
	Picture picture;
	status_t status = Display::Get().ReadScreen(Display::Get().ScreenFrame(0), &picture);
	return status == B_OK ? Display::Get().SavePicture(picture, arguments[0].c_str()) : status;
}


status_t
ScriptRunner::Pause(const Arguments& arguments)
{
	return snooze(atoll(arguments[0].c_str()) * 1000);
}


status_t
ScriptRunner::Limit(const Arguments& arguments)
{
	fRobot.SetLimit(static_cast<bigtime_t>(strtod(arguments[0].c_str(), nullptr) * 1000000));
	return B_OK;
}


status_t
ScriptRunner::CloseWindow(const Arguments&)
{
	status_t status = fWindow.SendMessage(B_QUIT_REQUESTED);
	fRobot.Settle();
	return status;
}


status_t
ScriptRunner::MoveWindow(const Arguments& arguments)
{
	BRect frame;
	status_t status = fRobot.GetWindowFrame(fWindow, &frame);
	if (status != B_OK)
		return status;
	frame.OffsetTo(strtof(arguments[0].c_str(), nullptr), strtof(arguments[1].c_str(), nullptr));
	return fRobot.PlaceWindow(fWindow, frame);
}


status_t
ScriptRunner::ResizeWindow(const Arguments& arguments)
{
	BRect frame;
	status_t status = fRobot.GetWindowFrame(fWindow, &frame);
	if (status != B_OK)
		return status;
	frame.right = frame.left + strtof(arguments[0].c_str(), nullptr);
	frame.bottom = frame.top + strtof(arguments[1].c_str(), nullptr);
	return fRobot.PlaceWindow(fWindow, frame);
}


status_t
ScriptRunner::MinimizeWindow(const Arguments&)
{
	return fRobot.MinimizeWindow(fWindow, true);
}


status_t
ScriptRunner::RestoreWindow(const Arguments&)
{
	return fRobot.MinimizeWindow(fWindow, false);
}


status_t
ScriptRunner::ZoomWindow(const Arguments&)
{
	return fRobot.ZoomWindow(fWindow);
}


status_t
ScriptRunner::Print(const Arguments& arguments)
{
	printf("%s\n", arguments[0].c_str());
	return B_OK;
}


status_t
ScriptRunner::Quit(const Arguments&)
{
	fflush(stdout);
	be_app_messenger.SendMessage(B_QUIT_REQUESTED);
	// The program's end ends this thread too, which uses the kits no more.
	End().HasLeft();
	snooze(fRobot.Limit());
	fprintf(stderr, "robot: %s:%d: the program does not quit\n", fPath.c_str(), fLine);
	for (const BString& title : fRobot.WindowTitles())
		fprintf(stderr, "robot: a window is open: \"%s\"\n", title.String());
	_exit(kExitDidNotQuit);
}

} // namespace


void
StartRobotScript()
{
	const char* path = getenv("BE_ROBOT_SCRIPT");
	if (path == nullptr || path[0] == '\0')
		return;

	std::string script = path;
	// Programs that this one starts have nothing to do with the script.
	unsetenv("BE_ROBOT_SCRIPT");
	atexit([] { End().Wait(); });
	std::thread([script] {
		ScriptRunner(script.c_str()).Run();
		End().HasLeft();
	}).detach();
}

} // namespace BPrivate
