// SPDX-License-Identifier: MIT
// Every property of every built-in and standard component: edited, shown, saved and loaded back.

#include "PropertyWalk.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "project/Project.h"
#include "support/TemporaryFolder.h"

namespace {

/// What concerns the program only. Every other property of a component is seen while designing.
const std::set<std::string> kUnseen = {"Name", "Visible", "Flags", "ResizingMode"};
const std::map<std::string, std::set<std::string>> kUnseenOfClass = {
	{"TButton", {"Default"}},
	{"TClock", {"Running"}},
	{"TListView", {"ListType"}},
	{"TOutlineListView", {"ListType"}},
	{"TPictureButton", {"Behavior", "OnFile"}},
	{"TSlider", {"KeyIncrement"}},
	{"TTextView",
		{"Autoindent", "Editable", "MaxBytes", "Selectable", "Stylable", "TabWidth", "Undo"}},
};

bool
IsUnseen(const std::string& className, const std::string& name)
{
	const auto ofClass = kUnseenOfClass.find(className);
	return kUnseen.count(name) != 0
		|| (ofClass != kUnseenOfClass.end() && ofClass->second.count(name) != 0);
}


class EveryPropertyTest : public PropertyWalk {
protected:
	/// Saves the form and loads it into another one; both must have the same values and look the same.
	void ExpectSavedAndLoaded()
	{
		const std::string path = folder / "form.frm";
		Show(nullptr, nullptr);
		{
			WindowGuard guard(form);
			ASSERT_TRUE(form->SaveToFile(path.c_str()));
		}
		TDesignForm* loaded = Load(path.c_str());
		EXPECT_EQ(ValuesOf(loaded), ValuesOf(form));
		ASSERT_EQ(loaded->CountComponents(), form->CountComponents());
		for (int32 i = 0; i < form->CountComponents(); i++)
			EXPECT_EQ(ValuesOf(loaded->ComponentAt(i)), ValuesOf(form->ComponentAt(i)));
		EXPECT_TRUE(LooksLike(PictureOf(loaded), PictureOf(form)));
		Close(loaded);
	}

	void EditClass(const char* className, Hand hand)
	{
		SCOPED_TRACE(className);
		RenewForm();
		TComponent* component = Place(className, BRect(10, 10, 209, 109));
		ASSERT_NE(component, nullptr);
		EditAll(component, hand, 1);
		EditAll(component, Hand::kKeys, 2);
		for (const auto& [name, value] : ValuesOf(component))
			EXPECT_TRUE(IsUnseen(className, name) || seen.count(name) != 0)
				<< className << ": " << name << " is not seen on the form";
		ExpectSavedAndLoaded();
	}

	TemporaryFolder folder;
};


/// The classes are those of the libraries that the designer loads, dealt out to tests that can run side by side.
constexpr int32 kParts = 4;

class EveryPropertyOfAPartTest : public EveryPropertyTest,
								 public testing::WithParamInterface<int32> {};

} // namespace

TEST_P(EveryPropertyOfAPartTest, IsEditedSavedAndLoaded)
{
	const int32 count = PaletteCatalog().CountPalEntries();
	ASSERT_GE(count, kParts);
	for (int32 i = GetParam(); i < count; i += kParts)
		EditClass(PaletteCatalog().PalEntryAt(i)->ClassName(), Hand::kKeys);
}

INSTANTIATE_TEST_SUITE_P(Of, EveryPropertyOfAPartTest, testing::Range<int32>(0, kParts));


TEST_F(EveryPropertyTest, OfAButtonByMouse)
{
	EditClass("TButton", Hand::kMouse);
}


TEST_F(EveryPropertyTest, OfAForm)
{
	EditAll(form, Hand::kMouse, 1);
	EditAll(form, Hand::kKeys, 2);
	ExpectSavedAndLoaded();
}


TEST_F(EveryPropertyTest, OfAnApplication)
{
	const std::string path = folder / "project.plim";
	TProject project(FORM_HIDDEN);
	project.NewProject(false);
	EditAll(project.App(), Hand::kMouse, 1);
	EditAll(project.App(), Hand::kKeys, 2);
	ASSERT_TRUE(project.SaveToFile(path.c_str(), false));
	TProject loaded(FORM_HIDDEN);
	ASSERT_TRUE(loaded.LoadFromFile(path.c_str()));
	EXPECT_EQ(ValuesOf(loaded.App()), ValuesOf(project.App()));
	Show(nullptr, nullptr);
}
