// SPDX-License-Identifier: MIT
// Forms that could not be read completely: what their files held is kept.

#include "designer/KeptOriginal.h"

#include <filesystem>

#include "designer/DesignerTest.h"

namespace {

class KeptOriginalTest : public DesignerTest {
protected:
	/// A form's file with a button of a class that no library offers, and a check box.
	std::string WriteForeign(const char* title)
	{
		TDesignForm* form = NewForm();
		form->SetPropertyValue("Title", title);
		Place(form, "TButton", "Foreign");
		Place(form, "TCheckBox", "Known");
		Save(form, fFolder / "form.frm");
		std::string content = fFolder.Read("form.frm");
		for (size_t at = content.find("TButton"); at != std::string::npos;
			 at = content.find("TButton"))
			content.replace(at, 7, "TMissng");
		std::filesystem::remove(fFolder / "form.frm");
		fFolder.Write("form.frm", content);
		return content;
	}

	TDesignForm* LoadForm()
	{
		TDesignForm* form = NewForm();
		Load(form, fFolder / "form.frm");
		EXPECT_TRUE(fResult);
		return form;
	}

	bool Has(const char* name) const { return std::filesystem::exists(fFolder / name); }
};

} // namespace


TEST_F(KeptOriginalTest, TheFirstSaveKeepsWhatTheFileHeldAndTheSecondDoesNot)
{
	const std::string content = WriteForeign("One");
	TDesignForm* form = LoadForm();
	EXPECT_EQ(form->CountComponents(), 1);
	EXPECT_FALSE(Has("form.frm.orig"));
	Save(form, fFolder / "form.frm");
	EXPECT_TRUE(fResult);
	EXPECT_TRUE(fFolder.Read("form.frm.orig") == content);
	Save(form, fFolder / "form.frm");
	Save(LoadForm(), fFolder / "form.frm");
	EXPECT_TRUE(fFolder.Read("form.frm.orig") == content);
	EXPECT_FALSE(Has("form.frm.orig2"));
}


TEST_F(KeptOriginalTest, AnEarlierOneIsNeverReplaced)
{
	const std::string first = WriteForeign("One");
	Save(LoadForm(), fFolder / "form.frm");
	const std::string second = WriteForeign("Two");
	Save(LoadForm(), fFolder / "form.frm");
	EXPECT_TRUE(fFolder.Read("form.frm.orig") == first);
	EXPECT_TRUE(fFolder.Read("form.frm.orig2") == second);

	// The user has put the first one back, and lost the library again.
	std::filesystem::copy_file(fFolder / "form.frm.orig", fFolder / "form.frm",
		std::filesystem::copy_options::overwrite_existing);
	Save(LoadForm(), fFolder / "form.frm");
	EXPECT_FALSE(Has("form.frm.orig3"));
}


TEST_F(KeptOriginalTest, AFileThatStaysAsItIsNeedsNone)
{
	const std::string content = WriteForeign("One");
	TDesignForm* form = LoadForm();
	Save(form, fFolder / "other.frm");
	EXPECT_TRUE(fFolder.Read("form.frm") == content);
	EXPECT_FALSE(Has("other.frm.orig"));
	// From here on it is a form without the component.
	Save(form, fFolder / "other.frm");
	EXPECT_FALSE(Has("other.frm.orig"));
	EXPECT_FALSE(Has("form.frm.orig"));
}


TEST_F(KeptOriginalTest, ACompleteFormNeedsNone)
{
	TDesignForm* form = NewForm();
	Place(form, "TButton", "Known");
	Save(form, fFolder / "form.frm");
	Save(LoadForm(), fFolder / "form.frm");
	EXPECT_FALSE(Has("form.frm.orig"));
}


TEST_F(KeptOriginalTest, AFormIsNotSavedOverWhatCannotBeKept)
{
	WriteForeign("One");
	// With its ending, the name would be longer than a name may be.
	const std::string folder = fFolder.Make("f");
	const std::string name(252, 'n');
	std::filesystem::current_path(folder);
	std::filesystem::rename(fFolder / "form.frm", name);
	const std::string content = fFolder.Read("f/" + name);
	TDesignForm* form = NewForm();
	Load(form, name);
	ASSERT_TRUE(fResult);
	form->View()->SetModified(true);
	Save(form, name);
	EXPECT_FALSE(fResult);
	EXPECT_TRUE(form->Modified());
	EXPECT_TRUE(fFolder.Read("f/" + name) == content);
}


TEST_F(KeptOriginalTest, AMissingFileHasNothingToKeep)
{
	EXPECT_EQ(KeepOriginal((fFolder / "none.frm").c_str()), B_OK);
	EXPECT_FALSE(Has("none.frm.orig"));
}
