// SPDX-License-Identifier: MIT
// Where the user's folders are by the XDG conventions.

#include "storage/XdgDirectories.h"

#include <algorithm>

#include <limits.h>
#include <pwd.h>
#include <stdio.h>
#include <stdlib.h>
#include <unistd.h>

namespace BPrivate {

namespace {

// Without slashes at its end, so that paths can be joined and compared.
std::string
Trimmed(std::string path)
{
	while (path.size() > 1 && path.back() == '/')
		path.pop_back();
	return path;
}


std::string
InHome(const char* path)
{
	const std::string home = home_directory();
	return (home == "/" ? "" : home) + path;
}


std::string
BaseDirectory(const char* variable, const char* fallback)
{
	const char* value = getenv(variable);
	if (value != nullptr && value[0] == '/')
		return Trimmed(value);
	return InHome(fallback);
}


// The value of a line NAME="$HOME/path" or NAME="/path"; empty for any other line.
std::string
UserDirectoryValue(const std::string& line, const std::string& variable)
{
	const std::string start = variable + "=\"";
	const size_t end = line.rfind('"');
	if (line.compare(0, start.size(), start) != 0 || end == std::string::npos || end < start.size())
		return "";

	std::string value;
	for (size_t i = start.size(); i < end; i++) {
		if (line[i] == '\\' && i + 1 < end)
			i++;
		value += line[i];
	}
	if (value.compare(0, 6, "$HOME/") == 0)
		return Trimmed(InHome(value.c_str() + 5));
	return value[0] == '/' ? Trimmed(value) : "";
}


// The share folder of the place that the running program is installed in.
std::string
ProgramShareDirectory()
{
	char buffer[PATH_MAX];
	const ssize_t length = readlink("/proc/self/exe", buffer, sizeof(buffer));
	if (length <= 0 || length >= (ssize_t)sizeof(buffer))
		return "";
	std::string path(buffer, length);
	path.resize(path.rfind('/'));
	const size_t slash = path.rfind('/');
	if (slash == std::string::npos || path.substr(slash) != "/bin")
		return "";
	return path.substr(0, slash) + "/share";
}


void
AddOnce(const std::string& directory, std::vector<std::string>* directories)
{
	if (directory.empty() || directory[0] != '/')
		return;
	const std::string trimmed = Trimmed(directory);
	if (std::find(directories->begin(), directories->end(), trimmed) == directories->end())
		directories->push_back(trimmed);
}

} // namespace


std::string
home_directory()
{
	const char* home = getenv("HOME");
	if (home != nullptr && home[0] == '/')
		return Trimmed(home);

	std::vector<char> buffer(16384);
	struct passwd entry;
	struct passwd* found = nullptr;
	if (getpwuid_r(getuid(), &entry, buffer.data(), buffer.size(), &found) == 0 && found != nullptr
		&& found->pw_dir != nullptr && found->pw_dir[0] == '/')
		return Trimmed(found->pw_dir);
	return "/";
}


std::string
xdg_config_home()
{
	return BaseDirectory("XDG_CONFIG_HOME", "/.config");
}


std::string
xdg_data_home()
{
	return BaseDirectory("XDG_DATA_HOME", "/.local/share");
}


std::string
xdg_cache_home()
{
	return BaseDirectory("XDG_CACHE_HOME", "/.cache");
}


std::string
xdg_state_home()
{
	return BaseDirectory("XDG_STATE_HOME", "/.local/state");
}


std::string
xdg_user_directory(const char* name, const char* fallback)
{
	const std::string variable = std::string("XDG_") + name + "_DIR";
	std::string directory;
	FILE* file = fopen((xdg_config_home() + "/user-dirs.dirs").c_str(), "re");
	if (file != nullptr) {
		char line[PATH_MAX + 64];
		while (fgets(line, sizeof(line), file) != nullptr) {
			const std::string value = UserDirectoryValue(line, variable);
			if (!value.empty())
				directory = value;
		}
		fclose(file);
	}
	return directory.empty() ? InHome(fallback) : directory;
}


std::vector<std::string>
xdg_data_directories()
{
	std::vector<std::string> directories;
	AddOnce(xdg_data_home(), &directories);
	AddOnce(ProgramShareDirectory(), &directories);

	const char* variable = getenv("XDG_DATA_DIRS");
	const std::string list =
		variable != nullptr && variable[0] != '\0' ? variable : "/usr/local/share:/usr/share";
	size_t start = 0;
	while (start <= list.size()) {
		const size_t end = std::min(list.find(':', start), list.size());
		AddOnce(list.substr(start, end - start), &directories);
		start = end + 1;
	}
	return directories;
}

} // namespace BPrivate
