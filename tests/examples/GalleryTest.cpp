// SPDX-License-Identifier: MIT
// The gallery is used like by a person, and makes the pictures that its page shows.

#include <filesystem>
#include <fstream>
#include <iterator>
#include <regex>

#include <gtest/gtest.h>

#include "support/Command.h"
#include "support/TemporaryFolder.h"

namespace {

const std::string kGallery = PLIM_BUILD_DIR "/bin/gallery";

/// In a folder of its own, which is its home too.
command_result
RunGallery(const TemporaryFolder& folder, const std::string& script)
{
	folder.Make("home");
	return RunCommand("cd " + (folder / "home") + " && HOME=" + (folder / "home")
		+ " BE_DISPLAY=qt OUT=" + folder.Path() + " BE_ROBOT_SCRIPT=" + script + " " + Within(120)
		+ kGallery);
}


std::string
ReadFile(const std::string& path)
{
	std::ifstream file(path, std::ios::binary);
	return std::string(std::istreambuf_iterator<char>(file), {});
}

} // namespace


TEST(GalleryTest, ControlsTellWhatWasDoneWithThem)
{
	TemporaryFolder folder;
	const command_result result =
		RunGallery(folder, PLIM_SOURCE_DIR "/tests/examples/gallery.robot");
	EXPECT_EQ(result.code, 0) << result.output;
}


TEST(GalleryTest, EachPictureOfThePageIsMadeByTheScript)
{
	TemporaryFolder folder;
	const command_result result =
		RunGallery(folder, PLIM_SOURCE_DIR "/examples/gallery/pictures.robot");
	ASSERT_EQ(result.code, 0) << result.output;

	const std::string page = ReadFile(PLIM_SOURCE_DIR "/docs/gallery.md");
	const std::regex picture("images/gallery/([a-z-]+\\.png)");
	std::sregex_iterator match(page.begin(), page.end(), picture);
	ASSERT_NE(match, std::sregex_iterator());
	for (; match != std::sregex_iterator(); match++) {
		const std::string name = (*match)[1];
		EXPECT_TRUE(std::filesystem::exists(PLIM_SOURCE_DIR "/docs/images/gallery/" + name))
			<< name;
		ASSERT_TRUE(std::filesystem::exists(folder / name)) << name;
		EXPECT_GT(std::filesystem::file_size(folder / name), 1000u) << name;
	}
}
