// SPDX-License-Identifier: MIT
// BSymLink: a symbolic link.

#include <SymLink.h>

#include <string.h>
#include <unistd.h>

#include <Directory.h>
#include <Entry.h>
#include <Errors.h>
#include <Path.h>

#include "storage/StorageStatus.h"


BSymLink::BSymLink() {}


BSymLink::BSymLink(const BSymLink& other)
	: BNode(other)
{
}


BSymLink::BSymLink(const entry_ref* ref)
	: BNode(ref)
{
}


BSymLink::BSymLink(const BEntry* entry)
	: BNode(entry)
{
}


BSymLink::BSymLink(const char* path)
	: BNode(path)
{
}


BSymLink::BSymLink(const BDirectory* dir, const char* path)
	: BNode(dir, path)
{
}


BSymLink::~BSymLink() {}


ssize_t
BSymLink::ReadLink(char* buf, size_t size)
{
	if (buf == nullptr)
		return B_BAD_VALUE;
	if (InitCheck() != B_OK)
		return InitCheck();
	if (!IsSymLink())
		return B_BAD_VALUE;

	char target[PATH_MAX];
	const ssize_t length = readlinkat(Descriptor(), "", target, sizeof(target));
	if (length < 0)
		return BPrivate::status_from_errno(errno);
	memcpy(buf, target, min_c((size_t)length, size));
	if ((size_t)length < size)
		buf[length] = '\0';
	return length;
}


ssize_t
BSymLink::MakeLinkedPath(const char* dirPath, BPath* path)
{
	if (dirPath == nullptr || path == nullptr)
		return B_BAD_VALUE;
	char target[PATH_MAX + 1];
	const ssize_t length = ReadLink(target, sizeof(target));
	if (length < 0)
		return length;

	const status_t status = target[0] == '/' ? path->SetTo(target) : path->SetTo(dirPath, target);
	return status == B_OK ? (ssize_t)strlen(path->Path()) : status;
}


ssize_t
BSymLink::MakeLinkedPath(const BDirectory* dir, BPath* path)
{
	if (dir == nullptr || path == nullptr)
		return B_BAD_VALUE;
	const BPath folder(dir);
	return folder.InitCheck() == B_OK ? MakeLinkedPath(folder.Path(), path) : folder.InitCheck();
}


bool
BSymLink::IsAbsolute()
{
	char target[PATH_MAX + 1];
	return ReadLink(target, sizeof(target)) > 0 && target[0] == '/';
}
