// SPDX-License-Identifier: MIT
// Attributes whose text is a MIME type or a signature.

#ifndef _ATTRIBUTE_TEXT_H
#define _ATTRIBUTE_TEXT_H

#include <SupportDefs.h>

class BNode;

namespace BPrivate {

/// \a text: B_MIME_TYPE_LENGTH bytes. B_BAD_DATA, nothing written, when the text is no MIME type.
status_t read_mime_attribute(const BNode& node, const char* name, char* text);

/// Null removes the attribute, which need not be there. B_BAD_VALUE for a text that is no MIME type.
status_t write_mime_attribute(BNode* node, const char* name, const char* text);

} // namespace BPrivate

#endif
