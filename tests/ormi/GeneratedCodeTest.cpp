// SPDX-License-Identifier: MIT
// Tests that the compiler takes what the generator writes for every property and event that there is.

#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include <Application.h>

#include "codegen/DialectGenerator.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "model/AppComponent.h"
#include "model/Event.h"
#include "model/Property.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "project/Project.h"
#include "support/Command.h"
#include "support/ComponentLibraries.h"
#include "support/TemporaryFolder.h"

namespace {

/// A text with all that has a meaning in C++ source, and what must not have one.
const char* const kHardText =
	"say \"hi\" \\ 50%\tnext\nline ?\?/ ?\?' gr\xc3\xbc\xc3\x9f no\xc2\xa0"
	"break \x01"
	"1 $TAB $FORMNAME */ // \xe2\x80\xae \xff end\\";


/// Ticks all events; in the classic dialect all but the one whose parameter text no compiler reads.
void
TickEvents(TComponent* component, source_dialect dialect)
{
	for (int32 i = 0; i < component->CountEvents(); i++) {
		const char* name = component->EventAt(i)->name;
		if (dialect == DIALECT_STANDARD || strcmp(name, "OnMouseMoved") != 0)
			component->SetEventSelection(name, true);
	}
}


TComponent*
Place(TDesignForm* form, const char* className, BRect frame, TComponent* parent = nullptr)
{
	PaletteCatalog().SetDropEntry(PaletteCatalog().FindPalEntry(className));
	BView* view = parent != nullptr ? parent->DTView() : form->View();
	TComponent* component = form->CreateComponent(view, frame);
	form->DoneDroppingComponent();
	if (component != nullptr && parent != nullptr)
		dynamic_cast<TComponentOwner*>(parent)->AddComponent(component);
	return component;
}


/// Puts a component of every class on \a form, and into each container another one of every class.
void
PlaceAll(TDesignForm* form, source_dialect dialect)
{
	std::vector<const char*> classes;
	for (int32 i = 0; i < PaletteCatalog().CountPalEntries(); i++)
		classes.push_back(PaletteCatalog().PalEntryAt(i)->ClassName());
	ASSERT_EQ(classes.size(), 21u);

	std::vector<TComponent*> containers;
	float top = 10;
	for (const char* className : classes) {
		TComponent* component = Place(form, className, BRect(10, top, 200, top + 60));
		ASSERT_NE(component, nullptr) << className;
		TickEvents(component, dialect);
		top += 70;
		if (dynamic_cast<TComponentOwner*>(component) != nullptr)
			containers.push_back(component);
	}
	for (TComponent* container : containers) {
		for (const char* className : classes) {
			TComponent* component = Place(form, className, BRect(10, 10, 100, 50), container);
			ASSERT_NE(component, nullptr) << className;
			TickEvents(component, dialect);
		}
	}
}


/// Gives every property that is a text in the program the same one.
void
SetTexts(TComponent* component, const char* text)
{
	for (int32 i = 0; i < component->CountProperties(); i++) {
		TProperty* property = component->PropertyAt(i);
		if (property->IsGenerated() && property->IsQuoted())
			property->SetValue(text);
	}
}


/// Generates the program "AllEvents" into \a folder, with every component, property and event that there is.
/// \a text: what all texts in it are; null for what they are at first.
void
GenerateAll(const TemporaryFolder& folder, source_dialect dialect, const char* text)
{
	TProject project(FORM_HIDDEN);
	project.App()->SetPropertyValue("Name", "AllEvents");
	project.App()->SetPropertyValue("GenerationPath", folder.Path().c_str());
	TickEvents(project.App(), dialect);
	TDesignForm* form = project.NewForm();
	TickEvents(form, dialect);
	ASSERT_NO_FATAL_FAILURE(PlaceAll(form, dialect));
	if (text != nullptr) {
		SetTexts(form, text);
		for (int32 i = 0; i < form->View()->CountComponents(); i++)
			SetTexts(form->View()->ComponentAt(i), text);
	}
	TDialectGenerator generator(dialect);
	generator.SetAppComponent(project.App());
	generator.GenerateApp();
}


/// Compiles the program in one piece, as a stranger to the tree would. \a flags: beside the folders of headers.
command_result
Compile(const TemporaryFolder& folder, const std::string& compiler, const std::string& flags)
{
	folder.Write("all.cpp", "#include \"Form1.cpp\"\n#include \"AllEvents.cpp\"\n");
	return RunCommand("cd " + folder.Path()
		+ " && includes=$(PKG_CONFIG_PATH=" PLIM_BUILD_DIR
		  "/pkgconfig pkg-config --cflags-only-I ormi) && " PLIM_LAUNCHER " "
		+ compiler + " " + flags
		+ " " PLIM_CXXFLAGS " -Wno-multichar $includes -c all.cpp -o all.o");
}


/// The same with no warning taken, from the program and from the headers.
command_result
CompileStrictly(const TemporaryFolder& folder, const std::string& compiler)
{
	return Compile(folder, compiler, "-std=c++17 -Wall -Wextra -Werror -pedantic");
}

} // namespace


class GeneratedCodeTest : public testing::Test {
protected:
	GeneratedCodeTest()
	{
		LoadComponentLibraries();
		EXPECT_NE(PaletteCatalog().CountPalEntries(), 0);
	}

	BApplication fApplication{"application/x-vnd.plimworks-ormi-test"};
	TemporaryFolder fFolder;
};


TEST_F(GeneratedCodeTest, EveryPropertyAndEventCompiles)
{
	ASSERT_NO_FATAL_FAILURE(GenerateAll(fFolder, DIALECT_CLASSIC, nullptr));
	const command_result result = Compile(fFolder, PLIM_CXX, "-fpermissive -w");
	EXPECT_EQ(result.code, 0) << result.output;
	// Something was ticked.
	const std::string form = fFolder.Read("Form1.cpp");
	for (const char* handler : {"TForm1::QuitRequested", "TForm1::Button1Click",
			 "TForm1::Box1FrameMoved", "TForm1::TextControl2Enter", "TForm1::Slider1Modify",
			 "TForm1::MenuBar1Invoke(BMenuItem *item)"})
		EXPECT_NE(form.find(handler), std::string::npos) << handler;
}


TEST_F(GeneratedCodeTest, StandardCodeCompilesStrictlyAndKeepsTheTexts)
{
	ASSERT_NO_FATAL_FAILURE(GenerateAll(fFolder, DIALECT_STANDARD, kHardText));
	// The user's code tells what the texts are, and ends the program before the handlers matter, which are empty.
	std::string form = fFolder.Read("Form1.cpp");
	const std::string create = "void TForm1::FormCreate(void)\n{\n\n}";
	const size_t at = form.find(create);
	ASSERT_NE(at, std::string::npos);
	form.replace(at, create.length(),
		"#include <stdio.h>\n#include <unistd.h>\n\n"
		"void TForm1::FormCreate(void)\n{\n"
		"  for (const char *text : {Title(), Button1->Label(), StringView1->Text(), "
		"TextView1->Text(),\n"
		"         TextControl1->Label(), Box1->Label(), StatusBar1->Text(),\n"
		"         Slider1->MinLimitLabel()}) {\n"
		"    fputs(text, stdout);\n    putchar(0);\n  }\n"
		"  fflush(stdout);\n  _exit(0);\n}");
	fFolder.Write("Form1.cpp", form);

	const command_result compiled = CompileStrictly(fFolder, PLIM_CXX);
	ASSERT_EQ(compiled.code, 0) << compiled.output;
	const command_result ran = RunCommand("cd " + fFolder.Path()
		+ " && " PLIM_CXX " " PLIM_CXXFLAGS " all.o -o all $(PKG_CONFIG_PATH=" PLIM_BUILD_DIR
		  "/pkgconfig pkg-config --libs ormi) && BE_DISPLAY=none ./all");
	EXPECT_EQ(ran.code, 0) << ran.output;
	std::string expected;
	for (int i = 0; i < 8; i++)
		expected.append(kHardText).append(1, '\0');
	EXPECT_EQ(ran.output, expected);
}


TEST_F(GeneratedCodeTest, StandardCodeCompilesStrictlyWithClang)
{
	if (PLIM_CLANG[0] == '\0')
		GTEST_SKIP() << "there is no clang++ on this machine";
	ASSERT_NO_FATAL_FAILURE(GenerateAll(fFolder, DIALECT_STANDARD, kHardText));
	const command_result compiled = CompileStrictly(fFolder, PLIM_CLANG);
	EXPECT_EQ(compiled.code, 0) << compiled.output;
}
