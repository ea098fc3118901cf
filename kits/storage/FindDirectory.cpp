// SPDX-License-Identifier: MIT
// find_directory: where the user's and the system's folders are.

#include <FindDirectory.h>

#include <string>

#include <stdlib.h>
#include <string.h>

#include <Directory.h>
#include <Errors.h>
#include <Path.h>

#include "storage/XdgDirectories.h"

namespace {

/// What the paths of the table below start at.
enum base_directory { kRoot, kHome, kConfig, kData, kCache, kState, kDesktop, kTemp };

struct directory_place {
	int32 which;
	base_directory base;
	const char* path;
};

// The settings that all users share are the user's own here, as they were on the older system: a
// program has to be able to write them.
const directory_place kPlaces[] = {
	{B_DESKTOP_DIRECTORY, kDesktop, ""},
	{B_TRASH_DIRECTORY, kData, "/Trash/files"},

	{B_SYSTEM_DIRECTORY, kRoot, "/usr"},
	{B_BEOS_SYSTEM_DIRECTORY, kRoot, "/usr"},
	{B_SYSTEM_ADDONS_DIRECTORY, kRoot, "/usr/lib"},
	{B_SYSTEM_BOOT_DIRECTORY, kRoot, "/boot"},
	{B_SYSTEM_FONTS_DIRECTORY, kRoot, "/usr/share/fonts"},
	{B_SYSTEM_LIB_DIRECTORY, kRoot, "/usr/lib"},
	{B_SYSTEM_SERVERS_DIRECTORY, kRoot, "/usr/libexec"},
	{B_SYSTEM_APPS_DIRECTORY, kRoot, "/usr/bin"},
	{B_SYSTEM_BIN_DIRECTORY, kRoot, "/usr/bin"},
	{B_BEOS_ETC_DIRECTORY, kRoot, "/etc"},
	{B_SYSTEM_DOCUMENTATION_DIRECTORY, kRoot, "/usr/share/doc"},
	{B_SYSTEM_PREFERENCES_DIRECTORY, kRoot, "/usr/bin"},
	{B_SYSTEM_TRANSLATORS_DIRECTORY, kRoot, "/usr/lib/translators"},
	{B_SYSTEM_MEDIA_NODES_DIRECTORY, kRoot, "/usr/lib/media"},
	{B_SYSTEM_SOUNDS_DIRECTORY, kRoot, "/usr/share/sounds"},
	{B_SYSTEM_DATA_DIRECTORY, kRoot, "/usr/share"},
	{B_SYSTEM_DEVELOP_DIRECTORY, kRoot, "/usr"},
	{B_SYSTEM_PACKAGES_DIRECTORY, kRoot, "/var/cache"},
	{B_SYSTEM_HEADERS_DIRECTORY, kRoot, "/usr/include"},
	{B_SYSTEM_DESKBAR_DIRECTORY, kRoot, "/usr/share/applications"},

	{B_COMMON_DIRECTORY, kRoot, "/usr/local"},
	{B_COMMON_SYSTEM_DIRECTORY, kRoot, "/usr/local"},
	{B_COMMON_ADDONS_DIRECTORY, kRoot, "/usr/local/lib"},
	{B_COMMON_BOOT_DIRECTORY, kRoot, "/boot"},
	{B_COMMON_FONTS_DIRECTORY, kRoot, "/usr/local/share/fonts"},
	{B_COMMON_LIB_DIRECTORY, kRoot, "/usr/local/lib"},
	{B_COMMON_SERVERS_DIRECTORY, kRoot, "/usr/local/libexec"},
	{B_COMMON_BIN_DIRECTORY, kRoot, "/usr/local/bin"},
	{B_SYSTEM_ETC_DIRECTORY, kRoot, "/etc"},
	{B_COMMON_DOCUMENTATION_DIRECTORY, kRoot, "/usr/local/share/doc"},
	{B_SYSTEM_SETTINGS_DIRECTORY, kConfig, ""},
	{B_COMMON_DEVELOP_DIRECTORY, kRoot, "/usr/local"},
	{B_SYSTEM_LOG_DIRECTORY, kRoot, "/var/log"},
	{B_SYSTEM_SPOOL_DIRECTORY, kRoot, "/var/spool"},
	{B_SYSTEM_TEMP_DIRECTORY, kTemp, ""},
	{B_SYSTEM_VAR_DIRECTORY, kRoot, "/var"},
	{B_COMMON_TRANSLATORS_DIRECTORY, kRoot, "/usr/local/lib/translators"},
	{B_COMMON_MEDIA_NODES_DIRECTORY, kRoot, "/usr/local/lib/media"},
	{B_COMMON_SOUNDS_DIRECTORY, kRoot, "/usr/local/share/sounds"},
	{B_COMMON_DATA_DIRECTORY, kRoot, "/usr/local/share"},
	{B_SYSTEM_CACHE_DIRECTORY, kRoot, "/var/cache"},
	{B_COMMON_PACKAGES_DIRECTORY, kRoot, "/var/cache"},
	{B_COMMON_HEADERS_DIRECTORY, kRoot, "/usr/local/include"},

	{B_SYSTEM_NONPACKAGED_DIRECTORY, kRoot, "/usr/local"},
	{B_SYSTEM_NONPACKAGED_ADDONS_DIRECTORY, kRoot, "/usr/local/lib"},
	{B_SYSTEM_NONPACKAGED_TRANSLATORS_DIRECTORY, kRoot, "/usr/local/lib/translators"},
	{B_SYSTEM_NONPACKAGED_MEDIA_NODES_DIRECTORY, kRoot, "/usr/local/lib/media"},
	{B_SYSTEM_NONPACKAGED_BIN_DIRECTORY, kRoot, "/usr/local/bin"},
	{B_SYSTEM_NONPACKAGED_DATA_DIRECTORY, kRoot, "/usr/local/share"},
	{B_SYSTEM_NONPACKAGED_FONTS_DIRECTORY, kRoot, "/usr/local/share/fonts"},
	{B_SYSTEM_NONPACKAGED_SOUNDS_DIRECTORY, kRoot, "/usr/local/share/sounds"},
	{B_SYSTEM_NONPACKAGED_DOCUMENTATION_DIRECTORY, kRoot, "/usr/local/share/doc"},
	{B_SYSTEM_NONPACKAGED_LIB_DIRECTORY, kRoot, "/usr/local/lib"},
	{B_SYSTEM_NONPACKAGED_HEADERS_DIRECTORY, kRoot, "/usr/local/include"},
	{B_SYSTEM_NONPACKAGED_DEVELOP_DIRECTORY, kRoot, "/usr/local"},

	{B_USER_DIRECTORY, kHome, ""},
	{B_USER_CONFIG_DIRECTORY, kConfig, ""},
	{B_USER_ADDONS_DIRECTORY, kHome, "/.local/lib"},
	{B_USER_BOOT_DIRECTORY, kConfig, "/autostart"},
	{B_USER_FONTS_DIRECTORY, kData, "/fonts"},
	{B_USER_LIB_DIRECTORY, kHome, "/.local/lib"},
	{B_USER_SETTINGS_DIRECTORY, kConfig, ""},
	{B_USER_DESKBAR_DIRECTORY, kData, "/applications"},
	{B_USER_PRINTERS_DIRECTORY, kConfig, "/printers"},
	{B_USER_TRANSLATORS_DIRECTORY, kHome, "/.local/lib/translators"},
	{B_USER_MEDIA_NODES_DIRECTORY, kHome, "/.local/lib/media"},
	{B_USER_SOUNDS_DIRECTORY, kData, "/sounds"},
	{B_USER_DATA_DIRECTORY, kData, ""},
	{B_USER_CACHE_DIRECTORY, kCache, ""},
	{B_USER_PACKAGES_DIRECTORY, kCache, "/packages"},
	{B_USER_HEADERS_DIRECTORY, kHome, "/.local/include"},
	{B_USER_NONPACKAGED_DIRECTORY, kHome, "/.local"},
	{B_USER_NONPACKAGED_ADDONS_DIRECTORY, kHome, "/.local/lib"},
	{B_USER_NONPACKAGED_TRANSLATORS_DIRECTORY, kHome, "/.local/lib/translators"},
	{B_USER_NONPACKAGED_MEDIA_NODES_DIRECTORY, kHome, "/.local/lib/media"},
	{B_USER_NONPACKAGED_BIN_DIRECTORY, kHome, "/.local/bin"},
	{B_USER_NONPACKAGED_DATA_DIRECTORY, kData, ""},
	{B_USER_NONPACKAGED_FONTS_DIRECTORY, kData, "/fonts"},
	{B_USER_NONPACKAGED_SOUNDS_DIRECTORY, kData, "/sounds"},
	{B_USER_NONPACKAGED_DOCUMENTATION_DIRECTORY, kData, "/doc"},
	{B_USER_NONPACKAGED_LIB_DIRECTORY, kHome, "/.local/lib"},
	{B_USER_NONPACKAGED_HEADERS_DIRECTORY, kHome, "/.local/include"},
	{B_USER_NONPACKAGED_DEVELOP_DIRECTORY, kHome, "/.local"},
	{B_USER_DEVELOP_DIRECTORY, kHome, "/.local"},
	{B_USER_DOCUMENTATION_DIRECTORY, kData, "/doc"},
	{B_USER_SERVERS_DIRECTORY, kHome, "/.local/libexec"},
	{B_USER_APPS_DIRECTORY, kHome, "/.local/bin"},
	{B_USER_BIN_DIRECTORY, kHome, "/.local/bin"},
	{B_USER_PREFERENCES_DIRECTORY, kHome, "/.local/bin"},
	{B_USER_ETC_DIRECTORY, kConfig, ""},
	{B_USER_LOG_DIRECTORY, kState, "/log"},
	{B_USER_SPOOL_DIRECTORY, kState, "/spool"},
	{B_USER_VAR_DIRECTORY, kState, ""},

	{B_APPS_DIRECTORY, kRoot, "/usr/bin"},
	{B_PREFERENCES_DIRECTORY, kRoot, "/usr/bin"},
	{B_UTILITIES_DIRECTORY, kRoot, "/usr/bin"},
	{B_PACKAGE_LINKS_DIRECTORY, kRoot, "/usr/share"},
};

// Folders of one user are nobody else's business.
const mode_t kUserMode = 0700;
const mode_t kSystemMode = 0755;


std::string
BasePath(base_directory base)
{
	switch (base) {
		case kRoot:
			return "";
		case kHome:
			return BPrivate::home_directory();
		case kConfig:
			return BPrivate::xdg_config_home();
		case kData:
			return BPrivate::xdg_data_home();
		case kCache:
			return BPrivate::xdg_cache_home();
		case kState:
			return BPrivate::xdg_state_home();
		case kDesktop:
			return BPrivate::xdg_user_directory("DESKTOP", "/Desktop");
		case kTemp:
		{
			const char* temporary = getenv("TMPDIR");
			return temporary != nullptr && temporary[0] == '/' ? temporary : "/tmp";
		}
	}
	return "";
}


status_t
FindPlace(int32 which, bool createIt, std::string* path)
{
	for (const directory_place& place : kPlaces) {
		if (place.which != which)
			continue;
		*path = BasePath(place.base) + place.path;
		if (path->size() >= B_PATH_NAME_LENGTH)
			return B_NAME_TOO_LONG;
		if (!createIt)
			return B_OK;
		return create_directory(path->c_str(), place.base == kRoot ? kSystemMode : kUserMode);
	}
	return B_BAD_VALUE;
}

} // namespace


status_t
find_directory(directory_which which, dev_t, bool createIt, char* pathString, int32 length)
{
	if (pathString == nullptr || length <= 0)
		return B_BAD_VALUE;
	std::string path;
	const status_t status = FindPlace(which, createIt, &path);
	if (status != B_OK)
		return status;
	if (path.size() >= (size_t)length)
		return B_BUFFER_OVERFLOW;
	memcpy(pathString, path.c_str(), path.size() + 1);
	return B_OK;
}


status_t
find_directory(directory_which which, BPath* path, bool createIt, BVolume*)
{
	if (path == nullptr)
		return B_BAD_VALUE;
	std::string place;
	const status_t status = FindPlace(which, createIt, &place);
	if (status != B_OK) {
		path->Unset();
		return status;
	}
	return path->SetTo(place.c_str());
}
