// SPDX-License-Identifier: MIT
// What exists: the ports of loopers and of waiting senders, and the handlers by token.

#ifndef _APP_REGISTRY_H
#define _APP_REGISTRY_H

#include <memory>
#include <mutex>
#include <unordered_map>
#include <vector>

#include <OS.h>
#include <SupportDefs.h>

class BHandler;
class BLooper;
class BWindow;

namespace BPrivate {

class LooperPort;
class ReplyPort;


/// Answers, without touching them, whether loopers and handlers still exist and who belongs to whom.
///
/// There is one, made at its first use and never deleted: static objects and threads use it before main() and after.
class Registry {
public:
	static Registry& Default();

	/// The port comes locked by the calling thread.
	std::shared_ptr<LooperPort> AddLooper(BLooper* looper, BWindow* window);
	void RemoveLooper(BLooper* looper);

	/// NULL when there is no such looper.
	std::shared_ptr<LooperPort> PortFor(const BLooper* looper);
	std::shared_ptr<LooperPort> PortFor(port_id id);
	std::shared_ptr<LooperPort> PortForThread(thread_id thread);
	/// All loopers, the oldest first.
	std::vector<std::shared_ptr<LooperPort>> Loopers();

	void AddReplyPort(port_id id, std::shared_ptr<ReplyPort> port);
	void RemoveReplyPort(port_id id);
	std::shared_ptr<ReplyPort> ReplyPortFor(port_id id);
	port_id NewPortId();

	/// Tokens are never used twice.
	int32 AddHandler(BHandler* handler);
	void RemoveHandler(int32 token);
	/// \a port: of the looper that the handler belongs to from now on, -1 for none.
	void SetHandlerPort(int32 token, port_id port);
	/// -1 when the handler has no looper or is gone.
	port_id HandlerPort(int32 token);
	/// The handler if it belongs to the looper of \a port; it stays there as long as the caller holds that lock.
	BHandler* HandlerIn(port_id port, int32 token);

	/// The looper of the application object.
	void SetApplicationPort(port_id port);
	port_id ApplicationPort();

private:
	struct HandlerEntry {
		BHandler* handler;
		port_id port;
	};

	Registry();

	std::mutex fMutex;
	port_id fNextPort;
	int32 fNextToken;
	port_id fApplicationPort;
	std::unordered_map<port_id, std::shared_ptr<LooperPort>> fPorts;
	std::unordered_map<const BLooper*, std::shared_ptr<LooperPort>> fLoopers;
	std::unordered_map<port_id, std::shared_ptr<ReplyPort>> fReplyPorts;
	std::unordered_map<int32, HandlerEntry> fHandlers;
};

} // namespace BPrivate

#endif // _APP_REGISTRY_H
