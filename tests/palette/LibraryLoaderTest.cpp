// SPDX-License-Identifier: MIT

#include "palette/LibraryLoader.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>

#include <Application.h>
#include <Box.h>
#include <Button.h>
#include <Path.h>
#include <Window.h>

#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "support/CapturedOutput.h"
#include "support/Printers.h"
#include "support/TemporaryFolder.h"

class LibraryLoaderTest : public testing::Test {
protected:
	static void SetUpTestSuite()
	{
		setenv("BE_DISPLAY", "none", 1);
		if (be_app == nullptr)
			new BApplication("application/x-vnd.Plimworks-PaletteTest");
	}

	static std::string Library(const std::string& name)
	{
		return PLIM_BUILD_DIR "/tests/libraries/" + name;
	}

	/// Loads a folder and returns what was printed.
	std::string Load(TLibraryLoader& loader, const std::string& folder)
	{
		CapturedOutput output;
		fStatus = loader.LoadFolder(folder.c_str());
		return output.Text();
	}

	TPaletteCatalog fCatalog;
	status_t fStatus = B_ERROR;
};


TEST_F(LibraryLoaderTest, ALibrarysEntriesGoIntoTheCatalogInTheirOrder)
{
	TLibraryLoader loader(&fCatalog);
	const std::string output = Load(loader, Library("good"));

	const std::string path = Library("good") + "/test_library_good.so";
	EXPECT_EQ(output,
		"load_add_on(" + path + ") success\nInitComponentLib() success\n3 Components in " + path
			+ "\n");
	ASSERT_EQ(fCatalog.CountPalEntries(), 3);
	EXPECT_STREQ(fCatalog.PalEntryAt(0)->ClassName(), "TFirst");
	EXPECT_STREQ(fCatalog.PalEntryAt(1)->ClassName(), "TSecond");
	EXPECT_STREQ(fCatalog.PalEntryAt(2)->ClassName(), "TThird");
	EXPECT_EQ(loader.CountEntries(), 3);
}


TEST_F(LibraryLoaderTest, ALibraryThatLacksAnEntryPointIsRejected)
{
	TLibraryLoader loader(&fCatalog);
	const std::string output = Load(loader, Library("no_uninit"));
	EXPECT_NE(output.find("get_image_symbol() failed\n"), std::string::npos) << output;
	EXPECT_EQ(fCatalog.CountPalEntries(), 0);
}


TEST_F(LibraryLoaderTest, ALibraryThatRefusesToInitializeIsRejected)
{
	TLibraryLoader loader(&fCatalog);
	const std::string output = Load(loader, Library("refuses_init"));
	EXPECT_NE(output.find("Failed to initialize component library " + Library("refuses_init")
				  + "/test_library_refuses_init.so\n"),
		std::string::npos)
		<< output;
	EXPECT_EQ(fCatalog.CountPalEntries(), 0);
}


TEST_F(LibraryLoaderTest, AMissingEntryIsToldAndTheOthersAreLoaded)
{
	TLibraryLoader loader(&fCatalog);
	const std::string output = Load(loader, Library("missing_entry"));
	EXPECT_NE(output.find("Failed to create palette entry 1\n"), std::string::npos) << output;
	ASSERT_EQ(fCatalog.CountPalEntries(), 2);
	EXPECT_STREQ(fCatalog.PalEntryAt(1)->ClassName(), "TThird");
}


TEST_F(LibraryLoaderTest, AnExceptionInALibraryIsAFailureOfTheLibraryAlone)
{
	TLibraryLoader loader(&fCatalog);
	std::string output = Load(loader, Library("throws"));
	const std::string path = Library("throws") + "/test_library_throws.so";
	EXPECT_EQ(output,
		"load_add_on(" + path + ") success\nFailed to initialize component library " + path + "\n");
	EXPECT_EQ(fCatalog.CountPalEntries(), 0);

	output = Load(loader, Library("entry_throws"));
	EXPECT_NE(output.find("Failed to create palette entry 1\n"), std::string::npos) << output;
	EXPECT_EQ(fCatalog.CountPalEntries(), 2);
}


TEST_F(LibraryLoaderTest, AnEntryWithoutANameIsTold)
{
	TLibraryLoader loader(&fCatalog);
	const std::string output = Load(loader, Library("nameless"));
	EXPECT_NE(output.find("Failed to create palette entry 1\n"), std::string::npos) << output;
	EXPECT_EQ(fCatalog.CountPalEntries(), 2);
	EXPECT_NE(fCatalog.FindPalEntry("TThird"), nullptr);
}


TEST_F(LibraryLoaderTest, ALibraryThatPrintsIsLoaded)
{
	TLibraryLoader loader(&fCatalog);
	const std::string output = Load(loader, Library("prints"));
	EXPECT_NE(output.find("a line of the library's own\n"), std::string::npos) << output;
	EXPECT_EQ(fCatalog.CountPalEntries(), 3);
}


TEST_F(LibraryLoaderTest, ALibraryOfAnotherDesignerIsToldAndLeftOut)
{
	const struct {
		const char* library;
		const char* difference;
	} kCases[] = {
		{"other_build", "interface 42, libstdc++, and not interface 1, libstdc++"},
		{"other_classes", "its classes have other sizes"},
		{"other_record", "the record of its build is another one"},
	};
	for (const auto& row : kCases) {
		TLibraryLoader loader(&fCatalog);
		const std::string output = Load(loader, Library(row.library));
		const std::string path = Library(row.library) + "/test_library_" + row.library + ".so";
		EXPECT_EQ(output,
			"load_add_on(" + path + ") success\nComponent library " + path
				+ " was built for another designer: " + row.difference + "\n");
		EXPECT_EQ(fCatalog.CountPalEntries(), 0) << row.library;
	}
}


TEST_F(LibraryLoaderTest, OfTwoLibrariesWithTheSameClassesTheFirstIsUsedAndTheOtherTold)
{
	TLibraryLoader loader(&fCatalog);
	Load(loader, Library("good"));
	TPaletteEntry* first = fCatalog.FindPalEntry("TFirst");
	const std::string output = Load(loader, Library("prints"));
	for (const char* name : {"TFirst", "TSecond", "TThird"})
		EXPECT_NE(
			output.find("Warning: Another library offers the class '" + std::string(name) + "' of "
				+ Library("prints") + "/test_library_prints.so; forms get that one's\n"),
			std::string::npos)
			<< output;
	EXPECT_EQ(fCatalog.CountPalEntries(), 6);
	EXPECT_EQ(fCatalog.FindPalEntry("TFirst"), first);
}


TEST_F(LibraryLoaderTest, AMissingFolderLoadsNothing)
{
	TLibraryLoader loader(&fCatalog);
	EXPECT_EQ(Load(loader, Library("nowhere")), "");
	EXPECT_EQ(fStatus, B_ENTRY_NOT_FOUND);
	EXPECT_EQ(fCatalog.CountPalEntries(), 0);
}


TEST_F(LibraryLoaderTest, FilesThatAreNoLibrariesAreSkippedSilently)
{
	TemporaryFolder folder;
	folder.Write("readme.txt", "no library");
	folder.Make("folder");
	folder.Make("folder.so");
	folder.Write("text.so", "no library either");
	folder.Write("empty.so");
	folder.Write("magic.so", "\177ELF");
	folder.Link(folder / "nowhere", "dangling.so");
	folder.Link(folder / "loop.so", "loop.so");
	std::ifstream library(Library("good") + "/test_library_good.so", std::ios::binary);
	std::string half(5000, '\0');
	library.read(half.data(), static_cast<std::streamsize>(half.size()));
	folder.Write("half.so", half);
	std::filesystem::copy("/proc/self/exe", folder / "program.so");
	TLibraryLoader loader(&fCatalog);
	EXPECT_EQ(Load(loader, folder.Path()), "");
	EXPECT_EQ(fStatus, B_OK);
}


TEST_F(LibraryLoaderTest, LinksToLibrariesAreFollowed)
{
	TemporaryFolder folder;
	folder.Link(Library("good") + "/test_library_good.so", "linked.so");
	TLibraryLoader loader(&fCatalog);
	Load(loader, folder.Path());
	EXPECT_EQ(fCatalog.CountPalEntries(), 3);
}


TEST_F(LibraryLoaderTest, ButtonsFormOneColumnWithoutGapsAcrossLibraries)
{
	BWindow* window = new BWindow(BRect(0, 0, 200, 400), "palette", B_TITLED_WINDOW, 0);
	BBox* palette = new BBox(window->Bounds(), "palette");
	window->AddChild(palette);

	TLibraryLoader loader(&fCatalog, palette);
	Load(loader, Library("missing_entry"));
	Load(loader, Library("good"));

	ASSERT_GT(palette->CountChildren(), 0);
	float y = 0;
	for (int32 i = 0; i < palette->CountChildren(); i++) {
		BView* button = palette->ChildAt(i);
		EXPECT_EQ(button->Frame(), BRect(0, y, 100, y + 24)) << button->Name();
		float width;
		float height;
		button->GetPreferredSize(&width, &height);
		y += height;
	}
	EXPECT_EQ(loader.ColumnHeight(), y);
	EXPECT_EQ(loader.CountEntries(), palette->CountChildren());
	window->Quit();
}


TEST_F(LibraryLoaderTest, APaletteButtonSendsItsEntryToThePalette)
{
	BWindow* window = new BWindow(BRect(0, 0, 200, 400), "palette", B_TITLED_WINDOW, 0);
	BBox* palette = new BBox(window->Bounds(), "palette");
	window->AddChild(palette);
	TPaletteEntry entry(0, "Button", "TButton");
	entry.Init(palette, BPoint(0, 30));

	BButton* button = dynamic_cast<BButton*>(palette->FindView("Button"));
	ASSERT_NE(button, nullptr);
	EXPECT_STREQ(button->Label(), "Button");
	EXPECT_EQ(button->Target(), palette);
	ASSERT_NE(button->Message(), nullptr);
	EXPECT_EQ(button->Message()->what, kPaletteEntryPressed);
	void* pointer = nullptr;
	EXPECT_EQ(button->Message()->FindPointer("palEntry", &pointer), B_OK);
	EXPECT_EQ(pointer, &entry);
	window->Quit();
}


TEST_F(LibraryLoaderTest, TheComponentsFolderLiesBesideTheProgram)
{
	BPath path;
	ASSERT_EQ(FindComponentsFolder(&path), B_OK);
	const std::filesystem::path program = std::filesystem::read_symlink("/proc/self/exe");
	EXPECT_EQ(std::string(path.Path()), (program.parent_path() / "Components").string());
}
