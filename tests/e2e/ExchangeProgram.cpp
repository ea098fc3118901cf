// SPDX-License-Identifier: MIT
// A program that exchanges data with others, for the tests on a real display: it does what it reads, a
// command a line, and prints what happens to it.
//
//   window TITLE LEFT TOP DRAGS FILE   shows a window of 150 by 150 pixels; a press in it drags what DRAGS
//                                      names: nothing, rect, bitmap or the FILE (refs)
//   special TITLE LEFT TOP LOOK FEEL FLAGS
//                                      the same with these numbers of Window.h
//   limits TITLE LEAST MOST            of width and height
//   behind TITLE OTHER                 sends a window behind another one
//   frame TITLE LEFT TOP WIDTH HEIGHT  gives a window another place and size, in four steps
//   where TITLE                        prints what the window's frame is
//   put TYPE FILE, put-number NAME N   adds a field to what commit puts on the clipboard
//   commit                             empties the clipboard and puts that there
//   get, get TYPE FILE                 prints the names of what is on the clipboard, and sizes; writes one
//   quit
#include <cstdio>
#include <fstream>
#include <iostream>
#include <iterator>
#include <map>
#include <sstream>
#include <string>

#include <Application.h>
#include <Bitmap.h>
#include <Clipboard.h>
#include <Entry.h>
#include <Message.h>
#include <OS.h>
#include <Path.h>
#include <Screen.h>
#include <View.h>
#include <Window.h>

namespace {

const uint32 kMsgDragged = 'drag';
const uint32 kMsgAnswer = 'answ';


void
Print(const std::string& line)
{
	std::string whole = line + "\n";
	fputs(whole.c_str(), stdout);
	fflush(stdout);
}


std::string
PointText(BPoint point)
{
	std::ostringstream text;
	text << point.x << "," << point.y;
	return text.str();
}


/// The fields that the tests look at.
std::string
Described(const BMessage& message)
{
	std::string text = message.what == B_SIMPLE_DATA ? "data"
		: message.what == kMsgDragged                ? "drag"
													 : "other";
	entry_ref ref;
	for (int32 i = 0; message.FindRef("refs", i, &ref) == B_OK; i++)
		text += std::string(" ref=") + BPath(&ref).Path();
	const void* bytes;
	ssize_t size;
	if (message.FindData("text/plain", B_MIME_TYPE, &bytes, &size) == B_OK)
		text += " text=" + std::string(static_cast<const char*>(bytes), size);
	int32 number;
	if (message.FindInt32("number", &number) == B_OK)
		text += " number=" + std::to_string(number);
	return text;
}


class ExchangeView : public BView {
public:
	ExchangeView(BRect frame, const std::string& drags, const std::string& file)
		: BView(frame, "exchange", B_FOLLOW_ALL, B_WILL_DRAW),
		  fDrags(drags),
		  fFile(file)
	{
	}

	void AttachedToWindow() override { MakeFocus(); }

	void Draw(BRect) override { FillRect(BRect(10, 10, 30, 30)); }

	void MouseDown(BPoint where) override
	{
		Say("pressed");
		BMessage message(kMsgDragged);
		message.AddInt32("number", 42);
		message.AddData("text/plain", B_MIME_TYPE, "dragged", 7);
		if (fDrags == "rect")
			DragMessage(&message, BRect(where.x - 5, where.y - 6, where.x + 20, where.y + 20));
		else if (fDrags == "bitmap")
			DragMessage(&message, new BBitmap(BRect(0, 0, 15, 15), B_RGBA32), BPoint(2, 3));
		else if (fDrags == "refs") {
			entry_ref ref;
			get_ref_for_path(fFile.c_str(), &ref);
			BMessage files(B_SIMPLE_DATA);
			files.AddRef("refs", &ref);
			DragMessage(&files, BRect(where, where + BPoint(10, 10)));
		}
	}

	void MouseUp(BPoint) override { Say("released"); }

	void MouseMoved(BPoint, uint32 transit, const BMessage* dragged) override
	{
		if (dragged != nullptr && transit == B_ENTERED_VIEW)
			Say("entered " + Described(*dragged));
		if (dragged != nullptr && transit == B_EXITED_VIEW)
			Say("exited");
	}

	void KeyDown(const char* bytes, int32 numBytes) override
	{
		Say("key " + std::to_string(numBytes > 0 ? bytes[0] : 0));
	}

	void MessageReceived(BMessage* message) override
	{
		if (message->WasDropped()) {
			BPoint offset;
			BPoint where = message->DropPoint(&offset);
			Say("dropped " + Described(*message) + " at " + PointText(ConvertFromScreen(where))
				+ " offset " + PointText(offset));
			message->SendReply(kMsgAnswer);
		} else if (message->what == kMsgAnswer)
			Say("answered");
		else
			BView::MessageReceived(message);
	}

private:
	void Say(const std::string& what) { Print(std::string(Window()->Title()) + " " + what); }

	const std::string fDrags;
	const std::string fFile;
};


/// Prints what its hooks are told.
class ExchangeWindow : public BWindow {
public:
	ExchangeWindow(BRect frame, const char* title, window_look look, window_feel feel, uint32 flags)
		: BWindow(frame, title, look, feel, flags)
	{
	}

	void Minimize(bool minimize) override
	{
		Say(minimize ? "minimized" : "restored");
		BWindow::Minimize(minimize);
	}

	void FrameMoved(BPoint where) override { Say("moved " + PointText(where)); }

	void FrameResized(float width, float height) override
	{
		Say("resized " + PointText(BPoint(width, height)));
	}

	/// Both what it is told of the screen, and what it finds.
	void ScreenChanged(BRect frame, color_space mode) override
	{
		const BRect found = BScreen(this).Frame();
		Say("screen " + PointText(frame.LeftTop()) + " " + PointText(frame.RightBottom()) + " mode "
			+ std::to_string(mode) + " found " + PointText(found.RightBottom()));
	}

	bool QuitRequested() override
	{
		Say("closed");
		return true;
	}

private:
	void Say(const std::string& what) { Print(std::string(Title()) + " " + what); }
};


std::string
ContentOf(const std::string& path)
{
	std::ifstream file(path, std::ios::binary);
	return {std::istreambuf_iterator<char>(file), {}};
}


class Commands {
public:
	void Run()
	{
		std::string line;
		while (std::getline(std::cin, line) && line != "quit") {
			std::istringstream words(line);
			std::string command;
			words >> command;
			Do(command, words);
		}
		be_app->PostMessage(B_QUIT_REQUESTED);
	}

private:
	void Do(const std::string& command, std::istringstream& words)
	{
		std::string name, value;
		if (command == "window")
			OpenWindow(words);
		else if (command == "special")
			OpenSpecial(words);
		else if (command == "limits")
			SetLimits(words);
		else if (command == "behind")
			SendBehind(words);
		else if (command == "frame")
			SetFrame(words);
		else if (command == "where")
			PrintFrame(words);
		else if (command == "sync")
			Sync(words);
		else if (command == "put") {
			words >> name >> value;
			std::string bytes = ContentOf(value);
			fToPut.AddData(name.c_str(), B_MIME_TYPE, bytes.data(), bytes.size());
		} else if (command == "put-number") {
			words >> name >> value;
			fToPut.AddInt32(name.c_str(), std::stoi(value));
		} else if (command == "commit")
			Commit();
		else if (command == "get") {
			words >> name >> value;
			Get(name, value);
		} else
			Print("unknown " + command);
	}

	void OpenWindow(std::istringstream& words)
	{
		std::string title, drags, file;
		float left, top;
		words >> title >> left >> top >> drags >> file;
		Show(title, BPoint(left, top), B_TITLED_WINDOW_LOOK, B_NORMAL_WINDOW_FEEL, 0, drags, file);
	}

	void OpenSpecial(std::istringstream& words)
	{
		std::string title;
		float left, top;
		uint32 look, feel, flags;
		words >> title >> left >> top >> look >> feel >> flags;
		Show(title, BPoint(left, top), static_cast<window_look>(look),
			static_cast<window_feel>(feel), flags, "nothing", "");
	}

	void Show(const std::string& title, BPoint leftTop, window_look look, window_feel feel,
		uint32 flags, const std::string& drags, const std::string& file)
	{
		auto window =
			new ExchangeWindow(BRect(leftTop, BSize(149, 149)), title.c_str(), look, feel, flags);
		window->AddChild(new ExchangeView(window->Bounds(), drags, file));
		fWindows[title] = window;
		window->Show();
		Print("opened " + title);
	}

	void SetLimits(std::istringstream& words)
	{
		std::string title;
		float least, most;
		words >> title >> least >> most;
		BWindow* window = fWindows[title];
		window->Lock();
		window->SetSizeLimits(least, most, least, most);
		window->Unlock();
		Print("limited " + title);
	}

	void SetFrame(std::istringstream& words)
	{
		std::string title;
		float left, top, width, height;
		words >> title >> left >> top >> width >> height;
		BWindow* window = fWindows[title];
		window->Lock();
		window->MoveTo(left, window->Frame().top);
		window->MoveTo(left, top);
		window->ResizeTo(width - 1, window->Frame().Height());
		window->ResizeTo(width - 1, height - 1);
		window->Unlock();
		Print("placed " + title);
	}

	void PrintFrame(std::istringstream& words)
	{
		std::string title;
		words >> title;
		BWindow* window = fWindows[title];
		window->Lock();
		const BRect frame = window->Frame();
		window->Unlock();
		Print(
			title + " at " + PointText(frame.LeftTop()) + " to " + PointText(frame.RightBottom()));
	}

	/// By then the display has done with what it was at.
	void Sync(std::istringstream& words)
	{
		std::string title;
		words >> title;
		BWindow* window = fWindows[title];
		window->Lock();
		window->Sync();
		window->Unlock();
		Print("synced " + title);
	}

	void SendBehind(std::istringstream& words)
	{
		std::string title, other;
		words >> title >> other;
		BWindow* window = fWindows[title];
		window->Lock();
		window->SendBehind(fWindows[other]);
		window->Unlock();
		Print("sent " + title);
	}

	void Commit()
	{
		be_clipboard->Lock();
		be_clipboard->Clear();
		*be_clipboard->Data() = fToPut;
		status_t status = be_clipboard->Commit();
		be_clipboard->Unlock();
		fToPut.MakeEmpty();
		Print("committed " + std::to_string(status));
	}

	void Get(const std::string& type, const std::string& path)
	{
		be_clipboard->Lock();
		const BMessage* data = be_clipboard->Data();
		std::string line = "clipboard";
		char* name;
		type_code code;
		for (int32 i = 0; data->GetInfo(B_ANY_TYPE, i, &name, &code) == B_OK; i++) {
			const void* bytes;
			ssize_t size = 0;
			data->FindData(name, code, &bytes, &size);
			line += std::string(" ") + name + "=" + std::to_string(size);
		}
		const void* bytes;
		ssize_t size;
		if (!path.empty() && data->FindData(type.c_str(), B_MIME_TYPE, &bytes, &size) == B_OK)
			std::ofstream(path, std::ios::binary).write(static_cast<const char*>(bytes), size);
		be_clipboard->Unlock();
		Print(line);
	}

	BMessage fToPut;
	// By their titles; the tests name none that they have closed.
	std::map<std::string, BWindow*> fWindows;
};


int32
ReadCommands(void*)
{
	Commands().Run();
	return 0;
}

} // namespace


int
main()
{
	BApplication application("application/x-vnd.exchange-program");
	thread_id commands = spawn_thread(ReadCommands, "commands", B_NORMAL_PRIORITY, nullptr);
	resume_thread(commands);
	Print("ready");
	application.Run();
	return 0;
}
