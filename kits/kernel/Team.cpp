// SPDX-License-Identifier: MIT
// Programs in processes of their own.

#include "kernel/Team.h"

#include <errno.h>
#include <fcntl.h>
#include <signal.h>
#include <string.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <image.h>

#include "kernel/Kernel.h"
#include "support/HostError.h"

namespace BPrivate {

namespace {

/// Waits for the end of a process, which then is the end of its thread.
void*
watch_team(void* argument)
{
	std::unique_ptr<std::shared_ptr<Thread>> record(
		static_cast<std::shared_ptr<Thread>*>(argument));
	Thread* team = record->get();

	int state = 0;
	pid_t ended;
	do {
		ended = waitpid(team->hostId, &state, 0);
	} while (ended < 0 && errno == EINTR);

	KernelSection section;
	if (ended < 0)
		team->result = B_ERROR;
	else
		team->result = WIFEXITED(state) ? WEXITSTATUS(state) : B_INTERRUPTED;
	if (team->gate >= 0)
		close(team->gate);
	end_thread_record(team);
	return nullptr;
}


/// The child's side: waits for the gate and becomes the program. Only functions that are safe
/// after a fork in a program with threads.
[[noreturn]] void
run_program(int gate, const char** argv, const char** environment)
{
	char go;
	ssize_t bytes;
	do {
		bytes = read(gate, &go, 1);
	} while (bytes < 0 && errno == EINTR);
	// The parent is gone before it let us go on.
	if (bytes != 1)
		_exit(127);

	sigset_t none;
	sigemptyset(&none);
	sigprocmask(SIG_SETMASK, &none, nullptr);
	execve(argv[0], const_cast<char**>(argv), const_cast<char**>(environment));
	_exit(127);
}


status_t
check_program(const char* path)
{
	struct stat node;
	if (stat(path, &node) != 0)
		return host_error();
	if (!S_ISREG(node.st_mode) || access(path, X_OK) != 0)
		return B_NOT_AN_EXECUTABLE;
	return B_OK;
}

} // namespace


bool
resume_team(Thread* team)
{
	if (!team->started) {
		team->started = true;
		bool written = write(team->gate, "g", 1) == 1;
		close(team->gate);
		team->gate = -1;
		return written;
	}
	if (team->suspended == 0)
		return false;
	team->suspended = 0;
	return signal_team(team, SIGCONT) == B_OK;
}


status_t
suspend_team(Thread* team)
{
	if (!team->started)
		return B_OK;
	team->suspended = 1;
	return signal_team(team, SIGSTOP);
}


status_t
signal_team(Thread* team, int signal)
{
	return kill(team->hostId, signal) == 0 ? B_OK : host_error();
}

} // namespace BPrivate


using namespace BPrivate;


thread_id
load_image(int32 argc, const char** argv, const char** environ)
{
	if (argc < 1 || argv == nullptr || argv[0] == nullptr)
		return B_BAD_VALUE;
	status_t status = check_program(argv[0]);
	if (status != B_OK)
		return status;

	// The list need not end with a null pointer, but execve() wants one.
	std::vector<const char*> arguments(argv, argv + argc);
	arguments.push_back(nullptr);
	const char* noEnvironment[] = {nullptr};
	if (environ == nullptr)
		environ = ::environ == nullptr ? noEnvironment : const_cast<const char**>(::environ);

	int gate[2];
	if (pipe2(gate, O_CLOEXEC) != 0)
		return host_error();

	KernelSection section;
	pid_t child = fork();
	if (child == 0) {
		close(gate[1]);
		run_program(gate[0], arguments.data(), environ);
	}
	close(gate[0]);
	if (child < 0) {
		close(gate[1]);
		return B_NO_MORE_TEAMS;
	}

	auto team = std::make_shared<Thread>();
	team->kind = Thread::Kind::kTeam;
	team->id = child;
	team->hostId = child;
	team->gate = gate[1];
	const char* leaf = strrchr(argv[0], '/');
	copy_name(team->name, leaf == nullptr ? argv[0] : leaf + 1);
	add_thread_record(team);

	auto argument = std::make_unique<std::shared_ptr<Thread>>(team);
	pthread_t watcher;
	if (pthread_create(&watcher, nullptr, &watch_team, argument.get()) != 0) {
		close(gate[1]);
		kill(child, SIGKILL);
		waitpid(child, nullptr, 0);
		remove_thread_record(team);
		return B_NO_MORE_THREADS;
	}
	static_cast<void>(argument.release());
	pthread_detach(watcher);
	return child;
}
