// SPDX-License-Identifier: MIT

#include "designer/RefFilters.h"

#include <gtest/gtest.h>

TEST(RefFiltersTest, ShowFoldersAndTheirOwnDocuments)
{
	const struct {
		const char* type;
		bool form;
		bool project;
	} kCases[] = {
		{"application/x-vnd.Be-directory", true, true},
		{"application/x-plim-form", true, false},
		{"application/x-plim-project", false, true},
		{"Application/x-plim-form", false, false},
		{"application/x-plim-forms", false, false},
		{"text/plain", false, false},
		{"", false, false},
		{nullptr, false, false},
	};
	TFormRefFilter form;
	TProjectRefFilter project;
	for (const auto& row : kCases) {
		const char* type = row.type != nullptr ? row.type : "none";
		EXPECT_EQ(form.Filter(nullptr, nullptr, nullptr, row.type), row.form) << type;
		EXPECT_EQ(project.Filter(nullptr, nullptr, nullptr, row.type), row.project) << type;
	}
}
