// SPDX-License-Identifier: MIT
// One run of the program with every event, used by a script.

#pragma once

#include <map>
#include <string>
#include <vector>

#include <Rect.h>

using Lines = std::vector<std::string>;

/// An event that the program was generated with.
struct listed_event {
	std::string owner;
	std::string component; ///< "" for the form's or the application's own
	std::string className;
	BRect frame;
	std::string name;

	/// As the program tells of it.
	std::string FullName() const;
};

/// All of them, in the order of the project.
std::vector<listed_event> ListedEvents();

/// A script, and what the program told while each of its steps was carried out.
class ProgramRun {
public:
	/// Of the program in that dialect.
	explicit ProgramRun(const std::string& dialect);

	/// What follows is done in the step \a name.
	void Step(const std::string& name);
	/// A command of the robot.
	void Do(const std::string& command);
	/// Runs the program with words of the shell before and after its name. The last step must end it.
	void Run(const std::string& before = "", const std::string& after = "");

	int Code() const { return fCode; }
	const std::string& Output() const { return fOutput; }
	/// "NAME ARGUMENTS" of each call, in order; those of the time before the first step have the name "".
	const Lines& Calls(const std::string& step) const;
	Lines AllCalls() const;
	/// The calls of \a step whose name is, or begins with, \a name: "Main.Button1.OnClick", "Main.Button1.".
	Lines Calls(const std::string& step, const std::string& name) const;

private:
	void Read();

	std::string fDialect;
	std::string fScript;
	Lines fSteps = {""};
	std::map<std::string, Lines> fCalls;
	int fCode = -1;
	std::string fOutput;
};
