// SPDX-License-Identifier: MIT
// An X client of its own kind that drags, or is dropped on, by the XDND protocol (version 5) and Xlib alone.
//
// usage: xdnd_client source LEFT TOP TYPE FILE    a press in its window of 60 by 60 pixels drags the file's
//                                                 content as TYPE; at the end it prints "finished" or "refused"
//        xdnd_client target LEFT TOP TYPE FILE    prints "answered" when it has accepted what is dragged over
//                                                 it, and "dropped" when it has written what was dropped to FILE
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <iterator>
#include <string>

#include <X11/Xatom.h>
#include <X11/Xlib.h>

namespace {

const long kVersion = 5;
const int kSize = 60;

Display* sDisplay;
Window sWindow;


Atom
AtomFor(const char* name)
{
	return XInternAtom(sDisplay, name, False);
}


void
Say(const char* line)
{
	puts(line);
	fflush(stdout);
}


void
SendTo(Window window, const char* type, long a, long b = 0, long c = 0, long d = 0)
{
	XEvent event = {};
	event.xclient.type = ClientMessage;
	event.xclient.window = window;
	event.xclient.message_type = AtomFor(type);
	event.xclient.format = 32;
	event.xclient.data.l[0] = static_cast<long>(sWindow);
	event.xclient.data.l[1] = a;
	event.xclient.data.l[2] = b;
	event.xclient.data.l[3] = c;
	event.xclient.data.l[4] = d;
	XSendEvent(sDisplay, window, False, NoEventMask, &event);
}


void
MakeWindow(int left, int top)
{
	XSetWindowAttributes attributes = {};
	attributes.override_redirect = True;
	attributes.background_pixel = 0xff8800;
	attributes.event_mask = ButtonPressMask | ButtonReleaseMask | PointerMotionMask | ExposureMask;
	sWindow = XCreateWindow(sDisplay, DefaultRootWindow(sDisplay), left, top, kSize, kSize, 0,
		CopyFromParent, InputOutput, CopyFromParent, CWOverrideRedirect | CWBackPixel | CWEventMask,
		&attributes);
	XStoreName(sDisplay, sWindow, "xdnd client");
}


bool
IsAware(Window window)
{
	Atom type;
	int format;
	unsigned long count, left;
	unsigned char* data = nullptr;
	XGetWindowProperty(sDisplay, window, AtomFor("XdndAware"), 0, 1, False, AnyPropertyType, &type,
		&format, &count, &left, &data);
	if (data != nullptr)
		XFree(data);
	return type != None;
}


/// One drag from the press to the last answer of the target.
class Source {
public:
	Source(const char* type, const char* file)
		: fType(AtomFor(type))
	{
		std::ifstream stream(file, std::ios::binary);
		fContent.assign(std::istreambuf_iterator<char>(stream), {});
	}

	[[noreturn]] void Run()
	{
		XSync(sDisplay, False);
		Say("ready");
		for (;;) {
			XEvent event;
			XNextEvent(sDisplay, &event);
			if (event.type == ButtonPress)
				Pressed(event.xbutton);
			else if (event.type == MotionNotify)
				Moved(event.xmotion.x_root, event.xmotion.y_root, event.xmotion.time);
			else if (event.type == ButtonRelease)
				Released(event.xbutton);
			else if (event.type == SelectionRequest)
				Give(event.xselectionrequest);
			else if (event.type == ClientMessage)
				Answered(event.xclient);
		}
	}

private:
	void Pressed(const XButtonEvent& event)
	{
		XSetSelectionOwner(sDisplay, AtomFor("XdndSelection"), sWindow, event.time);
		fIsDragging = true;
		Say("dragging");
	}

	void Moved(int x, int y, Time time)
	{
		if (!fIsDragging)
			return;
		Window target = TargetAt(x, y);
		if (target != fTarget) {
			if (fTarget != None)
				SendTo(fTarget, "XdndLeave", 0);
			fTarget = target;
			fWaits = false;
			fAccepted = false;
			if (fTarget != None)
				SendTo(fTarget, "XdndEnter", kVersion << 24, static_cast<long>(fType));
		}
		fX = x;
		fY = y;
		fTime = time;
		SendPosition();
	}

	/// One at a time: each has to be answered first.
	void SendPosition()
	{
		fIsPending = fWaits;
		if (fTarget == None || fWaits)
			return;
		fWaits = true;
		SendTo(fTarget, "XdndPosition", 0, fX << 16 | fY, static_cast<long>(fTime),
			static_cast<long>(AtomFor("XdndActionCopy")));
	}

	void Released(const XButtonEvent& event)
	{
		if (!fIsDragging)
			return;
		Moved(event.x_root, event.y_root, event.time);
		fIsReleased = true;
		if (!fWaits)
			End();
	}

	void End()
	{
		fIsReleased = false;
		fIsDragging = false;
		if (fTarget != None && fAccepted) {
			SendTo(fTarget, "XdndDrop", 0, static_cast<long>(fTime));
			return;
		}
		if (fTarget != None)
			SendTo(fTarget, "XdndLeave", 0);
		fTarget = None;
		Say("refused");
	}

	void Answered(const XClientMessageEvent& event)
	{
		if (event.message_type == AtomFor("XdndStatus")) {
			fWaits = false;
			fAccepted = (event.data.l[1] & 1) != 0;
			if (fIsPending)
				SendPosition();
			else if (fIsReleased)
				End();
		} else if (event.message_type == AtomFor("XdndFinished")) {
			fTarget = None;
			Say((event.data.l[1] & 1) != 0 ? "finished" : "refused");
		}
	}

	void Give(const XSelectionRequestEvent& request)
	{
		XEvent answer = {};
		answer.xselection.type = SelectionNotify;
		answer.xselection.requestor = request.requestor;
		answer.xselection.selection = request.selection;
		answer.xselection.target = request.target;
		answer.xselection.time = request.time;
		if (request.target == fType) {
			XChangeProperty(sDisplay, request.requestor, request.property, fType, 8,
				PropModeReplace, reinterpret_cast<const unsigned char*>(fContent.data()),
				static_cast<int>(fContent.size()));
			answer.xselection.property = request.property;
		} else if (request.target == AtomFor("TARGETS")) {
			XChangeProperty(sDisplay, request.requestor, request.property, XA_ATOM, 32,
				PropModeReplace, reinterpret_cast<const unsigned char*>(&fType), 1);
			answer.xselection.property = request.property;
		}
		XSendEvent(sDisplay, request.requestor, False, NoEventMask, &answer);
	}

	/// The outermost window there that takes drops.
	Window TargetAt(int x, int y)
	{
		Window root = DefaultRootWindow(sDisplay);
		Window window = root;
		while (window != None) {
			if (window != root && IsAware(window))
				return window;
			Window child;
			int childX, childY;
			if (!XTranslateCoordinates(sDisplay, root, window, x, y, &childX, &childY, &child))
				return None;
			window = child;
		}
		return None;
	}

	const Atom fType;
	std::string fContent;
	Window fTarget = None;
	bool fIsDragging = false;
	bool fWaits = false;
	bool fIsPending = false;
	bool fAccepted = false;
	bool fIsReleased = false;
	int fX = 0;
	int fY = 0;
	Time fTime = CurrentTime;
};


class Target {
public:
	Target(const char* type, const char* file)
		: fType(AtomFor(type)),
		  fFile(file)
	{
		XChangeProperty(sDisplay, sWindow, AtomFor("XdndAware"), XA_ATOM, 32, PropModeReplace,
			reinterpret_cast<const unsigned char*>(&kVersion), 1);
	}

	[[noreturn]] void Run()
	{
		XSync(sDisplay, False);
		Say("ready");
		for (;;) {
			XEvent event;
			XNextEvent(sDisplay, &event);
			if (event.type == ClientMessage)
				Handle(event.xclient);
			else if (event.type == SelectionNotify)
				Received(event.xselection);
		}
	}

private:
	void Handle(const XClientMessageEvent& event)
	{
		auto source = static_cast<Window>(event.data.l[0]);
		if (event.message_type == AtomFor("XdndEnter")) {
			Say("entered");
			fHasAnswered = false;
		} else if (event.message_type == AtomFor("XdndPosition")) {
			SendTo(source, "XdndStatus", 1, 0, 0, static_cast<long>(AtomFor("XdndActionCopy")));
			XSync(sDisplay, False);
			if (!fHasAnswered)
				Say("answered");
			fHasAnswered = true;
		} else if (event.message_type == AtomFor("XdndLeave"))
			Say("left");
		else if (event.message_type == AtomFor("XdndDrop")) {
			fSource = source;
			XConvertSelection(sDisplay, AtomFor("XdndSelection"), fType, AtomFor("CONTENT"),
				sWindow, static_cast<Time>(event.data.l[2]));
		}
	}

	void Received(const XSelectionEvent& event)
	{
		bool isGiven = event.property != None;
		if (isGiven) {
			Atom type;
			int format;
			unsigned long count, left;
			unsigned char* data = nullptr;
			XGetWindowProperty(sDisplay, sWindow, event.property, 0, 65536, True, AnyPropertyType,
				&type, &format, &count, &left, &data);
			std::ofstream(fFile, std::ios::binary)
				.write(reinterpret_cast<char*>(data), static_cast<std::streamsize>(count));
			XFree(data);
		}
		SendTo(
			fSource, "XdndFinished", isGiven ? 1 : 0, static_cast<long>(AtomFor("XdndActionCopy")));
		Say(isGiven ? "dropped" : "not given");
	}

	const Atom fType;
	const char* fFile;
	Window fSource = None;
	bool fHasAnswered = false;
};

} // namespace


int
main(int argc, char** argv)
{
	if (argc != 6)
		return 2;
	sDisplay = XOpenDisplay(nullptr);
	if (sDisplay == nullptr)
		return 1;
	MakeWindow(atoi(argv[2]), atoi(argv[3]));
	bool isSource = strcmp(argv[1], "source") == 0;
	XMapRaised(sDisplay, sWindow);
	if (isSource)
		Source(argv[4], argv[5]).Run();
	Target(argv[4], argv[5]).Run();
}
