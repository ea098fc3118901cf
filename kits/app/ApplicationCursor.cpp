// SPDX-License-Identifier: MIT
// The application's cursor, kept here and shown by the display.

#include <mutex>

#include <Application.h>
#include <Cursor.h>

#include "app/CursorPrivate.h"

namespace BPrivate {

namespace {

/// What the application asked for, and who shows it. Any thread.
struct CursorState {
	std::mutex mutex;
	CursorHost* host = nullptr;
	std::shared_ptr<const CursorShape> shape = std::make_shared<const CursorShape>();
	int32 hideCount = 0;
};


CursorState&
State()
{
	static CursorState* state = new CursorState;
	return *state;
}

} // namespace


void
SetCursorHost(CursorHost* host)
{
	std::lock_guard<std::mutex> lock(State().mutex);
	State().host = host;
	if (host == nullptr)
		return;
	host->SetApplicationCursor(State().shape);
	host->SetCursorHidden(State().hideCount > 0);
}


static void
ChangeHideCount(int32 change)
{
	std::lock_guard<std::mutex> lock(State().mutex);
	int32 count = State().hideCount + change;
	State().hideCount = count > 0 ? count : 0;
	if (State().host != nullptr)
		State().host->SetCursorHidden(State().hideCount > 0);
}

} // namespace BPrivate

using BPrivate::State;


void
BApplication::ShowCursor()
{
	BPrivate::ChangeHideCount(-1);
}


void
BApplication::HideCursor()
{
	BPrivate::ChangeHideCount(1);
}


void
BApplication::ObscureCursor()
{
	std::lock_guard<std::mutex> lock(State().mutex);
	if (State().host != nullptr)
		State().host->ObscureCursor();
}


bool
BApplication::IsCursorHidden() const
{
	std::lock_guard<std::mutex> lock(State().mutex);
	return State().hideCount > 0;
}


void
BApplication::SetCursor(const void* cursor)
{
	BCursor made(cursor);
	SetCursor(&made, false);
}


void
BApplication::SetCursor(const BCursor* cursor, bool)
{
	if (cursor == nullptr || cursor->InitCheck() != B_OK)
		return;

	std::lock_guard<std::mutex> lock(State().mutex);
	State().shape = BPrivate::CursorAccess::Shape(*cursor);
	if (State().host != nullptr)
		State().host->SetApplicationCursor(State().shape);
}
