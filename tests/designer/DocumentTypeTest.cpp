// SPDX-License-Identifier: MIT
// Documents without attributes, as copying or unpacking leaves them, are still known.

#include <Node.h>
#include <NodeInfo.h>
#include <StorageDefs.h>

#include "designer/DesignerTest.h"
#include "designer/DocumentFile.h"
#include "designer/FormFile.h"

class DocumentTypeTest : public DesignerTest {
protected:
	/// Lets the kit find the types where a program's installation has them.
	ScopedVariable fData{"XDG_DATA_DIRS", PLIM_BUILD_DIR "/share"};

	static std::string TypeOf(const std::string& path)
	{
		BNode node(path.c_str());
		BNodeInfo info(&node);
		char type[B_MIME_TYPE_LENGTH] = "";
		info.GetType(type);
		return type;
	}
};


TEST_F(DocumentTypeTest, TheContentTellsTheTypeWhateverTheName)
{
	TPLIMFormFile form;
	form.SetFilename((fFolder / "form").c_str());
	ASSERT_TRUE(form.SaveFile());
	TPLIMFile project("application/x-plim-project");
	project.what = 'PPrj';
	project.SetFilename((fFolder / "project").c_str());
	ASSERT_TRUE(project.SaveFile());

	const std::string copiedForm = fFolder.Write("copy.txt", fFolder.Read("form"));
	const std::string copiedProject = fFolder.Write("copy.frm", fFolder.Read("project"));
	EXPECT_EQ(TypeOf(copiedForm), "application/x-plim-form");
	EXPECT_EQ(TypeOf(copiedProject), "application/x-plim-project");
}


TEST_F(DocumentTypeTest, TheEndingTellsTheTypeOfOtherContent)
{
	EXPECT_EQ(TypeOf(fFolder.Write("some.frm")), "application/x-plim-form");
	EXPECT_EQ(TypeOf(fFolder.Write("some.plim")), "application/x-plim-project");
}
