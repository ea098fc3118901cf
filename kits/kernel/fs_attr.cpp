// SPDX-License-Identifier: MIT
// Attributes of files as the host's extended attributes.
//
// The value of an extended attribute is a header, which holds the type, and the data. A value
// without it was made by another program. The MIME type is the exception: its value is the bare
// text, which everybody can read, and which the API shows with a null byte at its end.

#include <fs_attr.h>

#include <errno.h>
#include <fcntl.h>
#include <stdio.h>
#include <string.h>
#include <sys/xattr.h>
#include <unistd.h>

#include <algorithm>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include <TypeConstants.h>

namespace {

constexpr std::string_view kNamespace = "user.";
constexpr const char* kTypeAttribute = "BEOS:TYPE";
constexpr const char* kHostTypeAttribute = "user.mime_type";
constexpr char kMagic[4] = {'\0', 'B', 'e', 'A'};
constexpr size_t kHeaderSize = 8;
// The host's limits.
constexpr size_t kMaxValueSize = 65536;
constexpr size_t kMaxNameLength = 255;


struct Attribute {
	uint32 type;
	std::string data;
};


struct AttributeDirectory {
	~AttributeDirectory() { close(fd); }

	int fd;
	std::vector<std::string> names;
	size_t next = 0;
	dirent entry = {};
};


/// The host's name of an attribute; empty, with errno set, when it can have none.
std::string
host_name(const char* name)
{
	if (name == nullptr || name[0] == '\0') {
		errno = EINVAL;
		return std::string();
	}
	if (strcmp(name, kTypeAttribute) == 0)
		return kHostTypeAttribute;

	std::string result(kNamespace);
	result += name;
	if (result.size() > kMaxNameLength) {
		errno = ENAMETOOLONG;
		return std::string();
	}
	return result;
}


/// A name for a descriptor that was opened for its path only, which the f... functions refuse.
std::string
descriptor_path(int fd)
{
	return "/proc/self/fd/" + std::to_string(fd);
}


ssize_t
get_value(int fd, const std::string& name, char* buffer, size_t size)
{
	ssize_t bytes = fgetxattr(fd, name.c_str(), buffer, size);
	if (bytes < 0 && errno == EBADF && fd >= 0)
		bytes = getxattr(descriptor_path(fd).c_str(), name.c_str(), buffer, size);
	// The API knows a missing attribute as a missing entry, on every file system.
	if (bytes < 0 && errno == ENODATA)
		errno = ENOENT;
	return bytes;
}


int
set_value(int fd, const std::string& name, const std::string& value)
{
	int result = fsetxattr(fd, name.c_str(), value.data(), value.size(), 0);
	if (result < 0 && errno == EBADF && fd >= 0) {
		result = setxattr(descriptor_path(fd).c_str(), name.c_str(), value.data(), value.size(), 0);
	}
	// However it is told: there is no room for it.
	if (result < 0 && (errno == E2BIG || errno == ERANGE))
		errno = ENOSPC;
	return result;
}


ssize_t
list_names(int fd, char* buffer, size_t size)
{
	ssize_t bytes = flistxattr(fd, buffer, size);
	if (bytes < 0 && errno == EBADF && fd >= 0)
		bytes = listxattr(descriptor_path(fd).c_str(), buffer, size);
	return bytes;
}


std::string
encode(const std::string& name, const Attribute& attribute)
{
	if (name == kHostTypeAttribute)
		return attribute.data.substr(0, attribute.data.find('\0'));

	std::string value(kMagic, sizeof(kMagic));
	for (int shift = 24; shift >= 0; shift -= 8)
		value += static_cast<char>(attribute.type >> shift);
	return value + attribute.data;
}


Attribute
decode(const std::string& name, std::string_view value)
{
	if (name == kHostTypeAttribute) {
		std::string text(value.substr(0, value.find('\0')));
		text += '\0';
		return {B_MIME_STRING_TYPE, text};
	}
	if (value.size() < kHeaderSize || memcmp(value.data(), kMagic, sizeof(kMagic)) != 0)
		return {B_XATTR_TYPE, std::string(value)};

	uint32 type = 0;
	for (size_t i = sizeof(kMagic); i < kHeaderSize; i++)
		type = type << 8 | static_cast<uchar>(value[i]);
	return {type, std::string(value.substr(kHeaderSize))};
}


bool
read_attribute(int fd, const std::string& name, Attribute* attribute)
{
	if (name.empty())
		return false;
	std::string value(kMaxValueSize, '\0');
	ssize_t bytes = get_value(fd, name, value.data(), value.size());
	if (bytes < 0)
		return false;
	*attribute = decode(name, std::string_view(value.data(), bytes));
	return true;
}


/// Reads the names that are there now; false with errno set.
bool
fill_directory(AttributeDirectory* directory)
{
	std::vector<char> list;
	ssize_t bytes;
	do {
		bytes = list_names(directory->fd, nullptr, 0);
		if (bytes < 0)
			return false;
		// Room for one that is added meanwhile.
		list.resize(bytes + kMaxNameLength + 1);
		bytes = list_names(directory->fd, list.data(), list.size());
	} while (bytes < 0 && errno == ERANGE);
	if (bytes < 0)
		return false;

	directory->names.clear();
	directory->next = 0;
	std::string_view rest(list.data(), bytes);
	while (!rest.empty()) {
		std::string_view name = rest.substr(0, rest.find('\0'));
		rest.remove_prefix(std::min(name.size() + 1, rest.size()));
		if (name == kHostTypeAttribute)
			directory->names.emplace_back(kTypeAttribute);
		else if (name.starts_with(kNamespace))
			directory->names.emplace_back(name.substr(kNamespace.size()));
	}
	return true;
}


/// Owns \a fd from now on.
DIR*
make_directory(int fd)
{
	if (fd < 0)
		return nullptr;
	auto directory = std::make_unique<AttributeDirectory>();
	directory->fd = fd;
	if (!fill_directory(directory.get())) {
		// The host tells a file system without attributes by an error.
		if (errno != ENOTSUP)
			return nullptr;
	}
	return reinterpret_cast<DIR*>(directory.release());
}


AttributeDirectory*
attribute_directory(DIR* directory)
{
	if (directory == nullptr)
		errno = EBADF;
	return reinterpret_cast<AttributeDirectory*>(directory);
}

} // namespace


ssize_t
fs_read_attr(int fd, const char* attribute, uint32, off_t pos, void* buffer, size_t readBytes)
{
	if (pos < 0 || (buffer == nullptr && readBytes > 0)) {
		errno = EINVAL;
		return -1;
	}
	Attribute found;
	if (!read_attribute(fd, host_name(attribute), &found))
		return -1;

	if (static_cast<uint64>(pos) >= found.data.size() || readBytes == 0)
		return 0;
	size_t size = std::min(readBytes, found.data.size() - static_cast<size_t>(pos));
	memcpy(buffer, found.data.data() + pos, size);
	return size;
}


ssize_t
fs_write_attr(
	int fd, const char* attribute, uint32 type, off_t pos, const void* buffer, size_t readBytes)
{
	if (pos < 0 || (buffer == nullptr && readBytes > 0)) {
		errno = EINVAL;
		return -1;
	}
	std::string name = host_name(attribute);
	if (name.empty())
		return -1;
	if (readBytes > kMaxValueSize || static_cast<uint64>(pos) > kMaxValueSize) {
		errno = ENOSPC;
		return -1;
	}

	Attribute changed = {type, std::string()};
	if (pos > 0) {
		if (!read_attribute(fd, name, &changed) && errno != ENOENT)
			return -1;
		changed.type = type;
		changed.data.resize(std::max<size_t>(changed.data.size(), pos + readBytes));
	} else
		changed.data.resize(readBytes);
	if (readBytes > 0)
		memcpy(changed.data.data() + pos, buffer, readBytes);
	return set_value(fd, name, encode(name, changed)) < 0 ? -1 : static_cast<ssize_t>(readBytes);
}


int
fs_remove_attr(int fd, const char* attribute)
{
	std::string name = host_name(attribute);
	if (name.empty())
		return -1;
	int result = fremovexattr(fd, name.c_str());
	if (result < 0 && errno == EBADF && fd >= 0)
		result = removexattr(descriptor_path(fd).c_str(), name.c_str());
	if (result < 0 && errno == ENODATA)
		errno = ENOENT;
	return result;
}


int
fs_stat_attr(int fd, const char* attribute, struct attr_info* attrInfo)
{
	if (attrInfo == nullptr) {
		errno = EINVAL;
		return -1;
	}
	Attribute found;
	if (!read_attribute(fd, host_name(attribute), &found))
		return -1;
	attrInfo->type = found.type;
	attrInfo->size = found.data.size();
	return 0;
}


DIR*
fs_open_attr_dir(const char* path)
{
	if (path == nullptr) {
		errno = EINVAL;
		return nullptr;
	}
	return make_directory(open(path, O_PATH | O_CLOEXEC));
}


DIR*
fs_fopen_attr_dir(int fd)
{
	return make_directory(fcntl(fd, F_DUPFD_CLOEXEC, 0));
}


int
fs_close_attr_dir(DIR* dir)
{
	AttributeDirectory* directory = attribute_directory(dir);
	if (directory == nullptr)
		return -1;
	delete directory;
	return 0;
}


struct dirent*
fs_read_attr_dir(DIR* dir)
{
	AttributeDirectory* directory = attribute_directory(dir);
	if (directory == nullptr || directory->next >= directory->names.size())
		return nullptr;

	const std::string& name = directory->names[directory->next++];
	dirent& entry = directory->entry;
	snprintf(entry.d_name, sizeof(entry.d_name), "%s", name.c_str());
	entry.d_reclen = sizeof(entry);
	entry.d_type = DT_UNKNOWN;
	return &entry;
}


void
fs_rewind_attr_dir(DIR* dir)
{
	AttributeDirectory* directory = attribute_directory(dir);
	if (directory == nullptr)
		return;
	// When the names cannot be read any more, the old ones are the best there is.
	if (!fill_directory(directory))
		directory->next = 0;
}
