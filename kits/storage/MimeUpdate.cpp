// SPDX-License-Identifier: MIT
// Writing the user's packages of the MIME database, and telling the desktop.

#include "storage/MimeUpdate.h"

#include <vector>

#include <fcntl.h>
#include <spawn.h>
#include <stdlib.h>
#include <string.h>
#include <sys/wait.h>
#include <unistd.h>

#include <Errors.h>
#include <File.h>

#include "storage/StorageStatus.h"

extern char** environ;

namespace BPrivate {

namespace {

const char* const kUpdateProgram = "update-mime-database";
// A database that takes longer is left to finish by itself.
const useconds_t kUpdateStep = 2000;
const int kMaxUpdateSteps = 5000;


status_t
WriteNewFile(int fd, const std::string& content)
{
	size_t done = 0;
	while (done < content.size()) {
		const ssize_t bytes = write(fd, content.data() + done, content.size() - done);
		if (bytes < 0 && errno != EINTR)
			return status_from_errno(errno);
		if (bytes > 0)
			done += bytes;
	}
	return status_of(fchmod(fd, 0644)) == B_OK ? status_of(fsync(fd)) : status_from_errno(errno);
}

} // namespace


const char* const kSupertypeSuffix = ".be-supertype";


std::string
package_file_name(const std::string& key)
{
	// No type has an equals sign.
	const size_t slash = key.find('/');
	if (slash == std::string::npos)
		return "be-api." + key + kSupertypeSuffix;
	return "be-api." + key.substr(0, slash) + "=" + key.substr(slash + 1) + ".xml";
}


status_t
read_whole_file(const std::string& path, size_t maxSize, std::string* content)
{
	BFile file(path.c_str(), B_READ_ONLY | O_NONBLOCK);
	off_t size;
	const status_t status = file.GetSize(&size);
	if (status != B_OK)
		return status;
	if (!file.IsFile() || size > (off_t)maxSize)
		return B_BAD_DATA;

	content->resize(size);
	size_t done = 0;
	while (done < content->size()) {
		const ssize_t bytes = file.Read(content->data() + done, content->size() - done);
		if (bytes < 0)
			return bytes;
		if (bytes == 0)
			break;
		done += bytes;
	}
	content->resize(done);
	return B_OK;
}


status_t
replace_file(const std::string& path, const std::string& content)
{
	std::string temporary = path.substr(0, path.rfind('/') + 1) + ".be-api-XXXXXX";
	const int fd = mkostemp(temporary.data(), O_CLOEXEC);
	if (fd < 0)
		return status_from_errno(errno);

	status_t status = WriteNewFile(fd, content);
	close(fd);
	if (status == B_OK)
		status = status_of(rename(temporary.c_str(), path.c_str()));
	if (status != B_OK)
		unlink(temporary.c_str());
	return status;
}


void
update_desktop_database(const std::string& folder)
{
	// The files are small and can be made again: waiting for the disk would only take time.
	std::vector<char*> environment;
	for (char** variable = environ; *variable != nullptr; variable++)
		environment.push_back(*variable);
	char noSync[] = "PKGSYSTEM_ENABLE_FSYNC=0";
	environment.push_back(noSync);
	environment.push_back(nullptr);

	posix_spawn_file_actions_t actions;
	posix_spawn_file_actions_init(&actions);
	posix_spawn_file_actions_addopen(&actions, STDIN_FILENO, "/dev/null", O_RDONLY, 0);
	posix_spawn_file_actions_addopen(&actions, STDOUT_FILENO, "/dev/null", O_WRONLY, 0);
	posix_spawn_file_actions_addopen(&actions, STDERR_FILENO, "/dev/null", O_WRONLY, 0);

	std::string program = kUpdateProgram;
	std::string argument = folder;
	char* arguments[] = {program.data(), argument.data(), nullptr};
	pid_t child;
	const int error =
		posix_spawnp(&child, kUpdateProgram, &actions, nullptr, arguments, environment.data());
	posix_spawn_file_actions_destroy(&actions);
	if (error != 0)
		return;

	for (int step = 0; step < kMaxUpdateSteps && waitpid(child, nullptr, WNOHANG) == 0; step++)
		usleep(kUpdateStep);
}

} // namespace BPrivate
