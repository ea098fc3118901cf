// SPDX-License-Identifier: MIT
// ShortcutTable: what a key with its modifiers means.
#include "interface/ShortcutTable.h"

#include <algorithm>

#include <InterfaceDefs.h>

namespace BPrivate {

namespace {

uint32
Folded(uint32 key)
{
	return key >= 'A' && key <= 'Z' ? key - 'A' + 'a' : key;
}


uint32
Relevant(uint32 modifiers)
{
	return modifiers & (B_SHIFT_KEY | B_COMMAND_KEY | B_CONTROL_KEY | B_OPTION_KEY);
}


uint32
WithImpliedCommand(uint32 modifiers)
{
	if ((modifiers & B_NO_COMMAND_KEY) != 0)
		return Relevant(modifiers);
	return Relevant(modifiers) | B_COMMAND_KEY;
}

} // namespace


void
ShortcutTable::Add(Shortcut shortcut)
{
	Remove(shortcut.key, shortcut.modifiers);
	shortcut.key = Folded(shortcut.key);
	shortcut.modifiers = WithImpliedCommand(shortcut.modifiers);
	fShortcuts.push_back(std::move(shortcut));
}


bool
ShortcutTable::Remove(uint32 key, uint32 modifiers)
{
	modifiers = WithImpliedCommand(modifiers);
	return std::erase_if(fShortcuts, [&](const Shortcut& shortcut) {
		return shortcut.key == Folded(key) && shortcut.modifiers == modifiers;
	}) != 0;
}


void
ShortcutTable::RemoveOwnedBy(const void* owner)
{
	std::erase_if(fShortcuts, [&](const Shortcut& shortcut) { return shortcut.owner == owner; });
}


bool
ShortcutTable::Has(uint32 key, uint32 modifiers) const
{
	return Find(key, WithImpliedCommand(modifiers)) != nullptr;
}


const Shortcut*
ShortcutTable::Find(uint32 key, uint32 modifiers) const
{
	for (const Shortcut& shortcut : fShortcuts) {
		if (shortcut.key == Folded(key) && shortcut.modifiers == Relevant(modifiers))
			return &shortcut;
	}
	return nullptr;
}

} // namespace BPrivate
