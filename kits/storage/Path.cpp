// SPDX-License-Identifier: MIT
// BPath: an absolute path as text.

#include <Path.h>

#include <string.h>

#include <Directory.h>
#include <Entry.h>
#include <Errors.h>
#include <StorageDefs.h>
#include <TypeConstants.h>

#include "storage/EntryRefFlattening.h"
#include "storage/EntryResolving.h"


namespace {

bool
EndsWith(const std::string& text, const char* end)
{
	const size_t length = strlen(end);
	return text.size() >= length && text.compare(text.size() - length, length, end) == 0;
}


bool
NeedsNormalizing(const std::string& path)
{
	if (path[0] != '/')
		return true;
	return path.find("//") != std::string::npos || path.find("/./") != std::string::npos
		|| path.find("/../") != std::string::npos || EndsWith(path, "/.") || EndsWith(path, "/..")
		|| (path.size() > 1 && path.back() == '/');
}

} // namespace


BPath::BPath()
	: fStatus(B_NO_INIT)
{
}


BPath::BPath(const BPath& path)
	: BFlattenable(path),
	  fPath(path.fPath),
	  fStatus(path.fStatus)
{
}


BPath::BPath(const entry_ref* ref)
	: fStatus(B_NO_INIT)
{
	SetTo(ref);
}


BPath::BPath(const BEntry* entry)
	: fStatus(B_NO_INIT)
{
	SetTo(entry);
}


BPath::BPath(const char* dir, const char* leaf, bool normalize)
	: fStatus(B_NO_INIT)
{
	SetTo(dir, leaf, normalize);
}


BPath::BPath(const BDirectory* dir, const char* leaf, bool normalize)
	: fStatus(B_NO_INIT)
{
	SetTo(dir, leaf, normalize);
}


BPath::~BPath() {}


status_t
BPath::InitCheck() const
{
	return fStatus;
}


status_t
BPath::SetTo(const entry_ref* ref)
{
	if (ref == nullptr)
		return Fail(B_BAD_VALUE);
	std::string path;
	const status_t status = BPrivate::find_ref_path(*ref, &path);
	if (status != B_OK)
		return Fail(status);
	fPath = path;
	fStatus = B_OK;
	return B_OK;
}


status_t
BPath::SetTo(const BEntry* entry)
{
	if (entry == nullptr)
		return Fail(B_BAD_VALUE);
	entry_ref ref;
	const status_t status = entry->GetRef(&ref);
	return status == B_OK ? SetTo(&ref) : Fail(status);
}


status_t
BPath::SetTo(const char* path, const char* leaf, bool normalize)
{
	if (path == nullptr || (leaf != nullptr && leaf[0] == '/'))
		return Fail(B_BAD_VALUE);

	// The arguments may point into the path that is replaced.
	std::string joined = path;
	if (leaf != nullptr && leaf[0] != '\0')
		joined = joined.empty() ? leaf : BPrivate::join_path(joined, leaf);
	if (joined.size() >= B_PATH_NAME_LENGTH)
		return Fail(B_NAME_TOO_LONG);

	if (normalize || NeedsNormalizing(joined)) {
		entry_ref ref;
		status_t status = BPrivate::resolve_path(joined.c_str(), false, &ref);
		if (status == B_OK)
			status = BPrivate::find_ref_path(ref, &joined);
		if (status != B_OK)
			return Fail(status);
	}
	fPath = joined;
	fStatus = B_OK;
	return B_OK;
}


status_t
BPath::SetTo(const BDirectory* dir, const char* leaf, bool normalize)
{
	if (dir == nullptr)
		return Fail(B_BAD_VALUE);
	BEntry entry;
	status_t status = dir->GetEntry(&entry);
	if (status != B_OK)
		return Fail(status);
	BPath folder(&entry);
	if (folder.InitCheck() != B_OK)
		return Fail(folder.InitCheck());
	return SetTo(folder.Path(), leaf, normalize);
}


void
BPath::Unset()
{
	Fail(B_NO_INIT);
}


status_t
BPath::Append(const char* path, bool normalize)
{
	if (fStatus != B_OK)
		return Fail(B_BAD_VALUE);
	if (path == nullptr)
		return Fail(B_BAD_VALUE);
	return SetTo(fPath.c_str(), path, normalize);
}


const char*
BPath::Path() const
{
	return fStatus == B_OK ? fPath.c_str() : nullptr;
}


const char*
BPath::Leaf() const
{
	return fStatus == B_OK ? fPath.c_str() + fPath.rfind('/') + 1 : nullptr;
}


status_t
BPath::GetParent(BPath* path) const
{
	if (path == nullptr)
		return B_BAD_VALUE;
	if (fStatus != B_OK)
		return fStatus;
	if (fPath == "/")
		return B_ENTRY_NOT_FOUND;
	const size_t slash = fPath.rfind('/');
	return path->SetTo(slash == 0 ? "/" : fPath.substr(0, slash).c_str());
}


bool
BPath::IsAbsolute() const
{
	return fStatus == B_OK && fPath[0] == '/';
}


bool
BPath::operator==(const BPath& item) const
{
	return *this == item.Path();
}


bool
BPath::operator==(const char* path) const
{
	if (fStatus != B_OK || path == nullptr)
		return fStatus != B_OK && path == nullptr;
	return fPath == path;
}


bool
BPath::operator!=(const BPath& item) const
{
	return !(*this == item);
}


bool
BPath::operator!=(const char* path) const
{
	return !(*this == path);
}


BPath&
BPath::operator=(const BPath& item)
{
	fPath = item.fPath;
	fStatus = item.fStatus;
	return *this;
}


BPath&
BPath::operator=(const char* path)
{
	if (path == nullptr)
		Unset();
	else
		SetTo(path);
	return *this;
}


bool
BPath::IsFixedSize() const
{
	return false;
}


type_code
BPath::TypeCode() const
{
	return B_REF_TYPE;
}


ssize_t
BPath::FlattenedSize() const
{
	entry_ref ref;
	if (fStatus == B_OK && BPrivate::resolve_path(fPath.c_str(), false, &ref) != B_OK)
		return B_ENTRY_NOT_FOUND;
	return BPrivate::flatten_entry_ref(ref).size();
}


status_t
BPath::Flatten(void* buffer, ssize_t size) const
{
	if (buffer == nullptr)
		return B_BAD_VALUE;
	entry_ref ref;
	if (fStatus == B_OK) {
		const status_t status = BPrivate::resolve_path(fPath.c_str(), false, &ref);
		if (status != B_OK)
			return status;
	}
	const std::string bytes = BPrivate::flatten_entry_ref(ref);
	if (size < (ssize_t)bytes.size())
		return B_BAD_VALUE;
	memcpy(buffer, bytes.data(), bytes.size());
	return B_OK;
}


bool
BPath::AllowsTypeCode(type_code code) const
{
	return code == B_REF_TYPE;
}


status_t
BPath::Unflatten(type_code code, const void* buffer, ssize_t size)
{
	if (code != B_REF_TYPE || size < 0)
		return Fail(B_BAD_VALUE);
	entry_ref ref;
	const status_t status = BPrivate::unflatten_entry_ref(buffer, size, &ref);
	if (status != B_OK)
		return Fail(status);
	if (ref.name != nullptr)
		return SetTo(&ref);
	Unset();
	return B_OK;
}


status_t
BPath::Fail(status_t status)
{
	fPath.clear();
	fStatus = status;
	return status;
}
