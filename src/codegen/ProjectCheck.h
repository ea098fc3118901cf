// SPDX-License-Identifier: MIT
// Finds what would keep a project's generated sources from compiling.

#pragma once

#include <string>
#include <string_view>
#include <unordered_map>
#include <unordered_set>
#include <vector>

#include "codegen/Dialect.h"

class TAppComponent;
class TComponent;
class TDesignForm;
struct TEvent;

/// A reason why generated sources would not compile, or would overwrite each other.
struct project_problem {
	std::string file; // the document that has it
	std::string text; // what is wrong and what to do, in one sentence
};

/// Looks through an application and its forms for names that cannot be used in generated sources.
///
/// That is: names of the application, a form or a component that are no C++ identifiers; files, classes and
/// members that would have the same name; selected events whose handlers would not compile. Used once; reads
/// the forms without locking them.
class TProjectCheck {
public:
	/// \a projectFile: the name under which problems of the application are reported.
	/// \a dialect: that which the sources are to be written in.
	TProjectCheck(const TAppComponent* app, const char* projectFile,
		source_dialect dialect = DIALECT_CLASSIC);

	/// Looks at everything, and returns the problems in the order of the project's forms.
	const std::vector<project_problem>& Run();

private:
	/// What has a name, for a report: "the event OnClick of the component 'Button1'".
	struct name_owner {
		std::string Text() const;

		const char* kind;            // "the component"
		const char* name;            // null when the kind says it all
		const char* event = nullptr; // null when the name is not that of a handler
	};
	typedef std::unordered_map<std::string, name_owner> name_owners;

	void CheckApp();
	void CheckForm(TDesignForm* form);
	void CheckFormFile(TDesignForm* form);
	void CheckFormClasses(TDesignForm* form);
	void CheckComponentNames(TDesignForm* form);
	void CheckComponentClass(const TComponent* component);
	void CheckHandlers(TDesignForm* form);
	void CheckHandler(const TEvent& event, const std::string& name, const name_owner& eventOwner);
	void CheckIdentifier(const char* name, const name_owner& owner);
	void ClaimName(
		name_owners& owners, const std::string& name, const name_owner& owner, const char* kind);
	void Report(const std::string& text);

	const TAppComponent* fApp;
	std::string fProjectFile;
	source_dialect fDialect;
	std::string fFile; // the document being looked at
	name_owners fFiles;
	name_owners fClasses;
	name_owners fMembers;  // of the class being looked at
	name_owners fHandlers; // of the class being looked at, in lower case
	std::vector<project_problem> fProblems;
};

/// Whether \a name is a C++ identifier and no keyword.
bool IsIdentifier(std::string_view name);
