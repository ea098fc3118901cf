// SPDX-License-Identifier: MIT
// Resources: kept behind a file's content, found again, and not trusted.

#include <Resources.h>

#include <gtest/gtest.h>

#include <Errors.h>

#include "support/TemporaryFolder.h"

namespace {

std::string
Data(BResources& resources, type_code type, int32 id)
{
	size_t size;
	const void* data = resources.LoadResource(type, id, &size);
	return data == nullptr ? "" : std::string((const char*)data, size);
}

} // namespace


TEST(ResourcesTest, ResourcesComeBackBehindTheContent)
{
	const TemporaryFolder folder;
	const std::string path = folder.Write("file", "content");
	{
		BResources resources(path.c_str());
		ASSERT_EQ(resources.InitCheck(), B_OK);
		EXPECT_EQ(resources.AddResource('TEST', 1, "one", 3, "first"), B_OK);
		EXPECT_EQ(resources.AddResource('TEST', -2, "", 0), B_OK);
		EXPECT_EQ(resources.AddResource('bits', 1, "\0\1", 2, ""), B_OK);
		EXPECT_EQ(resources.Sync(), B_OK);
	}
	EXPECT_EQ(folder.Read("file").substr(0, 7), "content");

	BResources resources(path.c_str());
	EXPECT_EQ(Data(resources, 'TEST', 1), "one");
	EXPECT_EQ(Data(resources, 'bits', 1), std::string("\0\1", 2));
	EXPECT_TRUE(resources.HasResource('TEST', -2));
	EXPECT_TRUE(resources.HasResource('TEST', "first"));
	EXPECT_TRUE(resources.HasResource('bits', ""));
	EXPECT_FALSE(resources.HasResource('bits', "first"));
	EXPECT_FALSE(resources.HasResource('TEST', 2));
	size_t size;
	EXPECT_EQ(resources.LoadResource('none', 1, &size), nullptr);

	type_code type;
	int32 id;
	const char* name;
	ASSERT_TRUE(resources.GetResourceInfo(1, &type, &id, &name, &size));
	EXPECT_EQ(id, -2);
	EXPECT_EQ(name, nullptr);
	EXPECT_EQ(size, 0u);
	EXPECT_FALSE(resources.GetResourceInfo(3, &type, &id, &name, &size));
	ASSERT_TRUE(resources.GetResourceInfo((type_code)'bits', 0, &id, &name, &size));
	EXPECT_STREQ(name, "");
}


TEST(ResourcesTest, ReplacingAndRemovingIsWrittenAtTheEnd)
{
	const TemporaryFolder folder;
	const std::string path = folder.Write("file", "content");
	{
		BResources resources(path.c_str());
		resources.AddResource('TEST', 1, "a long one", 10);
		resources.AddResource('TEST', 2, "two", 3);
		resources.Sync();
		resources.AddResource('TEST', 1, "1", 1);
		EXPECT_EQ(resources.RemoveResource('TEST', 2), B_OK);
		EXPECT_EQ(resources.RemoveResource('TEST', 2), B_BAD_VALUE);
	}
	BResources resources(path.c_str());
	EXPECT_EQ(Data(resources, 'TEST', 1), "1");
	EXPECT_FALSE(resources.HasResource('TEST', 2));
	resources.RemoveResource('TEST', 1);
	EXPECT_EQ(resources.Sync(), B_OK);
	EXPECT_EQ(folder.Read("file"), "content");
}


TEST(ResourcesTest, ReadOnlyFileCannotBeChanged)
{
	const TemporaryFolder folder;
	const BFile file(folder.Write("file").c_str(), B_READ_ONLY);
	BResources resources(&file);
	EXPECT_EQ(resources.InitCheck(), B_OK);
	EXPECT_EQ(resources.AddResource('TEST', 1, "x", 1), B_NOT_ALLOWED);
	EXPECT_EQ(BResources((folder / "none").c_str()).InitCheck(), B_ENTRY_NOT_FOUND);
}


TEST(ResourcesTest, MergingAndWritingToAnotherFile)
{
	const TemporaryFolder folder;
	BFile from((folder / "from").c_str(), B_READ_WRITE | B_CREATE_FILE);
	BFile to(folder.Write("to", "tail").c_str(), B_READ_WRITE);
	{
		BResources resources(&from);
		resources.AddResource('TEST', 1, "new", 3);
	}
	BResources resources;
	resources.AddResource('TEST', 1, "old", 3);
	resources.AddResource('TEST', 2, "two", 3);
	EXPECT_EQ(resources.MergeFrom(&from), B_OK);
	EXPECT_EQ(resources.WriteTo(&to), B_OK);
	BResources written((folder / "to").c_str());
	EXPECT_EQ(Data(written, 'TEST', 1), "new");
	EXPECT_EQ(Data(written, 'TEST', 2), "two");
	EXPECT_EQ(folder.Read("to").substr(0, 4), "tail");
}


TEST(ResourcesTest, DamagedResourcesAreRefused)
{
	const TemporaryFolder folder;
	const std::string path = folder.Write("file", "content");
	{
		BResources resources(path.c_str());
		resources.AddResource('TEST', 1, "one", 3, "first");
	}
	const std::string good = folder.Read("file");
	const std::string mark = good.substr(good.size() - 8);
	const std::string block = good.substr(7, good.size() - 7 - 16);
	for (const std::string& damaged : {block.substr(0, 10) + std::string("\12\0\0\0\0\0\0\0", 8),
			 block + std::string(8, '\xff'), std::string("\1\0\0\0\0\0\0\0", 8),
			 std::string(8, 'T') + std::string(8, '\xff') + std::string("\20\0\0\0\0\0\0\0", 8)}) {
		folder.Write("file", damaged + mark);
		EXPECT_EQ(BResources(path.c_str()).InitCheck(), B_BAD_DATA);
		EXPECT_EQ(folder.Read("file"), damaged + mark);
	}
	BResources clobbered(path.c_str(), true);
	EXPECT_EQ(clobbered.InitCheck(), B_OK);
}


TEST(ResourcesTest, FileOfTheRunningProgramIsFound)
{
	BResources resources;
	EXPECT_EQ(resources.SetToImage((const void*)&Data), B_OK);
	EXPECT_TRUE(resources.File().IsFile());
	EXPECT_EQ(resources.SetToImage((const void*)nullptr), B_BAD_VALUE);
}
