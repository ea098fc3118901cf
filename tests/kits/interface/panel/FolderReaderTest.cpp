// SPDX-License-Identifier: MIT
// Tests of reading folders: what is listed, filtered, and in which order.
#include "interface/panel/FolderReader.h"

#include <map>

#include <sys/stat.h>
#include <unistd.h>

#include <gtest/gtest.h>

#include <Entry.h>
#include <FilePanel.h>
#include <OS.h>

#include "interface/panel/PanelPaths.h"
#include "support/TemporaryFolder.h"

using namespace BPrivate;

namespace {

/// Writes down what it is asked about.
class RecordingFilter : public BRefFilter {
public:
	bool Filter(
		const entry_ref* ref, BNode* node, struct stat_beos* stat, const char* mimeType) override
	{
		types[ref->name] = mimeType;
		sizes[ref->name] = stat->st_size;
		struct stat own;
		nodesAgree = nodesAgree && node->GetStat(&own) == B_OK && own.st_ino == stat->st_ino;
		refsResolve = refsResolve && BEntry(ref).Exists();
		return refused.find(ref->name) == refused.end();
	}

	std::map<std::string, std::string> types;
	std::map<std::string, off_t> sizes;
	std::map<std::string, bool> refused;
	bool nodesAgree = true;
	bool refsResolve = true;
};


class FolderReaderTest : public ::testing::Test {
protected:
	/// The names that a pass finds, in the order that a panel shows them in.
	std::vector<std::string> Names(FolderOrder order = FolderOrder::kName, bool descending = false)
	{
		std::string path;
		EXPECT_EQ(FindFolder(fFolder.Path(), &path), B_OK);
		EXPECT_EQ(fReader.Open(path), B_OK);
		while (fReader.ReadSome(fRules, system_time() + 1000000)) {
		}
		SortEntries(&fReader.Entries(), order, descending);
		std::vector<std::string> names;
		for (const FolderEntry& entry : fReader.Entries())
			names.push_back(entry.Name());
		return names;
	}

	const FolderEntry* Find(const std::string& name)
	{
		for (const FolderEntry& entry : fReader.Entries()) {
			if (entry.Name() == name)
				return &entry;
		}
		return nullptr;
	}

	typedef std::vector<std::string> List;

	TemporaryFolder fFolder;
	FolderRules fRules;
	FolderReader fReader;
};

} // namespace


TEST_F(FolderReaderTest, FoldersComeFirstThenFilesInNaturalOrder)
{
	fFolder.Write("b10");
	fFolder.Write("b9");
	fFolder.Write("A");
	fFolder.Make("z");
	fFolder.Make("Y");
	EXPECT_EQ(Names(), (List{"Y", "z", "A", "b9", "b10"}));
	EXPECT_EQ(Names(FolderOrder::kName, true), (List{"z", "Y", "b10", "b9", "A"}));
}


TEST_F(FolderReaderTest, OrderBySizeAndTimeFallsBackToTheName)
{
	fFolder.Write("large", "12345");
	fFolder.Write("small", "1");
	fFolder.Write("also small", "2");
	fFolder.Make("folder");
	EXPECT_EQ(Names(FolderOrder::kSize), (List{"folder", "also small", "small", "large"}));
	EXPECT_EQ(Names(FolderOrder::kSize, true), (List{"folder", "large", "small", "also small"}));

	const auto old = std::filesystem::file_time_type::clock::now() - std::chrono::hours(1);
	std::filesystem::last_write_time(fFolder / "small", old);
	EXPECT_EQ(Names(FolderOrder::kModified)[1], "small");
	EXPECT_EQ(Names(FolderOrder::kModified, true).back(), "small");
}


TEST_F(FolderReaderTest, HiddenEntriesAreReadOnDemand)
{
	fFolder.Write(".hidden");
	fFolder.Write("seen");
	EXPECT_EQ(Names(), (List{"seen"}));
	fRules.showHidden = true;
	EXPECT_EQ(Names(), (List{".hidden", "seen"}));
}


TEST_F(FolderReaderTest, FlavorsDecideWhatIsListed)
{
	fFolder.Make("folder");
	fFolder.Write("file");
	fFolder.Link("file", "link to file");
	fFolder.Link("folder", "link to folder");
	fFolder.Link("nowhere", "broken");
	fFolder.Link("loop", "loop");
	EXPECT_EQ(Names(), (List{"folder", "link to folder", "file", "link to file"}));
	fRules.flavors = B_DIRECTORY_NODE;
	EXPECT_EQ(Names(), (List{"folder", "link to folder"}));
	fRules.flavors = B_SYMLINK_NODE;
	EXPECT_EQ(Names(), (List{"folder", "link to folder", "broken", "link to file", "loop"}));
	fRules.flavors = B_ANY_NODE;
	EXPECT_EQ(
		Names(), (List{"folder", "link to folder", "broken", "file", "link to file", "loop"}));
}


TEST_F(FolderReaderTest, EntriesTellWhatTheyAre)
{
	fFolder.Write("file", "12345");
	fFolder.Link("file", "link");
	fFolder.Link("nowhere", "broken");
	ASSERT_EQ(chmod(fFolder.Write("program").c_str(), 0755), 0);
	fRules.flavors = B_ANY_NODE;
	Names();
	ASSERT_NE(Find("link"), nullptr);
	EXPECT_TRUE(Find("link")->isLink);
	EXPECT_FALSE(Find("link")->isBroken);
	EXPECT_EQ(Find("link")->size, 5);
	EXPECT_TRUE(Find("broken")->isBroken);
	EXPECT_TRUE(Find("program")->isProgram);
	EXPECT_FALSE(Find("file")->isProgram);
	EXPECT_GT(Find("file")->modified, 0);
}


TEST_F(FolderReaderTest, TheFilterSeesEachEntryWithNodeStatusAndType)
{
	fFolder.Make("folder");
	fFolder.Write("text.txt", "some text\n");
	fFolder.Link("text.txt", "link");
	fFolder.Link("nowhere", "broken");
	RecordingFilter filter;
	filter.refused["text.txt"] = true;
	fRules.filter = &filter;
	fRules.flavors = B_ANY_NODE;
	EXPECT_EQ(Names(), (List{"folder", "broken", "link"}));
	EXPECT_EQ(filter.types["folder"], "application/x-vnd.Be-directory");
	EXPECT_EQ(filter.types["text.txt"], "text/plain");
	EXPECT_EQ(filter.types["link"], "text/plain");
	EXPECT_EQ(filter.types["broken"], "application/x-vnd.Be-symlink");
	EXPECT_EQ(filter.sizes["text.txt"], 10);
	EXPECT_EQ(filter.sizes["link"], 10);
	EXPECT_TRUE(filter.nodesAgree);
	EXPECT_TRUE(filter.refsResolve);
}


TEST_F(FolderReaderTest, NamesThatAreNoTextAreListed)
{
	fFolder.Write("caf\xe9");
	RecordingFilter filter;
	fRules.filter = &filter;
	EXPECT_EQ(Names(), (List{"caf\xe9"}));
	EXPECT_EQ(fReader.Entries()[0].shownName, "caf\xef\xbf\xbd");
	EXPECT_TRUE(filter.refsResolve);
}


TEST_F(FolderReaderTest, PipesAreListedWithoutBeingOpened)
{
	ASSERT_EQ(mkfifo((fFolder / "pipe").c_str(), 0600), 0);
	RecordingFilter filter;
	fRules.filter = &filter;
	EXPECT_EQ(Names(), (List{"pipe"}));
}


TEST_F(FolderReaderTest, AFolderIsReadInPieces)
{
	for (int i = 0; i < 50; i++)
		fFolder.Write(std::to_string(i));
	ASSERT_EQ(fReader.Open(fFolder.Path()), B_OK);
	int32 pieces = 1;
	// With no time left each step still gets on by one.
	while (fReader.ReadSome(fRules, 0))
		pieces++;
	EXPECT_GE(pieces, 50);
	EXPECT_EQ(fReader.Entries().size(), 50u);
	EXPECT_FALSE(fReader.IsReading());
}


TEST_F(FolderReaderTest, AFolderThatVanishesWhileItIsReadEnds)
{
	const std::string path = fFolder.Make("sub");
	for (int i = 0; i < 20; i++)
		fFolder.Write("sub/" + std::to_string(i));
	ASSERT_EQ(fReader.Open(path), B_OK);
	fReader.ReadSome(fRules, 0);
	std::filesystem::remove_all(path);
	while (fReader.ReadSome(fRules, 0)) {
	}
	EXPECT_LE(fReader.Entries().size(), 20u);
}


TEST_F(FolderReaderTest, WhatIsNoFolderCannotBeOpened)
{
	EXPECT_EQ(fReader.Open(fFolder / "none"), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(fReader.Open(fFolder.Write("file")), B_NOT_A_DIRECTORY);
	EXPECT_FALSE(fReader.IsReading());
	EXPECT_FALSE(fReader.ReadSome(fRules, 0));
}
