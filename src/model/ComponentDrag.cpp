// SPDX-License-Identifier: MIT
// The component that the mouse drags.

#include "model/ComponentDrag.h"

#include <mutex>
#include <random>

#include <Message.h>
#include <View.h>

#include "model/Component.h"

namespace {

struct component_drag {
	TComponent* component;
	BLooper* window;
	int64 number;
};

std::mutex sLock;
component_drag sDrag = {nullptr, nullptr, 0};


int64
NewNumber()
{
	std::random_device device;
	return static_cast<int64>(static_cast<uint64>(device()) << 32 | device());
}

} // namespace

namespace ComponentDrag {

void
Begin(TComponent* component, BMessage* message)
{
	const BView* view = component->DTView();
	const component_drag drag = {
		component, view != nullptr ? view->Looper() : nullptr, NewNumber()};
	message->AddPointer("component", component);
	message->AddInt64("drag", drag.number);
	std::lock_guard<std::mutex> lock(sLock);
	sDrag = drag;
}


void
Forget(const TComponent* component)
{
	std::lock_guard<std::mutex> lock(sLock);
	if (sDrag.component == component)
		sDrag = {nullptr, nullptr, 0};
}


TComponent*
Find(const BMessage* message)
{
	void* pointer;
	int64 number;
	if (message->FindPointer("component", &pointer) != B_OK || pointer == nullptr
		|| message->FindInt64("drag", &number) != B_OK)
		return nullptr;
	std::lock_guard<std::mutex> lock(sLock);
	return pointer == sDrag.component && number == sDrag.number ? sDrag.component : nullptr;
}


BLooper*
WindowOf(const TComponent* component)
{
	std::lock_guard<std::mutex> lock(sLock);
	return component == sDrag.component ? sDrag.window : nullptr;
}

} // namespace ComponentDrag
