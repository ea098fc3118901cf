// SPDX-License-Identifier: MIT
// The shared MIME database: the packages of all folders of data, and the user's own changes.

#include "storage/MimeDatabase.h"

#include <algorithm>

#include <dirent.h>
#include <fcntl.h>
#include <stdio.h>
#include <string.h>
#include <sys/stat.h>
#include <unistd.h>

#include <Directory.h>
#include <Errors.h>

#include "storage/MimeUpdate.h"
#include "storage/StorageStatus.h"
#include "storage/XdgDirectories.h"

namespace BPrivate {

namespace {

const char* const kPackages = "/mime/packages";
// Rules from this priority on are believed before the name is.
const int32 kCertainPriority = 80;
const int32 kMaxPriority = 100;
const size_t kMaxPackageSize = 64 << 20;


// The names of the package files, in alphabetical order.
std::vector<std::string>
PackageFiles(const std::string& folder)
{
	std::vector<std::string> names;
	DIR* listing = opendir(folder.c_str());
	if (listing == nullptr)
		return names;
	while (const dirent* entry = readdir(listing)) {
		const std::string name = entry->d_name;
		if (name[0] != '.' && (name.ends_with(".xml") || name.ends_with(kSupertypeSuffix)))
			names.push_back(name);
	}
	closedir(listing);
	std::sort(names.begin(), names.end());
	return names;
}


// Tells one state of the folder from another.
std::string
Signature(const std::string& folder)
{
	std::string signature = folder + "\n";
	for (const std::string& name : PackageFiles(folder)) {
		struct stat stat;
		if (::stat((folder + "/" + name).c_str(), &stat) != 0)
			continue;
		signature += name;
		for (int64 number : {(int64)stat.st_ino, (int64)stat.st_size, (int64)stat.st_mtim.tv_sec,
				 (int64)stat.st_mtim.tv_nsec})
			signature += " " + std::to_string(number);
		signature += "\n";
	}
	return signature;
}


bool
IsSubtypeOf(const std::string& type, const std::string& supertype)
{
	return type.size() > supertype.size() && type[supertype.size()] == '/'
		&& type.compare(0, supertype.size(), supertype) == 0;
}

/// Reads those of the folder's packages only that could have the type.
bool
FolderHas(const std::string& folder, const std::string& key)
{
	for (const std::string& name : PackageFiles(folder)) {
		std::string document;
		if (read_whole_file(folder + "/" + name, kMaxPackageSize, &document) != B_OK)
			continue;
		const std::string letters = mime_key(document);
		// A character may also be written as its number.
		if (letters.find(key) == std::string::npos && letters.find("&#") == std::string::npos)
			continue;
		std::vector<mime_description> types;
		read_mime_package(document, &types);
		for (const mime_description& type : types) {
			const std::string known = mime_key(type.type);
			if (known == key || IsSubtypeOf(known, key))
				return true;
		}
	}
	return false;
}

} // namespace


MimeDatabase&
MimeDatabase::Default()
{
	// Never destroyed: objects with static storage use it after main().
	static MimeDatabase* sDatabase = new MimeDatabase;
	return *sDatabase;
}


bool
MimeDatabase::Find(const std::string& type, mime_description* description)
{
	std::lock_guard<std::mutex> lock(fLock);
	Refresh();

	const std::string key = mime_key(type);
	bool isFound = false;
	*description = mime_description();
	for (const folder& folder : fFolders) {
		const auto found = folder.types.find(key);
		if (found != folder.types.end()) {
			const mime_description& here = found->second;
			if (!isFound)
				description->type = here.type;
			if (description->comment.empty())
				description->comment = here.comment;
			if (description->longDescription.empty())
				description->longDescription = here.longDescription;
			if (description->preferredApp.empty())
				description->preferredApp = here.preferredApp;
			if (!description->replacesGlobs)
				description->globs.insert(
					description->globs.end(), here.globs.begin(), here.globs.end());
			description->replacesGlobs |= here.replacesGlobs;
			isFound = true;
			continue;
		}
		const auto next = folder.types.lower_bound(key + "/");
		if (next != folder.types.end() && IsSubtypeOf(next->first, key)) {
			if (!isFound)
				description->type = key;
			isFound = true;
		}
	}
	return isFound;
}


bool
MimeDatabase::Has(const std::string& type)
{
	const std::string key = mime_key(type);
	if (key.find('/') != std::string::npos) {
		std::lock_guard<std::mutex> lock(fLock);
		if (fFolders.empty()) {
			const std::vector<std::string> directories = xdg_data_directories();
			return std::any_of(
				directories.begin(), directories.end(), [&key](const std::string& directory) {
					return FolderHas(directory + kPackages, key);
				});
		}
	}
	mime_description description;
	return Find(type, &description);
}


std::vector<std::string>
MimeDatabase::Types()
{
	std::lock_guard<std::mutex> lock(fLock);
	Refresh();

	std::map<std::string, std::string> types;
	for (const folder& folder : fFolders) {
		for (const auto& [key, description] : folder.types)
			types.emplace(key, description.type);
	}
	std::vector<std::string> names;
	for (const auto& [key, name] : types)
		names.push_back(name);
	return names;
}


status_t
MimeDatabase::Change(const std::string& type, const std::function<void(mime_description*)>& change)
{
	std::lock_guard<std::mutex> lock(fLock);
	const std::string folder = xdg_data_home() + kPackages;
	const std::string file = folder + "/" + package_file_name(mime_key(type));

	mime_description description;
	std::string document;
	std::vector<mime_description> types;
	if (read_whole_file(file, kMaxPackageSize, &document) == B_OK
		&& read_mime_package(document, &types) == B_OK && !types.empty())
		description = types[0];
	else
		description.type = type;

	change(&description);
	status_t status = create_directory(folder.c_str(), 0700);
	if (status == B_OK)
		status = replace_file(file, write_mime_package(description));
	if (status == B_OK)
		update_desktop_database(xdg_data_home() + "/mime");
	return status;
}


status_t
MimeDatabase::Remove(const std::string& type)
{
	mime_description known;
	const bool isKnown = Find(type, &known);

	std::lock_guard<std::mutex> lock(fLock);
	const std::string file = xdg_data_home() + kPackages + "/" + package_file_name(mime_key(type));
	if (unlink(file.c_str()) != 0) {
		const status_t status = status_from_errno(errno);
		return status == B_ENTRY_NOT_FOUND && isKnown ? B_NOT_ALLOWED : status;
	}
	update_desktop_database(xdg_data_home() + "/mime");
	return B_OK;
}


std::string
MimeDatabase::Guess(std::string_view content, const std::string& name)
{
	std::lock_guard<std::mutex> lock(fLock);
	Refresh();

	std::string type = GuessByContent(content, kCertainPriority, kMaxPriority);
	if (type.empty())
		type = GuessByName(name);
	if (type.empty())
		type = GuessByContent(content, 0, kCertainPriority - 1);
	return type;
}


void
MimeDatabase::Refresh()
{
	const std::vector<std::string> directories = xdg_data_directories();
	bool isChanged = directories.size() != fFolders.size();
	fFolders.resize(directories.size());
	for (size_t i = 0; i < directories.size(); i++)
		isChanged = RefreshFolder(directories[i] + kPackages, &fFolders[i]) || isChanged;
	if (isChanged)
		CollectRules();
}


bool
MimeDatabase::RefreshFolder(const std::string& path, folder* folder)
{
	std::string signature = Signature(path);
	if (signature == folder->signature)
		return false;

	folder->signature = std::move(signature);
	folder->types.clear();
	for (const std::string& name : PackageFiles(path)) {
		std::string document;
		if (read_whole_file(path + "/" + name, kMaxPackageSize, &document) != B_OK)
			continue;
		std::vector<mime_description> types;
		// What stands before the damage of a damaged package is as good as ever.
		read_mime_package(document, &types);
		for (mime_description& type : types)
			Merge(std::move(type), &folder->types);
	}
	return true;
}


void
MimeDatabase::CollectRules()
{
	fRules.clear();
	for (size_t i = 0; i < fFolders.size(); i++) {
		for (const auto& [key, type] : fFolders[i].types) {
			const auto isReplaced = [&key = key](const folder& other) {
				const auto found = other.types.find(key);
				return found != other.types.end() && found->second.replacesMagics;
			};
			if (std::any_of(fFolders.begin(), fFolders.begin() + i, isReplaced))
				continue;
			for (const mime_magic& magic : type.magics)
				fRules.push_back({type.type, i, &magic});
		}
	}
	std::stable_sort(fRules.begin(), fRules.end(), [](const rule& a, const rule& b) {
		return a.magic->priority != b.magic->priority ? a.magic->priority > b.magic->priority
													  : a.folder < b.folder;
	});
}


void
MimeDatabase::Merge(mime_description type, std::map<std::string, mime_description>* types)
{
	const std::string key = mime_key(type.type);
	const auto found = types->find(key);
	if (found == types->end()) {
		types->emplace(key, std::move(type));
		return;
	}

	mime_description& known = found->second;
	const auto take = [](const std::string& from, std::string* to) {
		if (!from.empty())
			*to = from;
	};
	take(type.comment, &known.comment);
	take(type.longDescription, &known.longDescription);
	take(type.preferredApp, &known.preferredApp);
	if (type.replacesGlobs)
		known.globs.clear();
	if (type.replacesMagics)
		known.magics.clear();
	known.replacesGlobs |= type.replacesGlobs;
	known.replacesMagics |= type.replacesMagics;
	known.globs.insert(known.globs.end(), type.globs.begin(), type.globs.end());
	known.magics.insert(known.magics.end(), type.magics.begin(), type.magics.end());
}


std::string
MimeDatabase::GuessByContent(std::string_view content, int32 lowest, int32 highest) const
{
	if (content.empty())
		return "";
	for (const rule& rule : fRules) {
		if (rule.magic->priority <= highest && rule.magic->priority >= lowest
			&& rule.magic->Holds(content))
			return rule.type;
	}
	return "";
}


std::string
MimeDatabase::GuessByName(const std::string& name) const
{
	if (name.empty())
		return "";

	// The heaviest pattern wins, then one that knows the case, then the longest, then precedence.
	const mime_glob* best = nullptr;
	std::string type;
	for (size_t i = 0; i < fFolders.size(); i++) {
		for (const auto& [key, description] : fFolders[i].types) {
			const auto isReplaced = [&key = key](const folder& other) {
				const auto found = other.types.find(key);
				return found != other.types.end() && found->second.replacesGlobs;
			};
			for (const mime_glob& glob : description.globs) {
				if (!glob.Holds(name))
					continue;
				const bool isBetter = best == nullptr || glob.weight > best->weight
					|| (glob.weight == best->weight
						&& (glob.isCaseSensitive > best->isCaseSensitive
							|| (glob.isCaseSensitive == best->isCaseSensitive
								&& glob.pattern.size() > best->pattern.size())));
				if (!isBetter || std::any_of(fFolders.begin(), fFolders.begin() + i, isReplaced))
					continue;
				best = &glob;
				type = description.type;
			}
		}
	}
	return type;
}

} // namespace BPrivate
