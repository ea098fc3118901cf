// SPDX-License-Identifier: MIT
// What is known about threads, this process and the machine.

#include <OS.h>

#include <stdio.h>
#include <stdlib.h>
#include <string.h>
#include <sys/resource.h>
#include <sys/sysinfo.h>
#include <sys/utsname.h>
#include <unistd.h>

#include <algorithm>
#include <fstream>
#include <string>

#include <image.h>

#include "kernel/Kernel.h"

using namespace BPrivate;

namespace {

/// Reads a thread's processor times from the host.
void
fill_times(pid_t hostId, thread_info* info)
{
	std::ifstream file("/proc/self/task/" + std::to_string(hostId) + "/stat");
	std::string line;
	std::getline(file, line);
	// The name, in parentheses, may hold anything; twelve fields lie between it and the times.
	size_t nameEnd = line.rfind(')');
	if (nameEnd == std::string::npos)
		return;

	unsigned long user;
	unsigned long kernel;
	if (sscanf(line.c_str() + nameEnd + 1, " %*c %*d %*d %*d %*d %*d %*u %*u %*u %*u %*u %lu %lu",
			&user, &kernel)
		!= 2)
		return;
	bigtime_t tick = 1000000 / sysconf(_SC_CLK_TCK);
	info->user_time = user * tick;
	info->kernel_time = kernel * tick;
}


void
fill_stack(const Thread* thread, thread_info* info)
{
	pthread_attr_t attributes;
	if (pthread_getattr_np(thread->pthread, &attributes) != 0)
		return;
	size_t size;
	if (pthread_attr_getstack(&attributes, &info->stack_base, &size) == 0)
		info->stack_end = static_cast<char*>(info->stack_base) + size;
	pthread_attr_destroy(&attributes);
}


void
fill_info(const Thread* thread, thread_info* info)
{
	*info = thread_info();
	info->thread = thread->id;
	info->team = thread->kind == Thread::Kind::kTeam ? thread->id : getpid();
	memcpy(info->name, thread->name, sizeof(info->name));
	info->priority = thread->priority;
	info->sem = thread->waitsFor;

	bool notStarted = thread->kind == Thread::Kind::kTeam && !thread->started;
	if (thread->suspended != 0 || notStarted)
		info->state = B_THREAD_SUSPENDED;
	else
		info->state = static_cast<thread_state>(thread->activity.load());

	if (thread->kind == Thread::Kind::kTeam)
		return;
	fill_times(thread->hostId, info);
	fill_stack(thread, info);
}


bool
is_this_team(team_id team)
{
	return team == B_CURRENT_TEAM || team == getpid();
}


int32
count_images()
{
	int32 count = 0;
	int32 cookie = 0;
	image_info info;
	while (get_next_image_info(B_CURRENT_TEAM, &cookie, &info) == B_OK)
		count++;
	return count;
}


/// Reads the program's arguments; returns their number.
int32
read_arguments(char (&args)[64])
{
	std::ifstream file("/proc/self/cmdline", std::ios::binary);
	std::string line((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
	int32 count = static_cast<int32>(std::count(line.begin(), line.end(), '\0'));
	if (!line.empty() && line.back() == '\0')
		line.pop_back();
	std::replace(line.begin(), line.end(), '\0', ' ');
	snprintf(args, sizeof(args), "%s", line.c_str());
	return count;
}

} // namespace


status_t
get_thread_info(thread_id id, thread_info* info)
{
	if (info == nullptr)
		return B_BAD_VALUE;

	KernelSection section;
	std::shared_ptr<Thread> thread = find_thread_record(id);
	if (thread == nullptr)
		return B_BAD_THREAD_ID;
	fill_info(thread.get(), info);
	return B_OK;
}


status_t
get_next_thread_info(team_id team, int32* cookie, thread_info* info)
{
	if (cookie == nullptr || info == nullptr)
		return B_BAD_VALUE;
	if (!is_this_team(team))
		return B_BAD_TEAM_ID;

	KernelSection section;
	for (const std::shared_ptr<Thread>& thread : live_threads()) {
		if (thread->id <= *cookie || thread->kind == Thread::Kind::kTeam)
			continue;
		fill_info(thread.get(), info);
		*cookie = thread->id;
		return B_OK;
	}
	return B_BAD_VALUE;
}


status_t
get_team_info(team_id id, team_info* info)
{
	if (info == nullptr)
		return B_BAD_VALUE;
	if (!is_this_team(id))
		return B_BAD_TEAM_ID;

	*info = team_info();
	info->team = getpid();
	info->image_count = count_images();
	info->debugger_nub_thread = -1;
	info->debugger_nub_port = -1;
	info->argc = read_arguments(info->args);
	info->uid = getuid();
	info->gid = getgid();

	KernelSection section;
	for (const std::shared_ptr<Thread>& thread : live_threads())
		info->thread_count += thread->kind == Thread::Kind::kTeam ? 0 : 1;
	return B_OK;
}


status_t
get_system_info(system_info* info)
{
	if (info == nullptr)
		return B_BAD_VALUE;
	*info = system_info();

	struct sysinfo host;
	if (sysinfo(&host) != 0)
		return B_ERROR;
	uint64 memory = static_cast<uint64>(host.totalram) * host.mem_unit;
	info->boot_time = real_time_clock_usecs() - system_time();
	info->cpu_count = static_cast<uint32>(sysconf(_SC_NPROCESSORS_ONLN));
	info->free_memory = static_cast<uint64>(host.freeram) * host.mem_unit;
	info->max_pages = memory / B_PAGE_SIZE;
	info->used_pages = (memory - info->free_memory) / B_PAGE_SIZE;
	info->max_sems = INT32_MAX;
	info->max_ports = INT32_MAX;
	info->used_teams = host.procs;
	rlimit limit;
	if (getrlimit(RLIMIT_NPROC, &limit) == 0 && limit.rlim_cur < UINT32_MAX)
		info->max_threads = info->max_teams = static_cast<uint32>(limit.rlim_cur);
	else
		info->max_threads = info->max_teams = INT32_MAX;

	utsname name;
	if (uname(&name) == 0) {
		snprintf(info->kernel_name, sizeof(info->kernel_name), "%s %s", name.sysname, name.release);
		snprintf(info->kernel_build_date, sizeof(info->kernel_build_date), "%.31s", name.version);
		info->kernel_version = strtol(name.release, nullptr, 10);
	}

	KernelSection section;
	info->used_threads = static_cast<uint32>(live_threads().size());
	return B_OK;
}


int32
is_computer_on()
{
	return 1;
}


void
debugger(const char* message)
{
	fprintf(stderr, "debugger: %s\n", message == nullptr ? "" : message);
	fflush(stderr);
	abort();
}
