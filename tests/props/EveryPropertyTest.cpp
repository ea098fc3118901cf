// SPDX-License-Identifier: MIT
// Every property of every built-in and standard component, edited by mouse and by keyboard, saved and loaded back.

#include <algorithm>
#include <map>

#include "PropertyWinTest.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "palette/LibraryLoader.h"
#include "palette/PaletteCatalog.h"
#include "project/Project.h"
#include "props/StringList.h"
#include "support/CapturedOutput.h"
#include "support/TemporaryFolder.h"

namespace {

using Values = std::map<std::string, std::string>;

/// What is typed for a text property: edges stay on the screen, beside the property window.
std::string
NewText(const std::string& name, bool isForm, int round)
{
	// A form's right and bottom edges move with the others before they are edited.
	const std::map<std::string, int> edges = {{"Left", (isForm ? 400 : 10) + round},
		{"Top", 60 + round}, {"Right", (isForm ? 700 : 90) + 20 * round},
		{"Bottom", 200 + 20 * round}};
	const auto edge = edges.find(name);
	if (edge != edges.end())
		return std::to_string(edge->second);
	if (name == "Divider")
		return std::to_string(20 + round);
	return "Text" + std::to_string(round);
}


class EveryPropertyTest : public PropertyWinTest {
protected:
	void SetUp() override
	{
		PropertyWinTest::SetUp();
		if (PaletteCatalog().CountPalEntries() == 0)
			TLibraryLoader(&PaletteCatalog()).LoadFolder(PLIM_BUILD_DIR "/bin/Components");
		form = NewForm("Form1");
		{
			WindowGuard guard(form);
			form->MoveTo(400, 60);
			form->ResizeTo(300, 200);
			form->Show();
		}
		robot.Settle();
	}

	void TearDown() override
	{
		Show(nullptr, nullptr);
		Close(form);
		PropertyWinTest::TearDown();
	}

	TDesignForm* NewForm(const char* name, form_visibility visibility = FORM_SHOWN)
	{
		return new TDesignForm(name, visibility);
	}

	void Close(TDesignForm* closed)
	{
		if (closed->Lock())
			closed->Quit();
	}

	TComponent* Place(const char* className, BRect frame)
	{
		WindowGuard guard(form);
		PaletteCatalog().SetDropEntry(PaletteCatalog().FindPalEntry(className));
		TComponent* component = form->CreateComponent(form->View(), frame);
		form->DoneDroppingComponent();
		return component;
	}

	void ShowOnForm(TComponent* component)
	{
		Show(nullptr, nullptr);
		Show(component, form->View());
		{
			WindowGuard guard(window);
			window->Activate();
		}
		ASSERT_TRUE(robot.WaitForWindow("Properties"));
		robot.Settle();
	}

	std::string ValueOf(TComponent* component, const std::string& name)
	{
		robot.Settle();
		WindowGuard guard(form);
		return component->FindProperty(name.c_str())->Value();
	}

	Values ValuesOf(TComponent* component)
	{
		Values values;
		for (int32 i = 0; i < component->CountProperties(); i++)
			values[component->PropertyAt(i)->Name()] = component->PropertyAt(i)->Value();
		return values;
	}

	std::vector<std::string> ChoicesOf(TComponent* component, const std::string& name)
	{
		WindowGuard guard(form);
		TStringList list(20);
		component->FindProperty(name.c_str())->Editor()->GetValuePickList(&list);
		std::vector<std::string> choices;
		for (int32 i = 0; i < list.CountItems(); i++)
			choices.push_back(list.StringAt(i));
		return choices;
	}

	bool IsColor(const std::string& name) { return name.find("Color") != std::string::npos; }

	std::string DialogFor(const std::string& name)
	{
		if (name == "WindowFlags")
			return "Window Flags";
		return IsColor(name) ? "Color" : "View Flags";
	}

	void WaitForEndOf(const std::string& dialog)
	{
		ASSERT_TRUE(robot.WaitForNoWindow(dialog.c_str()));
		ASSERT_TRUE(robot.WaitForWindow("Properties"));
		robot.Settle();
	}

	/// Edits a property with the pointer, typing only what must be typed. Returns the value that must come out; none
	/// when any other than before will do.
	std::string EditByMouse(TComponent* component, const std::string& name, TPropEditType type)
	{
		Select(name.c_str());
		if (type == PET_STRING) {
			const std::string text = NewText(name, component == form, 1);
			Enter(text.c_str());
			return text;
		}
		if (type == PET_PICKLIST) {
			const std::string before = ValueOf(component, name);
			for (const std::string& choice : ChoicesOf(component, name)) {
				if (choice == before)
					continue;
				EXPECT_TRUE(robot.ClickView("mfPickEdit"));
				EXPECT_TRUE(robot.ClickItem(choice.c_str()));
				return choice;
			}
			return before;
		}
		EXPECT_TRUE(robot.ClickView("btnModalEdit"));
		const std::string dialog = DialogFor(name);
		EXPECT_TRUE(robot.WaitForWindow(dialog.c_str()));
		if (IsColor(name)) {
			BPoint middle;
			EXPECT_TRUE(robot.FindView("ccColors", &middle));
			robot.Click(BPoint(middle.x - 70, middle.y));
		} else
			EXPECT_TRUE(robot.ClickView(
				dialog == "View Flags" ? "Pulse Needed" : "No workspace activation"));
		EXPECT_TRUE(robot.ClickView("btnOK"));
		WaitForEndOf(dialog);
		return "";
	}

	/// The same with keys alone; the list has the keyboard focus before and after.
	std::string EditByKeys(TComponent* component, const std::string& name, TPropEditType type)
	{
		robot.Key("home");
		for (int32 row = RowOf(name.c_str()); row > 0; row--)
			robot.Key("down");
		robot.Settle();
		std::string expected;
		robot.Key("tab");
		robot.Settle();
		if (type == PET_STRING) {
			expected = NewText(name, component == form, 2);
			robot.Key("command+a");
			robot.Type(expected.c_str());
			robot.Key("enter");
		} else if (type == PET_PICKLIST) {
			const std::vector<std::string> choices = ChoicesOf(component, name);
			const auto current =
				std::find(choices.begin(), choices.end(), ValueOf(component, name));
			const size_t next = current == choices.end() || current + 1 == choices.end()
				? 0
				: current + 1 - choices.begin();
			// Opened by a key, the menu begins at its first item.
			robot.Key("space");
			for (size_t i = 0; i < next; i++)
				robot.Key("down");
			robot.Key("enter");
			expected = choices[next];
		} else {
			const std::string dialog = DialogFor(name);
			robot.Key("space");
			EXPECT_TRUE(robot.WaitForWindow(dialog.c_str()));
			robot.Key("tab");
			if (IsColor(name)) {
				robot.Key("right");
				robot.Key("left");
				robot.Key("left");
			} else
				robot.Key("space");
			robot.Key("enter");
			WaitForEndOf(dialog);
		}
		robot.Settle();
		robot.Key("shift+tab");
		return expected;
	}

	void EditAll(TComponent* component)
	{
		ShowOnForm(component);
		for (const bool byMouse : {true, false}) {
			if (!byMouse) {
				WindowGuard guard(window);
				List("lvProperties")->MakeFocus(true);
			}
			for (int32 i = 0; i < component->CountProperties() && !HasFatalFailure(); i++) {
				const std::string name = component->PropertyAt(i)->Name();
				const std::string before = ValueOf(component, name);
				const TPropEditType type = component->PropertyAt(i)->Editor()->Type();
				const std::string expected = byMouse ? EditByMouse(component, name, type)
													 : EditByKeys(component, name, type);
				const std::string after = ValueOf(component, name);
				const std::string where = std::string(component->ClassName()) + " " + name
					+ (byMouse ? " by mouse" : " by keyboard");
				EXPECT_NE(after, before) << where;
				EXPECT_TRUE(expected.empty() || after == expected)
					<< where << ": " << after << " in place of " << expected;
			}
		}
	}

	TDesignForm* form = nullptr;
	TemporaryFolder folder;
};


class EveryPropertyOfAClassTest : public EveryPropertyTest,
								  public testing::WithParamInterface<const char*> {};

} // namespace

TEST_F(EveryPropertyTest, OfAForm)
{
	EditAll(form);
	const std::string path = folder / "form.frm";
	{
		WindowGuard guard(form);
		ASSERT_TRUE(form->SaveToFile(path.c_str()));
	}
	TDesignForm* loaded = NewForm("Form1", FORM_HIDDEN);
	ASSERT_TRUE(loaded->LoadFromFile(path.c_str()));
	{
		WindowGuard guard(form);
		EXPECT_EQ(ValuesOf(loaded), ValuesOf(form));
	}
	Close(loaded);
}


TEST_P(EveryPropertyOfAClassTest, IsEditedSavedAndLoaded)
{
	TComponent* component = Place(GetParam(), BRect(10, 10, 50, 40));
	ASSERT_NE(component, nullptr);
	EditAll(component);
	const std::string path = folder / "form.frm";
	{
		WindowGuard guard(form);
		ASSERT_TRUE(form->SaveToFile(path.c_str()));
	}
	TDesignForm* loaded = NewForm("Form1", FORM_HIDDEN);
	ASSERT_TRUE(loaded->LoadFromFile(path.c_str()));
	{
		WindowGuard guard(form);
		ASSERT_EQ(loaded->CountComponents(), 1);
		EXPECT_EQ(ValuesOf(loaded->ComponentAt(0)), ValuesOf(component));
	}
	Close(loaded);
}

INSTANTIATE_TEST_SUITE_P(Standard, EveryPropertyOfAClassTest,
	testing::Values("TButton", "TCheckBox", "TTextControl", "TStringView", "TBox"),
	[](const auto& row) { return std::string(row.param); });


TEST_F(EveryPropertyTest, OfAnApplication)
{
	const std::string path = folder / "project.plim";
	TProject project(FORM_HIDDEN);
	project.NewProject(false);
	EditAll(project.App());
	ASSERT_TRUE(project.SaveToFile(path.c_str(), false));
	TProject loaded(FORM_HIDDEN);
	ASSERT_TRUE(loaded.LoadFromFile(path.c_str()));
	EXPECT_EQ(ValuesOf(loaded.App()), ValuesOf(project.App()));
	Show(nullptr, nullptr);
}
