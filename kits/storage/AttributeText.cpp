// SPDX-License-Identifier: MIT
// Attributes whose text is a MIME type or a signature.

#include "storage/AttributeText.h"

#include <string.h>

#include <Errors.h>
#include <MimeType.h>
#include <Node.h>
#include <TypeConstants.h>

namespace BPrivate {

status_t
read_mime_attribute(const BNode& node, const char* name, char* text)
{
	char buffer[B_MIME_TYPE_LENGTH + 1];
	const ssize_t bytes = node.ReadAttr(name, B_MIME_STRING_TYPE, 0, buffer, B_MIME_TYPE_LENGTH);
	if (bytes < 0)
		return bytes;
	buffer[bytes] = '\0';
	if (!BMimeType::IsValid(buffer))
		return B_BAD_DATA;
	strcpy(text, buffer);
	return B_OK;
}


status_t
write_mime_attribute(BNode* node, const char* name, const char* text)
{
	if (text == nullptr) {
		const status_t status = node->RemoveAttr(name);
		return status == B_ENTRY_NOT_FOUND ? B_OK : status;
	}
	if (!BMimeType::IsValid(text))
		return B_BAD_VALUE;
	const ssize_t written = node->WriteAttr(name, B_MIME_STRING_TYPE, 0, text, strlen(text) + 1);
	return written < 0 ? written : B_OK;
}

} // namespace BPrivate
