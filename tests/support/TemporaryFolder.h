// SPDX-License-Identifier: MIT
// A folder that lasts as long as a test, and shorthands for what lies in it.

#ifndef TESTS_SUPPORT_TEMPORARY_FOLDER_H
#define TESTS_SUPPORT_TEMPORARY_FOLDER_H

#include <sys/xattr.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <optional>
#include <string>

/// An empty folder, removed with its content at the end.
class TemporaryFolder {
public:
	TemporaryFolder()
	{
		std::string name =
			std::filesystem::canonical(std::filesystem::temp_directory_path()) / "plimworks-XXXXXX";
		fPath = mkdtemp(name.data());
	}
	~TemporaryFolder() { std::filesystem::remove_all(fPath); }

	const std::string& Path() const { return fPath; }
	/// The path of a name inside, whether or not it exists.
	std::string operator/(const std::string& name) const { return fPath + "/" + name; }

	/// Writes a file and returns its path.
	std::string Write(const std::string& name, const std::string& content = "") const
	{
		const std::string path = *this / name;
		std::ofstream(path, std::ios::binary) << content;
		return path;
	}
	std::string Read(const std::string& name) const
	{
		std::ifstream file(*this / name, std::ios::binary);
		return std::string(std::istreambuf_iterator<char>(file), {});
	}
	/// Makes a folder, with those above it, and returns its path.
	std::string Make(const std::string& name) const
	{
		std::filesystem::create_directories(*this / name);
		return *this / name;
	}
	/// Makes a folder that is no successor of one that another test has removed: the host gives the
	/// inodes of those away first, and the kit would know them.
	std::string MakeUnknown(const std::string& name) const
	{
		for (int i = 0; i < 500; i++)
			Make("used-up/" + std::to_string(i));
		return Make(name);
	}
	void Link(const std::string& target, const std::string& name) const
	{
		std::filesystem::create_symlink(target, *this / name);
	}

	/// Whether files here can have attributes; not every file system keeps them.
	bool KeepsAttributes() const
	{
		return setxattr(fPath.c_str(), "user.probe", "x", 1, 0) == 0
			&& removexattr(fPath.c_str(), "user.probe") == 0;
	}

private:
	std::string fPath;
};

/// Skips the test where files have no attributes.
#define SKIP_WITHOUT_ATTRIBUTES(folder)                                                            \
	if (!(folder).KeepsAttributes())                                                               \
	GTEST_SKIP() << "the temporary folder has no extended attributes"

/// Sets a variable of the environment, and puts the old value back at the end.
class ScopedVariable {
public:
	ScopedVariable(const char* name, const std::string& value)
		: fName(name)
	{
		const char* old = getenv(name);
		if (old != nullptr)
			fOld = old;
		setenv(name, value.c_str(), 1);
	}
	~ScopedVariable()
	{
		if (fOld)
			setenv(fName, fOld->c_str(), 1);
		else
			unsetenv(fName);
	}

private:
	const char* fName;
	std::optional<std::string> fOld;
};

#endif
