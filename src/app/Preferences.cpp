// SPDX-License-Identifier: MIT

#include "app/Preferences.h"

#include <Directory.h>
#include <File.h>
#include <FindDirectory.h>

#include "app/ReplacementFile.h"

namespace {

constexpr uint32 kPreferences = 'pref';
// The folder that older systems call B_COMMON_SETTINGS_DIRECTORY; not every header still has the name.
constexpr directory_which kSettingsDirectory = static_cast<directory_which>(2010);

} // namespace

TPreferences::TPreferences(const char* fileName)
	: TTypedMessage(kPreferences),
	  fStatus(Load(fileName)),
	  fSaved(true)
{
}


TPreferences::~TPreferences()
{
	if (!fSaved || fPath.InitCheck() != B_OK)
		return;

	BPath folder;
	if (fPath.GetParent(&folder) == B_OK)
		create_directory(folder.Path(), 0700);
	TReplacementFile file(fPath.Path());
	if (file.InitCheck() != B_OK)
		return;
	if (Flatten(file.Stream()) == B_OK && file.KeepTail() == B_OK)
		file.Replace();
}


status_t
TPreferences::Load(const char* fileName)
{
	status_t status = find_directory(kSettingsDirectory, &fPath);
	if (status != B_OK)
		return status;
	status = fPath.Append(fileName);
	if (status != B_OK)
		return status;

	BFile file(fPath.Path(), B_READ_ONLY);
	if (file.InitCheck() != B_OK)
		return file.InitCheck();
	return Unflatten(&file);
}
