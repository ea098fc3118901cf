// SPDX-License-Identifier: MIT
// What the open panels show.

#pragma once

#include <FilePanel.h>

/// Shows folders and form files.
class TFormRefFilter : public BRefFilter {
public:
	bool Filter(
		const entry_ref* ref, BNode* node, struct stat_beos* stat, const char* mimeType) override;
};

/// Shows folders and project files.
class TProjectRefFilter : public BRefFilter {
public:
	bool Filter(
		const entry_ref* ref, BNode* node, struct stat_beos* stat, const char* mimeType) override;
};
