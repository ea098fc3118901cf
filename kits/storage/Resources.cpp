// SPDX-License-Identifier: MIT
// BResources: typed data kept in a file, found by number or name.
//
// The resources lie at the end of the file: a block of records (type, number, sizes of name and data,
// each 4 bytes in the order of a little endian machine, then name and data), the size of the block (8
// bytes) and a mark (8 bytes). What stands before is none of their business.

#include <Resources.h>

#include <string>
#include <vector>

#include <dlfcn.h>
#include <stdio.h>
#include <string.h>

#include <Entry.h>
#include <Errors.h>

#include "storage/StorageStatus.h"

namespace {

const char kMark[8] = {'B', 'e', 'R', 's', 'r', 'c', '\0', '\1'};
const size_t kTrailerSize = sizeof(uint64) + sizeof(kMark);
const size_t kRecordSize = 4 * sizeof(uint32);
const uint64 kMaxResources = 1 << 30;


struct resource {
	type_code type;
	int32 id;
	bool hasName;
	std::string name;
	std::string data;
};


void
AppendNumber(uint64 number, size_t size, std::string* bytes)
{
	for (size_t i = 0; i < size; i++)
		*bytes += (char)(number >> 8 * i);
}


uint64
NumberAt(const char* bytes, size_t size)
{
	uint64 number = 0;
	for (size_t i = size; i > 0; i--)
		number = number << 8 | (uint8)bytes[i - 1];
	return number;
}


status_t
ReadBlock(BFile& file, off_t offset, size_t size, std::string* bytes)
{
	bytes->resize(size);
	size_t done = 0;
	while (done < size) {
		const ssize_t read = file.ReadAt(offset + done, bytes->data() + done, size - done);
		if (read < 0)
			return read;
		if (read == 0)
			return B_BAD_DATA;
		done += read;
	}
	return B_OK;
}


status_t
ParseRecords(const std::string& bytes, std::vector<resource>* resources)
{
	size_t position = 0;
	while (position < bytes.size()) {
		if (bytes.size() - position < kRecordSize)
			return B_BAD_DATA;
		const char* record = bytes.data() + position;
		resource read;
		read.type = NumberAt(record, 4);
		read.id = (int32)NumberAt(record + 4, 4);
		// The size of the name counts a terminator, so that no name is not an empty one.
		const uint64 nameSize = NumberAt(record + 8, 4);
		const uint64 dataSize = NumberAt(record + 12, 4);
		position += kRecordSize;
		if (nameSize + dataSize > bytes.size() - position)
			return B_BAD_DATA;
		read.hasName = nameSize > 0;
		if (read.hasName)
			read.name = bytes.substr(position, nameSize - 1).c_str();
		read.data = bytes.substr(position + nameSize, dataSize);
		position += nameSize + dataSize;
		resources->push_back(std::move(read));
	}
	return B_OK;
}


/// Finds the resources of a file. \a contentSize: what the file has besides.
status_t
ReadResources(BFile& file, off_t* contentSize, std::vector<resource>* resources)
{
	off_t size;
	status_t status = file.GetSize(&size);
	if (status != B_OK)
		return status;
	*contentSize = size;
	if (size < (off_t)kTrailerSize)
		return B_OK;

	std::string trailer;
	status = ReadBlock(file, size - kTrailerSize, kTrailerSize, &trailer);
	if (status != B_OK)
		return status;
	if (memcmp(trailer.data() + sizeof(uint64), kMark, sizeof(kMark)) != 0)
		return B_OK;

	const uint64 blockSize = NumberAt(trailer.data(), sizeof(uint64));
	if (blockSize > kMaxResources || blockSize > (uint64)size - kTrailerSize)
		return B_BAD_DATA;
	std::string block;
	status = ReadBlock(file, size - kTrailerSize - blockSize, blockSize, &block);
	if (status != B_OK)
		return status;
	*contentSize = size - kTrailerSize - blockSize;
	return ParseRecords(block, resources);
}


status_t
WriteResources(BFile& file, off_t contentSize, const std::vector<resource>& resources)
{
	std::string block;
	for (const resource& written : resources) {
		AppendNumber(written.type, 4, &block);
		AppendNumber((uint32)written.id, 4, &block);
		AppendNumber(written.hasName ? written.name.size() + 1 : 0, 4, &block);
		AppendNumber(written.data.size(), 4, &block);
		if (written.hasName)
			block.append(written.name.c_str(), written.name.size() + 1);
		block += written.data;
	}
	const size_t blockSize = block.size();
	if (blockSize > kMaxResources)
		return B_FILE_TOO_LARGE;
	if (!resources.empty()) {
		AppendNumber(blockSize, sizeof(uint64), &block);
		block.append(kMark, sizeof(kMark));
	}

	const ssize_t bytes = file.WriteAt(contentSize, block.data(), block.size());
	if (bytes < 0)
		return bytes;
	if ((size_t)bytes < block.size())
		return B_DEVICE_FULL;
	return file.SetSize(contentSize + block.size());
}

} // namespace


struct BResources::Contents {
	std::vector<std::unique_ptr<resource>> resources;
	off_t contentSize = 0;
	bool isChanged = false;

	resource* Find(type_code type, int32 id) const
	{
		for (const auto& candidate : resources) {
			if (candidate->type == type && candidate->id == id)
				return candidate.get();
		}
		return nullptr;
	}

	resource* Find(type_code type, const char* name) const
	{
		for (const auto& candidate : resources) {
			if (candidate->type == type && name != nullptr && candidate->hasName
				&& candidate->name == name)
				return candidate.get();
		}
		return nullptr;
	}

	/// The index counts resources of the type alone.
	resource* At(type_code type, int32 index) const
	{
		for (const auto& candidate : resources) {
			if (candidate->type == type && index-- == 0)
				return candidate.get();
		}
		return nullptr;
	}

	resource* FindData(const void* data) const
	{
		for (const auto& candidate : resources) {
			if (candidate->data.data() == data)
				return candidate.get();
		}
		return nullptr;
	}

	void Remove(const resource* removed)
	{
		std::erase_if(
			resources, [removed](const auto& candidate) { return candidate.get() == removed; });
		isChanged = true;
	}

	std::vector<resource> Copies() const
	{
		std::vector<resource> copies;
		for (const auto& original : resources)
			copies.push_back(*original);
		return copies;
	}
};


BResources::BResources()
	: fContents(std::make_unique<Contents>()),
	  fStatus(B_OK)
{
}


BResources::BResources(const BFile* file, bool clobber)
	: BResources()
{
	SetTo(file, clobber);
}


BResources::BResources(const char* path, bool clobber)
	: BResources()
{
	SetTo(path, clobber);
}


BResources::BResources(const entry_ref* ref, bool clobber)
	: BResources()
{
	SetTo(ref, clobber);
}


BResources::~BResources()
{
	Unset();
}


status_t
BResources::SetTo(const BFile* file, bool clobber)
{
	Unset();
	if (file == nullptr)
		return B_OK;
	fFile = *file;
	return Load(clobber);
}


status_t
BResources::SetTo(const char* path, bool clobber)
{
	Unset();
	if (path == nullptr)
		return B_OK;
	if (fFile.SetTo(path, B_READ_WRITE) != B_OK)
		fFile.SetTo(path, B_READ_ONLY);
	return Load(clobber);
}


status_t
BResources::SetTo(const entry_ref* ref, bool clobber)
{
	Unset();
	if (ref == nullptr)
		return B_OK;
	if (fFile.SetTo(ref, B_READ_WRITE) != B_OK)
		fFile.SetTo(ref, B_READ_ONLY);
	return Load(clobber);
}


status_t
BResources::SetToImage(image_id image, bool clobber)
{
	image_info info;
	const status_t status = get_image_info(image, &info);
	if (status == B_OK)
		return SetTo(info.name, clobber);
	Unset();
	fStatus = status;
	return status;
}


status_t
BResources::SetToImage(const void* codeOrDataPointer, bool clobber)
{
	Dl_info info;
	if (codeOrDataPointer != nullptr && dladdr(codeOrDataPointer, &info) != 0
		&& info.dli_fname != nullptr) {
		// The program itself has the name it was started by, which need not be a path.
		const bool isPath = strchr(info.dli_fname, '/') != nullptr;
		return SetTo(isPath ? info.dli_fname : "/proc/self/exe", clobber);
	}
	Unset();
	fStatus = B_BAD_VALUE;
	return fStatus;
}


void
BResources::Unset()
{
	if (fContents->isChanged && fFile.InitCheck() == B_OK)
		Sync();
	fFile.Unset();
	fContents = std::make_unique<Contents>();
	fStatus = B_OK;
}


status_t
BResources::InitCheck() const
{
	return fStatus;
}


const BFile&
BResources::File() const
{
	return fFile;
}


const void*
BResources::LoadResource(type_code type, int32 id, size_t* _size)
{
	const resource* found = fContents->Find(type, id);
	if (found == nullptr)
		return nullptr;
	if (_size != nullptr)
		*_size = found->data.size();
	return found->data.data();
}


const void*
BResources::LoadResource(type_code type, const char* name, size_t* _size)
{
	const resource* found = fContents->Find(type, name);
	return found == nullptr ? nullptr : LoadResource(type, found->id, _size);
}


status_t
BResources::PreloadResourceType(type_code)
{
	return fStatus;
}


status_t
BResources::Sync()
{
	if (fStatus != B_OK)
		return fStatus;
	if (fFile.InitCheck() != B_OK)
		return B_NO_INIT;
	if (!fContents->isChanged)
		return B_OK;
	if (!fFile.IsWritable())
		return B_NOT_ALLOWED;
	const status_t status = WriteResources(fFile, fContents->contentSize, fContents->Copies());
	if (status == B_OK)
		fContents->isChanged = false;
	return status;
}


status_t
BResources::MergeFrom(BFile* fromFile)
{
	if (fromFile == nullptr)
		return B_BAD_VALUE;
	std::vector<resource> merged;
	off_t contentSize;
	status_t status = ReadResources(*fromFile, &contentSize, &merged);
	for (size_t i = 0; i < merged.size() && status == B_OK; i++) {
		const resource& added = merged[i];
		status = AddResource(added.type, added.id, added.data.data(), added.data.size(),
			added.hasName ? added.name.c_str() : nullptr);
	}
	return status;
}


status_t
BResources::WriteTo(BFile* file)
{
	if (file == nullptr)
		return B_BAD_VALUE;
	if (!file->IsWritable())
		return file->InitCheck() == B_OK ? B_NOT_ALLOWED : file->InitCheck();
	std::vector<resource> replaced;
	off_t contentSize;
	// Damaged resources of the file are replaced like sound ones.
	const status_t status = ReadResources(*file, &contentSize, &replaced);
	if (status != B_OK && status != B_BAD_DATA)
		return status;

	fFile = *file;
	fContents->contentSize = contentSize;
	fContents->isChanged = true;
	fStatus = B_OK;
	return Sync();
}


status_t
BResources::AddResource(type_code type, int32 id, const void* data, size_t length, const char* name)
{
	if (fStatus != B_OK)
		return fStatus;
	if (data == nullptr && length > 0)
		return B_BAD_VALUE;
	if (fFile.InitCheck() == B_OK && !fFile.IsWritable())
		return B_NOT_ALLOWED;
	if (length > kMaxResources)
		return B_FILE_TOO_LARGE;

	resource* added = fContents->Find(type, id);
	if (added == nullptr) {
		fContents->resources.push_back(std::make_unique<resource>());
		added = fContents->resources.back().get();
	}
	added->type = type;
	added->id = id;
	added->hasName = name != nullptr;
	added->name = name == nullptr ? "" : name;
	added->data.assign((const char*)data, length);
	fContents->isChanged = true;
	return B_OK;
}


bool
BResources::HasResource(type_code type, int32 id)
{
	return fContents->Find(type, id) != nullptr;
}


bool
BResources::HasResource(type_code type, const char* name)
{
	return fContents->Find(type, name) != nullptr;
}


// Writes what is asked for about a resource that was found; null pointers are not written.
static bool
Describe(const resource* found, type_code* type, int32* id, const char** name, size_t* length)
{
	if (found == nullptr)
		return false;
	if (type != nullptr)
		*type = found->type;
	if (id != nullptr)
		*id = found->id;
	if (name != nullptr)
		*name = found->hasName ? found->name.c_str() : nullptr;
	if (length != nullptr)
		*length = found->data.size();
	return true;
}


bool
BResources::GetResourceInfo(int32 byIndex, type_code* typeFound, int32* idFound,
	const char** nameFound, size_t* lengthFound)
{
	if (byIndex < 0 || (size_t)byIndex >= fContents->resources.size())
		return false;
	return Describe(
		fContents->resources[byIndex].get(), typeFound, idFound, nameFound, lengthFound);
}


bool
BResources::GetResourceInfo(
	type_code byType, int32 andIndex, int32* idFound, const char** nameFound, size_t* lengthFound)
{
	return Describe(fContents->At(byType, andIndex), nullptr, idFound, nameFound, lengthFound);
}


bool
BResources::GetResourceInfo(
	type_code byType, int32 andID, const char** nameFound, size_t* lengthFound)
{
	return Describe(fContents->Find(byType, andID), nullptr, nullptr, nameFound, lengthFound);
}


bool
BResources::GetResourceInfo(
	type_code byType, const char* andName, int32* idFound, size_t* lengthFound)
{
	return Describe(fContents->Find(byType, andName), nullptr, idFound, nullptr, lengthFound);
}


bool
BResources::GetResourceInfo(const void* byPointer, type_code* typeFound, int32* idFound,
	size_t* lengthFound, const char** nameFound)
{
	return Describe(fContents->FindData(byPointer), typeFound, idFound, nameFound, lengthFound);
}


status_t
BResources::RemoveResource(const void* resource)
{
	if (fStatus != B_OK)
		return fStatus;
	if (fFile.InitCheck() == B_OK && !fFile.IsWritable())
		return B_NOT_ALLOWED;
	const auto* found = fContents->FindData(resource);
	if (found == nullptr)
		return B_BAD_VALUE;
	fContents->Remove(found);
	return B_OK;
}


status_t
BResources::RemoveResource(type_code type, int32 id)
{
	const auto* found = fContents->Find(type, id);
	return found == nullptr ? B_BAD_VALUE : RemoveResource(found->data.data());
}


status_t
BResources::Load(bool clobber)
{
	fStatus = fFile.InitCheck();
	if (fStatus != B_OK)
		return fStatus;

	std::vector<resource> read;
	fStatus = ReadResources(fFile, &fContents->contentSize, &read);
	if (fStatus != B_OK && !(clobber && fStatus == B_BAD_DATA))
		return fStatus;
	fStatus = B_OK;
	if (clobber) {
		fContents->isChanged = fFile.IsWritable();
		return fFile.IsWritable() ? B_OK : B_NOT_ALLOWED;
	}
	for (resource& loaded : read)
		fContents->resources.push_back(std::make_unique<resource>(std::move(loaded)));
	return B_OK;
}
