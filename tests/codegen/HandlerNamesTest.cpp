// SPDX-License-Identifier: MIT
// The names that generated code gives to files and event handlers.

#include "codegen/HandlerNames.h"

#include <string>

#include <gtest/gtest.h>

#include "codegen/SampleProject.h"
#include "designer/DesignForm.h"
#include "model/Event.h"

namespace {

std::string
BaseNameOf(const char* path)
{
	char buffer[kGeneratedNameSize];
	EXPECT_EQ(BaseFilename(path, buffer), buffer);
	return buffer;
}


std::string
HandlerOf(const char* eventName)
{
	TEvent event(eventName, nullptr, nullptr, true);
	char buffer[kGeneratedNameSize];
	EXPECT_EQ(EventHandlerName(&event, buffer), buffer);
	return buffer;
}

} // namespace


TEST(HandlerNamesTest, BaseFilenameIsTheLastPartUpToItsFirstDot)
{
	EXPECT_EQ(BaseNameOf("/boot/home/my.form.x"), "my");
	EXPECT_EQ(BaseNameOf("/x/my.form.b"), "my");
	EXPECT_EQ(BaseNameOf("/a.b/plain"), "plain");
	EXPECT_EQ(BaseNameOf("/x/.hidden"), "");
	EXPECT_EQ(BaseNameOf("/x/"), "");
}


TEST(HandlerNamesTest, BaseFilenameOfAPathWithoutASlashTakesTheWholePath)
{
	EXPECT_EQ(BaseNameOf("Form1.frm"), "Form1");
	EXPECT_EQ(BaseNameOf(""), "");
}


TEST(HandlerNamesTest, BaseFilenameFitsItsBuffer)
{
	EXPECT_EQ(BaseNameOf(("/x/" + std::string(400, 'n') + ".frm").c_str()), std::string(255, 'n'));
}


TEST(HandlerNamesTest, BaseFormFilenameIsTheFilesOrWithoutOneTheForms)
{
	SampleProject project;
	char buffer[kGeneratedNameSize] = "untouched";
	TDesignForm* unsaved = project.AddForm("Form1", "");
	EXPECT_STREQ(BaseFormFilename(unsaved, buffer), "Form1");
	EXPECT_STREQ(buffer, "untouched");

	TDesignForm* saved = project.AddForm("Form2", "/x/main.window.frm");
	EXPECT_EQ(BaseFormFilename(saved, buffer), buffer);
	EXPECT_STREQ(buffer, "main");
}


TEST(HandlerNamesTest, EventHandlerNameDropsOneLeadingOn)
{
	EXPECT_EQ(HandlerOf("OnQuitRequested"), "QuitRequested");
	EXPECT_EQ(HandlerOf("Show"), "Show");
	EXPECT_EQ(HandlerOf("OnOnClick"), "OnClick");
	EXPECT_EQ(HandlerOf("onClick"), "onClick");
	EXPECT_EQ(HandlerOf("ONClick"), "ONClick");
	EXPECT_EQ(HandlerOf("On"), "");
	EXPECT_EQ(HandlerOf("O"), "O");
	EXPECT_EQ(HandlerOf("Once"), "ce");
}


TEST(HandlerNamesTest, ComponentEventHandlerNameBeginsWithTheComponent)
{
	TestApplication();
	TSampleControl button("TButton", "Button1", 0, 0, 1, 1);
	TEvent event("OnClick", nullptr, nullptr, true);
	char buffer[kGeneratedNameSize];
	EXPECT_STREQ(ComponentEventHandlerName(&button, &event, buffer), "Button1Click");
	EXPECT_EQ(HandlerName(button, event), "Button1Click");
}


TEST(HandlerNamesTest, LongHandlerNamesFitTheBufferAndAreWholeElsewhere)
{
	TestApplication();
	const std::string longName(300, 'b');
	TSampleControl button("TButton", longName.c_str(), 0, 0, 1, 1);
	TEvent event("OnClick", nullptr, nullptr, true);
	char buffer[kGeneratedNameSize];
	EXPECT_EQ(ComponentEventHandlerName(&button, &event, buffer), std::string(255, 'b'));
	EXPECT_EQ(HandlerName(button, event), (longName + "Click").c_str());
}


TEST(HandlerNamesTest, MissingReturnTypesAndParametersAreVoid)
{
	TEvent bare("OnShow", nullptr, nullptr, true);
	EXPECT_EQ(HandlerPrototype(bare, "Show"), "$TABvirtual void Show(void);\n");
	EXPECT_EQ(HandlerStart(bare, "TX", "Show"), "void TX::Show(void)\n{\n");
	EXPECT_EQ(HandlerBody(bare), "\n");

	TEvent full("OnAsk", "int32 a, bool b", "bool", true);
	EXPECT_EQ(HandlerPrototype(full, "Ask"), "$TABvirtual bool Ask(int32 a, bool b);\n");
	EXPECT_EQ(HandlerStart(full, "TX", "Ask"), "bool TX::Ask(int32 a, bool b)\n{\n");
	EXPECT_EQ(HandlerBody(full), "$TABbool result;\n\n$TABreturn result;\n");
}


TEST(HandlerNamesTest, NonBreakingSpacesInParametersAreKept)
{
	TEvent moved("OnMouseMoved",
		"const\xc2\xa0"
		"BMessage\xc2\xa0*message",
		nullptr, true);
	EXPECT_EQ(HandlerPrototype(moved, "MouseMoved"),
		"$TABvirtual void MouseMoved(const\xc2\xa0"
		"BMessage\xc2\xa0*message);\n");
}
