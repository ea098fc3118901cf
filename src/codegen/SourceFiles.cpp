// SPDX-License-Identifier: MIT
// Looking at, reading and making the files and folders that generation works on.

#include "codegen/SourceFiles.h"

#include <vector>

#include <Directory.h>
#include <Entry.h>
#include <File.h>
#include <String.h>

#include "codegen/SourceText.h"


bool
PathExists(const char* path)
{
	BEntry entry(path, true);
	return entry.InitCheck() == B_OK && entry.Exists();
}


bool
IsFolder(const char* path)
{
	BEntry entry(path, true);
	return entry.InitCheck() == B_OK && entry.IsDirectory();
}


bool
FileExists(const char* path)
{
	BEntry entry(path, false);
	return entry.InitCheck() == B_OK && entry.Exists();
}


bool
CreatePath(const char* path)
{
	if (path == nullptr || path[0] == '\0')
		return false;

	BEntry entry(path);
	BDirectory parent;
	char name[B_FILE_NAME_LENGTH];
	if (entry.GetParent(&parent) != B_OK || entry.GetName(name) != B_OK)
		return false;

	const status_t status = parent.CreateDirectory(name, nullptr);
	return status == B_OK || status == B_FILE_EXISTS;
}


status_t
ReadContent(const char* path, std::vector<char>& content)
{
	BFile file;
	status_t status = file.SetTo(path, B_READ_ONLY);
	if (status != B_OK)
		return status;
	// Folders can be opened like files, but hold no text.
	if (file.IsDirectory())
		return B_IS_A_DIRECTORY;

	off_t size = 0;
	status = file.GetSize(&size);
	if (status != B_OK)
		return status;

	content.resize(static_cast<size_t>(size));
	size_t length = 0;
	while (length < content.size()) {
		const ssize_t read = file.Read(content.data() + length, content.size() - length);
		if (read < 0)
			return static_cast<status_t>(read);
		if (read == 0)
			break;
		length += static_cast<size_t>(read);
	}
	content.resize(length);
	return B_OK;
}


status_t
ReadFileInto(BString& text, const char* path, int32* cutLine)
{
	text = "";
	if (cutLine != nullptr)
		*cutLine = 0;

	std::vector<char> content;
	const status_t status = ReadContent(path, content);
	if (status != B_OK)
		return status;

	const int32 cut = AppendNormalizedLines(content.data(), content.size(), text);
	if (cutLine != nullptr)
		*cutLine = cut;
	return B_OK;
}
