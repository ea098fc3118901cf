// SPDX-License-Identifier: MIT
// The type of a file that says nothing about it.

#include "storage/MimeGuess.h"

#include <fcntl.h>
#include <string.h>
#include <sys/stat.h>
#include <unistd.h>

#include <MimeType.h>

#include "storage/KnownNodes.h"
#include "storage/MimeDatabase.h"
#include "storage/StorageStatus.h"

namespace BPrivate {

namespace {

const char* const kDirectoryType = "application/x-vnd.Be-directory";
const char* const kSymLinkType = "application/x-vnd.Be-symlink";
const char* const kTextType = "text/plain";
const std::string_view kElfMagic("\177ELF", 4);


// Whether the bytes are text in UTF-8, of which the last character may be cut off.
bool
IsText(std::string_view content)
{
	for (size_t i = 0; i < content.size(); i++) {
		const unsigned char lead = content[i];
		if (lead < 0x20 && strchr("\t\n\r\f\b\033", lead) == nullptr)
			return false;
		if (lead == 0 || lead == 0x7f)
			return false;
		if (lead < 0x80)
			continue;
		if (lead < 0xc2 || lead > 0xf4)
			return false;
		for (int more = lead >= 0xf0 ? 3 : lead >= 0xe0 ? 2 : 1; more > 0; more--) {
			if (++i == content.size())
				return true;
			if ((content[i] & 0xc0) != 0x80)
				return false;
		}
	}
	return !content.empty();
}


// The first bytes of a file that is open in any way; none when it cannot be read.
std::string
FirstBytes(int fd)
{
	std::string content(kMimeContentSize, '\0');
	ssize_t bytes = pread(fd, content.data(), content.size(), 0);
	if (bytes < 0 && errno == EBADF) {
		// Open for writing, or for the status alone.
		const std::string link = "/proc/self/fd/" + std::to_string(fd);
		const int readable = open(link.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC);
		if (readable >= 0) {
			bytes = pread(readable, content.data(), content.size(), 0);
			close(readable);
		}
	}
	content.resize(bytes < 0 ? 0 : bytes);
	return content;
}

} // namespace


std::string
guess_mime_type(std::string_view content, const std::string& name)
{
	if (content.starts_with(kElfMagic))
		return B_APP_MIME_TYPE;
	std::string type = MimeDatabase::Default().Guess(content, name);
	if (!type.empty())
		return type;
	return IsText(content) ? kTextType : B_FILE_MIME_TYPE;
}


status_t
guess_descriptor_type(int fd, std::string name, std::string* type)
{
	struct stat stat;
	if (fstat(fd, &stat) != 0)
		return status_from_errno(errno);
	if (S_ISDIR(stat.st_mode)) {
		*type = kDirectoryType;
		return B_OK;
	}
	if (S_ISLNK(stat.st_mode)) {
		*type = kSymLinkType;
		return B_OK;
	}
	if (!S_ISREG(stat.st_mode)) {
		*type = B_FILE_MIME_TYPE;
		return B_OK;
	}

	std::string path;
	if (name.empty() && find_descriptor_path(fd, &path) == B_OK)
		name = path.substr(path.rfind('/') + 1);
	*type = guess_mime_type(FirstBytes(fd), name);
	return B_OK;
}

} // namespace BPrivate
