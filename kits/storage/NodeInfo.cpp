// SPDX-License-Identifier: MIT
// BNodeInfo: the file type, preferred application and icon of a node.

#include <NodeInfo.h>

#include <string.h>
#include <unistd.h>

#include <Bitmap.h>
#include <Errors.h>
#include <Node.h>
#include <TypeConstants.h>
#include <fs_attr.h>

#include "storage/AttributeText.h"
#include "storage/MimeGuess.h"

namespace {

const char* const kTypeAttribute = "BEOS:TYPE";
const char* const kPreferredAppAttribute = "BEOS:PREF_APP";
const char* const kIconAttribute = "BEOS:ICON";
const char* const kLargeIconAttribute = "BEOS:L:STD_ICON";
const char* const kMiniIconAttribute = "BEOS:M:STD_ICON";
// An icon is a picture of a few colours: more bytes are none.
const off_t kMaxIconSize = 1 << 20;

} // namespace


BNodeInfo::BNodeInfo()
	: fNode(nullptr),
	  fStatus(B_NO_INIT)
{
}


BNodeInfo::BNodeInfo(BNode* node)
	: fNode(nullptr),
	  fStatus(B_NO_INIT)
{
	SetTo(node);
}


BNodeInfo::~BNodeInfo() {}


status_t
BNodeInfo::SetTo(BNode* node)
{
	fNode = nullptr;
	fStatus = node == nullptr ? B_BAD_VALUE : node->InitCheck();
	if (fStatus == B_OK)
		fNode = node;
	return fStatus;
}


status_t
BNodeInfo::InitCheck() const
{
	return fStatus;
}


status_t
BNodeInfo::GetType(char* type) const
{
	if (type == nullptr)
		return B_BAD_VALUE;
	if (fStatus != B_OK)
		return fStatus;
	if (BPrivate::read_mime_attribute(*fNode, kTypeAttribute, type) == B_OK)
		return B_OK;

	// Copied, unpacked and checked out files have lost the attribute.
	const int fd = fNode->Dup();
	if (fd < 0)
		return fd;
	std::string guess;
	const status_t status = BPrivate::guess_descriptor_type(fd, "", &guess);
	close(fd);
	if (status != B_OK)
		return status;
	if (guess == B_FILE_MIME_TYPE || guess.size() >= B_MIME_TYPE_LENGTH)
		return B_ENTRY_NOT_FOUND;
	strcpy(type, guess.c_str());
	return B_OK;
}


status_t
BNodeInfo::SetType(const char* type)
{
	if (fStatus != B_OK)
		return fStatus;
	return BPrivate::write_mime_attribute(fNode, kTypeAttribute, type);
}


status_t
BNodeInfo::GetIcon(BBitmap* icon, icon_size which) const
{
	if (icon == nullptr || (which != B_LARGE_ICON && which != B_MINI_ICON))
		return B_BAD_VALUE;
	if (fStatus != B_OK)
		return fStatus;
	if (icon->InitCheck() != B_OK || icon->Bounds() != BRect(0, 0, which - 1, which - 1))
		return B_BAD_VALUE;

	// One byte a pixel, rows of the icon's width.
	uint8 data[B_LARGE_ICON * B_LARGE_ICON];
	const size_t size = which * which;
	const bool isLarge = which == B_LARGE_ICON;
	const ssize_t bytes = fNode->ReadAttr(isLarge ? kLargeIconAttribute : kMiniIconAttribute,
		isLarge ? B_LARGE_ICON_TYPE : B_MINI_ICON_TYPE, 0, data, size);
	if (bytes < 0)
		return bytes;
	if ((size_t)bytes != size)
		return B_BAD_DATA;
	icon->SetBits(data, size, 0, B_CMAP8);
	return B_OK;
}


status_t
BNodeInfo::GetIcon(uint8** data, size_t* size, type_code* type) const
{
	if (data == nullptr || size == nullptr || type == nullptr)
		return B_BAD_VALUE;
	if (fStatus != B_OK)
		return fStatus;
	attr_info info;
	const status_t status = fNode->GetAttrInfo(kIconAttribute, &info);
	if (status != B_OK)
		return status;
	if (info.size <= 0 || info.size > kMaxIconSize)
		return B_BAD_DATA;

	uint8* bytes = new uint8[info.size];
	const ssize_t read = fNode->ReadAttr(kIconAttribute, info.type, 0, bytes, info.size);
	if (read != info.size) {
		delete[] bytes;
		return read < 0 ? read : B_BAD_DATA;
	}
	*data = bytes;
	*size = info.size;
	*type = info.type;
	return B_OK;
}


status_t
BNodeInfo::GetPreferredApp(char* signature, app_verb) const
{
	if (signature == nullptr)
		return B_BAD_VALUE;
	if (fStatus != B_OK)
		return fStatus;
	return BPrivate::read_mime_attribute(*fNode, kPreferredAppAttribute, signature);
}


status_t
BNodeInfo::SetPreferredApp(const char* signature, app_verb)
{
	if (fStatus != B_OK)
		return fStatus;
	return BPrivate::write_mime_attribute(fNode, kPreferredAppAttribute, signature);
}
