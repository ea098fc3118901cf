// SPDX-License-Identifier: MIT
// The keyboard's side of the input hub.
#include <cstring>

#include "display/Display.h"
#include "display/InputHub.h"
#include "display/KeyMap.h"

namespace BPrivate {

StackedWindow*
InputHub::KeyTarget() const
{
	// A menu's window is never active, and takes the keys all the same while it is open.
	if (OpenMenu() != nullptr)
		return OpenMenu();
	StackedWindow* target = fActive != nullptr ? fActive : fStack.TopFocus();
	if (target == nullptr || fStack.BlockerOf(target) != nullptr)
		return nullptr;
	return target;
}


void
InputHub::SetModifiers(uint32 modifiers)
{
	std::lock_guard<std::mutex> lock(fMutex);
	SetModifiersLocked(modifiers);
}


void
InputHub::SetModifiersLocked(uint32 modifiers)
{
	if (modifiers == fKeys.modifiers)
		return;

	uint32 old = fKeys.modifiers;
	fKeys.modifiers = modifiers;
	StackedWindow* target = KeyTarget();
	if (target == nullptr)
		return;
	auto message = std::make_unique<BMessage>(B_MODIFIERS_CHANGED);
	message->AddInt64("when", system_time());
	message->AddInt32("modifiers", static_cast<int32>(modifiers));
	message->AddInt32("be:old_modifiers", static_cast<int32>(old));
	message->AddData("states", B_UINT8_TYPE, fKeys.key_states, sizeof(fKeys.key_states));
	target->client->Deliver(std::move(message));
}


void
InputHub::Key(const KeyInput& key, bool down)
{
	std::lock_guard<std::mutex> lock(fMutex);
	KeyLocked(key, down);
}


void
InputHub::KeyLocked(const KeyInput& key, bool down)
{
	fLastInput = system_time();
	if (key.rawKey > 0 && key.rawKey < 128) {
		uint8& state = fKeys.key_states[key.rawKey >> 3];
		uint8 mask = static_cast<uint8>(0x80 >> (key.rawKey & 7));
		state = down ? state | mask : state & ~mask;
	}
	SetModifiersLocked(key.modifiers);
	if (fDrag != nullptr && down && key.rawChar == B_ESCAPE) {
		CancelDragLocked();
		return;
	}

	StackedWindow* target = KeyTarget();
	if (target == nullptr)
		return;

	uint32 what = key.bytes.Length() > 0 ? (down ? B_KEY_DOWN : B_KEY_UP)
										 : (down ? B_UNMAPPED_KEY_DOWN : B_UNMAPPED_KEY_UP);
	auto message = std::make_unique<BMessage>(what);
	message->AddInt64("when", fLastInput);
	message->AddInt32("key", key.rawKey);
	message->AddInt32("modifiers", static_cast<int32>(key.modifiers));
	message->AddData("states", B_UINT8_TYPE, fKeys.key_states, sizeof(fKeys.key_states));
	if (key.bytes.Length() > 0) {
		message->AddInt32("raw_char", key.rawChar);
		for (int32 i = 0; i < key.bytes.Length(); i++)
			message->AddInt8("byte", key.bytes[i]);
		message->AddString("bytes", key.bytes);
	}
	if (down && key.repeat > 0)
		message->AddInt32("be:key_repeat", key.repeat);
	target->client->Deliver(std::move(message));
}


void
InputHub::GetKeys(key_info* info) const
{
	std::lock_guard<std::mutex> lock(fMutex);
	*info = fKeys;
}


void
InputHub::InjectKey(const InjectedKey& injected, bool down)
{
	std::lock_guard<std::mutex> lock(fMutex);
	KeyInput key;
	key.rawKey = injected.rawKey;
	key.bytes = injected.bytes;
	key.rawChar = RawCharForKey(injected.rawKey);
	key.modifiers = injected.modifiers;
	// The general modifiers come with the key of one side, as from a keyboard.
	for (int32 modifierKey : {kRawLeftShift, kRawLeftCommand, kRawLeftControl, kRawLeftOption}) {
		uint32 bits = ModifiersForKey(modifierKey);
		uint32 sides = (bits | bits << 1) & ~0xffu;
		if ((key.modifiers & bits & 0xff) != 0 && (key.modifiers & sides) == 0)
			key.modifiers |= bits;
	}
	KeyLocked(key, down);
}

} // namespace BPrivate
