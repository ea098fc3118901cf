// SPDX-License-Identifier: MIT
// What a load had to leave out.

#pragma once

#include <vector>

#include <String.h>

enum load_problem_kind {
	LOAD_FILE_UNREADABLE,   // a form file could not be opened or read; the form is empty
	LOAD_CLASS_UNKNOWN,     // no library offers the class; the component is dropped
	LOAD_COMPONENT_DAMAGED, // the component's record could not be used; the component is dropped
	LOAD_OWNER_REFUSED      // a component would be inside itself; it stays on the form
};

struct load_problem {
	load_problem_kind kind;
	BString file; // the document that has the problem
	BString text; // one sentence, without a line break
};

/// The problems of one load, in the order in which they were met.
class TLoadReport {
public:
	void Add(load_problem_kind kind, const char* file, const BString& text)
	{
		fProblems.push_back({kind, file, text});
	}

	const std::vector<load_problem>& Problems() const { return fProblems; }

private:
	std::vector<load_problem> fProblems;
};
