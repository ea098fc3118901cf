// SPDX-License-Identifier: MIT

#include "ProgramRun.h"

#include <fstream>
#include <sstream>

#include "support/Command.h"
#include "support/TemporaryFolder.h"

namespace {

const std::string kStepMark = "> ";
const std::string kCallMark = "! ";

} // namespace

std::string
listed_event::FullName() const
{
	return owner + "." + (component.empty() ? "" : component + ".") + name;
}


std::vector<listed_event>
ListedEvents()
{
	std::vector<listed_event> events;
	std::ifstream list(EVENTS_LIST);
	for (std::string line; std::getline(list, line);) {
		listed_event event;
		std::istringstream words(line);
		std::string frame;
		std::getline(words, event.owner, '\t');
		std::getline(words, event.component, '\t');
		std::getline(words, event.className, '\t');
		std::getline(words, frame, '\t');
		std::getline(words, event.name, '\t');
		std::istringstream(frame) >> event.frame.left >> event.frame.top >> event.frame.right
			>> event.frame.bottom;
		events.push_back(event);
	}
	return events;
}


ProgramRun::ProgramRun(const std::string& dialect)
	: fDialect(dialect)
{
}


void
ProgramRun::Step(const std::string& name)
{
	fSteps.push_back(name);
	Do("print \"" + kStepMark + name + "\"");
}


void
ProgramRun::Do(const std::string& command)
{
	fScript += command + "\n";
}


void
ProgramRun::Run(const std::string& before, const std::string& after)
{
	TemporaryFolder folder;
	std::ofstream(folder / "script.robot") << fScript;
	const command_result result = RunCommand(
		"BE_DISPLAY=qt QT_QPA_PLATFORM=offscreen BE_ROBOT_SCRIPT=" + (folder / "script.robot") + " "
		+ before + " " + Within(60) + EVENTS_PROGRAM + fDialect + " " + after);
	fCode = result.code;
	fOutput = result.output;
	Read();
}


void
ProgramRun::Read()
{
	std::string step;
	std::istringstream output(fOutput);
	for (std::string line; std::getline(output, line);) {
		if (line.compare(0, kStepMark.size(), kStepMark) == 0)
			step = line.substr(kStepMark.size());
		else if (line.compare(0, kCallMark.size(), kCallMark) == 0)
			fCalls[step].push_back(line.substr(kCallMark.size()));
	}
}


const Lines&
ProgramRun::Calls(const std::string& step) const
{
	static const Lines kNone;
	const auto found = fCalls.find(step);
	return found != fCalls.end() ? found->second : kNone;
}


Lines
ProgramRun::AllCalls() const
{
	Lines all;
	for (const std::string& step : fSteps) {
		const Lines& calls = Calls(step);
		all.insert(all.end(), calls.begin(), calls.end());
	}
	return all;
}


Lines
ProgramRun::Calls(const std::string& step, const std::string& name) const
{
	Lines wanted;
	for (const std::string& call : Calls(step)) {
		const bool begins = call.compare(0, name.size(), name) == 0;
		if (begins
			&& (name.back() == '.' || call.size() == name.size() || call[name.size()] == ' '))
			wanted.push_back(call);
	}
	return wanted;
}
