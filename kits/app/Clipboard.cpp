// SPDX-License-Identifier: MIT
// Data that programs cut, copy and paste.

#include <Clipboard.h>

#include <algorithm>
#include <atomic>
#include <map>
#include <mutex>
#include <string>
#include <vector>

#include <Application.h>
#include <Locker.h>
#include <Message.h>

#include "app/ClipboardPrivate.h"
#include "app/Delivery.h"
#include "app/MessagePrivate.h"

namespace BPrivate {

static const char* const kSystemName = "system";


/// The content that all objects of one name share.
class ClipboardStore {
public:
	static std::shared_ptr<ClipboardStore> Named(const std::string& name);

	std::mutex mutex;
	BMessage data;
	uint32 count = 0;
	BMessenger source;
	std::vector<BMessenger> watchers;
	/// Another program has taken over, and its data are not fetched yet; count has them already.
	bool changedElsewhere = false;

	void TellWatchers();
};


/// What one object sees: a copy of the content, and how old it is.
class ClipboardState {
public:
	explicit ClipboardState(const char* name)
		: name(name != nullptr ? name : kSystemName)
	{
	}

	const std::string name;
	BLocker lock;
	BMessage data;
	std::atomic<uint32> count = 0;
};


namespace {

/// The seam's other side. The mutex is held during its calls, never the store's.
struct ExchangeState {
	std::mutex mutex;
	ClipboardExchange* exchange = nullptr;
};


ExchangeState&
Exchange()
{
	static ExchangeState* state = new ExchangeState;
	return *state;
}


/// A program may use the clipboard before it shows anything.
void
EnsureExchange()
{
	{
		std::lock_guard<std::mutex> lock(Exchange().mutex);
		if (Exchange().exchange != nullptr)
			return;
	}
	if (be_app != nullptr)
		ConnectClipboardExchange();
}


/// Fetches what another program has put on the system clipboard; see ClipboardExchange::Get().
status_t
GetFromHost(BMessage* data)
{
	std::lock_guard<std::mutex> lock(Exchange().mutex);
	return Exchange().exchange != nullptr ? Exchange().exchange->Get(data) : B_ENTRY_NOT_FOUND;
}


status_t
PutToHost(const BMessage& data)
{
	std::lock_guard<std::mutex> lock(Exchange().mutex);
	return Exchange().exchange != nullptr ? Exchange().exchange->Put(data) : B_OK;
}

} // namespace


std::shared_ptr<ClipboardStore>
ClipboardStore::Named(const std::string& name)
{
	static std::mutex* mutex = new std::mutex;
	static auto* stores = new std::map<std::string, std::shared_ptr<ClipboardStore>>;
	std::lock_guard<std::mutex> lock(*mutex);
	std::shared_ptr<ClipboardStore>& store = (*stores)[name];
	if (store == nullptr)
		store = std::make_shared<ClipboardStore>();
	return store;
}


void
ClipboardStore::TellWatchers()
{
	std::vector<BMessenger> targets;
	{
		std::lock_guard<std::mutex> lock(mutex);
		std::erase_if(watchers, [](const BMessenger& watcher) { return !watcher.IsValid(); });
		targets = watchers;
	}
	for (const BMessenger& target : targets)
		target.SendMessage(B_CLIPBOARD_CHANGED);
}


void
SetClipboardExchange(ClipboardExchange* exchange)
{
	std::lock_guard<std::mutex> lock(Exchange().mutex);
	Exchange().exchange = exchange;
}


void
ClipboardChangedElsewhere()
{
	std::shared_ptr<ClipboardStore> store = ClipboardStore::Named(kSystemName);
	{
		std::lock_guard<std::mutex> lock(store->mutex);
		store->count++;
		store->source = BMessenger();
		store->changedElsewhere = true;
	}
	store->TellWatchers();
}

} // namespace BPrivate

using BPrivate::ClipboardState;
using BPrivate::ClipboardStore;

BClipboard* be_clipboard = new BClipboard(BPrivate::kSystemName);


BClipboard::BClipboard(const char* name, bool)
	: fStore(ClipboardStore::Named(name != nullptr ? name : BPrivate::kSystemName)),
	  fState(new ClipboardState(name))
{
}


BClipboard::~BClipboard()
{
	delete fState;
}


const char*
BClipboard::Name() const
{
	return fState->name.c_str();
}


uint32
BClipboard::LocalCount() const
{
	return fState->count;
}


uint32
BClipboard::SystemCount() const
{
	std::lock_guard<std::mutex> lock(fStore->mutex);
	return fStore->count;
}


status_t
BClipboard::StartWatching(BMessenger target)
{
	if (!target.IsValid())
		return B_BAD_VALUE;

	std::lock_guard<std::mutex> lock(fStore->mutex);
	std::vector<BMessenger>& watchers = fStore->watchers;
	if (std::find(watchers.begin(), watchers.end(), target) == watchers.end())
		watchers.push_back(target);
	return B_OK;
}


status_t
BClipboard::StopWatching(BMessenger target)
{
	std::lock_guard<std::mutex> lock(fStore->mutex);
	std::vector<BMessenger>& watchers = fStore->watchers;
	auto found = std::find(watchers.begin(), watchers.end(), target);
	if (found == watchers.end())
		return B_BAD_VALUE;
	watchers.erase(found);
	return B_OK;
}


bool
BClipboard::Lock()
{
	if (!fState->lock.Lock())
		return false;

	// A second level must not cost what was added and not committed.
	if (fState->lock.CountLocks() == 1)
		Fetch();
	return true;
}


void
BClipboard::Unlock()
{
	fState->lock.Unlock();
}


bool
BClipboard::IsLocked() const
{
	return fState->lock.IsLocked();
}


status_t
BClipboard::Clear()
{
	return IsLocked() ? fState->data.MakeEmpty() : B_NOT_ALLOWED;
}


status_t
BClipboard::Commit()
{
	return Commit(false);
}


status_t
BClipboard::Commit(bool failIfChanged)
{
	if (!IsLocked())
		return B_NOT_ALLOWED;
	{
		std::lock_guard<std::mutex> lock(fStore->mutex);
		if (failIfChanged && fStore->count != fState->count)
			return B_ERROR;
		fStore->data = fState->data;
		fStore->source = BPrivate::MessengerFor(BPrivate::ApplicationAddress());
		fStore->changedElsewhere = false;
		fState->count = ++fStore->count;
	}
	status_t status = B_OK;
	if (fState->name == BPrivate::kSystemName)
		status = BPrivate::PutToHost(fState->data);
	fStore->TellWatchers();
	return status;
}


status_t
BClipboard::Revert()
{
	return IsLocked() ? Fetch() : B_NOT_ALLOWED;
}


BMessenger
BClipboard::DataSource() const
{
	std::lock_guard<std::mutex> lock(fStore->mutex);
	return fStore->source;
}


BMessage*
BClipboard::Data() const
{
	return IsLocked() ? &fState->data : nullptr;
}


/// Makes the object's data the shared ones, after asking the host for newer ones. B_TIMED_OUT, and no data,
/// when the program that has them does not answer.
status_t
BClipboard::Fetch()
{
	BMessage foreign;
	status_t status = B_ENTRY_NOT_FOUND;
	if (fState->name == BPrivate::kSystemName) {
		BPrivate::EnsureExchange();
		status = BPrivate::GetFromHost(&foreign);
	}
	bool isForeign = status == B_OK || status == B_TIMED_OUT;

	std::lock_guard<std::mutex> lock(fStore->mutex);
	if (isForeign) {
		// The host need not have said that it changed.
		if (!fStore->changedElsewhere && !foreign.HasSameData(fStore->data))
			fStore->count++;
		fStore->data = foreign;
		fStore->source = BMessenger();
		fStore->changedElsewhere = false;
	}
	fState->data = fStore->data;
	fState->count = fStore->count;
	return status == B_TIMED_OUT ? status : B_OK;
}
