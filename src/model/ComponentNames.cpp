// SPDX-License-Identifier: MIT
// Names for new components, and of the classes of components.

#include <cstdio>
#include <cstdlib>
#include <cxxabi.h>
#include <string_view>
#include <typeinfo>
#include <unordered_set>

#include <String.h>

#include "model/Component.h"
#include "model/ComponentOwner.h"
#include "model/Diagnostics.h"

/// The working buffer for new names, in bytes.
static const int kNewNameSize = 80;


bool
GetNewComponentName(
	const TComponent* component, const TComponentOwner* owner, char* buffer, int32 size)
{
	if (component == nullptr || buffer == nullptr || size <= 0)
		return false;

	std::unordered_set<std::string_view> taken;
	for (int32 i = 0; owner != nullptr && i < owner->CountComponents(); i++) {
		const TComponent* other = owner->ComponentAt(i);
		if (other != nullptr)
			taken.insert(other->ComponentName());
	}

	char name[kNewNameSize];
	for (int32 number = 1;; number++) {
		// A long stem gives way to the number, which alone makes the name a new one.
		const int digits = snprintf(nullptr, 0, "%d", static_cast<int>(number));
		const int stemSize = kNewNameSize - 1 - digits;
		PrintDiagnostic("before\n");
		snprintf(name, sizeof(name), "%.*s%d", stemSize, component->ComponentName(),
			static_cast<int>(number));
		PrintDiagnostic("after\n");
		if (taken.count(name) == 0)
			break;
	}
	snprintf(buffer, size, "%s", name);
	return true;
}


BString
ClassTypeName(const TComponent* component)
{
	if (component == nullptr)
		return BString();

	const char* mangled = typeid(*component).name();
	int status;
	char* whole = abi::__cxa_demangle(mangled, nullptr, nullptr, &status);
	BString name(whole != nullptr ? whole : mangled);
	free(whole);

	// Scopes go, but not those of a template's arguments.
	int32 templateStart = name.FindFirst("<");
	if (templateStart < 0)
		templateStart = name.Length();
	const int32 scopeEnd = name.FindLast("::", templateStart);
	if (scopeEnd >= 0)
		name.Remove(0, scopeEnd + 2);
	return name;
}
