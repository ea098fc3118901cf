// SPDX-License-Identifier: MIT

#include "designer/KeptOriginal.h"

#include <vector>

#include <Entry.h>
#include <File.h>
#include <NodeInfo.h>
#include <String.h>

#include "app/ReplacementFile.h"
#include "designer/FileStamp.h"
#include "designer/FormFile.h"

namespace {

status_t
ReadContent(BFile* file, std::vector<char>* content)
{
	off_t size;
	const status_t status = file->GetSize(&size);
	if (status != B_OK)
		return status;
	content->resize(static_cast<size_t>(size));
	const ssize_t length = file->ReadAt(0, content->data(), content->size());
	if (length != size)
		return length < 0 ? static_cast<status_t>(length) : B_IO_ERROR;
	return B_OK;
}


status_t
WriteContent(const char* path, const std::vector<char>& content)
{
	TReplacementFile file(path);
	if (file.InitCheck() != B_OK)
		return file.InitCheck();
	const ssize_t size = static_cast<ssize_t>(content.size());
	const ssize_t written = file.Stream()->Write(content.data(), size);
	if (written != size)
		return written < 0 ? static_cast<status_t>(written) : B_DEVICE_FULL;
	BNodeInfo(file.Stream()).SetType(kFormFileType);
	return file.Replace();
}

} // namespace

status_t
KeepOriginal(const char* path)
{
	BFile file(path, B_READ_ONLY);
	if (file.InitCheck() == B_ENTRY_NOT_FOUND)
		return B_OK;
	if (file.InitCheck() != B_OK)
		return file.InitCheck();
	std::vector<char> content;
	const status_t status = ReadContent(&file, &content);
	if (status != B_OK)
		return status;
	TFileStamp stamp;
	stamp.Take(&file);

	BString kept;
	for (int32 number = 1;; number++) {
		kept = path;
		kept << ".orig";
		if (number > 1)
			kept << number;
		// A link that leads nowhere is somebody's, too.
		if (!BEntry(kept.String()).Exists())
			return WriteContent(kept.String(), content);
		if (!stamp.Differs(kept.String()) && BEntry(kept.String(), true).IsFile())
			return B_OK;
	}
}
