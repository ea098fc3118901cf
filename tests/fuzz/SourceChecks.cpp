// SPDX-License-Identifier: MIT
// What must hold for any source that a user has edited and that is generated again.

#include "fuzz/SourceChecks.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <iterator>
#include <memory>
#include <string>

#include <String.h>

#include "codegen/CodeGenerator.h"
#include "codegen/SampleProject.h"
#include "codegen/SourceText.h"
#include "designer/DesignForm.h"
#include "fuzz/Require.h"
#include "support/TemporaryFolder.h"

namespace {

/// The files that users edit, and one that is written anew each time.
const char* const kFiles[] = {"Form1.h", "Form1.cpp", "MyApp.h", "MyApp.cpp", "Form1.fcp"};
constexpr size_t kAnew = 4;


SampleProject&
Project()
{
	// Never destroyed: the application is gone by then.
	static SampleProject* const sProject = [] {
		setenv("BE_DISPLAY", "none", 1);
		return SampleProject::MakeFull().release();
	}();
	return *sProject;
}


std::string
Generate(const TemporaryFolder& folder, size_t file)
{
	TCodeGenerator generator;
	generator.SetAppComponent(&Project().App());
	generator.SetGenerationPath(folder.Path().c_str());
	TDesignForm* form = static_cast<TDesignForm*>(Project().App().ComponentAt(0));
	switch (file) {
		case 0:
			generator.GenerateFormHeader(form);
			break;
		case 2:
			generator.GenerateAppHeader();
			break;
		case 3:
			generator.GenerateAppSource();
			break;
		default:
			generator.GenerateFormSource(form);
			break;
	}
	for (const generated_file& each : generator.Writer().Files())
		REQUIRE(each.outcome != GENERATED_UNWRITABLE && each.outcome != GENERATED_UNREADABLE);
	return folder.Read(kFiles[file]);
}


void
CheckRegeneration(size_t file, const std::string& text)
{
	static const TemporaryFolder sFolder;
	for (const char* name : kFiles)
		remove((sFolder / name).c_str());
	sFolder.Write(kFiles[file], text);
	const std::string once = Generate(sFolder, file);
	if (file == kAnew) {
		REQUIRE(once == Generate(sFolder, file));
		return;
	}

	// What stands before everything that is the generator's stays.
	const size_t kept =
		std::min({text.find("// ["), text.find_first_of("$\t\n"), text.find('\0'), text.size()});
	if (kept <= kMaxLineLength)
		REQUIRE(once.compare(0, kept, text, 0, kept) == 0);

	// A section whose end marker the user has moved takes what is in between with it; what is missed then is written
	// the next time. From there on nothing more happens, but that reading adds an empty line.
	const std::string twice = Generate(sFolder, file);
	const std::string thrice = Generate(sFolder, file);
	REQUIRE(thrice == twice + "\n" || thrice == twice);
}


void
CheckSections(const std::string& text)
{
	BString lines;
	AppendNormalizedLines(text.data(), text.size(), lines);
	REQUIRE(lines.FindFirst("\t") < 0);
	REQUIRE(lines.Length() > 0 && lines.String()[lines.Length() - 1] == '\n');
	REQUIRE(strlen(lines.String()) == static_cast<size_t>(lines.Length()));

	const BString content("  the new content\n");
	BString edited(lines);
	const bool written = WriteMachineSection("FORM_CLASS", content, true, edited);
	REQUIRE(written == (edited.FindFirst(content) >= 0) || lines.FindFirst(content) >= 0);
	if (written) {
		const BString once(edited);
		REQUIRE(WriteMachineSection("FORM_CLASS", content, true, edited));
		REQUIRE(edited == once);
	} else
		REQUIRE(edited == lines);

	BString user;
	WriteUserSection("FORM_CLASS", true, lines, user);
	REQUIRE(user.FindFirst("// [FORM_CLASS]\n") == 0);

	for (int32 start : {-1, 0, lines.Length() / 2, lines.Length()}) {
		const BString body = FunctionBody(lines, start);
		const int32 from = start < 0 ? 0 : start;
		REQUIRE(body.Length() <= lines.Length() - from);
		REQUIRE(strncmp(body.String(), lines.String() + from, body.Length()) == 0);
	}

	BString replaced(lines);
	ReplacePlaceholders(replaced, {{"$FORMNAME", "Form1"}, {"$TAB", "  "}});
	REQUIRE(replaced.IFindFirst("$TAB") < 0 || lines.IFindFirst("$T") >= 0);
	BString indented(lines);
	IndentContinuationLines(indented);
	REQUIRE(indented.Length() >= lines.Length());
}

} // namespace


void
CheckSourceBytes(const uint8_t* bytes, size_t size)
{
	if (size == 0)
		return;
	const std::string text(reinterpret_cast<const char*>(bytes) + 1, size - 1);
	CheckSections(text);
	CheckRegeneration(bytes[0] % std::size(kFiles), text);
}
