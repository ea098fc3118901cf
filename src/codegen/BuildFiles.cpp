// SPDX-License-Identifier: MIT
// The files that build a generated program.

#include "codegen/BuildFiles.h"

#include <ctype.h>
#include <string.h>

#include <algorithm>
#include <string_view>

namespace {

constexpr const char* kHeading = "Written once by Plimworks; it is yours from now on.";

constexpr std::string_view kLaunchFlags[] = {"B_SINGLE_LAUNCH", "B_MULTIPLE_LAUNCH",
	"B_EXCLUSIVE_LAUNCH", "B_BACKGROUND_APP", "B_ARGV_ONLY"};

/// Names that CMake has targets of its own for.
constexpr std::string_view kReservedTargets[] = {"all", "clean", "depend", "edit_cache", "help",
	"install", "package", "package_source", "preinstall", "rebuild_cache", "test"};


bool
IsPlain(char c)
{
	return isalnum(static_cast<unsigned char>(c)) || strchr("_.+-", c) != nullptr;
}


/// \a text without line breaks and other control characters.
BString
OnOneLine(const BString& text)
{
	BString line;
	for (int32 i = 0; i < text.Length(); i++)
		line << (static_cast<unsigned char>(text[i]) < 0x20 ? ' ' : text[i]);
	return line;
}


/// \a text with a backslash before each of \a characters.
BString
Escaped(const BString& text, const char* characters)
{
	BString escaped;
	for (int32 i = 0; i < text.Length(); i++) {
		if (strchr(characters, text[i]) != nullptr)
			escaped << "\\";
		escaped << text[i];
	}
	return escaped;
}


/// The name of the target for the program \a name.
BString
TargetName(const BString& name)
{
	BString target;
	for (int32 i = 0; i < name.Length(); i++)
		target << (IsPlain(name[i]) ? name[i] : '_');
	const std::string_view text(target.String());
	const bool isReserved =
		std::find(std::begin(kReservedTargets), std::end(kReservedTargets), text)
		!= std::end(kReservedTargets);
	if (target.IsEmpty() || isReserved)
		target << "_program";
	return target;
}


/// \a text as one argument of a CMake command.
BString
CMakeArgument(const BString& text)
{
	const char* end = text.String() + text.Length();
	if (!text.IsEmpty() && std::all_of(text.String(), end, IsPlain))
		return text;
	BString argument("\"");
	argument << Escaped(OnOneLine(text), "\\\"$") << "\"";
	return argument;
}


/// \a text as the value of a variable of make; several words stay several.
BString
MakeValue(const BString& text)
{
	BString value = OnOneLine(text);
	value.ReplaceAll("$", "$$");
	value.ReplaceAll("#", "\\#");
	return value;
}

} // namespace


BString
CMakeText(const build_plan& plan)
{
	const BString target = TargetName(plan.name);
	BString text;
	text << "# Builds " << OnOneLine(plan.name) << ". " << kHeading << "\n"
		 << "#\n"
		 << "#   cmake -S . -B build -DCMAKE_PREFIX_PATH=<where Plimworks is installed>\n"
		 << "#   cmake --build build\n"
		 << "\n"
		 << "cmake_minimum_required(VERSION 3.16)\n"
		 << "project(" << target << " LANGUAGES CXX)\n"
		 << "\n"
		 << "find_package(Ormi REQUIRED)\n"
		 << "\n"
		 << "# The sources of forms that are added later belong here. The .fcp files are included "
			"by them.\n"
		 << "add_executable(" << target << "\n";
	for (const BString& source : plan.sources)
		text << "  " << CMakeArgument(source) << "\n";
	text << ")\n"
		 << "target_compile_features(" << target << " PRIVATE cxx_std_17)\n"
		 << "target_link_libraries(" << target << " PRIVATE Ormi::ormi)\n";
	return text;
}


BString
MakefileText(const build_plan& plan)
{
	const char* permissive = plan.dialect == DIALECT_CLASSIC ? " -fpermissive" : "";
	BString text;
	text << "# Builds " << OnOneLine(plan.name) << " on Haiku. " << kHeading << "\n"
		 << "#\n"
		 << "#   make\n"
		 << "\n"
		 << "NAME = " << MakeValue(plan.name) << "\n"
		 << "TYPE = APP\n";
	if (!plan.signature.IsEmpty())
		text << "APP_MIME_SIG = " << MakeValue(plan.signature) << "\n";
	text << "\n"
		 << "# The sources of forms that are added later belong here. The .fcp files are included "
			"by them.\n"
		 << "SRCS =";
	for (const BString& source : plan.sources)
		text << " \\\n\t" << MakeValue(source);
	text << "\n"
		 << "RDEFS = " << MakeValue(plan.name) << ".rdef\n"
		 << "\n"
		 << "# Where Plimworks is installed, with the runtime library of generated programs.\n"
		 << "PLIMWORKS ?= /boot/home/config/non-packaged\n"
		 << "SYSTEM_INCLUDE_PATHS = $(PLIMWORKS)/include/plimworks "
			"$(PLIMWORKS)/develop/headers/plimworks\n"
		 << "LIBPATHS = $(PLIMWORKS)/lib\n"
		 << "LIBS = ormi be translation $(STDCPPLIBS)\n"
		 << "\n"
		 << "COMPILER_FLAGS = -std=c++17 -Wno-multichar" << permissive << "\n"
		 << "\n"
		 << "ENGINE_FOLDER := $(shell findpaths -r makefile_engine B_FIND_PATH_DEVELOP_DIRECTORY "
			"2>/dev/null)\n"
		 << "ifeq ($(ENGINE_FOLDER),)\n"
		 << "$(error there is no makefile engine, which Haiku has; elsewhere use CMakeLists.txt)\n"
		 << "endif\n"
		 << "include $(ENGINE_FOLDER)/etc/makefile-engine\n";
	return text;
}


BString
ResourceText(const build_plan& plan)
{
	BString text;
	text << "// The resources of " << OnOneLine(plan.name) << ". " << kHeading << "\n";
	if (!plan.signature.IsEmpty()) {
		text << "\nresource app_signature \"" << Escaped(OnOneLine(plan.signature), "\\\"")
			 << "\";\n";
	}
	if (!plan.launchFlags.IsEmpty())
		text << "\nresource app_flags " << plan.launchFlags << ";\n";
	return text;
}


bool
AreLaunchFlags(const BString& flags)
{
	std::string_view rest(flags.String(), flags.Length());
	while (true) {
		const size_t bar = rest.find('|');
		const std::string_view flag = rest.substr(0, bar);
		if (std::find(std::begin(kLaunchFlags), std::end(kLaunchFlags), flag)
			== std::end(kLaunchFlags))
			return false;
		if (bar == std::string_view::npos)
			return true;
		rest.remove_prefix(bar + 1);
	}
}
