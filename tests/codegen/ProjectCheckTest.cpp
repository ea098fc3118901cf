// SPDX-License-Identifier: MIT
// The problems that would keep generated sources from compiling.

#include "codegen/ProjectCheck.h"

#include <functional>

#include <gtest/gtest.h>

#include "codegen/SampleProject.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "model/Event.h"

namespace {

/// The problems of a project, each "FILE: text", one a line.
std::string
ProblemsOf(SampleProject& project)
{
	TProjectCheck check(&project.App(), "/x/app.plim");
	std::string all;
	for (const project_problem& problem : check.Run())
		all += problem.file + ": " + problem.text + "\n";
	return all;
}


TSampleControl*
PlaceButton(SampleProject& project, TDesignForm* form, const char* name)
{
	return project.Place(form, new TSampleControl("TButton", name, 0, 0, 1, 1));
}

} // namespace


TEST(IsIdentifierTest, TakesWordsThatAreNoKeywords)
{
	for (const char* name : {"a", "_", "Button1", "__x", "classes", "A9"})
		EXPECT_TRUE(IsIdentifier(name)) << name;
	for (const char* name : {"", "1a", "a b", "a-b", "a.b", "a$", "\xc3\xa4", "class", "this",
			 "xor", "co_await", "new"})
		EXPECT_FALSE(IsIdentifier(name)) << name;
}


TEST(ProjectCheckTest, FindsNothingInASoundProject)
{
	EXPECT_EQ(ProblemsOf(*SampleProject::MakeFull()), "");
}


TEST(ProjectCheckTest, FindsEachKindOfProblem)
{
	typedef std::function<void(SampleProject&, TDesignForm*)> change;
	struct problem_case {
		const char* name;
		change make;
		const char* expected; // a part of the one problem
	} const cases[] = {
		{"application's name",
			[](SampleProject& project, TDesignForm*) { project.App().SetComponentName("My App"); },
			"/x/app.plim: the name of the application 'My App' is no C++ identifier; rename it"},
		{"form's name", [](SampleProject&, TDesignForm* form) { form->SetComponentName("Form-1"); },
			"/x/Form1.frm: the name of the form 'Form-1' is no C++ identifier; rename it"},
		{"form's file name",
			[](SampleProject&, TDesignForm* form) { form->SetFilename("/x/my-form.frm"); },
			"/x/my-form.frm: the file's name 'my-form' cannot be part of a C++ identifier"},
		{"component's name",
			[](SampleProject& project, TDesignForm* form) { PlaceButton(project, form, "1st"); },
			"/x/Form1.frm: the name of the component '1st' is no C++ identifier; rename it"},
		{"component called like a keyword",
			[](SampleProject& project, TDesignForm* form) { PlaceButton(project, form, "delete"); },
			"the name of the component 'delete' is no C++ identifier"},
		{"two components of one name",
			[](SampleProject& project, TDesignForm* form) {
				PlaceButton(project, form, "Twin");
				PlaceButton(project, form, "Twin");
			},
			"the component 'Twin' and the component 'Twin' would both have the member 'Twin'"},
		{"component called like a generated function",
			[](SampleProject& project, TDesignForm* form) {
				PlaceButton(project, form, "FormCreate");
			},
			"the generated class and the component 'FormCreate' would both have the member"},
		{"component called like its class",
			[](SampleProject& project, TDesignForm* form) {
				PlaceButton(project, form, "TButton");
			},
			"the components' class 'TButton' and the component 'TButton' would both have the "
			"member"},
		{"component called like the form's class",
			[](SampleProject& project, TDesignForm* form) { PlaceButton(project, form, "TForm1"); },
			"the form's class and the component 'TForm1' would both have the member"},
		{"component class that is no identifier",
			[](SampleProject& project, TDesignForm* form) {
				project.Place(form, new TSampleControl("T Odd", "Odd", 0, 0, 1, 1));
			},
			"the class name 'T Odd' of the component 'Odd' is no C++ identifier"},
		{"component called like a handler",
			[](SampleProject& project, TDesignForm* form) {
				PlaceButton(project, form, "BClick");
				PlaceButton(project, form, "B")->AddSelectedEvent("OnClick");
			},
			"the component 'BClick' and the event OnClick of the component 'B' would both have the "
			"member 'BClick'"},
		{"two handlers of one name",
			[](SampleProject& project, TDesignForm* form) {
				PlaceButton(project, form, "A")->AddSelectedEvent("OnBClick");
				PlaceButton(project, form, "AB")->AddSelectedEvent("OnClick");
			},
			"would both have the member 'ABClick'"},
		{"handlers that differ in case",
			[](SampleProject& project, TDesignForm* form) {
				PlaceButton(project, form, "Go")->AddSelectedEvent("OnClick");
				PlaceButton(project, form, "GO")->AddSelectedEvent("OnClick");
			},
			"the handlers of the event OnClick of the component 'Go' and of the event OnClick of "
			"the "
			"component 'GO' differ in the case of letters only"},
		{"non-breaking spaces in a handler's parameters",
			[](SampleProject&, TDesignForm* form) {
				form->SetEventSelection("OnMouseMoved", true);
			},
			"the handler 'MouseMoved' of the event OnMouseMoved of the form 'Form1' would not "
			"compile: "
			"its parameters hold characters that are no plain ASCII"},
		{"parameters with open brackets",
			[](SampleProject& project, TDesignForm* form) {
				PlaceButton(project, form, "B")->AddSelectedEvent("OnX", "int (*f)(int");
			},
			"the brackets of its parameters do not match"},
		{"handler that returns a reference",
			[](SampleProject& project, TDesignForm* form) {
				PlaceButton(project, form, "B")->AddSelectedEvent("OnX", nullptr, "BString &");
			},
			"it cannot return 'BString &'"},
		{"handler that returns void by name",
			[](SampleProject& project, TDesignForm* form) {
				PlaceButton(project, form, "B")->AddSelectedEvent("OnX", nullptr, "void");
			},
			"it cannot return 'void'"},
		{"handler that returns a constant",
			[](SampleProject& project, TDesignForm* form) {
				PlaceButton(project, form, "B")->AddSelectedEvent("OnX", nullptr, "const int");
			},
			"it cannot return 'const int'"},
		{"handler without a name of its own",
			[](SampleProject&, TDesignForm* form) {
				form->AddEvent(new TEvent("On", nullptr, nullptr, true));
			},
			"the handler '' of the event On of the form 'Form1' is no C++ identifier"},
		{"application handler called like a generated function",
			[](SampleProject& project, TDesignForm*) {
				project.App().AddEvent(new TEvent("OnMainForm", nullptr, nullptr, true));
			},
			"/x/app.plim: the generated class and the event OnMainForm of the application"},
		{"two forms that share a file name",
			[](SampleProject& project, TDesignForm*) { project.AddForm("Other", "/y/Form1.frm"); },
			"/y/Form1.frm: the form 'Form1' and the form 'Other' would both have the files "
			"'Form1'"},
		{"form and application that share a file name",
			[](SampleProject& project, TDesignForm*) { project.AddForm("Other", "/y/MyApp.frm"); },
			"the application 'MyApp' and the form 'Other' would both have the files 'MyApp'"},
		{"form called like the application",
			[](SampleProject& project, TDesignForm*) { project.AddForm("MyApp", "/y/Other.frm"); },
			"the application 'MyApp' and the form 'MyApp' would both have the class 'TMyApp'"},
		{"form called like another one's view",
			[](SampleProject& project, TDesignForm*) { project.AddForm("Form1View", "/y/F.frm"); },
			"the form 'Form1' and the form 'Form1View' would both have the class 'TForm1View'"},
		{"form called like a component class",
			[](SampleProject& project, TDesignForm* form) {
				form->SetComponentName("Button");
				PlaceButton(project, form, "B");
			},
			"'TButton' is also the class of the form 'Button'"},
	};
	for (const problem_case& each : cases) {
		SampleProject project;
		TDesignForm* form = project.AddForm("Form1", "/x/Form1.frm");
		each.make(project, form);
		const std::string problems = ProblemsOf(project);
		EXPECT_NE(problems.find(each.expected), std::string::npos) << each.name << ":\n"
																   << problems;
		EXPECT_EQ(std::count(problems.begin(), problems.end(), '\n'), 1) << each.name << ":\n"
																		 << problems;
	}
}


TEST(ProjectCheckTest, AFormCalledFormClashesWithTheRuntimeLibrary)
{
	SampleProject project;
	project.AddForm("Form", "/x/Form.frm");
	const std::string problems = ProblemsOf(project);
	EXPECT_NE(
		problems.find("the runtime library and the form 'Form' would both have the class 'TForm'"),
		std::string::npos)
		<< problems;
}


TEST(ProjectCheckTest, EventsThatAreNotSelectedAreNoProblem)
{
	SampleProject project;
	TDesignForm* form = project.AddForm("Form1", "/x/Form1.frm");
	TSampleControl* button = PlaceButton(project, form, "B");
	button->AddEvent(new TEvent("On", "(", "void", false));
	EXPECT_EQ(ProblemsOf(project), "");
}


TEST(ProjectCheckTest, PointersToConstantsAreReturned)
{
	SampleProject project;
	TDesignForm* form = project.AddForm("Form1", "/x/Form1.frm");
	PlaceButton(project, form, "B")->AddSelectedEvent("OnX", nullptr, "const char *");
	EXPECT_EQ(ProblemsOf(project), "");
}
