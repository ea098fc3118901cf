// SPDX-License-Identifier: MIT
// Images and add-ons: loading, symbols, and every way in which a load fails.

#include <image.h>

#include <stdlib.h>
#include <string.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <set>
#include <string>

#include <gtest/gtest.h>

/// Exported by the program, for its own image's symbols.
extern "C" int
image_test_function()
{
	return 5;
}


namespace {

namespace fs = std::filesystem;

const std::string kAddOns = std::string(PLIM_BUILD_DIR) + "/tests/kernel_addons/";


std::string
trace()
{
	const char* text = getenv("ADDON_TRACE");
	return text == nullptr ? "" : text;
}


/// A folder that goes with the test.
class ImageTest : public testing::Test {
protected:
	void SetUp() override
	{
		fFolder = fs::temp_directory_path() / ("image_test_" + std::to_string(getpid()));
		fs::create_directories(fFolder);
		unsetenv("ADDON_TRACE");
	}
	void TearDown() override { fs::remove_all(fFolder); }

	std::string Write(const std::string& name, const std::string& content)
	{
		std::ofstream(fFolder / name, std::ios::binary) << content;
		return (fFolder / name).string();
	}

	fs::path fFolder;
};


std::string
read_file(const std::string& path)
{
	std::ifstream file(path, std::ios::binary);
	return std::string((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
}


TEST_F(ImageTest, StaticObjectsLiveFromLoadToUnload)
{
	image_id image = load_add_on((kAddOns + "Good.so").c_str());
	ASSERT_GT(image, 0);
	EXPECT_EQ(trace(), "loaded");
	EXPECT_EQ(unload_add_on(image), B_OK);
	EXPECT_EQ(trace(), "unloaded");
	EXPECT_EQ(unload_add_on(image), B_BAD_IMAGE_ID);

	// Loaded again it is as new.
	image = load_add_on((kAddOns + "Good.so").c_str());
	ASSERT_GT(image, 0);
	EXPECT_EQ(trace(), "loaded");
	EXPECT_EQ(unload_add_on(image), B_OK);
}


TEST_F(ImageTest, LoadingTwiceCounts)
{
	image_id first = load_add_on((kAddOns + "Good.so").c_str());
	ASSERT_GT(first, 0);
	// By another way to the same file.
	fs::create_symlink(kAddOns + "Good.so", fFolder / "Link.so");
	image_id second = load_add_on((fFolder / "Link.so").c_str());
	EXPECT_EQ(second, first);
	EXPECT_EQ(unload_add_on(first), B_OK);
	EXPECT_EQ(trace(), "loaded");
	void* symbol;
	EXPECT_EQ(get_image_symbol(first, "addon_value", B_SYMBOL_TYPE_DATA, &symbol), B_OK);
	EXPECT_EQ(unload_add_on(second), B_OK);
	EXPECT_EQ(trace(), "unloaded");
	EXPECT_EQ(get_image_symbol(first, "addon_value", B_SYMBOL_TYPE_DATA, &symbol), B_BAD_IMAGE_ID);
}


TEST_F(ImageTest, SymbolsAreFoundByNameAndType)
{
	image_id image = load_add_on((kAddOns + "Good.so").c_str());
	ASSERT_GT(image, 0);

	int (*function)(int) = nullptr;
	ASSERT_EQ(get_image_symbol(
				  image, "addon_function", B_SYMBOL_TYPE_TEXT, reinterpret_cast<void**>(&function)),
		B_OK);
	int* value = nullptr;
	ASSERT_EQ(get_image_symbol(
				  image, "addon_value", B_SYMBOL_TYPE_DATA, reinterpret_cast<void**>(&value)),
		B_OK);
	*value = 10;
	EXPECT_EQ(function(1), 11);

	void* symbol = nullptr;
	EXPECT_EQ(
		get_image_symbol(image, "addon_value", B_SYMBOL_TYPE_TEXT, &symbol), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(
		get_image_symbol(image, "addon_function", B_SYMBOL_TYPE_DATA, &symbol), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(get_image_symbol(image, "addon_function", B_SYMBOL_TYPE_ANY, &symbol), B_OK);
	EXPECT_EQ(get_image_symbol(image, "nothing", B_SYMBOL_TYPE_ANY, &symbol), B_ENTRY_NOT_FOUND);
	// Only wanted by the add-on, defined by another.
	EXPECT_EQ(get_image_symbol(image, "setenv", B_SYMBOL_TYPE_ANY, &symbol), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(get_image_symbol(image, nullptr, B_SYMBOL_TYPE_ANY, &symbol), B_BAD_VALUE);
	EXPECT_EQ(get_image_symbol(image, "addon_value", B_SYMBOL_TYPE_ANY, nullptr), B_BAD_VALUE);
	EXPECT_EQ(get_image_symbol(-5, "x", B_SYMBOL_TYPE_ANY, &symbol), B_BAD_IMAGE_ID);
	EXPECT_EQ(unload_add_on(image), B_OK);
}


TEST_F(ImageTest, SymbolsAreListed)
{
	image_id image = load_add_on((kAddOns + "Good.so").c_str());
	ASSERT_GT(image, 0);
	std::set<std::string> names;
	char name[64];
	int32 length = sizeof(name);
	int32 type;
	void* location;
	int32 n = 0;
	while (get_nth_image_symbol(image, n, name, &length, &type, &location) == B_OK) {
		names.insert(name);
		if (strcmp(name, "addon_value") == 0) {
			EXPECT_EQ(type, B_SYMBOL_TYPE_DATA);
			EXPECT_EQ(length, 11);
			EXPECT_EQ(*static_cast<int*>(location), 42);
		}
		length = sizeof(name);
		n++;
		ASSERT_LT(n, 1000);
	}
	EXPECT_EQ(names.count("addon_function"), 1u);
	EXPECT_EQ(names.count("addon_value"), 1u);
	EXPECT_EQ(names.count("setenv"), 0u);

	length = 4;
	EXPECT_EQ(get_nth_image_symbol(image, 0, name, &length, nullptr, nullptr), B_OK);
	EXPECT_EQ(strlen(name), 3u);
	EXPECT_EQ(get_nth_image_symbol(image, -1, name, &length, nullptr, nullptr), B_BAD_INDEX);
	EXPECT_EQ(get_nth_image_symbol(-5, 0, name, &length, nullptr, nullptr), B_BAD_IMAGE_ID);
	EXPECT_EQ(unload_add_on(image), B_OK);
}


TEST_F(ImageTest, WhatCannotBeLoadedSaysWhy)
{
	EXPECT_EQ(load_add_on(nullptr), B_BAD_VALUE);
	EXPECT_EQ(load_add_on((fFolder / "nothing.so").c_str()), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(load_add_on(""), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(load_add_on(fFolder.c_str()), B_NOT_AN_EXECUTABLE);
	EXPECT_EQ(load_add_on(Write("text.so", "this is no library").c_str()), B_NOT_AN_EXECUTABLE);
	EXPECT_EQ(load_add_on(Write("empty.so", "").c_str()), B_NOT_AN_EXECUTABLE);
	EXPECT_EQ(load_add_on((kAddOns + "MissingSymbol.so").c_str()), B_MISSING_SYMBOL);
	EXPECT_EQ(load_add_on((kAddOns + "MissingLibrary.so").c_str()), B_MISSING_LIBRARY);
}


TEST_F(ImageTest, ACutOffLibraryIsRefused)
{
	std::string whole = read_file(kAddOns + "Good.so");
	ASSERT_GT(whole.size(), 4096u);
	for (size_t size : {size_t(16), size_t(64), size_t(300), whole.size() / 4, whole.size() / 3}) {
		std::string path = Write("cut.so", whole.substr(0, size));
		EXPECT_EQ(load_add_on(path.c_str()), B_NOT_AN_EXECUTABLE) << size;
	}
	std::string otherMachine = whole;
	otherMachine[18] ^= 0x55;
	EXPECT_EQ(load_add_on(Write("other.so", otherMachine).c_str()), B_NOT_AN_EXECUTABLE);
}


TEST_F(ImageTest, TheProgramIsTheFirstImage)
{
	int32 cookie = 0;
	image_info info;
	ASSERT_EQ(get_next_image_info(B_CURRENT_TEAM, &cookie, &info), B_OK);
	EXPECT_EQ(info.type, B_APP_IMAGE);
	EXPECT_EQ(fs::canonical(info.name), fs::canonical("/proc/self/exe"));
	EXPECT_NE(info.text, nullptr);
	EXPECT_GT(info.text_size, 0);
	EXPECT_NE(info.node, 0u);

	int (*function)() = nullptr;
	ASSERT_EQ(get_image_symbol(info.id, "image_test_function", B_SYMBOL_TYPE_TEXT,
				  reinterpret_cast<void**>(&function)),
		B_OK);
	EXPECT_EQ(function(), 5);

	bool library = false;
	while (get_next_image_info(getpid(), &cookie, &info) == B_OK)
		library |= info.type == B_LIBRARY_IMAGE && strstr(info.name, "libc.so") != nullptr;
	EXPECT_TRUE(library);
	EXPECT_EQ(get_next_image_info(B_CURRENT_TEAM, &cookie, &info), B_BAD_VALUE);
	EXPECT_EQ(get_next_image_info(1, &cookie, &info), B_BAD_TEAM_ID);
	EXPECT_EQ(get_next_image_info(B_CURRENT_TEAM, nullptr, &info), B_BAD_VALUE);
}


TEST_F(ImageTest, AnAddOnIsAnImageToo)
{
	image_id image = load_add_on((kAddOns + "Good.so").c_str());
	ASSERT_GT(image, 0);
	image_info info;
	ASSERT_EQ(get_image_info(image, &info), B_OK);
	EXPECT_EQ(info.id, image);
	EXPECT_EQ(info.type, B_ADD_ON_IMAGE);
	EXPECT_EQ(fs::canonical(info.name), fs::canonical(kAddOns + "Good.so"));

	int32 cookie = 0;
	bool listed = false;
	while (get_next_image_info(B_CURRENT_TEAM, &cookie, &info) == B_OK)
		listed |= info.id == image;
	EXPECT_TRUE(listed);

	EXPECT_EQ(unload_add_on(image), B_OK);
	EXPECT_EQ(get_image_info(image, &info), B_BAD_IMAGE_ID);
	EXPECT_EQ(get_image_info(image, nullptr), B_BAD_VALUE);
}


TEST_F(ImageTest, OnlyAddOnsCanBeUnloaded)
{
	int32 cookie = 0;
	image_info info;
	ASSERT_EQ(get_next_image_info(B_CURRENT_TEAM, &cookie, &info), B_OK);
	EXPECT_EQ(unload_add_on(info.id), B_BAD_IMAGE_ID);
	EXPECT_EQ(unload_add_on(0), B_BAD_IMAGE_ID);
}


TEST(LoadImageTest, TheProgramWaitsUntilItIsResumed)
{
	const char* arguments[] = {"/bin/sh", "-c", "exit 7"};
	thread_id team = load_image(3, arguments, nullptr);
	ASSERT_GT(team, 0);
	thread_info info;
	ASSERT_EQ(get_thread_info(team, &info), B_OK);
	EXPECT_EQ(info.state, B_THREAD_SUSPENDED);
	EXPECT_STREQ(info.name, "sh");

	EXPECT_EQ(resume_thread(team), B_OK);
	status_t result = B_OK;
	EXPECT_EQ(wait_for_thread(team, &result), B_OK);
	EXPECT_EQ(result, 7);
	EXPECT_EQ(wait_for_thread(team, &result), B_BAD_THREAD_ID);
}


TEST(LoadImageTest, TheProgramGetsItsEnvironment)
{
	const char* arguments[] = {"/bin/sh", "-c", "test \"$LOAD_IMAGE_TEST\" = yes"};
	const char* environment[] = {"LOAD_IMAGE_TEST=yes", nullptr};
	status_t result = B_ERROR;
	EXPECT_EQ(wait_for_thread(load_image(3, arguments, environment), &result), B_OK);
	EXPECT_EQ(result, 0);
}


TEST(LoadImageTest, TheProgramCanBeStoppedAndKilled)
{
	const char* arguments[] = {"/bin/sleep", "100"};
	thread_id team = load_image(2, arguments, nullptr);
	ASSERT_GT(team, 0);
	EXPECT_EQ(resume_thread(team), B_OK);
	EXPECT_EQ(resume_thread(team), B_BAD_THREAD_STATE);
	EXPECT_EQ(suspend_thread(team), B_OK);
	thread_info info;
	EXPECT_EQ(get_thread_info(team, &info), B_OK);
	EXPECT_EQ(info.state, B_THREAD_SUSPENDED);
	EXPECT_EQ(wait_for_thread_etc(team, B_RELATIVE_TIMEOUT, 10000, nullptr), B_TIMED_OUT);
	EXPECT_EQ(kill_thread(team), B_OK);
	status_t result = B_OK;
	EXPECT_EQ(wait_for_thread(team, &result), B_OK);
	EXPECT_EQ(result, B_INTERRUPTED);
}


TEST(LoadImageTest, WhatIsNoProgramIsRefused)
{
	const char* missing[] = {"/nothing/here"};
	EXPECT_EQ(load_image(1, missing, nullptr), B_ENTRY_NOT_FOUND);
	const char* folder[] = {"/"};
	EXPECT_EQ(load_image(1, folder, nullptr), B_NOT_AN_EXECUTABLE);
	EXPECT_EQ(load_image(0, missing, nullptr), B_BAD_VALUE);
	EXPECT_EQ(load_image(1, nullptr, nullptr), B_BAD_VALUE);
}

} // namespace
