// SPDX-License-Identifier: MIT
// Volumes: the mounted file systems and their figures.

#include <Volume.h>

#include <algorithm>
#include <vector>

#include <sys/stat.h>

#include <gtest/gtest.h>

#include <Directory.h>
#include <Entry.h>
#include <Errors.h>
#include <Messenger.h>
#include <Path.h>
#include <StorageDefs.h>
#include <VolumeRoster.h>


TEST(VolumeTest, BootVolumeHoldsTheRoot)
{
	BVolumeRoster roster;
	BVolume volume;
	ASSERT_EQ(roster.GetBootVolume(&volume), B_OK);
	struct stat stat;
	ASSERT_EQ(lstat("/", &stat), 0);
	EXPECT_EQ(volume.Device(), stat.st_dev);

	BDirectory root;
	BEntry entry;
	char name[B_FILE_NAME_LENGTH];
	ASSERT_EQ(volume.GetRootDirectory(&root), B_OK);
	ASSERT_EQ(root.GetEntry(&entry), B_OK);
	EXPECT_EQ(BPath(&entry), "/");
	EXPECT_EQ(volume.GetName(name), B_OK);
	EXPECT_STREQ(name, "/");
	EXPECT_GT(volume.Capacity(), 0);
	EXPECT_GE(volume.FreeBytes(), 0);
	EXPECT_LE(volume.FreeBytes(), volume.Capacity());
	EXPECT_GT(volume.BlockSize(), 0);
}


TEST(VolumeTest, UnknownAndUnsetVolumesFail)
{
	const BVolume unset;
	EXPECT_EQ(unset.InitCheck(), B_NO_INIT);
	EXPECT_EQ(unset.Device(), (dev_t)-1);
	EXPECT_EQ(unset.Capacity(), B_NO_INIT);
	EXPECT_FALSE(unset.IsReadOnly());
	BVolume volume(0xfffffff0);
	EXPECT_EQ(volume.InitCheck(), B_DEVICE_NOT_FOUND);
	EXPECT_NE(volume, unset);
	volume.Unset();
	EXPECT_EQ(volume, unset);
	BDirectory directory;
	EXPECT_EQ(volume.GetRootDirectory(&directory), B_NO_INIT);
}


TEST(VolumeTest, RosterWalksEveryVolumeOnceAndRewinds)
{
	BVolumeRoster roster;
	BVolume volume;
	std::vector<dev_t> devices;
	while (roster.GetNextVolume(&volume) == B_OK) {
		EXPECT_EQ(std::count(devices.begin(), devices.end(), volume.Device()), 0);
		devices.push_back(volume.Device());
	}
	EXPECT_EQ(volume.InitCheck(), B_NO_INIT);
	BVolume boot;
	roster.GetBootVolume(&boot);
	EXPECT_EQ(std::count(devices.begin(), devices.end(), boot.Device()), 1);
	roster.Rewind();
	ASSERT_EQ(roster.GetNextVolume(&volume), B_OK);
	EXPECT_EQ(volume.Device(), devices[0]);
	EXPECT_EQ(roster.GetNextVolume(nullptr), B_BAD_VALUE);
}


TEST(VolumeTest, HostsInnerFileSystemsAreNotPersistent)
{
	struct stat stat;
	if (lstat("/proc", &stat) != 0)
		GTEST_SKIP() << "the host has no /proc";
	EXPECT_FALSE(BVolume(stat.st_dev).IsPersistent());
}
