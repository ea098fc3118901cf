// SPDX-License-Identifier: MIT
// A looper's loop: from the queue through the filters to the handler, and out of it.

#include <cstdio>

#include <List.h>
#include <Looper.h>
#include <MessageFilter.h>
#include <MessageQueue.h>

#include "app/LoopFrame.h"
#include "app/LooperPort.h"
#include "app/MessagePrivate.h"
#include "app/Registry.h"
#include "kernel/Kernel.h"

using BPrivate::CurrentThread;
using BPrivate::LooperPort;
using BPrivate::LoopFrame;
using BPrivate::Registry;

static thread_local LoopFrame* sInnermostFrame = nullptr;


LoopFrame::LoopFrame(BLooper* looper)
	: looper(looper),
	  outer(sInnermostFrame)
{
	sInnermostFrame = this;
}


LoopFrame::~LoopFrame()
{
	sInnermostFrame = outer;
}


LoopFrame*
LoopFrame::Find(const BLooper* looper)
{
	LoopFrame* frame = sInnermostFrame;
	while (frame != nullptr && frame->looper != looper)
		frame = frame->outer;
	return frame;
}


void
LoopFrame::ReturnTo(LoopFrame* frame)
{
	sInnermostFrame = frame;
}


thread_id
BLooper::Run()
{
	if (fRunCalled)
		return B_NOT_ALLOWED;
	if (!IsLocked() && !Lock())
		return B_BAD_VALUE;

	char name[B_OS_NAME_LENGTH];
	snprintf(name, sizeof(name), "%s%s", fPort->Window() != nullptr ? "w>" : "",
		Name() != nullptr ? Name() : "looper");
	thread_id thread = spawn_thread(TaskEntry, name, fPriority, this);
	if (thread < 0)
		return thread;

	fRunCalled = true;
	fPort->SetThread(thread);
	fPort->SetRunning();

	// From here on another thread may lock and quit the looper: nothing of it is touched any more.
	Unlock();
	resume_thread(thread);
	return thread;
}


void
BLooper::Loop()
{
	if (fRunCalled || (!IsLocked() && !Lock()))
		return;

	fRunCalled = true;
	fLoopsInCaller = true;
	fPort->SetThread(CurrentThread());
	fPort->SetRunning();
	Unlock();
	EnterLoop();
}


void
BLooper::Quit()
{
	if (!IsLocked()) {
		fprintf(stderr, "ERROR - you must Lock a looper before calling Quit(), looper=%s\n",
			Name() != nullptr ? Name() : "unnamed");
		if (!Lock())
			return;
	}

	if (!fRunCalled) {
		fTerminating = true;
		delete this;
		return;
	}
	if (LoopFrame::Find(this) != nullptr)
		DeleteAndLeave();

	// The looper deletes itself in its own thread; the port is what is left to wait for.
	std::shared_ptr<LooperPort> port = fPort;
	thread_id thread = port->Thread();
	bool ownThread = !fLoopsInCaller;
	PostMessage(_QUIT_);
	port->UnlockFully();
	BPrivate::CheckWait("a looper to quit");
	port->WaitUntilClosed();
	if (ownThread) {
		status_t result;
		wait_for_thread(thread, &result);
	}
}


bool
BLooper::QuitRequested()
{
	return true;
}


void
BLooper::DispatchMessage(BMessage* message, BHandler* handler)
{
	if (message->what == B_QUIT_REQUESTED && handler == this)
		HandleQuitRequest(message);
	else
		handler->MessageReceived(message);
}


void
BLooper::MessageReceived(BMessage* message)
{
	BHandler::MessageReceived(message);
}


BMessage*
BLooper::CurrentMessage() const
{
	return LoopFrame::Find(this) != nullptr ? fLastMessage : nullptr;
}


BMessage*
BLooper::DetachCurrentMessage()
{
	BMessage* message = CurrentMessage();
	if (message != nullptr)
		fLastMessage = nullptr;
	return message;
}


BMessage*
BLooper::MessageFromPort(bigtime_t timeout)
{
	return fPort->WaitForMessage(timeout) ? fPort->Take() : nullptr;
}


BHandler*
BLooper::ChooseTarget(BMessage*, BHandler* target, bool)
{
	return target;
}


void
BLooper::QueueRanEmpty()
{
}


status_t
BLooper::TaskEntry(void* looper)
{
	static_cast<BLooper*>(looper)->EnterLoop();
	return B_OK;
}


// A function of its own: no local of it changes after the jump's place was marked.
void
BLooper::EnterLoop()
{
	LoopFrame frame(this);
	if (_setjmp(frame.place) == 0)
		RunLoop();
}


// Returns, with the looper locked, only when the looper outlives its loop.
void
BLooper::RunLoop()
{
	while (true) {
		if (fQueue->IsEmpty()) {
			if (!fPort->HasMessages())
				QueueRanEmpty();
			fPort->WaitForMessage(B_INFINITE_TIMEOUT);
		}

		Lock();
		if (!fTerminating) {
			fPort->MoveInto(fQueue);
			fLastMessage = fQueue->NextMessage();
			if (fLastMessage != nullptr)
				DispatchNext(fLastMessage);
		}
		BMessage* message = fLastMessage;
		fLastMessage = nullptr;
		if (fTerminating) {
			delete message;
			return;
		}
		Unlock();
		// Unlocked: what the deletion tells a waiting sender must not find us locked.
		delete message;
	}
}


void
BLooper::DispatchNext(BMessage* message)
{
	// A looper that was quit from elsewhere is not asked, nor may a filter keep it.
	if (message->what == _QUIT_) {
		if (!fOutlivesLoop)
			DeleteAndLeave();
		fTerminating = true;
		return;
	}

	int32 token = BMessage::Private(message).Target();
	bool preferred = token == kPreferredToken;
	BHandler* target = this;
	if (preferred)
		target = fPreferred != nullptr ? fPreferred : this;
	else if (token != kNoToken)
		target = Registry::Default().HandlerIn(fPort->Id(), token);

	target = ChooseTarget(message, target, preferred);
	if (target != nullptr)
		target = FilterMessage(message, target);
	if (target != nullptr && target->Looper() == this)
		DispatchMessage(message, target);
}


BHandler*
BLooper::FilterMessage(BMessage* message, BHandler* target)
{
	target = RunFilters(true, message, target);

	// A new target's own filters run too.
	BHandler* previous = nullptr;
	while (target != nullptr && target != previous) {
		previous = target;
		target = RunFilters(false, message, target);
	}
	return target;
}


/// Runs the common filters, or the target's own. Returns the target that they leave, NULL to drop the message.
BHandler*
BLooper::RunFilters(bool common, BMessage* message, BHandler* target)
{
	Registry& registry = Registry::Default();
	BHandler* owner = target;
	int32 ownerToken = owner->fToken;

	// A filter may change the list, or delete the handler that it belongs to: everything is looked up again each time.
	for (int32 i = 0;; i++) {
		BList* filters = common ? fCommonFilters : owner->fFilters;
		if (filters == nullptr || i >= filters->CountItems())
			return target;

		BMessageFilter* filter = static_cast<BMessageFilter*>(filters->ItemAt(i));
		if (!filter->Applies(message))
			continue;
		if (filter->Run(message, &target) == B_SKIP_MESSAGE || target == nullptr)
			return nullptr;
		if (!common && registry.HandlerIn(fPort->Id(), ownerToken) != owner)
			return target != owner ? target : nullptr;
	}
}


void
BLooper::HandleQuitRequest(BMessage* message)
{
	bool quit = QuitRequested();
	if (message->IsSourceWaiting()) {
		BMessage reply(B_REPLY);
		reply.AddBool("result", quit);
		reply.AddInt32("thread", Thread());
		message->SendReply(&reply);
	}
	if (quit)
		Quit();
}


/// Deletes the looper and goes on behind its loop, in the looper's own thread.
void
BLooper::DeleteAndLeave()
{
	LoopFrame* frame = LoopFrame::Find(this);
	fTerminating = true;
	// Before it is unregistered: who finds it gone has to know of the thread.
	if (!fLoopsInCaller)
		BPrivate::announce_thread_end();
	delete this;
	LoopFrame::ReturnTo(frame);
	_longjmp(frame->place, 1);
}
