// SPDX-License-Identifier: MIT
// Ports: queues of messages between the threads of this process.

#include <OS.h>

#include <string.h>

#include <algorithm>
#include <deque>
#include <map>

#include "kernel/Kernel.h"

using namespace BPrivate;

namespace {

constexpr int32 kMaxCapacity = 4096;
constexpr size_t kMaxMessageSize = 256 * 1024;


struct PortMessage {
	int32 code;
	std::vector<char> data;
};


struct Port {
	char name[B_OS_NAME_LENGTH];
	size_t capacity;
	bool closed = false;
	std::deque<PortMessage> messages;
	WaitQueue readers;
	WaitQueue writers;
};


struct PortTable {
	std::map<port_id, std::shared_ptr<Port>> ports;
	port_id nextId = 1;
};


PortTable&
table()
{
	static PortTable* sTable = new PortTable;
	return *sTable;
}


std::shared_ptr<Port>
find_port_record(port_id id)
{
	auto found = table().ports.find(id);
	return found == table().ports.end() ? nullptr : found->second;
}


/// Waits until the port has a message; B_BAD_PORT_ID when none can come any more.
status_t
wait_for_message(KernelSection& section, Port& port, const KernelDeadline& deadline)
{
	while (port.messages.empty()) {
		if (port.closed)
			return B_BAD_PORT_ID;
		Waiter waiter;
		status_t status = section.Wait(port.readers, waiter, deadline, B_THREAD_WAITING);
		if (status != B_OK)
			return status;
	}
	return B_OK;
}


status_t
wait_for_room(KernelSection& section, Port& port, const KernelDeadline& deadline)
{
	while (!port.closed && port.messages.size() >= port.capacity) {
		Waiter waiter;
		status_t status = section.Wait(port.writers, waiter, deadline, B_THREAD_WAITING);
		if (status != B_OK)
			return status;
	}
	return port.closed ? B_BAD_PORT_ID : B_OK;
}

} // namespace


port_id
create_port(int32 capacity, const char* name)
{
	if (capacity < 1 || capacity > kMaxCapacity)
		return B_BAD_VALUE;

	KernelSection section;
	auto port = std::make_shared<Port>();
	port->capacity = capacity;
	copy_name(port->name, name == nullptr ? "unnamed port" : name);
	port_id id = table().nextId++;
	table().ports[id] = port;
	return id;
}


port_id
find_port(const char* name)
{
	if (name == nullptr)
		return B_BAD_VALUE;

	KernelSection section;
	for (const auto& entry : table().ports) {
		if (strncmp(entry.second->name, name, B_OS_NAME_LENGTH - 1) == 0)
			return entry.first;
	}
	return B_NAME_NOT_FOUND;
}


ssize_t
read_port(port_id port, int32* code, void* buffer, size_t bufferSize)
{
	return read_port_etc(port, code, buffer, bufferSize, 0, 0);
}


ssize_t
read_port_etc(
	port_id id, int32* code, void* buffer, size_t bufferSize, uint32 flags, bigtime_t timeout)
{
	if (buffer == nullptr && bufferSize > 0)
		return B_BAD_VALUE;

	KernelSection section;
	std::shared_ptr<Port> port = find_port_record(id);
	if (port == nullptr)
		return B_BAD_PORT_ID;
	status_t status = wait_for_message(section, *port, KernelDeadline(flags, timeout));
	if (status != B_OK)
		return status;

	PortMessage message = std::move(port->messages.front());
	port->messages.pop_front();
	port->writers.WakeAll(B_OK);

	size_t size = std::min(bufferSize, message.data.size());
	if (size > 0)
		memcpy(buffer, message.data.data(), size);
	if (code != nullptr)
		*code = message.code;
	return size;
}


status_t
write_port(port_id port, int32 code, const void* buffer, size_t bufferSize)
{
	return write_port_etc(port, code, buffer, bufferSize, 0, 0);
}


status_t
write_port_etc(
	port_id id, int32 code, const void* buffer, size_t bufferSize, uint32 flags, bigtime_t timeout)
{
	if (bufferSize > kMaxMessageSize || (buffer == nullptr && bufferSize > 0))
		return B_BAD_VALUE;

	KernelSection section;
	std::shared_ptr<Port> port = find_port_record(id);
	if (port == nullptr)
		return B_BAD_PORT_ID;
	status_t status = wait_for_room(section, *port, KernelDeadline(flags, timeout));
	if (status != B_OK)
		return status;

	const char* bytes = static_cast<const char*>(buffer);
	port->messages.push_back({code, std::vector<char>(bytes, bytes + bufferSize)});
	port->readers.WakeAll(B_OK);
	return B_OK;
}


status_t
close_port(port_id id)
{
	KernelSection section;
	std::shared_ptr<Port> port = find_port_record(id);
	if (port == nullptr)
		return B_BAD_PORT_ID;
	port->closed = true;
	port->readers.WakeAll(B_OK);
	port->writers.WakeAll(B_OK);
	return B_OK;
}


status_t
delete_port(port_id id)
{
	KernelSection section;
	std::shared_ptr<Port> port = find_port_record(id);
	if (port == nullptr)
		return B_BAD_PORT_ID;
	table().ports.erase(id);
	port->closed = true;
	port->messages.clear();
	port->readers.WakeAll(B_BAD_PORT_ID);
	port->writers.WakeAll(B_BAD_PORT_ID);
	return B_OK;
}


ssize_t
port_buffer_size(port_id port)
{
	return port_buffer_size_etc(port, 0, 0);
}


ssize_t
port_buffer_size_etc(port_id id, uint32 flags, bigtime_t timeout)
{
	KernelSection section;
	std::shared_ptr<Port> port = find_port_record(id);
	if (port == nullptr)
		return B_BAD_PORT_ID;
	status_t status = wait_for_message(section, *port, KernelDeadline(flags, timeout));
	if (status != B_OK)
		return status;
	return port->messages.front().data.size();
}


ssize_t
port_count(port_id id)
{
	KernelSection section;
	std::shared_ptr<Port> port = find_port_record(id);
	return port == nullptr ? B_BAD_PORT_ID : static_cast<ssize_t>(port->messages.size());
}
