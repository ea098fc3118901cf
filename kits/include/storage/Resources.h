// SPDX-License-Identifier: MIT
// BResources: typed data kept in a file, found by number or name.

#ifndef _RESOURCES_H
#define _RESOURCES_H

#include <memory>

#include <File.h>
#include <image.h>

/// The resources of a file.
///
/// They lie behind the rest of the file's content, so that a program stays a program. They are read
/// when the object is set, and changes are written by Sync(), by setting the object to another file
/// and by destruction.
class BResources {
public:
	BResources();
	BResources(const BFile* file, bool clobber = false);
	BResources(const char* path, bool clobber = false);
	BResources(const entry_ref* ref, bool clobber = false);
	virtual ~BResources();

	/// \a clobber drops the file's present resources. The object opens the file for itself; where it
	/// can only be read, changing the resources is B_NOT_ALLOWED. B_BAD_DATA for damaged resources.
	status_t SetTo(const BFile* file, bool clobber = false);
	status_t SetTo(const char* path, bool clobber = false);
	status_t SetTo(const entry_ref* ref, bool clobber = false);
	/// The file of a loaded image, or of the one that contains the address.
	status_t SetToImage(image_id image, bool clobber = false);
	status_t SetToImage(const void* codeOrDataPointer, bool clobber = false);
	void Unset();
	status_t InitCheck() const;
	const BFile& File() const;

	/// The data are owned by the object; null when absent.
	const void* LoadResource(type_code type, int32 id, size_t* _size);
	const void* LoadResource(type_code type, const char* name, size_t* _size);
	/// Everything is in memory from the beginning: returns InitCheck().
	status_t PreloadResourceType(type_code type = 0);

	status_t Sync();
	/// Adds the file's resources, replacing those of the same type and number.
	status_t MergeFrom(BFile* fromFile);
	/// Writes the resources to \a file, which the object stands for from then on.
	status_t WriteTo(BFile* file);

	/// Replaces a resource of the same type and number.
	status_t AddResource(
		type_code type, int32 id, const void* data, size_t length, const char* name = NULL);
	bool HasResource(type_code type, int32 id);
	bool HasResource(type_code type, const char* name);
	bool GetResourceInfo(int32 byIndex, type_code* typeFound, int32* idFound,
		const char** nameFound, size_t* lengthFound);
	bool GetResourceInfo(type_code byType, int32 andIndex, int32* idFound, const char** nameFound,
		size_t* lengthFound);
	bool GetResourceInfo(
		type_code byType, int32 andID, const char** nameFound, size_t* lengthFound);
	bool GetResourceInfo(
		type_code byType, const char* andName, int32* idFound, size_t* lengthFound);
	bool GetResourceInfo(const void* byPointer, type_code* typeFound, int32* idFound,
		size_t* lengthFound, const char** nameFound);
	status_t RemoveResource(const void* resource);
	status_t RemoveResource(type_code type, int32 id);

private:
	struct Contents;

	BResources(const BResources&) = delete;
	BResources& operator=(const BResources&) = delete;

	status_t Load(bool clobber);

	BFile fFile;
	std::unique_ptr<Contents> fContents;
	status_t fStatus;
};

#endif
