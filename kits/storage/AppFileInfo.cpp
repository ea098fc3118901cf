// SPDX-License-Identifier: MIT
// BAppFileInfo: what an application's file tells about the application.

#include <AppFileInfo.h>

#include <string>

#include <Errors.h>
#include <File.h>
#include <Message.h>
#include <TypeConstants.h>
#include <fs_attr.h>

#include "storage/AttributeText.h"

namespace {

const char* const kSignatureAttribute = "BEOS:APP_SIG";
const char* const kFlagsAttribute = "BEOS:APP_FLAGS";
const char* const kTypesAttribute = "BEOS:FILE_TYPES";
const type_code kFlagsType = 'APPF';

} // namespace


BAppFileInfo::BAppFileInfo() {}


BAppFileInfo::BAppFileInfo(BFile* file)
	: BNodeInfo(file)
{
}


BAppFileInfo::~BAppFileInfo() {}


status_t
BAppFileInfo::SetTo(BFile* file)
{
	return BNodeInfo::SetTo(file);
}


status_t
BAppFileInfo::GetType(char* type) const
{
	return BNodeInfo::GetType(type);
}


status_t
BAppFileInfo::SetType(const char* type)
{
	return BNodeInfo::SetType(type);
}


status_t
BAppFileInfo::GetSignature(char* signature) const
{
	if (signature == nullptr)
		return B_BAD_VALUE;
	if (InitCheck() != B_OK)
		return InitCheck();
	return BPrivate::read_mime_attribute(*Node(), kSignatureAttribute, signature);
}


status_t
BAppFileInfo::SetSignature(const char* signature)
{
	if (InitCheck() != B_OK)
		return InitCheck();
	return BPrivate::write_mime_attribute(Node(), kSignatureAttribute, signature);
}


status_t
BAppFileInfo::GetAppFlags(uint32* flags) const
{
	if (flags == nullptr)
		return B_BAD_VALUE;
	if (InitCheck() != B_OK)
		return InitCheck();
	uint32 value;
	const ssize_t bytes = Node()->ReadAttr(kFlagsAttribute, kFlagsType, 0, &value, sizeof(value));
	if (bytes < 0)
		return bytes;
	if (bytes != sizeof(value))
		return B_BAD_DATA;
	*flags = value;
	return B_OK;
}


status_t
BAppFileInfo::SetAppFlags(uint32 flags)
{
	if (InitCheck() != B_OK)
		return InitCheck();
	const ssize_t written =
		Node()->WriteAttr(kFlagsAttribute, kFlagsType, 0, &flags, sizeof(flags));
	return written < 0 ? written : B_OK;
}


status_t
BAppFileInfo::RemoveAppFlags()
{
	return InitCheck() == B_OK ? Node()->RemoveAttr(kFlagsAttribute) : InitCheck();
}


status_t
BAppFileInfo::GetSupportedTypes(BMessage* types) const
{
	if (types == nullptr)
		return B_BAD_VALUE;
	if (InitCheck() != B_OK)
		return InitCheck();
	attr_info info;
	const status_t status = Node()->GetAttrInfo(kTypesAttribute, &info);
	if (status != B_OK)
		return status;

	std::string bytes(info.size, '\0');
	const ssize_t read =
		Node()->ReadAttr(kTypesAttribute, B_MESSAGE_TYPE, 0, bytes.data(), bytes.size());
	if (read < 0)
		return read;
	// A message in memory is not told where the memory ends.
	BMemoryIO stream((const void*)bytes.data(), (size_t)read);
	return types->Unflatten(&stream) == B_OK ? B_OK : B_BAD_DATA;
}


status_t
BAppFileInfo::SetSupportedTypes(const BMessage* types, bool updateMimeDB, bool)
{
	if (InitCheck() != B_OK)
		return InitCheck();
	if (types == nullptr) {
		const status_t status = Node()->RemoveAttr(kTypesAttribute);
		return status == B_ENTRY_NOT_FOUND ? B_OK : status;
	}

	BMessage supported;
	const char* type;
	for (int32 i = 0; types->FindString("types", i, &type) == B_OK; i++) {
		if (!BMimeType::IsValid(type))
			return B_BAD_VALUE;
		supported.AddString("types", type);
	}
	std::string bytes(supported.FlattenedSize(), '\0');
	status_t status = supported.Flatten(bytes.data(), bytes.size());
	if (status != B_OK)
		return status;
	const ssize_t written =
		Node()->WriteAttr(kTypesAttribute, B_MESSAGE_TYPE, 0, bytes.data(), bytes.size());
	if (written < 0)
		return written;

	for (int32 i = 0; updateMimeDB && supported.FindString("types", i, &type) == B_OK; i++) {
		BMimeType mimeType(type);
		status = mimeType.Install();
		if (status != B_OK && status != B_FILE_EXISTS)
			return status;
	}
	return B_OK;
}


status_t
BAppFileInfo::SetSupportedTypes(const BMessage* types, bool syncAll)
{
	return SetSupportedTypes(types, true, syncAll);
}


status_t
BAppFileInfo::SetSupportedTypes(const BMessage* types)
{
	return SetSupportedTypes(types, true, false);
}


bool
BAppFileInfo::IsSupportedType(const char* type) const
{
	BMessage types;
	const BMimeType asked(type);
	if (asked.InitCheck() != B_OK || GetSupportedTypes(&types) != B_OK)
		return false;
	const char* supported;
	for (int32 i = 0; types.FindString("types", i, &supported) == B_OK; i++) {
		if (BMimeType(supported).Contains(&asked))
			return true;
	}
	return false;
}


status_t
BAppFileInfo::GetIcon(BBitmap* icon, icon_size which) const
{
	return BNodeInfo::GetIcon(icon, which);
}


status_t
BAppFileInfo::GetIcon(uint8** data, size_t* size) const
{
	type_code type;
	return BNodeInfo::GetIcon(data, size, &type);
}
