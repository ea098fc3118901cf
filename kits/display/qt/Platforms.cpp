// SPDX-License-Identifier: MIT
// Which of Qt's platforms the environment leads to.
#include "display/qt/Platforms.h"

#include <cstdlib>
#include <cstring>

#include <dlfcn.h>
#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

namespace BPrivate {

namespace {

std::string
Environment(const char* name)
{
	const char* value = getenv(name);
	return value != nullptr ? value : "";
}


/// Connects once, since Qt would end the program where it cannot.
class XServerProbe {
public:
	bool Answers()
	{
		void* library = dlopen("libxcb.so.1", RTLD_NOW | RTLD_LOCAL);
		if (library == nullptr)
			return false;
		auto connect = reinterpret_cast<Connect>(dlsym(library, "xcb_connect"));
		auto hasError = reinterpret_cast<HasError>(dlsym(library, "xcb_connection_has_error"));
		fDisconnect = reinterpret_cast<Disconnect>(dlsym(library, "xcb_disconnect"));
		if (connect == nullptr || hasError == nullptr || fDisconnect == nullptr)
			return false;

		fConnection = connect(nullptr, nullptr);
		bool answers = fConnection != nullptr && hasError(fConnection) == 0;
		if (!answers)
			HangUp();
		return answers;
	}

	void HangUp()
	{
		if (fConnection != nullptr)
			fDisconnect(fConnection);
		fConnection = nullptr;
	}

private:
	typedef void* (*Connect)(const char* display, int* screen);
	typedef int (*HasError)(void* connection);
	typedef void (*Disconnect)(void* connection);

	void* fConnection = nullptr;
	Disconnect fDisconnect = nullptr;
};


XServerProbe sProbe;


bool
WaylandAnswers()
{
	std::string path = Environment("WAYLAND_DISPLAY");
	if (path.empty())
		path = "wayland-0";
	if (path[0] != '/')
		path = Environment("XDG_RUNTIME_DIR") + "/" + path;

	sockaddr_un address = {};
	address.sun_family = AF_UNIX;
	if (path.size() >= sizeof(address.sun_path))
		return false;
	strcpy(address.sun_path, path.c_str());
	int file = socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0);
	bool answers =
		file >= 0 && connect(file, reinterpret_cast<sockaddr*>(&address), sizeof(address)) == 0;
	if (file >= 0)
		close(file);
	return answers;
}


bool
StartsWith(const std::string& text, const char* start)
{
	return text.compare(0, strlen(start), start) == 0;
}

} // namespace


std::string
ChoosePlatforms(std::string* reason)
{
	std::string display = Environment("DISPLAY");
	std::string wayland = Environment("WAYLAND_DISPLAY");
	std::string wanted = Environment("QT_QPA_PLATFORM");
	if (wanted.empty() && display.empty() && wayland.empty())
		return "offscreen";

	// A list of platforms is Qt's own affair: there is always one more behind it.
	if (!wanted.empty() && wanted.find(';') != std::string::npos)
		return wanted;
	bool wantsX = wanted.empty() ? !display.empty() : StartsWith(wanted, "xcb");
	bool wantsWayland = wanted.empty() ? !wayland.empty() : StartsWith(wanted, "wayland");
	if (!wanted.empty() && !wantsX && !wantsWayland)
		return wanted;

	std::string platforms;
	if (wantsX && sProbe.Answers())
		platforms = wanted.empty() ? "xcb" : wanted;
	if (wantsWayland && WaylandAnswers()) {
		if (!platforms.empty())
			platforms += ";";
		platforms += wanted.empty() ? "wayland" : wanted;
	}
	if (platforms.empty())
		*reason = wantsX ? "no X server answers at \"" + display + "\""
						 : "no Wayland compositor answers at \"" + wayland + "\"";
	return platforms;
}


void
PlatformsConnected()
{
	sProbe.HangUp();
}


bool
HasWindowManager(const std::string& platforms)
{
	return platforms.find("xcb") != std::string::npos
		|| platforms.find("wayland") != std::string::npos;
}

} // namespace BPrivate
