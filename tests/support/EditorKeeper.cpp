// SPDX-License-Identifier: MIT

#include "support/EditorKeeper.h"

#include <dlfcn.h>

#include <cstdint>
#include <mutex>
#include <set>

#include "model/Component.h"
#include "props/PropertyEditor.h"

// Of the sanitizers' allocator, whose header not every compiler brings along.
extern "C" int __sanitizer_get_ownership(const volatile void* address);

namespace {

/// The addresses of the editors met so far, in a form that is no pointer for the leak checker.
struct editor_list {
	std::mutex mutex;
	std::set<uintptr_t> hidden;
};


editor_list&
Editors()
{
	static editor_list sEditors;
	return sEditors;
}


/// Whether there is an editor on the heap at \a address, of a class whose library is loaded.
bool
IsAlive(void* address)
{
	Dl_info info;
	return __sanitizer_get_ownership(address) != 0
		&& dladdr(*static_cast<void**>(address), &info) != 0;
}

} // namespace


void
DeleteForgottenEditors()
{
	std::lock_guard<std::mutex> lock(Editors().mutex);
	for (uintptr_t hidden : Editors().hidden) {
		void* address = reinterpret_cast<void*>(~hidden);
		if (IsAlive(address))
			delete static_cast<TPropertyEditor*>(address);
	}
	Editors().hidden.clear();
}


/// Comes before the library's own function of this name, notes the editor and calls the library's.
void
TComponent::AddPropAndEditor(TProperty* property, TPropertyEditor* editor, const char* setStatement,
	const char* getStatement, bool quoted)
{
	typedef void (*add_function)(
		TComponent*, TProperty*, TPropertyEditor*, const char*, const char*, bool);
	static const add_function sAdd = reinterpret_cast<add_function>(
		dlsym(RTLD_NEXT, "_ZN10TComponent16AddPropAndEditorEP9TPropertyP15TPropertyEditorPKcS5_b"));
	if (editor != nullptr) {
		std::lock_guard<std::mutex> lock(Editors().mutex);
		Editors().hidden.insert(~reinterpret_cast<uintptr_t>(editor));
	}
	sAdd(this, property, editor, setStatement, getStatement, quoted);
}
