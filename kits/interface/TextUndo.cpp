// SPDX-License-Identifier: MIT

#include "TextUndo.h"

namespace BPrivate {

namespace {

// The oldest changes go when all together are larger, in bytes.
constexpr size_t kMostBytes = 64 * 1024 * 1024;

} // namespace


size_t
TextUndo::SizeOf(const TextChange& change)
{
	size_t size = sizeof(TextChange) + change.removed.size() + change.inserted.size();
	if (change.styles != nullptr)
		size += static_cast<size_t>(change.styles->count) * sizeof(text_run);
	return size;
}


void
TextUndo::Note(TextChange change)
{
	if (change.removed.empty() && change.inserted.empty())
		return;
	if (fDirection == kNew) {
		for (const auto& undone : fUndone)
			fSize -= SizeOf(*undone);
		fUndone.clear();
		if (Join(change))
			return;
	}
	Changes& changes = fDirection == kBack ? fUndone : fDone;
	changes.push_back(std::make_unique<TextChange>(std::move(change)));
	fSize += SizeOf(*changes.back());
	fSealed = fDirection != kNew;
	while (fSize > kMostBytes && fDone.size() > 1) {
		fSize -= SizeOf(*fDone.front());
		fDone.pop_front();
	}
}


// Whether the change belongs to the one before it, which has grown by it.
bool
TextUndo::Join(const TextChange& change)
{
	if (fSealed || fDone.empty())
		return false;
	TextChange& last = *fDone.back();
	const size_t before = SizeOf(last);
	if (change.removed.empty()) {
		if (change.offset != last.offset + static_cast<int32>(last.inserted.size()))
			return false;
		last.inserted += change.inserted;
	} else {
		const bool onlyRemove = change.inserted.empty() && last.inserted.empty()
			&& change.styles == nullptr && last.styles == nullptr;
		if (onlyRemove && change.offset == last.offset)
			last.removed += change.removed;
		else if (onlyRemove
			&& change.offset + static_cast<int32>(change.removed.size()) == last.offset)
			last.removed.insert(0, change.removed);
		else
			return false;
		last.offset = change.offset;
	}
	fSize += SizeOf(last) - before;
	return true;
}


void
TextUndo::Forget()
{
	fDone.clear();
	fUndone.clear();
	fSize = 0;
	fSealed = true;
}


std::unique_ptr<TextChange>
TextUndo::StartUndo(const std::string& text)
{
	fDirection = kBack;
	return Take(&fDone, text);
}


std::unique_ptr<TextChange>
TextUndo::StartRedo(const std::string& text)
{
	fDirection = kForth;
	return Take(&fUndone, text);
}


void
TextUndo::End()
{
	fDirection = kNew;
	fSealed = true;
}


std::unique_ptr<TextChange>
TextUndo::Take(Changes* changes, const std::string& text)
{
	if (!changes->empty()) {
		const TextChange& last = *changes->back();
		const size_t offset = static_cast<size_t>(last.offset);
		if (offset <= text.size()
			&& text.compare(offset, last.inserted.size(), last.inserted) == 0) {
			std::unique_ptr<TextChange> change = std::move(changes->back());
			changes->pop_back();
			fSize -= SizeOf(*change);
			return change;
		}
		Forget();
	}
	End();
	return nullptr;
}

} // namespace BPrivate
