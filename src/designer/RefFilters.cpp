// SPDX-License-Identifier: MIT

#include "designer/RefFilters.h"

#include <cstring>

#include "designer/FormFile.h"

namespace {

bool
IsFolderOr(const char* documentType, const char* mimeType)
{
	if (mimeType == nullptr)
		return false;
	return strcmp(mimeType, "application/x-vnd.Be-directory") == 0
		|| strcmp(mimeType, documentType) == 0;
}

} // namespace

bool
TFormRefFilter::Filter(const entry_ref*, BNode*, struct stat_beos*, const char* mimeType)
{
	return IsFolderOr(kFormFileType, mimeType);
}


bool
TProjectRefFilter::Filter(const entry_ref*, BNode*, struct stat_beos*, const char* mimeType)
{
	return IsFolderOr(kProjectFileType, mimeType);
}
