// SPDX-License-Identifier: MIT
// What exists: the ports of loopers and of waiting senders, and the handlers by token.

#include "app/Registry.h"

#include <algorithm>

#include "app/LooperPort.h"

namespace BPrivate {

namespace {

// Apart from small numbers, so that a mixed-up identifier is found rather than taken for another port.
constexpr port_id kFirstPort = 1000;
constexpr int32 kFirstToken = 1;


template <typename Map, typename Key>
typename Map::mapped_type
Find(const Map& map, const Key& key)
{
	auto found = map.find(key);
	return found != map.end() ? found->second : nullptr;
}

} // namespace


Registry&
Registry::Default()
{
	static Registry* registry = new Registry;
	return *registry;
}


Registry::Registry()
	: fNextPort(kFirstPort),
	  fNextToken(kFirstToken),
	  fApplicationPort(-1)
{
}


std::shared_ptr<LooperPort>
Registry::AddLooper(BLooper* looper, BWindow* window)
{
	std::lock_guard<std::mutex> lock(fMutex);
	auto port = std::make_shared<LooperPort>(fNextPort++, looper, window);
	// Before others can find it: they must not use a looper that is still being made.
	port->Lock(B_INFINITE_TIMEOUT);
	fPorts[port->Id()] = port;
	fLoopers[looper] = port;
	return port;
}


void
Registry::RemoveLooper(BLooper* looper)
{
	std::lock_guard<std::mutex> lock(fMutex);
	auto found = fLoopers.find(looper);
	if (found == fLoopers.end())
		return;
	if (fApplicationPort == found->second->Id())
		fApplicationPort = -1;
	fPorts.erase(found->second->Id());
	fLoopers.erase(found);
}


std::shared_ptr<LooperPort>
Registry::PortFor(const BLooper* looper)
{
	std::lock_guard<std::mutex> lock(fMutex);
	return Find(fLoopers, looper);
}


std::shared_ptr<LooperPort>
Registry::PortFor(port_id id)
{
	std::lock_guard<std::mutex> lock(fMutex);
	return Find(fPorts, id);
}


std::shared_ptr<LooperPort>
Registry::PortForThread(thread_id thread)
{
	if (thread < 0)
		return nullptr;

	std::lock_guard<std::mutex> lock(fMutex);
	for (const auto& [id, port] : fPorts) {
		if (port->Thread() == thread)
			return port;
	}
	return nullptr;
}


std::vector<std::shared_ptr<LooperPort>>
Registry::Loopers()
{
	std::vector<std::shared_ptr<LooperPort>> ports;
	{
		std::lock_guard<std::mutex> lock(fMutex);
		for (const auto& [id, port] : fPorts)
			ports.push_back(port);
	}
	std::sort(ports.begin(), ports.end(),
		[](const auto& left, const auto& right) { return left->Id() < right->Id(); });
	return ports;
}


void
Registry::AddReplyPort(port_id id, std::shared_ptr<ReplyPort> port)
{
	std::lock_guard<std::mutex> lock(fMutex);
	fReplyPorts[id] = std::move(port);
}


void
Registry::RemoveReplyPort(port_id id)
{
	std::lock_guard<std::mutex> lock(fMutex);
	fReplyPorts.erase(id);
}


std::shared_ptr<ReplyPort>
Registry::ReplyPortFor(port_id id)
{
	std::lock_guard<std::mutex> lock(fMutex);
	return Find(fReplyPorts, id);
}


port_id
Registry::NewPortId()
{
	std::lock_guard<std::mutex> lock(fMutex);
	return fNextPort++;
}


int32
Registry::AddHandler(BHandler* handler)
{
	std::lock_guard<std::mutex> lock(fMutex);
	int32 token = fNextToken++;
	fHandlers[token] = {handler, -1};
	return token;
}


void
Registry::RemoveHandler(int32 token)
{
	std::lock_guard<std::mutex> lock(fMutex);
	fHandlers.erase(token);
}


void
Registry::SetHandlerPort(int32 token, port_id port)
{
	std::lock_guard<std::mutex> lock(fMutex);
	auto found = fHandlers.find(token);
	if (found != fHandlers.end())
		found->second.port = port;
}


port_id
Registry::HandlerPort(int32 token)
{
	std::lock_guard<std::mutex> lock(fMutex);
	auto found = fHandlers.find(token);
	return found != fHandlers.end() ? found->second.port : -1;
}


BHandler*
Registry::HandlerIn(port_id port, int32 token)
{
	std::lock_guard<std::mutex> lock(fMutex);
	auto found = fHandlers.find(token);
	return found != fHandlers.end() && found->second.port == port ? found->second.handler : nullptr;
}


void
Registry::SetApplicationPort(port_id port)
{
	std::lock_guard<std::mutex> lock(fMutex);
	fApplicationPort = port;
}


port_id
Registry::ApplicationPort()
{
	std::lock_guard<std::mutex> lock(fMutex);
	return fApplicationPort;
}

} // namespace BPrivate
