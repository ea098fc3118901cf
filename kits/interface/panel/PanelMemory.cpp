// SPDX-License-Identifier: MIT
// What the file panels of a program remember from one run to the next.

#include "interface/panel/PanelMemory.h"

#include <algorithm>
#include <cctype>
#include <cmath>
#include <cstdlib>
#include <cstring>
#include <iterator>

#include <sys/stat.h>
#include <unistd.h>

#include <Application.h>
#include <DataIO.h>
#include <FindDirectory.h>
#include <Message.h>
#include <Path.h>
#include <Roster.h>
#include <StorageDefs.h>

#include "interface/panel/PanelPaths.h"
#include "storage/MimeUpdate.h"
#include "storage/XdgDirectories.h"

namespace BPrivate {

namespace {

constexpr uint32 kFileCode = 'FPnl';
constexpr size_t kMostFolders = 5;
constexpr size_t kMostBytes = 64 * 1024;
constexpr float kLargestSize = 10000;


/// The signature as the name of a file.
std::string
FileName(const std::string& signature)
{
	std::string name = signature.substr(0, B_FILE_NAME_LENGTH - 1);
	if (name.empty())
		return "unknown";
	for (char& character : name) {
		if (!isalnum(static_cast<unsigned char>(character)) && strchr("-_.", character) == nullptr)
			character = '_';
	}
	return name;
}


bool
IsFolder(const std::string& path)
{
	struct stat stat;
	return ::stat(path.c_str(), &stat) == 0 && S_ISDIR(stat.st_mode);
}

} // namespace


PanelMemory::PanelMemory(const std::string& signature)
	: fName(FileName(signature)),
	  fWidth(0),
	  fHeight(0),
	  fShowsHidden(false)
{
}


status_t
PanelMemory::Load()
{
	std::string content;
	const std::string path = FilePath(false);
	if (path.empty())
		return B_ENTRY_NOT_FOUND;
	status_t status = read_whole_file(path, kMostBytes, &content);
	BMessage memory;
	if (status == B_OK) {
		BMemoryIO stream(content.data(), content.size());
		status = memory.Unflatten(&stream);
	}
	if (status != B_OK)
		return status;
	if (memory.what != kFileCode)
		return B_BAD_DATA;

	fFolders.clear();
	const char* folder;
	for (int32 i = 0; size_t(i) < kMostFolders && memory.FindString("folder", i, &folder) == B_OK;
		 i++) {
		if (folder[0] == '/')
			fFolders.emplace_back(folder);
	}
	SetSize(memory.GetFloat("width", 0), memory.GetFloat("height", 0));
	fShowsHidden = memory.GetBool("hidden", false);
	return B_OK;
}


status_t
PanelMemory::Save() const
{
	const std::string path = FilePath(true);
	if (path.empty())
		return B_ERROR;

	BMessage memory(kFileCode);
	for (const std::string& folder : fFolders)
		memory.AddString("folder", folder.c_str());
	memory.AddFloat("width", fWidth);
	memory.AddFloat("height", fHeight);
	memory.AddBool("hidden", fShowsHidden);
	std::string content(memory.FlattenedSize(), '\0');
	const status_t status = memory.Flatten(content.data(), content.size());
	return status == B_OK ? replace_file(path, content) : status;
}


std::vector<std::string>
PanelMemory::Folders() const
{
	std::vector<std::string> folders;
	std::copy_if(fFolders.begin(), fFolders.end(), std::back_inserter(folders), IsFolder);
	return folders;
}


void
PanelMemory::AddFolder(const std::string& folder)
{
	std::erase(fFolders, folder);
	fFolders.insert(fFolders.begin(), folder);
	if (fFolders.size() > kMostFolders)
		fFolders.pop_back();
}


void
PanelMemory::SetSize(float width, float height)
{
	const auto checked = [](float length) {
		return std::isfinite(length) ? std::clamp(std::floor(length), 0.0f, kLargestSize) : 0;
	};
	fWidth = checked(width);
	fHeight = checked(height);
}


/// Empty when there is no such place.
std::string
PanelMemory::FilePath(bool create) const
{
	BPath path;
	if (find_directory(B_USER_SETTINGS_DIRECTORY, &path, create) != B_OK
		|| path.Append("file_panels") != B_OK)
		return "";
	if (create && mkdir(path.Path(), 0700) != 0 && !IsFolder(path.Path()))
		return "";
	return std::string(path.Path()) + "/" + fName;
}


std::string
ProgramName()
{
	app_info info;
	if (be_app == nullptr || be_app->GetAppInfo(&info) != B_OK || info.ref.name == nullptr)
		return "";
	return info.ref.name;
}


std::string
ApplicationSignature()
{
	app_info info;
	if (be_app == nullptr || be_app->GetAppInfo(&info) != B_OK)
		return "unknown";
	return info.signature;
}


std::string
StartFolder(const PanelMemory& memory)
{
	char* current = getcwd(nullptr, 0);
	std::string folder = current != nullptr ? current : "";
	free(current);
	std::string home;
	const bool hasHome = FindFolder(home_directory(), &home) == B_OK;
	if (!folder.empty() && folder != "/" && (!hasHome || folder != home))
		return folder;

	for (const std::string& remembered : memory.Folders()) {
		std::string resolved;
		if (FindFolder(remembered, &resolved) == B_OK)
			return resolved;
	}
	if (!folder.empty())
		return folder;
	return hasHome ? home : "/";
}

} // namespace BPrivate
