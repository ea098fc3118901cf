// SPDX-License-Identifier: MIT
// Where generated text goes: the files of a run, and what became of each.

#include "codegen/SourceWriter.h"

#include <algorithm>

#include <File.h>

#include "app/ReplacementFile.h"
#include "codegen/SourceFiles.h"

namespace {

/// Generated files are for their owner and group to write, for all to read, and not to execute.
constexpr mode_t kSourcePermissions = 0664;


/// Whether the file at \a path holds exactly \a text.
bool
HasContent(const char* path, const BString& text)
{
	std::vector<char> content;
	return ReadContent(path, content) == B_OK
		&& content.size() == static_cast<size_t>(text.Length())
		&& std::equal(content.begin(), content.end(), text.String());
}


status_t
ReplaceContent(const char* path, const char* content, size_t length, bool isNew)
{
	// Waiting for the disk would take longer than everything else that the generator does.
	TReplacementFile replacement(path, REPLACE_UNSYNCED);
	status_t status = replacement.InitCheck();
	if (status != B_OK)
		return status;

	BFile* stream = replacement.Stream();
	const ssize_t written = stream->Write(content, length);
	if (written != static_cast<ssize_t>(length))
		return written < 0 ? static_cast<status_t>(written) : B_DEVICE_FULL;

	mode_t permissions;
	if (isNew && stream->GetPermissions(&permissions) == B_OK)
		stream->SetPermissions(permissions & kSourcePermissions);
	return replacement.Replace();
}

} // namespace


TSourceWriter::TSourceWriter()
	: fDryRun(false)
{
}


bool
TSourceWriter::PrepareFolder(const char* path)
{
	return PathExists(path) || (fDryRun && path[0] != '\0') || CreatePath(path);
}


void
TSourceWriter::WriteText(const char* path, const BString& text)
{
	const bool isNew = !FileExists(path);
	generated_file file{path, isNew ? GENERATED_CREATED : GENERATED_CHANGED, B_OK, BString()};
	if (!isNew && HasContent(path, text))
		file.outcome = GENERATED_UNCHANGED;
	else if (fDryRun)
		file.text = text;
	else {
		file.status = ReplaceContent(path, text.String(), text.Length(), isNew);
		if (file.status != B_OK)
			file.outcome = GENERATED_UNWRITABLE;
	}
	fFiles.push_back(file);
}


void
TSourceWriter::WriteOnce(const char* path, const BString& text)
{
	if (FileExists(path))
		AddKept(path);
	else
		WriteText(path, text);
}


void
TSourceWriter::AddKept(const char* path)
{
	fFiles.push_back({path, GENERATED_KEPT, B_OK, BString()});
}


bool
TSourceWriter::KeepCopy(const char* path)
{
	if (fDryRun)
		return true;

	std::vector<char> content;
	status_t status = ReadContent(path, content);
	if (status == B_OK) {
		BString copy(path);
		copy << "~";
		status = ReplaceContent(copy.String(), content.data(), content.size(), false);
	}
	if (status != B_OK)
		fFiles.push_back({path, GENERATED_UNWRITABLE, status, BString()});
	return status == B_OK;
}


void
TSourceWriter::AddUnreadable(const char* path, status_t status)
{
	fFiles.push_back({path, GENERATED_UNREADABLE, status, BString()});
}


void
TSourceWriter::AddRemark(const char* path, const BString& sentence)
{
	BString remark(path);
	remark << ": " << sentence;
	fRemarks.push_back(remark);
}
